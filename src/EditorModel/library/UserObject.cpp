// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/UserObject.h>

#include <EditorModel/library/ImportObject.h>
#include <EditorModel/persistence/Fields.h>

#include <algorithm>
#include <utility>

namespace EditorCollection {

UserObject::~UserObject() = default;

PubSub::Object* UserObject::addItem(const Import::Object* item)
{
    items.push_back(item);
    return this;
}

PubSub::Object* UserObject::removeItem(const Import::Object* item)
{
    const auto place = std::find(items.begin(), items.end(), item);
    if (place != items.end())
        items.erase(place);
    return this;
}

PubSub::Object* UserObject::clear()
{
    items.clear();
    return this;
}

PubSub::Object* UserObject::setItems(std::deque<const Import::Object*> newItems)
{
    items = std::move(newItems);
    return this;
}

bool UserObject::operator==(const UserObject& other) const
{
    return items == other.items;
}

bool UserObject::operator!=(const UserObject& other) const
{
    return !(*this == other);
}

void fields(Serialize::Fields& f, UserObject& collection)
{
    f("items", collection.items);
}

} // namespace EditorCollection

EDITORMODEL_PERSISTENT_CLASS(EditorCollection::UserObject)
