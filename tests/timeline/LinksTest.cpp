// SPDX-License-Identifier: Apache-2.0
#include "tests/timeline/Timelines.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <array>
#include <map>
#include <vector>

namespace {

using namespace TimelineTests;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;
using Timeline::Clip;
using Timeline::Track;

class Links : public ::testing::Test
{
protected:
    /// Entered in the order of calling; the addresses ascend with the numbers.
    void link(int master, int slave) { timeline.addLink(&clips[master], &clips[slave], MTime()); }
    void lay(int clip, int track) { timeline.addClip(&clips[clip], lying(&tracks[track], 0, 100)); }

    std::array<Clip, 8> clips;
    std::array<Track, 3> tracks{Track(PrimaryTrack), Track(NativeAudioTrack), Track(NativeAudioTrack)};
    Timeline::Object timeline;
};

TEST_F(Links, ASlaveHasOneMaster)
{
    EXPECT_EQ(timeline.addLink(&clips[0], &clips[2], MTime(5)), &timeline);
    EXPECT_EQ(timeline.addLink(&clips[1], &clips[2], MTime(7)), &timeline);
    ASSERT_EQ(timeline.links.size(), 1u);
    EXPECT_TRUE(timeline.links.at(&clips[2]) == Timeline::Link(&clips[1], MTime(7)));
    EXPECT_TRUE(timeline.isSlave(&clips[2]));
    EXPECT_FALSE(timeline.isSlave(&clips[1]));
    EXPECT_EQ(timeline.masterOf(&clips[2]), &clips[1]);
    EXPECT_EQ(timeline.masterOf(&clips[1]), nullptr);
}

TEST_F(Links, AreRemovedBySlaveOrAll)
{
    link(0, 1);
    link(0, 2);
    link(0, 3);
    EXPECT_EQ(timeline.removeLink(&clips[0]), &timeline);
    EXPECT_EQ(timeline.links.size(), 3u);
    EXPECT_EQ(timeline.removeLink(&clips[1]), &timeline);
    EXPECT_EQ(timeline.findSlaves(&clips[0]), (Clips{&clips[2], &clips[3]}));
    EXPECT_EQ(timeline.clearLinks(), &timeline);
    EXPECT_TRUE(timeline.links.empty());
}

TEST_F(Links, NullIsNoSlaveAndHasNoMaster)
{
    EXPECT_FALSE(timeline.isSlave(nullptr));
    EXPECT_EQ(timeline.masterOf(nullptr), nullptr);
    link(0, 1);
    EXPECT_FALSE(timeline.isSlave(nullptr));
    EXPECT_EQ(timeline.masterOf(nullptr), nullptr);
}

TEST_F(Links, MayNameNoMaster)
{
    timeline.addLink(nullptr, &clips[0], MTime(3));
    EXPECT_TRUE(timeline.isSlave(&clips[0]));
    EXPECT_EQ(timeline.masterOf(&clips[0]), nullptr);
    EXPECT_EQ(timeline.findSlaves(nullptr), Clips{&clips[0]});
}

TEST_F(Links, SlavesAreThoseOfAMasterWhetherOnTheTimelineOrNot)
{
    link(5, 6);
    link(5, 2);
    link(4, 3);
    EXPECT_EQ(timeline.findSlaves(&clips[5]), (Clips{&clips[2], &clips[6]}));
    EXPECT_THAT(timeline.findSlaves(&clips[2]), IsEmpty());
    EXPECT_THAT(timeline.findSlaves(nullptr), IsEmpty());
}

TEST_F(Links, AHeapOfAClipWithoutSlavesIsTheClip)
{
    EXPECT_THAT(timeline.clipHeap(&clips[0]), ElementsAre(&clips[0]));
    link(1, 2);
    EXPECT_THAT(timeline.clipHeap(&clips[0]), ElementsAre(&clips[0]));
    EXPECT_THAT(timeline.clipHeap(&clips[2]), ElementsAre(&clips[2]));
    EXPECT_THAT(timeline.clipHeap(nullptr), ElementsAre(nullptr));
}

TEST_F(Links, AHeapGoesByGenerationsAndMasterByMaster)
{
    link(3, 7);
    link(3, 1);
    link(7, 0);
    link(7, 5);
    link(1, 6);
    link(6, 2);
    // 3; its slaves 1 and 7; those of 1, then of 7; that of 6
    EXPECT_THAT(timeline.clipHeap(&clips[3]),
                ElementsAre(&clips[3], &clips[1], &clips[7], &clips[6], &clips[0], &clips[5], &clips[2]));
    EXPECT_THAT(timeline.clipHeap(&clips[1]), ElementsAre(&clips[1], &clips[6], &clips[2]));
}

TEST_F(Links, AHeapInACycleListsEachClipOnce)
{
    link(0, 1);
    link(1, 2);
    link(2, 0);
    link(2, 3);
    EXPECT_THAT(timeline.clipHeap(&clips[1]), ElementsAre(&clips[1], &clips[2], &clips[0], &clips[3]));
    timeline.addLink(&clips[4], &clips[4], MTime());
    EXPECT_THAT(timeline.clipHeap(&clips[4]), ElementsAre(&clips[4]));
}

RC_GTEST_PROP(ClipHeap, IsTheQueueOfAPlainBreadthFirstWalk, ())
{
    constexpr int count = 12;
    const std::vector<Clip> clips(count);
    Timeline::Object timeline;
    std::vector<int> masters(count, -1);
    // Masters come before their slaves in some order, so that there is no cycle.
    const std::vector<int> order = anyOrder(count);
    for (int i = 1; i != count; ++i) {
        const int master = *rc::gen::inRange(-1, i);
        if (master >= 0) {
            masters[order[i]] = order[master];
            timeline.addLink(&clips[order[master]], &clips[order[i]], MTime());
        }
    }

    const int first = *rc::gen::inRange(0, count);
    std::vector<int> queue{first};
    for (std::size_t i = 0; i != queue.size(); ++i) {
        for (int slave = 0; slave != count; ++slave) {
            if (masters[slave] == queue[i])
                queue.push_back(slave);
        }
    }
    std::vector<int> heap;
    for (const Clip* clip : timeline.clipHeap(&clips[first]))
        heap.push_back(int(clip - clips.data()));
    RC_ASSERT(heap == queue);
}

TEST_F(Links, AreGroupedByMaster)
{
    link(0, 4);
    link(0, 2);
    link(2, 3);
    timeline.addLink(nullptr, &clips[5], MTime());
    EXPECT_THAT(timeline.master2slaves(),
                ElementsAre(Pair(nullptr, Clips{&clips[5]}), Pair(&clips[0], Clips{&clips[2], &clips[4]}),
                            Pair(&clips[2], Clips{&clips[3]})));
    EXPECT_THAT(Timeline::Object().master2slaves(), IsEmpty());
}

TEST_F(Links, OfATrackAreThoseOfItsClipsThatHaveAMaster)
{
    link(0, 4);
    link(0, 2);
    link(0, 6);
    link(2, 3);
    timeline.addLink(nullptr, &clips[5], MTime());
    lay(0, 2);
    lay(1, 0);
    lay(2, 0);
    lay(3, 0);
    lay(4, 1);
    lay(5, 0);
    // 1 is no slave, 4 lies elsewhere, 6 nowhere, and 5 has no master.
    EXPECT_THAT(timeline.master2slaves(&tracks[0]),
                ElementsAre(Pair(&clips[0], Clips{&clips[2]}), Pair(&clips[2], Clips{&clips[3]})));
    EXPECT_THAT(timeline.master2slaves(&tracks[2]), IsEmpty());
    EXPECT_THAT(timeline.master2slaves(nullptr), IsEmpty());
}

TEST_F(Links, NativeAudioLiesOnANativeAudioTrack)
{
    lay(0, 0);
    lay(1, 1);
    lay(2, 2);
    timeline.addClip(&clips[3], Timeline::ClipTiming());
    EXPECT_FALSE(timeline.isNativeAudio(&clips[0]));
    EXPECT_TRUE(timeline.isNativeAudio(&clips[1]));
    EXPECT_TRUE(timeline.isNativeAudio(&clips[2]));
    EXPECT_FALSE(timeline.isNativeAudio(&clips[3]));
    expectUnknownKey([&] { timeline.isNativeAudio(&clips[4]); });
    expectUnknownKey([&] { timeline.isNativeAudio(nullptr); });
}

TEST_F(Links, NativeAudioOfAMasterIsItsFirstSlaveThere)
{
    lay(1, 0);
    lay(2, 1);
    lay(3, 1);
    lay(4, 1);
    link(0, 1);
    link(7, 2);
    link(0, 4);
    link(0, 3);
    EXPECT_EQ(timeline.findNativeAudio(&clips[0]), &clips[3]);
    EXPECT_EQ(timeline.findNativeAudio(&clips[7]), &clips[2]);
    EXPECT_EQ(timeline.findNativeAudio(&clips[1]), nullptr);
    EXPECT_EQ(timeline.findNativeAudio(nullptr), nullptr);
    timeline.removeLink(&clips[3])->removeLink(&clips[4]);
    EXPECT_EQ(timeline.findNativeAudio(&clips[0]), nullptr);
}

TEST_F(Links, ASlaveThatIsNotOnTheTimelineIsMetStrictly)
{
    lay(3, 1);
    link(0, 2);
    link(0, 3);
    expectUnknownKey([&] { timeline.findNativeAudio(&clips[0]); });
    // Behind the clip that is found, it isn't met, and of another master it doesn't matter.
    timeline.removeLink(&clips[2]);
    link(0, 4);
    link(6, 1);
    EXPECT_EQ(timeline.findNativeAudio(&clips[0]), &clips[3]);
}

class DisabledByTrack : public Links
{
protected:
    bool isDisabled(int type, const Track& track)
    {
        clips[0].setType(Clip::ClipType(type));
        timeline.addClip(&clips[0], lying(&track, 0, 100));
        return timeline.isDisabledByTrack(&clips[0]);
    }
};

TEST_F(DisabledByTrack, PicturesAndOverlaysAreHidden)
{
    Track track(AudioTrack);
    for (const int type : {1, 4, 8, 32}) {
        track.setHidden(false)->setMuted(true);
        EXPECT_FALSE(isDisabled(type, track)) << type;
        track.setHidden(true)->setMuted(false);
        EXPECT_TRUE(isDisabled(type, track)) << type;
    }
}

TEST_F(DisabledByTrack, SoundIsMuted)
{
    Track track(AudioTrack);
    for (const int type : {2, 16}) {
        track.setHidden(true)->setMuted(false);
        EXPECT_FALSE(isDisabled(type, track)) << type;
        track.setHidden(false)->setMuted(true);
        EXPECT_TRUE(isDisabled(type, track)) << type;
    }
}

TEST_F(DisabledByTrack, NativeSoundIsMutedWithItsPicture)
{
    for (const int type : {2, 16}) {
        Track pictures(PrimaryTrack);
        timeline.addClip(&clips[1], lying(&pictures, 0, 100));
        link(1, 0);
        Track sounds(NativeAudioTrack);
        EXPECT_FALSE(isDisabled(type, sounds)) << type;
        pictures.setHidden(true);
        EXPECT_FALSE(isDisabled(type, sounds)) << type;
        pictures.setMuted(true);
        EXPECT_TRUE(isDisabled(type, sounds)) << type;
        sounds.setMuted(true);
        pictures.setMuted(false);
        EXPECT_TRUE(isDisabled(type, sounds)) << type;
        timeline.setClipTrack(&clips[1], nullptr);
        sounds.setMuted(false);
        EXPECT_FALSE(isDisabled(type, sounds)) << type;
    }
}

TEST_F(DisabledByTrack, NativeSoundNeedsAMasterOnTheTimelineUnlessItIsMuted)
{
    Track sounds(NativeAudioTrack);
    expectUnknownKey([&] { isDisabled(2, sounds); });
    link(1, 0);
    expectUnknownKey([&] { isDisabled(2, sounds); });
    sounds.setMuted(true);
    EXPECT_TRUE(isDisabled(2, sounds));
}

TEST_F(DisabledByTrack, AClipOfNoSingleTypeIsNever)
{
    Track track(NativeAudioTrack);
    track.setMuted(true)->setHidden(true);
    for (const int type : {0, 3, 5, 6, 7, 9, 18, 24, 36, 48, 63, 64, -1})
        EXPECT_FALSE(isDisabled(type, track)) << type;
}

TEST_F(DisabledByTrack, AClipThatIsNotOnTheTimelineIsNot)
{
    for (const int type : {0, 1, 2, 4, 8, 16, 32}) {
        clips[0].setType(Clip::ClipType(type));
        EXPECT_FALSE(timeline.isDisabledByTrack(&clips[0])) << type;
    }
    EXPECT_TRUE(timeline.clips.empty());
}

TEST_F(DisabledByTrack, SoundOnNoTrackIsNot)
{
    timeline.addClip(&clips[0], Timeline::ClipTiming());
    for (const int type : {2, 16}) {
        clips[0].setType(Clip::ClipType(type));
        EXPECT_FALSE(timeline.isDisabledByTrack(&clips[0])) << type;
    }
}

} // namespace
