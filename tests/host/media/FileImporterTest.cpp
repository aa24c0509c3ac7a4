// SPDX-License-Identifier: Apache-2.0
#include "tests/host/editing/Edits.h"
#include "tests/host/shared/Samples.h"
#include "tests/shared/LiveAllocations.h"

#include "host/media/AddFilesToCollection.h"
#include "host/media/CollectionKeeper.h"
#include "host/media/FileImporter.h"
#include "host/media/FileNotAdded.h"
#include "host/media/MediaOpener.h"
#include "host/media/ResourceKeeper.h"

#include <QDir>
#include <QFileInfo>

#include <gmock/gmock.h>

#include <functional>
#include <memory>

namespace {

using namespace HostTests;
using EditorCollection::UserObject;
using FileAdder::Contexts;
using FileAdder::ResourceTableContext;
using FileAdder::TimelineContext;
using FileAdder::UserCollectionContext;
using Importer = Host::FileImporter;
using Host::EditSession;
using Host::MediaClips;
using Lines = std::vector<std::string>;
using Table = ResourceTable::Object;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;
using Timeline::Clip;
using Timeline::Track;

constexpr FileAdder::Asrc anywhere{};

std::string nameOf(const QString& path)
{
    return QFileInfo(path).fileName().toStdString();
}

std::string namesOf(const QStringList& paths)
{
    std::string names;
    for (const QString& path : paths) {
        names += ' ' + nameOf(path);
    }
    return names;
}

const char* trackText(TrackType type)
{
    switch (type) {
    case PrimaryTrack:
        return "primary";
    case ExtraVideoTrack:
        return "extra";
    case NativeAudioTrack:
        return "native";
    case AudioTrack:
        return "audio";
    default:
        return "track";
    }
}

/// "primary: film.mp4 0-2000 @0; native: ..." in the order of the tracks.
std::string textOf(const Timeline::Object& timeline)
{
    std::string text;
    for (const Track* const track : timeline.tracks) {
        const std::string row = EditTests::row(timeline, track);
        text += (text.empty() ? "" : "; ") + std::string(trackText(track->type)) + ":" +
                (row.empty() ? "" : " " + row);
    }
    return text;
}

class Files : public Message::View<Media::File>
{
public:
    explicit Files(Lines& lines) : m_lines(lines) { observeNew(); }

private:
    using View::changed;
    void changed(const Media::File* file, const Media::File* old) override
    {
        if (file->isOpened != old->isOpened || file->isFailed != old->isFailed) {
            m_lines.push_back((file->isOpened ? "opened " : "failed ") + nameOf(file->path));
        }
    }
    void removed(const Media::File* file) override { m_lines.push_back("closed " + nameOf(file->path)); }

    Lines& m_lines;
};

class Tables : public Message::View<Table>
{
public:
    Tables(Lines& lines, Table* table) : m_lines(lines) { add(table); }

private:
    using View::changed;
    void changed(const Table* table) override
    {
        m_lines.push_back("table " + std::to_string(table->resource2fileInfo.size()));
    }

    Lines& m_lines;
};

class Collections : public Message::View<UserObject>
{
public:
    Collections(Lines& lines, const UserObject* collection) : m_lines(lines) { observe(collection); }

private:
    using View::changed;
    void changed(const UserObject* collection) override
    {
        std::string line = "collection";
        for (const Import::Object* const item : collection->items) {
            line += ' ' + item->tag.toStdString();
        }
        m_lines.push_back(line);
    }

    Lines& m_lines;
};

class Timelines : public Message::View<Timeline::Object>
{
public:
    Timelines(Lines& lines, const Timeline::Object* timeline) : m_lines(lines) { observe(timeline); }

    std::function<void()> onChanged;

private:
    using View::changed;
    void changed(const Timeline::Object* timeline) override
    {
        m_lines.push_back(textOf(*timeline));
        if (onChanged) {
            onChanged();
        }
    }

    Lines& m_lines;
};

/// Hears all messages that belong to requests.
class Requests
    : private PubSub::Subscriber<FileAdder::AddMediaFiles, FileAdder::AddMediaFilesResult, Host::FileNotAdded,
                                 ResourceTable::AddFilesToTableRequest, Host::AddFilesToCollection>
{
public:
    explicit Requests(Lines& lines) : m_lines(lines)
    {
        subscribe(FileAdder::globalObject());
        subscribe(EditorCollection::globalObject());
        subscribeAll<Table>();
    }

private:
    void notify(const FileAdder::AddMediaFiles& message) override
    {
        m_lines.push_back("asked:" + namesOf(message.files));
    }
    void notify(const FileAdder::AddMediaFilesResult& message) override
    {
        m_lines.push_back("answer " + std::to_string(message.result) + ":" + namesOf(message.files));
    }
    void notify(const Host::FileNotAdded& message) override
    {
        const char* const places[] = {"anywhere", "table", "collection", "timeline"};
        m_lines.push_back(nameOf(message.path) + " not in " + places[message.place] + ": " +
                          message.reason.toStdString());
    }
    void notify(const ResourceTable::AddFilesToTableRequest& message) override
    {
        m_lines.push_back("for table:" + namesOf(message.files));
    }
    void notify(const Host::AddFilesToCollection& message) override
    {
        std::string names;
        for (const Media::File* const file : message.files) {
            names += ' ' + nameOf(file->path);
        }
        m_lines.push_back("for collection:" + names);
    }

    Lines& m_lines;
};

/// All modules, and others that write down everything they hear, in one list.
class FileImporter : public testing::Test
{
protected:
    FileImporter() { lines.clear(); }
    void SetUp() override { Host::showMediaLibraryLog(false); }

    FileAdder::AddedResult add(const QStringList& paths, const Contexts& contexts)
    {
        return FileAdder::addMediaFiles(paths, anywhere, contexts);
    }
    FileAdder::AddedResult lay(const QStringList& paths, const TimelineContext& context)
    {
        return add(paths, Contexts().setContext(context));
    }

    Contexts everywhere() const
    {
        return Contexts()
            .setContext(TimelineContext(now()))
            .setContext(UserCollectionContext())
            .setContext(ResourceTableContext(&table));
    }
    const Timeline::Object* now() const { return session.timeline(); }
    /// What was heard since the last time.
    Lines heard() { return std::exchange(lines, {}); }
    const Track* addTrack(TrackType type)
    {
        const Track* const track = session.makeTrack(type);
        EXPECT_TRUE(session.addTrack(track));
        lines.clear();
        return track;
    }

    const QString film = sample("film.mp4");
    const QString wav = sample("speech.wav");
    const QString png = sample("picture.png");
    const QString song = sample("song.mp3");

    Lines lines;
    Table table;
    Requests requests{lines};
    Files files{lines};
    Host::MediaOpener opener;
    Host::ResourceKeeper resources;
    Host::CollectionKeeper collection;
    EditSession session;
    Importer importer{session};
    Tables tables{lines, &table};
    Collections collections{lines, collection.collection()};
    Timelines timelines{lines, session.timeline()};
};

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

// The timeline

TEST_F(FileImporter, AppendsOnTheTrackAndTheLevelThatAreGiven)
{
    const Track* const extra = addTrack(ExtraVideoTrack);
    EXPECT_EQ(lay({png, png}, TimelineContext(now(), extra, 1, -1)), Importer::AllAdded);
    EXPECT_EQ(lines.back(), "answer 1: picture.png picture.png");
    EXPECT_EQ(textOf(*now()), "extra: picture.png 0-4000 @0 L1, picture.png 4000-8000 @0 L1");
    // No level is the lowest one.
    EXPECT_EQ(lay({png}, TimelineContext(now(), extra, MTime(-1), Clip::VideoClip, -1, true)),
              Importer::AllAdded);
    EXPECT_EQ(textOf(*now()), "extra: picture.png 0-4000 @0, picture.png 0-4000 @0 L1, "
                              "picture.png 4000-8000 @0 L1");
}

TEST_F(FileImporter, LaysTheSoundOfAVideoOnItsOwnTrackWhereverTheVideoGoes)
{
    const Track* const extra = addTrack(ExtraVideoTrack);
    EXPECT_EQ(lay({film}, TimelineContext(now(), extra, 0, -1)), Importer::AllAdded);
    EXPECT_EQ(textOf(*now()), "extra: film.mp4 0-2000 @0; native: film.mp4 0-2000 @0");
}

TEST_F(FileImporter, InsertsAtAPositionOneAfterAnotherOnEachTrack)
{
    lay({png, wav}, TimelineContext(now()));
    EXPECT_EQ(lay({film, wav, film}, TimelineContext(now(), nullptr, -1, 1000)), Importer::AllAdded);
    EXPECT_EQ(textOf(*now()),
              "primary: picture.png 0-1000 @0, film.mp4 1000-3000 @0, film.mp4 3000-5000 @0, "
              "picture.png 5000-8000 @1000; "
              "audio: speech.wav 0-1000 @0, speech.wav 1000-2500 @0, speech.wav 2500-3000 @1000; "
              "native: film.mp4 1000-3000 @0, film.mp4 3000-5000 @0");
    EXPECT_EQ(lay({png}, TimelineContext(now(), nullptr, -1, 0)), Importer::AllAdded);
    EXPECT_THAT(textOf(*now()), HasSubstr("primary: picture.png 0-4000 @0, picture.png 4000-5000 @0,"));
}

TEST_F(FileImporter, RefusesTracksThatDoNotTakeTheFileAndLaysTheOthers)
{
    const Track* const primary = addTrack(PrimaryTrack);
    const Track* const native = addTrack(NativeAudioTrack);
    EXPECT_EQ(lay({wav, png}, TimelineContext(now(), primary, 0, -1)), Importer::SomeAdded);
    EXPECT_EQ(heard(), Lines({
                           "asked: speech.wav picture.png",
                           "opened speech.wav",
                           "opened picture.png",
                           "speech.wav not in timeline: The clip \"speech.wav\" can't lie at 00:00:00.000: "
                           "the track takes no sound.",
                           "primary: picture.png 0-4000 @0; native:",
                           "answer 2: picture.png",
                       }));
    const Track elsewhere(PrimaryTrack);
    const std::tuple<const Track*, int, const char*> refused[] = {
        {native, 0, "on a native audio track by itself"},
        {&elsewhere, 0, "The track is not on the timeline."},
        {primary, 1, "on level 1, which the track does not have"},
        {primary, -2, "on level -2, which the track does not have"},
    };
    for (const auto& [track, level, reason] : refused) {
        EXPECT_EQ(lay({film}, TimelineContext(now(), track, level, -1)), Importer::NoneAdded);
        ASSERT_GE(lines.size(), 2u);
        EXPECT_THAT(lines[lines.size() - 2], HasSubstr(reason));
        EXPECT_EQ(heard().back(), "answer 3:");
    }
    EXPECT_EQ(textOf(*now()), "primary: picture.png 0-4000 @0; native:");
}

TEST_F(FileImporter, LeavesNeitherAGapNorATrackForWhatIsRefusedAtAPosition)
{
    lay({png}, TimelineContext(now()));
    lines.clear();
    // Five milliseconds are no clip.
    EXPECT_EQ(lay({film, wav, png}, TimelineContext(now(), nullptr, -1, 5)), Importer::SomeAdded);
    const std::string primary = "primary: picture.png 0-4000 @0";
    const std::string reason =
        ": The clip \"picture.png\" can't be split at 00:00:00.005: there must be a clip "
        "of 00:00:00.010 on either side, beside the transitions.";
    EXPECT_EQ(heard(), Lines({
                           "asked: film.mp4 speech.wav picture.png",
                           "opened film.mp4",
                           "opened speech.wav",
                           primary + "; native:",
                           primary,
                           "film.mp4 not in timeline" + reason,
                           primary + "; audio:",
                           primary + "; audio: speech.wav 5-1505 @0",
                           "picture.png not in timeline" + reason,
                           "answer 2: speech.wav",
                       }));
    EXPECT_EQ(lay({png}, TimelineContext(now(), nullptr, -1, -7)), Importer::NoneAdded);
    EXPECT_EQ(textOf(*now()), primary + "; audio: speech.wav 5-1505 @0");
}

TEST_F(FileImporter, BuildsClipsByTheStrategy)
{
    EXPECT_EQ(lay({film, song}, {now(), MediaClips::PictureAlone}), Importer::AllAdded);
    EXPECT_EQ(textOf(*now()), "primary: film.mp4 0-2000 @0, song.mp3 2000-6000 @0");
    EXPECT_EQ(lay({wav, png}, {now(), MediaClips::PictureAlone}), Importer::SomeAdded);
    EXPECT_EQ(lay({film, png}, {now(), MediaClips::SoundAlone}), Importer::SomeAdded);
    EXPECT_EQ(lay({png}, {now(), static_cast<MediaClips::Strategy>(7)}), Importer::NoneAdded);
    EXPECT_EQ(textOf(*now()),
              "primary: film.mp4 0-2000 @0, song.mp3 2000-6000 @0, picture.png 6000-10000 @0; "
              "audio: film.mp4 0-2000 @0");
    Lines reasons = heard();
    reasons.erase(std::remove_if(reasons.begin(), reasons.end(),
                                 [](const std::string& line) { return line.find(" not in ") == line.npos; }),
                  reasons.end());
    EXPECT_EQ(
        reasons,
        Lines({"speech.wav not in timeline: has no picture", "picture.png not in timeline: has no sound",
               "picture.png not in timeline: cannot be laid: clips aren't built by strategy 7"}));
}

TEST_F(FileImporter, BuildsClipsOfTheTypeThatIsGiven)
{
    const auto ofType = [this](Clip::ClipType type,
                               MediaClips::Strategy strategy = Timeline::DefaultStrategy) {
        TimelineContext context(now(), nullptr, MTime(-1), type, -1, false);
        context.clipBuildingStrategy = strategy;
        return context;
    };
    EXPECT_EQ(lay({film, wav}, ofType(Clip::AudioClip)), Importer::AllAdded);
    EXPECT_EQ(textOf(*now()), "audio: film.mp4 0-2000 @0, speech.wav 2000-3500 @0");
    EXPECT_EQ(lay({film}, ofType(Clip::VideoClip)), Importer::AllAdded);
    const std::string laid = "audio: film.mp4 0-2000 @0, speech.wav 2000-3500 @0; "
                             "primary: film.mp4 0-2000 @0; native: film.mp4 0-2000 @0";
    EXPECT_EQ(textOf(*now()), laid);

    lines.clear();
    const std::tuple<QString, TimelineContext, const char*> refused[] = {
        {png, ofType(Clip::AudioClip), "has no sound"},
        {wav, ofType(Clip::VideoClip), "has no picture"},
        {film, ofType(Clip::OverlayClip), "cannot become a clip of type 4"},
        {film, ofType(Clip::IntroVideoClip), "cannot become a clip of type 8"},
        {film, ofType(Clip::VideoClip, MediaClips::SoundAlone),
         "cannot be laid: the clip would be without what makes its type"},
        {film, ofType(Clip::AudioClip, MediaClips::PictureAlone),
         "cannot be laid: the clip would be without what makes its type"},
    };
    for (const auto& [path, context, reason] : refused) {
        EXPECT_EQ(lay({path}, context), Importer::NoneAdded);
        ASSERT_GE(lines.size(), 2u);
        EXPECT_EQ(lines[lines.size() - 2], nameOf(path) + " not in timeline: " + reason);
    }
    EXPECT_EQ(textOf(*now()), laid);
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

// Other modules

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
