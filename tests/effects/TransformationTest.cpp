// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/effects/Transformation.h>

#include <gtest/gtest.h>

#include <memory>
#include <type_traits>
#include <utility>

namespace {

using Transformation::Object;
using Types::Transform;

static_assert(std::is_base_of_v<Serialize::ISerializable, Object>);
static_assert(!Testing::isVirtualBase<Serialize::ISerializable, Object>);
static_assert(!std::is_base_of_v<PubSub::Object, Object>);

const Transform oneToNine(1, 2, 3, 4, 5, 6, 7, 8, 9);

void expectOneToNine(const Object& object)
{
    EXPECT_EQ(object.matrix.m11, 1);
    EXPECT_EQ(object.matrix.m12, 2);
    EXPECT_EQ(object.matrix.m13, 3);
    EXPECT_EQ(object.matrix.m21, 4);
    EXPECT_EQ(object.matrix.m22, 5);
    EXPECT_EQ(object.matrix.m23, 6);
    EXPECT_EQ(object.matrix.m31, 7);
    EXPECT_EQ(object.matrix.m32, 8);
    EXPECT_EQ(object.matrix.m33, 9);
    EXPECT_EQ(object.opacity, 60);
}

TEST(Transformation, IsAnOpaqueIdentityByDefault)
{
    const Object object;
    EXPECT_EQ(object.matrix.m11, 1.0);
    EXPECT_EQ(object.matrix.m12, 0.0);
    EXPECT_EQ(object.matrix.m13, 0.0);
    EXPECT_EQ(object.matrix.m21, 0.0);
    EXPECT_EQ(object.matrix.m22, 1.0);
    EXPECT_EQ(object.matrix.m23, 0.0);
    EXPECT_EQ(object.matrix.m31, 0.0);
    EXPECT_EQ(object.matrix.m32, 0.0);
    EXPECT_EQ(object.matrix.m33, 1.0);
    EXPECT_EQ(object.opacity, 100);
}

TEST(Transformation, SettersStoreWhatTheyAreGivenAndReturnTheObject)
{
    Object object;
    EXPECT_EQ(object.setMatrix(oneToNine), &object);
    EXPECT_EQ(object.setOpacity(-7), &object);
    EXPECT_EQ(object.opacity, -7);
    object.setMatrix(oneToNine)->setOpacity(60);
    expectOneToNine(object);
}

TEST(Transformation, CopiesWhole)
{
    const Object original(oneToNine, 60);
    expectOneToNine(original);
    Object copy(original);
    expectOneToNine(copy);

    Object assigned;
    EXPECT_EQ(&(assigned = original), &assigned);
    expectOneToNine(assigned);
    const Object& itself = assigned;
    assigned = itself;
    expectOneToNine(assigned);

    Object moved(std::move(copy));
    expectOneToNine(moved);
    Object target;
    target = std::move(moved);
    expectOneToNine(target);
}

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
