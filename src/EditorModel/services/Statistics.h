// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>

namespace Statistics {

/// The sender of messages about the usage statistics. It holds nothing: its identity is its use. It can be
/// written, without fields, but isn't made by name.
class EDITORMODEL_EXPORT Object : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT_UNREGISTERED(Object)

public:
    ~Object() override;
};

/// The one instance, made at the first call and destroyed when the process exits. Never null.
EDITORMODEL_EXPORT const Object* globalObject();

} // namespace Statistics
