// SPDX-License-Identifier: Apache-2.0
#include "tests/analysis/Trackings.h"
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldTexts.h"
#include "tests/types/Printing.h"

#include <gmock/gmock.h>

#include <type_traits>
#include <utility>

namespace {

using MotionTracking::Data;
using MotionTracking::Frame;
using testing::ElementsAre;
using TrackingTests::Entry;
using TrackingTests::Spans;
using TrackingTests::spansOf;
using TrackingTests::trackingOf;

static_assert(std::is_base_of_v<Serialize::ISerializable, Data> && std::is_base_of_v<PubSub::Object, Data>);
static_assert(!Testing::isVirtualBase<Serialize::ISerializable, Data>);
static_assert(!Testing::isVirtualBase<PubSub::Object, Data>);
static_assert(std::is_same_v<decltype(std::declval<Data>().findFrame(MTime(), true)),
                             std::map<MTime, MotionTracking::TimedFrame>::const_iterator>);

const Frame here(0.1, 0.2, 0.3, 0.4);
const Frame there(0.5, 0.2, 0.3, 0.4);

TEST(TrackingData, IsMadeForAnIdentifierWithoutFrames)
{
    EXPECT_EQ(Data(QStringLiteral("a")).id, QStringLiteral("a"));
    EXPECT_TRUE(Data(QStringLiteral("a")).frames.empty());
}

TEST(TrackingData, IsMadeByName)
{
    Testing::expectMadeByName<Data>("MotionTracking::Data");
}

TEST(TrackingData, IsWrittenWithItsIdInFront)
{
    EXPECT_THAT(Testing::fieldKeys(Data()), ElementsAre("id", "frames"));
}

TEST(TrackingData, ComesBackWithAllItsEntries)
{
    const Data data = trackingOf({{-40, 40, here}, {0, 0, there}, {40, -5, here}});
    for (const Way& way : allWays) {
        const Document::Graph graph = graphOf(documentOf({&data}, way));
        const auto* const loaded = graph.rootAs<Data>();
        ASSERT_NE(loaded, nullptr) << way.name;
        EXPECT_TRUE(*loaded == data) << way.name;
        EXPECT_EQ(spansOf(*loaded), spansOf(data)) << way.name;
    }
}

TEST(TrackingDataEquality, LooksAtIdTimesAndRectangles)
{
    const Data data = trackingOf({{0, 40, here}, {40, 40, there}});
    EXPECT_TRUE(data == data);
    EXPECT_TRUE(data == trackingOf({{0, 40, here}, {40, 40, there}}));
    EXPECT_TRUE(Data() == Data());

    Data renamed = data;
    renamed.id = QStringLiteral("other");
    EXPECT_FALSE(data == renamed);
    EXPECT_FALSE(data == trackingOf({{0, 40, here}}));
    EXPECT_FALSE(trackingOf({{0, 40, here}}) == data);
    EXPECT_FALSE(data == trackingOf({{0, 40, here}, {41, 40, there}}));
    EXPECT_FALSE(data == trackingOf({{0, 40, here}, {40, 40, here}}));
}

TEST(TrackingDataEquality, ComparesRectanglesNearly)
{
    const auto wide = [](double width) { return trackingOf({{0, 40, Frame(0.1, 0.2, width, 0.4)}}); };
    EXPECT_TRUE(wide(0.3) == wide(0.3 * (1 + 1e-13)));
    EXPECT_FALSE(wide(0.3) == wide(0.3 * (1 + 1e-11)));
}

TEST(TrackingDataEquality, HasNoPartForDurations)
{
    EXPECT_TRUE(trackingOf({{0, 40, here}}) == trackingOf({{0, 1000, here}}));
}

/// The start of the entry that is found, or -1.
int startOfFound(const Data& data, int position, bool nextIfNone)
{
    const auto found = data.findFrame(position, nextIfNone);
    return found != data.frames.end() ? int(found->first.ms()) : -1;
}

TEST(TrackingDataFindFrame, FindsNothingInEmptyData)
{
    EXPECT_EQ(startOfFound(Data(), 0, false), -1);
    EXPECT_EQ(startOfFound(Data(), 0, true), -1);
}

TEST(TrackingDataFindFrame, FindsTheEntryAtATime)
{
    const Data data = trackingOf({{100, 40, here}, {140, 40, there}, {300, 40, here}});
    struct Case
    {
        int position;
        int found;
        int foundOrNext;
    };
    const Case cases[] = {
        {-1000, -1, 100}, {99, -1, 100},   {100, 100, 100},
        {139, 100, 100},  {140, 140, 140}, // two meet: the later one
        {141, 140, 140},  {180, 140, 140}, // the end is inside
        {181, -1, 300},   {299, -1, 300},  {300, 300, 300},
        {340, 300, 300},  {341, -1, -1},   {1000000, -1, -1},
    };
    for (const Case& c : cases) {
        EXPECT_EQ(startOfFound(data, c.position, false), c.found) << c.position;
        EXPECT_EQ(startOfFound(data, c.position, true), c.foundOrNext) << c.position;
    }
}

TEST(TrackingDataFindFrame, LooksAtTheLastEntryToBeginAlone)
{
    const Data data = trackingOf({{0, 100, here}, {50, 10, there}, {200, 10, here}});
    EXPECT_EQ(startOfFound(data, 49, false), 0);
    EXPECT_EQ(startOfFound(data, 60, false), 50);
    EXPECT_EQ(startOfFound(data, 61, false), -1);
    EXPECT_EQ(startOfFound(data, 61, true), 200);
}

TEST(TrackingDataFindFrame, FindsAnEntryOfNoLengthAtItsTimeAlone)
{
    const Data data = trackingOf({{0, 40, here}, {10, 0, there}, {20, -5, here}});
    EXPECT_EQ(startOfFound(data, 10, false), 10);
    EXPECT_EQ(startOfFound(data, 11, false), -1);
    EXPECT_EQ(startOfFound(data, 11, true), 20);
    EXPECT_EQ(startOfFound(data, 20, false), -1);
    EXPECT_EQ(startOfFound(data, 20, true), -1);
}

Spans optimized(const std::vector<Entry>& entries)
{
    Data data = trackingOf(entries);
    data.optimize();
    return spansOf(data);
}

TEST(TrackingDataOptimize, LeavesEmptyDataEmpty)
{
    EXPECT_EQ(optimized({}), Spans());
}

TEST(TrackingDataOptimize, LeavesASingleEntryAsItIs)
{
    EXPECT_EQ(optimized({{7, 40, here}}), (Spans{{7, 40}}));
}

TEST(TrackingDataOptimize, JoinsWhatMeets)
{
    EXPECT_EQ(optimized({{0, 40, here}, {40, 40, here}}), (Spans{{0, 80}}));
    EXPECT_EQ(optimized({{-100, 40, here}, {-60, 40, here}, {-20, 40, here}}), (Spans{{-100, 120}}));
}

TEST(TrackingDataOptimize, JoinsOverAHoleOfAtMost16Milliseconds)
{
    EXPECT_EQ(optimized({{0, 40, here}, {56, 40, here}}), (Spans{{0, 96}}));
    EXPECT_EQ(optimized({{0, 40, here}, {57, 40, here}}), (Spans{{0, 40}, {57, 40}}));
}

TEST(TrackingDataOptimize, JoinsWhatOverlapsByAtMost16Milliseconds)
{
    EXPECT_EQ(optimized({{0, 40, here}, {30, 40, here}}), (Spans{{0, 70}}));
    EXPECT_EQ(optimized({{0, 40, here}, {24, 40, here}}), (Spans{{0, 64}}));
    EXPECT_EQ(optimized({{0, 40, here}, {23, 40, here}}), (Spans{{0, 40}, {23, 40}}));
}

TEST(TrackingDataOptimize, EndsWhereTheLastJoinedEntryEnds)
{
    EXPECT_EQ(optimized({{0, 100, here}, {90, 5, here}}), (Spans{{0, 95}}));
    // What follows is measured from there: 95 and 111 are 16 apart, 95 and 112 are 17.
    EXPECT_EQ(optimized({{0, 100, here}, {90, 5, here}, {111, 10, here}}), (Spans{{0, 121}}));
    EXPECT_EQ(optimized({{0, 100, here}, {90, 5, here}, {112, 10, here}}), (Spans{{0, 95}, {112, 10}}));
}

TEST(TrackingDataOptimize, KeepsOtherRectanglesApart)
{
    for (double Frame::*field : {&Frame::left, &Frame::top, &Frame::width, &Frame::height}) {
        Frame other = here;
        other.*field += 0.05;
        EXPECT_EQ(optimized({{0, 40, here}, {40, 40, other}}), (Spans{{0, 40}, {40, 40}}));
    }
    EXPECT_EQ(optimized({{0, 10, here}, {10, 10, here}, {20, 10, there}, {30, 10, there}, {40, 10, here}}),
              (Spans{{0, 20}, {20, 20}, {40, 10}}));
}

TEST(TrackingDataOptimize, JoinsRectanglesThatAreNearlyEqual)
{
    const auto wide = [](double width) { return Frame(0.1, 0.2, width, 0.4); };
    EXPECT_EQ(optimized({{0, 40, wide(0.3)}, {40, 40, wide(0.3 * (1 + 1e-13))}}), (Spans{{0, 80}}));
    EXPECT_EQ(optimized({{0, 40, wide(0.3)}, {40, 40, wide(0.3 * (1 + 1e-11))}}), (Spans{{0, 40}, {40, 40}}));
    // What is hardly anything is nearly equal to nothing.
    const auto at = [](double left) { return Frame(left, 0.2, 0.3, 0.4); };
    EXPECT_EQ(optimized({{0, 40, at(0)}, {40, 40, at(1e-12)}}), (Spans{{0, 80}}));
    EXPECT_EQ(optimized({{0, 40, at(0)}, {40, 40, at(1.1e-12)}}), (Spans{{0, 40}, {40, 40}}));
}

TEST(TrackingDataOptimize, ComparesWithTheFirstRectangleOfTheRun)
{
    const auto wide = [](double part) { return Frame(0.1, 0.2, 0.3 * (1 + part * 1e-12), 0.4); };
    ASSERT_TRUE(wide(0.8) == wide(1.6));
    Data data = trackingOf({{0, 40, wide(0)}, {40, 40, wide(0.8)}, {80, 40, wide(1.6)}});
    data.optimize();
    EXPECT_EQ(spansOf(data), (Spans{{0, 80}, {80, 40}}));
    EXPECT_EQ(data.frames.at(MTime(0)).width, wide(0).width);
    EXPECT_EQ(data.frames.at(MTime(80)).width, wide(1.6).width);
}

TEST(TrackingDataOptimize, LeavesTheIdAlone)
{
    Data data = trackingOf({{0, 40, here}, {40, 40, here}});
    data.optimize();
    EXPECT_EQ(data.id, QStringLiteral("tracking"));
}

} // namespace
