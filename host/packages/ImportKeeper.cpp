// SPDX-License-Identifier: Apache-2.0
#include "host/packages/ImportKeeper.h"

#include <EditorModel/library/InApp.h>

#include <algorithm>
#include <utility>

namespace Host {
namespace {

using State = Import::State;

constexpr State::Stage stage(ImportStage value)
{
    return static_cast<State::Stage>(static_cast<int>(value));
}

bool isUnderWay(const State& state)
{
    return state.stage == stage(Waiting) || state.stage == stage(Fetching) ||
           state.stage == stage(Installing);
}

bool isAskedFor(const State& before, const State& after)
{
    const bool canStart = before.stage == stage(NotFetched) || before.stage == stage(FetchFailed);
    return canStart && after.stage == stage(Waiting);
}

bool isGivenUp(const State& before, const State& after)
{
    return isUnderWay(before) && after.stage == stage(NotFetched);
}

void updateCatalogues()
{
    Message::View<Package::InApp::Object> view;
    for (const Package::InApp::Object* catalogue : view.enumerateAll()) {
        view.observe(catalogue);
        view.change(catalogue)->update();
    }
}

} // namespace

/// Frees at its end, if it is the outermost one, what was retired meanwhile.
class ImportKeeper::Request
{
public:
    explicit Request(ImportKeeper& keeper) : m_keeper(keeper) { ++m_keeper.m_depth; }
    Request(const Request&) = delete;
    Request& operator=(const Request&) = delete;
    ~Request()
    {
        --m_keeper.m_depth;
        m_keeper.freeRetired();
    }

private:
    ImportKeeper& m_keeper;
};

/// Hears that an owner lets go of an item, which may end then.
class ImportKeeper::ItemView : public Message::View<Import::Object>
{
public:
    explicit ItemView(ImportKeeper& keeper) : m_keeper(keeper) {}

private:
    void removed(const Import::Object* item) override { m_keeper.removeRecord(item); }

    ImportKeeper& m_keeper;
};

ImportKeeper::ImportKeeper(const QString& folder)
    : m_folder(folder), m_items(std::make_unique<ItemView>(*this))
{
    PubSub::Subscriber<Import::Details::AcquireState,
                       Import::Details::ReleaseState>::subscribeAll<Import::Details::AcquireSubscription>();
}

ImportKeeper::~ImportKeeper()
{
    m_fetch.reset();
    // Nobody asks a keeper that ends for a new state.
    unsubscribeAll<Import::Details::AcquireSubscription>();
    while (!m_records.empty()) {
        removeRecord(m_records.begin()->first);
    }
}

bool ImportKeeper::step()
{
    if (m_isStepping) {
        return false;
    }
    const Request request(*this);
    m_isStepping = true;
    struct Reset
    {
        bool& flag;
        ~Reset() { flag = false; }
    } const reset{m_isStepping};
    try {
        if (m_current) {
            goOn();
        } else if (!m_queue.empty()) {
            begin();
        }
    } catch (const ImportError& error) {
        fail(error);
    }
    return m_current || !m_queue.empty();
}

void ImportKeeper::run()
{
    while (step()) {
    }
}

void ImportKeeper::notify(const Import::Details::AcquireState& request)
{
    const Request going(*this);
    Record& record = recordOf(request.object);
    ++record.acquisitions;
    PubSub::publish(Import::Details::AcquireStateNotification(request.sender, &record.state));
}

void ImportKeeper::notify(const Import::Details::ReleaseState& request)
{
    const Request going(*this);
    const auto record = m_records.find(request.object);
    if (record != m_records.end() && record->second->acquisitions > 0) {
        --record->second->acquisitions;
        removeUnused(request.object);
    }
}

void ImportKeeper::changeRequested(Import::State* state, Import::State* value)
{
    const Request request(*this);
    const Import::Object* const item = state->import;
    State next(*state);
    if (isAskedFor(*state, *value)) {
        next.setStage(stage(Waiting))->setProgress(0.0)->setDeployError(Package::DefaultDeployResult);
        m_queue.push_back(item);
    } else if (isGivenUp(*state, *value) && !(item == m_current && m_isGivingToOwner)) {
        next.setStage(stage(NotFetched))->setProgress(0.0);
        giveUp(item);
    } else {
        return;
    }
    *value = next;
    Message::View<State>::changeRequested(state, value);
    removeUnused(item);
}

void ImportKeeper::removeRequested(Import::State*) {}

ImportKeeper::Record& ImportKeeper::recordOf(const Import::Object* item)
{
    std::unique_ptr<Record>& record = m_records[item];
    if (!record) {
        record = std::make_unique<Record>();
        m_items->observe(item);
        const bool isHere = item && !item->location().isEmpty();
        own(&record->state)
            ->setImport(item)
            ->setStage(stage(isHere ? Fetched : NotFetched))
            ->setProgress(isHere ? 1.0 : 0.0);
    }
    return *record;
}

void ImportKeeper::removeRecord(const Import::Object* item)
{
    const Request request(*this);
    auto record = m_records.extract(item);
    if (record.empty()) {
        return;
    }
    giveUp(item);
    m_retired.push_back(std::move(record.mapped()));
    const State* const state = &m_retired.back()->state;
    m_items->forget(item);
    remove(state);
}

void ImportKeeper::removeUnused(const Import::Object* item)
{
    const auto record = m_records.find(item);
    if (record != m_records.end() && record->second->acquisitions == 0 &&
        !isUnderWay(record->second->state)) {
        removeRecord(item);
    }
}

void ImportKeeper::giveUp(const Import::Object* item)
{
    m_queue.erase(std::remove(m_queue.begin(), m_queue.end(), item), m_queue.end());
    if (m_current == item) {
        end();
    }
}

void ImportKeeper::begin()
{
    m_current = m_queue.front();
    m_queue.pop_front();
    if (!m_current) {
        throw ImportError(NoAddress, "there is no item that could be fetched");
    }
    m_fetch = std::make_unique<ImportFetch>(*m_current, m_folder);
    change(&recordOf(m_current).state)->setStage(stage(Fetching));
}

void ImportKeeper::goOn()
{
    if (m_fetch->isComplete()) {
        install();
        return;
    }
    m_fetch->copyBlock();
    const double progress = m_fetch->progress();
    const State::Stage next = stage(m_fetch->isComplete() ? Installing : Fetching);
    change(&recordOf(m_current).state)->setStage(next)->setProgress(progress);
}

void ImportKeeper::install()
{
    const Import::Object* const item = m_current;
    m_isGivingToOwner = true;
    giveToOwner(item, m_fetch->install());
    if (m_current != item) {
        return;
    }
    m_fetch->keep();
    end();
    change(&recordOf(item).state)->setStage(stage(Fetched));
    removeUnused(item);
}

void ImportKeeper::giveToOwner(const Import::Object* item, const QString& path)
{
    if (item->pack) {
        updateCatalogues();
    } else {
        m_items->change(item)->setLocation(path);
    }
    if (m_current != item) {
        return;
    }
    const QString location = item->location();
    if (item->pack ? location.isEmpty() : location != path) {
        throw ImportError(NotAccepted, path + ": nobody takes it for the item");
    }
}

void ImportKeeper::fail(const ImportError& error)
{
    const Import::Object* const item = m_current;
    end();
    const State* const state = &recordOf(item).state;
    PubSub::publish(ImportFailed(state, error.reason));
    // Whoever hears of it may give the import up.
    const auto record = m_records.find(item);
    if (record == m_records.end() || !isUnderWay(*state)) {
        return;
    }
    change(state)
        ->setDeployError(static_cast<Package::DeployResult>(static_cast<int>(error.failure)))
        ->setStage(stage(FetchFailed));
    removeUnused(item);
}

void ImportKeeper::end()
{
    m_fetch.reset();
    m_current = nullptr;
    m_isGivingToOwner = false;
}

void ImportKeeper::freeRetired()
{
    if (m_depth == 0) {
        const auto records = std::exchange(m_retired, {});
    }
}

} // namespace Host
