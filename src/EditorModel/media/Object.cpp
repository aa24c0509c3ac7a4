// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/Object.h>

namespace Media {

Object::~Object() = default;

} // namespace Media
