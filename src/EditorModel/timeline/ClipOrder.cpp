// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/ClipOrder.h>

#include <EditorModel/timeline/ClipTiming.h>
#include <EditorModel/timeline/Object.h>
#include <EditorModel/timeline/Track.h>

#include <cstddef>

namespace {

std::size_t indexOf(const Timeline::Track* track)
{
    return track->timeline->trackIndex(track);
}

} // namespace

bool ClipTimingOrder::operator()(const Timeline::ClipTiming& a, const Timeline::ClipTiming& b) const
{
    const std::size_t indexOfA = indexOf(a.track);
    const std::size_t indexOfB = indexOf(b.track);
    if (indexOfA != indexOfB)
        return indexOfA < indexOfB;
    if (a.trackLevel != b.trackLevel)
        return a.trackLevel < b.trackLevel;
    return a.timestamp < b.timestamp;
}

ClipOrder::ClipOrder(const Timeline::Object* timeline_) : timeline(timeline_) {}

bool ClipOrder::operator()(const Timeline::Clip* a, const Timeline::Clip* b) const
{
    return ClipTimingOrder()(timeline->clipTiming(a), timeline->clipTiming(b));
}

bool ClipTimestampOrder::operator()(const Timeline::ClipTiming& a, const Timeline::ClipTiming& b) const
{
    return a.timestamp < b.timestamp;
}
