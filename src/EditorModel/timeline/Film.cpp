// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/Film.h>

#include <EditorModel/effects/Transition.h>
#include <EditorModel/persistence/Fields.h>
#include <EditorModel/timeline/Clip.h>
#include <EditorModel/timeline/Object.h>

#include <algorithm>
#include <utility>

namespace Film {
namespace {

template <class Node>
const Node* rootIn(const Object& film, const Node* node)
{
    while (const Node* const master = film.masterOf(node))
        node = master;
    return node;
}

} // namespace

const MTime Object::MIN_DURATION = 5000;

Object::~Object() = default;

Object* Object::bindTimeline(const Timeline::Object* master, const Timeline::Object* slave)
{
    timelineBindings[master] = slave;
    return this;
}

Object* Object::bindClip(const Timeline::Clip* master, const Timeline::Clip* slave)
{
    clipBindings[slave] = master;
    return this;
}

Object* Object::unbind(const Timeline::Object* master)
{
    timelineBindings.erase(master);
    return this;
}

Object* Object::unbind(const Timeline::Clip* slave)
{
    clipBindings.erase(slave);
    return this;
}

Object* Object::removeTree(const Timeline::Clip* master)
{
    for (const Timeline::Clip* slave : slavesOf(master))
        unbind(slave);
    return this;
}

const Timeline::Object* Object::slaveOf(const Timeline::Object* master) const
{
    const auto binding = timelineBindings.find(master);
    return binding != timelineBindings.end() ? binding->second : nullptr;
}

const Timeline::Object* Object::masterOf(const Timeline::Object* slave) const
{
    const auto binding = std::find_if(timelineBindings.begin(), timelineBindings.end(),
                                      [&](const auto& entry) { return entry.second == slave; });
    return binding != timelineBindings.end() ? binding->first : nullptr;
}

const Timeline::Clip* Object::masterOf(const Timeline::Clip* slave) const
{
    const auto binding = clipBindings.find(slave);
    return binding != clipBindings.end() ? binding->second : nullptr;
}

std::set<const Timeline::Clip*> Object::slavesOf(const Timeline::Clip* master) const
{
    std::set<const Timeline::Clip*> slaves;
    for (const auto& [slave, itsMaster] : clipBindings) {
        if (itsMaster == master)
            slaves.insert(slaves.end(), slave);
    }
    return slaves;
}

const Timeline::Object* Object::rootOf(const Timeline::Object* timeline) const
{
    return rootIn(*this, timeline);
}

const Timeline::Clip* Object::rootOf(const Timeline::Clip* clip) const
{
    return rootIn(*this, clip);
}

Object* Object::setExpectedDuration(MTime duration)
{
    expectedDuration = duration;
    return this;
}

Object* Object::setFitDurationToAudio(bool on)
{
    fitDurationToAudio = on;
    return this;
}

Object* Object::setCropMode(bool on)
{
    cropMode = on;
    return this;
}

Object* Object::setNativeAudioVolume(int volume)
{
    nativeAudioVolume = volume;
    return this;
}

Object* Object::setDetachedAudioVolume(int volume)
{
    detachedAudioVolume = volume;
    return this;
}

Object* Object::setTransitionsList(std::deque<const Transition::Object*> transitions)
{
    transitionsList = std::move(transitions);
    return this;
}

Object* Object::setStartTitlesEnabled(bool on)
{
    startTitlesEnabled = on;
    return this;
}

Object* Object::setFinalTitlesEnabled(bool on)
{
    finalTitlesEnabled = on;
    return this;
}

Object* Object::setStartTitles(Overlay::Preset* titles)
{
    startTitles = titles;
    return this;
}

Object* Object::setFinalTitles(Overlay::Preset* titles)
{
    finalTitles = titles;
    return this;
}

Object* Object::setBackground(const Media::File* file)
{
    background = file;
    return this;
}

void fields(Serialize::Fields& f, Object& film)
{
    f("timelineBindings", film.timelineBindings)("clipBindings", film.clipBindings);
    f("expectedDuration", film.expectedDuration);
    f("nativeAudioVolume", film.nativeAudioVolume)("detachedAudioVolume", film.detachedAudioVolume);
    f("fitDurationToAudio", film.fitDurationToAudio)("cropMode", film.cropMode);
    f("transitionsList", film.transitionsList);
}

} // namespace Film

EDITORMODEL_PERSISTENT_CLASS(Film::Object)
