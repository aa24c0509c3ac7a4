// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"
#include "tests/types/Printing.h"

#include <EditorModel/analysis/Filmstrip.h>
#include <EditorModel/bus/View.h>

#include <gtest/gtest.h>

#include <type_traits>

// What a module that makes filmstrips defines.
namespace Filmstrip {
class Payload
{};
} // namespace Filmstrip

namespace {

using Filmstrip::Object;
using Types::Range;

static_assert(Testing::isVirtualBase<PubSub::Object, Object>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, Object>);
static_assert(std::is_same_v<decltype(Object::bumpCount), quint64>);

const ResourceRef film = {QStringLiteral("film"), Resource::VideoType};
const auto payload = std::make_shared<const Filmstrip::Payload>();

Object withEveryFieldSet()
{
    Object strip;
    strip.setResource(film)->setWidth(64)->setHeight(36)->setSourceDuration(60000);
    strip.setTimingMode(Media::TimingMode(2))->setSourceRange(1000, 9000)->setCurrentRange(2000, 3000);
    strip.setStep(250)->setReversed(true)->bump();
    strip.payload = payload;
    return strip;
}

void expectEveryFieldSet(const Object& strip, quint64 bumps = 1)
{
    EXPECT_EQ(strip.resource, film);
    EXPECT_EQ(strip.width, 64);
    EXPECT_EQ(strip.height, 36);
    EXPECT_EQ(strip.sourceDuration, MTime(60000));
    EXPECT_EQ(strip.timingMode, 2);
    EXPECT_EQ(strip.sourceRange, Range(1000, 9000));
    EXPECT_EQ(strip.currentRange, Range(2000, 3000));
    EXPECT_EQ(strip.step, MTime(250));
    EXPECT_TRUE(strip.reversed);
    EXPECT_EQ(strip.bumpCount, bumps);
    EXPECT_EQ(strip.payload, payload);
}

TEST(Filmstrip, RangesAreSetAsSuchOrByTheirEnds)
{
    Object strip;
    strip.setSourceRange(Range(1, 2))->setCurrentRange(Range(3, 4));
    EXPECT_EQ(strip.sourceRange, Range(1, 2));
    EXPECT_EQ(strip.currentRange, Range(3, 4));
    EXPECT_EQ(strip.setSourceRange(20, 10), &strip);
    EXPECT_EQ(strip.setCurrentRange(40, 30), &strip);
    EXPECT_EQ(strip.sourceRange, Range(20, 10)) << "kept although it ends before it begins";
    EXPECT_EQ(strip.currentRange, Range(40, 30));
}

TEST(Filmstrip, BumpingTwiceCountsTwoAndChangesNothingElse)
{
    Object strip = withEveryFieldSet();
    EXPECT_EQ(strip.bump()->bump(), &strip);
    expectEveryFieldSet(strip, 3);
}

TEST(Filmstrip, CountsOnBeyond32Bits)
{
    Object strip;
    strip.bumpCount = 4294967295;
    EXPECT_EQ(strip.bump()->bumpCount, 4294967296u);
}

TEST(Filmstrip, ObserversTellABumpFromNoChange)
{
    class Observer : public Message::View<Object>
    {
    public:
        quint64 bumps = 0;

    private:
        void changed(const Object* strip, const Object* old) override
        {
            bumps += strip->bumpCount - old->bumpCount;
        }
    };
    Object strip;
    Message::View<Object> owner;
    Observer observer;
    owner.own(&strip);
    observer.observe(&strip);
    observer.change(&strip)->setStep(MTime());
    EXPECT_EQ(observer.bumps, 0u);
    observer.change(&strip)->bump();
    EXPECT_EQ(observer.bumps, 1u);
}

} // namespace
