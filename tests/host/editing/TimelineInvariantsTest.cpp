// SPDX-License-Identifier: Apache-2.0
#include "Edits.h"

#include <limits>
#include <utility>

namespace {

using namespace EditTests;
using Host::TimelineFault;
using testing::ElementsAre;
using testing::IsEmpty;

/// Two clips that meet, a transition between them, and a title that depends on the second and follows it.
class TimelineFaults : public testing::Test
{
protected:
    TimelineFaults()
    {
        a.setName("a")->setSourceDuration(5000);
        b.setName("b")->setSourceDuration(5000);
        s.setName("s")->setSourceDuration(5000);
        t.addTrack(primary.setTimeline(&t))->addTrack(title.setTimeline(&t));
        t.addClip(&a, ClipTiming(&primary, 0, 0, 1000, 0, 5000));
        t.addClip(&b, ClipTiming(&primary, 0, 1000, 1000, 0, 5000));
        t.addClip(&s, ClipTiming(&title, 0, 1200, 500, 0, 5000));
        t.addLink(&b, &s, 200)->addTransition(&between, {&a, &b}, 600);
        t.addTrackingLink(&s, Timeline::TrackingLinkInfo({&b, "face"}, QPointF()));
    }

    /// The kinds of all faults.
    std::vector<int> kinds() const
    {
        std::vector<int> found;
        for (const TimelineFault& fault : Host::timelineFaults(t)) {
            found.push_back(fault.kind);
            EXPECT_TRUE(fault.text.startsWith("A ") || fault.text.startsWith("The "))
                << fault.text.toStdString();
            EXPECT_TRUE(fault.text.endsWith(".")) << fault.text.toStdString();
        }
        return found;
    }

    Track primary{PrimaryTrack};
    Track title{TitleTrack};
    Clip a, b, s;
    /// On no timeline; null addresses aside, nothing looks at it.
    Clip away;
    Transition::Object between, other;
    Timeline::Object t;
};

TEST_F(TimelineFaults, ASoundTimelineHasNone)
{
    EXPECT_THAT(Host::timelineFaults(t), IsEmpty());
    EXPECT_THAT(Host::timelineFaults(Timeline::Object()), IsEmpty());
}

TEST_F(TimelineFaults, NullIsNoClip)
{
    t.addClip(nullptr, ClipTiming(&primary, 0, 5000, 100, 0, 100));
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::NoClip));
}

TEST_F(TimelineFaults, AClipLiesOnATrackOfTheTimeline)
{
    t.setClipTrack(&s, nullptr);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::NoTrack));
    Track unlisted;
    t.setClipTrack(&s, &unlisted);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::NoTrack));
}

TEST_F(TimelineFaults, ATrackIsListedOnce)
{
    t.addTrack(&primary);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::TrackListedTwice));
    t.removeTrack(&primary)->addTrack(&primary)->addTrack(nullptr);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::TrackListedTwice));
}

TEST_F(TimelineFaults, ATrackNamesItsTimeline)
{
    Timeline::Object other_;
    for (const Timeline::Object* const wrong :
         {static_cast<const Timeline::Object*>(nullptr), &std::as_const(other_)}) {
        title.setTimeline(wrong);
        EXPECT_THAT(kinds(), ElementsAre(TimelineFault::ForeignTrack));
    }
    title.setTimeline(&t);
    EXPECT_THAT(kinds(), IsEmpty());
    EXPECT_THAT(Host::timelineFaults(t, Timeline::Object(t)), IsEmpty());
    EXPECT_THAT(Host::timelineFaults(Timeline::Object(t)), testing::SizeIs(2));
}

TEST_F(TimelineFaults, NoTimelineShowsItself)
{
    Timeline::Object inner, innermost;
    Clip showsInnermost, showsMore;
    b.setNestedTimeline(&inner);
    s.setNestedTimeline(&innermost);
    inner.addClip(&showsInnermost, ClipTiming())->addClip(nullptr, ClipTiming());
    showsInnermost.setNestedTimeline(&innermost);
    innermost.addClip(&showsMore, ClipTiming());
    EXPECT_THAT(kinds(), IsEmpty());
    // By way of two others, and of one.
    showsMore.setNestedTimeline(&t);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::ShowsItself, TimelineFault::ShowsItself));
    // Neither can another one that it shows.
    showsMore.setNestedTimeline(&innermost);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::ShowsItself, TimelineFault::ShowsItself));
    showsMore.setNestedTimeline(nullptr);
    a.setNestedTimeline(&t);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::ShowsItself));
}

TEST_F(TimelineFaults, AreOrderedByTrackLevelAndStart)
{
    std::vector<Clip> clips(40);
    t.addClip(&s, ClipTiming(&title, 1, 0, 0, 0, 5000));
    const auto names = [this] {
        std::vector<std::string> found;
        for (const TimelineFault& fault : Host::timelineFaults(t)) {
            found.push_back(fault.clip->name.toStdString());
        }
        return found;
    };
    // All lack a duration. The later their addresses, the earlier they start.
    std::vector<std::string> expected;
    for (int i = 0; i != 40; ++i) {
        clips[i].setName(QString::number(i))->setSourceDuration(5000);
        t.addClip(&clips[i], ClipTiming(&title, 0, 9000 - 10 * i, 0, 0, 5000));
        expected.insert(expected.begin(), std::to_string(i));
    }
    expected.push_back("s");
    t.removeTransition(&between)->setClipDuration(&b, 0);
    expected.insert(expected.begin(), "b");
    EXPECT_EQ(names(), expected);
}

TEST_F(TimelineFaults, OfSeveralAtOnePlaceTheNamesDecide)
{
    std::vector<Clip> clips(8);
    for (int i = 0; i != 8; ++i) {
        clips[i].setName(QString(QChar('q' - i)))->setSourceDuration(5000);
        t.addClip(&clips[i], ClipTiming(&title, 0, 3000, 100, 0, 5000));
    }
    // All but the first are before its end.
    std::string named;
    for (const TimelineFault& fault : Host::timelineFaults(t)) {
        named += fault.clip->name.toStdString();
        EXPECT_TRUE(fault.text.contains("before the clip \"j\"")) << fault.text.toStdString();
    }
    EXPECT_EQ(named, "klmnopq");
    // Of a circle the first one is named.
    t.clips.clear();
    t.links.clear();
    t.trackingLinks.clear();
    t.transitions.clear();
    for (int i = 0; i != 8; ++i) {
        t.addClip(&clips[i], ClipTiming(&title, 0, 8000 - 1000 * i, 100, 0, 5000));
        t.addLink(&clips[i], &clips[(i + 1) % 8], 0);
    }
    ASSERT_THAT(kinds(), ElementsAre(TimelineFault::LinkCycle));
    EXPECT_EQ(Host::timelineFaults(t).front().clip, &clips[7]);
}

TEST_F(TimelineFaults, TimesAreNeitherNegativeNorTooLate)
{
    const ClipTiming sound = t.clipTiming(&s);
    std::vector<ClipTiming> wild(8, sound);
    wild[0].timestamp = -1;
    wild[1].sourcePosition = MTime(-2147483648);
    wild[2].sourceDuration = MTime(2147483648);
    wild[3].fadeInDuration = -1;
    wild[4].fadeOutDuration = std::numeric_limits<qint64>::min();
    wild[5].timestamp = MTime(2147483647 - 499);
    wild[6].duration = std::numeric_limits<qint64>::max();
    wild[7].timestamp = std::numeric_limits<qint64>::max();
    for (const ClipTiming& timing : wild) {
        t.addClip(&s, timing);
        EXPECT_THAT(kinds(), ElementsAre(TimelineFault::TimeOutOfRange)) << &timing - wild.data();
    }
    t.addClip(&s, sound)->moveClip(&s, MTime(2147483647 - 500));
    EXPECT_THAT(kinds(), IsEmpty());
    t.links[&s].offset = std::numeric_limits<qint64>::min();
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::TimeOutOfRange));
}

TEST_F(TimelineFaults, DurationsArePositive)
{
    for (const MTime duration : {MTime(0), MTime(-1), MTime(std::numeric_limits<qint64>::min())}) {
        t.setClipDuration(&s, duration);
        EXPECT_THAT(kinds(), ElementsAre(TimelineFault::NoDuration));
    }
    t.setClipDuration(&s, 1);
    EXPECT_THAT(kinds(), IsEmpty());
}

TEST_F(TimelineFaults, TheShownStretchLiesInTheSource)
{
    t.setClipSourcePosition(&s, 4500);
    EXPECT_THAT(kinds(), IsEmpty());
    t.setClipSourcePosition(&s, 4502);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::OutsideSource));
    t.setClipSourcePosition(&s, -2);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::OutsideSource));
    s.setUnlimitedDuration(true);
    EXPECT_THAT(kinds(), IsEmpty());
    t.setClipSourcePosition(&s, -700);
    EXPECT_THAT(kinds(), IsEmpty());
}

TEST_F(TimelineFaults, TheStretchMayLieBeyondTheSourceAsFarAsSpeedsAreRounded)
{
    // At twice the speed 3, 2998 and 3001 become 1.5, 1499 and 1500.5, and the halves are rounded up.
    s.setSourceDuration(3001);
    t.addClip(&s, ClipTiming(&title, 0, 1200, 2998, 3, 3001))->setClipSpeed(&s, 2);
    EXPECT_EQ(t.clipTiming(&s).sourceEnd(), MTime(1501));
    EXPECT_EQ(t.clipTiming(&s).sourceDuration, MTime(1501));
    // 1, 2999 and 3000: 0.5, 1499.5 and 1500.
    s.setSourceDuration(3000);
    t.addClip(&s, ClipTiming(&title, 0, 1200, 2999, 1, 3000))->setClipSpeed(&s, 2);
    EXPECT_EQ(t.clipTiming(&s).sourceEnd(), MTime(1501));
    EXPECT_EQ(t.clipTiming(&s).sourceDuration, MTime(1500));
    EXPECT_THAT(kinds(), IsEmpty());
    t.reverseClip(&s);
    EXPECT_EQ(t.clipTiming(&s).sourcePosition, MTime(-1));
    EXPECT_THAT(kinds(), IsEmpty());
}

TEST_F(TimelineFaults, TransitionsAndFadesFitIntoTheClip)
{
    t.setClipFadeInDuration(&s, 200)->setClipFadeOutDuration(&s, 300);
    EXPECT_THAT(kinds(), IsEmpty());
    t.setClipFadeOutDuration(&s, 301);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::TooLongAtEnds));
    t.setClipFadeOutDuration(&s, 0);
    t.addTransition(&other, {&b, nullptr}, 400)->setTransitionDuration(&other, 700);
    EXPECT_THAT(kinds(), IsEmpty());
    t.setTransitionDuration(&other, 701);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::TooLongAtEnds));
}

TEST_F(TimelineFaults, ClipsOfOneTrackAndLevelDoNotOverlap)
{
    Clip c, d;
    t.addClip(&c, ClipTiming(&title, 0, 1000, 200, 0, 5000));
    EXPECT_THAT(kinds(), IsEmpty());
    t.setClipDuration(&c, 201);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::Overlap));
    t.setClipTrackLevel(&c, 1);
    EXPECT_THAT(kinds(), IsEmpty());
    // The long one covers both that come after it, though they don't cover one another.
    t.addClip(&c, ClipTiming(&title, 0, 1000, 4000, 0, 5000));
    t.addClip(&d, ClipTiming(&title, 0, 4000, 100, 0, 5000));
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::Overlap, TimelineFault::Overlap));
}

TEST_F(TimelineFaults, LinksNameClipsOfTheTimeline)
{
    t.addLink(&b, &away, 0);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::DanglingLink));
    t.removeLink(&away)->addLink(&away, &s, 0);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::DanglingLink));
    t.addLink(nullptr, &s, 0);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::DanglingLink));
}

TEST_F(TimelineFaults, LinksDoNotGoRoundInACircle)
{
    t.addLink(&a, &b, 0);
    EXPECT_THAT(kinds(), IsEmpty());
    t.addLink(&b, &a, 0);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::LinkCycle));
    t.removeLink(&b)->addLink(&a, &a, 0);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::LinkCycle));
}

TEST_F(TimelineFaults, TrackingLinksNameClipsOfTheTimeline)
{
    t.addTrackingLink(&s, Timeline::TrackingLinkInfo({&away, "face"}, QPointF()));
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::DanglingTracking));
    t.clearTrackingLinks()->addTrackingLink(&away, Timeline::TrackingLinkInfo({&b, "face"}, QPointF()));
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::DanglingTracking));
}

TEST_F(TimelineFaults, TransitionsNameClipsOfTheTimeline)
{
    t.transitions[&other] = {&away, nullptr};
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::DanglingTransition));
    t.transitions[&other] = {nullptr, &away};
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::DanglingTransition));
}

TEST_F(TimelineFaults, ATransitionStandsOnAPair)
{
    t.transitions[&other] = {&s, &s};
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::TransitionOnNothing));
    t.transitions[&other] = {nullptr, nullptr};
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::TransitionOnNothing));
}

TEST_F(TimelineFaults, TheClipsOfATransitionMeet)
{
    t.moveClip(&b, 1001);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::TransitionApart));
    t.moveClip(&b, 1000)->setClipTrackLevel(&b, 1);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::TransitionApart));
}

TEST_F(TimelineFaults, OneTransitionEntersOrLeavesAClip)
{
    t.transitions[&other] = {nullptr, &b};
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::CrowdedTransition));
    t.transitions[&other] = {&a, nullptr};
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::CrowdedTransition));
}

TEST_F(TimelineFaults, TheFieldsOfTheClipsAreTheSharesOfTheirTransitions)
{
    t.clips[&a].transitionOut = 299;
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::WrongShare));
    t.setTransitionDuration(&between, 0);
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::WrongShare, TimelineFault::WrongShare));
    t.removeTransition(&between);
    EXPECT_THAT(kinds(), IsEmpty());
    t.clips[&a].transitionIn = 1;
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::WrongShare));
    t.clips[&a].transitionIn = 0;
    t.clips[&s].transitionOut = 1;
    EXPECT_THAT(kinds(), ElementsAre(TimelineFault::WrongShare));
}

TEST_F(TimelineFaults, AFaultNamesTheClipAndTheTimes)
{
    t.moveClip(&b, 900);
    const std::vector<TimelineFault> faults = Host::timelineFaults(t);
    ASSERT_THAT(faults, testing::SizeIs(2));
    EXPECT_EQ(faults[0].clip, &b);
    EXPECT_EQ(faults[0].text,
              "The clip \"b\" starts at 00:00:00.900, before the clip \"a\" on the same track "
              "and level ends at 00:00:01.000.");
    EXPECT_EQ(faults[1].kind, TimelineFault::TransitionApart);
    EXPECT_EQ(faults[1].clip, &a);
}

} // namespace
