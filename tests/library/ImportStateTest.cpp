// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/library/Import.h>

#include <gtest/gtest.h>

#include <type_traits>

namespace {

using Import::State;
using Import::Details::AcquireState;
using Import::Details::AcquireStateNotification;
using Import::Details::AcquireSubscription;
using Import::Details::ReleaseState;
using Package::DeployResult;

static_assert(Testing::isVirtualBase<PubSub::Object, State>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, State>);
static_assert(std::is_base_of_v<PubSub::Object, AcquireSubscription>);
static_assert(std::is_base_of_v<Message::Types::Request<AcquireSubscription>, AcquireState>);
static_assert(std::is_base_of_v<Message::Types::Request<AcquireSubscription>, ReleaseState>);
static_assert(std::is_base_of_v<PubSub::Subscriber<AcquireStateNotification>, Import::StateAcquier>);
static_assert(std::is_same_v<std::underlying_type_t<State::Stage>, int>);
static_assert(std::is_same_v<std::underlying_type_t<DeployResult>, int>);

TEST(ImportStateMessages, HoldWhatTheyWereMadeWith)
{
    const AcquireSubscription subscription;
    const Import::Object object;
    const State state;
    EXPECT_EQ(AcquireState(&subscription, &object).sender, &subscription);
    EXPECT_EQ(AcquireState(&subscription, &object).object, &object);
    EXPECT_EQ(ReleaseState(&subscription, &object).sender, &subscription);
    EXPECT_EQ(ReleaseState(&subscription, &object).object, &object);
    EXPECT_EQ(AcquireStateNotification(&subscription, &state).sender, &subscription);
    EXPECT_EQ(AcquireStateNotification(&subscription, &state).state, &state);
}

TEST(StateAcquier, HoldsTheLastAnswerToItsSubscription)
{
    const AcquireSubscription subscription;
    const AcquireSubscription other;
    const State states[3];
    Import::StateAcquier acquirer;
    EXPECT_EQ(acquirer.state, nullptr);
    acquirer.subscribe(&subscription);
    PubSub::publish(AcquireStateNotification(&other, &states[0]));
    PubSub::publish(AcquireStateNotification(nullptr, &states[0]));
    EXPECT_EQ(acquirer.state, nullptr);
    PubSub::publish(AcquireStateNotification(&subscription, &states[1]));
    EXPECT_EQ(acquirer.state, &states[1]);
    PubSub::publish(AcquireStateNotification(&subscription, &states[2]));
    EXPECT_EQ(acquirer.state, &states[2]);
    acquirer.unsubscribe(&subscription);
    PubSub::publish(AcquireStateNotification(&subscription, &states[0]));
    EXPECT_EQ(acquirer.state, &states[2]);
}

} // namespace
