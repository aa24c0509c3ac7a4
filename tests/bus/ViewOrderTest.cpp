// SPDX-License-Identifier: Apache-2.0
#include "TracedView.h"

#include <stdexcept>

// The order of a view's steps, seen by whoever acts between two of them.

namespace {

using namespace BusTests;
using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Not;

TEST_F(ViewTest, AWatcherForNewObjectsThatObservesOneAlreadyHearsItsArrivalOnce)
{
    TracedView owner(trace, "owner"), watcher(trace, "watcher");
    watcher.observeNew();
    watcher.observe(&a());
    trace.take();
    owner.own(&a());
    EXPECT_EQ(trace.take(), arrival("owner", "a", 0) + arrival("watcher", "a", 0));
}

TEST_F(ViewTest, AnOwnerAnswersRequestsBeforeItAnnouncesTheObject)
{
    TracedView owner(trace, "owner"), watcher(trace, "watcher");
    watcher.observeNew();
    watcher.onAdded = [&] { watcher.change(&a())->setValue(7); };
    owner.own(&a());
    EXPECT_EQ(a().value, 7);
}

TEST_F(ViewTest, AnOwnerAnswersNoRequestsWhileTheObjectArrivesAtItself)
{
    TracedView owner(trace, "owner");
    b().value = 9;
    owner.onAdded = [&] { PubSub::publish(Message::Types::Change<Note>(&a(), &b())); };
    owner.own(&a());
    EXPECT_EQ(a().value, 0);
}

TEST_F(ViewTest, AnObserverIsSubscribedBeforeItsCallbacksRun)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a());
    trace.take();
    observer.onAdded = [&] { owner.change(&a())->setValue(7); };
    observer.observe(&a());
    EXPECT_THAT(trace.take(), Contains("observer changed a: 0"));
}

TEST_F(ViewTest, AnAnnouncedObjectIsInTheTableBeforeTheCallbacksRun)
{
    TracedView owner(trace, "owner"), watcher(trace, "watcher");
    watcher.observeNew();
    bool known = false;
    watcher.onAdded = [&] { known = watcher.isObserved(&a()); };
    owner.own(&a());
    EXPECT_TRUE(known);
}

/// Both let go of the entry, and neither of the owner's subscription.
TEST_F(ViewTest, AnOwnerThatObservedAndForgotStillAnswersAnAdd)
{
    TracedView owner(trace, "owner"), client(trace, "client");
    owner.own(&a());
    owner.observe(&a());
    owner.forget(&a());
    client.add(&a());
    EXPECT_TRUE(owner.isOwned(&a()));
}

TEST_F(ViewTest, AnOwnerThatItsOwnAnnouncementMadeAnObserverStillAnswersAnAdd)
{
    TracedView owner(trace, "owner"), client(trace, "client");
    owner.observeNew();
    owner.own(&a());
    owner.forget(&a());
    owner.forgetNew();
    client.add(&a());
    EXPECT_TRUE(owner.isOwned(&a()));
}

TEST_F(ViewTest, AnObserverHearsOfTheObjectUntilItsDepartureIsOver)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a());
    observer.observe(&a());
    trace.take();
    observer.onRemoved = [&] {
        observer.onRemoved = nullptr;
        PubSub::publish(Message::Types::Changed<Note>(&a(), &b()));
    };
    owner.remove(&a());
    EXPECT_THAT(trace.take(), Contains("observer changed a: b=0"));
}

/// The announcement of a departure comes before the owner stops answering.
TEST_F(ViewTest, AnOwnerThatRemovesStillAnswersThoseWhoLetGo)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a());
    observer.observe(&a());
    observer.onRemoved = [&] { PubSub::publish(Message::Types::Change<Note>(&a(), &b())); };
    b().value = 9;
    owner.remove(&a());
    EXPECT_EQ(a().value, 9);
}

TEST_F(ViewTest, AnOwnerOfARemovedObjectDoesNotAnswerAnAddOfIt)
{
    TracedView owner(trace, "owner"), observer(trace, "observer"), client(trace, "client");
    for (const bool byOwner : {true, false}) {
        owner.own(&a());
        observer.observe(&a());
        (byOwner ? owner : observer).remove(&a());
        client.add(&a());
        EXPECT_FALSE(owner.isObserved(&a())) << byOwner;
    }
}

TEST_F(ViewTest, AWatcherOfNewObjectsHearsTheirChangesFromTheirArrivalOn)
{
    TracedView owner(trace, "owner"), watcher(trace, "watcher");
    watcher.observeNew();
    watcher.onAdded = [&] { owner.change(&a())->setValue(7); };
    owner.own(&a());
    EXPECT_THAT(trace.take(), Contains("watcher changed a: 0"));
}

TEST_F(ViewTest, AForgottenObjectIsNotHeardOfFromItsDepartureOn)
{
    TracedView owner(trace, "owner"), observer(trace, "observer");
    owner.own(&a());
    observer.observe(&a());
    trace.take();
    observer.onRemoved = [&] { PubSub::publish(Message::Types::Changed<Note>(&a(), &b())); };
    observer.forget(&a());
    EXPECT_THAT(trace.take(), Not(Contains("observer changed a: b=0")));
}

TEST_F(ViewTest, AnOwnerWhoseCallbackThrowsOnArrivalHasTheObjectAndNobodyKnowsIt)
{
    TracedView owner(trace, "owner"), watcher(trace, "watcher"), client(trace, "client");
    watcher.observeNew();
    client.observe(&a());
    trace.take();
    owner.onAdded = [] { throw std::runtime_error("owner"); };
    EXPECT_THROW(owner.own(&a()), std::runtime_error);
    EXPECT_TRUE(owner.isOwned(&a()));
    EXPECT_THAT(trace.take(), ElementsAre("owner added a=0"));
    EXPECT_FALSE(watcher.isObserved(&a()));
    client.change(&a())->setValue(1);
    client.remove(&a());
    EXPECT_EQ(a().value, 0);
    EXPECT_THAT(trace.take(), IsEmpty());
}

TEST_F(ViewTest, AMessageThatNamesNoObjectEntersNoTable)
{
    TracedView open(trace, "open"), watcher(trace, "watcher");
    open.processAddRequests();
    watcher.observeNew();
    PubSub::publish(Message::Types::Add<Note>(nullptr, nullptr));
    PubSub::publish(Message::Types::Added<Note>(nullptr));
    EXPECT_THAT(open.objects(), IsEmpty());
    EXPECT_THAT(watcher.objects(), IsEmpty());
    EXPECT_THAT(trace.take(), IsEmpty());
}

TEST_F(ViewTest, RemovingNullFromAnEmptyViewReachesNobody)
{
    TracedView owner(trace, "owner"), empty(trace, "empty");
    owner.own(&a());
    trace.take();
    empty.remove(nullptr);
    EXPECT_TRUE(owner.isOwned(&a()));
    EXPECT_THAT(trace.take(), IsEmpty());
}

} // namespace
