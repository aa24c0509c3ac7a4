// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/analysis/VUMeter.h>
#include <EditorModel/bus/View.h>

#include <gtest/gtest.h>

#include <type_traits>

namespace {

using VUMeter::Object;

static_assert(Testing::isVirtualBase<PubSub::Object, Object>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, Object>);
static_assert(sizeof(Object::Role) == 4);

Object withEveryFieldSet()
{
    Object meter("microphone", Object::Role(2));
    meter.setLeftChannelPeakLevel(-1.0_dB)->setRightChannelPeakLevel(-2.0_dB);
    meter.setLeftChannelLevel(-3.0_dB)->setRightChannelLevel(-4.0_dB);
    meter.setLeftChannelClippingDetected(true)->setRightChannelClippingDetected(true);
    return meter;
}

void expectMeasured(const Object& meter)
{
    EXPECT_EQ(meter.leftChannelPeakLevel.level(), -1.0);
    EXPECT_EQ(meter.rightChannelPeakLevel.level(), -2.0);
    EXPECT_EQ(meter.leftChannelLevel.level(), -3.0);
    EXPECT_EQ(meter.rightChannelLevel.level(), -4.0);
    EXPECT_TRUE(meter.leftChannelClippingDetected);
    EXPECT_TRUE(meter.rightChannelClippingDetected);
}

void expectNothingMeasured(const Object& meter)
{
    EXPECT_EQ(meter.leftChannelPeakLevel.level(), 0.0);
    EXPECT_EQ(meter.rightChannelPeakLevel.level(), 0.0);
    EXPECT_EQ(meter.leftChannelLevel.level(), 0.0);
    EXPECT_EQ(meter.rightChannelLevel.level(), 0.0);
    EXPECT_FALSE(meter.leftChannelClippingDetected);
    EXPECT_FALSE(meter.rightChannelClippingDetected);
}

void expectEveryFieldSet(const Object& meter)
{
    EXPECT_EQ(meter.sourceID, "microphone");
    EXPECT_EQ(meter.role, 2);
    expectMeasured(meter);
}

TEST(VUMeter, IsMadeForASourceInARole)
{
    const Object meter("output", Object::Role(3));
    EXPECT_EQ(meter.sourceID, "output");
    EXPECT_EQ(meter.role, 3);
    expectNothingMeasured(meter);
}

TEST(VUMeter, CopyingFromAnotherTakesWhatWasMeasuredAndKeepsWhoItIs)
{
    const Object other = withEveryFieldSet();
    Object meter("output", Object::Role(3));
    EXPECT_EQ(meter.copyFrom(&other), &meter);
    EXPECT_EQ(meter.sourceID, "output");
    EXPECT_EQ(meter.role, 3);
    expectMeasured(meter);
    expectEveryFieldSet(other);
}

TEST(VUMeter, CopyingFromItselfChangesNothing)
{
    Object meter = withEveryFieldSet();
    EXPECT_EQ(meter.copyFrom(&meter), &meter);
    expectEveryFieldSet(meter);
}

TEST(VUMeter, TakesLevelsOverWithinAChange)
{
    Object meter("output", Object::Role(3));
    const Object measured = withEveryFieldSet();
    Message::View<Object> owner, observer;
    owner.own(&meter);
    observer.observe(&meter);
    observer.change(&meter)->copyFrom(&measured);
    expectMeasured(*observer.object());
    EXPECT_EQ(observer.object()->sourceID, "output");
}

} // namespace
