// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/PanAndZoom.h>

#include <QSize>

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <cstdlib>
#include <memory>

namespace {

using PanAndZoom::generateEnvelope;

// The single-precision values of 1.01, 1.1, 0.9, 0.8 and 0.045.
constexpr double overlap = 1.0099999904632568;
constexpr double nearScale = 1.100000023841858;
constexpr double beginScale = 0.8999999761581421;
constexpr double endScale = 0.800000011920929;
constexpr double shift = 0.04500000178813934;

const QSize square(1080, 1080);
const QSize wide(1920, 1080);
const QSize tall(540, 1080);

struct Scale
{
    double x = 1.0;
    double y = 1.0;
};

struct Shift
{
    double x = 0.0;
    double y = 0.0;
};

/// What a sequence of rand() gives, drawn again from the same seed.
class Draws
{
public:
    explicit Draws(unsigned seed) { std::srand(seed); }

    static int draw() { return std::rand(); }

    static Shift drawShift()
    {
        static constexpr double steps[] = {-shift, 0.0, shift};
        Shift drawn;
        drawn.y = steps[draw() % 3];
        drawn.x = steps[draw() % 3];
        return drawn;
    }
};

void expectValue(const Transformation::Object& value, const Scale& scale, const Shift& moved)
{
    EXPECT_DOUBLE_EQ(value.matrix.m11, scale.x);
    EXPECT_EQ(value.matrix.m12, 0.0);
    EXPECT_EQ(value.matrix.m13, 0.0);
    EXPECT_EQ(value.matrix.m21, 0.0);
    EXPECT_DOUBLE_EQ(value.matrix.m22, scale.y);
    EXPECT_EQ(value.matrix.m23, 0.0);
    EXPECT_EQ(value.matrix.m31, moved.x);
    EXPECT_EQ(value.matrix.m32, moved.y);
    EXPECT_EQ(value.matrix.m33, 1.0);
    EXPECT_EQ(value.opacity, 100);
}

std::unique_ptr<TransformationEnvelope> seeded(unsigned seed, bool randomStart, bool fitMode,
                                               const QSize& source, const QSize& frame, double from = 0.0,
                                               double to = 1.0)
{
    std::srand(seed);
    return std::unique_ptr<TransformationEnvelope>(
        generateEnvelope(randomStart, fitMode, source, frame, from, to));
}

/// The picture fitted to the frame before anything moves: the key that a random start leaves alone.
Transformation::Object fitted(bool fitMode, const QSize& source, const QSize& frame)
{
    std::srand(1);
    const bool movesBegin = std::rand() % 4 != 0;
    const auto envelope = seeded(1, true, fitMode, source, frame);
    return movesBegin ? envelope->keyValues.back().value : envelope->keyValues.front().value;
}

TEST(PanAndZoom, FitsThePictureByItsAspect)
{
    // 1920 by 1080 into a square: the aspects are in the ratio 16 to 9.
    expectValue(fitted(true, wide, square), {16.0 / 9.0, overlap}, {});
    expectValue(fitted(false, wide, square), {overlap, overlap * 9.0 / 16.0}, {});
    // 540 by 1080 into a square: 1 to 2.
    expectValue(fitted(true, tall, square), {overlap, 2 * overlap}, {});
    expectValue(fitted(false, tall, square), {0.5, overlap}, {});
    // Into another frame than a square: 16 to 9 by 1 to 2.
    expectValue(fitted(true, wide, tall), {32.0 / 9.0, overlap}, {});
}

TEST(PanAndZoom, LeavesAPictureOfTheFramesAspectAsItIs)
{
    for (const bool fitMode : {true, false}) {
        expectValue(fitted(fitMode, wide, QSize(1280, 720)), {}, {});
        expectValue(fitted(fitMode, square, QSize(1, 1)), {}, {});
        // Nor where the aspects are 1.1e-13 apart.
        expectValue(fitted(fitMode, QSize(3000001, 3000000), QSize(3000002, 3000001)), {}, {});
    }
    // Where they are 4e-12 apart it is fitted: the picture is the wider one.
    const double ratio = (500001.0 / 500000.0) / (500002.0 / 500001.0);
    expectValue(fitted(true, QSize(500001, 500000), QSize(500002, 500001)), {ratio, overlap}, {});
}

TEST(PanAndZoom, LeavesAPictureAsItIsWhereASizeIsEmpty)
{
    for (const QSize& empty : {QSize(), QSize(0, 1080), QSize(1920, 0), QSize(-16, -9)}) {
        for (const bool fitMode : {true, false}) {
            expectValue(fitted(fitMode, empty, square), {}, {});
            expectValue(fitted(fitMode, wide, empty), {}, {});
        }
    }
}

TEST(PanAndZoom, ShrinksTheFittedPictureFromBeginToEnd)
{
    for (unsigned seed = 0; seed < 100; ++seed) {
        const auto envelope = seeded(seed, false, true, wide, square, 0.25, 0.75);
        Draws draws(seed);
        const Shift begin = draws.drawShift();
        const Shift end = draws.drawShift();
        ASSERT_EQ(envelope->keyValues.size(), 2u);
        EXPECT_EQ(envelope->keyValues[0].step, 0.25);
        EXPECT_EQ(envelope->keyValues[1].step, 0.75);
        expectValue(envelope->keyValues[0].value, {beginScale * 16 / 9, beginScale * overlap}, begin);
        expectValue(envelope->keyValues[1].value, {endScale * 16 / 9, endScale * overlap}, end);
    }
}

TEST(PanAndZoom, MovesOneEndAtARandomStart)
{
    int outwards = 0;
    int inwards = 0;
    for (unsigned seed = 0; seed < 100; ++seed) {
        const auto envelope = seeded(seed, true, false, tall, square);
        Draws draws(seed);
        const bool isOutwards = draws.draw() % 4 != 0;
        const Shift moved = draws.drawShift();
        ASSERT_EQ(envelope->keyValues.size(), 2u);
        const auto& begin = envelope->keyValues[0].value;
        const auto& end = envelope->keyValues[1].value;
        expectValue(isOutwards ? begin : end, {nearScale * 0.5, nearScale * overlap}, moved);
        expectValue(isOutwards ? end : begin, {0.5, overlap}, {});
        ++(isOutwards ? outwards : inwards);
    }
    EXPECT_GT(outwards, inwards);
    EXPECT_GT(inwards, 0);
}

TEST(PanAndZoom, OnlyScalesAndShiftsAPictureThatFits)
{
    const auto envelope = seeded(7, false, true, wide, wide);
    Draws draws(7);
    const Shift begin = draws.drawShift();
    const Shift end = draws.drawShift();
    expectValue(envelope->keyValues[0].value, {beginScale, beginScale}, begin);
    expectValue(envelope->keyValues[1].value, {endScale, endScale}, end);
}

TEST(PanAndZoom, TakesThreeDrawsAtARandomStartAndFourOtherwise)
{
    for (const bool randomStart : {true, false}) {
        seeded(11, randomStart, true, wide, square);
        const int next = std::rand();
        Draws draws(11);
        for (int i = 0; i < (randomStart ? 3 : 4); ++i) {
            draws.draw();
        }
        EXPECT_EQ(draws.draw(), next);
    }
}

TEST(PanAndZoom, SortsItsKeys)
{
    const auto backwards = seeded(3, false, true, wide, wide, 1.0, 0.0);
    ASSERT_EQ(backwards->keyValues.size(), 2u);
    EXPECT_EQ(backwards->keyValues[0].step, 0.0);
    EXPECT_DOUBLE_EQ(backwards->keyValues[0].value.matrix.m11, endScale);
    EXPECT_EQ(backwards->keyValues[1].step, 1.0);
    EXPECT_DOUBLE_EQ(backwards->keyValues[1].value.matrix.m11, beginScale);
}

TEST(PanAndZoom, KeepsTwoKeysAtOneStepTheEndInFront)
{
    const auto envelope = seeded(3, false, true, wide, wide, 0.5, 0.5);
    ASSERT_EQ(envelope->keyValues.size(), 2u);
    EXPECT_EQ(envelope->keyValues[0].step, 0.5);
    EXPECT_EQ(envelope->keyValues[1].step, 0.5);
    EXPECT_DOUBLE_EQ(envelope->keyValues[0].value.matrix.m11, endScale);
    EXPECT_DOUBLE_EQ(envelope->keyValues[1].value.matrix.m11, beginScale);
}

RC_GTEST_PROP(PanAndZoom, ShiftsByTheFirstDrawDownwards, (unsigned seed))
{
    const auto envelope = seeded(seed, false, false, wide, wide);
    Draws draws(seed);
    const Shift begin = draws.drawShift();
    const Shift end = draws.drawShift();
    RC_ASSERT(envelope->keyValues[0].value.matrix.m31 == begin.x);
    RC_ASSERT(envelope->keyValues[0].value.matrix.m32 == begin.y);
    RC_ASSERT(envelope->keyValues[1].value.matrix.m31 == end.x);
    RC_ASSERT(envelope->keyValues[1].value.matrix.m32 == end.y);
}

} // namespace
