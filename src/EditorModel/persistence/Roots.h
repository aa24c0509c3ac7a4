// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/FailurePlace.h>
#include <EditorModel/persistence/Serializable.h>

#include <deque>
#include <iosfwd>

namespace Serialize {
class Fields;
}

namespace Serialize::Details {

/// The objects of a document, held by pointer, as one field of whatever stores them. Readers give what they
/// make to the current construction log.
using Roots = std::deque<const ISerializable*>;

constexpr const char* rootsKey = "objects";

/// Runs what stores or reads the roots; their key is noted as that of any other field.
template <class Body>
void atRoots(Body body)
{
    try {
        body();
    } catch (...) {
        FailurePlace::add(rootsKey, 0);
        throw;
    }
}

void visitRoots(Fields& fields, Roots& roots);

void writeBinaryArchive(std::ostream& stream, Roots& roots);
void writeXmlArchive(std::ostream& stream, Roots& roots);
void readBinaryArchive(std::istream& stream, Roots& roots);
void readXmlArchive(std::istream& stream, Roots& roots);

void writeStream(ISerializer& serializer, Roots& roots);
void readStream(IDeserializer& deserializer, Roots& roots);

} // namespace Serialize::Details
