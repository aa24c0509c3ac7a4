// SPDX-License-Identifier: Apache-2.0
#include "host/commands/PlayCommand.h"

#include "host/commands/Interrupt.h"
#include "host/commands/LevelLine.h"
#include "host/commands/Refusal.h"
#include "host/media/MediaInput.h"
#include "host/playback/SoundMeter.h"
#include "host/playback/SoundOutput.h"
#include "host/project/ProjectDocument.h"
#include "host/timeline/TimelineOutline.h"

#include <EditorModel/media/File.h>

#include <QDir>
#include <QFileInfo>

#include <set>

namespace Host {
namespace {

using Files = std::set<const Media::File*>;

/// The files of clips with sound that are not there. Paths that are not absolute are taken from the folder of
/// the project.
Files missingFiles(const Timeline::Object& timeline, const QString& project)
{
    const QDir folder = QFileInfo(project).absoluteDir();
    Files checked;
    Files missing;
    const TimelineOutline outline(timeline);
    for (const Timeline::Clip* clip : outline.clips()) {
        if (!clip->isAudioClip() || !clip->file || !checked.insert(clip->file).second) {
            continue;
        }
        try {
            requireFile(folder.absoluteFilePath(clip->file->path));
        } catch (const MediaError& error) {
            writeError(clip->file->path, error.reason);
            missing.insert(clip->file);
        }
    }
    return missing;
}

/// Stops a playback when the user interrupts the process.
class Stopper : private PlayerViewBase, private MarkerViewBase
{
public:
    Stopper(const Playback::Object* playback, const Interrupt& interrupt) : m_interrupt(interrupt)
    {
        playerObserve(playback);
        markerObserve(playback->position);
    }

private:
    using MarkerViewBase::markerChanged;
    void markerChanged(const Composition::Marker*) override
    {
        if (m_interrupt.isRaised()) {
            playerChange(player())->stop();
        }
    }

    const Interrupt& m_interrupt;
};

} // namespace

ExitCode play(const PlayOptions& options)
{
    return unlessRefused([&] {
        const ProjectDocument document = ProjectDocument::load(options.project);
        const Timeline::Object& timeline = document.timeline();
        if (timeline.clips.empty()) {
            throw Refusal(options.project, "has nothing to play");
        }
        const Files missing = missingFiles(timeline, options.project);

        Player player(timeline);
        const SoundOutput output(options.volume / 100.0);
        const SoundMeter meter(output.output(),
                               [&](const Timeline::Clip& clip) { return missing.count(clip.file) == 0; });
        const LevelLine line(player.player(), meter.meter(), options.step, stdout);
        const Interrupt interrupt;
        const Stopper stopper(player.player(), interrupt);
        player.play(options.step, options.pace);
        if (!line.isWritten()) {
            writeError("standard output", "cannot be written");
        }
        return missing.empty() && line.isWritten() ? Success : Failure;
    });
}

} // namespace Host
