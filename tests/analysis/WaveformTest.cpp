// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/analysis/Waveform.h>
#include <EditorModel/bus/View.h>

#include <gtest/gtest.h>

#include <type_traits>

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
