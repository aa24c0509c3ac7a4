// SPDX-License-Identifier: Apache-2.0
#include "TracedView.h"

#include <memory>
#include <optional>
#include <stdexcept>

namespace {

using namespace BusTests;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::UnorderedElementsAreArray;

TEST_F(ViewTest, AnOwnerThatWatchesForNewObjectsTurnsIntoAnObserverOfItsOwn)
{
    TracedView view(trace, "view");
    view.observeNew();
    view.own(&a());
    EXPECT_EQ(trace.take(), arrival("view", "a", 0) + arrival("view", "a", 0));
    EXPECT_TRUE(view.isObserved(&a()));
    EXPECT_FALSE(view.isOwned(&a()));
}

TEST_F(ViewTest, AnOpenViewThatAddsTurnsIntoAnObserverOfItsOwn)
{
    TracedView view(trace, "view");
    view.processAddRequests();
    view.add(&a());
    EXPECT_EQ(trace.take(), arrival("view", "a", 0) + arrival("view", "a", 0));
    EXPECT_TRUE(view.isObserved(&a()));
    EXPECT_FALSE(view.isOwned(&a()));
}

TEST_F(ViewTest, RequestsAboutAnObjectThatItsOwnerOnlyObservesNowFallOnNobody)
{
    TracedView owner(trace, "owner"), client(trace, "client");
    owner.own(&a());
    client.observe(&a());
    owner.observe(&a());
    trace.take();
    client.change(&a())->setValue(1);
    owner.change(&a())->setValue(2);
    client.remove(&a());
    EXPECT_THAT(trace.take(), IsEmpty());
    EXPECT_EQ(a().value, 0);
}

TEST_F(ViewTest, ObservingAnOwnedObjectGivesUpTheWritablePointer)
{
    TracedView view(trace, "view");
    view.own(&a());
    EXPECT_TRUE(view.isOwned(&a()));
    view.observe(&a());
    EXPECT_FALSE(view.isOwned(&a()));
    EXPECT_TRUE(view.isObserved(&a()));
    EXPECT_EQ(view.ownerPointer(&a()), nullptr);
}

TEST_F(ViewTest, ObservingAllGivesUpEverythingThatTheViewOwns)
{
    TracedView view(trace, "view");
    view.own(&a());
    view.own(&b());
    view.observeAll();
    EXPECT_FALSE(view.isOwned(&a()));
    EXPECT_FALSE(view.isOwned(&b()));
    EXPECT_THAT(view.objects(), ElementsAre(&a(), &b()));
    EXPECT_THAT(view.enumerateAll(), IsEmpty());
}

TEST_F(ViewTest, OwningAnObservedObjectMakesItWritableUntilItsOwnAnnouncementComesBack)
{
    TracedView view(trace, "view");
    view.observe(&a());
    trace.take();
    std::vector<bool> owned;
    view.onAdded = [&] { owned.push_back(view.isOwned(&a())); };
    view.own(&a());
    // It comes back to the subscription that observe() made.
    EXPECT_EQ(trace.take(), arrival("view", "a", 0) + arrival("view", "a", 0));
    EXPECT_THAT(owned, ElementsAre(true, false));
    EXPECT_FALSE(view.isOwned(&a()));
}

TEST_F(ViewTest, AfterForgettingAnObjectCanBeOwned)
{
    TracedView view(trace, "view");
    view.observe(&a());
    view.forget(&a());
    trace.take();
    view.own(&a());
    EXPECT_EQ(trace.take(), arrival("view", "a", 0));
    EXPECT_TRUE(view.isOwned(&a()));
}

TEST_F(ViewTest, AForgottenOwnedObjectIsGoneBeforeTheCallbacksAndHasNoOwner)
{
    TracedView owner(trace, "owner"), client(trace, "client");
    owner.own(&a())->setValue(5);
    client.observe(&a());
    trace.take();
    bool known = true;
    owner.onRemoved = [&] { known = owner.isObserved(&a()); };
    owner.forget(&a());
    EXPECT_EQ(trace.take(), departure("owner", "a", 5));
    EXPECT_FALSE(known);
    EXPECT_TRUE(client.isObserved(&a()));
    client.change(&a())->setValue(6);
    client.remove(&a());
    EXPECT_THAT(trace.take(), IsEmpty());
    EXPECT_EQ(a().value, 5);
}

/// It stays subscribed as an owner, so an add of the same object is answered without being open.
TEST_F(ViewTest, AForgetfulOwnerStillAnswersAnAddOfTheObject)
{
    TracedView owner(trace, "owner"), client(trace, "client");
    owner.own(&a());
    owner.forget(&a());
    trace.take();
    client.add(&a());
    EXPECT_EQ(trace.take(), arrival("owner", "a", 0) + arrival("client", "a", 0));
    EXPECT_TRUE(owner.isOwned(&a()));
}

TEST_F(ViewTest, AnOpenOwnerAnswersAnAddOfItsOwnObjectOnce)
{
    TracedView owner(trace, "owner"), client(trace, "client");
    owner.processAddRequests();
    owner.own(&a());
    trace.take();
    client.add(&a());
    EXPECT_EQ(trace.take(), arrival("owner", "a", 0) + arrival("client", "a", 0));
}

TEST_F(ViewTest, ANullChangeOnAnEmptyViewAddsTheChainsOwnValue)
{
    TracedView client(trace, "client"), owner(trace, "owner");
    client.change(nullptr)->setValue(3);
    EXPECT_THAT(trace.take(), IsEmpty());
    owner.processAddRequests();
    const Note* address = nullptr;
    owner.onAdded = [&] { address = owner.object(); };
    {
        auto chain = client.change(nullptr);
        chain->setValue(4);
        trace.name(*chain.operator->(), "chain's");
    }
    EXPECT_EQ(trace.take(), arrival("owner", "chain's", 4) + arrival("client", "chain's", 4));
    EXPECT_TRUE(owner.isOwned(address));
    owner.onAdded = nullptr;
}

TEST_F(ViewTest, TwoOpenViewsBothTakeAnAddedObject)
{
    TracedView one(trace, "one"), two(trace, "two"), client(trace, "client");
    one.processAddRequests();
    two.processAddRequests();
    client.add(&a());
    // Each announces what it took to the client, which is the only observer.
    EXPECT_THAT(trace.take(), UnorderedElementsAreArray(arrival("one", "a", 0) + arrival("client", "a", 0) +
                                                        arrival("two", "a", 0) + arrival("client", "a", 0)));
    EXPECT_TRUE(one.isOwned(&a()));
    EXPECT_TRUE(two.isOwned(&a()));
    EXPECT_THAT(client.enumerateAll(), ElementsAre(&a()));
}

TEST_F(ViewTest, AViewThatEndsTellsNobody)
{
    std::optional<TracedView> owner(std::in_place, trace, "owner");
    TracedView client(trace, "client");
    owner->own(&a())->setValue(1);
    client.observe(&a());
    trace.take();
    owner.reset();
    EXPECT_THAT(trace.take(), IsEmpty());
    EXPECT_TRUE(client.isObserved(&a()));
    client.change(&a())->setValue(2);
    client.remove(&a());
    EXPECT_THAT(trace.take(), IsEmpty());
    EXPECT_EQ(a().value, 1);
    EXPECT_THAT(client.enumerateAll(), IsEmpty());
}

TEST_F(ViewTest, AViewMayOutliveItsObjects)
{
    TracedView view(trace, "view");
    auto note = std::make_unique<Note>();
    auto other = std::make_unique<Note>();
    view.own(note.get());
    view.observe(other.get());
    note.reset();
    other.reset();
    EXPECT_EQ(view.objects().size(), 2u);
}

TEST_F(ViewTest, NullIsIgnoredWhereItHasNoMeaning)
{
    TracedView view(trace, "view");
    view.observe(nullptr);
    view.forget(nullptr);
    view.add(nullptr);
    view.own(nullptr);
    EXPECT_THAT(view.objects(), IsEmpty());
    EXPECT_THAT(trace.take(), IsEmpty());
    EXPECT_FALSE(view.isOwned(nullptr));
    EXPECT_EQ(view.ownerPointer(nullptr), nullptr);
}

TEST_F(ViewTest, ForgettingAnUnknownObjectStillLetsItDepart)
{
    TracedView view(trace, "view");
    view.forget(&a());
    EXPECT_EQ(trace.take(), departure("view", "a", 0));
}

TEST_F(ViewTest, AnUnknownObjectIsChangedByItsOwner)
{
    TracedView owner(trace, "owner"), client(trace, "client");
    owner.own(&a());
    trace.take();
    client.change(&a())->setValue(4);
    EXPECT_EQ(trace.take(), change("owner", "a", 0, 4));
}

// Requests that an owner adjusts or refuses

class StubbornView : public TracedView
{
public:
    using TracedView::TracedView;

    bool refuses = false;

protected:
    void addRequested(Note* note) override
    {
        write("add requested");
        if (!refuses) {
            TracedView::addRequested(note);
        }
    }

    void changeRequested(Note* note, Note* value) override
    {
        write("change requested");
        if (!refuses) {
            value->setValue(value->value * 10);
            TracedView::changeRequested(note, value);
        }
    }

    void removeRequested(Note* note) override
    {
        write("remove requested");
        if (!refuses) {
            TracedView::removeRequested(note);
        }
    }
};

TEST_F(ViewTest, AnOwnerMayRefuseRequests)
{
    StubbornView owner(trace, "owner");
    TracedView client(trace, "client");
    owner.own(&a());
    owner.processAddRequests();
    client.observe(&a());
    trace.take();
    owner.refuses = true;
    client.add(&b());
    client.change(&a())->setValue(1);
    client.remove(&a());
    EXPECT_THAT(trace.take(),
                ElementsAre("owner add requested", "owner change requested", "owner remove requested"));
    EXPECT_EQ(a().value, 0);
    EXPECT_TRUE(owner.isOwned(&a()));
    EXPECT_FALSE(client.isObserved(&b()));
}

TEST_F(ViewTest, AnOwnerMayAdjustARequestedChangeAndTheRequestersValueStaysAsItIs)
{
    StubbornView owner(trace, "owner");
    owner.own(&a());
    trace.take();
    Note wanted(2);
    PubSub::publish(Message::Types::Change<Note>(&a(), &wanted));
    EXPECT_EQ(trace.take(), Lines{"owner change requested"} + change("owner", "a", 0, 20));
    EXPECT_EQ(wanted.value, 2);
}

TEST_F(ViewTest, TheValueOfAGrantedChangeIsTheOldOneAfterwards)
{
    class Keeper : public TracedView
    {
    public:
        using TracedView::TracedView;
        int left = -1;

    protected:
        void changeRequested(Note* note, Note* value) override
        {
            TracedView::changeRequested(note, value);
            left = value->value;
        }
    };
    Keeper owner(trace, "owner");
    owner.own(&a())->setValue(4);
    Note wanted(2);
    PubSub::publish(Message::Types::Change<Note>(&a(), &wanted));
    EXPECT_EQ(a().value, 2);
    EXPECT_EQ(owner.left, 4);
}

TEST_F(ViewTest, AnOwnersOwnOperationsAreNotRequests)
{
    StubbornView owner(trace, "owner");
    owner.refuses = true;
    owner.own(&a());
    owner.change(&a())->setValue(1);
    EXPECT_EQ(trace.take(), arrival("owner", "a", 0) + change("owner", "a", 0, 1));
    owner.remove(&a());
    EXPECT_EQ(trace.take(), departure("owner", "a", 1));
}

// Copies

TEST_F(ViewTest, ACopyHoldsWhatTheOriginalHoldsWithoutACallback)
{
    TracedView original(trace, "original");
    original.own(&a());
    original.observe(&b());
    trace.take();
    TracedView copy(original, "copy");
    EXPECT_THAT(trace.take(), IsEmpty());
    EXPECT_TRUE(copy.isOwned(&a()));
    EXPECT_TRUE(copy.isObserved(&b()));
    EXPECT_FALSE(copy.isOwned(&b()));
}

TEST_F(ViewTest, ACopyHearsForItselfAndOutlivesTheOriginal)
{
    TracedView owner(trace, "owner");
    std::optional<TracedView> original(std::in_place, trace, "original");
    owner.own(&a());
    original->observe(&a());
    trace.take();
    TracedView copy(*original, "copy");
    owner.change(&a())->setValue(1);
    EXPECT_THAT(trace.take(),
                UnorderedElementsAreArray(change("owner", "a", 0, 1) + change("original", "a", 0, 1) +
                                          change("copy", "a", 0, 1)));
    original.reset();
    owner.change(&a())->setValue(2);
    EXPECT_EQ(trace.take(), change("owner", "a", 1, 2) + change("copy", "a", 1, 2));
}

TEST_F(ViewTest, ACopyIsAsOpenAndAsWatchfulAsTheOriginal)
{
    auto open = std::make_unique<TracedView>(trace, "open");
    auto watchful = std::make_unique<TracedView>(trace, "watchful");
    open->processAddRequests();
    watchful->observeNew();
    TracedView openCopy(*open, "open copy"), watchfulCopy(*watchful, "watchful copy"),
        client(trace, "client");
    open.reset();
    watchful.reset();
    client.add(&a());
    EXPECT_THAT(trace.take(),
                UnorderedElementsAreArray(arrival("open copy", "a", 0) + arrival("watchful copy", "a", 0) +
                                          arrival("client", "a", 0)));
}

TEST_F(ViewTest, ACopiedOwnerAnswersRequestsAndEnumerations)
{
    std::optional<TracedView> original(std::in_place, trace, "original");
    TracedView client(trace, "client");
    original->own(&a());
    TracedView copy(*original, "copy");
    original.reset();
    trace.take();
    EXPECT_THAT(client.enumerateAll(), ElementsAre(&a()));
    client.change(&a())->setValue(3);
    EXPECT_EQ(trace.take(), change("copy", "a", 0, 3));
}

// Callbacks that use the views in turn

TEST_F(ViewTest, AnObserverMayForgetInItsCallbackWhatChanges)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a());
    observer.observe(&a());
    trace.take();
    observer.onChanged = [&] {
        observer.onChanged = nullptr;
        observer.forget(&a());
    };
    owner.change(&a())->setValue(1);
    EXPECT_EQ(trace.take(),
              change("owner", "a", 0, 1) + change("observer", "a", 0, 1) + departure("observer", "a", 1));
    owner.change(&a())->setValue(2);
    EXPECT_EQ(trace.take(), change("owner", "a", 1, 2));
}

TEST_F(ViewTest, AnObserverMayAnswerAChangeWithAnother)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a());
    observer.observe(&a());
    trace.take();
    observer.onChanged = [&] {
        if (a().value < 3) {
            observer.change(&a())->setValue(a().value + 1);
        }
    };
    owner.change(&a())->setValue(1);
    EXPECT_EQ(trace.take(), change("owner", "a", 0, 1) + change("observer", "a", 0, 1) +
                                change("owner", "a", 1, 2) + change("observer", "a", 1, 2) +
                                change("owner", "a", 2, 3) + change("observer", "a", 2, 3));
}

TEST_F(ViewTest, AnObserverMayEndAnotherOne)
{
    TracedView owner(trace, "owner");
    auto one = std::make_unique<TracedView>(trace, "one");
    auto two = std::make_unique<TracedView>(trace, "two");
    owner.own(&a());
    one->observe(&a());
    two->observe(&a());
    trace.take();
    one->onChanged = [&] { two.reset(); };
    two->onChanged = [&] { one.reset(); };
    owner.change(&a())->setValue(1);
    const Lines lines = trace.take();
    EXPECT_EQ(lines, change("owner", "a", 0, 1) + change(one ? "one" : "two", "a", 0, 1));
}

TEST_F(ViewTest, AnOwnerMayRemoveInItsCallbackWhatChanges)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a());
    observer.observe(&a());
    trace.take();
    owner.onChanged = [&] {
        owner.onChanged = nullptr;
        owner.remove(&a());
    };
    owner.change(&a())->setValue(1);
    EXPECT_EQ(trace.take(),
              change("owner", "a", 0, 1) + departure("observer", "a", 1) + departure("owner", "a", 1));
    EXPECT_THAT(owner.objects(), IsEmpty());
}

TEST_F(ViewTest, AnExceptionFromACallbackPassesThroughAndLeavesTheChangeDone)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a());
    observer.observe(&a());
    trace.take();
    observer.onChanged = [] { throw std::runtime_error("observer"); };
    EXPECT_THROW(owner.change(&a())->setValue(1), std::runtime_error);
    EXPECT_EQ(a().value, 1);
    EXPECT_EQ(trace.take(), change("owner", "a", 0, 1) + change("observer", "a", 0, 1));
    observer.onChanged = nullptr;
    EXPECT_THROW(
        {
            owner.onAdded = [] { throw std::runtime_error("owner"); };
            owner.own(&b());
        },
        std::runtime_error);
    owner.onAdded = nullptr;
    trace.take();
    observer.change(&a())->setValue(2);
    EXPECT_EQ(trace.take(), change("owner", "a", 1, 2) + change("observer", "a", 1, 2));
}

} // namespace
