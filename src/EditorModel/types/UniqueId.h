// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>

#include <QString>

namespace Types {

/// A fresh random UUID in braces with lower-case digits, as new objects are identified by. There is no
/// counter behind it.
EDITORMODEL_EXPORT QString nextUniqueId();

} // namespace Types
