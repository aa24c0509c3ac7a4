// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>

#include <QString>

#include <deque>
#include <optional>
#include <utility>

namespace Animation {

/// "x-application/AnimationItem-serialized": an envelope on the clipboard.
EDITORMODEL_EXPORT extern const QString* const itemMimeType;

/// Names the value type of an envelope, `ValueType`, and the value of an empty one, `s_defaultValue`.
template <class T>
struct ValueTypeTrait;

template <>
struct EDITORMODEL_EXPORT ValueTypeTrait<double>
{
    using ValueType = double;
    static constexpr double s_defaultValue = 1.0;
};

/// Gives the value between two keys by a static `interpolate`.
template <class T>
struct ValueTypeInterpolator;

template <>
struct EDITORMODEL_EXPORT ValueTypeInterpolator<double>
{
    /// Linear; not clamped to the two steps, and not-a-number where both are equal to `step`.
    static double interpolate(double lowerStep, double upperStep, double step, const double& lower,
                              const double& upper);
};

/// A keyframe.
template <class T>
class EDITORMODEL_EXPORT KeyValue : public Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(KeyValue)

public:
    /// The position on the envelope's axis.
    double step = 0.0;
    T value{};

    KeyValue();
    KeyValue(double step_, const T& value_);
    KeyValue(const KeyValue&) = default;
    KeyValue& operator=(const KeyValue&) = default;
    ~KeyValue() override;
};

/// An envelope: keyframes along an axis, with a value for where there are none. Before the first key the
/// first value holds, behind the last key the last one.
///
/// There are two of them, `VolumeEnvelope` and `TransformationEnvelope`; see Envelope.h.
template <class Trait, class Interpolator>
class EDITORMODEL_EXPORT Item : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Item)

public:
    using ValueType = typename Trait::ValueType;
    using Key = KeyValue<ValueType>;

    /// Ascending by step, where they were added by addKeyValue(). Nothing sorts what was put here otherwise,
    /// reading from an archive included.
    std::deque<Key> keyValues;
    /// The value of an envelope without keys; `Trait::s_defaultValue` at first.
    ValueType defaultValue;

    Item();
    Item(const Item&) = default;
    /// Takes the list and leaves none behind; the default value is copied.
    Item(Item&& other);
    Item& operator=(const Item&) = default;
    ~Item() override;

    /// Inserts in front of the first key whose step is not less, thus in front of those with an equal step,
    /// which stay.
    Item* addKeyValue(const Key& key);
    Item* addKeyValue(double step, const ValueType& value);

    /// Copies of the keys below and above a position. A key that the position has reached is the lower one,
    /// and counts as reached from less than 2.220446049250313e-15 before it, whatever the size of the steps.
    std::pair<std::optional<Key>, std::optional<Key>> neighbours(double step) const;
    /// Interpolated between the two neighbours, the value of the only one, or the default value. At the
    /// position of two keys with equal steps it is not-a-number.
    ValueType valueAt(double step) const;
};

} // namespace Animation
