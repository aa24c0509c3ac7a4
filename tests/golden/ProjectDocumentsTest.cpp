// SPDX-License-Identifier: Apache-2.0
// What documents with a project and with what collections store look like, written down by hand. Stored data
// is for life: these texts are never written anew from what the code gives.
#include "TextArchives.h"

#include <EditorModel/library/EditorCollection.h>
#include <EditorModel/library/ImportObject.h>
#include <EditorModel/library/PersistentItem.h>
#include <EditorModel/library/Project.h>
#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>

namespace {

using namespace GoldenTests;

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::Pair;

constexpr const char* project = R"(<?xml version="1.0" encoding="UTF-8" standalone="yes" ?>
<!DOCTYPE boost_serialization>
<boost_serialization signature="serialization::archive" version="18">
<content class_id="0" tracking_level="1" version="0" object_id="_0">
	<timeline class_id="-1"></timeline>
	<userCollection class_id="2" tracking_level="1" version="0" object_id="_1">
		<items class_id="3" tracking_level="0" version="0">
			<count>3</count>
			<item_version>0</item_version>
			<item class_id="4" tracking_level="1" version="0" object_id="_2">
				<tag>Song</tag>
				<description>A song</description>
				<descriptionUrl>https://example.org/song</descriptionUrl>
				<location>song.flac</location>
				<remoteUrl>https://example.org/song.flac</remoteUrl>
				<remoteSize>5000000000</remoteSize>
				<kind>2</kind>
				<category>sample_music</category>
			</item>
			<item class_id_reference="4" object_id_reference="_2"></item>
			<item class_id="-1"></item>
		</items>
	</userCollection>
	<resourceTable class_id="5" tracking_level="1" version="0" object_id="_3">
		<resource2fileInfo class_id="6" tracking_level="0" version="0">
			<count>0</count>
			<item_version>0</item_version>
		</resource2fileInfo>
	</resourceTable>
	<portable>1</portable>
</content>
</boost_serialization>

)";

constexpr const char* quizItem = R"(<?xml version="1.0" encoding="UTF-8" standalone="yes" ?>
<!DOCTYPE boost_serialization>
<boost_serialization signature="serialization::archive" version="18">
<content class_id="0" tracking_level="1" version="0" object_id="_0">
	<uniqueId>{1}</uniqueId>
	<item class_id="1" tracking_level="1" version="0" object_id="_1">
		<questions class_id="2" tracking_level="0" version="0">
			<count>0</count>
			<item_version>0</item_version>
		</questions>
		<tag>School</tag>
		<description></description>
	</item>
	<preview class_id="3" tracking_level="0" version="1">
		<px class_id="-1"></px>
	</preview>
	<categories class_id="5" tracking_level="0" version="0">
		<count>1</count>
		<item_version>0</item_version>
		<item>all</item>
	</categories>
	<collectionId>Quiz</collectionId>
	<customStrings class_id="6" tracking_level="0" version="0">
		<count>1</count>
		<item_version>0</item_version>
		<item class_id="7" tracking_level="0" version="0">
			<first>author</first>
			<second>me</second>
		</item>
	</customStrings>
</content>
</boost_serialization>

)";

TEST(ProjectDocuments, TheXmlArchiveIsAsWrittenDown)
{
    Import::Object song;
    song.tag = "Song";
    song.description = "A song";
    song.descriptionUrl = "https://example.org/song";
    song.kind = Import::Object::Kind(2);
    song.category = "sample_music";
    song.setLocation("song.flac");
    song.setRemoteUrl("https://example.org/song.flac");
    song.setRemoteSize(5000000000);
    EditorCollection::UserObject collection;
    collection.items = {&song, &song, nullptr};
    ResourceTable::Object table;
    Project::Content written;
    written.userCollection = &collection;
    written.resourceTable = &table;
    written.portable = true;
    EXPECT_EQ(saved(written), project);

    Project::Content read;
    load(project, read);
    const std::unique_ptr<EditorCollection::UserObject> readCollection(read.userCollection);
    const std::unique_ptr<ResourceTable::Object> readTable(read.resourceTable);
    EXPECT_EQ(saved(read), project);
    EXPECT_EQ(read.timeline, nullptr);
    EXPECT_TRUE(read.portable);
    ASSERT_TRUE(readCollection && readTable);
    EXPECT_THAT(readTable->resource2fileInfo, IsEmpty());
    ASSERT_EQ(readCollection->items.size(), 3u);
    const std::unique_ptr<const Import::Object> readSong(readCollection->items[0]);
    EXPECT_THAT(readCollection->items, ElementsAre(readSong.get(), readSong.get(), nullptr));
    EXPECT_EQ(readSong->tag, "Song");
    EXPECT_EQ(readSong->remoteSize(), 5000000000);
}

TEST(PersistentItemDocuments, TheXmlArchiveIsAsWrittenDown)
{
    Quiz::Preset quiz;
    quiz.tag = "School";
    EditorCollection::PersistentItem<Quiz::Preset> written;
    written.uniqueId = "{1}";
    written.item = &quiz;
    written.categories = {"all"};
    written.collectionId = "Quiz";
    written.customStrings = {{"author", "me"}};
    EXPECT_EQ(saved(written), quizItem);

    EditorCollection::PersistentItem<Quiz::Preset> read;
    load(quizItem, read);
    const std::unique_ptr<Quiz::Preset> readQuiz(read.item);
    EXPECT_EQ(read.uniqueId, "{1}");
    ASSERT_TRUE(readQuiz);
    EXPECT_EQ(readQuiz->tag, "School");
    EXPECT_EQ(read.preview, nullptr);
    EXPECT_THAT(read.categories, ElementsAre("all"));
    EXPECT_EQ(read.collectionId, "Quiz");
    EXPECT_THAT(read.customStrings, ElementsAre(Pair(QString("author"), QString("me"))));
}

} // namespace
