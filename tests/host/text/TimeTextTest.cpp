// SPDX-License-Identifier: Apache-2.0
#include "host/text/TimeText.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <limits>

namespace {

using Host::spanText;
using Host::tickText;
using Host::timeOfText;

constexpr qint64 lowest = std::numeric_limits<qint64>::min();

TEST(TypedTimes, AreReadAsPeopleWriteThem)
{
    const std::pair<const char*, qint64> times[] = {
        {"0", 0},
        {"5", 5000},
        {"90.25", 90250},
        {"1.5s", 1500},
        {"0.007", 7},
        {"250ms", 250},
        {"0ms", 0},
        {"2:03", 123000},
        {"2:03.5", 123500},
        {"61:00", 3660000},
        {"1:02:03", 3723000},
        {"01:02:03.045", 3723045},
        {"00:00:00.001", 1},
        {"100:00:00", 360000000},
        {"-1", -1000},
        {"-0:00:01.250", -1250},
        {"-40ms", -40},
        {"+2", 2000},
    };
    for (const auto& [text, ms] : times) {
        const auto time = timeOfText(text);
        ASSERT_TRUE(time) << text;
        EXPECT_EQ(time->ms(), ms) << text;
    }
}

TEST(TypedTimes, AreNothingElse)
{
    for (const char* text : {"",
                             " ",
                             "abc",
                             "1:2:3:4",
                             "1:60",
                             "1:60:00",
                             "1.2345",
                             ".5",
                             "5.",
                             "1,5",
                             "1:-2",
                             "--1",
                             "1 s",
                             "1.5ms",
                             "1h",
                             "0x10",
                             "1e3",
                             "nan",
                             "1:00ms",
                             "1:00s",
                             "1\n",
                             "12345678901",
                             "٣",
                             "1::2",
                             "99:9:61",
                             "1:2:3.1234",
                             "00:00:001",
                             "9999999:00:00",
                             "100000:00:00.001"}) {
        EXPECT_FALSE(timeOfText(QString::fromUtf8(text))) << text;
    }
    EXPECT_EQ(timeOfText("100000:00:00"), MTime(360000000000));
}

TEST(Spans, AreShort)
{
    EXPECT_EQ(spanText(0), "0 s");
    EXPECT_EQ(spanText(4004), "4.004 s");
    EXPECT_EQ(spanText(5500), "5.5 s");
    EXPECT_EQ(spanText(1250), "1.25 s");
    EXPECT_EQ(spanText(59999), "59.999 s");
    EXPECT_EQ(spanText(60000), "1:00");
    EXPECT_EQ(spanText(62500), "1:02.5");
    EXPECT_EQ(spanText(3599999), "59:59.999");
    EXPECT_EQ(spanText(7203000), "2:00:03");
    EXPECT_EQ(spanText(-4004), "-4.004 s");
    EXPECT_EQ(spanText(-62500), "-1:02.5");
    EXPECT_EQ(spanText(lowest), "-2562047788015:12:55.808");
}

TEST(Ticks, ShowWhatTellsThemApart)
{
    EXPECT_EQ(tickText(5000, 5000, 20000), "0:05");
    EXPECT_EQ(tickText(0, 500, 4000), "0:00.0");
    EXPECT_EQ(tickText(3500, 500, 4000), "0:03.5");
    EXPECT_EQ(tickText(250, 50, 1000), "0:00.25");
    EXPECT_EQ(tickText(3, 1, 10), "0:00.003");
    EXPECT_EQ(tickText(3540000, 60000, 3599999), "59:00");
    EXPECT_EQ(tickText(60000, 60000, 3600000), "0:01:00");
    EXPECT_EQ(tickText(5430000, 30000, 7200000), "1:30:30");
    EXPECT_EQ(tickText(-5000, 5000, 5000), "-0:05");
}

RC_GTEST_PROP(TypedTimes, ComeBackFromWhatIsShownOfThem, ())
{
    const qint64 ms = *rc::gen::inRange<qint64>(-360000000000, 360000000001);
    // A span of less than a minute has a blank before its unit.
    const QString shown = QString::fromStdString(spanText(ms)).remove(' ');
    RC_ASSERT(timeOfText(shown) == MTime(ms));
    RC_ASSERT(timeOfText(QString::fromStdString(tickText(ms, 1, ms))) == MTime(ms));
}

} // namespace
