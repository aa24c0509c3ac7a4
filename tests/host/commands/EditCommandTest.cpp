// SPDX-License-Identifier: Apache-2.0
#include "FilmProject.h"
#include "tests/host/shared/Samples.h"

#include "host/project/ProjectDocument.h"
#include "host/timeline/TimelineOutline.h"

#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Transition.h>
#include <EditorModel/library/ImportObject.h>
#include <EditorModel/library/UserObject.h>
#include <EditorModel/media/File.h>
#include <EditorModel/media/ResourceTable.h>

#include <QFileInfo>

#include <gmock/gmock.h>

#include <algorithm>

namespace {

using namespace HostTests;
using Host::ProjectDocument;
using testing::AllOf;
using testing::EndsWith;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::StartsWith;
using Timeline::Clip;
using Timeline::ClipTiming;

TEST(EditCommand, AddsFiles)
{
    const FilmProject project;
    const ProjectDocument appended = project.edited("add speech.wav");
    EXPECT_EQ(timingAt(appended, 7).timestamp, MTime(1500));
    // The clips behind make room, with their sound.
    const ProjectDocument inserted = project.edited("add film.mp4 2");
    EXPECT_EQ(clipAt(inserted, 2)->name, "film.mp4");
    EXPECT_EQ(timingAt(inserted, 2).timestamp, MTime(2000));
    EXPECT_EQ(timingAt(inserted, 3).timestamp, MTime(4000));
    EXPECT_EQ(timingAt(inserted, 4).timestamp, MTime(8000));
    EXPECT_EQ(timingAt(inserted, 7).timestamp, MTime(8000));
}

TEST(EditCommand, MovesClips)
{
    const FilmProject project;
    const ProjectDocument moved = project.edited("move long.mkv 7.5");
    EXPECT_EQ(timingAt(moved, 3).timestamp, MTime(7500));
    EXPECT_EQ(timingAt(moved, 5).timestamp, MTime(7500));
    const ProjectDocument raised = project.edited("move 6 0:03 3 1");
    EXPECT_EQ(timingAt(raised, 6).timestamp, MTime(3000));
    EXPECT_EQ(timingAt(raised, 6).trackLevel, 1);
}

TEST(EditCommand, TrimsClipsToATime)
{
    const FilmProject project;
    const ProjectDocument right = project.edited("trim-right film.mp4 1.25");
    EXPECT_EQ(timingAt(right, 1).duration, MTime(1250));
    EXPECT_EQ(timingAt(right, 4).duration, MTime(1250));
    EXPECT_EQ(timingAt(right, 2).timestamp, MTime(2000));
    const ProjectDocument left = project.edited("trim-left 3 0:00:07");
    EXPECT_EQ(timingAt(left, 3).timestamp, MTime(7000));
    EXPECT_EQ(timingAt(left, 3).sourcePosition, MTime(1000));
    EXPECT_EQ(timingAt(left, 3).duration, MTime(3000));
    const ProjectDocument rippled = project.edited("trim-right 2 5000ms ripple");
    EXPECT_EQ(timingAt(rippled, 2).duration, MTime(3000));
    EXPECT_EQ(timingAt(rippled, 3).timestamp, MTime(6000));
}

TEST(EditCommand, SplitsClips)
{
    const FilmProject project;
    const ProjectDocument document = project.edited("split long.mkv 7.5");
    ASSERT_EQ(document.timeline().clips.size(), 8u);
    EXPECT_EQ(timingAt(document, 3).end(), MTime(7500));
    EXPECT_EQ(timingAt(document, 4).timestamp, MTime(7500));
    EXPECT_EQ(timingAt(document, 4).end(), MTime(10000));
    EXPECT_EQ(timingAt(document, 4).sourcePosition, MTime(1500));
    EXPECT_EQ(document.timeline().masterOf(clipAt(document, 7)), clipAt(document, 4));
}

TEST(EditCommand, ChangesSpeedAndDirection)
{
    const FilmProject project;
    const ProjectDocument document = project.edited("speed 3 2 then reverse 3");
    EXPECT_EQ(timingAt(document, 3).duration, MTime(2000));
    EXPECT_TRUE(timingAt(document, 3).reversed);
    EXPECT_DOUBLE_EQ(document.timeline().clipSpeed(clipAt(document, 3)), 2.0);
}

TEST(EditCommand, SetsFades)
{
    const FilmProject project;
    const ProjectDocument document = project.edited("fade-in speech.wav 0.5 , fade-out speech.wav 250ms");
    EXPECT_EQ(timingAt(document, 6).fadeInDuration, MTime(500));
    EXPECT_EQ(timingAt(document, 6).fadeOutDuration, MTime(250));
}

TEST(EditCommand, SwitchesClipsAndSetsTheirVolume)
{
    const FilmProject project;
    const ProjectDocument off = project.edited("disable long.mkv then disable picture.png , disable 4");
    for (const int number : {2, 3, 4, 5}) {
        EXPECT_FALSE(clipAt(off, number)->enabled) << number;
    }
    EXPECT_TRUE(clipAt(off, 1)->enabled);
    EXPECT_TRUE(clipAt(off, 6)->enabled);
    EXPECT_THAT(editormodel({"show", project.path()}).output, HasSubstr("disabled"));
    // A clip that an edit has made can be switched as well.
    const ProjectDocument on = project.edited("enable 3 then split 3 8 then disable 7");
    EXPECT_TRUE(clipAt(on, 3)->enabled);
    EXPECT_FALSE(clipAt(on, 4)->enabled);
    EXPECT_EQ(timingAt(on, 4).timestamp, MTime(8000));
    const ProjectDocument loud = project.edited("volume speech.wav 35 then volume film.mp4 120");
    EXPECT_EQ(clipAt(loud, 8)->volume, 35);
    EXPECT_EQ(clipAt(loud, 5)->volume, 120);
    EXPECT_EQ(clipAt(loud, 1)->volume, 100);
}

TEST(EditCommand, AddsAndRemovesTransitions)
{
    const FilmProject project;
    const ProjectDocument between = project.edited("transition add 1 2 1 wipe");
    const Transition::Object* const wipe =
        between.timeline().transitionOf(clipAt(between, 1), clipAt(between, 2));
    ASSERT_TRUE(wipe);
    EXPECT_EQ(wipe->tag, "wipe");
    EXPECT_EQ(timingAt(between, 1).transitionOut, MTime(500));
    EXPECT_EQ(timingAt(between, 2).transitionIn, MTime(500));
    // A transition of one clip takes half of the default of two seconds.
    const ProjectDocument into = project.edited("transition add - 1 then transition add 3 -");
    EXPECT_EQ(timingAt(into, 1).transitionIn, MTime(1000));
    EXPECT_EQ(timingAt(into, 3).transitionOut, MTime(1000));
    EXPECT_EQ(into.timeline().transitions.size(), 3u);
    const ProjectDocument removed = project.edited("transition remove 1 then transition remove 3");
    ASSERT_EQ(removed.timeline().transitions.size(), 1u);
    EXPECT_EQ(removed.timeline().transitions.begin()->first->tag, "wipe");
}

TEST(EditCommand, AddsMovesAndRemovesTracks)
{
    const FilmProject project;
    const ProjectDocument added = project.edited("track add audio then track add extra-video");
    ASSERT_EQ(added.timeline().tracks.size(), 5u);
    EXPECT_EQ(added.timeline().tracks[3]->type, AudioTrack);
    EXPECT_EQ(added.timeline().tracks[4]->type, ExtraVideoTrack);
    const ProjectDocument moved = project.edited("track move 4 3");
    EXPECT_TRUE(moved.timeline().isTrackEmpty(moved.timeline().tracks[2]));
    EXPECT_FALSE(moved.timeline().isTrackEmpty(moved.timeline().tracks[3]));
    const ProjectDocument removed = project.edited("track remove 4");
    EXPECT_EQ(removed.timeline().tracks.size(), 4u);
    EXPECT_EQ(removed.timeline().clips.size(), 5u);
}

TEST(EditCommand, LinksAndUnlinksClips)
{
    const FilmProject project;
    const ProjectDocument linked = project.edited("link 3 6");
    EXPECT_EQ(linked.timeline().masterOf(clipAt(linked, 6)), clipAt(linked, 3));
    const ProjectDocument unlinked = project.edited("unlink 6");
    EXPECT_FALSE(unlinked.timeline().isSlave(clipAt(unlinked, 6)));
}

TEST(EditCommand, DeletesClips)
{
    const FilmProject project;
    const ProjectDocument lifted = project.edited("delete film.mp4");
    ASSERT_EQ(lifted.timeline().clips.size(), 4u);
    EXPECT_EQ(timingAt(lifted, 1).timestamp, MTime(2000));
    const ProjectDocument extracted = project.edited("extract picture.png");
    EXPECT_EQ(clipAt(extracted, 1)->name, "long.mkv");
    EXPECT_EQ(timingAt(extracted, 1).timestamp, MTime(2000));
}

TEST(EditCommand, NumbersWhatItMakesBehindWhatTheDocumentHad)
{
    const FilmProject project;
    // The right part and its sound are 7 and 8; the numbers of the others stay.
    const ProjectDocument document = project.edited("split 3 8 then delete 1 then delete 7 then fade-in 6 1");
    EXPECT_EQ(document.timeline().clips.size(), 4u);
    EXPECT_EQ(document.timeline().duration(), MTime(8000));
}

TEST(EditCommand, RefusesInOneLineAndLeavesTheDocumentAsItIs)
{
    const FilmProject project;
    const QByteArray before = contentOf(project.path());
    const std::pair<const char*, const char*> wrong[] = {
        {"split 3 5", "split 3 5: "},
        {"split 3 6.005", "split 3 6.005: "},
        {"trim-right 1 3", "trim-right 1 3: "},
        {"trim-left 4 1", "trim-left 4 1: "},
        {"move 1 3", "move 1 3: "},
        {"speed 1 0", "speed 1 0: "},
        {"speed 1 fast", "speed 1 fast: \"fast\" is no speed: 2 and 0.5 are\n"},
        {"fade-in 6 2", "fade-in 6 2: "},
        {"volume 6 -1", "volume 6 -1: \"-1\" is no volume: whole percents are, from 0 on\n"},
        {"volume 6 12.5", "volume 6 12.5: \"12.5\" is no volume: "},
        {"volume 2 50",
         "volume 2 50: The clip \"picture.png\" at 00:00:02.000 has no sound, and so no volume.\n"},
        {"enable nobody", "enable nobody: there is no clip \"nobody\"\n"},
        {"disable 1 2", "disable 1 2: has a word too many\n"},
        {"transition add 1 3", "transition add 1 3: "},
        {"transition add 1 2 0", "transition add 1 2 0: \"0\" is no length of a transition\n"},
        {"transition remove 1", "transition remove 1: there is no transition \"1\"\n"},
        {"track move 1 2", "track move 1 2: "},
        {"track add fish", "track add fish: \"fish\" is no role of a track: "},
        {"track remove 9", "track remove 9: there is no track \"9\"\n"},
        {"link 1 1", "link 1 1: "},
        {"delete 0", "delete 0: there is no clip \"0\"\n"},
        {"delete nobody", "delete nobody: there is no clip \"nobody\"\n"},
        {"split 1 noon", "split 1 noon: \"noon\" is no time: 1:02.5, 62.5 and 62500ms are\n"},
        {"move 1 3 1 high", "move 1 3 1 high: \"high\" is no level\n"},
        {"trim-right 1 1 gently", "trim-right 1 1 gently: \"gently\" is not understood: \"ripple\" may"},
        {"split 1", "split 1: lacks a word\n"},
        {"reverse 1 2", "reverse 1 2: has a word too many\n"},
        {"frobnicate 1", "frobnicate 1: is no edit; "},
        {"add nobody.mp4", "add nobody.mp4: nobody.mp4 does not exist\n"},
        {"delete 1 then delete 1", "delete 1: there is no clip \"1\"\n"},
        {"delete 6 then split 1 9", "split 1 9: "},
        {"delete 6 then", "\"\": is no edit; "},
    };
    for (const auto& [words, error] : wrong) {
        const Outcome outcome = project.edit(words);
        EXPECT_EQ(outcome.exitCode, 1) << words;
        EXPECT_THAT(outcome.output, IsEmpty()) << words;
        EXPECT_THAT(outcome.errors, AllOf(StartsWith(error), EndsWith("\n")));
        EXPECT_EQ(std::count(outcome.errors.begin(), outcome.errors.end(), '\n'), 1) << outcome.errors;
        EXPECT_EQ(contentOf(project.path()), before) << words;
    }
    project.edited("add speech.wav");
    EXPECT_EQ(project.edit("delete speech.wav").errors,
              "delete speech.wav: there are several clips \"speech.wav\": give the number of one\n");
}

TEST(EditCommand, TellsInOneLineThatThereIsNoTimeline)
{
    const Folder folder;
    const Media::File file;
    Document::saveFile(folder.path("file.json"), {&file}, Document::Json, Document::Stream);
    folder.write("letter.json", "Dear Sir or Madam,\n");
    for (const auto& [name, error] : {std::pair("missing.json", "missing.json: does not exist\n"),
                                      std::pair("letter.json", "letter.json: "),
                                      std::pair("file.json", "file.json: holds no timeline, but File\n")}) {
        const Outcome outcome = editormodel({"edit", name, "delete", "1"}, folder.path());
        EXPECT_EQ(outcome.exitCode, 1);
        EXPECT_THAT(outcome.errors, StartsWith(error));
        EXPECT_EQ(std::count(outcome.errors.begin(), outcome.errors.end(), '\n'), 1) << outcome.errors;
    }
    EXPECT_EQ(editormodel({"edit", "a.json"}).exitCode, 2);
    EXPECT_THAT(editormodel({"edit", "--help"}).output,
                AllOf(HasSubstr("split CLIP TIME"), HasSubstr("transition add"), EndsWith("\n")));
}

TEST(EditCommand, KeepsWhatElseTheDocumentHolds)
{
    const FilmProject project;
    const Folder folder;
    Media::File file;
    file.setPath("other.wav");
    const ProjectDocument document = ProjectDocument::load(project.path());
    Document::saveFile(folder.path("both.bin"), {&file, &document.timeline()}, Document::Binary,
                       Document::Stream);
    ASSERT_EQ(editormodel({"edit", folder.path("both.bin"), "delete", "6"}).exitCode, 0);
    const Document::Graph graph = Document::loadFile(folder.path("both.bin"), Document::ForeignDocuments);
    ASSERT_EQ(graph.roots().size(), 2u);
    ASSERT_TRUE(graph.rootAs<Media::File>());
    EXPECT_EQ(graph.rootAs<Media::File>()->path, "other.wav");
    EXPECT_EQ(Host::timelineOf(graph)->clips.size(), 5u);
}

TEST(EditCommand, TakesTitlesFromPackagesThatAreSound)
{
    const FilmProject project;
    const QString starter = QString(HOST_PACKAGES "/starter");
    const QStringList title = {"title", "starter.opening-title=The film", "0.5", "1"};
    const QStringList edit = {"edit", project.path(), "--packages", starter};
    EXPECT_EQ(editormodel(edit + title).errors, "");
    const ProjectDocument document = ProjectDocument::load(project.path());
    const Timeline::Object& timeline = document.timeline();
    const auto titles = timeline.clipsAt(timeline.titleTrack());
    ASSERT_EQ(titles.size(), 1u);
    EXPECT_EQ((*titles.begin())->name, "The film");
    EXPECT_EQ((*titles.begin())->overlay->items.front().text, "The film");

    const Folder folder;
    folder.write("package.json", "{}");
    const QByteArray before = contentOf(project.path());
    const Outcome outcome =
        editormodel(QStringList{"edit", project.path(), "--packages", folder.path()} + title);
    EXPECT_EQ(outcome.exitCode, 1);
    EXPECT_THAT(outcome.errors,
                StartsWith(QFileInfo(folder.path()).fileName().toStdString() + ": package.json: "));
    EXPECT_EQ(contentOf(project.path()), before);

    const Folder empty;
    EXPECT_EQ(editormodel(QStringList{"edit", project.path(), "--packages", empty.path()} + title).errors,
              empty.path().toStdString() + ": holds no package\n");
    EXPECT_EQ(contentOf(project.path()), before);
}

TEST(EditCommand, ListsAddedMediaInTheWholeProject)
{
    const FilmProject project;
    const ProjectDocument document = project.edited("add picture.jpg");
    std::vector<QString> items;
    for (const Import::Object* item : document.project()->userCollection->items) {
        items.push_back(item->tag);
    }
    EXPECT_THAT(items,
                testing::ElementsAre("film.mp4", "picture.png", "long.mkv", "speech.wav", "picture.jpg"));
    const auto& table = document.project()->resourceTable->resource2fileInfo;
    EXPECT_TRUE(std::any_of(table.begin(), table.end(), [](const auto& entry) {
        return entry.second.info.path == sample("picture.jpg");
    }));
}

} // namespace
