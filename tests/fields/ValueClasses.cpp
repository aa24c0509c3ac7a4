// SPDX-License-Identifier: Apache-2.0
#include "ClassTable.h"

#include <EditorModel/types/Pen.h>
#include <EditorModel/types/Range.h>
#include <EditorModel/types/Rect.h>
#include <EditorModel/types/Transform.h>

namespace FieldTests {
namespace {

ClassTable transform()
{
    using Types::Transform;
    return ClassOf<Transform>("Types::Transform")
        .field<&Transform::m11>("m11", 1.0)
        .field<&Transform::m12>("m12", 0.0)
        .field<&Transform::m13>("m13", 0.0)
        .field<&Transform::m21>("m21", 0.0)
        .field<&Transform::m22>("m22", 1.0)
        .field<&Transform::m23>("m23", 0.0)
        .field<&Transform::m31>("m31", 0.0)
        .field<&Transform::m32>("m32", 0.0)
        .field<&Transform::m33>("m33", 1.0);
}

ClassTable pen()
{
    using Types::Pen;
    return ClassOf<Pen>("Types::Pen")
        .field<&Pen::color>("color", 0xFF000000)
        .field<&Pen::width>("width", 0)
        .field<&Pen::enabled>("enabled", false);
}

ClassTable rect()
{
    using Types::Rect;
    return ClassOf<Rect>("Types::Rect")
        .field<&Rect::left>("left", 0.0)
        .field<&Rect::top>("top", 0.0)
        .field<&Rect::right>("right", 0.0)
        .field<&Rect::bottom>("bottom", 0.0);
}

ClassTable range()
{
    using Types::Range;
    return ClassOf<Range>("Types::Range").field<&Range::from>("from", 0).field<&Range::to>("to", -1);
}

} // namespace

std::vector<ClassTable> valueClasses()
{
    return {transform(), pen(), rect(), range()};
}

} // namespace FieldTests
