// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/LiveAllocations.h"

#include "tests/host/shared/Samples.h"

#include "host/media/CollectingFailed.h"
#include "host/media/CollectionKeeper.h"

#include <EditorModel/library/CollectionIds.h>
#include <EditorModel/library/Pack.h>

#include <QDir>

#include <gmock/gmock.h>

namespace {

using EditorCollection::UserObject;
using Keeper = Host::CollectionKeeper;
using Lines = std::vector<std::string>;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

/// Another module that watches the collection: it writes down what is listed after each change.
class Client : public Message::View<UserObject>
{
public:
    explicit Client(const UserObject* collection)
    {
        observe(collection);
        lines.clear();
    }

    Lines lines;
    bool isRemoved = false;

private:
    using View::changed;
    void changed(const UserObject* collection) override
    {
        std::string line;
        for (const Import::Object* const item : collection->items) {
            line += (line.empty() ? "" : " ") + item->tag.toStdString();
        }
        lines.push_back(line);
    }
    void removed(const UserObject*) override { isRemoved = true; }
};

/// A description as whoever opens files makes it.
class File : public Media::File
{
public:
    enum Shape
    {
        Film,
        Sound,
        Picture,
        SoundWithCover,
        Nothing,
    };

    explicit File(const QString& place, Shape shape = Sound)
    {
        setPath(place);
        m_video.isImage = shape != Film;
        if (shape == Film || shape == Picture || shape == SoundWithCover) {
            addTrack(&m_video);
        }
        if (shape == Film || shape == Sound || shape == SoundWithCover) {
            addTrack(&m_audio);
        }
    }

private:
    Track::Video m_video;
    Track::Audio m_audio;
};

void request(const std::deque<const Media::File*>& files)
{
    PubSub::publish(Host::AddFilesToCollection(files));
}

TEST(CollectionKeeper, OwnsACollectionThatIsEmptyAtFirst)
{
    const Keeper keeper;
    EXPECT_THAT(keeper.collection()->items, IsEmpty());
    EXPECT_THAT(Message::View<UserObject>().enumerateAll(), ElementsAre(keeper.collection()));
}

TEST(CollectionKeeper, DescribesAFileByAnItem)
{
    const Keeper keeper;
    const File film("/media/a film.mp4", File::Film);
    request({&film});
    ASSERT_THAT(keeper.collection()->items, SizeIs(1));
    const Import::Object& item = *keeper.collection()->items.front();
    EXPECT_EQ(item.location(), "/media/a film.mp4");
    EXPECT_EQ(item.tag, "a film.mp4");
    EXPECT_EQ(item.category, "user_files");
    EXPECT_EQ(item.kind, 1);
    EXPECT_EQ(item.remoteUrl(), "");
    EXPECT_EQ(item.remoteSize(), -1);
    EXPECT_EQ(item.pack, nullptr);
}

TEST(CollectionKeeper, TellsTheKindsOfFilesApart)
{
    const Keeper keeper;
    const File film("/film", File::Film);
    const File sound("/sound", File::Sound);
    const File picture("/picture", File::Picture);
    const File song("/song", File::SoundWithCover);
    const File nothing("/nothing", File::Nothing);
    request({&film, &sound, &picture, &song, &nothing});
    std::vector<int> kinds;
    for (const Import::Object* const item : keeper.collection()->items) {
        kinds.push_back(item->kind);
    }
    EXPECT_THAT(kinds, ElementsAre(1, 2, 3, 2, 0));
}

TEST(CollectionKeeper, AddsAllFilesOfARequestInOneChange)
{
    const Keeper keeper;
    Client client(keeper.collection());
    const File b("/b");
    const File a("/a");
    const File c("/c");
    request({&b, &a});
    request({&c});
    EXPECT_EQ(client.lines, Lines({"b a", "b a c"}));
    // Nothing is new.
    request({&a, &c});
    request({});
    EXPECT_THAT(client.lines, SizeIs(2));
}

TEST(CollectionKeeper, ListsAFileOnceOnWhateverWayToIt)
{
    const Keeper keeper;
    const File plain("/a/b.wav");
    const File roundabout("/a/../a/./b.wav");
    const File relative("c.wav");
    const File absolute(QDir::currentPath() + "/c.wav");
    request({&plain, &roundabout, &plain});
    request({&relative, &absolute, &roundabout});
    ASSERT_THAT(keeper.collection()->items, SizeIs(2));
    EXPECT_EQ(keeper.collection()->items[1]->location(), QDir::currentPath() + "/c.wav");
}

TEST(CollectionKeeper, LeavesTheFolderOfALinkWhereTheLinkLeadsTo)
{
    const HostTests::Folder folder;
    ASSERT_TRUE(QDir(folder.path()).mkpath("there/inner"));
    ASSERT_TRUE(QDir(folder.path()).mkpath("here"));
    ASSERT_TRUE(QFile::link(folder.path("there/inner"), folder.path("here/link")));
    const Keeper keeper;
    const File above(folder.path("here/link/../a.wav"));
    const File below(folder.path("here/link/b.wav"));
    request({&above, &below});
    ASSERT_THAT(keeper.collection()->items, SizeIs(2));
    EXPECT_EQ(keeper.collection()->items[0]->location(), folder.path("there/a.wav"));
    EXPECT_EQ(keeper.collection()->items[1]->location(), folder.path("here/link/b.wav"));
}

TEST(CollectionKeeper, GoesByTheItemsThatStandInACollectionItIsGiven)
{
    Import::Object own;
    own.setLocation("/a/./b.wav");
    Import::Object remote;
    Package::InApp::Pack pack;
    Import::Object ofPack;
    ofPack.pack = &pack;
    ofPack.setLocation("/c.wav");
    UserObject collection;
    collection.addItem(&own);
    collection.addItem(&remote);
    collection.addItem(&ofPack);
    {
        const Keeper keeper(&collection);
        EXPECT_EQ(keeper.collection(), &collection);
        EXPECT_THAT(Host::listedFiles(collection), ElementsAre("/a/b.wav"));
        const File b("/a/b.wav");
        // Where an item of a pack lies is for the pack to say.
        const File c("/c.wav");
        request({&b, &c});
        ASSERT_THAT(collection.items, SizeIs(4));
        EXPECT_EQ(collection.items[0], &own);
        EXPECT_EQ(collection.items[3]->tag, "c.wav");
    }
    EXPECT_THAT(Message::View<UserObject>().enumerateAll(), IsEmpty());
    EXPECT_THAT(collection.items, SizeIs(4));
}

TEST(CollectionKeeper, LetsOthersChangeTheCollection)
{
    const Keeper keeper;
    Client client(keeper.collection());
    const File a("/a");
    const File b("/b");
    request({&a, &b});
    Import::Object theirs;
    theirs.tag = "theirs";
    const Import::Object* const first = keeper.collection()->items.front();
    client.change(keeper.collection())->removeItem(first);
    client.change(keeper.collection())->addItem(&theirs);
    EXPECT_EQ(client.lines, Lines({"a b", "b", "b theirs"}));
    // The item is there as long as the keeper is: whoever heard of it may hold it.
    EXPECT_EQ(first->location(), "/a");

    client.change(keeper.collection())->addItem(nullptr);
    EXPECT_THAT(client.lines, SizeIs(3));
    EXPECT_THAT(keeper.collection()->items, SizeIs(2));

    // A file that was taken out can come back.
    request({&a});
    EXPECT_EQ(client.lines.back(), "b theirs a");
}

TEST(CollectionKeeper, LetsNobodyRemoveTheCollection)
{
    auto keeper = std::make_unique<Keeper>();
    Client client(keeper->collection());
    client.remove(keeper->collection());
    EXPECT_FALSE(client.isRemoved);
    EXPECT_THAT(client.enumerateAll(), SizeIs(1));
    keeper.reset();
    EXPECT_TRUE(client.isRemoved);
    EXPECT_THAT(client.enumerateAll(), IsEmpty());
}

/// Writes down why files are not collected.
class FailureList : private PubSub::Subscriber<Host::CollectingFailed>
{
public:
    FailureList() { subscribe(EditorCollection::globalObject()); }

    Lines lines;

private:
    void notify(const Host::CollectingFailed& message) override
    {
        lines.push_back((message.path + ' ' + message.reason).toStdString());
    }
};

TEST(CollectionKeeper, LeavesACollectionToTheModuleThatOwnsIt)
{
    UserObject collection;
    Message::View<UserObject> owner;
    owner.own(&collection);
    Client client(&collection);
    const FailureList failures;
    const File film("/film", File::Film);
    const File sound("/sound", File::Sound);
    {
        const Keeper keeper(&collection);
        EXPECT_EQ(keeper.collection(), &collection);
        request({&film, &sound});
        EXPECT_THAT(failures.lines,
                    ElementsAre("/film is not collected: the user's collection is kept by another module",
                                "/sound is not collected: the user's collection is kept by another module"));
        EXPECT_THAT(collection.items, IsEmpty());
    }
    EXPECT_THAT(client.lines, IsEmpty());
    EXPECT_FALSE(client.isRemoved);
    EXPECT_TRUE(owner.isOwned(&collection));
    // The owner has let go of it.
    owner.remove(&collection);
    const Keeper next(&collection);
    request({&film});
    EXPECT_THAT(collection.items, SizeIs(1));
    EXPECT_THAT(failures.lines, SizeIs(2));
}

TEST(CollectionKeeper, FreesTheItemsThatItMade)
{
    const File a("/a");
    const File b("/b", File::Film);
    const auto run = [&] {
        const Keeper keeper;
        Client client(keeper.collection());
        request({&a, &b});
        client.change(keeper.collection())->clear();
        request({&a});
    };
    run(); // what is made once for all time
    const long before = Testing::liveAllocations();
    run();
    EXPECT_EQ(Testing::liveAllocations(), before);
}

} // namespace
