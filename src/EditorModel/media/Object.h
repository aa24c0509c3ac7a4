// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>

#include <QString>

namespace Media {

/// What files and format records have in common.
class EDITORMODEL_EXPORT Object : public virtual PubSub::Object
{
public:
    /// Copied with the object; not stored, and not read by the model.
    QString label;

    Object() = default;
    Object(const Object&) = default;
    Object(Object&&) = default;
    Object& operator=(const Object&) = default;
    Object& operator=(Object&&) = default;
    ~Object() override;
};

} // namespace Media
