// SPDX-License-Identifier: Apache-2.0
#include "tests/host/shared/SampleTimeline.h"

#include "host/timeline/TimelineOutline.h"
#include "host/timeline/TimelineTable.h"

#include <EditorModel/effects/Quiz.h>

#include <gmock/gmock.h>

#include <limits>

namespace {

using namespace HostTests;
using testing::ElementsAre;
using testing::HasSubstr;
using Timeline::Clip;

TEST(TimelineTable, ListsWhatAnEmptyTimelineHas)
{
    const Timeline::Object timeline;
    EXPECT_EQ(Host::timelineTable(timeline),
              "Timeline: 0 clips on 0 tracks, 00:00:00.000; 1920 x 1080, 29.97 fps, 44100 Hz, stereo\n");
}

TEST(TimelineTable, ListsTracksClipsTransitionsAndLinks)
{
    SampleTimeline sample;
    Timeline::Track* const primary = sample.addTrack(PrimaryTrack);
    Timeline::Track* const native = sample.addTrack(NativeAudioTrack);
    Timeline::Track* const titles = sample.addTrack(TitleTrack);
    native->setMuted(true)->setLinked(true);
    titles->setGapless(true)->setUsed(false);
    Clip* const second = sample.addClip("b.mp4", Clip::VideoClip, primary, 4000, 2000);
    Clip* const first = sample.addClip("a.mp4", Clip::VideoClip, primary, 0, 4000);
    Clip* const sound = sample.addClip("a.mp4", Clip::AudioClip, native, 0, 4000);
    Clip* const title = sample.addClip("Hello", Clip::OverlayClip, titles, 500, 1500, 1);
    sample.trim(second, 1000, 500);
    sample.timeline.setClipFadeInDuration(title, 250)->setClipFadeOutDuration(title, 300);
    sample.timeline.addLink(first, sound, 0)->addLink(first, title, 500);
    sample.timeline.addTrackingLink(title, {Timeline::TrackedObject(first, "face"), QPointF()});
    sample.addTransition("dissolve", first, second, 1000);
    sample.addTransition("fade", second, nullptr, 400);

    EXPECT_EQ(Host::timelineTable(sample.timeline),
              R"(Timeline: 4 clips on 3 tracks, 00:00:06.000; 1920 x 1080, 29.97 fps, 44100 Hz, stereo

Track  Role          Clips  Levels  State
    1  primary           2       1
    2  native audio      1       1  muted, linked
    3  title             1       1  gapless, unused

Clip  Name   Kind     Track  Level         Start        Length  Source                       Speed       Fade-in      Fade-out  State
   1  a.mp4  picture      1      0  00:00:00.000  00:00:04.000  00:00:00.000 - 00:00:04.000      1
   2  b.mp4  picture      1      0  00:00:04.000  00:00:02.000  00:00:01.000 - 00:00:03.000      1
   3  a.mp4  sound        2      0  00:00:00.000  00:00:04.000  00:00:00.000 - 00:00:04.000      1                              off by its track
   4  Hello  overlay      3      1  00:00:00.500  00:00:01.500  00:00:00.000 - 00:00:01.500      1  00:00:00.250  00:00:00.300

Transition  Name      Out of   Into           Length
         1  dissolve  1 a.mp4  2 b.mp4  00:00:01.000
         2  fade      2 b.mp4  -        00:00:00.400

Linked clip  Master         Offset
3 a.mp4      1 a.mp4  00:00:00.000
4 Hello      1 a.mp4  00:00:00.500

Following clip  Tracked in  Tracking
4 Hello         1 a.mp4     face
)");
}

TEST(TimelineTable, ListsTheLabelsOfClips)
{
    SampleTimeline sample;
    const Timeline::Track* const primary = sample.addTrack(PrimaryTrack);
    Clip* const second = sample.addClip("b.mp4", Clip::VideoClip, primary, 4000, 2000);
    Clip* const first = sample.addClip("a.mp4", Clip::VideoClip, primary, 0, 4000);
    Timeline::Label cut, beat, nameless;
    cut.setName("cut here")->setPosition(2500);
    beat.setName("beat")->setPosition(1000);
    nameless.setPosition(4500);
    first->addLabel(&cut)->addLabel(&beat)->addLabel(nullptr);
    second->addLabel(&nameless)->addLabel(&cut);
    EXPECT_THAT(Host::timelineTable(sample.timeline), testing::EndsWith(R"(
Label     Clip         Position
beat      1 a.mp4  00:00:01.000
cut here  1 a.mp4  00:00:02.500
cut here  2 b.mp4  00:00:02.500
-         2 b.mp4  00:00:04.500
)"));
}

TEST(TimelineTable, GivesTheSourceInItsOwnTime)
{
    SampleTimeline sample;
    const Timeline::Track* const track = sample.addTrack(PrimaryTrack);
    const Clip* const clip = sample.addClip("fast", Clip::VideoClip, track, 0, 2000);
    sample.trim(clip, 1000, 7000);
    // 10 s of source, of which 1 s to 3 s are shown; at double speed in one second.
    sample.timeline.setClipSpeed(clip, 2.0);
    EXPECT_THAT(Host::timelineTable(sample.timeline),
                HasSubstr("00:00:01.000  00:00:01.000 - 00:00:03.000      2\n"));
    // The same stretch, backwards.
    sample.timeline.reverseClip(clip);
    EXPECT_THAT(Host::timelineTable(sample.timeline),
                testing::ContainsRegex("00:00:01.000  00:00:01.000 - 00:00:03.000      2 +reversed\n"));
}

TEST(TimelineTable, NamesTheKindsAndStatesOfClips)
{
    SampleTimeline sample;
    Timeline::Track* const track = sample.addTrack(static_cast<TrackType>(0));
    const Quiz::Preset quiz;
    const Timeline::Object nested;
    Media::File file;
    file.setPath("/somewhere/film.mov");
    sample.addClip("q", Clip::OverlayClip, track, 0, 10)->setQuiz(&quiz);
    sample.addClip("n", Clip::VideoClip, track, 10, 10)->setNestedTimeline(&nested)->setEnabled(false);
    sample.addClip("", Clip::IntroVideoClip, track, 20, 10)->setFile(&file)->setBroken(true);
    sample.addClip("", static_cast<Clip::ClipType>(3), track, 30, 10)->setVolume(50);
    const std::string table = Host::timelineTable(sample.timeline);
    EXPECT_THAT(table, testing::ContainsRegex("\n +1  - +4 +1\n"));
    EXPECT_THAT(table, testing::ContainsRegex("1  q +quiz "));
    EXPECT_THAT(table, testing::ContainsRegex("2  n +timeline .* 1 +disabled\n"));
    EXPECT_THAT(table, testing::ContainsRegex("3  film.mov +picture .* 1 +intro, broken\n"));
    EXPECT_THAT(table, testing::ContainsRegex("4  - +- .* 1 +volume 50 %\n"));
}

TEST(TimelineTable, WithstandsWhatNoTimelineShouldHold)
{
    constexpr qint64 highest = std::numeric_limits<qint64>::max();
    SampleTimeline sample;
    Timeline::Track* const native = sample.addTrack(NativeAudioTrack);
    const Timeline::Track unlisted(AudioTrack);
    const Clip elsewhere;
    sample.timeline.addTrack(nullptr)->addTrack(native);
    Clip* const slave = sample.addClip("slave", Clip::AudioClip, native, highest, highest);
    sample.addClip("lost", Clip::AudioClip, &unlisted, -highest, highest);
    sample.addClip("none", Clip::VideoClip, nullptr, 0, -5);
    sample.timeline.addLink(&elsewhere, slave, 0)->addLink(nullptr, &elsewhere, 0);
    sample.timeline.addClip(nullptr, Timeline::ClipTiming());
    sample.timeline.addTrackingLink(slave, Timeline::TrackingLinkInfo());
    const Transition::Object transition("id");
    sample.timeline.transitions[&transition] = {&elsewhere, nullptr};
    sample.timeline.transitions[nullptr] = {slave, nullptr};

    const std::string table = Host::timelineTable(sample.timeline);
    EXPECT_THAT(table, HasSubstr("3 clips on 1 track, "));
    EXPECT_THAT(table, testing::ContainsRegex("2  audio .*not listed\n"));
    EXPECT_THAT(table, testing::ContainsRegex("3  none +picture +- "));
    EXPECT_THAT(table, HasSubstr("1  id    ? -     -     00:00:00.000\n"));
}

TEST(TimelineOutline, NumbersByTrackLevelAndStartWhereverThingsLie)
{
    SampleTimeline sample;
    const Timeline::Track* const lower = sample.addTrack(TitleTrack);
    const Timeline::Track* const upper = sample.addTrack(PrimaryTrack);
    const Clip* const e = sample.addClip("e", Clip::VideoClip, upper, 0, 10);
    const Clip* const d = sample.addClip("d", Clip::OverlayClip, lower, 5, 10, 1);
    const Clip* const c = sample.addClip("c", Clip::OverlayClip, lower, 0, 10, 1);
    const Clip* const b = sample.addClip("b", Clip::OverlayClip, lower, 30, 10);
    const Clip* const a = sample.addClip("a", Clip::OverlayClip, lower, 20, 10);
    const Transition::Object* const out = sample.addTransition("out", a, nullptr, 2);
    const Transition::Object* const in = sample.addTransition("in", nullptr, a, 2);
    const Transition::Object* const late = sample.addTransition("late", nullptr, e, 2);
    const Host::TimelineOutline outline(sample.timeline);
    EXPECT_THAT(outline.clips(), ElementsAre(a, b, c, d, e));
    EXPECT_THAT(outline.tracks(), ElementsAre(lower, upper));
    EXPECT_THAT(outline.transitions(), ElementsAre(in, out, late));
    EXPECT_EQ(outline.numberOf(d), 4);
    EXPECT_EQ(outline.numberOf(upper), 2);
    const Clip other;
    EXPECT_EQ(outline.numberOf(&other), 0);
    EXPECT_EQ(outline.numberOf(static_cast<const Clip*>(nullptr)), 0);
}

} // namespace
