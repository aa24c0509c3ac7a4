// SPDX-License-Identifier: Apache-2.0
// What an edit session does to transitions, tracks and links, and how it shares its timeline.
#include "EditFixture.h"

#include <memory>

namespace {

using namespace EditTests;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;

class EditSessionStructure : public ThreeInARow
{};

// Transitions

TEST_F(EditSessionStructure, ATransitionTakesHalfOfItsLengthFromEitherClip)
{
    const Transition::Object* const t = transition();
    done(session.addTransition(t, {a, b}, 601));
    EXPECT_EQ(row(primary), "a 0-1000 @0 >300, b 1000-3000 @0 <300, c 3000-4000 @0");
    EXPECT_THAT(now().transitions, ElementsAre(Pair(t, Pair(a, b))));
}

TEST_F(EditSessionStructure, WithoutAWishATransitionHasItsDefaultLengthOrWhatIsAvailable)
{
    // 2000 by default: 1000 from each, which is all of a.
    done(session.addTransition(transition(), {a, b}));
    EXPECT_EQ(row(primary), "a 0-1000 @0 >1000, b 1000-3000 @0 <1000, c 3000-4000 @0");
    // Half of the default is 1000, but 10 are left to the other end.
    done(session.addTransition(transition(), {c, nullptr}));
    EXPECT_EQ(row(primary), "a 0-1000 @0 >1000, b 1000-3000 @0 <1000, c 3000-4000 @0 >990");
}

TEST_F(EditSessionStructure, ATransitionKeepsItsDistanceFromTheOneAtTheOtherEnd)
{
    done(session.addTransition(transition(), {nullptr, a}, 200));
    // 1000 - (200 + 10)
    done(session.addTransition(transition(), {a, b}));
    EXPECT_EQ(row(primary), "a 0-1000 @0 <200 >790, b 1000-3000 @0 <790, c 3000-4000 @0");
}

TEST_F(EditSessionStructure, ATransitionThatHasNoRoomIsRefused)
{
    done(session.addTransition(transition(), {a, b}));
    refused(session.addTransition(transition(), {nullptr, a}), {"\"a\"", "\"dissolve\"", "00:00:01.000"});
}

TEST_F(EditSessionStructure, ATransitionReplacesThoseThatAreInItsWay)
{
    const Transition::Object* const t = transition();
    done(session.addTransition(transition(), {a, b}, 600));
    done(session.addTransition(t, {a, nullptr}, 250));
    EXPECT_EQ(row(primary), "a 0-1000 @0 >250, b 1000-3000 @0, c 3000-4000 @0");
    EXPECT_THAT(now().transitions, ElementsAre(Pair(t, Pair(a, nullptr))));
}

TEST_F(EditSessionStructure, ATransitionMayBeGivenAnotherLength)
{
    const Transition::Object* const t = transition();
    done(session.addTransition(t, {a, b}, 600));
    done(session.addTransition(t, {a, b}, 400));
    EXPECT_EQ(row(primary), "a 0-1000 @0 >200, b 1000-3000 @0 <200, c 3000-4000 @0");
    // Without a wish it keeps the one that it has.
    done(session.addTransition(t, {a, b}));
    EXPECT_EQ(row(primary), "a 0-1000 @0 >200, b 1000-3000 @0 <200, c 3000-4000 @0");
}

TEST_F(EditSessionStructure, ATransitionIsRefusedOnClipsThatDoNotFollowOneAnother)
{
    const Transition::Object* const t = transition();
    refused(session.addTransition(t, {a, c}), {"\"c\"", "\"a\"", "00:00:03.000", "00:00:01.000"});
    refused(session.addTransition(t, {b, a}), {"\"a\"", "\"b\""});
    refused(session.addTransition(t, {a, a}), {"different"});
    refused(session.addTransition(t, {nullptr, nullptr}), {"clip"});
    refused(session.addTransition(t, {x, nullptr}), {"\"x\"", "not on the timeline"});
    refused(session.addTransition(nullptr, {a, b}), {"no transition"});
    refused(session.addTransition(t, {a, b}, -2), {"\"dissolve\"", "-00:00:00.002"});
    done(session.addTransition(t, {a, b}, 600));
    refused(session.addTransition(t, {b, c}), {"\"dissolve\"", "already", "00:00:00.700"});
}

TEST_F(EditSessionStructure, RemovingATransitionGivesItsSharesBack)
{
    const Transition::Object* const t = transition();
    done(session.addTransition(t, {a, b}, 600));
    done(session.removeTransition(t));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0, c 3000-4000 @0");
    refused(session.removeTransition(t), {"not on the timeline"});
    refused(session.removeTransition(nullptr), {"not on the timeline"});
}

// Tracks

TEST_F(EditSessionStructure, ATrackTakesThePlaceOfAnotherOfItsType)
{
    Track* const second = session.makeTrack(ExtraVideoTrack);
    Track* const third = session.makeTrack(ExtraVideoTrack);
    done(session.addTrack(second));
    done(session.addTrack(third));
    done(session.moveTrack(extra, third));
    EXPECT_THAT(now().tracks, ElementsAre(primary, native, audio, title, second, third, extra));
    done(session.moveTrack(third, second));
    EXPECT_THAT(now().tracks, ElementsAre(primary, native, audio, title, third, second, extra));
    refused(session.moveTrack(extra, primary), {"type"});
    refused(session.moveTrack(extra, extra), {"another"});
    refused(session.moveTrack(nullptr, extra), {"not on the timeline"});
    refused(session.moveTrack(extra, session.makeTrack(ExtraVideoTrack)), {"not on the timeline"});
}

TEST_F(EditSessionStructure, ATrackIsAddedOnceAndToItsOwnTimeline)
{
    refused(session.addTrack(nullptr), {"no new track"});
    refused(session.addTrack(extra), {"no new track"});
    Track foreign(AudioTrack);
    refused(session.addTrack(&foreign), {"another timeline"});
}

TEST_F(EditSessionStructure, ATrackIsRemovedWithItsClipsAndWhatDependsOnThem)
{
    Clip* const s = overlay("s");
    Clip* const t = overlay("t");
    lay(s, title, 1200, 500);
    lay(t, title, 5000, 500);
    done(session.link(b, s));
    done(session.append({x, primary, 0, 0, 1000, sound("xn")}));
    done(session.addTransition(transition(), {a, b}, 600));
    done(session.removeTrack(primary));
    EXPECT_THAT(now().tracks, ElementsAre(extra, native, audio, title));
    EXPECT_EQ(row(native), "");
    EXPECT_EQ(row(title), "t 5000-5500 @0");
    EXPECT_THAT(now().transitions, IsEmpty());
    EXPECT_THAT(links(), IsEmpty());
    refused(session.removeTrack(primary), {"not on the timeline"});
    refused(session.append({picture("y"), primary}), {"not on the timeline"});
}

// Links

TEST_F(EditSessionStructure, ALinkNotesHowFarTheTwoAreApart)
{
    Clip* const s = overlay("s");
    lay(s, title, 1200, 500);
    done(session.link(b, s));
    EXPECT_THAT(links(), ElementsAre("s(1200)>b(1000)+200"));
    done(session.link(c, s));
    EXPECT_THAT(links(), ElementsAre("s(1200)>c(3000)+-1800"));
    done(session.unlink(s));
    EXPECT_THAT(links(), IsEmpty());
    refused(session.unlink(s), {"\"s\"", "00:00:01.200"});
}

TEST_F(EditSessionStructure, ALinkInACircleIsRefused)
{
    done(session.link(a, b));
    done(session.link(b, c));
    refused(session.link(c, a), {"\"a\"", "\"c\"", "00:00:00.000"});
    refused(session.link(a, a), {"\"a\""});
    refused(session.link(a, x), {"\"x\"", "not on the timeline"});
    refused(session.link(x, a), {"\"x\"", "not on the timeline"});
    refused(session.link(nullptr, a), {"no clip"});
    refused(session.link(a, nullptr), {"no clip"});
}

TEST_F(EditSessionStructure, TheOffsetOfAForeignLinkChangesByWhatTheClipsMove)
{
    // Whoever made the link counts its offset from somewhere else.
    Clip* const s = overlay("s");
    lay(s, title, 3200, 500);
    watcher.change(session.timeline())->addLink(c, s, 5);
    EXPECT_THAT(links(), ElementsAre("s(3200)>c(3000)+5"));
    EXPECT_TRUE(session.move(s, 3300));
    EXPECT_TRUE(session.move(c, 4000));
    EXPECT_THAT(links(), ElementsAre("s(4300)>c(4000)+105"));
}

// Tracking links

class Following : public EditSessionStructure
{
protected:
    Following()
    {
        lay(s, title, 1200, 500);
        b->addMotionTracking("face")->addMotionTracking("hand");
    }

    Clip* s = overlay("s");
};

TEST_F(Following, AClipFollowsWhatIsTrackedInAnotherOne)
{
    done(session.follow(s, Timeline::TrackingLinkInfo({b, "face"}, QPointF(0.25, -1))));
    done(session.follow(s, Timeline::TrackingLinkInfo({b, "hand"}, QPointF(0.5, 2))));
    const Timeline::TrackingLinkInfo* const link = now().getTrackingLink(s);
    ASSERT_TRUE(link);
    EXPECT_EQ(link->trackedObject.clip, b);
    EXPECT_EQ(link->trackedObject.trackingId, "hand");
    EXPECT_EQ(link->objectRelativeOffset, QPointF(0.5, 2));
    done(session.unfollow(s));
    EXPECT_THAT(now().trackingLinks, IsEmpty());
    refused(session.unfollow(s), {"\"s\"", "00:00:01.200", "follows no other clip"});
}

TEST_F(Following, IsRefusedWhereThereIsNothingToFollow)
{
    const auto face = [](const Clip* clip) { return Timeline::TrackingLinkInfo({clip, "face"}, QPointF()); };
    refused(session.follow(s, face(a)), {"\"s\"", "\"face\"", "\"a\"", "no such tracking"});
    refused(session.follow(s, face(nullptr)), {"no clip"});
    refused(session.follow(s, face(x)), {"\"x\"", "not on the timeline"});
    refused(session.follow(x, face(b)), {"\"x\"", "not on the timeline"});
    refused(session.unfollow(x), {"\"x\"", "not on the timeline"});
    Clip* const n = sound("n");
    lay(n, audio, 0, 1000);
    refused(session.follow(n, face(b)), {"\"n\"", "sound"});
    const double nan = std::numeric_limits<double>::quiet_NaN();
    refused(session.follow(s, Timeline::TrackingLinkInfo({b, "face"}, QPointF(0, nan))), {"\"s\"", "offset"});
}

TEST_F(Following, IsRefusedInACircle)
{
    s->addMotionTracking("face");
    a->addMotionTracking("face");
    const auto face = [](const Clip* clip) { return Timeline::TrackingLinkInfo({clip, "face"}, QPointF()); };
    refused(session.follow(b, face(b)), {"\"b\"", "follows it"});
    done(session.follow(a, face(s)));
    done(session.follow(s, face(b)));
    refused(session.follow(b, face(a)), {"\"b\"", "\"a\"", "follows it"});
    // Another module may have made one.
    track(b, a);
    done(session.follow(c, face(a)));
}

// Other timelines

TEST_F(EditSessionStructure, AClipOfAnotherTimelineIsRefused)
{
    Timeline::Object other;
    x->setTimeline(&other);
    refused(session.append({x, primary}), {"\"x\"", "another timeline"});
    Clip* const xn = sound("xn");
    xn->setTimeline(&other);
    x->setTimeline(nullptr);
    refused(session.append({x, primary, 0, 0, -1, xn}), {"\"xn\"", "another timeline"});
    xn->setTimeline(session.timeline());
    done(session.append({x, primary, 0, 0, -1, xn}));
}

TEST_F(EditSessionStructure, AClipThatShowsItsOwnTimelineIsRefused)
{
    x->setNestedTimeline(session.timeline());
    refused(session.append({x, primary}), {"\"x\"", "show itself"});
    EditSession other;
    Track* const track = other.makeTrack(PrimaryTrack);
    EXPECT_TRUE(other.addTrack(track));
    Clip* const inner = other.makeClip(Clip::VideoClip);
    inner->setSourceDuration(5000)->setNestedTimeline(session.timeline());
    EXPECT_TRUE(other.append({inner, track}));
    x->setNestedTimeline(other.timeline());
    refused(session.insert({x, primary}, 0), {"\"x\"", "show itself"});
    EXPECT_TRUE(other.lift(inner));
    done(session.append({x, primary}));
    const EditResult result = other.overwrite({inner, track}, 0);
    EXPECT_THAT(result.refusal.toStdString(), testing::HasSubstr("show itself"));
    // The other way round it can be shown twice.
    done(session.append({picture("y")->setNestedTimeline(other.timeline()), primary}));
}

// Native audio

class NativeAudioWithSlaves : public EditSessionStructure
{
protected:
    NativeAudioWithSlaves()
    {
        done(session.append({x, primary, 0, 0, 1000, xn}));
        done(session.addTrack(second));
    }

    /// Another module makes it native audio of the native audio.
    void layBelow(MTime duration)
    {
        watcher.change(session.timeline())
            ->addClip(yn, ClipTiming(second, 0, 4000, duration, 0, 10000))
            ->addLink(xn, yn, 0);
    }

    Clip* xn = sound("xn", 600);
    Clip* yn = sound("yn");
    Track* second = session.makeTrack(NativeAudioTrack);
};

TEST_F(NativeAudioWithSlaves, DealsThemOutWhereItIsCutWithItsMaster)
{
    Clip* const s = overlay("s");
    Clip* const t = overlay("t");
    lay(s, title, 4100, 100);
    lay(t, title, 4400, 100);
    done(session.link(xn, s));
    done(session.link(xn, t));
    track(s, xn);
    track(t, xn);
    done(session.split(x, 4300));
    EXPECT_THAT(links(), ElementsAre("s(4100)>xn(4000)+100", "t(4400)>xn(4300)+100", "xn(4000)>x(4000)+0",
                                     "xn(4300)>x(4300)+0"));
    EXPECT_EQ(now().getTrackingLink(s)->trackedObject.clip, xn);
    EXPECT_EQ(now().getTrackingLink(t)->trackedObject.clip, now().masterOf(t));
}

TEST_F(NativeAudioWithSlaves, TakesNativeAudioOfItsOwnAlong)
{
    layBelow(600);
    EXPECT_TRUE(session.trimRight(x, 500));
    EXPECT_EQ(row(native), "xn 4000-4500 @0");
    EXPECT_EQ(row(second), "yn 4000-4500 @0");
    EXPECT_TRUE(session.split(x, 4300));
    EXPECT_EQ(row(second), "yn 4000-4300 @0, yn 4300-4500 @300");
    EXPECT_THAT(links(), ElementsAre("xn(4000)>x(4000)+0", "xn(4300)>x(4300)+0", "yn(4000)>xn(4000)+0",
                                     "yn(4300)>xn(4300)+0"));
}

TEST_F(EditSessionStructure, NativeAudioIsAsLongAsATimelineAtMost)
{
    for (const MTime wild : {std::numeric_limits<qint64>::min(), std::numeric_limits<qint64>::max()}) {
        refused(session.append({x, primary, 0, 0, 1000, sound("xn", wild)}),
                {"more than a timeline can hold"});
    }
    Clip* const xn = sound("xn");
    done(session.append({x, primary, 0, 0, 1000, xn}));
    xn->setSourceDuration(std::numeric_limits<qint64>::max());
    done(session.trimRight(x, 100));
    EXPECT_EQ(row(native), "xn 4000-4900 @0");
    xn->setSourceDuration(std::numeric_limits<qint64>::min());
    done(session.trimRight(x, 100));
    EXPECT_EQ(row(native), "");
}

TEST_F(EditSessionStructure, OfSeveralClipsThatStandInTheWayTheFirstIsNamed)
{
    std::vector<Clip*> intros;
    for (int i = 0; i != 8; ++i) {
        Clip* const intro = picture("intro");
        lay(intro, extra, 100 * (8 - i), 100);
        intros.push_back(intro->setType(Clip::IntroVideoClip));
    }
    refused(session.insert({x, extra}, 0), {"00:00:00.100 would have to move"});
    refused(session.overwrite({x, extra, 0, 0, 500}, 350), {"at 00:00:00.300 is part of an intro"});
}

TEST_F(NativeAudioWithSlaves, GoesWithNativeAudioOfItsOwn)
{
    layBelow(600);
    // 9 of 600 ms would be left.
    EXPECT_TRUE(session.trimLeft(x, 591));
    EXPECT_EQ(row(native), "");
    EXPECT_EQ(row(second), "");
    EXPECT_THAT(links(), IsEmpty());
}

// Sharing

TEST_F(EditSessionStructure, RequestsOfOthersAreGrantedWhereTheyLeaveNoFault)
{
    watcher.change(session.timeline())->moveClip(c, 5000);
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0, c 5000-6000 @0");
    EXPECT_EQ(watcher.changes, 1);
    watcher.change(session.timeline())->moveClip(c, 2000);
    watcher.change(session.timeline())->removeTrack(primary);
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0, c 5000-6000 @0");
    EXPECT_EQ(watcher.changes, 1);
}

/// 3000 ms of source from 1 on, which another module has brought to a speed of 2: the stretch of 0.5 and
/// 1499.5 ms is rounded to 1 and 1500, and the source to 1500.
class RoundedStretch : public EditSessionStructure
{
protected:
    RoundedStretch()
    {
        lay(p, extra, 0, 2000);
        watcher.change(session.timeline())
            ->setClipSourcePosition(p, 1)
            ->setClipDuration(p, 2999)
            ->setClipSpeed(p, 2);
    }

    Clip* p = picture("p", 3000);
};

TEST_F(RoundedStretch, IsEditedOn)
{
    EXPECT_EQ(row(extra), "p 0-1500 @1");
    EXPECT_EQ(now().clipTiming(p).sourceDuration, MTime(1500));
    EXPECT_TRUE(session.trimLeft(p, 10));
    EXPECT_EQ(row(extra), "p 10-1500 @11");
    EXPECT_FALSE(session.trimRight(p, -1));
    EXPECT_TRUE(session.split(p, 1000));
    EXPECT_EQ(row(extra), "p 10-1000 @11, p 1000-1500 @1001");
}

TEST_F(RoundedStretch, IsTakenIntoItsSourceByReversing)
{
    EXPECT_TRUE(session.reverse(p));
    // 1500 - 1500 - 1 is before the start.
    EXPECT_EQ(row(extra), "p 0-1500 @0 rev");
    watcher.change(session.timeline())->reverseClip(p);
    EXPECT_EQ(row(extra), "p 0-1500 @0");
}

TEST_F(EditSessionStructure, ASpeedTakesARoundedStretchIntoItsSource)
{
    Clip* const p = picture("p", 3000);
    lay(p, extra, 0, 2000);
    watcher.change(session.timeline())->setClipDuration(p, 3001);
    EXPECT_EQ(row(extra), "p 0-3001 @0");
    EXPECT_TRUE(session.setSpeed(p, 0.5));
    EXPECT_EQ(row(extra), "p 0-6000 @0");
}

TEST_F(EditSessionStructure, ATimelineIsNotTakenFromItsSession)
{
    watcher.remove(session.timeline());
    EXPECT_FALSE(watcher.isRemoved);
    EXPECT_TRUE(session.lift(a));
    EXPECT_EQ(watcher.changes, 1);
}

TEST(EditSession, OthersHearOfTheTimelinesEnd)
{
    auto session = std::make_unique<EditSession>();
    Watcher watcher(session->timeline());
    EXPECT_FALSE(watcher.isRemoved);
    session.reset();
    EXPECT_TRUE(watcher.isRemoved);
}

TEST(EditSession, ATimelineHasOneSessionAtATime)
{
    EditSession first;
    Track* const track = first.makeTrack(PrimaryTrack);
    Watcher watcher(first.timeline());
    {
        EditSession second(const_cast<Timeline::Object*>(first.timeline()));
        const EditResult result = second.addTrack(track);
        EXPECT_EQ(result.refusal, "The timeline is edited by somebody else.");
        EXPECT_EQ(second.timeline(), first.timeline());
    }
    EXPECT_FALSE(watcher.isRemoved);
    EXPECT_EQ(watcher.changes, 0);
    EXPECT_TRUE(first.addTrack(track));
    EXPECT_EQ(watcher.changes, 1);
}

TEST(EditSession, FollowsAnotherOneOnItsTimeline)
{
    Timeline::Object timeline;
    Track track(PrimaryTrack);
    track.setTimeline(&timeline);
    {
        EditSession first(&timeline);
        EXPECT_TRUE(first.addTrack(&track));
    }
    EditSession second(&timeline);
    EXPECT_TRUE(second.removeTrack(&track));
}

TEST(EditSession, EditsATimelineOfTheCaller)
{
    Timeline::Object timeline;
    Track track(PrimaryTrack);
    track.setTimeline(&timeline);
    Clip clip;
    clip.setSourceDuration(5000);
    timeline.addTrack(&track)->addClip(&clip, ClipTiming(&track, 0, 0, 3000, 0, 5000));
    {
        EditSession session(&timeline);
        EXPECT_EQ(session.timeline(), &timeline);
        EXPECT_TRUE(session.trimRight(&clip, 1000));
    }
    EXPECT_EQ(timeline.clipTiming(&clip).duration, MTime(2000));
}

TEST(EditSession, ATimelineWithAFaultIsNotEditedUntilSomebodyMendsIt)
{
    Timeline::Object timeline;
    Track track(PrimaryTrack);
    track.setTimeline(&timeline);
    Clip clip;
    clip.setName("late")->setSourceDuration(5000);
    timeline.addTrack(&track)->addClip(&clip, ClipTiming(&track, 0, 0, 6000, 0, 5000));
    EditSession session(&timeline);
    Watcher watcher(&timeline);
    const EditResult result = session.lift(&clip);
    EXPECT_THAT(result.refusal.toStdString(), testing::HasSubstr("\"late\""));
    EXPECT_EQ(watcher.changes, 0);
    watcher.change(&timeline)->setClipDuration(&clip, 5000);
    EXPECT_TRUE(session.lift(&clip));
    EXPECT_EQ(watcher.changes, 2);
    EXPECT_THAT(timeline.clips, IsEmpty());
}

} // namespace
