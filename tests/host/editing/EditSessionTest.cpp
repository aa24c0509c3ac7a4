// SPDX-License-Identifier: Apache-2.0
#include "EditFixture.h"

namespace {

using namespace EditTests;
using testing::ElementsAre;
using testing::IsEmpty;

class EditSessionMove : public ThreeInARow
{};

// Placing

TEST_F(EditSessionMove, AppendingLaysAClipAtTheEndOfItsLane)
{
    done(session.append({x, primary, 0, 250, 500}));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0, c 3000-4000 @0, x 4000-4500 @250");
}

TEST_F(EditSessionMove, AppendingToAnEmptyLaneStartsAtZeroAndTakesAllOfTheSource)
{
    done(session.append({x, extra, 2}));
    EXPECT_EQ(row(extra), "x 0-10000 @0 L2");
}

TEST_F(EditSessionMove, InsertingMovesTheLaterClipsToTheRight)
{
    done(session.insert({x, primary, 0, 0, 500}, 1000));
    EXPECT_EQ(row(primary), "a 0-1000 @0, x 1000-1500 @0, b 1500-3500 @0, c 3500-4500 @0");
}

TEST_F(EditSessionMove, InsertingSplitsTheClipThatLiesAcross)
{
    done(session.insert({x, primary, 0, 0, 500}, 2000));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-2000 @0, x 2000-2500 @0, b 2500-3500 @1000, c 3500-4500 @0");
}

TEST_F(EditSessionMove, InsertingIsRefusedWhereTheClipAcrossCannotBeSplit)
{
    // One millisecond less than a clip may have.
    refused(session.insert({x, primary, 0, 0, 500}, 1009), {"\"b\"", "00:00:01.009"});
    done(session.insert({x, primary, 0, 0, 500}, 1010));
}

TEST_F(EditSessionMove, InsertingTakesSlavesAlongAndLeavesOtherClipsOfTheirTracks)
{
    Clip* const s = overlay("s");
    Clip* const u = overlay("u");
    lay(s, title, 1200, 500);
    lay(u, title, 500, 500);
    done(session.link(b, s));
    done(session.insert({x, primary, 0, 0, 500}, 1000));
    EXPECT_EQ(row(title), "u 500-1000 @0, s 1700-2200 @0");
    EXPECT_THAT(links(), ElementsAre("s(1700)>b(1500)+200"));
}

TEST_F(EditSessionMove, InsertingLeavesOtherLevelsOfTheTrackWhereTheyAre)
{
    Clip* const p = picture("p");
    Clip* const q = picture("q");
    lay(p, extra, 0, 1000, 0);
    lay(q, extra, 0, 1000, 1);
    done(session.insert({x, extra, 0, 0, 500}, 0));
    EXPECT_EQ(row(extra), "x 0-500 @0, p 500-1500 @0, q 0-1000 @0 L1");
}

TEST_F(EditSessionMove, InsertingAtACutTakesTheTransitionOut)
{
    done(session.addTransition(transition(), {a, b}, 600));
    EXPECT_EQ(row(primary), "a 0-1000 @0 >300, b 1000-3000 @0 <300, c 3000-4000 @0");
    done(session.insert({x, primary, 0, 0, 500}, 1000));
    EXPECT_EQ(row(primary), "a 0-1000 @0, x 1000-1500 @0, b 1500-3500 @0, c 3500-4500 @0");
    EXPECT_THAT(now().transitions, IsEmpty());
}

TEST_F(EditSessionMove, InsertingIsRefusedWhereASlaveWouldRunIntoAnotherClip)
{
    Clip* const s = overlay("s");
    Clip* const u = overlay("u");
    lay(s, title, 1200, 500);
    lay(u, title, 1900, 500);
    done(session.link(b, s));
    refused(session.insert({x, primary, 0, 0, 500}, 1000), {"\"s\"", "\"u\"", "00:00:02.200"});
}

TEST_F(EditSessionMove, OverwritingInAClipSplitsIt)
{
    done(session.overwrite({x, primary, 0, 0, 1000}, 1500));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-1500 @0, x 1500-2500 @0, b 2500-3000 @1500, c 3000-4000 @0");
}

TEST_F(EditSessionMove, OverwritingTrimsAtItsEndsAndRemovesWhatLiesBetween)
{
    Clip* const s = overlay("s");
    lay(s, title, 1200, 500);
    done(session.link(b, s));
    done(session.overwrite({x, primary, 0, 0, 3000}, 500));
    EXPECT_EQ(row(primary), "a 0-500 @0, x 500-3500 @0, c 3500-4000 @500");
    EXPECT_EQ(row(title), "s 1200-1700 @0");
    EXPECT_THAT(links(), IsEmpty());
}

TEST_F(EditSessionMove, OverwritingTakesTransitionsAndFadesOfTheEndsThatItCutsOff)
{
    done(session.addTransition(transition(), {nullptr, a}, 100));
    done(session.addTransition(transition(), {c, nullptr}, 200));
    done(session.addTransition(transition(), {a, b}, 400));
    done(session.setFades(a, 30, 40));
    done(session.setFades(c, 50, 60));
    done(session.overwrite({x, primary, 0, 0, 3000}, 500));
    EXPECT_EQ(row(primary), "a 0-500 @0 <100 /30, x 500-3500 @0, c 3500-4000 @500 >200 \\60");
    EXPECT_EQ(now().transitions.size(), 2u);
}

TEST_F(EditSessionMove, OverwritingLeavesClipsThatItOnlyTouchesAsTheyAre)
{
    done(session.setFades(a, 0, 100));
    done(session.addTransition(transition(), {nullptr, c}, 200));
    done(session.overwrite({x, primary, 0, 0, 2000}, 1000));
    EXPECT_EQ(row(primary), "a 0-1000 @0 \\100, x 1000-3000 @0, c 3000-4000 @0 <200");
}

TEST_F(EditSessionMove, OverwritingTakesLeftoversThatAreTooShort)
{
    // 5 ms would be left of a clip on either side.
    done(session.overwrite({x, primary, 0, 0, 990}, 5));
    EXPECT_EQ(row(primary), "x 5-995 @0, b 1000-3000 @0, c 3000-4000 @0");
}

TEST_F(EditSessionMove, OverwritingRemovesTheNativeAudioOfWhatLiesUnder)
{
    Clip* const d = picture("d");
    Clip* const dn = sound("dn");
    done(session.append({d, primary, 0, 0, 1000, dn}));
    EXPECT_EQ(row(native), "dn 4000-5000 @0");
    Clip* const xn = sound("xn");
    done(session.overwrite({x, primary, 0, 100, 500, xn}, 4250));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0, c 3000-4000 @0, d 4000-4250 @0, "
                            "x 4250-4750 @100, d 4750-5000 @750");
    EXPECT_EQ(row(native), "dn 4000-4250 @0, xn 4250-4750 @100, dn 4750-5000 @750");
    EXPECT_THAT(links(), ElementsAre("dn(4000)>d(4000)+0", "dn(4750)>d(4750)+0", "xn(4250)>x(4250)+0"));
}

TEST_F(EditSessionMove, OverwritingAWholeClipRemovesItsNativeAudio)
{
    done(session.append({picture("d"), primary, 0, 0, 1000, sound("dn")}));
    done(session.overwrite({x, primary, 0, 0, 1000}, 4000));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0, c 3000-4000 @0, x 4000-5000 @0");
    EXPECT_EQ(row(native), "");
}

TEST_F(EditSessionMove, PlacingIsRefusedForClipsAndLanesThatDoNotFit)
{
    refused(session.append({nullptr, primary}), {"no clip"});
    refused(session.append({a, primary}), {"\"a\"", "already", "00:00:00.000"});
    refused(session.append({x, nullptr}), {"track"});
    Track other(PrimaryTrack);
    refused(session.append({x, &other}), {"track"});
    refused(session.append({x, primary, 1}), {"\"x\"", "level 1", "00:00:00.000"});
    refused(session.append({x, extra, -1}), {"\"x\"", "level -1"});
    refused(session.append({x, native}), {"\"x\"", "native audio track"});
    refused(session.append({x, audio}), {"\"x\"", "sound"});
    refused(session.append({sound("n"), primary}), {"\"n\"", "sound"});
    refused(session.append({x, primary, 0, 0, 9}), {"\"x\"", "00:00:00.009"});
    refused(session.append({x, primary, 0, 9000, 1001}), {"\"x\"", "00:00:10.001"});
    refused(session.append({x, primary, 0, -1, 500}), {"\"x\"", "-00:00:00.001"});
    refused(session.append({x, primary, 0, 0, 500, x}), {"\"x\"", "native audio"});
    refused(session.append({x, primary, 0, 0, 500, picture("y")}), {"\"y\"", "not sound"});
    refused(session.insert({x, primary, 0, 0, 500}, -1), {"\"x\"", "-00:00:00.001"});
    refused(session.overwrite({x, extra, 0, 0, 500}, MTime(2147483647)), {"\"x\"", "596:31:23.647"});
    refused(session.insert({x, extra, 0, 0, 500}, std::numeric_limits<qint64>::max()), {"more than"});
}

// Removing

TEST_F(EditSessionMove, LiftingLeavesAGap)
{
    done(session.addTransition(transition(), {a, b}, 600));
    done(session.addTransition(transition(), {b, c}, 400));
    done(session.lift(b));
    EXPECT_EQ(row(primary), "a 0-1000 @0, c 3000-4000 @0");
    EXPECT_THAT(now().transitions, IsEmpty());
}

TEST_F(EditSessionMove, ExtractingClosesTheGap)
{
    Clip* const s = overlay("s");
    Clip* const t = overlay("t");
    lay(s, title, 1200, 500);
    lay(t, title, 3100, 500);
    done(session.link(b, s));
    done(session.link(c, t));
    done(session.extract(b));
    EXPECT_EQ(row(primary), "a 0-1000 @0, c 1000-2000 @0");
    // The one goes with its master, the other follows its own.
    EXPECT_EQ(row(title), "t 1100-1600 @0");
    EXPECT_THAT(links(), ElementsAre("t(1100)>c(1000)+100"));
}

TEST_F(EditSessionMove, RemovingTakesTrackingLinksOfBothSides)
{
    Clip* const s = overlay("s");
    lay(s, title, 1200, 500);
    track(s, b);
    done(session.lift(b));
    EXPECT_THAT(now().trackingLinks, IsEmpty());
    track(s, c);
    done(session.lift(s));
    EXPECT_THAT(now().trackingLinks, IsEmpty());
}

TEST_F(EditSessionMove, NativeAudioIsRemovedWithItsMasterAlone)
{
    Clip* const xn = sound("xn");
    done(session.append({x, primary, 0, 0, 1000, xn}));
    refused(session.lift(xn), {"\"xn\"", "native audio", "00:00:04.000"});
    refused(session.extract(xn), {"\"xn\"", "native audio"});
    done(session.extract(x));
    EXPECT_EQ(row(native), "");
    refused(session.lift(x), {"\"x\"", "not on the timeline"});
}

// Splitting

TEST_F(EditSessionMove, SplittingDealsOutTransitionsFadesAndSlaves)
{
    Clip* const s = overlay("s");
    Clip* const t = overlay("t");
    lay(s, title, 1200, 500);
    lay(t, title, 2000, 500);
    done(session.link(b, s));
    done(session.link(b, t));
    done(session.addTransition(transition(), {a, b}, 600));
    const Transition::Object* const outbound = transition();
    done(session.addTransition(outbound, {b, c}, 400));
    done(session.setFades(b, 100, 150));

    const EditResult result = session.split(b, 2000);
    done(result);
    EXPECT_EQ(row(primary), "a 0-1000 @0 >300, b 1000-2000 @0 <300 /100, b 2000-3000 @1000 >200 \\150, "
                            "c 3000-4000 @0 <200");
    EXPECT_EQ(now().clipTiming(result.clip).timestamp, MTime(2000));
    EXPECT_EQ(now().transitionClipPair(outbound), Timeline::ClipPair(result.clip, c));
    EXPECT_THAT(links(), ElementsAre("s(1200)>b(1000)+200", "t(2000)>b(2000)+0"));
}

TEST_F(EditSessionMove, SplittingMakesACopyOfTheClip)
{
    b->setVolume(70)->setMediaTrack(3);
    const EditResult result = session.split(b, 1500);
    done(result);
    EXPECT_NE(result.clip, b);
    EXPECT_EQ(result.clip->name, "b");
    EXPECT_EQ(result.clip->volume, 70);
    EXPECT_EQ(result.clip->mediaTrack, 3);
    EXPECT_EQ(result.clip->timeline, session.timeline());
}

TEST_F(EditSessionMove, SplittingTakesNativeAudioAlong)
{
    done(session.append({x, primary, 0, 100, 1000, sound("xn")}));
    done(session.split(x, 4300));
    EXPECT_EQ(row(native), "xn 4000-4300 @100, xn 4300-5000 @400");
    EXPECT_THAT(links(), ElementsAre("xn(4000)>x(4000)+0", "xn(4300)>x(4300)+0"));
}

TEST_F(EditSessionMove, BothPartsOfASlaveDependOnItsMaster)
{
    Clip* const s = overlay("s");
    lay(s, title, 1200, 1000);
    done(session.link(b, s));
    done(session.split(s, 1700));
    EXPECT_EQ(row(title), "s 1200-1700 @0, s 1700-2200 @500");
    EXPECT_THAT(links(), ElementsAre("s(1200)>b(1000)+200", "s(1700)>b(1000)+700"));
}

TEST_F(EditSessionMove, SplittingCarriesTrackingLinksOver)
{
    Clip* const s = overlay("s");
    Clip* const t = overlay("t");
    lay(s, title, 1200, 500);
    lay(t, title, 2100, 500);
    track(s, b);
    track(t, b);
    const EditResult right = session.split(b, 2000);
    done(right);
    EXPECT_EQ(now().getTrackingLink(s)->trackedObject.clip, b);
    EXPECT_EQ(now().getTrackingLink(t)->trackedObject.clip, right.clip);
    const EditResult rightTitle = session.split(t, 2300);
    done(rightTitle);
    EXPECT_EQ(now().getTrackingLink(rightTitle.clip)->trackedObject.clip, right.clip);
    EXPECT_EQ(now().getTrackingLink(rightTitle.clip)->trackedObject.trackingId, "face");
}

TEST_F(EditSessionMove, SplittingKeepsClearOfTransitions)
{
    done(session.addTransition(transition(), {a, b}, 600));
    done(session.addTransition(transition(), {b, c}, 400));
    refused(session.split(b, 1309), {"\"b\"", "00:00:01.309"});
    refused(session.split(b, 2790), {"\"b\"", "00:00:02.790"});
    refused(session.split(b, 900), {"\"b\""});
    refused(session.split(x, 900), {"\"x\"", "not on the timeline"});
    refused(session.split(nullptr, 900), {"no clip"});
    done(session.split(b, 1310));
}

// Trimming

TEST_F(EditSessionMove, TrimmingTheLeftEndPartsTheClipFromTheOneBefore)
{
    Clip* const s = overlay("s");
    lay(s, title, 1200, 500);
    done(session.link(b, s));
    done(session.addTransition(transition(), {a, b}, 600));
    done(session.addTransition(transition(), {b, c}, 400));
    done(session.trimLeft(b, 400));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1400-3000 @400 >200, c 3000-4000 @0 <200");
    // The slave stays where it is.
    EXPECT_EQ(row(title), "s 1200-1700 @0");
    EXPECT_THAT(links(), ElementsAre("s(1200)>b(1400)+-200"));
}

TEST_F(EditSessionMove, TrimmingTheLeftEndWithRippleKeepsTheCuts)
{
    done(session.addTransition(transition(), {a, b}, 600));
    done(session.addTransition(transition(), {b, c}, 400));
    done(session.trimLeft(b, 400, Ripple::Yes));
    EXPECT_EQ(row(primary), "a 0-1000 @0 >300, b 1000-2600 @400 <300 >200, c 2600-3600 @0 <200");
    done(session.trimLeft(b, -400, Ripple::Yes));
    EXPECT_EQ(row(primary), "a 0-1000 @0 >300, b 1000-3000 @0 <300 >200, c 3000-4000 @0 <200");
}

TEST_F(EditSessionMove, TrimmingTheRightEndWithRippleMovesTheLaterClipsAndTheirSlaves)
{
    Clip* const t = overlay("t");
    lay(t, title, 3100, 500);
    done(session.link(c, t));
    done(session.trimRight(b, 500, Ripple::Yes));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-2500 @0, c 2500-3500 @0");
    EXPECT_EQ(row(title), "t 2600-3100 @0");
    done(session.trimRight(b, -700, Ripple::Yes));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3200 @0, c 3200-4200 @0");
    EXPECT_EQ(row(title), "t 3300-3800 @0");
}

TEST_F(EditSessionMove, ARippleLeavesTheTrimmedClipWhereItIsThoughItDependsOnALaterOne)
{
    done(session.link(c, b));
    done(session.trimRight(b, 500, Ripple::Yes));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-2500 @0, c 2500-3500 @0");
    EXPECT_THAT(links(), ElementsAre("b(1000)>c(2500)+-1500"));
}

TEST_F(EditSessionMove, TrimmingLimitsATransitionToWhatIsLeft)
{
    done(session.addTransition(transition(), {b, c}, 1600));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0 >800, c 3000-4000 @0 <800");
    done(session.trimRight(c, 500));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0 >500, c 3000-3500 @0 <500");
}

TEST_F(EditSessionMove, TrimmingRemovesATransitionThatHasNoRoomLeft)
{
    done(session.addTransition(transition(), {b, c}, 1200));
    done(session.addTransition(transition(), {c, nullptr}, 300));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0 >600, c 3000-4000 @0 <600 >300");
    // Half of the shortest transition is 5, and 5 + 300 is more than 304. Alone the outbound one keeps 10
    // from the other end.
    done(session.trimRight(c, 696));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0, c 3000-3304 @0 >294");
}

TEST_F(EditSessionMove, TrimmingCutsFades)
{
    done(session.setFades(c, 300, 600));
    done(session.trimRight(c, 500));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0, c 3000-3500 @0 /300 \\200");
    done(session.trimRight(c, 300));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0, c 3000-3200 @0 /200");
}

TEST_F(EditSessionMove, TrimmingIsRefusedBeyondNeighboursAndTheSource)
{
    refused(session.trimRight(a, -1), {"\"b\"", "\"a\"", "00:00:01.001"});
    refused(session.trimLeft(b, -1), {"\"b\"", "-00:00:00.001"});
    refused(session.trimRight(c, -9001), {"\"c\"", "00:00:10.001"});
    refused(session.trimRight(c, 991), {"\"c\"", "00:00:00.009"});
    refused(session.trimLeft(c, 991), {"\"c\"", "00:00:00.009"});
    refused(session.trimLeft(x, 1), {"\"x\""});
    refused(session.trimLeft(a, std::numeric_limits<qint64>::min()), {"more than"});
    done(session.trimRight(c, -9000));
    done(session.trimRight(c, 9990));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0, c 3000-3010 @0");
}

TEST_F(EditSessionMove, AClipOfUnlimitedDurationIsBoundToNoSource)
{
    c->setUnlimitedDuration(true);
    done(session.trimRight(c, -20000));
    done(session.lift(b));
    done(session.trimLeft(c, -500));
    EXPECT_EQ(row(primary), "a 0-1000 @0, c 2500-24000 @-500");
    done(session.reverse(c));
    // 10000 - 21500 - (-500)
    EXPECT_EQ(row(primary), "a 0-1000 @0, c 2500-24000 @-11000 rev");
}

// Moving

TEST_F(EditSessionMove, MovingTakesTheWholeGroupAlong)
{
    Clip* const s = overlay("s");
    Clip* const t = overlay("t");
    lay(s, title, 3200, 500);
    lay(t, title, 5000, 500);
    done(session.link(c, s));
    done(session.link(s, t));
    done(session.addTransition(transition(), {b, c}, 600));
    done(session.move(c, 3500));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0, c 3500-4500 @0");
    EXPECT_EQ(row(title), "s 3700-4200 @0, t 5500-6000 @0");
    EXPECT_THAT(links(), ElementsAre("s(3700)>c(3500)+200", "t(5500)>s(3700)+1800"));
}

TEST_F(EditSessionMove, MovingASlaveChangesItsOffset)
{
    Clip* const s = overlay("s");
    lay(s, title, 3200, 500);
    done(session.link(c, s));
    done(session.move(s, 2900));
    EXPECT_THAT(links(), ElementsAre("s(2900)>c(3000)+-100"));
}

TEST_F(EditSessionMove, MovingToAnotherLaneLeavesTheSlavesOnTheirTracks)
{
    Clip* const xn = sound("xn");
    done(session.append({x, primary, 0, 0, 1000, xn}));
    done(session.move(x, 4500, extra, 1));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0, c 3000-4000 @0");
    EXPECT_EQ(row(extra), "x 4500-5500 @0 L1");
    EXPECT_EQ(row(native), "xn 4500-5500 @0");
}

TEST_F(EditSessionMove, MovingKeepsTransitionsAtTheClipItself)
{
    done(session.addTransition(transition(), {c, nullptr}, 300));
    done(session.move(c, 4000));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0, c 4000-5000 @0 >300");
}

TEST_F(EditSessionMove, MovingIsRefusedOntoOtherClipsAndBeforeTheStart)
{
    refused(session.move(c, 2999), {"\"c\"", "\"b\"", "00:00:02.999"});
    refused(session.move(a, -1), {"\"a\"", "-00:00:00.001"});
    refused(session.move(c, 5000, audio, 0), {"\"c\"", "sound", "00:00:05.000"});
    refused(session.move(c, 5000, primary, 1), {"\"c\"", "level 1"});
    refused(session.move(x, 5000), {"\"x\"", "not on the timeline"});
    Clip* const s = overlay("s");
    lay(s, title, 500, 500);
    done(session.link(b, s));
    refused(session.move(b, 400, extra, 0), {"\"s\"", "-00:00:00.100"});
}

// Speed and direction

TEST_F(EditSessionMove, SpeedingUpShortensTheClip)
{
    done(session.setSpeed(b, 2));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-2000 @0, c 3000-4000 @0");
    EXPECT_EQ(now().clipTiming(b).sourceDuration, MTime(5000));
    // The speed is absolute.
    done(session.setSpeed(b, 1));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0, c 3000-4000 @0");
}

TEST_F(EditSessionMove, SlowingDownWithRippleMovesTheLaterClips)
{
    refused(session.setSpeed(b, 0.5), {"\"c\"", "\"b\"", "00:00:05.000"});
    done(session.addTransition(transition(), {b, c}, 600));
    done(session.setSpeed(b, 0.5, Ripple::Yes));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-5000 @0 >300, c 5000-6000 @0 <300");
}

TEST_F(EditSessionMove, RoundingDoesNotTakeAClipOutOfItsSource)
{
    // At a speed of 4 the times of the one, 252.5, 0.5 and 252, are rounded to 253, 1 and 252: that fits.
    Clip* const p = picture("p", 1010);
    Clip* const q = picture("q", 1009);
    done(session.append({p, extra, 0, 2, 1008}));
    done(session.append({q, extra, 1, 3, 1006}));
    done(session.setSpeed(p, 4));
    EXPECT_EQ(row(extra), "p 0-252 @1, q 0-1006 @3 L1");
    // Those of the other, 252.25, 0.75 and 251.5, are rounded to 252, 1 and 252: one too many.
    done(session.setSpeed(q, 4));
    EXPECT_EQ(row(extra), "p 0-252 @1, q 0-252 @0 L1");
}

TEST_F(EditSessionMove, ImpossibleSpeedsAreRefused)
{
    for (const double speed : {0.0, -1.0, 1e-9, std::numeric_limits<double>::quiet_NaN(),
                               std::numeric_limits<double>::infinity()}) {
        refused(session.setSpeed(b, speed), {"\"b\"", "00:00:01.000"});
    }
    // 2000 / 220 is 9.09.
    refused(session.setSpeed(b, 220), {"\"b\"", "00:00:00.009"});
}

/// Its speed would be lost to rounding, and it could not be played slower again.
TEST_F(EditSessionMove, NoSourceIsPlayedInFewerMillisecondsThanTheShortestClip)
{
    Clip* const still = picture("still", 4000);
    still->setUnlimitedDuration(true);
    done(session.append({still, extra, 0, 0, 100000}));
    refused(session.setSpeed(still, 401), {"\"still\""});
    done(session.setSpeed(still, 400));
    EXPECT_EQ(row(extra), "still 0-250 @0");
    done(session.setSpeed(still, 1));
    EXPECT_EQ(row(extra), "still 0-100000 @0");
}

TEST_F(EditSessionMove, ReversingMirrorsTheStretch)
{
    done(session.reverse(b));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @8000 rev, c 3000-4000 @0");
    done(session.reverse(b));
    EXPECT_EQ(row(primary), "a 0-1000 @0, b 1000-3000 @0, c 3000-4000 @0");
}

// Native audio

TEST_F(EditSessionMove, NativeAudioFollowsWhateverIsDoneToItsMaster)
{
    done(session.append({x, primary, 0, 1000, 2000, sound("xn")}));
    EXPECT_EQ(row(native), "xn 4000-6000 @1000");
    done(session.trimLeft(x, 200));
    EXPECT_EQ(row(native), "xn 4200-6000 @1200");
    done(session.trimRight(x, 300));
    EXPECT_EQ(row(native), "xn 4200-5700 @1200");
    done(session.setSpeed(x, 2));
    EXPECT_EQ(row(native), "xn 4200-4950 @600");
    done(session.reverse(x));
    // 5000 - 750 - 600
    EXPECT_EQ(row(native), "xn 4200-4950 @3650 rev");
    done(session.move(x, 5000));
    EXPECT_EQ(row(native), "xn 5000-5750 @3650 rev");
    EXPECT_THAT(links(), ElementsAre("xn(5000)>x(5000)+0"));
}

TEST_F(EditSessionMove, NativeAudioPlaysAsFarAsItsSourceGoes)
{
    Clip* const xn = sound("xn", 1500);
    done(session.append({x, primary, 0, 0, 2000, xn}));
    EXPECT_EQ(row(native), "xn 4000-5500 @0");
    // Backwards the end comes first, for which there is no sound.
    done(session.reverse(x));
    EXPECT_EQ(row(native), "xn 4500-6000 @0 rev");
    EXPECT_THAT(links(), ElementsAre("xn(4500)>x(4000)+500"));
    done(session.reverse(x));
    done(session.split(x, 5600));
    EXPECT_EQ(row(native), "xn 4000-5500 @0");
    done(session.trimLeft(x, 1400));
    EXPECT_EQ(row(native), "xn 5400-5500 @1400");
    // 9 ms would be left.
    done(session.trimLeft(x, 91));
    EXPECT_EQ(row(native), "");
    EXPECT_THAT(links(), IsEmpty());
}

TEST_F(EditSessionMove, NativeAudioThatHasNothingToPlayIsRefused)
{
    refused(session.append({x, primary, 0, 1500, 1000, sound("xn", 1505)}), {"\"xn\"", "00:00:04.000"});
}

TEST_F(EditSessionMove, NativeAudioIsNotEditedByItself)
{
    Clip* const xn = sound("xn");
    done(session.append({x, primary, 0, 0, 1000, xn}));
    const std::vector<std::string> why = {"\"xn\"", "native audio", "00:00:04.000"};
    refused(session.trimLeft(xn, 10), why);
    refused(session.trimRight(xn, 10), why);
    refused(session.split(xn, 4500), why);
    refused(session.move(xn, 5000), why);
    refused(session.setSpeed(xn, 2), why);
    refused(session.reverse(xn), why);
    refused(session.unlink(xn), why);
    refused(session.link(a, xn), why);
    refused(session.addTransition(transition(), {xn, nullptr}), why);
    done(session.setFades(xn, 10, 20));
    EXPECT_EQ(row(native), "xn 4000-5000 @0 /10 \\20");
}

// Intros

TEST_F(EditSessionMove, AnIntroIsNeitherRetimedNorMovedNorOverwritten)
{
    b->setType(Clip::IntroVideoClip);
    const std::vector<std::string> why = {"\"b\"", "00:00:01.000", "timing can't be edited"};
    refused(session.trimLeft(b, 10), why);
    refused(session.trimRight(b, 10), why);
    refused(session.split(b, 2000), why);
    refused(session.move(b, 9000), why);
    refused(session.setSpeed(b, 2), why);
    refused(session.reverse(b), why);
    refused(session.overwrite({x, primary, 0, 0, 600}, 500), why);
    refused(session.insert({x, primary, 0, 0, 600}, 0), why);
    refused(session.insert({x, primary, 0, 0, 600}, 2000), why);
    refused(session.extract(a), why);
    refused(session.trimRight(a, 10, Ripple::Yes), why);
    done(session.setFades(b, 10, 20));
    done(session.addTransition(transition(), {a, b}, 600));
    done(session.extract(b));
    EXPECT_EQ(row(primary), "a 0-1000 @0, c 1000-2000 @0");
}

TEST_F(EditSessionMove, AnIntroStaysWhereItsMasterOnlyChangesTheLane)
{
    done(session.link(a, b));
    b->setType(Clip::IntroVideoClip);
    done(session.move(a, 0, extra, 0));
    EXPECT_EQ(row(primary), "b 1000-3000 @0, c 3000-4000 @0");
    EXPECT_EQ(row(extra), "a 0-1000 @0");
    refused(session.move(a, 1, extra, 0), {"\"b\"", "would have to move"});
}

// Fades

TEST_F(EditSessionMove, FadesMayFillTheClip)
{
    done(session.setFades(a, 400, 600));
    EXPECT_EQ(row(primary), "a 0-1000 @0 /400 \\600, b 1000-3000 @0, c 3000-4000 @0");
    refused(session.setFades(a, 401, 600), {"\"a\"", "00:00:00.401", "00:00:01.000"});
    refused(session.setFades(a, -1, 600), {"\"a\"", "-00:00:00.001"});
    refused(session.setFades(a, 0, -1), {"\"a\""});
    refused(session.setFades(x, 0, 0), {"\"x\""});
}

} // namespace
