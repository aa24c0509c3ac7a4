// SPDX-License-Identifier: Apache-2.0
#include "Listeners.h"

#include <EditorModel/bus/View.h>

#include <cstdlib>
#include <deque>
#include <limits>
#include <memory>
#include <new>
#include <type_traits>

namespace {
thread_local std::size_t allocations = 0;
/// How many more succeed.
thread_local std::size_t budget = std::numeric_limits<std::size_t>::max();
} // namespace

// Counts the allocations of the whole program, those of the library included.
void* operator new(std::size_t size)
{
    ++allocations;
    if (budget == 0) {
        throw std::bad_alloc();
    }
    --budget;
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

/// The program's allocations fail after so many, for the life of this.
class Shortage
{
public:
    explicit Shortage(std::size_t left) { budget = left; }
    Shortage(const Shortage&) = delete;
    Shortage& operator=(const Shortage&) = delete;
    ~Shortage() { budget = std::numeric_limits<std::size_t>::max(); }
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

TEST_F(AllocationTest, UnsubscribingNeedsNoMemory)
{
    std::deque<Lamp> lamps(200);
    Counter counter;
    for (const Lamp& each : lamps) {
        counter.subscribe(&each);
    }
    {
        const Shortage shortage(0);
        for (const Lamp& each : lamps) {
            EXPECT_NO_THROW(counter.unsubscribe(&each));
        }
    }
    for (const Lamp& each : lamps) {
        publish(Lit(&each));
    }
    EXPECT_EQ(counter.reached, 0);
}

TEST_F(AllocationTest, LeavingAnObjectOfManySubscribersNeedsNoMemory)
{
    std::deque<Counter> counters(200);
    for (Counter& counter : counters) {
        counter.subscribe(&lamp);
        counter.subscribeAll<Lamp>();
    }
    {
        const Shortage shortage(0);
        for (Counter& counter : counters) {
            EXPECT_NO_THROW(counter.unsubscribe(&lamp));
            EXPECT_NO_THROW(counter.unsubscribeAll<Lamp>());
        }
    }
    publish(Lit(&lamp));
    for (const Counter& counter : counters) {
        EXPECT_EQ(counter.reached, 0);
    }
}

/// Counts in a place that outlives it.
class Passer : public PubSub::Subscriber<Lit>
{
public:
    explicit Passer(int& reached) : m_reached(reached) {}
    void notify(const Lit&) override { ++m_reached; }

private:
    int& m_reached;
};

TEST_F(AllocationTest, ASubscriberThatEndsWithoutMemoryIsNotReached)
{
    int reached = 0;
    std::deque<Lamp> lamps(200);
    std::vector<std::unique_ptr<Passer>> subscribers;
    for (int i = 0; i != 200; ++i) {
        subscribers.push_back(std::make_unique<Passer>(reached));
        for (const Lamp& each : lamps) {
            subscribers.back()->subscribe(&each);
        }
        subscribers.back()->subscribeAll<Lamp>();
    }
    {
        const Shortage shortage(0);
        subscribers.clear();
    }
    for (const Lamp& each : lamps) {
        publish(Lit(&each));
    }
    EXPECT_EQ(reached, 0);
}

TEST_F(AllocationTest, ASubscriptionThatFailsLeavesNone)
{
    struct Unheard : PubSub::Message<Lamp>
    {
        using Message::Message;
    };
    struct Both : PubSub::Subscriber<Unheard, Lit>
    {
        void notify(const Unheard&) override { ++reached; }
        void notify(const Lit&) override { ++reached; }
        int reached = 0;
    };
    Both both;
    for (std::size_t left = 0; !both.isSubscribedAll<Lamp>(); ++left) {
        ASSERT_LT(left, 100u);
        bool failed = false;
        {
            const Shortage shortage(left);
            try {
                both.subscribeAll<Lamp>();
            } catch (const std::bad_alloc&) {
                failed = true;
            }
        }
        ASSERT_EQ(both.isSubscribedAll<Lamp>(), !failed);
        both.reached = 0;
        publish(Unheard(&lamp));
        publish(Lit(&lamp));
        ASSERT_EQ(both.reached, failed ? 0 : 2);
    }
}

// A change for which the memory runs out

/// A deque of the GNU library allocates where it is made from another, also by a move.
struct Album : virtual PubSub::Object
{
    std::deque<int> pages;
    std::string title;
};

static_assert(std::is_nothrow_move_assignable_v<Album>);

const std::string before = "a title that is too long to lie within the string";
const std::string after = "another title that is too long to lie within it";

/// What the album is after a change in which so many allocations succeed; true if the change was done.
bool changes(Album& album, Message::View<Album>& view, std::size_t left)
{
    album.pages = {1, 2, 3};
    album.title = before;
    try {
        auto chain = view.change(&album);
        chain->pages = {4};
        chain->title = after;
        budget = left;
    } catch (const std::bad_alloc&) {
        budget = std::numeric_limits<std::size_t>::max();
        return false;
    }
    budget = std::numeric_limits<std::size_t>::max();
    return true;
}

void expectAllOrNothing(Album& album, Message::View<Album>& view)
{
    changes(album, view, 1000); // makes the tables of the messages
    std::size_t left = 0;
    while (!changes(album, view, left)) {
        EXPECT_EQ(album.pages, (std::deque<int>{1, 2, 3})) << left;
        EXPECT_EQ(album.title, before) << left;
        ASSERT_LT(++left, 100u);
    }
    EXPECT_GT(left, 0u);
    EXPECT_EQ(album.pages, std::deque<int>{4});
    EXPECT_EQ(album.title, after);
}

TEST_F(AllocationTest, AnOwnersChangeThatFailsLeavesTheObjectWhole)
{
    Album album;
    Message::View<Album> owner;
    owner.own(&album);
    expectAllOrNothing(album, owner);
}

TEST_F(AllocationTest, ARequestedChangeThatFailsLeavesTheObjectWhole)
{
    Album album;
    Message::View<Album> owner, client;
    owner.own(&album);
    client.observe(&album);
    expectAllOrNothing(album, client);
}

} // namespace
