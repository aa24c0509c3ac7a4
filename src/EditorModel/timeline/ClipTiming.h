// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/media/TimingMode.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/MTime.h>

namespace Timeline {

struct Clip;
struct Track;

/// When and how a clip plays on a timeline. The timeline holds one for each of its clips.
///
/// All times but those of the two mappings are in the time of the timeline: the source is measured at the
/// clip's present speed, so that its native length divided by `sourceDuration` is the speed. Nothing is
/// checked.
struct EDITORMODEL_EXPORT ClipTiming : public virtual Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(ClipTiming)

public:
    /// Not owned.
    const Timeline::Track* track = nullptr;
    /// Tells apart the clips that lie on a track of several levels at one time.
    int trackLevel = 0;
    /// Where the clip starts on the timeline.
    MTime timestamp;
    MTime duration;
    /// Where the shown stretch starts, from the start of the source.
    MTime sourcePosition;
    /// The length of the whole source.
    MTime sourceDuration;
    /// Of no consequence here.
    bool speedCompensated = false;
    /// How far a transition reaches into the clip from its start; 0 for none.
    MTime transitionIn;
    /// How far a transition reaches into the clip from its end; 0 for none.
    MTime transitionOut;
    MTime fadeInDuration;
    MTime fadeOutDuration;
    /// The source plays backwards. Changed by reverse(), which also moves the stretch.
    bool reversed = false;
    /// Of no consequence here.
    Media::TimingMode timingMode = Media::DefaultTimingMode;

    ClipTiming() = default;
    ClipTiming(const Timeline::Track* track_, int trackLevel_, MTime timestamp_, MTime duration_,
               MTime sourcePosition_, MTime sourceDuration_);
    ClipTiming(const ClipTiming&) = default;
    ClipTiming(ClipTiming&&) = default;
    ClipTiming& operator=(const ClipTiming&) = default;
    ClipTiming& operator=(ClipTiming&&) = default;
    ~ClipTiming() override;

    ClipTiming& setTrack(const Timeline::Track* newTrack);
    ClipTiming& setTrackLevel(int level);
    ClipTiming& setTimestamp(MTime time);
    ClipTiming& setDuration(MTime newDuration);
    ClipTiming& setSourcePosition(MTime position);
    ClipTiming& setSourceDuration(MTime newDuration);
    ClipTiming& setSpeedCompensated(bool on);
    ClipTiming& setTransitionIn(MTime length);
    ClipTiming& setTransitionOut(MTime length);
    ClipTiming& setFadeInDuration(MTime length);
    ClipTiming& setFadeOutDuration(MTime length);
    ClipTiming& setTimingMode(Media::TimingMode mode);

    /// `timestamp` + `duration`.
    MTime end() const;
    /// `sourcePosition` + `duration`.
    MTime sourceEnd() const;
    /// Closed at both ends: [timestamp, end()].
    bool contains(MTime time) const;
    /// On any track and level; timings that only touch do not overlap.
    bool overlapsWith(const ClipTiming& other) const;
    /// `next` starts just where this one ends, on the same track and level.
    bool placedSequentially(const ClipTiming& next) const;
    /// Equal but for track, level and `speedCompensated`, which may be any.
    bool isSameTime(const ClipTiming& other) const;

    /// Moves the left edge to the right by `delta`, which may be negative; the picture under the rest of the
    /// clip stays where it is.
    ClipTiming& resizeLeft(MTime delta);
    /// Moves the right edge to the right by `delta`, which may be negative.
    ClipTiming& resizeRight(MTime delta);
    /// Mirrors the shown stretch within the source and turns its direction round; the place on the timeline
    /// stays.
    ClipTiming& reverse();
    /// Multiplies the present speed. Duration, stretch and source shrink by `factor`, each rounded by itself;
    /// start, transitions and fades stay. What a factor of 0 makes of them is told at MTime::divRound().
    ClipTiming& speedUp(double factor);

    /// The position in the source, in its native time, at a time of the timeline. Not clamped: a time outside
    /// the clip gives a position outside the stretch. `nativeDuration` is the length of the whole source.
    /// Neither it nor `sourceDuration` is to be 0: the result means nothing then.
    MTime mapToSource(MTime time, MTime nativeDuration) const;
    /// The same by `clip->sourceDuration`; nothing else of the clip counts.
    MTime mapToSource(MTime time, const Timeline::Clip* clip) const;
    /// The time of the timeline at which a position in the source, in its native time, is shown: the inverse
    /// of mapToSource(), but for rounding. Not clamped; the clip's `sourceDuration` is not to be 0.
    MTime mapToTimeline(MTime sourceTime, const Timeline::Clip* clip) const;
};

/// All fields are compared.
EDITORMODEL_EXPORT bool operator==(const ClipTiming& a, const ClipTiming& b);
EDITORMODEL_EXPORT bool operator!=(const ClipTiming& a, const ClipTiming& b);
/// By `timestamp` alone.
EDITORMODEL_EXPORT bool operator<(const ClipTiming& a, const ClipTiming& b);

} // namespace Timeline

EDITORMODEL_ARCHIVE_NAME(Timeline::ClipTiming, "Timeline::ClipTiming")
