// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldTexts.h"
#include "tests/types/Printing.h"

#include <EditorModel/analysis/BeatDetection.h>
#include <EditorModel/analysis/Stabilization.h>
#include <EditorModel/effects/Effect.h>
#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Quiz.h>
#include <EditorModel/media/File.h>
#include <EditorModel/timeline/Composition.h>
#include <EditorModel/timeline/Object.h>
#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>

#include <algorithm>
#include <type_traits>
#include <utility>
#include <vector>

namespace {

using testing::ElementsAre;
using Testing::FieldText;
using testing::IsEmpty;
using testing::UnorderedElementsAre;
using Timeline::Clip;
using Timeline::Label;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, Clip>);
static_assert(Testing::isVirtualBase<PubSub::Object, Clip>);
static_assert(std::is_same_v<std::underlying_type_t<Clip::ClipType>, int>);

/// A clip with every field set, and all that its fields name.
struct Fixture
{
    Timeline::Object timeline;
    Timeline::Object nested;
    Composition::Range range;
    Media::File file;
    Overlay::Preset overlay;
    Quiz::Preset quiz;
    VolumeEnvelope volume;
    TransformationEnvelope crop;
    TransformationEnvelope move;
    BeatDetection::Object beats;
    Stabilization::Object stabilization;
    Label label;
    Effect::Object effect{"blur", "1"};
    Effect::Object second{"glow", "2"};
    Clip clip;

    Fixture()
    {
        clip.setTimeline(&timeline)->setType(Clip::IntroAudioClip)->setName("name")->setRange(&range);
        clip.setFile(&file)->setOverlay(&overlay)->setQuiz(&quiz)->setNestedTimeline(&nested);
        clip.setVolume(50)->setVolumeEnvelope(&volume)->setCropEnvelope(&crop)->setMoveEnvelope(&move);
        clip.setRhythm(&beats)->setStabilization(&stabilization)->setMediaTrack(3)->setLabels({&label});
        clip.setMotionTrackings({"b", "a"})->setEnabled(false)->setBroken(true);
        clip.setUnlimitedDuration(true)->setSourceDuration(9000)->addEffect(&effect)->addEffect(&second);
    }

    void expectEveryFieldSet(const Clip& other) const
    {
        EXPECT_EQ(other.timeline, &timeline);
        EXPECT_EQ(other.type, Clip::IntroAudioClip);
        EXPECT_EQ(other.name, "name");
        EXPECT_EQ(other.range, &range);
        EXPECT_EQ(other.file, &file);
        EXPECT_EQ(other.overlay, &overlay);
        EXPECT_EQ(other.quiz, &quiz);
        EXPECT_EQ(other.nestedTimeline, &nested);
        EXPECT_EQ(other.volume, 50);
        EXPECT_EQ(other.volumeEnvelope, &volume);
        EXPECT_EQ(other.cropEnvelope, &crop);
        EXPECT_EQ(other.moveEnvelope, &move);
        EXPECT_EQ(other.rhythm, &beats);
        EXPECT_EQ(other.stabilization, &stabilization);
        EXPECT_EQ(other.mediaTrack, 3);
        EXPECT_THAT(other.labels, ElementsAre(&label));
        EXPECT_THAT(other.motionTrackings, ElementsAre("a", "b"));
        EXPECT_FALSE(other.enabled);
        EXPECT_TRUE(other.broken);
        EXPECT_TRUE(other.unlimitedDuration);
        EXPECT_EQ(other.sourceDuration, MTime(9000));
        EXPECT_THAT(other.effects, ElementsAre(&effect, &second));
    }
};

TEST(Clip, HasTheseTypes)
{
    EXPECT_EQ(Clip::VideoClip, 1);
    EXPECT_EQ(Clip::AudioClip, 2);
    EXPECT_EQ(Clip::OverlayClip, 4);
    EXPECT_EQ(Clip::IntroVideoClip, 8);
    EXPECT_EQ(Clip::IntroAudioClip, 16);
    EXPECT_EQ(Clip::IntroOverlayClip, 32);
}

TEST(Clip, HasTheseDurations)
{
    EXPECT_EQ(Clip::MIN_DURATION, MTime(10));
    EXPECT_EQ(Clip::DEFAULT_TITLE_CLIP_DURATION, MTime(6000));
    EXPECT_EQ(Clip::DEFAULT_CALLOUT_CLIP_DURATION, MTime(3000));
    EXPECT_EQ(Clip::DEFAULT_IMAGE_CLIP_DURATION, MTime(4000));
    EXPECT_EQ(Clip::DEFAULT_QUIZ_CLIP_DURATION, MTime(5500));
}

// Computed before main, in a source of its own.
const MTime twiceTheMargin = Clip::MIN_DURATION + Clip::MIN_DURATION;

TEST(Clip, HasItsDurationsWhileOtherConstantsAreComputed)
{
    EXPECT_EQ(twiceTheMargin, MTime(20));
}

TEST(Clip, IsOfNoKindAtFirst)
{
    const Clip clip;
    EXPECT_FALSE(clip.isVideoClip());
    EXPECT_FALSE(clip.isAudioClip());
    EXPECT_FALSE(clip.isOverlayClip());
    EXPECT_FALSE(clip.isIntroClip());
}

TEST(Clip, GivesItselfBackForEveryChangeOfItsLists)
{
    const Timeline::Label label;
    Clip clip;
    EXPECT_EQ(clip.addEffect(nullptr), &clip);
    EXPECT_EQ(clip.removeEffect(nullptr), &clip);
    EXPECT_EQ(clip.clearEffects(), &clip);
    EXPECT_EQ(clip.addLabel(&label), &clip);
    EXPECT_EQ(clip.removeLabel(&label), &clip);
    EXPECT_EQ(clip.addMotionTracking("a"), &clip);
    EXPECT_EQ(clip.removeMotionTracking("a"), &clip);
}

TEST(Clip, SetsItsOwnSetsWithoutAChange)
{
    Fixture fixture;
    Clip& clip = fixture.clip;
    EXPECT_EQ(clip.setLabels(clip.labels), &clip);
    EXPECT_EQ(clip.setMotionTrackings(clip.motionTrackings), &clip);
    fixture.expectEveryFieldSet(clip);
}

TEST(Clip, IsMadeByName)
{
    Testing::expectMadeByName<Clip>("Timeline::Clip");
}

TEST(Clip, IsWrittenInAnOrderOfItsOwnWithoutItsRange)
{
    const Fixture fixture;
    // What the pointers lead to is another class's matter.
    std::vector<FieldText> heads;
    for (const auto& [key, text] : Testing::fieldTexts(fixture.clip))
        heads.emplace_back(key, text.substr(0, std::min(text.find('\n'), text.find(" #"))));
    EXPECT_THAT(heads,
                ElementsAre(FieldText("timeline", "Timeline::Object"), FieldText("type", "16"),
                            FieldText("name", "Q\"name\""), FieldText("enabled", "false"),
                            FieldText("overlay", "Overlay::Preset"), FieldText("quiz", "Quiz::Preset"),
                            FieldText("file", "File"), FieldText("nestedTimeline", "Timeline::Object"),
                            FieldText("volume", "50"), FieldText("volumeEnvelope", "VolumeEnvelope"),
                            FieldText("cropEnvelope", "TransformationEnvelope"),
                            FieldText("moveEnvelope", "TransformationEnvelope"), FieldText("broken", "true"),
                            FieldText("unlimitedDuration", "true"), FieldText("sourceDuration", "9000ms"),
                            FieldText("effects", ""), FieldText("rhythm", "BeatDetection::Object"),
                            FieldText("stabilization", "Stabilization::Object"), FieldText("mediaTrack", "3"),
                            FieldText("labels", ""), FieldText("motionTrackings", "")));
}

TEST(Clip, ComesBackWithEveryPointerInItsPlace)
{
    Fixture fixture;
    fixture.timeline.width = 11;
    fixture.nested.width = 12;
    fixture.file.path = "file";
    fixture.overlay.tag = "overlay";
    fixture.quiz.tag = "quiz";
    fixture.volume.defaultValue = 0.25;
    fixture.crop.defaultValue.opacity = 31;
    fixture.move.defaultValue.opacity = 32;
    fixture.beats.interval = 41;
    fixture.stabilization.shakiness = 42;
    fixture.label.name = "label";
    for (const Way& way : allWays) {
        SCOPED_TRACE(way.name);
        const Document::Graph graph = graphOf(documentOf({&fixture.clip}, way));
        const auto* const loaded = graph.rootAs<Clip>();
        ASSERT_NE(loaded, nullptr);
        EXPECT_EQ(loaded->range, nullptr);
        EXPECT_EQ(loaded->type, Clip::IntroAudioClip);
        ASSERT_TRUE(loaded->timeline && loaded->nestedTimeline && loaded->file && loaded->overlay &&
                    loaded->quiz && loaded->volumeEnvelope && loaded->cropEnvelope && loaded->moveEnvelope &&
                    loaded->rhythm && loaded->stabilization);
        EXPECT_EQ(loaded->timeline->width, 11);
        EXPECT_EQ(loaded->nestedTimeline->width, 12);
        EXPECT_EQ(loaded->file->path, "file");
        EXPECT_EQ(loaded->overlay->tag, "overlay");
        EXPECT_EQ(loaded->quiz->tag, "quiz");
        EXPECT_EQ(loaded->volumeEnvelope->defaultValue, 0.25);
        EXPECT_EQ(loaded->cropEnvelope->defaultValue.opacity, 31);
        EXPECT_EQ(loaded->moveEnvelope->defaultValue.opacity, 32);
        EXPECT_EQ(loaded->rhythm->interval, MTime(41));
        EXPECT_EQ(loaded->stabilization->shakiness, 42);
        ASSERT_EQ(loaded->labels.size(), 1u);
        EXPECT_EQ((*loaded->labels.begin())->name, "label");
        EXPECT_THAT(loaded->motionTrackings, ElementsAre("a", "b"));
        ASSERT_EQ(loaded->effects.size(), 2u);
        EXPECT_EQ(loaded->effects[0]->id, "blur");
        EXPECT_EQ(loaded->effects[1]->id, "glow");
    }
}

TEST(Clip, ThatItsTimelineHoldsComesBackInsideIt)
{
    Timeline::Object timeline;
    Timeline::Track track(PrimaryTrack);
    track.setTimeline(&timeline);
    Clip clip;
    clip.setTimeline(&timeline)->setName("looped");
    timeline.addTrack(&track)->addClip(&clip, Timeline::ClipTiming(&track, 0, 5, 6, 7, 8));
    for (const Way& way : allWays) {
        SCOPED_TRACE(way.name);
        const Document::Graph graph = graphOf(documentOf({&clip}, way));
        const auto* const loaded = graph.rootAs<Clip>();
        ASSERT_TRUE(loaded && loaded->timeline);
        ASSERT_EQ(loaded->timeline->clips.size(), 1u);
        EXPECT_EQ(loaded->timeline->clips.begin()->first, loaded);
        const Timeline::ClipTiming& timing = loaded->timeline->clips.begin()->second;
        EXPECT_EQ(timing.timestamp, MTime(5));
        EXPECT_THAT(loaded->timeline->tracks, ElementsAre(timing.track));
        EXPECT_EQ(timing.track->timeline, loaded->timeline);
    }
}

TEST(Clip, IsTestedForItsKindByASingleType)
{
    // The type; then whether it is a picture, sound, an overlay, and of an intro.
    const std::vector<std::pair<int, std::vector<bool>>> table = {
        {0, {false, false, false, false}},  {1, {true, false, false, false}},
        {2, {false, true, false, false}},   {3, {false, false, false, false}},
        {4, {false, false, true, false}},   {8, {true, false, false, true}},
        {9, {false, false, false, false}},  {16, {false, true, false, true}},
        {24, {false, false, false, false}}, {32, {false, false, true, false}},
        {36, {false, false, false, false}}, {63, {false, false, false, false}},
        {64, {false, false, false, false}}, {-1, {false, false, false, false}},
    };
    for (const auto& [type, kinds] : table) {
        Clip clip;
        clip.setType(Clip::ClipType(type));
        EXPECT_THAT(kinds, ElementsAre(clip.isVideoClip(), clip.isAudioClip(), clip.isOverlayClip(),
                                       clip.isIntroClip()))
            << type;
    }
}

TEST(ClipEffects, AreListedAsOftenAsTheyAreAdded)
{
    const Effect::Object a("a");
    const Effect::Object b("b");
    Clip clip;
    clip.addEffect(&a)->addEffect(&b)->addEffect(&a);
    EXPECT_THAT(clip.effects, ElementsAre(&a, &b, &a));
    clip.clearEffects();
    EXPECT_THAT(clip.effects, IsEmpty());
}

TEST(ClipEffects, AreRemovedWhereverTheyStandByTheirAddress)
{
    const Effect::Object a("same");
    const Effect::Object b("same");
    const Effect::Object c("same");
    Clip clip;
    clip.addEffect(&a)->addEffect(&b)->addEffect(&a)->addEffect(&c);
    clip.removeEffect(&a);
    EXPECT_THAT(clip.effects, ElementsAre(&b, &c));
    clip.removeEffect(&a);
    EXPECT_THAT(clip.effects, ElementsAre(&b, &c));
}

TEST(ClipEffects, AreRemovedByAPointerThatStandsInTheChainItself)
{
    const Effect::Object a("a");
    const Effect::Object b("b");
    Clip clip;
    clip.addEffect(&a)->addEffect(&a)->addEffect(&b)->addEffect(&a);
    clip.removeEffect(clip.effects.front());
    EXPECT_THAT(clip.effects, ElementsAre(&b));
}

TEST(ClipEffects, AreFoundByTheFirstOfTheirIdentifier)
{
    const Effect::Object first("a", "1");
    const Effect::Object second("a", "2");
    const Effect::Object other("b", "3");
    Clip clip;
    EXPECT_EQ(clip.findEffect("a"), nullptr);
    EXPECT_EQ(clip.findEffect(""), nullptr);
    clip.addEffect(&other)->addEffect(&second)->addEffect(&first);
    EXPECT_EQ(clip.findEffect("a"), &second);
    EXPECT_EQ(clip.findEffect("b"), &other);
    EXPECT_EQ(clip.findEffect("2"), nullptr);
    EXPECT_EQ(clip.findEffect("A"), nullptr);
}

TEST(ClipEffects, AreReplacedInTheirPlaceByBothIdentifiers)
{
    const Effect::Object sameId("a", "1");
    const Effect::Object sameUniqueId("b", "2");
    const Effect::Object old("a", "2");
    const Effect::Object again("a", "2");
    Effect::Object replacement("a", "2");
    replacement.intensity = 0.5;
    Clip clip;
    clip.addEffect(&sameId)->addEffect(&sameUniqueId)->addEffect(&old)->addEffect(&again);
    EXPECT_EQ(clip.replaceEffect(&replacement), &clip);
    EXPECT_THAT(clip.effects, ElementsAre(&sameId, &sameUniqueId, &replacement, &again));
    EXPECT_EQ(old.intensity, 1.0);
    clip.replaceEffect(&replacement);
    EXPECT_THAT(clip.effects, ElementsAre(&sameId, &sameUniqueId, &replacement, &again));
}

TEST(ClipLabels, AreListedOnce)
{
    const Label a;
    const Label b;
    Clip clip;
    clip.addLabel(&a)->addLabel(&b)->addLabel(&a);
    EXPECT_THAT(clip.labels, UnorderedElementsAre(&a, &b));
    clip.removeLabel(&a)->removeLabel(&a);
    EXPECT_THAT(clip.labels, ElementsAre(&b));
}

TEST(ClipLabels, DifferByAddress)
{
    const Label a;
    const Label sameAsA;
    const Label shared;
    Clip clip;
    Clip other;
    clip.addLabel(&a)->addLabel(&shared);
    other.addLabel(&sameAsA)->addLabel(&shared);
    EXPECT_THAT(clip.labelsDifference(&other), ElementsAre(&a));
    EXPECT_THAT(other.labelsDifference(&clip), ElementsAre(&sameAsA));
    EXPECT_THAT(clip.labelsDifference(&clip), IsEmpty());
    const Clip without;
    EXPECT_THAT(clip.labelsDifference(&without), UnorderedElementsAre(&a, &shared));
    EXPECT_THAT(without.labelsDifference(&clip), IsEmpty());
}

TEST(ClipMotionTrackings, AreListedOnceAndInOrder)
{
    Clip clip;
    clip.addMotionTracking("b")->addMotionTracking("a")->addMotionTracking("b")->addMotionTracking("");
    EXPECT_THAT(clip.motionTrackings, ElementsAre("", "a", "b"));
    clip.removeMotionTracking("a")->removeMotionTracking("c");
    EXPECT_THAT(clip.motionTrackings, ElementsAre("", "b"));
}

} // namespace
