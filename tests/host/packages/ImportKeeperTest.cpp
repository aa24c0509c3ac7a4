// SPDX-License-Identifier: Apache-2.0
#include "PackageBuilder.h"
#include "tests/shared/LiveAllocations.h"

#include "host/packages/ImportKeeper.h"
#include "host/packages/PackageShelf.h"

#include <EditorModel/library/ImportViews.h>

#include <QFile>
#include <QUrl>

#include <gmock/gmock.h>

#include <functional>
#include <string>
#include <utility>
#include <vector>

#include <sys/stat.h>

namespace {

using namespace HostTests;
using testing::ElementsAre;
using testing::IsEmpty;
using Lines = std::vector<std::string>;
using Import::State;

const char* stageName(const State& state)
{
    switch (static_cast<int>(state.stage)) {
    case Host::NotFetched:
        return "not fetched";
    case Host::Waiting:
        return "waiting";
    case Host::Fetching:
        return "fetching";
    case Host::Installing:
        return "installing";
    case Host::Fetched:
        return "fetched";
    case Host::FetchFailed:
        return "failed";
    default:
        return "?";
    }
}

/// What a user interface holds. It writes down each change of a state, with whole percents, and failures.
class Client : public Import::StateView, private PubSub::Subscriber<Host::ImportFailed>
{
public:
    Client() { PubSub::Subscriber<Host::ImportFailed>::subscribeAll<State>(); }

    using Import::StateView::cancelImport;
    using Import::StateView::import;
    using Import::StateView::importStateChange;
    using Import::StateView::importStateOf;
    using Import::StateView::importStateRemove;
    using Import::StateView::importStates;
    using Import::StateView::releaseImportState;

    Lines lines;
    std::function<void(const State*)> onChanged;
    std::function<void(const State*)> onFailed;

protected:
    void importStateChanged(const State* state, const State* before, const State* after) override
    {
        Import::StateView::importStateChanged(state, before, after);
        const State& shown = after->import ? *after : *before;
        std::string text = after->import ? "" : "gone: ";
        text += shown.import ? shown.import->tag.toStdString() : "null";
        text += std::string(" ") + stageName(shown) + " " + std::to_string(int(shown.progress * 100));
        if (shown.deployError != 0) {
            text += " error " + std::to_string(shown.deployError);
        }
        lines.push_back(text);
        if (onChanged && after->import) {
            onChanged(state);
        }
    }

private:
    void notify(const Host::ImportFailed& message) override
    {
        lines.push_back("because " + message.reason.toStdString());
        if (onFailed) {
            onFailed(message.sender);
        }
    }
};

/// An item on the bus, with an owner who grants its changes.
class Imports : public testing::Test
{
protected:
    Imports()
    {
        item.tag = "a";
        owner.own(&item);
        QDir(folder.path()).mkdir("remote");
    }

    /// A file of this many blocks at the item's address.
    QString offer(double blocks, const QString& name = "a.wav")
    {
        const QByteArray content(int(blocks * Host::ImportFetch::blockSize), 'x');
        const QString path = folder.write("remote/" + name, content);
        item.setRemoteUrl(QUrl::fromLocalFile(path).toString());
        return path;
    }

    QStringList fetchedFiles() const
    {
        return QDir(folder.path("media")).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot);
    }

    /// What the client hears of a whole try.
    Lines fetch()
    {
        Host::ImportKeeper keeper(folder.path("media"));
        Client client;
        client.importStateOf(&item);
        client.lines.clear();
        client.import(&item);
        keeper.run();
        return std::exchange(client.lines, {});
    }

    const Folder folder;
    Import::Object item;
    Message::View<Import::Object> owner;
};

TEST_F(Imports, GoFromNotFetchedThroughBlocksToFetched)
{
    offer(2.5);
    Host::ImportKeeper keeper(folder.path("media"));
    Client client;
    client.import(&item);
    EXPECT_EQ(std::exchange(client.lines, {}), Lines({"a not fetched 0", "a waiting 0"}));
    EXPECT_THAT(fetchedFiles(), IsEmpty());
    EXPECT_TRUE(keeper.step());
    EXPECT_TRUE(keeper.step());
    EXPECT_EQ(std::exchange(client.lines, {}), Lines({"a fetching 0", "a fetching 40"}));
    EXPECT_TRUE(keeper.step());
    EXPECT_TRUE(keeper.step());
    EXPECT_EQ(item.location(), "");
    EXPECT_FALSE(QFile::exists(folder.path("media/a.wav")));
    EXPECT_FALSE(keeper.step());
    EXPECT_FALSE(keeper.step());
    EXPECT_EQ(client.lines, Lines({"a fetching 80", "a installing 100", "a fetched 100"}));
    EXPECT_EQ(item.location(), folder.path("media/a.wav"));
    EXPECT_EQ(contentOf(item.location()), contentOf(folder.path("remote/a.wav")));
    EXPECT_THAT(fetchedFiles(), ElementsAre("a.wav"));
}

TEST_F(Imports, AreFetchedFromTheStartWhereTheyHaveALocation)
{
    item.setLocation("/somewhere/a.wav");
    Host::ImportKeeper keeper(folder.path("media"));
    Client client;
    client.import(&item);
    client.cancelImport(&item);
    EXPECT_EQ(client.lines, Lines({"a fetched 100"}));
    EXPECT_FALSE(keeper.step());
}

TEST_F(Imports, DoNothingWhereNobodyKeepsThem)
{
    Client client;
    client.import(&item);
    client.cancelImport(&item);
    client.releaseImportState(&item);
    EXPECT_EQ(client.importStateOf(&item), nullptr);
    EXPECT_THAT(client.lines, IsEmpty());
}

TEST_F(Imports, CanBeGivenUpInEveryStageBeforeTheEnd)
{
    offer(2);
    Host::ImportKeeper keeper(folder.path("media"));
    Client client;
    // Waiting, fetching, after a block, and when all is there.
    for (int steps = 0; steps <= 3; ++steps) {
        client.import(&item);
        for (int i = 0; i < steps; ++i) {
            EXPECT_TRUE(keeper.step());
        }
        client.lines.clear();
        client.cancelImport(&item);
        EXPECT_EQ(client.lines, Lines({"a not fetched 0"})) << steps;
        EXPECT_THAT(fetchedFiles(), IsEmpty()) << steps;
        EXPECT_FALSE(keeper.step());
    }
    EXPECT_EQ(item.location(), "");
    client.import(&item);
    keeper.run();
    EXPECT_THAT(fetchedFiles(), ElementsAre("a.wav"));
}

TEST_F(Imports, CannotBeGivenUpWhileTheOwnerIsGivenTheMedia)
{
    offer(1);
    Host::ImportKeeper keeper(folder.path("media"));
    Client client;
    struct Watcher : Message::View<Import::Object>
    {
        using Message::View<Import::Object>::changed;
        void changed(const Import::Object*, const Import::Object*) override { onChange(); }
        std::function<void()> onChange;
    } watcher;
    watcher.observe(&item);
    watcher.onChange = [&] { client.cancelImport(&item); };
    client.import(&item);
    keeper.run();
    EXPECT_EQ(client.lines.back(), "a fetched 100");
    EXPECT_EQ(item.location(), folder.path("media/a.wav"));
    EXPECT_THAT(fetchedFiles(), ElementsAre("a.wav"));
}

TEST_F(Imports, CanBeGivenUpByAnObserverOfTheProgress)
{
    offer(4);
    Host::ImportKeeper keeper(folder.path("media"));
    Client client;
    client.onChanged = [&](const State* state) {
        if (state->progress == 0.5) {
            EXPECT_FALSE(keeper.step()) << "the outer call goes on";
            client.cancelImport(state);
        }
    };
    client.import(&item);
    client.lines.clear();
    keeper.run();
    EXPECT_EQ(client.lines, Lines({"a fetching 0", "a fetching 25", "a fetching 50", "a not fetched 0"}));
    EXPECT_THAT(fetchedFiles(), IsEmpty());
}

TEST_F(Imports, AreFetchedOneAfterAnother)
{
    offer(0.5);
    Import::Object second;
    second.tag = "b";
    owner.own(&second);
    second.setRemoteUrl(offer(1, "b.wav"));
    offer(0.5);
    Host::ImportKeeper keeper(folder.path("media"));
    Client client;
    client.import(&item);
    client.import(&second);
    client.lines.clear();
    keeper.run();
    EXPECT_EQ(client.lines, Lines({"a fetching 0", "a installing 100", "a fetched 100", "b fetching 0",
                                   "b installing 100", "b fetched 100"}));
    EXPECT_EQ(second.location(), folder.path("media/b.wav"));
    owner.remove(&second);
    EXPECT_EQ(client.lines.back(), "gone: b fetched 100");
}

TEST_F(Imports, NeverReplaceAFile)
{
    offer(0.5);
    QDir(folder.path()).mkdir("media");
    folder.write("media/a.wav", "mine");
    folder.write("media/a-2.wav", "mine");
    EXPECT_EQ(fetch().back(), "a fetched 100");
    EXPECT_EQ(item.location(), folder.path("media/a-3.wav"));
    EXPECT_EQ(contentOf(folder.path("media/a.wav")), "mine");
}

TEST_F(Imports, FailWhereTheAddressLeadsToNoFileOfThisMachine)
{
    const std::pair<QString, std::string> wrong[] = {
        {"", "the item has no address from which it can be fetched"},
        {"https://example.com/a.wav", "https://example.com/a.wav: does not lead to a file of this machine"},
        {"file://server/a.wav", "file://server/a.wav: does not lead to a file of this machine"},
        {"media/a.wav", "media/a.wav: does not lead to a file of this machine"},
        {"file:a.wav", "file:a.wav: does not lead to a file of this machine"},
    };
    for (const auto& [address, reason] : wrong) {
        item.setRemoteUrl(address);
        const std::string error = address.isEmpty() ? "1" : "2";
        EXPECT_EQ(fetch(), Lines({"a waiting 0", "because " + reason, "a failed 0 error " + error}));
        EXPECT_THAT(fetchedFiles(), IsEmpty());
    }
}

TEST_F(Imports, FailWhereTheFileCannotBeRead)
{
    const QString missing = folder.path("remote/no.wav");
    item.setRemoteUrl(missing);
    EXPECT_EQ(fetch()[1], "because " + missing.toStdString() + ": does not exist");
    item.setRemoteUrl(folder.path("remote"));
    EXPECT_EQ(fetch()[1], "because " + folder.path("remote").toStdString() + ": is a folder");
    item.setRemoteUrl("/dev/zero");
    EXPECT_EQ(fetch()[2], "a failed 0 error 3");
    EXPECT_THAT(fetchedFiles(), IsEmpty());
}

TEST_F(Imports, TakePathsAsTheyStandAndAddressesDecoded)
{
    const QString path = offer(0.1, "a%20b c.wav");
    item.setRemoteUrl(path);
    EXPECT_EQ(fetch().at(3), "a fetched 100");
    item.setLocation("");
    item.setRemoteUrl("file://localhost" + QUrl::fromLocalFile(path).path(QUrl::FullyEncoded));
    EXPECT_EQ(fetch().at(3), "a fetched 100");
    EXPECT_EQ(item.location(), folder.path("media/a%20b c-2.wav"));
}

TEST_F(Imports, FailWhereTheSizeIsNotTheToldOne)
{
    const QString path = offer(0.5);
    item.setRemoteSize(131071);
    EXPECT_EQ(fetch(), Lines({"a waiting 0", "because a.wav: has 131072 bytes instead of 131071",
                              "a failed 0 error 5"}));
    item.setRemoteSize(131072);
    EXPECT_EQ(fetch().at(3), "a fetched 100");
}

TEST_F(Imports, FailWhereTheFileShrinksOrGrowsMeanwhile)
{
    for (const double blocks : {1.5, 2.5}) {
        const QString path = offer(2);
        Host::ImportKeeper keeper(folder.path("media"));
        Client client;
        client.import(&item);
        keeper.step();
        keeper.step();
        client.lines.clear();
        QFile(path).resize(qint64(blocks * Host::ImportFetch::blockSize));
        keeper.run();
        EXPECT_EQ(client.lines.back(), "a failed 50 error 5");
        EXPECT_EQ(client.lines.at(client.lines.size() - 2),
                  "because " + path.toStdString() + ": has changed while it was fetched");
        EXPECT_THAT(fetchedFiles(), IsEmpty());
    }
}

TEST_F(Imports, FailWhereTheFolderCannotBeMade)
{
    offer(0.5);
    folder.write("media", "in the way");
    const Lines heard = fetch();
    EXPECT_EQ(heard.at(1), "because " + folder.path("media").toStdString() + ": cannot be made");
    EXPECT_EQ(heard.at(2), "a failed 0 error 4");
    EXPECT_EQ(contentOf(folder.path("media")), "in the way");
}

TEST_F(Imports, FailWhereNobodyOwnsTheItem)
{
    offer(0.5);
    owner.forget(&item);
    const Lines heard = fetch();
    EXPECT_EQ(heard.at(heard.size() - 2),
              "because " + folder.path("media/a.wav").toStdString() + ": nobody takes it for the item");
    EXPECT_EQ(heard.back(), "a failed 100 error 6");
    EXPECT_THAT(fetchedFiles(), IsEmpty());
}

TEST_F(Imports, CanBeTriedAgainAfterAFailure)
{
    Host::ImportKeeper keeper(folder.path("media"));
    Client client;
    client.import(&item);
    keeper.run();
    EXPECT_EQ(client.lines.back(), "a failed 0 error 1");
    offer(0.5);
    client.lines.clear();
    client.import(&item);
    keeper.run();
    EXPECT_EQ(client.lines, Lines({"a waiting 0", "a fetching 0", "a installing 100", "a fetched 100"}));
}

TEST_F(Imports, AreNotMarkedAsFailedWhereWhoeverHearsOfItGivesThemUp)
{
    Host::ImportKeeper keeper(folder.path("media"));
    Client client;
    client.onFailed = [&](const State* state) { client.cancelImport(state); };
    client.import(&item);
    client.lines.clear();
    keeper.run();
    EXPECT_EQ(client.lines,
              Lines({"because the item has no address from which it can be fetched", "a not fetched 0"}));
}

TEST_F(Imports, AreChangedByTheKeeperAloneButForTheirStage)
{
    offer(1);
    Host::ImportKeeper keeper(folder.path("media"));
    Client client;
    const State* const state = client.importStateOf(&item);
    client.lines.clear();
    const auto stage = [](int value) { return static_cast<State::Stage>(value); };
    client.importStateChange(state)->setStage(stage(Host::Fetched));
    client.importStateChange(state)->setImport(nullptr);
    client.importStateChange(state)->setProgress(0.5);
    client.importStateRemove(state);
    EXPECT_THAT(client.lines, IsEmpty());
    client.importStateChange(state)->setStage(stage(Host::Waiting))->setProgress(0.5)->setImport(nullptr);
    EXPECT_EQ(client.lines, Lines({"a waiting 0"}));
    EXPECT_EQ(state->import, &item);
}

TEST_F(Imports, KeepAReleasedStateForTheOtherView)
{
    Host::ImportKeeper keeper(folder.path("media"));
    Client one;
    Client two;
    EXPECT_EQ(one.importStateOf(&item), two.importStateOf(&item));
    EXPECT_EQ(one.importStateOf(&item), two.importStateOf(&item)) << "a view asks once";
    one.releaseImportState(&item);
    EXPECT_EQ(keeper.stateCount(), 1u);
    two.releaseImportState(&item);
    EXPECT_EQ(keeper.stateCount(), 0u);
    EXPECT_EQ(one.lines, Lines({"a not fetched 0", "gone: a not fetched 0"}));
    EXPECT_EQ(two.lines, one.lines);
    EXPECT_THAT(one.importStates(), IsEmpty());
    two.releaseImportState(&item);
    EXPECT_NE(one.importStateOf(&item), nullptr);
    EXPECT_EQ(keeper.stateCount(), 1u);
}

TEST_F(Imports, KeepAReleasedStateUntilTheItemIsFetched)
{
    offer(1);
    Host::ImportKeeper keeper(folder.path("media"));
    Client client;
    client.import(&item);
    keeper.step();
    client.lines.clear();
    client.releaseImportState(&item);
    EXPECT_EQ(keeper.stateCount(), 1u);
    keeper.run();
    EXPECT_EQ(client.lines, Lines({"a installing 100", "a fetched 100", "gone: a fetched 100"}));
    EXPECT_EQ(keeper.stateCount(), 0u);
    EXPECT_THAT(fetchedFiles(), ElementsAre("a.wav"));
}

TEST_F(Imports, MayBeReleasedByAnObserverInTheMiddle)
{
    Host::ImportKeeper keeper(folder.path("media"));
    Client client;
    client.onChanged = [&](const State* state) {
        if (static_cast<int>(state->stage) == Host::FetchFailed) {
            client.releaseImportState(&item);
            EXPECT_EQ(state->import, &item) << "a message about it is still going round";
        }
    };
    client.import(&item);
    keeper.run();
    EXPECT_EQ(keeper.stateCount(), 0u);
}

TEST_F(Imports, EndWithTheItem)
{
    offer(2);
    Host::ImportKeeper keeper(folder.path("media"));
    Client client;
    client.import(&item);
    keeper.step();
    keeper.step();
    client.lines.clear();
    owner.remove(&item);
    EXPECT_EQ(client.lines, Lines({"gone: a fetching 50"}));
    EXPECT_EQ(keeper.stateCount(), 0u);
    EXPECT_THAT(fetchedFiles(), IsEmpty());
    EXPECT_FALSE(keeper.step());
}

TEST_F(Imports, EndWithTheKeeper)
{
    offer(2);
    Client client;
    {
        Host::ImportKeeper keeper(folder.path("media"));
        client.import(&item);
        keeper.step();
        keeper.step();
        EXPECT_EQ(fetchedFiles().size(), 1);
    }
    EXPECT_EQ(client.lines.back(), "gone: a fetching 50");
    EXPECT_THAT(fetchedFiles(), IsEmpty());
}

TEST_F(Imports, AreFetchedByOneOfTwoKeepers)
{
    offer(0.5);
    Host::ImportKeeper one(folder.path("media"));
    Host::ImportKeeper two(folder.path("media"));
    Client client;
    client.import(&item);
    EXPECT_EQ(one.stateCount(), 1u);
    EXPECT_EQ(two.stateCount(), 1u);
    EXPECT_EQ(client.importStates().size(), 1u) << "the last answer counts";
    one.run();
    two.run();
    EXPECT_EQ(client.lines,
              Lines({"a not fetched 0", "a waiting 0", "a fetching 0", "a installing 100", "a fetched 100"}));
    EXPECT_THAT(fetchedFiles(), ElementsAre("a.wav"));
    client.releaseImportState(&item);
    EXPECT_EQ(one.stateCount() + two.stateCount(), 0u) << "both hear of it";
}

TEST_F(Imports, HaveAStateAlsoWhereThereIsNoItem)
{
    Host::ImportKeeper keeper(folder.path("media"));
    Client client;
    const State* const state = client.importStateOf(nullptr);
    ASSERT_NE(state, nullptr);
    client.import(state);
    keeper.run();
    EXPECT_EQ(static_cast<int>(state->stage), Host::FetchFailed);
    client.releaseImportState(nullptr);
    EXPECT_EQ(keeper.stateCount(), 0u);
}

/// A pack that is offered, and an item of it.
class PackImports : public Imports
{
protected:
    PackImports()
    {
        Package::InApp::Pack pack;
        pack.appId = "looks";
        pack.downloadUrl = folder.path("remote/looks");
        writeEffectPackage(pack.downloadUrl, "warm");
        QDir().mkdir(folder.path("media"));
        shelf.put(folder.path("media"));
        shelf.offer(pack);
        item.pack = shelf.catalogue().findPack("looks");
    }

    Host::PackageShelf shelf;
};

TEST_F(PackImports, InstallThePack)
{
    const Lines heard = fetch();
    EXPECT_EQ(heard.back(), "a fetched 100");
    EXPECT_EQ(item.location(), folder.path("media/looks"));
    EXPECT_TRUE(item.pack->isInstalled());
    EXPECT_EQ(shelf.find<Effect::Object>("warm")->tag, "Warm");
    EXPECT_THAT(fetchedFiles(), ElementsAre("looks"));
}

TEST_F(PackImports, LeaveNothingOfAPackThatIsGivenUpOrThatNobodyTakes)
{
    {
        Host::ImportKeeper keeper(folder.path("media"));
        Client client;
        client.import(&item);
        keeper.step();
        keeper.step();
        client.cancelImport(&item);
        EXPECT_THAT(fetchedFiles(), IsEmpty());
    }
    folder.write("remote/looks/package.json", "no");
    const Lines heard = fetch();
    EXPECT_EQ(heard.back(), "a failed 100 error 6");
    EXPECT_THAT(fetchedFiles(), IsEmpty());
    EXPECT_FALSE(item.pack->isInstalled());
}

TEST_F(PackImports, FailWhereTheIdentifierIsNoNameOfAFolder)
{
    for (const char* const appId : {"", ".", "..", ".hidden", "../outside", "a/b", "/a"}) {
        const_cast<Package::InApp::Pack*>(item.pack)->appId = appId;
        EXPECT_EQ(fetch().back(), "a failed 0 error 4") << appId;
        EXPECT_THAT(fetchedFiles(), IsEmpty()) << appId;
    }
    EXPECT_EQ(QDir(folder.path()).entryList(QDir::Dirs | QDir::NoDotAndDotDot),
              QStringList({"media", "remote"}));
}

TEST_F(PackImports, FailForPackedFilesAndForFoldersWithLinks)
{
    const QString link = folder.path("remote/looks/link");
    Lines heard;
    // To a file, a folder, the folder itself, and nothing.
    for (const char* const target : {"/etc/passwd", "/etc", ".", "nowhere"}) {
        ASSERT_TRUE(QFile::link(target, link));
        heard = fetch();
        EXPECT_EQ(heard.back(), "a failed 0 error 3") << target;
        EXPECT_THAT(heard, testing::Contains("because " + link.toStdString() +
                                             ": is a link; packs are fetched without any"));
        EXPECT_THAT(fetchedFiles(), IsEmpty());
        ASSERT_TRUE(QFile::remove(link));
    }
    ASSERT_EQ(mkfifo(link.toUtf8().constData(), 0600), 0);
    heard = fetch();
    EXPECT_EQ(heard.back(), "a failed 0 error 3");
    EXPECT_THAT(heard, testing::Contains("because " + link.toStdString() + ": is not a regular file"));
    const_cast<Package::InApp::Pack*>(item.pack)->downloadUrl = folder.write("remote/looks.zip", "PK");
    heard = fetch();
    EXPECT_EQ(heard.back(), "a failed 0 error 7");
    EXPECT_THAT(fetchedFiles(), IsEmpty());
}

TEST_F(Imports, FreeAllThatTheyNeeded)
{
    offer(2);
    const auto round = [&] {
        Host::ImportKeeper keeper(folder.path("media"));
        Client client;
        client.import(&item);
        keeper.step();
        keeper.step();
        client.cancelImport(&item);
        client.import(&item);
        keeper.run();
        client.releaseImportState(&item);
        item.setLocation("");
        item.setRemoteUrl("no");
        client.import(&item);
        keeper.run();
        offer(2);
    };
    round();
    const long before = Testing::liveAllocations();
    round();
    EXPECT_EQ(Testing::liveAllocations(), before);
}

} // namespace
