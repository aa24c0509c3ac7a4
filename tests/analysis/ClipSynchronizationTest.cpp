// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/analysis/ClipSynchronization.h>

#include <gmock/gmock.h>

#include <functional>
#include <type_traits>
#include <vector>

namespace {

using ClipSynchronization::canSynchronize;
using ClipSynchronization::Details::InputDataCheckNotification;
using ClipSynchronization::Details::InputDataCheckRequest;
using Clips = std::set<const Timeline::Clip*>;

static_assert(Testing::isVirtualBase<PubSub::Object, ClipSynchronization::Object>);
static_assert(std::is_base_of_v<Message::Types::Request<ClipSynchronization::Object>, InputDataCheckRequest>);
static_assert(
    std::is_base_of_v<Message::Types::Notification<ClipSynchronization::Object>, InputDataCheckNotification>);

/// The question never looks into its clips.
const Timeline::Clip* someClip(int number)
{
    static const char places[2] = {};
    return reinterpret_cast<const Timeline::Clip*>(&places[number]);
}

/// A module that gives one answer after the other.
class Module : public PubSub::Subscriber<InputDataCheckRequest>
{
public:
    explicit Module(std::vector<bool> answers = {}) : m_answers(std::move(answers))
    {
        subscribeAll<ClipSynchronization::Object>();
    }

    std::vector<const ClipSynchronization::Object*> senders;
    std::vector<const Clips*> questions;
    std::function<void()> beforeAnswering;

private:
    void notify(const InputDataCheckRequest& request) override
    {
        senders.push_back(request.sender);
        questions.push_back(request.clips);
        if (beforeAnswering)
            std::exchange(beforeAnswering, nullptr)();
        for (const bool answer : m_answers)
            PubSub::publish(InputDataCheckNotification(request.sender, answer));
    }

    std::vector<bool> m_answers;
};

TEST(ClipSynchronization, IsRefusedIfNobodyAnswers)
{
    EXPECT_FALSE(canSynchronize({}));
    EXPECT_FALSE(canSynchronize({someClip(0), someClip(1)}));
    const Module silent;
    EXPECT_FALSE(canSynchronize({someClip(0), someClip(1)}));
    EXPECT_EQ(silent.questions.size(), 1u);
}

TEST(ClipSynchronization, AsksAboutTheCallersOwnSet)
{
    const Module module({true});
    const Clips clips = {someClip(0), someClip(1)};
    EXPECT_TRUE(canSynchronize(clips));
    ASSERT_EQ(module.questions.size(), 1u);
    EXPECT_EQ(module.questions[0], &clips);
    EXPECT_NE(module.senders[0], nullptr);
}

TEST(ClipSynchronization, AsksAboutNoClipsAtAll)
{
    const Module module;
    const Clips none;
    EXPECT_FALSE(canSynchronize(none));
    ASSERT_EQ(module.questions.size(), 1u);
    EXPECT_EQ(module.questions[0], &none);
}

TEST(ClipSynchronization, ForNoClipsTheAnswerCountsAsForAny)
{
    const Module module({true});
    EXPECT_TRUE(canSynchronize({}));
    EXPECT_TRUE(canSynchronize({nullptr}));
}

TEST(ClipSynchronization, TheLastAnswerWins)
{
    {
        const Module module({true, true, false});
        EXPECT_FALSE(canSynchronize({someClip(0)}));
    }
    const Module module({false, true});
    EXPECT_TRUE(canSynchronize({someClip(0)}));
}

TEST(ClipSynchronization, AnAnswerDoesNotOutliveItsQuestion)
{
    {
        const Module module({true});
        EXPECT_TRUE(canSynchronize({someClip(0)}));
    }
    EXPECT_FALSE(canSynchronize({someClip(0)}));
}

TEST(ClipSynchronization, AnAnswerToSomebodyElseDoesNotCount)
{
    Module module;
    const ClipSynchronization::Object other;
    module.beforeAnswering = [&] {
        PubSub::publish(InputDataCheckNotification(&other, true));
        PubSub::publish(InputDataCheckNotification(nullptr, true));
    };
    EXPECT_FALSE(canSynchronize({someClip(0)}));
}

TEST(ClipSynchronization, AQuestionWithinAQuestionHasAnAnswerOfItsOwn)
{
    Module module({false});
    bool inner = true;
    module.beforeAnswering = [&] { inner = canSynchronize({someClip(1)}); };
    EXPECT_FALSE(canSynchronize({someClip(0)}));
    EXPECT_FALSE(inner);
    ASSERT_EQ(module.senders.size(), 2u);
    EXPECT_NE(module.senders[0], module.senders[1]);
}

TEST(ClipSynchronization, TheAnswerHoldsWhatItWasMadeWith)
{
    const ClipSynchronization::Object object;
    EXPECT_EQ(InputDataCheckNotification(&object, true).sender, &object);
    EXPECT_TRUE(InputDataCheckNotification(&object, true).result);
    EXPECT_FALSE(InputDataCheckNotification(&object, false).result);
}

} // namespace
