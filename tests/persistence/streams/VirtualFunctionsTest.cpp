// SPDX-License-Identifier: Apache-2.0
// The places of the virtual functions by which classes and streams meet.
#include "Recorder.h"
#include "Samples.h"
#include "tests/shared/VirtualSlots.h"

#include <gmock/gmock.h>

#if defined(__GXX_ABI_VERSION)

namespace {

using namespace StreamTest;
using Testing::callSlot;
using testing::ElementsAre;

/// Gives one object for every pointer, and nothing else.
class Giver : public Serialize::IDeserializer
{
public:
    explicit Giver(Serialize::IFieldStream& stream) : m_stream(stream) {}

    void readPointer(Serialize::ISerializable*& object) override { object = &leaf; }
    Serialize::IDeserializer& readObject(Serialize::ISerializable& object) override
    {
        read = &object;
        return *this;
    }
    Serialize::IFieldStream& stream() override { return m_stream; }

    Leaf leaf;
    Serialize::ISerializable* read = nullptr;

private:
    Serialize::IFieldStream& m_stream;
};

/// Notes which way it is asked to go.
class Traveller : public Serialize::ISerializable
{
public:
    const std::string GetNameInArchive() const override { return "Traveller"; }
    void Serialize(Serialize::ISerializer&) const override { line = "there"; }
    void Deserialize(Serialize::IDeserializer&) override { line = "and back"; }

    mutable std::string line;
};

class TravellerCreator : public Serialize::BaseCreator
{
public:
    Serialize::ISerializable* Create() const override { return new Traveller; }
};

/// Behind the destructor: name, write, read. A creator's destructor stands behind what it makes.
TEST(PersistentRoot, ItsVirtualFunctionsKeepTheirPlaces)
{
    const TravellerCreator creator;
    const Serialize::BaseCreator* const base = &creator;
    const std::unique_ptr<Serialize::ISerializable> made(callSlot<Serialize::ISerializable*>(base, 0));
    const auto& traveller = dynamic_cast<const Traveller&>(*made);
    EXPECT_EQ(callSlot<std::string>(made.get(), 2), "Traveller");
    Recorder recorder;
    Serialize::ISerializer* const serializer = &recorder;
    callSlot<void>(made.get(), 3, serializer);
    EXPECT_EQ(traveller.line, "there");
    Giver giver(recorder);
    Serialize::IDeserializer* const deserializer = &giver;
    callSlot<void>(made.get(), 4, deserializer);
    EXPECT_EQ(traveller.line, "and back");
}

/// Behind the destructor: pointer, object, stream.
TEST(Serializers, TheirVirtualFunctionsKeepTheirPlaces)
{
    const Traveller traveller;
    const Serialize::ISerializable* const object = &traveller;
    Recorder recorder;
    Serialize::IFieldStream* const stream = &recorder;
    Serialize::ISerializer* const serializer = &recorder;
    callSlot<void>(serializer, 2, object);
    EXPECT_EQ(callSlot<Serialize::ISerializer*>(serializer, 3, object), serializer);
    EXPECT_EQ(callSlot<Serialize::IFieldStream*>(serializer, 4), stream);
    EXPECT_THAT(recorder.calls, ElementsAre("pointer Traveller", "object Traveller"));

    Giver giver(recorder);
    Serialize::IDeserializer* const deserializer = &giver;
    Serialize::ISerializable* read = nullptr;
    callSlot<void>(deserializer, 2, &read);
    EXPECT_EQ(read, &giver.leaf);
    EXPECT_EQ(callSlot<Serialize::IDeserializer*>(deserializer, 3, read), deserializer);
    EXPECT_EQ(giver.read, &giver.leaf);
    EXPECT_EQ(callSlot<Serialize::IFieldStream*>(deserializer, 4), stream);
}

/// Behind the destructor: item, sequence and class, the end of each in front of its beginning; the field; the
/// values.
TEST(FieldStream, ItsVirtualFunctionsKeepTheirPlaces)
{
    Recorder recorder;
    Serialize::IFieldStream* const stream = &recorder;
    const Traveller traveller;
    const Serialize::ItemRecord item{"item", 1};
    const Serialize::CountRecord sequence{"sequence", 2};
    const Serialize::ClassRecord record{"class", &traveller};
    const Serialize::FieldRecord field{"key", nullptr};
    int count = 3;
    callSlot<void>(stream, 2, &item);
    callSlot<void>(stream, 3, &item);
    callSlot<void>(stream, 4, &sequence);
    callSlot<void>(stream, 5, &count);
    callSlot<void>(stream, 6, &record);
    callSlot<void>(stream, 7, &record);
    callSlot<void>(stream, 8, &field);
    EXPECT_THAT(recorder.calls,
                ElementsAre("endItem 1", "beginItem 1", "endSequence 2", "beginSequence 3",
                            "endClass class of Traveller", "beginClass class of Traveller", "field key"));

    recorder.calls.clear();
    std::shared_ptr<const Types::Image> picture;
    QPointF point(1, 2);
    QString text = "a";
    std::string bytes = "b";
    MTime time = 4;
    double real = 5;
    qint64 large = 6;
    quint32 colour = 7;
    qint32 whole = 8;
    bool flag = true;
    callSlot<void>(stream, 9, &picture);
    callSlot<void>(stream, 10, &point);
    callSlot<void>(stream, 11, &text);
    callSlot<void>(stream, 12, &bytes);
    callSlot<void>(stream, 13, &time);
    callSlot<void>(stream, 14, &real);
    callSlot<void>(stream, 15, &large);
    callSlot<void>(stream, 16, &colour);
    callSlot<void>(stream, 17, &whole);
    callSlot<void>(stream, 18, &flag);
    EXPECT_THAT(recorder.calls,
                ElementsAre("no picture", "point 1.000000 2.000000", "text a", "bytes b", "time 4",
                            "real 5.000000", "int64 6", "uint32 7", "int32 8", "true"));
}

} // namespace

#endif
