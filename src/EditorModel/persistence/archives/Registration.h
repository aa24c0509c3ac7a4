// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Type.h>

namespace Serialize::Details {

/// Makes what Boost's archives need of a type known to them.
void enterForms(const Type& type);

} // namespace Serialize::Details
