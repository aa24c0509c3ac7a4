// SPDX-License-Identifier: Apache-2.0
// A timeline that modules share: who hears of an edit, and what of.
#include "tests/timeline/Timelines.h"

#include <EditorModel/bus/View.h>

#include <gtest/gtest.h>

#include <array>
#include <string>
#include <vector>

namespace {

using namespace TimelineTests;
using testing::ElementsAre;
using Timeline::Clip;

/// Writes what it hears, and what it finds out by comparing old and new.
class Module : public Message::View<Timeline::Object>
{
public:
    Module(std::vector<std::string>& trace, std::string name) : m_trace(&trace), m_name(std::move(name)) {}

    /// Numbers in the trace count from here.
    const Clip* firstClip = nullptr;

protected:
    void added(const Timeline::Object* timeline) override { write("added " + sizeOf(timeline)); }

    void changed(const Timeline::Object*, const Timeline::Object* oldValue,
                 const Timeline::Object* newValue) override
    {
        std::string line = "changed " + sizeOf(oldValue) + " -> " + sizeOf(newValue);
        for (const Clip* clip : newValue->clipsDifference(oldValue))
            line += ", new " + numberOf(clip);
        for (const Clip* clip : oldValue->clipsDifference(newValue))
            line += ", gone " + numberOf(clip);
        for (const auto& [clip, timing] : newValue->clips) {
            if (oldValue->contains(clip) && timing != oldValue->clipTiming(clip)) {
                line += ", clip " + numberOf(clip) + " from " +
                        std::to_string(oldValue->clipTiming(clip).timestamp.ms()) + " to " +
                        std::to_string(timing.timestamp.ms());
            }
        }
        write(line);
    }

    void changed(const Timeline::Object* timeline, const Timeline::Object* oldValue) override
    {
        write("changed " + sizeOf(timeline) + ", was " + sizeOf(oldValue));
    }

    void changed(const Timeline::Object* timeline) override { write("changed " + sizeOf(timeline)); }
    void removed(const Timeline::Object* timeline) override { write("removed " + sizeOf(timeline)); }

private:
    static std::string sizeOf(const Timeline::Object* timeline)
    {
        return std::to_string(timeline->clips.size());
    }

    std::string numberOf(const Clip* clip) const { return std::to_string(clip - firstClip); }
    void write(const std::string& line) { m_trace->push_back(m_name + " " + line); }

    std::vector<std::string>* m_trace;
    std::string m_name;
};

class SharedTimeline : public ::testing::Test
{
protected:
    SharedTimeline()
    {
        owner.firstClip = client.firstClip = watcher.firstClip = clips.data();
        timeline.addClip(&clips[0], lying(&track, 0, 500))->addClip(&clips[1], lying(&track, 500, 500));
        owner.own(&timeline);
        client.observe(&timeline);
        watcher.observe(&timeline);
        trace.clear();
    }

    std::vector<std::string> trace;
    std::array<Clip, 3> clips;
    Timeline::Track track;
    Timeline::Object timeline;
    Module owner{trace, "owner"};
    Module client{trace, "client"};
    Module watcher{trace, "watcher"};
};

TEST_F(SharedTimeline, AnEditByAClientIsCarriedOutByTheOwnerAndHeardByAll)
{
    const Timeline::Object* const shared = &timeline;
    {
        auto chain = client.change(shared);
        chain->moveClip(&clips[1], MTime(700))
            ->addClip(&clips[2], lying(&track, 2000, 10))
            ->removeClip(&clips[0])
            ->addTrack(&track);
        // Until the end of the chain the timeline is as it was.
        EXPECT_EQ(timeline.clips.size(), 2u);
        EXPECT_EQ(timeline.clipTiming(&clips[1]).timestamp, MTime(500));
        EXPECT_TRUE(timeline.tracks.empty());
        EXPECT_TRUE(trace.empty());
    }
    const std::string difference = "changed 2 -> 2, new 2, gone 0, clip 1 from 500 to 700";
    EXPECT_THAT(trace, ElementsAre("owner " + difference, "owner changed 2, was 2", "owner changed 2",
                                   "client " + difference, "client changed 2, was 2", "client changed 2",
                                   "watcher " + difference, "watcher changed 2, was 2", "watcher changed 2"));
    EXPECT_EQ(client.object(), shared);
    EXPECT_TRUE(owner.isOwned(&timeline));
    EXPECT_FALSE(timeline.contains(&clips[0]));
    EXPECT_EQ(timeline.clipTiming(&clips[1]).timestamp, MTime(700));
    EXPECT_THAT(timeline.tracks, ElementsAre(&track));
}

TEST_F(SharedTimeline, AnEditByTheOwnerIsHeardByTheOthersAfterwards)
{
    owner.change(&timeline)->moveClip(&clips[0], MTime(100));
    const std::string difference = "changed 2 -> 2, clip 0 from 0 to 100";
    EXPECT_THAT(trace, ElementsAre("owner " + difference, "owner changed 2, was 2", "owner changed 2",
                                   "client " + difference, "client changed 2, was 2", "client changed 2",
                                   "watcher " + difference, "watcher changed 2, was 2", "watcher changed 2"));
    EXPECT_EQ(timeline.clipTiming(&clips[0]).timestamp, MTime(100));
}

TEST_F(SharedTimeline, AnEditThatChangesNothingIsAnnouncedAllTheSame)
{
    client.change(&timeline)->removeClip(&clips[2]);
    EXPECT_THAT(trace,
                ElementsAre("owner changed 2 -> 2", "owner changed 2, was 2", "owner changed 2",
                            "client changed 2 -> 2", "client changed 2, was 2", "client changed 2",
                            "watcher changed 2 -> 2", "watcher changed 2, was 2", "watcher changed 2"));
}

TEST_F(SharedTimeline, AnEditThatAsksAboutAnUnknownClipIsLostWhole)
{
    expectUnknownKey([&] {
        auto chain = client.change(&timeline);
        chain->clearClips();
        chain->clipTiming(&clips[0]);
    });
    EXPECT_EQ(timeline.clips.size(), 2u);
    EXPECT_TRUE(trace.empty());
}

TEST_F(SharedTimeline, TheFormatIsEditedInTheSameWay)
{
    client.change(&timeline)->setGeometry(640, 480)->setOpaque(false);
    EXPECT_EQ(timeline.width, 640);
    EXPECT_FALSE(timeline.opaque);
    EXPECT_EQ(timeline.clips.size(), 2u);
    EXPECT_EQ(trace.size(), 9u);
}

TEST_F(SharedTimeline, ATimelineThatDepartsIsComparedWithAnEmptyOne)
{
    owner.remove(&timeline);
    EXPECT_THAT(
        trace, ElementsAre("client changed 2 -> 0, gone 0, gone 1", "client changed 2", "client removed 2",
                           "watcher changed 2 -> 0, gone 0, gone 1", "watcher changed 2", "watcher removed 2",
                           "owner changed 2 -> 0, gone 0, gone 1", "owner changed 2", "owner removed 2"));
}

} // namespace
