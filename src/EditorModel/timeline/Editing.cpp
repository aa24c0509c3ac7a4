// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/Object.h>

#include <EditorModel/timeline/Clip.h>
#include <EditorModel/timeline/Track.h>

#include <algorithm>
#include <iterator>

namespace Timeline {
namespace {

const Track* findAudioTrack(const std::deque<const Track*>& tracks, bool linked)
{
    const auto found = std::find_if(tracks.begin(), tracks.end(), [linked](const Track* track) {
        return track->type == AudioTrack && track->linked == linked;
    });
    return found == tracks.end() ? nullptr : *found;
}

} // namespace

bool isMultilevelTrack(TrackType type)
{
    const int others = type & ~(PrimaryTrack | ExtraVideoTrack);
    return others != 0 || type == ExtraVideoTrack;
}

bool isMultilevelTrack(const Track* track)
{
    return isMultilevelTrack(track->type);
}

void displaceTrack(std::deque<const Track*>& tracks, const Track* track, const Track* target)
{
    const auto from = std::find(tracks.begin(), tracks.end(), track);
    const auto to = std::find(tracks.begin(), tracks.end(), target);
    if (from == tracks.end() || to == tracks.end())
        return;
    if (from < to)
        std::rotate(from, std::next(from), std::next(to));
    else
        std::rotate(to, from, std::next(from));
}

// Clips

Object* Object::addClip(const Clip* clip, const ClipTiming& timing)
{
    clips[clip] = timing;
    return this;
}

Object* Object::moveClip(const Clip* clip, const ClipTiming& timing)
{
    return addClip(clip, timing);
}

Object* Object::moveClip(const Clip* clip, MTime timestamp)
{
    clips[clip].setTimestamp(timestamp);
    return this;
}

Object* Object::removeClip(const Clip* clip)
{
    clips.erase(clip);
    return this;
}

Object* Object::clearClips()
{
    clips.clear();
    return this;
}

Object* Object::resizeClipLeft(const Clip* clip, MTime delta)
{
    clips[clip].resizeLeft(delta);
    return this;
}

Object* Object::resizeClipRight(const Clip* clip, MTime delta)
{
    clips[clip].resizeRight(delta);
    return this;
}

Object* Object::reverseClip(const Clip* clip)
{
    clips[clip].reverse();
    return this;
}

Object* Object::setClipDuration(const Clip* clip, MTime duration)
{
    clips[clip].setDuration(duration);
    return this;
}

Object* Object::setClipSourcePosition(const Clip* clip, MTime position)
{
    clips[clip].setSourcePosition(position);
    return this;
}

Object* Object::setClipFadeInDuration(const Clip* clip, MTime duration)
{
    clips[clip].setFadeInDuration(duration);
    return this;
}

Object* Object::setClipFadeOutDuration(const Clip* clip, MTime duration)
{
    clips[clip].setFadeOutDuration(duration);
    return this;
}

Object* Object::setClipTrack(const Clip* clip, const Track* track)
{
    clips[clip].setTrack(track);
    return this;
}

Object* Object::setClipTrackLevel(const Clip* clip, int level)
{
    clips[clip].setTrackLevel(level);
    return this;
}

Object* Object::setClipSpeedCompensated(const Clip* clip, bool on)
{
    clips[clip].setSpeedCompensated(on);
    return this;
}

Object* Object::setClipSpeed(const Clip* clip, double speed)
{
    ClipTiming& timing = clips[clip];
    timing.speedUp(speed / clipSpeed(clip));
    return this;
}

bool Object::canEditTiming(const Clip* clip) const
{
    if (isNativeAudio(clip))
        return false;
    switch (clip->type) {
    case Clip::IntroVideoClip:
    case Clip::IntroAudioClip:
    case Clip::IntroOverlayClip:
        return false;
    default:
        return true;
    }
}

bool Object::canSplit(const Clip* clip, MTime offset) const
{
    if (!canEditTiming(clip))
        return false;
    const ClipTiming& timing = clipTiming(clip);
    const MTime cut = timing.timestamp + offset;
    const MTime earliest = timing.timestamp + timing.transitionIn + Clip::MIN_DURATION;
    const MTime tooLate = timing.end() - timing.transitionOut - Clip::MIN_DURATION;
    return earliest <= cut && cut < tooLate;
}

// Tracks

Object* Object::addTrack(const Track* track)
{
    tracks.push_back(track);
    return this;
}

Object* Object::removeTrack(const Track* track)
{
    tracks.erase(std::remove(tracks.begin(), tracks.end(), track), tracks.end());
    return this;
}

Object* Object::clearTrack(const Track* track)
{
    for (auto entry = clips.begin(); entry != clips.end();) {
        if (entry->second.track == track)
            entry = clips.erase(entry);
        else
            ++entry;
    }
    return this;
}

Object* Object::clearTracks()
{
    tracks.clear();
    return this;
}

bool Object::canMoveTrack(const Track* track, const Track* target) const
{
    return track && target && track != target && track->type == target->type;
}

Object* Object::moveTrack(const Track* track, const Track* target)
{
    if (canMoveTrack(track, target))
        displaceTrack(tracks, track, target);
    return this;
}

const Track* Object::primaryTrack() const
{
    return findFirstTrack(PrimaryTrack);
}

const Track* Object::extraVideoTrack() const
{
    return findFirstTrack(ExtraVideoTrack);
}

const Track* Object::nativeAudioTrack() const
{
    return findFirstTrack(NativeAudioTrack);
}

const Track* Object::titleTrack() const
{
    return findFirstTrack(TitleTrack);
}

const Track* Object::quizTrack() const
{
    return findFirstTrack(QuizTrack);
}

const Track* Object::linkedAudioTrack() const
{
    return findAudioTrack(tracks, true);
}

const Track* Object::detachedAudioTrack() const
{
    return findAudioTrack(tracks, false);
}

// Links

Object* Object::addLink(const Clip* master, const Clip* slave, MTime offset)
{
    links[slave] = Link(master, offset);
    return this;
}

Object* Object::removeLink(const Clip* slave)
{
    links.erase(slave);
    return this;
}

Object* Object::clearLinks()
{
    links.clear();
    return this;
}

} // namespace Timeline
