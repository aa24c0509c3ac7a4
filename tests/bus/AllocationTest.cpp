// SPDX-License-Identifier: Apache-2.0
#include "Listeners.h"

#include <cstdlib>
#include <deque>
#include <new>

namespace {
thread_local std::size_t allocations = 0;
}

// Counts the allocations of the whole program, those of the library included.
void* operator new(std::size_t size)
{
    ++allocations;
    if (void* memory = std::malloc(size ? size : 1)) {
        return memory;
    }
    throw std::bad_alloc();
}

void operator delete(void* memory) noexcept
{
    std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept
{
    std::free(memory);
}

namespace {

using namespace BusTests;
using PubSub::publish;

class Counter : public PubSub::Subscriber<Lit, Dimmed>
{
public:
    void notify(const Lit&) override
    {
        ++reached;
        if (nested) {
            publish(Dimmed(nested));
        }
    }
    void notify(const Dimmed&) override { ++reached; }

    const Lamp* nested = nullptr;
    int reached = 0;
};

class AllocationTest : public BusTest
{
protected:
    template <typename Action>
    static std::size_t allocationsOf(Action action)
    {
        const std::size_t before = allocations;
        action();
        return allocations - before;
    }
};

TEST_F(AllocationTest, APublicationThatReachesNobodyAllocatesNothing)
{
    struct Fresh : PubSub::Message<Lamp>
    {
        using Message::Message;
    };
    publish(Fresh(&lamp)); // the table of the message type
    EXPECT_EQ(allocationsOf([this] { publish(Fresh(&lamp)); }), 0u);
    Counter stranger;
    stranger.subscribe(&other);
    publish(Lit(&lamp));
    EXPECT_EQ(allocationsOf([this] { publish(Lit(&lamp)); }), 0u);
}

TEST_F(AllocationTest, APublicationAllocatesNothingOnceItsArenaHasGrown)
{
    std::deque<Counter> counters(10);
    for (Counter& counter : counters) {
        counter.subscribe(&lamp);
        counter.subscribe(&other);
        counter.nested = &other;
    }
    publish(Lit(&lamp));
    EXPECT_EQ(allocationsOf([this] { publish(Lit(&lamp)); }), 0u);
    EXPECT_EQ(counters.front().reached, 2 * (1 + 10));
}

TEST_F(AllocationTest, SubscribingAgainAllocatesNothing)
{
    Counter counter;
    const auto comeAndGo = [&] {
        counter.subscribe(&lamp);
        counter.subscribe(&other);
        counter.subscribeAll<Lamp>();
        counter.unsubscribe(&lamp);
        counter.unsubscribe(&other);
        counter.unsubscribeAll<Lamp>();
    };
    comeAndGo();
    EXPECT_EQ(allocationsOf(comeAndGo), 0u);
}

} // namespace
