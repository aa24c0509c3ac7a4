// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Command.h>

namespace Command {

Object::~Object() = default;

const Object* globalObject()
{
    static const Object object;
    return &object;
}

} // namespace Command
