// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/Transition.h>
#include <EditorModel/timeline/Clip.h>
#include <EditorModel/timeline/Object.h>
#include <EditorModel/timeline/TransitionType.h>
#include <EditorModel/types/StrictLookup.h>

#include <algorithm>
#include <cmath>

namespace Timeline {
namespace {

using Ignored = QSet<const Transition::Object*>;

/// No wish where a duration goes in, no transition possible where one comes out.
constexpr MTime NONE = -1;

/// Toward zero; what is out of range becomes the nearest time.
MTime truncated(double ms)
{
    return MTime::fromMsRound(std::trunc(ms));
}

MTime half(MTime time)
{
    return truncated(static_cast<double>(time.ms()) * 0.5);
}

MTime twice(MTime time)
{
    return truncated(2.0 * static_cast<double>(time.ms()));
}

template <class Matches>
const Transition::Object* firstTransition(const Timeline::Object& timeline, Matches matches)
{
    for (const auto& [transition, pair] : timeline.transitions) {
        if (matches(pair))
            return transition;
    }
    return nullptr;
}

/// What a transition may take of a clip that has one of the length `other` at its far end.
MTime room(const ClipTiming& timing, MTime other)
{
    return other == MTime() ? timing.duration : timing.duration - (other + Clip::MIN_DURATION);
}

bool isIgnored(const Transition::Object* transition, const Ignored& ignored)
{
    return transition && ignored.contains(transition);
}

/// What the transition at the head leaves of the clip.
MTime behindInbound(const Timeline::Object& timeline, const Clip* clip, const Ignored& ignored)
{
    const ClipTiming& timing = timeline.clipTiming(clip);
    const bool isFree = isIgnored(timeline.inboundTransitionOf(clip), ignored);
    return isFree ? timing.duration : timing.duration - timing.transitionIn;
}

/// What the transition at the tail leaves of the clip.
MTime beforeOutbound(const Timeline::Object& timeline, const Clip* clip, const Ignored& ignored)
{
    const ClipTiming& timing = timeline.clipTiming(clip);
    const bool isFree = isIgnored(timeline.outboundTransitionOf(clip), ignored);
    return isFree ? timing.duration : timing.duration - timing.transitionOut;
}

/// The transition that a new one on the pair would take the place of.
const Transition::Object* transitionInPlace(const Timeline::Object& timeline, const ClipPair& pair)
{
    switch (transitionType(pair.first, pair.second)) {
    case BetweenClips:
        return timeline.transitionOf(pair.first, pair.second);
    case IntoClip:
        return timeline.inboundTransitionOf(pair.second);
    case OutOfClip:
        return timeline.outboundTransitionOf(pair.first);
    case NoTransition:
        break;
    }
    return nullptr;
}

/// What transitions take of the tail of the first and of the head of the second clip.
MTime presentLength(const Timeline::Object& timeline, const ClipPair& pair)
{
    MTime length;
    if (pair.first)
        length += timeline.clipTiming(pair.first).transitionOut;
    if (pair.second)
        length += timeline.clipTiming(pair.second).transitionIn;
    return length;
}

/// The length to aim at where nobody wished for one.
MTime unwishedLength(const Timeline::Object& timeline, const ClipPair& pair, MTime defaultDuration,
                     const Ignored& ignored)
{
    const Transition::Object* const inPlace = transitionInPlace(timeline, pair);
    if (inPlace && !ignored.contains(inPlace)) {
        const MTime length = presentLength(timeline, pair);
        if (length != NONE)
            return length;
    }
    const bool isBetween = transitionType(pair.first, pair.second) == BetweenClips;
    return isBetween ? defaultDuration : half(defaultDuration);
}

MTime limitedBetween(MTime wish, MTime limit)
{
    return twice(std::max(half(Clip::MIN_DURATION), std::min(half(wish), limit)));
}

MTime limitedOneSided(MTime wish, MTime limit)
{
    return std::max(Clip::MIN_DURATION, std::min(wish, limit - Clip::MIN_DURATION));
}

} // namespace

Object* Object::addTransition(const Transition::Object* transition, const ClipPair& pair, MTime duration)
{
    if (pair.first == pair.second)
        return this;

    // A copy, since the pair may be that of a transition that is removed.
    const ClipPair clipPair = pair;
    // Before anything is removed: a transition passes its length on to the one that takes its place.
    const MTime length = expectedTransitionDuration(clipPair, transition->defaultDuration, duration);
    if (const Transition::Object* const outbound = outboundTransitionOf(clipPair.first))
        removeTransition(outbound);
    if (const Transition::Object* const inbound = inboundTransitionOf(clipPair.second))
        removeTransition(inbound);
    transitions[transition] = clipPair;
    return setTransitionDuration(transition, length);
}

Object* Object::removeTransition(const Transition::Object* transition)
{
    const auto& [first, second] = Types::strictAt(transitions, transition);
    if (first)
        clips[first].transitionOut = 0;
    if (second)
        clips[second].transitionIn = 0;
    transitions.erase(transition);
    return this;
}

Object* Object::clearTransitions()
{
    while (!transitions.empty())
        removeTransition(transitions.begin()->first);
    return this;
}

Object* Object::setTransitionDuration(const Transition::Object* transition, MTime duration)
{
    const auto& [first, second] = Types::strictAt(transitions, transition);
    const MTime share = first && second ? half(duration) : duration;
    if (first)
        clips[first].transitionOut = share;
    if (second)
        clips[second].transitionIn = share;
    return this;
}

bool Object::hasTransition(const Transition::Object* transition) const
{
    return transitions.count(transition) != 0;
}

bool Object::hasTransition(const Clip* first, const Clip* second) const
{
    return transitionOf(first, second) != nullptr;
}

const Transition::Object* Object::transitionOf(const Clip* first, const Clip* second) const
{
    return firstTransition(*this, [&](const ClipPair& pair) { return pair == ClipPair(first, second); });
}

const Transition::Object* Object::inboundTransitionOf(const Clip* clip) const
{
    // One-sided transitions name null, and don't lead into it.
    return clip ? firstTransition(*this, [&](const ClipPair& pair) { return pair.second == clip; }) : nullptr;
}

const Transition::Object* Object::outboundTransitionOf(const Clip* clip) const
{
    return clip ? firstTransition(*this, [&](const ClipPair& pair) { return pair.first == clip; }) : nullptr;
}

ClipPair Object::transitionClipPair(const Transition::Object* transition) const
{
    const auto found = transitions.find(transition);
    return found == transitions.end() ? ClipPair() : found->second;
}

Types::Range Object::transitionRange(const Transition::Object* transition) const
{
    const auto [first, second] = transitionClipPair(transition);
    Types::Range range;
    if (first) {
        const ClipTiming& timing = clipTiming(first);
        range = Types::Range(timing.end() - timing.transitionOut, timing.end());
    }
    if (second) {
        const ClipTiming& timing = clipTiming(second);
        range = Types::Range(first ? range.from : timing.timestamp, timing.timestamp + timing.transitionIn);
    }
    return range;
}

MTime Object::availableTransitionDuration(const ClipPair& pair) const
{
    const auto outgoing = [&] { return room(clipTiming(pair.first), clipTiming(pair.first).transitionIn); };
    const auto incoming = [&] {
        return room(clipTiming(pair.second), clipTiming(pair.second).transitionOut);
    };
    switch (transitionType(pair.first, pair.second)) {
    case BetweenClips:
        // Each of the two clips gives half of the length.
        return std::max(Clip::MIN_DURATION, twice(std::min(outgoing(), incoming())));
    case IntoClip:
        return std::max(Clip::MIN_DURATION, incoming());
    case OutOfClip:
        return std::max(Clip::MIN_DURATION, outgoing());
    case NoTransition:
        break;
    }
    return NONE;
}

MTime Object::availableTransitionDuration(const Transition::Object* transition) const
{
    return availableTransitionDuration(transitionClipPair(transition));
}

MTime Object::expectedTransitionDuration(const ClipPair& pair, MTime defaultDuration, MTime duration,
                                         const QSet<const Transition::Object*>& ignored) const
{
    const MTime wish = duration == NONE ? unwishedLength(*this, pair, defaultDuration, ignored) : duration;
    switch (transitionType(pair.first, pair.second)) {
    case BetweenClips:
        return limitedBetween(wish, std::min(behindInbound(*this, pair.first, ignored),
                                             beforeOutbound(*this, pair.second, ignored)));
    case IntoClip:
        return limitedOneSided(wish, beforeOutbound(*this, pair.second, ignored));
    case OutOfClip:
        return limitedOneSided(wish, behindInbound(*this, pair.first, ignored));
    case NoTransition:
        break;
    }
    return wish;
}

MTime Object::expectedTransitionDuration(const ClipPair& pair, MTime defaultDuration, MTime duration) const
{
    return expectedTransitionDuration(pair, defaultDuration, duration, {});
}

} // namespace Timeline
