// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/analysis/MotionTracking.h>
#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>

#include <functional>
#include <set>
#include <stdexcept>
#include <utility>
#include <vector>

namespace {

using MotionTracking::Data;
using MotionTracking::Helper;
using MotionTracking::Details::IsAvailableTrackingNotification;
using MotionTracking::Details::IsAvailableTrackingRequest;
using MotionTracking::Details::LoadTrackingNotification;
using testing::ElementsAre;
using testing::IsEmpty;
using Timeline::Clip;

/// Holds the data of some trackings, and writes down what it is asked.
class Holder : public PubSub::Subscriber<IsAvailableTrackingRequest>
{
public:
    explicit Holder(std::set<QString> ids = {}) : m_ids(std::move(ids)) { subscribeAll<Data>(); }

    std::vector<QString> questions;
    /// By their bases, to which the address of one that has ended leads no more.
    std::vector<const PubSub::Object*> senders;
    std::function<void(const IsAvailableTrackingRequest&)> beforeAnswering;

private:
    void notify(const IsAvailableTrackingRequest& request) override
    {
        questions.push_back(request.id);
        senders.push_back(request.sender);
        if (beforeAnswering)
            std::exchange(beforeAnswering, nullptr)(request);
        PubSub::publish(IsAvailableTrackingNotification(request.sender, m_ids.count(request.id) == 1));
    }

    const std::set<QString> m_ids;
};

Clip clipWith(const std::set<QString>& trackings)
{
    Clip clip;
    clip.setMotionTrackings(trackings);
    return clip;
}

TEST(LostMotionTracking, IsAskedOfNobodyForAClipWithoutTrackings)
{
    const Holder holder;
    EXPECT_FALSE(Clip().hasLostMotionTracking());
    EXPECT_THAT(holder.questions, IsEmpty());
}

TEST(LostMotionTracking, IsNoneWhereAllAreHeld)
{
    const Holder holder({"a", "b", "c"});
    EXPECT_FALSE(clipWith({"c", "a"}).hasLostMotionTracking());
    EXPECT_THAT(holder.questions, ElementsAre("a", "c"));
}

TEST(LostMotionTracking, IsAskedForInAscendingOrderUpToTheFirstLost)
{
    const Holder holder({"B", "a", "d"});
    EXPECT_TRUE(clipWith({"d", "c", "a", "B"}).hasLostMotionTracking());
    EXPECT_THAT(holder.questions, ElementsAre("B", "a", "c"));
}

TEST(LostMotionTracking, IsEveryOneWhereNobodyAnswers)
{
    EXPECT_TRUE(clipWith({"a"}).hasLostMotionTracking());
    EXPECT_FALSE(Clip().hasLostMotionTracking());
}

TEST(LostMotionTracking, IsAskedForEachByItselfAnew)
{
    // The first is held; an answer that stayed would count for the second, about which nobody answers.
    struct Forgetful : public PubSub::Subscriber<IsAvailableTrackingRequest>
    {
        Forgetful() { subscribeAll<Data>(); }
        void notify(const IsAvailableTrackingRequest& request) override
        {
            if (std::exchange(isFirst, false))
                PubSub::publish(IsAvailableTrackingNotification(request.sender, true));
        }
        bool isFirst = true;
    };
    const Forgetful holder;
    EXPECT_TRUE(clipWith({"a", "b"}).hasLostMotionTracking());
}

TEST(LostMotionTracking, LeavesTheClipAsItIs)
{
    const Holder holder({"a"});
    const Clip clip = clipWith({"a", "b"});
    EXPECT_TRUE(clip.hasLostMotionTracking());
    EXPECT_THAT(clip.motionTrackings, ElementsAre("a", "b"));
}

TEST(MotionTrackingHelper, HasNoAnswerAtFirst)
{
    const Helper helper;
    EXPECT_EQ(helper.data, nullptr);
    EXPECT_FALSE(helper.available);
}

TEST(MotionTrackingHelper, AsksInTheNameOfAnEmptySender)
{
    Holder holder({"a"});
    QString senderId = "none";
    holder.beforeAnswering = [&](const IsAvailableTrackingRequest& request) {
        senderId = request.sender->id;
    };
    EXPECT_TRUE(Helper().isAvailable("a"));
    EXPECT_EQ(senderId, "");
    EXPECT_FALSE(Helper().isAvailable("b"));
}

TEST(MotionTrackingHelper, HearsOnlyTheAnswersToItsQuestion)
{
    Holder holder;
    const Data other("a");
    holder.beforeAnswering = [&](const IsAvailableTrackingRequest&) {
        PubSub::publish(IsAvailableTrackingNotification(&other, true));
        PubSub::publish(IsAvailableTrackingNotification(nullptr, true));
    };
    EXPECT_FALSE(Helper().isAvailable("a"));
}

TEST(MotionTrackingHelper, TheLastAnswerCounts)
{
    for (const bool last : {true, false}) {
        Holder holder(last ? std::set<QString>{"a"} : std::set<QString>{});
        holder.beforeAnswering = [&](const IsAvailableTrackingRequest& request) {
            PubSub::publish(IsAvailableTrackingNotification(request.sender, !last));
        };
        EXPECT_EQ(Helper().isAvailable("a"), last);
    }
}

TEST(MotionTrackingHelper, AnswersAQuestionWithinAQuestion)
{
    Holder holder({"b"});
    bool inner = false;
    holder.beforeAnswering = [&](const IsAvailableTrackingRequest&) { inner = Helper().isAvailable("b"); };
    EXPECT_FALSE(Helper().isAvailable("a"));
    EXPECT_TRUE(inner);
    EXPECT_THAT(holder.questions, ElementsAre("a", "b"));
    EXPECT_NE(holder.senders[0], holder.senders[1]);
}

TEST(MotionTrackingHelper, KeepsTheDataThatIsLoadedMeanwhile)
{
    Holder holder({"a"});
    const auto loaded = std::make_shared<const Data>("a");
    holder.beforeAnswering = [&](const IsAvailableTrackingRequest& request) {
        PubSub::publish(LoadTrackingNotification(request.sender, std::make_shared<const Data>("first")));
        PubSub::publish(LoadTrackingNotification(request.sender, loaded));
    };
    Helper helper;
    EXPECT_TRUE(helper.isAvailable("a"));
    EXPECT_EQ(helper.data, loaded);
    EXPECT_EQ(loaded.use_count(), 2);
}

TEST(MotionTrackingHelper, LetsGoOfItsSenderAlsoWhenTheHolderThrows)
{
    Holder holder({"a"});
    Helper helper;
    EXPECT_TRUE(helper.isAvailable("a"));
    EXPECT_FALSE(helper.isSubscribed(holder.senders.back()));
    holder.beforeAnswering = [](const IsAvailableTrackingRequest&) { throw std::runtime_error("busy"); };
    EXPECT_THROW(helper.isAvailable("b"), std::runtime_error);
    EXPECT_FALSE(helper.isSubscribed(holder.senders.back()));
}

TEST(MotionTrackingMessages, HoldWhatTheyAreMadeWith)
{
    const Data sender("sender");
    EXPECT_EQ(IsAvailableTrackingRequest(&sender, "a").sender, &sender);
    EXPECT_EQ(IsAvailableTrackingRequest(&sender, "a").id, "a");
    EXPECT_EQ(IsAvailableTrackingNotification(&sender, true).sender, &sender);
    EXPECT_TRUE(IsAvailableTrackingNotification(&sender, true).available);
    EXPECT_FALSE(IsAvailableTrackingNotification(&sender, false).available);
    const auto loaded = std::make_shared<const Data>("a");
    EXPECT_EQ(LoadTrackingNotification(&sender, loaded).sender, &sender);
    EXPECT_EQ(LoadTrackingNotification(&sender, loaded).data, loaded);
}

TEST(LostMotionTracking, IsAskedToTheEndWhileWhoeverAnswersChangesTheClip)
{
    Holder holder({"a", "b"});
    Clip clip = clipWith({"a", "b", "c"});
    holder.beforeAnswering = [&](const IsAvailableTrackingRequest&) { clip.setMotionTrackings({}); };
    EXPECT_TRUE(clip.hasLostMotionTracking());
    EXPECT_THAT(holder.questions, ElementsAre("a", "b", "c"));
}

} // namespace
