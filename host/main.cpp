// SPDX-License-Identifier: Apache-2.0
#include "Console.h"
#include "DisplayText.h"
#include "MediaProbe.h"
#include "ProbeCommand.h"
#include "ShowCommand.h"

#include <EditorModel/persistence/Document.h>

#include <QCoreApplication>
#include <QFile>

#include <CLI/CLI.hpp>

#include <clocale>
#include <cstdlib>
#include <exception>
#include <new>
#include <string>
#include <vector>

#include <langinfo.h>

namespace {

QString fileName(const std::string& argument)
{
    return QFile::decodeName(QByteArray::fromStdString(argument));
}

/// File names are taken for UTF-8 also where the locale knows none: otherwise Qt could not name them at all.
void useUtf8()
{
    std::setlocale(LC_ALL, "");
    if (std::string(nl_langinfo(CODESET)) != "UTF-8") {
        setenv("LC_ALL", "C.UTF-8", 1);
    }
}

std::string checkDocumentName(const std::string& name)
{
    return Document::formOfPath(fileName(name)) ? std::string()
                                                : "the name of a document ends in .json, .xml or .bin";
}

/// The arguments in it must not steer the terminal.
std::string usageMessage(const CLI::App*, const CLI::Error& error)
{
    return Host::printable(QString::fromStdString(error.what()).simplified()) +
           "\nRun with --help for more information; a file name that begins with - goes after --.\n";
}

/// An unknown option is the better reason than the file that is missing then.
int refuse(const CLI::App& app, const CLI::ParseError& error)
{
    const std::vector<std::string> unknown = app.remaining(true);
    const bool isMissing = dynamic_cast<const CLI::RequiredError*>(&error) != nullptr;
    return isMissing && !unknown.empty() ? app.exit(CLI::ExtrasError(unknown)) : app.exit(error);
}

struct Arguments
{
    std::vector<std::string> files;
    std::string document;
    bool json = false;
    bool verbose = false;
};

Host::ExitCode runProbe(const Arguments& arguments)
{
    Host::showMediaLibraryLog(arguments.verbose);
    Host::ProbeOptions options;
    for (const std::string& file : arguments.files) {
        options.paths << fileName(file);
    }
    options.savePath = fileName(arguments.document);
    options.json = arguments.json;
    return Host::probe(options);
}

} // namespace

int main(int argc, char** argv)
{
    useUtf8();
    const QCoreApplication application(argc, argv);

    Arguments arguments;
    CLI::App app("Describes media files, and shows descriptions that were saved.", "editormodel");
    app.require_subcommand(1);
    app.failure_message(usageMessage);

    CLI::App* const probe = app.add_subcommand("probe", "Describe media files");
    probe->add_option("FILE", arguments.files, "Video, sound or picture files")->required()->type_name("");
    probe
        ->add_option("--save", arguments.document, "Save the descriptions as a document: .json, .xml or .bin")
        ->type_name("PATH")
        ->check(checkDocumentName);
    probe->add_flag("--json", arguments.json, "Print JSON instead of a table");
    probe->add_flag("--verbose", arguments.verbose, "Let FFmpeg's libraries tell what they do");

    CLI::App* const show = app.add_subcommand("show", "Show the descriptions in a document");
    show->add_option("DOCUMENT", arguments.document, "A document that probe has saved")
        ->required()
        ->type_name("");

    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        return refuse(app, error) == 0 ? Host::Success : Host::UsageError;
    }
    try {
        return probe->parsed() ? runProbe(arguments) : Host::show(fileName(arguments.document));
    } catch (const std::bad_alloc&) {
        Host::writeError(QStringLiteral("there is not enough memory"));
    } catch (const std::exception& error) {
        Host::writeError(QString::fromUtf8(error.what()));
    }
    return Host::Failure;
}
