// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/effects/Animation.h>
#include <EditorModel/effects/Transformation.h>

#include <QtGlobal>

#include <functional>

namespace Norvel::Proc {
struct Matrix3x3;
}

namespace Animation {

template <>
struct EDITORMODEL_EXPORT ValueTypeTrait<Transformation::Object>
{
    using ValueType = Transformation::Object;
    // Inline, so that it stands before every constant of a source that sees it.
    static inline const Transformation::Object s_defaultValue{};
};

} // namespace Animation

namespace Envelope {

struct EDITORMODEL_EXPORT TransformationInterpolator
{
    /// Interpolates translation, scale, rotation and opacity by themselves; shear and perspective are
    /// dropped. The rotation goes the shorter way round, and backwards where both ways are equal. The opacity
    /// is rounded, a half upwards. Not clamped to the two steps; where these are equal the result means
    /// nothing.
    static Transformation::Object interpolate(double lowerStep, double upperStep, double step,
                                              const Transformation::Object& lower,
                                              const Transformation::Object& upper);
};

} // namespace Envelope

/// Gain over time, as a factor: 1.0 leaves the sound as it is.
using VolumeEnvelope =
    Animation::Item<Animation::ValueTypeTrait<double>, Animation::ValueTypeInterpolator<double>>;
/// Place, size and opacity of a picture over time.
using TransformationEnvelope =
    Animation::Item<Animation::ValueTypeTrait<Transformation::Object>, Envelope::TransformationInterpolator>;

EDITORMODEL_ARCHIVE_NAME(Animation::KeyValue<double>, "AnimationDoubleKeyValue")
EDITORMODEL_ARCHIVE_NAME(Animation::KeyValue<Transformation::Object>, "AnimationTransformationKeyValue")
EDITORMODEL_ARCHIVE_NAME(VolumeEnvelope, "VolumeEnvelope")
EDITORMODEL_ARCHIVE_NAME(TransformationEnvelope, "TransformationEnvelope")

EDITORMODEL_PERSISTENT_INSTANTIATION(Animation::KeyValue<double>)
EDITORMODEL_PERSISTENT_INSTANTIATION(Animation::KeyValue<Transformation::Object>)
EDITORMODEL_PERSISTENT_INSTANTIATION(VolumeEnvelope)
EDITORMODEL_PERSISTENT_INSTANTIATION(TransformationEnvelope)

extern template class Animation::KeyValue<double>;
extern template class Animation::KeyValue<Transformation::Object>;
extern template class Animation::Item<Animation::ValueTypeTrait<double>,
                                      Animation::ValueTypeInterpolator<double>>;
extern template class Animation::Item<Animation::ValueTypeTrait<Transformation::Object>,
                                      Envelope::TransformationInterpolator>;

/// Envelopes as functions, for those that render: each holds a copy of its envelope, so that it outlives the
/// envelope, sees no later change and may be called on any thread. A call allocates nothing.
///
/// On the axis of an envelope, 1.0 stands for `total` units of the caller's time. A part of a longer source
/// starts at `position` and is `length` long; only the ratios of the three count. `total` is not 0.
namespace Envelope {

/// The gain at a time, from the current time and those at which the played span begins and ends.
using VolumeFunction = std::function<double(qint64 current, qint64 begin, qint64 end)>;
/// The transform at a progress through the played span, 0.0 where it begins and 1.0 where it ends. The
/// opacity is a factor: 1.0 is opaque.
using TransformationFunction =
    std::function<void(double progress, Norvel::Proc::Matrix3x3& matrix, double& opacity)>;

/// Always 1.0 where `item` is null. A span whose `end` equals its `begin` divides by zero.
EDITORMODEL_EXPORT VolumeFunction envelopeFunction(qint64 position, qint64 total, qint64 length,
                                                   const VolumeEnvelope* item);
/// Always the identity and 1.0 where `item` is null.
EDITORMODEL_EXPORT TransformationFunction envelopeFunction(qint64 position, qint64 total, qint64 length,
                                                           const TransformationEnvelope* item);

/// A linear fade at either end of the span, by their lengths; where they overlap they multiply. A time
/// outside the span divides by a length of zero: combine() keeps it inside.
EDITORMODEL_EXPORT VolumeFunction fadeFunction(qint64 fadeIn, qint64 fadeOut);

/// The product of both, at a time held within the span. The second is called first. Calling it throws
/// `std::bad_function_call` where one of them is empty.
EDITORMODEL_EXPORT VolumeFunction combine(VolumeFunction first, VolumeFunction second);

} // namespace Envelope
