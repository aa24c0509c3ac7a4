// SPDX-License-Identifier: Apache-2.0
// The calls in which a class tells its fields, and what streams make of calls out of order.
#include "Samples.h"
#include "Streaming.h"
#include "tests/shared/VirtualSlots.h"

#include <EditorModel/persistence/Fields.h>
#include <EditorModel/persistence/Serializer.h>

#include <QBuffer>

using namespace StreamTest;
using testing::ElementsAre;

namespace {

/// Notes every call, and writes nothing.
class Recorder : public Serialize::ISerializer, public Serialize::IFieldStream
{
public:
    std::vector<std::string> calls;
    std::map<std::string, const void*> addresses;

    void writePointer(const Serialize::ISerializable* object) override
    {
        calls.push_back("pointer " + (object ? object->GetNameInArchive() : std::string("null")));
    }

    Serialize::ISerializer& writeObject(const Serialize::ISerializable& object) override
    {
        calls.push_back("object " + object.GetNameInArchive());
        object.Serialize(*this);
        return *this;
    }

    Serialize::IFieldStream& stream() override { return *this; }

    void endItem(const Serialize::ItemRecord& item) override { note("endItem", item.index); }
    void beginItem(const Serialize::ItemRecord& item) override { note("beginItem", item.index); }
    void endSequence(const Serialize::CountRecord& sequence) override { note("endSequence", sequence.count); }
    void beginSequence(int* count) override { note("beginSequence", *count); }
    void endClass(const Serialize::ClassRecord& record) override
    {
        calls.push_back("endClass " + nameOf(record));
    }
    void beginClass(const Serialize::ClassRecord& record) override
    {
        calls.push_back("beginClass " + nameOf(record));
    }
    void field(const Serialize::FieldRecord& record) override
    {
        calls.push_back(std::string("field ") + record.name);
        addresses.emplace(record.name, record.value);
    }

    void value(std::shared_ptr<const Types::Image>* value) override
    {
        calls.push_back(*value ? "picture" : "no picture");
    }
    void value(QPointF* value) override
    {
        calls.push_back("point " + std::to_string(value->x()) + ' ' + std::to_string(value->y()));
    }
    void value(QString* value) override { calls.push_back("text " + value->toStdString()); }
    void value(std::string* value) override { calls.push_back("bytes " + *value); }
    void value(MTime* value) override { note("time", value->ms()); }
    void value(double* value) override { note("real", *value); }
    void value(qint64* value) override { note("int64", *value); }
    void value(quint32* value) override { note("uint32", *value); }
    void value(qint32* value) override { note("int32", *value); }
    void value(bool* value) override { calls.push_back(*value ? "true" : "false"); }

private:
    template <class T>
    void note(const char* what, T value)
    {
        calls.push_back(what + (' ' + std::to_string(value)));
    }

    /// With the class of the object that stands behind the record.
    static std::string nameOf(const Serialize::ClassRecord& record)
    {
        return record.name + (" of " + record.object->GetNameInArchive());
    }
};

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

} // namespace

#if defined(__GXX_ABI_VERSION)

using Testing::callSlot;

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

#endif

TEST(FieldList, IsToldInTheCallsOfTheStream)
{
    Sheet sheet;
    sheet.girth = 2.5;
    sheet.title = "title";
    sheet.numbers = {7, -1};
    sheet.marks = {{"in", 40}, {"out", 50}};
    sheet.couple = {3, true};
    sheet.place = QPointF(0.5, -2.0);
    sheet.start = MTime(9);
    sheet.gain = 0.25;
    sheet.leaf = &sheet.inner;

    Recorder recorder;
    sheet.Serialize(recorder);

    const std::vector<std::string> expected{
        "beginClass StreamTest::Sheet of StreamTest::Sheet",
        "field BaseOfObject",
        "beginClass StreamTest::Trunk of StreamTest::Sheet",
        "field girth",
        "real 2.500000",
        "endClass StreamTest::Trunk of StreamTest::Sheet",
        "field title",
        "text title",
        "field numbers",
        "beginSequence 2",
        "beginItem 1",
        "field Data",
        "int32 7",
        "endItem 1",
        "beginItem 2",
        "field Data",
        "int32 -1",
        "endItem 2",
        "endSequence 2",
        "field marks",
        "beginSequence 2",
        "beginItem 1",
        "field Key",
        "text in",
        "field Value",
        "int32 40",
        "endItem 1",
        "beginItem 2",
        "field Key",
        "text out",
        "field Value",
        "int32 50",
        "endItem 2",
        "endSequence 2",
        "field couple",
        "beginSequence 1",
        "beginItem 1",
        "field First",
        "int32 3",
        "field Second",
        "true",
        "endItem 1",
        "endSequence 1",
        "field place",
        "point 0.500000 -2.000000",
        "field start",
        "time 9",
        "field gain",
        "real 0.250000",
        "field inner",
        "object StreamTest::Leaf",
        "beginClass StreamTest::Leaf of StreamTest::Leaf",
        "field number",
        "int32 0",
        "field text",
        "text ",
        "endClass StreamTest::Leaf of StreamTest::Leaf",
        "field leaf",
        "pointer StreamTest::Leaf",
        "field self",
        "pointer null",
        "field none",
        "pointer null",
        "endClass StreamTest::Sheet of StreamTest::Sheet",
    };
    EXPECT_EQ(recorder.calls, expected);
    EXPECT_EQ(recorder.addresses["title"], &sheet.title);
    EXPECT_EQ(recorder.addresses["numbers"], &sheet.numbers);
    EXPECT_EQ(recorder.addresses["inner"], &sheet.inner);
    EXPECT_EQ(recorder.addresses["leaf"], &sheet.leaf);
    EXPECT_EQ(recorder.addresses["BaseOfObject"], static_cast<const Trunk*>(&sheet));
}

TEST(FieldList, TellsTwoBasesAndEveryKindOfValue)
{
    Tree tree;
    tree.bytes = "bytes";
    tree.mood = Wild;
    tree.large = 4;
    tree.colour = 6;
    Recorder recorder;
    tree.Serialize(recorder);
    const std::vector<std::string> expected{
        "beginClass StreamTest::Tree of StreamTest::Tree",
        "field BaseOfObject",
        "beginClass StreamTest::Trunk of StreamTest::Tree",
        "field girth",
        "real 0.000000",
        "endClass StreamTest::Trunk of StreamTest::Tree",
        "field BaseOfObject",
        "beginClass StreamTest::Bark of StreamTest::Tree",
        "field rough",
        "false",
        "endClass StreamTest::Bark of StreamTest::Tree",
        "field flag",
        "false",
        "field whole",
        "int32 0",
        "field colour",
        "uint32 6",
        "field large",
        "int64 4",
        "field real",
        "real 0.000000",
        "field time",
        "time 0",
        "field bytes",
        "bytes bytes",
        "field text",
        "text ",
        "field point",
        "point 0.000000 0.000000",
        "field mood",
        "int32 5",
        "field pen",
        "object Types::Pen",
    };
    ASSERT_GE(recorder.calls.size(), expected.size());
    recorder.calls.resize(expected.size());
    EXPECT_EQ(recorder.calls, expected);
}

TEST(FieldList, TellsATupleAsASequenceAndAMapOfTextsAsAMap)
{
    Grove grove;
    grove.triple = {"x", 9, Wild};
    grove.notes = {{"key", "value"}};
    Recorder recorder;
    grove.Serialize(recorder);
    const auto from = std::find(recorder.calls.begin(), recorder.calls.end(), "field triple");
    const auto to = std::find(recorder.calls.begin(), recorder.calls.end(), "field list");
    EXPECT_THAT((std::vector<std::string>(from, to)),
                ElementsAre("field triple", "beginSequence 3", "beginItem 1", "field Data", "text x",
                            "endItem 1", "beginItem 2", "field Data", "int32 9", "endItem 2", "beginItem 3",
                            "field Data", "int32 5", "endItem 3", "endSequence 3", "field notes",
                            "beginSequence 1", "beginItem 1", "field Key", "text key", "field Value",
                            "text value", "endItem 1", "endSequence 1"));
}

namespace {

/// A writer at whose stream calls can be made in any order.
class Calls : public Streams
{
protected:
    Serialize::IFieldStream& stream() { return m_writer->stream(); }

    QBuffer m_buffer;
    const bool m_isOpen = m_buffer.open(QIODevice::WriteOnly);
    const std::unique_ptr<Serialize::StreamWriter> m_writer =
        Serialize::makeStreamWriter(GetParam(), m_buffer);
    int m_number = 0;
    const Leaf m_leaf{};
};

INSTANTIATE_TEST_SUITE_P(Forms, Calls, testing::Values(Document::Binary, Document::Xml, Document::Json),
                         nameOf);

/// Writes itself as a part of itself, without an end.
class Endless : public Leaf
{
    void Serialize(Serialize::ISerializer& serializer) const override
    {
        serializer.stream().beginClass({"Endless", this});
        serializer.stream().field({"again", this});
        serializer.writeObject(*this);
        serializer.stream().endClass({"Endless", this});
    }
};

/// Forgets to write itself.
class Silent : public Leaf
{
    void Serialize(Serialize::ISerializer&) const override {}
};

} // namespace

TEST_P(Calls, OutOfOrderAreRefused)
{
    EXPECT_THROW(stream().endClass({"StreamTest::Leaf", &m_leaf}), std::logic_error);
    EXPECT_THROW(stream().endSequence({"Sequence", 0}), std::logic_error);
    EXPECT_THROW(stream().beginItem({"Item", 1}), std::logic_error);
    EXPECT_THROW(stream().endItem({"Item", 1}), std::logic_error);
    EXPECT_THROW(stream().field({nullptr, &m_number}), std::logic_error);
}

TEST_P(Calls, ThatLeaveAFieldWithoutAValueAreRefused)
{
    stream().field({"a", &m_number});
    EXPECT_THROW(stream().field({"b", &m_number}), std::logic_error);
    EXPECT_THROW(m_writer->finish(), std::logic_error);
}

TEST_P(Calls, ThatGiveAValueWithoutAFieldAreRefused)
{
    stream().field({"leaf", &m_leaf});
    stream().beginClass({"StreamTest::Leaf", &m_leaf});
    EXPECT_THROW(stream().value(&m_number), std::logic_error);
    EXPECT_THROW(m_writer->finish(), std::logic_error);
}

TEST_P(Calls, ThatMiscountASequenceAreRefused)
{
    int count = 2;
    stream().field({"sequence", &count});
    stream().beginSequence(&count);
    EXPECT_THROW(stream().field({"Data", &m_number}), std::logic_error);
    EXPECT_THROW(stream().beginItem({"Item", 0}), std::logic_error);
    stream().beginItem({"Item", 1});
    EXPECT_THROW(stream().endItem({"Item", 2}), std::logic_error);
    stream().endItem({"Item", 1});
    EXPECT_THROW(stream().endSequence({"Sequence", 2}), std::logic_error);
    stream().beginItem({"Item", 2});
    stream().endItem({"Item", 2});
    EXPECT_THROW(stream().beginItem({"Item", 3}), std::logic_error);
    stream().endSequence({"Sequence", 2});
    count = -1;
    stream().field({"other", &count});
    EXPECT_THROW(stream().beginSequence(&count), std::logic_error);
}

TEST_P(Calls, ThatNeverEndAreStopped)
{
    EXPECT_THROW(m_writer->writeObject(Endless()), std::runtime_error);
}

TEST_P(Calls, ThatNeverBeginAreRefused)
{
    EXPECT_THROW(m_writer->writeObject(Silent()), std::logic_error);
}

TEST_P(Calls, ThatNameADifferentClassAtTheEndAreRefused)
{
    stream().field({"leaf", &m_leaf});
    stream().beginClass({"StreamTest::Leaf", &m_leaf});
    EXPECT_THROW(stream().endClass({"StreamTest::Moss", &m_leaf}), std::logic_error);
}

TEST(XmlStream, RefusesKeysThatCannotBeTags)
{
    for (const char* key : {"", "two words", "1st", "a:b", "<", "\xC3\xA4"}) {
        QBuffer buffer;
        buffer.open(QIODevice::WriteOnly);
        const auto writer = Serialize::makeStreamWriter(Document::Xml, buffer);
        int number = 0;
        writer->stream().field({key, &number});
        EXPECT_THROW(writer->stream().value(&number), std::runtime_error) << key;
    }
}

TEST(JsonStream, RefusesAKeyThatStandsTwice)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    const auto writer = Serialize::makeStreamWriter(Document::Json, buffer);
    int number = 0;
    for (const char* key : {"EditorModel", "version"}) {
        writer->stream().field({key, &number});
        EXPECT_THROW(writer->stream().value(&number), std::logic_error);
    }
}
