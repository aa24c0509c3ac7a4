// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldTexts.h"

#include <EditorModel/library/Pack.h>

#include <gmock/gmock.h>

#include <type_traits>

namespace {

using Package::InApp::Pack;
using testing::ElementsAre;
using Testing::FieldText;

static_assert(Testing::isVirtualBase<PubSub::Object, Pack>);
static_assert(std::is_base_of_v<Serialize::ISerializable, Pack>);
static_assert(!Testing::isVirtualBase<Serialize::ISerializable, Pack>);
static_assert(std::is_same_v<std::underlying_type_t<Pack::InstallationStatus>, int>);
static_assert(Pack::Installed == 1);

Pack everyFieldSet()
{
    Pack pack;
    pack.appId = "weather";
    pack.locale2productName = {{"en_US", "Weather"}, {"de_DE", "Wetter"}};
    pack.locale2previewUrl = {{"en_US", "http://a.test/en.png"}, {"fr_FR", "http://a.test/fr.png"}};
    pack.downloadUrl = "http://a.test/weather.zip";
    pack.reservedText = "extra";
    pack.installationStatus = Pack::Installed;
    return pack;
}

TEST(Pack, IsNotInstalledAtFirst)
{
    EXPECT_FALSE(Pack().isInstalled());
}

TEST(Pack, IsNamedInTheLanguageAskedFor)
{
    const Pack pack = everyFieldSet();
    EXPECT_EQ(pack.productName("de_DE"), "Wetter");
    EXPECT_EQ(pack.productName("en_US"), "Weather");
    EXPECT_EQ(pack.previewUrl("fr_FR"), "http://a.test/fr.png");
    EXPECT_EQ(pack.previewUrl("en_US"), "http://a.test/en.png");
}

TEST(Pack, IsNamedInAmericanEnglishWhereTheLanguageIsMissing)
{
    const Pack pack = everyFieldSet();
    for (const char* const locale : {"fr_FR", "de", "DE_de", ""})
        EXPECT_EQ(pack.productName(locale), "Weather") << locale;
    for (const char* const locale : {"de_DE", "fr", "en_GB", ""})
        EXPECT_EQ(pack.previewUrl(locale), "http://a.test/en.png") << locale;
}

TEST(Pack, HasNoNameWhereAmericanEnglishIsMissingAsWell)
{
    Pack pack = everyFieldSet();
    pack.locale2productName = {{"de_DE", "Wetter"}, {"en_GB", "Weather"}};
    pack.locale2previewUrl = {{"de_DE", "http://a.test/de.png"}};
    EXPECT_EQ(pack.productName("fr_FR"), QString());
    EXPECT_EQ(pack.productName("en_US"), QString());
    EXPECT_EQ(pack.previewUrl("fr_FR"), QString());
    EXPECT_EQ(pack.productName("de_DE"), "Wetter");
    EXPECT_EQ(Pack().productName("en_US"), QString());
    EXPECT_EQ(Pack().previewUrl(QString()), QString());
}

TEST(Pack, AnEmptyTextOfTheLanguageIsAnAnswer)
{
    Pack pack = everyFieldSet();
    pack.locale2productName["it_IT"] = QString();
    EXPECT_EQ(pack.productName("it_IT"), QString());
    EXPECT_EQ(pack.previewUrl("it_IT"), "http://a.test/en.png");
}

TEST(Pack, IsInstalledAtOneStatusOnly)
{
    Pack pack;
    for (int status = -1; status != 4; ++status) {
        EXPECT_EQ(pack.setInstallationStatus(Pack::InstallationStatus(status)), &pack);
        EXPECT_EQ(pack.installationStatus, status);
        EXPECT_EQ(pack.isInstalled(), status == 1) << status;
    }
}

TEST(Pack, EqualsItsCopyAndItself)
{
    const Pack pack = everyFieldSet();
    const Pack copy = pack;
    EXPECT_TRUE(pack == pack);
    EXPECT_FALSE(pack != pack);
    EXPECT_TRUE(pack == copy);
    EXPECT_FALSE(pack != copy);
    EXPECT_TRUE(Pack() == Pack());
}

TEST(Pack, DiffersByEachField)
{
    const Pack pack = everyFieldSet();
    const auto expectDifferent = [&](auto change) {
        Pack other = pack;
        change(other);
        EXPECT_FALSE(pack == other);
        EXPECT_TRUE(pack != other);
        EXPECT_FALSE(other == pack);
    };
    expectDifferent([](Pack& other) { other.appId = "Weather"; });
    expectDifferent([](Pack& other) { other.locale2productName["de_DE"] = "Klima"; });
    expectDifferent([](Pack& other) { other.locale2productName.remove("de_DE"); });
    expectDifferent([](Pack& other) { other.locale2previewUrl["it_IT"] = "http://a.test/it.png"; });
    expectDifferent([](Pack& other) { other.locale2previewUrl["fr_FR"] = "http://a.test/other.png"; });
    expectDifferent([](Pack& other) { other.downloadUrl.clear(); });
    expectDifferent([](Pack& other) { other.downloadUrl = "http://a.test/other.zip"; });
    expectDifferent([](Pack& other) { other.reservedText = "more"; });
    expectDifferent([](Pack& other) { other.setInstallationStatus(Pack::DefaultStatus); });
    expectDifferent([](Pack& other) { other.setInstallationStatus(Pack::InstallationStatus(2)); });
}

TEST(Pack, IsWrittenWithoutWhatIsKnownAtRunTime)
{
    const std::string names = "\n  2 items"
                              "\n  item 1"
                              "\n    first: Q\"de_DE\""
                              "\n    second: Q\"Wetter\""
                              "\n  item 2"
                              "\n    first: Q\"en_US\""
                              "\n    second: Q\"Weather\"";
    const std::string urls = "\n  2 items"
                             "\n  item 1"
                             "\n    first: Q\"en_US\""
                             "\n    second: Q\"http://a.test/en.png\""
                             "\n  item 2"
                             "\n    first: Q\"fr_FR\""
                             "\n    second: Q\"http://a.test/fr.png\"";
    EXPECT_THAT(Testing::fieldTexts(everyFieldSet()),
                ElementsAre(FieldText("appId", "Q\"weather\""), FieldText("locale2productName", names),
                            FieldText("locale2previewUrl", urls),
                            FieldText("downloadUrl", "Q\"http://a.test/weather.zip\"")));
}

TEST(Pack, ThatWasLoadedIsNotInstalled)
{
    const Pack pack = everyFieldSet();
    Pack expected = pack;
    expected.reservedText.clear();
    expected.setInstallationStatus(Pack::DefaultStatus);
    for (const Way& way : allWays) {
        const auto graph = graphOf(documentOf({&pack}, way));
        ASSERT_TRUE(graph.rootAs<Pack>()) << way.name;
        EXPECT_FALSE(graph.rootAs<Pack>()->isInstalled()) << way.name;
        EXPECT_TRUE(*graph.rootAs<Pack>() == expected) << way.name;
    }
}

TEST(Pack, IsMadeByName)
{
    Testing::expectMadeByName<Pack>("Package::InApp::Pack");
}

} // namespace
