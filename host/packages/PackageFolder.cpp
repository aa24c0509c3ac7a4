// SPDX-License-Identifier: Apache-2.0
#include "host/packages/PackageFolder.h"

#include "host/commands/Refusal.h"
#include "host/media/MediaInput.h"

#include <QDir>
#include <QFileInfo>

namespace Host {

const QString PackageFolder::descriptionName = QStringLiteral("package.json");

PackageFolder::PackageFolder(const QString& path) : m_path(QFileInfo(path).canonicalFilePath()) {}

QString PackageFolder::file(const QString& name) const
{
    const QString whole = inside(name);
    try {
        requireFile(whole);
    } catch (const MediaError& error) {
        throw Refusal(name, error.reason);
    }
    return whole;
}

QString PackageFolder::folder(const QString& name) const
{
    const QString whole = inside(name);
    const QFileInfo info(whole);
    if (!info.isDir()) {
        throw Refusal(name, info.exists() ? "is no folder" : "does not exist");
    }
    return whole;
}

Document::Graph PackageFolder::document(const QString& name) const
{
    const QString whole = file(name);
    try {
        return Document::loadFile(whole, Document::ForeignDocuments);
    } catch (const Document::Error& error) {
        // The fault names the file already.
        QString reason = QString::fromUtf8(error.what());
        const QString prefix = whole + ": ";
        throw Refusal(name,
                      "is damaged: " + (reason.startsWith(prefix) ? reason.mid(prefix.size()) : reason));
    }
}

/// The name is walked as a text first: what does not exist has no canonical path.
QString PackageFolder::inside(const QString& name) const
{
    if (name.isEmpty()) {
        throw Refusal(name, "has no name");
    }
    const QString clean = QDir::cleanPath(name);
    if (QDir::isAbsolutePath(clean) || clean == ".." || clean.startsWith("../")) {
        throw Refusal(name, "lies outside of the package");
    }
    const QString whole = m_path + '/' + clean;
    const QString target = QFileInfo(whole).canonicalFilePath();
    if (!target.isEmpty() && target != m_path && !target.startsWith(m_path + '/')) {
        throw Refusal(name, "is a link that leads out of the package");
    }
    return whole;
}

} // namespace Host
