// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/timeline/Composition.h>

#include <EditorModel/bus/View.h>
#include <EditorModel/media/Media.h>

#include <gmock/gmock.h>
#include <rapidcheck/gtest.h>

#include <type_traits>

namespace {

using Composition::Marker;
using Composition::Range;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::UnorderedElementsAre;

static_assert(std::is_base_of_v<Composition::Child, Marker>);
static_assert(std::is_base_of_v<Composition::Child, Range>);
static_assert(std::is_base_of_v<Types::Range, Range>);
static_assert(!std::is_base_of_v<Types::Range, Marker>);
static_assert(Testing::isVirtualBase<PubSub::Object, Composition::Child>);
static_assert(Testing::isVirtualBase<PubSub::Object, Composition::Object>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, Composition::Object>);

TEST(CompositionRange, IsMadeWithoutAParent)
{
    EXPECT_EQ(Range(1, 2, 3, 4).parent, nullptr);
}

TEST(CompositionRange, IsEmptyAtFirst)
{
    EXPECT_TRUE(Range().empty());
}

TEST(CompositionRange, TakesItsSpanLevelAndZValue)
{
    const Range range(10, 50, 3, -4);
    EXPECT_EQ(range.from, MTime(10));
    EXPECT_EQ(range.to, MTime(50));
    EXPECT_EQ(range.level, 3);
    EXPECT_EQ(range.zValue, -4);
    EXPECT_TRUE(range.contains(10));
    EXPECT_FALSE(range.contains(50));
}

TEST(CompositionRange, RangesOfDifferentParentsAreEqual)
{
    const Composition::Object parents[2];
    Range a(0, 10, 1, 2);
    Range b(0, 10, 1, 2);
    a.setParent(&parents[0]);
    b.setParent(&parents[1]);
    EXPECT_TRUE(a == b);
    EXPECT_FALSE(a != b);
    EXPECT_FALSE(a < b);
    EXPECT_FALSE(b < a);
}

TEST(CompositionRange, EveryOtherFieldIsCompared)
{
    const Range range(0, 10, 1, 2);
    for (const Range& other :
         {Range(1, 10, 1, 2), Range(0, 11, 1, 2), Range(0, 10, 2, 2), Range(0, 10, 1, 3)}) {
        EXPECT_FALSE(range == other);
        EXPECT_TRUE(range != other);
        EXPECT_TRUE(range < other);
        EXPECT_FALSE(other < range);
    }
}

TEST(CompositionRange, IsOrderedByFromThenToThenLevelThenZValue)
{
    EXPECT_LT(Range(0, 10, 0, 0), Range(0, 10, 1, 0));
    EXPECT_LT(Range(0, 10, 5, 0), Range(0, 20, 0, 0));
    EXPECT_LT(Range(0, 90, 9, 9), Range(1, 2, 0, 0));
    EXPECT_LT(Range(0, 10, 0, 9), Range(0, 10, 1, 0));
    EXPECT_LT(Range(0, 10, 0, -1), Range(0, 10, 0, 0));
}

RC_GTEST_PROP(CompositionRange, ItsOrderIsThatOfItsFourNumbers, ())
{
    // Few values, so that many of them are equal.
    const auto numbers = [] {
        const auto small = rc::gen::inRange(-1, 2);
        return *rc::gen::tuple(small, small, small, small);
    };
    const auto a = numbers();
    const auto b = numbers();
    const auto rangeOf = [](const auto& four) {
        return std::apply([](int from, int to, int level, int z) { return Range(from, to, level, z); }, four);
    };
    RC_ASSERT((rangeOf(a) < rangeOf(b)) == (a < b));
    RC_ASSERT((rangeOf(a) == rangeOf(b)) == (a == b));
    RC_ASSERT((rangeOf(a) != rangeOf(b)) == (a != b));
}

struct Outline
{
    Marker markers[2];
    Range ranges[2];
    Media::Video videos[2];
    Media::Audio audios[2];
    Composition::Object object;
};

TEST(Composition, AddingPutsIntoTheSetOfTheKindAndLeavesTheCurrentOnes)
{
    Outline o;
    EXPECT_EQ(o.object.add(&o.markers[0]), &o.object);
    EXPECT_EQ(o.object.add(&o.ranges[0]), &o.object);
    EXPECT_EQ(o.object.add(&o.videos[0]), &o.object);
    EXPECT_EQ(o.object.add(&o.audios[0]), &o.object);
    o.object.add(&o.markers[1])->add(&o.markers[1]);
    EXPECT_THAT(o.object.markers, UnorderedElementsAre(&o.markers[0], &o.markers[1]));
    EXPECT_THAT(o.object.ranges, ElementsAre(&o.ranges[0]));
    EXPECT_THAT(o.object.videos, ElementsAre(&o.videos[0]));
    EXPECT_THAT(o.object.audios, ElementsAre(&o.audios[0]));
    EXPECT_EQ(o.object.marker, nullptr);
    EXPECT_EQ(o.object.range, nullptr);
    EXPECT_EQ(o.object.video, nullptr);
    EXPECT_EQ(o.object.audio, nullptr);
}

TEST(Composition, RemovingTakesOutOfTheSetAndLeavesTheCurrentOne)
{
    Outline o;
    for (int i = 0; i != 2; ++i)
        o.object.add(&o.markers[i])->add(&o.ranges[i])->add(&o.videos[i])->add(&o.audios[i]);
    o.object.change(&o.markers[0])->change(&o.ranges[0])->change(&o.videos[0])->change(&o.audios[0]);

    EXPECT_EQ(o.object.remove(&o.markers[0]), &o.object);
    EXPECT_EQ(o.object.remove(&o.ranges[0]), &o.object);
    EXPECT_EQ(o.object.remove(&o.videos[0]), &o.object);
    EXPECT_EQ(o.object.remove(&o.audios[0]), &o.object);
    EXPECT_THAT(o.object.markers, ElementsAre(&o.markers[1]));
    EXPECT_THAT(o.object.ranges, ElementsAre(&o.ranges[1]));
    EXPECT_THAT(o.object.videos, ElementsAre(&o.videos[1]));
    EXPECT_THAT(o.object.audios, ElementsAre(&o.audios[1]));
    EXPECT_EQ(o.object.marker, &o.markers[0]);
    EXPECT_EQ(o.object.range, &o.ranges[0]);
    EXPECT_EQ(o.object.video, &o.videos[0]);
    EXPECT_EQ(o.object.audio, &o.audios[0]);
}

TEST(Composition, RemovingWhatIsNotThereChangesNothing)
{
    Outline o;
    o.object.add(&o.markers[0])->add(&o.ranges[0])->add(&o.videos[0])->add(&o.audios[0]);
    o.object.remove(&o.markers[1])->remove(&o.ranges[1])->remove(&o.videos[1])->remove(&o.audios[1]);
    EXPECT_THAT(o.object.markers, ElementsAre(&o.markers[0]));
    EXPECT_THAT(o.object.ranges, ElementsAre(&o.ranges[0]));
    EXPECT_THAT(o.object.videos, ElementsAre(&o.videos[0]));
    EXPECT_THAT(o.object.audios, ElementsAre(&o.audios[0]));
}

TEST(Composition, ChangingNamesTheCurrentOneAndLeavesTheSets)
{
    Outline o;
    EXPECT_EQ(o.object.change(&o.markers[0]), &o.object);
    EXPECT_EQ(o.object.change(&o.ranges[0]), &o.object);
    EXPECT_EQ(o.object.change(&o.videos[0]), &o.object);
    EXPECT_EQ(o.object.change(&o.audios[0]), &o.object);
    EXPECT_EQ(o.object.marker, &o.markers[0]);
    EXPECT_EQ(o.object.range, &o.ranges[0]);
    EXPECT_EQ(o.object.video, &o.videos[0]);
    EXPECT_EQ(o.object.audio, &o.audios[0]);
    EXPECT_THAT(o.object.markers, IsEmpty());
    EXPECT_THAT(o.object.ranges, IsEmpty());
    EXPECT_THAT(o.object.videos, IsEmpty());
    EXPECT_THAT(o.object.audios, IsEmpty());
    o.object.change(static_cast<const Marker*>(nullptr));
    EXPECT_EQ(o.object.marker, nullptr);
}

TEST(Composition, SettingTheCurrentOneIsChangingIt)
{
    Outline o;
    EXPECT_EQ(o.object.setMarker(&o.markers[1]), &o.object);
    EXPECT_EQ(o.object.setRange(&o.ranges[1]), &o.object);
    EXPECT_EQ(o.object.setVideo(&o.videos[1]), &o.object);
    EXPECT_EQ(o.object.setAudio(&o.audios[1]), &o.object);
    EXPECT_EQ(o.object.marker, &o.markers[1]);
    EXPECT_EQ(o.object.range, &o.ranges[1]);
    EXPECT_EQ(o.object.video, &o.videos[1]);
    EXPECT_EQ(o.object.audio, &o.audios[1]);
    EXPECT_THAT(o.object.markers, IsEmpty());
    EXPECT_EQ(o.object.setMarker(nullptr)->marker, nullptr);
}

TEST(Composition, SettingAWholeSetReplacesItAndLeavesTheCurrentOne)
{
    Outline o;
    o.object.add(&o.markers[0])->add(&o.ranges[0])->add(&o.videos[0])->add(&o.audios[0]);
    o.object.change(&o.markers[0])->change(&o.ranges[0])->change(&o.videos[0])->change(&o.audios[0]);
    EXPECT_EQ(o.object.setMarkers({&o.markers[1]}), &o.object);
    EXPECT_EQ(o.object.setRanges({&o.ranges[1]}), &o.object);
    EXPECT_EQ(o.object.setVideos({&o.videos[1]}), &o.object);
    EXPECT_EQ(o.object.setAudios({&o.audios[1]}), &o.object);
    EXPECT_THAT(o.object.markers, ElementsAre(&o.markers[1]));
    EXPECT_THAT(o.object.ranges, ElementsAre(&o.ranges[1]));
    EXPECT_THAT(o.object.videos, ElementsAre(&o.videos[1]));
    EXPECT_THAT(o.object.audios, ElementsAre(&o.audios[1]));
    EXPECT_EQ(o.object.marker, &o.markers[0]);
    EXPECT_EQ(o.object.range, &o.ranges[0]);
    EXPECT_EQ(o.object.video, &o.videos[0]);
    EXPECT_EQ(o.object.audio, &o.audios[0]);
}

TEST(Composition, TakesItsOwnSetsAsTheyAre)
{
    Outline o;
    o.object.add(&o.markers[0])->add(&o.ranges[0])->add(&o.videos[0])->add(&o.audios[0]);
    o.object.setMarkers(o.object.markers)->setRanges(o.object.ranges);
    o.object.setVideos(o.object.videos)->setAudios(o.object.audios);
    EXPECT_THAT(o.object.markers, ElementsAre(&o.markers[0]));
    EXPECT_THAT(o.object.ranges, ElementsAre(&o.ranges[0]));
    EXPECT_THAT(o.object.videos, ElementsAre(&o.videos[0]));
    EXPECT_THAT(o.object.audios, ElementsAre(&o.audios[0]));
}

TEST(Composition, IsSharedOnTheBusLikeAnyObject)
{
    Marker marker;
    Composition::Object object;
    Message::View<Composition::Object> owner;
    Message::View<Composition::Object> client;
    owner.own(&object);
    client.observe(&object);
    client.change(&object)->add(&marker)->setMarker(&marker);
    EXPECT_THAT(object.markers, ElementsAre(&marker));
    EXPECT_EQ(client.object()->marker, &marker);
}

} // namespace
