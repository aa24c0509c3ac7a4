// SPDX-License-Identifier: Apache-2.0
#include "PackageBuilder.h"
#include "tests/shared/LiveAllocations.h"

#include "host/packages/PackageShelf.h"

#include <EditorModel/library/PackViews.h>

#include <QFile>

#include <gmock/gmock.h>

#include <functional>
#include <string>
#include <vector>

namespace {

using namespace HostTests;
using EditorCollection::CollectionID;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;
using Lines = std::vector<std::string>;
using Catalogue = Package::InApp::Object;
using Package::InApp::Pack;

/// Writes down what it hears of the catalogue, of the packs in it, and of imports.
class Client : public Package::InApp::View,
               public Package::InApp::PackView,
               public Message::View<Import::Object>
{
public:
    Client()
    {
        Message::View<Import::Object>::observeNew();
        Message::View<Catalogue> catalogues;
        for (const Catalogue* catalogue : catalogues.enumerateAll()) {
            packInAppObserve(catalogue);
        }
        lines.clear();
    }

    void update() { packInAppChange(nullptr)->update(); }
    void watch(const Pack* pack) { packObserve(pack); }
    void ask(const std::function<void(Catalogue*)>& edit)
    {
        auto chain = packInAppChange(nullptr);
        edit(&*chain.operator->());
    }
    void install(const Pack* pack) { packChange(pack)->setInstallationStatus(Pack::DefaultStatus); }
    void drop(const Pack* pack) { packRemove(pack); }
    void dropCatalogue() { packInAppRemove(nullptr); }

    Lines lines;
    std::function<void()> onCatalogue;

protected:
    using Package::InApp::View::packInAppChanged;
    void packInAppChanged(const Catalogue* object, const Catalogue* before, const Catalogue* after) override
    {
        std::string text = "catalogue:";
        for (const Pack* pack : after->packs) {
            text += " " + pack->appId.toStdString();
        }
        lines.push_back(text);
        Package::InApp::View::packInAppChanged(object, before, after);
        if (onCatalogue) {
            onCatalogue();
        }
    }
    void updateStatusChanged(const Catalogue* object) override
    {
        lines.push_back("flag " + std::to_string(object->updateStatus));
    }
    void packChanged(const Pack* pack, const Pack* before, const Pack* after) override
    {
        lines.push_back("pack " + pack->appId.toStdString() + ": " +
                        std::to_string(before->installationStatus) + " to " +
                        std::to_string(after->installationStatus));
    }

private:
    using Message::View<Import::Object>::changed;
    void added(const Import::Object* import) override
    {
        lines.push_back("import " + import->tag.toStdString() + " of " + import->pack->appId.toStdString());
    }
    void removed(const Import::Object* import) override
    {
        lines.push_back("no import " + import->tag.toStdString());
    }
};

class Shelf : public testing::Test
{
protected:
    /// A package with an import "Bell".
    void writeImportPackage(const QString& name)
    {
        PackageBuilder package(folder.path(name));
        folder.write(name + "/bell.wav", "RIFF");
        package.writeImport("bell.json", "Bell", "bell.wav");
        package.description.imports = {
            PackageBuilder::addOn({{"sample_audio", CollectionID::IMPORTS}},
                                  {PackageBuilder::resource(name + ".bell", "bell.json")})};
        package.writeDescription();
    }

    const Folder folder;
};

TEST_F(Shelf, HasTheStarterPackageWithoutFaults)
{
    Host::PackageShelf shelf;
    EXPECT_EQ(shelf.put(HOST_PACKAGES), 1u);
    EXPECT_THAT(shelf.faults(), IsEmpty());
    ASSERT_THAT(shelf.packages(), SizeIs(1));

    const auto titles = shelf.items<Overlay::Preset>(CollectionID::TITLES);
    ASSERT_THAT(titles, SizeIs(2));
    EXPECT_EQ(titles[0]->uniqueId, "starter.opening-title");
    EXPECT_EQ(titles[0]->item->items.at(0).text, "Title");
    EXPECT_EQ(titles[0]->preview, nullptr);
    EXPECT_THAT(titles[0]->categories, ElementsAre("basic"));
    EXPECT_EQ(titles[1]->item->items.at(1).text, "Occupation");
    EXPECT_EQ(titles[1]->preview->size(), QSize(32, 18));
    EXPECT_EQ(shelf.find<Transition::Object>("starter.crossfade")->id, "crossfade");
    EXPECT_EQ(shelf.find<Transition::Object>("starter.crossfade")->defaultDuration, MTime(1000));
    EXPECT_EQ(shelf.find<Effect::Object>("starter.sepia")->id, "Sepia");
    EXPECT_DOUBLE_EQ(shelf.find<Effect::Object>("starter.sepia")->intensity, 0.8);
    const auto* const chime = shelf.find<Import::Object>("starter.chime");
    EXPECT_EQ(QFile(shelf.mediaPath(chime)).size(), chime->remoteSize());
    EXPECT_EQ(chime->location(), shelf.package("starter")->folder);

    EXPECT_EQ(shelf.find<Overlay::Preset>("starter.sepia"), nullptr);
    EXPECT_EQ(shelf.find<Quiz::Preset>("starter.chime"), nullptr);
    EXPECT_EQ(shelf.catalogue().findPack("starter")->productName("de_DE"), "Grundausstattung");
    EXPECT_TRUE(shelf.catalogue().findPack("starter")->isInstalled());
    const Package::StorageItem& stored = shelf.storage().package2storage.at("starter");
    EXPECT_THAT(stored.collection2tags.at(CollectionID::TITLES), ElementsAre("Lower third", "Opening title"));
    EXPECT_THAT(stored.collection2categories.at(CollectionID::IMPORTS), ElementsAre("sample_audio"));
}

TEST_F(Shelf, TakesOffExactlyWhatAPackageBrought)
{
    writeEffectPackage(folder.path("a"), "a.warm");
    writeEffectPackage(folder.path("b"), "b.warm");
    Host::PackageShelf shelf;
    EXPECT_EQ(shelf.put(folder.path()), 2u);
    EXPECT_THAT(shelf.items<Effect::Object>(CollectionID::EFFECTS_VIDEO), SizeIs(2));
    const Package::StorageItem& other = shelf.storage().package2storage.at("b");
    EXPECT_THAT(other.collection2tags.at("Effects"), ElementsAre("Warm"));

    EXPECT_TRUE(shelf.takeOff("a"));
    EXPECT_EQ(shelf.find<Effect::Object>("a.warm"), nullptr);
    EXPECT_EQ(shelf.find<Effect::Object>("b.warm")->tag, "Warm");
    EXPECT_THAT(shelf.items<Effect::Object>(CollectionID::EFFECTS_VIDEO), SizeIs(1));
    EXPECT_EQ(shelf.storage().package2storage.count("a"), 0u);
    EXPECT_THAT(other.collection2tags.at("Effects"), ElementsAre("Warm"));
    EXPECT_EQ(shelf.catalogue().findPack("a"), nullptr);
    EXPECT_THAT(shelf.catalogue().packs, ElementsAre(shelf.catalogue().findPack("b")));
    EXPECT_FALSE(shelf.takeOff("a"));

    shelf.refresh();
    EXPECT_EQ(shelf.package("a"), nullptr) << "it stays off";
    shelf.put(folder.path("a"));
    EXPECT_EQ(shelf.find<Effect::Object>("a.warm")->tag, "Warm");
    shelf.refresh();
    EXPECT_NE(shelf.package("a"), nullptr);
}

TEST_F(Shelf, AnswersWhereThePackagesLie)
{
    writeEffectPackage(folder.path("a"), "a.warm", "com.example.a");
    writeEffectPackage(folder.path("b"), "b.warm");
    folder.write("b/package.json", "{");
    QDir(folder.path()).mkdir("nothing");
    EXPECT_THAT(Package::PackageFetcher().appId2directory, IsEmpty());
    {
        Host::PackageShelf shelf;
        shelf.put(folder.path());
        const Package::PackageFetcher fetcher;
        const QMap<QString, QString> expected{{"com.example.a", folder.path("a")}};
        EXPECT_EQ(fetcher.appId2directory, expected);
        EXPECT_THAT(fetcher.reservedTexts, ElementsAre("b"));
    }
    EXPECT_THAT(Package::PackageFetcher().appId2directory, IsEmpty());
}

TEST_F(Shelf, TellsOfWhatComesAndGoes)
{
    Host::PackageShelf shelf;
    Client client;
    writeImportPackage("a");
    shelf.put(folder.path("a"));
    EXPECT_EQ(std::exchange(client.lines, {}), Lines({"catalogue: a", "import Bell of a"}));
    EXPECT_EQ(shelf.find<Import::Object>("a.bell")->location(), folder.path("a"));
    shelf.takeOff("a");
    EXPECT_EQ(client.lines, Lines({"no import Bell", "catalogue:"}));
}

TEST_F(Shelf, HasImportsThatDoNotComeWithTheirPackageToo)
{
    PackageBuilder package(folder.path("a"));
    package.writeImport("remote.json", "Remote", QString());
    package.description.imports = {PackageBuilder::addOn(
        {{"sample_audio", CollectionID::IMPORTS}}, {PackageBuilder::resource("a.remote", "remote.json")})};
    package.writeDescription();
    Host::PackageShelf shelf;
    const Client client;
    shelf.put(folder.path());
    EXPECT_EQ(client.lines, Lines({"catalogue: a", "import Remote of a"}));
    EXPECT_EQ(shelf.mediaPath(shelf.find<Import::Object>("a.remote")), "");
}

TEST_F(Shelf, LetsGoOfEverythingWhenItEnds)
{
    auto shelf = std::make_unique<Host::PackageShelf>();
    Client client;
    writeImportPackage("a");
    shelf->put(folder.path("a"));
    client.lines.clear();
    shelf.reset();
    EXPECT_EQ(client.lines, Lines({"no import Bell", "catalogue:", "catalogue:"}));
}

TEST_F(Shelf, ReadsItsFoldersAgainWhenAnUpdateIsAskedFor)
{
    writeImportPackage("kept");
    writeImportPackage("gone");
    Host::PackageShelf shelf;
    Client client;
    shelf.put(folder.path());
    const Import::Object* const kept = shelf.find<Import::Object>("kept.bell");
    client.lines.clear();
    QDir(folder.path("gone")).removeRecursively();
    writeImportPackage("new");
    client.update();
    EXPECT_EQ(client.lines,
              Lines({"catalogue: gone kept", "flag 1", "no import Bell", "catalogue: kept",
                     "catalogue: kept new", "import Bell of new", "catalogue: kept new", "flag 0"}));
    EXPECT_EQ(shelf.find<Import::Object>("kept.bell"), kept) << "nothing in its folder has changed";
    EXPECT_EQ(shelf.catalogue().updateStatus, 0);
}

TEST_F(Shelf, ReadsAPackageAnewWhenOneOfItsFilesHasChanged)
{
    writeEffectPackage(folder.path("a"), "a.warm");
    Host::PackageShelf shelf;
    shelf.put(folder.path());
    PackageBuilder(folder.path("a")).writeEffect("warm.json", "Warmer");
    shelf.refresh();
    EXPECT_EQ(shelf.find<Effect::Object>("a.warm")->tag, "Warmer");
    EXPECT_THAT(shelf.storage().package2storage.at("a").collection2tags.at("Effects"), ElementsAre("Warmer"));
    folder.write("a/warm.json", "no");
    shelf.refresh();
    EXPECT_EQ(shelf.find<Effect::Object>("a.warm"), nullptr);
    EXPECT_THAT(shelf.faults(), SizeIs(1));
    PackageBuilder(folder.path("a")).writeEffect("warm.json", "Warm");
    shelf.refresh();
    EXPECT_THAT(shelf.faults(), IsEmpty());
}

TEST_F(Shelf, RaisesTheFlagOnceWhateverObserversAsk)
{
    Host::PackageShelf shelf;
    Client client;
    bool isAsking = false;
    client.onCatalogue = [&] {
        if (shelf.catalogue().updateStatus != 0 && !std::exchange(isAsking, true)) {
            client.update();
        }
    };
    client.update();
    EXPECT_EQ(client.lines, Lines({"catalogue:", "flag 1", "catalogue:", "flag 0"}));
}

TEST_F(Shelf, GrantsNobodyAnythingButTheUpdateFlag)
{
    writeEffectPackage(folder.path("a"), "a.warm");
    Host::PackageShelf shelf;
    shelf.put(folder.path());
    Client client;
    const Pack* const pack = shelf.catalogue().findPack("a");
    client.watch(pack);
    client.lines.clear();
    const Pack foreign;
    client.ask([&](Catalogue* catalogue) { catalogue->addPack(&foreign); });
    client.install(pack);
    client.drop(pack);
    client.dropCatalogue();
    EXPECT_THAT(client.lines, IsEmpty());
    client.ask([&](Catalogue* catalogue) { catalogue->addPack(&foreign)->update(); });
    EXPECT_EQ(client.lines, Lines({"catalogue: a", "flag 1", "catalogue: a", "flag 0"}));
    EXPECT_TRUE(pack->isInstalled());
}

TEST_F(Shelf, KeepsOfferedPacksInTheCatalogueAlsoWhenTheyAreNotInstalled)
{
    Host::PackageShelf shelf;
    Pack offered;
    offered.appId = "a";
    offered.downloadUrl = "file:///somewhere";
    offered.installationStatus = Pack::Installed;
    shelf.offer(offered);
    const Pack* const pack = shelf.catalogue().findPack("a");
    EXPECT_FALSE(pack->isInstalled());
    Client client;
    client.watch(pack);
    client.lines.clear();
    writeEffectPackage(folder.path("a"), "a.warm");
    shelf.put(folder.path("a"));
    EXPECT_EQ(std::exchange(client.lines, {}), Lines({"pack a: 0 to 1"}));
    shelf.takeOff("a");
    EXPECT_EQ(client.lines, Lines({"pack a: 1 to 0"}));
    EXPECT_EQ(shelf.catalogue().findPack("a"), pack);
    EXPECT_EQ(pack->downloadUrl, "file:///somewhere");
}

TEST_F(Shelf, KeepsWhatWasThereFirstWhereTwoPackagesHaveOneIdentifier)
{
    writeEffectPackage(folder.path("a"), "a.warm", "same");
    writeEffectPackage(folder.path("b"), "b.warm", "same");
    writeEffectPackage(folder.path("c"), "a.warm");
    Host::PackageShelf shelf;
    shelf.put(folder.path());
    EXPECT_EQ(shelf.package("same")->folder, folder.path("a"));
    ASSERT_THAT(shelf.faults(), SizeIs(2));
    EXPECT_EQ(shelf.faults()[0].reason, "has the identifier of the package in " + folder.path("a"));
    EXPECT_EQ(shelf.faults()[1].reason, "has the identifier of an element of same: a.warm");
    QDir(folder.path("a")).removeRecursively();
    shelf.refresh();
    EXPECT_EQ(shelf.package("same")->folder, folder.path("b"));
    EXPECT_EQ(shelf.find<Effect::Object>("a.warm"), shelf.package("c")->itemsOf<Effect::Object>()[0]->item);
    EXPECT_THAT(shelf.faults(), IsEmpty());
}

TEST_F(Shelf, NamesPlacesThatAreNoFolders)
{
    Host::PackageShelf shelf;
    EXPECT_EQ(shelf.put("/no/such/folder"), 0u);
    EXPECT_EQ(shelf.put(folder.write("file", "x")), 0u);
    EXPECT_EQ(shelf.put(folder.path()), 0u);
    ASSERT_THAT(shelf.faults(), SizeIs(2));
    EXPECT_EQ(shelf.faults()[0].package, "/no/such/folder");
    EXPECT_EQ(shelf.faults()[0].reason, "does not exist");
    EXPECT_EQ(shelf.faults()[1].reason, "is no folder");
    shelf.refresh();
    EXPECT_THAT(shelf.faults(), SizeIs(2)) << "each once";
}

TEST_F(Shelf, NamesAPlaceOnceThoughItIsPutAgain)
{
    Host::PackageShelf shelf;
    const QString late = folder.path("late");
    EXPECT_EQ(shelf.put(late), 0u);
    EXPECT_EQ(shelf.put(folder.path("never")), 0u);
    EXPECT_EQ(shelf.put(late), 0u);
    ASSERT_THAT(shelf.faults(), SizeIs(2));
    EXPECT_EQ(shelf.faults()[0].package, folder.path("never"));
    EXPECT_EQ(shelf.faults()[1].package, late);
    // By now it is there.
    writeEffectPackage(late, "late.warm");
    EXPECT_EQ(shelf.put(late), 1u);
    ASSERT_THAT(shelf.faults(), SizeIs(1));
    EXPECT_EQ(shelf.faults()[0].package, folder.path("never"));
}

/// What a message that is going round tells of is there until it has gone round.
TEST_F(Shelf, KeepsWhatIsTakenOffWhileARequestAboutItIsAnswered)
{
    writeImportPackage("a");
    Host::PackageShelf shelf;
    shelf.put(folder.path());
    struct Watcher : Message::View<Import::Object>
    {
        using Message::View<Import::Object>::changed;
        void changed(const Import::Object* import, const Import::Object*) override
        {
            onChange();
            tag = import->tag;
        }
        std::function<void()> onChange;
        QString tag;
    } watcher;
    const Import::Object* const bell = shelf.find<Import::Object>("a.bell");
    watcher.observe(bell);
    watcher.onChange = [&] { shelf.takeOff("a"); };
    watcher.change(bell)->tag = "Gong";
    EXPECT_EQ(watcher.tag, "Gong");
    EXPECT_EQ(shelf.find<Import::Object>("a.bell"), nullptr);
    EXPECT_FALSE(watcher.isObserved(bell));
}

TEST_F(Shelf, LeavesOffWhatIsTakenOffWhileItsFoldersAreReadAgain)
{
    writeEffectPackage(folder.path("a"), "a.warm");
    writeEffectPackage(folder.path("b"), "b.warm");
    Host::PackageShelf shelf;
    shelf.put(folder.path());
    Client client;
    bool isTakenOff = false;
    client.onCatalogue = [&] {
        if (!std::exchange(isTakenOff, true)) {
            shelf.takeOff("b");
        }
    };
    PackageBuilder(folder.path("a")).writeEffect("warm.json", "Warmer");
    shelf.refresh();
    EXPECT_EQ(shelf.find<Effect::Object>("a.warm")->tag, "Warmer");
    EXPECT_EQ(shelf.package("b"), nullptr);
    EXPECT_EQ(shelf.catalogue().findPack("b"), nullptr);
}

TEST_F(Shelf, BringsNoImportsOfAPackageThatIsTakenOffWhileItComes)
{
    writeImportPackage("a");
    Host::PackageShelf shelf;
    Client client;
    client.onCatalogue = [&] { shelf.takeOff("a"); };
    shelf.put(folder.path());
    EXPECT_EQ(client.lines, Lines({"catalogue: a", "catalogue:"}));
    EXPECT_THAT(Message::View<Import::Object>().enumerateAll(), IsEmpty());
    EXPECT_THAT(shelf.packages(), IsEmpty());
}

TEST_F(Shelf, LeavesThePackOfAPackageThatIsPutAgainWhileItIsTakenOff)
{
    writeImportPackage("a");
    Host::PackageShelf shelf;
    shelf.put(folder.path());
    struct Watcher : Message::View<Import::Object>
    {
        void removed(const Import::Object*) override { onRemoval(); }
        std::function<void()> onRemoval;
    } watcher;
    watcher.observe(shelf.find<Import::Object>("a.bell"));
    watcher.onRemoval = [&] { shelf.put(folder.path("a")); };
    EXPECT_TRUE(shelf.takeOff("a"));
    const auto* const bell = shelf.find<Import::Object>("a.bell");
    ASSERT_NE(bell, nullptr);
    ASSERT_NE(shelf.catalogue().findPack("a"), nullptr);
    EXPECT_EQ(bell->pack, shelf.catalogue().findPack("a"));
    EXPECT_TRUE(bell->pack->isInstalled());
}

TEST_F(Shelf, FreesAllThatItHad)
{
    writeImportPackage("a");
    writeEffectPackage(folder.path("b"), "b.warm");
    folder.write("b/warm.json", "no");
    const auto round = [&] {
        Host::PackageShelf shelf;
        shelf.put(folder.path());
        shelf.put(HOST_PACKAGES);
        shelf.takeOff("starter");
        shelf.put(HOST_PACKAGES "/starter");
        shelf.refresh();
    };
    round();
    const long before = Testing::liveAllocations();
    round();
    EXPECT_EQ(Testing::liveAllocations(), before);
}

} // namespace
