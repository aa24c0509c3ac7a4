// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/PackageStorage.h>

#include <EditorModel/persistence/Fields.h>

namespace Package {

void fields(Serialize::Fields& f, StorageItem& item)
{
    f("collection2tags", item.collection2tags)("collection2categories", item.collection2categories);
}

void fields(Serialize::Fields& f, Storage& storage)
{
    f("package2storage", storage.package2storage);
}

} // namespace Package

EDITORMODEL_PERSISTENT_CLASS(Package::StorageItem)
EDITORMODEL_PERSISTENT_CLASS(Package::Storage)
