// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/timeline/TimelineOutline.h"

#include <EditorModel/timeline/Timeline.h>

#include <QString>

#include <deque>
#include <set>

namespace Host {

/// A timeline, and how people can find it and the clips on it.
struct CheckedTimeline
{
    TimelineOutline outline;
    /// "the timeline", "timeline 2", `the timeline of clip 3 "intro"`.
    QString name;
    /// Behind the name of a clip, where it isn't the only timeline: " in timeline 2".
    QString suffix;

    /// `clip 2 "holiday"`; "a clip" for one that isn't here.
    QString nameOf(const Timeline::Clip* clip) const;
};

/// The timelines, then those that their clips show, each once, in an order that doesn't depend on addresses.
std::deque<CheckedTimeline> checkedTimelines(const std::deque<const Timeline::Object*>& timelines);

} // namespace Host
