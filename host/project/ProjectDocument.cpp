// SPDX-License-Identifier: Apache-2.0
#include "host/project/ProjectDocument.h"

#include "host/commands/Refusal.h"
#include "host/project/DocumentFile.h"
#include "host/project/FileReplacement.h"
#include "host/project/ProjectStore.h"

#include <utility>

namespace Host {
namespace {

/// So much may be wrong with a project that it isn't known for one.
Document::Graph plainDocument(const QString& path)
{
    try {
        return loadDocument(path);
    } catch (const Document::Error& error) {
        throw Document::Error(error.form(), error.place(), error.reason() + ProjectStore::backupHint(path));
    } catch (const Refusal& refusal) {
        const std::string hint = ProjectStore::backupHint(path);
        throw Refusal(path, refusal.reason + QString::fromStdString(hint));
    }
}

} // namespace

ProjectDocument ProjectDocument::load(const QString& path)
{
    // Before the reading: what comes in between is taken for a change.
    const QByteArray version = versionOf(path);
    if (ProjectStore::isProject(path)) {
        OpenedProject opened = ProjectStore::open(path);
        Project::Content* const content = &opened.content();
        return ProjectDocument(path, version, opened.takeGraph(), content);
    }
    Document::Graph graph = plainDocument(path);
    if (graph.rootAs<Project::Content>()) {
        // Nothing would tell that such a project is damaged.
        throw Refusal(path, "holds a project without its checksum" +
                                QString::fromStdString(ProjectStore::backupHint(path)));
    }
    return ProjectDocument(path, version, std::move(graph), nullptr);
}

Timeline::Object& ProjectDocument::timeline() const
{
    Timeline::Object* const timeline = m_project ? m_project->timeline : timelineOf(m_graph);
    if (!timeline) {
        throw Refusal(m_path, "holds no timeline, but " + contentOf(m_graph));
    }
    return *timeline;
}

void ProjectDocument::save()
{
    if (m_project) {
        ProjectStore::save(*m_project, m_path, m_version);
    } else if (versionOf(m_path) == m_version) {
        saveDocument({m_graph.roots().begin(), m_graph.roots().end()}, m_path);
    } else {
        throw Refusal(m_path, "is not replaced: somebody has changed it since it was read");
    }
    m_version = versionOf(m_path);
}

ProjectDocument::ProjectDocument(QString path, QByteArray version, Document::Graph graph,
                                 Project::Content* project)
    : m_path(std::move(path)), m_version(std::move(version)), m_graph(std::move(graph)), m_project(project)
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
