// SPDX-License-Identifier: Apache-2.0
#include "host/packages/PackageReader.h"

#include "host/commands/Refusal.h"
#include "host/packages/PackageFolder.h"

#include <EditorModel/library/Pack.h>

#include <QDir>
#include <QFileInfo>

#include <set>
#include <type_traits>
#include <utility>

namespace Host {
namespace {

using CategoriesOfCollections = std::map<QString, std::set<QString>>;

/// What a document holds: the element, and what its item is to be like.
template <class T>
struct ElementDocument
{
    T* element = nullptr;
    CollectionItem<T> item;
};

QString classOf(const Serialize::ISerializable* object)
{
    return object ? QString::fromStdString(object->GetNameInArchive()) : "nothing";
}

/// Throws Refusal.
template <class T>
ElementDocument<T> elementOf(const Document::Graph& graph, const QString& name)
{
    ElementDocument<T> found;
    if (auto* const item = graph.rootAs<CollectionItem<T>>()) {
        found.element = item->item;
        found.item = *item;
        if (!found.element) {
            throw Refusal(name, "holds an item without an element");
        }
        return found;
    }
    found.element = graph.rootAs<T>();
    if (!found.element) {
        const Serialize::ISerializable* const root = graph.roots().empty() ? nullptr : graph.roots().front();
        throw Refusal(name, "holds no " + QString::fromStdString(T().GetNameInArchive()) + ", but " +
                                classOf(root));
    }
    return found;
}

/// An absolute name stays one, so that it is refused.
QString joined(const QString& folder, const QString& name)
{
    return folder.isEmpty() || name.isEmpty() || QDir::isAbsolutePath(name) ? name : folder + '/' + name;
}

class Reader
{
public:
    Reader(const QString& folder, const std::map<QString, QString>& id2package)
        : m_folder(folder), m_id2package(id2package), m_content(std::make_unique<PackageContent>())
    {
        m_content->folder = m_folder.path();
        m_content->appId = QFileInfo(m_folder.path()).fileName();
    }

    PackageReading read()
    {
        try {
            readDescription();
        } catch (const Refusal& refusal) {
            note(refusal);
            return {nullptr, std::move(m_faults), {}};
        }
        const Package::Object& description = *m_content->description;
        readAddOns<Overlay::Preset>(description.overlays);
        readAddOns<Transition::Object>(description.transitions);
        readAddOns<Effect::Object>(description.effects);
        readAddOns<Import::Object>(description.imports);
        readAddOns<Quiz::Preset>(description.quizzes);
        checkFolder(description.fontsDir);
        return {std::move(m_content), std::move(m_faults), std::move(m_takenIds)};
    }

private:
    void readDescription()
    {
        const QString& name = PackageFolder::descriptionName;
        Document::Graph graph = m_folder.document(name);
        auto* const description = graph.rootAs<Package::Object>();
        if (!description) {
            const Serialize::ISerializable* const root =
                graph.roots().empty() ? nullptr : graph.roots().front();
            throw Refusal(name, "holds no Package::Object, but " + classOf(root));
        }
        if (graph.roots().size() > 1) {
            readPack(graph.roots()[1]);
        }
        description->reservedFirst = m_content->appId;
        description->reservedSecond = m_content->folder;
        description->reservedThird = m_content->folder + '/' + name;
        m_content->description = description;
        m_content->documents.push_back(std::move(graph));
    }

    void readPack(const Serialize::ISerializable* root)
    {
        const QString& name = PackageFolder::descriptionName;
        const auto* const pack = dynamic_cast<const Package::InApp::Pack*>(root);
        if (!pack) {
            throw Refusal(name, "holds no Package::InApp::Pack as its second object, but " + classOf(root));
        }
        if (pack->appId.isEmpty()) {
            throw Refusal(name, "gives the package an empty identifier");
        }
        m_content->pack = pack;
        m_content->appId = pack->appId;
    }

    template <class T>
    void readAddOns(const std::deque<Package::CollectionAddOn>& addOns)
    {
        for (const Package::CollectionAddOn& addOn : addOns) {
            checkFolder(addOn.translationDir);
            for (const Package::Resource& resource : addOn.resources) {
                try {
                    readResource<T>(addOn, resource);
                } catch (const Refusal& refusal) {
                    note(refusal);
                }
            }
        }
    }

    template <class T>
    void readResource(const Package::CollectionAddOn& addOn, const Package::Resource& resource)
    {
        const QString name = joined(addOn.contentPath, resource.file);
        switch (static_cast<int>(resource.type)) {
        case ElementResource:
            return readElement<T>(addOn, resource.id, name);
        case MediaResource:
            m_folder.file(name);
            return;
        default:
            throw Refusal(name, "is of an unknown type: " + QString::number(resource.type));
        }
    }

    template <class T>
    void readElement(const Package::CollectionAddOn& addOn, const QString& resourceId, const QString& name)
    {
        Document::Graph graph = m_folder.document(name);
        ElementDocument<T> document = elementOf<T>(graph, name);
        const QString id = resourceId.isEmpty() ? document.item.uniqueId : resourceId;
        requireFreeId(id, name);
        const CategoriesOfCollections places = placesOf(document.item.categories, addOn, name);
        if constexpr (std::is_same_v<T, Import::Object>) {
            readMedia(*document.element, addOn, name);
        }
        m_ids.insert(id);
        document.item.uniqueId = id;
        document.item.item = document.element;
        addItems(document.item, places);
        m_content->documents.push_back(std::move(graph));
    }

    void requireFreeId(const QString& id, const QString& name)
    {
        if (id.isEmpty()) {
            throw Refusal(name, "has no identifier");
        }
        if (m_ids.count(id) != 0) {
            throw Refusal(name, "has the identifier of another element: " + id);
        }
        const auto other = m_id2package.find(id);
        if (other != m_id2package.end()) {
            m_takenIds.insert(id);
            throw Refusal(name, "has the identifier of an element of " + other->second + ": " + id);
        }
    }

    static CategoriesOfCollections placesOf(const std::set<QString>& categories,
                                            const Package::CollectionAddOn& addOn, const QString& name)
    {
        CategoriesOfCollections places;
        for (const QString& category : categories) {
            const auto place = addOn.category2collection.find(category);
            if (place == addOn.category2collection.end()) {
                throw Refusal(name, "has a category that leads to no collection: " + category);
            }
            places[place->second].insert(category);
        }
        if (categories.empty()) {
            for (const auto& [category, collection] : addOn.category2collection) {
                places[collection].insert(category);
            }
        }
        if (places.empty()) {
            throw Refusal(name, "has no category, so that no collection takes it");
        }
        return places;
    }

    void readMedia(Import::Object& import, const Package::CollectionAddOn& addOn, const QString& name)
    {
        const QString location = import.location();
        if (!location.isEmpty()) {
            try {
                m_content->media[&import] = m_folder.file(joined(addOn.contentPath, location));
            } catch (const Refusal& refusal) {
                throw Refusal(name, "names a media file that " + refusal.reason + ": " + refusal.name);
            }
        }
        m_content->imports.push_back(&import);
    }

    template <class T>
    void addItems(const CollectionItem<T>& item, const CategoriesOfCollections& places)
    {
        for (const auto& [collection, categories] : places) {
            auto copy = std::make_unique<CollectionItem<T>>(item);
            copy->collectionId = collection;
            copy->categories = categories;
            std::get<CollectionItems<T>>(m_content->items).push_back(std::move(copy));
            m_content->storage.collection2tags[collection].insert(item.item->tag);
            m_content->storage.collection2categories[collection].insert(categories.begin(), categories.end());
        }
    }

    void checkFolder(const QString& name)
    {
        try {
            if (!name.isEmpty()) {
                m_folder.folder(name);
            }
        } catch (const Refusal& refusal) {
            note(refusal);
        }
    }

    void note(const Refusal& refusal)
    {
        m_faults.push_back({m_content->appId, refusal.name, refusal.reason});
    }

    const PackageFolder m_folder;
    const std::map<QString, QString>& m_id2package;
    std::unique_ptr<PackageContent> m_content;
    std::set<QString> m_ids;
    std::set<QString> m_takenIds;
    std::deque<PackageFault> m_faults;
};

} // namespace

PackageReading readPackage(const QString& folder, const std::map<QString, QString>& id2package)
{
    return Reader(folder, id2package).read();
}

} // namespace Host
