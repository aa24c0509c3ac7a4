// SPDX-License-Identifier: Apache-2.0
#include "host/commands/CommandLine.h"

#include "host/text/DisplayText.h"

#include <EditorModel/persistence/Document.h>

#include <QCoreApplication>
#include <QFile>
#include <QGuiApplication>

#include <exception>
#include <memory>
#include <new>

namespace Host {
namespace {

/// The arguments in it must not steer the terminal.
std::string usageMessage(const CLI::App*, const CLI::Error& error)
{
    return printable(QString::fromStdString(error.what()).simplified()) +
           "\nRun with --help for more information; a file name that begins with - goes after --, or is "
           "written ./-NAME.\n";
}

/// An unknown option is the better reason than the file that is missing then.
int refuse(const CLI::App& app, const CLI::ParseError& error)
{
    const std::vector<std::string> unknown = app.remaining(true);
    const bool isMissing = dynamic_cast<const CLI::RequiredError*>(&error) != nullptr;
    return isMissing && !unknown.empty() ? app.exit(CLI::ExtrasError(unknown)) : app.exit(error);
}

void showGraveMessages(QtMsgType type, const QMessageLogContext&, const QString& message)
{
    if (type == QtCriticalMsg || type == QtFatalMsg) {
        writeError(message);
    }
}

/// Pictures, drawn or in a document, need a platform; it has no windows, so that it needs no screen.
std::unique_ptr<QCoreApplication> makeApplication(bool hasPictures, int& argc, char** argv)
{
    if (!hasPictures) {
        return std::make_unique<QCoreApplication>(argc, argv);
    }
    qputenv("QT_QPA_PLATFORM", "offscreen");
    // On a machine without a session Qt warns of folders that no picture needs.
    const QtMessageHandler before = qInstallMessageHandler(showGraveMessages);
    auto application = std::make_unique<QGuiApplication>(argc, argv);
    qInstallMessageHandler(before);
    return application;
}

} // namespace

CommandLine::CommandLine()
    : m_app("Describes media files, edits and draws timelines, and draws envelopes.", "editormodel")
{
    m_app.require_subcommand(1);
    m_app.failure_message(usageMessage);
}

CLI::App& CommandLine::add(const char* name, const char* description, const Runner& run)
{
    CLI::App* const command = m_app.add_subcommand(name, description);
    command->callback([this, run] { m_run = run; });
    return *command;
}

void CommandLine::needPictures(CLI::App& command, const std::function<bool()>& isNeeded)
{
    command.parse_complete_callback([this, isNeeded] { m_hasPictures = isNeeded(); });
}

ExitCode CommandLine::run(int argc, char** argv)
{
    try {
        m_app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        return refuse(m_app, error) == 0 ? Success : UsageError;
    }
    const auto application = makeApplication(m_hasPictures, argc, argv);
    try {
        return m_run();
    } catch (const std::bad_alloc&) {
        writeError(QStringLiteral("there is not enough memory"));
    } catch (const std::exception& error) {
        writeError(QString::fromUtf8(error.what()));
    }
    return Failure;
}

QString fileName(const std::string& argument)
{
    return QFile::decodeName(QByteArray::fromStdString(argument));
}

QStringList fileNames(const std::vector<std::string>& arguments)
{
    QStringList names;
    for (const std::string& argument : arguments) {
        names << fileName(argument);
    }
    return names;
}

std::string checkOutputName(const std::string& name)
{
    if (name.empty()) {
        return "the name of a file is missing";
    }
    const bool isKept = QFile::encodeName(fileName(name)).toStdString() == name;
    return isKept ? std::string() : "the name \"" + name + "\" is not UTF-8";
}

std::string checkDocumentName(const std::string& name)
{
    return Document::formOfPath(fileName(name)) ? std::string()
                                                : "the name of a document ends in .json, .xml or .bin";
}

} // namespace Host
