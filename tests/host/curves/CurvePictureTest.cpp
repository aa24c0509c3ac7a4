// SPDX-License-Identifier: Apache-2.0
#include "tests/host/shared/Pictures.h"
#include "tests/host/shared/Samples.h"

#include "host/commands/Refusal.h"
#include "host/curves/TransformationPicture.h"
#include "host/curves/VolumePicture.h"
#include "host/drawing/Picture.h"
#include "host/drawing/PictureStyle.h"

#include <QTransform>

#include <gmock/gmock.h>

#include <cmath>
#include <limits>

namespace {

using namespace HostTests;

constexpr double nan = std::numeric_limits<double>::quiet_NaN();
constexpr double inf = std::numeric_limits<double>::infinity();

VolumeEnvelope hill()
{
    VolumeEnvelope envelope;
    envelope.addKeyValue(0.0, 0.0)->addKeyValue(0.5, 1.0)->addKeyValue(1.0, 0.0);
    return envelope;
}

TEST(VolumePicture, DrawsTheCurveWhereTheFunctionsSay)
{
    const Host::VolumePicture picture(Host::VolumeCurve(hill(), {8000, 0, 0}));
    const Drawing drawing(picture);
    EXPECT_EQ(drawing.image.size(), picture.size() * 2);
    const Host::CurveLane& lane = picture.lane();
    // Away from the keys and from the lines of the grid, on either side.
    for (const double progress : {0.07, 0.21, 0.33, 0.45, 0.55, 0.68, 0.81, 0.93}) {
        const double volume = progress < 0.5 ? 2.0 * progress : 2.0 - 2.0 * progress;
        const QPointF place = lane.place(progress, volume);
        EXPECT_TRUE(isNear(drawing.at(place), Host::Style::first)) << nameOf(drawing.at(place));
        const QPointF above = place - QPointF(0.0, 12.0);
        EXPECT_TRUE(isNear(drawing.at(above), Host::Style::lane)) << nameOf(drawing.at(above));
        // The area below is a bluish shade.
        const QColor below = drawing.at(place + QPointF(0.0, 12.0));
        EXPECT_GT(below.blue(), below.red() + 10) << nameOf(below);
    }
}

TEST(VolumePicture, MarksItsKeys)
{
    const Host::VolumePicture picture(Host::VolumeCurve(hill(), {8000, 0, 0}));
    const Drawing drawing(picture);
    for (const auto& [step, value] : {std::pair(0.0, 0.0), std::pair(0.5, 1.0), std::pair(1.0, 0.0)}) {
        const QPointF key = picture.lane().place(step, value);
        EXPECT_EQ(nameOf(drawing.at(key)), nameOf(Host::Style::paper));
        EXPECT_TRUE(isNear(drawing.at(key - QPointF(0.0, 4.5)), Host::Style::first));
    }
}

TEST(VolumePicture, ShadesWhatTheFadesTakeAway)
{
    VolumeEnvelope flat;
    flat.addKeyValue(0.0, 1.0);
    const Host::VolumePicture picture(Host::VolumeCurve(flat, {10000, 4000, 2000}));
    const Drawing drawing(picture);
    const Host::CurveLane& lane = picture.lane();
    // At a tenth of the time a quarter of the fade-in is over, at nine tenths half of the fade-out.
    EXPECT_TRUE(isNear(drawing.at(lane.place(0.1, 0.25)), Host::Style::first));
    EXPECT_TRUE(isNear(drawing.at(lane.place(0.9, 0.5)), Host::Style::first));
    EXPECT_TRUE(isNear(drawing.at(lane.place(0.6, 1.0)), Host::Style::first));
    const auto isShaded = [](const QColor& colour) { return colour.red() > colour.blue() + 40; };
    EXPECT_TRUE(isShaded(drawing.at(lane.place(0.1, 0.5))));
    EXPECT_TRUE(isShaded(drawing.at(lane.place(0.9, 0.75))));
    EXPECT_FALSE(isShaded(drawing.at(lane.place(0.1, 0.1))));
    EXPECT_FALSE(isShaded(drawing.at(lane.place(0.55, 0.5))));
    // Without fades nothing is shaded.
    const Host::VolumePicture plain(Host::VolumeCurve(flat, {10000, 0, 0}));
    EXPECT_FALSE(isShaded(Drawing(plain).at(plain.lane().place(0.1, 0.5))));
}

TEST(VolumePicture, LeavesAGapWhereTheVolumeIsNoNumber)
{
    VolumeEnvelope envelope;
    envelope.addKeyValue(0.0, 0.5)->addKeyValue(0.4, nan)->addKeyValue(0.6, 0.5)->addKeyValue(1.0, 0.5);
    const Host::VolumePicture picture(Host::VolumeCurve(envelope, {10000, 0, 0}));
    const Drawing drawing(picture);
    EXPECT_FALSE(isNear(drawing.at(picture.lane().place(0.45, 0.5)), Host::Style::first));
    EXPECT_TRUE(isNear(drawing.at(picture.lane().place(0.75, 0.5)), Host::Style::first));
}

TEST(VolumePicture, WithstandsWhatNoEnvelopeShouldHold)
{
    VolumeEnvelope envelope;
    envelope.addKeyValue(-3.0, -inf)->addKeyValue(0.2, 1e300)->addKeyValue(0.5, 1.0)->addKeyValue(0.5, -2.0);
    envelope.addKeyValue(7.0, inf);
    envelope.keyValues.emplace_back(nan, nan);
    for (const Host::CurveSpan& span : {Host::CurveSpan{1, 0, 0}, Host::CurveSpan{359999999, 1, 359999999},
                                        Host::CurveSpan{10, 500, 900}}) {
        const Host::VolumePicture picture(Host::VolumeCurve(envelope, span));
        EXPECT_FALSE(Drawing(picture).image.isNull());
    }
    EXPECT_FALSE(
        Drawing(Host::VolumePicture(Host::VolumeCurve(VolumeEnvelope(), {1000, 0, 0}))).image.isNull());
}

Transformation::Object pose(double scale, double degrees, double dx, double dy, int opacity)
{
    QTransform turned;
    turned.rotate(degrees);
    return Transformation::Object(
        QTransform::fromScale(scale, scale) * turned * QTransform::fromTranslate(dx, dy), opacity);
}

TEST(TransformationPicture, DrawsEachPartInItsLane)
{
    TransformationEnvelope envelope;
    envelope.addKeyValue(0.0, pose(1.0, 350.0, 0.0, 0.5, 100));
    envelope.addKeyValue(1.0, pose(2.0, 30.0, 1.0, -0.5, 0));
    const Host::TransformationPicture picture(Host::TransformationCurve(envelope, 10000));
    const Drawing drawing(picture);
    EXPECT_EQ(drawing.image.size(), picture.size() * 2);
    for (const double progress : {0.13, 0.27, 0.73, 0.87}) {
        const auto at = [&](int lane, double value) {
            return drawing.at(picture.lane(lane).place(progress, value));
        };
        EXPECT_TRUE(isNear(at(0, progress), Host::Style::first)) << progress;
        // The two lines of the scale are one, and the second is dashed over the first.
        EXPECT_FALSE(isNear(at(1, 1.0 + progress), Host::Style::lane)) << progress;
        // The rotation goes on through the full turn.
        EXPECT_TRUE(isNear(at(2, 350.0 + 40.0 * progress), Host::Style::first)) << progress;
        // The opacity goes in whole percents, which here are less than the line is wide.
        EXPECT_TRUE(isNear(at(3, 1.0 - progress), Host::Style::first)) << progress;
    }
    // dy falls through zero, dashed: along a stretch there is some of its colour.
    int orange = 0;
    for (double progress = 0.60; progress < 0.65; progress += 0.001) {
        orange += isNear(drawing.at(picture.lane(0).place(progress, 0.5 - progress)), Host::Style::second);
    }
    EXPECT_GT(orange, 10);
}

TEST(TransformationPicture, ShowsThePoseInLittleFrames)
{
    const QColor sky(125, 190, 245);
    const QColor hills(92, 160, 92);
    TransformationEnvelope still;
    still.addKeyValue(0.0, Transformation::Object());
    const Host::TransformationPicture plain(Host::TransformationCurve(still, 1000));
    const Drawing drawing(plain);
    for (int i = 0; i != Host::TransformationPicture::frameCount; ++i) {
        const QPointF centre = plain.frameCentre(i);
        EXPECT_EQ(drawing.at(centre + QPointF(-20.0, -28.0)), sky);
        EXPECT_EQ(drawing.at(centre + QPointF(-20.0, 32.0)), hills);
    }

    // At half its size, a unit being the height of 72, and moved to the left by a quarter of that.
    TransformationEnvelope small;
    small.addKeyValue(0.0, pose(0.5, 0.0, -0.25, 0.0, 100));
    const Host::TransformationPicture moved(Host::TransformationCurve(small, 1000));
    const Drawing smaller(moved);
    const QPointF centre = moved.frameCentre(3);
    EXPECT_EQ(smaller.at(centre + QPointF(-47.0, -15.0)), sky);
    EXPECT_EQ(smaller.at(centre + QPointF(-53.0, -15.0)), Host::Style::text);
    EXPECT_EQ(smaller.at(centre + QPointF(10.0, -15.0)), sky);
    EXPECT_EQ(smaller.at(centre + QPointF(17.0, -15.0)), Host::Style::text);
    EXPECT_EQ(smaller.at(centre + QPointF(-18.0, 22.0)), Host::Style::text);

    // Half a turn, at half the opacity: the hills hang from above, mixed with the ground.
    TransformationEnvelope upsideDown;
    upsideDown.addKeyValue(0.0, pose(1.0, 180.0, 0.0, 0.0, 50));
    const Host::TransformationPicture turned(Host::TransformationCurve(upsideDown, 1000));
    const QColor hanging = Drawing(turned).at(turned.frameCentre(0) + QPointF(-20.0, -32.0));
    EXPECT_EQ(hanging, QColor((30 + 92 + 1) / 2, (41 + 160 + 1) / 2, (59 + 92 + 1) / 2));
}

TEST(TransformationPicture, WithstandsWhatNoEnvelopeShouldHold)
{
    TransformationEnvelope envelope;
    envelope.addKeyValue(-1.0, pose(1e200, 20.0, inf, nan, 100));
    envelope.addKeyValue(0.5, pose(0.0, 20.0, 0.0, 0.0, -300));
    envelope.addKeyValue(0.5, pose(1e5, 20.0, 1e9, 0.0, 2147483647));
    envelope.addKeyValue(2.0, Transformation::Object(Types::Transform(1, 0, 5, 0, 1, 7, 0, 0, 0), 100));
    for (const MTime length : {MTime(1), MTime(359999999)}) {
        const Host::TransformationPicture picture(Host::TransformationCurve(envelope, length));
        EXPECT_FALSE(Drawing(picture).image.isNull());
    }
    TransformationEnvelope sheared;
    sheared.addKeyValue(0.0, Transformation::Object(Types::Transform(1, 0, 5, 0, 1, 7, 0, 0, 0), 100));
    for (const TransformationEnvelope& odd : {sheared, TransformationEnvelope()}) {
        const Host::TransformationPicture picture(Host::TransformationCurve(odd, 10));
        EXPECT_FALSE(Drawing(picture).image.isNull());
    }
}

TEST(SavedPicture, IsAWellFormedDrawingOfVectors)
{
    const Folder folder;
    const QString path = folder.path("curve.svg");
    Host::savePicture(Host::VolumePicture(Host::VolumeCurve(hill(), {8000, 1000, 0})), path, Host::Svg);
    const Svg svg = readSvg(path);
    EXPECT_EQ(svg.error, "");
    EXPECT_EQ(svg.viewBox, "0 0 1280 600");
    EXPECT_GE(svg.lines, 2);
    for (const char* text : {"Volume envelope", "00:00:04.000", "100 %", "60 %", "-6 dB", "fade-in"}) {
        EXPECT_TRUE(svg.texts.contains(text)) << text;
    }

    TransformationEnvelope envelope;
    envelope.addKeyValue(0.0, pose(1.5, 30.0, 0.2, 0.1, 70));
    Host::savePicture(Host::TransformationPicture(Host::TransformationCurve(envelope, 8000)), path,
                      Host::Svg);
    const Svg frames = readSvg(path);
    EXPECT_EQ(frames.error, "");
    for (const char* text :
         {"Transformation envelope", "Translation", "Scale", "Rotation", "Opacity", "dx"}) {
        EXPECT_TRUE(frames.texts.contains(text)) << text;
    }
}

TEST(SavedPicture, GoesByTheEndingOfItsName)
{
    EXPECT_EQ(Host::pictureFormOfPath("a.png"), Host::Png);
    EXPECT_EQ(Host::pictureFormOfPath("/x/a.b.SVG"), Host::Svg);
    EXPECT_EQ(Host::pictureFormOfPath("a.jpg"), std::nullopt);
    EXPECT_EQ(Host::pictureFormOfPath("png"), std::nullopt);
    EXPECT_EQ(Host::pictureFormOfPath(""), std::nullopt);
}

TEST(SavedPicture, TellsWhyItCannotBeWritten)
{
    const Host::VolumePicture picture(Host::VolumeCurve(hill(), {1000, 0, 0}));
    try {
        Host::savePicture(picture, "/no/such/folder/a.png", Host::Png);
        FAIL() << "nothing was thrown";
    } catch (const Host::Refusal& error) {
        EXPECT_TRUE(error.reason.startsWith("cannot be written: ")) << error.what();
    }
}

} // namespace
