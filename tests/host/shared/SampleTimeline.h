// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/effects/Transition.h>
#include <EditorModel/media/File.h>
#include <EditorModel/timeline/Timeline.h>

#include <deque>

namespace HostTests {

/// A timeline with all that it points at.
class SampleTimeline
{
public:
    SampleTimeline() = default;
    SampleTimeline(const SampleTimeline&) = delete;

    Timeline::Track* addTrack(TrackType type)
    {
        tracks.emplace_back(type);
        tracks.back().setTimeline(&timeline);
        timeline.addTrack(&tracks.back());
        return &tracks.back();
    }

    /// From the start of a source that is as long as the clip.
    Timeline::Clip* addClip(const QString& name, Timeline::Clip::ClipType type, const Timeline::Track* track,
                            MTime start, MTime length, int level = 0)
    {
        clips.emplace_back();
        clips.back().setTimeline(&timeline)->setType(type)->setName(name)->setSourceDuration(length);
        timeline.addClip(&clips.back(), Timeline::ClipTiming(track, level, start, length, 0, length));
        return &clips.back();
    }

    /// A longer source: so much of it lies before the clip, and so much behind.
    void trim(const Timeline::Clip* clip, MTime before, MTime behind)
    {
        Timeline::ClipTiming& timing = timeline.clips.at(clip);
        timing.setSourcePosition(before).setSourceDuration(before + timing.duration + behind);
        const_cast<Timeline::Clip*>(clip)->setSourceDuration(timing.sourceDuration);
    }

    Transition::Object* addTransition(const QString& tag, const Timeline::Clip* from,
                                      const Timeline::Clip* to, MTime length)
    {
        transitions.emplace_back();
        transitions.back().tag = tag;
        timeline.addTransition(&transitions.back(), {from, to}, length);
        return &transitions.back();
    }

    Timeline::Object timeline;
    std::deque<Timeline::Track> tracks;
    std::deque<Timeline::Clip> clips;
    std::deque<Transition::Object> transitions;
};

} // namespace HostTests
