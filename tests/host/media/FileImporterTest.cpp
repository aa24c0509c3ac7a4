// SPDX-License-Identifier: Apache-2.0
#include "ImportFixture.h"

#include "tests/shared/LiveAllocations.h"

#include <QDir>

namespace {

using namespace ImportTests;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

class FileImporter : public ImportFixture
{};

TEST_F(FileImporter, FillsTheTableThenTheCollectionThenTheTimeline)
{
    EXPECT_EQ(add({film, png, wav}, everywhere()), Importer::AllAdded);
    const std::string film0 = "primary: film.mp4 0-2000 @0";
    const std::string both = film0 + ", picture.png 2000-6000 @0";
    const std::string native = "; native: film.mp4 0-2000 @0";
    EXPECT_EQ(heard(), Lines({
                           "asked: film.mp4 picture.png speech.wav",
                           "opened film.mp4",
                           "opened picture.png",
                           "opened speech.wav",
                           "for table: film.mp4 picture.png speech.wav",
                           "table 4",
                           "for collection: film.mp4 picture.png speech.wav",
                           "collection film.mp4 picture.png speech.wav",
                           "primary:",
                           "primary:; native:",
                           film0 + native,
                           both + native,
                           both + native + "; audio:",
                           both + native + "; audio: speech.wav 0-1500 @0",
                           "answer 1: film.mp4 picture.png speech.wav",
                       }));
    EXPECT_THAT(EditTests::linkTexts(*now()), ElementsAre("film.mp4(0)>film.mp4(0)+0"));
}

TEST_F(FileImporter, GoesNowhereElseThanItIsAsked)
{
    EXPECT_EQ(add({wav}, Contexts().setContext(UserCollectionContext())), Importer::AllAdded);
    EXPECT_EQ(heard(), Lines({"asked: speech.wav", "opened speech.wav", "for collection: speech.wav",
                              "collection speech.wav", "answer 1: speech.wav", "closed speech.wav"}));
    EXPECT_EQ(add({wav}, Contexts().setContext(ResourceTableContext(&table))), Importer::AllAdded);
    EXPECT_EQ(heard(), Lines({"asked: speech.wav", "opened speech.wav", "for table: speech.wav", "table 1",
                              "answer 1: speech.wav", "closed speech.wav"}));
    EXPECT_EQ(lay({png}, TimelineContext(now())), Importer::AllAdded);
    EXPECT_EQ(heard(), Lines({"asked: picture.png", "opened picture.png",
                              "primary:", "primary: picture.png 0-4000 @0", "answer 1: picture.png"}));
}

TEST_F(FileImporter, TellsThatNothingIsAsked)
{
    EXPECT_EQ(add({}, everywhere()), Importer::NothingAsked);
    EXPECT_EQ(add({film}, Contexts()), Importer::NothingAsked);
    EXPECT_EQ(heard(), Lines({"asked:", "answer 4:", "asked: film.mp4", "answer 4:"}));
}

TEST_F(FileImporter, AddsAFileThatCannotBeOpenedNowhere)
{
    EXPECT_EQ(add({"/no/such/a.mp4", wav, "", "/no/such/a.mp4"}, everywhere()), Importer::SomeAdded);
    EXPECT_EQ(heard(), Lines({
                           "asked: a.mp4 speech.wav  a.mp4",
                           "failed a.mp4",
                           "a.mp4 not in anywhere: does not exist",
                           "opened speech.wav",
                           "failed ",
                           " not in anywhere: has no name",
                           "a.mp4 not in anywhere: does not exist",
                           "for table: speech.wav",
                           "table 1",
                           "for collection: speech.wav",
                           "collection speech.wav",
                           "audio:",
                           "audio: speech.wav 0-1500 @0",
                           "answer 2: speech.wav",
                       }));

    EXPECT_EQ(add({"/no/such/a.mp4"}, everywhere()), Importer::NoneAdded);
    EXPECT_EQ(heard(),
              Lines({"asked: a.mp4", "failed a.mp4", "a.mp4 not in anywhere: does not exist", "answer 3:"}));
}

TEST_F(FileImporter, RefusesATimelineThatItsSessionDoesNotEditAndDoesTheRest)
{
    const Timeline::Object other;
    Contexts contexts = everywhere();
    contexts.setContext(TimelineContext(&other));
    EXPECT_EQ(add({wav, png}, contexts), Importer::SomeAdded);
    EXPECT_EQ(heard(), Lines({
                           "asked: speech.wav picture.png",
                           "opened speech.wav",
                           "opened picture.png",
                           "for table: speech.wav picture.png",
                           "table 2",
                           "for collection: speech.wav picture.png",
                           "collection speech.wav picture.png",
                           "speech.wav not in timeline: is not laid: the timeline isn't edited here",
                           "picture.png not in timeline: is not laid: the timeline isn't edited here",
                           "answer 2: speech.wav picture.png",
                           "closed speech.wav",
                           "closed picture.png",
                       }));
    EXPECT_THAT(other.clips, IsEmpty());
    EXPECT_EQ(lay({wav}, TimelineContext(nullptr)), Importer::NoneAdded);
}

TEST_F(FileImporter, LaysAFileAsOftenAsItIsNamedAndOpensItOnce)
{
    const QString roundabout = sample("./speech.wav");
    EXPECT_EQ(add({wav, wav, roundabout}, everywhere()), Importer::AllAdded);
    EXPECT_EQ(heard(), Lines({
                           "asked: speech.wav speech.wav speech.wav",
                           "opened speech.wav",
                           "for table: speech.wav speech.wav speech.wav",
                           "table 1",
                           "for collection: speech.wav speech.wav speech.wav",
                           "collection speech.wav",
                           "audio:",
                           "audio: speech.wav 0-1500 @0",
                           "audio: speech.wav 0-1500 @0, speech.wav 1500-3000 @0",
                           "audio: speech.wav 0-1500 @0, speech.wav 1500-3000 @0, speech.wav 3000-4500 @0",
                           "answer 1: speech.wav speech.wav speech.wav",
                       }));
    // What the table and the collection hold already is there.
    EXPECT_EQ(add({wav}, everywhere()), Importer::AllAdded);
    EXPECT_EQ(heard(), Lines({
                           "asked: speech.wav",
                           "for table: speech.wav",
                           "for collection: speech.wav",
                           "audio: speech.wav 0-1500 @0, speech.wav 1500-3000 @0, speech.wav 3000-4500 @0, "
                           "speech.wav 4500-6000 @0",
                           "answer 1: speech.wav",
                       }));
    std::set<const Media::File*> used;
    for (const auto& entry : now()->clips) {
        used.insert(entry.first->file);
    }
    EXPECT_THAT(used, SizeIs(1));
}

TEST_F(FileImporter, FindsFilesFromTheFolderOfTheProcess)
{
    const QString relative = QDir::current().relativeFilePath(wav);
    EXPECT_EQ(add({relative}, everywhere()), Importer::AllAdded);
    ASSERT_THAT(now()->clips, SizeIs(1));
    EXPECT_EQ(now()->clips.begin()->first->file->path, wav);
    EXPECT_EQ(collection.collection()->items.front()->location(), wav);
    EXPECT_EQ(table.resource2fileInfo.begin()->second.info.path, wav);
}

TEST_F(FileImporter, RefusesATableThatNobodyOwnsAndDoesTheRest)
{
    Table lost;
    Contexts contexts = everywhere();
    contexts.setContext(ResourceTableContext(&lost));
    EXPECT_EQ(add({wav}, contexts), Importer::SomeAdded);
    EXPECT_EQ(heard(), Lines({
                           "asked: speech.wav",
                           "opened speech.wav",
                           "speech.wav not in table: is not entered: no module owns this table",
                           "for collection: speech.wav",
                           "collection speech.wav",
                           "audio:",
                           "audio: speech.wav 0-1500 @0",
                           "answer 2: speech.wav",
                       }));
    EXPECT_EQ(add({wav}, Contexts().setContext(ResourceTableContext(nullptr))), Importer::NoneAdded);
}

TEST_F(FileImporter, DoesNotTouchATableThatEndsWhileItIsFilled)
{
    class Ender : public PubSub::Subscriber<ResourceTable::AddFilesToTableRequest>
    {
    public:
        explicit Ender(const Table* table) { subscribe(table); }
        void notify(const ResourceTable::AddFilesToTableRequest&) override { end(); }
        std::function<void()> end;
    };
    auto shortLived = std::make_unique<Table>();
    Message::View<Table> client;
    client.own(shortLived.get());
    Ender ender(shortLived.get());
    ender.end = [&] {
        client.remove(shortLived.get());
        ender.unsubscribe(shortLived.get());
        shortLived.reset();
    };
    EXPECT_EQ(add({wav}, Contexts().setContext(ResourceTableContext(shortLived.get()))), Importer::NoneAdded);
    EXPECT_FALSE(shortLived);
    EXPECT_THAT(lines,
                testing::Contains("speech.wav not in table: is not entered: no module owns this table"));
}

TEST_F(FileImporter, WorksOffARequestThatIsMadeMeanwhile)
{
    timelines.onChanged = [this] {
        timelines.onChanged = nullptr;
        EXPECT_EQ(add({png}, Contexts().setContext(UserCollectionContext())), Importer::AllAdded);
    };
    EXPECT_EQ(lay({wav, "/no/such/a.mp4"}, TimelineContext(now())), Importer::SomeAdded);
    EXPECT_EQ(heard(), Lines({
                           "asked: speech.wav a.mp4",
                           "opened speech.wav",
                           "failed a.mp4",
                           "a.mp4 not in anywhere: does not exist",
                           "audio:",
                           "asked: picture.png",
                           "opened picture.png",
                           "for collection: picture.png",
                           "collection picture.png",
                           "answer 1: picture.png",
                           "closed picture.png",
                           "audio: speech.wav 0-1500 @0",
                           "answer 2: speech.wav",
                       }));
}

TEST_F(FileImporter, GoesOnAfterAnObserverHasThrown)
{
    timelines.onChanged = [this] {
        timelines.onChanged = nullptr;
        throw std::runtime_error("no");
    };
    EXPECT_THROW(add({wav}, everywhere()), std::runtime_error);
    EXPECT_EQ(heard().back(), "audio:");
    EXPECT_EQ(add({wav}, everywhere()), Importer::AllAdded);
    EXPECT_EQ(textOf(*now()), "audio: speech.wav 0-1500 @0");
}

TEST_F(FileImporter, AnswersBesideAnotherOneOfWhichTheLastDecides)
{
    EditSession otherSession;
    const Importer other(otherSession);
    EXPECT_EQ(add({wav}, everywhere()), Importer::SomeAdded);
    EXPECT_EQ(heard(), Lines({
                           "asked: speech.wav",
                           "opened speech.wav",
                           "for table: speech.wav",
                           "table 1",
                           "for collection: speech.wav",
                           "collection speech.wav",
                           "audio:",
                           "audio: speech.wav 0-1500 @0",
                           "answer 1: speech.wav",
                           "opened speech.wav",
                           "for table: speech.wav",
                           "for collection: speech.wav",
                           "speech.wav not in timeline: is not laid: the timeline isn't edited here",
                           "answer 2: speech.wav",
                           "closed speech.wav",
                       }));
    EXPECT_EQ(lay({wav}, TimelineContext(otherSession.timeline())), Importer::AllAdded);
    EXPECT_THAT(otherSession.timeline()->clips, SizeIs(1));
    EXPECT_THAT(now()->clips, SizeIs(1));
}

TEST(FileImporterAlone, IsMissedWhereThereIsNone)
{
    EXPECT_EQ(FileAdder::addMediaFiles({sample("speech.wav")}, anywhere,
                                       Contexts().setContext(UserCollectionContext())),
              FileAdder::NotAnswered);
}

TEST(FileImporterAlone, TellsWhichOtherModulesAreMissing)
{
    Lines lines;
    const Requests requests(lines);
    EditSession session;
    const Importer importer(session);
    Table table;
    Message::View<Table> owner;
    owner.own(&table);
    Contexts contexts;
    contexts.setContext(UserCollectionContext()).setContext(ResourceTableContext(&table));
    const QStringList files = {sample("speech.wav")};
    EXPECT_EQ(FileAdder::addMediaFiles(files, anywhere, contexts), Importer::NoneAdded);
    EXPECT_EQ(std::exchange(lines, {}),
              Lines({"asked: speech.wav",
                     "speech.wav not in anywhere: is not opened: there is no module for that", "answer 3:"}));

    const Host::MediaOpener opener;
    EXPECT_EQ(FileAdder::addMediaFiles(files, anywhere, contexts), Importer::NoneAdded);
    EXPECT_EQ(lines, Lines({"asked: speech.wav", "for table: speech.wav",
                            "speech.wav not in table: is not entered: no module fills this table",
                            "for collection: speech.wav",
                            "speech.wav not in collection: is not collected: no module keeps the user's "
                            "collection",
                            "answer 3:"}));
}

TEST(FileImporterAlone, TellsWhyACollectionIsNotFilled)
{
    EditorCollection::UserObject kept;
    Message::View<EditorCollection::UserObject> owner;
    owner.own(&kept);
    const Host::CollectionKeeper keeper(&kept);
    Lines lines;
    const Requests requests(lines);
    EditSession session;
    const Importer importer(session);
    const Host::MediaOpener opener;
    EXPECT_EQ(FileAdder::addMediaFiles({sample("speech.wav")}, anywhere,
                                       Contexts().setContext(UserCollectionContext())),
              Importer::NoneAdded);
    EXPECT_EQ(lines, Lines({"asked: speech.wav", "for collection: speech.wav",
                            "speech.wav not in collection: is not collected: the user's collection is kept "
                            "by another module",
                            "answer 3:"}));
    EXPECT_THAT(kept.items, testing::IsEmpty());
}

TEST(FileImporterAlone, FreesEverythingThatItMade)
{
    Host::showMediaLibraryLog(false);
    const auto run = [] {
        Table table;
        const Host::MediaOpener opener;
        const Host::ResourceKeeper resources;
        const Host::CollectionKeeper collection;
        EditSession session;
        const Importer importer(session);
        Message::View<Table> client;
        client.add(&table);
        Contexts contexts;
        contexts.setContext(TimelineContext(session.timeline(), nullptr, -1, 5))
            .setContext(UserCollectionContext())
            .setContext(ResourceTableContext(&table));
        // The second one is refused on the timeline.
        EXPECT_EQ(FileAdder::addMediaFiles({sample("speech.wav"), sample("film.mp4"), "/no/such/file"},
                                           anywhere, contexts),
                  Importer::SomeAdded);
        EXPECT_EQ(FileAdder::addMediaFiles({sample("film.mp4")}, anywhere,
                                           Contexts().setContext(UserCollectionContext())),
                  Importer::AllAdded);
    };
    run(); // what is made once for all time
    const long before = Testing::liveAllocations();
    run();
    EXPECT_EQ(Testing::liveAllocations(), before);
}

} // namespace
