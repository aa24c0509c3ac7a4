// SPDX-License-Identifier: Apache-2.0
// What the forms look like, typed by hand.
#include "Samples.h"
#include "Streaming.h"

#include <limits>

using namespace StreamTest;

namespace {

void fill(Sheet& sheet)
{
    sheet.girth = 2.5;
    sheet.title = "Ende & \"Anfang\"";
    sheet.numbers = {7, -1};
    sheet.marks = {{"in", 40}};
    sheet.couple = {3, true};
    sheet.place = QPointF(0.5, -2.0);
    sheet.start = MTime(Q_INT64_C(2147483648));
    sheet.gain = -std::numeric_limits<double>::infinity();
    sheet.inner.number = 5;
    sheet.leaf = &sheet.inner;
    sheet.self = &sheet;
}

void expectFilled(const Sheet& sheet)
{
    EXPECT_EQ(sheet.girth, 2.5);
    EXPECT_EQ(sheet.title, QString("Ende & \"Anfang\""));
    EXPECT_EQ(sheet.numbers, (std::deque<int>{7, -1}));
    EXPECT_EQ(sheet.marks, (std::map<QString, int>{{"in", 40}}));
    EXPECT_EQ(sheet.couple, std::make_pair(3, true));
    EXPECT_EQ(sheet.place, QPointF(0.5, -2.0));
    EXPECT_EQ(sheet.start.ms(), Q_INT64_C(2147483648));
    EXPECT_EQ(sheet.gain, -std::numeric_limits<double>::infinity());
    EXPECT_EQ(sheet.inner.number, 5);
    EXPECT_EQ(sheet.leaf, &sheet.inner);
    EXPECT_EQ(sheet.self, &sheet);
    EXPECT_EQ(sheet.none, nullptr);
}

const char* const xml = R"(<?xml version="1.0" encoding="UTF-8"?>
<EditorModel route="stream" version="1">
    <root class="StreamTest::Sheet" id="1">
        <BaseOfObject class="StreamTest::Trunk">
            <girth>2.5</girth>
        </BaseOfObject>
        <title>Ende &amp; &quot;Anfang&quot;</title>
        <numbers count="2">
            <Item>
                <Data>7</Data>
            </Item>
            <Item>
                <Data>-1</Data>
            </Item>
        </numbers>
        <marks count="1">
            <Item>
                <Key>in</Key>
                <Value>40</Value>
            </Item>
        </marks>
        <couple count="1">
            <Item>
                <First>3</First>
                <Second>true</Second>
            </Item>
        </couple>
        <place x="0.5" y="-2"/>
        <start>2147483648</start>
        <gain>-inf</gain>
        <inner class="StreamTest::Leaf" id="2">
            <number>5</number>
            <text></text>
        </inner>
        <leaf ref="2"/>
        <self ref="1"/>
        <none null="true"/>
    </root>
</EditorModel>
)";

const char* const json = R"({
    "EditorModel": "stream",
    "version": 1,
    "root": {
        "$meta": {
            "class": "StreamTest::Sheet",
            "id": 1
        },
        "BaseOfObject": [
            {
                "$meta": {
                    "class": "StreamTest::Trunk"
                },
                "girth": 2.5
            }
        ],
        "title": "Ende & \"Anfang\"",
        "numbers": [
            {
                "Data": 7
            },
            {
                "Data": -1
            }
        ],
        "marks": [
            {
                "Key": "in",
                "Value": 40
            }
        ],
        "couple": [
            {
                "First": 3,
                "Second": true
            }
        ],
        "place": {
            "x": 0.5,
            "y": -2.0
        },
        "start": 2147483648,
        "gain": "-inf",
        "inner": {
            "$meta": {
                "class": "StreamTest::Leaf",
                "id": 2
            },
            "number": 5,
            "text": ""
        },
        "leaf": {
            "$meta": {
                "ref": 2
            }
        },
        "self": {
            "$meta": {
                "ref": 1
            }
        },
        "none": null
    }
}
)";

/// A name, its first mention and every later one.
const QByteArray firstMention(const char* name)
{
    return QByteArray(1, '\0') + QByteArray(1, static_cast<char>(qstrlen(name))) + name;
}

} // namespace

TEST(XmlStream, LooksAsItDoesForever)
{
    Sheet sheet;
    fill(sheet);
    EXPECT_EQ(saved(Document::Xml, sheet).toStdString(), xml);
    const Loaded loaded(Document::Xml, xml);
    expectFilled(loaded.root<Sheet>());
}

TEST(JsonStream, LooksAsItDoesForever)
{
    Sheet sheet;
    fill(sheet);
    EXPECT_EQ(saved(Document::Json, sheet).toStdString(), json);
    const Loaded loaded(Document::Json, json);
    expectFilled(loaded.root<Sheet>());
}

TEST(BinaryStream, LooksAsItDoesForever)
{
    Leaf first;
    first.number = 258;
    first.text = QString::fromUtf8("\xC3\xA9");
    Twig twig;
    twig.soft = &first;
    QByteArray bytes = firstMention("root") + "\x03" + firstMention("StreamTest::Twig"); // names 32 and 33
    bytes += firstMention("soft") + "\x03" + firstMention("StreamTest::Leaf");           // names 34 and 35
    bytes += firstMention("number") + QByteArray("\x0D\x02\x01\x00\x00", 5);             // name 36
    bytes += firstMention("text") + "\x12\x02\xC3\xA9" + "\x05";                         // name 37
    bytes += firstMention("strict") + "\x01" + "\x05";                                   // name 38
    bytes += firstMention("root1") + "\x02\x02";                                         // object 2
    bytes += firstMention("root2") + "\x03\x21" + "\x22\x01" + "\x26\x01" + "\x05";
    const Twig empty;
    EXPECT_EQ(saved(Document::Binary, {&twig, &first, &empty}).toHex(), bytes.toHex());
    const Loaded loaded(Document::Binary, bytes, 3);
    EXPECT_EQ(loaded.root<Twig>().soft->number, 258);
    EXPECT_EQ(loaded.roots()[1], loaded.root<Twig>().soft);
    EXPECT_EQ(loaded.root<Twig>(2).soft, nullptr);
}

TEST(BinaryStream, NumbersOfEveryKindHaveTheirBytes)
{
    // Written through the stream itself, value by value, and looked up behind their keys.
    Tree tree;
    tree.flag = true;
    tree.colour = 0x01020304;
    tree.large = -2;
    tree.real = 1.0;
    tree.time = MTime(Q_INT64_C(0x0102030405060708));
    tree.point = QPointF(-2.0, 0.5);
    const QByteArray bytes = saved(Document::Binary, tree);
    const auto behind = [&](const char* key, int size) {
        const QByteArray name = firstMention(key);
        const int place = bytes.indexOf(name);
        EXPECT_GE(place, 0) << key;
        return bytes.mid(place + name.size(), size).toHex();
    };
    EXPECT_EQ(behind("flag", 1), "0c");
    EXPECT_EQ(behind("rough", 1), "0b");
    EXPECT_EQ(behind("colour", 5), "0e04030201");
    EXPECT_EQ(behind("large", 9), "0ffeffffffffffffff");
    EXPECT_EQ(behind("real", 9), "10000000000000f03f");
    EXPECT_EQ(behind("time", 9), "110807060504030201");
    EXPECT_EQ(behind("point", 17), "1300000000000000c0000000000000e03f");
}

TEST(BinaryStream, SequencesAndItemsHaveTheirBytes)
{
    Sheet sheet;
    sheet.numbers = {1};
    const QByteArray bytes = saved(Document::Binary, sheet);
    const QByteArray sequence = firstMention("numbers") + "\x07\x01\x09" + firstMention("Data") +
                                QByteArray("\x0D\x01\0\0\0\x0A\x08", 7);
    EXPECT_TRUE(bytes.contains(sequence)) << bytes.toHex().toStdString();
    EXPECT_TRUE(bytes.contains(firstMention("BaseOfObject") + "\x04" + firstMention("StreamTest::Trunk")));
}

TEST(JsonStream, ReadsMembersInAnyOrder)
{
    const Loaded loaded(
        Document::Json,
        R"({"root": {"text": "t", "number": 3, "$meta": {"id": 9, "class": "StreamTest::Leaf"}},
                            "version": 1, "EditorModel": "stream"})");
    EXPECT_EQ(loaded.root<Leaf>().number, 3);
    EXPECT_EQ(loaded.root<Leaf>().text, QString("t"));
}

TEST(JsonStream, KeepsTheOrderOfTwoBases)
{
    Tree tree;
    tree.girth = 1.5;
    tree.rough = true;
    const QByteArray document = saved(Document::Json, tree).simplified();
    EXPECT_TRUE(document.contains("\"BaseOfObject\": [ { \"$meta\": { \"class\": \"StreamTest::Trunk\" }, "
                                  "\"girth\": 1.5 }, { \"$meta\": { \"class\": \"StreamTest::Bark\" }, "
                                  "\"rough\": true } ]"))
        << document.toStdString();
}

TEST(XmlStream, TakesCommentsAndCdata)
{
    const Loaded loaded(Document::Xml, R"(<!-- before --><EditorModel version="1" route="stream">
        <root id="1" class="StreamTest::Leaf"><!-- in between --><number>3</number>
        <text><![CDATA[<!DOCTYPE & <b>]]> and <!-- no --> more&#x41;</text></root></EditorModel><!-- after -->)");
    EXPECT_EQ(loaded.root<Leaf>().number, 3);
    EXPECT_EQ(loaded.root<Leaf>().text, QString("<!DOCTYPE & <b> and  moreA"));
}

TEST(XmlStream, PutsAsideWhatXmlCannotHold)
{
    Leaf leaf;
    leaf.text = QString::fromUtf8("a\0b", 3);
    EXPECT_TRUE(saved(Document::Xml, leaf).contains("<text encoding=\"base64\">YQBi</text>"));
    leaf.text = "line\rend";
    EXPECT_TRUE(saved(Document::Xml, leaf).contains("<text encoding=\"base64\">bGluZQ1lbmQ=</text>"));
    leaf.text = " two\n\tlines ";
    EXPECT_TRUE(saved(Document::Xml, leaf).contains("<text> two\n\tlines </text>"));
}
