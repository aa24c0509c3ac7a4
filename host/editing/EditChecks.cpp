// SPDX-License-Identifier: Apache-2.0
#include "host/editing/EditChecks.h"

#include "host/editing/EditText.h"
#include "host/editing/NestedTimelines.h"
#include "host/editing/TimelineInvariants.h"

namespace Host {
namespace {

using Timeline::Clip;
using Timeline::ClipTiming;

bool takesSound(TrackType type)
{
    return type == AudioTrack || type == NativeAudioTrack;
}

bool hasRole(TrackType type)
{
    return takesSound(type) || type == PrimaryTrack || type == ExtraVideoTrack || type == TitleTrack ||
           type == QuizTrack;
}

bool accepts(TrackType type, const Clip* clip)
{
    const bool isSeen = clip->isVideoClip() || clip->isOverlayClip();
    if (!hasRole(type) || (!isSeen && !clip->isAudioClip())) {
        return true;
    }
    return takesSound(type) != isSeen;
}

QString at(MTime time)
{
    return " at " + timeText(time);
}

/// Whoever places it would wait for its end in vain.
void checkNesting(const EditDraft& draft, const Clip* clip)
{
    if (!clip->nestedTimeline) {
        return;
    }
    std::vector<const Clip*> nesting = nestingClips(draft.timeline());
    nesting.push_back(clip);
    if (!endlessClips(draft.edited(), nesting).empty()) {
        throw EditRefused{
            "The " + clipText(clip) +
            " can't be placed: the timeline that it shows would show itself, directly or by way "
            "of others."};
    }
}

void checkNew(const EditDraft& draft, const Clip* clip)
{
    const Timeline::Object& timeline = draft.timeline();
    if (!clip) {
        throw EditRefused{"There is no clip to place."};
    }
    if (timeline.contains(clip)) {
        throw EditRefused{"The " + clipText(clip) + " is on the timeline already" +
                          at(timeline.clipTiming(clip).timestamp) + "."};
    }
    if (clip->timeline && clip->timeline != &draft.edited()) {
        throw EditRefused{"The " + clipText(clip) + " belongs to another timeline."};
    }
    checkTime(clip->sourceDuration);
    checkNesting(draft, clip);
}

void checkNativeAudio(const EditDraft& draft, const Placement& what)
{
    const Timeline::Object& timeline = draft.timeline();
    checkNew(draft, what.nativeAudio);
    if (what.nativeAudio == what.clip) {
        throw EditRefused{"The " + clipText(what.clip) + " can't be its own native audio."};
    }
    if (!timeline.nativeAudioTrack()) {
        throw EditRefused{"There is no native audio track for the " + clipText(what.nativeAudio) + "."};
    }
    if (!accepts(NativeAudioTrack, what.nativeAudio)) {
        throw EditRefused{"The " + clipText(what.nativeAudio) + " is not sound and can't be native audio."};
    }
}

} // namespace

void checkTime(MTime time)
{
    if (time < -LATEST_TIME || time > LATEST_TIME) {
        throw EditRefused{"The time " + timeText(time) + " is more than a timeline can hold, which is " +
                          timeText(LATEST_TIME) + "."};
    }
}

void checkPresent(const Timeline::Object& timeline, const Clip* clip)
{
    if (!clip) {
        throw EditRefused{"There is no clip to edit."};
    }
    if (!timeline.contains(clip)) {
        throw EditRefused{"The " + clipText(clip) + " is not on the timeline."};
    }
}

void checkEditable(const Timeline::Object& timeline, const Clip* clip)
{
    checkPresent(timeline, clip);
    if (!timeline.canEditTiming(clip)) {
        const QString reason = timeline.isNativeAudio(clip)
                                   ? " is native audio, which goes with the clip that it belongs to."
                                   : " is part of an intro, whose timing can't be edited.";
        throw EditRefused{"The " + clipText(clip) + at(timeline.clipTiming(clip).timestamp) + reason};
    }
}

void checkCanSplit(const Timeline::Object& timeline, const Clip* clip, MTime time)
{
    checkEditable(timeline, clip);
    if (!timeline.canSplit(clip, time - timeline.clipTiming(clip).timestamp)) {
        throw EditRefused{"The " + clipText(clip) + " can't be split" + at(time) +
                          ": there must be a clip of " + timeText(Clip::MIN_DURATION) +
                          " on either side, beside the transitions."};
    }
}

void checkLength(const Clip* clip, MTime start, MTime length)
{
    if (length < Clip::MIN_DURATION) {
        throw EditRefused{"The " + clipText(clip) + at(start) + " would last " + timeText(length) +
                          ", which is less than " + timeText(Clip::MIN_DURATION) + "."};
    }
}

void checkStretch(const Clip* clip, const ClipTiming& timing, MTime before)
{
    if (beyondSource(clip, timing) > before) {
        throw EditRefused{"The " + clipText(clip) + at(timing.timestamp) + " would show its source from " +
                          timeText(timing.sourcePosition) + " to " + timeText(timing.sourceEnd()) +
                          ", but that lasts " + timeText(timing.sourceDuration) + "."};
    }
}

void checkListed(const Timeline::Object& timeline, const Timeline::Track* track)
{
    if (!track || !timeline.contains(track)) {
        throw EditRefused{"The track is not on the timeline."};
    }
}

void checkLane(const Timeline::Object& timeline, const Clip* clip, const Lane& lane, MTime time)
{
    checkListed(timeline, lane.track);
    const QString which = "The " + clipText(clip) + " can't lie" + at(time);
    if (lane.level < 0 || (lane.level > 0 && !Timeline::isMultilevelTrack(lane.track))) {
        throw EditRefused{which + QString(" on level %1, which the track does not have.").arg(lane.level)};
    }
    if (lane.track->type == NativeAudioTrack) {
        throw EditRefused{which + " on a native audio track by itself."};
    }
    if (!accepts(lane.track->type, clip)) {
        throw EditRefused{which + (clip->isAudioClip() ? ": the track takes no sound."
                                                       : ": the track takes nothing but sound.")};
    }
}

ClipTiming checkedTiming(const EditDraft& draft, const Placement& what, MTime time)
{
    checkNew(draft, what.clip);
    checkLane(draft.timeline(), what.clip, {what.track, what.level}, time);
    if (what.nativeAudio) {
        checkNativeAudio(draft, what);
    }
    for (const MTime checked : {time, what.sourcePosition, what.duration}) {
        checkTime(checked);
    }
    const MTime source = what.clip->sourceDuration;
    const MTime duration = what.duration == MTime(-1) ? source - what.sourcePosition : what.duration;
    checkLength(what.clip, time, duration);
    const ClipTiming timing(what.track, what.level, time, duration, what.sourcePosition, source);
    checkStretch(what.clip, timing);
    return timing;
}

} // namespace Host
