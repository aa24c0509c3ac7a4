// SPDX-License-Identifier: Apache-2.0
#include "TimelineDocument.h"

#include "MediaInput.h"

#include <deque>
#include <utility>

namespace Host {
namespace {

void saveRoots(const std::deque<const Serialize::ISerializable*>& roots, const QString& path)
{
    const auto form = Document::formOfPath(path);
    if (!form) {
        throw Refusal(path, "is no name of a document: such a name ends in .json, .xml or .bin");
    }
    Document::saveFile(path, roots, *form, Document::Stream);
}

QString contentOf(const Document::Graph& graph)
{
    const auto* const root = graph.rootAs<Serialize::ISerializable>();
    return root ? QString::fromStdString(root->GetNameInArchive()) : "nothing";
}

} // namespace

Refusal::Refusal(const QString& about, const QString& why)
    : std::runtime_error((about + ": " + why).toStdString()), name(about), reason(why)
{}

TimelineDocument TimelineDocument::load(const QString& path)
{
    try {
        requireFile(path);
    } catch (const MediaError& error) {
        throw Refusal(path, error.reason);
    }
    Document::Graph graph = Document::loadFile(path, Document::ForeignDocuments);
    Timeline::Object* const timeline = timelineOf(graph);
    if (!timeline) {
        throw Refusal(path, "holds no timeline, but " + contentOf(graph));
    }
    return TimelineDocument(std::move(graph), timeline);
}

void TimelineDocument::save(const Timeline::Object& timeline, const QString& path)
{
    saveRoots({&timeline}, path);
}

void TimelineDocument::save(const QString& path) const
{
    saveRoots({m_graph.roots().begin(), m_graph.roots().end()}, path);
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
