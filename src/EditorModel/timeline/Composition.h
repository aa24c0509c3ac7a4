// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/types/MTime.h>
#include <EditorModel/types/Range.h>

#include <set>

namespace Media {
class Audio;
class Video;
} // namespace Media

/// The outline of a media object: its markers, its ranges, and its streams of pictures and sound. Nothing of
/// it is stored, and nothing in it owns what it points at.
namespace Composition {

struct Object;

/// What markers and ranges have in common.
struct EDITORMODEL_EXPORT Child : public virtual PubSub::Object
{
    /// The composition that it belongs to, or null. Adding it there doesn't set this.
    const Composition::Object* parent = nullptr;

    Child() = default;
    Child(const Child&) = default;
    Child& operator=(const Child&) = default;
    ~Child() override;
};

/// A position in the media object.
struct EDITORMODEL_EXPORT Marker : public Child
{
    MTime position;
    /// Not read by the model.
    bool user = false;

    Marker() = default;
    Marker(const Marker&) = default;
    Marker& operator=(const Marker&) = default;
    ~Marker() override;

    Marker* setPosition(MTime newPosition);
    Marker* setUser(bool on);
};

/// A half-open span [from, to) on a level. It has no parent until it is given one.
struct EDITORMODEL_EXPORT Range : public Child, public Types::Range
{
    /// Compared, and otherwise not read by the model, as `zValue`.
    int level = 0;
    int zValue = 0;

    /// From 0 to -1: empty.
    Range() = default;
    Range(MTime from_, MTime to_, int level_, int zValue_);
    Range(const Range&) = default;
    Range& operator=(const Range&) = default;
    ~Range() override;

    Range* setParent(const Composition::Object* newParent);
    Range* setFrom(MTime time);
    Range* setTo(MTime time);
    Range* setRange(MTime newFrom, MTime newTo);
    Range* setLevel(int newLevel);
    Range* setZValue(int newValue);
};

/// All but the parents is compared.
EDITORMODEL_EXPORT bool operator==(const Range& a, const Range& b);
EDITORMODEL_EXPORT bool operator!=(const Range& a, const Range& b);
/// By `from`, `to`, `level` and `zValue`, in this order.
EDITORMODEL_EXPORT bool operator<(const Range& a, const Range& b);

/// The outline, with the current one of each kind. Every operation that changes it returns it, for chains.
struct EDITORMODEL_EXPORT Object : public virtual PubSub::Object
{
    std::set<const Composition::Marker*> markers;
    std::set<const Composition::Range*> ranges;
    std::set<const Media::Video*> videos;
    std::set<const Media::Audio*> audios;

    /// The current one of each kind, or null. It need not be in the set.
    const Composition::Marker* marker = nullptr;
    const Composition::Range* range = nullptr;
    const Media::Video* video = nullptr;
    const Media::Audio* audio = nullptr;

    Object() = default;
    Object(const Object&) = default;
    Object& operator=(const Object&) = default;
    ~Object() override;

    Object* add(const Composition::Marker* newMarker);
    Object* add(const Composition::Range* newRange);
    Object* add(const Media::Video* newVideo);
    Object* add(const Media::Audio* newAudio);

    /// Takes it out of its set; the current one stays, even if it is this.
    Object* remove(const Composition::Marker* oldMarker);
    Object* remove(const Composition::Range* oldRange);
    Object* remove(const Media::Video* oldVideo);
    Object* remove(const Media::Audio* oldAudio);

    /// Makes it the current one of its kind; its set stays.
    Object* change(const Composition::Marker* newMarker);
    Object* change(const Composition::Range* newRange);
    Object* change(const Media::Video* newVideo);
    Object* change(const Media::Audio* newAudio);

    /// The same as change().
    Object* setMarker(const Composition::Marker* newMarker);
    Object* setRange(const Composition::Range* newRange);
    Object* setVideo(const Media::Video* newVideo);
    Object* setAudio(const Media::Audio* newAudio);

    /// The current one of the kind stays.
    Object* setMarkers(const std::set<const Composition::Marker*>& newMarkers);
    Object* setRanges(const std::set<const Composition::Range*>& newRanges);
    Object* setVideos(const std::set<const Media::Video*>& newVideos);
    Object* setAudios(const std::set<const Media::Audio*>& newAudios);
};

} // namespace Composition
