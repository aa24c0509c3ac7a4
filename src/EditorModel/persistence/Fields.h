// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Type.h>
#include <EditorModel/types/MTime.h>

#include <QPointF>
#include <QString>

#include <memory>
#include <string>
#include <variant>

class QByteArray;
class QPixmap;

namespace Types {
class Image;
}

namespace Serialize {

/// The key of a field: in the archives, and in the field stream where it has another name there. Null is a
/// value without a key of its own.
struct Key
{
    const char* archive;
    const char* stream;

    constexpr Key(const char* both) : archive(both), stream(both) {}
    constexpr Key(const char* inArchive, const char* inStream) : archive(inArchive), stream(inStream) {}
};

/// A value that has no fields of its own, by address. Enumerations go as `int`.
using Scalar = std::variant<bool*, int*, quint32*, qint64*, double*, std::string*, QString*, MTime*, QPointF*,
                            std::shared_ptr<const Types::Image>*>;

/// What a pointer names: the complete object, with its type where that is registered.
struct Pointee
{
    void* object;
    const Type* type;
};

struct PointerField;

/// How the pointers of one class are read and set.
struct PointerAccess
{
    /// The object is null for a null pointer, its type for a class that is not registered.
    Pointee (*get)(const PointerField& field);
    /// The pointer as it goes through the field stream.
    const ISerializable* (*root)(const PointerField& field);
    /// Null is stored as it is. An object of another class than the field's throws `std::bad_cast`, or, where
    /// the field is soft, stores null.
    void (*set)(const PointerField& field, const Pointee& pointee);
    void (*setRoot)(const PointerField& field, ISerializable* root);
};

/// A field that points at a persistent object or at a picture.
struct PointerField
{
    const PointerAccess& access;
    /// The class that the field is declared with; null for an abstract one.
    const Type* declared;
    void* slot;
    bool soft;
};

/// How the items of a sequence are introduced in the archives.
enum SequenceKind : int
{
    Collection,   ///< a standard container: "count" and "item_version"
    QtCollection, ///< a Qt container: "count" as `int`
    Group,        ///< a pair or a tuple: nothing
};

class Fields;

namespace Details {
/// Runs a field list, guards the depth to which lists may nest, and notes the field that an exception comes
/// from.
EDITORMODEL_EXPORT void visit(Fields& fields, const Type& type, void* object);
} // namespace Details

/// The visitor of field lists. A class tells its fields once, in archive order; what a visitor does with
/// them, write, read or check, is its own affair. Any exception that leaves a field is noted with the field's
/// key.
class EDITORMODEL_EXPORT Fields
{
public:
    /// True if the visitor stores into the fields.
    bool loading() const { return m_loading; }
    /// True if a container that is read into keeps what it has. The field stream adds to containers, and the
    /// archives replace what is in them, as their libraries do.
    bool keepsEntries() const { return m_keepsEntries; }

    /// A field. Pointers are nullable and read strictly: an object of another class throws `std::bad_cast`.
    template <class T>
    Fields& operator()(const Key& key, T& value);

    /// A pointer that reads as null where the object is of another class.
    template <class T>
    Fields& soft(const Key& key, T*& pointer);

    /// The field list of a persistent base, under `key` in the archives and "BaseOfObject" in the stream.
    template <class Base, class Derived>
    Fields& base(const char* key, Derived& object);

    /// A value that is stored in another form: `encode` gives what is written for `value`, `decode` what is
    /// kept of what was read.
    template <class T, class Encode, class Decode>
    Fields& coded(const Key& key, T& value, Encode encode, Decode decode);

    /// The value's own address, or null for a copy that stands in for it.
    void scalar(const Key& key, const Scalar& value, const void* address)
    {
        m_position.key = key;
        onScalar(key, value, address);
    }
    void object(const Key& key, const Type& type, void* object)
    {
        m_position.key = key;
        onObject(key, type, object);
    }
    void pointer(const Key& key, const PointerField& field)
    {
        m_position.key = key;
        onPointer(key, field);
    }
    void container(const Key& key, const Type& type, void* container)
    {
        m_position.key = key;
        onContainer(key, type, container);
    }

    /// The items of a container stand between `beginSequence` and `endSequence`. `count` is what is written;
    /// the result is the number of items to visit.
    int beginSequence(SequenceKind kind, int count);
    void beginItem(int index);
    void endItem(int index);
    void endSequence(int count);
    /// The key and value of a map's item.
    void entry(const Type& pair, void* entry);

    /// `size` bytes with no key of their own; a reader has resized `bytes` to nothing before.
    void binary(QByteArray& bytes, int size);
    /// The one owner of a picture that was read through a pointer.
    std::shared_ptr<const Types::Image> share(const Types::Image* image);

protected:
    explicit Fields(bool loading, bool keepsEntries = false)
        : m_loading(loading), m_keepsEntries(keepsEntries)
    {}
    virtual ~Fields();
    Fields(const Fields&) = delete;
    Fields& operator=(const Fields&) = delete;

private:
    virtual void onScalar(const Key& key, const Scalar& value, const void* address) = 0;
    virtual void onObject(const Key& key, const Type& type, void* object) = 0;
    virtual void onBase(const Key& key, const Type& type, void* object) = 0;
    virtual void onPointer(const Key& key, const PointerField& field) = 0;
    virtual void onContainer(const Key& key, const Type& type, void* container) = 0;
    virtual int onBeginSequence(SequenceKind kind, int count) = 0;
    virtual void onBeginItem(int index) = 0;
    virtual void onEndItem(int index) = 0;
    virtual void onEndSequence(int count) = 0;
    virtual void onEntry(const Type& pair, void* entry) = 0;
    virtual void onBinary(QByteArray& bytes, int size) = 0;
    virtual std::shared_ptr<const Types::Image> onShare(const Types::Image* image) = 0;

    void baseFields(const char* key, const Type& type, void* object);

    friend void Details::visit(Fields& fields, const Type& type, void* object);

    /// The field that is being visited, for the place of a failure.
    struct Position
    {
        Key key{nullptr};
        int item = 0;

        void note() const;
    };

    const bool m_loading;
    const bool m_keepsEntries;
    Position m_position;
};

namespace Details {
/// How a C++ type is visited; an error that names this type says that its argument is no field.
template <class T, class = void>
struct FieldOf;
template <class T>
PointerField pointerField(T*& slot, bool soft);
} // namespace Details

template <class T>
Fields& Fields::operator()(const Key& key, T& value)
{
    Details::FieldOf<T>::visit(*this, key, value);
    return *this;
}

template <class T>
Fields& Fields::soft(const Key& key, T*& value)
{
    pointer(key, Details::pointerField(value, true));
    return *this;
}

template <class Base, class Derived>
Fields& Fields::base(const char* key, Derived& object)
{
    baseFields(key, Base::persistentType(), static_cast<Base*>(&object));
    return *this;
}

template <class T, class Encode, class Decode>
Fields& Fields::coded(const Key& key, T& value, Encode encode, Decode decode)
{
    // The stored form lives only here; a null address keeps it out of what is known by address.
    auto stored = encode(value);
    scalar(key, Scalar(&stored), nullptr);
    if (loading())
        value = decode(stored);
    return *this;
}

} // namespace Serialize

#include <EditorModel/persistence/detail/FieldTypes.h>

EDITORMODEL_ARCHIVE_NAME(QByteArray, "QByteArray")
EDITORMODEL_ARCHIVE_NAME(QPixmap, "QPixmap")
EDITORMODEL_ARCHIVE_NAME(Types::Image, "Types::Image")
