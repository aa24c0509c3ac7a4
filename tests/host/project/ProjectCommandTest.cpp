// SPDX-License-Identifier: Apache-2.0
#include "SmallProject.h"
#include "tests/host/commands/Command.h"
#include "tests/host/shared/SampleTimeline.h"
#include "tests/host/shared/Samples.h"

#include "host/media/MediaTable.h"
#include "host/media/ResourceText.h"
#include "host/project/ProjectDocument.h"
#include "host/timeline/TimelineTable.h"

#include <EditorModel/media/File.h>

#include <QFileInfo>

#include <gmock/gmock.h>

namespace {

using namespace HostTests;
using Host::ProjectStore;
using testing::HasSubstr;
using testing::IsEmpty;
using Timeline::Clip;

/// Two clips, one of which shows another timeline with a clip; both have files.
class SampleProject
{
public:
    SampleProject()
    {
        files.resize(2);
        files[0].setPath("b.mov");
        files[1].setPath("a.wav");
        const Timeline::Track* const primary = outer.addTrack(PrimaryTrack);
        outer.addClip("film", Clip::VideoClip, primary, 0, 4000)->setFile(&files[0]);
        outer.addClip("nest", Clip::VideoClip, primary, 4000, 500)->nestedTimeline = &inner.timeline;
        inner.addClip("sound", Clip::AudioClip, inner.addTrack(AudioTrack), 0, 500)->setFile(&files[1]);
        local.tag = "Trailer";
        local.category = "user_files";
        local.setLocation("/films/trailer.mov");
        remote.tag = "Beach";
        remote.setRemoteUrl("https://example.org/beach.mov");
        remote.setRemoteSize(1500000);
        collection.items = {&local, &remote, &local};
        table.resource2fileInfo[{"film", Resource::VideoType}].info.path = "b.mov";
        content.timeline = &outer.timeline;
        content.userCollection = &collection;
        content.resourceTable = &table;
        content.portable = true;
    }
    SampleProject(const SampleProject&) = delete;

    SampleTimeline outer;
    SampleTimeline inner;
    std::deque<Media::File> files;
    Import::Object local;
    Import::Object remote;
    EditorCollection::UserObject collection;
    ResourceTable::Object table;
    Project::Content content;
};

class ProjectCommands : public testing::TestWithParam<const char*>
{
protected:
    QString path() const { return m_folder.path(QString("film.") + GetParam()); }

    const Folder m_folder{};
    const SampleProject m_project;
};
INSTANTIATE_TEST_SUITE_P(Forms, ProjectCommands, testing::Values("json", "xml", "bin"),
                         [](const auto& form) { return std::string(form.param); });

TEST_P(ProjectCommands, ShowAllThatAProjectHolds)
{
    ProjectStore::save(m_project.content, path());
    const Outcome shown = editormodel({"show", path()});
    EXPECT_EQ(shown.exitCode, 0);
    EXPECT_THAT(shown.errors, IsEmpty());
    EXPECT_EQ(shown.output, "Timeline    2 clips on 1 track, 00:00:04.500\n"
                            "Media       2 files\n"
                            "Collection  3 items\n"
                            "Resources   1\n"
                            "Portable    yes\n"
                            "\n" +
                                Host::timelineTable(m_project.outer.timeline) + "\n" +
                                Host::mediaTable({&m_project.files[1], &m_project.files[0]}) +
                                "\n"
                                "Item     Category      Size  From\n"
                                "Trailer  user_files       -  /films/trailer.mov\n"
                                "Beach                1.5 MB  https://example.org/beach.mov\n"
                                "Trailer  user_files       -  /films/trailer.mov\n"
                                "\n" +
                                Host::resourceText(m_project.table));
}

TEST_P(ProjectCommands, ShowWhatAnEmptyProjectLacks)
{
    ProjectStore::save(Project::Content(), path());
    EXPECT_EQ(editormodel({"show", path()}).output, "Timeline    none\n"
                                                    "Media       0 files\n"
                                                    "Collection  none\n"
                                                    "Resources   none\n"
                                                    "Portable    no\n");
    const Outcome edited = editormodel({"edit", path(), "delete", "1"});
    EXPECT_EQ(edited.exitCode, 1);
    EXPECT_EQ(edited.errors, path().toStdString() + ": holds no timeline, but Project::Content\n");
}

TEST_P(ProjectCommands, EditATimelineAndKeepTheRestOfTheProject)
{
    ProjectStore::save(m_project.content, path());
    ASSERT_EQ(editormodel({"edit", path(), "delete", "film"}).errors, "");
    const Host::OpenedProject edited = ProjectStore::open(path());
    EXPECT_EQ(edited.content().timeline->clips.size(), 1u);
    EXPECT_EQ(edited.content().userCollection->items.size(), 3u);
    EXPECT_EQ(edited.content().resourceTable->resource2fileInfo.size(), 1u);
    EXPECT_TRUE(edited.content().portable);
    EXPECT_EQ(ProjectStore::openBackup(path()).content().timeline->clips.size(), 2u);
    EXPECT_EQ(editormodel({"picture", path(), m_folder.path("film.svg")}).errors, "");
    EXPECT_TRUE(contentOf(m_folder.path("film.svg")).contains("nest"));
}

TEST_P(ProjectCommands, SaveNothingOverWhatAnotherHasSavedMeanwhile)
{
    ProjectStore::save(m_project.content, path());
    Document::saveFile(m_folder.path("plain.json"), {&m_project.outer.timeline}, Document::Json,
                       Document::Stream);
    for (const QString& place : {path(), m_folder.path("plain.json")}) {
        auto slow = Host::ProjectDocument::load(place);
        auto quick = Host::ProjectDocument::load(place);
        quick.timeline().removeClip(quick.timeline().clips.begin()->first);
        quick.save();
        EXPECT_ANY_THROW(slow.save());
        EXPECT_EQ(Host::ProjectDocument::load(place).timeline().clips.size(), 1u);
        // What it has saved itself is no reason.
        quick.timeline().clearClips();
        quick.save();
        EXPECT_EQ(Host::ProjectDocument::load(place).timeline().clips.size(), 0u);
    }
}

TEST_P(ProjectCommands, NameTheBackupOfADamagedProjectAndShowIt)
{
    SmallProject(1).save(path());
    ProjectStore::save(m_project.content, path());
    m_folder.write(QFileInfo(path()).fileName(), contentOf(path()).replace("Trailer", "Trailor"));
    for (const QStringList& command :
         {QStringList({"show", path()}), QStringList({"edit", path(), "delete", "1"}),
          QStringList({"picture", path(), m_folder.path("film.png")})}) {
        const Outcome outcome = editormodel(command);
        EXPECT_EQ(outcome.exitCode, 1);
        EXPECT_THAT(outcome.output, IsEmpty());
        EXPECT_THAT(outcome.errors, HasSubstr("it is damaged: its content does not fit its checksum; its "
                                              "backup " +
                                              path().toStdString() + ".backup can be opened\n"));
    }
    EXPECT_THAT(editormodel({"show", path() + ".backup"}).output, HasSubstr("Collection  1 item\n"));
}

} // namespace
