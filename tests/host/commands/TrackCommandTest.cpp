// SPDX-License-Identifier: Apache-2.0
#include "Command.h"
#include "tests/host/shared/Samples.h"

#include "host/analysis/TrackingStore.h"
#include "host/project/ProjectDocument.h"
#include "host/timeline/TimelineOutline.h"

#include <EditorModel/analysis/MotionTracking.h>
#include <EditorModel/persistence/Document.h>

#include <gmock/gmock.h>

namespace {

using namespace HostTests;
using Host::ProjectDocument;
using Host::TrackingStore;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::StartsWith;

/// A project of a patch of 40 x 32 in a picture of 160 x 120, which is at (22 + 2 n, 31 + n) in picture n of
/// 25 in a second, and of a picture.
class TrackCommand : public testing::Test
{
protected:
    TrackCommand()
    {
        EXPECT_EQ(
            editormodel({"new", path(), "--media", "patch.mkv", "picture.png", "speech.wav"}, sample(""))
                .errors,
            "");
    }

    QString path() const { return m_folder.path("film.json"); }
    static QStringList patch() { return {"0.1375", "0.258334", "0.25", "0.266667"}; }
    Outcome track(const QString& clip, const QStringList& more = patch()) const
    {
        return editormodel(QStringList{"track", path(), clip} + more);
    }

    const Folder m_folder{};
};

TEST_F(TrackCommand, FollowsAPatchThroughAClip)
{
    const Outcome outcome = track("patch.mkv", patch() << "--id"
                                                       << "patch");
    EXPECT_EQ(outcome.exitCode, 0);
    EXPECT_THAT(outcome.errors, IsEmpty());
    EXPECT_EQ(outcome.output, "patch: 25 places from 0 s to 1 s\n");

    TrackingStore trackings;
    const ProjectDocument document = ProjectDocument::load(path());
    const Host::TimelineOutline outline(document.timeline());
    EXPECT_THAT(outline.clips().front()->motionTrackings, ElementsAre("patch"));
    EXPECT_FALSE(outline.clips().front()->hasLostMotionTracking());
    const auto data = trackings.find("patch");
    ASSERT_TRUE(data);
    const auto end = data->findFrame(999, false);
    ASSERT_NE(end, data->frames.end());
    EXPECT_NEAR(end->second.left, (22 + 2 * 24) / 160.0, 1e-9);
    EXPECT_NEAR(end->second.top, (31 + 24) / 120.0, 1e-9);
}

TEST_F(TrackCommand, FollowsWhatTheClipShowsOfItsSource)
{
    ASSERT_EQ(editormodel({"edit", path(), "trim-left", "1", "0.2", "then", "trim-right", "1", "0.6"}).errors,
              "");
    // The patch of the sixth picture.
    const Outcome outcome = track("1", {"0.2", "0.3", "0.25", "0.266667", "--id", "part"});
    EXPECT_THAT(outcome.errors, IsEmpty());
    TrackingStore trackings;
    const ProjectDocument document = ProjectDocument::load(path());
    const auto data = trackings.find("part");
    ASSERT_TRUE(data);
    EXPECT_EQ(data->frames.begin()->first, MTime(200));
    EXPECT_LE(data->frames.rbegin()->first, MTime(600));
    EXPECT_GE(data->frames.rbegin()->first, MTime(560));
    EXPECT_NEAR(data->frames.begin()->second.left, 32 / 160.0, 1e-9);
    EXPECT_NEAR(data->frames.at(400).left, (22 + 2 * 10) / 160.0, 1e-9);
}

TEST_F(TrackCommand, LetsTitlesFollowAndKeepsTheTrackingsOfAPlainDocument)
{
    const ProjectDocument project = ProjectDocument::load(path());
    const QString plain = m_folder.path("plain.bin");
    Document::saveFile(plain, {&project.timeline()}, Document::Binary, Document::Stream);
    for (const char* const id : {"one", "two"}) {
        EXPECT_EQ(editormodel(QStringList{"track", plain, "1"} + patch() + QStringList{"--id", id}).errors,
                  "");
    }
    TrackingStore trackings;
    trackings.load(TrackingStore::folderOf(plain));
    EXPECT_THAT(trackings.ids(), ElementsAre("one", "two"));
    EXPECT_EQ(editormodel({"edit", plain, "title", "tag", "0.1", "0.5", "then", "follow", "tag", "1", "two"})
                  .errors,
              "");
    EXPECT_EQ(editormodel({"check", plain}).output, "No faults.\n");
}

TEST_F(TrackCommand, GivesANewNameToWhatHasNone)
{
    const Outcome first = track("1");
    const Outcome second = track("1");
    const QString id = QString::fromStdString(first.output).section(':', 0, 0);
    EXPECT_FALSE(id.isEmpty());
    EXPECT_NE(first.output, second.output);
    const ProjectDocument document = ProjectDocument::load(path());
    const auto& ids = Host::TimelineOutline(document.timeline()).clips().front()->motionTrackings;
    EXPECT_EQ(ids.size(), 2u);
    EXPECT_EQ(ids.count(id), 1u);
}

TEST_F(TrackCommand, RefusesInOneLineAndLeavesTheProjectAsItIs)
{
    const QByteArray before = contentOf(path());
    for (const auto& [outcome, error] :
         {std::pair(track("nobody"), "track: there is no clip \"nobody\"\n"),
          std::pair(track("patch.mkv", {"0.9", "0", "0.2", "0.2"}),
                    "patch.mkv: cannot be searched for a rectangle that is not within its pictures\n"),
          std::pair(track("speech.wav"), "speech.wav: ")}) {
        EXPECT_EQ(outcome.exitCode, 1);
        EXPECT_THAT(outcome.output, IsEmpty());
        EXPECT_THAT(outcome.errors, StartsWith(error));
        EXPECT_EQ(std::count(outcome.errors.begin(), outcome.errors.end(), '\n'), 1);
    }
    EXPECT_EQ(contentOf(path()), before);
    EXPECT_EQ(track("1", {"0", "0", "1"}).exitCode, 2);
    EXPECT_EQ(track("1", {"a", "b", "c", "d"}).exitCode, 2);
}

} // namespace
