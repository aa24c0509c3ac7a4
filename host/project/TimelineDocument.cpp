// SPDX-License-Identifier: Apache-2.0
#include "host/project/TimelineDocument.h"

#include "host/commands/Refusal.h"
#include "host/project/DocumentFile.h"

#include <utility>

namespace Host {
TimelineDocument TimelineDocument::load(const QString& path)
{
    Document::Graph graph = loadDocument(path);
    Timeline::Object* const timeline = timelineOf(graph);
    if (!timeline) {
        throw Refusal(path, "holds no timeline, but " + contentOf(graph));
    }
    return TimelineDocument(std::move(graph), timeline);
}

void TimelineDocument::save(const Timeline::Object& timeline, const QString& path)
{
    saveDocument({&timeline}, path);
}

void TimelineDocument::save(const QString& path) const
{
    saveDocument({m_graph.roots().begin(), m_graph.roots().end()}, path);
}

TimelineDocument::TimelineDocument(Document::Graph graph, Timeline::Object* timeline)
    : m_graph(std::move(graph)), m_timeline(timeline)
{}

Timeline::Object* timelineOf(const Document::Graph& graph)
{
    for (Serialize::ISerializable* root : graph.roots()) {
        if (auto* const timeline = dynamic_cast<Timeline::Object*>(root)) {
            return timeline;
        }
    }
    return nullptr;
}

} // namespace Host
