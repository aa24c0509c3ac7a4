// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/Envelope.h>

#include <QPointF>
#include <QRectF>
#include <QSizeF>
#include <QTransform>

#include <cmath>
#include <limits>

double Animation::ValueTypeInterpolator<double>::interpolate(double lowerStep, double upperStep, double step,
                                                             const double& lower, const double& upper)
{
    const double t = (step - lowerStep) / (upperStep - lowerStep);
    return (1.0 - t) * lower + t * upper;
}

namespace {

constexpr double PI = 3.141592653589793;

/// An angle below 360 degrees, and not below 0 unless it was below -360. Infinity becomes not-a-number.
double normalised(double angle)
{
    if (angle < 0.0)
        angle += 360.0;
    return angle >= 360.0 ? std::fmod(angle, 360.0) : angle;
}

QTransform rotation(double angle)
{
    return QTransform().rotate(angle, Qt::ZAxis);
}

double rotationAngle(const QTransform& transform)
{
    const QPointF axis = transform.map(QPointF(1.0, 0.0)) - transform.map(QPointF(0.0, 0.0));
    return axis.isNull() ? 0.0 : normalised(std::atan2(axis.y(), axis.x()) * 180.0 / PI);
}

/// The size of the unit square without its rotation.
QSizeF scaleOf(const QTransform& transform, double angle)
{
    return (transform * rotation(-angle)).mapRect(QRectF(0.0, 0.0, 1.0, 1.0)).size();
}

/// The shorter way from one angle to another, in [-180, 180).
double rotationDelta(double from, double to)
{
    return normalised(normalised(to - from) - 180.0) - 180.0;
}

/// Cuts off the fraction. What no int holds, not-a-number included, gives the lowest one, as the conversion
/// of the common processors does; the language leaves it open.
int truncated(double value)
{
    using Limits = std::numeric_limits<int>;
    const bool fits = value > Limits::min() - 1.0 && value < Limits::max() + 1.0;
    return fits ? static_cast<int>(value) : Limits::min();
}

} // namespace

Transformation::Object Envelope::TransformationInterpolator::interpolate(double lowerStep, double upperStep,
                                                                         double step,
                                                                         const Transformation::Object& lower,
                                                                         const Transformation::Object& upper)
{
    const double t = (step - lowerStep) / (upperStep - lowerStep);
    const auto between = [t](double a, double b) { return (1.0 - t) * a + t * b; };

    const QTransform from = lower.matrix.toQTransform();
    const QTransform to = upper.matrix.toQTransform();
    const double fromAngle = rotationAngle(from);
    const double toAngle = rotationAngle(to);
    const QSizeF fromScale = scaleOf(from, fromAngle);
    const QSizeF toScale = scaleOf(to, toAngle);

    const double width = between(fromScale.width(), toScale.width());
    const double height = between(fromScale.height(), toScale.height());
    const double angle = normalised(fromAngle + rotationDelta(fromAngle, toAngle) * t);
    const double dx = between(from.dx(), to.dx());
    const double dy = between(from.dy(), to.dy());

    const QTransform matrix =
        QTransform::fromScale(width, height) * rotation(angle) * QTransform::fromTranslate(dx, dy);
    return {matrix, truncated(upper.opacity * t + (1.0 - t) * lower.opacity + 0.5)};
}
