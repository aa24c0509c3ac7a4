// SPDX-License-Identifier: Apache-2.0
// A whole timeline, with its cycles and shared objects, through every form and both routes.
#include <boost/archive/binary_iarchive.hpp>
#include <boost/archive/binary_oarchive.hpp>

#include "tests/archives/CutDocuments.h"
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldVisitors.h"
#include "tests/shared/FullTimeline.h"
#include "tests/shared/LiveAllocations.h"
#include "tests/shared/TimelineComparison.h"

#include <EditorModel/persistence/ObjectTracker.h>

#include <boost/serialization/nvp.hpp>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <sstream>

namespace {

using boost::archive::object_tracker;
using boost::serialization::make_nvp;
using Testing::FullTimeline;
using ::testing::IsEmpty;
using Testing::liveAllocations;
using Testing::timelineDifferences;

/// The clip with the name; null if there is none.
const Timeline::Clip* clipOf(const Timeline::Object& timeline, const char* name)
{
    for (const auto& entry : timeline.clips) {
        if (entry.first->name == QString::fromUtf8(name))
            return entry.first;
    }
    return nullptr;
}

class TimelineDocument : public ::testing::TestWithParam<Way>
{
protected:
    const Way& way() const { return GetParam(); }

    void expectSame(const Timeline::Object& stored, const Timeline::Object* loaded)
    {
        ASSERT_NE(loaded, nullptr);
        EXPECT_THAT(timelineDifferences(stored, *loaded, way().wrapsTimes()), IsEmpty());
    }

    FullTimeline m_full;
};

INSTANTIATE_TEST_SUITE_P(Ways, TimelineDocument, ::testing::ValuesIn(allWays),
                         [](const auto& instance) { return std::string(instance.param.name); });

TEST_P(TimelineDocument, ATimelineComesBackWithAllThatItPointsAt)
{
    m_full.setFieldsThatAreNotStored();
    const auto graph = graphOf(documentOf({&m_full.timeline}, way()));
    expectSame(m_full.timeline, graph.rootAs<Timeline::Object>());
    EXPECT_EQ(graph.size(), m_full.objectCount());
}

TEST_P(TimelineDocument, WhatWasLoadedIsStoredAsWhatItWasLoadedFrom)
{
    const auto first = graphOf(documentOf({&m_full.timeline}, way()));
    const auto* const once = first.rootAs<Timeline::Object>();
    const auto second = graphOf(documentOf({once}, way()));
    ASSERT_NE(second.rootAs<Timeline::Object>(), nullptr);
    // Times are short enough after the first store.
    EXPECT_THAT(timelineDifferences(*once, *second.rootAs<Timeline::Object>()), IsEmpty());
    EXPECT_EQ(second.size(), first.size());
}

TEST_P(TimelineDocument, ItsCyclesClose)
{
    const auto graph = graphOf(documentOf({&m_full.timeline}, way()));
    const auto* const timeline = graph.rootAs<Timeline::Object>();
    ASSERT_TRUE(timeline && clipOf(*timeline, "chapter") && !timeline->tracks.empty());
    for (const auto& entry : timeline->clips)
        EXPECT_EQ(entry.first->timeline, timeline);
    for (const Timeline::Track* const track : timeline->tracks)
        EXPECT_EQ(track->timeline, timeline);
    const Timeline::Object* const nested = clipOf(*timeline, "chapter")->nestedTimeline;
    ASSERT_TRUE(nested && clipOf(*nested, "mirror") && clipOf(*nested, "nested picture"));
    EXPECT_EQ(clipOf(*nested, "mirror")->nestedTimeline, timeline);
    const Timeline::Object* const innermost = clipOf(*nested, "nested picture")->nestedTimeline;
    ASSERT_TRUE(innermost && clipOf(*innermost, "own mirror"));
    EXPECT_EQ(clipOf(*innermost, "own mirror")->nestedTimeline, innermost);
}

TEST_P(TimelineDocument, SharedObjectsStaySharedAndEqualOnesStayTwo)
{
    const auto graph = graphOf(documentOf({&m_full.timeline}, way()));
    const auto* const timeline = graph.rootAs<Timeline::Object>();
    ASSERT_NE(timeline, nullptr);
    const Timeline::Clip* const beach = clipOf(*timeline, "beach");
    const Timeline::Clip* const seagull = clipOf(*timeline, "Möwe");
    const Timeline::Clip* const chapter = clipOf(*timeline, "chapter");
    ASSERT_TRUE(beach && seagull && chapter);
    ASSERT_EQ(beach->effects.size(), 3u);
    ASSERT_EQ(seagull->effects.size(), 2u);
    EXPECT_EQ(beach->effects[0], beach->effects[2]);
    EXPECT_EQ(beach->effects[0], seagull->effects[0]);
    EXPECT_EQ(seagull->cropEnvelope, seagull->moveEnvelope);
    EXPECT_EQ(beach->file, seagull->file);
    ASSERT_EQ(chapter->effects.size(), 1u);
    EXPECT_EQ(chapter->effects[0]->uniqueId, seagull->effects[1]->uniqueId);
    EXPECT_NE(chapter->effects[0], seagull->effects[1]);
    EXPECT_EQ(clipOf(*timeline, "song")->volumeEnvelope, clipOf(*timeline, "beach sound")->volumeEnvelope);
    EXPECT_NE(clipOf(*timeline, "intro sound")->volumeEnvelope,
              clipOf(*timeline, "song again")->volumeEnvelope);
}

TEST_P(TimelineDocument, SeveralRootsOfOneGraphComeBackAsOneGraph)
{
    const auto graph = graphOf(
        documentOf({&m_full.clip("mirror"), &m_full.innermost, &m_full.timeline, &m_full.labels[3]}, way()));
    ASSERT_EQ(graph.roots().size(), 4u);
    const auto* const timeline = dynamic_cast<Timeline::Object*>(graph.roots()[2]);
    expectSame(m_full.timeline, timeline);
    EXPECT_EQ(graph.size(), m_full.objectCount());
    EXPECT_EQ(graph.rootAs<Timeline::Clip>()->nestedTimeline, timeline);
    EXPECT_EQ(clipOf(*clipOf(*timeline, "chapter")->nestedTimeline, "nested picture")->nestedTimeline,
              dynamic_cast<Timeline::Object*>(graph.roots()[1]));
    const auto* const label = dynamic_cast<Timeline::Label*>(graph.roots()[3]);
    EXPECT_EQ(clipOf(*timeline, "beach sound")->labels.count(label), 1u);
    EXPECT_EQ(clipOf(*timeline, "beach")->labels.count(label), 0u);
}

TEST_P(TimelineDocument, ATimelineReadThroughOneOfItsClipsIsWhole)
{
    const auto graph = graphOf(documentOf({&m_full.clip("own mirror")}, way()));
    const auto* const clip = graph.rootAs<Timeline::Clip>();
    ASSERT_NE(clip, nullptr);
    expectSame(m_full.innermost, clip->timeline);
}

TEST_P(TimelineDocument, AnEmptyTimelineComesBack)
{
    const Timeline::Object empty;
    const auto graph = graphOf(documentOf({&empty}, way()));
    expectSame(empty, graph.rootAs<Timeline::Object>());
    EXPECT_EQ(graph.size(), 1u);
}

TEST_P(TimelineDocument, EverythingThatWasLoadedIsFreedOnce)
{
    const QByteArray document = documentOf({&m_full.timeline}, way());
    graphOf(document);
    const long before = liveAllocations();
    {
        const auto graph = graphOf(document);
        EXPECT_GE(liveAllocations() - before, long(m_full.objectCount()));
    }
    EXPECT_EQ(liveAllocations(), before);
}

TEST_P(TimelineDocument, TheTrackerHasOneDeleterForEachLoadedObject)
{
    const auto graph = graphOf(documentOf({&m_full.timeline}, way()));
    const Timeline::Object* const timeline = graph.rootAs<Timeline::Object>();
    object_tracker tracker;
    tracker << make_nvp("timeline", timeline);
    const auto& records = tracker.records();
    const auto deleters = std::count_if(records.begin(), records.end(), [](const auto& record) {
        return record.first && record.second.deleter;
    });
    EXPECT_EQ(std::size_t(deleters), graph.size());
    EXPECT_EQ(std::size_t(deleters), m_full.objectCount());
}

TEST_P(TimelineDocument, ALoadThatFailsLeavesNothingBehind)
{
    const QByteArray document = documentOf({&m_full.timeline}, way());
    EXPECT_EQ(loadError(document), "");
    constexpr int cuts = 80;
    for (int cut = 1; cut < cuts; ++cut) {
        const QByteArray damaged = cutWithin(document, double(cut) / cuts, way());
        const std::string first = loadError(damaged);
        ASSERT_NE(first, "") << "cut " << cut << " of " << cuts;
        const long before = liveAllocations();
        ASSERT_EQ(loadError(damaged), first);
        ASSERT_EQ(liveAllocations(), before) << "cut " << cut << " of " << cuts << ": " << first;
    }
}

/// Or the cuts would be found by the checksum, before anything was made.
TEST_P(TimelineDocument, ACutDocumentThatIsClosedAgainIsReadUpToTheCut)
{
    const QByteArray document = documentOf({&m_full.timeline}, way());
    EXPECT_EQ(closedAgain(document, way()), document);
    const std::string error = loadError(cutWithin(document, 0.5, way()));
    EXPECT_NE(error.find(", at objects[1]/"), std::string::npos) << error;
}

TEST(TimelineInArchives, TheTrackerFreesWhatAnArchiveLoaded)
{
    FullTimeline full;
    std::stringstream stream;
    {
        boost::archive::binary_oarchive archive(stream);
        const Timeline::Object* const timeline = &full.timeline;
        archive << make_nvp("timeline", timeline);
    }
    const std::string bytes = stream.str();
    const auto loadAndFree = [&] {
        std::istringstream input(bytes);
        Timeline::Object* timeline = nullptr;
        boost::archive::binary_iarchive archive(input);
        archive >> make_nvp("timeline", timeline);
        EXPECT_THAT(timelineDifferences(full.timeline, *timeline, true), IsEmpty());
        object_tracker tracker;
        tracker << make_nvp("timeline", timeline);
        tracker.deleteAll();
    };
    loadAndFree();
    const long before = liveAllocations();
    loadAndFree();
    EXPECT_EQ(liveAllocations(), before);
}

} // namespace
