// SPDX-License-Identifier: Apache-2.0
#include "host/commands/CheckCommand.h"
#include "host/commands/CompareCommand.h"
#include "host/commands/Console.h"
#include "host/commands/ConvertCommand.h"
#include "host/commands/CurveCommand.h"
#include "host/commands/EditCommand.h"
#include "host/commands/NewCommand.h"
#include "host/commands/PackagesCommand.h"
#include "host/commands/PictureCommand.h"
#include "host/commands/ProbeCommand.h"
#include "host/commands/ShowCommand.h"
#include "host/commands/TrackCommand.h"
#include "host/media/MediaProbe.h"
#include "host/project/FaultList.h"
#include "host/text/DisplayText.h"

#include <EditorModel/persistence/Document.h>

#include <QCoreApplication>
#include <QFile>
#include <QGuiApplication>

#include <CLI/CLI.hpp>

#include <clocale>
#include <csignal>
#include <cstdlib>
#include <exception>
#include <map>
#include <memory>
#include <new>
#include <string>
#include <vector>

#include <langinfo.h>

namespace {

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

/// File names are taken for UTF-8 also where the locale knows none: otherwise Qt could not name them at all.
void useUtf8()
{
    std::setlocale(LC_ALL, "");
    if (std::string(nl_langinfo(CODESET)) != "UTF-8") {
        setenv("LC_ALL", "C.UTF-8", 1);
        std::setlocale(LC_ALL, "");
    }
}

/// A name that Qt cannot hold would become that of another file.
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
    /// Of the command that was given.
    Host::ExitCode (*run)(const Arguments&) = nullptr;
    bool readsTimelines = false;

    std::vector<std::string> files;
    std::vector<std::string> words;
    std::string document;
    std::string output;
    bool json = false;
    bool verbose = false;
    bool isForced = false;
    bool isOwn = false;

    std::string name;
    std::vector<double> rectangle;
    std::string id;

    std::string picture;
    Host::CurveOptions curve;
    qint64 length = 10000;
    qint64 fadeIn = 0;
    qint64 fadeOut = 0;
};

Host::ExitCode runProbe(const Arguments& arguments)
{
    Host::showMediaLibraryLog(arguments.verbose);
    Host::ProbeOptions options;
    options.paths = fileNames(arguments.files);
    options.savePath = fileName(arguments.document);
    options.json = arguments.json;
    return Host::probe(options);
}

Host::ExitCode runCurve(const Arguments& arguments)
{
    Host::CurveOptions options = arguments.curve;
    options.document = fileName(arguments.document);
    options.picturePath = fileName(arguments.picture);
    options.span = {arguments.length, arguments.fadeIn, arguments.fadeOut};
    return Host::curve(options);
}

Host::ExitCode runShow(const Arguments& arguments)
{
    return Host::show(fileName(arguments.document));
}

Host::ExitCode runPicture(const Arguments& arguments)
{
    return Host::drawTimeline(fileName(arguments.document), fileName(arguments.picture));
}

Host::ExitCode runNew(const Arguments& arguments)
{
    Host::showMediaLibraryLog(false);
    return Host::newProject(fileName(arguments.document), fileNames(arguments.files));
}

Host::ExitCode runEdit(const Arguments& arguments)
{
    Host::showMediaLibraryLog(false);
    return Host::editProject(fileName(arguments.document), fileNames(arguments.words),
                             fileNames(arguments.files));
}

Host::ExitCode runCheck(const Arguments& arguments)
{
    Host::showMediaLibraryLog(false);
    return Host::checkProject(fileName(arguments.document), arguments.json);
}

Host::ExitCode runConvert(const Arguments& arguments)
{
    Host::ConvertOptions options;
    options.input = fileName(arguments.document);
    options.output = fileName(arguments.output);
    options.isForced = arguments.isForced;
    options.isOwn = arguments.isOwn;
    return Host::convert(options);
}

Host::ExitCode runTrack(const Arguments& arguments)
{
    Host::showMediaLibraryLog(false);
    const std::vector<double>& r = arguments.rectangle;
    return Host::trackClip({fileName(arguments.document), fileName(arguments.name),
                            QRectF(r[0], r[1], r[2], r[3]), fileName(arguments.id)});
}

Host::ExitCode runCompare(const Arguments& arguments)
{
    return Host::compareDocuments(fileName(arguments.document), fileNames(arguments.files));
}

Host::ExitCode runPackages(const Arguments& arguments)
{
    return Host::showPackages(fileNames(arguments.files));
}

using Runner = Host::ExitCode (*)(const Arguments& arguments);

CLI::App* addCommand(CLI::App& app, Arguments& arguments, const char* name, const char* description,
                     Runner run)
{
    CLI::App* const command = app.add_subcommand(name, description);
    command->callback([&arguments, run] { arguments.run = run; });
    return command;
}

void addProbe(CLI::App& app, Arguments& arguments)
{
    CLI::App* const probe = addCommand(app, arguments, "probe", "Describe media files", runProbe);
    probe->add_option("FILE", arguments.files, "Video, sound or picture files")->required()->type_name("");
    probe
        ->add_option("--save", arguments.document,
                     "Save the descriptions and the resources as a document: .json, .xml or .bin")
        ->type_name("PATH")
        ->check(checkOutputName)
        ->check(checkDocumentName);
    probe->add_flag("--json", arguments.json, "Print JSON instead of a table");
    probe->add_flag("--verbose", arguments.verbose, "Let FFmpeg's libraries tell what they do");
}

void addShow(CLI::App& app, Arguments& arguments)
{
    CLI::App* const show = addCommand(app, arguments, "show", "Show what is in a document", runShow);
    show->add_option("DOCUMENT", arguments.document,
                     "A document with a timeline, or one that probe has saved")
        ->required()
        ->type_name("");
    show->parse_complete_callback([&arguments] { arguments.readsTimelines = true; });
}

void addCurve(CLI::App& app, Arguments& arguments)
{
    const std::map<std::string, Host::CurveSample> samples = {{"volume", Host::VolumeSample},
                                                              {"transformation", Host::TransformationSample}};
    // Up to 99:59:59.999, which is what a label has room for.
    constexpr qint64 longest = 359999999;
    const CLI::Validator milliseconds = CLI::Range(qint64(0), longest).description("");

    CLI::App* const curve = addCommand(app, arguments, "curve", "Show how an envelope goes", runCurve);
    curve->add_option("DOCUMENT", arguments.document, "A document with a volume or transformation envelope")
        ->required()
        ->type_name("")
        ->check(checkOutputName);
    curve->add_option("-o,--output", arguments.picture, "Draw it as a picture too: .png or .svg")
        ->type_name("PATH")
        ->check(checkOutputName);
    curve->add_option("--length", arguments.length, "How long the envelope is played, in milliseconds")
        ->type_name("MS")
        ->check(CLI::Range(qint64(1), longest).description(""))
        ->capture_default_str();
    curve->add_option("--fade-in", arguments.fadeIn, "The length of a fade-in of the volume")
        ->type_name("MS")
        ->check(milliseconds);
    curve->add_option("--fade-out", arguments.fadeOut, "The length of a fade-out of the volume")
        ->type_name("MS")
        ->check(milliseconds);
    curve->add_option("--steps", arguments.curve.steps, "How many steps the table has")
        ->type_name("N")
        ->check(CLI::Range(1, 10000).description(""))
        ->capture_default_str();
    curve
        ->add_option("--sample", arguments.curve.sample,
                     "Make the document first, with an envelope to look at: volume or transformation")
        ->type_name("KIND")
        ->transform(CLI::CheckedTransformer(samples, CLI::ignore_case).description(""));
    curve->add_flag("--own", arguments.curve.isOwn,
                    "Read binary and XML archives too, which must be of your own making");
}

void addNew(CLI::App& app, Arguments& arguments)
{
    CLI::App* const command = addCommand(app, arguments, "new", "Make a project of media files", runNew);
    command->add_option("PROJECT", arguments.document, "Where it goes: .json, .xml or .bin")
        ->required()
        ->type_name("")
        ->check(checkOutputName)
        ->check(checkDocumentName);
    command->add_option("--media", arguments.files, "Video, sound or picture files, laid one after another")
        ->required()
        ->type_name("FILE");
}

void addEdit(CLI::App& app, Arguments& arguments)
{
    CLI::App* const edit = addCommand(app, arguments, "edit", "Edit the timeline of a project", runEdit);
    edit->add_option("PROJECT", arguments.document, "A document with a timeline")->required()->type_name("");
    // One folder an option: what follows it are edits.
    edit->add_option("--packages", arguments.files, "A package, or a folder of packages, to take titles from")
        ->type_name("FOLDER")
        ->expected(1)
        ->allow_extra_args(false)
        ->take_all();
    edit->add_option("EDIT", arguments.words, "One of the edits below; others follow after \"then\"")
        ->required()
        ->type_name("");
    edit->footer(Host::editCommands);
    edit->parse_complete_callback([&arguments] { arguments.readsTimelines = true; });
}

void addPicture(CLI::App& app, Arguments& arguments)
{
    CLI::App* const picture =
        addCommand(app, arguments, "picture", "Draw the timeline of a project", runPicture);
    picture->add_option("PROJECT", arguments.document, "A document with a timeline")
        ->required()
        ->type_name("");
    picture->add_option("OUT", arguments.picture, "Where the picture goes: .png or .svg")
        ->required()
        ->type_name("")
        ->check(checkOutputName);
}

void addCheck(CLI::App& app, Arguments& arguments)
{
    CLI::App* const check =
        addCommand(app, arguments, "check", "Tell what is wrong with a project", runCheck);
    check->add_option("PROJECT", arguments.document, "A project, or a document with a timeline")
        ->required()
        ->type_name("");
    check->add_flag("--json", arguments.json, "Print JSON instead of lines");
    check->footer(
        "The command ends with 0 if all is well, 1 if there are faults, 2 if the file can't be read.\n" +
        Host::faultCodesText());
    check->parse_complete_callback([&arguments] { arguments.readsTimelines = true; });
}

void addConvert(CLI::App& app, Arguments& arguments)
{
    CLI::App* const convert =
        addCommand(app, arguments, "convert", "Write a document in another form", runConvert);
    convert->add_option("IN", arguments.document, "A project or a document")->required()->type_name("");
    convert->add_option("OUT", arguments.output, "Where it goes: .json, .xml or .bin")
        ->required()
        ->type_name("")
        ->check(checkOutputName)
        ->check(checkDocumentName);
    convert->add_flag("--force", arguments.isForced, "Replace a file that is there");
    convert->add_flag("--own", arguments.isOwn,
                      "Read binary and XML archives too, which must be of your own making");
    convert->parse_complete_callback([&arguments] { arguments.readsTimelines = true; });
}

void addTrack(CLI::App& app, Arguments& arguments)
{
    CLI::App* const track =
        addCommand(app, arguments, "track", "Follow a part of the picture through a clip", runTrack);
    track->add_option("PROJECT", arguments.document, "A document with a timeline")->required()->type_name("");
    track->add_option("CLIP", arguments.name, "Its number or name")->required()->type_name("");
    track
        ->add_option("RECTANGLE", arguments.rectangle,
                     "Left, top, width and height in its first picture, as parts of the picture's size")
        ->required()
        ->type_name("")
        ->expected(4);
    track->add_option("--id", arguments.id, "What to call it in edits and other commands")->type_name("NAME");
    track->parse_complete_callback([&arguments] { arguments.readsTimelines = true; });
}

void addCompare(CLI::App& app, Arguments& arguments)
{
    CLI::App* const compare =
        addCommand(app, arguments, "compare", "Tell whether documents hold the same", runCompare);
    compare->add_option("FIRST", arguments.document, "A project or a document")->required()->type_name("");
    compare->add_option("OTHER", arguments.files, "What is compared with it")->required()->type_name("");
    compare->footer(
        "The command ends with 0 if all are the same, 1 if one differs, 2 if one can't be read.\n");
    compare->parse_complete_callback([&arguments] { arguments.readsTimelines = true; });
}

void addPackages(CLI::App& app, Arguments& arguments)
{
    CLI::App* const packages = addCommand(
        app, arguments, "packages", "Show what packages bring, and what is wrong with them", runPackages);
    packages->add_option("FOLDER", arguments.files, "Packages, or folders of packages")
        ->required()
        ->type_name("");
    // They hold pictures.
    packages->parse_complete_callback([&arguments] { arguments.readsTimelines = true; });
}

void showGraveMessages(QtMsgType type, const QMessageLogContext&, const QString& message)
{
    if (type == QtCriticalMsg || type == QtFatalMsg) {
        Host::writeError(message);
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

int main(int argc, char** argv)
{
    useUtf8();
    // A reader who ends early must not keep what is to be saved from being saved.
    std::signal(SIGPIPE, SIG_IGN);

    Arguments arguments;
    CLI::App app("Describes media files, edits and draws timelines, and draws envelopes.", "editormodel");
    app.require_subcommand(1);
    app.failure_message(usageMessage);
    addProbe(app, arguments);
    addShow(app, arguments);
    addCurve(app, arguments);
    addNew(app, arguments);
    addEdit(app, arguments);
    addPicture(app, arguments);
    addCheck(app, arguments);
    addConvert(app, arguments);
    addTrack(app, arguments);
    addCompare(app, arguments);
    addPackages(app, arguments);
    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        return refuse(app, error) == 0 ? Host::Success : Host::UsageError;
    }

    const auto application =
        makeApplication(arguments.readsTimelines || !arguments.picture.empty(), argc, argv);
    try {
        return arguments.run(arguments);
    } catch (const std::bad_alloc&) {
        Host::writeError(QStringLiteral("there is not enough memory"));
    } catch (const std::exception& error) {
        Host::writeError(QString::fromUtf8(error.what()));
    }
    return Host::Failure;
}
