// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/analysis/Waveform.h>
#include <EditorModel/bus/View.h>

#include <gtest/gtest.h>

#include <type_traits>
#include <utility>

// What an analysing module defines.
namespace Types {
class Blob
{};
} // namespace Types

namespace {

using Waveform::Object;

static_assert(Testing::isVirtualBase<PubSub::Object, Object>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, Object>);

const ResourceRef sound = {QStringLiteral("sound"), Resource::AudioType};
const auto blob = std::make_shared<const Types::Blob>();

TEST(Waveform, IsOfNothingByDefault)
{
    const Object waveform;
    EXPECT_EQ(waveform.resource, ResourceRef(QString(), Resource::NoType));
    EXPECT_EQ(waveform.data, nullptr);
}

TEST(Waveform, SettersStoreAndReturnTheObject)
{
    Object waveform;
    EXPECT_EQ(waveform.setResource(sound), &waveform);
    EXPECT_EQ(waveform.setData(blob), &waveform);
    EXPECT_EQ(waveform.resource, sound);
    EXPECT_EQ(waveform.data, blob);
    waveform.setData(nullptr);
    EXPECT_EQ(waveform.data, nullptr);
}

TEST(Waveform, CopiesWholeAndSharesTheData)
{
    const auto expectWhole = [](const Object& waveform) {
        EXPECT_EQ(waveform.resource, sound);
        EXPECT_EQ(waveform.data, blob);
    };
    Object original;
    original.setResource(sound)->setData(blob);
    Object copy(original);
    expectWhole(copy);
    Object assigned;
    EXPECT_EQ(&(assigned = original), &assigned);
    const Object& itself = assigned;
    assigned = itself;
    expectWhole(assigned);
    const Object moved(std::move(copy));
    expectWhole(moved);
    Object target;
    EXPECT_EQ(&(target = std::move(assigned)), &target);
    expectWhole(target);
    expectWhole(original);
}

TEST(Waveform, ReachesItsObserversOnTheBus)
{
    Object waveform;
    Message::View<Object> owner, observer;
    owner.own(&waveform);
    observer.observe(&waveform);
    owner.change(&waveform)->setResource(sound)->setData(blob);
    EXPECT_EQ(observer.object()->data, blob);
}

} // namespace
