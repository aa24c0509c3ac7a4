// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/Rect.h>

#include <gtest/gtest.h>

#include <array>
#include <limits>

namespace {

using Types::Rect;

std::array<double, 4> edgesOf(const Rect& rect)
{
    return {rect.left, rect.top, rect.right, rect.bottom};
}

TEST(Rect, TakesLeftTopRightBottom)
{
    EXPECT_EQ((std::array<double, 4>{1, 2, 3, 4}), edgesOf(Rect(1, 2, 3, 4)));
}

TEST(Rect, EqualsWhatDiffersByLessThanItsPrecision)
{
    EXPECT_TRUE(Rect(0, 0, 0, 0) == Rect(1e-13, -1e-13, 1e-13, 0));
    EXPECT_TRUE(Rect(1000, 1, 1, 1) == Rect(1000 + 0.9e-9, 1, 1, 1));
}

TEST(Rect, DiffersInAnyEdge)
{
    const Rect rect(1, 2, 3, 4);
    EXPECT_TRUE(rect == Rect(1, 2, 3, 4));
    EXPECT_FALSE(rect == Rect(1 + 1e-11, 2, 3, 4));
    EXPECT_FALSE(rect == Rect(1, 2 + 1e-11, 3, 4));
    EXPECT_FALSE(rect == Rect(1, 2, 3 + 1e-11, 4));
    EXPECT_FALSE(rect == Rect(1, 2, 3, 4 + 1e-11));
}

TEST(Rect, EqualsItselfWhateverItHolds)
{
    const Rect odd(std::numeric_limits<double>::quiet_NaN(), 0, std::numeric_limits<double>::infinity(), 0);
    const Rect copy = odd;
    EXPECT_TRUE(odd == odd);
    EXPECT_FALSE(odd == copy);
}

} // namespace
