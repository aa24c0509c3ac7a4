// SPDX-License-Identifier: Apache-2.0
#include "host/media/CollectionKeeper.h"

#include "host/media/CollectingFailed.h"
#include "host/media/FileFacts.h"

#include <EditorModel/library/CollectionIds.h>

#include <QFileInfo>

#include <algorithm>
#include <utility>

namespace Host {
namespace {

using EditorCollection::UserObject;

Import::Object::Kind kindOf(const Media::File& file)
{
    if (movingPicture(file)) {
        return CollectionKeeper::VideoKind;
    }
    if (!file.audioTracks.empty()) {
        return CollectionKeeper::AudioKind;
    }
    return stillPicture(file) ? CollectionKeeper::ImageKind : Import::Object::DefaultKind;
}

std::unique_ptr<Import::Object> makeItem(const Media::File& file, const QString& place)
{
    auto item = std::make_unique<Import::Object>();
    item->tag = QFileInfo(place).fileName();
    item->kind = kindOf(file);
    item->category = EditorCollection::CategoryID::USER_FILES;
    item->setLocation(place);
    return item;
}

} // namespace

CollectionKeeper::CollectionKeeper() : m_own(std::make_unique<UserObject>()), m_collection(m_own.get())
{
    own(m_collection);
    subscribe(EditorCollection::globalObject());
}

CollectionKeeper::CollectionKeeper(UserObject* collection) : m_collection(collection)
{
    if (enumerateAll().count(collection) == 0) {
        own(m_collection);
    }
    subscribe(EditorCollection::globalObject());
}

CollectionKeeper::~CollectionKeeper()
{
    if (isOwned(m_collection)) {
        remove(m_collection);
    }
}

void CollectionKeeper::notify(const AddFilesToCollection& request)
{
    if (!isOwned(m_collection)) {
        refuse(request);
        return;
    }
    std::set<QString> listed = listedFiles(*m_collection);
    UserObject filled(*m_collection);
    for (const Media::File* const file : request.files) {
        const QString place = absolutePath(file->path);
        if (listed.insert(place).second) {
            m_items.push_back(makeItem(*file, place));
            filled.addItem(m_items.back().get());
        }
    }
    if (filled != *m_collection) {
        change(m_collection)->setItems(std::move(filled.items));
    }
}

void CollectionKeeper::refuse(const AddFilesToCollection& request) const
{
    const std::deque<const Media::File*> files = request.files;
    for (const Media::File* const file : files) {
        PubSub::publish(CollectingFailed(
            file->path, "is not collected: the user's collection is kept by another module"));
    }
}

void CollectionKeeper::changeRequested(UserObject* collection, UserObject* value)
{
    if (std::find(value->items.begin(), value->items.end(), nullptr) == value->items.end()) {
        CollectionView::changeRequested(collection, value);
    }
}

void CollectionKeeper::removeRequested(UserObject*) {}

std::set<QString> listedFiles(const UserObject& collection)
{
    std::set<QString> files;
    for (const Import::Object* const item : collection.items) {
        if (item && !item->pack && !item->location().isEmpty()) {
            files.insert(absolutePath(item->location()));
        }
    }
    return files;
}

} // namespace Host
