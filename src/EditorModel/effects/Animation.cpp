// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/Animation.h>

#include <EditorModel/effects/Envelope.h>
#include <EditorModel/effects/KeySearch.h>
#include <EditorModel/persistence/Fields.h>

#include <utility>

namespace Animation {

template <class T>
KeyValue<T>::KeyValue() = default;

template <class T>
KeyValue<T>::KeyValue(double step_, const T& value_) : step(step_), value(value_)
{}

template <class T>
KeyValue<T>::~KeyValue() = default;

template <class Trait, class Interpolator>
Item<Trait, Interpolator>::Item() : defaultValue(Trait::s_defaultValue)
{}

template <class Trait, class Interpolator>
Item<Trait, Interpolator>::Item(Item&& other)
    : PubSub::Object(other),
      Serialize::ISerializable(other),
      keyValues(std::exchange(other.keyValues, {})),
      defaultValue(other.defaultValue)
{}

template <class Trait, class Interpolator>
Item<Trait, Interpolator>::~Item() = default;

template <class Trait, class Interpolator>
Item<Trait, Interpolator>* Item<Trait, Interpolator>::addKeyValue(const Key& key)
{
    const auto isBefore = [](const Key& other, double step) { return other.step < step; };
    const auto place = std::lower_bound(keyValues.begin(), keyValues.end(), key.step, isBefore);
    keyValues.insert(place, key);
    return this;
}

template <class Trait, class Interpolator>
Item<Trait, Interpolator>* Item<Trait, Interpolator>::addKeyValue(double step, const ValueType& value)
{
    return addKeyValue(Key(step, value));
}

template <class Trait, class Interpolator>
auto Item<Trait, Interpolator>::neighbours(double step) const
    -> std::pair<std::optional<Key>, std::optional<Key>>
{
    const auto keyAt = [this](std::size_t index) {
        return index < keyValues.size() ? std::optional<Key>(keyValues[index]) : std::nullopt;
    };
    const Details::Neighbours found = Details::neighbours(keyValues, step);
    return {keyAt(found.lower), keyAt(found.upper)};
}

template <class Trait, class Interpolator>
auto Item<Trait, Interpolator>::valueAt(double step) const -> ValueType
{
    return Details::valueAt<Interpolator>(keyValues, defaultValue, step);
}

template <class T>
void fields(Serialize::Fields& f, KeyValue<T>& key)
{
    f("step", key.step)("value", key.value);
}

template <class Trait, class Interpolator>
void fields(Serialize::Fields& f, Item<Trait, Interpolator>& item)
{
    f("defaultValue", item.defaultValue)("keyValues", item.keyValues);
}

} // namespace Animation

EDITORMODEL_PERSISTENT_INSTANTIATION_CLASS(Animation::KeyValue<double>)
EDITORMODEL_PERSISTENT_INSTANTIATION_CLASS(Animation::KeyValue<Transformation::Object>)
EDITORMODEL_PERSISTENT_INSTANTIATION_CLASS(VolumeEnvelope)
EDITORMODEL_PERSISTENT_INSTANTIATION_CLASS(TransformationEnvelope)

template class Animation::KeyValue<double>;
template class Animation::KeyValue<Transformation::Object>;
template class Animation::Item<Animation::ValueTypeTrait<double>, Animation::ValueTypeInterpolator<double>>;
template class Animation::Item<Animation::ValueTypeTrait<Transformation::Object>,
                               Envelope::TransformationInterpolator>;
