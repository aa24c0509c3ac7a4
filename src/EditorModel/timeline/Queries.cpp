// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/Object.h>

#include <EditorModel/timeline/Clip.h>
#include <EditorModel/timeline/Track.h>
#include <EditorModel/types/StrictLookup.h>

#include <algorithm>
#include <functional>
#include <iterator>
#include <vector>

namespace Timeline {
namespace {

const ClipTiming* findTiming(const Timeline::Object& timeline, const Clip* clip)
{
    const auto found = timeline.clips.find(clip);
    return found == timeline.clips.end() ? nullptr : &found->second;
}

/// The clips for which `holds(clip, timing)`; a walk meets them in the order of the set.
template <class Predicate>
std::set<const Clip*> clipsWhere(const Timeline::Object& timeline, Predicate holds)
{
    std::set<const Clip*> chosen;
    for (const auto& [clip, timing] : timeline.clips) {
        if (holds(clip, timing))
            chosen.insert(chosen.end(), clip);
    }
    return chosen;
}

template <class Predicate>
std::deque<const Track*> tracksWhere(const Timeline::Object& timeline, Predicate holds)
{
    std::deque<const Track*> chosen;
    std::copy_if(timeline.tracks.begin(), timeline.tracks.end(), std::back_inserter(chosen), holds);
    return chosen;
}

} // namespace

// Clips

const ClipTiming& Object::clipTiming(const Clip* clip) const
{
    return Types::strictAt(clips, clip);
}

bool Object::contains(const Clip* clip) const
{
    return clips.find(clip) != clips.end();
}

double Object::clipSpeed(const Clip* clip) const
{
    const ClipTiming& timing = clipTiming(clip);
    return double(clip->sourceDuration.ms()) / double(timing.sourceDuration.ms());
}

std::set<const Clip*> Object::clipsByType(int mask) const
{
    return clipsWhere(*this, [mask](const Clip* clip, const ClipTiming&) { return clip->type & mask; });
}

std::set<const Clip*> Object::clipsDifference(const Object* other) const
{
    const std::less<const Clip*> isBefore;
    auto theirs = other->clips.begin();
    return clipsWhere(*this, [&](const Clip* clip, const ClipTiming&) {
        while (theirs != other->clips.end() && isBefore(theirs->first, clip))
            ++theirs;
        return theirs == other->clips.end() || theirs->first != clip;
    });
}

std::set<const Clip*> Object::clipsAt(const Track* track) const
{
    return clipsWhere(*this,
                      [track](const Clip*, const ClipTiming& timing) { return timing.track == track; });
}

std::set<const Clip*> Object::clipsAt(const Track* track, MTime time) const
{
    return clipsWhere(*this, [track, time](const Clip*, const ClipTiming& timing) {
        return timing.track == track && timing.timestamp <= time && time < timing.end();
    });
}

// The whole timeline

MTime Object::duration() const
{
    if (clips.empty())
        return MTime();
    MTime latest = clips.begin()->second.end();
    for (const auto& [clip, timing] : clips)
        latest = std::max(latest, timing.end());
    return latest;
}

MTime Object::lastClipTimestamp() const
{
    return duration();
}

MTime Object::nextClipBoundary(MTime time) const
{
    MTime next = time;
    const auto consider = [&](MTime boundary) {
        if (boundary > time && (next == time || boundary < next))
            next = boundary;
    };
    for (const auto& [clip, timing] : clips) {
        consider(timing.timestamp);
        consider(timing.end());
    }
    return next;
}

MTime Object::prevClipBoundary(MTime time) const
{
    MTime previous = time;
    const auto consider = [&](MTime boundary) {
        if (boundary < time && (previous == time || boundary > previous))
            previous = boundary;
    };
    for (const auto& [clip, timing] : clips) {
        consider(timing.timestamp);
        consider(timing.end());
    }
    return previous;
}

// Tracks

bool Object::contains(const Track* track) const
{
    return trackIndex(track) != tracks.size();
}

std::size_t Object::trackIndex(const Track* track) const
{
    return std::size_t(std::find(tracks.begin(), tracks.end(), track) - tracks.begin());
}

const Track* Object::findFirstTrack(TrackType type) const
{
    const auto found = std::find_if(tracks.begin(), tracks.end(),
                                    [type](const Track* track) { return track->type == type; });
    return found == tracks.end() ? nullptr : *found;
}

std::deque<const Track*> Object::findTracks(TrackType type) const
{
    return findTracks({type});
}

std::deque<const Track*> Object::findTracks(std::initializer_list<TrackType> types) const
{
    return tracksWhere(*this, [types](const Track* track) {
        return std::find(types.begin(), types.end(), track->type) != types.end();
    });
}

std::deque<const Track*> Object::findUsedTracks(TrackType type) const
{
    return tracksWhere(*this, [type](const Track* track) { return track->type == type && track->used; });
}

bool Object::isTrackEmpty(const Track* track) const
{
    return std::none_of(clips.begin(), clips.end(),
                        [track](const auto& entry) { return entry.second.track == track; });
}

std::multimap<MTime, const Clip*> Object::trackTiming(const Track* track) const
{
    std::multimap<MTime, const Clip*> byStart;
    for (const auto& [clip, timing] : clips) {
        if (timing.track == track)
            byStart.emplace_hint(byStart.end(), timing.timestamp, clip);
    }
    return byStart;
}

MTime Object::trackDuration(const std::multimap<MTime, const Clip*>& timing) const
{
    if (timing.empty())
        return MTime();
    const MTime lastStart = timing.rbegin()->first;
    auto entry = timing.lower_bound(lastStart);
    MTime longest = clipTiming(entry->second).duration;
    while (++entry != timing.end())
        longest = std::max(longest, clipTiming(entry->second).duration);
    return lastStart + longest;
}

MTime Object::trackDuration(const Track* track) const
{
    const ClipTiming* last = nullptr;
    for (const auto& [clip, timing] : clips) {
        if (timing.track != track)
            continue;
        const bool isLater = !last || timing.timestamp > last->timestamp;
        if (isLater || (timing.timestamp == last->timestamp && timing.duration > last->duration))
            last = &timing;
    }
    return last ? last->end() : MTime();
}

// Links

bool Object::isSlave(const Clip* clip) const
{
    return links.find(clip) != links.end();
}

const Clip* Object::masterOf(const Clip* clip) const
{
    const auto found = links.find(clip);
    return found == links.end() ? nullptr : found->second.master;
}

std::set<const Clip*> Object::findSlaves(const Clip* master) const
{
    std::set<const Clip*> slaves;
    for (const auto& [slave, link] : links) {
        if (link.master == master)
            slaves.insert(slaves.end(), slave);
    }
    return slaves;
}

std::deque<const Clip*> Object::clipHeap(const Clip* clip) const
{
    std::deque<const Clip*> heap{clip};
    // One walk serves all clips of a generation: walks are counted by the depth, which is small.
    for (std::size_t next = 0; next != heap.size();) {
        std::map<const Clip*, std::vector<const Clip*>> generation;
        for (std::size_t i = next; i != heap.size(); ++i)
            generation.try_emplace(heap[i]);
        for (const auto& [slave, link] : links) {
            const auto master = generation.find(link.master);
            // Every clip but the first is met as the slave of its one master, so a cycle leads back to the
            // first.
            if (master != generation.end() && slave != clip)
                master->second.push_back(slave);
        }
        for (const std::size_t end = heap.size(); next != end; ++next) {
            const std::vector<const Clip*>& slaves = generation.at(heap[next]);
            heap.insert(heap.end(), slaves.begin(), slaves.end());
        }
    }
    return heap;
}

std::map<const Clip*, std::set<const Clip*>> Object::master2slaves() const
{
    std::map<const Clip*, std::set<const Clip*>> groups;
    for (const auto& [slave, link] : links) {
        std::set<const Clip*>& slaves = groups[link.master];
        slaves.insert(slaves.end(), slave);
    }
    return groups;
}

std::map<const Clip*, std::set<const Clip*>> Object::master2slaves(const Track* track) const
{
    std::map<const Clip*, std::set<const Clip*>> groups;
    for (const auto& [slave, link] : links) {
        const ClipTiming* const timing = link.master ? findTiming(*this, slave) : nullptr;
        if (timing && timing->track == track) {
            std::set<const Clip*>& slaves = groups[link.master];
            slaves.insert(slaves.end(), slave);
        }
    }
    return groups;
}

bool Object::isNativeAudio(const Clip* clip) const
{
    const Track* const track = clipTiming(clip).track;
    return track && track->type == NativeAudioTrack;
}

const Clip* Object::findNativeAudio(const Clip* master) const
{
    for (const auto& [slave, link] : links) {
        if (link.master == master && isNativeAudio(slave))
            return slave;
    }
    return nullptr;
}

bool Object::isDisabledByTrack(const Clip* clip) const
{
    // More than one type, or none, answers false to both.
    const bool hasPicture = clip->isVideoClip() || clip->isOverlayClip();
    if (!hasPicture && !clip->isAudioClip())
        return false;
    const ClipTiming* const timing = findTiming(*this, clip);
    const Track* const track = timing ? timing->track : nullptr;
    if (!track)
        return false;
    if (hasPicture)
        return track->hidden;
    if (track->muted)
        return true;
    if (track->type != NativeAudioTrack)
        return false;
    const Track* const mastersTrack = clipTiming(masterOf(clip)).track;
    return mastersTrack && mastersTrack->muted;
}

} // namespace Timeline
