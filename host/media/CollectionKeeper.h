// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/media/AddFilesToCollection.h"

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/bus/View.h>
#include <EditorModel/library/ImportObject.h>
#include <EditorModel/library/UserObject.h>

#include <QString>

#include <deque>
#include <memory>
#include <set>

namespace Host {

/// The module that owns the user's collection, and lists media files in it. All that a request adds comes in
/// one change; a request that brings nothing new changes nothing.
///
/// A file becomes an item once for its absolute path, also where the item that stands there is another
/// module's. The item has the path as its location, the name of the file as its tag, the category
/// EditorCollection::CategoryID::USER_FILES, and the kind by what the file shows or lets hear.
///
/// Requests from other modules to change the collection are granted unless they list null; requests to remove
/// it are refused.
///
/// A collection that another module owns already is left to it: for each file of a request CollectingFailed
/// goes out.
class CollectionKeeper : private Message::View<EditorCollection::UserObject>,
                         private PubSub::Subscriber<AddFilesToCollection>
{
public:
    /// The kinds of items; the numbers are those of the kinds of resources.
    static constexpr auto VideoKind = static_cast<Import::Object::Kind>(1);
    static constexpr auto AudioKind = static_cast<Import::Object::Kind>(2);
    static constexpr auto ImageKind = static_cast<Import::Object::Kind>(3);

    /// With a collection of its own, empty.
    CollectionKeeper();
    /// The collection, and what it lists, stay the caller's, and outlive the keeper. The items that the
    /// keeper makes are freed with the keeper: store the collection before.
    explicit CollectionKeeper(EditorCollection::UserObject* collection);
    CollectionKeeper(const CollectionKeeper&) = delete;
    CollectionKeeper& operator=(const CollectionKeeper&) = delete;
    /// Ends the sharing of the collection.
    ~CollectionKeeper() override;

    const EditorCollection::UserObject* collection() const { return m_collection; }

private:
    using CollectionView = Message::View<EditorCollection::UserObject>;

    void notify(const AddFilesToCollection& request) override;
    void refuse(const AddFilesToCollection& request) const;
    void changeRequested(EditorCollection::UserObject* collection,
                         EditorCollection::UserObject* value) override;
    void removeRequested(EditorCollection::UserObject* collection) override;

    std::unique_ptr<EditorCollection::UserObject> m_own;
    EditorCollection::UserObject* m_collection;
    /// They outlive the collection's use of them, since old values name them.
    std::deque<std::unique_ptr<Import::Object>> m_items;
};

/// The absolute paths of the files that are listed; items of packs, and those without a place, have none.
std::set<QString> listedFiles(const EditorCollection::UserObject& collection);

} // namespace Host
