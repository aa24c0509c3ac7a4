// SPDX-License-Identifier: Apache-2.0
// The commands that look at documents and leave them as they are.
#include "host/commands/CheckCommand.h"
#include "host/commands/CommandTable.h"
#include "host/commands/CompareCommand.h"
#include "host/commands/ConvertCommand.h"
#include "host/commands/PictureCommand.h"
#include "host/commands/PlayCommand.h"
#include "host/commands/ShowCommand.h"
#include "host/commands/ThumbsCommand.h"
#include "host/media/MediaProbe.h"
#include "host/project/FaultList.h"
#include "host/text/TimeText.h"

#include <memory>
#include <optional>

namespace Host {
namespace {

std::string checkStep(const std::string& text)
{
    const std::optional<MTime> step = timeOfText(fileName(text));
    return step && *step > MTime() ? std::string() : "a step is a time of more than zero, as in 0.25 or 40ms";
}

} // namespace

void addShow(CommandLine& line)
{
    const auto document = std::make_shared<std::string>();
    CLI::App& command =
        line.add("show", "Show what is in a document", [document] { return show(fileName(*document)); });
    command.add_option("DOCUMENT", *document, "A document with a timeline, or one that probe has saved")
        ->required()
        ->type_name("");
    line.needPictures(command);
}

void addPicture(CommandLine& line)
{
    struct Arguments
    {
        std::string project;
        std::string picture;
    };
    const auto arguments = std::make_shared<Arguments>();
    CLI::App& command = line.add("picture", "Draw the timeline of a project", [arguments] {
        return drawTimeline(fileName(arguments->project), fileName(arguments->picture));
    });
    command.add_option("PROJECT", arguments->project, "A document with a timeline")
        ->required()
        ->type_name("");
    command.add_option("OUT", arguments->picture, "Where the picture goes: .png or .svg")
        ->required()
        ->type_name("")
        ->check(checkOutputName);
    line.needPictures(command);
}

void addCheck(CommandLine& line)
{
    struct Arguments
    {
        std::string project;
        bool json = false;
    };
    const auto arguments = std::make_shared<Arguments>();
    CLI::App& command = line.add("check", "Tell what is wrong with a project", [arguments] {
        showMediaLibraryLog(false);
        return checkProject(fileName(arguments->project), arguments->json);
    });
    command.add_option("PROJECT", arguments->project, "A project, or a document with a timeline")
        ->required()
        ->type_name("");
    command.add_flag("--json", arguments->json, "Print JSON instead of lines");
    command.footer(
        "The command ends with 0 if all is well, 1 if there are faults, 2 if the file can't be read.\n" +
        faultCodesText());
    line.needPictures(command);
}

void addConvert(CommandLine& line)
{
    struct Arguments
    {
        std::string input;
        std::string output;
        ConvertOptions options;
    };
    const auto arguments = std::make_shared<Arguments>();
    CLI::App& command = line.add("convert", "Write a document in another form", [arguments] {
        ConvertOptions options = arguments->options;
        options.input = fileName(arguments->input);
        options.output = fileName(arguments->output);
        return convert(options);
    });
    command.add_option("IN", arguments->input, "A project or a document")->required()->type_name("");
    command.add_option("OUT", arguments->output, "Where it goes: .json, .xml or .bin")
        ->required()
        ->type_name("")
        ->check(checkOutputName)
        ->check(checkDocumentName);
    command.add_flag("--force", arguments->options.isForced, "Replace a file that is there");
    command.add_flag("--own", arguments->options.isOwn,
                     "Read binary and XML archives too, which must be of your own making");
    line.needPictures(command);
}

void addCompare(CommandLine& line)
{
    struct Arguments
    {
        std::string first;
        std::vector<std::string> others;
    };
    const auto arguments = std::make_shared<Arguments>();
    CLI::App& command = line.add("compare", "Tell whether documents hold the same", [arguments] {
        return compareDocuments(fileName(arguments->first), fileNames(arguments->others));
    });
    command.add_option("FIRST", arguments->first, "A project or a document")->required()->type_name("");
    command.add_option("OTHER", arguments->others, "What is compared with it")->required()->type_name("");
    command.footer(
        "The command ends with 0 if all are the same, 1 if one differs, 2 if one can't be read.\n");
    line.needPictures(command);
}

void addThumbs(CommandLine& line)
{
    struct Arguments
    {
        std::string project;
        std::string picture;
    };
    const auto arguments = std::make_shared<Arguments>();
    CLI::App& command =
        line.add("thumbs", "Draw the timeline of a project with pictures of its media", [arguments] {
            showMediaLibraryLog(false);
            return drawThumbs(fileName(arguments->project), fileName(arguments->picture));
        });
    command.add_option("PROJECT", arguments->project, "A document with a timeline")
        ->required()
        ->type_name("");
    command
        .add_option("OUT", arguments->picture,
                    "Where the picture goes: .png or .svg; else beside the project, as NAME-thumbs.png")
        ->type_name("")
        ->check(checkOutputName);
    line.needPictures(command);
}

void addPlay(CommandLine& line)
{
    struct Arguments
    {
        std::string project;
        std::string step = "40ms";
        int volume = 100;
        bool isDry = false;
    };
    const auto arguments = std::make_shared<Arguments>();
    CLI::App& command = line.add("play", "Play the timeline of a project to a level meter", [arguments] {
        showMediaLibraryLog(false);
        PlayOptions options;
        options.project = fileName(arguments->project);
        options.step = *timeOfText(fileName(arguments->step));
        options.volume = arguments->volume;
        options.pace = arguments->isDry ? Player::Dry : Player::RealTime;
        return play(options);
    });
    command.add_option("PROJECT", arguments->project, "A document with a timeline")
        ->required()
        ->type_name("");
    command.add_option("--step", arguments->step, "The time from one level to the next")
        ->type_name("TIME")
        ->check(CLI::Validator(checkStep, ""))
        ->capture_default_str();
    command.add_option("--volume", arguments->volume, "Of the output, in percent")
        ->type_name("PERCENT")
        ->check(CLI::Range(0, 1000).description(""))
        ->capture_default_str();
    command.add_flag("--dry", arguments->isDry, "Don't wait from one step to the next");
    command.footer(
        "Nothing is decoded: each sound is taken to be at full scale, so that the levels are those "
        "which volumes, envelopes and fades make of it.\n");
    line.needPictures(command);
}

} // namespace Host
