// SPDX-License-Identifier: Apache-2.0
#include "host/project/GraphComparison.h"

#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>

#include <deque>
#include <limits>

namespace {

using namespace Host;
using Timeline::Clip;
using Timeline::ClipTiming;
using Timeline::Label;

std::string textOf(const Serialize::ISerializable& root)
{
    return canonicalText(recordOf({&root}));
}

/// A timeline of clips that only what leads to them tells apart, at addresses in the order of the numbers.
struct Chain
{
    Chain(const std::vector<int>& order, bool isCut = false) : clips(order.size())
    {
        timeline.addTrack(&track);
        for (std::size_t i = 0; i != order.size(); ++i) {
            at(order[i]).addLabel(&labels[std::size_t(order[i])]);
            timeline.addClip(&at(order[i]), ClipTiming(&track, 0, 0, 10, 0, 10));
        }
        for (std::size_t i = 1; i != order.size(); ++i) {
            timeline.addLink(&at(order[i - 1]), &at(order[i]), isCut && i == order.size() / 2 ? 1 : 0);
        }
    }

    Clip& at(int place) { return clips[std::size_t(place)]; }

    std::vector<Clip> clips;
    Label labels[8];
    Timeline::Track track;
    Timeline::Object timeline;
};

TEST(GraphComparison, TheAddressesOfObjectsDoNotCount)
{
    const Chain one({0, 1, 2, 3, 4, 5});
    const Chain other({3, 1, 5, 0, 4, 2});
    EXPECT_EQ(textOf(one.timeline), textOf(other.timeline));
    EXPECT_FALSE(firstDifference(recordOf({&one.timeline}), recordOf({&other.timeline})));
}

TEST(GraphComparison, WhatLeadsToAnObjectCounts)
{
    const Chain one({0, 1, 2, 3, 4, 5});
    const Chain cut({0, 1, 2, 3, 4, 5}, true);
    EXPECT_NE(textOf(one.timeline), textOf(cut.timeline));
    EXPECT_TRUE(firstDifference(recordOf({&one.timeline}), recordOf({&cut.timeline})));
}

/// Pairs of clips that are equal in every way, but that each belongs to one other.
TEST(GraphComparison, EqualPairsAreEqualHoweverTheyLie)
{
    const auto paired = [](std::vector<std::pair<int, int>> pairs) {
        std::deque<Clip> clips(6);
        Timeline::Object timeline;
        for (const auto& [a, b] : pairs) {
            Clip& master = clips[std::size_t(a)];
            Clip& slave = clips[std::size_t(b)];
            timeline.addClip(&master, ClipTiming())
                ->addClip(&slave, ClipTiming())
                ->addLink(&master, &slave, 0);
        }
        return textOf(timeline);
    };
    EXPECT_EQ(paired({{0, 1}, {2, 3}, {4, 5}}), paired({{5, 0}, {1, 4}, {3, 2}}));
    EXPECT_NE(paired({{0, 1}, {2, 3}, {4, 5}}), paired({{0, 1}, {0, 3}, {4, 5}}));
}

TEST(GraphComparison, SharingCounts)
{
    Label first;
    Label second;
    Clip a;
    Clip b;
    Timeline::Object timeline;
    timeline.addClip(&a, ClipTiming())->addClip(&b, ClipTiming(nullptr, 0, 10, 10, 0, 0));
    a.addLabel(&first);
    b.addLabel(&first);
    const std::string shared = textOf(timeline);
    b.removeLabel(&first)->addLabel(&second);
    EXPECT_NE(textOf(timeline), shared);
}

TEST(GraphComparison, TheOrderOfListsCounts)
{
    const Timeline::Track picture(PrimaryTrack);
    const Timeline::Track sound(AudioTrack);
    Timeline::Object a;
    Timeline::Object b;
    a.addTrack(&picture)->addTrack(&sound);
    b.addTrack(&sound)->addTrack(&picture);
    EXPECT_NE(textOf(a), textOf(b));
}

TEST(GraphComparison, EveryBitOfAValueCounts)
{
    VolumeEnvelope envelope;
    const std::string one = textOf(envelope);
    envelope.defaultValue = 1.0 + std::numeric_limits<double>::epsilon();
    EXPECT_NE(textOf(envelope), one);
    envelope.defaultValue = 0.0;
    const std::string zero = textOf(envelope);
    envelope.defaultValue = -0.0;
    EXPECT_NE(textOf(envelope), zero);
    envelope.defaultValue = std::numeric_limits<double>::infinity();
    const std::string infinite = textOf(envelope);
    envelope.defaultValue = std::numeric_limits<double>::quiet_NaN();
    EXPECT_NE(textOf(envelope), infinite);
    EXPECT_EQ(textOf(envelope), textOf(VolumeEnvelope(envelope)));

    ClipTiming timing;
    timing.setTimestamp(qint64(1) << 32);
    EXPECT_NE(textOf(timing), textOf(ClipTiming()));
}

TEST(GraphComparison, HalfASurrogatePairIsNoQuestionMark)
{
    Clip half;
    Clip mark;
    Clip replacement;
    half.setName(QString(QChar(0xD800)));
    mark.setName("?");
    replacement.setName(QString(QChar(0xFFFD)));
    EXPECT_NE(textOf(half), textOf(mark));
    EXPECT_NE(textOf(half), textOf(replacement));
}

TEST(GraphComparison, TextsCannotLookLikeLines)
{
    Clip a;
    Clip b;
    a.setName("x\"\n#2 Timeline::Clip: y");
    b.setName("x\"\\n#2 Timeline::Clip: y");
    EXPECT_NE(textOf(a), textOf(b));
}

TEST(GraphComparison, NamesTheFirstDifference)
{
    Clip a;
    Clip b;
    a.setVolume(80);
    const auto difference = firstDifference(recordOf({&a}), recordOf({&b}));
    ASSERT_TRUE(difference);
    EXPECT_THAT(*difference, testing::HasSubstr("volume: 80 against "));
    EXPECT_THAT(*difference, testing::EndsWith("volume: 80 against 100"));
    EXPECT_TRUE(firstDifference(recordOf({&a}), recordOf({&a, &b})));
    EXPECT_TRUE(firstDifference(recordOf({&a}), recordOf({nullptr})));
}

TEST(GraphComparison, LabelsHaveNoOrder)
{
    // In a set they lie in the order of their addresses.
    Timeline::Label labels[3];
    labels[0].name = labels[2].name = "in";
    labels[1].name = "out";
    Clip a;
    a.labels = {&labels[0], &labels[1]};
    Clip b;
    b.labels = {&labels[1], &labels[2]};
    EXPECT_EQ(textOf(a), textOf(b));
    labels[2].name = "later";
    EXPECT_NE(textOf(a), textOf(b));
}

TEST(GraphComparison, CountsItemsWhereTheirNumbersDiffer)
{
    Timeline::Object a;
    Timeline::Object b;
    const Timeline::Track track;
    a.addTrack(&track);
    const auto difference = firstDifference(recordOf({&a}), recordOf({&b}));
    ASSERT_TRUE(difference);
    EXPECT_THAT(*difference, testing::EndsWith("tracks: 1 item against 0 items"));
}

TEST(GraphComparison, ALongChainOfObjectsIsRecorded)
{
    std::deque<Timeline::Object> timelines(20000);
    std::deque<Clip> clips(20000);
    for (std::size_t i = 0; i + 1 != timelines.size(); ++i) {
        timelines[i].addClip(&clips[i], ClipTiming());
        clips[i].setNestedTimeline(&timelines[i + 1]);
    }
    EXPECT_EQ(recordOf({&timelines.front()}).nodes.size(), 20000u + 19999u + 19999u);
}

} // namespace
