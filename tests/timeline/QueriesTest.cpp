// SPDX-License-Identifier: Apache-2.0
#include "tests/timeline/Timelines.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <array>
#include <iterator>
#include <limits>
#include <utility>
#include <vector>

namespace {

using namespace TimelineTests;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;
using Timeline::Clip;
using Timeline::ClipTiming;
using Timeline::Track;

class Queries : public ::testing::Test
{
protected:
    void lay(int clip, int track, MTime timestamp, MTime duration, int level = 0)
    {
        timeline.addClip(&clips[clip], lying(&tracks[track], timestamp, duration, level));
    }

    Clips those(std::initializer_list<int> indices) const
    {
        Clips chosen;
        for (const int i : indices)
            chosen.insert(&clips[i]);
        return chosen;
    }

    std::array<Clip, 6> clips;
    std::array<Track, 3> tracks;
    Timeline::Object timeline;
};

TEST_F(Queries, TheTimingOfAClipIsTheStoredOne)
{
    lay(0, 1, 10, 20);
    EXPECT_EQ(&timeline.clipTiming(&clips[0]), &timeline.clips.at(&clips[0]));
    expectUnknownKey([&] { timeline.clipTiming(&clips[1]); });
    expectUnknownKey([&] { timeline.clipTiming(nullptr); });
    EXPECT_EQ(timeline.clips.size(), 1u);
}

TEST_F(Queries, AClipIsContainedIfItHasATiming)
{
    EXPECT_FALSE(timeline.contains(noClip));
    EXPECT_FALSE(timeline.contains(&clips[0]));
    timeline.addLink(&clips[0], &clips[1], MTime());
    EXPECT_FALSE(timeline.contains(&clips[0]));
    EXPECT_FALSE(timeline.contains(&clips[1]));
    lay(0, 0, 0, 0);
    EXPECT_TRUE(timeline.contains(&clips[0]));
    EXPECT_FALSE(timeline.contains(noClip));
}

TEST_F(Queries, SpeedIsTheNativeLengthByThePresentOne)
{
    lay(0, 0, 0, 2000);
    clips[0].setSourceDuration(MTime(3000));
    EXPECT_EQ(timeline.clipSpeed(&clips[0]), 1.5);
    clips[0].setSourceDuration(MTime(500));
    EXPECT_EQ(timeline.clipSpeed(&clips[0]), 0.25);
    timeline.addClip(&clips[0], ClipTiming());
    EXPECT_EQ(timeline.clipSpeed(&clips[0]), std::numeric_limits<double>::infinity());
    expectUnknownKey([&] { timeline.clipSpeed(&clips[1]); });
    expectUnknownKey([&] { timeline.clipSpeed(nullptr); });
}

TEST_F(Queries, ClipsAreChosenByAMaskOfTypes)
{
    const int types[] = {0, 1, 2, 4, 8, 48};
    for (int i = 0; i != 6; ++i) {
        clips[i].setType(Clip::ClipType(types[i]));
        lay(i, 0, 0, 10);
    }
    EXPECT_THAT(timeline.clipsByType(0), IsEmpty());
    EXPECT_EQ(timeline.clipsByType(1), those({1}));
    EXPECT_EQ(timeline.clipsByType(Clip::VideoClip | Clip::IntroVideoClip), those({1, 4}));
    EXPECT_EQ(timeline.clipsByType(16), those({5}));
    EXPECT_EQ(timeline.clipsByType(63), those({1, 2, 3, 4, 5}));
    EXPECT_EQ(timeline.clipsByType(-1), those({1, 2, 3, 4, 5}));
    EXPECT_THAT(timeline.clipsByType(64), IsEmpty());
}

TEST_F(Queries, TheDifferenceIsByAddressAndNotByTiming)
{
    for (const int i : {0, 1, 3, 4})
        lay(i, 0, i, 10);
    Timeline::Object other;
    for (const int i : {1, 2, 3, 5})
        other.addClip(&clips[i], ClipTiming());
    EXPECT_EQ(timeline.clipsDifference(&other), those({0, 4}));
    EXPECT_EQ(other.clipsDifference(&timeline), those({2, 5}));
    EXPECT_THAT(timeline.clipsDifference(&timeline), IsEmpty());
    const Timeline::Object none;
    EXPECT_EQ(timeline.clipsDifference(&none), those({0, 1, 3, 4}));
    EXPECT_THAT(none.clipsDifference(&timeline), IsEmpty());
}

TEST_F(Queries, ClipsLieAtATrack)
{
    lay(0, 0, 0, 10);
    lay(1, 1, 0, 10);
    lay(2, 0, 50, 10);
    timeline.addClip(&clips[3], ClipTiming());
    EXPECT_EQ(timeline.clipsAt(&tracks[0]), those({0, 2}));
    EXPECT_THAT(timeline.clipsAt(&tracks[2]), IsEmpty());
    EXPECT_EQ(timeline.clipsAt(nullptr), those({3}));
}

TEST_F(Queries, ClipsLieAtATimeFromTheirStartUpToButNotAtTheirEnd)
{
    lay(0, 0, 1000, 500);
    lay(1, 0, 1500, 500);
    lay(2, 1, 1000, 500);
    lay(3, 0, 1200, 100, 1);
    lay(4, 0, 1000, 0);
    EXPECT_THAT(timeline.clipsAt(&tracks[0], MTime(999)), IsEmpty());
    EXPECT_EQ(timeline.clipsAt(&tracks[0], MTime(1000)), those({0}));
    EXPECT_EQ(timeline.clipsAt(&tracks[0], MTime(1250)), those({0, 3}));
    EXPECT_EQ(timeline.clipsAt(&tracks[0], MTime(1499)), those({0}));
    EXPECT_EQ(timeline.clipsAt(&tracks[0], MTime(1500)), those({1}));
    EXPECT_THAT(timeline.clipsAt(&tracks[0], MTime(2000)), IsEmpty());
    EXPECT_THAT(timeline.clipsAt(&tracks[2], MTime(1000)), IsEmpty());
}

TEST_F(Queries, ATimelineLastsUntilTheClipThatEndsLast)
{
    EXPECT_EQ(timeline.duration(), MTime());
    EXPECT_EQ(timeline.lastClipTimestamp(), MTime());
    lay(0, 0, 0, 1000);
    lay(1, 1, 100, 100);
    EXPECT_EQ(timeline.duration(), MTime(1000));
    EXPECT_EQ(timeline.lastClipTimestamp(), MTime(1000));
    lay(2, 2, 990, 11);
    EXPECT_EQ(timeline.duration(), MTime(1001));
    EXPECT_EQ(timeline.lastClipTimestamp(), MTime(1001));
}

TEST_F(Queries, ATimelineThatLiesBeforeZeroEndsBeforeZero)
{
    lay(0, 0, -1000, 100);
    lay(1, 0, -700, 100);
    EXPECT_EQ(timeline.duration(), MTime(-600));
    EXPECT_EQ(timeline.lastClipTimestamp(), MTime(-600));
    EXPECT_EQ(timeline.trackDuration(&tracks[0]), MTime(-600));
}

TEST_F(Queries, WithoutClipsABoundaryIsTheTimeItself)
{
    for (const int time : {-5, 0, 1000}) {
        EXPECT_EQ(timeline.nextClipBoundary(time), MTime(time));
        EXPECT_EQ(timeline.prevClipBoundary(time), MTime(time));
    }
}

TEST_F(Queries, BoundariesAreStrictlyBehindAndBefore)
{
    lay(0, 0, 1000, 1000);
    EXPECT_EQ(timeline.nextClipBoundary(0), MTime(1000));
    EXPECT_EQ(timeline.nextClipBoundary(999), MTime(1000));
    EXPECT_EQ(timeline.nextClipBoundary(1000), MTime(2000));
    EXPECT_EQ(timeline.nextClipBoundary(2000), MTime(2000));
    EXPECT_EQ(timeline.nextClipBoundary(2500), MTime(2500));
    EXPECT_EQ(timeline.prevClipBoundary(3000), MTime(2000));
    EXPECT_EQ(timeline.prevClipBoundary(2000), MTime(1000));
    EXPECT_EQ(timeline.prevClipBoundary(1001), MTime(1000));
    EXPECT_EQ(timeline.prevClipBoundary(1000), MTime(1000));
    EXPECT_EQ(timeline.prevClipBoundary(500), MTime(500));
}

TEST_F(Queries, BoundariesAreThoseOfAllTracks)
{
    lay(0, 0, 1000, 1000);
    lay(1, 1, 1500, 1500);
    EXPECT_EQ(timeline.nextClipBoundary(1000), MTime(1500));
    EXPECT_EQ(timeline.nextClipBoundary(2000), MTime(3000));
    EXPECT_EQ(timeline.prevClipBoundary(2000), MTime(1500));
    EXPECT_EQ(timeline.prevClipBoundary(9000), MTime(3000));
}

TEST_F(Queries, ATrackIsEmptyWhereNoClipLiesOnIt)
{
    EXPECT_TRUE(timeline.isTrackEmpty(&tracks[0]));
    EXPECT_TRUE(timeline.isTrackEmpty(nullptr));
    lay(0, 0, 0, 0);
    EXPECT_FALSE(timeline.isTrackEmpty(&tracks[0]));
    EXPECT_TRUE(timeline.isTrackEmpty(&tracks[1]));
    EXPECT_TRUE(timeline.isTrackEmpty(nullptr));
}

TEST_F(Queries, AnUnknownTrackHasNothing)
{
    lay(0, 0, 10, 20);
    for (const Track* track : {static_cast<const Track*>(&tracks[1]), noTrack}) {
        EXPECT_THAT(timeline.trackTiming(track), IsEmpty());
        EXPECT_THAT(timeline.clipsAt(track), IsEmpty());
        EXPECT_EQ(timeline.trackDuration(track), MTime());
        EXPECT_TRUE(timeline.isTrackEmpty(track));
    }
}

TEST_F(Queries, ClipsOfATrackAreInTheOrderOfTheirStartsThenOfTheirAddresses)
{
    lay(0, 0, 500, 10);
    lay(1, 0, 100, 10);
    lay(2, 1, 100, 10);
    lay(3, 0, 500, 90);
    lay(4, 0, 100, 5);
    lay(5, 0, -20, 5);
    EXPECT_THAT(timeline.trackTiming(&tracks[0]),
                ElementsAre(Pair(MTime(-20), &clips[5]), Pair(MTime(100), &clips[1]),
                            Pair(MTime(100), &clips[4]), Pair(MTime(500), &clips[0]),
                            Pair(MTime(500), &clips[3])));
}

TEST_F(Queries, ATrackLastsUntilTheEndOfTheClipThatStartsLast)
{
    lay(0, 0, 0, 1000);
    lay(1, 0, 100, 100, 1);
    EXPECT_EQ(timeline.trackDuration(&tracks[0]), MTime(200));
    EXPECT_EQ(timeline.trackDuration(timeline.trackTiming(&tracks[0])), MTime(200));
    EXPECT_EQ(timeline.duration(), MTime(1000));
}

TEST_F(Queries, OfClipsThatStartTogetherTheLongestCounts)
{
    lay(0, 0, 700, 100);
    lay(1, 0, 700, 300, 1);
    lay(2, 0, 700, 200, 2);
    EXPECT_EQ(timeline.trackDuration(&tracks[0]), MTime(1000));
    EXPECT_EQ(timeline.trackDuration(timeline.trackTiming(&tracks[0])), MTime(1000));
}

TEST_F(Queries, NoClipsLastNoTime)
{
    EXPECT_EQ(timeline.trackDuration(std::multimap<MTime, const Clip*>()), MTime());
}

TEST_F(Queries, TheTimingOfATrackIsReadStrictlyWhereItStartsLast)
{
    lay(0, 0, 0, 10);
    const std::multimap<MTime, const Clip*> early{{MTime(0), &clips[5]}, {MTime(50), &clips[0]}};
    EXPECT_EQ(timeline.trackDuration(early), MTime(60));
    const std::multimap<MTime, const Clip*> late{{MTime(0), &clips[0]}, {MTime(50), &clips[5]}};
    expectUnknownKey([&] { timeline.trackDuration(late); });
    const std::multimap<MTime, const Clip*> second{{MTime(50), &clips[0]}, {MTime(50), &clips[5]}};
    expectUnknownKey([&] { timeline.trackDuration(second); });
}

/// The same questions asked of plain tables of numbers.
struct Row
{
    int track;
    int from;
    int length;
};

std::vector<int> boundariesOf(const std::vector<Row>& rows)
{
    std::vector<int> boundaries;
    for (const Row& row : rows) {
        boundaries.push_back(row.from);
        boundaries.push_back(row.from + row.length);
    }
    std::sort(boundaries.begin(), boundaries.end());
    boundaries.erase(std::unique(boundaries.begin(), boundaries.end()), boundaries.end());
    return boundaries;
}

struct RandomTimeline
{
    std::array<Track, 3> tracks;
    std::vector<Clip> clips;
    std::vector<Row> rows;
    Timeline::Object timeline;

    RandomTimeline() : clips(std::size_t(*rc::gen::inRange(0, 12)))
    {
        for (const Clip& clip : clips) {
            rows.push_back({*rc::gen::inRange(0, 3), *rc::gen::inRange(-20, 20), *rc::gen::inRange(0, 15)});
            const Row& row = rows.back();
            timeline.addClip(&clip, lying(&tracks[row.track], row.from, row.length));
        }
    }
};

RC_GTEST_PROP(Boundaries, AreTheNeighboursOfATimeInASortedList, ())
{
    const RandomTimeline random;
    const std::vector<int> boundaries = boundariesOf(random.rows);
    for (int time = -25; time != 40; ++time) {
        const auto next = std::upper_bound(boundaries.begin(), boundaries.end(), time);
        RC_ASSERT(random.timeline.nextClipBoundary(time) == MTime(next == boundaries.end() ? time : *next));
        const auto notBefore = std::lower_bound(boundaries.begin(), boundaries.end(), time);
        RC_ASSERT(random.timeline.prevClipBoundary(time) ==
                  MTime(notBefore == boundaries.begin() ? time : *(notBefore - 1)));
    }
}

RC_GTEST_PROP(Boundaries, AreWalkedThroughForthAndBack, ())
{
    const RandomTimeline random;
    std::vector<int> forth;
    for (MTime time = -100; time != random.timeline.nextClipBoundary(time); forth.push_back(int(time.ms())))
        time = random.timeline.nextClipBoundary(time);
    RC_ASSERT(forth == boundariesOf(random.rows));
    std::vector<int> back;
    for (MTime time = 100; time != random.timeline.prevClipBoundary(time); back.push_back(int(time.ms())))
        time = random.timeline.prevClipBoundary(time);
    RC_ASSERT(std::equal(back.rbegin(), back.rend(), forth.begin(), forth.end()));
}

RC_GTEST_PROP(TrackQueries, AgreeWithPlainTables, ())
{
    const RandomTimeline random;
    const int time = *rc::gen::inRange(-25, 40);
    int latest = std::numeric_limits<int>::min();
    for (int track = 0; track != 3; ++track) {
        Clips onTrack;
        Clips atTime;
        std::vector<std::pair<int, int>> starts;
        for (std::size_t i = 0; i != random.rows.size(); ++i) {
            const Row& row = random.rows[i];
            latest = std::max(latest, row.from + row.length);
            if (row.track != track)
                continue;
            onTrack.insert(&random.clips[i]);
            starts.push_back({row.from, row.length});
            if (time >= row.from && time < row.from + row.length)
                atTime.insert(&random.clips[i]);
        }
        std::sort(starts.begin(), starts.end());
        const Track* const asked = &random.tracks[track];
        const int end = starts.empty() ? 0 : starts.back().first + starts.back().second;
        RC_ASSERT(random.timeline.clipsAt(asked) == onTrack);
        RC_ASSERT(random.timeline.clipsAt(asked, time) == atTime);
        RC_ASSERT(random.timeline.isTrackEmpty(asked) == onTrack.empty());
        RC_ASSERT(random.timeline.trackTiming(asked).size() == onTrack.size());
        RC_ASSERT(random.timeline.trackDuration(asked) == MTime(end));
        RC_ASSERT(random.timeline.trackDuration(random.timeline.trackTiming(asked)) == MTime(end));
    }
    RC_ASSERT(random.timeline.duration() == MTime(random.rows.empty() ? 0 : latest));
}

} // namespace
