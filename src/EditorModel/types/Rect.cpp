// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/Rect.h>

#include <EditorModel/persistence/Fields.h>
#include <EditorModel/types/FuzzyCompare.h>

namespace Types {

Rect::Rect() = default;

Rect::Rect(double left_, double top_, double right_, double bottom_)
    : left(left_), top(top_), right(right_), bottom(bottom_)
{}

bool operator==(const Rect& a, const Rect& b)
{
    if (&a == &b)
        return true;
    return fuzzyEqual(a.left, b.left) && fuzzyEqual(a.top, b.top) && fuzzyEqual(a.right, b.right) &&
           fuzzyEqual(a.bottom, b.bottom);
}

void fields(Serialize::Fields& f, Rect& rect)
{
    f("top", rect.top)("left", rect.left)("bottom", rect.bottom)("right", rect.right);
}

} // namespace Types

EDITORMODEL_PERSISTENT_CLASS(Types::Rect)
