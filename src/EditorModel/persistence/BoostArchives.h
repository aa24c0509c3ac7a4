// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Type.h>

#include <iosfwd>

namespace Serialize::Details {

/// Makes what Boost's archives need of a type known to them.
void enterForms(const Type& type);

/// Whole archives with one object, written and read through a pointer. A reader gives the object to the
/// current construction log.
void writeBinaryArchive(std::ostream& stream, const ISerializable& root);
void writeXmlArchive(std::ostream& stream, const ISerializable& root);
ISerializable* readBinaryArchive(std::istream& stream);
ISerializable* readXmlArchive(std::istream& stream);

} // namespace Serialize::Details
