// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/Link.h>

#include <EditorModel/persistence/Fields.h>
#include <EditorModel/timeline/Clip.h>

namespace Timeline {

Link::Link(const Timeline::Clip* master_, MTime offset_) : master(master_), offset(offset_) {}

Link::~Link() = default;

bool operator==(const Link& a, const Link& b)
{
    return a.master == b.master && a.offset == b.offset;
}

void fields(Serialize::Fields& f, Link& link)
{
    f("master", link.master)("offset", link.offset);
}

} // namespace Timeline

EDITORMODEL_PERSISTENT_CLASS(Timeline::Link)
