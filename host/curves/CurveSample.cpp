// SPDX-License-Identifier: Apache-2.0
#include "host/curves/CurveSample.h"

#include <QTransform>

namespace Host {
namespace {

Transformation::Object pose(double scale, double degrees, double dx, double dy, int opacity)
{
    QTransform rotation;
    rotation.rotate(degrees);
    return Transformation::Object(
        QTransform::fromScale(scale, scale) * rotation * QTransform::fromTranslate(dx, dy), opacity);
}

} // namespace

VolumeEnvelope sampleVolumeEnvelope()
{
    VolumeEnvelope envelope;
    envelope.addKeyValue(0.0, 0.8)->addKeyValue(0.18, 1.0)->addKeyValue(0.32, 1.0);
    envelope.addKeyValue(0.38, 0.25)->addKeyValue(0.62, 0.25)->addKeyValue(0.72, 1.15);
    envelope.addKeyValue(0.85, 0.9);
    return envelope;
}

TransformationEnvelope sampleTransformationEnvelope()
{
    TransformationEnvelope envelope;
    envelope.addKeyValue(0.0, pose(1.0, 0.0, 0.0, 0.0, 100));
    envelope.addKeyValue(0.3, pose(1.6, 0.0, 0.3, -0.15, 100));
    envelope.addKeyValue(0.5, pose(0.7, -20.0, -0.2, 0.1, 100));
    envelope.addKeyValue(0.75, pose(0.7, 25.0, 0.25, 0.0, 80));
    envelope.addKeyValue(1.0, pose(0.3, 0.0, 0.0, 0.0, 0));
    return envelope;
}

} // namespace Host
