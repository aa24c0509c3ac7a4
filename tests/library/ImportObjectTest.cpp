// SPDX-License-Identifier: Apache-2.0
#include "tests/library/PackModule.h"
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldTexts.h"

#include <EditorModel/library/ImportObject.h>
#include <EditorModel/library/Pack.h>

#include <gmock/gmock.h>

#include <type_traits>

namespace {

using LibraryTests::PackModule;
using Package::InApp::Pack;
using testing::ElementsAre;
using Testing::FieldText;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, Import::Object>);
static_assert(Testing::isVirtualBase<PubSub::Object, Import::Object>);
static_assert(std::is_same_v<std::underlying_type_t<Import::Object::Kind>, int>);

Import::Object everyFieldSet(const Pack* pack = nullptr)
{
    Import::Object object;
    object.tag = "Rain";
    object.description = "Rain on a window";
    object.descriptionUrl = "http://a.test/rain.html";
    object.kind = Import::Object::Kind(2);
    object.category = "Weather";
    object.pack = pack;
    object.setLocation("/media/rain.mov");
    object.setRemoteUrl("http://a.test/rain.mov");
    object.setRemoteSize(5000000000);
    return object;
}

Pack weatherPack()
{
    Pack pack;
    pack.appId = "weather";
    pack.downloadUrl = "http://a.test/weather.zip";
    return pack;
}

TEST(ImportObject, WithoutAPackItKnowsItsPlacesItself)
{
    const PackModule module({{QString(), "/packs"}, {"weather", "/packs/weather"}});
    Import::Object object;
    object.setLocation("/media/rain.mov");
    object.setRemoteUrl("http://a.test/rain.mov");
    object.setRemoteSize(12);
    EXPECT_EQ(object.location(), "/media/rain.mov");
    EXPECT_EQ(object.remoteUrl(), "http://a.test/rain.mov");
    EXPECT_EQ(object.remoteSize(), 12);
    EXPECT_TRUE(module.senders.empty()) << "nobody is to be asked";
    object.setLocation(QString());
    object.setRemoteUrl(QString());
    object.setRemoteSize(-1);
    EXPECT_EQ(object.location(), QString());
    EXPECT_EQ(object.remoteUrl(), QString());
    EXPECT_EQ(object.remoteSize(), -1);
}

TEST(ImportObject, OfAPackIsDownloadedWithItWhateverItsOwnAddress)
{
    const Pack pack = weatherPack();
    Import::Object object = everyFieldSet(&pack);
    EXPECT_EQ(object.remoteUrl(), "http://a.test/weather.zip");
    object.setRemoteUrl("http://b.test/rain.mov");
    EXPECT_EQ(object.remoteUrl(), "http://a.test/weather.zip");
    EXPECT_EQ(object.remoteSize(), 5000000000);
    object.pack = nullptr;
    EXPECT_EQ(object.remoteUrl(), "http://b.test/rain.mov");
}

TEST(ImportObject, OfAPackWithoutAnAddressHasNone)
{
    const Pack pack;
    const Import::Object object = everyFieldSet(&pack);
    EXPECT_EQ(object.remoteUrl(), QString());
}

TEST(ImportObject, OfAPackLiesWhereThePackDoes)
{
    const PackModule module({{"weather", "/packs/weather"}, {"sport", "/packs/sport"}});
    const Pack pack = weatherPack();
    Import::Object object = everyFieldSet(&pack);
    EXPECT_EQ(object.location(), "/packs/weather");
    object.setLocation("/elsewhere/rain.mov");
    EXPECT_EQ(object.location(), "/packs/weather");
    object.pack = nullptr;
    EXPECT_EQ(object.location(), "/elsewhere/rain.mov");
}

TEST(ImportObject, OfAPackThatNobodyListsLiesNowhere)
{
    const Pack pack = weatherPack();
    const Import::Object object = everyFieldSet(&pack);
    EXPECT_EQ(object.location(), QString());
    const PackModule module({{"sport", "/packs/sport"}, {"Weather", "/packs/other"}});
    EXPECT_EQ(object.location(), QString());
    EXPECT_EQ(module.senders.size(), 1u);
}

TEST(ImportObject, AsksAfreshWhereItsPackLies)
{
    const Pack pack = weatherPack();
    const Import::Object object = everyFieldSet(&pack);
    PackModule module;
    EXPECT_EQ(object.location(), QString());
    module.directories["weather"] = "/packs/weather";
    EXPECT_EQ(object.location(), "/packs/weather");
    module.directories["weather"] = "/moved/weather";
    EXPECT_EQ(object.location(), "/moved/weather");
    module.directories.clear();
    EXPECT_EQ(object.location(), QString());
    EXPECT_EQ(module.senders.size(), 4u);
}

TEST(ImportObject, IsWrittenWithItsOwnPlacesAndWithoutItsPack)
{
    const Pack pack = weatherPack();
    EXPECT_THAT(Testing::fieldTexts(everyFieldSet(&pack)),
                ElementsAre(FieldText("tag", "Q\"Rain\""), FieldText("description", "Q\"Rain on a window\""),
                            FieldText("descriptionUrl", "Q\"http://a.test/rain.html\""),
                            FieldText("location", "Q\"/media/rain.mov\""),
                            FieldText("remoteUrl", "Q\"http://a.test/rain.mov\""),
                            FieldText("remoteSize", "5000000000l"), FieldText("kind", "2"),
                            FieldText("category", "Q\"Weather\"")));
}

TEST(ImportObject, ComesBackWithoutItsPack)
{
    const Pack pack = weatherPack();
    const Import::Object object = everyFieldSet(&pack);
    for (const Way& way : allWays) {
        SCOPED_TRACE(way.name);
        const auto graph = graphOf(documentOf({&object}, way));
        const auto* const loaded = graph.rootAs<Import::Object>();
        ASSERT_TRUE(loaded);
        EXPECT_EQ(graph.size(), 1u);
        EXPECT_EQ(loaded->pack, nullptr);
        EXPECT_EQ(loaded->location(), "/media/rain.mov");
        EXPECT_EQ(loaded->remoteUrl(), "http://a.test/rain.mov");
        EXPECT_EQ(loaded->remoteSize(), 5000000000);
    }
}

TEST(ImportObject, HasAMimeType)
{
    EXPECT_EQ(*Import::Object::mimeType, "x-application/ImportObject-serialized");
}

TEST(ImportObject, IsMadeByName)
{
    Testing::expectMadeByName<Import::Object>("Import::Object");
}

} // namespace
