// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/persistence/Persistent.h>

namespace Types {

/// A rectangle by its four edges, in the units of whoever holds it. Nothing keeps them in order.
class EDITORMODEL_EXPORT Rect : public Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Rect)

public:
    double left = 0.0;
    double top = 0.0;
    double right = 0.0;
    double bottom = 0.0;

    Rect();
    Rect(double left_, double top_, double right_, double bottom_);
    Rect(const Rect&) = default;

    Rect& operator=(const Rect&) = default;
};

/// Edge by edge, each as fuzzyEqual(); a rectangle always equals itself.
EDITORMODEL_EXPORT bool operator==(const Rect& a, const Rect& b);

} // namespace Types

EDITORMODEL_ARCHIVE_NAME(Types::Rect, "Types::Rect")
