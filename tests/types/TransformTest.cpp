// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/Transform.h>

#include <EditorModel/types/Norvel.h>

#include <QTransform>

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <array>

namespace {

using Norvel::Proc::Matrix3x3;
using Types::Transform;
using Numbers = std::array<double, 9>;

template <class T>
Numbers numbersOf(const T& t)
{
    return {t.m11, t.m12, t.m13, t.m21, t.m22, t.m23, t.m31, t.m32, t.m33};
}

Numbers numbersOf(const QTransform& t)
{
    return {t.m11(), t.m12(), t.m13(), t.m21(), t.m22(), t.m23(), t.m31(), t.m32(), t.m33()};
}

const Numbers COUNTED = {1, 2, 3, 4, 5, 6, 7, 8, 9};

TEST(Transform, IsTheIdentityAtFirst)
{
    EXPECT_TRUE(Transform().toQTransform().isIdentity());
}

TEST(Transform, TakesNineNumbersRowByRow)
{
    EXPECT_EQ(COUNTED, numbersOf(Transform(1, 2, 3, 4, 5, 6, 7, 8, 9)));
}

TEST(Transform, CopiesAMatrixStraight)
{
    const Matrix3x3 matrix = {1, 2, 3, 4, 5, 6, 7, 8, 9};
    Transform assigned;
    assigned = matrix;
    EXPECT_EQ(COUNTED, numbersOf(Transform(matrix)));
    EXPECT_EQ(COUNTED, numbersOf(assigned));
    EXPECT_EQ(COUNTED, numbersOf(Transform::fromMatrix3x3(matrix)));
    EXPECT_EQ(COUNTED, numbersOf(assigned.toMatrix3x3()));
}

TEST(Transform, TakesTheLikeNamedNumbersOfAQTransform)
{
    const QTransform transform(1, 2, 3, 4, 5, 6, 7, 8, 9);
    Transform assigned;
    assigned = transform;
    EXPECT_EQ(COUNTED, numbersOf(Transform(transform)));
    EXPECT_EQ(COUNTED, numbersOf(assigned));
    EXPECT_EQ(COUNTED, numbersOf(Transform::fromQTransform(transform)));
    EXPECT_EQ(COUNTED, numbersOf(assigned.toQTransform()));
}

TEST(Transform, HoldsATranslationInItsThirdRow)
{
    const Transform transform = QTransform::fromTranslate(30, 40);
    EXPECT_EQ(30.0, transform.m31);
    EXPECT_EQ(40.0, transform.m32);
    EXPECT_EQ(QPointF(31, 42), transform.toQTransform().map(QPointF(1, 2)));
}

RC_GTEST_PROP(Transform, ComesBackFromQTransformAndMatrix, (const Numbers& n))
{
    const Transform transform(n[0], n[1], n[2], n[3], n[4], n[5], n[6], n[7], n[8]);
    RC_ASSERT(numbersOf(Transform(transform.toQTransform())) == n);
    RC_ASSERT(numbersOf(Transform(transform.toMatrix3x3())) == n);
}

} // namespace
