// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>

namespace Timeline {
struct Clip;
struct ClipTiming;
struct Object;
} // namespace Timeline

// Strict weak orders for sorts and sorted containers.

/// By the index of the track, then by its level, then by the start; what agrees in all three is equivalent.
/// Each track is looked up in its own timeline, Track::timeline. Track and timeline must not be null.
struct EDITORMODEL_EXPORT ClipTimingOrder
{
    bool operator()(const Timeline::ClipTiming& a, const Timeline::ClipTiming& b) const;
};

/// Clips as ClipTimingOrder has their timings in one timeline. Throws
/// `std::out_of_range("invalid map<K, T> key")` for a clip that is not on it.
struct EDITORMODEL_EXPORT ClipOrder
{
    /// Not owned.
    const Timeline::Object* timeline;

    explicit ClipOrder(const Timeline::Object* timeline_);

    bool operator()(const Timeline::Clip* a, const Timeline::Clip* b) const;
};

/// By the start alone.
struct EDITORMODEL_EXPORT ClipTimestampOrder
{
    bool operator()(const Timeline::ClipTiming& a, const Timeline::ClipTiming& b) const;
};
