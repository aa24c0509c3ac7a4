// SPDX-License-Identifier: Apache-2.0
#include "tests/host/shared/Pictures.h"
#include "tests/host/shared/SampleTimeline.h"

#include "host/commands/Refusal.h"
#include "host/timeline/TimelineClipBox.h"
#include "host/timeline/TimelineLabels.h"
#include "host/timeline/TimelinePicture.h"
#include "host/timeline/TimelineRuler.h"
#include "host/timeline/TimelineStyle.h"
#include "host/timeline/TimelineTies.h"

#include <EditorModel/effects/Quiz.h>

#include <gmock/gmock.h>

#include <limits>

namespace {

using namespace HostTests;
using Host::TimelinePicture;
using Host::Style::coloursOf;
using testing::ElementsAre;
using Timeline::Clip;

/// How many of the pixels in an area are near a colour.
int countNear(const Drawing& drawing, const QRectF& area, const QColor& colour)
{
    int count = 0;
    for (double y = area.top(); y < area.bottom(); y += 0.5) {
        for (double x = area.left(); x < area.right(); x += 0.5) {
            count += isNear(drawing.at({x, y}), colour);
        }
    }
    return count;
}

/// Of the body of a clip, in parts of its width and height.
QPointF bodyPlace(const TimelinePicture& picture, const Clip* clip, double across, double down)
{
    const QRectF body = Host::clipBody(picture.layout().boxOf(clip));
    return {body.left() + across * body.width(), body.top() + down * body.height()};
}

TEST(TimelinePicture, DrawsClipsByKindWhereTheyLie)
{
    SampleTimeline sample;
    const Timeline::Track* const primary = sample.addTrack(PrimaryTrack);
    const Timeline::Track* const audio = sample.addTrack(AudioTrack);
    const Timeline::Track* const titles = sample.addTrack(TitleTrack);
    const Quiz::Preset quiz;
    const Timeline::Object nested;
    const std::pair<const Clip*, Host::ClipKind> clips[] = {
        {sample.addClip("picture", Clip::VideoClip, primary, 0, 4000), Host::PictureKind},
        {sample.addClip("nested", Clip::VideoClip, primary, 6000, 4000)->setNestedTimeline(&nested),
         Host::NestedKind},
        {sample.addClip("sound", Clip::AudioClip, audio, 2000, 8000), Host::SoundKind},
        {sample.addClip("title", Clip::OverlayClip, titles, 0, 3000), Host::OverlayKind},
        {sample.addClip("quiz", Clip::OverlayClip, titles, 5000, 5000)->setQuiz(&quiz), Host::QuizKind},
    };
    const TimelinePicture picture(sample.timeline, "sample");
    const Drawing drawing(picture);
    EXPECT_EQ(drawing.image.size(), picture.size() * 2);
    for (const auto& [clip, kind] : clips) {
        EXPECT_EQ(nameOf(drawing.at(bodyPlace(picture, clip, 0.5, 0.8))), nameOf(coloursOf(kind).body));
        const QRectF strip = Host::clipStrip(picture.layout().boxOf(clip));
        EXPECT_EQ(nameOf(drawing.at({strip.right() - 20.0, strip.center().y()})),
                  nameOf(coloursOf(kind).strip));
        EXPECT_GT(countNear(drawing, QRectF(strip.topLeft(), QSizeF(80.0, strip.height())), Qt::white), 50);
    }
    // 10 s over the whole width: nothing between 4 s and 6 s on the primary track.
    const QRectF rows = picture.layout().rowsArea();
    const double y = picture.layout().rows()[0].area.center().y();
    EXPECT_EQ(nameOf(drawing.at({rows.left() + rows.width() * 0.55, y})), nameOf(Host::Style::lane));
    EXPECT_DOUBLE_EQ(picture.layout().boxOf(clips[1].first).left(), rows.left() + rows.width() * 0.6);
    EXPECT_TRUE(picture.layout().boxOf(nullptr).isEmpty());
}

TEST(TimelinePicture, HasARowForEachLevelOfEachTrack)
{
    SampleTimeline sample;
    const Timeline::Track* const titles = sample.addTrack(TitleTrack);
    const Timeline::Track* const primary = sample.addTrack(PrimaryTrack);
    const Timeline::Track* const audio = sample.addTrack(AudioTrack);
    const Clip* const lower = sample.addClip("", Clip::OverlayClip, titles, 0, 1000, 0);
    const Clip* const upper = sample.addClip("", Clip::OverlayClip, titles, 0, 1000, 7);
    const Clip* const sound = sample.addClip("", Clip::AudioClip, audio, 0, 1000, 3);
    const TimelinePicture picture(sample.timeline, "sample");
    const Host::TimelineLayout& layout = picture.layout();
    ASSERT_EQ(layout.rows().size(), 4u);
    std::vector<std::pair<const Timeline::Track*, int>> lanes;
    for (const Host::TimelineRow& row : layout.rows()) {
        lanes.emplace_back(row.track, row.level);
    }
    EXPECT_THAT(lanes, ElementsAre(std::pair(titles, 0), std::pair(titles, 7), std::pair(primary, 0),
                                   std::pair(audio, 3)));
    EXPECT_TRUE(layout.rows()[0].area.contains(layout.boxOf(lower)));
    EXPECT_TRUE(layout.rows()[1].area.contains(layout.boxOf(upper)));
    EXPECT_TRUE(layout.rows()[3].area.contains(layout.boxOf(sound)));
}

TEST(TimelinePicture, ShadesWhatFadesTakeAway)
{
    SampleTimeline sample;
    const Timeline::Track* const track = sample.addTrack(AudioTrack);
    const Clip* const clip = sample.addClip("music", Clip::AudioClip, track, 0, 10000);
    sample.timeline.setClipFadeInDuration(clip, 2000)->setClipFadeOutDuration(clip, 4000);
    const TimelinePicture picture(sample.timeline, "sample");
    const Drawing drawing(picture);
    const auto isShaded = [&](double across, double down) {
        const QColor colour = drawing.at(bodyPlace(picture, clip, across, down));
        return colour.red() > colour.blue() + 40;
    };
    // Above the ramps, which rise to the right until 2 s and fall from 6 s on.
    EXPECT_TRUE(isShaded(0.02, 0.5));
    EXPECT_TRUE(isShaded(0.1, 0.25));
    EXPECT_FALSE(isShaded(0.1, 0.75));
    EXPECT_FALSE(isShaded(0.5, 0.9));
    EXPECT_FALSE(isShaded(0.58, 0.1));
    EXPECT_TRUE(isShaded(0.8, 0.25));
    EXPECT_FALSE(isShaded(0.8, 0.75));
    EXPECT_TRUE(isShaded(0.98, 0.7));
}

TEST(TimelinePicture, PointsToWhereTheSourceGoesOn)
{
    SampleTimeline sample;
    const Timeline::Track* const track = sample.addTrack(PrimaryTrack);
    const Clip* const whole = sample.addClip("a", Clip::VideoClip, track, 0, 3000);
    const Clip* const head = sample.addClip("b", Clip::VideoClip, track, 3000, 3000);
    const Clip* const tail = sample.addClip("c", Clip::VideoClip, track, 6000, 3000);
    sample.trim(head, 0, 500);
    sample.trim(tail, 500, 0);
    const TimelinePicture picture(sample.timeline, "sample");
    const Drawing drawing(picture);
    const auto marksAt = [&](const Clip* clip, bool atEnd) {
        const QRectF strip = Host::clipStrip(picture.layout().boxOf(clip));
        const QRectF end(atEnd ? strip.right() - 7.0 : strip.left() + 4.0, strip.center().y() - 2.0, 3.0,
                         4.0);
        return countNear(drawing, end, Qt::white) > 5;
    };
    EXPECT_FALSE(marksAt(whole, false));
    EXPECT_FALSE(marksAt(whole, true));
    EXPECT_FALSE(marksAt(head, false));
    EXPECT_TRUE(marksAt(head, true));
    EXPECT_TRUE(marksAt(tail, false));
    EXPECT_FALSE(marksAt(tail, true));
}

TEST(TimelinePicture, DrawsTransitionsOverTheCut)
{
    SampleTimeline sample;
    const Timeline::Track* const track = sample.addTrack(PrimaryTrack);
    const Clip* const first = sample.addClip("a", Clip::VideoClip, track, 0, 4000);
    const Clip* const second = sample.addClip("b", Clip::VideoClip, track, 4000, 6000);
    const Transition::Object* const between = sample.addTransition("", first, second, 2000);
    const Transition::Object* const out = sample.addTransition("", second, nullptr, 1000);
    const TimelinePicture picture(sample.timeline, "sample");
    const Host::TimelineTies ties(picture.layout(), picture.outline());
    const QRectF area = ties.transitionArea(between, first);
    EXPECT_DOUBLE_EQ(area.left(), picture.layout().x(3000.0));
    EXPECT_DOUBLE_EQ(area.right(), picture.layout().x(5000.0));
    EXPECT_EQ(ties.transitionArea(between, second), area);
    EXPECT_DOUBLE_EQ(ties.transitionArea(out, second).left(), picture.layout().x(9000.0));
    EXPECT_DOUBLE_EQ(ties.transitionArea(out, second).right(), picture.layout().x(10000.0));
    EXPECT_TRUE(ties.transitionArea(out, first).isEmpty());

    const Drawing drawing(picture);
    const auto at = [&](const QRectF& rect, double across, double down) {
        return nameOf(drawing.at({rect.left() + across * rect.width(), rect.top() + down * rect.height()}));
    };
    const std::string tie = nameOf(Host::Style::transition);
    EXPECT_EQ(at(area, 0.1, 0.5), tie);
    EXPECT_EQ(at(area, 0.9, 0.5), tie);
    EXPECT_NE(at(area, 0.5, 0.1), tie);
    // Out of a clip there is the left half alone, as wide as the whole.
    const QRectF last = ties.transitionArea(out, second);
    EXPECT_EQ(at(last, 0.1, 0.5), tie);
    EXPECT_EQ(at(last, 0.6, 0.5), tie);
    EXPECT_NE(at(last, 0.9, 0.2), tie);
}

TEST(TimelinePicture, TiesSlavesToTheirMastersAndFollowersToWhatTheyFollow)
{
    SampleTimeline sample;
    const Timeline::Track* const primary = sample.addTrack(PrimaryTrack);
    const Timeline::Track* const native = sample.addTrack(NativeAudioTrack);
    const Clip* const master = sample.addClip("a", Clip::VideoClip, primary, 0, 4000);
    const Clip* const slave = sample.addClip("a", Clip::AudioClip, native, 0, 4000);
    const auto gapBetween = [](const TimelinePicture& picture) {
        const std::vector<Host::TimelineRow>& rows = picture.layout().rows();
        return QRectF(rows[0].area.bottomLeft() + QPointF(2.0, 0.0),
                      rows[1].area.topRight() - QPointF(2.0, 0.0));
    };
    const auto colouredBy = [&](const QColor& colour) {
        const TimelinePicture picture(sample.timeline, "sample");
        return countNear(Drawing(picture), gapBetween(picture), colour);
    };
    EXPECT_EQ(colouredBy(Host::Style::link), 0);
    sample.timeline.addLink(master, slave, 0);
    EXPECT_GT(colouredBy(Host::Style::link), 8);
    sample.timeline.clearLinks();
    EXPECT_EQ(colouredBy(Host::Style::trackingLink), 0);
    sample.timeline.addTrackingLink(slave, {Timeline::TrackedObject(master, "face"), QPointF()});
    EXPECT_GT(colouredBy(Host::Style::trackingLink), 8);
}

TEST(TimelinePicture, FliesFlagsAtTheLabelsOfClips)
{
    SampleTimeline sample;
    const Timeline::Track* const primary = sample.addTrack(PrimaryTrack);
    Clip* const clip = sample.addClip("a", Clip::VideoClip, primary, 0, 10000);
    Timeline::Label chorus, nameless, far;
    chorus.setName("chorus")->setPosition(2000);
    nameless.setPosition(7000);
    far.setName("far")->setPosition(std::numeric_limits<qint64>::max());
    clip->addLabel(&chorus)->addLabel(&nameless)->addLabel(&far);
    const TimelinePicture picture(sample.timeline, "labels");
    const Drawing drawing(picture);
    const auto flag = [&](const Timeline::Label& label) {
        return Host::labelFlag(picture.layout(), {clip, &label});
    };
    EXPECT_TRUE(flag(far).isEmpty());
    const QRectF body = Host::clipBody(picture.layout().boxOf(clip));
    EXPECT_NEAR(flag(chorus).left(), body.left() + 0.2 * body.width(), 0.01);
    EXPECT_NEAR(flag(nameless).left(), body.left() + 0.7 * body.width(), 0.01);
    for (const Timeline::Label* label : {&chorus, &nameless}) {
        const QRectF staff = flag(*label);
        EXPECT_TRUE(isNear(drawing.at({staff.left(), staff.center().y()}), Host::Style::label));
    }
    // The cloth of one without a name is filled, the other has its name on it.
    EXPECT_TRUE(isNear(drawing.at(flag(nameless).bottomRight() - QPointF(3.0, 5.0)), Host::Style::label));
    const Folder folder;
    Host::savePicture(picture, folder.path("t.svg"), Host::Svg);
    const Svg svg = readSvg(folder.path("t.svg"));
    EXPECT_EQ(svg.texts.count("chorus"), 1);
    EXPECT_EQ(svg.texts.count("far"), 0);
}

TEST(TimelinePicture, GreysWhatIsNotPlayed)
{
    SampleTimeline sample;
    Timeline::Track* const hidden = sample.addTrack(PrimaryTrack);
    hidden->setHidden(true);
    const Timeline::Track* const shown = sample.addTrack(ExtraVideoTrack);
    const Clip* const byTrack = sample.addClip("a", Clip::VideoClip, hidden, 0, 4000);
    const Clip* const byItself = sample.addClip("b", Clip::VideoClip, shown, 0, 4000)->setEnabled(false);
    const Clip* const broken = sample.addClip("c", Clip::VideoClip, shown, 4000, 4000)->setBroken(true);
    const TimelinePicture picture(sample.timeline, "sample");
    const Drawing drawing(picture);
    const std::string grey = nameOf(Host::Style::offColours().body);
    EXPECT_EQ(nameOf(drawing.at(bodyPlace(picture, byTrack, 0.7, 0.6))), grey);
    const QRectF body = Host::clipBody(picture.layout().boxOf(byItself)).adjusted(8.0, 20.0, -8.0, -4.0);
    const int ground = countNear(drawing, body, Host::Style::offColours().body);
    const int all =
        countNear(drawing, body, QColor(240, 243, 247)) + countNear(drawing, body, QColor(203, 213, 225));
    EXPECT_GT(ground, 100);
    EXPECT_GT(countNear(drawing, body, QColor(203, 213, 225)), all / 50);
    const QRectF box = picture.layout().boxOf(broken);
    EXPECT_GT(
        countNear(drawing, QRectF(box.left(), box.bottom() - 2.0, box.width(), 3.0), Host::Style::broken),
        100);
}

TEST(TimelinePicture, GrowsSoThatManyClipsHaveNames)
{
    SampleTimeline sample;
    const Timeline::Track* const primary = sample.addTrack(PrimaryTrack);
    const Timeline::Track* const native = sample.addTrack(NativeAudioTrack);
    for (int i = 0; i != 100; ++i) {
        const qint64 length = 1000 + i % 7 * 500;
        const MTime start = sample.timeline.trackDuration(primary);
        const Clip* const master = sample.addClip("Take", Clip::VideoClip, primary, start, length);
        sample.timeline.addLink(master, sample.addClip("Take", Clip::AudioClip, native, start, length), 0);
    }
    const Folder folder;
    const TimelinePicture picture(sample.timeline, "many");
    EXPECT_GT(picture.size().width(), 4000);
    EXPECT_LT(picture.size().width(), 8300);
    Host::savePicture(picture, folder.path("many.svg"), Host::Svg);
    const Svg svg = readSvg(folder.path("many.svg"));
    EXPECT_EQ(svg.error, "");
    EXPECT_TRUE(svg.texts.contains("200 clips   ·   2 tracks   ·   length 00:04:07.500   ·   "
                                   "1920 x 1080, 29.97 fps, 44100 Hz, stereo"));
    EXPECT_GT(svg.texts.count("Take"), 100);
    EXPECT_TRUE(svg.texts.contains("200"));
    const Drawing drawing(picture);
    for (const Clip* clip : picture.outline().clips()) {
        const QRectF strip = Host::clipStrip(picture.layout().boxOf(clip));
        const QPointF place(strip.right() - 3.0, strip.center().y());
        ASSERT_EQ(nameOf(drawing.at(place)), nameOf(coloursOf(Host::kindOf(*clip)).strip));
    }
}

TEST(TimelinePicture, IsAWellFormedDrawingWithTheFactsInIt)
{
    SampleTimeline sample;
    Timeline::Track* const track = sample.addTrack(AudioTrack);
    track->setMuted(true)->setLinked(true);
    const Clip* const clip = sample.addClip("a & <b>", Clip::AudioClip, track, 0, 4004);
    sample.timeline.setClipSpeed(clip, 2.0)->reverseClip(clip);
    const Folder folder;
    Host::savePicture(TimelinePicture(sample.timeline, "my film"), folder.path("t.svg"), Host::Svg);
    const Svg svg = readSvg(folder.path("t.svg"));
    EXPECT_EQ(svg.error, "");
    for (const char* text : {"my film", "Audio", "muted", "linked", "a & <b>", "sound", "0:00.0", "0:02.0",
                             "2.002 s   ×2   ◀ reversed"}) {
        EXPECT_TRUE(svg.texts.contains(QString::fromUtf8(text))) << text;
    }
}

TEST(TimelinePicture, IsAnSvgWhereItIsTooHighForPixels)
{
    SampleTimeline sample;
    for (int i = 0; i != 300; ++i) {
        sample.addTrack(AudioTrack);
    }
    const TimelinePicture picture(sample.timeline, "tracks");
    const Folder folder;
    try {
        Host::savePicture(picture, folder.path("t.png"), Host::Png);
        FAIL() << "nothing was thrown";
    } catch (const Host::Refusal& error) {
        EXPECT_EQ(error.reason, "cannot be written: a picture of this size must be an .svg");
    }
    EXPECT_FALSE(QFile::exists(folder.path("t.png")));
    Host::savePicture(picture, folder.path("t.svg"), Host::Svg);
    EXPECT_EQ(readSvg(folder.path("t.svg")).texts.count("Audio"), 300);
}

TEST(TimelinePicture, WithstandsWhatNoTimelineShouldHold)
{
    constexpr qint64 highest = std::numeric_limits<qint64>::max();
    SampleTimeline sample;
    Timeline::Track* const track = sample.addTrack(static_cast<TrackType>(7));
    const Timeline::Track unlisted(AudioTrack);
    const Clip elsewhere;
    sample.timeline.addTrack(nullptr)->addTrack(track);
    const Clip* const far = sample.addClip("far", Clip::AudioClip, track, highest, highest);
    const Clip* const early = sample.addClip("early", Clip::VideoClip, &unlisted, -highest, highest);
    const Clip* const none = sample.addClip("none", Clip::VideoClip, nullptr, 0, -5, -2000000000);
    sample.timeline.setClipFadeInDuration(far, highest)->setClipFadeOutDuration(none, -highest);
    sample.timeline.clips.at(far).setTransitionIn(highest).setTransitionOut(-highest);
    sample.timeline.addClip(nullptr, Timeline::ClipTiming());
    sample.timeline.addLink(&elsewhere, far, 0)->addLink(nullptr, none, 0)->addLink(early, &elsewhere, 0);
    sample.timeline.addTrackingLink(far, Timeline::TrackingLinkInfo());
    const Transition::Object transition;
    const Transition::Object other;
    sample.timeline.transitions[&transition] = {&elsewhere, far};
    sample.timeline.transitions[&other] = {nullptr, nullptr};
    sample.timeline.transitions[nullptr] = {early, none};
    EXPECT_FALSE(Drawing(TimelinePicture(sample.timeline, "odd")).image.isNull());
    EXPECT_FALSE(Drawing(TimelinePicture(Timeline::Object(), "")).image.isNull());
}

TEST(TimelineRuler, HasRoundTimesAsCloseAsTheirLabelsAllow)
{
    const std::tuple<qint64, qint64, std::size_t> expected[] = {
        {4004, 500, 9}, {20500, 2000, 11}, {1, 1, 2}, {3600000, 600000, 7}, {359999999, 43200000, 9}};
    for (const auto& [length, step, count] : expected) {
        SampleTimeline sample;
        sample.addClip("", Clip::VideoClip, sample.addTrack(PrimaryTrack), 0, length);
        const TimelinePicture picture(sample.timeline, "");
        // Ten labels side by side and a half, those at the ends being centred on the ends: eleven times.
        ASSERT_EQ(picture.layout().rulerArea().width(), 1040.0);
        const Host::TimelineRuler ruler(picture.layout());
        EXPECT_EQ(ruler.step().ms(), step) << length;
        EXPECT_EQ(ruler.times().size(), count) << length;
        EXPECT_EQ(ruler.times().front(), MTime(0));
    }
}

TEST(TimelineRuler, GoesBackToClipsBeforeZero)
{
    SampleTimeline sample;
    sample.addClip("", Clip::VideoClip, sample.addTrack(PrimaryTrack), -1500, 5500);
    const TimelinePicture picture(sample.timeline, "");
    const Host::TimelineRuler ruler(picture.layout());
    EXPECT_EQ(ruler.step(), MTime(1000));
    EXPECT_THAT(ruler.times(),
                ElementsAre(MTime(-1000), MTime(0), MTime(1000), MTime(2000), MTime(3000), MTime(4000)));
}

} // namespace
