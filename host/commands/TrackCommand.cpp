// SPDX-License-Identifier: Apache-2.0
#include "host/commands/TrackCommand.h"

#include "host/analysis/BlockTracker.h"
#include "host/analysis/TrackingStore.h"
#include "host/commands/Refusal.h"
#include "host/editing/EditWords.h"
#include "host/media/MediaInput.h"
#include "host/project/ProjectDocument.h"
#include "host/text/DisplayText.h"
#include "host/text/TimeText.h"
#include "host/timeline/TimelineOutline.h"

#include <EditorModel/analysis/MotionTracking.h>
#include <EditorModel/media/File.h>
#include <EditorModel/types/UniqueId.h>

#include <fmt/format.h>

namespace Host {
namespace {

const Timeline::Clip& clipToTrack(const Timeline::Object& timeline, const QString& word)
{
    try {
        return *clipOf(timeline, TimelineOutline(timeline).clips(), word);
    } catch (const Refusal& refusal) {
        throw Refusal("track", refusal.reason);
    }
}

MotionTracking::Data trackingOf(const Timeline::Clip& clip, const Timeline::ClipTiming& timing,
                                const TrackOptions& options)
{
    const QString about = nameOf(clip);
    if (!clip.file || clip.file->path.isEmpty()) {
        throw Refusal(about, "plays no file");
    }
    const SourceStretch stretch = sourceStretchOf(clip, timing);
    MotionTracking::AnalyzeTask task;
    task.setInitialFrame(options.rectangle)
        .setInitialPosition(stretch.from)
        .setAnalyzingRange({stretch.from, stretch.to});
    const QString id = options.id.isEmpty() ? Types::nextUniqueId() : options.id;
    try {
        return followRectangle(id, clip.file->path, clip.mediaTrack, task);
    } catch (const MediaError& error) {
        throw Refusal(about, error.reason);
    }
}

std::string textOf(const MotionTracking::Data& tracking)
{
    const auto& [last, frame] = *tracking.frames.rbegin();
    return fmt::format("{}: {} places from {} to {}\n", printable(tracking.id), tracking.frames.size(),
                       spanText(tracking.frames.begin()->first), spanText(last + frame.duration));
}

} // namespace

ExitCode trackClip(const TrackOptions& options)
{
    return unlessRefused([&] {
        TrackingStore store;
        ProjectDocument document = ProjectDocument::load(options.project);
        const Timeline::Object& timeline = document.timeline();
        const Timeline::Clip& clip = clipToTrack(timeline, options.clip);
        const MotionTracking::Data tracking = trackingOf(clip, timeline.clipTiming(&clip), options);
        if (!document.project()) {
            store.load(TrackingStore::folderOf(options.project));
        }
        store.put(tracking);
        document.writable(clip).addMotionTracking(tracking.id);
        document.save();
        if (!document.project()) {
            store.save(TrackingStore::folderOf(options.project));
        }
        return writeOutput(textOf(tracking)) ? Success : Failure;
    });
}

} // namespace Host
