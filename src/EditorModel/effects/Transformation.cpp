// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/Transformation.h>

#include <EditorModel/persistence/Fields.h>

#include <QTransform>

namespace Transformation {

Object::Object() = default;

Object::Object(const Types::Transform& matrix_, int opacity_) : matrix(matrix_), opacity(opacity_) {}

Object::~Object() = default;

Object* Object::setMatrix(const Types::Transform& newMatrix)
{
    matrix = newMatrix;
    return this;
}

Object* Object::setOpacity(int percent)
{
    opacity = percent;
    return this;
}

bool operator==(const Object& a, const Object& b)
{
    return qFuzzyCompare(a.matrix.toQTransform(), b.matrix.toQTransform()) && a.opacity == b.opacity;
}

bool operator!=(const Object& a, const Object& b)
{
    return !(a == b);
}

void fields(Serialize::Fields& f, Object& transformation)
{
    f("matrix", transformation.matrix)("opacity", transformation.opacity);
}

} // namespace Transformation

EDITORMODEL_PERSISTENT_CLASS(Transformation::Object)
