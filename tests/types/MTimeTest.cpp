// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/MTime.h>

#include "tests/types/Printing.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <chrono>
#include <cmath>
#include <limits>
#include <type_traits>
#include <unordered_set>

namespace {

constexpr qint64 HIGHEST = std::numeric_limits<qint64>::max();
constexpr qint64 LOWEST = std::numeric_limits<qint64>::min();
constexpr double INFINITE = std::numeric_limits<double>::infinity();
constexpr double NOT_A_NUMBER = std::numeric_limits<double>::quiet_NaN();

TEST(MTime, IsZeroByDefault)
{
    EXPECT_EQ(0, MTime().ms());
}

TEST(MTime, IsMadeOfWholeMillisecondsWithoutACast)
{
    const MTime fromInt = 1500;
    const MTime fromLongLong = -1LL;
    EXPECT_EQ(1500, fromInt.ms());
    EXPECT_EQ(-1, fromLongLong.ms());
}

TEST(MTime, RefusesFractionsWithoutRounding)
{
    EXPECT_FALSE((std::is_constructible_v<MTime, double>));
    EXPECT_FALSE((std::is_constructible_v<MTime, float>));
}

TEST(MTime, IsOneNumberWide)
{
    EXPECT_EQ(sizeof(qint64), sizeof(MTime));
    EXPECT_TRUE(std::is_trivially_copyable_v<MTime>);
}

TEST(MTime, WorksInConstantExpressions)
{
    constexpr MTime time = MTime::fromMsRound(2.5) + MTime(4).mulRound(0.25) - 1;
    static_assert(time.ms() == 3);
    static_assert(std::abs(MTime(-3)) == 3);
    static_assert(MTime::fromUsRound(1500.0) == 2);
    EXPECT_EQ(time, MTime(3));
}

TEST(MTime, ConvertsToAndFromChronoMilliseconds)
{
    using namespace std::chrono_literals;
    const MTime time = 250ms;
    const std::chrono::milliseconds back = time;
    EXPECT_EQ(250, time.ms());
    EXPECT_EQ(250ms, back);
    EXPECT_EQ(MTime(3000), MTime(3s));
    EXPECT_EQ(MTime(750), time + 500ms);
}

TEST(MTime, ComparesAsItsCount)
{
    EXPECT_TRUE(MTime(1) == MTime(1));
    EXPECT_FALSE(MTime(1) == MTime(2));
    EXPECT_TRUE(MTime(1) != MTime(2));
    EXPECT_FALSE(MTime(2) != MTime(2));
    EXPECT_TRUE(MTime(-2) < MTime(-1));
    EXPECT_FALSE(MTime(1) < MTime(1));
    EXPECT_TRUE(MTime(1) <= MTime(1));
    EXPECT_FALSE(MTime(2) <= MTime(1));
    EXPECT_TRUE(MTime(2) > MTime(1));
    EXPECT_FALSE(MTime(1) > MTime(1));
    EXPECT_TRUE(MTime(1) >= MTime(1));
    EXPECT_FALSE(MTime(0) >= MTime(1));
    EXPECT_EQ(MTime(1), std::min(MTime(1), MTime(2)));
    EXPECT_EQ(MTime(2), std::max(MTime(1), MTime(2)));
}

TEST(MTime, AddsAndSubtractsAsItsCount)
{
    EXPECT_EQ(MTime(7), MTime(5) + MTime(2));
    EXPECT_EQ(MTime(-3), MTime(2) - MTime(5));
    EXPECT_EQ(MTime(-5), -MTime(5));
    MTime time = 10;
    time += 5;
    EXPECT_EQ(MTime(15), time);
    time -= 20;
    EXPECT_EQ(MTime(-5), time);
}

TEST(MTime, HasAMagnitude)
{
    EXPECT_EQ(MTime(5), std::abs(MTime(-5)));
    EXPECT_EQ(MTime(5), std::abs(MTime(5)));
    EXPECT_EQ(MTime(0), std::abs(MTime(0)));
}

TEST(MTime, GoesIntoHashedContainers)
{
    const std::unordered_set<MTime> times = {1, 2, 1};
    EXPECT_EQ(2u, times.size());
}

TEST(MTimeRounding, TakesTheNearestMillisecond)
{
    EXPECT_EQ(MTime(1), MTime::fromMsRound(1.49));
    EXPECT_EQ(MTime(2), MTime::fromMsRound(1.51));
    EXPECT_EQ(MTime(-1), MTime::fromMsRound(-1.49));
    EXPECT_EQ(MTime(-2), MTime::fromMsRound(-1.51));
}

TEST(MTimeRounding, TakesAHalfAwayFromZero)
{
    EXPECT_EQ(MTime(1), MTime::fromMsRound(0.5));
    EXPECT_EQ(MTime(3), MTime::fromMsRound(2.5));
    EXPECT_EQ(MTime(-1), MTime::fromMsRound(-0.5));
    EXPECT_EQ(MTime(-3), MTime::fromMsRound(-2.5));
}

TEST(MTimeRounding, IsNotFooledByTheNeighboursOfAHalf)
{
    EXPECT_EQ(MTime(0), MTime::fromMsRound(std::nextafter(0.5, 0.0)));
    EXPECT_EQ(MTime(1), MTime::fromUsRound(std::nextafter(1500.0, 0.0)));
    EXPECT_EQ(MTime(0), MTime::fromUsRound(std::nextafter(500.0, 0.0)));
}

TEST(MTimeRounding, KeepsTheLargestOddWholeNumbers)
{
    EXPECT_EQ(MTime(4503599627370497), MTime::fromMsRound(4503599627370497.0));
    EXPECT_EQ(MTime(9007199254740991), MTime::fromMsRound(9007199254740991.0));
}

TEST(MTimeRounding, TakesMicroseconds)
{
    EXPECT_EQ(MTime(2), MTime::fromUsRound(1600.0));
    EXPECT_EQ(MTime(1), MTime::fromUsRound(1499.9));
    EXPECT_EQ(MTime(2), MTime::fromUsRound(1500.0));
    EXPECT_EQ(MTime(-2), MTime::fromUsRound(-1500.0));
    EXPECT_EQ(MTime(0), MTime::fromUsRound(-499.0));
}

TEST(MTimeRounding, MultipliesAndDivides)
{
    EXPECT_EQ(MTime(150), MTime(100).mulRound(1.5));
    EXPECT_EQ(MTime(2), MTime(3).mulRound(0.5));
    EXPECT_EQ(MTime(-2), MTime(-3).mulRound(0.5));
    EXPECT_EQ(MTime(33), MTime(100).divRound(3.0));
    EXPECT_EQ(MTime(67), MTime(200).divRound(3.0));
    EXPECT_EQ(MTime(-200), MTime(100).divRound(-0.5));
}

TEST(MTimeRounding, DividesAndDoesNotMultiplyByTheInverse)
{
    // 49 times a 98th, which no double holds, falls just short of a half.
    EXPECT_EQ(MTime(1), MTime(49).divRound(98.0));
    EXPECT_EQ(MTime(-1), MTime(49).divRound(-98.0));
}

TEST(MTimeRounding, MakesZeroOfNotANumber)
{
    EXPECT_EQ(MTime(), MTime::fromMsRound(NOT_A_NUMBER));
    EXPECT_EQ(MTime(), MTime::fromUsRound(NOT_A_NUMBER));
    EXPECT_EQ(MTime(), MTime(5).mulRound(NOT_A_NUMBER));
    EXPECT_EQ(MTime(), MTime(0).divRound(0.0));
}

TEST(MTimeRounding, SaturatesBeyondTheRange)
{
    EXPECT_EQ(MTime(HIGHEST), MTime::fromMsRound(1e30));
    EXPECT_EQ(MTime(LOWEST), MTime::fromMsRound(-1e30));
    EXPECT_EQ(MTime(HIGHEST), MTime::fromMsRound(9223372036854775808.0));
    EXPECT_EQ(MTime(LOWEST), MTime::fromMsRound(-9223372036854775808.0));
    EXPECT_EQ(MTime(HIGHEST), MTime::fromUsRound(INFINITE));
    EXPECT_EQ(MTime(LOWEST), MTime::fromUsRound(-INFINITE));
    EXPECT_EQ(MTime(HIGHEST), MTime(5).divRound(0.0));
    EXPECT_EQ(MTime(LOWEST), MTime(-5).divRound(0.0));
    EXPECT_EQ(MTime(LOWEST), MTime(HIGHEST).mulRound(-2.0));
}

TEST(MTimeRounding, ReadsMicrosecondsBeyondTheRangeOfAnInteger)
{
    EXPECT_EQ(MTime(10000000000000000), MTime::fromUsRound(1e19));
}

RC_GTEST_PROP(MTimeRounding, IsWithinHalfAMillisecond, ())
{
    const double ms = *rc::gen::inRange(-1000000, 1000000) / 1024.0;
    RC_ASSERT(std::abs(static_cast<double>(MTime::fromMsRound(ms).ms()) - ms) <= 0.5);
}

RC_GTEST_PROP(MTimeRounding, TreatsBothSignsAlike, (double ms))
{
    RC_PRE(std::abs(ms) < 1e18);
    RC_ASSERT(MTime::fromMsRound(-ms) == -MTime::fromMsRound(ms));
    RC_ASSERT(MTime::fromUsRound(-ms) == -MTime::fromUsRound(ms));
}

RC_GTEST_PROP(MTimeRounding, GivesBackWholeMilliseconds, (int ms))
{
    RC_ASSERT(MTime::fromMsRound(ms) == MTime(ms));
    RC_ASSERT(MTime::fromUsRound(ms * 1000.0) == MTime(ms));
    RC_ASSERT(MTime(ms).mulRound(1.0) == MTime(ms));
    RC_ASSERT(MTime(ms).divRound(1.0) == MTime(ms));
}

} // namespace
