// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldTexts.h"

#include <EditorModel/library/PackageContent.h>

#include <gmock/gmock.h>

#include <type_traits>

namespace {

using Package::CollectionAddOn;
using testing::ElementsAre;
using Testing::FieldText;

static_assert(!Testing::isVirtualBase<Serialize::ISerializable, Package::Resource>);
static_assert(!Testing::isVirtualBase<Serialize::ISerializable, CollectionAddOn>);
static_assert(Testing::isVirtualBase<Serialize::ISerializable, Package::Object>);
static_assert(Testing::isVirtualBase<PubSub::Object, Package::Object>);
static_assert(!std::is_base_of_v<PubSub::Object, Package::Resource>);
static_assert(!std::is_base_of_v<PubSub::Object, CollectionAddOn>);
static_assert(std::is_same_v<std::underlying_type_t<Package::Resource::Type>, int>);

Package::Resource fullResource(const QString& id = "rain")
{
    Package::Resource resource;
    resource.type = Package::Resource::Type(3);
    resource.id = id;
    resource.file = id + ".mov";
    resource.timing.mode = Resource::Timing::Looped;
    resource.timing.intro = 100;
    resource.timing.outro = 250;
    resource.timing.loopMinCount = 2;
    return resource;
}

CollectionAddOn fullAddOn(const QString& name = "titles")
{
    CollectionAddOn addOn;
    addOn.contentPath = name + "/content";
    addOn.translationDir = name + "/lang";
    addOn.category2collection = {{"Rain", "weather"}, {"Sun", "bright"}};
    addOn.resources = {fullResource("rain"), fullResource("sun")};
    return addOn;
}

Package::Object fullPackage()
{
    Package::Object package;
    package.reservedFirst = "one";
    package.reservedSecond = "two";
    package.reservedThird = "three";
    package.overlays = {fullAddOn("overlays"), fullAddOn("more overlays")};
    package.transitions = {fullAddOn("transitions")};
    package.effects = {fullAddOn("effects")};
    package.imports = {fullAddOn("imports")};
    package.quizzes = {fullAddOn("quizzes")};
    package.fontsDir = "fonts";
    return package;
}

TEST(PackageResource, IsWrittenWithTheTimesOfItsTimingAmongItsOwnFields)
{
    EXPECT_THAT(Testing::fieldTexts(fullResource()),
                ElementsAre(FieldText("type", "3"), FieldText("id", "Q\"rain\""),
                            FieldText("file", "Q\"rain.mov\""), FieldText("intro", "100ms"),
                            FieldText("outro", "250ms"), FieldText("count", "2")));
}

TEST(PackageResource, ComesBackWithoutTheModeOfItsTiming)
{
    const Package::Resource resource = fullResource();
    for (const Way& way : allWays) {
        SCOPED_TRACE(way.name);
        const auto graph = graphOf(documentOf({&resource}, way));
        const auto* const loaded = graph.rootAs<Package::Resource>();
        ASSERT_TRUE(loaded);
        EXPECT_EQ(loaded->timing.mode, 0);
        EXPECT_EQ(loaded->timing.intro, MTime(100));
        EXPECT_EQ(loaded->timing.outro, MTime(250));
        EXPECT_EQ(loaded->timing.loopMinCount, 2);
        EXPECT_EQ(loaded->type, 3);
        EXPECT_EQ(loaded->id, "rain");
        EXPECT_EQ(loaded->file, "rain.mov");
    }
}

TEST(PackageResource, IsMadeByName)
{
    Testing::expectMadeByName<Package::Resource>("Package::Resource");
}

TEST(CollectionAddOn, IsWrittenWithItsResourcesLast)
{
    const std::string collections = "\n  2 items"
                                    "\n  item 1"
                                    "\n    first: Q\"Rain\""
                                    "\n    second: Q\"weather\""
                                    "\n  item 2"
                                    "\n    first: Q\"Sun\""
                                    "\n    second: Q\"bright\"";
    const std::string resources = "\n  1 items"
                                  "\n  item 1"
                                  "\n  item: Package::Resource"
                                  "\n    type: 3"
                                  "\n    id: Q\"rain\""
                                  "\n    file: Q\"rain.mov\""
                                  "\n    intro: 100ms"
                                  "\n    outro: 250ms"
                                  "\n    count: 2";
    CollectionAddOn addOn = fullAddOn();
    addOn.resources.pop_back();
    EXPECT_THAT(Testing::fieldTexts(addOn), ElementsAre(FieldText("contentPath", "Q\"titles/content\""),
                                                        FieldText("translationDir", "Q\"titles/lang\""),
                                                        FieldText("category2collection", collections),
                                                        FieldText("resources", resources)));
}

TEST(CollectionAddOn, IsMadeByName)
{
    Testing::expectMadeByName<CollectionAddOn>("Package::CollectionAddOn");
}

TEST(Package, IsWrittenWithItsFontsInFrontOfItsQuizzes)
{
    EXPECT_THAT(Testing::fieldKeys(fullPackage()),
                ElementsAre("overlays", "transitions", "effects", "imports", "fontsDir", "quizzes"));
}

TEST(Package, WritesEachKindOfContentUnderItsOwnKey)
{
    Package::Object package = fullPackage();
    package.overlays.pop_back();
    for (const FieldText& field : Testing::fieldTexts(package)) {
        if (field.first == "fontsDir") {
            EXPECT_EQ(field.second, "Q\"fonts\"");
        } else {
            EXPECT_THAT(field.second, testing::StartsWith("\n  1 items\n  item 1"
                                                          "\n  item: Package::CollectionAddOn"
                                                          "\n    contentPath: Q\"" +
                                                          field.first + "/content\"\n"));
        }
    }
}

TEST(Package, ComesBackWithoutItsRunTimeTexts)
{
    const Package::Object package = fullPackage();
    for (const Way& way : allWays) {
        SCOPED_TRACE(way.name);
        const auto graph = graphOf(documentOf({&package}, way));
        const auto* const loaded = graph.rootAs<Package::Object>();
        ASSERT_TRUE(loaded);
        EXPECT_EQ(loaded->reservedFirst, QString());
        EXPECT_EQ(loaded->reservedSecond, QString());
        EXPECT_EQ(loaded->reservedThird, QString());
        EXPECT_EQ(Testing::Dump::of(*loaded), Testing::Dump::of(package));
    }
}

TEST(Package, IsMadeByName)
{
    Testing::expectMadeByName<Package::Object>("Package::Object");
}

} // namespace
