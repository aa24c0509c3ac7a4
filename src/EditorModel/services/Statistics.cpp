// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Statistics.h>

#include <EditorModel/persistence/Fields.h>

namespace Statistics {

Object::~Object() = default;

const Object* globalObject()
{
    static const Object object;
    return &object;
}

void fields(Serialize::Fields&, Object&) {}

} // namespace Statistics

EDITORMODEL_PERSISTENT_CLASS_UNREGISTERED(Statistics::Object, "Statistics::Object")
