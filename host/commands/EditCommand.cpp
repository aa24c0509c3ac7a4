// SPDX-License-Identifier: Apache-2.0
#include "host/commands/EditCommand.h"

#include "host/commands/Refusal.h"
#include "host/editing/EditScript.h"
#include "host/packages/PackageShelf.h"
#include "host/project/ProjectDocument.h"
#include "host/project/ProjectModules.h"

#include <QFileInfo>

namespace Host {
namespace {

/// A separator stands between commands, so that one without a command before or behind it is an empty
/// command.
QList<QStringList> commandsOf(const QStringList& words)
{
    QList<QStringList> commands = {QStringList()};
    for (const QString& word : words) {
        if (word == "then" || word == ",") {
            commands << QStringList();
        } else {
            commands.last() << word;
        }
    }
    return commands;
}

void fill(PackageShelf& shelf, const QStringList& folders)
{
    for (const QString& folder : folders) {
        // What is no folder is a fault of its own.
        if (shelf.put(folder) == 0 && QFileInfo(folder).isDir()) {
            throw Refusal(folder, "holds no package");
        }
    }
    const std::deque<PackageFault> faults = shelf.faults();
    if (!faults.empty()) {
        const PackageFault& first = faults.front();
        throw Refusal(first.file.isEmpty() ? first.package : first.package + ": " + first.file, first.reason);
    }
}

/// A plain document is a project that has but a timeline.
Project::Content contentOf(const ProjectDocument& document)
{
    Project::Content content = document.project() ? *document.project() : Project::Content();
    content.timeline = &document.timeline();
    return content;
}

} // namespace

const char* const editCommands =
    R"(Edits, of which several are separated by "then" and stored together:
  add FILE [TIME]                       at the end, or where later clips make room
  overwrite FILE TIME [TRACK [LEVEL]]   what lies under it is trimmed, split or removed
  title TEXT TIME [LENGTH [TRACK]]      above what lies there; TEXT may be a document with a preset, or the
                                        identifier of one in a package, and =TEXT behind it
  move CLIP TIME [TRACK [LEVEL]]
  trim-left CLIP TIME [ripple]          the clip starts at the time
  trim-right CLIP TIME [ripple]         the clip ends at the time
  split CLIP TIME
  speed CLIP FACTOR [ripple]            1 plays the source as it is
  reverse CLIP
  fade-in CLIP LENGTH, fade-out CLIP LENGTH
  enable CLIP, disable CLIP             a video with its sound
  volume CLIP PERCENT                   100 is that of the source; of a video, its sound
  transition add CLIP CLIP [LENGTH [NAME]]   - for either makes it one-sided; NAME may be in a package
  transition remove TRANSITION
  track add ROLE                        primary, extra-video, native-audio, audio, title or quiz
  track move TRACK TRACK, track remove TRACK
  link MASTER SLAVE, unlink SLAVE
  follow CLIP CLIP TRACKING [X Y]       what a tracking has found in the other, at an offset from it
  unfollow CLIP
  delete CLIP, extract CLIP             leaving a gap or closing it
CLIP is a number or a name, TRACK and TRANSITION are numbers, as show prints them before the first edit; what
an edit makes is numbered on from there. Times are times of the timeline: 1:02:03.5, 62.5 (seconds) or 62500ms.
With ripple the clips behind follow.
)";

ExitCode editProject(const QString& path, const QStringList& words, const QStringList& packages)
{
    return unlessRefused([&] {
        PackageShelf shelf;
        fill(shelf, packages);
        ProjectDocument document = ProjectDocument::load(path);
        ProjectModules modules(contentOf(document));
        EditScript script(modules.session(), modules.clips(), modules.media(), modules.places(), &shelf);
        for (const QStringList& command : commandsOf(words)) {
            script.run(command);
        }
        document.save();
        return Success;
    });
}

} // namespace Host
