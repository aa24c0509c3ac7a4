// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/AvTime.h>

#include "tests/types/Printing.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

namespace {

TEST(AvTime, IsCutOffTowardsZero)
{
    EXPECT_EQ(MTime(1), Types::fromAvTime(1999));
    EXPECT_EQ(MTime(-1), Types::fromAvTime(-1999));
    EXPECT_EQ(MTime(0), Types::fromAvTime(-999));
    EXPECT_EQ(MTime(0), Types::fromAvTime(0));
}

TEST(AvTime, IsRoundedWhereAskedFor)
{
    EXPECT_EQ(MTime(2), Types::fromAvTimeRound(1600));
    EXPECT_EQ(MTime(1), Types::fromAvTimeRound(1400));
    EXPECT_EQ(MTime(2), Types::fromAvTimeRound(1500));
    EXPECT_EQ(MTime(-2), Types::fromAvTimeRound(-1500));
}

TEST(AvTime, IsRoundedByWayOfADouble)
{
    // Above 2^53 doubles stand 2 apart, and 9 007 199 254 741 499 becomes ...500.
    EXPECT_EQ(MTime(9007199254742), Types::fromAvTimeRound(9007199254741499));
    EXPECT_EQ(MTime(9007199254741), Types::fromAvTime(9007199254741499));
}

TEST(AvTime, CountsMicroseconds)
{
    EXPECT_EQ(1500000, Types::toAvTime(MTime(1500)));
    EXPECT_EQ(-1000, Types::toAvTime(MTime(-1)));
}

TEST(AvTime, LosesWhatIsBelowAMillisecond)
{
    EXPECT_EQ(1000, Types::toAvTime(Types::fromAvTime(1999)));
    EXPECT_EQ(-1000, Types::toAvTime(Types::fromAvTime(-1001)));
}

RC_GTEST_PROP(AvTime, GivesBackEveryTime, (int ms))
{
    const MTime time = ms;
    RC_ASSERT(Types::fromAvTime(Types::toAvTime(time)) == time);
    RC_ASSERT(Types::fromAvTimeRound(Types::toAvTime(time)) == time);
}

RC_GTEST_PROP(AvTime, LosesLessThanAMillisecond, (int us))
{
    const qint64 avTime = us;
    const qint64 lost = avTime - Types::toAvTime(Types::fromAvTime(avTime));
    RC_ASSERT(qAbs(lost) < 1000);
    RC_ASSERT(lost == 0 || (lost > 0) == (avTime > 0));
}

} // namespace
