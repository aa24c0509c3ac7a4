// SPDX-License-Identifier: Apache-2.0
#include "host/commands/EditCommand.h"

#include "host/commands/Refusal.h"
#include "host/editing/EditScript.h"
#include "host/media/MediaOpener.h"
#include "host/project/ProjectDocument.h"

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

} // namespace

const char* const editCommands =
    R"(Edits, of which several are separated by "then" and stored together:
  add FILE [TIME]                       at the end, or where later clips make room
  overwrite FILE TIME [TRACK [LEVEL]]   what lies under it is trimmed, split or removed
  title TEXT TIME [LENGTH [TRACK]]      above what lies there; TEXT may be a document with a preset
  move CLIP TIME [TRACK [LEVEL]]
  trim-left CLIP TIME [ripple]          the clip starts at the time
  trim-right CLIP TIME [ripple]         the clip ends at the time
  split CLIP TIME
  speed CLIP FACTOR [ripple]            1 plays the source as it is
  reverse CLIP
  fade-in CLIP LENGTH, fade-out CLIP LENGTH
  transition add CLIP CLIP [LENGTH [NAME]]   - for either makes it one-sided
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

ExitCode editProject(const QString& path, const QStringList& words)
{
    return unlessRefused([&] {
        const ProjectDocument document = ProjectDocument::load(path);
        const MediaOpener opener;
        EditSession session(&document.timeline());
        EditScript script(session);
        for (const QStringList& command : commandsOf(words)) {
            script.run(command);
        }
        document.save(path);
        return Success;
    });
}

} // namespace Host
