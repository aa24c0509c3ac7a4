// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/Envelope.h>
#include <EditorModel/types/Norvel.h>

#include <QTransform>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <functional>
#include <limits>
#include <memory>
#include <string>
#include <vector>

namespace {

using Envelope::combine;
using Envelope::envelopeFunction;
using Envelope::fadeFunction;
using Norvel::Proc::Matrix3x3;
using Types::Transform;
using Interpolator = Envelope::TransformationInterpolator;

constexpr double infinity = std::numeric_limits<double>::infinity();

using Numbers = std::array<double, 9>;
constexpr Numbers identity{1, 0, 0, 0, 1, 0, 0, 0, 1};

template <class M>
Numbers numbersOf(const M& m)
{
    return {m.m11, m.m12, m.m13, m.m21, m.m22, m.m23, m.m31, m.m32, m.m33};
}

template <class M>
void expectMatrix(const M& matrix, const Numbers& expected)
{
    const Numbers numbers = numbersOf(matrix);
    for (std::size_t i = 0; i < 9; ++i) {
        EXPECT_NEAR(numbers[i], expected[i], 1e-12) << "coefficient " << i;
    }
}

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

VolumeEnvelope hill()
{
    VolumeEnvelope envelope;
    envelope.addKeyValue(0, 0)->addKeyValue(0.5, 1)->addKeyValue(1, 0.5);
    return envelope;
}

TEST(VolumeFunction, FollowsTheEnvelopeOverTheSpan)
{
    const VolumeEnvelope envelope = hill();
    const auto gain = envelopeFunction(0, 100, 100, &envelope);
    EXPECT_DOUBLE_EQ(gain(1000, 1000, 3000), 0);
    EXPECT_DOUBLE_EQ(gain(1250, 1000, 3000), 0.25);
    EXPECT_DOUBLE_EQ(gain(2000, 1000, 3000), 1);
    EXPECT_DOUBLE_EQ(gain(2500, 1000, 3000), 0.75);
    EXPECT_DOUBLE_EQ(gain(3000, 1000, 3000), 0.5);
    EXPECT_DOUBLE_EQ(gain(0, 1000, 3000), 0);
    EXPECT_DOUBLE_EQ(gain(9000, 1000, 3000), 0.5);
}

TEST(VolumeFunction, AddressesAPartOfTheAxisHoweverLongItIsPlayed)
{
    const VolumeEnvelope envelope = hill();
    // From 0.25 on the axis to 0.75.
    const auto gain = envelopeFunction(50, 200, 100, &envelope);
    for (const qint64 length : {100, 1000, 10}) {
        EXPECT_DOUBLE_EQ(gain(0, 0, length), 0.5);
        EXPECT_DOUBLE_EQ(gain(length / 2, 0, length), 1);
        EXPECT_DOUBLE_EQ(gain(length, 0, length), 0.75);
        // What lies beyond the part still is on the axis.
        EXPECT_DOUBLE_EQ(gain(length + length / 2, 0, length), 0.5);
        EXPECT_DOUBLE_EQ(gain(-length / 2, 0, length), 0);
    }
}

TEST(VolumeFunction, OfNothingIsOneEverywhere)
{
    const auto gain = envelopeFunction(0, 0, 0, static_cast<const VolumeEnvelope*>(nullptr));
    EXPECT_EQ(gain(5, 0, 10), 1.0);
    EXPECT_EQ(gain(-5, 0, 0), 1.0);
}

TEST(VolumeFunction, WithoutKeysIsTheDefault)
{
    VolumeEnvelope envelope;
    EXPECT_EQ(envelopeFunction(0, 10, 10, &envelope)(3, 0, 10), 1.0);
    envelope.defaultValue = 0.25;
    EXPECT_EQ(envelopeFunction(0, 10, 10, &envelope)(3, 0, 10), 0.25);
    EXPECT_EQ(envelopeFunction(0, 10, 10, &envelope)(3, 3, 3), 0.25);
}

TEST(VolumeFunction, OfASingleKeyIsItsValueEverywhere)
{
    VolumeEnvelope envelope;
    envelope.addKeyValue(0.5, 0.125);
    const auto gain = envelopeFunction(0, 10, 10, &envelope);
    for (const qint64 current : {-5, 0, 3, 5, 8, 10, 20}) {
        EXPECT_EQ(gain(current, 0, 10), 0.125);
    }
    EXPECT_EQ(gain(0, 0, 0), 0.125);
}

TEST(VolumeFunction, AtTwoKeysOfOneStepIsNotANumber)
{
    VolumeEnvelope envelope;
    envelope.addKeyValue(0, 0)->addKeyValue(0.5, 20)->addKeyValue(0.5, 10)->addKeyValue(1, 30);
    const auto gain = envelopeFunction(0, 10, 10, &envelope);
    EXPECT_TRUE(std::isnan(gain(5, 0, 10)));
    EXPECT_DOUBLE_EQ(gain(4, 0, 10), 8);
    EXPECT_DOUBLE_EQ(gain(6, 0, 10), 22);
}

TEST(VolumeFunction, DividesByZeroOnASpanWithoutLength)
{
    const VolumeEnvelope envelope = hill();
    const auto gain = envelopeFunction(0, 100, 100, &envelope);
    EXPECT_TRUE(std::isnan(gain(7, 7, 7)));
    EXPECT_DOUBLE_EQ(gain(8, 7, 7), 0.5);
    EXPECT_DOUBLE_EQ(gain(6, 7, 7), 0);
}

TEST(VolumeFunction, DividesByATotalOfZero)
{
    const VolumeEnvelope envelope = hill();
    EXPECT_TRUE(std::isnan(envelopeFunction(0, 0, 0, &envelope)(5, 0, 10)));
    // An infinite offset is beyond the last key.
    EXPECT_DOUBLE_EQ(envelopeFunction(1, 0, 1, &envelope)(5, 0, 10), 0.5);
}

TEST(VolumeFunction, KeepsACopyOfTheEnvelope)
{
    auto envelope = std::make_unique<VolumeEnvelope>(hill());
    const auto gain = envelopeFunction(0, 100, 100, envelope.get());
    envelope->addKeyValue(0.25, 100);
    EXPECT_DOUBLE_EQ(gain(25, 0, 100), 0.5);
    envelope.reset();
    EXPECT_DOUBLE_EQ(gain(25, 0, 100), 0.5);
    const auto copy = gain;
    EXPECT_DOUBLE_EQ(copy(75, 0, 100), 0.75);
}

TEST(VolumeFunction, AgreesWithTheEnvelopeAlsoWhereItIsNotSorted)
{
    VolumeEnvelope envelope;
    const double steps[] = {0.5, 0.125, 0.75, 0.25, 1.0, 0.875, 0.0};
    for (const double step : steps) {
        envelope.keyValues.emplace_back(step, 10 * step + 1);
    }
    const auto gain = envelopeFunction(0, 64, 64, &envelope);
    for (int i = -8; i <= 72; ++i) {
        EXPECT_DOUBLE_EQ(gain(i, 0, 64), envelope.valueAt(i / 64.0)) << i;
    }
}

struct Rendered
{
    Matrix3x3 matrix{9, 9, 9, 9, 9, 9, 9, 9, 9};
    double opacity = 9;
};

Rendered render(const Envelope::TransformationFunction& function, double progress)
{
    Rendered rendered;
    function(progress, rendered.matrix, rendered.opacity);
    return rendered;
}

TransformationEnvelope slide()
{
    TransformationEnvelope envelope;
    envelope.addKeyValue(0, {Transform(1, 0, 0, 0, 1, 0, 0, 0, 1), 0});
    envelope.addKeyValue(1, {Transform(3, 0, 0, 0, 5, 0, 8, -4, 1), 100});
    return envelope;
}

TEST(TransformationFunction, FollowsTheEnvelopeByProgress)
{
    const TransformationEnvelope envelope = slide();
    const auto function = envelopeFunction(0, 10, 10, &envelope);
    const Rendered half = render(function, 0.5);
    expectMatrix(half.matrix, {2, 0, 0, 0, 3, 0, 4, -2, 1});
    EXPECT_DOUBLE_EQ(half.opacity, 0.5);
    const Rendered before = render(function, -1);
    EXPECT_EQ(numbersOf(before.matrix), identity);
    EXPECT_EQ(before.opacity, 0.0);
    const Rendered after = render(function, 2);
    EXPECT_EQ(numbersOf(after.matrix), (Numbers{3, 0, 0, 0, 5, 0, 8, -4, 1}));
    EXPECT_EQ(after.opacity, 1.0);
}

TEST(TransformationFunction, AddressesAPartOfTheAxis)
{
    const TransformationEnvelope envelope = slide();
    // From 0.25 on the axis to 0.75.
    const auto function = envelopeFunction(25, 100, 50, &envelope);
    expectMatrix(render(function, 0).matrix, {1.5, 0, 0, 0, 2, 0, 2, -1, 1});
    expectMatrix(render(function, 0.5).matrix, {2, 0, 0, 0, 3, 0, 4, -2, 1});
    expectMatrix(render(function, 1).matrix, {2.5, 0, 0, 0, 4, 0, 6, -3, 1});
    EXPECT_DOUBLE_EQ(render(function, 1).opacity, 0.75);
}

TEST(TransformationFunction, OfNothingIsTheIdentityAndOpaque)
{
    const auto function = envelopeFunction(0, 0, 0, static_cast<const TransformationEnvelope*>(nullptr));
    const Rendered rendered = render(function, 0.5);
    EXPECT_EQ(numbersOf(rendered.matrix), identity);
    EXPECT_EQ(rendered.opacity, 1.0);
}

TEST(TransformationFunction, WithoutKeysIsTheDefault)
{
    TransformationEnvelope envelope;
    envelope.defaultValue.setMatrix(Transform(1, 2, 3, 4, 5, 6, 7, 8, 9))->setOpacity(30);
    const Rendered rendered = render(envelopeFunction(0, 10, 10, &envelope), 0.5);
    EXPECT_EQ(numbersOf(rendered.matrix), (Numbers{1, 2, 3, 4, 5, 6, 7, 8, 9}));
    EXPECT_DOUBLE_EQ(rendered.opacity, 0.3);
}

TEST(TransformationFunction, OfASingleKeyKeepsItsMatrixWhole)
{
    TransformationEnvelope envelope;
    envelope.addKeyValue(0.5, {Transform(1, 2, 3, 4, 5, 6, 7, 8, 9), 1});
    const auto function = envelopeFunction(0, 10, 10, &envelope);
    for (const double progress : {-1.0, 0.5, 2.0, infinity, std::nan("")}) {
        const Rendered rendered = render(function, progress);
        EXPECT_EQ(numbersOf(rendered.matrix), (Numbers{1, 2, 3, 4, 5, 6, 7, 8, 9}));
        EXPECT_EQ(rendered.opacity, 0.01);
    }
}

TEST(TransformationFunction, KeepsACopyOfTheEnvelope)
{
    auto envelope = std::make_unique<TransformationEnvelope>(slide());
    const auto function = envelopeFunction(0, 10, 10, envelope.get());
    envelope->addKeyValue(0.5, {Transform(), 7});
    envelope.reset();
    expectMatrix(render(function, 0.5).matrix, {2, 0, 0, 0, 3, 0, 4, -2, 1});
}

TEST(Fade, IsLinearAtBothEnds)
{
    const auto fade = fadeFunction(10, 20);
    EXPECT_DOUBLE_EQ(fade(100, 100, 200), 0);
    EXPECT_DOUBLE_EQ(fade(105, 100, 200), 0.5);
    EXPECT_DOUBLE_EQ(fade(109, 100, 200), 0.9);
    EXPECT_DOUBLE_EQ(fade(110, 100, 200), 1);
    EXPECT_DOUBLE_EQ(fade(150, 100, 200), 1);
    EXPECT_DOUBLE_EQ(fade(180, 100, 200), 1);
    EXPECT_DOUBLE_EQ(fade(181, 100, 200), 0.95);
    EXPECT_DOUBLE_EQ(fade(190, 100, 200), 0.5);
    EXPECT_DOUBLE_EQ(fade(200, 100, 200), 0);
}

TEST(Fade, MultipliesWhereBothOverlap)
{
    EXPECT_DOUBLE_EQ(fadeFunction(10, 10)(5, 0, 10), 0.25);
    EXPECT_DOUBLE_EQ(fadeFunction(10, 10)(2, 0, 10), 0.16);
    EXPECT_DOUBLE_EQ(fadeFunction(20, 40)(10, 0, 20), 0.125);
}

TEST(Fade, OfNoLengthIsNone)
{
    const auto fade = fadeFunction(0, 0);
    EXPECT_EQ(fade(0, 0, 10), 1.0);
    EXPECT_EQ(fade(5, 0, 10), 1.0);
    EXPECT_EQ(fade(10, 0, 10), 1.0);
    EXPECT_EQ(fadeFunction(0, 5)(0, 0, 10), 1.0);
    EXPECT_EQ(fadeFunction(5, 0)(10, 0, 10), 1.0);
}

TEST(Fade, GoesOnOutsideTheSpan)
{
    EXPECT_DOUBLE_EQ(fadeFunction(10, 0)(-5, 0, 10), -0.5);
    EXPECT_DOUBLE_EQ(fadeFunction(0, 10)(15, 0, 10), -0.5);
    EXPECT_EQ(fadeFunction(0, 0)(-1, 0, 10), -infinity);
    EXPECT_EQ(fadeFunction(0, 0)(11, 0, 10), -infinity);
}

struct Calls
{
    std::vector<std::string> log;

    Envelope::VolumeFunction named(const std::string& name, double gain)
    {
        return [this, name, gain](qint64 current, qint64 begin, qint64 end) {
            log.push_back(name + " " + std::to_string(current) + " " + std::to_string(begin) + " " +
                          std::to_string(end));
            return gain;
        };
    }
};

TEST(Combination, IsTheProductAndCallsTheSecondFirst)
{
    Calls calls;
    const auto both = combine(calls.named("first", 3), calls.named("second", 5));
    EXPECT_EQ(calls.log.size(), 0u);
    EXPECT_EQ(both(7, 0, 10), 15);
    EXPECT_THAT(calls.log, ::testing::ElementsAre("second 7 0 10", "first 7 0 10"));
}

TEST(Combination, HoldsTheTimeWithinTheSpan)
{
    const struct
    {
        qint64 current, begin, end;
        const char* expected;
    } table[] = {
        {-1, 0, 10, "a 0 0 10"},  {0, 0, 10, "a 0 0 10"},     {10, 0, 10, "a 10 0 10"},
        {11, 0, 10, "a 10 0 10"}, {5, 10, 0, "a 0 10 0"},     {-5, 10, 0, "a 10 10 0"},
        {0, 10, 0, "a 10 10 0"},  {20, 10, 10, "a 10 10 10"},
    };
    for (const auto& row : table) {
        Calls calls;
        combine(calls.named("a", 1), calls.named("b", 1))(row.current, row.begin, row.end);
        EXPECT_EQ(calls.log.back(), row.expected);
    }
}

TEST(Combination, KeepsFadesOfNoLengthFromDividingByZero)
{
    const auto both = combine(fadeFunction(0, 0), fadeFunction(0, 0));
    EXPECT_EQ(both(-5, 0, 10), 1.0);
    EXPECT_EQ(both(15, 0, 10), 1.0);
}

TEST(Combination, OfEnvelopeAndFadeMultiplies)
{
    const VolumeEnvelope envelope = hill();
    const auto both = combine(envelopeFunction(0, 100, 100, &envelope), fadeFunction(50, 50));
    EXPECT_DOUBLE_EQ(both(25, 0, 100), 0.25);
    EXPECT_DOUBLE_EQ(both(50, 0, 100), 1);
    EXPECT_DOUBLE_EQ(both(75, 0, 100), 0.375);
    EXPECT_DOUBLE_EQ(both(500, 0, 100), 0);
}

TEST(Combination, WithNothingThrowsWhenItIsCalled)
{
    Calls calls;
    const auto withoutFirst = combine(nullptr, calls.named("second", 1));
    EXPECT_THROW(withoutFirst(0, 0, 10), std::bad_function_call);
    EXPECT_THAT(calls.log, ::testing::ElementsAre("second 0 0 10"));
    const auto withoutSecond = combine(calls.named("first", 1), nullptr);
    EXPECT_THROW(withoutSecond(0, 0, 10), std::bad_function_call);
    EXPECT_EQ(calls.log.size(), 1u);
    EXPECT_THROW(combine(nullptr, nullptr)(0, 0, 10), std::bad_function_call);
}

} // namespace
