// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/MTime.h>

#include <deque>
#include <map>
#include <set>

namespace Media {
class File;
}
namespace Overlay {
class Preset;
}
namespace Timeline {
struct Clip;
struct Object;
} // namespace Timeline
namespace Transition {
class Object;
}

namespace Film {

/// A film: a timeline that is derived from others, and the settings that it is made with. Derived timelines
/// and clips are slaves, and what they come from are their masters. Making the film is the business of the
/// module that drives it.
///
/// Nothing that the pointers name is owned. Every operation that changes the film returns it, for chains; a
/// timeline or clip that isn't bound changes nothing.
struct EDITORMODEL_EXPORT Object : public virtual Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Object)

public:
    /// 5000 ms, the shortest that a film is to be. The film itself doesn't enforce it.
    static const MTime MIN_DURATION;

    /// From master to slave: a master has one slave.
    std::map<const Timeline::Object*, const Timeline::Object*> timelineBindings;
    /// The other way round, from slave to master: a slave has one master, and a master many slaves.
    std::map<const Timeline::Clip*, const Timeline::Clip*> clipBindings;
    MTime expectedDuration = MIN_DURATION;
    bool fitDurationToAudio = false;
    /// What it selects, and the unit of the volumes, are a matter of whoever makes the film.
    bool cropMode = false;
    int nativeAudioVolume = 0;
    int detachedAudioVolume = 0;
    std::deque<const Transition::Object*> transitionsList;
    /// This and all that follows is not stored.
    bool startTitlesEnabled = false;
    bool finalTitlesEnabled = false;
    Overlay::Preset* startTitles = nullptr;
    Overlay::Preset* finalTitles = nullptr;
    const Media::File* background = nullptr;

    Object() = default;
    Object(const Object&) = default;
    Object(Object&&) = default;
    Object& operator=(const Object&) = default;
    Object& operator=(Object&&) = default;
    ~Object() override;

    /// An earlier slave of the master is no longer bound.
    Object* bindTimeline(const Timeline::Object* master, const Timeline::Object* slave);
    /// An earlier master of the slave is forgotten. Bindings must not close a circle: see rootOf().
    Object* bindClip(const Timeline::Clip* master, const Timeline::Clip* slave);
    /// Takes the master, not the slave, as bindTimeline() leaves only that to be found.
    Object* unbind(const Timeline::Object* master);
    Object* unbind(const Timeline::Clip* slave);
    /// Unbinds the slaves of the clip. These keep their own slaves, and the clip its master.
    Object* removeTree(const Timeline::Clip* master);

    /// Null for a timeline that isn't a master.
    const Timeline::Object* slaveOf(const Timeline::Object* master) const;
    /// The first by address where several timelines have this slave; null where none has.
    const Timeline::Object* masterOf(const Timeline::Object* slave) const;
    /// Null for a clip without a master.
    const Timeline::Clip* masterOf(const Timeline::Clip* slave) const;
    std::set<const Timeline::Clip*> slavesOf(const Timeline::Clip* master) const;
    /// Goes from master to master as masterOf() gives them, and returns the last one: the timeline or clip
    /// itself where it has none. Doesn't return where the bindings form a circle.
    const Timeline::Object* rootOf(const Timeline::Object* timeline) const;
    const Timeline::Clip* rootOf(const Timeline::Clip* clip) const;

    Object* setExpectedDuration(MTime duration);
    Object* setFitDurationToAudio(bool on);
    Object* setCropMode(bool on);
    Object* setNativeAudioVolume(int volume);
    Object* setDetachedAudioVolume(int volume);
    Object* setTransitionsList(std::deque<const Transition::Object*> transitions);
    Object* setStartTitlesEnabled(bool on);
    Object* setFinalTitlesEnabled(bool on);
    Object* setStartTitles(Overlay::Preset* titles);
    Object* setFinalTitles(Overlay::Preset* titles);
    Object* setBackground(const Media::File* file);
};

} // namespace Film

EDITORMODEL_ARCHIVE_NAME(Film::Object, "Film::Object")
