// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/Transition.h>
#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>

#include <array>
#include <limits>
#include <stdexcept>

namespace {

using testing::IsEmpty;
using testing::Pair;
using testing::UnorderedElementsAre;
using Timeline::ClipPair;
using Timeline::ClipTiming;
using Ignored = QSet<const Transition::Object*>;

constexpr MTime D = 2000;
constexpr MTime NONE = -1;
constexpr auto* UNKNOWN_KEY = "invalid map<K, T> key";

/// That a strict look-up throws what it says.
template <class Call>
void expectThrowsForUnknown(Call call)
{
    try {
        call();
        ADD_FAILURE() << "nothing was thrown";
    } catch (const std::out_of_range& error) {
        EXPECT_STREQ(error.what(), UNKNOWN_KEY);
    }
}

/// Clips and transitions stand in arrays, in the order of their addresses.
class Transitions : public ::testing::Test
{
protected:
    static ClipTiming timing(MTime timestamp, MTime duration)
    {
        return ClipTiming(nullptr, 0, timestamp, duration, 0, duration);
    }

    void put(const Timeline::Clip& clip, MTime duration, MTime transitionIn = 0, MTime transitionOut = 0)
    {
        ClipTiming timing = Transitions::timing(0, duration);
        timing.setTransitionIn(transitionIn).setTransitionOut(transitionOut);
        timeline.addClip(&clip, timing);
    }

    /// Puts all four clips on the timeline, each 4000 ms long.
    void putAll()
    {
        for (const Timeline::Clip& clip : clips)
            put(clip, 4000);
    }

    MTime in(const Timeline::Clip& clip) const { return timeline.clipTiming(&clip).transitionIn; }
    MTime out(const Timeline::Clip& clip) const { return timeline.clipTiming(&clip).transitionOut; }

    /// With the default of 2000 ms.
    MTime expected(const Timeline::Clip* first, const Timeline::Clip* second, MTime wish,
                   const Ignored& ignored = {}) const
    {
        return timeline.expectedTransitionDuration({first, second}, D, wish, ignored);
    }

    MTime available(const Timeline::Clip* first, const Timeline::Clip* second) const
    {
        return timeline.availableTransitionDuration(ClipPair(first, second));
    }

    std::array<Timeline::Clip, 4> clips;
    const Timeline::Clip& a = clips[0];
    const Timeline::Clip& b = clips[1];
    const Timeline::Clip& c = clips[2];
    const Timeline::Clip& d = clips[3];
    std::array<Transition::Object, 4> objects;
    const Transition::Object* const t0 = &objects[0];
    const Transition::Object* const t1 = &objects[1];
    const Transition::Object* const t2 = &objects[2];
    const Transition::Object* const t3 = &objects[3];
    Timeline::Object timeline;
};

using AvailableTransitionDuration = Transitions;
using ExpectedTransitionDuration = Transitions;
using AddTransition = Transitions;
using RemoveTransition = Transitions;
using ClearTransitions = Transitions;
using SetTransitionDuration = Transitions;
using TransitionQueries = Transitions;
using TransitionRange = Transitions;

// What is available

TEST_F(AvailableTransitionDuration, LeavesTheLeastLengthBesideTheTransitionAtTheFarEnd)
{
    put(a, 1000, 200);
    put(b, 800);
    // Twice the lesser of 1000 - 210 and 800.
    EXPECT_EQ(available(&a, &b), MTime(1580));
    EXPECT_EQ(available(&a, nullptr), MTime(790));
    EXPECT_EQ(available(nullptr, &b), MTime(800));

    put(b, 800, 0, 1);
    EXPECT_EQ(available(&a, &b), MTime(1578));
    EXPECT_EQ(available(nullptr, &b), MTime(789));
}

TEST_F(AvailableTransitionDuration, TakesNoNoticeOfTransitionsAtTheNearEnd)
{
    put(a, 1000, 0, 300);
    put(b, 800, 400, 0);
    EXPECT_EQ(available(&a, &b), MTime(1600));
    EXPECT_EQ(available(&a, nullptr), MTime(1000));
    EXPECT_EQ(available(nullptr, &b), MTime(800));
}

TEST_F(AvailableTransitionDuration, IsNeverLessThanTheLeastLengthOfAClip)
{
    put(a, 5);
    put(b, 0);
    put(c, 300, 295, 300);
    EXPECT_EQ(available(&a, nullptr), MTime(10));
    EXPECT_EQ(available(nullptr, &a), MTime(10));
    EXPECT_EQ(available(&a, &b), MTime(10));
    EXPECT_EQ(available(&c, nullptr), MTime(10));
    EXPECT_EQ(available(nullptr, &c), MTime(10));
    EXPECT_EQ(available(&c, &a), MTime(10));

    put(a, 11);
    put(b, 6);
    EXPECT_EQ(available(&a, nullptr), MTime(11));
    EXPECT_EQ(available(&a, &b), MTime(12));
}

TEST_F(AvailableTransitionDuration, CountsANegativeShareAsOneToo)
{
    put(a, 1000, -200);
    EXPECT_EQ(available(&a, nullptr), MTime(1190));
}

TEST_F(AvailableTransitionDuration, NeedsAnyClipAtAll)
{
    putAll();
    EXPECT_EQ(available(nullptr, nullptr), NONE);
    EXPECT_EQ(available(&a, &a), NONE);
    EXPECT_EQ(Timeline::Object().availableTransitionDuration(ClipPair(&a, &a)), NONE);
}

TEST_F(AvailableTransitionDuration, OfATransitionIsThatOfItsPair)
{
    putAll();
    put(a, 1000, 200);
    timeline.transitions = {{t0, {&a, &b}}, {t1, {&a, nullptr}}, {t2, {nullptr, nullptr}}};
    EXPECT_EQ(timeline.availableTransitionDuration(t0), MTime(1580));
    EXPECT_EQ(timeline.availableTransitionDuration(t1), MTime(790));
    EXPECT_EQ(timeline.availableTransitionDuration(t2), NONE);
    EXPECT_EQ(timeline.availableTransitionDuration(t3), NONE);
}

TEST_F(AvailableTransitionDuration, IsStrictOnTheClipsOfThePair)
{
    put(a, 1000);
    expectThrowsForUnknown([&] { available(&a, &b); });
    expectThrowsForUnknown([&] { available(&b, &a); });
    expectThrowsForUnknown([&] { available(&b, nullptr); });
    expectThrowsForUnknown([&] { available(nullptr, &b); });
    timeline.transitions = {{t0, {&a, &b}}};
    expectThrowsForUnknown([&] { timeline.availableTransitionDuration(t0); });
    EXPECT_EQ(timeline.clips.size(), 1u);
}

// What comes out

TEST_F(ExpectedTransitionDuration, IsTheDefaultBetweenClipsThatHaveRoomForIt)
{
    putAll();
    EXPECT_EQ(expected(&a, &b, NONE), MTime(2000));
}

TEST_F(ExpectedTransitionDuration, IsHalfOfTheDefaultAtOneSide)
{
    putAll();
    EXPECT_EQ(expected(&a, nullptr, NONE), MTime(1000));
    EXPECT_EQ(expected(nullptr, &a, NONE), MTime(1000));
    EXPECT_EQ(timeline.expectedTransitionDuration({&a, nullptr}, 2001, NONE), MTime(1000));
    EXPECT_EQ(timeline.expectedTransitionDuration({nullptr, &a}, 2003, NONE), MTime(1001));
}

TEST_F(ExpectedTransitionDuration, IsEvenBetweenClips)
{
    putAll();
    EXPECT_EQ(expected(&a, &b, 2001), MTime(2000));
    EXPECT_EQ(expected(&a, &b, 11), MTime(10));
    EXPECT_EQ(expected(&a, &b, 12), MTime(12));
    EXPECT_EQ(timeline.expectedTransitionDuration({&a, &b}, 2003, NONE), MTime(2002));
    EXPECT_EQ(expected(&a, nullptr, 2001), MTime(2001));
    EXPECT_EQ(expected(nullptr, &a, 2001), MTime(2001));
}

TEST_F(ExpectedTransitionDuration, MayTakeTheWholeOfTheShorterOfTwoClips)
{
    put(a, 600);
    put(b, 600);
    put(c, 4000);
    EXPECT_EQ(expected(&a, &b, 2000), MTime(1200));
    EXPECT_EQ(expected(&a, &c, 2000), MTime(1200));
    EXPECT_EQ(expected(&c, &a, 2000), MTime(1200));
    EXPECT_EQ(expected(&a, &b, 1199), MTime(1198));
}

TEST_F(ExpectedTransitionDuration, LeavesTheLeastLengthOfAClipThatIsCoveredAtOneSide)
{
    put(a, 4000);
    EXPECT_EQ(expected(&a, nullptr, 3995), MTime(3990));
    EXPECT_EQ(expected(nullptr, &a, 3995), MTime(3990));
    EXPECT_EQ(expected(&a, nullptr, 3990), MTime(3990));
    EXPECT_EQ(expected(&a, nullptr, 3989), MTime(3989));
}

TEST_F(ExpectedTransitionDuration, HasNoMarginBetweenClipsWhereAvailableHasOne)
{
    put(a, 1000, 200);
    put(b, 800);
    EXPECT_EQ(expected(&a, &b, 5000), MTime(1600));
    EXPECT_EQ(available(&a, &b), MTime(1580));
    // At one side the margin is there, also without a transition at the other end.
    EXPECT_EQ(expected(&a, nullptr, 5000), MTime(790));
    EXPECT_EQ(expected(nullptr, &b, 5000), MTime(790));
    EXPECT_EQ(available(nullptr, &b), MTime(800));
}

TEST_F(ExpectedTransitionDuration, IsNeverLessThanTheLeastLengthOfAClipWhateverTheClipHas)
{
    put(a, 4000);
    put(b, 4000);
    put(c, 3);
    put(d, 3);
    for (const MTime wish : {MTime(0), MTime(1), MTime(9), MTime(10), MTime(-2), MTime(-4000)}) {
        EXPECT_EQ(expected(&a, &b, wish), MTime(10)) << wish.ms();
        EXPECT_EQ(expected(&a, nullptr, wish), MTime(10)) << wish.ms();
        EXPECT_EQ(expected(nullptr, &b, wish), MTime(10)) << wish.ms();
        EXPECT_EQ(expected(&c, &d, wish), MTime(10)) << wish.ms();
    }
    EXPECT_EQ(expected(&c, &d, 2000), MTime(10));
    EXPECT_EQ(expected(&c, nullptr, 2000), MTime(10));
    EXPECT_EQ(expected(nullptr, &c, NONE), MTime(10));
}

TEST_F(ExpectedTransitionDuration, ForAPairOfOneClipOrOfNullsIsTheWish)
{
    putAll();
    EXPECT_EQ(expected(nullptr, nullptr, 700), MTime(700));
    EXPECT_EQ(expected(nullptr, nullptr, NONE), MTime(1000));
    EXPECT_EQ(expected(&a, &a, 9000), MTime(9000));
    EXPECT_EQ(expected(&a, &a, NONE), MTime(1000));
    EXPECT_EQ(expected(nullptr, nullptr, 0), MTime(0));
    EXPECT_EQ(expected(nullptr, nullptr, -2), MTime(-2));
    // No transition is taken for the one in place, not even one with this very pair.
    timeline.transitions = {{t0, {&a, &a}}, {t1, {nullptr, nullptr}}};
    timeline.setTransitionDuration(t0, 300);
    EXPECT_EQ(expected(&a, &a, NONE), MTime(1000));
    EXPECT_EQ(expected(nullptr, nullptr, NONE), MTime(1000));
}

TEST_F(ExpectedTransitionDuration, CutsHalvesOffTowardsZero)
{
    EXPECT_EQ(timeline.expectedTransitionDuration({nullptr, nullptr}, 2001, NONE), MTime(1000));
    EXPECT_EQ(timeline.expectedTransitionDuration({nullptr, nullptr}, -3, NONE), MTime(-1));
    EXPECT_EQ(timeline.expectedTransitionDuration({nullptr, nullptr}, 1, NONE), MTime(0));
}

TEST_F(ExpectedTransitionDuration, IsTheLengthOfTheTransitionInPlaceWithoutAWish)
{
    putAll();
    timeline.addTransition(t0, {&a, &b}, 600);
    timeline.addTransition(t1, {nullptr, &c}, 70);
    timeline.addTransition(t2, {&d, nullptr}, 80);
    EXPECT_EQ(expected(&a, &b, NONE), MTime(600));
    EXPECT_EQ(expected(nullptr, &c, NONE), MTime(70));
    EXPECT_EQ(expected(&d, nullptr, NONE), MTime(80));
    EXPECT_EQ(expected(&a, &b, 601), MTime(600));
    EXPECT_EQ(expected(&a, &b, 602), MTime(602));

    // Between clips, the one in place is the one with the very pair.
    EXPECT_EQ(expected(&b, &a, NONE), MTime(2000));
    EXPECT_EQ(expected(&a, &c, NONE), MTime(2000));
    // At one side, it is any that leaves or enters the clip, and counts as far as it reaches into that.
    EXPECT_EQ(expected(&a, nullptr, NONE), MTime(300));
    EXPECT_EQ(expected(nullptr, &b, NONE), MTime(300));
}

TEST_F(ExpectedTransitionDuration, AddsUpSharesThatDiffer)
{
    put(a, 4000, 0, 301);
    put(b, 4000, 402, 0);
    timeline.transitions = {{t0, {&a, &b}}};
    EXPECT_EQ(expected(&a, &b, NONE), MTime(702));
}

TEST_F(ExpectedTransitionDuration, IsTheDefaultWhereTheTransitionInPlaceIsIgnored)
{
    putAll();
    timeline.addTransition(t0, {&a, &b}, 600);
    timeline.addTransition(t1, {nullptr, &c}, 70);
    EXPECT_EQ(expected(&a, &b, NONE, {t0}), MTime(2000));
    EXPECT_EQ(expected(&a, &b, NONE, {t1}), MTime(600));
    EXPECT_EQ(expected(nullptr, &c, NONE, {t1}), MTime(1000));
    EXPECT_EQ(expected(&a, nullptr, NONE, {t0}), MTime(1000));
}

TEST_F(ExpectedTransitionDuration, IsTheDefaultWhereTheLengthInPlaceIsThatOfNoWish)
{
    put(a, 4000, 0, -1);
    timeline.transitions = {{t0, {&a, nullptr}}};
    EXPECT_EQ(expected(&a, nullptr, NONE), MTime(1000));
    put(a, 4000, 0, 0);
    EXPECT_EQ(expected(&a, nullptr, NONE), MTime(10));
}

TEST_F(ExpectedTransitionDuration, LeavesTheTransitionAtTheFarEndItsShareUnlessItIsIgnored)
{
    put(a, 1000);
    put(b, 1000);
    timeline.addTransition(t0, {nullptr, &a}, 300);
    timeline.addTransition(t1, {&b, nullptr}, 400);

    EXPECT_EQ(expected(&a, nullptr, 5000), MTime(690));
    EXPECT_EQ(expected(&a, nullptr, 5000, {t0}), MTime(990));
    EXPECT_EQ(expected(&a, nullptr, 5000, {t1}), MTime(690));
    EXPECT_EQ(expected(nullptr, &b, 5000), MTime(590));
    EXPECT_EQ(expected(nullptr, &b, 5000, {t1}), MTime(990));

    EXPECT_EQ(expected(&a, &b, 5000), MTime(1200));
    EXPECT_EQ(expected(&a, &b, 5000, {t1}), MTime(1400));
    EXPECT_EQ(expected(&a, &b, 5000, {t0}), MTime(1200));
    EXPECT_EQ(expected(&a, &b, 5000, {t0, t1}), MTime(2000));
}

TEST_F(ExpectedTransitionDuration, DoesNotIgnoreAShareThatNoTransitionAccountsFor)
{
    put(a, 1000, 300, 0);
    put(b, 1000, 0, 400);
    const Ignored everything = {nullptr, t0, t1, t2, t3};
    EXPECT_EQ(expected(&a, nullptr, 5000, everything), MTime(690));
    EXPECT_EQ(expected(nullptr, &b, 5000, everything), MTime(590));
    EXPECT_EQ(expected(&a, &b, 5000, everything), MTime(1200));
}

TEST_F(ExpectedTransitionDuration, IsStrictOnTheClipsWithAWishAndWithoutOne)
{
    put(a, 4000);
    for (const MTime wish : {NONE, MTime(500)}) {
        expectThrowsForUnknown([&] { expected(&a, &b, wish); });
        expectThrowsForUnknown([&] { expected(&b, &a, wish); });
        expectThrowsForUnknown([&] { expected(&b, nullptr, wish); });
        expectThrowsForUnknown([&] { expected(nullptr, &b, wish); });
        EXPECT_NO_THROW(expected(&b, &b, wish));
    }
    timeline.transitions = {{t0, {&a, &b}}};
    expectThrowsForUnknown([&] { expected(&a, &b, NONE); });
    EXPECT_EQ(timeline.clips.size(), 1u);
}

TEST_F(ExpectedTransitionDuration, WithoutIgnoredTransitionsIsThatWithNone)
{
    putAll();
    timeline.addTransition(t0, {nullptr, &a}, 300);
    EXPECT_EQ(timeline.expectedTransitionDuration({&a, nullptr}, D, 5000), MTime(3690));
    EXPECT_EQ(timeline.expectedTransitionDuration({&a, nullptr}, D, 5000, {}), MTime(3690));
}

TEST_F(ExpectedTransitionDuration, SaturatesWhereItIsOutOfRange)
{
    const MTime most = std::numeric_limits<qint64>::max();
    put(a, most);
    put(b, most);
    EXPECT_EQ(expected(&a, &b, most), most);
    EXPECT_EQ(available(&a, &b), most);
}

// Adding

TEST_F(AddTransition, CentresItOnTheCutBetweenTwoClips)
{
    putAll();
    timeline.addTransition(t0, {&a, &b}, NONE);
    EXPECT_EQ(out(a), MTime(1000));
    EXPECT_EQ(in(b), MTime(1000));
    EXPECT_EQ(in(a), MTime(0));
    EXPECT_EQ(out(b), MTime(0));
    EXPECT_THAT(timeline.transitions, UnorderedElementsAre(Pair(t0, ClipPair(&a, &b))));
}

TEST_F(AddTransition, GivesTheOneClipAllOfIt)
{
    putAll();
    timeline.addTransition(t0, {&a, nullptr}, 3995)->addTransition(t1, {nullptr, &b}, 701);
    EXPECT_EQ(out(a), MTime(3990));
    EXPECT_EQ(in(a), MTime(0));
    EXPECT_EQ(in(b), MTime(701));
    EXPECT_EQ(out(b), MTime(0));
}

TEST_F(AddTransition, ChangesNothingElseInATiming)
{
    ClipTiming whole(nullptr, 3, 100, 4000, 50, 9000);
    whole.setTransitionIn(7).setFadeInDuration(11).setFadeOutDuration(12).setSpeedCompensated(true).reverse();
    timeline.addClip(&a, whole);
    timeline.addTransition(t0, {&a, nullptr}, 500);
    EXPECT_EQ(timeline.clipTiming(&a), whole.setTransitionOut(500));
}

TEST_F(AddTransition, TakesTheDefaultOfTheTransition)
{
    putAll();
    objects[0].defaultDuration = 600;
    timeline.addTransition(t0, {&a, &b}, NONE)->addTransition(t1, {&c, &d}, NONE);
    EXPECT_EQ(out(a), MTime(300));
    EXPECT_EQ(out(c), MTime(1000));
}

TEST_F(AddTransition, DoesNothingForAPairOfOneClipOrOfNulls)
{
    putAll();
    timeline.addTransition(t0, {&a, &b}, 600);
    const auto clipsBefore = timeline.clips;
    const auto transitionsBefore = timeline.transitions;
    EXPECT_EQ(timeline.addTransition(t0, {&a, &a}, 300), &timeline);
    EXPECT_EQ(timeline.addTransition(t1, {nullptr, nullptr}, 300), &timeline);
    EXPECT_EQ(timeline.addTransition(nullptr, {nullptr, nullptr}, 300), &timeline);
    EXPECT_EQ(timeline.clips, clipsBefore);
    EXPECT_EQ(timeline.transitions, transitionsBefore);
    EXPECT_THAT(Timeline::Object().addTransition(t1, {&a, &a}, 300)->clips, IsEmpty());
}

TEST_F(AddTransition, KeepsTheLengthOfTheOneThatItReplaces)
{
    putAll();
    timeline.addTransition(t0, {&a, &b}, 600);
    timeline.clips.at(&b).setTransitionIn(402);
    timeline.addTransition(t1, {&a, &b}, NONE);
    EXPECT_EQ(out(a), MTime(351));
    EXPECT_EQ(in(b), MTime(351));
    EXPECT_THAT(timeline.transitions, UnorderedElementsAre(Pair(t1, ClipPair(&a, &b))));
}

TEST_F(AddTransition, KeepsTheLengthAtOneSideToo)
{
    putAll();
    timeline.addTransition(t0, {&a, nullptr}, 333)->addTransition(t1, {nullptr, &b}, 77);
    timeline.addTransition(t2, {&a, nullptr}, NONE)->addTransition(t3, {nullptr, &b}, NONE);
    EXPECT_EQ(out(a), MTime(333));
    EXPECT_EQ(in(b), MTime(77));
    EXPECT_THAT(timeline.transitions,
                UnorderedElementsAre(Pair(t2, ClipPair(&a, nullptr)), Pair(t3, ClipPair(nullptr, &b))));
}

TEST_F(AddTransition, DisplacesTheOneThatLeavesTheOutgoingClip)
{
    putAll();
    timeline.addTransition(t0, {&a, &c}, 600);
    ASSERT_EQ(in(c), MTime(300));
    timeline.addTransition(t1, {&a, &b}, 800);
    EXPECT_EQ(in(c), MTime(0));
    EXPECT_EQ(out(a), MTime(400));
    EXPECT_EQ(in(b), MTime(400));
    EXPECT_THAT(timeline.transitions, UnorderedElementsAre(Pair(t1, ClipPair(&a, &b))));
}

TEST_F(AddTransition, DisplacesTheOneThatEntersTheIncomingClip)
{
    putAll();
    timeline.addTransition(t0, {&c, &b}, 600)->addTransition(t1, {&a, &d}, 500);
    timeline.addTransition(t2, {&a, &b}, 800);
    EXPECT_EQ(out(c), MTime(0));
    EXPECT_EQ(in(d), MTime(0));
    EXPECT_EQ(out(a), MTime(400));
    EXPECT_EQ(in(b), MTime(400));
    EXPECT_THAT(timeline.transitions, UnorderedElementsAre(Pair(t2, ClipPair(&a, &b))));
}

TEST_F(AddTransition, LetsThoseAtTheFarEndsStand)
{
    putAll();
    timeline.addTransition(t0, {&c, &a}, 600)->addTransition(t1, {&b, &d}, 500);
    timeline.addTransition(t2, {&a, &b}, 20000);
    // The lesser of 4000 - 300 and 4000 - 250.
    EXPECT_EQ(out(a), MTime(3700));
    EXPECT_EQ(in(b), MTime(3700));
    EXPECT_EQ(in(a), MTime(300));
    EXPECT_EQ(out(b), MTime(250));
    EXPECT_EQ(timeline.transitions.size(), 3u);
}

TEST_F(AddTransition, DisplacesOneTransitionAnEndAndTheFirstByAddress)
{
    putAll();
    timeline.transitions = {{t0, {&a, &c}}, {t1, {&a, &d}}};
    timeline.setTransitionDuration(t0, 600)->setTransitionDuration(t1, 600);
    timeline.addTransition(t2, {&a, &b}, 800);
    EXPECT_EQ(in(c), MTime(0));
    EXPECT_EQ(in(d), MTime(300));
    EXPECT_THAT(timeline.transitions,
                UnorderedElementsAre(Pair(t1, ClipPair(&a, &d)), Pair(t2, ClipPair(&a, &b))));
}

TEST_F(AddTransition, MovesATransitionThatStandsElsewhereAndLeavesItsClipsAsTheyAre)
{
    putAll();
    timeline.addTransition(t0, {&a, &b}, 600);
    timeline.addTransition(t0, {&c, &d}, NONE);
    EXPECT_THAT(timeline.transitions, UnorderedElementsAre(Pair(t0, ClipPair(&c, &d))));
    EXPECT_EQ(out(a), MTime(300));
    EXPECT_EQ(in(b), MTime(300));
    EXPECT_EQ(out(c), MTime(1000));
    EXPECT_EQ(in(d), MTime(1000));
}

TEST_F(AddTransition, TakesATransitionThatStandsThereOutBeforeItComesBack)
{
    putAll();
    timeline.addTransition(t0, {&a, &b}, 600);
    timeline.addTransition(t0, {&a, nullptr}, 500);
    EXPECT_THAT(timeline.transitions, UnorderedElementsAre(Pair(t0, ClipPair(&a, nullptr))));
    EXPECT_EQ(out(a), MTime(500));
    EXPECT_EQ(in(b), MTime(0));
}

TEST_F(AddTransition, TakesAPairTurnedRoundForAnotherPair)
{
    put(a, 1000);
    put(b, 1000);
    timeline.addTransition(t0, {&a, &b}, 600);
    timeline.addTransition(t1, {&b, &a}, 5000);
    EXPECT_EQ(out(a), MTime(300));
    EXPECT_EQ(in(b), MTime(300));
    EXPECT_EQ(out(b), MTime(700));
    EXPECT_EQ(in(a), MTime(700));
    EXPECT_EQ(timeline.transitions.size(), 2u);
}

TEST_F(AddTransition, TheGivenPairMayBeThatOfATransitionThatIsDisplaced)
{
    putAll();
    timeline.addTransition(t0, {&a, &b}, 600);
    timeline.addTransition(t1, timeline.transitions.at(t0), NONE);
    EXPECT_THAT(timeline.transitions, UnorderedElementsAre(Pair(t1, ClipPair(&a, &b))));
    EXPECT_EQ(out(a), MTime(300));
    EXPECT_EQ(in(b), MTime(300));
}

TEST_F(AddTransition, ChangesNothingWhenAClipIsMissing)
{
    putAll();
    timeline.addTransition(t0, {&a, &b}, 600);
    timeline.removeClip(&c);
    const auto clipsBefore = timeline.clips;
    const auto transitionsBefore = timeline.transitions;
    for (const MTime wish : {NONE, MTime(500)}) {
        expectThrowsForUnknown([&] { timeline.addTransition(t1, {&a, &c}, wish); });
        expectThrowsForUnknown([&] { timeline.addTransition(t1, {&c, &b}, wish); });
        expectThrowsForUnknown([&] { timeline.addTransition(t1, {&c, nullptr}, wish); });
        expectThrowsForUnknown([&] { timeline.addTransition(t1, {nullptr, &c}, wish); });
    }
    EXPECT_EQ(timeline.clips, clipsBefore);
    EXPECT_EQ(timeline.transitions, transitionsBefore);
}

TEST_F(AddTransition, BringsBackAClipThatTheDisplacedTransitionLed)
{
    putAll();
    timeline.addTransition(t0, {&a, &c}, 600);
    timeline.removeClip(&c);
    timeline.addTransition(t1, {&a, &b}, 800);
    EXPECT_EQ(timeline.clipTiming(&c), ClipTiming());
}

// Removing

TEST_F(RemoveTransition, ResetsTheSharesOfItsClips)
{
    putAll();
    timeline.addTransition(t0, {&a, &b}, 600)->addTransition(t1, {&b, &c}, 500);
    timeline.addTransition(t2, {nullptr, &a}, 400);
    EXPECT_EQ(timeline.removeTransition(t0), &timeline);
    EXPECT_EQ(out(a), MTime(0));
    EXPECT_EQ(in(b), MTime(0));
    EXPECT_EQ(in(a), MTime(400));
    EXPECT_EQ(out(b), MTime(250));
    EXPECT_EQ(in(c), MTime(250));
    EXPECT_FALSE(timeline.hasTransition(t0));
    EXPECT_EQ(timeline.transitions.size(), 2u);
}

TEST_F(RemoveTransition, ResetsTheOneClipThatItCovers)
{
    put(a, 4000, 20, 30);
    put(b, 4000, 40, 50);
    timeline.transitions = {{t0, {&a, nullptr}}, {t1, {nullptr, &b}}, {t2, {nullptr, nullptr}}};
    timeline.removeTransition(t0)->removeTransition(t1)->removeTransition(t2);
    EXPECT_EQ(in(a), MTime(20));
    EXPECT_EQ(out(a), MTime(0));
    EXPECT_EQ(in(b), MTime(0));
    EXPECT_EQ(out(b), MTime(50));
    EXPECT_EQ(timeline.clips.size(), 2u);
    EXPECT_THAT(timeline.transitions, IsEmpty());
}

TEST_F(RemoveTransition, ThrowsForAnUnknownOneSoAlsoTheSecondTime)
{
    putAll();
    timeline.addTransition(t0, {&a, &b}, 600);
    timeline.removeTransition(t0);
    const auto before = timeline.clips;
    expectThrowsForUnknown([&] { timeline.removeTransition(t0); });
    expectThrowsForUnknown([&] { timeline.removeTransition(nullptr); });
    EXPECT_EQ(timeline.clips, before);
}

TEST_F(RemoveTransition, BringsBackClipsThatHaveLeft)
{
    putAll();
    timeline.addTransition(t0, {&a, &b}, 600)->addTransition(t1, {&c, nullptr}, 600);
    timeline.clearClips()->removeTransition(t0);
    EXPECT_THAT(timeline.clips, UnorderedElementsAre(Pair(&a, ClipTiming()), Pair(&b, ClipTiming())));
}

TEST_F(ClearTransitions, ResetsAllShares)
{
    putAll();
    const auto before = timeline.clips;
    timeline.addTransition(t0, {&a, &b}, 600)->addTransition(t1, {&b, &c}, 500);
    timeline.addTransition(t2, {nullptr, &a}, 400)->addTransition(t3, {&d, nullptr}, 300);
    EXPECT_EQ(timeline.clearTransitions(), &timeline);
    EXPECT_THAT(timeline.transitions, IsEmpty());
    EXPECT_EQ(timeline.clips, before);
}

TEST_F(ClearTransitions, BringsBackClipsThatHaveLeft)
{
    timeline.transitions = {{t1, {&a, &b}}, {t0, {nullptr, &c}}, {t2, {nullptr, nullptr}}};
    timeline.clearTransitions();
    EXPECT_THAT(timeline.clips,
                UnorderedElementsAre(Pair(&a, ClipTiming()), Pair(&b, ClipTiming()), Pair(&c, ClipTiming())));
}

TEST_F(ClearTransitions, DoesNothingWithoutAny)
{
    put(a, 1000, 200, 300);
    const auto before = timeline.clips;
    timeline.clearTransitions();
    EXPECT_EQ(timeline.clips, before);
}

// Setting a duration

TEST_F(SetTransitionDuration, GivesEachOfTwoClipsHalfAndLosesAnOddMillisecond)
{
    putAll();
    timeline.addTransition(t0, {&a, &b}, 600);
    EXPECT_EQ(timeline.setTransitionDuration(t0, 1001), &timeline);
    EXPECT_EQ(out(a), MTime(500));
    EXPECT_EQ(in(b), MTime(500));
    timeline.setTransitionDuration(t0, -3);
    EXPECT_EQ(out(a), MTime(-1));
    EXPECT_EQ(in(b), MTime(-1));
}

TEST_F(SetTransitionDuration, GivesTheOneClipAll)
{
    putAll();
    timeline.transitions = {{t0, {&a, nullptr}}, {t1, {nullptr, &b}}};
    timeline.setTransitionDuration(t0, 1001)->setTransitionDuration(t1, 77);
    EXPECT_EQ(out(a), MTime(1001));
    EXPECT_EQ(in(a), MTime(0));
    EXPECT_EQ(in(b), MTime(77));
    EXPECT_EQ(out(b), MTime(0));
}

TEST_F(SetTransitionDuration, HasNoLimits)
{
    put(a, 100);
    timeline.transitions = {{t0, {&a, nullptr}}};
    timeline.setTransitionDuration(t0, 100000);
    EXPECT_EQ(out(a), MTime(100000));
    timeline.setTransitionDuration(t0, 0);
    EXPECT_EQ(out(a), MTime(0));
}

TEST_F(SetTransitionDuration, DoesNothingForAPairOfNulls)
{
    timeline.transitions = {{t0, {nullptr, nullptr}}};
    timeline.setTransitionDuration(t0, 1000);
    EXPECT_THAT(timeline.clips, IsEmpty());
}

TEST_F(SetTransitionDuration, BringsBackClipsThatHaveLeft)
{
    timeline.transitions = {{t0, {&a, &b}}};
    timeline.setTransitionDuration(t0, 1000);
    EXPECT_THAT(timeline.clips, UnorderedElementsAre(Pair(&a, ClipTiming().setTransitionOut(500)),
                                                     Pair(&b, ClipTiming().setTransitionIn(500))));
}

TEST_F(SetTransitionDuration, ThrowsForAnUnknownTransition)
{
    putAll();
    timeline.addTransition(t0, {&a, &b}, 600);
    const auto before = timeline.clips;
    expectThrowsForUnknown([&] { timeline.setTransitionDuration(t1, 1000); });
    expectThrowsForUnknown([&] { timeline.setTransitionDuration(nullptr, 1000); });
    EXPECT_EQ(timeline.clips, before);
}

TEST_F(SetTransitionDuration, ResizingAndMovingAClipLeaveItAlone)
{
    putAll();
    timeline.addTransition(t0, {&a, &b}, 600);
    timeline.resizeClipLeft(&b, 3900)->resizeClipRight(&a, -3900)->moveClip(&a, MTime(70));
    EXPECT_EQ(out(a), MTime(300));
    EXPECT_EQ(in(b), MTime(300));
    EXPECT_TRUE(timeline.hasTransition(t0));
}

// Queries

TEST_F(TransitionQueries, FindATransitionByItself)
{
    timeline.transitions = {{t0, {&a, &b}}};
    EXPECT_TRUE(timeline.hasTransition(t0));
    EXPECT_FALSE(timeline.hasTransition(t1));
    EXPECT_FALSE(timeline.hasTransition(nullptr));
}

TEST_F(TransitionQueries, FindATransitionByItsExactPair)
{
    timeline.transitions = {{t0, {&a, &b}}, {t1, {nullptr, &b}}, {t2, {&a, nullptr}}};
    EXPECT_EQ(timeline.transitionOf(&a, &b), t0);
    EXPECT_EQ(timeline.transitionOf(nullptr, &b), t1);
    EXPECT_EQ(timeline.transitionOf(&a, nullptr), t2);
    EXPECT_EQ(timeline.transitionOf(&b, &a), nullptr);
    EXPECT_EQ(timeline.transitionOf(&b, nullptr), nullptr);
    EXPECT_EQ(timeline.transitionOf(nullptr, nullptr), nullptr);
    EXPECT_TRUE(timeline.hasTransition(&a, &b));
    EXPECT_TRUE(timeline.hasTransition(nullptr, &b));
    EXPECT_TRUE(timeline.hasTransition(&a, nullptr));
    EXPECT_FALSE(timeline.hasTransition(&b, &a));
    EXPECT_FALSE(timeline.hasTransition(nullptr, nullptr));

    timeline.transitions[t3] = {nullptr, nullptr};
    EXPECT_EQ(timeline.transitionOf(nullptr, nullptr), t3);
    EXPECT_TRUE(timeline.hasTransition(nullptr, nullptr));
}

TEST_F(TransitionQueries, TellInboundFromOutbound)
{
    timeline.transitions = {{t0, {&a, &b}}, {t1, {&b, &c}}, {t2, {nullptr, &a}}, {t3, {&c, nullptr}}};
    EXPECT_EQ(timeline.inboundTransitionOf(&a), t2);
    EXPECT_EQ(timeline.inboundTransitionOf(&b), t0);
    EXPECT_EQ(timeline.inboundTransitionOf(&c), t1);
    EXPECT_EQ(timeline.inboundTransitionOf(&d), nullptr);
    EXPECT_EQ(timeline.outboundTransitionOf(&a), t0);
    EXPECT_EQ(timeline.outboundTransitionOf(&b), t1);
    EXPECT_EQ(timeline.outboundTransitionOf(&c), t3);
    EXPECT_EQ(timeline.outboundTransitionOf(&d), nullptr);
}

TEST_F(TransitionQueries, NullIsNotWhereOneSidedTransitionsLead)
{
    timeline.transitions = {{t0, {nullptr, &a}}, {t1, {&a, nullptr}}, {t2, {nullptr, nullptr}}};
    EXPECT_EQ(timeline.inboundTransitionOf(nullptr), nullptr);
    EXPECT_EQ(timeline.outboundTransitionOf(nullptr), nullptr);
}

TEST_F(TransitionQueries, GiveTheFirstByAddressOfSeveral)
{
    timeline.transitions = {{t3, {&a, &b}}, {t2, {&a, &b}}, {t1, {&a, &b}}};
    EXPECT_EQ(timeline.transitionOf(&a, &b), t1);
    EXPECT_EQ(timeline.inboundTransitionOf(&b), t1);
    EXPECT_EQ(timeline.outboundTransitionOf(&a), t1);
}

TEST_F(TransitionQueries, GiveThePairOfATransition)
{
    timeline.transitions = {{t0, {&a, &b}}, {t1, {nullptr, &b}}};
    EXPECT_EQ(timeline.transitionClipPair(t0), ClipPair(&a, &b));
    EXPECT_EQ(timeline.transitionClipPair(t1), ClipPair(nullptr, &b));
    EXPECT_EQ(timeline.transitionClipPair(t2), ClipPair(nullptr, nullptr));
    EXPECT_EQ(timeline.transitionClipPair(nullptr), ClipPair(nullptr, nullptr));
    EXPECT_EQ(timeline.transitions.size(), 2u);
}

// What is covered

TEST_F(TransitionRange, ReachesAcrossTheCut)
{
    timeline.addClip(&a, timing(1000, 4000))->addClip(&b, timing(5000, 3000));
    timeline.addTransition(t0, {&a, &b}, 600);
    EXPECT_EQ(timeline.transitionRange(t0), Types::Range(4700, 5300));
}

TEST_F(TransitionRange, GoesFromClipToClipHoweverTheyLie)
{
    timeline.addClip(&a, timing(1000, 4000))->addClip(&b, timing(9000, 3000));
    timeline.addTransition(t0, {&a, &b}, 600)->addTransition(t1, {&b, &a}, 400);
    EXPECT_EQ(timeline.transitionRange(t0), Types::Range(4700, 9300));
    EXPECT_EQ(timeline.transitionRange(t1), Types::Range(11800, 1200));
}

TEST_F(TransitionRange, OfOneClipStartsOrEndsWithIt)
{
    timeline.addClip(&a, timing(1000, 4000));
    timeline.addTransition(t0, {nullptr, &a}, 300)->addTransition(t1, {&a, nullptr}, 500);
    EXPECT_EQ(timeline.transitionRange(t0), Types::Range(1000, 1300));
    EXPECT_EQ(timeline.transitionRange(t1), Types::Range(4500, 5000));
}

TEST_F(TransitionRange, IsTheDefaultForAnUnknownTransitionAndForAPairOfNulls)
{
    timeline.transitions = {{t0, {nullptr, nullptr}}};
    EXPECT_EQ(timeline.transitionRange(t0), Types::Range(0, -1));
    EXPECT_EQ(timeline.transitionRange(t1), Types::Range(0, -1));
    EXPECT_EQ(timeline.transitionRange(nullptr), Types::Range(0, -1));
}

TEST_F(TransitionRange, IsStrictOnTheClips)
{
    put(a, 1000);
    timeline.transitions = {{t0, {&a, &b}}, {t1, {&b, &a}}, {t2, {&b, nullptr}}, {t3, {nullptr, &b}}};
    for (const Transition::Object* const transition : {t0, t1, t2, t3})
        expectThrowsForUnknown([&] { timeline.transitionRange(transition); });
    EXPECT_EQ(timeline.clips.size(), 1u);
}

} // namespace
