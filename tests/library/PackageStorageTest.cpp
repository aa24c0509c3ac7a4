// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/library/PackageStorage.h>

#include <gmock/gmock.h>

namespace {

using Package::Storage;
using Package::StorageItem;
using testing::ElementsAre;
using Testing::FieldText;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, StorageItem>);
static_assert(Testing::isVirtualBase<PubSub::Object, StorageItem>);
static_assert(Testing::isVirtualBase<Serialize::ISerializable, Storage>);
static_assert(Testing::isVirtualBase<PubSub::Object, Storage>);

StorageItem fullItem()
{
    StorageItem item;
    item.collection2tags = {{"titles", {"Rain", "Sun"}}, {"transitions", {}}};
    item.collection2categories = {{"titles", {"Weather"}}};
    return item;
}

const std::string tagsText = "\n  2 items"
                             "\n  item 1"
                             "\n    first: Q\"titles\""
                             "\n    second:"
                             "\n      2 items"
                             "\n      item 1"
                             "\n      item: Q\"Rain\""
                             "\n      item 2"
                             "\n      item: Q\"Sun\""
                             "\n  item 2"
                             "\n    first: Q\"transitions\""
                             "\n    second:"
                             "\n      0 items";
const std::string categoriesText = "\n  1 items"
                                   "\n  item 1"
                                   "\n    first: Q\"titles\""
                                   "\n    second:"
                                   "\n      1 items"
                                   "\n      item 1"
                                   "\n      item: Q\"Weather\"";

TEST(PackageStorageItem, IsWrittenWithItsTagsFirst)
{
    EXPECT_THAT(Testing::fieldTexts(fullItem()),
                ElementsAre(FieldText("collection2tags", tagsText),
                            FieldText("collection2categories", categoriesText)));
}

TEST(PackageStorageItem, IsMadeByName)
{
    Testing::expectMadeByName<StorageItem>("Package::StorageItem");
}

TEST(PackageStorage, IsWrittenWithAnItemForEachPackage)
{
    Storage storage;
    storage.package2storage["weather"].collection2categories = {{"titles", {"Rain"}}};
    storage.package2storage["empty"];
    EXPECT_THAT(Testing::fieldTexts(storage),
                ElementsAre(FieldText("package2storage", "\n  2 items"
                                                         "\n  item 1"
                                                         "\n    first: Q\"empty\""
                                                         "\n    second: Package::StorageItem"
                                                         "\n      collection2tags:"
                                                         "\n        0 items"
                                                         "\n      collection2categories:"
                                                         "\n        0 items"
                                                         "\n  item 2"
                                                         "\n    first: Q\"weather\""
                                                         "\n    second: Package::StorageItem"
                                                         "\n      collection2tags:"
                                                         "\n        0 items"
                                                         "\n      collection2categories:"
                                                         "\n        1 items"
                                                         "\n        item 1"
                                                         "\n          first: Q\"titles\""
                                                         "\n          second:"
                                                         "\n            1 items"
                                                         "\n            item 1"
                                                         "\n            item: Q\"Rain\"")));
}

TEST(PackageStorage, IsMadeByName)
{
    Testing::expectMadeByName<Storage>("Package::Storage");
}

} // namespace
