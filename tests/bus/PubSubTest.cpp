// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/bus/PubSub.h>

#include <gmock/gmock.h>

#include <functional>
#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::UnorderedElementsAre;

struct Lamp : virtual PubSub::Object
{};

struct Door : virtual PubSub::Object
{};

struct Opaque
{};

struct Lit : PubSub::Message<Lamp>
{
    using Message::Message;
};

struct Dimmed : PubSub::Message<Lamp>
{
    using Message::Message;
};

struct Opened : PubSub::Message<Door>
{
    using Message::Message;
};

struct Touched : PubSub::Message<Opaque>
{
    using Message::Message;
};

using Trace = std::vector<std::string>;

/// Writes what reaches it into the trace, then does what it is told.
template <typename... M>
class Listener;

template <typename M>
class Listener<M> : public PubSub::Subscriber<M>
{
public:
    Listener(Trace& trace, std::string name) : m_trace(&trace), m_name(std::move(name)) {}

    void notify(const M&) override
    {
        m_trace->push_back(m_name);
        if (then) {
            const auto act = then;
            act();
        }
    }

    std::function<void()> then;

private:
    Trace* m_trace;
    std::string m_name;
};

using LitListener = Listener<Lit>;

class LampAndDoor : public PubSub::Subscriber<Lit, Dimmed, Opened>
{
public:
    explicit LampAndDoor(Trace& trace) : m_trace(&trace) {}

    void notify(const Lit&) override { m_trace->push_back("lit"); }
    void notify(const Dimmed&) override { m_trace->push_back("dimmed"); }
    void notify(const Opened&) override { m_trace->push_back("opened"); }

private:
    Trace* m_trace;
};

TEST(Publication, ReachesOnlyTheSubscribersOfItsSender)
{
    Trace trace;
    Lamp lamp, other;
    LitListener one(trace, "one"), two(trace, "two"), stranger(trace, "stranger");
    one.subscribe(&lamp);
    two.subscribe(&lamp);
    stranger.subscribe(&other);
    PubSub::publish(Lit(&lamp));
    EXPECT_THAT(trace, UnorderedElementsAre("one", "two"));
}

} // namespace
