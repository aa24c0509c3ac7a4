// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/MTime.h>

#include <QString>
#include <QtGlobal>

#include <map>
#include <set>

// What the editing surface is doing, for the modules around it. These are plain records: nothing that their
// pointers name is owned, and every operation that changes one returns it, for chains.

namespace Media {
class File;
}
namespace Timeline {
struct Clip;
struct Object;
} // namespace Timeline

namespace Editor {

/// What is being edited.
struct EDITORMODEL_EXPORT Object : public virtual Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Object)

public:
    /// Not stored.
    const Timeline::Object* timeline = nullptr;
    /// Two further objects that an editor in use has; what they are, the modules agree on. Not stored.
    const PubSub::Object* reservedFirst = nullptr;
    const PubSub::Object* reservedSecond = nullptr;
    bool enabled = true;
    std::set<const Timeline::Clip*> clips;

    Object() = default;
    Object(const Object&) = default;
    Object(Object&&) = default;
    Object& operator=(const Object&) = default;
    Object& operator=(Object&&) = default;
    ~Object() override;

    Object* setTimeline(const Timeline::Object* newTimeline);
    Object* setClips(const std::set<const Timeline::Clip*>& newClips);
    Object* setEnabled(bool on);
    Object* enable();
    Object* disable();

    /// The editor is enabled and has a clip.
    bool canEdit() const;
    /// The timeline and both further objects are set.
    bool isValid() const;
};

} // namespace Editor

EDITORMODEL_ARCHIVE_NAME(Editor::Object, "Editor::Object")

namespace Ruler {

/// What the ruler of times shows.
struct EDITORMODEL_EXPORT Object : public virtual PubSub::Object
{
    const Timeline::Object* timeline = nullptr;
    /// By their times; what the value tells of a beat is a matter of the modules.
    std::map<MTime, bool> beats;

    Object() = default;
    Object(const Object&) = default;
    Object(Object&&) = default;
    Object& operator=(const Object&) = default;
    Object& operator=(Object&&) = default;
    ~Object() override;

    Object* setTimeline(const Timeline::Object* newTimeline);
    Object* setBeats(const std::map<MTime, bool>& newBeats);
};

} // namespace Ruler

namespace FastTrack {

/// Defined by whichever modules vote; only the addresses of their objects count.
class Suppressor;
class Freezer;

/// A set of files, and a switch that others can hold back. Votes are counted by object: whoever votes twice
/// withdraws once, and a state ends when the last voter has withdrawn.
struct EDITORMODEL_EXPORT Object : public virtual PubSub::Object
{
    std::set<const Media::File*> files;
    /// Not read by the model.
    qint64 reservedWord = 0;
    QString contentPath;
    bool enabled = false;
    /// Not read by the model.
    bool reservedFlag = false;
    std::set<const FastTrack::Suppressor*> suppressors;
    std::set<const FastTrack::Freezer*> freezers;

    Object() = default;
    Object(const Object&) = default;
    Object(Object&&) = default;
    Object& operator=(const Object&) = default;
    Object& operator=(Object&&) = default;
    ~Object() override;

    Object* addFile(const Media::File* file);
    Object* removeFile(const Media::File* file);
    Object* setFiles(std::set<const Media::File*> newFiles);
    Object* setContentPath(const QString& path);
    Object* setEnabled(bool on);

    Object* suppress(const FastTrack::Suppressor* suppressor);
    Object* unsuppress(const FastTrack::Suppressor* suppressor);
    Object* freeze(const FastTrack::Freezer* freezer);
    Object* unfreeze(const FastTrack::Freezer* freezer);

    /// Enabled, and suppressed by nobody.
    bool active() const;
    /// Held by a freezer, be it active or not.
    bool freezed() const;
};

} // namespace FastTrack
