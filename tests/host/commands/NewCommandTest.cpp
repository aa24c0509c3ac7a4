// SPDX-License-Identifier: Apache-2.0
#include "FilmProject.h"

#include "host/media/CollectionKeeper.h"
#include "host/project/ProjectStore.h"

#include <EditorModel/media/File.h>
#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/timeline/Timeline.h>

#include <QFileInfo>

#include <gmock/gmock.h>

namespace {

using namespace HostTests;
using Host::ProjectDocument;
using Host::TimelineOutline;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;
using Timeline::Clip;
using Timeline::ClipTiming;

TEST(NewCommand, LaysMediaOneAfterAnother)
{
    const FilmProject project;
    const ProjectDocument document = ProjectDocument::load(project.path());
    const Timeline::Object& timeline = document.timeline();
    const TimelineOutline outline(timeline);
    ASSERT_EQ(outline.clips().size(), 6u);
    const std::tuple<const char*, Clip::ClipType, TrackType, qint64, qint64> expected[] = {
        {"film.mp4", Clip::VideoClip, PrimaryTrack, 0, 2000},
        {"picture.png", Clip::VideoClip, PrimaryTrack, 2000, 4000},
        {"long.mkv", Clip::VideoClip, PrimaryTrack, 6000, 4000},
        {"film.mp4", Clip::AudioClip, NativeAudioTrack, 0, 2000},
        {"long.mkv", Clip::AudioClip, NativeAudioTrack, 6000, 4000},
        {"speech.wav", Clip::AudioClip, AudioTrack, 0, 1500},
    };
    for (std::size_t i = 0; i != outline.clips().size(); ++i) {
        const auto& [name, type, track, start, length] = expected[i];
        const Clip* const clip = outline.clips()[i];
        const ClipTiming& timing = timeline.clipTiming(clip);
        EXPECT_EQ(clip->name, name);
        EXPECT_EQ(clip->type, type);
        EXPECT_EQ(clip->timeline, &timeline);
        EXPECT_EQ(clip->sourceDuration, MTime(length));
        EXPECT_EQ(QFileInfo(clip->file->path), QFileInfo(sample(name)));
        EXPECT_TRUE(QFileInfo(clip->file->path).isAbsolute());
        EXPECT_EQ(timing.track->type, track);
        EXPECT_EQ(timing.timestamp, MTime(start)) << name;
        EXPECT_EQ(timing.duration, MTime(length)) << name;
    }
    EXPECT_EQ(timeline.masterOf(clipAt(document, 4)), clipAt(document, 1));
    EXPECT_EQ(timeline.masterOf(clipAt(document, 5)), clipAt(document, 3));
    EXPECT_EQ(clipAt(document, 4)->mediaTrack, 1);
    EXPECT_EQ(timeline.links.size(), 2u);
    for (const Timeline::Track* track : timeline.tracks) {
        EXPECT_EQ(track->timeline, &timeline);
    }
}

TEST(NewCommand, TakesCoverArtForNoPicture)
{
    const Folder folder;
    ASSERT_EQ(editormodel({"new", folder.path("a.xml"), "--media", sample("song.mp3")}).exitCode, 0);
    const ProjectDocument document = ProjectDocument::load(folder.path("a.xml"));
    ASSERT_EQ(document.timeline().clips.size(), 1u);
    EXPECT_EQ(clipAt(document, 1)->type, Clip::AudioClip);
    EXPECT_EQ(timingAt(document, 1).track->type, AudioTrack);
}

TEST(NewCommand, TellsOfEachFileThatItCannotTakeAndMakesNoProjectThen)
{
    const Folder folder;
    folder.copy("film.mp4", "cut.mp4", 0.5);
    folder.copy("speech.wav", "good.wav");
    const Outcome outcome =
        editormodel({"new", "a.bin", "--media", "good.wav", "missing.mp4", "cut.mp4", "."}, folder.path());
    EXPECT_EQ(outcome.exitCode, 1);
    EXPECT_EQ(outcome.errors, "missing.mp4: does not exist\n"
                              "cut.mp4: looks like QuickTime / MOV but is damaged or incomplete\n"
                              ".: is a folder\n");
    EXPECT_FALSE(QFile::exists(folder.path("a.bin")));
}

TEST(NewCommand, ReplacesNoFile)
{
    const Folder folder;
    folder.write("a.json", "precious");
    const Outcome outcome = editormodel({"new", "a.json", "--media", sample("speech.wav")}, folder.path());
    EXPECT_EQ(outcome.exitCode, 1);
    EXPECT_EQ(outcome.errors, "a.json: exists already\n");
    EXPECT_EQ(contentOf(folder.path("a.json")), "precious");
    EXPECT_EQ(editormodel({"new", "a.doc", "--media", sample("speech.wav")}).exitCode, 2);
    EXPECT_EQ(editormodel({"new", "b.json"}).exitCode, 2);
    const Outcome unwritten = editormodel({"new", "/no/such/folder/a.json", "--media", sample("speech.wav")});
    EXPECT_EQ(unwritten.exitCode, 1);
    EXPECT_THAT(unwritten.errors, HasSubstr("/no/such/folder/a.json"));
}

TEST(NewCommand, ListsItsMediaInTheCollectionAndInTheTableOfResources)
{
    const Folder folder;
    const QString path = folder.path("a.json");
    const Outcome outcome = editormodel(
        {"new", path, "--media", "film.mp4", "speech.wav", "film.mp4", "picture.png"}, sample(""));
    EXPECT_EQ(outcome.exitCode, 0);
    EXPECT_THAT(outcome.errors, IsEmpty());

    const Host::OpenedProject project = Host::ProjectStore::open(path);
    const Project::Content& content = project.content();
    std::vector<std::pair<QString, int>> items;
    for (const Import::Object* const item : content.userCollection->items) {
        EXPECT_EQ(item->location(), sample(item->tag));
        EXPECT_EQ(item->category, "user_files");
        items.emplace_back(item->tag, item->kind);
    }
    EXPECT_THAT(items,
                ElementsAre(std::make_pair(QString("film.mp4"), 1), std::make_pair(QString("speech.wav"), 2),
                            std::make_pair(QString("picture.png"), 3)));

    // Two tracks of the film, and one of each of the others.
    std::multiset<QString> paths;
    for (const auto& entry : content.resourceTable->resource2fileInfo) {
        paths.insert(entry.second.info.path);
    }
    EXPECT_EQ(paths, (std::multiset<QString>{sample("film.mp4"), sample("film.mp4"), sample("speech.wav"),
                                             sample("picture.png")}));

    // The film lies there twice, each time with its sound, and is described once.
    EXPECT_THAT(content.timeline->clips, SizeIs(6));
    std::set<const Media::File*> files;
    for (const auto& entry : content.timeline->clips) {
        files.insert(entry.first->file);
    }
    EXPECT_THAT(files, SizeIs(3));
}

} // namespace
