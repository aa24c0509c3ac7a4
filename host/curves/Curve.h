// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/effects/Envelope.h>
#include <EditorModel/types/MTime.h>
#include <EditorModel/types/Norvel.h>

#include <deque>
#include <vector>

namespace Host {

/// How an envelope is played: from its beginning over all of its axis.
struct CurveSpan
{
    /// More than zero. On the axis of the envelope it is 1.0.
    MTime length = 10000;
    MTime fadeIn;
    MTime fadeOut;

    bool hasFades() const { return fadeIn > MTime() || fadeOut > MTime(); }
    /// The time at a progress, 0.0 where the span begins and 1.0 where it ends.
    MTime timeAt(double progress) const { return length.mulRound(progress); }
};

/// What the evaluation functions give for a volume envelope with fades, at a progress from 0.0 to 1.0.
class VolumeCurve
{
public:
    VolumeCurve(const VolumeEnvelope& envelope, const CurveSpan& span);

    const CurveSpan& span() const { return m_span; }
    const std::deque<VolumeEnvelope::Key>& keys() const { return m_keys; }

    double envelopeAt(double progress) const;
    double fadeAt(double progress) const;
    /// The envelope with its fades.
    double volumeAt(double progress) const;

private:
    double call(const Envelope::VolumeFunction& function, double progress) const;

    CurveSpan m_span;
    std::deque<VolumeEnvelope::Key> m_keys;
    Envelope::VolumeFunction m_envelope;
    Envelope::VolumeFunction m_fade;
    Envelope::VolumeFunction m_volume;
};

/// A transform, taken apart as a scale that is followed by a rotation and a translation.
struct Pose
{
    Norvel::Proc::Matrix3x3 matrix;
    double dx = 0.0;
    double dy = 0.0;
    double scaleX = 1.0;
    double scaleY = 1.0;
    /// In degrees, from 0 up to but not including 360.
    double rotation = 0.0;
    /// 1.0 is opaque.
    double opacity = 1.0;
};

Pose poseOf(const Norvel::Proc::Matrix3x3& matrix, double opacity);
Pose poseOf(const Transformation::Object& transformation);

/// The same for a transformation envelope, which takes no fades.
class TransformationCurve
{
public:
    TransformationCurve(const TransformationEnvelope& envelope, MTime length);

    const CurveSpan& span() const { return m_span; }
    const std::deque<TransformationEnvelope::Key>& keys() const { return m_keys; }

    Pose poseAt(double progress) const;

private:
    CurveSpan m_span;
    std::deque<TransformationEnvelope::Key> m_keys;
    Envelope::TransformationFunction m_function;
};

/// The places of `steps` equal steps from 0.0 to 1.0, both ends included.
std::vector<double> evenSteps(int steps);

/// Turns angles in degrees, which jump at a full turn, into a course without jumps: each is moved by whole
/// turns next to the one before it.
std::vector<double> unwrapped(std::vector<double> degrees);

} // namespace Host
