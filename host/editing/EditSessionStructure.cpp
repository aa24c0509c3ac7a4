// SPDX-License-Identifier: Apache-2.0
// What an edit session does to transitions, tracks, links and tracking links.
#include "host/editing/EditSession.h"

#include "host/editing/EditChecks.h"
#include "host/editing/EditDraft.h"
#include "host/editing/EditText.h"

#include <EditorModel/effects/Transition.h>

#include <algorithm>
#include <cmath>
#include <set>

namespace Host {
namespace {

using Timeline::Clip;
using Timeline::ClipPair;
using Timeline::ClipTiming;
using Timeline::Track;

void checkTransitionClip(const Timeline::Object& timeline, const Clip* clip)
{
    if (!clip) {
        return;
    }
    checkPresent(timeline, clip);
    if (timeline.isNativeAudio(clip)) {
        checkEditable(timeline, clip);
    }
}

void checkPair(const Timeline::Object& timeline, const ClipPair& pair)
{
    const auto& [first, second] = pair;
    if (first == second) {
        throw EditRefused{"A transition needs a clip, or two different ones."};
    }
    checkTransitionClip(timeline, first);
    checkTransitionClip(timeline, second);
    if (!first || !second) {
        return;
    }
    const ClipTiming& outgoing = timeline.clipTiming(first);
    const ClipTiming& incoming = timeline.clipTiming(second);
    if (!outgoing.placedSequentially(incoming)) {
        throw EditRefused{"The " + clipText(second) + " at " + timeText(incoming.timestamp) +
                          " does not follow the " + clipText(first) + ", which ends at " +
                          timeText(outgoing.end()) + "."};
    }
}

void checkTransition(const Timeline::Object& timeline, const Transition::Object* transition,
                     const ClipPair& pair)
{
    if (!transition) {
        throw EditRefused{"There is no transition to add."};
    }
    if (timeline.hasTransition(transition) && timeline.transitionClipPair(transition) != pair) {
        throw EditRefused{"The " + transitionText(transition) + " is on the timeline already, at " +
                          timeText(timeline.transitionRange(transition).from) + "."};
    }
}

void checkRoom(const Timeline::Object& timeline, const Transition::Object* transition, const Clip* clip)
{
    if (!hasRoomForTransitions(timeline, clip)) {
        const ClipTiming& timing = timeline.clipTiming(clip);
        throw EditRefused{"The " + clipText(clip) + " at " + timeText(timing.timestamp) + ", which lasts " +
                          timeText(timing.duration) + ", has no room for the " + transitionText(transition) +
                          "."};
    }
}

/// The clip of one of the pair that sentences are about.
const Clip* subject(const ClipPair& pair)
{
    return pair.first ? pair.first : pair.second;
}

bool dependsOn(const Timeline::Object& timeline, const Clip* clip, const Clip* master)
{
    const std::deque<const Clip*> heap = timeline.clipHeap(master);
    return std::find(heap.begin(), heap.end(), clip) != heap.end();
}

/// By tracking links, of which other modules may have made a circle.
bool follows(const Timeline::Object& timeline, const Clip* clip, const Clip* followed)
{
    std::set<const Clip*> way;
    while (clip != followed && way.insert(clip).second) {
        const Timeline::TrackingLinkInfo* const link = timeline.getTrackingLink(clip);
        if (!link) {
            return false;
        }
        clip = link->trackedObject.clip;
    }
    return clip == followed;
}

void checkFollowing(const Timeline::Object& timeline, const Clip* clip,
                    const Timeline::TrackingLinkInfo& info)
{
    const Clip* const followed = info.trackedObject.clip;
    checkPresent(timeline, clip);
    checkPresent(timeline, followed);
    const QString start = "The " + clipText(clip) + " at " + timeText(timeline.clipTiming(clip).timestamp);
    if (clip->isAudioClip()) {
        throw EditRefused{start + " is sound, which has no place to follow with."};
    }
    if (follows(timeline, followed, clip)) {
        throw EditRefused{start + " can't follow the " + clipText(followed) + ", which follows it."};
    }
    if (followed->motionTrackings.count(info.trackedObject.trackingId) == 0) {
        throw EditRefused{start + " can't follow \"" + info.trackedObject.trackingId + "\": the " +
                          clipText(followed) + " has no such tracking."};
    }
    const QPointF offset = info.objectRelativeOffset;
    if (!std::isfinite(offset.x()) || !std::isfinite(offset.y())) {
        throw EditRefused{start + " can't follow at an offset that is no number."};
    }
}

} // namespace

// Transitions

EditResult EditSession::addTransition(const Transition::Object* transition, const ClipPair& pair, MTime wish)
{
    return edit(subject(pair), [&](EditDraft& draft) {
        Timeline::Object& timeline = draft.timeline();
        checkPair(timeline, pair);
        checkTransition(timeline, transition, pair);
        checkTime(wish);
        if (wish < MTime(-1)) {
            throw EditRefused{"The " + transitionText(transition) + " can't last " + timeText(wish) + "."};
        }
        timeline.addTransition(transition, pair, fittingLength(timeline, transition, pair, wish));
        checkRoom(timeline, transition, pair.first);
        checkRoom(timeline, transition, pair.second);
    });
}

EditResult EditSession::removeTransition(const Transition::Object* transition)
{
    return edit(subject(m_timeline->transitionClipPair(transition)), [&](EditDraft& draft) {
        if (!draft.timeline().hasTransition(transition)) {
            throw EditRefused{"The transition is not on the timeline."};
        }
        draft.timeline().removeTransition(transition);
    });
}

// Tracks

EditResult EditSession::addTrack(const Track* track)
{
    return edit(nullptr, [&](EditDraft& draft) {
        if (!track || draft.timeline().contains(track)) {
            throw EditRefused{"There is no new track to add."};
        }
        if (track->timeline != m_timeline) {
            throw EditRefused{"The track belongs to another timeline."};
        }
        draft.timeline().addTrack(track);
    });
}

EditResult EditSession::moveTrack(const Track* track, const Track* target)
{
    return edit(nullptr, [&](EditDraft& draft) {
        checkListed(draft.timeline(), track);
        checkListed(draft.timeline(), target);
        if (!draft.timeline().canMoveTrack(track, target)) {
            throw EditRefused{"A track can only take the place of another one of its type."};
        }
        draft.timeline().moveTrack(track, target);
    });
}

EditResult EditSession::removeTrack(const Track* track)
{
    return edit(nullptr, [&](EditDraft& draft) {
        checkListed(draft.timeline(), track);
        draft.erase(draft.withDependants(draft.timeline().clipsAt(track)));
        draft.timeline().removeTrack(track);
    });
}

// Links

EditResult EditSession::link(const Clip* master, const Clip* slave)
{
    return edit(slave, [&](EditDraft& draft) {
        checkPresent(draft.timeline(), master);
        checkPresent(draft.timeline(), slave);
        if (draft.timeline().isNativeAudio(slave)) {
            checkEditable(draft.timeline(), slave);
        }
        if (dependsOn(draft.timeline(), master, slave)) {
            throw EditRefused{"The " + clipText(slave) + " at " + timeText(draft.timing(slave).timestamp) +
                              " can't depend on the " + clipText(master) + ", which depends on it."};
        }
        draft.link(master, slave);
    });
}

EditResult EditSession::unlink(const Clip* slave)
{
    return edit(slave, [&](EditDraft& draft) {
        checkPresent(draft.timeline(), slave);
        if (!draft.timeline().isSlave(slave)) {
            throw EditRefused{"The " + clipText(slave) + " at " + timeText(draft.timing(slave).timestamp) +
                              " depends on no other clip."};
        }
        if (draft.timeline().isNativeAudio(slave)) {
            checkEditable(draft.timeline(), slave);
        }
        draft.unlink(slave);
    });
}

// Tracking links

EditResult EditSession::follow(const Clip* clip, const Timeline::TrackingLinkInfo& info)
{
    return edit(clip, [&](EditDraft& draft) {
        checkFollowing(draft.timeline(), clip, info);
        draft.timeline().addTrackingLink(clip, info);
    });
}

EditResult EditSession::unfollow(const Clip* clip)
{
    return edit(clip, [&](EditDraft& draft) {
        checkPresent(draft.timeline(), clip);
        if (!draft.timeline().getTrackingLink(clip)) {
            throw EditRefused{"The " + clipText(clip) + " at " + timeText(draft.timing(clip).timestamp) +
                              " follows no other clip."};
        }
        draft.timeline().removeTrackingLink(clip);
    });
}

} // namespace Host
