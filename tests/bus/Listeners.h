// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/PubSub.h>

#include <gmock/gmock.h>

#include <functional>
#include <string>
#include <utility>
#include <vector>

namespace BusTests {

struct Lamp : virtual PubSub::Object
{};

struct Door : virtual PubSub::Object
{};

/// Can be sent about, but not be subscribed to.
struct Weather
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

struct Forecast : PubSub::Message<Weather>
{
    using Message::Message;
};

using Heard = std::vector<std::string>;

/// Writes its name when something reaches it, then does what the test tells it to.
template <typename M>
class Listener : public PubSub::Subscriber<M>
{
public:
    Listener(Heard& heard, std::string name) : m_heard(&heard), m_name(std::move(name)) {}

    void notify(const M&) override
    {
        m_heard->push_back(m_name);
        if (then) {
            const auto action = then; // the listener may end in it
            action();
        }
    }

    std::function<void()> then;

private:
    Heard* m_heard;
    std::string m_name;
};

using LampListener = Listener<Lit>;

/// One subscriber of three message types about two kinds of object.
class HouseListener : public PubSub::Subscriber<Lit, Dimmed, Opened>
{
public:
    explicit HouseListener(Heard& heard, std::string name = "house")
        : m_heard(&heard), m_name(std::move(name))
    {}

    void notify(const Lit&) override { m_heard->push_back(m_name + " lit"); }
    void notify(const Dimmed&) override { m_heard->push_back(m_name + " dimmed"); }
    void notify(const Opened&) override { m_heard->push_back(m_name + " opened"); }

private:
    Heard* m_heard;
    std::string m_name;
};

class BusTest : public testing::Test
{
protected:
    Heard take() { return std::exchange(heard, Heard()); }

    Lamp lamp;
    Lamp other;
    Door door;
    Heard heard;
};

} // namespace BusTests
