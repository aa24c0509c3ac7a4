// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/Messages.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>

namespace EditorCollection {
class UserObject;
}
namespace ResourceTable {
class Object;
}
namespace Timeline {
struct Object;
}

namespace Project {

/// The root of a saved project. It owns nothing: copies name the same objects, and after a load whoever
/// loaded owns them.
class EDITORMODEL_EXPORT Content : public virtual Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Content)

public:
    Timeline::Object* timeline = nullptr;
    /// The user's items in this project.
    EditorCollection::UserObject* userCollection = nullptr;
    /// The resources that the project uses.
    ResourceTable::Object* resourceTable = nullptr;
    /// Saved together with its files, to be taken elsewhere.
    bool portable = false;

    Content() = default;
    Content(const Content&) = default;
    Content& operator=(const Content&) = default;
    ~Content() override;

    /// The same three objects, by address; `portable` isn't compared.
    bool operator==(const Content& other) const;
    bool operator!=(const Content& other) const;
};

} // namespace Project

/// By these the application tells that a project was read or written, so that modules can read or write what
/// they keep beside it. The model publishes neither. The contexts are the application's own types: modules
/// subscribe to all of them.
namespace ProjectExtraInfo {

class LoadContext;
class SaveContext;

/// A project was read. The sender is the application's context.
class EDITORMODEL_EXPORT ProjectContentLoaded : public Message::Types::Notification<LoadContext>
{
public:
    using Notification::Notification;
    ProjectContentLoaded(const ProjectContentLoaded&) = default;
    ProjectContentLoaded& operator=(const ProjectContentLoaded&) = default;
    ~ProjectContentLoaded() override;
};

/// A project was written. The sender is the application's context.
class EDITORMODEL_EXPORT ProjectContentSaved : public Message::Types::Notification<SaveContext>
{
public:
    using Notification::Notification;
    ProjectContentSaved(const ProjectContentSaved&) = default;
    ProjectContentSaved& operator=(const ProjectContentSaved&) = default;
    ~ProjectContentSaved() override;
};

} // namespace ProjectExtraInfo

EDITORMODEL_ARCHIVE_NAME(Project::Content, "Project::Content")
