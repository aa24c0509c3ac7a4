// SPDX-License-Identifier: Apache-2.0
#include "tests/timeline/Timelines.h"

#include <EditorModel/effects/Transition.h>

#include <gtest/gtest.h>

#include <array>
#include <functional>
#include <string>
#include <vector>

namespace {

using namespace TimelineTests;
using Timeline::Clip;
using Timeline::ClipTiming;

/// An operation that writes to a timing, and by hand what it does to it.
struct Write
{
    std::string name;
    std::function<Timeline::Object*(Timeline::Object&, const Clip*)> write;
    std::function<void(ClipTiming&)> expect;
};

void PrintTo(const Write& write, std::ostream* out)
{
    *out << write.name;
}

const Timeline::Track someTrack(TitleTrack);

const std::vector<Write>& writes()
{
    using Object = Timeline::Object;
    static const std::vector<Write> all = {
        {"moveClip", [](Object& o, const Clip* c) { return o.moveClip(c, MTime(70)); },
         [](ClipTiming& t) { t.timestamp = 70; }},
        {"resizeClipLeft", [](Object& o, const Clip* c) { return o.resizeClipLeft(c, MTime(30)); },
         [](ClipTiming& t) {
             t.timestamp = t.timestamp.ms() + 30;
             t.sourcePosition = t.sourcePosition.ms() + 30;
             t.duration = t.duration.ms() - 30;
         }},
        {"resizeClipRight", [](Object& o, const Clip* c) { return o.resizeClipRight(c, MTime(-40)); },
         [](ClipTiming& t) { t.duration = t.duration.ms() - 40; }},
        {"reverseClip", [](Object& o, const Clip* c) { return o.reverseClip(c); },
         [](ClipTiming& t) {
             t.sourcePosition = t.sourceDuration.ms() - t.duration.ms() - t.sourcePosition.ms();
             t.reversed = true;
         }},
        {"setClipDuration", [](Object& o, const Clip* c) { return o.setClipDuration(c, MTime(81)); },
         [](ClipTiming& t) { t.duration = 81; }},
        {"setClipSourcePosition",
         [](Object& o, const Clip* c) { return o.setClipSourcePosition(c, MTime(82)); },
         [](ClipTiming& t) { t.sourcePosition = 82; }},
        {"setClipFadeInDuration",
         [](Object& o, const Clip* c) { return o.setClipFadeInDuration(c, MTime(83)); },
         [](ClipTiming& t) { t.fadeInDuration = 83; }},
        {"setClipFadeOutDuration",
         [](Object& o, const Clip* c) { return o.setClipFadeOutDuration(c, MTime(84)); },
         [](ClipTiming& t) { t.fadeOutDuration = 84; }},
        {"setClipTrack", [](Object& o, const Clip* c) { return o.setClipTrack(c, &someTrack); },
         [](ClipTiming& t) { t.track = &someTrack; }},
        {"setClipTrackLevel", [](Object& o, const Clip* c) { return o.setClipTrackLevel(c, 5); },
         [](ClipTiming& t) { t.trackLevel = 5; }},
        {"setClipSpeedCompensated",
         [](Object& o, const Clip* c) { return o.setClipSpeedCompensated(c, true); },
         [](ClipTiming& t) { t.speedCompensated = true; }},
        // The native length is 4000 and the present one 2000: the speed goes from 2 to 4. Of nothing, nothing
        // is left.
        {"setClipSpeed", [](Object& o, const Clip* c) { return o.setClipSpeed(c, 4.0); },
         [](ClipTiming& t) {
             t.sourceDuration = t.sourceDuration.ms() / 2;
             t.sourcePosition = t.sourcePosition.ms() / 2;
             t.duration = t.duration.ms() / 2;
         }},
    };
    return all;
}

class ClipWrites : public ::testing::TestWithParam<Write>
{
protected:
    ClipWrites() { clips[0].setSourceDuration(MTime(4000)); }

    static ClipTiming wholeTiming()
    {
        ClipTiming timing(&otherTrack, 1, MTime(100), MTime(600), MTime(300), MTime(2000));
        timing.setTransitionIn(MTime(11)).setTransitionOut(MTime(12));
        timing.setFadeInDuration(MTime(13)).setFadeOutDuration(MTime(14));
        return timing;
    }

    inline static const Timeline::Track otherTrack;
    std::array<Clip, 2> clips;
    Timeline::Object timeline;
};

INSTANTIATE_TEST_SUITE_P(Timeline, ClipWrites, ::testing::ValuesIn(writes()),
                         [](const auto& instance) { return instance.param.name; });

TEST_P(ClipWrites, ChangeTheirPartOfTheStoredTimingAlone)
{
    timeline.addClip(&clips[0], wholeTiming())->addClip(&clips[1], wholeTiming());
    EXPECT_EQ(GetParam().write(timeline, &clips[0]), &timeline);
    ClipTiming expected = wholeTiming();
    GetParam().expect(expected);
    EXPECT_TRUE(timeline.clips.at(&clips[0]) == expected);
    EXPECT_TRUE(timeline.clips.at(&clips[1]) == wholeTiming());
}

TEST_P(ClipWrites, EnterAClipThatIsNotThereWithADefaultTiming)
{
    timeline.addClip(&clips[1], wholeTiming());
    EXPECT_EQ(GetParam().write(timeline, &clips[0]), &timeline);
    ClipTiming expected;
    GetParam().expect(expected);
    EXPECT_TRUE(timeline.contains(&clips[0]));
    EXPECT_TRUE(timeline.clips.at(&clips[0]) == expected);
    EXPECT_TRUE(timeline.clips.at(&clips[1]) == wholeTiming());
}

class Editing : public ::testing::Test
{
protected:
    /// A clip on the first track.
    void lay(int clip, MTime timestamp, MTime duration)
    {
        timeline.addClip(&clips[clip], lying(&tracks[0], timestamp, duration));
    }

    std::array<Clip, 3> clips;
    std::array<Timeline::Track, 2> tracks{Timeline::Track(PrimaryTrack), Timeline::Track(NativeAudioTrack)};
    Timeline::Object timeline;
};

TEST_F(Editing, AClipIsEnteredAndItsWholeTimingReplaced)
{
    ClipTiming first = lying(&tracks[0], 10, 20);
    first.setFadeInDuration(MTime(5));
    EXPECT_EQ(timeline.addClip(&clips[0], first), &timeline);
    EXPECT_TRUE(timeline.clipTiming(&clips[0]) == first);

    const ClipTiming second = lying(&tracks[1], 30, 40, 2);
    EXPECT_EQ(timeline.addClip(&clips[0], second), &timeline);
    EXPECT_TRUE(timeline.clipTiming(&clips[0]) == second);
    EXPECT_EQ(timeline.clips.size(), 1u);

    EXPECT_EQ(timeline.moveClip(&clips[0], first), &timeline);
    EXPECT_TRUE(timeline.clipTiming(&clips[0]) == first);
    timeline.moveClip(&clips[1], second);
    EXPECT_TRUE(timeline.clipTiming(&clips[1]) == second);
}

TEST_F(Editing, AClipMayTakeTheTimingOfAnother)
{
    lay(0, 10, 20);
    timeline.addClip(&clips[1], timeline.clipTiming(&clips[0]));
    timeline.addClip(&clips[1], timeline.clipTiming(&clips[1]));
    EXPECT_TRUE(timeline.clipTiming(&clips[1]) == lying(&tracks[0], 10, 20));
}

TEST_F(Editing, ClipsAreRemovedOneOrAll)
{
    lay(0, 0, 10);
    lay(1, 10, 10);
    lay(2, 20, 10);
    EXPECT_EQ(timeline.removeClip(&clips[1]), &timeline);
    EXPECT_FALSE(timeline.contains(&clips[1]));
    EXPECT_EQ(timeline.clips.size(), 2u);
    EXPECT_EQ(timeline.removeClip(&clips[1]), &timeline);
    EXPECT_EQ(timeline.removeClip(nullptr), &timeline);
    EXPECT_EQ(timeline.clips.size(), 2u);
    EXPECT_EQ(timeline.clearClips(), &timeline);
    EXPECT_TRUE(timeline.clips.empty());
}

TEST_F(Editing, ARemovedClipIsStillNamedByItsLinkAndTransition)
{
    const Transition::Object transition;
    lay(0, 0, 1000);
    lay(1, 1000, 1000);
    timeline.addLink(&clips[0], &clips[1], MTime());
    timeline.addTransition(&transition, {&clips[0], &clips[1]}, MTime(100));
    timeline.removeClip(&clips[1]);
    EXPECT_EQ(timeline.masterOf(&clips[1]), &clips[0]);
    EXPECT_EQ(timeline.transitionClipPair(&transition), Timeline::ClipPair(&clips[0], &clips[1]));
}

TEST_F(Editing, SpeedIsAbsolute)
{
    clips[0].setSourceDuration(MTime(9000));
    timeline.addClip(&clips[0], ClipTiming(&tracks[0], 0, 500, 3000, 1500, 9000));
    EXPECT_EQ(timeline.clipSpeed(&clips[0]), 1.0);

    timeline.setClipSpeed(&clips[0], 1.5);
    EXPECT_TRUE(timeline.clipTiming(&clips[0]) == ClipTiming(&tracks[0], 0, 500, 2000, 1000, 6000));
    EXPECT_EQ(timeline.clipSpeed(&clips[0]), 1.5);

    timeline.setClipSpeed(&clips[0], 1.5);
    EXPECT_TRUE(timeline.clipTiming(&clips[0]) == ClipTiming(&tracks[0], 0, 500, 2000, 1000, 6000));

    timeline.setClipSpeed(&clips[0], 0.5);
    EXPECT_TRUE(timeline.clipTiming(&clips[0]) == ClipTiming(&tracks[0], 0, 500, 6000, 3000, 18000));
}

TEST_F(Editing, SpeedRoundsEachTimeByItself)
{
    clips[0].setSourceDuration(MTime(1000));
    timeline.addClip(&clips[0], ClipTiming(&tracks[0], 0, 7, 500, 100, 1000));
    // 333.3, 33.3 and 166.7
    timeline.setClipSpeed(&clips[0], 3.0);
    EXPECT_TRUE(timeline.clipTiming(&clips[0]) == ClipTiming(&tracks[0], 0, 7, 167, 33, 333));
}

TEST_F(Editing, SpeedIsChangedByItsRatioToThePresentOne)
{
    // 2 / (3.0 / 11.0) is just above 22 / 3, so that 11 divided by it falls just short of 1.5.
    clips[0].setSourceDuration(MTime(3));
    timeline.addClip(&clips[0], ClipTiming(&tracks[0], 0, 7, 11, 0, 11));
    timeline.setClipSpeed(&clips[0], 2.0);
    EXPECT_TRUE(timeline.clipTiming(&clips[0]) == ClipTiming(&tracks[0], 0, 7, 1, 0, 1));
}

TEST_F(Editing, TimingsOfIntrosAreNotEdited)
{
    lay(0, 0, 100);
    const std::vector<std::pair<int, bool>> table = {
        {0, true},  {1, true},   {2, true},  {3, true},  {4, true},  {8, false}, {9, true},  {16, false},
        {24, true}, {32, false}, {40, true}, {48, true}, {56, true}, {63, true}, {64, true}, {-1, true},
    };
    for (const auto& [type, canEdit] : table) {
        clips[0].setType(static_cast<Clip::ClipType>(type));
        EXPECT_EQ(timeline.canEditTiming(&clips[0]), canEdit) << type;
    }
}

TEST_F(Editing, TimingsOnTheNativeAudioTrackAreNotEdited)
{
    clips[0].setType(Clip::VideoClip);
    for (const TrackType type :
         {TrackType(0), PrimaryTrack, ExtraVideoTrack, NativeAudioTrack, AudioTrack, TitleTrack, QuizTrack}) {
        const Timeline::Track track(type);
        timeline.addClip(&clips[0], lying(&track, 0, 100));
        EXPECT_EQ(timeline.canEditTiming(&clips[0]), type != NativeAudioTrack) << type;
        EXPECT_EQ(timeline.canSplit(&clips[0], 50), type != NativeAudioTrack) << type;
    }
}

TEST_F(Editing, ACutLeavesTheLeastDurationOnItsLeftAndMoreOnItsRight)
{
    lay(0, 1000, 500);
    EXPECT_TRUE(timeline.canSplit(&clips[0], 10));
    EXPECT_FALSE(timeline.canSplit(&clips[0], 9));
    EXPECT_TRUE(timeline.canSplit(&clips[0], 489));
    EXPECT_FALSE(timeline.canSplit(&clips[0], 490));
    for (const int outside : {-1000, -10, -1, 0, 491, 499, 500, 501, 1010, 1489})
        EXPECT_FALSE(timeline.canSplit(&clips[0], outside)) << outside;
}

TEST_F(Editing, ACutKeepsClearOfTransitions)
{
    ClipTiming timing = lying(&tracks[0], 1000, 500);
    timing.setTransitionIn(MTime(100)).setTransitionOut(MTime(50));
    timeline.addClip(&clips[0], timing);
    EXPECT_FALSE(timeline.canSplit(&clips[0], 109));
    EXPECT_TRUE(timeline.canSplit(&clips[0], 110));
    EXPECT_TRUE(timeline.canSplit(&clips[0], 439));
    EXPECT_FALSE(timeline.canSplit(&clips[0], 440));
}

TEST_F(Editing, AShortClipIsNotCutAnywhere)
{
    for (int duration = 0; duration <= 20; ++duration) {
        lay(0, 1000, duration);
        for (int offset = -5; offset <= duration + 5; ++offset)
            EXPECT_FALSE(timeline.canSplit(&clips[0], offset)) << duration << " at " << offset;
    }
    lay(0, 1000, 21);
    EXPECT_TRUE(timeline.canSplit(&clips[0], 10));
    EXPECT_FALSE(timeline.canSplit(&clips[0], 11));
}

TEST_F(Editing, AClipWhoseTimingIsNotEditedIsNotCut)
{
    lay(0, 0, 1000);
    clips[0].setType(Clip::IntroOverlayClip);
    EXPECT_FALSE(timeline.canSplit(&clips[0], 500));
}

TEST_F(Editing, ThePredicatesAreStrict)
{
    lay(0, 0, 1000);
    for (const Clip* unknown : {noClip, static_cast<const Clip*>(&clips[1])}) {
        expectUnknownKey([&] { timeline.canEditTiming(unknown); });
        expectUnknownKey([&] { timeline.canSplit(unknown, 500); });
    }
    EXPECT_EQ(timeline.clips.size(), 1u);
}

} // namespace
