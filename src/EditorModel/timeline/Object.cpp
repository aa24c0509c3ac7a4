// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/Object.h>

#include <EditorModel/effects/Transition.h>
#include <EditorModel/persistence/Fields.h>
#include <EditorModel/timeline/Clip.h>

#include <utility>

namespace Timeline {

Object::~Object() = default;

/// Written out since a default is free to move a virtual base twice, which is why compilers warn of it. The
/// bases are small: copies of them cost no more than moves.
Object& Object::operator=(Object&& other) noexcept
{
    Serialize::ISerializable::operator=(other);
    PubSub::Object::operator=(other);
    Media::Video::operator=(other);
    Media::Audio::operator=(other);
    scope = other.scope;
    reservedText = std::move(other.reservedText);
    composition = other.composition;
    markerUpdateEnabled = other.markerUpdateEnabled;
    clips = std::move(other.clips);
    links = std::move(other.links);
    trackingLinks = std::move(other.trackingLinks);
    transitions = std::move(other.transitions);
    tracks = std::move(other.tracks);
    exportRanges = std::move(other.exportRanges);
    reservedFirst = other.reservedFirst;
    reservedSecond = other.reservedSecond;
    return *this;
}

Object* Object::addExportRange(const Composition::Range* range)
{
    exportRanges.insert(range);
    return this;
}

Object* Object::removeExportRange(const Composition::Range* range)
{
    exportRanges.erase(range);
    return this;
}

Object* Object::setScope(Scope newScope)
{
    scope = newScope;
    return this;
}

Object* Object::setMarkerUpdateEnabled(bool on)
{
    markerUpdateEnabled = on;
    return this;
}

Object* Object::setComposition(const Composition::Object* newComposition)
{
    composition = newComposition;
    return this;
}

void fields(Serialize::Fields& f, Object& timeline)
{
    f.base<Media::Video>("Video", timeline).base<Media::Audio>("Audio", timeline);
    f("tracks", timeline.tracks)("clips", timeline.clips)("links", timeline.links);
    f("trackingLinks", timeline.trackingLinks)("transitions", timeline.transitions);
}

} // namespace Timeline

EDITORMODEL_PERSISTENT_CLASS(Timeline::Object, Media::Video, Media::Audio)
