// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldTexts.h"
#include "tests/types/Printing.h"

#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>
#include <rapidcheck/gtest.h>

#include <cmath>
#include <functional>
#include <limits>
#include <vector>

namespace {

using testing::ElementsAre;
using Testing::FieldText;
using testing::StartsWith;
using Timeline::Clip;
using Timeline::ClipTiming;
using Timeline::Track;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, ClipTiming>);
static_assert(!std::is_base_of_v<PubSub::Object, ClipTiming>);

const Track someTrack;
const Track otherTrack;

ClipTiming everyFieldSet()
{
    ClipTiming timing(&someTrack, 2, 100, 3000, 2000, 10000);
    timing.setSpeedCompensated(true).setTransitionIn(30).setTransitionOut(40);
    timing.setFadeInDuration(50).setFadeOutDuration(60).setTimingMode(Media::TimingMode(7));
    timing.reversed = true;
    return timing;
}

ClipTiming at(MTime timestamp, MTime duration)
{
    return ClipTiming(&someTrack, 0, timestamp, duration, 0, duration);
}

static_assert(sizeof(ClipTiming::timingMode) == 4);
static_assert(sizeof(ClipTiming::trackLevel) == 4);

TEST(ClipTiming, IsMadeOfTrackLevelAndFourTimes)
{
    const ClipTiming timing(&someTrack, 2, 100, 3000, 2000, 10000);
    EXPECT_EQ(timing.track, &someTrack);
    EXPECT_EQ(timing.trackLevel, 2);
    EXPECT_EQ(timing.timestamp, MTime(100));
    EXPECT_EQ(timing.duration, MTime(3000));
    EXPECT_EQ(timing.sourcePosition, MTime(2000));
    EXPECT_EQ(timing.sourceDuration, MTime(10000));
    EXPECT_THAT(Testing::defaultFields(timing),
                ElementsAre("speedCompensated", "transitionIn", "transitionOut", "fadeInDuraion",
                            "fadeOutDuraion", "reversed", "timingMode"));
}

TEST(ClipTiming, IsMadeByName)
{
    Testing::expectMadeByName<ClipTiming>("Timeline::ClipTiming");
}

TEST(ClipTiming, IsWrittenInAnOrderOfItsOwnWithTwoMisspeltKeys)
{
    std::vector<FieldText> fields = Testing::fieldTexts(everyFieldSet());
    ASSERT_FALSE(fields.empty());
    EXPECT_THAT(fields.front().second, StartsWith("Timeline::Track #"));
    fields.front().second.clear();
    EXPECT_THAT(fields, ElementsAre(FieldText("track", ""), FieldText("trackLevel", "2"),
                                    FieldText("timestamp", "100ms"), FieldText("sourceDuration", "10000ms"),
                                    FieldText("sourcePosition", "2000ms"), FieldText("duration", "3000ms"),
                                    FieldText("speedCompensated", "true"), FieldText("transitionIn", "30ms"),
                                    FieldText("transitionOut", "40ms"), FieldText("fadeInDuraion", "50ms"),
                                    FieldText("fadeOutDuraion", "60ms"), FieldText("reversed", "true"),
                                    FieldText("timingMode", "7")));
}

TEST(ClipTiming, ALongDurationWrapsInTheArchivesAndIsWholeInTheStream)
{
    const ClipTiming timing = ClipTiming().setDuration(2147483648);
    for (const Way& way : allWays) {
        const Document::Graph graph = graphOf(documentOf({&timing}, way));
        const auto* const loaded = graph.rootAs<ClipTiming>();
        ASSERT_NE(loaded, nullptr) << way.name;
        EXPECT_EQ(loaded->duration, way.wrapsTimes() ? MTime(-2147483648) : MTime(2147483648)) << way.name;
    }
}

TEST(ClipTiming, EndsADurationBehindItsStart)
{
    const ClipTiming timing(nullptr, 0, 100, 3000, 2000, 10000);
    EXPECT_EQ(timing.end(), MTime(3100));
    EXPECT_EQ(timing.sourceEnd(), MTime(5000));
    EXPECT_EQ(ClipTiming(nullptr, 0, 100, -30, -5, 0).end(), MTime(70));
    EXPECT_EQ(ClipTiming(nullptr, 0, 100, -30, -5, 0).sourceEnd(), MTime(-35));
}

TEST(ClipTiming, ContainsBothItsEnds)
{
    const ClipTiming timing = at(100, 50);
    EXPECT_FALSE(timing.contains(99));
    EXPECT_TRUE(timing.contains(100));
    EXPECT_TRUE(timing.contains(149));
    EXPECT_TRUE(timing.contains(timing.end()));
    EXPECT_FALSE(timing.contains(151));
}

TEST(ClipTiming, WithoutADurationContainsJustItsStart)
{
    const ClipTiming timing = at(100, 0);
    EXPECT_FALSE(timing.contains(99));
    EXPECT_TRUE(timing.contains(100));
    EXPECT_FALSE(timing.contains(101));
}

TEST(ClipTiming, OfNegativeDurationContainsNothing)
{
    const ClipTiming timing = at(100, -10);
    for (const int time : {89, 90, 95, 100, 101})
        EXPECT_FALSE(timing.contains(time)) << time;
}

TEST(ClipTiming, ThatOnlyTouchDoNotOverlapButFollow)
{
    const ClipTiming first = at(0, 100);
    const ClipTiming second = at(100, 50);
    EXPECT_FALSE(first.overlapsWith(second));
    EXPECT_FALSE(second.overlapsWith(first));
    EXPECT_TRUE(first.placedSequentially(second));
    EXPECT_FALSE(second.placedSequentially(first));
}

TEST(ClipTiming, ThatShareAMillisecondOverlapAndDoNotFollow)
{
    const ClipTiming first = at(0, 101);
    const ClipTiming second = at(100, 50);
    EXPECT_TRUE(first.overlapsWith(second));
    EXPECT_TRUE(second.overlapsWith(first));
    EXPECT_TRUE(first.overlapsWith(first));
    EXPECT_FALSE(first.placedSequentially(second));
    EXPECT_FALSE(at(0, 99).placedSequentially(second));
}

TEST(ClipTiming, WithoutDurationsFollowEachOther)
{
    const ClipTiming first = at(100, 0);
    const ClipTiming second = at(100, 0);
    EXPECT_TRUE(first.placedSequentially(second));
    EXPECT_TRUE(second.placedSequentially(first));
    EXPECT_FALSE(first.overlapsWith(second));
}

TEST(ClipTiming, FollowsOnlyOnItsTrackAndLevel)
{
    const ClipTiming first = at(0, 100);
    EXPECT_FALSE(first.placedSequentially(at(100, 50).setTrack(&otherTrack)));
    EXPECT_FALSE(first.placedSequentially(at(100, 50).setTrack(nullptr)));
    EXPECT_FALSE(first.placedSequentially(at(100, 50).setTrackLevel(1)));
    EXPECT_TRUE(ClipTiming(first).setTrack(nullptr).placedSequentially(at(100, 50).setTrack(nullptr)));
}

TEST(ClipTiming, WithoutADurationOverlapsInsideAnotherAndNotAtItsEnds)
{
    const ClipTiming other = at(100, 50);
    EXPECT_TRUE(at(101, 0).overlapsWith(other));
    EXPECT_TRUE(other.overlapsWith(at(149, 0)));
    EXPECT_FALSE(at(100, 0).overlapsWith(other));
    EXPECT_FALSE(other.overlapsWith(at(100, 0)));
    EXPECT_FALSE(at(150, 0).overlapsWith(other));
    EXPECT_FALSE(other.overlapsWith(at(150, 0)));
}

TEST(ClipTiming, OverlapsOnAnyTrackAndLevel)
{
    const ClipTiming timing = at(0, 100);
    EXPECT_TRUE(timing.overlapsWith(at(50, 100).setTrack(&otherTrack)));
    EXPECT_TRUE(timing.overlapsWith(at(50, 100).setTrackLevel(3)));
}

/// What differs from everyFieldSet() in one field.
ClipTiming with(const std::function<void(ClipTiming&)>& change)
{
    ClipTiming timing = everyFieldSet();
    change(timing);
    return timing;
}

TEST(ClipTiming, IsOfTheSameTimeWhateverItsTrackLevelAndCompensation)
{
    const ClipTiming timing = everyFieldSet();
    EXPECT_TRUE(timing == everyFieldSet());
    EXPECT_FALSE(timing != everyFieldSet());
    EXPECT_TRUE(timing.isSameTime(everyFieldSet()));
    for (const ClipTiming& other : {
             with([](ClipTiming& t) { t.setTrack(&otherTrack); }),
             with([](ClipTiming& t) { t.setTrackLevel(3); }),
             with([](ClipTiming& t) { t.setSpeedCompensated(false); }),
         }) {
        EXPECT_TRUE(timing.isSameTime(other));
        EXPECT_TRUE(other.isSameTime(timing));
        EXPECT_FALSE(timing == other);
        EXPECT_TRUE(timing != other);
    }
}

TEST(ClipTiming, IsOfAnotherTimeIfAnyOtherFieldDiffers)
{
    const ClipTiming timing = everyFieldSet();
    for (const ClipTiming& other : {
             with([](ClipTiming& t) { t.setTimestamp(101); }),
             with([](ClipTiming& t) { t.setDuration(3001); }),
             with([](ClipTiming& t) { t.setSourcePosition(2001); }),
             with([](ClipTiming& t) { t.setSourceDuration(10001); }),
             with([](ClipTiming& t) { t.setTransitionIn(31); }),
             with([](ClipTiming& t) { t.setTransitionOut(41); }),
             with([](ClipTiming& t) { t.setFadeInDuration(51); }),
             with([](ClipTiming& t) { t.setFadeOutDuration(61); }),
             with([](ClipTiming& t) { t.setTimingMode(Media::TimingMode(8)); }),
             with([](ClipTiming& t) { t.reversed = false; }),
         }) {
        EXPECT_FALSE(timing.isSameTime(other)) << Testing::Dump::of(other);
        EXPECT_FALSE(timing == other) << Testing::Dump::of(other);
        EXPECT_TRUE(timing != other) << Testing::Dump::of(other);
    }
}

TEST(ClipTiming, IsOrderedByItsStartAlone)
{
    EXPECT_TRUE(at(99, 50) < at(100, 10));
    EXPECT_FALSE(at(100, 10) < at(99, 50));
    EXPECT_FALSE(at(100, 10) < at(100, 50).setTrack(&otherTrack));
    EXPECT_FALSE(at(100, 50).setTrack(&otherTrack) < at(100, 10));
}

TEST(ClipTiming, ResizingLeftMovesStartAndSourceTogether)
{
    ClipTiming timing = everyFieldSet();
    EXPECT_EQ(&timing.resizeLeft(250), &timing);
    EXPECT_TRUE(timing ==
                with([](ClipTiming& t) { t.setTimestamp(350).setSourcePosition(2250).setDuration(2750); }));
    timing.resizeLeft(-350);
    EXPECT_TRUE(timing ==
                with([](ClipTiming& t) { t.setTimestamp(0).setSourcePosition(1900).setDuration(3100); }));
}

TEST(ClipTiming, ResizingRightChangesTheDurationAlone)
{
    ClipTiming timing = everyFieldSet();
    EXPECT_EQ(&timing.resizeRight(250), &timing);
    EXPECT_TRUE(timing == with([](ClipTiming& t) { t.setDuration(3250); }));
    timing.resizeRight(-350);
    EXPECT_TRUE(timing == with([](ClipTiming& t) { t.setDuration(2900); }));
}

TEST(ClipTiming, ResizingHasNoLimits)
{
    ClipTiming timing(nullptr, 0, 100, 50, 20, 80);
    timing.resizeLeft(60);
    EXPECT_EQ(timing.duration, MTime(-10));
    timing.resizeLeft(-200).resizeRight(1000);
    EXPECT_EQ(timing.timestamp, MTime(-40));
    EXPECT_EQ(timing.sourcePosition, MTime(-120));
    EXPECT_EQ(timing.duration, MTime(1190));
    EXPECT_EQ(timing.sourceDuration, MTime(80));
}

TEST(ClipTiming, ReversingMirrorsTheStretchWithinTheSource)
{
    ClipTiming timing(&someTrack, 2, 100, 3000, 2000, 10000);
    EXPECT_EQ(&timing.reverse(), &timing);
    ClipTiming mirrored(&someTrack, 2, 100, 3000, 5000, 10000);
    mirrored.reversed = true;
    EXPECT_TRUE(timing == mirrored);
    timing.reverse();
    EXPECT_TRUE(timing == ClipTiming(&someTrack, 2, 100, 3000, 2000, 10000));
}

TEST(ClipTiming, SpeedingUpByTwoHalvesAllButStartTransitionsAndFades)
{
    ClipTiming timing = everyFieldSet();
    EXPECT_EQ(&timing.speedUp(2.0), &timing);
    EXPECT_TRUE(timing == with([](ClipTiming& t) {
                    t.setSourceDuration(5000).setSourcePosition(1000).setDuration(1500);
                }));
}

TEST(ClipTiming, SpeedingUpRoundsEachFieldByItself)
{
    // 1001 / 2 = 500.5, 101 / 2 = 50.5 and 301 / 2 = 150.5: a half goes away from zero.
    ClipTiming timing(nullptr, 0, 0, 301, 101, 1001);
    timing.speedUp(2.0);
    EXPECT_EQ(timing.sourceDuration, MTime(501));
    EXPECT_EQ(timing.sourcePosition, MTime(51));
    EXPECT_EQ(timing.duration, MTime(151));
    // 402 / 2 = 201: the end has drifted by one.
    EXPECT_EQ(timing.sourceEnd(), MTime(202));
}

TEST(ClipTiming, SpeedingUpByLessThanOneSlowsDown)
{
    ClipTiming timing(nullptr, 0, 7, 300, 100, 1000);
    timing.speedUp(0.5);
    EXPECT_EQ(timing.timestamp, MTime(7));
    EXPECT_EQ(timing.duration, MTime(600));
    EXPECT_EQ(timing.sourcePosition, MTime(200));
    EXPECT_EQ(timing.sourceDuration, MTime(2000));
}

/// Twice as fast as its source, which is 20000 long.
ClipTiming fast()
{
    return ClipTiming(nullptr, 0, 1000, 3000, 2000, 10000);
}

TEST(ClipTiming, MapsToTheSourceAtItsSpeed)
{
    // The scale is 10000 / 20000 = 0.5.
    EXPECT_EQ(fast().mapToSource(1000, 20000), MTime(4000));
    EXPECT_EQ(fast().mapToSource(2500, 20000), MTime(7000));
    EXPECT_EQ(fast().mapToSource(4000, 20000), MTime(10000));
    Clip clip;
    clip.setSourceDuration(20000);
    EXPECT_EQ(fast().mapToSource(2500, &clip), MTime(7000));
}

TEST(ClipTiming, MapsToTheSourceFromItsFarEndWhileItIsReversed)
{
    ClipTiming timing(nullptr, 0, 1000, 3000, 2000, 10000);
    timing.reversed = true;
    EXPECT_EQ(timing.mapToSource(timing.timestamp, 10000), MTime(8000));
    EXPECT_EQ(timing.mapToSource(timing.end(), 10000), MTime(5000));
    ClipTiming twice = fast();
    twice.reversed = true;
    EXPECT_EQ(twice.mapToSource(2500, 20000), MTime(13000));
}

TEST(ClipTiming, MapsToTheSourceByDividingByTheScale)
{
    // 35 / (14.0 / 3.0) falls just short of 7.5; 35 * 3.0 / 14.0 would be that, and rounded up.
    EXPECT_EQ(ClipTiming(nullptr, 0, 0, 1, 0, 14).mapToSource(35, 3), MTime(7));
}

TEST(ClipTiming, RoundsBeforeItCountsFromTheFarEnd)
{
    // 1 / (2 / 1) = 0.5, which is 1; 1 - 1 = 0. Rounded at the end, it would be 1 - 0.5 = 0.5, and so 1.
    ClipTiming timing(nullptr, 0, 0, 2, 0, 2);
    timing.reversed = true;
    EXPECT_EQ(timing.mapToSource(1, 1), MTime(0));
}

TEST(ClipTiming, MapsTimesOutsideTheClipAsWell)
{
    EXPECT_EQ(fast().mapToSource(0, 20000), MTime(2000));
    EXPECT_EQ(fast().mapToSource(-2000, 20000), MTime(-2000));
    EXPECT_EQ(fast().mapToSource(99000, 20000), MTime(200000));
    Clip clip;
    clip.setSourceDuration(20000);
    EXPECT_EQ(fast().mapToTimeline(-2000, &clip), MTime(-2000));
    EXPECT_EQ(fast().mapToTimeline(200000, &clip), MTime(99000));
}

TEST(ClipTiming, MapsToTheTimelineAtItsSpeed)
{
    Clip clip;
    clip.setSourceDuration(20000);
    EXPECT_EQ(fast().mapToTimeline(4000, &clip), MTime(1000));
    EXPECT_EQ(fast().mapToTimeline(7000, &clip), MTime(2500));
    ClipTiming reversed = fast();
    reversed.reversed = true;
    EXPECT_EQ(reversed.mapToTimeline(13000, &clip), MTime(2500));
}

TEST(ClipTiming, MapsToTheTimelineWithOneRoundingAtTheEnd)
{
    Clip clip;
    clip.setSourceDuration(3000);
    // 2 * (1000 / 3000) - 0 = 0.67, and 1 * (1000 / 3000) - 0 = 0.33.
    const ClipTiming timing(nullptr, 0, 10, 500, 0, 1000);
    EXPECT_EQ(timing.mapToTimeline(2, &clip), MTime(11));
    EXPECT_EQ(timing.mapToTimeline(1, &clip), MTime(10));
    // 1 * (1000 / 2000) - 1 = -0.5, which is -1; rounded before, it would be 1 - 1 = 0.
    clip.setSourceDuration(2000);
    EXPECT_EQ(ClipTiming(nullptr, 0, 10, 500, 1, 1000).mapToTimeline(1, &clip), MTime(9));
}

TEST(ClipTiming, ComputesTheScaleBeforeTheProduct)
{
    // 27 * (13.0 / 6.0) falls just short of 58.5; 27 * 13.0 / 6.0 would be that, and rounded up.
    Clip clip;
    clip.setSourceDuration(6);
    EXPECT_EQ(ClipTiming(nullptr, 0, 0, 1, 0, 13).mapToTimeline(27, &clip), MTime(58));
}

TEST(ClipTiming, WithoutASourceMapsWithoutAGuard)
{
    constexpr MTime highest = std::numeric_limits<qint64>::max();
    // A scale of 0: a time divided by zero saturates.
    EXPECT_EQ(ClipTiming(nullptr, 0, 0, 10, 0, 0).mapToSource(5, 1000), highest);
    // An infinite scale, and an undefined one.
    EXPECT_EQ(ClipTiming(nullptr, 0, 0, 10, 0, 1000).mapToSource(5, MTime()), MTime());
    EXPECT_EQ(ClipTiming().mapToSource(5, MTime()), MTime());
    EXPECT_EQ(ClipTiming(nullptr, 0, 7, 10, 0, 1000).speedUp(0.0).duration, highest);
    const Clip clip;
    EXPECT_EQ(ClipTiming().setTimestamp(7).mapToTimeline(5, &clip), MTime(7));
}

MTime anyTime(int from, int to)
{
    return *rc::gen::inRange(from, to);
}

ClipTiming anyTiming()
{
    ClipTiming timing(&someTrack, *rc::gen::inRange(0, 4), anyTime(-100000, 100000), anyTime(-1000, 100000),
                      anyTime(-100000, 100000), anyTime(1, 100000));
    timing.setSpeedCompensated(*rc::gen::arbitrary<bool>());
    timing.setTransitionIn(anyTime(0, 1000)).setTransitionOut(anyTime(0, 1000));
    timing.setFadeInDuration(anyTime(0, 1000)).setFadeOutDuration(anyTime(0, 1000));
    timing.reversed = *rc::gen::arbitrary<bool>();
    return timing;
}

RC_GTEST_PROP(ClipTiming, ReversingTwiceGivesBackTheRecord, ())
{
    const ClipTiming before = anyTiming();
    ClipTiming timing = before;
    RC_ASSERT(timing.reverse() != before);
    RC_ASSERT(timing.reverse() == before);
}

RC_GTEST_PROP(ClipTiming, ResizingThereAndBackGivesBackTheRecord, ())
{
    const ClipTiming before = anyTiming();
    const MTime delta = anyTime(-100000, 100000);
    ClipTiming timing = before;
    RC_ASSERT(timing.resizeLeft(delta).resizeLeft(-delta) == before);
    RC_ASSERT(timing.resizeRight(delta).resizeRight(-delta) == before);
}

RC_GTEST_PROP(ClipTiming, ResizingLeftKeepsTheEndAndThePictureUnderEveryTime, ())
{
    const ClipTiming before = anyTiming();
    const MTime native = anyTime(1, 100000);
    const MTime time = anyTime(-100000, 100000);
    ClipTiming timing = before;
    timing.resizeLeft(anyTime(-100000, 100000));
    RC_ASSERT(timing.end() == before.end());
    RC_ASSERT(timing.sourceEnd() == before.sourceEnd());
    RC_ASSERT(timing.mapToSource(time, native) == before.mapToSource(time, native));
}

RC_GTEST_PROP(ClipTiming, MappingToTheSourceAndBackIsOffByRoundingOnly, ())
{
    const ClipTiming timing = anyTiming();
    Clip clip;
    clip.setSourceDuration(anyTime(1, 100000));
    const MTime time = anyTime(-100000, 100000);
    const MTime back = timing.mapToTimeline(timing.mapToSource(time, &clip), &clip);
    // Half a millisecond of the source, as long as it is on the timeline, and half a millisecond there.
    const double scale = double(timing.sourceDuration.ms()) / double(clip.sourceDuration.ms());
    RC_ASSERT(double(std::abs(back - time).ms()) <= 0.5 * scale + 0.5 + 1e-6);
}

RC_GTEST_PROP(ClipTiming, MappingToTheTimelineAndBackIsOffByRoundingOnly, ())
{
    const ClipTiming timing = anyTiming();
    Clip clip;
    clip.setSourceDuration(anyTime(1, 100000));
    const MTime position = anyTime(-100000, 100000);
    const MTime back = timing.mapToSource(timing.mapToTimeline(position, &clip), &clip);
    const double scale = double(timing.sourceDuration.ms()) / double(clip.sourceDuration.ms());
    RC_ASSERT(double(std::abs(back - position).ms()) <= 0.5 / scale + 0.5 + 1e-6);
}

RC_GTEST_PROP(ClipTiming, OverlappingIsMutualAndMeansSharingAMillisecond, ())
{
    const ClipTiming a = at(anyTime(0, 30), anyTime(1, 20));
    const ClipTiming b = at(anyTime(0, 30), anyTime(1, 20));
    bool shares = false;
    for (int time = 0; time < 60; ++time) {
        const auto plays = [time](const ClipTiming& timing) {
            return timing.timestamp <= MTime(time) && MTime(time) < timing.end();
        };
        shares = shares || (plays(a) && plays(b));
    }
    RC_ASSERT(a.overlapsWith(b) == shares);
    RC_ASSERT(b.overlapsWith(a) == shares);
}

} // namespace
