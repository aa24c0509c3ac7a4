// SPDX-License-Identifier: Apache-2.0
#include "tests/host/shared/Samples.h"

#include "host/media/AddingFailed.h"
#include "host/media/MediaDescriber.h"
#include "host/media/MediaOpener.h"
#include "host/media/ResourceKeeper.h"

#include <EditorModel/timeline/Composition.h>

#include <QDir>

#include <gmock/gmock.h>

#include <atomic>
#include <functional>
#include <set>
#include <thread>

namespace {

using namespace HostTests;
using Keeper = Host::ResourceKeeper;
using Table = ResourceTable::Object;
using Lines = std::vector<std::string>;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

/// A module that has a table and writes down what it hears: how many entries there are after each change, and
/// which files were not added.
class Client : public Message::View<Table>, private PubSub::Subscriber<Host::AddingFailed>
{
public:
    Client() { subscribeAll<Table>(); }

    Lines lines;
    std::function<void(const Table*)> onChanged;

protected:
    using Message::View<Table>::changed;
    void changed(const Table* table) override
    {
        lines.push_back("entries: " + std::to_string(table->resource2fileInfo.size()));
        if (onChanged) {
            onChanged(table);
        }
    }
    void notify(const Host::AddingFailed& message) override
    {
        EXPECT_TRUE(isObserved(message.sender));
        lines.push_back(message.path.toStdString() + ": " + message.reason.toStdString());
    }
};

void request(const Table& table, const QStringList& files)
{
    PubSub::publish(ResourceTable::AddFilesToTableRequest(&table, files));
}

ResourceRef video(const QString& path, int index = 0)
{
    return {Keeper::identifier(path, index), Resource::VideoType};
}

ResourceRef audio(const QString& path, int index = 0)
{
    return {Keeper::identifier(path, index), Resource::AudioType};
}

ResourceRef image(const QString& path, int index = 0)
{
    return {Keeper::identifier(path, index), Resource::ImageType};
}

std::vector<ResourceRef> keys(const Table& table)
{
    std::vector<ResourceRef> found;
    for (const auto& entry : table.resource2fileInfo) {
        found.push_back(entry.first);
    }
    return found;
}

class ResourceKeeper : public testing::Test
{
protected:
    void SetUp() override { Host::showMediaLibraryLog(false); }

    const QString film = sample("film.mp4");
    const QString tracks = sample("tracks.mkv");
    const QString wav = sample("speech.wav");
    const QString png = sample("picture.png");
    Host::MediaOpener opener;
    Table table;
};

TEST_F(ResourceKeeper, EntersEveryTrackAsAResourceOfItsKind)
{
    const Keeper keeper;
    Client client;
    client.add(&table);
    request(table, {tracks});
    const std::set<ResourceRef> expected = {video(tracks), video(tracks, 1), audio(tracks), audio(tracks, 1),
                                            audio(tracks, 2)};
    EXPECT_EQ(keys(table), std::vector<ResourceRef>(expected.begin(), expected.end()));
    // The tracks of the file are picture, sound, picture, sound, sound.
    const std::pair<ResourceRef, int> numbers[] = {{video(tracks), 0},
                                                   {audio(tracks), 1},
                                                   {video(tracks, 1), 2},
                                                   {audio(tracks, 1), 3},
                                                   {audio(tracks, 2), 4}};
    for (const auto& [resource, track] : numbers) {
        const ResourceTable::FileResourceInfo& info = table.resource2fileInfo.at(resource);
        EXPECT_EQ(info.info.track, track);
        EXPECT_EQ(info.info.path, tracks);
        EXPECT_EQ(info.timing.mode, Keeper::PlayedOnce);
    }
}

TEST_F(ResourceKeeper, GivesPicturesNoLengthOfTheirOwn)
{
    const Keeper keeper;
    Client client;
    client.add(&table);
    request(table, {png, wav, sample("song.mp3")});
    EXPECT_THAT(table.resource2fileInfo, SizeIs(4));
    EXPECT_EQ(table.resource2fileInfo.at(image(png)).info.duration, MTime());
    EXPECT_EQ(table.resource2fileInfo.at(image(png)).timing, Resource::Timing());
    EXPECT_EQ(table.resource2fileInfo.at(audio(wav)).info.duration, MTime(1500));
    const ResourceTable::FileResourceInfo& cover = table.resource2fileInfo.at(image(sample("song.mp3")));
    EXPECT_EQ(cover.info.track, 1);
    EXPECT_EQ(cover.info.duration, MTime());
}

TEST_F(ResourceKeeper, AddsAllFilesOfARequestInOneChange)
{
    const Keeper keeper;
    Client client;
    client.add(&table);
    EXPECT_EQ(std::exchange(client.lines, {}), Lines({"entries: 0"}));
    EXPECT_FALSE(client.isOwned(&table));
    request(table, {wav, png, film});
    EXPECT_EQ(std::exchange(client.lines, {}), Lines({"entries: 4"}));
    // Nothing is new.
    request(table, {png, film});
    EXPECT_THAT(client.lines, IsEmpty());
}

TEST_F(ResourceKeeper, TellsOfAFileThatCannotBeOpenedAndAddsTheOthers)
{
    const Keeper keeper;
    Client client;
    client.add(&table);
    client.lines.clear();
    request(table, {"/no/such/file.mp4", wav, "."});
    EXPECT_EQ(std::exchange(client.lines, {}),
              Lines({"/no/such/file.mp4: does not exist", ".: is a folder", "entries: 1"}));
    EXPECT_THAT(keys(table), ElementsAre(audio(wav)));

    request(table, {"/no/such/file.mp4"});
    EXPECT_EQ(client.lines, Lines({"/no/such/file.mp4: does not exist"}));
}

TEST(ResourceKeeperAlone, TellsWhereThereIsNoModuleThatOpensFiles)
{
    const Keeper keeper;
    Client client;
    Table table;
    client.add(&table);
    client.lines.clear();
    request(table, {"a.wav"});
    EXPECT_EQ(client.lines, Lines({"a.wav: is not opened: there is no module for that"}));
    EXPECT_THAT(keys(table), IsEmpty());
}

TEST_F(ResourceKeeper, NamesATrackTheSameOnEveryRunAndOnEveryWayToIt)
{
    // Worked out apart from the program: the UUID of version 5, by SHA-1, of the name "/a/b.mp4" in the
    // keeper's name space.
    EXPECT_EQ(Keeper::identifier("/a/b.mp4", 0), "5a1559fe-d533-5dcc-b2b7-23d35461d77f");
    EXPECT_EQ(Keeper::identifier("/a/b.mp4", 1), "5a1559fe-d533-5dcc-b2b7-23d35461d77f-1");
    EXPECT_EQ(Keeper::identifier("/a/b.mp4", 12), "5a1559fe-d533-5dcc-b2b7-23d35461d77f-12");
    EXPECT_EQ(Keeper::identifier("/a/../a/./b.mp4", 0), Keeper::identifier("/a/b.mp4", 0));
    EXPECT_EQ(Keeper::identifier("b.mp4", 0), Keeper::identifier(QDir::currentPath() + "/b.mp4", 0));
    EXPECT_NE(Keeper::identifier("/a/b.mp4", 0), Keeper::identifier("/a/B.mp4", 0));
}

TEST_F(ResourceKeeper, GoesOutOfAFolderBehindALinkAsTheSystemDoes)
{
    const Keeper keeper;
    const Folder folder;
    ASSERT_TRUE(QDir(folder.path()).mkpath("far/deep"));
    ASSERT_TRUE(QFile::link(folder.path("far/deep"), folder.path("link")));
    folder.copy("picture.png", "a");
    const QString far = folder.copy("speech.wav", "far/a");
    EXPECT_EQ(Keeper::identifier(folder.path() + "/link/../a", 0), Keeper::identifier(far, 0));
    EXPECT_EQ(Keeper::identifier("/../a", 0), Keeper::identifier("/a", 0));

    Client client;
    client.add(&table);
    request(table, {folder.path("a"), folder.path() + "/link/../a"});
    ASSERT_THAT(table.resource2fileInfo, SizeIs(2));
    EXPECT_EQ(table.resource2fileInfo.at(image(folder.path("a"))).info.path, folder.path("a"));
    EXPECT_EQ(table.resource2fileInfo.at(audio(far)).info.path, far);
}

TEST_F(ResourceKeeper, GivesIdentifiersThatTheTextFormCarries)
{
    const ResourceRef resource = video("/a:b=c/%1%2.mp4", 3);
    EXPECT_EQ(Resource::parseResource(Resource::serializeResource(resource)), resource);
}

TEST_F(ResourceKeeper, KeepsTheTimingThatStandsInTheTable)
{
    const Keeper keeper;
    Client client;
    client.add(&table);
    request(table, {wav});
    {
        auto edited = client.change(&table);
        ResourceTable::FileResourceInfo& info = edited->resource2fileInfo[audio(wav)];
        info.info.duration = MTime(7);
        info.timing.mode = Resource::Timing::Looped;
        info.timing.loopMinCount = 3;
    }
    request(table, {wav});
    const ResourceTable::FileResourceInfo& info = table.resource2fileInfo.at(audio(wav));
    EXPECT_EQ(info.info.duration, MTime(1500));
    EXPECT_EQ(info.timing.mode, Resource::Timing::Looped);
    EXPECT_EQ(info.timing.loopMinCount, 3);
}

TEST_F(ResourceKeeper, FillsATableThatAnotherModuleOwns)
{
    const Keeper keeper;
    Client owner;
    owner.own(&table);
    EXPECT_TRUE(owner.isOwned(&table));
    owner.lines.clear();
    request(table, {wav});
    EXPECT_EQ(owner.lines, Lines({"entries: 1"}));
    EXPECT_TRUE(owner.isOwned(&table));
    EXPECT_NE(Resource::Describer(audio(wav)).fileInfo(), nullptr);
    owner.remove(&table);
    EXPECT_EQ(Resource::Describer(audio(wav)).fileInfo(), nullptr);
}

TEST_F(ResourceKeeper, OpensNothingForATableThatNobodyOwns)
{
    const Keeper keeper;
    Client client;
    client.lines.clear();
    request(table, {wav, "/no/such/file"});
    EXPECT_THAT(keys(table), IsEmpty());
    EXPECT_THAT(client.lines, IsEmpty());
}

TEST_F(ResourceKeeper, TakesFilesThatAreOpenAsTheyAre)
{
    const Keeper keeper;
    const Folder folder;
    const QString path = folder.copy("speech.wav", "gone.wav");
    Host::MediaDescriber describer;
    describer.describe(path);
    ASSERT_TRUE(QFile::remove(path));
    Client client;
    client.add(&table);
    request(table, {folder.path() + "/./gone.wav"});
    EXPECT_THAT(keys(table), ElementsAre(audio(path)));
    // Those that were opened for the table alone are closed again.
    request(table, {png});
    EXPECT_THAT(Message::View<Media::File>().enumerateAll(), SizeIs(1));
}

TEST_F(ResourceKeeper, LeavesATableAloneThatIsRemovedWhileFilesAreOpened)
{
    const Keeper keeper;
    auto shortLived = std::make_unique<Table>();
    Client client;
    client.add(shortLived.get());
    class Remover : public PubSub::Subscriber<Host::OpeningFailed>
    {
    public:
        Remover() { subscribeAll<Media::File>(); }
        void notify(const Host::OpeningFailed&) override { onFailed(); }
        std::function<void()> onFailed;
    } remover;
    remover.onFailed = [&] {
        if (shortLived) {
            client.remove(shortLived.get());
            shortLived.reset();
        }
    };
    client.lines.clear();
    request(*shortLived, {"/no/such/file", wav});
    EXPECT_FALSE(shortLived);
    EXPECT_EQ(Resource::Describer(audio(wav)).fileInfo(), nullptr);
}

TEST_F(ResourceKeeper, AnswersForTheResourcesOfItsTables)
{
    const Keeper keeper;
    Client client;
    client.add(&table);
    request(table, {tracks, png});
    const Resource::FileInfo* const info = Resource::Describer(audio(tracks, 2)).fileInfo();
    ASSERT_NE(info, nullptr);
    EXPECT_EQ(info->path, tracks);
    EXPECT_EQ(info->track, 4);
    EXPECT_EQ(Resource::Describer(audio(tracks)).timing().mode, Keeper::PlayedOnce);
    EXPECT_EQ(Resource::Describer(image(png)).timing(), Resource::Timing());
    EXPECT_EQ(Resource::Describer(audio(tracks)).composition(), nullptr);
    // Another kind, and another file.
    EXPECT_EQ(Resource::Describer(image(tracks)).fileInfo(), nullptr);
    EXPECT_EQ(Resource::Describer(video(film)).fileInfo(), nullptr);
    EXPECT_EQ(Resource::Describer(video(film)).timing(), Resource::Timing());

    // What is played once maps a position to itself, within the length of the resource.
    Resource::Timing timing = Resource::Describer(audio(tracks)).timing();
    const Resource::ResourceTiming mapped =
        Resource::getTimings(300, info->duration, 100, 900, audio(tracks), timing);
    EXPECT_EQ(mapped.position, MTime(300));
    EXPECT_EQ(mapped.duration, info->duration);
}

TEST_F(ResourceKeeper, AnswersForATableThatComesWithItsEntries)
{
    const Keeper keeper;
    ResourceTable::FileResourceInfo& stored = table.resource2fileInfo[{"old", Resource::VideoType}];
    stored.info.path = "/old.mp4";
    stored.timing.mode = Resource::Timing::Stretched;
    const Resource::Describer describer({"old", Resource::VideoType});
    EXPECT_EQ(describer.fileInfo(), nullptr);
    Client client;
    client.add(&table);
    ASSERT_NE(describer.fileInfo(), nullptr);
    EXPECT_EQ(describer.fileInfo()->path, "/old.mp4");
    EXPECT_EQ(describer.timing().mode, Resource::Timing::Stretched);
    EXPECT_EQ(describer.composition(), nullptr);

    client.change(&table)->clear();
    EXPECT_EQ(describer.fileInfo(), nullptr);
}

TEST_F(ResourceKeeper, NamesTheCompositionThatTheFileHadWhenItWasAdded)
{
    const Keeper keeper;
    const Composition::Object composition;
    Media::File file;
    Media::File::Track::Video track;
    file.setPath("/composed.mp4")->setOpened(true)->setComposition(&composition)->addTrack(&track);
    opener.take(&file);
    Client client;
    client.add(&table);
    request(table, {"/composed.mp4"});
    EXPECT_EQ(Resource::Describer(video("/composed.mp4")).composition(), &composition);
    client.remove(&table);
    EXPECT_EQ(Resource::Describer(video("/composed.mp4")).composition(), nullptr);
}

TEST_F(ResourceKeeper, ForgetsACompositionWithTheLastTableThatHasItsResource)
{
    const Keeper keeper;
    auto composition = std::make_unique<Composition::Object>();
    Media::File file;
    Media::File::Track::Video track;
    file.setPath("/composed.mp4")->setOpened(true)->setComposition(composition.get())->addTrack(&track);
    opener.take(&file);
    Client client;
    client.add(&table);
    request(table, {"/composed.mp4"});
    Table stored = table;
    client.remove(&table);
    composition.reset();
    // As after a project was closed and loaded again.
    client.add(&stored);
    EXPECT_NE(Resource::Describer(video("/composed.mp4")).fileInfo(), nullptr);
    EXPECT_EQ(Resource::Describer(video("/composed.mp4")).composition(), nullptr);
}

TEST_F(ResourceKeeper, LetsWhatItAnsweredStandWhenTheTableChanges)
{
    const Keeper keeper;
    Client client;
    client.add(&table);
    request(table, {wav});
    const Resource::FileInfo* const first = Resource::Describer(audio(wav)).fileInfo();
    request(table, {png});
    EXPECT_EQ(Resource::Describer(audio(wav)).fileInfo(), first);

    client.change(&table)->resource2fileInfo[audio(wav)].info.duration = MTime(1);
    const Resource::FileInfo* const second = Resource::Describer(audio(wav)).fileInfo();
    EXPECT_EQ(second->duration, MTime(1));
    EXPECT_EQ(first->duration, MTime(1500));
    client.remove(&table);
    EXPECT_EQ(first->duration, MTime(1500));
}

TEST_F(ResourceKeeper, AnswersFromWithinTheChangeThatBringsTheResource)
{
    const Keeper keeper;
    Client client;
    client.add(&table);
    bool isKnown = false;
    client.onChanged = [&](const Table*) { isKnown = Resource::Describer(audio(wav)).fileInfo() != nullptr; };
    request(table, {wav});
    EXPECT_TRUE(isKnown);
}

TEST_F(ResourceKeeper, AnswersForEachOfSeveralTables)
{
    const Keeper keeper;
    Table second;
    Client client;
    client.add(&table);
    client.add(&second);
    request(table, {wav});
    request(second, {png});
    EXPECT_THAT(keys(table), ElementsAre(audio(wav)));
    EXPECT_THAT(keys(second), ElementsAre(image(png)));
    EXPECT_NE(Resource::Describer(audio(wav)).fileInfo(), nullptr);
    EXPECT_NE(Resource::Describer(image(png)).fileInfo(), nullptr);
    client.remove(&second);
    EXPECT_NE(Resource::Describer(audio(wav)).fileInfo(), nullptr);
    EXPECT_EQ(Resource::Describer(image(png)).fileInfo(), nullptr);
}

TEST_F(ResourceKeeper, AnswersOtherThreadsWhileTablesChange)
{
    const Keeper keeper;
    Client client;
    client.add(&table);
    request(table, {wav});
    std::atomic<bool> isOver = false;
    std::atomic<int> wrong = 0;
    std::atomic<int> asked = 0;
    std::thread asker([&] {
        while (!isOver) {
            const Resource::FileInfo* const info = Resource::Describer(audio(wav)).fileInfo();
            wrong += info && info->path == wav ? 0 : 1;
            ++asked;
        }
    });
    for (int i = 0; i < 200 || asked == 0; ++i) {
        client.change(&table)->resource2fileInfo[audio(wav)].info.duration = MTime(i);
    }
    isOver = true;
    asker.join();
    EXPECT_EQ(wrong, 0);
}

TEST_F(ResourceKeeper, LeavesTheHookEmptyWhenItEnds)
{
    Client client;
    client.own(&table);
    {
        const Keeper keeper;
        request(table, {wav});
        EXPECT_NE(Resource::Describer(audio(wav)).fileInfo(), nullptr);
    }
    EXPECT_EQ(Resource::Describer(audio(wav)).fileInfo(), nullptr);
    request(table, {png});
    EXPECT_THAT(keys(table), ElementsAre(audio(wav)));
}

} // namespace
