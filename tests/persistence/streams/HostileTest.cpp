// SPDX-License-Identifier: Apache-2.0
// Documents that are wrong, by accident or on purpose: each gives a clear exception or a sound object.
#include "Samples.h"
#include "Streaming.h"

#include <EditorModel/persistence/Fields.h>

#include <QBuffer>
#include <QFile>

using namespace StreamTest;
using testing::HasSubstr;

namespace {

QByteArray xml(const QByteArray& content)
{
    return "<EditorModel route=\"stream\" version=\"1\">" + content + "</EditorModel>";
}

QByteArray xmlLeaf(const QByteArray& fields)
{
    return xml("<root class=\"StreamTest::Leaf\" id=\"1\">" + fields + "</root>");
}

std::string failureOfXml(const QByteArray& document)
{
    return failureOf(Document::Xml, document).text;
}

QByteArray json(const QByteArray& root)
{
    return R"({"EditorModel": "stream", "version": 1, "root": )" + root + "}";
}

QByteArray jsonLeaf(const QByteArray& fields)
{
    return json(R"({"$meta": {"class": "StreamTest::Leaf", "id": 1}, )" + fields + "}");
}

std::string failureOfJson(const QByteArray& document)
{
    return failureOf(Document::Json, document).text;
}

QByteArray bytes(std::initializer_list<int> values)
{
    QByteArray result;
    for (const int value : values)
        result += static_cast<char>(value);
    return result;
}

QByteArray name(const QByteArray& text)
{
    return bytes({0, text.size()}) + text;
}

/// The head of a binary document with one object; the names 32 and 33 are taken.
QByteArray binaryRoot(const QByteArray& className)
{
    return name("root") + '\x03' + name(className);
}

std::string failureOfBinary(const QByteArray& document)
{
    return failureOf(Document::Binary, document).text;
}

/// Every kind of value, container and pointer in one document.
QByteArray richDocument(Document::Form form)
{
    Tree tree;
    Tree second;
    Leaf leaf;
    Grove grove;
    tree.text = QString::fromUtf8("text \0 \xC3\xA4", 9);
    tree.bytes = "bytes";
    tree.real = 0.1;
    tree.leaf = &leaf;
    tree.sameLeaf = tree.soft = &tree.inner;
    tree.other = &second;
    second.other = &tree;
    second.anything = &grove;
    grove.numbers = {1, 2, 3};
    grove.litter.resize(2);
    grove.words = {{}, {"one"}, {"two", "three"}};
    grove.row = {&leaf, nullptr, &grove.litter[1]};
    grove.leaves = {&leaf};
    grove.names = {"x", "y"};
    grove.falls = {{&leaf, MTime(5)}};
    grove.named["first"].number = 1;
    grove.grid = {{2, {{3, 0.5}}}};
    grove.couple = {&leaf, nullptr};
    grove.triple = {"triple", 9, Wild};
    grove.notes = {{"key", "value"}};
    grove.list = {&leaf};
    return saved(form, tree);
}

/// Takes `room` bytes and then no more.
class FullDevice : public QIODevice
{
public:
    explicit FullDevice(qint64 room) : m_room(room) { open(QIODevice::WriteOnly); }

private:
    qint64 readData(char*, qint64) override { return -1; }
    qint64 writeData(const char*, qint64 size) override
    {
        if (size > m_room)
            return -1;
        m_room -= size;
        return size;
    }

    qint64 m_room;
};

} // namespace

TEST_P(Streams, RefuseADocumentThatEndsTooSoon)
{
    QByteArray document = richDocument(GetParam());
    if (GetParam() != Document::Binary)
        document = document.trimmed();
    EXPECT_EQ(failureOf(GetParam(), document).text, "");
    for (int size = 0; size < document.size(); ++size)
        EXPECT_NE(failureOf(GetParam(), document.left(size)).text, "") << size;
}

TEST_P(Streams, RefuseADocumentThatGoesOn)
{
    EXPECT_NE(failureOf(GetParam(), saved(GetParam(), Leaf()) + "x").text, "");
    EXPECT_NE(failureOf(GetParam(), saved(GetParam(), {nullptr, nullptr})).text, "");
}

TEST_P(Streams, WithstandRandomDamage)
{
    std::mt19937 random(20250101);
    const QByteArray document = richDocument(GetParam());
    for (int round = 0; round < 20000; ++round)
        expectSoundOrRefused(GetParam(), damaged(document, random));
}

TEST_P(Streams, WithstandNoise)
{
    std::mt19937 random(7);
    for (int size = 0; size < 300; ++size) {
        QByteArray noise;
        for (int i = 0; i < size; ++i)
            noise += static_cast<char>(random());
        expectSoundOrRefused(GetParam(), noise);
    }
}

TEST_P(Streams, TellADeviceThatTakesNothing)
{
    for (const qint64 room : {0, 1, 50}) {
        FullDevice device(room);
        EXPECT_THROW(
            {
                const auto writer = Serialize::makeStreamWriter(GetParam(), device);
                const Tree tree;
                writer->stream().field({"root", &tree});
                writer->writePointer(&tree);
                writer->finish();
            },
            std::runtime_error);
    }
}

TEST_P(Streams, TellADiskThatIsFull)
{
    QFile file("/dev/full");
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    const auto writer = Serialize::makeStreamWriter(GetParam(), file);
    writer->stream().field({"root", nullptr});
    writer->writePointer(nullptr);
    EXPECT_THROW(writer->finish(), std::runtime_error);
}

TEST(XmlStream, RefusesWhatIsNoStream)
{
    EXPECT_NE(failureOfXml(""), "");
    EXPECT_EQ(failureOfXml("<Model/>"),
              "line 1, column 9: expected the element \"EditorModel\", found \"Model\"");
    EXPECT_THAT(failureOfXml("<EditorModel route=\"archive\" version=\"1\"/>"),
                HasSubstr("expected the route \"stream\", found \"archive\""));
    EXPECT_THAT(failureOfXml("<EditorModel route=\"stream\" version=\"2\"/>"),
                HasSubstr("expected version 1 of the field stream, found version 2"));
    EXPECT_THAT(failureOfXml("<EditorModel version=\"1\"/>"),
                HasSubstr("expected the attribute \"route\", found none"));
}

TEST(XmlStream, NamesTheFieldThatItExpectsAndTheOneThatItFinds)
{
    EXPECT_EQ(failureOfXml(xmlLeaf("<text/><number>1</number>")),
              "expected the field \"number\", found the field \"text\"");
    EXPECT_EQ(failureOfXml(xmlLeaf("<number>1</number>")),
              "expected the field \"text\", found the end of \"root\"");
    EXPECT_EQ(failureOfXml(xmlLeaf("<number>1</number><text/><more/>")),
              "expected the end of \"root\", found the field \"more\"");
    EXPECT_EQ(failureOfXml(xmlLeaf("stray<number>1</number>")),
              "expected an element, found the text \"stray\"");
}

TEST(XmlStream, TellsLineAndColumn)
{
    const Failure failure = failureOf(Document::Xml, xmlLeaf("\n\n<number>x</number><text/>"));
    EXPECT_EQ(failure.text, "expected a whole number, found \"x\"");
    EXPECT_EQ(failure.position, "line 3, column 19");
}

TEST(XmlStream, RefusesNumbersThatAreNone)
{
    const auto failure = [](const QByteArray& text) {
        return failureOfXml(xmlLeaf("<number>" + text + "</number><text/>"));
    };
    EXPECT_EQ(failure("2147483647"), "");
    EXPECT_EQ(failure("-2147483648"), "");
    EXPECT_EQ(failure("2147483648"), "the number \"2147483648\" is out of range");
    for (const char* text : {"", " 1", "1 ", "+1", "1.0", "0x1", "1e3", "--1"})
        EXPECT_THAT(failure(text), HasSubstr("expected a whole number")) << text;
}

TEST(XmlStream, RefusesDocumentTypes)
{
    EXPECT_THAT(failureOfXml("<!DOCTYPE EditorModel [<!ENTITY a \"b\">]>" +
                             xmlLeaf("<number>1</number><text>&a;</text>")),
                HasSubstr("a document type declaration is not taken"));
    EXPECT_NE(failureOfXml(xmlLeaf("<number>1</number><text>&a;</text>")), "");
}

TEST(XmlStream, RefusesManyAttributesAtOnce)
{
    QByteArray attributes;
    for (int i = 0; i < 200000; ++i)
        attributes += " a" + QByteArray::number(i) + "=\"\"";
    EXPECT_THAT(failureOfXml(xml("<root" + attributes + "/>")), HasSubstr("more than 8 attributes"));
}

TEST(XmlStream, RefusesAttributesOutOfPlace)
{
    EXPECT_EQ(failureOfXml(xmlLeaf("<number unit=\"m\">1</number><text/>")),
              "the attribute \"unit\" has no place here");
    EXPECT_EQ(failureOfXml(xmlLeaf("<number>1</number><text encoding=\"rot13\">a</text>")),
              "expected the encoding \"base64\", found \"rot13\"");
    EXPECT_EQ(failureOfXml(xml("<root null=\"true\" id=\"1\"/>")), "the attribute \"id\" has no place here");
    EXPECT_EQ(failureOfXml(xml("<root null=\"no\"/>")), "expected \"true\", found \"no\"");
    EXPECT_EQ(failureOfXml(xml("<root/>")),
              "expected an object for \"root\", found an element without \"class\"");
}

TEST(XmlStream, RefusesTextThatIsNone)
{
    EXPECT_THAT(failureOfXml(xmlLeaf("<number>1</number><text encoding=\"base64\">YQ*=</text>")),
                HasSubstr("expected base64"));
    EXPECT_EQ(failureOfXml(xmlLeaf("<number>1</number><text encoding=\"base64\">/w==</text>")),
              "the text is not UTF-8");
    EXPECT_EQ(failureOfXml(xmlLeaf("<number>1</number><text>\xFF</text>")), "the text is not UTF-8");
    EXPECT_NE(failureOfXml(xmlLeaf("<number>1</number><text>\x01</text>")), "");
    EXPECT_NE(failureOfXml(xmlLeaf("<number>1</number><text>&#0;</text>")), "");
    EXPECT_NE(failureOfXml(xmlLeaf("<number>1</number><text><b/></text>")), "");
}

TEST(XmlStream, RefusesCountsBeyondTheDocument)
{
    const auto failure = [](const QByteArray& count) {
        return failureOfXml(
            xml("<root class=\"StreamTest::Grove\" id=\"1\"><numbers count=\"" + count + "\"/></root>"));
    };
    EXPECT_THAT(failure("2000000000"), HasSubstr("a sequence of 2000000000 items"));
    EXPECT_THAT(failure("-1"), HasSubstr("a sequence of -1 items"));
    EXPECT_THAT(failure("99999999999"), HasSubstr("out of range"));
    EXPECT_EQ(failure("1"), "expected the field \"Item\", found the end of \"numbers\"");
}

TEST(XmlStream, RefusesIdentitiesThatDoNotAgree)
{
    const auto twig = [](const QByteArray& soft, const QByteArray& strict) {
        return failureOfXml(xml("<root class=\"StreamTest::Twig\" id=\"1\"><soft " + soft +
                                "</soft><strict " + strict + "</strict></root>"));
    };
    const QByteArray leaf = "class=\"StreamTest::Leaf\" id=\"2\"><number>1</number><text/>";
    EXPECT_EQ(twig(leaf, "ref=\"2\">"), "");
    EXPECT_EQ(twig(leaf, leaf), "the number 2 stands for two objects");
    EXPECT_EQ(twig("ref=\"2\">", leaf),
              "expected an object, found a reference to 2, which is none read before");
    EXPECT_EQ(twig(leaf, "ref=\"1\">"), "std::bad_cast");
    EXPECT_EQ(twig("ref=\"1\">", "null=\"true\">"), "");
    EXPECT_EQ(twig("class=\"StreamTest::Leaf\">", leaf),
              "expected a pointer, found the part of the base \"StreamTest::Leaf\"");
    EXPECT_THAT(twig("ref=\"18446744073709551616\">", leaf), HasSubstr("out of range"));
    EXPECT_THAT(twig("ref=\"2\"><x/>", leaf), HasSubstr("found the field \"x\""));
}

TEST(XmlStream, RefusesNullAndOtherClassesForAValue)
{
    const auto nest = [](const QByteArray& egg) {
        return failureOfXml(xml("<root class=\"StreamTest::Nest\" id=\"1\"><before null=\"true\"/>" + egg +
                                "<after null=\"true\"/></root>"));
    };
    EXPECT_EQ(nest("<egg class=\"StreamTest::Leaf\" id=\"2\"><number>1</number><text/></egg>"), "");
    EXPECT_EQ(nest("<egg null=\"true\"/>"),
              "expected an object of the class \"StreamTest::Leaf\", found null");
    EXPECT_EQ(nest("<egg ref=\"1\"/>"),
              "expected an object of the class \"StreamTest::Leaf\", found a reference to object 1");
    EXPECT_EQ(nest("<egg class=\"StreamTest::Moss\" id=\"2\"><number>1</number><text/></egg>"),
              "expected the class \"StreamTest::Leaf\", found \"StreamTest::Moss\"");
}

TEST(XmlStream, RefusesTheWrongBase)
{
    EXPECT_EQ(
        failureOfXml(xml(
            "<root class=\"StreamTest::Sheet\" id=\"1\"><BaseOfObject class=\"StreamTest::Bark\"/></root>")),
        "expected the class \"StreamTest::Trunk\", found \"StreamTest::Bark\"");
    EXPECT_EQ(failureOfXml(xml("<root class=\"StreamTest::Sheet\" id=\"1\"><BaseOfObject "
                               "class=\"StreamTest::Trunk\" id=\"2\"/></root>")),
              "expected the part of the base \"StreamTest::Trunk\", found an object of the class "
              "\"StreamTest::Trunk\"");
}

TEST(XmlStream, StopsAtObjectsNestedTooDeep)
{
    QByteArray document;
    for (int i = 1; i <= 5000; ++i)
        document += (i == 1 ? "<root" : "<next") + QByteArray(" class=\"StreamTest::Chain\" id=\"") +
                    QByteArray::number(i) + "\">";
    EXPECT_EQ(failureOfXml("<EditorModel route=\"stream\" version=\"1\">" + document),
              "objects nest deeper than 1000 levels");
    EXPECT_NE(failureOfXml(xml(QByteArray("<a>").repeated(500000))), "");
}

TEST(XmlStream, ReadsManyEscapesInGoodTime)
{
    const Loaded loaded(Document::Xml, xmlLeaf("<number>1</number><text>" +
                                               QByteArray("&lt;").repeated(1000000) + "</text>"));
    EXPECT_EQ(loaded.root<Leaf>().text.size(), 1000000);
}

TEST(JsonStream, RefusesWhatIsNoStream)
{
    EXPECT_THAT(failureOfJson("["), HasSubstr("line 1, column 2"));
    EXPECT_EQ(failureOfJson("[]"), "expected an object, found an array");
    EXPECT_EQ(failureOfJson("{}"), "expected the field \"EditorModel\", found no more fields");
    EXPECT_EQ(failureOfJson(R"({"EditorModel": "archive", "version": 1})"),
              "expected the route \"stream\", found the text \"archive\"");
    EXPECT_EQ(failureOfJson(R"({"EditorModel": "stream", "version": 2})"),
              "expected version 1 of the field stream, found 2");
    EXPECT_EQ(failureOfJson(R"({"EditorModel": "stream", "version": 1})"),
              "expected the field \"root\", found no more fields");
}

TEST(JsonStream, NamesTheFieldThatItExpectsAndTheOneThatItFinds)
{
    EXPECT_EQ(failureOfJson(jsonLeaf(R"("number": 1, "texte": "")")),
              "expected the field \"text\", found the field \"texte\"");
    EXPECT_EQ(failureOfJson(jsonLeaf(R"("number": 1)")), "expected the field \"text\", found no more fields");
    EXPECT_EQ(failureOfJson(jsonLeaf(R"("number": 1, "text": "", "more": 2)")),
              "expected no more fields, found the field \"more\"");
}

TEST(JsonStream, TellsTheKeysToWhereItFailed)
{
    const QByteArray document = json(R"({"$meta": {"class": "StreamTest::Grove", "id": 1}, "numbers": [],
        "litter": [{"Data": {"$meta": {"class": "StreamTest::Leaf", "id": 2}, "number": 1, "text": ""}},
                   {"Data": {"$meta": {"class": "StreamTest::Leaf", "id": 3}, "number": 1, "text": 2}}]})");
    const Failure failure = failureOf(Document::Json, document);
    EXPECT_THAT(failure.text, HasSubstr("a text"));
    EXPECT_EQ(failure.position, "root/litter[2]/Data/text");
}

TEST(JsonStream, RefusesValuesOfAnotherKind)
{
    const auto failure = [](const QByteArray& number) {
        return failureOfJson(jsonLeaf("\"number\": " + number + ", \"text\": \"\""));
    };
    EXPECT_EQ(failure("-2147483648"), "");
    for (const char* number : {"2147483648", "-2147483649", "1.0", "1e3", "\"1\"", "true", "null", "[]", "{}",
                               "18446744073709551615", "1e999"})
        EXPECT_NE(failure(number), "") << number;
}

TEST(JsonStream, RefusesTextThatIsNone)
{
    EXPECT_NE(failureOfJson(jsonLeaf("\"number\": 1, \"text\": \"\xFF\"")), "");
    EXPECT_NE(failureOfJson(jsonLeaf("\"number\": 1, \"text\": \"\x01\"")), "");
    EXPECT_NE(failureOfJson(jsonLeaf(R"("number": 1, "text": "\ud800")")), "");
}

TEST(JsonStream, RefusesIdentitiesThatDoNotAgree)
{
    const auto twig = [](const QByteArray& soft, const QByteArray& strict) {
        return failureOfJson(json(R"({"$meta": {"class": "StreamTest::Twig", "id": 1}, "soft": )" + soft +
                                  ", \"strict\": " + strict + "}"));
    };
    const QByteArray leaf = R"({"$meta": {"class": "StreamTest::Leaf", "id": 2}, "number": 1, "text": ""})";
    EXPECT_EQ(twig(leaf, R"({"$meta": {"ref": 2}})"), "");
    EXPECT_EQ(twig(leaf, leaf), "the number 2 stands for two objects");
    EXPECT_EQ(twig(R"({"$meta": {"ref": 2}})", leaf),
              "expected an object, found a reference to 2, which is none read before");
    EXPECT_EQ(twig(leaf, R"({"$meta": {"ref": 1}})"), "std::bad_cast");
    for (const char* soft :
         {"{}", "1", "[]", "\"x\"", R"({"$meta": 1})", R"({"$meta": {}})", R"({"$meta": {"id": 3}})",
          R"({"$meta": {"class": 1, "id": 3}})", R"({"$meta": {"class": "StreamTest::Leaf"}})",
          R"({"$meta": {"ref": -1}})", R"({"$meta": {"ref": 1.5}})", R"({"$meta": {"ref": "1"}})",
          R"({"$meta": {"ref": 1}, "number": 1})", R"({"$meta": {"ref": 1, "id": 3}})",
          R"({"$meta": {"class": "StreamTest::Leaf", "id": 3, "x": 1}, "number": 1, "text": ""})"})
        EXPECT_NE(twig(soft, "null"), "") << soft;
}

TEST(JsonStream, RefusesBasesThatDoNotAgree)
{
    const auto sheet = [](const QByteArray& base) {
        return failureOfJson(
            json(R"({"$meta": {"class": "StreamTest::Sheet", "id": 1}, "BaseOfObject": )" + base + "}"));
    };
    EXPECT_EQ(sheet("1"), "expected an array for \"BaseOfObject\", found 1");
    EXPECT_EQ(sheet("[]"), "expected the part of another base, found only 0");
    EXPECT_EQ(sheet(R"([{"$meta": {"class": "StreamTest::Bark"}}])"),
              "expected the class \"StreamTest::Trunk\", found \"StreamTest::Bark\"");
    QByteArray document = saved(Document::Json, Sheet()).simplified();
    document.replace(R"("girth": 0.0 } ])", R"("girth": 0.0 }, {} ])");
    EXPECT_NE(failureOfJson(document), "");
}

TEST(JsonStream, RefusesItemsThatAreNone)
{
    const auto grove = [](const QByteArray& numbers) {
        return failureOfJson(
            json(R"({"$meta": {"class": "StreamTest::Grove", "id": 1}, "numbers": )" + numbers + "}"));
    };
    EXPECT_EQ(grove("{}"), "expected an array for \"numbers\", found an object");
    EXPECT_EQ(grove("[1]"), "expected an item, found 1");
    EXPECT_EQ(grove(R"([{"Data": 1, "Also": 2}])"), "expected no more fields, found the field \"Also\"");
}

TEST(JsonStream, StopsAtWhatNestsTooDeep)
{
    QByteArray document;
    for (int i = 1; i <= 5000; ++i)
        document += (i == 1 ? "" : "\"next\": ") +
                    QByteArray(R"({"$meta": {"class": "StreamTest::Chain", "id": )") + QByteArray::number(i) +
                    "}, ";
    document += "\"next\": null" + QByteArray("}").repeated(5000);
    EXPECT_EQ(failureOfJson(json(document)), "objects nest deeper than 1000 levels");
    EXPECT_NE(failureOfJson(json(QByteArray("[").repeated(1000000) + QByteArray("]").repeated(1000000))), "");
    EXPECT_NE(failureOfJson(QByteArray("[").repeated(1000000)), "");
}

TEST(BinaryStream, NamesWhatItExpectsAndWhatItFinds)
{
    const QByteArray leaf = binaryRoot("StreamTest::Leaf");
    EXPECT_EQ(failureOfBinary(""), "expected 1 bytes, found the end of the document after 0");
    EXPECT_EQ(failureOfBinary(name("toor") + '\x01'),
              "expected the field \"root\", found the field \"toor\"");
    EXPECT_EQ(failureOfBinary(leaf + '\x05'), "expected the field \"number\", found the end of an object");
    EXPECT_EQ(failureOfBinary(leaf + name("number") + '\x10'),
              "expected a number of 32 bits for \"number\", found a real number");
    EXPECT_EQ(failureOfBinary(leaf + name("number") + '\x63'),
              "expected a number of 32 bits for \"number\", found a field");
    EXPECT_EQ(failureOfBinary(leaf + name("number") + '\x1F'),
              "expected a number of 32 bits for \"number\", found the byte 31");
    const QByteArray whole =
        leaf + name("number") + bytes({0x0D, 1, 0, 0, 0}) + name("text") + bytes({0x12, 0});
    EXPECT_EQ(failureOfBinary(whole + '\x05'), "");
    EXPECT_EQ(failureOfBinary(whole + bytes({34})), "expected the end of an object, found a field");
    EXPECT_EQ(failureOfBinary(whole + bytes({5, 5, 5})),
              "expected the end of the document, found 2 more bytes");
    EXPECT_EQ(failureOfBinary(name("root") + '\x0B'), "expected an object for \"root\", found a truth value");
}

TEST(BinaryStream, TellsTheByte)
{
    const Failure failure =
        failureOf(Document::Binary, binaryRoot("StreamTest::Leaf") + name("number") + '\x10');
    EXPECT_EQ(failure.position, "byte 34"); // 6 and 1 for the root, 18 for the class, 8 and 1 for the number
}

TEST(BinaryStream, RefusesLengthsBeyondTheDocument)
{
    const QByteArray huge = bytes({0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0x01});
    const QByteArray number = name("number") + bytes({0x0D, 1, 0, 0, 0});
    EXPECT_EQ(failureOfBinary(bytes({0}) + huge), "expected 18446744073709551615 bytes, found only 0");
    EXPECT_EQ(failureOfBinary(binaryRoot("StreamTest::Leaf") + number + name("text") + '\x12' + huge + "abc"),
              "expected 18446744073709551615 bytes, found only 3");
    EXPECT_EQ(failureOfBinary(binaryRoot("StreamTest::Grove") + name("numbers") + bytes({7, 1, 9, 10, 8})),
              "expected the field \"Data\", found the end of an item");
    EXPECT_EQ(failureOfBinary(binaryRoot("StreamTest::Grove") + name("numbers") + bytes({7, 1, 9, 10})),
              "expected the field \"Data\", found the end of an item");
    EXPECT_EQ(failureOfBinary(binaryRoot("StreamTest::Grove") + name("numbers") + bytes({7, 2, 9, 10, 8})),
              "a sequence of 2 items is longer than the document");
    EXPECT_EQ(failureOfBinary(binaryRoot("StreamTest::Grove") + name("numbers") + '\x07' + huge),
              "a sequence of 18446744073709551615 items is longer than the document");
    EXPECT_EQ(failureOfBinary(name("root") + '\x02' +
                              bytes({0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 2})),
              "a count of more than 64 bits");
}

TEST(BinaryStream, RefusesNamesAndNumbersThatNobodyGave)
{
    EXPECT_EQ(failureOfBinary(bytes({32})), "expected a name, found the number 32");
    EXPECT_EQ(failureOfBinary(name("root") + bytes({3, 33})), "expected a name, found the number 33");
    EXPECT_EQ(failureOfBinary(name("root") + bytes({3, 5})), "expected a name, found the number 5");
    EXPECT_EQ(failureOfBinary(name("root") + bytes({2, 1})),
              "expected an object, found a reference to 1, which is none read before");
}

TEST(BinaryStream, RefusesTextThatIsNotUtf8)
{
    const QByteArray leaf = binaryRoot("StreamTest::Leaf") + name("number") + bytes({0x0D, 1, 0, 0, 0});
    EXPECT_EQ(failureOfBinary(leaf + name("text") + bytes({0x12, 1, 0xFF, 5})), "the text is not UTF-8");
}

TEST(BinaryStream, StopsAtObjectsNestedTooDeep)
{
    QByteArray document = binaryRoot("StreamTest::Chain") + name("next") + bytes({3, 33});
    document += bytes({34, 3, 33}).repeated(5000);
    EXPECT_EQ(failureOfBinary(document), "objects nest deeper than 1000 levels");
}
