// SPDX-License-Identifier: Apache-2.0
#include "host/editing/EffectRules.h"

#include <algorithm>

namespace Host {
namespace {

enum Kind : int
{
    Ordinary,
    PreTransform,
    CropTranspose,
    PictureInPicture,
    Static,
    Normalizing,
};

Kind kindOf(const Effect::Object* effect)
{
    static const std::map<QString, Kind> kinds = {
        {"Deinterlace", PreTransform},
        {"Stabilization", PreTransform},
        {"FixVertVideo", PreTransform},
        {"Crop", CropTranspose},
        {"RotateLeft", CropTranspose},
        {"RotateRight", CropTranspose},
        {"FlipHorizontal", CropTranspose},
        {"FlipVertical", CropTranspose},
        {"PictureInPicture", PictureInPicture},
        {"PictureInPictureShadow", PictureInPicture},
        {"Sepia", Static},
        {"Vignette", Static},
        {"FindEdges", Static},
        {"HalfToneColour", Static},
        {"SharpenHigh", Static},
        {"AudioNormalize", Normalizing},
        {"LoudnessMatch", Normalizing},
    };
    const auto known = effect ? kinds.find(effect->id) : kinds.end();
    return known == kinds.end() ? Ordinary : known->second;
}

/// The place of an effect in a sorted chain.
int rankOf(const Effect::Object* effect)
{
    const Kind kind = kindOf(effect);
    if (effect && effect->type() == Effect::Object::Audio) {
        return kind == Normalizing ? 5 : 4;
    }
    switch (kind) {
    case PreTransform:
        return 0;
    case CropTranspose:
        return 1;
    case PictureInPicture:
        return 3;
    default:
        return 2;
    }
}

void moveKind(Kind kind, const Effect::Details::EffectListFilterRequest& request)
{
    const auto isOther = [kind](const Effect::Object* effect) { return kindOf(effect) != kind; };
    Effect::List& list = request.list;
    const auto named = std::stable_partition(list.begin(), list.end(), isOther);
    request.result.insert(request.result.end(), named, list.end());
    list.erase(named, list.end());
}

} // namespace

class EffectRules::HeldEffect : public Effect::Object
{
public:
    HeldEffect(const QString& effectId, Type effectType) : Effect::Object(effectId), m_type(effectType) {}

    Type type() const override { return m_type; }

private:
    Type m_type;
};

EffectRules::EffectRules()
{
    std::vector<HeldEffect>& oldFilm = m_held["OldFilm"];
    for (const char* id : {"Sepia", "FilmGrain", "Vignette"}) {
        oldFilm.emplace_back(id, Effect::Object::Video);
    }
    std::vector<HeldEffect>& silentMovie = m_held["SilentMovie"] = oldFilm;
    silentMovie.emplace_back("FrameJitter", Effect::Object::Video);
    std::vector<HeldEffect>& phoneCall = m_held["PhoneCall"];
    for (const char* id : {"Phone", "AudioNormalize"}) {
        phoneCall.emplace_back(id, Effect::Object::Audio);
    }
    subscribeAll<Effect::Object>();
}

EffectRules::~EffectRules() = default;

void EffectRules::notify(const Effect::Details::SortRequest& request)
{
    std::stable_sort(request.list.begin(), request.list.end(),
                     [](const auto* a, const auto* b) { return rankOf(a) < rankOf(b); });
}

void EffectRules::notify(const Effect::Details::ExpandEffectsHoldersRequest& request)
{
    Effect::List expanded;
    for (const Effect::Object* effect : request.list) {
        const auto held = effect && !effect->bypass ? m_held.find(effect->id) : m_held.end();
        if (held == m_held.end()) {
            expanded.push_back(effect);
            continue;
        }
        for (const HeldEffect& part : held->second) {
            expanded.push_back(&part);
        }
    }
    request.list.swap(expanded);
}

void EffectRules::notify(const Effect::Details::RemoveAllPiPEffectsRequest& request)
{
    moveKind(PictureInPicture, request);
}

void EffectRules::notify(const Effect::Details::RemoveAllStaticEffectsRequest& request)
{
    moveKind(Static, request);
}

void EffectRules::notify(const Effect::Details::RemoveNormalizeEffectsRequest& request)
{
    moveKind(Normalizing, request);
}

void EffectRules::notify(const Effect::Details::RemoveCropTransposeEffectsRequest& request)
{
    moveKind(CropTranspose, request);
}

void EffectRules::notify(const Effect::Details::RemovePreTransformEffectsRequest& request)
{
    moveKind(PreTransform, request);
}

} // namespace Host
