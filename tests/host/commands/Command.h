// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QProcess>
#include <QProcessEnvironment>
#include <QString>
#include <QStringList>

#include <gmock/gmock.h>

#include <stdexcept>
#include <string>

namespace HostTests {

/// What a command left behind.
struct Outcome
{
    int exitCode;
    std::string output;
    std::string errors;
};

inline Outcome run(const QString& program, const QStringList& arguments, const QString& folder = QString(),
                   const QString& locale = "C.UTF-8")
{
    QProcess process;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert("LC_ALL", locale);
    process.setProcessEnvironment(environment);
    process.setWorkingDirectory(folder);
    process.start(program, arguments);
    if (!process.waitForFinished(60000) || process.exitStatus() != QProcess::NormalExit) {
        throw std::runtime_error("the command did not end by itself");
    }
    return {process.exitCode(), process.readAllStandardOutput().toStdString(),
            process.readAllStandardError().toStdString()};
}

inline Outcome editormodel(const QStringList& arguments, const QString& folder = QString(),
                           const QString& locale = "C.UTF-8")
{
    return run(EDITORMODEL_COMMAND, arguments, folder, locale);
}

/// These words in this order; the rest of the line may depend on what an encoder makes.
inline testing::Matcher<std::string> hasLine(const QStringList& words)
{
    return testing::ContainsRegex(("(^|\n) *" + words.join("  +") + "[^\n]*\n").toStdString());
}

} // namespace HostTests
