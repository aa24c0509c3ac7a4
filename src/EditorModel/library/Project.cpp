// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/Project.h>

#include <EditorModel/library/UserObject.h>
#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/persistence/Fields.h>
#include <EditorModel/timeline/Object.h>

namespace Project {

Content::~Content() = default;

bool Content::operator==(const Content& other) const
{
    return timeline == other.timeline && userCollection == other.userCollection &&
           resourceTable == other.resourceTable;
}

bool Content::operator!=(const Content& other) const
{
    return !(*this == other);
}

void fields(Serialize::Fields& f, Content& content)
{
    f("timeline", content.timeline)("userCollection", content.userCollection);
    f("resourceTable", content.resourceTable)("portable", content.portable);
}

} // namespace Project

namespace ProjectExtraInfo {

ProjectContentLoaded::~ProjectContentLoaded() = default;
ProjectContentSaved::~ProjectContentSaved() = default;

} // namespace ProjectExtraInfo

EDITORMODEL_PERSISTENT_CLASS(Project::Content)
