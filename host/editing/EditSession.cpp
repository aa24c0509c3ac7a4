// SPDX-License-Identifier: Apache-2.0
#include "host/editing/EditSession.h"

#include "host/editing/EditChecks.h"
#include "host/editing/EditDraft.h"
#include "host/editing/EditText.h"
#include "host/editing/TimelineInvariants.h"

#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Transition.h>

#include <algorithm>
#include <map>
#include <utility>
#include <vector>

namespace Host {
namespace {

using Timeline::Clip;
using Timeline::ClipPair;
using Timeline::ClipTiming;
using Timeline::Track;

/// Empty where there is none.
QString firstFault(const QString& opening, const std::vector<TimelineFault>& faults)
{
    return faults.empty() ? QString() : opening + faults.front().text;
}

Lane laneOf(const ClipTiming& timing)
{
    return {timing.track, timing.trackLevel};
}

MTime endOf(const Timeline::Object& timeline, const Lane& lane)
{
    MTime end;
    for (const auto& [clip, timing] : timeline.clips) {
        if (lane.holds(timing)) {
            end = std::max(end, timing.end());
        }
    }
    return end;
}

/// The clip of the lane that lies across a time, with something on either side; null if there is none.
const Clip* clipAcross(const Timeline::Object& timeline, const Lane& lane, MTime at)
{
    for (const auto& [clip, timing] : timeline.clips) {
        if (lane.holds(timing) && timing.timestamp < at && at < timing.end()) {
            return clip;
        }
    }
    return nullptr;
}

void lay(EditDraft& draft, const Placement& what, const ClipTiming& timing)
{
    draft.timeline().addClip(what.clip, timing);
    if (what.nativeAudio) {
        draft.addNativeAudio(what.clip, what.nativeAudio);
    }
}

/// Trims or splits the clip so that nothing of it lies between the two times. False, with nothing done, where
/// nothing would be left.
bool cutOut(EditDraft& draft, const Clip* clip, MTime from, MTime to)
{
    const ClipTiming& timing = draft.timing(clip);
    const bool keepsLeft = from - timing.timestamp >= Clip::MIN_DURATION;
    const bool keepsRight = timing.end() - to >= Clip::MIN_DURATION;
    if (keepsLeft && keepsRight) {
        draft.cut(clip, to);
    }
    if (keepsLeft) {
        draft.cutTail(clip, from);
    } else if (keepsRight) {
        draft.cutHead(clip, to);
    }
    return keepsLeft || keepsRight;
}

void clearLane(EditDraft& draft, const ClipTiming& room)
{
    // By their starts, which are all different on a lane.
    std::map<MTime, const Clip*> under;
    for (const auto& [clip, timing] : draft.timeline().clips) {
        if (laneOf(room).holds(timing) && timing.overlapsWith(room)) {
            under.emplace(timing.timestamp, clip);
        }
    }
    EditDraft::Clips covered;
    for (const auto& [start, clip] : under) {
        checkEditable(draft.timeline(), clip);
        if (!cutOut(draft, clip, room.timestamp, room.end())) {
            covered.insert(clip);
        }
    }
    draft.eraseWithNativeAudio(covered);
}

/// Native audio that has a master is not removed without it.
void checkRemovable(const Timeline::Object& timeline, const Clip* clip)
{
    checkPresent(timeline, clip);
    if (timeline.isNativeAudio(clip) && timeline.isSlave(clip)) {
        checkEditable(timeline, clip);
    }
}

/// Moves a stretch that lies beyond the source by rounding, as far as its length allows.
void takeIntoSource(const Clip* clip, ClipTiming& timing)
{
    if (beyondSource(clip, timing) > MTime()) {
        const MTime last = timing.sourceDuration - timing.duration;
        timing.sourcePosition = std::max(MTime(), std::min(timing.sourcePosition, last));
    }
}

/// Lets the clips behind follow a clip that has got another length.
void followLength(EditDraft& draft, const Clip* clip, const ClipTiming& before, Ripple ripple)
{
    draft.noteRetimed(clip);
    if (ripple == Ripple::Yes) {
        draft.ripple(laneOf(before), before.end(), draft.timing(clip).end() - before.end(), clip);
    }
}

} // namespace

Placement::Placement(const Clip* clip_, const Track* track_, int level_, MTime sourcePosition_,
                     MTime duration_, const Clip* nativeAudio_)
    : clip(clip_),
      track(track_),
      level(level_),
      sourcePosition(sourcePosition_),
      duration(duration_),
      nativeAudio(nativeAudio_)
{}

EditSession::EditSession() : m_own(std::make_unique<Timeline::Object>()), m_timeline(m_own.get())
{
    own(m_timeline);
}

EditSession::EditSession(Timeline::Object* timeline) : m_timeline(timeline)
{
    if (enumerateAll().count(timeline) != 0) {
        m_refusal = "The timeline is edited by somebody else.";
        return;
    }
    m_refusal = firstFault("The timeline has a fault: ", timelineFaults(*timeline));
    own(m_timeline);
}

EditSession::~EditSession()
{
    if (isObserved(m_timeline)) {
        remove(m_timeline);
    }
}

Clip* EditSession::makeClip(Clip::ClipType type)
{
    m_clips.push_back(std::make_unique<Clip>());
    return m_clips.back()->setTimeline(m_timeline)->setType(type);
}

Track* EditSession::makeTrack(TrackType type)
{
    m_tracks.push_back(std::make_unique<Track>(type));
    return m_tracks.back()->setTimeline(m_timeline);
}

Transition::Object* EditSession::makeTransition(const QString& id)
{
    m_transitions.push_back(std::make_unique<Transition::Object>(id));
    return m_transitions.back().get();
}

Overlay::Preset* EditSession::makeOverlay(const Overlay::Preset& preset)
{
    m_overlays.push_back(std::make_unique<Overlay::Preset>(preset));
    return m_overlays.back().get();
}

// Placing

EditResult EditSession::append(const Placement& what)
{
    return edit(what.clip, [&](EditDraft& draft) {
        const MTime at = endOf(draft.timeline(), {what.track, what.level});
        lay(draft, what, checkedTiming(draft, what, at));
    });
}

EditResult EditSession::insert(const Placement& what, MTime at)
{
    return edit(what.clip, [&](EditDraft& draft) {
        const ClipTiming timing = checkedTiming(draft, what, at);
        const Clip* const across = clipAcross(draft.timeline(), laneOf(timing), at);
        if (across) {
            checkCanSplit(draft.timeline(), across, at);
            draft.cut(across, at);
        }
        draft.ripple(laneOf(timing), at, timing.duration, across);
        lay(draft, what, timing);
    });
}

EditResult EditSession::overwrite(const Placement& what, MTime at)
{
    return edit(what.clip, [&](EditDraft& draft) {
        const ClipTiming timing = checkedTiming(draft, what, at);
        clearLane(draft, timing);
        lay(draft, what, timing);
    });
}

// Removing

EditResult EditSession::lift(const Clip* clip)
{
    return edit(clip, [&](EditDraft& draft) {
        checkRemovable(draft.timeline(), clip);
        draft.erase(draft.withDependants({clip}));
    });
}

EditResult EditSession::extract(const Clip* clip)
{
    return edit(clip, [&](EditDraft& draft) {
        checkRemovable(draft.timeline(), clip);
        const ClipTiming timing = draft.timing(clip);
        draft.erase(draft.withDependants({clip}));
        draft.ripple(laneOf(timing), timing.end(), -timing.duration);
    });
}

// Changing clips

EditResult EditSession::split(const Clip* clip, MTime at)
{
    const Clip* right = nullptr;
    EditResult result = edit(clip, [&](EditDraft& draft) {
        checkTime(at);
        checkCanSplit(draft.timeline(), clip, at);
        right = draft.cut(clip, at);
    });
    if (result) {
        result.clip = right;
    }
    return result;
}

EditResult EditSession::trimLeft(const Clip* clip, MTime delta, Ripple ripple)
{
    return edit(clip, [&](EditDraft& draft) {
        checkEditable(draft.timeline(), clip);
        checkTime(delta);
        ClipTiming& timing = draft.timing(clip);
        const ClipTiming before = timing;
        timing.resizeLeft(delta);
        if (ripple == Ripple::Yes) {
            timing.setTimestamp(before.timestamp);
        }
        checkLength(clip, before.timestamp, timing.duration);
        checkStretch(clip, timing, beyondSource(clip, before));
        followLength(draft, clip, before, ripple);
    });
}

EditResult EditSession::trimRight(const Clip* clip, MTime delta, Ripple ripple)
{
    return edit(clip, [&](EditDraft& draft) {
        checkEditable(draft.timeline(), clip);
        checkTime(delta);
        ClipTiming& timing = draft.timing(clip);
        const ClipTiming before = timing;
        timing.resizeRight(-delta);
        checkLength(clip, before.timestamp, timing.duration);
        checkStretch(clip, timing, beyondSource(clip, before));
        followLength(draft, clip, before, ripple);
    });
}

EditResult EditSession::move(const Clip* clip, MTime at)
{
    const auto entry = m_timeline->clips.find(clip);
    const bool isKnown = entry != m_timeline->clips.end();
    return move(clip, at, isKnown ? entry->second.track : nullptr, isKnown ? entry->second.trackLevel : 0);
}

EditResult EditSession::move(const Clip* clip, MTime at, const Track* track, int level)
{
    return edit(clip, [&](EditDraft& draft) {
        checkEditable(draft.timeline(), clip);
        checkTime(at);
        checkLane(draft.timeline(), clip, {track, level}, at);
        ClipTiming& timing = draft.timing(clip);
        draft.shift(draft.withDependants({clip}), at - timing.timestamp);
        timing.setTrack(track).setTrackLevel(level);
    });
}

EditResult EditSession::setSpeed(const Clip* clip, double speed, Ripple ripple)
{
    return edit(clip, [&](EditDraft& draft) {
        checkEditable(draft.timeline(), clip);
        ClipTiming& timing = draft.timing(clip);
        const ClipTiming before = timing;
        const double length = double(clip->sourceDuration.ms()) / speed;
        // A source of fewer milliseconds would lose its speed to rounding. Not-a-number is refused as well.
        const bool isPlayable =
            length >= double(Clip::MIN_DURATION.ms()) && length <= double(LATEST_TIME.ms());
        if (!isPlayable || before.sourceDuration <= MTime()) {
            throw EditRefused{"The " + clipText(clip) + " at " + timeText(before.timestamp) +
                              QString(" can't be played at a speed of %1.").arg(speed)};
        }
        draft.timeline().setClipSpeed(clip, speed);
        takeIntoSource(clip, timing);
        timing.duration -= beyondSource(clip, timing);
        checkLength(clip, before.timestamp, timing.duration);
        checkStretch(clip, timing);
        followLength(draft, clip, before, ripple);
    });
}

EditResult EditSession::reverse(const Clip* clip)
{
    return edit(clip, [&](EditDraft& draft) {
        checkEditable(draft.timeline(), clip);
        draft.timeline().reverseClip(clip);
        takeIntoSource(clip, draft.timing(clip));
        draft.noteRetimed(clip);
    });
}

EditResult EditSession::setFades(const Clip* clip, MTime fadeIn, MTime fadeOut)
{
    return edit(clip, [&](EditDraft& draft) {
        checkPresent(draft.timeline(), clip);
        checkTime(fadeIn);
        checkTime(fadeOut);
        const ClipTiming& timing = draft.timing(clip);
        if (fadeIn < MTime() || fadeOut < MTime() || fadeIn + fadeOut > timing.duration) {
            throw EditRefused{"The " + clipText(clip) + " at " + timeText(timing.timestamp) +
                              " can't be faded by " + timeText(fadeIn) + " and " + timeText(fadeOut) +
                              ": it lasts " + timeText(timing.duration) + "."};
        }
        draft.timeline().setClipFadeInDuration(clip, fadeIn)->setClipFadeOutDuration(clip, fadeOut);
    });
}

// Committing

EditResult EditSession::edit(const Clip* clip, const std::function<void(EditDraft&)>& steps)
{
    if (!m_refusal.isEmpty()) {
        return {m_refusal, clip};
    }
    EditDraft draft(*m_timeline);
    try {
        steps(draft);
        draft.finish();
    } catch (const EditRefused& refused) {
        return {refused.why, clip};
    }
    const QString fault =
        firstFault("The edit would leave a fault: ", timelineFaults(*m_timeline, draft.timeline()));
    if (!fault.isEmpty()) {
        return {fault, clip};
    }
    commit(draft);
    return {QString(), clip};
}

void EditSession::commit(EditDraft& draft)
{
    for (std::unique_ptr<Clip>& made : draft.takeMade()) {
        m_clips.push_back(std::move(made));
    }
    *change(m_timeline).operator->() = std::move(draft.timeline());
}

void EditSession::changeRequested(Timeline::Object* timeline, Timeline::Object* value)
{
    if (timelineFaults(*timeline, *value).empty()) {
        m_refusal.clear();
        TimelineView::changeRequested(timeline, value);
    }
}

void EditSession::removeRequested(Timeline::Object*) {}

} // namespace Host
