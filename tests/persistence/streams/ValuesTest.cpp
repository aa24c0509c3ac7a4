// SPDX-License-Identifier: Apache-2.0
#include "Samples.h"
#include "Streaming.h"

#include <EditorModel/types/Rect.h>
#include <EditorModel/types/Transform.h>

#include <QBuffer>

#include <cmath>
#include <limits>

using namespace StreamTest;

namespace {

/// Texts that go wrong where somebody is careless.
const std::vector<QString>& awkwardTexts()
{
    static const std::vector<QString> texts{
        "",
        " ",
        "\n",
        "  blanks at both ends\t ",
        "line\nfeed",
        "carriage\rreturn",
        "both\r\nof them",
        "tab\tand\vvertical\f",
        QString::fromUtf8("nul\0inside", 10),
        QString(QChar(0)),
        "bell\a escape\x1b delete\x7f",
        QString("next line") + QChar(0x85) + QChar(0x2028) + QChar(0x2029) + QChar(0xA0),
        "quotes \" ' ` and \\ and / and \\n",
        "<tag attribute=\"1\">&amp;&#10;</tag><!-- --><![CDATA[x]]>",
        "]]>",
        "<!DOCTYPE x>",
        "{\"$meta\": null}",
        QString::fromUtf8("Zw\xC3\xB6lf Boxk\xC3\xA4mpfer"),
        QString::fromUtf8("\xE6\x97\xA5\xE6\x9C\xAC\xE8\xAA\x9E"),
        QString::fromUtf8("outside the first plane \xF0\x9D\x84\x9E \xF4\x8F\xBF\xBF"),
        QString(QChar(0xFEFF)) + "a byte order mark first",
        QString("one within ") + QChar(0xFEFF),
        QString(QChar(0xFFFE)) + QChar(0xFFFF) + QChar(0xFDD0),
        "true",
        "null",
        "-inf",
        "0",
    };
    return texts;
}

const std::vector<double>& awkwardNumbers()
{
    using Limits = std::numeric_limits<double>;
    static const std::vector<double> numbers{
        0.0,
        -0.0,
        1.0,
        0.1,
        1.0 / 3.0,
        30000.0 / 1001.0,
        1e22,
        1e23,
        -123456789.25,
        5e-324,
        2.5e-310,
        Limits::min(),
        Limits::max(),
        Limits::lowest(),
        1e300 * 10,
        Limits::infinity(),
        -Limits::infinity(),
        9007199254740993.0,
    };
    return numbers;
}

void expectSame(double a, double b)
{
    EXPECT_EQ(a, b);
    EXPECT_EQ(std::signbit(a), std::signbit(b)) << a;
}

} // namespace

TEST_P(Streams, GiveBackEveryKindOfValue)
{
    Tree tree;
    tree.girth = 2.25;
    tree.rough = true;
    tree.flag = true;
    tree.whole = -17;
    tree.colour = 0x80FF0102;
    tree.large = Q_INT64_C(-9007199254740993);
    tree.real = 0.1;
    tree.time = MTime(1234);
    tree.bytes = "bytes";
    tree.text = "text";
    tree.point = QPointF(-1.5, 0.1);
    tree.mood = Wild;
    tree.pen = Types::Pen(0x12345678, 3, true);
    tree.inner.number = 8;
    tree.inner.text = "inner";

    const Tree copy = copied(tree);

    EXPECT_EQ(copy.girth, 2.25);
    EXPECT_TRUE(copy.rough);
    EXPECT_TRUE(copy.flag);
    EXPECT_EQ(copy.whole, -17);
    EXPECT_EQ(copy.colour, 0x80FF0102u);
    EXPECT_EQ(copy.large, Q_INT64_C(-9007199254740993));
    EXPECT_EQ(copy.real, 0.1);
    EXPECT_EQ(copy.time, MTime(1234));
    EXPECT_EQ(copy.bytes, "bytes");
    EXPECT_EQ(copy.text, QString("text"));
    EXPECT_EQ(copy.point.x(), -1.5);
    EXPECT_EQ(copy.point.y(), 0.1);
    EXPECT_EQ(copy.mood, Wild);
    EXPECT_EQ(copy.pen.color, 0x12345678u);
    EXPECT_EQ(copy.pen.width, 3);
    EXPECT_TRUE(copy.pen.enabled);
    EXPECT_EQ(copy.inner.number, 8);
    EXPECT_EQ(copy.inner.text, QString("inner"));
    EXPECT_EQ(copy.leaf, nullptr);
    EXPECT_EQ(copy.anything, nullptr);
}

TEST_P(Streams, GiveBackTheValueTypesOfTheModel)
{
    const Types::Rect rect(0.125, -2.0, 1e-9, 4.5);
    const Types::Rect sameRect = copied(rect);
    EXPECT_EQ(sameRect.left, 0.125);
    EXPECT_EQ(sameRect.top, -2.0);
    EXPECT_EQ(sameRect.right, 1e-9);
    EXPECT_EQ(sameRect.bottom, 4.5);

    const Types::Transform transform(1.5, -2.5, 3.5, -4.5, 5.5, -6.5, 7.5, -8.5, 9.5);
    const Types::Transform sameTransform = copied(transform);
    EXPECT_EQ(sameTransform.m11, 1.5);
    EXPECT_EQ(sameTransform.m12, -2.5);
    EXPECT_EQ(sameTransform.m13, 3.5);
    EXPECT_EQ(sameTransform.m21, -4.5);
    EXPECT_EQ(sameTransform.m22, 5.5);
    EXPECT_EQ(sameTransform.m23, -6.5);
    EXPECT_EQ(sameTransform.m31, 7.5);
    EXPECT_EQ(sameTransform.m32, -8.5);
    EXPECT_EQ(sameTransform.m33, 9.5);
}

TEST_P(Streams, GiveBackTheExtremesOfWholeNumbers)
{
    Tree tree;
    tree.whole = std::numeric_limits<int>::min();
    tree.colour = std::numeric_limits<quint32>::max();
    tree.large = std::numeric_limits<qint64>::max();
    tree.time = MTime(std::numeric_limits<qint64>::min());
    tree.mood = static_cast<Mood>(std::numeric_limits<int>::max());
    const Tree copy = copied(tree);
    EXPECT_EQ(copy.whole, std::numeric_limits<int>::min());
    EXPECT_EQ(copy.colour, std::numeric_limits<quint32>::max());
    EXPECT_EQ(copy.large, std::numeric_limits<qint64>::max());
    EXPECT_EQ(copy.time.ms(), std::numeric_limits<qint64>::min());
    EXPECT_EQ(static_cast<int>(copy.mood), std::numeric_limits<int>::max());
}

TEST_P(Streams, KeepTimesBeyondThirtyTwoBits)
{
    Tree tree;
    tree.time = MTime(Q_INT64_C(2147483648));
    EXPECT_EQ(copied(tree).time.ms(), Q_INT64_C(2147483648));
}

TEST_P(Streams, GiveBackEveryRealNumberExactly)
{
    for (const double number : awkwardNumbers()) {
        Tree tree;
        tree.real = number;
        tree.point = QPointF(number, -number);
        const Tree copy = copied(tree);
        expectSame(copy.real, number);
        expectSame(copy.point.x(), number);
        expectSame(copy.point.y(), -number);
    }
}

TEST_P(Streams, GiveBackNotANumber)
{
    Tree tree;
    tree.real = std::numeric_limits<double>::quiet_NaN();
    tree.girth = -std::numeric_limits<double>::quiet_NaN();
    tree.point = QPointF(std::numeric_limits<double>::quiet_NaN(), 1.0);
    const Tree copy = copied(tree);
    EXPECT_TRUE(std::isnan(copy.real));
    EXPECT_TRUE(std::isnan(copy.girth));
    EXPECT_TRUE(std::isnan(copy.point.x()));
    EXPECT_EQ(copy.point.y(), 1.0);
}

TEST_P(Streams, GiveBackEveryText)
{
    for (const QString& text : awkwardTexts()) {
        Tree tree;
        tree.text = text;
        tree.bytes = text.toStdString();
        const Tree copy = copied(tree);
        EXPECT_EQ(copy.text, text) << text.toUtf8().toPercentEncoding().toStdString();
        EXPECT_EQ(copy.bytes, text.toStdString());
    }
}

TEST_P(Streams, GiveBackEveryCharacterOfTheFirstPlane)
{
    QString all;
    for (int code = 0; code <= 0xFFFF; ++code) {
        const QChar c(code);
        if (!c.isSurrogate())
            all += c;
    }
    // In pieces, so that every form's exception stands beside ordinary text.
    Grove grove;
    for (int start = 0; start < all.size(); start += 61)
        grove.words.push_back({all.mid(start, 61)});
    EXPECT_EQ(copied(grove).words, grove.words);
}

TEST_P(Streams, PutASubstituteForHalfACharacter)
{
    Leaf leaf;
    leaf.text = QString("a") + QChar(0xD800) + "b";
    const QString text = copied(leaf).text;
    ASSERT_EQ(text.size(), 3);
    EXPECT_EQ(text.front(), QChar('a'));
    EXPECT_FALSE(text[1].isSurrogate());
    EXPECT_EQ(text.back(), QChar('b'));
}

TEST_P(Streams, GiveBackLongTexts)
{
    Tree tree;
    tree.text = QString("<&\"\n\t").repeated(200000);
    EXPECT_EQ(copied(tree).text, tree.text);
}

TEST_P(Streams, GiveBackEveryContainer)
{
    const Leaf a;
    const Leaf b;
    Grove grove;
    grove.numbers = {3, 1, 2};
    grove.litter.resize(2);
    grove.litter[1].number = 12;
    grove.words = {{}, {"one"}, {"two", "three"}};
    grove.row = {&b, nullptr, &a, &b};
    grove.leaves = {&a, &b};
    grove.names = {"x", "", "y"};
    grove.falls = {{&a, MTime(5)}, {nullptr, MTime(6)}};
    grove.named["first"].number = 1;
    grove.named[""].text = "second";
    grove.grid = {{1, {}}, {2, {{3, 0.5}, {4, -0.0}}}};
    grove.couple = {&a, nullptr};
    grove.triple = {"triple", 9, Wild};
    grove.notes = {{"key", "value"}, {"", ""}};
    grove.list = {&a, &a, nullptr};

    const Loaded loaded(GetParam(), saved(GetParam(), grove));
    const Grove& copy = loaded.root<Grove>();

    EXPECT_EQ(copy.numbers, grove.numbers);
    ASSERT_EQ(copy.litter.size(), 2u);
    EXPECT_EQ(copy.litter[1].number, 12);
    EXPECT_EQ(copy.words, grove.words);
    ASSERT_EQ(copy.row.size(), 4u);
    EXPECT_EQ(copy.row[0], copy.row[3]);
    EXPECT_EQ(copy.row[1], nullptr);
    EXPECT_NE(copy.row[0], copy.row[2]);
    EXPECT_EQ(copy.leaves, (std::set<const Leaf*>{copy.row[0], copy.row[2]}));
    EXPECT_EQ(copy.names, grove.names);
    EXPECT_EQ(copy.falls, (std::map<const Leaf*, MTime>{{copy.row[2], MTime(5)}, {nullptr, MTime(6)}}));
    ASSERT_EQ(copy.named.size(), 2u);
    EXPECT_EQ(copy.named.at("first").number, 1);
    EXPECT_EQ(copy.named.at("").text, QString("second"));
    EXPECT_EQ(copy.grid, grove.grid);
    EXPECT_EQ(copy.couple, std::make_pair(copy.row[2], static_cast<const Leaf*>(nullptr)));
    EXPECT_EQ(copy.triple, grove.triple);
    EXPECT_EQ(copy.notes, grove.notes);
    EXPECT_EQ(copy.list, (QList<const Leaf*>{copy.row[2], copy.row[2], nullptr}));
}

TEST_P(Streams, GiveBackEmptyContainers)
{
    const Grove copy = copied(Grove());
    EXPECT_TRUE(copy.numbers.empty());
    EXPECT_TRUE(copy.words.empty());
    EXPECT_TRUE(copy.leaves.empty());
    EXPECT_TRUE(copy.falls.empty());
    EXPECT_TRUE(copy.notes.isEmpty());
    EXPECT_TRUE(copy.list.isEmpty());
}

TEST_P(Streams, AddToTheContainersOfAnObjectThatIsReadInto)
{
    Grove stored;
    stored.numbers = {1, 2};
    stored.names = {"x"};
    stored.named["both"].number = 1;
    stored.named["stored"].number = 2;
    stored.grid = {{1, {{10, 0.5}}}, {2, {}}};
    stored.notes = {{"both", "stored"}, {"stored", "stored"}};
    QBuffer buffer;
    buffer.open(QIODevice::ReadWrite);
    const auto writer = Serialize::makeStreamWriter(GetParam(), buffer);
    writer->writeObject(stored);
    writer->finish();

    Grove grove;
    grove.numbers = {7, 8, 9};
    grove.names = {"y"};
    grove.named["both"].number = 3;
    grove.named["both"].text = "replaced";
    grove.named["own"].number = 4;
    grove.grid = {{1, {{10, 1.5}, {11, 2.5}}}, {3, {}}};
    grove.notes = {{"both", "own"}, {"own", "own"}};
    const Leaf* const place = &grove.named.at("both");
    const auto reader = Serialize::makeStreamReader(GetParam(), buffer.data());
    reader->readObject(grove);
    reader->finish();

    EXPECT_EQ(grove.numbers, (std::deque<int>{7, 8, 9, 1, 2}));
    EXPECT_EQ(grove.names, (std::set<QString>{"x", "y"}));
    ASSERT_EQ(grove.named.size(), 3u);
    EXPECT_EQ(grove.named.at("both").number, 1);
    EXPECT_EQ(grove.named.at("both").text, "");
    EXPECT_EQ(&grove.named.at("both"), place);
    EXPECT_EQ(grove.named.at("stored").number, 2);
    EXPECT_EQ(grove.named.at("own").number, 4);
    EXPECT_EQ(grove.grid,
              (std::map<int, std::map<int, double>>{{1, {{10, 0.5}, {11, 2.5}}}, {2, {}}, {3, {}}}));
    EXPECT_EQ(grove.notes,
              (QMap<QString, QString>{{"both", "stored"}, {"own", "own"}, {"stored", "stored"}}));
}

TEST(BinaryStream, KeepsBytesThatAreNotUtf8)
{
    Tree tree;
    tree.bytes = std::string("\xFF\x00\xC3\x28", 4);
    const Loaded loaded(Document::Binary, saved(Document::Binary, tree));
    EXPECT_EQ(loaded.root<Tree>().bytes, tree.bytes);
}

TEST(TextStreams, RefuseBytesThatAreNotUtf8ByName)
{
    Tree tree;
    for (const std::string bytes :
         {"\xFF", "\xC3\x28", "\xED\xA0\x80", "\xC0\x80", "\xF4\x90\x80\x80", "\xE2\x82"}) {
        tree.bytes = bytes;
        for (const Document::Form form : {Document::Xml, Document::Json}) {
            try {
                saved(form, tree);
                ADD_FAILURE() << "was written";
            } catch (const std::runtime_error& error) {
                EXPECT_STREQ(error.what(), "the text is not UTF-8");
            }
        }
    }
}
