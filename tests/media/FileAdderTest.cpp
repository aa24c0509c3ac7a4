// SPDX-License-Identifier: Apache-2.0
#include "tests/media/AddingRequests.h"
#include "tests/shared/FieldTexts.h"

#include <functional>
#include <stdexcept>
#include <string>
#include <thread>
#include <type_traits>
#include <utility>
#include <vector>

namespace {

using namespace FileAdder;
using namespace FileAdderTests;
using testing::ElementsAre;
using testing::IsEmpty;

static_assert(Testing::isVirtualBase<PubSub::Object, FileAdder::Object>);
static_assert(std::is_base_of_v<PubSub::Subscriber<AddMediaFilesResult>, Helper>);
static_assert(std::is_same_v<decltype(FileAdder::globalObject()), const FileAdder::Object*>);
static_assert(std::is_copy_constructible_v<FileAdder::Object> &&
              std::is_copy_assignable_v<FileAdder::Object>);
static_assert(std::is_copy_constructible_v<Helper> && std::is_copy_assignable_v<Helper>);

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
