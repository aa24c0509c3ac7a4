// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>

namespace Types {

/// True where both values are within 1e-12 of zero, or where they differ by at most the lesser magnitude
/// divided by 1e12. An infinity is not equal to itself, but, by this rule, to the opposite one: both sides of
/// the comparison are infinite. Not-a-number is equal to nothing.
EDITORMODEL_EXPORT bool fuzzyEqual(double a, double b);

} // namespace Types
