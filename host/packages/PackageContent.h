// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/library/Package.h>
#include <EditorModel/library/PersistentItem.h>
#include <EditorModel/persistence/Document.h>

#include <QString>

#include <deque>
#include <map>
#include <memory>
#include <tuple>

namespace Package::InApp {
class Pack;
}

namespace Host {

/// What is wrong with a package. The reason is one line that completes "The file ...".
struct PackageFault
{
    /// The `appId`; of a package that could not be read, the name of its folder.
    QString package;
    /// As the package names it, from its folder on; empty where the fault is in no single file.
    QString file;
    QString reason;
};

/// What this host takes Package::Resource::type for.
enum PackageResourceType : int
{
    ElementResource = 0, ///< a document with the element
    MediaResource = 1,   ///< a media file that elements use by the resource's identifier
};

template <class T>
using CollectionItem = EditorCollection::PersistentItem<T>;
template <class T>
using CollectionItems = std::deque<std::unique_ptr<CollectionItem<T>>>;

/// A package as it lies in its folder, and the items that it brings. The items point into the documents.
struct PackageContent
{
    QString appId;
    /// Canonical.
    QString folder;
    std::deque<Document::Graph> documents;
    const Package::Object* description = nullptr;
    /// What the description tells of the package itself; null where it tells nothing.
    const Package::InApp::Pack* pack = nullptr;
    std::tuple<CollectionItems<Overlay::Preset>, CollectionItems<Transition::Object>,
               CollectionItems<Effect::Object>, CollectionItems<Import::Object>,
               CollectionItems<Quiz::Preset>>
        items;
    /// The file of each import whose media comes with the package.
    std::map<const Import::Object*, QString> media;
    /// Every import of the package, once.
    std::deque<Import::Object*> imports;
    Package::StorageItem storage;

    template <class T>
    const CollectionItems<T>& itemsOf() const
    {
        return std::get<CollectionItems<T>>(items);
    }
};

} // namespace Host
