// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/EffectHelper.h>

namespace Effect {
namespace {

template <class Request>
void modify(List& list)
{
    PubSub::publish(Request(nullptr, list));
}

template <class Request>
List filter(List& list)
{
    List removed;
    PubSub::publish(Request(nullptr, list, removed));
    return removed;
}

} // namespace

void EffectHelper::sortEffects(List& list)
{
    modify<Details::SortRequest>(list);
}

void EffectHelper::expandEffectsHolders(List& list)
{
    modify<Details::ExpandEffectsHoldersRequest>(list);
}

List EffectHelper::removeAllPiPEffects(List& list)
{
    return filter<Details::RemoveAllPiPEffectsRequest>(list);
}

List EffectHelper::removeAllStaticEffects(List& list)
{
    return filter<Details::RemoveAllStaticEffectsRequest>(list);
}

List EffectHelper::removeAudioNormalizeEffects(List& list)
{
    return filter<Details::RemoveNormalizeEffectsRequest>(list);
}

List EffectHelper::removeCropTransposeEffects(List& list)
{
    return filter<Details::RemoveCropTransposeEffectsRequest>(list);
}

List EffectHelper::removePreTransformEffects(List& list)
{
    return filter<Details::RemovePreTransformEffectsRequest>(list);
}

} // namespace Effect
