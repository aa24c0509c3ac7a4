// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/EditorCollection.h>

namespace EditorCollection {

Object::~Object() = default;

const Object* globalObject()
{
    static const Object object;
    return &object;
}

} // namespace EditorCollection
