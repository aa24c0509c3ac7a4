// SPDX-License-Identifier: Apache-2.0
// What documents with a table of resources look like, written down by hand. Stored data is for life: these
// texts are never written anew from what the code gives.
#include "TextArchives.h"

#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/persistence/Document.h>

#include <gtest/gtest.h>

#include <QBuffer>

namespace {

using namespace GoldenTests;

constexpr const char* xmlArchive = R"(<?xml version="1.0" encoding="UTF-8" standalone="yes" ?>
<!DOCTYPE boost_serialization>
<boost_serialization signature="serialization::archive" version="18">
<content class_id="0" tracking_level="1" version="0" object_id="_0">
	<resource2fileInfo class_id="1" tracking_level="0" version="0">
		<count>2</count>
		<item_version>0</item_version>
		<item class_id="2" tracking_level="0" version="0">
			<first class_id="3" tracking_level="0" version="0">
				<element>a &amp; b</element>
				<element>1</element>
			</first>
			<second class_id="4" tracking_level="1" version="0" object_id="_1">
				<info class_id="5" tracking_level="1" version="0" object_id="_2">
					<path>/films/a &amp; b.mp4</path>
					<duration>61000</duration>
					<track>2</track>
				</info>
				<timing class_id="6" tracking_level="1" version="0" object_id="_3">
					<mode>3</mode>
					<intro>500</intro>
					<outro>700</outro>
					<loopMinCount>4</loopMinCount>
				</timing>
			</second>
		</item>
		<item>
			<first>
				<element>a &amp; b</element>
				<element>3</element>
			</first>
			<second object_id="_4">
				<info object_id="_5">
					<path></path>
					<duration>0</duration>
					<track>0</track>
				</info>
				<timing object_id="_6">
					<mode>0</mode>
					<intro>0</intro>
					<outro>0</outro>
					<loopMinCount>0</loopMinCount>
				</timing>
			</second>
		</item>
	</resource2fileInfo>
</content>
</boost_serialization>

)";

constexpr const char* jsonArchive = R"({"content": {
    "resource2fileInfo": {"count": 2, "item_version": 0, "item": [
        {"first": {"element": ["a & b", 1]},
         "second": {
            "info": {"path": "/films/a & b.mp4", "duration": 61000, "track": 2},
            "timing": {"mode": 3, "intro": 500, "outro": 700, "loopMinCount": 4}}},
        {"first": {"element": ["a & b", 3]},
         "second": {
            "info": {"path": "", "duration": 0, "track": 0},
            "timing": {"mode": 0, "intro": 0, "outro": 0, "loopMinCount": 0}}}]}}})";

constexpr const char* xmlStream = R"(<?xml version="1.0" encoding="UTF-8"?>
<EditorModel route="stream" version="1">
    <objects count="1">
        <Item>
            <Data class="ResourceTable::Object" id="1">
                <resource2fileInfo count="2">
                    <Item>
                        <Key count="2">
                            <Item>
                                <Data>a &amp; b</Data>
                            </Item>
                            <Item>
                                <Data>1</Data>
                            </Item>
                        </Key>
                        <Value class="ResourceTable::FileResourceInfo" id="2">
                            <info class="Resource::FileInfo" id="3">
                                <path>/films/a &amp; b.mp4</path>
                                <duration>61000</duration>
                                <track>2</track>
                            </info>
                            <timing class="Resource::Timing" id="4">
                                <mode>3</mode>
                                <intro>500</intro>
                                <outro>700</outro>
                                <loopMinCount>4</loopMinCount>
                            </timing>
                        </Value>
                    </Item>
                    <Item>
                        <Key count="2">
                            <Item>
                                <Data>a &amp; b</Data>
                            </Item>
                            <Item>
                                <Data>3</Data>
                            </Item>
                        </Key>
                        <Value class="ResourceTable::FileResourceInfo" id="5">
                            <info class="Resource::FileInfo" id="6">
                                <path></path>
                                <duration>0</duration>
                                <track>0</track>
                            </info>
                            <timing class="Resource::Timing" id="7">
                                <mode>0</mode>
                                <intro>0</intro>
                                <outro>0</outro>
                                <loopMinCount>0</loopMinCount>
                            </timing>
                        </Value>
                    </Item>
                </resource2fileInfo>
            </Data>
        </Item>
    </objects>
</EditorModel>
)";

ResourceTable::Object fullTable()
{
    ResourceTable::FileResourceInfo film;
    film.info.path = QStringLiteral("/films/a & b.mp4");
    film.info.track = 2;
    film.info.duration = 61000;
    film.timing.mode = Resource::Timing::Looped;
    film.timing.intro = 500;
    film.timing.outro = 700;
    film.timing.loopMinCount = 4;
    ResourceTable::Object table;
    table.resource2fileInfo[{QStringLiteral("a & b"), Resource::ImageType}] = {};
    table.resource2fileInfo[{QStringLiteral("a & b"), Resource::VideoType}] = film;
    return table;
}

TEST(ResourceDocuments, TheXmlArchiveIsAsWrittenDown)
{
    EXPECT_EQ(saved(fullTable()), xmlArchive);

    ResourceTable::Object content;
    load(xmlArchive, content);
    EXPECT_TRUE(content == fullTable());
}

TEST(ResourceDocuments, TheJsonArchiveIsAsWrittenDown)
{
    EXPECT_EQ(savedAsJson(fullTable()), nlohmann::json::parse(jsonArchive));

    ResourceTable::Object content;
    loadJson(jsonArchive, content);
    EXPECT_TRUE(content == fullTable());
}

TEST(ResourceDocuments, TheXmlStreamIsAsWrittenDown)
{
    QBuffer buffer;
    buffer.open(QIODevice::ReadWrite);
    Document::save(buffer, fullTable(), Document::Xml, Document::Stream);
    EXPECT_EQ(buffer.data().toStdString(), xmlStream);

    QByteArray stored = xmlStream;
    QBuffer input(&stored);
    input.open(QIODevice::ReadOnly);
    const auto graph = Document::load(input);
    ASSERT_TRUE(graph.rootAs<ResourceTable::Object>());
    EXPECT_TRUE(*graph.rootAs<ResourceTable::Object>() == fullTable());
}

TEST(ResourceDocuments, AnArchiveReplacesTheEntriesOfATableThatItIsReadInto)
{
    ResourceTable::Object content;
    content.resource2fileInfo[{QStringLiteral("c"), Resource::AudioType}] = {};
    load(xmlArchive, content);
    EXPECT_TRUE(content == fullTable());
}

} // namespace
