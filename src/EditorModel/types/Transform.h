// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/persistence/Persistent.h>

class QTransform;

namespace Norvel::Proc {
struct Matrix3x3;
}

namespace Types {

/// A 3x3 transform in row order with the names of QTransform: `m31` and `m32` are the translation. It has no
/// equality; compare the fields.
class EDITORMODEL_EXPORT Transform : public Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Transform)

public:
    double m11 = 1.0;
    double m12 = 0.0;
    double m13 = 0.0;
    double m21 = 0.0;
    double m22 = 1.0;
    double m23 = 0.0;
    double m31 = 0.0;
    double m32 = 0.0;
    double m33 = 1.0;

    /// The identity.
    Transform();
    Transform(double m11_, double m12_, double m13_, double m21_, double m22_, double m23_, double m31_,
              double m32_, double m33_);
    Transform(const Norvel::Proc::Matrix3x3& matrix);
    Transform(const QTransform& transform);
    Transform(const Transform&) = default;

    Transform& operator=(const Transform&) = default;
    Transform& operator=(const Norvel::Proc::Matrix3x3& matrix);
    Transform& operator=(const QTransform& transform);

    static Transform fromMatrix3x3(const Norvel::Proc::Matrix3x3& matrix);
    static Transform fromQTransform(const QTransform& transform);

    Norvel::Proc::Matrix3x3 toMatrix3x3() const;
    QTransform toQTransform() const;
};

} // namespace Types

EDITORMODEL_ARCHIVE_NAME(Types::Transform, "Types::Transform")
