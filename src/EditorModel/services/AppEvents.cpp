// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/AppEvents.h>

namespace AppEvents {

Object::~Object() = default;

const Object* globalObject()
{
    static const Object object;
    return &object;
}

} // namespace AppEvents
