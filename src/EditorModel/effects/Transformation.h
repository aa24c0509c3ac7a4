// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/Transform.h>

namespace Transformation {

/// Where a picture stands and how much of it shows.
class EDITORMODEL_EXPORT Object : public Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Object)

public:
    /// The identity by default.
    Types::Transform matrix;
    /// In percent.
    int opacity = 100;

    Object();
    Object(const Types::Transform& matrix_, int opacity_);
    Object(const Object&) = default;
    Object(Object&&) = default;
    Object& operator=(const Object&) = default;
    Object& operator=(Object&&) = default;
    ~Object() override;

    Object* setMatrix(const Types::Transform& newMatrix);
    Object* setOpacity(int percent);
};

/// The matrices coefficient by coefficient, as `qFuzzyCompare` of two `QTransform`: relative, to twelve
/// digits, so that zero equals zero only. The opacities exactly.
EDITORMODEL_EXPORT bool operator==(const Object& a, const Object& b);
EDITORMODEL_EXPORT bool operator!=(const Object& a, const Object& b);

} // namespace Transformation

EDITORMODEL_ARCHIVE_NAME(Transformation::Object, "Transformation::Object")
