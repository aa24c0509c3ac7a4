// SPDX-License-Identifier: Apache-2.0
// The commands that make projects and change them.
#include "host/commands/CommandTable.h"
#include "host/commands/EditCommand.h"
#include "host/commands/NewCommand.h"
#include "host/commands/TrackCommand.h"
#include "host/media/MediaProbe.h"

#include <memory>

namespace Host {
namespace {

struct TrackArguments
{
    std::string project;
    std::string clip;
    std::vector<double> rectangle;
    std::string id;
};

ExitCode runTrack(const TrackArguments& arguments)
{
    showMediaLibraryLog(false);
    const std::vector<double>& r = arguments.rectangle;
    return trackClip({fileName(arguments.project), fileName(arguments.clip), QRectF(r[0], r[1], r[2], r[3]),
                      fileName(arguments.id)});
}

} // namespace

void addNew(CommandLine& line)
{
    struct Arguments
    {
        std::string project;
        std::vector<std::string> media;
    };
    const auto arguments = std::make_shared<Arguments>();
    CLI::App& command = line.add("new", "Make a project of media files", [arguments] {
        showMediaLibraryLog(false);
        return newProject(fileName(arguments->project), fileNames(arguments->media));
    });
    command.add_option("PROJECT", arguments->project, "Where it goes: .json, .xml or .bin")
        ->required()
        ->type_name("")
        ->check(checkOutputName)
        ->check(checkDocumentName);
    command.add_option("--media", arguments->media, "Video, sound or picture files, laid one after another")
        ->required()
        ->type_name("FILE");
}

void addEdit(CommandLine& line)
{
    struct Arguments
    {
        std::string project;
        std::vector<std::string> words;
        std::vector<std::string> packages;
    };
    const auto arguments = std::make_shared<Arguments>();
    CLI::App& command = line.add("edit", "Edit the timeline of a project", [arguments] {
        showMediaLibraryLog(false);
        return editProject(fileName(arguments->project), fileNames(arguments->words),
                           fileNames(arguments->packages));
    });
    command.add_option("PROJECT", arguments->project, "A document with a timeline")
        ->required()
        ->type_name("");
    // One folder an option: what follows it are edits.
    command
        .add_option("--packages", arguments->packages,
                    "A package, or a folder of packages, to take titles from")
        ->type_name("FOLDER")
        ->expected(1)
        ->allow_extra_args(false)
        ->take_all();
    command.add_option("EDIT", arguments->words, "One of the edits below; others follow after \"then\"")
        ->required()
        ->type_name("");
    command.footer(editCommands);
    line.needPictures(command);
}

void addTrack(CommandLine& line)
{
    const auto arguments = std::make_shared<TrackArguments>();
    CLI::App& command = line.add("track", "Follow a part of the picture through a clip",
                                 [arguments] { return runTrack(*arguments); });
    command.add_option("PROJECT", arguments->project, "A document with a timeline")
        ->required()
        ->type_name("");
    command.add_option("CLIP", arguments->clip, "Its number or name")->required()->type_name("");
    command
        .add_option("RECTANGLE", arguments->rectangle,
                    "Left, top, width and height in its first picture, as parts of the picture's size")
        ->required()
        ->type_name("")
        ->expected(4);
    command.add_option("--id", arguments->id, "What to call it in edits and other commands")
        ->type_name("NAME");
    line.needPictures(command);
}

} // namespace Host
