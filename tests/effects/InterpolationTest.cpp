// SPDX-License-Identifier: Apache-2.0
#include "Matrices.h"

#include <EditorModel/effects/Envelope.h>

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <string>

namespace {

using Types::Transform;
using Interpolator = Envelope::TransformationInterpolator;

/// The coefficients of a rotation, written out: QTransform turns its x axis towards its y axis.
Numbers rotatedBy(double degrees)
{
    const double angle = degrees / 180.0 * std::acos(-1.0);
    return {std::cos(angle), std::sin(angle), 0, -std::sin(angle), std::cos(angle), 0, 0, 0, 1};
}

Transform transformOf(const Numbers& n)
{
    return Transform(n[0], n[1], n[2], n[3], n[4], n[5], n[6], n[7], n[8]);
}

Transformation::Object rotated(double degrees)
{
    return Transformation::Object(transformOf(rotatedBy(degrees)), 100);
}

/// At a part of the way between two matrices.
Transform between(const Transform& lower, const Transform& upper, double t)
{
    return Interpolator::interpolate(0, 1, t, {lower, 100}, {upper, 100}).matrix;
}

int opacityBetween(int lower, int upper, double t)
{
    return Interpolator::interpolate(0, 1, t, {Transform(), lower}, {Transform(), upper}).opacity;
}

TEST(TransformationInterpolation, MovesInAStraightLine)
{
    const Transform lower(1, 0, 0, 0, 1, 0, 10, -8, 1);
    const Transform upper(1, 0, 0, 0, 1, 0, 30, -12, 1);
    expectMatrix(between(lower, upper, 0), {1, 0, 0, 0, 1, 0, 10, -8, 1});
    expectMatrix(between(lower, upper, 0.25), {1, 0, 0, 0, 1, 0, 15, -9, 1});
    expectMatrix(between(lower, upper, 1), {1, 0, 0, 0, 1, 0, 30, -12, 1});
}

TEST(TransformationInterpolation, CountsTheWayInStepsOfItsOwn)
{
    const Transformation::Object lower(Transform(), 0);
    const Transformation::Object upper(Transform(1, 0, 0, 0, 1, 0, 8, 0, 1), 100);
    const auto value = Interpolator::interpolate(2, 6, 3, lower, upper);
    EXPECT_DOUBLE_EQ(value.matrix.m31, 2);
    EXPECT_EQ(value.opacity, 25);
}

TEST(TransformationInterpolation, ScalesEachSideByItself)
{
    const Transform lower(1, 0, 0, 0, 2, 0, 0, 0, 1);
    const Transform upper(3, 0, 0, 0, 4, 0, 0, 0, 1);
    expectMatrix(between(lower, upper, 0.5), {2, 0, 0, 0, 3, 0, 0, 0, 1});
    expectMatrix(between(lower, upper, 0.75), {2.5, 0, 0, 0, 3.5, 0, 0, 0, 1});
}

TEST(TransformationInterpolation, TurnsTheShorterWay)
{
    const struct
    {
        double from, to, t, expected;
    } table[] = {
        {0, 90, 0.5, 45},     {90, 0, 0.5, 45},    {350, 10, 0.5, 0},    {350, 10, 0.25, 355},
        {350, 10, 0.75, 5},   {10, 350, 0.5, 0},   {10, 350, 0.25, 5},   {0, 180, 0.5, 270},
        {180, 0, 0.5, 90},    {0, 179, 0.5, 89.5}, {0, 181, 0.5, 270.5}, {270, 180, 0.5, 225},
        {200, 200, 0.3, 200}, {300, 100, 0.5, 20},
    };
    for (const auto& row : table) {
        SCOPED_TRACE(std::to_string(row.from) + " to " + std::to_string(row.to));
        expectMatrix(between(transformOf(rotatedBy(row.from)), transformOf(rotatedBy(row.to)), row.t),
                     rotatedBy(row.expected));
    }
}

TEST(TransformationInterpolation, PassesZeroBetween350And10)
{
    TransformationEnvelope envelope;
    envelope.addKeyValue(0, rotated(350))->addKeyValue(1, rotated(10));
    expectMatrix(envelope.valueAt(0.5).matrix, identity);
}

TEST(TransformationInterpolation, TurnsBackwardsByHalfATurn)
{
    TransformationEnvelope envelope;
    envelope.addKeyValue(0, rotated(0))->addKeyValue(1, rotated(180));
    expectMatrix(envelope.valueAt(0.5).matrix, {0, -1, 0, 1, 0, 0, 0, 0, 1});
}

TEST(TransformationInterpolation, AHalfTurnBackwardsEndsAsOneForwards)
{
    // Qt knows the sine of 180 degrees exactly, and that of -180 only nearly.
    const Transform half(-1, 0, 0, 0, -1, 0, 0, 0, 1);
    EXPECT_EQ(between(Transform(), half, 1).m12, 0.0);
}

TEST(TransformationInterpolation, ScalesThenTurnsThenMoves)
{
    // Twice as wide, turned by a quarter, then moved: the x axis ends on (0, 2), the y axis on (-1, 0).
    const Transform matrix(0, 2, 0, -1, 0, 0, 5, 6, 1);
    expectMatrix(between(matrix, matrix, 0.5), {0, 2, 0, -1, 0, 0, 5, 6, 1});
    // Half way from there to the identity: 1.5 by 1, an eighth of a turn, and half of the distance.
    const double half = std::sqrt(0.5);
    expectMatrix(between(matrix, Transform(), 0.5), {1.5 * half, 1.5 * half, 0, -half, half, 0, 2.5, 3, 1});
}

TEST(TransformationInterpolation, DropsShearAndPerspective)
{
    // A shear makes the picture of the unit square two wide.
    const Transform sheared(1, 0, 0, 1, 1, 0, 0, 0, 1);
    expectMatrix(between(sheared, sheared, 0.5), {2, 0, 0, 0, 1, 0, 0, 0, 1});
    // The far side, divided by two, ends at half the height.
    const Transform inPerspective(1, 0, 0, 0, 1, 1, 0, 0, 1);
    expectMatrix(between(inPerspective, inPerspective, 0.5), {1, 0, 0, 0, 0.5, 0, 0, 0, 1});
    // A mirrored picture is taken for one that was turned by half a turn.
    const Transform mirrored(-1, 0, 0, 0, 1, 0, 0, 0, 1);
    expectMatrix(between(mirrored, mirrored, 0.5), {-1, 0, 0, 0, -1, 0, 0, 0, 1});
}

TEST(TransformationInterpolation, TakesAPointForUnturned)
{
    const Transform point(0, 0, 0, 0, 0, 0, 2, 0, 1);
    expectMatrix(between(point, Transform(), 0.5), {0.5, 0, 0, 0, 0.5, 0, 1, 0, 1});
    expectMatrix(between(point, transformOf(rotatedBy(90)), 0.5),
                 {0.5 * std::sqrt(0.5), 0.5 * std::sqrt(0.5), 0, -0.5 * std::sqrt(0.5), 0.5 * std::sqrt(0.5),
                  0, 1, 0, 1});
}

TEST(TransformationInterpolation, IsNotHeldBetweenItsKeys)
{
    const Transform upper(1, 0, 0, 0, 1, 0, 10, 0, 1);
    EXPECT_DOUBLE_EQ(between(Transform(), upper, 2).m31, 20);
    EXPECT_DOUBLE_EQ(between(Transform(), upper, -1).m31, -10);
    expectMatrix(between(Transform(), transformOf(rotatedBy(90)), 5), rotatedBy(90));
}

TEST(TransformationInterpolation, RoundsTheOpacity)
{
    EXPECT_EQ(opacityBetween(0, 100, 0.5), 50);
    EXPECT_EQ(opacityBetween(0, 1, 0.5), 1);
    EXPECT_EQ(opacityBetween(0, 1, 0.25), 0);
    EXPECT_EQ(opacityBetween(1, 0, 0.5), 1);
    EXPECT_EQ(opacityBetween(100, 0, 0.25), 75);
    EXPECT_EQ(opacityBetween(0, 3, 0.5), 2);
    EXPECT_EQ(opacityBetween(100, 100, 0.5), 100);
    // Below zero it is cut off: -99.5 and -1.0.
    EXPECT_EQ(opacityBetween(-100, -100, 0.5), -99);
    EXPECT_EQ(opacityBetween(-1, -2, 0.5), -1);
}

TEST(TransformationInterpolation, BetweenEqualStepsEndsInNotANumber)
{
    const auto value = Interpolator::interpolate(1, 1, 1, rotated(0), rotated(90));
    EXPECT_TRUE(std::isnan(value.matrix.m11));
    EXPECT_TRUE(std::isnan(value.matrix.m31));
    EXPECT_EQ(value.opacity, std::numeric_limits<int>::min());
}

TEST(TransformationInterpolation, EndsForAWayThatIsInfinitelyLong)
{
    TransformationEnvelope envelope;
    envelope.addKeyValue(1, rotated(270))->addKeyValue(1, rotated(0));
    // Just before both keys, which count as reached: the angle goes to infinity, backwards and forwards.
    EXPECT_TRUE(std::isnan(envelope.valueAt(1 - 1e-15).matrix.m11));
    EXPECT_TRUE(std::isnan(Interpolator::interpolate(1, 1, 1 - 1e-15, rotated(0), rotated(270)).matrix.m11));
    EXPECT_TRUE(std::isnan(Interpolator::interpolate(1, 1, 1 - 1e-15, rotated(270), rotated(0)).matrix.m11));
}

} // namespace
