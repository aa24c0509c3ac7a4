// SPDX-License-Identifier: Apache-2.0
#include "host/packages/PackageShelf.h"

#include "host/packages/PackageFolder.h"
#include "host/packages/PackageReader.h"

#include <QDateTime>
#include <QDir>
#include <QDirIterator>
#include <QFileInfo>

#include <algorithm>
#include <utility>

namespace Host {
namespace {

bool isPackage(const QString& folder)
{
    const QFileInfo description(folder + '/' + PackageFolder::descriptionName);
    return description.exists() || description.isSymLink();
}

} // namespace

/// Frees at its end, if it is the outermost one, what was retired meanwhile.
class PackageShelf::Request
{
public:
    explicit Request(PackageShelf& shelf) : m_shelf(shelf) { ++m_shelf.m_depth; }
    Request(const Request&) = delete;
    Request& operator=(const Request&) = delete;
    ~Request()
    {
        --m_shelf.m_depth;
        m_shelf.freeRetired();
    }

private:
    PackageShelf& m_shelf;
};

/// Grants others the update flag and nothing else.
class PackageShelf::CatalogueView : public Message::View<Package::InApp::Object>
{
public:
    explicit CatalogueView(PackageShelf& shelf) : m_shelf(shelf) {}

private:
    using Catalogue = Package::InApp::Object;

    void changeRequested(Catalogue* catalogue, Catalogue* value) override
    {
        // Raised already: the folders are being read.
        if (catalogue->updateStatus != 0 || value->updateStatus == 0) {
            return;
        }
        const Request request(m_shelf);
        Catalogue raised(*catalogue);
        raised.updateStatus = value->updateStatus;
        *value = raised;
        Message::View<Catalogue>::changeRequested(catalogue, value);
        m_shelf.refresh();
        change(catalogue)->updateStatus = 0;
    }
    void removeRequested(Catalogue*) override {}

    PackageShelf& m_shelf;
};

class PackageShelf::PacksView : public Message::View<Package::InApp::Pack>
{
private:
    void changeRequested(Package::InApp::Pack*, Package::InApp::Pack*) override {}
    void removeRequested(Package::InApp::Pack*) override {}
};

/// Keeps what is taken off while a request about an import is answered.
class PackageShelf::ImportsView : public Message::View<Import::Object>
{
public:
    explicit ImportsView(PackageShelf& shelf) : m_shelf(shelf) {}

private:
    void changeRequested(Import::Object* import, Import::Object* value) override
    {
        const Request request(m_shelf);
        Message::View<Import::Object>::changeRequested(import, value);
    }
    void removeRequested(Import::Object*) override {}

    PackageShelf& m_shelf;
};

PackageShelf::PackageShelf()
    : m_catalogueView(std::make_unique<CatalogueView>(*this)),
      m_packsView(std::make_unique<PacksView>()),
      m_importsView(std::make_unique<ImportsView>(*this))
{
    subscribeAll<Package::Object>();
    m_catalogueView->own(&m_catalogue);
}

PackageShelf::~PackageShelf()
{
    const Request request(*this);
    while (!m_folder2slot.empty()) {
        clear(m_folder2slot.begin()->first);
    }
    m_catalogueView->remove(&m_catalogue);
    while (!m_packs.empty()) {
        m_packsView->remove(m_packs.back().get());
        m_packs.pop_back();
    }
}

std::size_t PackageShelf::put(const QString& folder)
{
    const Request request(*this);
    const std::set<QString> folders = foldersOf(folder);
    for (const QString& package : folders) {
        m_withheld.erase(package);
        if (m_folder2slot.count(package) == 0) {
            shelve(package);
        }
    }
    if (std::find(m_places.begin(), m_places.end(), folder) == m_places.end()) {
        m_places.push_back(folder);
    }
    return folders.size();
}

bool PackageShelf::takeOff(const QString& appId)
{
    const PackageContent* const content = package(appId);
    if (!content) {
        return false;
    }
    const Request request(*this);
    const QString folder = content->folder;
    m_withheld.insert(folder);
    clear(folder);
    return true;
}

void PackageShelf::refresh()
{
    const Request request(*this);
    m_placeFaults.clear();
    std::set<QString> folders;
    for (const QString& place : std::deque<QString>(m_places)) {
        folders.merge(foldersOf(place));
    }
    for (const QString& folder : m_withheld) {
        folders.erase(folder);
    }
    std::deque<QString> outdated;
    for (const auto& [folder, slot] : m_folder2slot) {
        // Without content it may have been in the way of another package, which may be gone.
        if (!slot.content || folders.count(folder) == 0 || slot.fingerprint != fingerprintOf(folder)) {
            outdated.push_back(folder);
        }
    }
    for (const QString& folder : outdated) {
        clear(folder);
    }
    for (const QString& folder : completable()) {
        clear(folder);
    }
    for (const QString& folder : folders) {
        // Whoever hears of one package may have another one taken off.
        if (m_folder2slot.count(folder) == 0 && m_withheld.count(folder) == 0) {
            shelve(folder);
        }
    }
}

void PackageShelf::offer(const Package::InApp::Pack& pack)
{
    m_offered.insert(pack.appId);
    if (!m_catalogue.findPack(pack.appId)) {
        Package::InApp::Pack offered(pack);
        offered.installationStatus = Package::InApp::Pack::DefaultStatus;
        enter(offered);
    }
}

std::deque<PackageFault> PackageShelf::faults() const
{
    std::deque<PackageFault> all = m_placeFaults;
    for (const auto& [folder, slot] : m_folder2slot) {
        all.insert(all.end(), slot.faults.begin(), slot.faults.end());
    }
    return all;
}

std::deque<const PackageContent*> PackageShelf::packages() const
{
    std::deque<const PackageContent*> contents;
    for (const auto& [folder, slot] : m_folder2slot) {
        if (slot.content) {
            contents.push_back(slot.content.get());
        }
    }
    return contents;
}

const PackageContent* PackageShelf::package(const QString& appId) const
{
    for (const PackageContent* content : packages()) {
        if (content->appId == appId) {
            return content;
        }
    }
    return nullptr;
}

QString PackageShelf::mediaPath(const Import::Object* import) const
{
    for (const PackageContent* content : packages()) {
        const auto media = content->media.find(import);
        if (media != content->media.end()) {
            return media->second;
        }
    }
    return {};
}

void PackageShelf::notify(const Package::GetPackagesRequest& request)
{
    QMap<QString, QString> directories;
    QSet<QString> unread;
    for (const auto& [folder, slot] : m_folder2slot) {
        if (slot.content) {
            directories[slot.content->appId] = folder;
        } else {
            unread.insert(QFileInfo(folder).fileName());
        }
    }
    PubSub::publish(Package::GetPackagesNotification(request.sender, directories, unread));
}

/// Notes what is wrong with the place itself, in place of what was.
std::set<QString> PackageShelf::foldersOf(const QString& place)
{
    const auto isAboutPlace = [&place](const PackageFault& fault) { return fault.package == place; };
    m_placeFaults.erase(std::remove_if(m_placeFaults.begin(), m_placeFaults.end(), isAboutPlace),
                        m_placeFaults.end());
    const QFileInfo info(place);
    if (!info.isDir()) {
        m_placeFaults.push_back({place, {}, info.exists() ? "is no folder" : "does not exist"});
        return {};
    }
    if (isPackage(place)) {
        return {info.canonicalFilePath()};
    }
    std::set<QString> folders;
    for (const QFileInfo& folder : QDir(place).entryInfoList(QDir::Dirs | QDir::NoDotAndDotDot)) {
        if (isPackage(folder.filePath())) {
            folders.insert(folder.canonicalFilePath());
        }
    }
    return folders;
}

void PackageShelf::shelve(const QString& folder)
{
    PackageReading reading = readPackage(folder, m_id2package);
    Slot& slot = m_folder2slot[folder];
    slot.fingerprint = fingerprintOf(folder);
    slot.faults = std::move(reading.faults);
    slot.takenIds = std::move(reading.takenIds);
    if (!reading.content) {
        return;
    }
    if (const PackageContent* const other = package(reading.content->appId)) {
        slot.faults = {{reading.content->appId, PackageFolder::descriptionName,
                        "has the identifier of the package in " + other->folder}};
        return;
    }
    takeIn(slot, std::move(reading.content));
}

/// All of it is there before anybody hears of it.
void PackageShelf::takeIn(Slot& slot, std::unique_ptr<PackageContent> content)
{
    const PackageContent& shelved = *content;
    std::apply(
        [&](const auto&... items) {
            const auto enterIds = [&](const auto& list) {
                for (const auto& item : list) {
                    m_id2package[item->uniqueId] = shelved.appId;
                }
            };
            (enterIds(items), ...);
        },
        shelved.items);
    m_storage.package2storage[shelved.appId] = shelved.storage;
    slot.content = std::move(content);
    install(shelved);
}

void PackageShelf::clear(const QString& folder)
{
    auto slot = m_folder2slot.extract(folder);
    if (slot.empty()) {
        return;
    }
    std::unique_ptr<PackageContent> content = std::move(slot.mapped().content);
    if (!content) {
        return;
    }
    const PackageContent& gone = *content;
    m_retired.push_back(std::move(content));
    for (auto id = m_id2package.begin(); id != m_id2package.end();) {
        id = id->second == gone.appId ? m_id2package.erase(id) : std::next(id);
    }
    m_storage.package2storage.erase(gone.appId);
    for (const Import::Object* import : gone.imports) {
        m_importsView->remove(import);
    }
    // Whoever hears of an import may have put the package again.
    if (!package(gone.appId)) {
        uninstall(gone.appId);
    }
}

/// The folders of packages that lack elements whose identifiers are free by now.
std::deque<QString> PackageShelf::completable() const
{
    std::deque<QString> folders;
    for (const auto& [folder, slot] : m_folder2slot) {
        const bool isAnyFree = std::any_of(slot.takenIds.begin(), slot.takenIds.end(),
                                           [this](const QString& id) { return m_id2package.count(id) == 0; });
        if (isAnyFree) {
            folders.push_back(folder);
        }
    }
    return folders;
}

void PackageShelf::install(const PackageContent& content)
{
    Package::InApp::Pack described;
    if (content.pack) {
        described = *content.pack;
    }
    described.appId = content.appId;
    described.installationStatus = Package::InApp::Pack::Installed;
    const std::deque<Import::Object*> imports = content.imports;
    const Package::InApp::Pack* pack = m_catalogue.findPack(content.appId);
    if (!pack) {
        pack = enter(described);
    } else {
        m_packsView->change(pack)->setInstallationStatus(Package::InApp::Pack::Installed);
    }
    for (Import::Object* import : imports) {
        // Those who hear of one thing may have the package taken off before the next.
        if (package(content.appId) == &content) {
            m_importsView->own(import)->pack = pack;
        }
    }
}

void PackageShelf::uninstall(const QString& appId)
{
    const Package::InApp::Pack* const pack = m_catalogue.findPack(appId);
    if (!pack) {
        return;
    }
    if (m_offered.count(appId) != 0) {
        m_packsView->change(pack)->setInstallationStatus(Package::InApp::Pack::DefaultStatus);
        return;
    }
    m_catalogueView->change(&m_catalogue)->removePack(pack);
    m_packsView->remove(pack);
    const auto owned =
        std::find_if(m_packs.begin(), m_packs.end(), [pack](const auto& each) { return each.get() == pack; });
    m_retiredPacks.push_back(std::move(*owned));
    m_packs.erase(owned);
}

/// Has the catalogue tell of a copy.
const Package::InApp::Pack* PackageShelf::enter(const Package::InApp::Pack& pack)
{
    m_packs.push_back(std::make_unique<Package::InApp::Pack>(pack));
    Package::InApp::Pack* const entered = m_packs.back().get();
    m_packsView->own(entered);
    m_catalogueView->change(&m_catalogue)->addPack(entered);
    return entered;
}

void PackageShelf::freeRetired()
{
    if (m_depth != 0) {
        return;
    }
    const auto contents = std::exchange(m_retired, {});
    const auto packs = std::exchange(m_retiredPacks, {});
}

PackageShelf::Fingerprint PackageShelf::fingerprintOf(const QString& folder)
{
    Fingerprint fingerprint;
    QDirIterator files(folder, QDir::Files | QDir::Hidden | QDir::System, QDirIterator::Subdirectories);
    while (files.hasNext()) {
        files.next();
        const QFileInfo info = files.fileInfo();
        fingerprint[info.filePath()] = {info.size(), info.lastModified().toMSecsSinceEpoch()};
    }
    return fingerprint;
}

} // namespace Host
