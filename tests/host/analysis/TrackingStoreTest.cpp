// SPDX-License-Identifier: Apache-2.0
#include "tests/host/shared/Samples.h"

#include "host/analysis/TrackingStore.h"
#include "host/project/ProjectContexts.h"
#include "host/project/ProjectStore.h"

#include <EditorModel/persistence/Document.h>
#include <EditorModel/timeline/Timeline.h>

#include <QDir>
#include <QFileInfo>

#include <gmock/gmock.h>

#include <set>

namespace {

using namespace HostTests;
using Host::TrackingStore;
using MotionTracking::Data;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

Data tracking(const QString& id, double left)
{
    Data data(id);
    MotionTracking::TimedFrame& frame = data.frames[MTime(40)];
    frame.left = left;
    frame.width = 0.25;
    frame.duration = 40;
    return data;
}

TEST(TrackingStore, AnswersForWhatItHolds)
{
    TrackingStore store;
    store.put(tracking("face", 0.5));
    MotionTracking::Helper asker;
    EXPECT_TRUE(asker.isAvailable("face"));
    ASSERT_TRUE(asker.data);
    EXPECT_EQ(*asker.data, tracking("face", 0.5));
    MotionTracking::Helper other;
    EXPECT_FALSE(other.isAvailable("hand"));
    EXPECT_FALSE(other.data);
}

TEST(TrackingStore, DataThatWasHandedOutStaysAsItIs)
{
    TrackingStore store;
    store.put(tracking("face", 0.5));
    MotionTracking::Helper asker;
    asker.isAvailable("face");
    store.put(tracking("face", 0.25));
    EXPECT_EQ(asker.data->frames.at(40).left, 0.5);
    EXPECT_EQ(store.find("face")->frames.at(40).left, 0.25);
    store.remove("face");
    EXPECT_EQ(asker.data->frames.at(40).left, 0.5);
    EXPECT_FALSE(store.find("face"));
}

TEST(TrackingStore, AClipLosesATrackingThatIsRemoved)
{
    Timeline::Clip clip;
    clip.addMotionTracking("face")->addMotionTracking("hand");
    TrackingStore store;
    store.put(tracking("face", 0));
    EXPECT_TRUE(clip.hasLostMotionTracking());
    store.put(tracking("hand", 0));
    EXPECT_FALSE(clip.hasLostMotionTracking());
    store.remove("face");
    EXPECT_TRUE(clip.hasLostMotionTracking());
}

TEST(TrackingStore, AnyTextIsAnIdentifier)
{
    const QStringList ids = {"",
                             "face",
                             "Face",
                             "FACE",
                             "../face",
                             "a/b",
                             "a_b",
                             "a_005fb",
                             "a~b",
                             ".",
                             "nul",
                             " ",
                             "\n",
                             "%2e",
                             QString::fromUtf8("Gesicht ü"),
                             QString::fromUtf8("顔"),
                             QString(QChar(0)),
                             QString(5000, 'a'),
                             QString(5001, 'a'),
                             QString(101, 'a'),
                             QString(100, 'a')};
    std::set<QString> names;
    for (const QString& id : ids) {
        const QString name = TrackingStore::fileNameOf(id);
        EXPECT_LE(name.size(), 120) << id.toStdString();
        EXPECT_FALSE(name.contains('/')) << name.toStdString();
        EXPECT_EQ(name, name.toLower());
        names.insert(name);
    }
    EXPECT_THAT(names, SizeIs(std::size_t(ids.size())));
    EXPECT_EQ(TrackingStore::fileNameOf("face-1"), "t-face-1.json");
    EXPECT_EQ(TrackingStore::fileNameOf("a_b"), "t-a_005fb.json");

    const Folder folder;
    TrackingStore store;
    for (const QString& id : ids) {
        store.put(tracking(id, 0.125));
    }
    store.save(folder.path("trackings"));
    store.load(folder.path("trackings"));
    EXPECT_THAT(store.damages(), IsEmpty());
    EXPECT_THAT(store.ids(), SizeIs(ids.size()));
    for (const QString& id : ids) {
        ASSERT_TRUE(store.find(id)) << id.toStdString();
        EXPECT_EQ(*store.find(id), tracking(id, 0.125));
    }
}

TEST(TrackingStore, KeepsWholeTimesAndDurations)
{
    const Folder folder;
    TrackingStore store;
    Data data("long");
    data.frames[MTime(qint64(1) << 40)].duration = (qint64(1) << 40) + 1;
    store.put(data);
    store.save(folder.path());
    store.load(folder.path());
    ASSERT_THAT(store.find("long")->frames, SizeIs(1));
    EXPECT_EQ(store.find("long")->frames.begin()->first, MTime(qint64(1) << 40));
    EXPECT_EQ(store.find("long")->frames.begin()->second.duration, MTime((qint64(1) << 40) + 1));
}

TEST(TrackingStore, AFolderThatIsMissingIsEmptyAndIsNotMadeForNothing)
{
    const Folder folder;
    TrackingStore store;
    store.put(tracking("old", 0));
    store.load(folder.path("none"));
    EXPECT_THAT(store.ids(), IsEmpty());
    store.save(folder.path("none"));
    EXPECT_FALSE(QFileInfo::exists(folder.path("none")));
}

TEST(TrackingStore, ATrackingThatWasRemovedLeavesTheFolder)
{
    const Folder folder;
    TrackingStore store;
    store.put(tracking("face", 0));
    store.put(tracking("hand", 0));
    store.save(folder.path());
    folder.write("notes.txt", "mine");
    store.remove("face");
    store.save(folder.path());
    EXPECT_THAT(QDir(folder.path()).entryList(QDir::Files, QDir::Name),
                ElementsAre("notes.txt", "t-hand.json"));
}

TEST(TrackingStore, NamesDamagedFilesAndLeavesThemWhereTheyAre)
{
    const Folder folder;
    TrackingStore store;
    store.put(tracking("face", 0.5));
    store.put(tracking("hand", 0.5));
    store.save(folder.path());
    const QByteArray whole = contentOf(folder.path("t-face.json"));
    folder.write("t-face.json", whole.left(whole.size() / 2));
    folder.write("t-copy.json", contentOf(folder.path("t-hand.json")));
    const Timeline::Clip clip;
    Document::saveFile(folder.path("t-clip.json"), {&clip}, Document::Json, Document::Stream);

    store.load(folder.path());
    EXPECT_THAT(store.ids(), ElementsAre("hand"));
    ASSERT_THAT(store.damages(), SizeIs(3));
    EXPECT_EQ(store.damages()[0].path, folder.path("t-clip.json"));
    EXPECT_EQ(store.damages()[0].reason, "holds no tracking, but Timeline::Clip");
    EXPECT_EQ(store.damages()[1].path, folder.path("t-copy.json"));
    EXPECT_EQ(store.damages()[1].reason, "holds the tracking \"hand\", which has another name");
    EXPECT_EQ(store.damages()[2].path, folder.path("t-face.json"));
    EXPECT_FALSE(store.damages()[2].reason.isEmpty());

    store.save(folder.path());
    EXPECT_EQ(contentOf(folder.path("t-face.json")), whole.left(whole.size() / 2));
    store.put(tracking("face", 0.75));
    store.save(folder.path());
    store.load(folder.path());
    EXPECT_EQ(store.find("face")->frames.at(40).left, 0.75);
    EXPECT_THAT(store.damages(), SizeIs(2));
}

TEST(TrackingStore, TellsThatAFolderCannotBeMade)
{
    const Folder folder;
    folder.write("file", "");
    TrackingStore store;
    store.put(tracking("face", 0));
    EXPECT_THROW(store.save(folder.path("file/trackings")), Document::Error);
}

TEST(TrackingStore, GoesWithTheProject)
{
    const Folder folder;
    const Project::Content content;
    {
        TrackingStore store;
        store.put(tracking("face", 0.5));
        Host::ProjectStore::save(content, folder.path("film.json"));
    }
    TrackingStore store;
    store.put(tracking("of another project", 0));
    const Host::OpenedProject opened = Host::ProjectStore::open(folder.path("film.json"));
    EXPECT_THAT(store.ids(), ElementsAre("face"));
    EXPECT_EQ(*store.find("face"), tracking("face", 0.5));
}

} // namespace
