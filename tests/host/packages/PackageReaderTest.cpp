// SPDX-License-Identifier: Apache-2.0
#include "PackageBuilder.h"

#include "host/packages/PackageReader.h"

#include <QFile>

#include <gmock/gmock.h>

#include <string>
#include <vector>

namespace {

using namespace HostTests;
using EditorCollection::CollectionID;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::StartsWith;

std::vector<std::string> lines(const std::deque<Host::PackageFault>& faults)
{
    std::vector<std::string> texts;
    for (const Host::PackageFault& fault : faults) {
        texts.push_back((fault.package + ": " + fault.file + ": " + fault.reason).toStdString());
    }
    return texts;
}

/// A package "p" whose effects are these, each under "looks", and one sound effect under "sound".
class Reading : public testing::Test
{
protected:
    Host::PackageReading read(const std::deque<Package::Resource>& effects,
                              const std::map<QString, QString>& taken = {})
    {
        package.writeEffect("sound.json", "Sound");
        package.description.effects = {
            PackageBuilder::addOn({{"looks", "Effects"}}, effects),
            PackageBuilder::addOn({{"s", "EffectsAudio"}}, {PackageBuilder::resource("s", "sound.json")})};
        package.writeDescription();
        return Host::readPackage(folder.path("p"), taken);
    }

    /// The only fault of a package with such an effect; the sound effect is taken all the same.
    std::string faultOf(const Package::Resource& effect)
    {
        const Host::PackageReading reading = read({effect});
        const auto& items = reading.content->itemsOf<Effect::Object>();
        EXPECT_EQ(items.size(), 1u);
        EXPECT_EQ(items.at(0)->uniqueId, "s");
        EXPECT_EQ(reading.faults.size(), 1u);
        return lines(reading.faults).at(0);
    }

    const Folder folder;
    PackageBuilder package{folder.path("p")};
};

TEST_F(Reading, GoesByTheNameOfTheFolderWhereThePackageTellsNoIdentifier)
{
    const Host::PackageReading reading = read({});
    EXPECT_THAT(reading.faults, IsEmpty());
    EXPECT_EQ(reading.content->appId, "p");
    EXPECT_EQ(reading.content->pack, nullptr);
    EXPECT_EQ(reading.content->description->reservedFirst, "p");
    EXPECT_EQ(reading.content->description->reservedSecond, folder.path("p"));
    EXPECT_EQ(reading.content->description->reservedThird, folder.path("p/package.json"));
}

TEST_F(Reading, TakesWhatThePackageTellsOfItself)
{
    package.pack.appId = "com.example.p";
    package.pack.locale2productName["en_US"] = "P";
    const Host::PackageReading reading = read({});
    EXPECT_EQ(reading.content->appId, "com.example.p");
    EXPECT_EQ(reading.content->pack->productName("de_DE"), "P");
}

TEST_F(Reading, ListsAnElementInEachCollectionThatItsCategoriesLeadTo)
{
    Effect::Object effect;
    effect.tag = "Warm";
    EditorCollection::PersistentItem<Effect::Object> item;
    item.item = &effect;
    item.uniqueId = "own";
    item.categories = {"a", "b", "c"};
    item.customStrings["k"] = "v";
    package.write("warm.json", item);
    package.description.effects = {PackageBuilder::addOn({{"a", "X"}, {"b", "Y"}, {"c", "X"}, {"d", "Z"}},
                                                         {PackageBuilder::resource("", "warm.json")})};
    package.writeDescription();

    const Host::PackageReading reading = Host::readPackage(folder.path("p"), {});
    EXPECT_THAT(reading.faults, IsEmpty());
    const auto& items = reading.content->itemsOf<Effect::Object>();
    ASSERT_EQ(items.size(), 2u);
    EXPECT_EQ(items[0]->collectionId, "X");
    EXPECT_THAT(items[0]->categories, ElementsAre("a", "c"));
    EXPECT_EQ(items[1]->collectionId, "Y");
    EXPECT_THAT(items[1]->categories, ElementsAre("b"));
    EXPECT_EQ(items[0]->item, items[1]->item);
    EXPECT_EQ(items[0]->item->tag, "Warm");
    EXPECT_EQ(items[0]->uniqueId, "own");
    EXPECT_EQ(items[1]->customStrings.at("k"), "v");
    const std::map<QString, std::set<QString>> tags{{"X", {"Warm"}}, {"Y", {"Warm"}}};
    EXPECT_EQ(reading.content->storage.collection2tags, tags);
    const std::map<QString, std::set<QString>> categories{{"X", {"a", "c"}}, {"Y", {"b"}}};
    EXPECT_EQ(reading.content->storage.collection2categories, categories);
}

TEST_F(Reading, PutsAnElementWithoutCategoriesUnderAllOfTheAddOn)
{
    package.writeEffect("warm.json", "Warm");
    package.description.effects = {
        PackageBuilder::addOn({{"a", "X"}, {"b", "X"}}, {PackageBuilder::resource("w", "warm.json")})};
    package.writeDescription();
    const Host::PackageReading reading = Host::readPackage(folder.path("p"), {});
    ASSERT_EQ(reading.content->itemsOf<Effect::Object>().size(), 1u);
    EXPECT_THAT(reading.content->itemsOf<Effect::Object>()[0]->categories, ElementsAre("a", "b"));
}

TEST_F(Reading, NamesFilesThatAreMissingAndFilesThatAreNoDocuments)
{
    folder.write("p/letter.json", "Dear Sir or Madam,\n");
    folder.write("p/empty.json", "");
    QDir(folder.path("p")).mkdir("sub");
    EXPECT_EQ(faultOf(PackageBuilder::resource("w", "no.json")), "p: no.json: does not exist");
    EXPECT_THAT(faultOf(PackageBuilder::resource("w", "letter.json")),
                StartsWith("p: letter.json: is damaged: "));
    EXPECT_THAT(faultOf(PackageBuilder::resource("w", "empty.json")), StartsWith("p: empty.json: is "));
    EXPECT_EQ(faultOf(PackageBuilder::resource("w", "sub")), "p: sub: is a folder");
    EXPECT_EQ(faultOf(PackageBuilder::resource("w", "")), "p: : has no name");
}

TEST_F(Reading, RefusesFilesOutsideOfTheFolder)
{
    PackageBuilder(folder.path()).writeEffect("outside.json", "Outside");
    ASSERT_TRUE(QFile::link(folder.path("outside.json"), folder.path("p/link.json")));
    ASSERT_TRUE(QFile::link(folder.path(), folder.path("p/up")));
    EXPECT_EQ(faultOf(PackageBuilder::resource("w", "../outside.json")),
              "p: ../outside.json: lies outside of the package");
    EXPECT_EQ(faultOf(PackageBuilder::resource("w", "a/../../outside.json")),
              "p: a/../../outside.json: lies outside of the package");
    EXPECT_EQ(faultOf(PackageBuilder::resource("w", "..")), "p: ..: lies outside of the package");
    const QString absolute = folder.path("outside.json");
    EXPECT_EQ(faultOf(PackageBuilder::resource("w", absolute)),
              "p: " + absolute.toStdString() + ": lies outside of the package");
    EXPECT_EQ(faultOf(PackageBuilder::resource("w", "link.json")),
              "p: link.json: is a link that leads out of the package");
    EXPECT_EQ(faultOf(PackageBuilder::resource("w", "up/outside.json")),
              "p: up/outside.json: is a link that leads out of the package");
    EXPECT_EQ(faultOf(PackageBuilder::resource("w", "../outside.json", Host::MediaResource)),
              "p: ../outside.json: lies outside of the package");
    EXPECT_EQ(faultOf(PackageBuilder::resource("w", "p/../sound.json", 7)),
              "p: p/../sound.json: is of an unknown type: 7");
}

/// A folder whose name begins with the package's is another one.
TEST_F(Reading, RefusesLinksToTheFolderBeside)
{
    PackageBuilder(folder.path("pp")).writeEffect("a.json", "A");
    ASSERT_TRUE(QFile::link(folder.path("pp/a.json"), folder.path("p/a.json")));
    EXPECT_EQ(faultOf(PackageBuilder::resource("w", "a.json")),
              "p: a.json: is a link that leads out of the package");
}

TEST_F(Reading, TakesAbsoluteNamesForWhatTheyAreBelowAContentPathToo)
{
    package.description.overlays = {PackageBuilder::addOn(
        {{"a", "X"}},
        {PackageBuilder::resource("a", "/etc/passwd"), PackageBuilder::resource("b", "../../outside.json")},
        "titles")};
    const Host::PackageReading reading = read({});
    EXPECT_THAT(lines(reading.faults),
                ElementsAre("p: /etc/passwd: lies outside of the package",
                            "p: titles/../../outside.json: lies outside of the package"));
}

TEST_F(Reading, FollowsLinksThatStayInside)
{
    package.writeEffect("warm.json", "Warm");
    ASSERT_TRUE(QFile::link(folder.path("p/warm.json"), folder.path("p/link.json")));
    const Host::PackageReading reading = read({PackageBuilder::resource("w", "link.json")});
    EXPECT_THAT(reading.faults, IsEmpty());
    EXPECT_EQ(reading.content->itemsOf<Effect::Object>().size(), 2u);
}

TEST_F(Reading, RefusesElementsOfAnotherClassAndItemsWithoutAnElement)
{
    package.write("t.json", Transition::Object("t"));
    package.write("i.json", EditorCollection::PersistentItem<Effect::Object>());
    EXPECT_EQ(faultOf(PackageBuilder::resource("w", "t.json")),
              "p: t.json: holds no Effect::Object, but Transition::Object");
    EXPECT_EQ(faultOf(PackageBuilder::resource("w", "i.json")),
              "p: i.json: holds an item without an element");
}

TEST_F(Reading, RefusesIdentifiersThatAreMissingOrTaken)
{
    package.writeEffect("warm.json", "Warm");
    EXPECT_EQ(faultOf(PackageBuilder::resource("", "warm.json")), "p: warm.json: has no identifier");
    const Host::PackageReading twice = read({PackageBuilder::resource("s", "warm.json")});
    EXPECT_EQ(twice.content->itemsOf<Effect::Object>().size(), 1u);
    EXPECT_THAT(lines(twice.faults), ElementsAre("p: sound.json: has the identifier of another element: s"));
    const Host::PackageReading taken = read({PackageBuilder::resource("w", "warm.json")}, {{"w", "q"}});
    EXPECT_THAT(lines(taken.faults), ElementsAre("p: warm.json: has the identifier of an element of q: w"));
}

TEST_F(Reading, RefusesCategoriesThatLeadNowhere)
{
    Effect::Object effect;
    EditorCollection::PersistentItem<Effect::Object> item;
    item.item = &effect;
    item.categories = {"other"};
    package.write("warm.json", item);
    EXPECT_EQ(faultOf(PackageBuilder::resource("w", "warm.json")),
              "p: warm.json: has a category that leads to no collection: other");
    package.description.transitions = {PackageBuilder::addOn({}, {PackageBuilder::resource("t", "t.json")})};
    package.write("t.json", Transition::Object("t"));
    EXPECT_THAT(lines(read({}).faults),
                ElementsAre("p: t.json: has no category, so that no collection takes it"));
}

TEST_F(Reading, FindsTheMediaOfImportsInThePackageAlone)
{
    folder.write("p/a.wav", "RIFF");
    package.writeImport("good.json", "Good", "a.wav");
    package.writeImport("gone.json", "Gone", "b.wav");
    package.writeImport("out.json", "Out", "../a.wav");
    package.description.imports = {
        PackageBuilder::addOn({{"a", CollectionID::IMPORTS}}, {PackageBuilder::resource("1", "good.json"),
                                                               PackageBuilder::resource("2", "gone.json"),
                                                               PackageBuilder::resource("3", "out.json")})};
    const Host::PackageReading reading = read({});
    EXPECT_THAT(lines(reading.faults),
                ElementsAre("p: gone.json: names a media file that does not exist: b.wav",
                            "p: out.json: names a media file that lies outside of the package: ../a.wav"));
    ASSERT_EQ(reading.content->imports.size(), 1u);
    EXPECT_EQ(reading.content->media.at(reading.content->imports[0]), folder.path("p/a.wav"));
}

TEST_F(Reading, ChecksTheFoldersForFontsAndTranslations)
{
    package.description.fontsDir = "fonts";
    package.description.quizzes = {PackageBuilder::addOn({}, {})};
    package.description.quizzes[0].translationDir = "../languages";
    EXPECT_THAT(lines(read({}).faults),
                ElementsAre("p: ../languages: lies outside of the package", "p: fonts: does not exist"));
    folder.write("p/fonts", "no");
    EXPECT_THAT(lines(read({}).faults)[1], "p: fonts: is no folder");
}

TEST_F(Reading, GivesNoContentWhereTheDescriptionIsOfAnotherKind)
{
    package.write("package.json", Transition::Object("t"));
    const Host::PackageReading other = Host::readPackage(folder.path("p"), {});
    EXPECT_EQ(other.content, nullptr);
    EXPECT_THAT(lines(other.faults),
                ElementsAre("p: package.json: holds no Package::Object, but Transition::Object"));

    Document::saveFile(folder.path("p/package.json"), {&package.description, &package.description},
                       Document::Json, Document::Stream);
    EXPECT_THAT(lines(Host::readPackage(folder.path("p"), {}).faults),
                ElementsAre("p: package.json: holds no Package::InApp::Pack as its second object, but "
                            "Package::Object"));
    const Package::InApp::Pack nameless;
    Document::saveFile(folder.path("p/package.json"), {&package.description, &nameless}, Document::Json,
                       Document::Stream);
    EXPECT_THAT(lines(Host::readPackage(folder.path("p"), {}).faults),
                ElementsAre("p: package.json: gives the package an empty identifier"));
    QFile::remove(folder.path("p/package.json"));
    PackageBuilder(folder.path()).writeDescription();
    ASSERT_TRUE(QFile::link(folder.path("package.json"), folder.path("p/package.json")));
    EXPECT_THAT(lines(Host::readPackage(folder.path("p"), {}).faults),
                ElementsAre("p: package.json: is a link that leads out of the package"));
}

TEST_F(Reading, TellsOfEveryFileThatIsCutWhereverThatIs)
{
    package.writeEffect("warm.json", "Warm");
    const std::deque<Package::Resource> effects{PackageBuilder::resource("w", "warm.json")};
    EXPECT_THAT(read(effects).faults, IsEmpty());
    const QByteArray element = contentOf(folder.path("p/warm.json")).trimmed();
    for (int size = 0; size < element.size(); size += 7) {
        folder.write("p/warm.json", element.left(size));
        const Host::PackageReading reading = Host::readPackage(folder.path("p"), {});
        EXPECT_EQ(reading.content->itemsOf<Effect::Object>().size(), 1u) << size;
        ASSERT_EQ(reading.faults.size(), 1u) << size;
        EXPECT_EQ(reading.faults[0].file, "warm.json");
    }
    folder.write("p/warm.json", element);
    const QByteArray description = contentOf(folder.path("p/package.json")).trimmed();
    for (int size = 0; size < description.size(); size += 37) {
        folder.write("p/package.json", description.left(size));
        const Host::PackageReading reading = Host::readPackage(folder.path("p"), {});
        EXPECT_EQ(reading.content, nullptr) << size;
        ASSERT_EQ(reading.faults.size(), 1u) << size;
        EXPECT_EQ(reading.faults[0].file, "package.json");
    }
}

} // namespace
