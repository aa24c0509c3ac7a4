// SPDX-License-Identifier: Apache-2.0
// The commands that look at what projects are made of.
#include "host/commands/CommandTable.h"
#include "host/commands/CurveCommand.h"
#include "host/commands/PackagesCommand.h"
#include "host/commands/ProbeCommand.h"
#include "host/media/MediaProbe.h"

#include <map>
#include <memory>

namespace Host {
namespace {

struct ProbeArguments
{
    std::vector<std::string> files;
    std::string document;
    bool json = false;
    bool verbose = false;
};

ExitCode runProbe(const ProbeArguments& arguments)
{
    showMediaLibraryLog(arguments.verbose);
    ProbeOptions options;
    options.paths = fileNames(arguments.files);
    options.savePath = fileName(arguments.document);
    options.json = arguments.json;
    return probe(options);
}

struct CurveArguments
{
    std::string document;
    std::string picture;
    qint64 length = 10000;
    qint64 fadeIn = 0;
    qint64 fadeOut = 0;
    CurveOptions options;
};

ExitCode runCurve(const CurveArguments& arguments)
{
    CurveOptions options = arguments.options;
    options.document = fileName(arguments.document);
    options.picturePath = fileName(arguments.picture);
    options.span = {arguments.length, arguments.fadeIn, arguments.fadeOut};
    return curve(options);
}

} // namespace

void addProbe(CommandLine& line)
{
    const auto arguments = std::make_shared<ProbeArguments>();
    CLI::App& command =
        line.add("probe", "Describe media files", [arguments] { return runProbe(*arguments); });
    command.add_option("FILE", arguments->files, "Video, sound or picture files")->required()->type_name("");
    command
        .add_option("--save", arguments->document,
                    "Save the descriptions and the resources as a document: .json, .xml or .bin")
        ->type_name("PATH")
        ->check(checkOutputName)
        ->check(checkDocumentName);
    command.add_flag("--json", arguments->json, "Print JSON instead of a table");
    command.add_flag("--verbose", arguments->verbose, "Let FFmpeg's libraries tell what they do");
}

void addCurve(CommandLine& line)
{
    const std::map<std::string, CurveSample> samples = {{"volume", VolumeSample},
                                                        {"transformation", TransformationSample}};
    // Up to 99:59:59.999, which is what a label has room for.
    constexpr qint64 longest = 359999999;
    const CLI::Validator milliseconds = CLI::Range(qint64(0), longest).description("");

    const auto arguments = std::make_shared<CurveArguments>();
    CLI::App& command =
        line.add("curve", "Show how an envelope goes", [arguments] { return runCurve(*arguments); });
    command
        .add_option("DOCUMENT", arguments->document, "A document with a volume or transformation envelope")
        ->required()
        ->type_name("")
        ->check(checkOutputName);
    command.add_option("-o,--output", arguments->picture, "Draw it as a picture too: .png or .svg")
        ->type_name("PATH")
        ->check(checkOutputName);
    command.add_option("--length", arguments->length, "How long the envelope is played, in milliseconds")
        ->type_name("MS")
        ->check(CLI::Range(qint64(1), longest).description(""))
        ->capture_default_str();
    command.add_option("--fade-in", arguments->fadeIn, "The length of a fade-in of the volume")
        ->type_name("MS")
        ->check(milliseconds);
    command.add_option("--fade-out", arguments->fadeOut, "The length of a fade-out of the volume")
        ->type_name("MS")
        ->check(milliseconds);
    command.add_option("--steps", arguments->options.steps, "How many steps the table has")
        ->type_name("N")
        ->check(CLI::Range(1, 10000).description(""))
        ->capture_default_str();
    command
        .add_option("--sample", arguments->options.sample,
                    "Make the document first, with an envelope to look at: volume or transformation")
        ->type_name("KIND")
        ->transform(CLI::CheckedTransformer(samples, CLI::ignore_case).description(""));
    command.add_flag("--own", arguments->options.isOwn,
                     "Read binary and XML archives too, which must be of your own making");
    line.needPictures(command, [arguments] { return !arguments->picture.empty(); });
}

void addPackages(CommandLine& line)
{
    const auto folders = std::make_shared<std::vector<std::string>>();
    CLI::App& command = line.add("packages", "Show what packages bring, and what is wrong with them",
                                 [folders] { return showPackages(fileNames(*folders)); });
    command.add_option("FOLDER", *folders, "Packages, or folders of packages")->required()->type_name("");
    line.needPictures(command);
}

} // namespace Host
