// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/packages/PackageContent.h"

#include <EditorModel/bus/View.h>
#include <EditorModel/library/ImportViews.h>
#include <EditorModel/library/InApp.h>

#include <QMap>
#include <QPair>
#include <QString>

#include <deque>
#include <map>
#include <memory>
#include <set>

namespace Host {

/// The module that reads packages from folders and has what they bring.
///
/// Elements that are sound are shelved, whatever is wrong with others; a package whose description cannot be
/// read is not shelved at all. faults() tells all that is wrong.
///
/// On the bus it owns the catalogue of packs, which has each shelved package as an installed pack, the packs
/// in it, and the imports of the packages, which are linked to their packs. Of the catalogue others can
/// change the update flag alone: when it is raised the shelf reads the folders again, and lowers it when that
/// is done. Packs are not changed by others. GetPackagesRequest is answered with the folders of the shelved
/// packages, and with the names of the folders of those that could not be shelved.
///
/// Elements, items and descriptions belong to the shelf. They live until their package is taken off, or read
/// anew because files in its folder have changed, and the outermost request about it has been answered.
class PackageShelf : private PubSub::Subscriber<Package::GetPackagesRequest>
{
public:
    PackageShelf();
    PackageShelf(const PackageShelf&) = delete;
    ~PackageShelf() override;

    /// Shelves the package that lies in the folder, or, where it has no description, each package in the
    /// folders directly below; hidden ones are passed over. Tells how many there are, sound or not.
    std::size_t put(const QString& folder);
    /// Takes a package off, with all that it brought. It stays off until it is put again. False if there is
    /// no such package.
    bool takeOff(const QString& appId);
    /// Looks at all folders again: packages that have come are shelved, those that are gone are taken off,
    /// those in whose folders a file has changed are read anew, and so are those that lack elements whose
    /// identifiers have become free.
    void refresh();
    /// Has the catalogue tell of a pack that may not be installed. Of an `appId` that it has already nothing
    /// is taken over.
    void offer(const Package::InApp::Pack& pack);

    /// Folder by folder.
    std::deque<PackageFault> faults() const;
    std::deque<const PackageContent*> packages() const;
    const PackageContent* package(const QString& appId) const;
    const Package::InApp::Object& catalogue() const { return m_catalogue; }
    const Package::Storage& storage() const { return m_storage; }

    /// The element by the identifier of its items; null if there is none of this class.
    template <class T>
    const T* find(const QString& id) const
    {
        for (const PackageContent* content : packages()) {
            for (const auto& item : content->itemsOf<T>()) {
                if (item->uniqueId == id) {
                    return item->item;
                }
            }
        }
        return nullptr;
    }

    /// What a collection has, package by package.
    template <class T>
    std::deque<const CollectionItem<T>*> items(const QString& collectionId) const
    {
        std::deque<const CollectionItem<T>*> found;
        for (const PackageContent* content : packages()) {
            for (const auto& item : content->itemsOf<T>()) {
                if (item->collectionId == collectionId) {
                    found.push_back(item.get());
                }
            }
        }
        return found;
    }

    /// The media file of an import that came with its package; empty for any other.
    QString mediaPath(const Import::Object* import) const;

private:
    class CatalogueView;
    class ImportsView;
    class PacksView;
    class Request;

    /// Size and time of change of each file.
    using Fingerprint = QMap<QString, QPair<qint64, qint64>>;
    struct Slot
    {
        Fingerprint fingerprint;
        std::deque<PackageFault> faults;
        /// See PackageReading.
        std::set<QString> takenIds;
        /// Null if there is none that could be shelved.
        std::unique_ptr<PackageContent> content;
    };

    void notify(const Package::GetPackagesRequest& request) override;

    std::set<QString> foldersOf(const QString& place);
    void shelve(const QString& folder);
    void takeIn(Slot& slot, std::unique_ptr<PackageContent> content);
    void clear(const QString& folder);
    std::deque<QString> completable() const;
    void install(const PackageContent& content);
    void uninstall(const QString& appId);
    const Package::InApp::Pack* enter(const Package::InApp::Pack& pack);
    void freeRetired();

    static Fingerprint fingerprintOf(const QString& folder);

    Package::InApp::Object m_catalogue;
    Package::Storage m_storage;
    std::deque<std::unique_ptr<Package::InApp::Pack>> m_packs;
    /// The packs that stay in the catalogue when they are not installed.
    std::set<QString> m_offered;
    std::deque<QString> m_places;
    std::deque<PackageFault> m_placeFaults;
    /// Folders of packages that were taken off.
    std::set<QString> m_withheld;
    std::map<QString, Slot> m_folder2slot;
    std::map<QString, QString> m_id2package;
    /// No longer on the shelf, but a message that is still going round may tell of them.
    std::deque<std::unique_ptr<PackageContent>> m_retired;
    std::deque<std::unique_ptr<Package::InApp::Pack>> m_retiredPacks;
    /// The requests that are going on, one within another.
    int m_depth = 0;
    const std::unique_ptr<CatalogueView> m_catalogueView;
    const std::unique_ptr<PacksView> m_packsView;
    const std::unique_ptr<ImportsView> m_importsView;
};

} // namespace Host
