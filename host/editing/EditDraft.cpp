// SPDX-License-Identifier: Apache-2.0
#include "host/editing/EditDraft.h"

#include "host/editing/EditText.h"
#include "host/editing/NativeAudio.h"

#include <EditorModel/effects/Transition.h>

#include <algorithm>
#include <deque>
#include <iterator>
#include <utility>

namespace Host {
namespace {

using Timeline::Clip;
using Timeline::ClipPair;
using Timeline::ClipTiming;

MTime distance(const Timeline::Object& timeline, const Clip* master, const Clip* slave)
{
    return timeline.clipTiming(slave).timestamp - timeline.clipTiming(master).timestamp;
}

template <class Map, class Predicate>
void eraseIf(Map& map, const Predicate& isGone)
{
    for (auto entry = map.begin(); entry != map.end();) {
        entry = isGone(*entry) ? map.erase(entry) : std::next(entry);
    }
}

} // namespace

ClipTiming& EditDraft::timing(const Clip* clip)
{
    ClipTiming& found = m_timeline.clips.at(clip);
    m_touched.insert(clip);
    return found;
}

// Questions

std::vector<const Clip*> EditDraft::nativeAudioOf(const Clip* master) const
{
    std::vector<const Clip*> found;
    for (const auto& [slave, link] : m_timeline.links) {
        if (link.master == master && m_timeline.isNativeAudio(slave)) {
            found.push_back(slave);
        }
    }
    return found;
}

EditDraft::Clips EditDraft::laterClips(const Lane& lane, MTime from) const
{
    Clips later;
    for (const auto& [clip, timing] : m_timeline.clips) {
        if (lane.holds(timing) && timing.timestamp >= from) {
            later.insert(later.end(), clip);
        }
    }
    return later;
}

EditDraft::Clips EditDraft::withDependants(const Clips& clips, const Clip* fixed) const
{
    return withSlaves(clips, [fixed](const Clip* clip) { return clip != fixed; });
}

EditDraft::Clips EditDraft::withSlaves(const Clips& clips,
                                       const std::function<bool(const Clip*)>& isAccepted) const
{
    // One walk over the links, not one for each clip: a ripple takes most of a timeline along.
    const auto slavesOf = m_timeline.master2slaves();
    Clips all;
    std::deque<const Clip*> queue(clips.begin(), clips.end());
    while (!queue.empty()) {
        const Clip* const clip = queue.front();
        queue.pop_front();
        if (!isAccepted(clip) || !all.insert(clip).second) {
            continue;
        }
        const auto slaves = slavesOf.find(clip);
        if (slaves != slavesOf.end()) {
            queue.insert(queue.end(), slaves->second.begin(), slaves->second.end());
        }
    }
    return all;
}

MTime EditDraft::formerDistance(const Clip* slave) const
{
    const auto changed = m_formerDistances.find(slave);
    return changed != m_formerDistances.end() ? changed->second
                                              : distance(m_before, m_before.masterOf(slave), slave);
}

// Moving

void EditDraft::shift(const Clips& clips, MTime delta)
{
    if (delta == MTime()) {
        return;
    }
    std::vector<const Clip*> immovable;
    for (const Clip* const clip : clips) {
        const bool followsMaster =
            m_timeline.isNativeAudio(clip) && clips.count(m_timeline.masterOf(clip)) != 0;
        if (!followsMaster && !m_timeline.canEditTiming(clip)) {
            immovable.push_back(clip);
        }
    }
    if (!immovable.empty()) {
        const Clip* const first =
            *std::min_element(immovable.begin(), immovable.end(), ClipOrder(&m_timeline));
        throw EditRefused{"The " + clipText(first) + " at " + timeText(timing(first).timestamp) +
                          " would have to move, but its timing can't be edited."};
    }
    for (const Clip* const clip : clips) {
        m_timeline.clips.at(clip).timestamp += delta;
        m_touched.insert(m_touched.end(), clip);
    }
}

void EditDraft::ripple(const Lane& lane, MTime from, MTime delta, const Clip* fixed)
{
    shift(withDependants(laterClips(lane, from), fixed), delta);
}

// Links

void EditDraft::link(const Clip* master, const Clip* slave)
{
    const MTime offset = distance(m_timeline, master, slave);
    m_timeline.addLink(master, slave, offset);
    m_formerDistances[slave] = offset;
}

void EditDraft::unlink(const Clip* slave)
{
    m_timeline.removeLink(slave);
}

void EditDraft::relink(const Clip* slave, const Clip* master)
{
    const MTime now = distance(m_timeline, master, slave);
    m_timeline.addLink(master, slave, m_timeline.links.at(slave).offset + now - formerDistance(slave));
    m_formerDistances[slave] = now;
}

// Taking out

void EditDraft::erase(const Clips& clips)
{
    const auto isGone = [&clips](const Clip* clip) { return clips.count(clip) != 0; };
    std::vector<const Transition::Object*> transitions;
    for (const auto& [transition, pair] : m_timeline.transitions) {
        if (isGone(pair.first) || isGone(pair.second)) {
            transitions.push_back(transition);
        }
    }
    // Before the clips: taking one out writes to both its clips.
    for (const Transition::Object* const transition : transitions) {
        m_timeline.removeTransition(transition);
    }
    eraseIf(m_timeline.links,
            [&](const auto& entry) { return isGone(entry.first) || isGone(entry.second.master); });
    eraseIf(m_timeline.trackingLinks, [&](const auto& entry) {
        return isGone(entry.first) || isGone(entry.second.trackedObject.clip);
    });
    for (const Clip* const clip : clips) {
        m_timeline.removeClip(clip);
    }
    m_retimed.erase(std::remove_if(m_retimed.begin(), m_retimed.end(), isGone), m_retimed.end());
}

void EditDraft::eraseWithNativeAudio(const Clips& clips)
{
    if (!clips.empty()) {
        erase(withSlaves(clips, [&](const Clip* clip) {
            return clips.count(clip) != 0 || m_timeline.isNativeAudio(clip);
        }));
    }
}

// Cutting

const Clip* EditDraft::makeCopy(const Clip* clip)
{
    m_made.push_back(std::make_unique<Clip>(*clip));
    return m_made.back().get();
}

const Clip* EditDraft::cut(const Clip* clip, MTime at)
{
    const Clip* const right = cutAlone(clip, at);
    noteRetimed(clip);
    noteRetimed(right);
    std::deque<Parts> queue{{clip, right}};
    while (!queue.empty()) {
        const Parts parts = queue.front();
        queue.pop_front();
        const std::vector<Parts> audio = handOverSlaves(parts);
        queue.insert(queue.end(), audio.begin(), audio.end());
        handOverFollowers(parts);
    }
    return right;
}

const Clip* EditDraft::cutAlone(const Clip* clip, MTime at)
{
    const Clip* const right = makeCopy(clip);
    ClipTiming& leftTiming = timing(clip);
    ClipTiming rightTiming = leftTiming;
    rightTiming.resizeLeft(at - leftTiming.timestamp).setTransitionIn(0).setFadeInDuration(0);
    leftTiming.resizeRight(at - leftTiming.end()).setTransitionOut(0).setFadeOutDuration(0);
    m_timeline.addClip(right, rightTiming);

    if (const Transition::Object* const outbound = m_timeline.outboundTransitionOf(clip)) {
        m_timeline.transitions.at(outbound).first = right;
    }
    if (const Clip* const master = m_timeline.masterOf(clip)) {
        m_timeline.addLink(master, right, m_timeline.links.at(clip).offset);
        m_formerDistances[right] = formerDistance(clip);
        relink(right, master);
    }
    if (const Timeline::TrackingLinkInfo* const followed = m_timeline.getTrackingLink(clip)) {
        m_timeline.addTrackingLink(right, Timeline::TrackingLinkInfo(*followed));
    }
    return right;
}

std::vector<EditDraft::Parts> EditDraft::handOverSlaves(const Parts& parts)
{
    const MTime at = timing(parts.right).timestamp;
    std::vector<Parts> audio;
    for (const Clip* const slave : m_timeline.findSlaves(parts.left)) {
        if (timing(slave).timestamp >= at) {
            relink(slave, parts.right);
        } else if (m_timeline.isNativeAudio(slave) && timing(slave).end() > at) {
            audio.push_back({slave, cutAlone(slave, at)});
            relink(audio.back().right, parts.right);
        }
    }
    return audio;
}

void EditDraft::handOverFollowers(const Parts& parts)
{
    const MTime at = timing(parts.right).timestamp;
    for (auto& [follower, info] : m_timeline.trackingLinks) {
        if (info.trackedObject.clip == parts.left && timing(follower).timestamp >= at) {
            info.trackedObject.clip = parts.right;
        }
    }
}

void EditDraft::cutHead(const Clip* clip, MTime newStart)
{
    if (const Transition::Object* const inbound = m_timeline.inboundTransitionOf(clip)) {
        m_timeline.removeTransition(inbound);
    }
    ClipTiming& cutTiming = timing(clip);
    cutTiming.resizeLeft(newStart - cutTiming.timestamp).setFadeInDuration(0);
    noteRetimed(clip);
}

void EditDraft::cutTail(const Clip* clip, MTime newEnd)
{
    if (const Transition::Object* const outbound = m_timeline.outboundTransitionOf(clip)) {
        m_timeline.removeTransition(outbound);
    }
    ClipTiming& cutTiming = timing(clip);
    cutTiming.resizeRight(newEnd - cutTiming.end()).setFadeOutDuration(0);
    noteRetimed(clip);
}

void EditDraft::addNativeAudio(const Clip* master, const Clip* audio)
{
    ClipTiming audioTiming;
    audioTiming.track = m_timeline.nativeAudioTrack();
    const ClipTiming& masterTiming = timing(master);
    if (!followMaster(master, masterTiming, audio, audioTiming)) {
        throw EditRefused{"The " + clipText(audio) + " has nothing to play for what the " + clipText(master) +
                          " shows at " + timeText(masterTiming.timestamp) + "."};
    }
    m_timeline.addClip(audio, audioTiming);
    link(master, audio);
}

// Following up

void EditDraft::finish()
{
    retimeNativeAudio();
    limitFades();
    limitTransitions();
    updateOffsets();
}

void EditDraft::retimeNativeAudio()
{
    Clips mute;
    // The list grows: native audio may be the master of native audio.
    for (std::size_t i = 0; i != m_retimed.size(); ++i) {
        const Clip* const master = m_retimed[i];
        for (const Clip* const audio : nativeAudioOf(master)) {
            if (followMaster(master, timing(master), audio, timing(audio))) {
                noteRetimed(audio);
            } else {
                mute.insert(audio);
            }
        }
    }
    eraseWithNativeAudio(mute);
}

void EditDraft::limitFades()
{
    for (const Clip* const clip : m_retimed) {
        ClipTiming& limited = timing(clip);
        limited.fadeInDuration = std::min(limited.fadeInDuration, limited.duration);
        limited.fadeOutDuration =
            std::min(limited.fadeOutDuration, limited.duration - limited.fadeInDuration);
    }
}

void EditDraft::limitTransitions()
{
    std::vector<const Transition::Object*> parted;
    for (const auto& [transition, pair] : m_timeline.transitions) {
        const auto& [first, second] = pair;
        if (first && second && !timing(first).placedSequentially(timing(second))) {
            parted.push_back(transition);
        }
    }
    for (const Transition::Object* const transition : parted) {
        m_timeline.removeTransition(transition);
    }
    for (const Clip* const clip : m_retimed) {
        limitTransition(m_timeline.inboundTransitionOf(clip));
        limitTransition(m_timeline.outboundTransitionOf(clip));
    }
}

void EditDraft::limitTransition(const Transition::Object* transition)
{
    if (!transition) {
        return;
    }
    const ClipPair pair = m_timeline.transitionClipPair(transition);
    const MTime present = m_timeline.transitionRange(transition).length();
    m_timeline.setTransitionDuration(transition, fittingLength(m_timeline, transition, pair, present));
    if (!hasRoomForTransitions(m_timeline, pair.first) || !hasRoomForTransitions(m_timeline, pair.second)) {
        m_timeline.removeTransition(transition);
    }
}

void EditDraft::updateOffsets()
{
    for (auto& [slave, link] : m_timeline.links) {
        if (m_touched.count(slave) != 0 || m_touched.count(link.master) != 0) {
            link.offset += distance(m_timeline, link.master, slave) - formerDistance(slave);
        }
    }
}

// Lengths of transitions

MTime fittingLength(const Timeline::Object& timeline, const Transition::Object* transition,
                    const ClipPair& pair, MTime wish)
{
    const MTime standard = transition->defaultDuration;
    const MTime expected = timeline.expectedTransitionDuration(pair, standard, wish);
    const MTime available = timeline.availableTransitionDuration(pair);
    return expected <= available ? expected : timeline.expectedTransitionDuration(pair, standard, available);
}

bool hasRoomForTransitions(const Timeline::Object& timeline, const Clip* clip)
{
    if (!clip) {
        return true;
    }
    const ClipTiming& timing = timeline.clipTiming(clip);
    return timing.transitionIn + timing.transitionOut <= timing.duration;
}

} // namespace Host
