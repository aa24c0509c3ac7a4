// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldTexts.h"
#include "tests/timeline/Timelines.h"

#include <EditorModel/effects/Transition.h>
#include <EditorModel/timeline/Composition.h>

#include <gtest/gtest.h>

#include <array>
#include <type_traits>
#include <utility>

namespace {

using namespace TimelineTests;
using testing::ElementsAre;
using testing::IsEmpty;
using Timeline::Clip;
using Timeline::Track;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, Timeline::Object>);
static_assert(Testing::isVirtualBase<PubSub::Object, Timeline::Object>);
static_assert(Testing::isVirtualBase<Media::Video, Timeline::Object>);
static_assert(Testing::isVirtualBase<Media::Audio, Timeline::Object>);
static_assert(std::is_same_v<std::underlying_type_t<Timeline::Object::Scope>, int>);
static_assert(std::is_same_v<Timeline::ClipPair, std::pair<const Clip*, const Clip*>>);
// Views move what moves without throwing, and copy the rest.
static_assert(std::is_nothrow_move_assignable_v<Timeline::Object>);
static_assert(std::is_copy_constructible_v<Timeline::Object>);
static_assert(std::is_move_constructible_v<Timeline::Object>);
static_assert(std::is_copy_assignable_v<Timeline::Object>);

class TimelineObject : public ::testing::Test
{
protected:
    Timeline::Object withEveryFieldSet() const
    {
        Timeline::Object timeline;
        timeline.setGeometry(640, 480)->setFrameRate(25, 1)->setAspect(4, 3)->setExportMode(true);
        timeline.setOpaque(false);
        timeline.setChannelLayout(Norvel::Conf::ChannelLayout(6))->setSampleRate(48000);
        timeline.setSampleFormat(Norvel::Conf::SampleFormats(8));
        timeline.Media::Video::label = QStringLiteral("picture");
        timeline.Media::Audio::label = QStringLiteral("sound");
        timeline.setScope(Timeline::Object::Scope(3))->setComposition(&composition);
        timeline.setMarkerUpdateEnabled(false)->addExportRange(&range);
        timeline.reservedText = QStringLiteral("text");
        timeline.reservedFirst = (qint64(1) << 40) + 1;
        timeline.reservedSecond = -(qint64(1) << 41);
        timeline.addTrack(&tracks[1])->addTrack(&tracks[0]);
        timeline.addClip(&clips[0], lying(&tracks[0], 10, 1000))
            ->addClip(&clips[1], lying(&tracks[1], 1010, 2000, 3));
        timeline.addLink(&clips[0], &clips[1], MTime(7));
        timeline.addTrackingLink(&clips[1],
                                 {Timeline::TrackedObject(&clips[0], QStringLiteral("id")), QPointF(1, 2)});
        timeline.transitions[&transition] = {&clips[0], &clips[1]};
        return timeline;
    }

    void expectArchivedFieldsSet(const Timeline::Object& timeline) const
    {
        EXPECT_EQ(timeline.width, 640);
        EXPECT_EQ(timeline.height, 480);
        EXPECT_EQ(timeline.frameRateN, 25);
        EXPECT_EQ(timeline.frameRateD, 1);
        EXPECT_EQ(timeline.aspectX, 4);
        EXPECT_EQ(timeline.aspectY, 3);
        EXPECT_EQ(timeline.channelLayout, 6);
        EXPECT_EQ(timeline.sampleRate, 48000);
        EXPECT_EQ(timeline.sampleFormat, 8);
    }

    void expectEveryFieldSet(const Timeline::Object& timeline) const
    {
        expectArchivedFieldsSet(timeline);
        EXPECT_TRUE(timeline.exportMode);
        EXPECT_FALSE(timeline.opaque);
        EXPECT_EQ(timeline.Media::Video::label, QStringLiteral("picture"));
        EXPECT_EQ(timeline.Media::Audio::label, QStringLiteral("sound"));
        EXPECT_EQ(timeline.scope, 3);
        EXPECT_EQ(timeline.composition, &composition);
        EXPECT_FALSE(timeline.markerUpdateEnabled);
        EXPECT_THAT(timeline.exportRanges, ElementsAre(&range));
        EXPECT_EQ(timeline.reservedText, QStringLiteral("text"));
        EXPECT_EQ(timeline.reservedFirst, 1099511627777);
        EXPECT_EQ(timeline.reservedSecond, -2199023255552);
        EXPECT_THAT(timeline.tracks, ElementsAre(&tracks[1], &tracks[0]));
        ASSERT_EQ(timeline.clips.size(), 2u);
        EXPECT_TRUE(timeline.clipTiming(&clips[0]) == lying(&tracks[0], 10, 1000));
        EXPECT_TRUE(timeline.clipTiming(&clips[1]) == lying(&tracks[1], 1010, 2000, 3));
        ASSERT_EQ(timeline.links.size(), 1u);
        EXPECT_TRUE(timeline.links.at(&clips[1]) == Timeline::Link(&clips[0], MTime(7)));
        ASSERT_EQ(timeline.trackingLinks.size(), 1u);
        EXPECT_EQ(timeline.trackingLinks.at(&clips[1]).trackedObject.clip, &clips[0]);
        EXPECT_EQ(timeline.trackingLinks.at(&clips[1]).objectRelativeOffset, QPointF(1, 2));
        ASSERT_EQ(timeline.transitions.size(), 1u);
        EXPECT_EQ(timeline.transitions.at(&transition), Timeline::ClipPair(&clips[0], &clips[1]));
    }

    std::array<Clip, 2> clips;
    std::array<Track, 2> tracks{Track(PrimaryTrack), Track(TitleTrack)};
    Transition::Object transition;
    Composition::Object composition;
    Composition::Range range;
};

TEST_F(TimelineObject, StoresItsStateAndGivesItself)
{
    Timeline::Object timeline;
    Composition::Range second;
    EXPECT_EQ(timeline.setScope(Timeline::Object::Scope(-7)), &timeline);
    EXPECT_EQ(timeline.scope, -7);
    EXPECT_EQ(timeline.setMarkerUpdateEnabled(false), &timeline);
    EXPECT_FALSE(timeline.markerUpdateEnabled);
    EXPECT_EQ(timeline.setComposition(&composition), &timeline);
    EXPECT_EQ(timeline.composition, &composition);
    EXPECT_EQ(timeline.addExportRange(&range), &timeline);
    timeline.addExportRange(&second)->addExportRange(&range);
    EXPECT_EQ(timeline.exportRanges, (std::set<const Composition::Range*>{&range, &second}));
    EXPECT_EQ(timeline.removeExportRange(&range), &timeline);
    EXPECT_THAT(timeline.exportRanges, ElementsAre(&second));
    EXPECT_EQ(timeline.removeExportRange(&range), &timeline);
    EXPECT_THAT(timeline.exportRanges, ElementsAre(&second));
}

TEST_F(TimelineObject, ACopyIsEditedOnItsOwn)
{
    const Timeline::Object original = withEveryFieldSet();
    Timeline::Object copy(original);
    copy.clearClips()->clearLinks()->clearTrackingLinks()->clearTracks()->removeExportRange(&range);
    copy.transitions.clear();
    expectEveryFieldSet(original);
}

TEST_F(TimelineObject, IsMadeByName)
{
    Testing::expectMadeByName<Timeline::Object>("Timeline::Object");
}

TEST_F(TimelineObject, IsWrittenWithItsFormatsFirst)
{
    EXPECT_THAT(
        Testing::fieldKeys(Timeline::Object()),
        ElementsAre("base Video", "base Audio", "tracks", "clips", "links", "trackingLinks", "transitions"));
    const Timeline::Object whole = withEveryFieldSet();
    EXPECT_THAT(Testing::defaultFields(whole), IsEmpty());
}

class StoredTimeline : public TimelineObject, public ::testing::WithParamInterface<Way>
{};

INSTANTIATE_TEST_SUITE_P(Ways, StoredTimeline, ::testing::ValuesIn(allWays),
                         [](const auto& instance) { return std::string(instance.param.name); });

TEST_P(StoredTimeline, ComesBackWithOneObjectForEachThatItNames)
{
    clips[0].setName(QStringLiteral("first"));
    clips[1].setName(QStringLiteral("second"));
    const Timeline::Object original = withEveryFieldSet();
    for (Track& track : tracks)
        track.setTimeline(&original);
    const auto graph = graphOf(documentOf({&original}, GetParam()));
    const auto* const loaded = graph.rootAs<Timeline::Object>();
    ASSERT_TRUE(loaded);
    expectArchivedFieldsSet(*loaded);
    // The timeline, two tracks, two clips, a transition.
    EXPECT_EQ(graph.size(), 6u);

    ASSERT_EQ(loaded->tracks.size(), 2u);
    const Track* const titles = loaded->tracks[0];
    const Track* const pictures = loaded->tracks[1];
    EXPECT_EQ(titles->type, TitleTrack);
    EXPECT_EQ(pictures->type, PrimaryTrack);
    EXPECT_EQ(titles->timeline, loaded);
    ASSERT_EQ(loaded->clipsAt(pictures).size(), 1u);
    ASSERT_EQ(loaded->clipsAt(titles).size(), 1u);
    const Clip* const first = *loaded->clipsAt(pictures).begin();
    const Clip* const second = *loaded->clipsAt(titles).begin();
    EXPECT_EQ(first->name, QStringLiteral("first"));
    EXPECT_EQ(second->name, QStringLiteral("second"));

    EXPECT_TRUE(loaded->clipTiming(first) == lying(pictures, 10, 1000));
    EXPECT_TRUE(loaded->clipTiming(second) == lying(titles, 1010, 2000, 3));
    ASSERT_EQ(loaded->links.size(), 1u);
    EXPECT_TRUE(loaded->links.at(second) == Timeline::Link(first, MTime(7)));
    ASSERT_EQ(loaded->trackingLinks.size(), 1u);
    EXPECT_EQ(loaded->trackingLinks.at(second).trackedObject.clip, first);
    ASSERT_EQ(loaded->transitions.size(), 1u);
    EXPECT_EQ(loaded->transitions.begin()->second, Timeline::ClipPair(first, second));
}

TEST_P(StoredTimeline, ComesBackWithDefaultsWhereNothingIsStored)
{
    const Timeline::Object original = withEveryFieldSet();
    const auto graph = graphOf(documentOf({&original}, GetParam()));
    const auto* const loaded = graph.rootAs<Timeline::Object>();
    ASSERT_TRUE(loaded);
    EXPECT_EQ(loaded->scope, 0);
    EXPECT_EQ(loaded->composition, nullptr);
    EXPECT_TRUE(loaded->markerUpdateEnabled);
    EXPECT_THAT(loaded->exportRanges, IsEmpty());
    EXPECT_TRUE(loaded->reservedText.isEmpty());
    EXPECT_EQ(loaded->reservedFirst, 0);
    EXPECT_EQ(loaded->reservedSecond, 0);
    EXPECT_FALSE(loaded->exportMode);
    EXPECT_TRUE(loaded->opaque);
    EXPECT_TRUE(loaded->Media::Video::label.isEmpty());
    EXPECT_TRUE(loaded->Media::Audio::label.isEmpty());
}

} // namespace
