// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/effects/TransformationPreset.h>

#include <gtest/gtest.h>

#include <memory>
#include <type_traits>
#include <utility>

namespace {

using Envelope::TransformationPreset;

static_assert(std::is_base_of_v<Serialize::ISerializable, TransformationPreset>);
static_assert(!Testing::isVirtualBase<Serialize::ISerializable, TransformationPreset>);
static_assert(Testing::isVirtualBase<PubSub::Object, TransformationPreset>);

TransformationPreset presetWithEveryFieldSet()
{
    TransformationPreset preset;
    preset.type = TransformationPreset::Type(3);
    preset.tag = "slow";
    preset.description = "From left to right";
    preset.sourceDuration = MTime(2500);
    preset.transformation.addKeyValue(0.5, Transformation::Object(Types::Transform(), 70));
    preset.transformation.defaultValue.setOpacity(20);
    return preset;
}

TEST(TransformationPreset, LeavesNoKeysBehindWhenItIsMoved)
{
    TransformationPreset original = presetWithEveryFieldSet();
    const TransformationPreset moved(std::move(original));
    EXPECT_TRUE(original.transformation.keyValues.empty());
    EXPECT_EQ(original.transformation.defaultValue.opacity, 20);
}

TEST(TransformationPreset, HasAMimeType)
{
    ASSERT_NE(TransformationPreset::mimeType, nullptr);
    EXPECT_EQ(*TransformationPreset::mimeType, "x-application/TransformationItem-serialized");
}

TEST(TransformationPreset, IsStoredUnderItsNameFieldByField)
{
    EXPECT_STREQ(TransformationPreset::NameInArchive(), "Envelope::TransformationPreset");
    EXPECT_EQ(TransformationPreset().GetNameInArchive(), "Envelope::TransformationPreset");
    ASSERT_NE(Serialize::findCreator("Envelope::TransformationPreset"), nullptr);
    const std::unique_ptr<Serialize::ISerializable> made(
        Serialize::findCreator("Envelope::TransformationPreset")->Create());
    EXPECT_NE(dynamic_cast<TransformationPreset*>(made.get()), nullptr);

    const std::string dump = Testing::Dump::of(presetWithEveryFieldSet());
    const std::string expected = "root: Envelope::TransformationPreset #1\n"
                                 "  type: 3\n"
                                 "  tag: Q\"slow\"\n"
                                 "  description: Q\"From left to right\"\n"
                                 "  sourceDuration: 2500ms\n"
                                 "  transformation: TransformationEnvelope\n"
                                 "    defaultValue: Transformation::Object\n";
    EXPECT_EQ(dump.substr(0, expected.size()), expected);
}

} // namespace
