// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/effects/Transformation.h>

#include <gtest/gtest.h>

#include <memory>
#include <type_traits>

namespace {

using Transformation::Object;
using Types::Transform;

static_assert(std::is_base_of_v<Serialize::ISerializable, Object>);
static_assert(!Testing::isVirtualBase<Serialize::ISerializable, Object>);
static_assert(!std::is_base_of_v<PubSub::Object, Object>);

const Transform oneToNine(1, 2, 3, 4, 5, 6, 7, 8, 9);

TEST(TransformationEquality, AllowsForTwelveDigitsOfEveryCoefficient)
{
    const auto coefficients = {&Transform::m11, &Transform::m12, &Transform::m13,
                               &Transform::m21, &Transform::m22, &Transform::m23,
                               &Transform::m31, &Transform::m32, &Transform::m33};
    const Object object(oneToNine, 60);
    EXPECT_TRUE(object == object);
    EXPECT_FALSE(object != object);
    for (const auto coefficient : coefficients) {
        Object other = object;
        other.matrix.*coefficient *= 1.0 + 0.5e-12;
        EXPECT_TRUE(object == other);
        EXPECT_FALSE(object != other);
        other.matrix.*coefficient *= 1.0 + 4e-12;
        EXPECT_FALSE(object == other);
        EXPECT_TRUE(object != other);
    }
}

TEST(TransformationEquality, FindsNothingButZeroEqualToZero)
{
    const Object object;
    Object other;
    other.matrix.m31 = -0.0;
    EXPECT_TRUE(object == other);
    other.matrix.m31 = 1e-300;
    EXPECT_FALSE(object == other);
}

TEST(TransformationEquality, IsExactForTheOpacity)
{
    EXPECT_TRUE(Object(oneToNine, 60) == Object(oneToNine, 60));
    EXPECT_FALSE(Object(oneToNine, 60) == Object(oneToNine, 61));
    EXPECT_TRUE(Object(oneToNine, 60) != Object(oneToNine, 61));
}

TEST(Transformation, IsStoredUnderItsNameMatrixFirst)
{
    EXPECT_STREQ(Object::NameInArchive(), "Transformation::Object");
    EXPECT_EQ(Object().GetNameInArchive(), "Transformation::Object");
    ASSERT_NE(Serialize::findCreator("Transformation::Object"), nullptr);
    const std::unique_ptr<Serialize::ISerializable> made(
        Serialize::findCreator("Transformation::Object")->Create());
    EXPECT_NE(dynamic_cast<Object*>(made.get()), nullptr);
    EXPECT_EQ(Testing::Dump::of(Object(oneToNine, 60)), "root: Transformation::Object #1\n"
                                                        "  matrix: Types::Transform\n"
                                                        "    m11: 1\n"
                                                        "    m12: 2\n"
                                                        "    m13: 3\n"
                                                        "    m21: 4\n"
                                                        "    m22: 5\n"
                                                        "    m23: 6\n"
                                                        "    m31: 7\n"
                                                        "    m32: 8\n"
                                                        "    m33: 9\n"
                                                        "  opacity: 60\n");
}

} // namespace
