// SPDX-License-Identifier: Apache-2.0
#include "tests/timeline/Timelines.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <array>
#include <set>
#include <tuple>
#include <type_traits>
#include <vector>

namespace {

using namespace TimelineTests;
using testing::ElementsAre;
using Timeline::Clip;
using Timeline::ClipTiming;
using Timeline::Track;

static_assert(std::is_copy_assignable_v<ClipOrder>);
static_assert(std::is_copy_assignable_v<ClipTimingOrder>);
static_assert(std::is_copy_assignable_v<ClipTimestampOrder>);
static_assert(std::is_empty_v<ClipTimingOrder>);
static_assert(std::is_empty_v<ClipTimestampOrder>);

class ClipOrders : public ::testing::Test
{
protected:
    ClipOrders()
    {
        // The order of the list is not that of the addresses.
        for (const int i : {2, 0, 1}) {
            timeline.addTrack(&tracks[i]);
            tracks[i].setTimeline(&timeline);
        }
    }

    std::array<Track, 3> tracks;
    std::array<Clip, 5> clips;
    Timeline::Object timeline;
};

TEST_F(ClipOrders, TheTrackComesBeforeTheLevelAndTheLevelBeforeTheStart)
{
    const ClipTimingOrder isBefore;
    const ClipTiming first = lying(&tracks[2], 900, 10, 9);
    const ClipTiming second = lying(&tracks[0], 500, 10, 1);
    const ClipTiming third = lying(&tracks[0], 0, 10, 2);
    const ClipTiming fourth = lying(&tracks[0], 1, 10, 2);
    const std::vector<ClipTiming> ordered{first, second, third, fourth};
    for (std::size_t i = 0; i != ordered.size(); ++i) {
        for (std::size_t j = 0; j != ordered.size(); ++j)
            EXPECT_EQ(isBefore(ordered[i], ordered[j]), i < j) << i << ", " << j;
    }
}

TEST_F(ClipOrders, TimingsThatAgreeInTheThreeAreEquivalentWhateverElseDiffers)
{
    const ClipTiming one = lying(&tracks[0], 100, 10, 1);
    ClipTiming other(&tracks[0], 1, MTime(100), MTime(20), MTime(30), MTime(40));
    other.setSpeedCompensated(true).setTransitionIn(MTime(1)).setFadeOutDuration(MTime(2));
    other.reversed = true;
    EXPECT_FALSE(ClipTimingOrder()(one, other));
    EXPECT_FALSE(ClipTimingOrder()(other, one));
    EXPECT_FALSE(ClipTimingOrder()(one, one));
}

TEST_F(ClipOrders, EachTrackIsLookedUpInItsOwnTimeline)
{
    // The second in its timeline, although it is the first one here.
    Timeline::Object other;
    Track foreign;
    foreign.setTimeline(&other);
    other.addTrack(&tracks[0])->addTrack(&foreign);
    timeline.tracks.push_front(&foreign);

    const ClipTiming onForeign = lying(&foreign, 0, 10);
    const ClipTiming onFirst = lying(&tracks[2], 0, 10);
    const ClipTiming onLast = lying(&tracks[1], 0, 10);
    // At 1 each, then at 1 and 3.
    EXPECT_FALSE(ClipTimingOrder()(onForeign, onFirst));
    EXPECT_FALSE(ClipTimingOrder()(onFirst, onForeign));
    EXPECT_TRUE(ClipTimingOrder()(onForeign, onLast));
    EXPECT_FALSE(ClipTimingOrder()(onLast, onForeign));
}

TEST_F(ClipOrders, ATrackThatIsNotListedComesLast)
{
    Track unlisted;
    unlisted.setTimeline(&timeline);
    EXPECT_TRUE(ClipTimingOrder()(lying(&tracks[1], 900, 10), lying(&unlisted, 0, 10)));
    EXPECT_FALSE(ClipTimingOrder()(lying(&unlisted, 0, 10), lying(&tracks[1], 900, 10)));
}

TEST_F(ClipOrders, ClipsAreOrderedAsTheirTimings)
{
    timeline.addClip(&clips[0], lying(&tracks[1], 0, 10))->addClip(&clips[1], lying(&tracks[2], 70, 10));
    timeline.addClip(&clips[2], lying(&tracks[0], 50, 10))->addClip(&clips[3], lying(&tracks[2], 60, 10));
    std::vector<const Clip*> order{&clips[0], &clips[1], &clips[2], &clips[3]};
    std::sort(order.begin(), order.end(), ClipOrder(&timeline));
    EXPECT_THAT(order, ElementsAre(&clips[3], &clips[1], &clips[2], &clips[0]));

    const std::set<const Clip*, ClipOrder> sorted(order.begin(), order.end(), ClipOrder(&timeline));
    EXPECT_THAT(sorted, ElementsAre(&clips[3], &clips[1], &clips[2], &clips[0]));
}

TEST_F(ClipOrders, ClipsAreOrderedByTheTimelineThatWasAssigned)
{
    Timeline::Object other(timeline);
    timeline.addClip(&clips[0], lying(&tracks[0], 0, 10))->addClip(&clips[1], lying(&tracks[0], 5, 10));
    other.addClip(&clips[0], lying(&tracks[0], 5, 10))->addClip(&clips[1], lying(&tracks[0], 0, 10));
    ClipOrder order(&timeline);
    EXPECT_EQ(order.timeline, &timeline);
    EXPECT_TRUE(order(&clips[0], &clips[1]));
    order = ClipOrder(&other);
    EXPECT_EQ(order.timeline, &other);
    EXPECT_FALSE(order(&clips[0], &clips[1]));
    EXPECT_TRUE(order(&clips[1], &clips[0]));
}

TEST_F(ClipOrders, AClipThatIsNotOnTheTimelineIsRefused)
{
    timeline.addClip(&clips[0], lying(&tracks[0], 0, 10));
    const ClipOrder isBefore(&timeline);
    expectUnknownKey([&] { isBefore(&clips[0], &clips[1]); });
    expectUnknownKey([&] { isBefore(&clips[1], &clips[0]); });
    expectUnknownKey([&] { isBefore(&clips[0], nullptr); });
}

TEST_F(ClipOrders, StartsAreOrderedWhateverTheTrack)
{
    const ClipTimestampOrder isBefore;
    EXPECT_TRUE(isBefore(lying(&tracks[1], -5, 10, 3), lying(&tracks[2], 0, 1)));
    EXPECT_FALSE(isBefore(lying(&tracks[2], 0, 1), lying(&tracks[1], -5, 10, 3)));
    EXPECT_FALSE(isBefore(lying(nullptr, 7, 10), lying(&tracks[0], 7, 1, 2)));
    EXPECT_FALSE(isBefore(lying(&tracks[0], 7, 1, 2), lying(nullptr, 7, 10)));
}

RC_GTEST_PROP(ClipTimingOrders, AgreeWithTuplesOfTheThree, ())
{
    std::vector<Track> tracks(3);
    Timeline::Object timeline;
    const std::vector<int> places = anyOrder(3);
    for (const int i : places)
        timeline.addTrack(tracks[i].setTimeline(&timeline));

    std::vector<ClipTiming> timings;
    std::vector<std::tuple<int, int, int>> keys;
    for (int i = 0; i != 8; ++i) {
        const int place = *rc::gen::inRange(0, 3);
        const int level = *rc::gen::inRange(-1, 2);
        const int start = *rc::gen::inRange(-1, 2);
        timings.push_back(lying(&tracks[places[place]], start, *rc::gen::inRange(0, 9), level));
        keys.push_back({place, level, start});
    }
    for (std::size_t i = 0; i != timings.size(); ++i) {
        for (std::size_t j = 0; j != timings.size(); ++j) {
            RC_ASSERT(ClipTimingOrder()(timings[i], timings[j]) == (keys[i] < keys[j]));
            RC_ASSERT(ClipTimestampOrder()(timings[i], timings[j]) ==
                      (std::get<2>(keys[i]) < std::get<2>(keys[j])));
        }
    }
}

} // namespace
