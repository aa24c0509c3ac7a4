// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldTexts.h"

#include <EditorModel/effects/Quiz.h>

#include <gmock/gmock.h>

namespace {

using testing::ElementsAre;
using Testing::FieldText;

static_assert(!Testing::isVirtualBase<Serialize::ISerializable, Quiz::Question>);
static_assert(!Testing::isVirtualBase<Serialize::ISerializable, Quiz::Preset>);
static_assert(Testing::isVirtualBase<PubSub::Object, Quiz::Question>);
static_assert(Testing::isVirtualBase<PubSub::Object, Quiz::Preset>);

Quiz::Question question(const QString& text, const std::deque<QString>& answers,
                        const std::set<QString>& correctAnswers)
{
    Quiz::Question question;
    question.type = Quiz::Question::Type(2);
    question.text = text;
    question.answers = answers;
    question.correctAnswers = correctAnswers;
    return question;
}

const Quiz::Question capital = question("Capital?", {"Rome", "Oslo", "Paris"}, {"Oslo", "Bergen"});
const Quiz::Question sum = question("1 + 1?", {"2", "3"}, {"2"});

Quiz::Preset everyFieldSet()
{
    Quiz::Preset preset;
    preset.questions = {capital, sum};
    preset.tag = "School";
    preset.description = "Easy";
    return preset;
}

template <class Change>
Quiz::Question changed(Change change)
{
    Quiz::Question question = capital;
    change(question);
    return question;
}

template <class Change>
Quiz::Preset changedPreset(Change change)
{
    Quiz::Preset preset = everyFieldSet();
    change(preset);
    return preset;
}

TEST(QuizQuestion, EqualsWhatHasTheSameFields)
{
    EXPECT_TRUE(capital == capital);
    EXPECT_TRUE(capital == Quiz::Question(capital));
    EXPECT_TRUE(Quiz::Question() == Quiz::Question());
}

TEST(QuizQuestion, EveryFieldCounts)
{
    using Quiz::Question;
    EXPECT_FALSE(capital == changed([](Question& q) { q.type = Question::Type(1); }));
    EXPECT_FALSE(capital == changed([](Question& q) { q.text = "Which?"; }));
    EXPECT_FALSE(capital == changed([](Question& q) { q.answers[2] = "Madrid"; }));
    EXPECT_FALSE(capital == changed([](Question& q) { q.answers.pop_back(); }));
    EXPECT_FALSE(capital == changed([](Question& q) { q.answers.push_back("Madrid"); }));
    EXPECT_FALSE(capital == changed([](Question& q) { q.correctAnswers = {"Oslo"}; }));
    EXPECT_FALSE(capital == changed([](Question& q) { q.correctAnswers = {"Oslo", "Paris"}; }));
    EXPECT_FALSE(capital == changed([](Question& q) { q.correctAnswers.insert("Paris"); }));
}

TEST(QuizQuestion, TheOrderOfAnswersCounts)
{
    EXPECT_FALSE(capital == changed([](Quiz::Question& q) { q.answers = {"Oslo", "Rome", "Paris"}; }));
}

TEST(QuizQuestion, TheOrderInWhichCorrectAnswersWereEnteredDoesNotCount)
{
    Quiz::Question first, second;
    first.correctAnswers.insert("a");
    first.correctAnswers.insert("b");
    second.correctAnswers.insert("b");
    second.correctAnswers.insert("a");
    EXPECT_TRUE(first == second);
}

TEST(QuizQuestion, IsWrittenInTheOrderOfItsFields)
{
    EXPECT_THAT(Testing::fieldTexts(capital),
                ElementsAre(FieldText("type", "2"), FieldText("text", "Q\"Capital%3F\""),
                            FieldText("answers", "\n  3 items"
                                                 "\n  item 1"
                                                 "\n  item: Q\"Rome\""
                                                 "\n  item 2"
                                                 "\n  item: Q\"Oslo\""
                                                 "\n  item 3"
                                                 "\n  item: Q\"Paris\""),
                            FieldText("correctAnswers", "\n  2 items"
                                                        "\n  item 1"
                                                        "\n  item: Q\"Bergen\""
                                                        "\n  item 2"
                                                        "\n  item: Q\"Oslo\"")));
}

TEST(QuizQuestion, IsMadeByName)
{
    Testing::expectMadeByName<Quiz::Question>("Quiz::Question");
}

TEST(QuizPreset, EqualsWhatHasTheSameFields)
{
    const Quiz::Preset preset = everyFieldSet();
    EXPECT_TRUE(preset == preset);
    EXPECT_TRUE(preset == everyFieldSet());
    EXPECT_TRUE(Quiz::Preset() == Quiz::Preset());
}

TEST(QuizPreset, EveryFieldCounts)
{
    using Quiz::Preset;
    const Preset preset = everyFieldSet();
    EXPECT_FALSE(preset == changedPreset([](Preset& p) { p.tag = "Work"; }));
    EXPECT_FALSE(preset == changedPreset([](Preset& p) { p.description = "Hard"; }));
    EXPECT_FALSE(preset == changedPreset([](Preset& p) { p.questions.pop_back(); }));
    EXPECT_FALSE(preset == changedPreset([](Preset& p) { p.questions.push_back(sum); }));
    EXPECT_FALSE(preset == changedPreset([](Preset& p) { p.questions = {sum, capital}; }));
    EXPECT_FALSE(preset == changedPreset([](Preset& p) { p.questions[1].text = "2?"; }));
}

TEST(QuizPreset, TheOrderOfAnswersCounts)
{
    EXPECT_FALSE(everyFieldSet() == changedPreset([](Quiz::Preset& p) {
                     std::swap(p.questions[0].answers[0], p.questions[0].answers[1]);
                 }));
}

TEST(QuizPreset, HasAMimeType)
{
    EXPECT_EQ(*Quiz::Preset::mimeType, "x-application/QuizPreset-serialized");
}

TEST(QuizPreset, IsWrittenInTheOrderOfItsFields)
{
    EXPECT_THAT(Testing::fieldKeys(everyFieldSet()), ElementsAre("questions", "tag", "description"));
    Quiz::Preset preset = everyFieldSet();
    preset.questions = {Quiz::Question()};
    EXPECT_THAT(Testing::fieldTexts(preset),
                ElementsAre(FieldText("questions", "\n  1 items"
                                                   "\n  item 1"
                                                   "\n  item: Quiz::Question"
                                                   "\n    type: 0"
                                                   "\n    text: Q\"\""
                                                   "\n    answers:"
                                                   "\n      0 items"
                                                   "\n    correctAnswers:"
                                                   "\n      0 items"),
                            FieldText("tag", "Q\"School\""), FieldText("description", "Q\"Easy\"")));
}

TEST(QuizPreset, IsMadeByName)
{
    Testing::expectMadeByName<Quiz::Preset>("Quiz::Preset");
}

TEST(QuizPreset, ComesBackEqualWhateverItsCorrectAnswers)
{
    // "Bergen" is none of the answers.
    const Quiz::Preset preset = everyFieldSet();
    for (const Way& way : allWays) {
        const Document::Graph graph = graphOf(documentOf({&preset}, way));
        ASSERT_NE(graph.rootAs<Quiz::Preset>(), nullptr) << way.name;
        EXPECT_TRUE(*graph.rootAs<Quiz::Preset>() == preset) << way.name;
    }
}

} // namespace
