// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/Console.h"

#include <QString>
#include <QStringList>

#include <CLI/CLI.hpp>

#include <functional>
#include <string>
#include <vector>

namespace Host {

/// The command line of the program: commands are added, and one is run.
class CommandLine
{
public:
    using Runner = std::function<ExitCode()>;

    CommandLine();
    CommandLine(const CommandLine&) = delete;

    /// The command has no options yet. What the runner has of them is filled in when it is called.
    CLI::App& add(const char* name, const char* description, const Runner& run);
    /// For a command that draws pictures, or reads documents that may hold some. The question is put when the
    /// options are filled in; without one the answer is yes.
    void needPictures(
        CLI::App& command, const std::function<bool()>& isNeeded = [] { return true; });

    /// Reads the arguments and runs the command that they name, or tells what is wrong with them.
    ExitCode run(int argc, char** argv);

private:
    CLI::App m_app;
    Runner m_run;
    bool m_hasPictures = false;
};

// Arguments

QString fileName(const std::string& argument);
QStringList fileNames(const std::vector<std::string>& arguments);

/// Checks tell what is wrong, or nothing. A name that Qt cannot hold would become that of another file.
std::string checkOutputName(const std::string& name);
std::string checkDocumentName(const std::string& name);

} // namespace Host
