// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>

#include <array>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using Timeline::TrackedObject;
using Timeline::TrackingLinkInfo;

class TrackingLinks : public ::testing::Test
{
protected:
    using Clips = std::vector<const Timeline::Clip*>;

    static TrackingLinkInfo linkTo(const Timeline::Clip& clip, const char* id, QPointF offset = {})
    {
        return TrackingLinkInfo(TrackedObject(&clip, QString::fromLatin1(id)), offset);
    }

    /// By address, which is the order of `clips`.
    Clips followers() const
    {
        Clips found;
        for (const auto& [clip, link] : timeline.trackingLinks)
            found.push_back(clip);
        return found;
    }

    std::array<Timeline::Clip, 4> clips;
    const Timeline::Clip& x = clips[0];
    const Timeline::Clip& y = clips[1];
    const Timeline::Clip& c = clips[2];
    const Timeline::Clip& d = clips[3];
    Timeline::Object timeline;
};

TEST_F(TrackingLinks, AClipFollowsWhatItWasLinkedToLast)
{
    timeline.addTrackingLink(&x, linkTo(c, "face", QPointF(1, 2)));
    timeline.addTrackingLink(&x, linkTo(d, "car", QPointF(3, 4)));
    EXPECT_THAT(followers(), ElementsAre(&x));
    const TrackingLinkInfo* const link = timeline.getTrackingLink(&x);
    ASSERT_NE(link, nullptr);
    EXPECT_EQ(link->trackedObject.clip, &d);
    EXPECT_EQ(link->trackedObject.trackingId, QStringLiteral("car"));
    EXPECT_EQ(link->objectRelativeOffset, QPointF(3, 4));
}

TEST_F(TrackingLinks, ALinkIsThatOfTheMapUntilTheMapChanges)
{
    timeline.addTrackingLink(&x, linkTo(c, "face"));
    EXPECT_EQ(timeline.getTrackingLink(&x), &timeline.trackingLinks.at(&x));
}

TEST_F(TrackingLinks, ALinkMayBeAddedThatIsThereAlready)
{
    timeline.addTrackingLink(&x, linkTo(c, "face", QPointF(1, 2)));
    timeline.addTrackingLink(&x, *timeline.getTrackingLink(&x));
    timeline.addTrackingLink(&y, *timeline.getTrackingLink(&x));
    EXPECT_EQ(*timeline.getTrackingLink(&x), linkTo(c, "face", QPointF(1, 2)));
    EXPECT_EQ(*timeline.getTrackingLink(&y), linkTo(c, "face", QPointF(1, 2)));
}

TEST_F(TrackingLinks, AClipWithoutALinkGivesNull)
{
    EXPECT_EQ(timeline.getTrackingLink(&x), nullptr);
    EXPECT_EQ(timeline.getTrackingLink(nullptr), nullptr);
    timeline.addTrackingLink(&x, linkTo(c, "face"));
    EXPECT_EQ(timeline.getTrackingLink(&c), nullptr);
    EXPECT_THAT(followers(), ElementsAre(&x));
}

TEST_F(TrackingLinks, TheClipsNeedNotBeOnTheTimeline)
{
    timeline.addTrackingLink(&x, linkTo(c, "face"));
    EXPECT_TRUE(timeline.clips.empty());
    timeline.addClip(&x, Timeline::ClipTiming())->addClip(&c, Timeline::ClipTiming());
    timeline.removeClip(&x)->removeClip(&c);
    EXPECT_THAT(followers(), ElementsAre(&x));
}

TEST_F(TrackingLinks, ClearingAClipRemovesThoseThatFollowItAndRemovingItsLinkDoesNot)
{
    timeline.addTrackingLink(&x, linkTo(c, "face"))->addTrackingLink(&y, linkTo(c, "car"));
    timeline.addTrackingLink(&c, linkTo(d, "dog"))->addTrackingLink(&d, linkTo(x, "cat"));

    Timeline::Object other(timeline);
    other.removeTrackingLink(&c);
    EXPECT_EQ(other.trackingLinks.size(), 3u);
    EXPECT_EQ(other.getTrackingLink(&c), nullptr);

    timeline.clearTrackingLinks(&c);
    EXPECT_THAT(followers(), ElementsAre(&c, &d));
}

TEST_F(TrackingLinks, AnIdentifierRemovesEveryLinkToItWhateverTheClip)
{
    timeline.addTrackingLink(&x, linkTo(c, "face"))->addTrackingLink(&y, linkTo(c, "car"));
    timeline.addTrackingLink(&c, linkTo(d, "face"))->addTrackingLink(&d, linkTo(x, "Face"));
    timeline.removeTrackingLink(QStringLiteral("face"));
    EXPECT_THAT(followers(), ElementsAre(&y, &d));
}

TEST_F(TrackingLinks, AnEmptyIdentifierRemovesLinksWithAnEmptyOne)
{
    timeline.addTrackingLink(&x, linkTo(c, ""))->addTrackingLink(&y, linkTo(c, "car"));
    timeline.addTrackingLink(&d, TrackingLinkInfo());
    timeline.removeTrackingLink(QString());
    EXPECT_THAT(followers(), ElementsAre(&y));
}

TEST_F(TrackingLinks, TheIdentifierMayBeThatOfALinkThatGoes)
{
    for (const Timeline::Clip& clip : clips)
        timeline.addTrackingLink(&clip, linkTo(c, "a long identifier of its own"));
    timeline.removeTrackingLink(timeline.getTrackingLink(&x)->trackedObject.trackingId);
    EXPECT_THAT(followers(), IsEmpty());
}

TEST_F(TrackingLinks, ALinkThatNamesNoClipIsClearedWithNull)
{
    timeline.addTrackingLink(&x, TrackingLinkInfo())->addTrackingLink(&y, linkTo(c, "car"));
    timeline.addTrackingLink(nullptr, linkTo(d, "dog"));
    timeline.clearTrackingLinks(nullptr);
    EXPECT_THAT(followers(), ElementsAre(nullptr, &y));
    timeline.removeTrackingLink(static_cast<const Timeline::Clip*>(nullptr));
    EXPECT_THAT(followers(), ElementsAre(&y));
}

TEST_F(TrackingLinks, WhatIsUnknownErasesNothing)
{
    timeline.addTrackingLink(&x, linkTo(c, "face"));
    timeline.removeTrackingLink(&c)->removeTrackingLink(QStringLiteral("dog"))->clearTrackingLinks(&x);
    EXPECT_THAT(followers(), ElementsAre(&x));
    EXPECT_EQ(Timeline::Object().clearTrackingLinks()->trackingLinks.size(), 0u);
}

TEST_F(TrackingLinks, AllCanBeCleared)
{
    timeline.addTrackingLink(&x, linkTo(c, "face"))->addTrackingLink(&y, linkTo(d, "car"));
    timeline.clearTrackingLinks();
    EXPECT_THAT(followers(), IsEmpty());
}

TEST_F(TrackingLinks, EveryChangeGivesTheTimeline)
{
    EXPECT_EQ(timeline.addTrackingLink(&x, TrackingLinkInfo()), &timeline);
    EXPECT_EQ(timeline.removeTrackingLink(&x), &timeline);
    EXPECT_EQ(timeline.removeTrackingLink(QString()), &timeline);
    EXPECT_EQ(timeline.clearTrackingLinks(&x), &timeline);
    EXPECT_EQ(timeline.clearTrackingLinks(), &timeline);
}

} // namespace
