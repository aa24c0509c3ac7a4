// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/Envelope.h>

#include <EditorModel/effects/KeySearch.h>
#include <EditorModel/types/Norvel.h>

#include <algorithm>
#include <utility>
#include <vector>

namespace Envelope {
namespace {

/// A copy of an envelope that holds its keys side by side, and the part of its axis that is played.
template <class Trait, class Interpolator>
class Snapshot
{
public:
    using Item = Animation::Item<Trait, Interpolator>;
    using Value = typename Item::ValueType;

    Snapshot(qint64 position, qint64 total, qint64 length, const Item& item)
        : m_offset(static_cast<double>(position) / static_cast<double>(total)),
          m_span(static_cast<double>(length) / static_cast<double>(total)),
          m_defaultValue(item.defaultValue)
    {
        m_keys.reserve(item.keyValues.size());
        for (const auto& key : item.keyValues)
            m_keys.push_back({key.step, key.value});
    }

    Value valueAt(double progress) const
    {
        return Animation::Details::valueAt<Interpolator>(m_keys, m_defaultValue,
                                                         progress * m_span + m_offset);
    }

private:
    struct Key
    {
        double step;
        Value value;
    };

    double m_offset;
    double m_span;
    Value m_defaultValue;
    std::vector<Key> m_keys;
};

template <class Trait, class Interpolator>
Snapshot(qint64, qint64, qint64, const Animation::Item<Trait, Interpolator>&)
    -> Snapshot<Trait, Interpolator>;

} // namespace

VolumeFunction envelopeFunction(qint64 position, qint64 total, qint64 length, const VolumeEnvelope* item)
{
    if (!item)
        return [](qint64, qint64, qint64) { return 1.0; };
    return [snapshot = Snapshot(position, total, length, *item)](qint64 current, qint64 begin, qint64 end) {
        return snapshot.valueAt(static_cast<double>(current - begin) / static_cast<double>(end - begin));
    };
}

TransformationFunction envelopeFunction(qint64 position, qint64 total, qint64 length,
                                        const TransformationEnvelope* item)
{
    if (!item) {
        return [](double, Norvel::Proc::Matrix3x3& matrix, double& opacity) {
            matrix = {};
            opacity = 1.0;
        };
    }
    return [snapshot = Snapshot(position, total, length, *item)](
               double progress, Norvel::Proc::Matrix3x3& matrix, double& opacity) {
        const Transformation::Object transformation = snapshot.valueAt(progress);
        matrix = transformation.matrix.toMatrix3x3();
        opacity = transformation.opacity / 100.0;
    };
}

VolumeFunction fadeFunction(qint64 fadeIn, qint64 fadeOut)
{
    return [fadeIn, fadeOut](qint64 current, qint64 begin, qint64 end) {
        const qint64 gone = current - begin;
        const qint64 left = end - current;
        const double in = gone < fadeIn ? static_cast<double>(gone) / static_cast<double>(fadeIn) : 1.0;
        return left < fadeOut ? static_cast<double>(left) * in / static_cast<double>(fadeOut) : in;
    };
}

VolumeFunction combine(VolumeFunction first, VolumeFunction second)
{
    return [first = std::move(first), second = std::move(second)](qint64 current, qint64 begin, qint64 end) {
        const qint64 time = end < current ? end : std::max(current, begin);
        const double secondGain = second(time, begin, end);
        return first(time, begin, end) * secondGain;
    };
}

} // namespace Envelope
