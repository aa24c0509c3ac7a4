// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/persistence/Document.h>
#include <EditorModel/persistence/Serializer.h>

#include <memory>
#include <string>
#include <vector>

class QByteArray;
class QIODevice;

namespace Serialize {

/// Writes one document. Every object has a number in it, those held by value as well: whatever is pointed at
/// stands once, and a pointer to an object held by value leads to that object after loading, provided that it
/// is written behind it. A value at the top that no `field` announced gets the key "object".
///
/// What the caller calls out of order throws `std::logic_error`, what cannot be written `std::runtime_error`;
/// an object of an unregistered class behind a pointer throws `boost::archive::archive_exception`. After an
/// exception the document is not finished and must be thrown away.
class EDITORMODEL_EXPORT StreamWriter : public ISerializer
{
public:
    ~StreamWriter() override;

    /// Writes what is still held back. Throws where something is still open.
    virtual void finish() = 0;
};

/// Reads what a `StreamWriter` wrote. The document may come from anywhere: what it gets wrong throws
/// `std::runtime_error`, or `boost::archive::archive_exception` for a class that is not registered. Pictures
/// need a QGuiApplication.
class EDITORMODEL_EXPORT StreamReader : public IDeserializer
{
public:
    ~StreamReader() override;

    /// Throws unless everything has been read.
    virtual void finish() = 0;

    /// Where reading stands, or where it failed: "byte 123", "line 3, column 7", or the keys from the top,
    /// such as "objects[2]/Data/width".
    virtual std::string position() const = 0;

    /// Every object that was made for a pointer, in the order of making. They belong to the caller, after a
    /// failure too; `Document::load` takes them by itself.
    virtual const std::vector<ISerializable*>& made() const = 0;
};

/// The device is open for writing and outlives the writer.
EDITORMODEL_EXPORT std::unique_ptr<StreamWriter> makeStreamWriter(Document::Form form, QIODevice& device);

/// Throws `std::runtime_error` where the document cannot be one of this form at all; its text then tells the
/// place as well.
EDITORMODEL_EXPORT std::unique_ptr<StreamReader> makeStreamReader(Document::Form form,
                                                                  const QByteArray& document);

} // namespace Serialize
