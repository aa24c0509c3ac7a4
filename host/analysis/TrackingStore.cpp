// SPDX-License-Identifier: Apache-2.0
#include "host/analysis/TrackingStore.h"

#include "host/commands/Refusal.h"
#include "host/project/DocumentFile.h"
#include "host/project/ProjectContexts.h"

#include <QCryptographicHash>
#include <QDir>
#include <QFile>

#include <algorithm>

namespace Host {
namespace {

const QString folderName = QStringLiteral("trackings");
const QString prefix = QStringLiteral("t-");
const QString ending = QStringLiteral(".json");
constexpr int longestId = 100;

/// Small letters, digits and '-' stand for themselves, every other UTF-16 unit is four digits behind '_'.
QString encoded(const QString& id)
{
    QString name;
    for (const QChar c : id) {
        const bool isPlain = (c >= 'a' && c <= 'z') || (c >= '0' && c <= '9') || c == '-';
        name += isPlain ? QString(c) : QStringLiteral("_%1").arg(c.unicode(), 4, 16, QChar('0'));
    }
    return name;
}

QString digest(const QString& id)
{
    const auto* const units = reinterpret_cast<const char*>(id.utf16());
    const QByteArray bytes = QByteArray::fromRawData(units, id.size() * int(sizeof(ushort)));
    return QString::fromLatin1(QCryptographicHash::hash(bytes, QCryptographicHash::Sha256).toHex());
}

QStringList filesIn(const QDir& folder)
{
    return folder.entryList({prefix + '*' + ending}, QDir::Files | QDir::CaseSensitive, QDir::Name);
}

[[noreturn]] void refuse(const QString& path, const char* reason)
{
    throw Document::Error(path.toStdString(), "", reason);
}

} // namespace

TrackingStore::TrackingStore()
{
    subscribeAll<Data>();
    subscribeAll<ProjectExtraInfo::LoadContext>();
    subscribeAll<ProjectExtraInfo::SaveContext>();
}

TrackingStore::~TrackingStore() = default;

void TrackingStore::put(const Data& tracking)
{
    m_trackings[tracking.id] = std::make_shared<const Data>(tracking);
}

void TrackingStore::remove(const QString& id)
{
    m_trackings.erase(id);
}

std::shared_ptr<const MotionTracking::Data> TrackingStore::find(const QString& id) const
{
    const auto found = m_trackings.find(id);
    return found == m_trackings.end() ? nullptr : found->second;
}

QStringList TrackingStore::ids() const
{
    QStringList ids;
    for (const auto& entry : m_trackings) {
        ids << entry.first;
    }
    return ids;
}

void TrackingStore::load(const QString& folder)
{
    m_trackings.clear();
    m_damages.clear();
    const QDir place(folder);
    for (const QString& name : filesIn(place)) {
        loadFile(place.filePath(name));
    }
}

void TrackingStore::save(const QString& folder)
{
    const QDir place(folder);
    if (!m_trackings.empty() && !QDir().mkpath(folder)) {
        refuse(folder, "cannot be made");
    }
    QStringList written;
    for (const auto& [id, tracking] : m_trackings) {
        written << fileNameOf(id);
        const QString path = place.filePath(written.last());
        saveDocument({tracking.get()}, path);
        m_damages.erase(std::remove_if(m_damages.begin(), m_damages.end(),
                                       [&path](const Damage& damage) { return damage.path == path; }),
                        m_damages.end());
    }
    for (const QString& name : filesIn(place)) {
        const QString path = place.filePath(name);
        if (!written.contains(name) && !isDamaged(path) && !QFile::remove(path)) {
            refuse(path, "cannot be removed");
        }
    }
}

QString TrackingStore::folderOf(const QString& projectPath)
{
    return QDir(ProjectPlace{projectPath, nullptr}.sideFolder()).filePath(folderName);
}

QString TrackingStore::fileNameOf(const QString& id)
{
    const QString name = encoded(id);
    // No other name has a '~'.
    return prefix + (name.size() <= longestId ? name : '~' + digest(id)) + ending;
}

void TrackingStore::notify(const MotionTracking::Details::IsAvailableTrackingRequest& request)
{
    // Whoever hears of the data may change what there is.
    const std::shared_ptr<const Data> data = find(request.id);
    const Data* const sender = request.sender;
    if (data) {
        PubSub::publish(MotionTracking::Details::LoadTrackingNotification(sender, data));
    }
    PubSub::publish(MotionTracking::Details::IsAvailableTrackingNotification(sender, data != nullptr));
}

void TrackingStore::notify(const ProjectExtraInfo::ProjectContentLoaded& message)
{
    load(folderOf(message.sender->path));
}

void TrackingStore::notify(const ProjectExtraInfo::ProjectContentSaved& message)
{
    save(folderOf(message.sender->path));
}

void TrackingStore::loadFile(const QString& path)
{
    try {
        const Document::Graph graph = loadDocument(path);
        const auto* const data = graph.rootAs<Data>();
        if (!data) {
            m_damages.push_back({path, "holds no tracking, but " + contentOf(graph)});
        } else if (fileNameOf(data->id) != QFileInfo(path).fileName()) {
            m_damages.push_back({path, "holds the tracking \"" + data->id + "\", which has another name"});
        } else {
            put(*data);
        }
    } catch (const Refusal& refusal) {
        m_damages.push_back({path, refusal.reason});
    } catch (const Document::Error& error) {
        m_damages.push_back({path, QString::fromStdString(error.reason())});
    }
}

bool TrackingStore::isDamaged(const QString& path) const
{
    return std::any_of(m_damages.begin(), m_damages.end(),
                       [&path](const Damage& damage) { return damage.path == path; });
}

} // namespace Host
