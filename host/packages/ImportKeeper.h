// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/packages/ImportFetch.h"
#include "host/packages/ImportStages.h"

#include <EditorModel/bus/View.h>
#include <EditorModel/library/ImportViews.h>

#include <QString>

#include <deque>
#include <map>
#include <memory>

namespace Host {

/// The module that owns the states of imports and fetches their media from this machine's files, one after
/// another, into a folder.
///
/// An item has a state from the moment in which anybody asks for it, until all who asked have released it and
/// it is neither waited for nor fetched, or until its owner removes it from the bus. The item must live as
/// long. One with a location is Fetched from the start.
///
/// Others change the stage alone, and only so: NotFetched or FetchFailed to Waiting, which asks for the item,
/// and Waiting, Fetching or Installing to NotFetched, which gives it up; other changes are refused. Nothing
/// of an import that is given up or fails stays in the folder.
///
/// When the media is there, whoever owns the item on the bus is asked to give it its location; without an
/// owner the import fails. For an item of a pack the folder of the pack is fetched, and the owners of
/// catalogues are asked for an update; the import fails if the item has no location then.
class ImportKeeper : private Message::View<Import::State>,
                     private PubSub::Subscriber<Import::Details::AcquireState, Import::Details::ReleaseState>
{
public:
    /// The folder is made when it is needed.
    explicit ImportKeeper(const QString& folder);
    ImportKeeper(const ImportKeeper&) = delete;
    ~ImportKeeper() override;

    /// Copies one block, or does what comes before or behind the blocks, and tells of it by one change of a
    /// state. False if nothing is left to do, and, without doing anything, from within itself.
    bool step();
    /// Steps until nothing is left to do.
    void run();

    /// How many items have a state.
    std::size_t stateCount() const { return m_records.size(); }

private:
    class ItemView;
    class Request;

    struct Record
    {
        Import::State state;
        int acquisitions = 0;
    };

    void notify(const Import::Details::AcquireState& request) override;
    void notify(const Import::Details::ReleaseState& request) override;
    void changeRequested(Import::State* state, Import::State* value) override;
    void removeRequested(Import::State* state) override;

    Record& recordOf(const Import::Object* item);
    void removeRecord(const Import::Object* item);
    void removeUnused(const Import::Object* item);
    void giveUp(const Import::Object* item);
    void begin();
    void goOn();
    void install();
    void giveToOwner(const Import::Object* item, const QString& path);
    void fail(const ImportError& error);
    void end();
    void freeRetired();

    const QString m_folder;
    std::map<const Import::Object*, std::unique_ptr<Record>> m_records;
    std::deque<const Import::Object*> m_queue;
    /// The item that is being fetched; null if there is none.
    const Import::Object* m_current = nullptr;
    std::unique_ptr<ImportFetch> m_fetch;
    bool m_isStepping = false;
    /// It is too late to give it up.
    bool m_isGivingToOwner = false;
    /// The requests and steps that are going on, one within another.
    int m_depth = 0;
    /// No longer kept, but a message that is still going round may tell of them.
    std::deque<std::unique_ptr<Record>> m_retired;
    const std::unique_ptr<ItemView> m_items;
};

} // namespace Host
