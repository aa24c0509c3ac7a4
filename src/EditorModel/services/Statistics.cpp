// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Statistics.h>

namespace Statistics {

Object::~Object() = default;

const Object* globalObject()
{
    static const Object object;
    return &object;
}

} // namespace Statistics
