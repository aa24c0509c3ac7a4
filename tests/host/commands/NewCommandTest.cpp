// SPDX-License-Identifier: Apache-2.0
#include "tests/host/commands/Command.h"
#include "tests/host/shared/Samples.h"

#include "host/media/CollectionKeeper.h"
#include "host/project/ProjectStore.h"

#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/timeline/Timeline.h>

namespace {

using namespace HostTests;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

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
