// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/Label.h>

#include <EditorModel/persistence/Fields.h>
#include <EditorModel/timeline/Object.h>

namespace Timeline {

Label::~Label() = default;

Label* Label::setPosition(MTime newPosition)
{
    position = newPosition;
    return this;
}

Label* Label::setName(const QString& newName)
{
    name = newName;
    return this;
}

bool operator==(const Label& a, const Label& b)
{
    return a.timeline == b.timeline && a.position == b.position && a.name == b.name;
}

void fields(Serialize::Fields& f, Label& label)
{
    f("timeline", label.timeline)("position", label.position)("name", label.name);
}

} // namespace Timeline

EDITORMODEL_PERSISTENT_CLASS(Timeline::Label)
