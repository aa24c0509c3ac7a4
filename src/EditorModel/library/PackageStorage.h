// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>

#include <QString>

#include <map>
#include <set>

namespace Package {

/// What one package has put where.
class EDITORMODEL_EXPORT StorageItem : public virtual PubSub::Object, public virtual Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(StorageItem)

public:
    std::map<QString, std::set<QString>> collection2tags;
    std::map<QString, std::set<QString>> collection2categories;
};

/// What all packages have put where. Whoever fills the collections keeps it.
class EDITORMODEL_EXPORT Storage : public virtual PubSub::Object, public virtual Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Storage)

public:
    std::map<QString, StorageItem> package2storage;
};

} // namespace Package

EDITORMODEL_ARCHIVE_NAME(Package::StorageItem, "Package::StorageItem")
EDITORMODEL_ARCHIVE_NAME(Package::Storage, "Package::Storage")
