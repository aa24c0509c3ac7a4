// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Document.h>
#include <EditorModel/timeline/Timeline.h>

#include <QString>

namespace Host {

/// A timeline and all that it points at, as a document holds them.
class TimelineDocument
{
public:
    /// The document may be anybody's. Throws Refusal where there is no file or no timeline in it, else
    /// Document::Error.
    static TimelineDocument load(const QString& path);
    /// Replaces the file as a whole or not at all; its ending tells the form. Throws Refusal for another
    /// ending, and Document::Error.
    static void save(const Timeline::Object& timeline, const QString& path);

    Timeline::Object& timeline() const { return *m_timeline; }
    /// Saves the timeline, and what else the document held.
    void save(const QString& path) const;

private:
    TimelineDocument(Document::Graph graph, Timeline::Object* timeline);

    Document::Graph m_graph;
    Timeline::Object* m_timeline;
};

/// Which of its roots a document is about: the first timeline, or null.
Timeline::Object* timelineOf(const Document::Graph& graph);

} // namespace Host
