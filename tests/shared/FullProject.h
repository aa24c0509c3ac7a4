// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tests/shared/FullTimeline.h"

#include <EditorModel/library/EditorCollection.h>
#include <EditorModel/library/ImportObject.h>
#include <EditorModel/library/Project.h>
#include <EditorModel/media/ResourceTable.h>

#include <cstddef>
#include <deque>

namespace Testing {

/// A project with all that one can hold: a full timeline, a collection with an import that it lists twice
/// beside two that are only equal, and a table with every kind of resource. It owns everything, so that a
/// test can change any of it.
class FullProject
{
public:
    FullProject();
    FullProject(const FullProject&) = delete;
    FullProject& operator=(const FullProject&) = delete;

    /// Gives values to the fields that no document keeps.
    void setFieldsThatAreNotStored();

    /// How many objects there are for pointers to name, the project itself included.
    std::size_t objectCount() const;

    FullTimeline full;
    std::deque<Import::Object> imports;
    EditorCollection::UserObject collection;
    ResourceTable::Object table;
    Project::Content content;

private:
    void addImports();
    void addResources();
};

} // namespace Testing
