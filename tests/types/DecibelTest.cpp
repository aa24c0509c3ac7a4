// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/Decibel.h>

#include "tests/types/Printing.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <cmath>
#include <limits>
#include <type_traits>

namespace {

Decibel dB(double level)
{
    return Decibel::fromDbLevel(level);
}

TEST(Decibel, IsZeroByDefault)
{
    EXPECT_EQ(0.0, Decibel().level());
}

TEST(Decibel, IsAPlainValueOfOneNumber)
{
    EXPECT_FALSE(std::is_polymorphic_v<Decibel>);
    EXPECT_EQ(sizeof(double), sizeof(Decibel));
}

TEST(Decibel, KeepsItsLevel)
{
    EXPECT_EQ(-3.5, dB(-3.5).level());
    EXPECT_EQ(-3.5, (-3.5_dB).level());
    EXPECT_EQ(6.0, (6.0_dB).level());
}

TEST(Decibel, IsTwentyTimesTheLogarithmOfARatio)
{
    EXPECT_EQ(0.0, Decibel::fromRelativeLevel(1.0).level());
    EXPECT_DOUBLE_EQ(20.0, Decibel::fromRelativeLevel(10.0).level());
    EXPECT_DOUBLE_EQ(-20.0, Decibel::fromRelativeLevel(0.1).level());
    EXPECT_NEAR(6.020599913279624, Decibel::fromRelativeLevel(2.0).level(), 1e-12);
}

TEST(Decibel, GivesTheRatioBack)
{
    EXPECT_DOUBLE_EQ(1.0, Decibel().toRelativeLevel());
    EXPECT_DOUBLE_EQ(10.0, dB(20).toRelativeLevel());
    EXPECT_DOUBLE_EQ(0.01, dB(-40).toRelativeLevel());
}

TEST(Decibel, IsMinusInfiniteForSilence)
{
    const Decibel silence = Decibel::fromRelativeLevel(0.0);
    EXPECT_TRUE(std::isinf(silence.level()));
    EXPECT_LT(silence.level(), 0.0);
    EXPECT_EQ(0.0, silence.toRelativeLevel());
    EXPECT_TRUE(silence < dB(-1000));
}

TEST(Decibel, IsNotANumberForANegativeRatio)
{
    EXPECT_TRUE(std::isnan(Decibel::fromRelativeLevel(-1.0).level()));
}

TEST(Decibel, AddsLevels)
{
    EXPECT_EQ(-1.0, (dB(2) + dB(-3)).level());
    EXPECT_EQ(5.0, (dB(2) - dB(-3)).level());
    EXPECT_EQ(-2.0, (-dB(2)).level());
    Decibel level = dB(4);
    level += dB(1.5);
    EXPECT_EQ(5.5, level.level());
    level -= dB(6);
    EXPECT_EQ(-0.5, level.level());
}

TEST(DecibelEquality, HoldsCloseToZero)
{
    EXPECT_TRUE(dB(1e-13) == Decibel());
    EXPECT_TRUE(dB(1e-12) == dB(-1e-12));
    EXPECT_FALSE(dB(1e-13) != Decibel());
}

TEST(DecibelEquality, OfZeroEndsBeyondTheSmallestLevels)
{
    EXPECT_FALSE(dB(1.1e-12) == Decibel());
    EXPECT_TRUE(dB(1.1e-12) != Decibel());
}

TEST(DecibelEquality, IsRelativeElsewhere)
{
    EXPECT_TRUE(dB(1000.0) == dB(1000.0 + 0.9e-9));
    EXPECT_FALSE(dB(1000.0) == dB(1000.0 + 1.1e-9));
    EXPECT_TRUE(dB(1.0) == dB(1.0 + 0.9e-12));
    EXPECT_FALSE(dB(1.0) == dB(1.0 + 1.1e-12));
    EXPECT_FALSE(dB(1.0) == dB(-1.0));
}

TEST(DecibelEquality, EndsBehindTheLesserMagnitude)
{
    // A difference of 1, a million million times, is the lesser of the two.
    EXPECT_TRUE(dB(1e12) == dB(1e12 + 1));
    EXPECT_TRUE(dB(-1e12 - 1) == dB(-1e12));
    // One of 2 is more than it by far, and one of 1 more than 1e12 - 1 by one.
    EXPECT_FALSE(dB(1e12) == dB(1e12 + 2));
    EXPECT_FALSE(dB(1e12 - 1) == dB(1e12));
}

TEST(DecibelEquality, IsNoneForSilence)
{
    const Decibel silence = Decibel::fromRelativeLevel(0.0);
    EXPECT_FALSE(silence == silence);
    EXPECT_FALSE(silence <= silence);
    EXPECT_FALSE(silence < silence);
}

TEST(DecibelEquality, HoldsForOppositeInfinities)
{
    EXPECT_TRUE(Decibel::fromRelativeLevel(0.0) == dB(std::numeric_limits<double>::infinity()));
}

TEST(DecibelOrder, IsPlainWhenStrictAndFuzzyWhenNot)
{
    const Decibel level = dB(1.0);
    const Decibel slightlyMore = dB(1.0 + 0.5e-12);
    EXPECT_TRUE(level < slightlyMore);
    EXPECT_TRUE(slightlyMore > level);
    EXPECT_FALSE(level > slightlyMore);
    EXPECT_FALSE(level < level);
    EXPECT_FALSE(level > level);
    EXPECT_TRUE(slightlyMore <= level);
    EXPECT_TRUE(level >= slightlyMore);
    EXPECT_FALSE(dB(2.0) <= level);
    EXPECT_FALSE(level >= dB(2.0));
    EXPECT_TRUE(level <= dB(2.0));
    EXPECT_TRUE(dB(2.0) >= level);
}

RC_GTEST_PROP(Decibel, ComesBackFromItsRatio, ())
{
    const double level = *rc::gen::inRange(-200000, 200000) / 1000.0;
    RC_ASSERT(std::abs(Decibel::fromRelativeLevel(dB(level).toRelativeLevel()).level() - level) < 1e-9);
}

RC_GTEST_PROP(Decibel, SumStandsForTheProductOfTheRatios, ())
{
    const double a = *rc::gen::inRange(1, 10000) / 100.0;
    const double b = *rc::gen::inRange(1, 10000) / 100.0;
    const Decibel sum = Decibel::fromRelativeLevel(a) + Decibel::fromRelativeLevel(b);
    RC_ASSERT(std::abs(sum.toRelativeLevel() / (a * b) - 1.0) < 1e-12);
}

RC_GTEST_PROP(DecibelEquality, IsSymmetric, (double a, double b))
{
    RC_ASSERT((dB(a) == dB(b)) == (dB(b) == dB(a)));
    RC_ASSERT((dB(a) == dB(b)) == (dB(-a) == dB(-b)));
    RC_ASSERT(dB(a) == dB(a));
}

} // namespace
