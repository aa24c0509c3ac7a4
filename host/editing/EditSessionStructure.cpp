// SPDX-License-Identifier: Apache-2.0
// What an edit session does to transitions, tracks and links.
#include "host/editing/EditSession.h"

#include "host/editing/EditChecks.h"
#include "host/editing/EditDraft.h"
#include "host/editing/EditText.h"

#include <EditorModel/effects/Transition.h>

#include <algorithm>

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

} // namespace Host
