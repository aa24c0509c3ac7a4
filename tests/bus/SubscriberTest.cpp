// SPDX-License-Identifier: Apache-2.0
#include "Listeners.h"

#include <memory>
#include <optional>

namespace {

using namespace BusTests;
using PubSub::publish;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::UnorderedElementsAre;

class SubscriberTest : public BusTest
{
protected:
    void publishEverything()
    {
        publish(Lit(&lamp));
        publish(Dimmed(&lamp));
        publish(Opened(&door));
    }
};

TEST_F(SubscriberTest, ACopyIsSubscribedToWhatTheOriginalIs)
{
    LampListener original(heard, "listener");
    original.subscribe(&lamp);
    const LampListener copy(original);
    EXPECT_TRUE(copy.isSubscribed(&lamp));
    publish(Lit(&lamp));
    EXPECT_THAT(heard, ElementsAre("listener", "listener"));
}

TEST_F(SubscriberTest, ACopyIsSubscribedToAllThatTheOriginalIsSubscribedTo)
{
    LampListener original(heard, "listener");
    original.subscribeAll<Lamp>();
    const LampListener copy(original);
    EXPECT_TRUE(copy.isSubscribedAll<Lamp>());
    publish(Lit(nullptr));
    EXPECT_THAT(heard, ElementsAre("listener", "listener"));
}

TEST_F(SubscriberTest, ACopyGoesItsOwnWay)
{
    std::optional<LampListener> original(std::in_place, heard, "listener");
    original->subscribe(&lamp);
    LampListener copy(*original);
    copy.subscribe(&other);
    publish(Lit(&other));
    EXPECT_THAT(take(), ElementsAre("listener"));
    original->unsubscribe(&lamp);
    publish(Lit(&lamp));
    EXPECT_THAT(take(), ElementsAre("listener"));
    original.reset();
    publish(Lit(&lamp));
    EXPECT_THAT(take(), ElementsAre("listener"));
}

TEST_F(SubscriberTest, AnEndedCopyIsNotReached)
{
    LampListener original(heard, "listener");
    original.subscribe(&lamp);
    {
        const LampListener copy(original);
    }
    publish(Lit(&lamp));
    EXPECT_THAT(heard, ElementsAre("listener"));
}

TEST_F(SubscriberTest, ACopyReceivesAllMessageTypesOfTheOriginal)
{
    std::optional<HouseListener> original(std::in_place, heard);
    original->subscribe(&lamp);
    original->subscribeAll<Door>();
    HouseListener copy(*original);
    original.reset();
    publishEverything();
    EXPECT_THAT(take(), ElementsAre("house lit", "house dimmed", "house opened"));
    copy.unsubscribe(&lamp);
    publishEverything();
    EXPECT_THAT(take(), ElementsAre("house opened"));
}

/// Receives one more message type than its base.
class WiderListener : public LampListener, public PubSub::Subscriber<Dimmed>
{
public:
    using LampListener::LampListener;
    using LampListener::notify;

    void notify(const Dimmed&) override { ++dimmings; }

    int dimmings = 0;
};

TEST_F(SubscriberTest, ASlicedCopyReceivesWhatItsOwnTypeReceives)
{
    std::optional<WiderListener> whole(std::in_place, heard, "listener");
    whole->subscribe(&lamp);
    const LampListener slice(*whole);
    whole.reset();
    publishEverything();
    EXPECT_THAT(take(), ElementsAre("listener"));
}

TEST_F(SubscriberTest, ACopyOfTheBareBaseHoldsSubscriptionsAndReceivesNothing)
{
    HouseListener house(heard);
    house.subscribe(&lamp);
    PubSub::Details::SubscriberBase bare(house);
    EXPECT_TRUE(bare.isSubscribed(&lamp));
    bare.subscribe(&door);
    bare.unsubscribe(&lamp);
    publishEverything();
    EXPECT_THAT(heard, ElementsAre("house lit", "house dimmed"));
}

TEST_F(SubscriberTest, AnAssignmentReplacesTheSubscriptions)
{
    HouseListener from(heard, "from"), to(heard, "to");
    from.subscribe(&door);
    from.subscribeAll<Lamp>();
    to.subscribe(&lamp);
    to.subscribeAll<Door>();
    to.PubSub::Subscriber<Lit, Dimmed, Opened>::operator=(from);
    EXPECT_FALSE(to.isSubscribed(&lamp));
    EXPECT_TRUE(to.isSubscribed(&door));
    EXPECT_TRUE(to.isSubscribedAll<Lamp>());
    EXPECT_FALSE(to.isSubscribedAll<Door>());
    from.unsubscribe(&door);
    from.unsubscribeAll<Lamp>();
    publish(Lit(&other));
    publish(Opened(&door));
    publish(Opened(nullptr));
    EXPECT_THAT(take(), ElementsAre("to lit", "to opened"));
}

TEST_F(SubscriberTest, AnAssignmentToItselfChangesNothing)
{
    HouseListener house(heard);
    house.subscribe(&lamp);
    house.subscribeAll<Door>();
    const HouseListener& itself = house;
    house = itself;
    publishEverything();
    EXPECT_THAT(take(), ElementsAre("house lit", "house dimmed", "house opened"));
}

TEST_F(SubscriberTest, CopiesOfCopiesComeOutRight)
{
    auto first = std::make_unique<HouseListener>(heard, "a");
    first->subscribe(&lamp);
    auto second = std::make_unique<HouseListener>(*first);
    auto third = std::make_unique<HouseListener>(*second);
    second.reset();
    *third = *first;
    first.reset();
    publish(Lit(&lamp));
    EXPECT_THAT(take(), ElementsAre("a lit"));
    third.reset();
    publish(Lit(&lamp));
    EXPECT_THAT(take(), IsEmpty());
}

} // namespace
