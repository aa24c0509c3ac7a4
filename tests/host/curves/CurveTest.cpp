// SPDX-License-Identifier: Apache-2.0
#include "host/curves/Curve.h"
#include "host/curves/CurveText.h"
#include "host/drawing/Axis.h"

#include <QTransform>

#include <gmock/gmock.h>

#include <cmath>
#include <limits>

namespace {

using testing::DoubleNear;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pointwise;

constexpr double nan = std::numeric_limits<double>::quiet_NaN();
constexpr double inf = std::numeric_limits<double>::infinity();

std::vector<qint64> ms(const std::vector<MTime>& times)
{
    std::vector<qint64> counts;
    for (const MTime time : times) {
        counts.push_back(time.ms());
    }
    return counts;
}

TEST(Axis, CountsInOnesTwosOrFives)
{
    const auto near = [](const std::vector<double>& expected) {
        return Pointwise(DoubleNear(1e-9), expected);
    };
    EXPECT_THAT(Host::ticks({0.0, 1.0}, 6), near({0.0, 0.2, 0.4, 0.6, 0.8, 1.0}));
    EXPECT_THAT(Host::ticks({0.0, 1.0}, 5), near({0.0, 0.5, 1.0}));
    EXPECT_THAT(Host::ticks({-0.3, 1.24}, 7), near({0.0, 0.5, 1.0}));
    EXPECT_THAT(Host::ticks({-0.3, 1.24}, 9), near({-0.2, 0.0, 0.2, 0.4, 0.6, 0.8, 1.0, 1.2}));
    EXPECT_THAT(Host::ticks({-1500.0, 900.0}, 4), near({-1000.0, 0.0}));
    EXPECT_THAT(Host::ticks({0.0, 10.0}, 2), near({0.0, 10.0}));
}

TEST(Axis, CountsTimesInUnitsOfAClock)
{
    EXPECT_THAT(ms(Host::timeTicks(10000, 9)), ElementsAre(0, 2000, 4000, 6000, 8000, 10000));
    EXPECT_THAT(ms(Host::timeTicks(9999, 9)), ElementsAre(0, 2000, 4000, 6000, 8000));
    EXPECT_THAT(ms(Host::timeTicks(60000, 5)), ElementsAre(0, 15000, 30000, 45000, 60000));
    EXPECT_THAT(ms(Host::timeTicks(3600000, 3)), ElementsAre(0, 1800000, 3600000));
    EXPECT_THAT(ms(Host::timeTicks(3, 4)), ElementsAre(0, 1, 2, 3));
    EXPECT_THAT(ms(Host::timeTicks(359999999, 9)), ElementsAre(0, 43200000, 86400000, 129600000, 172800000,
                                                               216000000, 259200000, 302400000, 345600000));
    EXPECT_THAT(Host::timeTicks(-1, 9), IsEmpty());
}

TEST(Axis, CoversTheValuesThatCanBeDrawn)
{
    const auto expectRange = [](const Host::ValueRange& range, double low, double high) {
        EXPECT_DOUBLE_EQ(range.low, low);
        EXPECT_DOUBLE_EQ(range.high, high);
    };
    expectRange(Host::rangeOf({0.5, -2.0, 3.0}, 1.0), -2.0, 3.0);
    expectRange(Host::rangeOf({4.0, 4.0}, 1.0), 3.5, 4.5);
    expectRange(Host::rangeOf({nan, 1.0, inf, -inf, 1e300, 2.0}, 0.5), 1.0, 2.0);
    expectRange(Host::rangeOf({nan, inf}, 2.0), -1.0, 1.0);
    expectRange(Host::rangeOf({}, 2.0), -1.0, 1.0);
    expectRange(Host::widened({1.0, 3.0}, 0.25), 0.5, 3.5);
    expectRange(Host::rounded({0.0, 1.03}, 12), 0.0, 1.1);
    expectRange(Host::rounded({-0.31, 1.0}, 12), -0.4, 1.0);
}

TEST(Axis, HoldsValuesWithinTheRange)
{
    const Host::ValueRange range = {-1.0, 3.0};
    EXPECT_EQ(range.partOf(0.0), 0.25);
    EXPECT_EQ(range.partOf(-5.0), 0.0);
    EXPECT_EQ(range.partOf(inf), 1.0);
    EXPECT_TRUE(std::isnan(range.partOf(nan)));
}

TEST(Axis, WritesNumbersShortly)
{
    EXPECT_EQ(Host::numberText(0.5), "0.5");
    EXPECT_EQ(Host::numberText(-12.0), "-12");
    EXPECT_EQ(Host::numberText(1200.0), "1200");
    EXPECT_EQ(Host::numberText(-0.0001), "0");
    EXPECT_EQ(Host::numberText(1.25e15), "1.25e+15");
    EXPECT_EQ(Host::numberText(nan), "nan");
    EXPECT_EQ(Host::numberText(-inf), "-inf");
    EXPECT_EQ(Host::percentText(0.875), "87.5 %");
    EXPECT_EQ(Host::percentText(1.0), "100 %");
    EXPECT_EQ(Host::degreesText(-12.5), "-12.5°");
    EXPECT_EQ(Host::levelText(1.0), "0.0 dB");
    EXPECT_EQ(Host::levelText(10.0), "20.0 dB");
    EXPECT_EQ(Host::levelText(0.999), "0.0 dB");
    EXPECT_EQ(Host::levelText(0.0), "-inf dB");
    EXPECT_EQ(Host::levelText(-1.0), "-");
    EXPECT_EQ(Host::levelText(nan), "-");
}

TEST(AreaPlot, FillsColumnsToTheNearestEighth)
{
    EXPECT_THAT(Host::areaPlot({0.0, 0.125, 0.25, 0.5, 0.75, 1.0, 2.0, -1.0}, {0.0, 1.0}, 1),
                ElementsAre(" ▁▂▄▆██ "));
    EXPECT_THAT(Host::areaPlot({0.0, 0.25, 0.5, 0.75, 1.0, nan}, {0.0, 1.0}, 2),
                ElementsAre("   ▄█ ", " ▄███?"));
    EXPECT_THAT(Host::areaPlot({-1.0, 0.0, 1.0}, {-1.0, 1.0}, 1), ElementsAre(" ▄█"));
}

TEST(LinePlot, HasNoEmptyCells)
{
    // Sevenths between the lowest eighth and the full cell.
    EXPECT_EQ(Host::linePlot({0.0, 1.0, 2.0, 3.0, 4.0, 5.0, 6.0, 7.0, nan}, {0.0, 7.0}), "▁▂▃▄▅▆▇█?");
}

TEST(CurvePlaces, UnwrapAnglesIntoACourseWithoutJumps)
{
    EXPECT_THAT(Host::unwrapped({350.0, 0.0, 10.0, 355.0}), ElementsAre(350.0, 360.0, 370.0, 355.0));
    EXPECT_THAT(Host::unwrapped({10.0, 350.0, 10.0}), ElementsAre(10.0, -10.0, 10.0));
    EXPECT_THAT(Host::unwrapped({}), IsEmpty());
    EXPECT_THAT(Host::evenSteps(4), ElementsAre(0.0, 0.25, 0.5, 0.75, 1.0));
}

TEST(VolumeCurve, MultipliesTheEnvelopeWithItsFades)
{
    VolumeEnvelope envelope;
    envelope.addKeyValue(0.0, 1.0)->addKeyValue(1.0, 0.0);
    const Host::VolumeCurve curve(envelope, {1000, 400, 500});
    EXPECT_DOUBLE_EQ(curve.envelopeAt(0.2), 0.8);
    EXPECT_DOUBLE_EQ(curve.fadeAt(0.2), 0.5);
    EXPECT_DOUBLE_EQ(curve.volumeAt(0.2), 0.4);
    EXPECT_DOUBLE_EQ(curve.volumeAt(0.45), 0.55);
    EXPECT_DOUBLE_EQ(curve.volumeAt(0.75), 0.125);
    EXPECT_DOUBLE_EQ(curve.volumeAt(1.0), 0.0);
}

TEST(VolumeCurve, SeesPlacesBetweenTheMilliseconds)
{
    VolumeEnvelope envelope;
    envelope.addKeyValue(0.0, 0.0)->addKeyValue(1.0, 1.0);
    const Host::VolumeCurve curve(envelope, {1, 0, 0});
    EXPECT_DOUBLE_EQ(curve.volumeAt(0.25), 0.25);
}

TEST(Pose, IsTakenApartIntoScaleRotationAndTranslation)
{
    QTransform turned;
    turned.rotate(-90.0);
    const Host::Pose pose = Host::poseOf(Transformation::Object(
        QTransform::fromScale(2.0, 3.0) * turned * QTransform::fromTranslate(5.0, 7.0), 40));
    EXPECT_DOUBLE_EQ(pose.scaleX, 2.0);
    EXPECT_DOUBLE_EQ(pose.scaleY, 3.0);
    EXPECT_DOUBLE_EQ(pose.rotation, 270.0);
    EXPECT_DOUBLE_EQ(pose.dx, 5.0);
    EXPECT_DOUBLE_EQ(pose.dy, 7.0);
    EXPECT_DOUBLE_EQ(pose.opacity, 0.4);
    EXPECT_EQ(Host::poseOf(Transformation::Object()).rotation, 0.0);
    // Just below a full turn is still no full turn.
    Norvel::Proc::Matrix3x3 hardlyTurned;
    hardlyTurned.m12 = -1e-20;
    EXPECT_EQ(Host::poseOf(hardlyTurned, 1.0).rotation, 0.0);
}

Host::CurveTextSize smallText()
{
    Host::CurveTextSize size;
    size.steps = 4;
    size.columns = 33;
    size.rows = 2;
    return size;
}

TEST(VolumeText, ShowsKeysPlotAndValues)
{
    VolumeEnvelope envelope;
    envelope.addKeyValue(0.0, 1.0)->addKeyValue(0.5, 1.0)->addKeyValue(1.0, 0.0);
    const Host::VolumeCurve curve(envelope, {8000, 0, 0});
    // Two rows have sixteen eighths, and the second half falls by one eighth a column.
    EXPECT_EQ(Host::volumeText(curve, smallText()), "Volume envelope: 3 keys over 00:00:08.000\n"
                                                    "\n"
                                                    "Key  Time          Step  Volume    Level\n"
                                                    "#1   00:00:00.000     0   100 %   0.0 dB\n"
                                                    "#2   00:00:04.000   0.5   100 %   0.0 dB\n"
                                                    "#3   00:00:08.000     1     0 %  -inf dB\n"
                                                    "\n"
                                                    "100 % ┤█████████████████▇▆▅▄▃▂▁         \n"
                                                    " 50 % ┤█████████████████████████▇▆▅▄▃▂▁ \n"
                                                    "  0 % └─────────────────────────────────\n"
                                                    "       00:00:00.000         00:00:08.000\n"
                                                    "\n"
                                                    "Time          Volume    Level\n"
                                                    "00:00:00.000   100 %   0.0 dB\n"
                                                    "00:00:02.000   100 %   0.0 dB\n"
                                                    "00:00:04.000   100 %   0.0 dB\n"
                                                    "00:00:06.000    50 %  -6.0 dB\n"
                                                    "00:00:08.000     0 %  -inf dB\n");
}

TEST(VolumeText, ShowsWhatFadesDo)
{
    VolumeEnvelope envelope;
    envelope.addKeyValue(0.5, 2.0);
    const Host::VolumeCurve curve(envelope, {1000, 500, 250});
    const std::string text = Host::volumeText(curve, smallText());
    EXPECT_THAT(text, testing::StartsWith("Volume envelope: 1 key over 00:00:01.000, fade-in 00:00:00.500, "
                                          "fade-out 00:00:00.250\n"));
    EXPECT_THAT(text, testing::EndsWith("Time          Envelope  Fades  Volume    Level\n"
                                        "00:00:00.000     200 %    0 %     0 %  -inf dB\n"
                                        "00:00:00.250     200 %   50 %   100 %   0.0 dB\n"
                                        "00:00:00.500     200 %  100 %   200 %   6.0 dB\n"
                                        "00:00:00.750     200 %  100 %   200 %   6.0 dB\n"
                                        "00:00:01.000     200 %    0 %     0 %  -inf dB\n"));
}

TEST(VolumeText, WithstandsWhatNoEnvelopeShouldHold)
{
    VolumeEnvelope envelope;
    envelope.addKeyValue(0.5, 1.0)->addKeyValue(0.5, 0.0)->addKeyValue(2.0, inf);
    envelope.keyValues.emplace_back(nan, -1.0);
    const Host::VolumeCurve curve(envelope, {2, 0, 0});
    const std::string text = Host::volumeText(curve, {2, 9, 1});
    EXPECT_THAT(text, testing::HasSubstr("#4   -              nan  -100 %        -\n"));
    EXPECT_THAT(text, testing::HasSubstr("00:00:00.001"));
    EXPECT_THAT(Host::volumeText({VolumeEnvelope(), {1000, 0, 0}}, {1, 9, 1}),
                testing::HasSubstr("Volume envelope: 0 keys over 00:00:01.000\n"));
}

TEST(TransformationText, ShowsEveryPartOfThePose)
{
    TransformationEnvelope envelope;
    QTransform turned;
    turned.rotate(-90.0);
    envelope.addKeyValue(0.0, Transformation::Object());
    envelope.addKeyValue(1.0, Transformation::Object(QTransform::fromScale(2.0, 1.0) * turned *
                                                         QTransform::fromTranslate(0.7, -1.4),
                                                     30));
    const Host::TransformationCurve curve(envelope, 700);
    Host::CurveTextSize size;
    size.steps = 2;
    size.columns = 8;
    // Eight columns are seven steps apart, and a cell has seven steps between its lowest and its full height.
    EXPECT_EQ(Host::transformationText(curve, size),
              "Transformation envelope: 2 keys over 00:00:00.700\n"
              "\n"
              "Key  Time          Step   dx    dy  Scale x  Scale y  Rotation  Opacity\n"
              "#1   00:00:00.000  0       0     0    100 %    100 %        0°    100 %\n"
              "#2   00:00:00.700  1     0.7  -1.4    200 %    100 %      270°     30 %\n"
              "\n"
              "          00:00:00.000  00:00:00.700  Lowest   Highest\n"
              "dx        ▁▂▃▄▅▆▇█                         0   0.7\n"
              "dy        █▇▆▅▄▃▂▁                      -1.4   0\n"
              "Scale x   ▁▂▃▄▅▆▇█                     100 %   200 %\n"
              "Scale y   ▅▅▅▅▅▅▅▅                     100 %   100 %\n"
              "Rotation  █▇▆▅▄▃▂▁                      -90°   0°\n"
              "Opacity   █▇▆▅▄▃▂▁                      30 %   100 %\n"
              "\n"
              "Time            dx    dy  Scale x  Scale y  Rotation  Opacity\n"
              "00:00:00.000     0     0    100 %    100 %        0°    100 %\n"
              "00:00:00.350  0.35  -0.7    150 %    100 %      315°     65 %\n"
              "00:00:00.700   0.7  -1.4    200 %    100 %      270°     30 %\n");
}

TEST(TransformationText, TellsTheLowestAndTheHighestValueAsTheyAre)
{
    const auto linesOf = [](double dx, double dy) {
        TransformationEnvelope envelope;
        envelope.addKeyValue(0.0, Transformation::Object(QTransform::fromTranslate(dx, dy), 100));
        Host::CurveTextSize size;
        size.columns = 1;
        return Host::transformationText({envelope, 1000}, size);
    };
    // What the plot makes wider so that there is something to see is not what the values are.
    EXPECT_THAT(linesOf(1e6, 1e13), testing::ContainsRegex("\ndx +[^ ]+ +1000000   1000000\n"));
    EXPECT_THAT(linesOf(1e6, 1e13), testing::ContainsRegex("\ndy +[^ ]+ +1e\\+13   1e\\+13\n"));
    EXPECT_THAT(linesOf(-inf, nan), testing::ContainsRegex("\ndx +[^ ]+ +-inf   -inf\n"));
    EXPECT_THAT(linesOf(-inf, nan), testing::ContainsRegex("\ndy +[^ ]+ +-   -\n"));
}

} // namespace
