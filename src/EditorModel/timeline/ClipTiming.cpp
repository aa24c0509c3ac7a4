// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/ClipTiming.h>

#include <EditorModel/persistence/Fields.h>
#include <EditorModel/timeline/Clip.h>
#include <EditorModel/timeline/Track.h>

namespace Timeline {
namespace {

double count(MTime time)
{
    return static_cast<double>(time.ms());
}

} // namespace

ClipTiming::ClipTiming(const Timeline::Track* track_, int trackLevel_, MTime timestamp_, MTime duration_,
                       MTime sourcePosition_, MTime sourceDuration_)
    : track(track_),
      trackLevel(trackLevel_),
      timestamp(timestamp_),
      duration(duration_),
      sourcePosition(sourcePosition_),
      sourceDuration(sourceDuration_)
{}

ClipTiming::~ClipTiming() = default;

ClipTiming& ClipTiming::setTrack(const Timeline::Track* newTrack)
{
    track = newTrack;
    return *this;
}

ClipTiming& ClipTiming::setTrackLevel(int level)
{
    trackLevel = level;
    return *this;
}

ClipTiming& ClipTiming::setTimestamp(MTime time)
{
    timestamp = time;
    return *this;
}

ClipTiming& ClipTiming::setDuration(MTime newDuration)
{
    duration = newDuration;
    return *this;
}

ClipTiming& ClipTiming::setSourcePosition(MTime position)
{
    sourcePosition = position;
    return *this;
}

ClipTiming& ClipTiming::setSourceDuration(MTime newDuration)
{
    sourceDuration = newDuration;
    return *this;
}

ClipTiming& ClipTiming::setSpeedCompensated(bool on)
{
    speedCompensated = on;
    return *this;
}

ClipTiming& ClipTiming::setTransitionIn(MTime length)
{
    transitionIn = length;
    return *this;
}

ClipTiming& ClipTiming::setTransitionOut(MTime length)
{
    transitionOut = length;
    return *this;
}

ClipTiming& ClipTiming::setFadeInDuration(MTime length)
{
    fadeInDuration = length;
    return *this;
}

ClipTiming& ClipTiming::setFadeOutDuration(MTime length)
{
    fadeOutDuration = length;
    return *this;
}

ClipTiming& ClipTiming::setTimingMode(Media::TimingMode mode)
{
    timingMode = mode;
    return *this;
}

MTime ClipTiming::end() const
{
    return timestamp + duration;
}

MTime ClipTiming::sourceEnd() const
{
    return sourcePosition + duration;
}

bool ClipTiming::contains(MTime time) const
{
    return timestamp <= time && time <= end();
}

bool ClipTiming::overlapsWith(const ClipTiming& other) const
{
    return other.timestamp < end() && other.end() > timestamp;
}

bool ClipTiming::placedSequentially(const ClipTiming& next) const
{
    return end() == next.timestamp && track == next.track && trackLevel == next.trackLevel;
}

bool ClipTiming::isSameTime(const ClipTiming& other) const
{
    return timestamp == other.timestamp && sourceDuration == other.sourceDuration &&
           sourcePosition == other.sourcePosition && duration == other.duration &&
           transitionIn == other.transitionIn && transitionOut == other.transitionOut &&
           fadeInDuration == other.fadeInDuration && fadeOutDuration == other.fadeOutDuration &&
           reversed == other.reversed && timingMode == other.timingMode;
}

ClipTiming& ClipTiming::resizeLeft(MTime delta)
{
    timestamp += delta;
    sourcePosition += delta;
    duration -= delta;
    return *this;
}

ClipTiming& ClipTiming::resizeRight(MTime delta)
{
    duration += delta;
    return *this;
}

ClipTiming& ClipTiming::reverse()
{
    sourcePosition = sourceDuration - duration - sourcePosition;
    reversed = !reversed;
    return *this;
}

ClipTiming& ClipTiming::speedUp(double factor)
{
    sourceDuration = sourceDuration.divRound(factor);
    sourcePosition = sourcePosition.divRound(factor);
    duration = duration.divRound(factor);
    return *this;
}

MTime ClipTiming::mapToSource(MTime time, MTime nativeDuration) const
{
    const MTime scaled = sourcePosition - timestamp + time;
    const double scale = count(sourceDuration) / count(nativeDuration);
    const MTime position = scaled.divRound(scale);
    return reversed ? nativeDuration - position : position;
}

MTime ClipTiming::mapToSource(MTime time, const Timeline::Clip* clip) const
{
    return mapToSource(time, clip->sourceDuration);
}

MTime ClipTiming::mapToTimeline(MTime sourceTime, const Timeline::Clip* clip) const
{
    const MTime native = clip->sourceDuration;
    const MTime position = reversed ? native - sourceTime : sourceTime;
    const double scale = count(sourceDuration) / count(native);
    return timestamp + MTime::fromMsRound(count(position) * scale - count(sourcePosition));
}

bool operator==(const ClipTiming& a, const ClipTiming& b)
{
    return a.track == b.track && a.trackLevel == b.trackLevel && a.speedCompensated == b.speedCompensated &&
           a.isSameTime(b);
}

bool operator!=(const ClipTiming& a, const ClipTiming& b)
{
    return !(a == b);
}

bool operator<(const ClipTiming& a, const ClipTiming& b)
{
    return a.timestamp < b.timestamp;
}

void fields(Serialize::Fields& f, ClipTiming& timing)
{
    f("track", timing.track)("trackLevel", timing.trackLevel)("timestamp", timing.timestamp);
    f("sourceDuration", timing.sourceDuration)("sourcePosition", timing.sourcePosition);
    f("duration", timing.duration)("speedCompensated", timing.speedCompensated);
    f("transitionIn", timing.transitionIn)("transitionOut", timing.transitionOut);
    // Two keys are misspelt, and documents have them so.
    f("fadeInDuraion", timing.fadeInDuration)("fadeOutDuraion", timing.fadeOutDuration);
    f("reversed", timing.reversed)("timingMode", timing.timingMode);
}

} // namespace Timeline

EDITORMODEL_PERSISTENT_CLASS(Timeline::ClipTiming)
