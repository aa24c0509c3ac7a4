// SPDX-License-Identifier: Apache-2.0
// What a request to add files says, and what an answer.
#include "tests/media/AddingRequests.h"

#include <type_traits>

namespace {

using namespace FileAdder;
using namespace FileAdderTests;
using Timeline::Clip;
using Timeline::ClipBuildingStrategy;

static_assert(std::is_base_of_v<Message::Types::Request<FileAdder::Object>, AddMediaFiles>);
static_assert(std::is_base_of_v<Message::Types::Notification<FileAdder::Object>, AddMediaFilesResult>);
static_assert(sizeof(Asrc) == 4 && sizeof(AddedResult) == 4);
static_assert(!std::is_default_constructible_v<TimelineContext>);
static_assert(!std::is_default_constructible_v<ResourceTableContext>);
static_assert(std::is_default_constructible_v<Contexts>);
static_assert(std::is_empty_v<UserCollectionContext>);

template <class T>
constexpr bool isCopied = std::is_copy_constructible_v<T>&& std::is_copy_assignable_v<T>;
static_assert(isCopied<TimelineContext> && isCopied<UserCollectionContext> && isCopied<ResourceTableContext>);
static_assert(isCopied<Contexts> && isCopied<AddMediaFiles> && isCopied<AddMediaFilesResult>);

const Timeline::Object otherTimeline;
const ResourceTable::Object otherTable;

TEST(FileAdderTimelineContext, NamesATimelineAlone)
{
    expectContext(TimelineContext(&someTimeline), &someTimeline, nullptr, -1, 0, -1, false, 0);
    expectContext(TimelineContext(nullptr), nullptr, nullptr, -1, 0, -1, false, 0);
}

TEST(FileAdderTimelineContext, NamesALevelAndATimeOnATrack)
{
    expectContext(TimelineContext(&someTimeline, &someTrack, 2, MTime(1500)), &someTimeline, &someTrack, 1500,
                  0, 2, false, 0);
}

TEST(FileAdderTimelineContext, NamesWhatIsToLieOnATrack)
{
    expectContext(TimelineContext(&someTimeline, &someTrack, MTime(1500), Clip::OverlayClip, 2, true),
                  &someTimeline, &someTrack, 1500, 4, 2, true, 0);
    expectContext(TimelineContext(&someTimeline, nullptr, MTime(0), Clip::VideoClip, 0, false), &someTimeline,
                  nullptr, 0, 1, 0, false, 0);
}

TEST(FileAdderTimelineContext, NamesAStrategy)
{
    expectContext(TimelineContext(&someTimeline, ClipBuildingStrategy(7)), &someTimeline, nullptr, -1, 0, -1,
                  false, 7);
}

TEST(FileAdderResourceTableContext, NamesATable)
{
    const ResourceTableContext context(&someTable);
    EXPECT_EQ(context.table, &someTable);
    EXPECT_EQ(ResourceTableContext(nullptr).table, nullptr);
}

TEST(FileAdderContexts, AreAbsentAtFirst)
{
    const Contexts contexts;
    EXPECT_FALSE(contexts.timeline);
    EXPECT_FALSE(contexts.userCollection);
    EXPECT_FALSE(contexts.resourceTable);
}

TEST(FileAdderContexts, AreSetOneByOne)
{
    Contexts timeline;
    EXPECT_EQ(&timeline.setContext(fullContext()), &timeline);
    ASSERT_TRUE(timeline.timeline);
    expectFullContext(*timeline.timeline);
    EXPECT_FALSE(timeline.userCollection);
    EXPECT_FALSE(timeline.resourceTable);

    Contexts collection;
    EXPECT_EQ(&collection.setContext(UserCollectionContext()), &collection);
    EXPECT_FALSE(collection.timeline);
    EXPECT_TRUE(collection.userCollection);
    EXPECT_FALSE(collection.resourceTable);

    Contexts table;
    EXPECT_EQ(&table.setContext(ResourceTableContext(&someTable)), &table);
    EXPECT_FALSE(table.timeline);
    EXPECT_FALSE(table.userCollection);
    ASSERT_TRUE(table.resourceTable);
    EXPECT_EQ(table.resourceTable->table, &someTable);
}

TEST(FileAdderContexts, KeepTheLastOfAKind)
{
    Contexts contexts;
    contexts.setContext(fullContext()).setContext(TimelineContext(&otherTimeline));
    expectContext(*contexts.timeline, &otherTimeline, nullptr, -1, 0, -1, false, 0);
    contexts.setContext(ResourceTableContext(&someTable)).setContext(ResourceTableContext(&otherTable));
    EXPECT_EQ(contexts.resourceTable->table, &otherTable);
    contexts.setContext(UserCollectionContext()).setContext(UserCollectionContext());
    EXPECT_TRUE(contexts.userCollection);
}

TEST(FileAdderContexts, CopyWhole)
{
    const Contexts all = allContexts();
    expectAllContexts(all);
    expectAllContexts(Contexts(all));
    Contexts assigned;
    EXPECT_EQ(&(assigned = all), &assigned);
    const Contexts& itself = assigned;
    assigned = itself;
    expectAllContexts(assigned);
    assigned = Contexts();
    EXPECT_FALSE(assigned.timeline || assigned.userCollection || assigned.resourceTable);
}

TEST(FileAdderMessages, HoldWhatTheyAreMadeWith)
{
    expectRequest(AddMediaFiles(twoFiles, source(5), allContexts()));

    const AddMediaFilesResult answer(result(6), twoFiles);
    EXPECT_EQ(answer.sender, globalObject());
    EXPECT_EQ(answer.result, 6);
    EXPECT_EQ(answer.files, twoFiles);
}

TEST(FileAdderMessages, TakeTheirContextsByValue)
{
    Contexts contexts = allContexts();
    const AddMediaFiles request(twoFiles, source(5), contexts);
    contexts = Contexts();
    expectRequest(request);
}

} // namespace
