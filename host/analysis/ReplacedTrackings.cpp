// SPDX-License-Identifier: Apache-2.0
#include "host/analysis/ReplacedTrackings.h"

#include "host/commands/Refusal.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <algorithm>
#include <utility>

namespace Host {
namespace {

constexpr auto everything = QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot;

bool isTaken(const QString& path)
{
    const QFileInfo info(path);
    return info.exists() || info.isSymLink();
}

QString freeName(const QString& folder)
{
    const QString name = folder + "-replaced";
    QString free = name;
    for (int number = 2; isTaken(free); ++number) {
        free = QStringLiteral("%1-%2").arg(name).arg(number);
    }
    return free;
}

/// False also for what cannot be read.
bool haveSameContent(const QString& a, const QString& b)
{
    QFile first(a);
    QFile second(b);
    return QFileInfo(a).isFile() && QFileInfo(b).isFile() && first.open(QIODevice::ReadOnly) &&
           second.open(QIODevice::ReadOnly) && first.size() == second.size() &&
           first.readAll() == second.readAll();
}

bool holdsAllOf(const QDir& folder, const QDir& other)
{
    const QStringList names = other.entryList(everything);
    return std::all_of(names.begin(), names.end(), [&](const QString& name) {
        return haveSameContent(folder.filePath(name), other.filePath(name));
    });
}

/// Of a link, not what it leads to.
bool removeFolder(const QString& path)
{
    return QFileInfo(path).isSymLink() ? QFile::remove(path) : QDir(path).removeRecursively();
}

} // namespace

ReplacedTrackings::ReplacedTrackings(const QString& folder) : m_folder(folder)
{
    if (folder.isEmpty() || QDir(folder).entryList(everything).isEmpty()) {
        return;
    }
    const QString aside = freeName(folder);
    if (!QDir().rename(folder, aside)) {
        throw Refusal(folder, "cannot be set aside as " + QFileInfo(aside).fileName());
    }
    m_aside = aside;
}

ReplacedTrackings::~ReplacedTrackings()
{
    if (!m_aside.isEmpty() && !isTaken(m_folder)) {
        QDir().rename(m_aside, m_folder);
    }
}

QString ReplacedTrackings::settle()
{
    QString kept = std::exchange(m_aside, {});
    if (!kept.isEmpty() && holdsAllOf(QDir(m_folder), QDir(kept)) && removeFolder(kept)) {
        kept.clear();
    }
    return kept;
}

} // namespace Host
