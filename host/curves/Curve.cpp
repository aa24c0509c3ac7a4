// SPDX-License-Identifier: Apache-2.0
#include "host/curves/Curve.h"

#include <cmath>
#include <utility>

namespace Host {
namespace {

/// Microseconds, so that also a short span has more places than a picture has columns.
constexpr qint64 unitsPerMs = 1000;

qint64 units(MTime time)
{
    return time.ms() * unitsPerMs;
}

constexpr double pi = 3.141592653589793;

/// From -180..180 to 0..360; a tiny negative angle would round up to 360.
double wholeTurn(double degrees)
{
    const double positive = degrees < 0.0 ? degrees + 360.0 : degrees;
    return positive >= 360.0 ? 0.0 : positive;
}

} // namespace

VolumeCurve::VolumeCurve(const VolumeEnvelope& envelope, const CurveSpan& span)
    : m_span(span),
      m_keys(envelope.keyValues),
      m_envelope(Envelope::envelopeFunction(0, units(span.length), units(span.length), &envelope)),
      m_fade(Envelope::fadeFunction(units(span.fadeIn), units(span.fadeOut))),
      m_volume(Envelope::combine(m_envelope, m_fade))
{}

double VolumeCurve::envelopeAt(double progress) const
{
    return call(m_envelope, progress);
}

double VolumeCurve::fadeAt(double progress) const
{
    return call(m_fade, progress);
}

double VolumeCurve::volumeAt(double progress) const
{
    return call(m_volume, progress);
}

double VolumeCurve::call(const Envelope::VolumeFunction& function, double progress) const
{
    const qint64 end = units(m_span.length);
    return function(std::llround(progress * static_cast<double>(end)), 0, end);
}

Pose poseOf(const Norvel::Proc::Matrix3x3& matrix, double opacity)
{
    Pose pose;
    pose.matrix = matrix;
    pose.dx = matrix.m31;
    pose.dy = matrix.m32;
    pose.scaleX = std::hypot(matrix.m11, matrix.m12);
    pose.scaleY = std::hypot(matrix.m21, matrix.m22);
    pose.rotation = wholeTurn(std::atan2(matrix.m12, matrix.m11) * 180.0 / pi);
    pose.opacity = opacity;
    return pose;
}

Pose poseOf(const Transformation::Object& transformation)
{
    return poseOf(transformation.matrix.toMatrix3x3(), transformation.opacity / 100.0);
}

TransformationCurve::TransformationCurve(const TransformationEnvelope& envelope, MTime length)
    : m_keys(envelope.keyValues),
      m_function(Envelope::envelopeFunction(0, length.ms(), length.ms(), &envelope))
{
    m_span.length = length;
}

Pose TransformationCurve::poseAt(double progress) const
{
    Norvel::Proc::Matrix3x3 matrix;
    double opacity = 1.0;
    m_function(progress, matrix, opacity);
    return poseOf(matrix, opacity);
}

std::vector<double> evenSteps(int steps)
{
    std::vector<double> places;
    places.reserve(static_cast<std::size_t>(steps) + 1);
    for (int i = 0; i <= steps; ++i) {
        places.push_back(static_cast<double>(i) / steps);
    }
    return places;
}

std::vector<double> unwrapped(std::vector<double> degrees)
{
    for (std::size_t i = 1; i < degrees.size(); ++i) {
        const double turns = std::round((degrees[i] - degrees[i - 1]) / 360.0);
        if (std::isfinite(turns)) {
            degrees[i] -= turns * 360.0;
        }
    }
    return degrees;
}

} // namespace Host
