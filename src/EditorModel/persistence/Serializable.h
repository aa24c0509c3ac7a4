// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>

#include <string>
#include <vector>

namespace Serialize {

class ISerializer;
class IDeserializer;

/// Root of every class that writes and reads itself under named fields.
class EDITORMODEL_EXPORT ISerializable
{
public:
    ISerializable() = default;
    ISerializable(const ISerializable&) = default;
    ISerializable& operator=(const ISerializable&) = default;
    virtual ~ISerializable();

    /// The registered name of the most derived class.
    virtual const std::string GetNameInArchive() const = 0;
    virtual void Serialize(ISerializer& serializer) const = 0;
    /// Reads the fields in the order in which `Serialize` writes them. After an exception the object stays in
    /// the state that it had reached.
    virtual void Deserialize(IDeserializer& deserializer) = 0;
};

/// Makes objects of one class for a reader that knows only the class's name.
class EDITORMODEL_EXPORT BaseCreator
{
public:
    /// A default-constructed object on the heap, owned by the caller.
    virtual ISerializable* Create() const = 0;
    virtual ~BaseCreator();
};

/// Enters a class in the process-wide table of names when it is constructed, and does nothing else.
class EDITORMODEL_EXPORT Registrator
{
public:
    /// Both are kept by address and must live as long as the process. Throws `std::logic_error` where another
    /// class already has the name.
    Registrator(const char* const name, const BaseCreator* const creator);
};

/// The creator registered under `name`, or null.
EDITORMODEL_EXPORT const BaseCreator* findCreator(const std::string& name);

/// All registered names, sorted.
EDITORMODEL_EXPORT std::vector<std::string> registeredNames();

} // namespace Serialize
