// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/editing/ClipKeeper.h"
#include "host/editing/EditSession.h"
#include "host/media/CollectionKeeper.h"
#include "host/media/FileImporter.h"
#include "host/media/MediaOpener.h"
#include "host/media/ResourceKeeper.h"

#include <EditorModel/library/Project.h>
#include <EditorModel/media/FileAdder.h>
#include <EditorModel/media/ResourceTable.h>

#include <optional>

namespace Host {

/// The modules around the objects of one project, which edit it and add media to it. What they make for the
/// project is freed with them: store it before.
class ProjectModules : private Message::View<ResourceTable::Object>
{
public:
    /// The content's objects outlive the modules. It has a timeline; the others may be null.
    explicit ProjectModules(const Project::Content& content);
    ProjectModules(const ProjectModules&) = delete;
    ProjectModules& operator=(const ProjectModules&) = delete;
    ~ProjectModules() override;

    EditSession& session() { return m_session; }
    ClipKeeper& clips() { return m_clips; }
    MediaClips& media() { return m_importer.clips(); }
    /// Where media go besides the timeline.
    const FileAdder::Contexts& places() const { return m_places; }

private:
    MediaOpener m_opener;
    ResourceKeeper m_resources;
    std::optional<CollectionKeeper> m_collection;
    EditSession m_session;
    ClipKeeper m_clips{m_session.timeline()};
    FileImporter m_importer{m_session};
    FileAdder::Contexts m_places;
};

} // namespace Host
