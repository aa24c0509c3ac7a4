// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/library/UserBlob.h>

#include <gmock/gmock.h>

#include <functional>
#include <memory>
#include <type_traits>
#include <utility>
#include <vector>

namespace {

using UserBlob::Helper;
using UserBlob::Details::CreateLutNotification;
using UserBlob::Details::CreateLutRequest;
using UserBlob::Details::GetUserBlobsNotification;
using UserBlob::Details::GetUserBlobsRequest;
using UserBlob::Details::LoadBlobRequest;
using BlobObject = UserBlob::Details::Object;
using Result = Helper::CreateResult;
using Paths = QMap<QString, QString>;
using testing::ElementsAre;

static_assert(Testing::isVirtualBase<PubSub::Object, BlobObject>);
static_assert(std::is_base_of_v<BlobObject, Helper>);
static_assert(std::is_base_of_v<PubSub::Subscriber<CreateLutNotification, GetUserBlobsNotification>, Helper>);
static_assert(std::is_base_of_v<Message::Types::Request<BlobObject>, CreateLutRequest>);
static_assert(std::is_base_of_v<Message::Types::Request<BlobObject>, LoadBlobRequest>);
static_assert(std::is_base_of_v<Message::Types::Request<BlobObject>, GetUserBlobsRequest>);
static_assert(std::is_base_of_v<Message::Types::Notification<BlobObject>, CreateLutNotification>);
static_assert(std::is_base_of_v<Message::Types::Notification<BlobObject>, GetUserBlobsNotification>);

void expectResult(const Result& actual, int first, const QString& second, int third, const QString& fourth)
{
    EXPECT_EQ(actual.reservedFirst, first);
    EXPECT_EQ(actual.reservedSecond, second);
    EXPECT_EQ(actual.reservedThird, third);
    EXPECT_EQ(actual.reservedFourth, fourth);
}

/// A module that keeps blobs, and answers in the asker's name.
class Keeper : public PubSub::Subscriber<CreateLutRequest, LoadBlobRequest, GetUserBlobsRequest>
{
public:
    Keeper() { subscribeAll<BlobObject>(); }

    /// A result for each answer to one question.
    std::vector<Result> results;
    Paths paths;
    std::function<void()> beforeAnswering;

    std::vector<const BlobObject*> senders;
    /// The addresses of the texts, and the texts.
    std::vector<const QString*> arguments;
    std::vector<QString> texts;

private:
    void note(const BlobObject* sender)
    {
        senders.push_back(sender);
        if (beforeAnswering)
            std::exchange(beforeAnswering, nullptr)();
    }
    void note(const BlobObject* sender, const QString& text)
    {
        arguments.push_back(&text);
        texts.push_back(text);
        note(sender);
    }

    void notify(const CreateLutRequest& request) override
    {
        note(request.sender, request.file);
        for (const Result& result : results)
            PubSub::publish(CreateLutNotification(request.sender, &result));
    }
    void notify(const LoadBlobRequest& request) override { note(request.sender, request.blob); }
    void notify(const GetUserBlobsRequest& request) override
    {
        note(request.sender);
        PubSub::publish(GetUserBlobsNotification(request.sender, paths));
    }
};

TEST(UserBlobHelper, HasTheDefaultResultIfNobodyAnswers)
{
    Helper helper;
    expectResult(helper.createLut("/a.cube"), 0, "", 2, "");
    const Keeper silent;
    expectResult(helper.createLut("/a.cube"), 0, "", 2, "");
    EXPECT_EQ(silent.texts.size(), 1u);
}

TEST(UserBlobHelper, HasATableMadeOfTheCallersOwnText)
{
    Keeper keeper;
    keeper.results = {{1, "a", 3, "b"}};
    Helper helper;
    const QString file = "/a.cube";
    expectResult(helper.createLut(file), 1, "a", 3, "b");
    EXPECT_THAT(keeper.senders, ElementsAre(&helper));
    EXPECT_THAT(keeper.arguments, ElementsAre(&file));
    EXPECT_THAT(keeper.texts, ElementsAre("/a.cube"));
}

TEST(UserBlobHelper, GivesTheEarlierResultOnceMoreWhenTheModuleIsGone)
{
    Helper helper;
    {
        Keeper keeper;
        keeper.results = {{1, "a", 3, "b"}};
        helper.createLut("/a.cube");
    }
    expectResult(helper.createLut("/b.cube"), 1, "a", 3, "b");
    expectResult(Helper().createLut("/b.cube"), 0, "", 2, "");
}

TEST(UserBlobHelper, GivesACopyOfTheResult)
{
    Keeper keeper;
    keeper.results = {{1, "a", 3, "b"}};
    Helper helper;
    const Result first = helper.createLut("/a.cube");
    keeper.results = {{5, "c", 6, "d"}};
    expectResult(helper.createLut("/b.cube"), 5, "c", 6, "d");
    expectResult(first, 1, "a", 3, "b");
}

TEST(UserBlobHelper, TheLastAnswerToAQuestionCounts)
{
    Keeper keeper;
    keeper.results = {{1, "a", 3, "b"}, {5, "c", 6, "d"}};
    Helper helper;
    expectResult(helper.createLut("/a.cube"), 5, "c", 6, "d");
}

TEST(UserBlobHelper, OfTwoModulesTheOneThatAnswersLaterWins)
{
    Keeper keepers[2];
    int last = -1;
    for (int i = 0; i != 2; ++i)
        keepers[i].results = {{i, "keeper", 2, ""}};
    const auto watch = [&] {
        for (int i = 0; i != 2; ++i)
            keepers[i].beforeAnswering = [&last, i] { last = i; };
    };
    watch();
    Helper helper;
    const Result result = helper.createLut("/a.cube");
    expectResult(result, last, "keeper", 2, "");
    EXPECT_EQ(keepers[0].texts.size(), 1u);
    EXPECT_EQ(keepers[1].texts.size(), 1u);

    watch();
    keepers[0].paths = {{"id", "/0"}, {"zero", "/zero"}};
    keepers[1].paths = {{"id", "/1"}};
    const Paths paths = helper.registeredBlobId2Path();
    EXPECT_EQ(paths, keepers[last].paths);
}

TEST(UserBlobHelper, LoadsABlobWithoutAnAnswer)
{
    Helper helper;
    helper.loadBlob("nobody hears it");
    Keeper keeper;
    keeper.results = {{1, "a", 3, "b"}};
    const QString blob = "id";
    helper.loadBlob(blob);
    EXPECT_THAT(keeper.senders, ElementsAre(&helper));
    EXPECT_THAT(keeper.arguments, ElementsAre(&blob));
    EXPECT_THAT(keeper.texts, ElementsAre("id"));
    keeper.results.clear();
    expectResult(helper.createLut("/a.cube"), 0, "", 2, "");
}

TEST(UserBlobHelper, KnowsNoBlobsIfNobodyAnswers)
{
    const Helper helper;
    EXPECT_EQ(helper.registeredBlobId2Path(), Paths());
}

TEST(UserBlobHelper, AsksAnewAtEachCallWhichBlobsThereAre)
{
    Keeper keeper;
    keeper.paths = {{"lut", "/a.cube"}, {"other", "/b.cube"}};
    const Helper helper;
    const Paths& paths = helper.registeredBlobId2Path();
    EXPECT_EQ(paths, (Paths{{"lut", "/a.cube"}, {"other", "/b.cube"}}));
    keeper.paths = {{"lut", "/c.cube"}};
    EXPECT_EQ(paths.size(), 2);
    EXPECT_EQ(&helper.registeredBlobId2Path(), &paths);
    EXPECT_EQ(paths, (Paths{{"lut", "/c.cube"}}));
    EXPECT_THAT(keeper.senders, ElementsAre(&helper, &helper));
    keeper.paths = {};
    EXPECT_EQ(helper.registeredBlobId2Path(), Paths());
}

TEST(UserBlobHelper, GoesOnToKnowItsBlobsWhenTheModuleIsGone)
{
    const Helper helper;
    {
        Keeper keeper;
        keeper.paths = {{"lut", "/a.cube"}};
        helper.registeredBlobId2Path();
    }
    EXPECT_EQ(helper.registeredBlobId2Path(), (Paths{{"lut", "/a.cube"}}));
}

TEST(UserBlobHelper, KeepsTheTwoAnswersApart)
{
    Keeper keeper;
    keeper.results = {{1, "a", 3, "b"}};
    keeper.paths = {{"lut", "/a.cube"}};
    Helper helper;
    helper.createLut("/a.cube");
    keeper.results.clear();
    EXPECT_EQ(helper.registeredBlobId2Path().size(), 1);
    expectResult(helper.createLut("/b.cube"), 1, "a", 3, "b");
}

TEST(UserBlobHelper, AnAnswerToSomebodyElseDoesNotCount)
{
    const BlobObject somebody;
    Helper other;
    Helper helper;
    const Result foreign = {9, "x", 9, "y"};
    const BlobObject* const senders[] = {&somebody, &other, nullptr};
    for (const BlobObject* sender : senders) {
        PubSub::publish(CreateLutNotification(sender, &foreign));
        PubSub::publish(GetUserBlobsNotification(sender, {{"x", "/y"}}));
    }
    expectResult(helper.createLut("/a.cube"), 0, "", 2, "");
    EXPECT_EQ(helper.registeredBlobId2Path(), Paths());
    expectResult(other.createLut("/a.cube"), 9, "x", 9, "y");
    EXPECT_EQ(other.registeredBlobId2Path(), (Paths{{"x", "/y"}}));
}

TEST(UserBlobHelper, AnotherHelpersQuestionWithinAQuestionIsItsOwn)
{
    Keeper keeper;
    Helper helper;
    Helper inner;
    Result innerResult;
    keeper.results = {{1, "a", 3, "b"}};
    keeper.beforeAnswering = [&] {
        innerResult = inner.createLut("/inner.cube");
        keeper.results = {{5, "c", 6, "d"}};
    };
    expectResult(helper.createLut("/a.cube"), 5, "c", 6, "d");
    expectResult(innerResult, 1, "a", 3, "b");
    EXPECT_THAT(keeper.senders, ElementsAre(&helper, &inner));
}

/// A helper that has had both answers, from a module that is gone.
class AnsweredHelperTest : public testing::Test
{
protected:
    AnsweredHelperTest()
    {
        Keeper keeper;
        keeper.results = {{1, "a", 3, "b"}};
        keeper.paths = {{"lut", "/a.cube"}};
        m_helper.createLut("/a.cube");
        m_helper.registeredBlobId2Path();
    }

    static void expectAnswered(Helper& helper)
    {
        expectResult(helper.createLut("/nobody.cube"), 1, "a", 3, "b");
        EXPECT_EQ(helper.registeredBlobId2Path(), (Paths{{"lut", "/a.cube"}}));
    }

    /// It asks in its own name and hears nothing that is meant for the other.
    static void expectApart(Helper& helper, Helper& other)
    {
        EXPECT_TRUE(helper.isSubscribed(&helper));
        EXPECT_FALSE(helper.isSubscribed(&other));
        EXPECT_TRUE(other.isSubscribed(&other));
        EXPECT_FALSE(other.isSubscribed(&helper));
        Keeper keeper;
        keeper.results = {{7, "new", 8, "answer"}};
        expectResult(helper.createLut("/b.cube"), 7, "new", 8, "answer");
        EXPECT_THAT(keeper.senders, ElementsAre(&helper));
    }

    Helper m_helper;
};

TEST_F(AnsweredHelperTest, ACopyHasTheAnswersAndAsksInItsOwnName)
{
    Helper copy(m_helper);
    expectAnswered(copy);
    expectApart(copy, m_helper);
    expectAnswered(m_helper);
}

TEST_F(AnsweredHelperTest, AMovedOneHasTheAnswersAndAsksInItsOwnName)
{
    Helper moved(std::move(m_helper));
    expectAnswered(moved);
    expectApart(moved, m_helper);
    expectApart(m_helper, moved);
}

TEST_F(AnsweredHelperTest, ACopyOutlivesTheOther)
{
    auto other = std::make_unique<Helper>(m_helper);
    Helper copy(*other);
    other.reset();
    expectAnswered(copy);
    Keeper keeper;
    keeper.paths = {{"new", "/b.cube"}};
    EXPECT_EQ(copy.registeredBlobId2Path(), (Paths{{"new", "/b.cube"}}));
}

TEST_F(AnsweredHelperTest, AnAssignedOneTakesTheAnswersOverAndAsksInItsOwnName)
{
    Helper assigned;
    EXPECT_EQ(&(assigned = m_helper), &assigned);
    expectAnswered(assigned);
    expectApart(assigned, m_helper);
    expectAnswered(m_helper);
    EXPECT_EQ(&(assigned = std::move(m_helper)), &assigned);
    expectAnswered(assigned);
    expectApart(assigned, m_helper);
}

TEST_F(AnsweredHelperTest, AssignedToItselfItStaysAsItIs)
{
    const Helper& itself = m_helper;
    m_helper = itself;
    expectAnswered(m_helper);
    EXPECT_TRUE(m_helper.isSubscribed(&m_helper));
}

/// The copies of a derived class, which the compiler makes, hear no answers to the other either.
TEST_F(AnsweredHelperTest, ACopyOfADerivedOneAsksInItsOwnName)
{
    struct Client : Helper
    {
        int number = 0;
    };
    Client client;
    client.number = 4;
    static_cast<Helper&>(client) = m_helper;
    Client copy(client);
    EXPECT_EQ(copy.number, 4);
    expectAnswered(copy);
    expectApart(copy, client);
    Client moved(std::move(copy));
    expectApart(moved, copy);
}

TEST(UserBlobMessages, HoldWhatTheyWereMadeWith)
{
    const BlobObject object;
    const QString text = "text";
    const Result result;
    EXPECT_EQ(CreateLutRequest(&object, text).sender, &object);
    EXPECT_EQ(&CreateLutRequest(&object, text).file, &text);
    EXPECT_EQ(LoadBlobRequest(&object, text).sender, &object);
    EXPECT_EQ(&LoadBlobRequest(&object, text).blob, &text);
    EXPECT_EQ(GetUserBlobsRequest(&object).sender, &object);
    EXPECT_EQ(CreateLutNotification(&object, &result).sender, &object);
    EXPECT_EQ(CreateLutNotification(&object, &result).result, &result);
    const GetUserBlobsNotification answer(&object, {{"lut", "/a.cube"}});
    EXPECT_EQ(answer.sender, &object);
    EXPECT_EQ(answer.registeredBlobId2Path, (Paths{{"lut", "/a.cube"}}));
}

} // namespace
