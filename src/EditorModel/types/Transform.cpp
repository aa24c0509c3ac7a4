// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/Transform.h>

#include <EditorModel/persistence/Fields.h>
#include <EditorModel/types/Norvel.h>

#include <QTransform>

namespace Types {

Transform::Transform() = default;

Transform::Transform(double m11_, double m12_, double m13_, double m21_, double m22_, double m23_,
                     double m31_, double m32_, double m33_)
    : m11(m11_), m12(m12_), m13(m13_), m21(m21_), m22(m22_), m23(m23_), m31(m31_), m32(m32_), m33(m33_)
{}

Transform::Transform(const Norvel::Proc::Matrix3x3& matrix)
    : Transform(matrix.m11, matrix.m12, matrix.m13, matrix.m21, matrix.m22, matrix.m23, matrix.m31,
                matrix.m32, matrix.m33)
{}

Transform::Transform(const QTransform& transform)
    : Transform(transform.m11(), transform.m12(), transform.m13(), transform.m21(), transform.m22(),
                transform.m23(), transform.m31(), transform.m32(), transform.m33())
{}

Transform& Transform::operator=(const Norvel::Proc::Matrix3x3& matrix)
{
    return *this = Transform(matrix);
}

Transform& Transform::operator=(const QTransform& transform)
{
    return *this = Transform(transform);
}

Transform Transform::fromMatrix3x3(const Norvel::Proc::Matrix3x3& matrix)
{
    return Transform(matrix);
}

Transform Transform::fromQTransform(const QTransform& transform)
{
    return Transform(transform);
}

Norvel::Proc::Matrix3x3 Transform::toMatrix3x3() const
{
    return {m11, m12, m13, m21, m22, m23, m31, m32, m33};
}

QTransform Transform::toQTransform() const
{
    return QTransform(m11, m12, m13, m21, m22, m23, m31, m32, m33);
}

void fields(Serialize::Fields& f, Transform& transform)
{
    f("m11", transform.m11)("m12", transform.m12)("m13", transform.m13);
    f("m21", transform.m21)("m22", transform.m22)("m23", transform.m23);
    f("m31", transform.m31)("m32", transform.m32)("m33", transform.m33);
}

} // namespace Types

EDITORMODEL_PERSISTENT_CLASS(Types::Transform)
