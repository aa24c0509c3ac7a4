// SPDX-License-Identifier: Apache-2.0
// Whole documents in every form and route, to the byte where bytes count, written down by hand: a label, the
// same label again, and null. Stored data is for life: these are never written anew from what the code gives.
#include <EditorModel/persistence/Document.h>
#include <EditorModel/timeline/Label.h>

#include <nlohmann/json.hpp>

#include <gtest/gtest.h>

#include <QBuffer>

#include <deque>
#include <string>

namespace {

QByteArray hex(const char* digits)
{
    return QByteArray::fromHex(digits);
}

std::string digits(const QByteArray& bytes)
{
    return bytes.toHex(' ').toStdString();
}

/// Signature, version and route, length, SHA-256; then what Boost's archive writes on a machine with 64-bit
/// pointers and the lowest byte first.
const QByteArray binaryArchive =
    hex("89 45444d 0d0a1a0a  01 00  7300000000000000"
        "f15a436b844f890fbfb669dd496bedfa94c3419255480f9e15f1b20d48333fa6"
        "1600000000000000") +
    "serialization::archive" +
    hex("1200  04080408 01000000"                // versions and sizes
        "00 00000000  0300000000000000 00000000" // the list of objects, and its count
        "0100 0f00000000000000") +
    "Timeline::Label" +
    hex("01 00000000 00000000" // the first object of its class
        "ffff  d8ffffff  0200000000000000 c384"
        "0100 00000000" // the same object
        "ffff");

const QByteArray binaryStream =
    hex("89 45444d 0d0a1a0a  01 01  5800000000000000"
        "d8c8faa88e6da7d5a9a0e1cadf82c66ec1b29a22330c846e1cf54b7565afcfa6"
        "0007") +
    "objects" + hex("07 03  09 0004") + "Data" + hex("03 000f") + "Timeline::Label" + hex("0008") +
    "timeline" + hex("01 0008") + "position" + hex("11 d8ffffffffffffff 0004") + "name" +
    hex("12 02 c384 05 0a") +
    hex("09 21 02 01 0a") + // the same object, under the second name of the document
    hex("09 21 01 0a 08");

const QByteArray xmlArchive = R"(<?xml version="1.0" encoding="UTF-8" standalone="yes" ?>
<!DOCTYPE boost_serialization>
<boost_serialization signature="serialization::archive" version="18">
<objects class_id="0" tracking_level="0" version="0">
	<count>3</count>
	<item_version>0</item_version>
	<item class_id="1" class_name="Timeline::Label" tracking_level="1" version="0" object_id="_0">
		<timeline class_id="-1"></timeline>
		<position>-40</position>
		<name>Ä</name>
	</item>
	<item class_id_reference="1" object_id_reference="_0"></item>
	<item class_id="-1"></item>
</objects>
</boost_serialization>

<!-- EditorModel archive: 577 bytes, SHA-256 8f96c5c497f16bd752bd62fff6907b8de18ab878646f8c1523cef696dc6f4db3 -->
)";

const QByteArray xmlStream = R"(<?xml version="1.0" encoding="UTF-8"?>
<EditorModel route="stream" version="1">
    <objects count="3">
        <Item>
            <Data class="Timeline::Label" id="1">
                <timeline null="true"/>
                <position>-40</position>
                <name>Ä</name>
            </Data>
        </Item>
        <Item>
            <Data ref="1"/>
        </Item>
        <Item>
            <Data null="true"/>
        </Item>
    </objects>
</EditorModel>
)";

const QByteArray jsonArchive = R"({"EditorModel": "archive", "version": 1,
    "objects": {"count": 3, "item_version": 0, "item": [
        {"$meta": {"class": "Timeline::Label", "id": 1}, "timeline": null, "position": -40, "name": "Ä"},
        {"$meta": {"class": "Timeline::Label", "ref": 1}},
        null]}})";

const QByteArray jsonStream = R"({"EditorModel": "stream", "version": 1,
    "objects": [
        {"Data": {"$meta": {"class": "Timeline::Label", "id": 1},
            "timeline": null, "position": -40, "name": "Ä"}},
        {"Data": {"$meta": {"ref": 1}}},
        {"Data": null}]})";

QByteArray written(Document::Form form, Document::Route route)
{
    Timeline::Label label;
    label.setPosition(-40)->setName(QStringLiteral("Ä"));
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    Document::save(buffer, std::deque<const Serialize::ISerializable*>{&label, &label, nullptr}, form, route);
    return buffer.data();
}

void expectRead(QByteArray document)
{
    QBuffer buffer(&document);
    buffer.open(QIODevice::ReadOnly);
    const auto graph = Document::load(buffer);
    ASSERT_EQ(graph.roots().size(), 3u);
    const auto* const label = dynamic_cast<const Timeline::Label*>(graph.roots()[0]);
    ASSERT_TRUE(label);
    EXPECT_EQ(label->timeline, nullptr);
    EXPECT_EQ(label->position, MTime(-40));
    EXPECT_EQ(label->name, QStringLiteral("Ä"));
    EXPECT_EQ(graph.roots()[1], graph.roots()[0]);
    EXPECT_EQ(graph.roots()[2], nullptr);
}

TEST(DocumentForms, TheBinaryArchiveIsAsWrittenDown)
{
    EXPECT_EQ(digits(written(Document::Binary, Document::Archive)), digits(binaryArchive));
    expectRead(binaryArchive);
}

TEST(DocumentForms, TheBinaryStreamIsAsWrittenDown)
{
    EXPECT_EQ(digits(written(Document::Binary, Document::Stream)), digits(binaryStream));
    expectRead(binaryStream);
}

TEST(DocumentForms, TheXmlArchiveIsAsWrittenDown)
{
    EXPECT_EQ(written(Document::Xml, Document::Archive).toStdString(), xmlArchive.toStdString());
    expectRead(xmlArchive);
}

TEST(DocumentForms, TheXmlStreamIsAsWrittenDown)
{
    EXPECT_EQ(written(Document::Xml, Document::Stream).toStdString(), xmlStream.toStdString());
    expectRead(xmlStream);
}

// The members of Json objects have no order, and blanks between them no meaning.

TEST(DocumentForms, TheJsonArchiveIsAsWrittenDown)
{
    EXPECT_EQ(nlohmann::json::parse(written(Document::Json, Document::Archive).toStdString()),
              nlohmann::json::parse(jsonArchive.toStdString()));
    expectRead(jsonArchive);
}

TEST(DocumentForms, TheJsonStreamIsAsWrittenDown)
{
    EXPECT_EQ(nlohmann::json::parse(written(Document::Json, Document::Stream).toStdString()),
              nlohmann::json::parse(jsonStream.toStdString()));
    expectRead(jsonStream);
}

} // namespace
