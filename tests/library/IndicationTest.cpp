// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/library/Indication.h>

#include <gmock/gmock.h>

namespace {

using Indication::Object;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, Object>);
static_assert(Testing::isVirtualBase<PubSub::Object, Object>);

Object everyFieldSet()
{
    Object marks;
    marks.id = "Effects";
    marks.favoriteItems = {"blur"};
    marks.newItems = {"glow", "haze"};
    marks.knownItems = {"blur", "noise"};
    return marks;
}

TEST(Indication, IsMadeByItsName)
{
    Testing::expectMadeByName<Object>("Indication::Object");
}

TEST(Indication, WritesItsFieldsInOrder)
{
    EXPECT_THAT(Testing::fieldKeys(everyFieldSet()),
                ElementsAre("id", "favoriteItems", "newItems", "knownItems"));
}

TEST(Indication, SettersReturnTheObject)
{
    Object marks;
    EXPECT_EQ(&marks.setId("Title").setFavorite("a", true).setNew("b", true).setNew("b", false), &marks);
    EXPECT_EQ(marks.id, "Title");
    EXPECT_THAT(marks.favoriteItems, ElementsAre("a"));
    EXPECT_THAT(marks.newItems, IsEmpty());
    EXPECT_THAT(marks.knownItems, ElementsAre("b"));
}

TEST(Indication, FavouritesComeAndGo)
{
    Object marks;
    EXPECT_FALSE(marks.isFavorite("a"));
    marks.setFavorite("a", true).setFavorite("b", true).setFavorite("a", true);
    EXPECT_TRUE(marks.isFavorite("a"));
    EXPECT_FALSE(marks.isFavorite("A"));
    EXPECT_THAT(marks.favoriteItems, ElementsAre("a", "b"));
    marks.setFavorite("a", false);
    EXPECT_FALSE(marks.isFavorite("a"));
    EXPECT_THAT(marks.favoriteItems, ElementsAre("b"));
}

TEST(Indication, TakingTheMarkFromWhatIsNoFavouriteDoesNothing)
{
    Object marks = everyFieldSet();
    marks.setFavorite("glow", false);
    EXPECT_EQ(Testing::Dump::of(marks), Testing::Dump::of(everyFieldSet()));
}

TEST(Indication, AFavouriteIsNewOrKnownLikeAnyOtherItem)
{
    Object marks;
    marks.setFavorite("a", true).setNew("a", true).setId("Title");
    EXPECT_THAT(marks.favoriteItems, ElementsAre("a"));
    EXPECT_THAT(marks.newItems, ElementsAre("a"));
    marks.setFavorite("a", true);
    EXPECT_THAT(marks.newItems, ElementsAre("a"));
    marks.setNew("a", false);
    EXPECT_THAT(marks.favoriteItems, ElementsAre("a"));
    EXPECT_THAT(marks.knownItems, ElementsAre("a"));
    marks.setFavorite("a", false);
    EXPECT_THAT(marks.favoriteItems, IsEmpty());
    EXPECT_THAT(marks.knownItems, ElementsAre("a"));
}

TEST(Indication, WhatCeasesToBeNewBecomesKnown)
{
    Object marks = everyFieldSet();
    EXPECT_TRUE(marks.isNew("glow"));
    marks.setNew("glow", false);
    EXPECT_FALSE(marks.isNew("glow"));
    EXPECT_THAT(marks.newItems, ElementsAre("haze"));
    EXPECT_THAT(marks.knownItems, ElementsAre("blur", "glow", "noise"));
    EXPECT_THAT(marks.favoriteItems, ElementsAre("blur"));
}

TEST(Indication, WhatWasNotNewDoesNotBecomeKnown)
{
    Object marks = everyFieldSet();
    marks.setNew("wave", false).setNew("noise", false);
    EXPECT_EQ(Testing::Dump::of(marks), Testing::Dump::of(everyFieldSet()));
}

TEST(Indication, AKnownItemCanBecomeNewAgain)
{
    Object marks = everyFieldSet();
    EXPECT_FALSE(marks.isNew("noise"));
    marks.setNew("noise", true);
    EXPECT_TRUE(marks.isNew("noise"));
    EXPECT_THAT(marks.newItems, ElementsAre("glow", "haze", "noise"));
    EXPECT_THAT(marks.knownItems, ElementsAre("blur"));
}

TEST(Indication, AnItemInBothSetsIsKnownOnceAfterwards)
{
    Object marks;
    marks.newItems = {"a"};
    marks.knownItems = {"a"};
    marks.setNew("a", false);
    EXPECT_THAT(marks.newItems, IsEmpty());
    EXPECT_THAT(marks.knownItems, ElementsAre("a"));
}

TEST(Indication, AnItemMayBeNamedByTheMarkItself)
{
    Object marks = everyFieldSet();
    marks.setNew(*marks.newItems.begin(), false);
    EXPECT_THAT(marks.knownItems, ElementsAre("blur", "glow", "noise"));
    marks.setNew(*marks.knownItems.begin(), true);
    EXPECT_THAT(marks.newItems, ElementsAre("blur", "haze"));
    marks.setFavorite(*marks.favoriteItems.begin(), false);
    EXPECT_THAT(marks.favoriteItems, IsEmpty());
}

} // namespace
