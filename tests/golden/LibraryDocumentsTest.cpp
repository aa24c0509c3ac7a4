// SPDX-License-Identifier: Apache-2.0
// What documents with packages, marks and items of collections look like, written down by hand. Stored data
// is for life: these texts are never written anew from what the code gives.
#include "TextArchives.h"
#include "tests/shared/FieldVisitors.h"

#include <EditorModel/library/Indication.h>
#include <EditorModel/library/Pack.h>
#include <EditorModel/library/PackCatalogue.h>
#include <EditorModel/library/PackageContent.h>
#include <EditorModel/library/PackageStorage.h>
#include <EditorModel/library/PersistentItem.h>

#include <gtest/gtest.h>

#include <memory>
#include <string>

namespace {

using namespace GoldenTests;

const std::string package = begin + R"(
	<overlays class_id="1" tracking_level="0" version="0">
		<count>1</count>
		<item_version>0</item_version>
		<item class_id="2" tracking_level="1" version="0" object_id="_1">
			<contentPath>titles</contentPath>
			<translationDir>titles/lang</translationDir>
			<category2collection class_id="3" tracking_level="0" version="0">
				<count>1</count>
				<item_version>0</item_version>
				<item class_id="4" tracking_level="0" version="0">
					<first>Rain</first>
					<second>Title</second>
				</item>
			</category2collection>
			<resources class_id="5" tracking_level="0" version="0">
				<count>1</count>
				<item_version>0</item_version>
				<item class_id="6" tracking_level="1" version="0" object_id="_2">
					<type>3</type>
					<id>rain</id>
					<file>rain.mov</file>
					<intro>100</intro>
					<outro>250</outro>
					<count>2</count>
				</item>
			</resources>
		</item>
	</overlays>
	<transitions>
		<count>0</count>
		<item_version>0</item_version>
	</transitions>
	<effects>
		<count>0</count>
		<item_version>0</item_version>
	</effects>
	<imports>
		<count>0</count>
		<item_version>0</item_version>
	</imports>
	<fontsDir>fonts</fontsDir>
	<quizzes>
		<count>0</count>
		<item_version>0</item_version>
	</quizzes>
)" + end;

const std::string storage = begin + R"(
	<package2storage class_id="1" tracking_level="0" version="0">
		<count>1</count>
		<item_version>0</item_version>
		<item class_id="2" tracking_level="0" version="0">
			<first>weather</first>
			<second class_id="3" tracking_level="1" version="0" object_id="_1">
				<collection2tags class_id="4" tracking_level="0" version="0">
					<count>1</count>
					<item_version>0</item_version>
					<item class_id="5" tracking_level="0" version="0">
						<first>Title</first>
						<second class_id="6" tracking_level="0" version="0">
							<count>2</count>
							<item_version>0</item_version>
							<item>Rain</item>
							<item>Sun</item>
						</second>
					</item>
				</collection2tags>
				<collection2categories>
					<count>1</count>
					<item_version>0</item_version>
					<item>
						<first>Title</first>
						<second>
							<count>1</count>
							<item_version>0</item_version>
							<item>Weather</item>
						</second>
					</item>
				</collection2categories>
			</second>
		</item>
	</package2storage>
)" + end;

const std::string marks = begin + R"(
	<id>Effects</id>
	<favoriteItems class_id="1" tracking_level="0" version="0">
		<count>1</count>
		<item_version>0</item_version>
		<item>blur</item>
	</favoriteItems>
	<newItems>
		<count>2</count>
		<item_version>0</item_version>
		<item>glow</item>
		<item>haze</item>
	</newItems>
	<knownItems>
		<count>0</count>
		<item_version>0</item_version>
	</knownItems>
)" + end;

// The element and the picture are null, so that no other class's fields stand in the document.
const std::string item = begin + R"(
	<uniqueId>{1}</uniqueId>
	<item class_id="-1"></item>
	<preview class_id="2" tracking_level="0" version="1">
		<px class_id="-1"></px>
	</preview>
	<categories class_id="4" tracking_level="0" version="0">
		<count>1</count>
		<item_version>0</item_version>
		<item>all</item>
	</categories>
	<collectionId>Transitions</collectionId>
	<customStrings class_id="5" tracking_level="0" version="0">
		<count>1</count>
		<item_version>0</item_version>
		<item class_id="6" tracking_level="0" version="0">
			<first>author</first>
			<second>me</second>
		</item>
	</customStrings>
)" + end;

// Lists and maps of Qt have a count alone.
const std::string catalogue = begin + R"(
	<packs class_id="1" tracking_level="0" version="0">
		<count>3</count>
		<item class_id="2" tracking_level="1" version="0" object_id="_1">
			<appId>weather</appId>
			<locale2productName class_id="3" tracking_level="0" version="0">
				<count>2</count>
				<item class_id="4" tracking_level="0" version="0">
					<first>de_DE</first>
					<second>Wetter</second>
				</item>
				<item>
					<first>en_US</first>
					<second>Weather</second>
				</item>
			</locale2productName>
			<locale2previewUrl>
				<count>1</count>
				<item>
					<first>en_US</first>
					<second>https://example.org/weather.png</second>
				</item>
			</locale2previewUrl>
			<downloadUrl>https://example.org/weather.zip</downloadUrl>
		</item>
		<item class_id_reference="2" object_id_reference="_1"></item>
		<item class_id="-1"></item>
	</packs>
)" + end;

constexpr const char* catalogueJson = R"({"content": {"packs": {"count": 3, "item": [
    {"$meta": {"class": "Package::InApp::Pack", "id": 1},
     "appId": "weather",
     "locale2productName": {"count": 2, "item": [
        {"first": "de_DE", "second": "Wetter"}, {"first": "en_US", "second": "Weather"}]},
     "locale2previewUrl": {"count": 1, "item": [
        {"first": "en_US", "second": "https://example.org/weather.png"}]},
     "downloadUrl": "https://example.org/weather.zip"},
    {"$meta": {"class": "Package::InApp::Pack", "ref": 1}},
    null]}}})";

// Each list has an add-on of its own.
constexpr const char* packageJson = R"({"content": {
    "overlays": {"count": 1, "item_version": 0, "item": [{
        "contentPath": "titles", "translationDir": "titles/lang",
        "category2collection": {"count": 1, "item_version": 0, "item": [{"first": "Rain", "second": "Title"}]},
        "resources": {"count": 1, "item_version": 0, "item": [
            {"type": 3, "id": "rain", "file": "rain.mov", "intro": 100, "outro": 250, "count": 2}]}}]},
    "transitions": {"count": 1, "item_version": 0, "item": [{
        "contentPath": "wipes", "translationDir": "",
        "category2collection": {"count": 0, "item_version": 0}, "resources": {"count": 0, "item_version": 0}}]},
    "effects": {"count": 1, "item_version": 0, "item": [{
        "contentPath": "blurs", "translationDir": "",
        "category2collection": {"count": 0, "item_version": 0}, "resources": {"count": 0, "item_version": 0}}]},
    "imports": {"count": 1, "item_version": 0, "item": [{
        "contentPath": "songs", "translationDir": "",
        "category2collection": {"count": 0, "item_version": 0}, "resources": {"count": 0, "item_version": 0}}]},
    "fontsDir": "fonts",
    "quizzes": {"count": 1, "item_version": 0, "item": [{
        "contentPath": "riddles", "translationDir": "",
        "category2collection": {"count": 0, "item_version": 0}, "resources": {"count": 0, "item_version": 0}}]}}})";

constexpr const char* marksJson = R"({"content": {
    "id": "Effects",
    "favoriteItems": {"count": 1, "item_version": 0, "item": ["blur"]},
    "newItems": {"count": 2, "item_version": 0, "item": ["glow", "haze"]},
    "knownItems": {"count": 1, "item_version": 0, "item": ["dawn"]}}})";

TEST(PackageDocuments, TheXmlArchiveIsAsWrittenDown)
{
    Package::Resource resource;
    resource.type = Package::Resource::Type(3);
    resource.id = "rain";
    resource.file = "rain.mov";
    resource.timing.intro = 100;
    resource.timing.outro = 250;
    resource.timing.loopMinCount = 2;
    Package::CollectionAddOn addOn;
    addOn.contentPath = "titles";
    addOn.translationDir = "titles/lang";
    addOn.category2collection = {{"Rain", "Title"}};
    addOn.resources = {resource};
    Package::Object written;
    written.overlays = {addOn};
    written.fontsDir = "fonts";
    EXPECT_EQ(saved(written), package);

    Package::Object read;
    load(package, read);
    EXPECT_EQ(saved(read), package);
    ASSERT_EQ(read.overlays.size(), 1u);
    ASSERT_EQ(read.overlays[0].resources.size(), 1u);
    EXPECT_EQ(read.overlays[0].resources[0].file, "rain.mov");
    EXPECT_EQ(read.overlays[0].resources[0].timing.loopMinCount, 2);
}

TEST(PackageDocuments, TheJsonArchiveIsAsWrittenDown)
{
    const auto addOnAt = [](const char* path) {
        Package::CollectionAddOn addOn;
        addOn.contentPath = path;
        return addOn;
    };
    Package::Resource resource;
    resource.type = Package::Resource::Type(3);
    resource.id = "rain";
    resource.file = "rain.mov";
    resource.timing.intro = 100;
    resource.timing.outro = 250;
    resource.timing.loopMinCount = 2;
    Package::Object written;
    written.overlays = {addOnAt("titles")};
    written.overlays[0].translationDir = "titles/lang";
    written.overlays[0].category2collection = {{"Rain", "Title"}};
    written.overlays[0].resources = {resource};
    written.transitions = {addOnAt("wipes")};
    written.effects = {addOnAt("blurs")};
    written.imports = {addOnAt("songs")};
    written.quizzes = {addOnAt("riddles")};
    written.fontsDir = "fonts";
    EXPECT_EQ(savedAsJson(written), nlohmann::json::parse(packageJson));

    Package::Object read;
    loadJson(packageJson, read);
    EXPECT_EQ(Testing::Dump::of(read), Testing::Dump::of(written));
    ASSERT_EQ(read.quizzes.size(), 1u);
    EXPECT_EQ(read.quizzes[0].contentPath, "riddles");
}

TEST(IndicationDocuments, TheJsonArchiveIsAsWrittenDown)
{
    Indication::Object written;
    written.id = "Effects";
    written.favoriteItems = {"blur"};
    written.newItems = {"haze", "glow"};
    written.knownItems = {"dawn"};
    EXPECT_EQ(savedAsJson(written), nlohmann::json::parse(marksJson));

    Indication::Object read;
    loadJson(marksJson, read);
    EXPECT_EQ(Testing::Dump::of(read), Testing::Dump::of(written));
    EXPECT_EQ(read.knownItems.count("dawn"), 1u);
}

TEST(PackageStorageDocuments, TheXmlArchiveIsAsWrittenDown)
{
    Package::Storage written;
    Package::StorageItem& stored = written.package2storage["weather"];
    stored.collection2tags = {{"Title", {"Rain", "Sun"}}};
    stored.collection2categories = {{"Title", {"Weather"}}};
    EXPECT_EQ(saved(written), storage);
    Package::Storage read;
    load(storage, read);
    EXPECT_EQ(saved(read), storage);
}

TEST(IndicationDocuments, TheXmlArchiveIsAsWrittenDown)
{
    Indication::Object written;
    written.setId("Effects").setFavorite("blur", true).setNew("glow", true).setNew("haze", true);
    EXPECT_EQ(saved(written), marks);

    Indication::Object read;
    load(marks, read);
    EXPECT_EQ(saved(read), marks);
    EXPECT_TRUE(read.isFavorite("blur"));
    EXPECT_TRUE(read.isNew("haze"));
}

TEST(ItemDocuments, TheXmlArchiveIsAsWrittenDown)
{
    using Item = EditorCollection::PersistentItem<Transition::Object>;
    Item written;
    written.uniqueId = "{1}";
    written.categories = {"all"};
    written.collectionId = "Transitions";
    written.customStrings = {{"author", "me"}};
    EXPECT_EQ(saved(written), item);

    Item read;
    load(item, read);
    EXPECT_EQ(saved(read), item);
    EXPECT_EQ(read.collectionId, "Transitions");
    EXPECT_EQ(read.preview, nullptr);
}

void expectWeather(const Package::InApp::Object& read, const Package::InApp::Pack& weather)
{
    ASSERT_EQ(read.packs.size(), 3);
    const std::unique_ptr<const Package::InApp::Pack> pack(read.packs[0]);
    ASSERT_TRUE(pack);
    EXPECT_TRUE(*pack == weather);
    EXPECT_EQ(read.packs[1], pack.get());
    EXPECT_EQ(read.packs[2], nullptr);
}

TEST(CatalogueDocuments, AreAsWrittenDown)
{
    Package::InApp::Pack weather;
    weather.appId = "weather";
    weather.locale2productName = {{"en_US", "Weather"}, {"de_DE", "Wetter"}};
    weather.locale2previewUrl = {{"en_US", "https://example.org/weather.png"}};
    weather.downloadUrl = "https://example.org/weather.zip";
    Package::InApp::Object written;
    written.packs = {&weather, &weather, nullptr};

    EXPECT_EQ(saved(written), catalogue);
    Package::InApp::Object fromXml;
    load(catalogue, fromXml);
    expectWeather(fromXml, weather);

    EXPECT_EQ(savedAsJson(written), nlohmann::json::parse(catalogueJson));
    Package::InApp::Object fromJson;
    loadJson(catalogueJson, fromJson);
    expectWeather(fromJson, weather);
}

} // namespace
