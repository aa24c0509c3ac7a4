// SPDX-License-Identifier: Apache-2.0
#include "Matrices.h"

#include <EditorModel/effects/Envelope.h>
#include <EditorModel/types/Norvel.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

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

constexpr double infinity = std::numeric_limits<double>::infinity();

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
