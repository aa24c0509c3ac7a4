// SPDX-License-Identifier: Apache-2.0
#include "DispatcherProbe.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <deque>
#include <optional>
#include <random>
#include <set>
#include <string>
#include <vector>

// Drives the bus at random, from outside and from inside of handlers, beside a plain model of who is
// subscribed to what. The model says at every delivery whose turn it is, and at the end of every publication
// that nobody was left out.

namespace {

struct Lamp : virtual PubSub::Object
{};

struct Lit : PubSub::Message<Lamp>
{
    using Message::Message;
};

struct Dimmed : PubSub::Message<Lamp>
{
    using Message::Message;
};

class Walk;

/// A subscriber knows its place and which one it is of all that lived there; copies are told after they are
/// made.
struct Identity
{
    Walk* walk = nullptr;
    std::size_t place = 0;
    int life = 0;
};

class Narrow : public PubSub::Subscriber<Lit>
{
public:
    Narrow() = default;
    Narrow(const Narrow& other) : PubSub::Details::SubscriberBase(other), Details(other), Subscriber(other) {}
    Narrow& operator=(const Narrow& other)
    {
        Subscriber::operator=(other);
        return *this;
    }
    void notify(const Lit& message) override;

    Identity identity;

private:
    using Details = PubSub::Details::Subscriber<Lit>;
};

class Wide : public PubSub::Subscriber<Lit, Dimmed>
{
public:
    void notify(const Lit& message) override;
    void notify(const Dimmed& message) override;

    Identity identity;
};

/// What ends publications early.
struct Interruption
{};

class Walk
{
public:
    Walk(unsigned seed, long steps) : m_random(seed), m_steps(steps) {}

    void run()
    {
        while (m_steps > 0 && m_error.empty()) {
            try {
                step();
            } catch (const Interruption&) {
                // A handler at the outermost level threw.
            }
        }
    }

    template <typename M>
    void delivered(const Identity& identity, const M& message);

    const std::string& error() const { return m_error; }
    long deliveries() const { return m_deliveries; }
    int deepest() const { return m_deepest; }

private:
    static constexpr std::size_t places = 14;
    static constexpr std::size_t lamps = 5;
    static constexpr int maximalDepth = 6;

    struct Model
    {
        int life = 0; ///< 0 where nobody lives
        bool toAll = false;
        std::set<const Lamp*> lamps;
    };

    struct Turn
    {
        std::size_t place;
        int life;
    };

    struct Running
    {
        const void* message;
        const Lamp* sender;
        std::vector<Turn> turns;
        std::size_t next = 0;
    };

    /// Every third place is for a subscriber of one message type, the others for one of two.
    static bool isNarrow(std::size_t place) { return place % 3 == 0; }

    PubSub::Details::SubscriberBase& subscriber(std::size_t place)
    {
        return isNarrow(place) ? static_cast<PubSub::Details::SubscriberBase&>(*m_narrow[place])
                               : static_cast<PubSub::Details::SubscriberBase&>(*m_wide[place]);
    }

    std::size_t below(std::size_t bound) { return m_random() % bound; }
    bool lives(std::size_t place) const { return m_models[place].life != 0; }

    bool isDue(const Turn& turn, const Lamp* sender) const
    {
        const Model& model = m_models[turn.place];
        return model.life == turn.life && (model.toAll || (sender && model.lamps.count(sender)));
    }

    void fail(const std::string& error)
    {
        if (m_error.empty()) {
            m_error = error + ", " + std::to_string(m_steps) + " steps before the end";
        }
    }

    void step();
    void change(std::size_t place, const Lamp* lamp, std::size_t action);
    void begin(std::size_t place, std::optional<std::size_t> original);
    void end(std::size_t place);
    void assign(std::size_t to, std::size_t from);
    template <typename M>
    void publish(const Lamp* sender);
    template <typename M>
    void expectTurns(const M& message, Running& running);
    template <typename M>
    std::optional<Turn> holder(const void* address);

    std::mt19937 m_random;
    long m_steps;
    long m_deliveries = 0;
    int m_depth = 0;
    int m_deepest = 0;
    int m_lives = 0;
    std::array<Lamp, lamps> m_lamps;
    std::array<Model, places> m_models;
    std::array<std::optional<Narrow>, places> m_narrow;
    std::array<std::optional<Wide>, places> m_wide;
    std::vector<Running*> m_running;
    std::string m_error;
};

void Narrow::notify(const Lit& message)
{
    identity.walk->delivered(Identity(identity), message);
}

void Wide::notify(const Lit& message)
{
    identity.walk->delivered(Identity(identity), message);
}

void Wide::notify(const Dimmed& message)
{
    identity.walk->delivered(Identity(identity), message);
}

/// One random action. Those of several depths are mixed: a handler takes steps too.
void Walk::step()
{
    --m_steps;
    const std::size_t place = below(places);
    const std::size_t lamp = below(lamps + 1);
    const Lamp* sender = lamp == lamps ? nullptr : &m_lamps[lamp];
    const std::size_t action = below(100);
    if (action < 25) {
        below(2) ? publish<Lit>(sender) : publish<Dimmed>(sender);
    } else if (lives(place)) {
        change(place, sender, action);
    } else {
        const std::size_t original = below(places);
        const bool copies = action < 50 && lives(original) && isNarrow(original) == isNarrow(place);
        begin(place, copies ? std::optional<std::size_t>(original) : std::nullopt);
    }
}

void Walk::change(std::size_t place, const Lamp* lamp, std::size_t action)
{
    Model& model = m_models[place];
    if (action < 55) {
        subscriber(place).subscribe(lamp);
        if (lamp) {
            model.lamps.insert(lamp);
        }
    } else if (action < 73) {
        subscriber(place).unsubscribe(lamp);
        model.lamps.erase(lamp);
    } else if (action < 78) {
        subscriber(place).subscribeAll<Lamp>();
        model.toAll = true;
    } else if (action < 86) {
        subscriber(place).unsubscribeAll<Lamp>();
        model.toAll = false;
    } else if (action < 94) {
        end(place);
    } else {
        assign(place, below(places));
    }
    if (lives(place) && lamp && subscriber(place).isSubscribed(lamp) != (model.lamps.count(lamp) == 1)) {
        fail("isSubscribed() differs from the model");
    }
}

void Walk::begin(std::size_t place, std::optional<std::size_t> original)
{
    Model& model = m_models[place];
    model = original ? m_models[*original] : Model();
    model.life = ++m_lives;
    const Identity identity{this, place, model.life};
    if (isNarrow(place)) {
        original ? m_narrow[place].emplace(*m_narrow[*original]) : m_narrow[place].emplace();
        m_narrow[place]->identity = identity;
    } else {
        original ? m_wide[place].emplace(*m_wide[*original]) : m_wide[place].emplace();
        m_wide[place]->identity = identity;
    }
}

void Walk::end(std::size_t place)
{
    m_models[place] = Model();
    m_narrow[place].reset();
    m_wide[place].reset();
}

void Walk::assign(std::size_t to, std::size_t from)
{
    if (!lives(from)) {
        return;
    }
    subscriber(to) = subscriber(from);
    const int life = m_models[to].life;
    m_models[to] = Model(m_models[from]);
    m_models[to].life = life;
}

template <typename M>
void Walk::publish(const Lamp* sender)
{
    const M message(sender);
    Running running{&message, sender, {}};
    expectTurns(message, running);
    m_running.push_back(&running);
    m_deepest = std::max(m_deepest, ++m_depth);
    bool interrupted = false;
    try {
        PubSub::publish(message);
    } catch (const Interruption&) {
        interrupted = true;
    }
    --m_depth;
    m_running.pop_back();
    for (std::size_t i = running.next; !interrupted && i != running.turns.size(); ++i) {
        if (isDue(running.turns[i], sender)) {
            fail("somebody was left out");
        }
    }
    if (interrupted && m_depth > 0 && below(2)) {
        throw Interruption();
    }
}

/// Holds the dispatcher's list, whose order is its own affair, against the model.
template <typename M>
void Walk::expectTurns(const M& message, Running& running)
{
    for (void* address : PubSub::Details::DispatcherProbe::subscribers<M, Lamp>(message, running.sender)) {
        const std::optional<Turn> turn = holder<M>(address);
        if (!turn || !isDue(*turn, running.sender)) {
            return fail("somebody is listed who is not subscribed");
        }
        running.turns.push_back(*turn);
    }
    std::size_t due = 0;
    for (std::size_t place = 0; place != places; ++place) {
        const bool receives = std::is_same_v<M, Lit> || !isNarrow(place);
        due += lives(place) && receives && isDue({place, m_models[place].life}, running.sender);
    }
    std::set<std::size_t> listed;
    for (const Turn& turn : running.turns) {
        listed.insert(turn.place);
    }
    if (running.turns.size() != due || listed.size() != due) {
        fail("somebody is listed twice or not at all");
    }
}

template <typename M>
std::optional<Walk::Turn> Walk::holder(const void* address)
{
    using Receiver = PubSub::Details::Subscriber<M>;
    for (std::size_t place = 0; place != places; ++place) {
        if (!lives(place)) {
            continue;
        }
        const Receiver* receiver = nullptr;
        if (!isNarrow(place)) {
            receiver = &*m_wide[place];
        } else if constexpr (std::is_same_v<M, Lit>) {
            receiver = &*m_narrow[place];
        }
        if (receiver == address) {
            return Turn{place, m_models[place].life};
        }
    }
    return std::nullopt;
}

template <typename M>
void Walk::delivered(const Identity& identity, const M& message)
{
    ++m_deliveries;
    Running& running = *m_running.back();
    while (running.next != running.turns.size() && !isDue(running.turns[running.next], running.sender)) {
        ++running.next;
    }
    if (running.message != &message) {
        return fail("the message of another publication was delivered");
    }
    if (running.next == running.turns.size()) {
        return fail("somebody was reached who was not in the snapshot, or is not subscribed any more");
    }
    const Turn turn = running.turns[running.next++];
    if (turn.place != identity.place || turn.life != identity.life) {
        return fail("somebody was reached out of turn");
    }
    for (std::size_t steps = below(4); steps > 0 && m_steps > 0 && m_depth < maximalDepth; --steps) {
        step();
    }
    if (below(200) == 0) {
        throw Interruption();
    }
}

class BusWalk : public testing::TestWithParam<unsigned>
{};

TEST_P(BusWalk, DeliversWhatThePlainModelSays)
{
    Walk walk(GetParam(), 250'000);
    walk.run();
    EXPECT_EQ(walk.error(), "");
    EXPECT_GT(walk.deliveries(), 100'000);
    EXPECT_EQ(walk.deepest(), 6);
}

INSTANTIATE_TEST_SUITE_P(Seeds, BusWalk, testing::Values(1u, 2u, 3u, 4u));

} // namespace
