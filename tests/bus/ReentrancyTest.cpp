// SPDX-License-Identifier: Apache-2.0
#include "Listeners.h"

#include <deque>
#include <memory>
#include <optional>
#include <stdexcept>

namespace {

using namespace BusTests;
using PubSub::publish;
using testing::AnyOf;
using testing::Each;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;
using testing::UnorderedElementsAre;

class ReentrancyTest : public BusTest
{
protected:
    /// The order among subscribers is not defined, so every one of them does the same to all that follow.
    void makeThree()
    {
        for (const char* name : {"one", "two", "three"}) {
            three.emplace_back(heard, name).subscribe(&lamp);
        }
    }

    void eachDoes(const std::function<void()>& action)
    {
        for (LampListener& listener : three) {
            listener.then = action;
        }
    }

    std::deque<LampListener> three;
};

TEST_F(ReentrancyTest, WhoIsUnsubscribedBeforeItsTurnIsPassedOver)
{
    makeThree();
    eachDoes([this] {
        for (LampListener& listener : three) {
            listener.unsubscribe(&lamp);
        }
    });
    publish(Lit(&lamp));
    EXPECT_THAT(take(), SizeIs(1));
    publish(Lit(&lamp));
    EXPECT_THAT(take(), IsEmpty());
}

TEST_F(ReentrancyTest, WhoGivesUpAllObjectsBeforeItsTurnIsPassedOver)
{
    LampListener one(heard, "one"), two(heard, "two");
    one.subscribeAll<Lamp>();
    two.subscribeAll<Lamp>();
    one.then = [&] { two.unsubscribeAll<Lamp>(); };
    two.then = [&] { one.unsubscribeAll<Lamp>(); };
    publish(Lit(nullptr));
    EXPECT_THAT(take(), SizeIs(1));
}

TEST_F(ReentrancyTest, WhoLeavesAndComesBackBeforeItsTurnIsReached)
{
    makeThree();
    eachDoes([this] {
        for (LampListener& listener : three) {
            listener.unsubscribe(&lamp);
            listener.subscribe(&lamp);
        }
    });
    publish(Lit(&lamp));
    EXPECT_THAT(take(), UnorderedElementsAre("one", "two", "three"));
}

TEST_F(ReentrancyTest, WhoTurnsFromOneObjectToAllBeforeItsTurnIsReached)
{
    makeThree();
    eachDoes([this] {
        for (LampListener& listener : three) {
            listener.unsubscribe(&lamp);
            listener.subscribeAll<Lamp>();
        }
    });
    publish(Lit(&lamp));
    EXPECT_THAT(take(), UnorderedElementsAre("one", "two", "three"));
}

TEST_F(ReentrancyTest, WhoSubscribesMeanwhileIsNotReached)
{
    makeThree();
    LampListener late(heard, "late"), lateToAll(heard, "late to all");
    eachDoes([&] {
        late.subscribe(&lamp);
        lateToAll.subscribeAll<Lamp>();
    });
    publish(Lit(&lamp));
    EXPECT_THAT(take(), UnorderedElementsAre("one", "two", "three"));
    publish(Lit(&lamp));
    EXPECT_THAT(take(), UnorderedElementsAre("one", "two", "three", "late", "late to all"));
}

TEST_F(ReentrancyTest, WhoIsConstructedMeanwhileIsNotReached)
{
    makeThree();
    std::deque<LampListener> late;
    eachDoes([&] { late.emplace_back(heard, "late").subscribe(&lamp); });
    publish(Lit(&lamp));
    EXPECT_THAT(take(), UnorderedElementsAre("one", "two", "three"));
}

TEST_F(ReentrancyTest, TheFirstSubscriberMayMakeOthersWhoAreNotReached)
{
    LampListener only(heard, "only"), late(heard, "late");
    only.subscribe(&lamp);
    only.then = [&] { late.subscribe(&lamp); };
    publish(Lit(&lamp));
    EXPECT_THAT(take(), ElementsAre("only"));
}

TEST_F(ReentrancyTest, WhoEndsBeforeItsTurnIsPassedOver)
{
    auto one = std::make_unique<LampListener>(heard, "one");
    auto two = std::make_unique<LampListener>(heard, "two");
    one->subscribe(&lamp);
    two->subscribe(&lamp);
    one->then = [&] { two.reset(); };
    two->then = [&] { one.reset(); };
    publish(Lit(&lamp));
    EXPECT_THAT(take(), SizeIs(1));
}

TEST_F(ReentrancyTest, WhoIsBuiltWhereAnotherEndedIsNotTakenForIt)
{
    std::optional<LampListener> one, two;
    const auto rebuild = [&](std::optional<LampListener>& listener) {
        listener.reset();
        listener.emplace(heard, "new").subscribe(&lamp);
    };
    one.emplace(heard, "one").subscribe(&lamp);
    two.emplace(heard, "two").subscribe(&lamp);
    one->then = [&] { rebuild(two); };
    two->then = [&] { rebuild(one); };
    publish(Lit(&lamp));
    EXPECT_THAT(take(), ElementsAre(AnyOf("one", "two")));
    one->then = two->then = nullptr;
    publish(Lit(&lamp));
    EXPECT_THAT(take(), UnorderedElementsAre(AnyOf("one", "two"), "new"));
}

TEST_F(ReentrancyTest, ASubscriberMayEndInItsOwnHandler)
{
    std::vector<std::unique_ptr<LampListener>> listeners;
    for (std::size_t i = 0; i != 3; ++i) {
        listeners.push_back(std::make_unique<LampListener>(heard, std::to_string(i)));
        listeners.back()->subscribe(&lamp);
        listeners.back()->then = [&listeners, i] { listeners[i].reset(); };
    }
    publish(Lit(&lamp));
    EXPECT_THAT(take(), UnorderedElementsAre("0", "1", "2"));
    publish(Lit(&lamp));
    EXPECT_THAT(take(), IsEmpty());
}

TEST_F(ReentrancyTest, ASenderMayEndInAHandler)
{
    auto lampOnHeap = std::make_unique<Lamp>();
    LampListener one(heard, "one"), two(heard, "two");
    for (LampListener* listener : {&one, &two}) {
        listener->subscribe(lampOnHeap.get());
        listener->then = [&] { lampOnHeap.reset(); };
    }
    publish(Lit(lampOnHeap.get()));
    EXPECT_THAT(take(), UnorderedElementsAre("one", "two"));
}

TEST_F(ReentrancyTest, PublicationsNestAndEachHasItsOwnSnapshot)
{
    makeThree();
    std::deque<LampListener> ofOther;
    for (int i = 0; i != 50; ++i) {
        ofOther.emplace_back(heard, "other").subscribe(&other);
    }
    eachDoes([this] { publish(Lit(&other)); });
    publish(Lit(&lamp));
    const Heard reached = take();
    ASSERT_THAT(reached, SizeIs(3 * 51));
    for (const std::size_t turn : {0, 51, 102}) {
        EXPECT_NE(reached[turn], "other");
        EXPECT_THAT(Heard(reached.begin() + int(turn) + 1, reached.begin() + int(turn) + 51), Each("other"));
    }
    EXPECT_THAT(Heard({reached[0], reached[51], reached[102]}), UnorderedElementsAre("one", "two", "three"));
}

/// Each handler publishes again until the depth is reached: 3 + 9 + ... + 3^5 deliveries.
TEST_F(ReentrancyTest, PublicationsOfOneObjectNestDeeply)
{
    makeThree();
    int depth = 0;
    eachDoes([&] {
        if (depth < 4) {
            ++depth;
            publish(Lit(&lamp));
            --depth;
        }
    });
    publish(Lit(&lamp));
    EXPECT_THAT(heard, SizeIs(3 + 9 + 27 + 81 + 243));
}

/// The table of senders, the lists in it and the snapshots all move while they are in use.
TEST_F(ReentrancyTest, ThousandsOfObjectsMayComeAndGoInHandlers)
{
    makeThree();
    LampListener crowd(heard, "crowd");
    std::deque<Lamp> lamps(3000);
    std::deque<LampListener> ofOther;
    for (int i = 0; i != 500; ++i) {
        ofOther.emplace_back(heard, "other").subscribe(&other);
    }
    int turns = 0;
    eachDoes([&] {
        for (const Lamp& each : lamps) {
            crowd.subscribe(&each);
        }
        publish(Lit(&lamps.back()));
        // Once a publication to many has room it keeps it: only the first one makes the snapshots move.
        publish(Lit(&other));
        for (const Lamp& each : lamps) {
            crowd.unsubscribe(&each);
        }
        publish(Lit(&lamps.back()));
        ++turns;
    });
    publish(Lit(&lamp));
    EXPECT_EQ(turns, 3);
    Heard reached = take();
    ASSERT_THAT(reached, SizeIs(3 * 502));
    for (const std::size_t turn : {0, 502, 1004}) {
        EXPECT_THAT(reached[turn], AnyOf("one", "two", "three"));
        EXPECT_EQ(reached[turn + 1], "crowd");
        EXPECT_THAT(Heard(reached.begin() + int(turn) + 2, reached.begin() + int(turn) + 502), Each("other"));
    }
    EXPECT_THAT(Heard({reached[0], reached[502], reached[1004]}),
                UnorderedElementsAre("one", "two", "three"));
}

TEST_F(ReentrancyTest, WhoLeavesInANestedPublicationIsPassedOverInTheOuterOne)
{
    makeThree();
    LampListener inner(heard, "inner");
    inner.subscribe(&other);
    inner.then = [this] {
        for (LampListener& listener : three) {
            listener.unsubscribe(&lamp);
        }
    };
    eachDoes([this] { publish(Lit(&other)); });
    publish(Lit(&lamp));
    EXPECT_THAT(take(), ElementsAre(AnyOf("one", "two", "three"), "inner"));
}

TEST_F(ReentrancyTest, AnExceptionEndsThePublicationAndPassesThrough)
{
    makeThree();
    eachDoes([] { throw std::runtime_error("handler"); });
    EXPECT_THROW(publish(Lit(&lamp)), std::runtime_error);
    EXPECT_THAT(take(), SizeIs(1));
    eachDoes(nullptr);
    publish(Lit(&lamp));
    EXPECT_THAT(take(), UnorderedElementsAre("one", "two", "three"));
}

TEST_F(ReentrancyTest, AnExceptionInANestedPublicationLeavesTheOuterOneIntact)
{
    makeThree();
    LampListener inner(heard, "inner"), innerToo(heard, "inner");
    for (LampListener* listener : {&inner, &innerToo}) {
        listener->subscribe(&other);
        listener->then = [] { throw std::runtime_error("handler"); };
    }
    eachDoes([this] { EXPECT_THROW(publish(Lit(&other)), std::runtime_error); });
    publish(Lit(&lamp));
    EXPECT_THAT(take(), UnorderedElementsAre("one", "inner", "two", "inner", "three", "inner"));
}

TEST_F(ReentrancyTest, AssigningMeanwhileCountsAsLeavingAndSubscribing)
{
    makeThree();
    const LampListener ofNothing(heard, "nothing");
    LampListener late(heard, "late");
    eachDoes([&] {
        late = three.front();
        for (LampListener& listener : three) {
            listener.PubSub::Subscriber<Lit>::operator=(ofNothing);
        }
    });
    publish(Lit(&lamp));
    EXPECT_THAT(take(), SizeIs(1));
}

} // namespace
