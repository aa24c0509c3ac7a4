// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/ImportViews.h>

template class Message::View<Import::Object>;
template class Message::View<Import::State>;

template class Preview::Details::ObjectViewBase<Import::Object>;

namespace Import {
namespace {

bool canImport(const State& state)
{
    return state.stage == State::Initial || state.stage == State::Importable7;
}

bool canCancel(const State& state)
{
    return state.stage == State::Requested || state.stage == State::Cancellable4 ||
           state.stage == State::Cancellable5;
}

/// Publishes a request about the item in the name of an address that nobody else has; gives the state that
/// came as the answer.
template <class Request>
const State* answerTo(const Import::Object* object)
{
    StateAcquier acquirer;
    const Details::AcquireSubscription subscription;
    acquirer.subscribe(&subscription);
    PubSub::publish(Request(&subscription, object));
    acquirer.unsubscribe(&subscription);
    return acquirer.state;
}

} // namespace

const State* StateView::importStateOf(const Import::Object* object)
{
    const auto known = m_object2state.find(object);
    if (known != m_object2state.end())
        return known->second;
    const State* const state = answerTo<Details::AcquireState>(object);
    importStateObserve(state);
    return state;
}

void StateView::import(const Import::Object* object)
{
    if (const State* const state = importStateOf(object))
        import(state);
}

void StateView::import(const State* state)
{
    if (canImport(*state))
        importStateChange(state)->setStage(State::Requested);
}

void StateView::cancelImport(const Import::Object* object)
{
    if (const State* const state = importStateOf(object))
        cancelImport(state);
}

void StateView::cancelImport(const State* state)
{
    if (canCancel(*state))
        importStateChange(state)->setStage(State::Initial);
}

void StateView::releaseImportState(const Import::Object* object)
{
    answerTo<Details::ReleaseState>(object);
}

void StateView::importStateChanged(const State* state, const State* before, const State* after)
{
    if (before->import == after->import)
        return;
    if (before->import)
        m_object2state.erase(before->import);
    if (after->import)
        m_object2state[after->import] = state;
}

} // namespace Import
