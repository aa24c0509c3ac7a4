// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/Editor.h>

#include <EditorModel/persistence/Fields.h>
#include <EditorModel/timeline/Clip.h>

#include <utility>

namespace Editor {

Object::~Object() = default;

Object* Object::setTimeline(const Timeline::Object* newTimeline)
{
    timeline = newTimeline;
    return this;
}

Object* Object::setClips(const std::set<const Timeline::Clip*>& newClips)
{
    clips = newClips;
    return this;
}

Object* Object::setEnabled(bool on)
{
    enabled = on;
    return this;
}

Object* Object::enable()
{
    return setEnabled(true);
}

Object* Object::disable()
{
    return setEnabled(false);
}

bool Object::canEdit() const
{
    return enabled && !clips.empty();
}

bool Object::isValid() const
{
    return timeline && reservedFirst && reservedSecond;
}

void fields(Serialize::Fields& f, Object& editor)
{
    f("enabled", editor.enabled)("clips", editor.clips);
}

} // namespace Editor

EDITORMODEL_PERSISTENT_CLASS(Editor::Object)

namespace Ruler {

Object::~Object() = default;

Object* Object::setTimeline(const Timeline::Object* newTimeline)
{
    timeline = newTimeline;
    return this;
}

Object* Object::setBeats(const std::map<MTime, bool>& newBeats)
{
    beats = newBeats;
    return this;
}

} // namespace Ruler

namespace FastTrack {

Object::~Object() = default;

Object* Object::addFile(const Media::File* file)
{
    files.insert(file);
    return this;
}

Object* Object::removeFile(const Media::File* file)
{
    files.erase(file);
    return this;
}

Object* Object::setFiles(std::set<const Media::File*> newFiles)
{
    files = std::move(newFiles);
    return this;
}

Object* Object::setContentPath(const QString& path)
{
    contentPath = path;
    return this;
}

Object* Object::setEnabled(bool on)
{
    enabled = on;
    return this;
}

Object* Object::suppress(const FastTrack::Suppressor* suppressor)
{
    suppressors.insert(suppressor);
    return this;
}

Object* Object::unsuppress(const FastTrack::Suppressor* suppressor)
{
    suppressors.erase(suppressor);
    return this;
}

Object* Object::freeze(const FastTrack::Freezer* freezer)
{
    freezers.insert(freezer);
    return this;
}

Object* Object::unfreeze(const FastTrack::Freezer* freezer)
{
    freezers.erase(freezer);
    return this;
}

bool Object::active() const
{
    return enabled && suppressors.empty();
}

bool Object::freezed() const
{
    return !freezers.empty();
}

} // namespace FastTrack
