// SPDX-License-Identifier: Apache-2.0
#include "host/media/ResourceKeeper.h"

#include "host/media/AddingFailed.h"
#include "host/media/FileFacts.h"
#include "host/media/MediaDescriber.h"

#include <QUuid>

#include <algorithm>
#include <iterator>
#include <set>
#include <utility>

namespace Host {
namespace {

/// The files that are open, whoever owns them, by their absolute paths.
std::map<QString, const Media::File*> openFiles()
{
    std::map<QString, const Media::File*> files;
    for (const Media::File* file : Message::View<Media::File>().enumerateAll()) {
        if (file->isOpened) {
            files.emplace(absolutePath(file->path), file);
        }
    }
    return files;
}

/// Takes over what is found out anew of resources, and leaves the timing of those that are there.
void merge(const std::map<ResourceRef, ResourceTable::FileResourceInfo>& infos, ResourceTable::Object& table)
{
    for (const auto& [resource, info] : infos) {
        const auto entry = table.resource2fileInfo.try_emplace(resource, info).first;
        entry->second.info = info.info;
    }
}

} // namespace

/// What is found out of files for one request.
struct ResourceKeeper::Found
{
    std::map<ResourceRef, ResourceTable::FileResourceInfo> infos;
    Compositions compositions;
};

ResourceKeeper::ResourceKeeper()
{
    processAddRequests();
    subscribeAll<ResourceTable::Object>();
}

ResourceKeeper::~ResourceKeeper() = default;

QString ResourceKeeper::identifier(const QString& path, int index)
{
    static const QUuid space("7a3c52c8-6d1e-4f0b-9d43-5b8a1c0e2f96");
    const QString file = QUuid::createUuidV5(space, absolutePath(path)).toString(QUuid::WithoutBraces);
    return index == 0 ? file : file + '-' + QString::number(index);
}

const Resource::FileInfo* ResourceKeeper::fileInfo(const Resource::Describer& resource) const
{
    const std::lock_guard lock(m_mutex);
    const ResourceTable::FileResourceInfo* const info = find(resource);
    return info ? &info->info : nullptr;
}

const Composition::Object* ResourceKeeper::composition(const Resource::Describer& resource) const
{
    const std::lock_guard lock(m_mutex);
    const auto entry = m_compositions.find(resource.resource);
    return entry != m_compositions.end() && find(resource) ? entry->second : nullptr;
}

Resource::Timing ResourceKeeper::timing(const Resource::Describer& resource) const
{
    const std::lock_guard lock(m_mutex);
    const ResourceTable::FileResourceInfo* const info = find(resource);
    return info ? info->timing : Resource::Timing();
}

void ResourceKeeper::notify(const ResourceTable::AddFilesToTableRequest& request)
{
    const ResourceTable::Object* const table = request.sender;
    if (!watches(table)) {
        return;
    }
    const Found found = describe(table, QStringList(request.files));
    if (!isObserved(table)) {
        return;
    }
    // Whoever hears of the change may ask at once.
    remember(found.compositions);
    Table merged(*table);
    merge(found.infos, merged);
    if (!(merged == *table)) {
        change(table)->resource2fileInfo = std::move(merged.resource2fileInfo);
    }
}

bool ResourceKeeper::watches(const Table* table)
{
    if (!isObserved(table)) {
        const std::set<const Table*> owned = enumerateAll();
        if (owned.find(table) == owned.end()) {
            return false;
        }
        observe(table);
    }
    return true;
}

ResourceKeeper::Found ResourceKeeper::describe(const Table* table, const QStringList& paths)
{
    Found found;
    // Before anything is opened, which others hear of: they might close these.
    const std::map<QString, const Media::File*> open = openFiles();
    std::set<QString> done;
    QStringList closed;
    for (const QString& path : paths) {
        const QString place = absolutePath(path);
        if (!done.insert(place).second) {
            continue;
        }
        const auto known = open.find(place);
        if (known == open.end()) {
            closed << path;
        } else {
            addTracks(*known->second, found);
        }
    }
    for (const QString& path : closed) {
        MediaDescriber describer;
        const MediaDescriber::Entry& entry = describer.describe(path);
        // Opening tells others, who may have removed and destroyed the table.
        if (!isObserved(table)) {
            break;
        }
        if (entry.file.isOpened) {
            addTracks(entry.file, found);
        } else {
            PubSub::publish(AddingFailed(table, path, entry.reason));
        }
    }
    return found;
}

void ResourceKeeper::addTracks(const Media::File& file, Found& found)
{
    std::map<Resource::Type, int> counts;
    const auto add = [&](const Media::File::Track& track, Resource::Type type) {
        const ResourceRef resource(identifier(file.path, counts[type]++), type);
        ResourceTable::FileResourceInfo& info = found.infos[resource];
        info.info.path = absolutePath(file.path);
        info.info.track = track.index;
        info.info.duration = type == Resource::ImageType ? MTime() : file.length;
        info.timing.mode = type == Resource::ImageType ? Resource::Timing::Described : PlayedOnce;
        found.compositions[resource] = file.composition;
    };
    for (const auto* track : file.videoTracks) {
        add(*track, track->isImage ? Resource::ImageType : Resource::VideoType);
    }
    for (const auto* track : file.audioTracks) {
        add(*track, Resource::AudioType);
    }
}

void ResourceKeeper::remember(const Compositions& compositions)
{
    const std::lock_guard lock(m_mutex);
    for (const auto& [resource, composition] : compositions) {
        m_compositions[resource] = composition;
    }
}

void ResourceKeeper::changed(const Table*)
{
    learn(nullptr);
}

void ResourceKeeper::removed(const Table* table)
{
    learn(table);
}

/// A table that departs is told of while it still stands among the others.
void ResourceKeeper::learn(const Table* departing)
{
    std::map<ResourceRef, const ResourceTable::FileResourceInfo*> known;
    const std::lock_guard lock(m_mutex);
    for (const Table* table : objects()) {
        if (table == departing) {
            continue;
        }
        for (const auto& [resource, info] : table->resource2fileInfo) {
            if (known.find(resource) == known.end()) {
                known[resource] = keep(resource, info);
            }
        }
    }
    m_known.swap(known);
    forgetCompositions();
}

/// The composition of what stands in no table any more may end.
void ResourceKeeper::forgetCompositions()
{
    for (auto entry = m_compositions.begin(); entry != m_compositions.end();) {
        const bool isKnown = m_known.find(entry->first) != m_known.end();
        entry = isKnown ? std::next(entry) : m_compositions.erase(entry);
    }
}

const ResourceTable::FileResourceInfo* ResourceKeeper::keep(const ResourceRef& resource,
                                                            const ResourceTable::FileResourceInfo& info)
{
    std::deque<ResourceTable::FileResourceInfo>& kept = m_kept[resource];
    const auto same = std::find(kept.begin(), kept.end(), info);
    return same == kept.end() ? &kept.emplace_back(info) : &*same;
}

const ResourceTable::FileResourceInfo* ResourceKeeper::find(const Resource::Describer& resource) const
{
    const auto entry = m_known.find(resource.resource);
    return entry == m_known.end() ? nullptr : entry->second;
}

} // namespace Host
