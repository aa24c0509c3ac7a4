// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>

#include <deque>

namespace Import {
class Object;
}

namespace EditorCollection {

/// The user's own list of imported items, in the order in which they came. It owns none of them.
class EDITORMODEL_EXPORT UserObject : public virtual Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(UserObject)

public:
    std::deque<const Import::Object*> items;

    UserObject() = default;
    UserObject(const UserObject&) = default;
    UserObject(UserObject&&) = default;
    UserObject& operator=(const UserObject&) = default;
    UserObject& operator=(UserObject&&) = default;
    ~UserObject() override;

    /// Appends, also what is listed already.
    PubSub::Object* addItem(const Import::Object* item);
    /// Takes out the first occurrence. What isn't listed is an error of the caller, and changes nothing.
    PubSub::Object* removeItem(const Import::Object* item);
    PubSub::Object* clear();
    PubSub::Object* setItems(std::deque<const Import::Object*> newItems);

    /// The same objects, by address, in the same order.
    bool operator==(const UserObject& other) const;
    bool operator!=(const UserObject& other) const;
};

} // namespace EditorCollection

EDITORMODEL_ARCHIVE_NAME(EditorCollection::UserObject, "EditorCollection::UserObject")
