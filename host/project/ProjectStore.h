// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/library/Project.h>
#include <EditorModel/persistence/Document.h>

#include <QByteArray>
#include <QString>

#include <string>
#include <utility>

namespace Host {

/// A project that was read, and owner of all that it consists of.
class OpenedProject
{
public:
    /// The content is one of the graph's roots.
    OpenedProject(Document::Graph graph, Project::Content* content);

    Project::Content& content() const { return *m_content; }
    const Document::Graph& graph() const { return m_graph; }
    /// Hands over what owns the content, which stays where it is.
    Document::Graph takeGraph() { return std::move(m_graph); }

private:
    Document::Graph m_graph;
    Project::Content* m_content;
};

/// The module that saves whole projects and opens them. After either it publishes ProjectContentSaved or
/// ProjectContentLoaded with its context; what a subscriber throws passes through, and the project is saved
/// then. Errors are a Document::Error that names the file and the reason.
class ProjectStore
{
public:
    /// Replaces the file, and keeps the old one as backup, both whole at every instant; the ending of the
    /// name tells the form. An old file that is no whole project takes no whole backup's place: it is kept
    /// beside it, with the ending ".replaced". Where it fails the old file stands as it was.
    ///
    /// With the version of the file that was read, see versionOf(), no other one is replaced: what somebody
    /// has saved since then would be lost.
    static void save(const Project::Content& content, const QString& path,
                     const QByteArray& readVersion = QByteArray());

    /// The file may be anybody's. Where it cannot be read and its backup can, the error says so.
    static OpenedProject open(const QString& path);
    /// The project that was under this name before the last save.
    static OpenedProject openBackup(const QString& path);

    /// By its marks; false for a file that cannot be read.
    static bool isProject(const QString& path);
    /// Where save() keeps the old file.
    static QString backupOf(const QString& path);
    /// What to say behind the reason why a file cannot be opened: that its backup can, or nothing.
    static std::string backupHint(const QString& path);
};

} // namespace Host
