// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/Range.h>

#include "tests/types/Printing.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <set>
#include <type_traits>
#include <vector>

namespace {

using Types::Range;
using Ranges = std::set<Range>;

TEST(Range, IsEmptyByDefault)
{
    const Range range;
    EXPECT_EQ(MTime(0), range.from);
    EXPECT_EQ(MTime(-1), range.to);
    EXPECT_TRUE(range.empty());
    EXPECT_EQ(MTime(0), range.length());
    EXPECT_FALSE(range.contains(0));
    EXPECT_FALSE(range.contains(-1));
}

TEST(Range, IsAPlainValueOfTwoTimes)
{
    EXPECT_FALSE(std::is_polymorphic_v<Range>);
    EXPECT_EQ(2 * sizeof(MTime), sizeof(Range));
}

TEST(Range, StoresItsEndsInAnyOrder)
{
    const Range range(5, 2);
    EXPECT_EQ(MTime(5), range.from);
    EXPECT_EQ(MTime(2), range.to);
    EXPECT_EQ(MTime(0), range.length());
    EXPECT_TRUE(range.empty());
}

TEST(Range, FromATimeToItselfIsEmpty)
{
    EXPECT_TRUE(Range(3, 3).empty());
    EXPECT_EQ(MTime(0), Range(3, 3).length());
    EXPECT_FALSE(Range(3, 3).contains(3));
    EXPECT_FALSE(Range(3, 4).empty());
    EXPECT_EQ(MTime(1), Range(3, 4).length());
}

TEST(Range, HoldsItsStartAndNotItsEnd)
{
    const Range range(2, 5);
    EXPECT_FALSE(range.contains(1));
    EXPECT_TRUE(range.contains(2));
    EXPECT_TRUE(range.contains(4));
    EXPECT_FALSE(range.contains(5));
    EXPECT_EQ(MTime(3), range.length());
    EXPECT_FALSE(range.empty());
}

TEST(Range, IsEqualInBothEnds)
{
    EXPECT_TRUE(Range(1, 2) == Range(1, 2));
    EXPECT_FALSE(Range(1, 2) == Range(1, 3));
    EXPECT_FALSE(Range(1, 2) == Range(0, 2));
    EXPECT_TRUE(Range(1, 2) != Range(1, 3));
    EXPECT_FALSE(Range(1, 2) != Range(1, 2));
}

TEST(Range, OrdersByItsStartThenByItsEnd)
{
    EXPECT_TRUE(Range(1, 9) < Range(2, 3));
    EXPECT_FALSE(Range(2, 3) < Range(1, 9));
    EXPECT_TRUE(Range(1, 2) < Range(1, 3));
    EXPECT_FALSE(Range(1, 2) < Range(1, 2));
}

TEST(RangeIntersection, IsWhatBothHold)
{
    EXPECT_TRUE(Range(0, 5).hasIntersection(Range(3, 9)));
    EXPECT_EQ(Range(3, 5), Range(0, 5).intersection(Range(3, 9)));
    EXPECT_EQ(Range(3, 4), Range(0, 5).intersection(Range(3, 4)));
    EXPECT_EQ(Range(3, 4), Range(3, 4).intersection(Range(0, 5)));
}

TEST(RangeIntersection, OfRangesThatOnlyTouchIsADefaultRange)
{
    EXPECT_FALSE(Range(0, 5).hasIntersection(Range(5, 10)));
    EXPECT_FALSE(Range(5, 10).hasIntersection(Range(0, 5)));
    EXPECT_EQ(Range(), Range(0, 5).intersection(Range(5, 10)));
    EXPECT_EQ(Range(), Range(5, 10).intersection(Range(0, 5)));
    EXPECT_EQ(Range(), Range(0, 1).intersection(Range(5, 10)));
}

TEST(RangeUnion, DoesNotJoinRangesThatOnlyTouch)
{
    EXPECT_EQ((Ranges{{0, 5}, {5, 10}}), Range(0, 5).added(Range(5, 10)));
    EXPECT_EQ((Ranges{{0, 5}, {5, 10}}), Range(5, 10).added(Range(0, 5)));
}

TEST(RangeUnion, JoinsRangesThatIntersect)
{
    EXPECT_EQ((Ranges{{0, 10}}), Range(0, 6).added(Range(5, 10)));
    EXPECT_EQ((Ranges{{0, 10}}), Range(3, 4).added(Range(0, 10)));
}

TEST(RangeUnion, TakesInAPointInsideButNotOneAtTheStart)
{
    EXPECT_EQ((Ranges{{0, 5}}), Range(3, 3).added(Range(0, 5)));
    EXPECT_EQ((Ranges{{0, 0}, {0, 5}}), Range(0, 0).added(Range(0, 5)));
}

TEST(RangeUnion, OfEqualEmptyRangesIsOneRange)
{
    EXPECT_EQ((Ranges{{4, 4}}), Range(4, 4).added(Range(4, 4)));
}

TEST(RangeDifference, IsWhatTheOtherLeaves)
{
    EXPECT_EQ(Ranges{}, Range(0, 10).subsctracted(Range(0, 10)));
    EXPECT_EQ(Ranges{}, Range(2, 4).subsctracted(Range(0, 10)));
    EXPECT_EQ((Ranges{{0, 3}, {4, 10}}), Range(0, 10).subsctracted(Range(3, 4)));
    EXPECT_EQ((Ranges{{0, 5}}), Range(0, 10).subsctracted(Range(5, 12)));
    EXPECT_EQ((Ranges{{5, 10}}), Range(0, 10).subsctracted(Range(-2, 5)));
}

TEST(RangeDifference, IsTheRangeItselfWhereTheOtherStandsAside)
{
    EXPECT_EQ((Ranges{{0, 10}}), Range(0, 10).subsctracted(Range(10, 20)));
    EXPECT_EQ((Ranges{{10, 20}}), Range(10, 20).subsctracted(Range(0, 10)));
    EXPECT_EQ((Ranges{{3, 3}}), Range(3, 3).subsctracted(Range(3, 5)));
}

// A range whose ends are in the wrong order holds nothing, and yet has a place.
TEST(RangeOfWrongOrder, IntersectsWhatLiesOverBothOfItsEnds)
{
    const Range turned(5, 2);
    EXPECT_TRUE(turned.hasIntersection(Range(0, 10)));
    EXPECT_TRUE(Range(0, 10).hasIntersection(turned));
    EXPECT_EQ(turned, turned.intersection(Range(0, 10)));
    EXPECT_EQ(turned, Range(0, 10).intersection(turned));
    EXPECT_EQ((Ranges{{0, 10}}), turned.added(Range(0, 10)));
    // 5 is not before 10, and 2 not behind 0.
    EXPECT_FALSE(turned.hasIntersection(Range(0, 5)));
    EXPECT_FALSE(turned.hasIntersection(Range(2, 9)));
    EXPECT_EQ(Range(), turned.intersection(turned));
    EXPECT_EQ((Ranges{{5, 2}}), turned.added(turned));
}

TEST(RangeOfWrongOrder, LeavesTwoPiecesThatOverlap)
{
    EXPECT_EQ((Ranges{{0, 5}, {2, 10}}), Range(0, 10).subsctracted(Range(5, 2)));
    EXPECT_EQ(Ranges{}, Range(5, 2).subsctracted(Range(0, 10)));
    EXPECT_EQ((Ranges{{5, 2}}), Range(5, 2).subsctracted(Range(0, 5)));
}

TEST(RangeOfWrongOrder, ByDefaultIsMetByWhatLiesOverZeroAndTheInstantBefore)
{
    EXPECT_TRUE(Range().hasIntersection(Range(-2, 1)));
    EXPECT_FALSE(Range().hasIntersection(Range(0, 1)));
    EXPECT_FALSE(Range().hasIntersection(Range(-1, 1)));
    EXPECT_FALSE(Range().hasIntersection(Range()));
    EXPECT_EQ((Ranges{{0, -1}}), Range().added(Range()));
    EXPECT_EQ((Ranges{{0, -1}, {0, 1}}), Range().added(Range(0, 1)));
}

// The laws are checked point by point over a short line, with the ends in order and points allowed.
constexpr int LINE = 12;

Range anyRange()
{
    const int from = *rc::gen::inRange(0, LINE);
    const int to = *rc::gen::inRange(from, LINE + 1);
    return {from, to};
}

bool holds(const Ranges& ranges, MTime time)
{
    for (const Range& range : ranges) {
        if (range.contains(time))
            return true;
    }
    return false;
}

RC_GTEST_PROP(RangeIntersection, HoldsTheTimesOfBoth, ())
{
    const Range a = anyRange();
    const Range b = anyRange();
    for (int time = -1; time <= LINE; ++time)
        RC_ASSERT(a.intersection(b).contains(time) == (a.contains(time) && b.contains(time)));
    RC_ASSERT(a.intersection(b) == b.intersection(a));
    RC_ASSERT(a.hasIntersection(b) == b.hasIntersection(a));
}

RC_GTEST_PROP(RangeUnion, HoldsTheTimesOfEither, ())
{
    const Range a = anyRange();
    const Range b = anyRange();
    const Ranges sum = a.added(b);
    for (int time = -1; time <= LINE; ++time)
        RC_ASSERT(holds(sum, time) == (a.contains(time) || b.contains(time)));
    RC_ASSERT(sum == b.added(a));
    RC_ASSERT((sum.size() == 1) == (a.hasIntersection(b) || a == b));
}

RC_GTEST_PROP(RangeDifference, HoldsTheTimesOfTheFirstAlone, ())
{
    const Range a = anyRange();
    const Range b = anyRange();
    const Ranges rest = a.subsctracted(b);
    for (int time = -1; time <= LINE; ++time)
        RC_ASSERT(holds(rest, time) == (a.contains(time) && !b.contains(time)));
    RC_ASSERT(rest.size() <= 2u);
    for (const Range& piece : rest)
        RC_ASSERT(piece == a || !piece.empty());
}

RC_GTEST_PROP(RangeDifference, AndIntersectionMakeUpTheRange, ())
{
    const Range a = anyRange();
    const Range b = anyRange();
    MTime length = a.intersection(b).length();
    for (const Range& piece : a.subsctracted(b))
        length += piece.length();
    RC_ASSERT(length == a.length());
}

RC_GTEST_PROP(Range, HasAStrictOrder, ())
{
    const Range a = anyRange();
    const Range b = anyRange();
    RC_ASSERT((a < b) + (b < a) + (a == b) == 1);
}

} // namespace
