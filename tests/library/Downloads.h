// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/library/Import.h>

#include <gmock/gmock.h>

#include <functional>
#include <map>
#include <string>
#include <utility>
#include <vector>

/// Modules that deal with the states of imports, and the list in which they write what happens to them.
namespace LibraryTests {

using Lines = std::vector<std::string>;

inline std::string nameOf(const Import::Object* object)
{
    return object ? object->tag.toStdString() : "-";
}

/// A state is written as its item and its stage.
inline std::string text(const Import::State* state)
{
    return nameOf(state->import) + "@" + std::to_string(state->stage);
}

class Trace
{
public:
    void add(const std::string& line) { m_lines.push_back(line); }
    /// What was written since the last call.
    Lines take() { return std::exchange(m_lines, {}); }

private:
    Lines m_lines;
};

/// Every callback of its view is written.
class TracedStates : public Import::StateView
{
public:
    using Import::StateView::cancelImport;
    using Import::StateView::import;
    using Import::StateView::importState;
    using Import::StateView::importStateAdd;
    using Import::StateView::importStateChange;
    using Import::StateView::importStateForget;
    using Import::StateView::importStateIsObserved;
    using Import::StateView::importStateIsOwned;
    using Import::StateView::importStateObserve;
    using Import::StateView::importStateOf;
    using Import::StateView::importStateOwn;
    using Import::StateView::importStateOwnerPointer;
    using Import::StateView::importStateRemove;
    using Import::StateView::importStates;
    using Import::StateView::releaseImportState;

    TracedStates(Trace& trace, std::string name) : m_trace(&trace), m_name(std::move(name)) {}

protected:
    void importStateAdded(const Import::State* state) override { write("added " + text(state)); }
    void importStateRemoved(const Import::State* state) override { write("removed " + text(state)); }
    void importStateChanged(const Import::State* state, const Import::State* before,
                            const Import::State* after) override
    {
        write("changed " + text(before) + " to " + text(after));
        Import::StateView::importStateChanged(state, before, after);
    }
    void importStateChanged(const Import::State*, const Import::State* before) override
    {
        write("changed from " + text(before));
    }
    void importStateChanged(const Import::State* state) override { write("changed now " + text(state)); }

    void write(const std::string& line) { m_trace->add(m_name + " " + line); }

private:
    Trace* m_trace;
    std::string m_name;
};

/// The module that owns the states: it makes one when it is asked for, and lets it go when it is released.
class Downloads : public TracedStates,
                  public PubSub::Subscriber<Import::Details::AcquireState, Import::Details::ReleaseState>
{
public:
    using Subscription = Import::Details::AcquireSubscription;

    explicit Downloads(Trace& trace, const std::string& name = "owner") : TracedStates(trace, name)
    {
        subscribeAll<Subscription>();
    }

    /// Made at the first call.
    Import::State& stateOf(const Import::Object* object)
    {
        const auto entry = m_states.try_emplace(object);
        if (entry.second)
            importStateOwn(&entry.first->second)->setImport(object);
        return entry.first->second;
    }

    /// Replaces the answer.
    std::function<void(const Import::Details::AcquireState&)> answer;
    /// One for each request.
    std::vector<const Subscription*> senders;
    bool removesReleased = false;

private:
    void notify(const Import::Details::AcquireState& request) override
    {
        write("asked for " + nameOf(request.object));
        senders.push_back(request.sender);
        if (answer)
            answer(request);
        else
            PubSub::publish(
                Import::Details::AcquireStateNotification(request.sender, &stateOf(request.object)));
    }

    void notify(const Import::Details::ReleaseState& request) override
    {
        write("released " + nameOf(request.object));
        senders.push_back(request.sender);
        if (removesReleased)
            importStateRemove(&m_states[request.object]);
    }

    std::map<const Import::Object*, Import::State> m_states;
};

class ImportStates : public testing::Test
{
protected:
    ImportStates()
    {
        rain.tag = "rain";
        sun.tag = "sun";
    }

    Lines take() { return trace.take(); }

    Import::Object rain;
    Import::Object sun;
    Trace trace;
};

} // namespace LibraryTests
