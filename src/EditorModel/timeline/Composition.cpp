// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/Composition.h>

#include <tuple>

namespace Composition {
namespace {

auto orderOf(const Range& range)
{
    return std::tie(range.from, range.to, range.level, range.zValue);
}

} // namespace

Child::~Child() = default;
Marker::~Marker() = default;
Range::~Range() = default;
Object::~Object() = default;

Marker* Marker::setPosition(MTime newPosition)
{
    position = newPosition;
    return this;
}

Marker* Marker::setUser(bool on)
{
    user = on;
    return this;
}

Range::Range(MTime from_, MTime to_, int level_, int zValue_)
    : Types::Range(from_, to_), level(level_), zValue(zValue_)
{}

Range* Range::setParent(const Composition::Object* newParent)
{
    parent = newParent;
    return this;
}

Range* Range::setFrom(MTime time)
{
    from = time;
    return this;
}

Range* Range::setTo(MTime time)
{
    to = time;
    return this;
}

Range* Range::setRange(MTime newFrom, MTime newTo)
{
    return setFrom(newFrom)->setTo(newTo);
}

Range* Range::setLevel(int newLevel)
{
    level = newLevel;
    return this;
}

Range* Range::setZValue(int newValue)
{
    zValue = newValue;
    return this;
}

bool operator==(const Range& a, const Range& b)
{
    return orderOf(a) == orderOf(b);
}

bool operator!=(const Range& a, const Range& b)
{
    return !(a == b);
}

bool operator<(const Range& a, const Range& b)
{
    return orderOf(a) < orderOf(b);
}

Object* Object::add(const Composition::Marker* newMarker)
{
    markers.insert(newMarker);
    return this;
}

Object* Object::add(const Composition::Range* newRange)
{
    ranges.insert(newRange);
    return this;
}

Object* Object::add(const Media::Video* newVideo)
{
    videos.insert(newVideo);
    return this;
}

Object* Object::add(const Media::Audio* newAudio)
{
    audios.insert(newAudio);
    return this;
}

Object* Object::remove(const Composition::Marker* oldMarker)
{
    markers.erase(oldMarker);
    return this;
}

Object* Object::remove(const Composition::Range* oldRange)
{
    ranges.erase(oldRange);
    return this;
}

Object* Object::remove(const Media::Video* oldVideo)
{
    videos.erase(oldVideo);
    return this;
}

Object* Object::remove(const Media::Audio* oldAudio)
{
    audios.erase(oldAudio);
    return this;
}

Object* Object::change(const Composition::Marker* newMarker)
{
    marker = newMarker;
    return this;
}

Object* Object::change(const Composition::Range* newRange)
{
    range = newRange;
    return this;
}

Object* Object::change(const Media::Video* newVideo)
{
    video = newVideo;
    return this;
}

Object* Object::change(const Media::Audio* newAudio)
{
    audio = newAudio;
    return this;
}

Object* Object::setMarker(const Composition::Marker* newMarker)
{
    return change(newMarker);
}

Object* Object::setRange(const Composition::Range* newRange)
{
    return change(newRange);
}

Object* Object::setVideo(const Media::Video* newVideo)
{
    return change(newVideo);
}

Object* Object::setAudio(const Media::Audio* newAudio)
{
    return change(newAudio);
}

Object* Object::setMarkers(const std::set<const Composition::Marker*>& newMarkers)
{
    markers = newMarkers;
    return this;
}

Object* Object::setRanges(const std::set<const Composition::Range*>& newRanges)
{
    ranges = newRanges;
    return this;
}

Object* Object::setVideos(const std::set<const Media::Video*>& newVideos)
{
    videos = newVideos;
    return this;
}

Object* Object::setAudios(const std::set<const Media::Audio*>& newAudios)
{
    audios = newAudios;
    return this;
}

} // namespace Composition
