// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/library/EditorCollection.h>
#include <EditorModel/library/ImportObject.h>

#include <gmock/gmock.h>

#include <type_traits>
#include <utility>

namespace {

using EditorCollection::UserObject;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, UserObject>);
static_assert(Testing::isVirtualBase<PubSub::Object, UserObject>);
static_assert(std::is_same_v<decltype(std::declval<UserObject>().addItem(nullptr)), PubSub::Object*>);
static_assert(Testing::isVirtualBase<PubSub::Object, EditorCollection::Object>);
static_assert(std::is_same_v<decltype(EditorCollection::globalObject()), const EditorCollection::Object*>);

class UserCollection : public ::testing::Test
{
protected:
    Import::Object a;
    Import::Object b;
    Import::Object c;
    UserObject collection;
};

TEST_F(UserCollection, IsMadeByItsName)
{
    Testing::expectMadeByName<UserObject>("EditorCollection::UserObject");
}

TEST_F(UserCollection, WritesItsItemsAlone)
{
    EXPECT_THAT(Testing::fieldKeys(collection), ElementsAre("items"));
}

TEST_F(UserCollection, OperationsReturnTheCollectionAsAnObjectOfTheBus)
{
    const PubSub::Object* const object = &collection;
    EXPECT_EQ(collection.addItem(&a), object);
    EXPECT_EQ(collection.removeItem(&a), object);
    EXPECT_EQ(collection.setItems({}), object);
    EXPECT_EQ(collection.clear(), object);
}

TEST_F(UserCollection, ItemsAreAppended)
{
    collection.addItem(&b);
    collection.addItem(&a);
    EXPECT_THAT(collection.items, ElementsAre(&b, &a));
}

TEST_F(UserCollection, AnItemThatCameTwiceGoesOnce)
{
    collection.addItem(&a);
    collection.addItem(&b);
    collection.addItem(&a);
    EXPECT_THAT(collection.items, ElementsAre(&a, &b, &a));
    collection.removeItem(&a);
    EXPECT_THAT(collection.items, ElementsAre(&b, &a));
    collection.removeItem(&a);
    EXPECT_THAT(collection.items, ElementsAre(&b));
}

TEST_F(UserCollection, AnItemThatIsNotListedTakesNoOtherWithIt)
{
    collection.items = {&a, &b};
    collection.removeItem(&c);
    EXPECT_THAT(collection.items, ElementsAre(&a, &b));
}

TEST_F(UserCollection, ClearingLeavesNoItem)
{
    collection.items = {&a, &a, &b};
    collection.clear();
    EXPECT_THAT(collection.items, IsEmpty());
}

TEST_F(UserCollection, AListReplacesTheOldOne)
{
    collection.items = {&a};
    const std::deque<const Import::Object*> list = {&c, &b, &c};
    collection.setItems(list);
    EXPECT_THAT(collection.items, ElementsAre(&c, &b, &c));
    EXPECT_THAT(list, ElementsAre(&c, &b, &c));
}

TEST_F(UserCollection, AListThatIsGivenAwayIsTakenOver)
{
    std::deque<const Import::Object*> taken = {&c, &b};
    const auto* const first = &taken.front();
    collection.setItems(std::move(taken));
    EXPECT_EQ(&collection.items.front(), first);
}

TEST_F(UserCollection, EqualsOneWithTheSameItemsInTheSameOrder)
{
    collection.items = {&a, &b};
    UserObject other;
    other.items = {&a, &b};
    EXPECT_TRUE(collection == other);
    EXPECT_FALSE(collection != other);
    EXPECT_TRUE(UserObject() == UserObject());
}

TEST_F(UserCollection, DiffersByOrderByNumberAndByAddress)
{
    collection.items = {&a, &b};
    for (const std::deque<const Import::Object*>& items :
         {std::deque<const Import::Object*>{&b, &a}, {&a}, {&a, &b, &b}, {&a, &c}, {}}) {
        UserObject other;
        other.items = items;
        EXPECT_FALSE(collection == other);
        EXPECT_TRUE(collection != other);
    }
}

} // namespace
