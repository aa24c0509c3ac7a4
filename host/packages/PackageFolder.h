// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Document.h>

#include <QString>

namespace Host {

/// A folder out of which nothing leads: names that would are refused, whether by "..", by an absolute path or
/// by a link.
class PackageFolder
{
public:
    /// Where the description of a package lies in its folder.
    static const QString descriptionName;

    explicit PackageFolder(const QString& path);

    const QString& path() const { return m_path; }

    /// The path of a regular file with something in it. Throws Refusal, which names the file as given.
    QString file(const QString& name) const;
    /// The path of a folder. Throws Refusal.
    QString folder(const QString& name) const;
    /// A document of any origin. Throws Refusal.
    Document::Graph document(const QString& name) const;

private:
    QString inside(const QString& name) const;

    /// Canonical.
    const QString m_path;
};

} // namespace Host
