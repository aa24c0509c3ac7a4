// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/analysis/MotionTracking.h>

#include <map>
#include <ostream>
#include <vector>

namespace MotionTracking {

inline void PrintTo(const Frame& frame, std::ostream* out)
{
    *out << "(" << frame.left << ", " << frame.top << ", " << frame.width << ", " << frame.height << ")";
}

} // namespace MotionTracking

namespace TrackingTests {

struct Entry
{
    int start;
    int duration;
    MotionTracking::Frame frame;
};

inline MotionTracking::Data trackingOf(const std::vector<Entry>& entries)
{
    MotionTracking::Data data(QStringLiteral("tracking"));
    for (const Entry& entry : entries) {
        MotionTracking::TimedFrame& frame = data.frames[MTime(entry.start)];
        static_cast<MotionTracking::Frame&>(frame) = entry.frame;
        frame.duration = entry.duration;
    }
    return data;
}

/// The durations of entries by their starts.
using Spans = std::map<int, int>;

inline Spans spansOf(const MotionTracking::Data& data)
{
    Spans spans;
    for (const auto& [start, frame] : data.frames)
        spans[int(start.ms())] = int(frame.duration.ms());
    return spans;
}

} // namespace TrackingTests
