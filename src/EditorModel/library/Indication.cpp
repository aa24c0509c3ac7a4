// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/Indication.h>

#include <EditorModel/persistence/Fields.h>

#include <utility>

namespace Indication {

Object::~Object() = default;

Indication::Object& Object::setId(const QString& newId)
{
    id = newId;
    return *this;
}

bool Object::isFavorite(const QString& item) const
{
    return favoriteItems.count(item) != 0;
}

Indication::Object& Object::setFavorite(const QString& item, bool on)
{
    if (on)
        favoriteItems.insert(item);
    else
        favoriteItems.erase(item);
    return *this;
}

bool Object::isNew(const QString& item) const
{
    return newItems.count(item) != 0;
}

Indication::Object& Object::setNew(const QString& item, bool on)
{
    if (on) {
        newItems.insert(item);
        knownItems.erase(item);
    } else if (auto node = newItems.extract(item)) {
        // The mark moves with its node: `item` may be the text in it.
        knownItems.insert(std::move(node));
    }
    return *this;
}

void fields(Serialize::Fields& f, Object& marks)
{
    f("id", marks.id)("favoriteItems", marks.favoriteItems);
    f("newItems", marks.newItems)("knownItems", marks.knownItems);
}

} // namespace Indication

EDITORMODEL_PERSISTENT_CLASS(Indication::Object)
