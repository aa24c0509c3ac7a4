// SPDX-License-Identifier: Apache-2.0
#include "tests/library/Downloads.h"

#include <algorithm>
#include <array>

namespace {

using Import::State;
using Import::Details::AcquireStateNotification;
using Import::Details::AcquireSubscription;
using LibraryTests::Downloads;
using LibraryTests::TracedStates;
using testing::ElementsAre;
using testing::IsEmpty;

/// With one module that owns the states and one view that asks.
class ImportStateView : public LibraryTests::ImportStates
{
protected:
    /// The state of the item in the stage, which the view knows.
    State& stateAt(const Import::Object& object, int stage)
    {
        State& state = owner.stateOf(&object);
        owner.importStateChange(&state)->setStage(State::Stage(stage));
        view.importStateOf(&object);
        take();
        return state;
    }

    Downloads owner{trace};
    TracedStates view{trace, "view"};
};

TEST_F(ImportStateView, AsksForAStateAndObservesIt)
{
    const State* const state = view.importStateOf(&rain);
    EXPECT_EQ(state, &owner.stateOf(&rain));
    EXPECT_THAT(take(),
                ElementsAre("owner asked for rain", "owner added rain@2", "owner changed -@2 to rain@2",
                            "owner changed now rain@2", "view added rain@2", "view changed -@2 to rain@2",
                            "view changed now rain@2"));
    EXPECT_THAT(view.importStates(), ElementsAre(state));
    EXPECT_EQ(view.importState(), state);
    EXPECT_TRUE(view.importStateIsObserved(state));
    EXPECT_FALSE(view.importStateIsOwned(state));
    EXPECT_EQ(view.importStateOwnerPointer(state), nullptr);
    EXPECT_TRUE(owner.importStateIsOwned(state));
}

TEST_F(ImportStateView, AsksOnlyOnceForAnItem)
{
    const State* const state = view.importStateOf(&rain);
    take();
    EXPECT_EQ(view.importStateOf(&rain), state);
    EXPECT_THAT(take(), IsEmpty());
    EXPECT_EQ(view.importStateOf(&sun), &owner.stateOf(&sun));
    EXPECT_EQ(owner.senders.size(), 2u);
}

TEST_F(ImportStateView, AsksInTheNameOfAnAddressOfItsOwn)
{
    view.importStateOf(&rain);
    const AcquireSubscription* inner = nullptr;
    owner.answer = [&](const Import::Details::AcquireState&) {
        owner.answer = nullptr;
        EXPECT_EQ(view.importStateOf(&rain)->import, &rain);
        TracedStates other(trace, "other");
        other.importStateOf(&sun);
        inner = owner.senders.back();
    };
    EXPECT_EQ(view.importStateOf(&sun), nullptr) << "the answer to another view is none to this one";
    ASSERT_EQ(owner.senders.size(), 3u);
    EXPECT_NE(owner.senders[0], nullptr);
    EXPECT_NE(owner.senders[1], nullptr);
    EXPECT_NE(inner, owner.senders[1]);
}

TEST_F(ImportStateView, TakesNoAnswerToSomebodyElse)
{
    const State state;
    owner.answer = [&](const Import::Details::AcquireState&) {
        const AcquireSubscription other;
        PubSub::publish(AcquireStateNotification(&other, &state));
        PubSub::publish(AcquireStateNotification(nullptr, &state));
    };
    EXPECT_EQ(view.importStateOf(&rain), nullptr);
    EXPECT_THAT(view.importStates(), IsEmpty());
}

TEST_F(ImportStateView, GetsNothingWhereTheOwnerDoesNotAnswer)
{
    owner.answer = [](const Import::Details::AcquireState&) {};
    EXPECT_EQ(view.importStateOf(&rain), nullptr);
    view.import(&rain);
    view.cancelImport(&rain);
    EXPECT_THAT(take(), ElementsAre("owner asked for rain", "owner asked for rain", "owner asked for rain"));
    EXPECT_THAT(view.importStates(), IsEmpty());
}

TEST_F(ImportStateView, GetsNothingFromAnAnswerOfNull)
{
    owner.answer = [](const Import::Details::AcquireState& request) {
        PubSub::publish(AcquireStateNotification(request.sender, nullptr));
    };
    EXPECT_EQ(view.importStateOf(&rain), nullptr);
    view.import(&rain);
    view.cancelImport(&rain);
    EXPECT_THAT(take(), ElementsAre("owner asked for rain", "owner asked for rain", "owner asked for rain"));
    EXPECT_THAT(view.importStates(), IsEmpty());
}

TEST_F(ImportStateView, ObservesTheLastOfTwoAnswersAlone)
{
    State first;
    State second;
    first.setImport(&rain);
    second.setImport(&rain)->setStage(State::Stage(5));
    owner.answer = [&](const Import::Details::AcquireState& request) {
        PubSub::publish(AcquireStateNotification(request.sender, &first));
        PubSub::publish(AcquireStateNotification(request.sender, &second));
    };
    EXPECT_EQ(view.importStateOf(&rain), &second);
    EXPECT_THAT(view.importStates(), ElementsAre(&second));
    EXPECT_THAT(take(), ElementsAre("owner asked for rain", "view added rain@5", "view changed -@2 to rain@5",
                                    "view changed now rain@5"));
}

TEST_F(ImportStateView, OfTwoOwnersTheOneThatAnswersLaterWins)
{
    Downloads rival(trace, "rival");
    const State* const state = view.importStateOf(&rain);
    ASSERT_EQ(owner.senders.size(), 1u);
    EXPECT_EQ(owner.senders, rival.senders);
    const auto lines = take();
    const bool rivalWasLast = std::find(lines.begin(), lines.end(), "rival asked for rain") >
                              std::find(lines.begin(), lines.end(), "owner asked for rain");
    EXPECT_EQ(state, rivalWasLast ? &rival.stateOf(&rain) : &owner.stateOf(&rain));
    EXPECT_THAT(view.importStates(), ElementsAre(state));
}

TEST_F(ImportStateView, AnOwnerThatAsksItselfOwnsTheStateNoMore)
{
    const State* const state = owner.importStateOf(&rain);
    ASSERT_EQ(state, &owner.stateOf(&rain));
    EXPECT_FALSE(owner.importStateIsOwned(state));
    EXPECT_TRUE(owner.importStateIsObserved(state));
}

TEST_F(ImportStateView, AnOwnerKnowsItsStatesWithoutAskingItself)
{
    State& state = owner.stateOf(&rain);
    EXPECT_EQ(owner.importStateOf(&rain), &state);
    owner.import(&rain);
    EXPECT_EQ(state.stage, 3);
    EXPECT_TRUE(owner.importStateIsOwned(&state));
    EXPECT_THAT(owner.senders, IsEmpty());
}

/// What becomes of each stage from 0 to 8.
constexpr std::array<int, 9> imported = {0, 1, 3, 3, 4, 5, 6, 3, 8};
constexpr std::array<int, 9> cancelled = {0, 1, 2, 2, 2, 2, 6, 7, 8};

TEST_F(ImportStateView, ImportsFromTwoStagesOnly)
{
    for (int stage = 0; stage != 9; ++stage) {
        SCOPED_TRACE(stage);
        State& state = stateAt(rain, stage);
        view.import(&state);
        EXPECT_EQ(state.stage, imported[stage]);
        EXPECT_EQ(take().empty(), stage != 2 && stage != 7);

        owner.importStateChange(&state)->setStage(State::Stage(stage));
        view.import(&rain);
        EXPECT_EQ(state.stage, imported[stage]);
    }
}

TEST_F(ImportStateView, CancelsFromThreeStagesOnly)
{
    for (int stage = 0; stage != 9; ++stage) {
        SCOPED_TRACE(stage);
        State& state = stateAt(rain, stage);
        view.cancelImport(&state);
        EXPECT_EQ(state.stage, cancelled[stage]);
        EXPECT_EQ(take().empty(), stage < 3 || stage > 5);

        owner.importStateChange(&state)->setStage(State::Stage(stage));
        view.cancelImport(&rain);
        EXPECT_EQ(state.stage, cancelled[stage]);
    }
}

TEST_F(ImportStateView, TellsEveryoneOfAnImportAndOfItsCancelling)
{
    TracedStates other(trace, "other");
    other.importStateOf(&rain);
    stateAt(rain, 7);
    view.import(&rain);
    EXPECT_THAT(take(), ElementsAre("owner changed rain@7 to rain@3", "owner changed from rain@7",
                                    "owner changed now rain@3", "other changed rain@7 to rain@3",
                                    "other changed from rain@7", "other changed now rain@3",
                                    "view changed rain@7 to rain@3", "view changed from rain@7",
                                    "view changed now rain@3"));
    other.cancelImport(&rain);
    EXPECT_THAT(take(), ElementsAre("owner changed rain@3 to rain@2", "owner changed from rain@3",
                                    "owner changed now rain@2", "other changed rain@3 to rain@2",
                                    "other changed from rain@3", "other changed now rain@2",
                                    "view changed rain@3 to rain@2", "view changed from rain@3",
                                    "view changed now rain@2"));
}

TEST_F(ImportStateView, LeavesEverythingButTheStageAsItIs)
{
    State& state = stateAt(rain, 2);
    owner.importStateChange(&state)->setProgress(0.5)->setDeployError(Package::DeployResult(3));
    view.import(&rain);
    view.cancelImport(&rain);
    EXPECT_EQ(state.import, &rain);
    EXPECT_EQ(state.progress, 0.5);
    EXPECT_EQ(state.deployError, 3);
    EXPECT_EQ(state.stage, 2);
}

TEST_F(ImportStateView, AsksForTheStateOfAnItemThatIsImported)
{
    view.import(&rain);
    EXPECT_EQ(owner.stateOf(&rain).stage, 3);
    EXPECT_EQ(owner.senders.size(), 1u);
    view.cancelImport(&sun);
    EXPECT_EQ(owner.stateOf(&sun).stage, 2);
    EXPECT_EQ(owner.senders.size(), 2u);
}

TEST_F(ImportStateView, AnImportOfAStateWithoutAnOwnerIsLost)
{
    State state;
    state.setImport(&sun);
    view.importStateObserve(&state);
    take();
    view.import(&state);
    view.import(&sun);
    EXPECT_EQ(state.stage, 2);
    EXPECT_THAT(take(), IsEmpty());
}

TEST_F(ImportStateView, KnowsAStateThatItObservesWithoutAsking)
{
    State& state = owner.stateOf(&rain);
    view.importStateObserve(&state);
    take();
    EXPECT_EQ(view.importStateOf(&rain), &state);
    EXPECT_THAT(take(), IsEmpty());
}

TEST_F(ImportStateView, StillKnowsAStateWhoseStageHasChanged)
{
    State& state = stateAt(rain, 2);
    for (const int stage : {3, 4, 7, 9}) {
        owner.importStateChange(&state)->setStage(State::Stage(stage));
        take();
        EXPECT_EQ(view.importStateOf(&rain), &state);
        EXPECT_THAT(take(), IsEmpty());
    }
}

TEST_F(ImportStateView, FollowsAStateToAnotherItem)
{
    State& state = stateAt(rain, 2);
    owner.importStateChange(&state)->setImport(&sun);
    EXPECT_THAT(take(), testing::Contains("view changed rain@2 to sun@2"));
    EXPECT_EQ(view.importStateOf(&sun), &state);
    EXPECT_THAT(take(), IsEmpty());

    State another;
    another.setImport(&rain);
    owner.answer = [&](const Import::Details::AcquireState& request) {
        PubSub::publish(AcquireStateNotification(request.sender, &another));
    };
    EXPECT_EQ(view.importStateOf(&rain), &another) << "the owner is asked again";
}

TEST_F(ImportStateView, ForgetsWhoseStateItWasWhenTheItemIsTakenAway)
{
    State& state = stateAt(rain, 2);
    owner.importStateChange(&state)->setImport(nullptr);
    owner.answer = [](const Import::Details::AcquireState&) {};
    EXPECT_EQ(view.importStateOf(&rain), nullptr);
    EXPECT_TRUE(view.importStateIsObserved(&state));
    owner.importStateChange(&state)->setImport(&rain);
    EXPECT_EQ(view.importStateOf(&rain), &state);
}

TEST_F(ImportStateView, OfTwoStatesOfOneItemKnowsTheLaterOne)
{
    State& state = stateAt(rain, 2);
    State another;
    another.setImport(&rain);
    view.importStateObserve(&another);
    EXPECT_EQ(view.importStateOf(&rain), &another);
    owner.importStateChange(&state)->setStage(State::Requested);
    EXPECT_EQ(view.importStateOf(&rain), &another) << "a change of stage leaves what is known";
    // The end of either makes the view ask again, though it observes the other.
    owner.importStateRemove(&state);
    take();
    owner.answer = [](const Import::Details::AcquireState&) {};
    EXPECT_EQ(view.importStateOf(&rain), nullptr);
    EXPECT_THAT(view.importStates(), ElementsAre(&another));
}

TEST_F(ImportStateView, AsksAgainForAStateThatWasRemovedOrForgotten)
{
    State& state = stateAt(rain, 2);
    view.importStateForget(&state);
    EXPECT_THAT(take(),
                ElementsAre("view changed rain@2 to -@2", "view changed now rain@2", "view removed rain@2"));
    EXPECT_EQ(view.importStateOf(&rain), &state);
    EXPECT_THAT(take(), ElementsAre("owner asked for rain", "view added rain@2", "view changed -@2 to rain@2",
                                    "view changed now rain@2"));
    owner.importStateRemove(&state);
    EXPECT_THAT(view.importStates(), IsEmpty());
    take();
    owner.answer = [](const Import::Details::AcquireState&) {};
    EXPECT_EQ(view.importStateOf(&rain), nullptr);
    EXPECT_THAT(take(), ElementsAre("owner asked for rain"));
}

TEST_F(ImportStateView, ReleasingTellsTheOwnerAndNothingElse)
{
    State& state = stateAt(rain, 4);
    view.releaseImportState(&rain);
    EXPECT_THAT(take(), ElementsAre("owner released rain"));
    EXPECT_NE(owner.senders.back(), nullptr);
    EXPECT_TRUE(view.importStateIsObserved(&state));
    EXPECT_EQ(view.importStateOf(&rain), &state);
    EXPECT_THAT(take(), IsEmpty());
    view.releaseImportState(&sun);
    EXPECT_THAT(take(), ElementsAre("owner released sun"));
}

TEST_F(ImportStateView, AStateThatItsOwnerRemovesOnReleaseIsKnownNoMore)
{
    stateAt(rain, 4);
    owner.removesReleased = true;
    view.releaseImportState(&rain);
    EXPECT_THAT(take(),
                ElementsAre("owner released rain", "view changed rain@4 to -@2", "view changed now rain@4",
                            "view removed rain@4", "owner changed rain@4 to -@2", "owner changed now rain@4",
                            "owner removed rain@4"));
    EXPECT_THAT(view.importStates(), IsEmpty());
    view.importStateOf(&rain);
    EXPECT_EQ(take().front(), "owner asked for rain");
}

TEST_F(ImportStateView, AnAnswerForAnotherItemIsReturnedAndKnownUnderThatItem)
{
    State& state = owner.stateOf(&sun);
    owner.answer = [&](const Import::Details::AcquireState& request) {
        PubSub::publish(AcquireStateNotification(request.sender, &state));
    };
    EXPECT_EQ(view.importStateOf(&rain), &state);
    take();
    EXPECT_EQ(view.importStateOf(&sun), &state);
    EXPECT_THAT(take(), IsEmpty());
    EXPECT_EQ(view.importStateOf(&rain), &state);
    EXPECT_EQ(take().front(), "owner asked for rain");
}

TEST_F(ImportStateView, ACopyKnowsWhatTheOriginalKnows)
{
    State& state = stateAt(rain, 2);
    TracedStates copy(view);
    EXPECT_EQ(copy.importStateOf(&rain), &state);
    EXPECT_THAT(take(), IsEmpty());
    view.importStateForget(&state);
    take();
    EXPECT_EQ(copy.importStateOf(&rain), &state);
    copy.import(&rain);
    EXPECT_EQ(state.stage, 3);
}

/// Nobody owns states here.
using ImportStateViewAlone = LibraryTests::ImportStates;

TEST_F(ImportStateViewAlone, DoesNothing)
{
    TracedStates view(trace, "view");
    EXPECT_EQ(view.importStateOf(&rain), nullptr);
    view.import(&rain);
    view.cancelImport(&rain);
    view.releaseImportState(&rain);
    EXPECT_THAT(view.importStates(), IsEmpty());
    EXPECT_THAT(take(), IsEmpty());
}

TEST_F(ImportStateViewAlone, AddsAStateToWhoeverTakesAdds)
{
    Message::View<State> owner;
    owner.processAddRequests();
    State state;
    TracedStates view(trace, "view");
    view.importStateAdd(&state)->setImport(&rain);
    EXPECT_TRUE(owner.isOwned(&state));
    EXPECT_EQ(view.importStateOf(&rain), &state);
    view.import(&rain);
    EXPECT_EQ(state.stage, 3);
}

} // namespace
