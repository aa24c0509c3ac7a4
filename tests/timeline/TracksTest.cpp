// SPDX-License-Identifier: Apache-2.0
#include "tests/timeline/Timelines.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <array>
#include <deque>
#include <utility>
#include <vector>

namespace {

using namespace TimelineTests;
using testing::ElementsAre;
using testing::IsEmpty;
using Timeline::displaceTrack;
using Timeline::isMultilevelTrack;
using Timeline::Track;
using Tracks = std::deque<const Track*>;

TEST(TrackType, TheBitsTellWhetherATrackHasSeveralLevels)
{
    const std::vector<std::pair<int, bool>> table = {
        {0, false}, {16, false}, {32, true}, {48, false}, {64, true},  {80, true}, {96, true},
        {1, true},  {17, true},  {33, true}, {49, true},  {112, true}, {-1, true}, {128, true},
    };
    for (const auto& [type, isMultilevel] : table) {
        EXPECT_EQ(isMultilevelTrack(TrackType(type)), isMultilevel) << type;
        const Track track{TrackType(type)};
        EXPECT_EQ(isMultilevelTrack(&track), isMultilevel) << type;
    }
}

class TimelineTracks : public ::testing::Test
{
protected:
    TimelineTracks()
    {
        for (Track& track : tracks)
            track.setType(AudioTrack);
    }

    void list(std::initializer_list<const Track*> wanted) { timeline.tracks = wanted; }

    std::array<Track, 6> tracks;
    const Track* const a = &tracks[0];
    const Track* const b = &tracks[1];
    const Track* const c = &tracks[2];
    const Track* const d = &tracks[3];
    std::array<Timeline::Clip, 2> clips;
    Timeline::Object timeline;
};

TEST_F(TimelineTracks, AreListedInTheOrderOfAddingAlsoTwice)
{
    EXPECT_EQ(timeline.addTrack(c), &timeline);
    timeline.addTrack(a)->addTrack(c)->addTrack(b);
    EXPECT_THAT(timeline.tracks, ElementsAre(c, a, c, b));
}

TEST_F(TimelineTracks, AreTakenOutWhereverTheyStandAndTheRestStaysInOrder)
{
    list({c, a, c, b, c});
    EXPECT_EQ(timeline.removeTrack(c), &timeline);
    EXPECT_THAT(timeline.tracks, ElementsAre(a, b));
    EXPECT_EQ(timeline.removeTrack(c), &timeline);
    EXPECT_EQ(timeline.removeTrack(nullptr), &timeline);
    EXPECT_THAT(timeline.tracks, ElementsAre(a, b));
    EXPECT_EQ(timeline.clearTracks(), &timeline);
    EXPECT_THAT(timeline.tracks, IsEmpty());
}

TEST_F(TimelineTracks, LoseTheirClipsAndStay)
{
    list({a, b});
    timeline.addClip(&clips[0], lying(a, 0, 10))->addClip(&clips[1], lying(b, 0, 10));
    EXPECT_EQ(timeline.clearTrack(c), &timeline);
    EXPECT_EQ(timeline.clips.size(), 2u);
    EXPECT_EQ(timeline.clearTrack(a), &timeline);
    EXPECT_EQ(timeline.clipsAt(b), Clips{&clips[1]});
    EXPECT_EQ(timeline.clips.size(), 1u);
    EXPECT_THAT(timeline.tracks, ElementsAre(a, b));
}

TEST_F(TimelineTracks, ClipsOnNoTrackAreClearedWithNull)
{
    timeline.addClip(&clips[0], lying(nullptr, 0, 10))->addClip(&clips[1], lying(b, 0, 10));
    timeline.clearTrack(nullptr);
    EXPECT_EQ(timeline.clips.size(), 1u);
    EXPECT_TRUE(timeline.contains(&clips[1]));
}

TEST_F(TimelineTracks, CanBeMovedToAnotherOfTheirType)
{
    EXPECT_TRUE(timeline.canMoveTrack(a, b));
    EXPECT_FALSE(timeline.canMoveTrack(a, a));
    EXPECT_FALSE(timeline.canMoveTrack(nullptr, a));
    EXPECT_FALSE(timeline.canMoveTrack(a, nullptr));
    EXPECT_FALSE(timeline.canMoveTrack(nullptr, nullptr));
    tracks[1].setType(TitleTrack);
    EXPECT_FALSE(timeline.canMoveTrack(a, b));
    tracks[0].setType(TrackType(0));
    tracks[1].setType(TrackType(0));
    EXPECT_TRUE(timeline.canMoveTrack(a, b));
    tracks[1].setLinked(true)->setMuted(true)->setUsed(false);
    EXPECT_TRUE(timeline.canMoveTrack(a, b));
}

TEST_F(TimelineTracks, TakeThePlaceOfTheirTarget)
{
    list({a, b, c, d});
    EXPECT_EQ(timeline.moveTrack(a, c), &timeline);
    EXPECT_THAT(timeline.tracks, ElementsAre(b, c, a, d));

    list({a, b, c, d});
    timeline.moveTrack(d, b);
    EXPECT_THAT(timeline.tracks, ElementsAre(a, d, b, c));

    list({a, b, c, d});
    timeline.moveTrack(b, c);
    EXPECT_THAT(timeline.tracks, ElementsAre(a, c, b, d));
    timeline.moveTrack(b, c);
    EXPECT_THAT(timeline.tracks, ElementsAre(a, b, c, d));
    timeline.moveTrack(a, d);
    EXPECT_THAT(timeline.tracks, ElementsAre(b, c, d, a));
    timeline.moveTrack(a, b);
    EXPECT_THAT(timeline.tracks, ElementsAre(a, b, c, d));
}

TEST_F(TimelineTracks, StayWhereTheyCannotBeMoved)
{
    list({a, b, c, d});
    tracks[3].setType(QuizTrack);
    EXPECT_EQ(timeline.moveTrack(nullptr, a), &timeline);
    timeline.moveTrack(a, nullptr)->moveTrack(nullptr, nullptr);
    timeline.moveTrack(b, b);
    timeline.moveTrack(a, d)->moveTrack(d, a);
    EXPECT_THAT(timeline.tracks, ElementsAre(a, b, c, d));
}

TEST_F(TimelineTracks, AreDisplacedWhereTheyStandFirst)
{
    Tracks twice{a, b, a, c};
    displaceTrack(twice, a, c);
    EXPECT_THAT(twice, ElementsAre(b, a, c, a));

    Tracks targetTwice{a, b, c, b};
    displaceTrack(targetTwice, a, b);
    EXPECT_THAT(targetTwice, ElementsAre(b, a, c, b));
}

TEST_F(TimelineTracks, NothingMovesWhereOneIsNotListed)
{
    Tracks some{a, b};
    displaceTrack(some, c, a);
    displaceTrack(some, a, c);
    displaceTrack(some, c, d);
    displaceTrack(some, nullptr, a);
    EXPECT_THAT(some, ElementsAre(a, b));
    Tracks none;
    displaceTrack(none, a, b);
    EXPECT_THAT(none, IsEmpty());
}

TEST_F(TimelineTracks, AreDisplacedWhateverTheirType)
{
    tracks[0].setType(QuizTrack);
    Tracks some{a, b, c};
    displaceTrack(some, a, c);
    EXPECT_THAT(some, ElementsAre(b, c, a));
    displaceTrack(some, c, c);
    EXPECT_THAT(some, ElementsAre(b, c, a));
}

RC_GTEST_PROP(DisplaceTrack, TakesATrackOutAndPutsItInAtThePlaceOfItsTarget, ())
{
    const int size = *rc::gen::inRange(1, 12);
    const int from = *rc::gen::inRange(0, size);
    const int to = *rc::gen::inRange(0, size);
    const std::vector<Track> all(12);
    std::vector<const Track*> model;
    for (int i = 0; i != size; ++i)
        model.push_back(&all[i]);
    Tracks tracks(model.begin(), model.end());

    displaceTrack(tracks, &all[from], &all[to]);

    RC_ASSERT(std::is_permutation(tracks.begin(), tracks.end(), model.begin(), model.end()));
    model.erase(model.begin() + from);
    model.insert(model.begin() + to, &all[from]);
    RC_ASSERT(std::equal(tracks.begin(), tracks.end(), model.begin(), model.end()));
}

TEST_F(TimelineTracks, OfARoleAreTheFirstOfTheirType)
{
    struct Role
    {
        TrackType type;
        const Track* (Timeline::Object::*find)() const;
    };
    for (const Role& role :
         {Role{PrimaryTrack, &Timeline::Object::primaryTrack},
          Role{ExtraVideoTrack, &Timeline::Object::extraVideoTrack},
          Role{NativeAudioTrack, &Timeline::Object::nativeAudioTrack},
          Role{TitleTrack, &Timeline::Object::titleTrack}, Role{QuizTrack, &Timeline::Object::quizTrack}}) {
        list({c, b, a});
        EXPECT_EQ((timeline.*role.find)(), nullptr) << role.type;
        tracks[0].setType(role.type);
        tracks[1].setType(role.type);
        EXPECT_EQ((timeline.*role.find)(), b) << role.type;
        tracks[0].setType(AudioTrack);
        tracks[1].setType(AudioTrack);
        list({});
        EXPECT_EQ((timeline.*role.find)(), nullptr) << role.type;
    }
}

TEST_F(TimelineTracks, OfAudioAreLinkedOrDetached)
{
    EXPECT_EQ(timeline.linkedAudioTrack(), nullptr);
    EXPECT_EQ(timeline.detachedAudioTrack(), nullptr);
    for (Track& track : tracks)
        track.setLinked(true);
    tracks[0].setType(TitleTrack);
    list({a, c, b});
    EXPECT_EQ(timeline.linkedAudioTrack(), c);
    EXPECT_EQ(timeline.detachedAudioTrack(), nullptr);
    tracks[0].setLinked(false);
    tracks[2].setLinked(false);
    EXPECT_EQ(timeline.linkedAudioTrack(), b);
    EXPECT_EQ(timeline.detachedAudioTrack(), c);
}

TEST_F(TimelineTracks, AreContainedIfTheyAreListed)
{
    EXPECT_FALSE(timeline.contains(noTrack));
    EXPECT_FALSE(timeline.contains(a));
    list({b, a});
    timeline.addClip(&clips[0], lying(c, 0, 1));
    EXPECT_TRUE(timeline.contains(a));
    EXPECT_FALSE(timeline.contains(c));
    EXPECT_FALSE(timeline.contains(noTrack));
}

TEST_F(TimelineTracks, HaveTheIndexOfTheirFirstPlace)
{
    EXPECT_EQ(timeline.trackIndex(a), 0u);
    list({c, a, b, a});
    EXPECT_EQ(timeline.trackIndex(c), 0u);
    EXPECT_EQ(timeline.trackIndex(a), 1u);
    EXPECT_EQ(timeline.trackIndex(b), 2u);
    EXPECT_EQ(timeline.trackIndex(d), 4u);
    EXPECT_EQ(timeline.trackIndex(nullptr), 4u);
}

TEST_F(TimelineTracks, AreFoundByTypeInTheirOwnOrder)
{
    tracks[0].setType(PrimaryTrack);
    tracks[1].setType(QuizTrack);
    tracks[2].setType(PrimaryTrack);
    list({d, c, b, a});
    EXPECT_EQ(timeline.findFirstTrack(PrimaryTrack), c);
    EXPECT_EQ(timeline.findFirstTrack(TitleTrack), nullptr);
    EXPECT_THAT(timeline.findTracks(PrimaryTrack), ElementsAre(c, a));
    EXPECT_THAT(timeline.findTracks(TitleTrack), IsEmpty());
    EXPECT_THAT(timeline.findTracks({QuizTrack, PrimaryTrack}), ElementsAre(c, b, a));
    EXPECT_THAT(timeline.findTracks({PrimaryTrack, PrimaryTrack}), ElementsAre(c, a));
    EXPECT_THAT(timeline.findTracks({TitleTrack, AudioTrack}), ElementsAre(d));
    // No type is asked for, nor that of a track without a role.
    const Track roleless;
    timeline.addTrack(&roleless);
    EXPECT_THAT(timeline.findTracks(TrackType(0)), ElementsAre(&roleless));
    EXPECT_THAT(timeline.findTracks({}), IsEmpty());
    EXPECT_THAT(Timeline::Object().findTracks({QuizTrack, PrimaryTrack}), IsEmpty());
}

TEST_F(TimelineTracks, AreUsedUnlessTheySayOtherwise)
{
    list({d, c, b, a});
    tracks[1].setUsed(false);
    tracks[2].setType(QuizTrack);
    EXPECT_THAT(timeline.findUsedTracks(AudioTrack), ElementsAre(d, a));
    EXPECT_THAT(timeline.findUsedTracks(QuizTrack), ElementsAre(c));
    EXPECT_THAT(timeline.findUsedTracks(TitleTrack), IsEmpty());
}

} // namespace
