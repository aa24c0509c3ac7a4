// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/types/MTime.h>

#include <QtGlobal>

#include <memory>
#include <string>

class QPointF;
class QString;

namespace Types {
class Image;
}

namespace Serialize {

class ISerializable;

/// Opens and closes the field list of one class.
struct ClassRecord
{
    const char* name;
    const ISerializable* object;
};

/// Closes a sequence.
struct CountRecord
{
    const char* name;
    int count;
};

/// Opens and closes one item of a sequence; the first item has index 1.
struct ItemRecord
{
    const char* name;
    int index;
};

/// Announces the value that follows; `value` is its address.
struct FieldRecord
{
    const char* name;
    const void* value;
};

/// The stream of fields, the same on both sides: a writer reads through the addresses that it is given, a
/// reader stores through them. Nothing is kept after a call. A reader throws where the stream holds something
/// else than what is asked for.
class EDITORMODEL_EXPORT IFieldStream
{
public:
    virtual ~IFieldStream();

    virtual void endItem(const ItemRecord& item) = 0;
    virtual void beginItem(const ItemRecord& item) = 0;
    virtual void endSequence(const CountRecord& sequence) = 0;
    /// A reader sets `*count` to the number of items stored, never more than the stream can still hold.
    virtual void beginSequence(int* count) = 0;
    virtual void endClass(const ClassRecord& record) = 0;
    virtual void beginClass(const ClassRecord& record) = 0;
    virtual void field(const FieldRecord& record) = 0;

    virtual void value(std::shared_ptr<const Types::Image>* value) = 0;
    virtual void value(QPointF* value) = 0;
    virtual void value(QString* value) = 0;
    virtual void value(std::string* value) = 0;
    /// All 64 bits of the count of milliseconds.
    virtual void value(MTime* value) = 0;
    virtual void value(double* value) = 0;
    virtual void value(qint64* value) = 0;
    virtual void value(quint32* value) = 0;
    virtual void value(qint32* value) = 0;
    virtual void value(bool* value) = 0;
};

/// Writes objects over a field stream and keeps their identity: what is written a second time through a
/// pointer becomes a reference to the first.
class EDITORMODEL_EXPORT ISerializer
{
public:
    virtual ~ISerializer();

    /// Null is allowed. Throws where the object's class is not registered.
    virtual void writePointer(const ISerializable* object) = 0;
    /// Gives itself.
    virtual ISerializer& writeObject(const ISerializable& object) = 0;
    virtual IFieldStream& stream() = 0;
};

/// Reads what an `ISerializer` wrote.
class EDITORMODEL_EXPORT IDeserializer
{
public:
    virtual ~IDeserializer();

    /// Sets `object` to null, to an object made by the registered creator, or to one read before. An object
    /// that is still being read, in a cycle, is given with the fields that it has so far. What is made
    /// belongs to whoever reads. Throws where no creator is registered.
    virtual void readPointer(ISerializable*& object) = 0;
    /// Gives itself.
    virtual IDeserializer& readObject(ISerializable& object) = 0;
    virtual IFieldStream& stream() = 0;
};

} // namespace Serialize
