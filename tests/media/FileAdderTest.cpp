// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/media/FileAdder.h>

#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>

#include <functional>
#include <stdexcept>
#include <string>
#include <thread>
#include <type_traits>
#include <utility>
#include <vector>

namespace {

using namespace FileAdder;
using testing::ElementsAre;
using testing::IsEmpty;
using Timeline::Clip;
using Timeline::ClipBuildingStrategy;

static_assert(Testing::isVirtualBase<PubSub::Object, FileAdder::Object>);
static_assert(std::is_base_of_v<Message::Types::Request<FileAdder::Object>, AddMediaFiles>);
static_assert(std::is_base_of_v<Message::Types::Notification<FileAdder::Object>, AddMediaFilesResult>);
static_assert(std::is_base_of_v<PubSub::Subscriber<AddMediaFilesResult>, Helper>);
static_assert(std::is_same_v<decltype(FileAdder::globalObject()), const FileAdder::Object*>);
static_assert(sizeof(Asrc) == 4 && sizeof(AddedResult) == 4);
static_assert(!std::is_default_constructible_v<TimelineContext>);
static_assert(!std::is_default_constructible_v<ResourceTableContext>);
static_assert(std::is_default_constructible_v<Contexts>);
static_assert(std::is_empty_v<UserCollectionContext>);

template <class T>
constexpr bool isCopied = std::is_copy_constructible_v<T>&& std::is_copy_assignable_v<T>;
static_assert(isCopied<TimelineContext> && isCopied<UserCollectionContext> && isCopied<ResourceTableContext>);
static_assert(isCopied<Contexts> && isCopied<AddMediaFiles> && isCopied<AddMediaFilesResult>);
static_assert(isCopied<Helper> && isCopied<FileAdder::Object>);

const Timeline::Object someTimeline;
const Timeline::Object otherTimeline;
const Timeline::Track someTrack;
const ResourceTable::Object someTable;
const ResourceTable::Object otherTable;

const QStringList twoFiles = {QStringLiteral("/films/b.mp4"), QStringLiteral("/films/a.mp4")};

AddedResult result(int value)
{
    return static_cast<AddedResult>(value);
}

Asrc source(int value)
{
    return static_cast<Asrc>(value);
}

void expectContext(const TimelineContext& context, const Timeline::Object* timeline,
                   const Timeline::Track* track, MTime position, int clipType, int trackLevel, bool flag,
                   int strategy)
{
    EXPECT_EQ(context.timeline, timeline);
    EXPECT_EQ(context.track, track);
    EXPECT_EQ(context.position, position);
    EXPECT_EQ(context.clipType, clipType);
    EXPECT_EQ(context.trackLevel, trackLevel);
    EXPECT_EQ(context.flag, flag);
    EXPECT_EQ(context.clipBuildingStrategy, strategy);
}

/// Every field differs from what the other constructors give.
TimelineContext fullContext()
{
    TimelineContext context(&someTimeline, &someTrack, MTime(250), Clip::AudioClip, 3, true);
    context.clipBuildingStrategy = ClipBuildingStrategy(4);
    return context;
}

void expectFullContext(const TimelineContext& context)
{
    expectContext(context, &someTimeline, &someTrack, 250, 2, 3, true, 4);
}

/// Adds files for others: writes down what it is asked, and gives one answer after the other.
class Module : public PubSub::Subscriber<AddMediaFiles>
{
public:
    explicit Module(std::vector<AddedResult> answers = {}) : m_answers(std::move(answers))
    {
        subscribe(globalObject());
    }

    std::vector<AddMediaFiles> requests;
    std::function<void()> beforeAnswering;

private:
    void notify(const AddMediaFiles& request) override
    {
        requests.push_back(request);
        if (beforeAnswering)
            std::exchange(beforeAnswering, nullptr)();
        for (const AddedResult answer : m_answers)
            PubSub::publish(AddMediaFilesResult(answer, request.files));
    }

    const std::vector<AddedResult> m_answers;
};

TEST(FileAdderSender, IsOneForTheWholeProcess)
{
    const FileAdder::Object* const here = globalObject();
    const FileAdder::Object* there = nullptr;
    std::thread([&] { there = globalObject(); }).join();
    ASSERT_NE(here, nullptr);
    EXPECT_EQ(there, here);
    EXPECT_EQ(globalObject(), here);
}

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

TEST(FileAdderTimelineContext, CopiesWhole)
{
    const TimelineContext full = fullContext();
    expectFullContext(TimelineContext(full));
    TimelineContext assigned(&otherTimeline);
    EXPECT_EQ(&(assigned = full), &assigned);
    expectFullContext(assigned);
    const TimelineContext& itself = assigned;
    assigned = itself;
    expectFullContext(assigned);
}

TEST(FileAdderResourceTableContext, NamesATable)
{
    const ResourceTableContext context(&someTable);
    EXPECT_EQ(context.table, &someTable);
    ResourceTableContext assigned(nullptr);
    EXPECT_EQ(assigned.table, nullptr);
    assigned = context;
    EXPECT_EQ(assigned.table, &someTable);
    EXPECT_EQ(ResourceTableContext(context).table, &someTable);
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

Contexts allContexts()
{
    return Contexts()
        .setContext(fullContext())
        .setContext(UserCollectionContext())
        .setContext(ResourceTableContext(&someTable));
}

void expectAllContexts(const Contexts& contexts)
{
    ASSERT_TRUE(contexts.timeline);
    expectFullContext(*contexts.timeline);
    EXPECT_TRUE(contexts.userCollection);
    ASSERT_TRUE(contexts.resourceTable);
    EXPECT_EQ(contexts.resourceTable->table, &someTable);
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

void expectRequest(const AddMediaFiles& request)
{
    EXPECT_EQ(request.sender, globalObject());
    EXPECT_EQ(request.files, twoFiles);
    EXPECT_EQ(request.source, 5);
    expectAllContexts(request.contexts);
}

TEST(FileAdderMessages, HoldWhatTheyAreMadeWith)
{
    const AddMediaFiles request(twoFiles, source(5), allContexts());
    expectRequest(request);
    expectRequest(AddMediaFiles(request));
    AddMediaFiles assigned({}, source(0), {});
    EXPECT_EQ(&(assigned = request), &assigned);
    const AddMediaFiles& itself = assigned;
    assigned = itself;
    expectRequest(assigned);

    const AddMediaFilesResult answer(result(6), twoFiles);
    AddMediaFilesResult other(result(0), {});
    EXPECT_EQ(&(other = answer), &other);
    for (const AddMediaFilesResult& each : {answer, other}) {
        EXPECT_EQ(each.sender, globalObject());
        EXPECT_EQ(each.result, 6);
        EXPECT_EQ(each.files, twoFiles);
    }
}

TEST(FileAdderMessages, TakeTheirContextsByValue)
{
    Contexts contexts = allContexts();
    const AddMediaFiles request(twoFiles, source(5), contexts);
    contexts = Contexts();
    expectRequest(request);
}

TEST(FileAdder, AsksForWhatItIsGiven)
{
    const Module module({result(3)});
    EXPECT_EQ(FileAdder::addMediaFiles(twoFiles, source(5), allContexts()), 3);
    ASSERT_EQ(module.requests.size(), 1u);
    expectRequest(module.requests[0]);
}

TEST(FileAdder, GetsNothingWhereNobodyAnswers)
{
    EXPECT_EQ(FileAdder::addMediaFiles(twoFiles, source(5), allContexts()), 0);
    const Module silent;
    EXPECT_EQ(FileAdder::addMediaFiles(twoFiles, source(5), allContexts()), NotAnswered);
    EXPECT_EQ(silent.requests.size(), 1u);
}

TEST(FileAdder, AsksForNoFilesAsForAny)
{
    const Module module({result(3)});
    EXPECT_EQ(FileAdder::addMediaFiles({}, source(5), allContexts()), 3);
    ASSERT_EQ(module.requests.size(), 1u);
    EXPECT_THAT(module.requests[0].files, IsEmpty());
}

TEST(FileAdder, AsksAlsoWithoutADestination)
{
    const Module module({result(3)});
    EXPECT_EQ(FileAdder::addMediaFiles(twoFiles, source(5), Contexts()), 3);
    ASSERT_EQ(module.requests.size(), 1u);
    const Contexts& contexts = module.requests[0].contexts;
    EXPECT_FALSE(contexts.timeline || contexts.userCollection || contexts.resourceTable);
}

TEST(FileAdder, TakesTheLastOfTwoResults)
{
    const Module module({result(3), result(9)});
    EXPECT_EQ(FileAdder::addMediaFiles(twoFiles, source(5), {}), 9);
}

TEST(FileAdder, TakesAResultOfNoAnswerForOne)
{
    const Module module({result(3), NotAnswered});
    EXPECT_EQ(FileAdder::addMediaFiles(twoFiles, source(5), {}), 0);
}

TEST(FileAdder, AsksEveryModuleAndTakesAnAnswerOfOneOfThem)
{
    const Module one({result(3)});
    const Module silent;
    const Module other({result(3)});
    EXPECT_EQ(FileAdder::addMediaFiles(twoFiles, source(5), {}), 3);
    EXPECT_EQ(one.requests.size(), 1u);
    EXPECT_EQ(silent.requests.size(), 1u);
    EXPECT_EQ(other.requests.size(), 1u);
}

TEST(FileAdder, TakesTheAnswerOfTheModuleThatIsAskedLast)
{
    Module one({result(1)});
    Module two({result(2)});
    int last = 0;
    // Whichever module is asked later overwrites what the earlier one left here.
    one.beforeAnswering = [&] { last = 1; };
    two.beforeAnswering = [&] { last = 2; };
    EXPECT_EQ(FileAdder::addMediaFiles(twoFiles, source(5), {}), last);
    EXPECT_NE(last, 0);
}

TEST(FileAdder, HasNoPartInAnEarlierAnswer)
{
    {
        const Module module({result(3)});
        EXPECT_EQ(FileAdder::addMediaFiles(twoFiles, source(5), {}), 3);
    }
    EXPECT_EQ(FileAdder::addMediaFiles(twoFiles, source(5), {}), 0);
}

TEST(FileAdder, LetsThroughWhatAModuleThrows)
{
    Module module({result(3)});
    module.beforeAnswering = [] { throw std::runtime_error("busy"); };
    EXPECT_THROW(FileAdder::addMediaFiles(twoFiles, source(5), {}), std::runtime_error);
    EXPECT_EQ(FileAdder::addMediaFiles(twoFiles, source(5), {}), 3);
}

TEST(FileAdder, HearsAlsoTheAnswerToARequestWithinARequest)
{
    Module module;
    AddedResult inner = result(0);
    module.beforeAnswering = [&] {
        const Module other({result(4)});
        inner = FileAdder::addMediaFiles({}, source(6), {});
    };
    EXPECT_EQ(FileAdder::addMediaFiles(twoFiles, source(5), {}), 4);
    EXPECT_EQ(inner, 4);
    ASSERT_EQ(module.requests.size(), 2u);
    EXPECT_EQ(module.requests[0].source, 5);
    EXPECT_EQ(module.requests[1].source, 6);
}

/// The helper of a client that watches what reaches it.
class TracedHelper : public Helper
{
public:
    std::vector<std::string> trace;

private:
    void notify(const AddMediaFilesResult& answer) override
    {
        Helper::notify(answer);
        trace.push_back(std::to_string(answer.result) + ' ' + answer.files.join(' ').toStdString());
    }
};

TEST(FileAdderHelper, HearsTheAnswersToItsRequest)
{
    const Module module({result(3), result(9)});
    TracedHelper helper;
    EXPECT_EQ(helper.addMediaFiles(twoFiles, source(5), {}), 9);
    EXPECT_THAT(helper.trace, ElementsAre("3 /films/b.mp4 /films/a.mp4", "9 /films/b.mp4 /films/a.mp4"));
    EXPECT_EQ(helper.result, 9);
    EXPECT_TRUE(helper.reserved.isEmpty());
}

TEST(FileAdderHelper, HearsNothingWhileItDoesNotAsk)
{
    TracedHelper helper;
    PubSub::publish(AddMediaFilesResult(result(8), twoFiles));
    EXPECT_THAT(helper.trace, IsEmpty());

    const Module module({result(3)});
    EXPECT_EQ(helper.addMediaFiles(twoFiles, source(5), {}), 3);
    PubSub::publish(AddMediaFilesResult(result(8), twoFiles));
    EXPECT_THAT(helper.trace, ElementsAre("3 /films/b.mp4 /films/a.mp4"));
    EXPECT_EQ(helper.result, 3);
}

TEST(FileAdderHelper, IsSubscribedWhileItAsks)
{
    Module module({result(3)});
    TracedHelper helper;
    bool meanwhile = false;
    module.beforeAnswering = [&] { meanwhile = helper.isSubscribed(globalObject()); };
    EXPECT_FALSE(helper.isSubscribed(globalObject()));
    helper.addMediaFiles(twoFiles, source(5), {});
    EXPECT_TRUE(meanwhile);
    EXPECT_FALSE(helper.isSubscribed(globalObject()));

    module.beforeAnswering = [] { throw std::runtime_error("busy"); };
    EXPECT_THROW(helper.addMediaFiles(twoFiles, source(5), {}), std::runtime_error);
    EXPECT_FALSE(helper.isSubscribed(globalObject()));
}

TEST(FileAdderHelper, LeavesItsSenderAlsoWhereItWasSubscribedBefore)
{
    TracedHelper helper;
    helper.result = result(0);
    helper.subscribe(globalObject());
    helper.addMediaFiles(twoFiles, source(5), {});
    EXPECT_FALSE(helper.isSubscribed(globalObject()));
}

TEST(FileAdderHelper, KeepsItsResultWhereNobodyAnswers)
{
    Helper helper;
    helper.result = result(7);
    EXPECT_EQ(helper.addMediaFiles(twoFiles, source(5), {}), 7);

    {
        const Module module({result(3)});
        EXPECT_EQ(helper.addMediaFiles(twoFiles, source(5), {}), 3);
    }
    EXPECT_EQ(helper.addMediaFiles(twoFiles, source(5), {}), 3);
}

TEST(FileAdderHelper, CopiesItsFieldsAndItsSubscriptions)
{
    TracedHelper helper;
    helper.result = result(7);
    helper.reserved.insert(QStringLiteral("key"), QStringLiteral("value"));
    helper.subscribe(globalObject());

    TracedHelper copy(helper);
    TracedHelper assigned;
    assigned.result = result(0);
    EXPECT_EQ(&(assigned = helper), &assigned);
    const TracedHelper& itself = assigned;
    assigned = itself;
    helper.unsubscribe(globalObject());

    for (TracedHelper* each : {&copy, &assigned}) {
        EXPECT_EQ(each->result, 7);
        EXPECT_EQ(each->reserved.value(QStringLiteral("key")), QStringLiteral("value"));
        EXPECT_TRUE(each->isSubscribed(globalObject()));
    }
    PubSub::publish(AddMediaFilesResult(result(8), {}));
    EXPECT_EQ(helper.result, 7);
    EXPECT_EQ(copy.result, 8);
    EXPECT_EQ(assigned.result, 8);
    EXPECT_THAT(copy.trace, ElementsAre("8 "));
}

TEST(FileAdderHelper, CopiedWhileItAsksGoesOnListening)
{
    Module module({result(3)});
    TracedHelper helper;
    helper.result = result(0);
    std::vector<TracedHelper> copies;
    module.beforeAnswering = [&] { copies.push_back(helper); };
    EXPECT_EQ(helper.addMediaFiles(twoFiles, source(5), {}), 3);
    ASSERT_EQ(copies.size(), 1u);
    EXPECT_EQ(copies[0].result, 3);
    // The copy goes on listening: nobody has unsubscribed it.
    PubSub::publish(AddMediaFilesResult(result(8), {}));
    EXPECT_EQ(copies[0].result, 8);
    EXPECT_EQ(helper.result, 3);
}

} // namespace
