// SPDX-License-Identifier: Apache-2.0
// What documents with a table of resources look like, written down by hand. Stored data is for life: these
// texts are never written anew from what the code gives.
#include "TextArchives.h"

#include <EditorModel/media/ResourceTable.h>

#include <gtest/gtest.h>

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

TEST(ResourceDocuments, AnArchiveReplacesTheEntriesOfATableThatItIsReadInto)
{
    ResourceTable::Object content;
    content.resource2fileInfo[{QStringLiteral("c"), Resource::AudioType}] = {};
    load(xmlArchive, content);
    EXPECT_TRUE(content == fullTable());
}

} // namespace
