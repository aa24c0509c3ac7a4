// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/timeline/Timeline.h>

#include <QString>

#include <limits>
#include <vector>

namespace Host {

/// Where a timeline must end at the latest: archives keep times in 32 bits.
constexpr MTime LATEST_TIME = std::numeric_limits<qint32>::max();

/// Something in a timeline that no edit leaves behind.
struct TimelineFault
{
    enum Kind
    {
        NoClip,              ///< null is listed as a clip
        NoTrack,             ///< a clip lies on a track that is not listed, or on none
        TimeOutOfRange,      ///< a time is negative or beyond LATEST_TIME
        NoDuration,          ///< a clip's duration is not positive
        OutsideSource,       ///< a clip of limited duration shows more than its source, and not by rounding
        TooLongAtEnds,       ///< the transitions, or the fades, of a clip are longer than the clip
        Overlap,             ///< a clip starts before another one on its track and level ends
        TrackListedTwice,    ///< or null is listed as a track
        ForeignTrack,        ///< a listed track does not name this timeline as its own
        ShowsItself,         ///< a clip's nested timeline shows itself, if only by way of others
        DanglingLink,        ///< a link names a clip that is not on the timeline
        LinkCycle,           ///< a clip depends on itself
        DanglingTracking,    ///< a tracking link names a clip that is not on the timeline
        DanglingTransition,  ///< a transition names a clip that is not on the timeline
        TransitionOnNothing, ///< a transition's pair is of nulls or of one clip, or the transition is null
        TransitionApart,     ///< a transition's clips don't meet on one track and level
        CrowdedTransition,   ///< a second transition leaves, or enters, a clip
        WrongShare,          ///< a clip's transition field is not the share of its transition, or not 0
    };

    Kind kind;
    /// The clip that it is about; null where it is about none.
    const Timeline::Clip* clip = nullptr;
    /// One sentence for people, with its full stop.
    QString text;
};

/// How far a clip shows more than there is in its source, at the end where that is more; 0 for a clip of
/// unlimited duration. The times must be in range.
MTime beyondSource(const Timeline::Clip* clip, const Timeline::ClipTiming& timing);

/// By so much may a clip lie beyond its source: a change of speed rounds the start, the length and the source
/// each by itself.
constexpr MTime SOURCE_ROUNDING = 1;

/// All faults, in the order of their kinds, and of one kind by the track, the level and the start of the
/// clip; empty for a sound timeline. Nothing but clips and tracks that are listed, and nested timelines, is
/// looked into, and no time is too wild to be looked at. What cannot be told because of a fault of an earlier
/// kind is left out: a clip without a duration overlaps nothing.
std::vector<TimelineFault> timelineFaults(const Timeline::Object& timeline);
/// Those that the timeline would have with another value.
std::vector<TimelineFault> timelineFaults(const Timeline::Object& timeline, const Timeline::Object& value);

} // namespace Host
