// SPDX-License-Identifier: Apache-2.0
// The calls in which a class tells its fields, and what streams make of calls out of order.
#include "Recorder.h"
#include "Samples.h"
#include "Streaming.h"

#include <EditorModel/persistence/Fields.h>

#include <QBuffer>

using namespace StreamTest;
using testing::ElementsAre;

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
