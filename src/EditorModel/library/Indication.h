// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/library/CollectionIds.h>
#include <EditorModel/persistence/Persistent.h>

#include <QString>

#include <set>

namespace Indication {

/// The marks on the items of one collection. Items go by the texts that the modules know them by.
class EDITORMODEL_EXPORT Object : public virtual Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Object)

public:
    /// Whose marks these are, a collection's or one of IndicationID; the model never reads it.
    QString id;
    std::set<QString> favoriteItems;
    std::set<QString> newItems;
    /// Those that have been new and are so no longer.
    std::set<QString> knownItems;

    Object() = default;
    Object(const Object&) = default;
    Object(Object&&) = default;
    Object& operator=(const Object&) = default;
    Object& operator=(Object&&) = default;
    ~Object() override;

    Indication::Object& setId(const QString& newId);

    bool isFavorite(const QString& item) const;
    Indication::Object& setFavorite(const QString& item, bool on);

    bool isNew(const QString& item) const;
    /// An item that becomes new is no longer known. One that ceases to be new becomes known; where it wasn't
    /// new, nothing happens.
    Indication::Object& setNew(const QString& item, bool on);
};

} // namespace Indication

EDITORMODEL_ARCHIVE_NAME(Indication::Object, "Indication::Object")
