// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/library/Project.h>
#include <EditorModel/persistence/Document.h>
#include <EditorModel/timeline/Timeline.h>

#include <QByteArray>
#include <QString>

namespace Host {

/// What the commands work on: a project, or a plain document with a timeline in it, and all that it points
/// at.
class ProjectDocument
{
public:
    /// The document may be anybody's. Throws Refusal where there is no file, and Document::Error.
    static ProjectDocument load(const QString& path);

    /// Null for a plain document.
    Project::Content* project() const { return m_project; }
    const Document::Graph& graph() const { return m_graph; }

    /// The project's, or the first root that is one. Throws Refusal where there is none.
    Timeline::Object& timeline() const;

    /// A clip of a timeline in the document, which owns it: nobody else has claimed it constant.
    Timeline::Clip& writable(const Timeline::Clip& clip) const { return const_cast<Timeline::Clip&>(clip); }

    /// As what it was loaded as, with what else it holds, to where it was loaded from. The file is replaced
    /// as a whole or not at all, and not where somebody else has changed it meanwhile; its ending tells the
    /// form. Throws Refusal for another ending, and Document::Error.
    void save();

private:
    ProjectDocument(QString path, QByteArray version, Document::Graph graph, Project::Content* project);

    QString m_path;
    /// Of the file that was read, or saved here last.
    QByteArray m_version;
    Document::Graph m_graph;
    Project::Content* m_project;
};

/// Which of its roots a plain document is about: the first timeline, or null.
Timeline::Object* timelineOf(const Document::Graph& graph);

} // namespace Host
