// SPDX-License-Identifier: Apache-2.0
#include "TracedView.h"

#include <memory>

namespace {

using namespace BusTests;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::UnorderedElementsAreArray;

using Notes = std::set<const Note*>;

TEST_F(ViewTest, IsEmptyAtFirst)
{
    TracedView view(trace, "view");
    EXPECT_EQ(view.object(), nullptr);
    EXPECT_THAT(view.objects(), IsEmpty());
    EXPECT_FALSE(view.isObserved(&a()));
    EXPECT_FALSE(view.isOwned(&a()));
    EXPECT_FALSE(view.isObserved(nullptr));
    EXPECT_THAT(trace.take(), IsEmpty());
}

TEST_F(ViewTest, OwningAnObjectMakesItArriveAtItsOwner)
{
    TracedView owner(trace, "owner");
    owner.own(&a())->setValue(5);
    EXPECT_EQ(trace.take(), arrival("owner", "a", 5));
    EXPECT_TRUE(owner.isOwned(&a()));
    EXPECT_TRUE(owner.isObserved(&a()));
    EXPECT_EQ(owner.ownerPointer(&a()), &a());
}

TEST_F(ViewTest, AnOwnedObjectIsAnnouncedToThoseWhoWatchForNewOnesAfterItsOwnerKnows)
{
    TracedView owner(trace, "owner"), watcher(trace, "watcher");
    watcher.observeNew();
    owner.own(&a())->setValue(5);
    EXPECT_EQ(trace.take(), arrival("owner", "a", 5) + arrival("watcher", "a", 5));
    EXPECT_TRUE(watcher.isObserved(&a()));
    EXPECT_FALSE(watcher.isOwned(&a()));
}

TEST_F(ViewTest, ObservingMakesTheObjectArriveAtTheObserverAlone)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a())->setValue(5);
    trace.take();
    observer.observe(&a());
    EXPECT_EQ(trace.take(), arrival("observer", "a", 5));
    EXPECT_TRUE(observer.isObserved(&a()));
    EXPECT_FALSE(observer.isOwned(&a()));
    EXPECT_EQ(observer.object(), &a());
}

TEST_F(ViewTest, ObservingAgainMakesItArriveAgain)
{
    TracedView observer(trace, "observer");
    observer.observe(&a());
    trace.take();
    observer.observe(&a());
    EXPECT_EQ(trace.take(), arrival("observer", "a", 0));
}

TEST_F(ViewTest, TheOwnerOfAChangeHearsItBeforeAnyOtherView)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a())->setValue(1);
    observer.observe(&a());
    trace.take();
    owner.change(&a())->setValue(2);
    EXPECT_EQ(trace.take(), change("owner", "a", 1, 2) + change("observer", "a", 1, 2));
    EXPECT_EQ(a().value, 2);
    EXPECT_TRUE(owner.isOwned(&a()));
}

TEST_F(ViewTest, AnObserversChangeIsCarriedOutByTheOwnerAndComesBackFromIt)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a())->setValue(1);
    observer.observe(&a());
    trace.take();
    {
        auto chain = observer.change(&a());
        chain->setValue(2);
        EXPECT_EQ(a().value, 1);
        EXPECT_THAT(trace.take(), IsEmpty());
    }
    EXPECT_EQ(a().value, 2);
    EXPECT_EQ(trace.take(), change("owner", "a", 1, 2) + change("observer", "a", 1, 2));
}

TEST_F(ViewTest, AChangeReachesEveryObserverOnce)
{
    TracedView owner(trace, "owner"), one(trace, "one"), two(trace, "two"), stranger(trace, "stranger");
    owner.own(&a());
    owner.own(&b());
    one.observe(&a());
    two.observe(&a());
    stranger.observe(&b());
    trace.take();
    one.change(&a())->setValue(7);
    EXPECT_THAT(trace.take(), UnorderedElementsAreArray(change("owner", "a", 0, 7) +
                                                        change("one", "a", 0, 7) + change("two", "a", 0, 7)));
}

TEST_F(ViewTest, AChangeThatChangesNothingIsAnnounced)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a())->setValue(3);
    observer.observe(&a());
    trace.take();
    owner.change(&a());
    EXPECT_EQ(trace.take(), change("owner", "a", 3, 3) + change("observer", "a", 3, 3));
    observer.change(&a());
    EXPECT_EQ(trace.take(), change("owner", "a", 3, 3) + change("observer", "a", 3, 3));
}

TEST_F(ViewTest, ANullChangeActsOnTheFirstObject)
{
    TracedView owner(trace, "owner");
    owner.own(&b());
    owner.own(&a());
    trace.take();
    owner.change(nullptr)->setValue(4);
    EXPECT_EQ(trace.take(), change("owner", "a", 0, 4));
    EXPECT_EQ(b().value, 0);
}

TEST_F(ViewTest, WhenAnOwnerRemovesItsObjectTheObserversLetGoFirst)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a())->setValue(5);
    observer.observe(&a());
    trace.take();
    owner.remove(&a());
    EXPECT_EQ(trace.take(), departure("observer", "a", 5) + departure("owner", "a", 5));
    EXPECT_FALSE(owner.isObserved(&a()));
    EXPECT_FALSE(observer.isObserved(&a()));
}

TEST_F(ViewTest, WhenAnObserverRemovesAnObjectItLetsGoBeforeTheOwner)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a())->setValue(5);
    observer.observe(&a());
    trace.take();
    observer.remove(&a());
    EXPECT_EQ(trace.take(), departure("observer", "a", 5) + departure("owner", "a", 5));
    EXPECT_FALSE(owner.isObserved(&a()));
    EXPECT_FALSE(observer.isObserved(&a()));
}

TEST_F(ViewTest, TheEntryOutlivesTheCallbacksOfADeparture)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    Lines states;
    const auto note = [&] {
        states.push_back(std::string(owner.isOwned(&a()) ? "owned" : "not owned") +
                         (observer.isObserved(&a()) ? ", observed" : ", not observed"));
    };
    owner.onRemoved = note;
    observer.onRemoved = note;
    for (const bool byOwner : {true, false}) {
        owner.own(&a());
        observer.observe(&a());
        (byOwner ? owner : observer).remove(&a());
    }
    EXPECT_THAT(states, ElementsAre("owned, observed", "owned, not observed", "owned, observed",
                                    "owned, not observed"));
}

/// An owner that removes has stopped answering when its callbacks run; one that is asked to remove still
/// answers.
TEST_F(ViewTest, TheTwoWaysOfRemovingDifferInWhenTheOwnerStopsAnswering)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.onRemoved = [&] { PubSub::publish(Message::Types::Change<Note>(&a(), &b())); };
    b().value = 9;
    owner.own(&a());
    owner.remove(&a());
    EXPECT_EQ(a().value, 0);
    owner.own(&a());
    observer.observe(&a());
    observer.remove(&a());
    EXPECT_EQ(a().value, 9);
    EXPECT_EQ(b().value, 9);
}

TEST_F(ViewTest, ARemovedObjectIsNotWatchedAnyMore)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a());
    observer.observe(&a());
    owner.remove(&a());
    trace.take();
    owner.own(&a());
    EXPECT_EQ(trace.take(), arrival("owner", "a", 0));
    owner.change(&a())->setValue(1);
    EXPECT_EQ(trace.take(), change("owner", "a", 0, 1));
}

TEST_F(ViewTest, ANullRemoveActsOnTheFirstObject)
{
    TracedView owner(trace, "owner");
    owner.own(&a());
    owner.own(&b());
    trace.take();
    owner.remove(nullptr);
    EXPECT_EQ(trace.take(), departure("owner", "a", 0));
    EXPECT_THAT(owner.objects(), ElementsAre(&b()));
}

TEST_F(ViewTest, ANullRemoveOnAnEmptyViewDoesNothing)
{
    TracedView owner(trace, "owner"), empty(trace, "empty");
    owner.own(&a());
    trace.take();
    empty.remove(nullptr);
    EXPECT_THAT(trace.take(), IsEmpty());
    EXPECT_TRUE(owner.isOwned(&a()));
}

TEST_F(ViewTest, AnAddIsGrantedByAnOpenView)
{
    TracedView owner(trace, "owner"), client(trace, "client");
    owner.processAddRequests();
    client.add(&a())->setValue(6);
    EXPECT_EQ(trace.take(), arrival("owner", "a", 6) + arrival("client", "a", 6));
    EXPECT_TRUE(owner.isOwned(&a()));
    EXPECT_TRUE(client.isObserved(&a()));
    EXPECT_FALSE(client.isOwned(&a()));
}

TEST_F(ViewTest, AnAddedObjectIsOwnedBeforeItsFirstCallback)
{
    TracedView owner(trace, "owner"), client(trace, "client");
    owner.processAddRequests();
    bool owned = false;
    owner.onAdded = [&] { owned = owner.isOwned(&a()); };
    client.add(&a());
    EXPECT_TRUE(owned);
}

TEST_F(ViewTest, TheSettersOfAnAddActOnTheObjectBeforeItIsPublished)
{
    TracedView owner(trace, "owner");
    auto chain = owner.own(&a());
    chain->setValue(8);
    EXPECT_EQ(a().value, 8);
    EXPECT_THAT(trace.take(), IsEmpty());
    EXPECT_FALSE(owner.isObserved(&a()));
}

TEST_F(ViewTest, AnAddWithoutAnOpenViewIsLostYetALaterOwnerIsHeard)
{
    TracedView client(trace, "client"), closed(trace, "closed"), late(trace, "late");
    client.add(&a())->setValue(2);
    late.processAddRequests();
    EXPECT_THAT(trace.take(), IsEmpty());
    EXPECT_FALSE(client.isObserved(&a()));
    closed.own(&a());
    EXPECT_EQ(trace.take(), arrival("closed", "a", 2) + arrival("client", "a", 2));
    EXPECT_TRUE(client.isObserved(&a()));
}

TEST_F(ViewTest, ForgettingIsLocal)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a())->setValue(5);
    observer.observe(&a());
    trace.take();
    bool known = true;
    observer.onRemoved = [&] { known = observer.isObserved(&a()); };
    observer.forget(&a());
    EXPECT_EQ(trace.take(), departure("observer", "a", 5));
    EXPECT_FALSE(known);
    owner.change(&a())->setValue(6);
    EXPECT_EQ(trace.take(), change("owner", "a", 5, 6));
}

TEST_F(ViewTest, WatchingForNewObjectsCanBeGivenUp)
{
    TracedView owner(trace, "owner"), watcher(trace, "watcher");
    watcher.observeNew();
    owner.own(&a());
    watcher.forgetNew();
    trace.take();
    owner.own(&b());
    EXPECT_EQ(trace.take(), arrival("owner", "b", 0));
    owner.change(&a())->setValue(1);
    EXPECT_EQ(trace.take(), change("owner", "a", 0, 1) + change("watcher", "a", 0, 1));
}

TEST_F(ViewTest, EnumeratesWhatAnyViewOwns)
{
    TracedView one(trace, "one"), two(trace, "two"), observer(trace, "observer");
    EXPECT_THAT(observer.enumerateAll(), IsEmpty());
    Note unowned;
    one.own(&a());
    two.own(&b());
    two.own(&a());
    observer.observe(&unowned);
    EXPECT_EQ(observer.enumerateAll(), (Notes{&a(), &b()}));
    EXPECT_EQ(one.enumerateAll(), (Notes{&a(), &b()}));
}

TEST_F(ViewTest, ObservingAllTakesWhatIsThereInOrderAndWhatComes)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&b())->setValue(2);
    owner.own(&a())->setValue(1);
    trace.take();
    observer.observeAll();
    EXPECT_EQ(trace.take(), arrival("observer", "a", 1) + arrival("observer", "b", 2));
    Note c;
    trace.name(c, "c");
    owner.own(&c);
    EXPECT_EQ(trace.take(), arrival("owner", "c", 0) + arrival("observer", "c", 0));
}

TEST_F(ViewTest, AnOwnerPointerIsForWritingOnlyAtTheOwner)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a());
    observer.observe(&a());
    EXPECT_EQ(owner.ownerPointer(&a()), &a());
    EXPECT_EQ(observer.ownerPointer(&a()), nullptr);
    EXPECT_EQ(observer.ownerPointer(&b()), &b());
}

TEST_F(ViewTest, MayBeMadeForOneObject)
{
    Message::View<Note> observer(&a()), nothing(nullptr);
    EXPECT_THAT(observer.objects(), ElementsAre(&a()));
    EXPECT_FALSE(observer.isOwned(&a()));
    EXPECT_THAT(nothing.objects(), IsEmpty());
    TracedView owner(trace, "owner");
    owner.own(&a());
    observer.change(&a())->setValue(3);
    EXPECT_EQ(a().value, 3);
}

} // namespace
