// SPDX-License-Identifier: Apache-2.0
#include "DispatcherProbe.h"
#include "Listeners.h"

#include <deque>
#include <memory>
#include <thread>

namespace {

using namespace BusTests;
using PubSub::publish;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;
using testing::UnorderedElementsAre;

class PublicationTest : public BusTest
{};

TEST_F(PublicationTest, ReachesOnlyTheSubscribersOfItsSender)
{
    LampListener one(heard, "one"), two(heard, "two"), stranger(heard, "stranger");
    one.subscribe(&lamp);
    two.subscribe(&lamp);
    stranger.subscribe(&other);
    publish(Lit(&lamp));
    EXPECT_THAT(heard, UnorderedElementsAre("one", "two"));
}

TEST_F(PublicationTest, ReachesOnlyTheSubscribersOfItsMessageType)
{
    LampListener listener(heard, "lit");
    listener.subscribe(&lamp);
    publish(Dimmed(&lamp));
    EXPECT_THAT(heard, IsEmpty());
    publish(Lit(&lamp));
    EXPECT_THAT(heard, ElementsAre("lit"));
}

TEST_F(PublicationTest, WithoutAnySubscriberIsNoError)
{
    struct Unheard : PubSub::Message<Lamp>
    {
        using Message::Message;
    };
    publish(Unheard(&lamp));
    publish(Unheard(nullptr));
    publish(Lit(&lamp));
    EXPECT_THAT(heard, IsEmpty());
}

TEST_F(PublicationTest, ReachesWhoSubscribedToAllObjectsOfTheType)
{
    LampListener all(heard, "all");
    all.subscribeAll<Lamp>();
    EXPECT_TRUE(all.isSubscribedAll<Lamp>());
    EXPECT_FALSE(all.isSubscribedAll<Door>());
    EXPECT_FALSE(all.isSubscribed(&lamp));
    publish(Lit(&lamp));
    const Lamp future;
    publish(Lit(&future));
    EXPECT_THAT(take(), ElementsAre("all", "all"));
    all.unsubscribeAll<Lamp>();
    publish(Lit(&lamp));
    EXPECT_THAT(heard, IsEmpty());
}

TEST_F(PublicationTest, WithANullSenderReachesOnlyWhoSubscribedToAll)
{
    LampListener all(heard, "all"), one(heard, "one"), null(heard, "null");
    all.subscribeAll<Lamp>();
    one.subscribe(&lamp);
    null.subscribe(nullptr);
    EXPECT_FALSE(null.isSubscribed(nullptr));
    publish(Lit(nullptr));
    EXPECT_THAT(heard, ElementsAre("all"));
}

TEST_F(PublicationTest, ReachesWhoSubscribedToAllOfItsOwnTypeOnly)
{
    HouseListener house(heard);
    house.subscribeAll<Door>();
    publish(Lit(&lamp));
    EXPECT_THAT(take(), IsEmpty());
    publish(Opened(&door));
    EXPECT_THAT(take(), ElementsAre("house opened"));
}

TEST_F(PublicationTest, ReachesOnceWhoSubscribedInBothWays)
{
    LampListener both(heard, "both"), all(heard, "all"), one(heard, "one");
    both.subscribe(&lamp);
    both.subscribeAll<Lamp>();
    publish(Lit(&lamp));
    EXPECT_THAT(take(), ElementsAre("both"));
    all.subscribeAll<Lamp>();
    one.subscribe(&lamp);
    publish(Lit(&lamp));
    EXPECT_THAT(take(), UnorderedElementsAre("both", "all", "one"));
}

TEST_F(PublicationTest, EndingOneOfTwoSubscriptionsLeavesTheOther)
{
    LampListener both(heard, "both");
    both.subscribe(&lamp);
    both.subscribeAll<Lamp>();
    both.unsubscribeAll<Lamp>();
    publish(Lit(&lamp));
    EXPECT_THAT(take(), ElementsAre("both"));
    both.subscribeAll<Lamp>();
    both.unsubscribe(&lamp);
    publish(Lit(&lamp));
    EXPECT_THAT(take(), ElementsAre("both"));
}

TEST_F(PublicationTest, SubscriptionsAreNotCounted)
{
    LampListener listener(heard, "listener");
    listener.subscribe(&lamp);
    listener.subscribe(&lamp);
    listener.subscribeAll<Lamp>();
    listener.subscribeAll<Lamp>();
    publish(Lit(&lamp));
    EXPECT_THAT(take(), ElementsAre("listener"));
    listener.unsubscribe(&lamp);
    listener.unsubscribeAll<Lamp>();
    EXPECT_FALSE(listener.isSubscribed(&lamp));
    listener.unsubscribe(&lamp);
    publish(Lit(&lamp));
    EXPECT_THAT(take(), IsEmpty());
}

TEST_F(PublicationTest, OneSetOfSubscriptionsServesAllMessageTypes)
{
    HouseListener house(heard);
    house.subscribe(&lamp);
    house.subscribe(&door);
    publish(Lit(&lamp));
    publish(Dimmed(&lamp));
    publish(Opened(&door));
    EXPECT_THAT(take(), ElementsAre("house lit", "house dimmed", "house opened"));
    house.unsubscribe(&lamp);
    publish(Lit(&lamp));
    publish(Dimmed(&lamp));
    publish(Opened(&door));
    EXPECT_THAT(take(), ElementsAre("house opened"));
}

TEST_F(PublicationTest, AboutATypeThatCannotBeSubscribedToGoesOutWithANullSender)
{
    Listener<Forecast> listener(heard, "listener");
    const Weather weather;
    publish(Forecast(&weather));
    EXPECT_THAT(take(), IsEmpty());
    listener.subscribeAll<Weather>();
    publish(Forecast(&weather));
    EXPECT_THAT(take(), ElementsAre("listener"));
}

TEST_F(PublicationTest, KnowsASenderByTheAddressOfItsObjectBase)
{
    struct Appliance : virtual PubSub::Object
    {
        int watts = 0;
    };
    struct Fixture : Appliance, Lamp
    {};
    const Fixture fixture;
    LampListener listener(heard, "listener");
    listener.subscribe(static_cast<const Appliance*>(&fixture));
    publish(Lit(&fixture));
    EXPECT_THAT(heard, ElementsAre("listener"));
}

TEST_F(PublicationTest, AnEndedSubscriberIsNotReached)
{
    auto listener = std::make_unique<LampListener>(heard, "listener");
    listener->subscribe(&lamp);
    listener->subscribeAll<Lamp>();
    listener.reset();
    publish(Lit(&lamp));
    EXPECT_THAT(heard, IsEmpty());
}

TEST_F(PublicationTest, ManySubscribersOfOneObjectComeAndGoInAnyOrder)
{
    std::deque<LampListener> listeners;
    for (int i = 0; i != 100; ++i) {
        listeners.emplace_back(heard, std::to_string(i)).subscribe(&lamp);
    }
    publish(Lit(&lamp));
    EXPECT_THAT(take(), SizeIs(100));
    for (std::size_t i = 0; i != 100; ++i) {
        listeners[i * 37 % 100].unsubscribe(&lamp);
        publish(Lit(&lamp));
        const Heard reached = take();
        ASSERT_THAT(reached, SizeIs(99 - i));
        for (std::size_t gone = 0; gone <= i; ++gone) {
            ASSERT_THAT(reached, testing::Not(testing::Contains(std::to_string(gone * 37 % 100))));
        }
    }
}

TEST_F(PublicationTest, TheCopyOfASenderIsAnotherSender)
{
    LampListener listener(heard, "listener");
    listener.subscribe(&lamp);
    const Lamp copy(lamp);
    publish(Lit(&copy));
    EXPECT_THAT(take(), IsEmpty());
    lamp = other;
    publish(Lit(&lamp));
    EXPECT_THAT(take(), ElementsAre("listener"));
}

TEST_F(PublicationTest, CopiesOfMessagesKeepTheirSender)
{
    const Lit message(&lamp);
    Lit copy(message), assigned(nullptr);
    assigned = message;
    EXPECT_EQ(copy.sender, &lamp);
    EXPECT_EQ(assigned.sender, &lamp);
}

TEST_F(PublicationTest, TheDispatcherListsTheSubscribersOfASender)
{
    LampListener one(heard, "one"), two(heard, "two"), all(heard, "all"), stranger(heard, "stranger");
    one.subscribe(&lamp);
    two.subscribe(&lamp);
    all.subscribeAll<Lamp>();
    stranger.subscribe(&other);
    const auto address = [](LampListener& listener) {
        return static_cast<void*>(static_cast<PubSub::Details::Subscriber<Lit>*>(&listener));
    };
    using PubSub::Details::DispatcherProbe;
    const auto ofLamp = DispatcherProbe::subscribers<Lit, Lamp>(Lit(&lamp), &lamp);
    EXPECT_THAT(ofLamp, UnorderedElementsAre(address(one), address(two), address(all)));
    const auto ofNull = DispatcherProbe::subscribers<Lit, Lamp>(Lit(nullptr), nullptr);
    EXPECT_THAT(ofNull, ElementsAre(address(all)));
    EXPECT_THAT((DispatcherProbe::subscribers<Dimmed, Lamp>(Dimmed(&lamp), &lamp)), IsEmpty());
    EXPECT_THAT(heard, IsEmpty());
    publish(Lit(&lamp));
    EXPECT_THAT(heard, SizeIs(3));
}

// Two message types on two threads share nothing; the thread sanitizer looks at this one.
TEST_F(PublicationTest, TwoMessageTypesMayBeUsedOnTwoThreads)
{
    const auto use = [](auto listeners, auto& sender, auto message, Heard& reached) {
        for (int round = 0; round != 200; ++round) {
            decltype(listeners) few;
            for (int i = 0; i != 5; ++i) {
                few.emplace_back(reached, "x").subscribe(&sender);
            }
            publish(message);
        }
    };
    Heard doors;
    std::thread thread([&] { use(std::deque<Listener<Opened>>(), door, Opened(&door), doors); });
    use(std::deque<LampListener>(), lamp, Lit(&lamp), heard);
    thread.join();
    EXPECT_THAT(heard, SizeIs(1000));
    EXPECT_THAT(doors, SizeIs(1000));
}

struct Woken : PubSub::Message<Lamp>
{
    using Message::Message;
};

int wakings = 0;

/// Subscribes and publishes before main(), in whichever order the sources are initialised.
class EarlyBird : public PubSub::Subscriber<Woken>
{
public:
    EarlyBird()
    {
        subscribe(&lamp);
        publish(Woken(&lamp));
    }

    void notify(const Woken&) override { ++wakings; }

    Lamp lamp;
};

EarlyBird earlyBird;

TEST(Bus, WorksDuringStaticInitialisation)
{
    EXPECT_EQ(wakings, 1);
    publish(Woken(&earlyBird.lamp));
    EXPECT_EQ(wakings, 2);
    wakings = 1;
}

} // namespace
