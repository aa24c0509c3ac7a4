// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/PanAndZoom.h>

#include <QSize>
#include <QTransform>

#include <cstdlib>
#include <memory>

namespace PanAndZoom {
namespace {

// Single precision: the values that envelopes hold are the widened ones, 1.01 being 1.0099999904632568.
constexpr float OVERLAP = 1.01f;
constexpr float NEAR_SCALE = 1.1f;
constexpr float BEGIN_SCALE = 0.9f;
constexpr float END_SCALE = 0.8f;
constexpr float SHIFT = 0.045f;

double aspectOf(const QSize& size)
{
    return static_cast<double>(size.width()) / static_cast<double>(size.height());
}

/// Brings the picture to the shape of the frame, a little larger than needed along the side that isn't
/// fitted.
QTransform fitTransform(bool fitMode, const QSize& sourceSize, const QSize& frameSize)
{
    if (sourceSize.isEmpty() || frameSize.isEmpty())
        return {};
    const double sourceAspect = aspectOf(sourceSize);
    const double frameAspect = aspectOf(frameSize);
    if (qFuzzyCompare(sourceAspect, frameAspect))
        return {};
    const double overlap = OVERLAP;
    const double ratio = sourceAspect / frameAspect;
    const bool stretchesWidth = fitMode ? ratio > 1.0 : ratio < 1.0;
    return stretchesWidth ? QTransform::fromScale(ratio, overlap)
                          : QTransform::fromScale(overlap, overlap / ratio);
}

/// Back, not at all or forth, with equal chance.
double randomShift()
{
    return static_cast<float>(std::rand() % 3 - 1) * SHIFT;
}

/// Scales what is seen and shifts it at random, by the vertical draw first.
void move(Transformation::Object& transformation, double scale)
{
    QTransform matrix = transformation.matrix.toQTransform();
    matrix.scale(scale, scale);
    const double dy = randomShift();
    const double dx = randomShift();
    transformation.setMatrix(matrix * QTransform::fromTranslate(dx, dy));
}

} // namespace

TransformationEnvelope* generateEnvelope(bool randomStart, bool fitMode, const QSize& sourceSize,
                                         const QSize& frameSize, double fromStep, double toStep)
{
    Transformation::Object begin;
    begin.setMatrix(fitTransform(fitMode, sourceSize, frameSize));
    Transformation::Object end = begin;
    if (randomStart) {
        const bool zoomsOut = std::rand() % 4 != 0;
        move(zoomsOut ? begin : end, NEAR_SCALE);
    } else {
        move(begin, BEGIN_SCALE);
        move(end, END_SCALE);
    }
    auto envelope = std::make_unique<TransformationEnvelope>();
    envelope->addKeyValue(fromStep, begin)->addKeyValue(toStep, end);
    return envelope.release();
}

} // namespace PanAndZoom
