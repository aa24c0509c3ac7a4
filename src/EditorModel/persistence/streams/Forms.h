// SPDX-License-Identifier: Apache-2.0
// What the forms of a field stream have in common: how a value, an object and a sequence are put down. What
// may stand where and who is who is decided above them.
#pragma once

#include <EditorModel/types/MTime.h>

#include <QByteArray>
#include <QPointF>

#include <memory>
#include <string>

class QIODevice;

namespace Serialize::Details {

constexpr const char* baseKey = "BaseOfObject";
constexpr const char* rootKey = "object";
constexpr const char* pictureClass = "Types::Image";

class FormWriter
{
public:
    virtual ~FormWriter() = default;

    virtual void null(const std::string& key) = 0;
    virtual void reference(const std::string& key, quint64 id) = 0;
    virtual void beginObject(const std::string& key, const std::string& className, quint64 id) = 0;
    /// The part of an object that a base class writes; ends like an object.
    virtual void beginPart(const std::string& key, const std::string& className) = 0;
    virtual void endObject() = 0;
    virtual void picture(const std::string& key, quint64 id, const QByteArray& png) = 0;

    virtual void beginSequence(const std::string& key, int count) = 0;
    virtual void endSequence() = 0;
    virtual void beginItem() = 0;
    virtual void endItem() = 0;

    virtual void write(const std::string& key, bool value) = 0;
    virtual void write(const std::string& key, qint32 value) = 0;
    virtual void write(const std::string& key, quint32 value) = 0;
    virtual void write(const std::string& key, qint64 value) = 0;
    virtual void write(const std::string& key, double value) = 0;
    virtual void write(const std::string& key, MTime value) = 0;
    virtual void write(const std::string& key, const std::string& value) = 0;
    virtual void write(const std::string& key, const QPointF& value) = 0;

    virtual void finish() = 0;
};

/// What stands where an object, a part of one, a picture or a pointer to either is expected.
struct Mark
{
    enum Kind : int
    {
        Null,
        Reference,
        Object,
        Part,
    };

    Kind kind = Null;
    /// Of an object or a reference.
    quint64 id = 0;
    /// Of an object or a part.
    std::string className;
};

class FormReader
{
public:
    virtual ~FormReader() = default;

    /// Opens an object, a part or a picture; a null and a reference are over with this.
    virtual Mark mark(const std::string& key) = 0;
    virtual void endObject() = 0;
    /// The data of the picture that was opened last; closes it.
    virtual QByteArray png() = 0;

    /// The number of items, at most as many as the rest of the document can hold.
    virtual int beginSequence(const std::string& key) = 0;
    virtual void endSequence() = 0;
    virtual void beginItem() = 0;
    virtual void endItem() = 0;

    virtual void read(const std::string& key, bool& value) = 0;
    virtual void read(const std::string& key, qint32& value) = 0;
    virtual void read(const std::string& key, quint32& value) = 0;
    virtual void read(const std::string& key, qint64& value) = 0;
    virtual void read(const std::string& key, double& value) = 0;
    virtual void read(const std::string& key, MTime& value) = 0;
    virtual void read(const std::string& key, std::string& value) = 0;
    virtual void read(const std::string& key, QPointF& value) = 0;

    virtual void finish() = 0;
    virtual std::string position() const = 0;
};

std::unique_ptr<FormWriter> makeBinaryWriter(QIODevice& device);
std::unique_ptr<FormReader> makeBinaryReader(const QByteArray& document);
std::unique_ptr<FormWriter> makeXmlWriter(QIODevice& device);
std::unique_ptr<FormReader> makeXmlReader(const QByteArray& document);
std::unique_ptr<FormWriter> makeJsonWriter(QIODevice& device);
std::unique_ptr<FormReader> makeJsonReader(const QByteArray& document);

/// Throws unless the device takes all of the data.
void writeAll(QIODevice& device, const char* data, qint64 size);
/// Throws where the device still holds data back and cannot let go of it.
void flush(QIODevice& device);

/// A number as text: the shortest that reads back as the same number, or "inf", "-inf", "nan".
std::string textOf(double value);
/// Throws `std::runtime_error` for a text that is no number.
double realOf(const std::string& text);

/// Text of a document in a message: in quotes, and cut where it is long.
std::string inQuotes(const std::string& text);
[[noreturn]] void throwUnexpected(const std::string& expected, const std::string& found);

} // namespace Serialize::Details
