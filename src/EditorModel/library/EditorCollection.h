// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/library/CollectionIds.h>
#include <EditorModel/library/UserObject.h>

namespace EditorCollection {

/// The sender of messages about the collections as a whole. It holds nothing: its identity is its use.
class EDITORMODEL_EXPORT Object : public virtual PubSub::Object
{
public:
    ~Object() override;
};

/// The one instance, made at the first call and destroyed when the process exits. Never null.
EDITORMODEL_EXPORT const Object* globalObject();

} // namespace EditorCollection
