// SPDX-License-Identifier: Apache-2.0
// The route over ISerializer and IDeserializer: field lists as calls of a field stream.
#include <EditorModel/persistence/Fields.h>
#include <EditorModel/persistence/Roots.h>
#include <EditorModel/persistence/Serializer.h>

#include <stdexcept>

namespace Serialize {
namespace {

/// What writing and reading share: both name their values to the stream by address.
template <class Route>
class StreamFields : public Fields
{
protected:
    StreamFields(bool loading, Route& route)
        : Fields(loading, loading), m_route(route), m_stream(route.stream())
    {}

    Route& m_route;
    IFieldStream& m_stream;

private:
    void onScalar(const Key& key, const Scalar& value, const void* address) override
    {
        std::visit(
            [&](auto* target) {
                m_stream.field({key.stream, address ? address : target});
                m_stream.value(target);
            },
            value);
    }

    void onContainer(const Key& key, const Type& type, void* container) override
    {
        m_stream.field({key.stream, container});
        Details::visit(*this, type, container);
    }

    void onBeginItem(int index) override { m_stream.beginItem({itemName, index}); }
    void onEndItem(int index) override { m_stream.endItem({itemName, index}); }
    void onEndSequence(int count) override { m_stream.endSequence({sequenceName, count}); }

    int onBeginSequence(SequenceKind kind, int count) override
    {
        // A group always has as many items as its class says; the count in the stream must agree.
        const int expected = count;
        // A pair or a tuple stands as one item or several, as it was begun.
        m_stream.beginSequence(&count);
        if (kind == Group && count != expected)
            throw std::runtime_error("a group of " + std::to_string(expected) + " has " +
                                     std::to_string(count) + " items");
        return count;
    }

    void onEntry(const Type& pair, void* entry) override { Details::visit(*this, pair, entry); }

    void onBinary(QByteArray&, int) override { throw std::logic_error("the field stream has no raw bytes"); }

    std::shared_ptr<const Types::Image> onShare(const Types::Image*) override
    {
        throw std::logic_error("the field stream carries pictures as values");
    }

    static constexpr const char* itemName = "Item";
    static constexpr const char* sequenceName = "Sequence";
};

class FieldWriter final : public StreamFields<ISerializer>
{
public:
    explicit FieldWriter(ISerializer& serializer) : StreamFields(false, serializer) {}

private:
    void onObject(const Key& key, const Type& type, void* object) override
    {
        m_stream.field({key.stream, object});
        m_route.writeObject(*type.serializable(object));
    }

    void onBase(const Key& key, const Type& type, void* object) override
    {
        m_stream.field({key.stream, object});
        Details::writeFields(m_route, type, object);
    }

    void onPointer(const Key& key, const PointerField& field) override
    {
        m_stream.field({key.stream, field.slot});
        m_route.writePointer(field.access.root(field));
    }
};

class FieldReader final : public StreamFields<IDeserializer>
{
public:
    explicit FieldReader(IDeserializer& deserializer) : StreamFields(true, deserializer) {}

private:
    void onObject(const Key& key, const Type& type, void* object) override
    {
        m_stream.field({key.stream, object});
        m_route.readObject(*type.serializable(object));
    }

    void onBase(const Key& key, const Type& type, void* object) override
    {
        m_stream.field({key.stream, object});
        Details::readFields(m_route, type, object);
    }

    void onPointer(const Key& key, const PointerField& field) override
    {
        m_stream.field({key.stream, field.slot});
        ISerializable* object = nullptr;
        m_route.readPointer(object);
        field.access.setRoot(field, object);
    }
};

} // namespace

namespace Details {

void writeFields(ISerializer& serializer, const Type& type, const void* object)
{
    void* const address = const_cast<void*>(object);
    const ClassRecord record{type.name, type.serializable(address)};
    FieldWriter fields(serializer);
    serializer.stream().beginClass(record);
    visit(fields, type, address);
    serializer.stream().endClass(record);
}

void readFields(IDeserializer& deserializer, const Type& type, void* object)
{
    const ClassRecord record{type.name, type.serializable(object)};
    FieldReader fields(deserializer);
    deserializer.stream().beginClass(record);
    visit(fields, type, object);
    deserializer.stream().endClass(record);
}

void writeStream(ISerializer& serializer, Roots& roots)
{
    FieldWriter fields(serializer);
    visitRoots(fields, roots);
}

void readStream(IDeserializer& deserializer, Roots& roots)
{
    FieldReader fields(deserializer);
    visitRoots(fields, roots);
}

} // namespace Details
} // namespace Serialize
