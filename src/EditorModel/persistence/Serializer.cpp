// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/Serializer.h>

namespace Serialize {

IFieldStream::~IFieldStream() = default;
ISerializer::~ISerializer() = default;
IDeserializer::~IDeserializer() = default;

} // namespace Serialize
