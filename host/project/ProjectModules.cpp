// SPDX-License-Identifier: Apache-2.0
#include "host/project/ProjectModules.h"

namespace Host {

ProjectModules::ProjectModules(const Project::Content& content) : m_session(content.timeline)
{
    if (content.userCollection) {
        m_collection.emplace(content.userCollection);
        m_places.setContext(FileAdder::UserCollectionContext());
    }
    if (content.resourceTable) {
        add(content.resourceTable);
        m_places.setContext(FileAdder::ResourceTableContext(content.resourceTable));
    }
}

ProjectModules::~ProjectModules() = default;

} // namespace Host
