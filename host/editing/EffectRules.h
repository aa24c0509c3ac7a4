// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/effects/Effect.h>
#include <EditorModel/effects/EffectHelper.h>

#include <QString>

#include <map>
#include <vector>

namespace Host {

/// The module that answers the requests about effect lists, by the identifiers of the effects:
///
/// | Effects | are |
/// |---|---|
/// | Deinterlace, Stabilization, FixVertVideo | pre-transform: they repair the source's own pictures |
/// | Crop, RotateLeft, RotateRight, FlipHorizontal, FlipVertical | crop and transpose |
/// | PictureInPicture, PictureInPictureShadow | picture-in-picture |
/// | Sepia, Vignette, FindEdges, HalfToneColour, SharpenHigh | static: the same for every frame |
/// | AudioNormalize, LoudnessMatch | normalizing |
/// | OldFilm | a holder of Sepia, FilmGrain, Vignette |
/// | SilentMovie | a holder of what OldFilm holds, and FrameJitter |
/// | PhoneCall | a holder of the audio effects Phone, AudioNormalize |
///
/// Sorting puts video before audio. Among the video effects, pre-transform effects come first, then crop and
/// transpose, then all others, and picture-in-picture last, which places what the others have made; among
/// the audio effects the normalizing ones come last. Effects of one rank keep their order.
///
/// A filter request moves the effects that it names behind what the result holds, in their order. Expanding
/// leaves a bypassed holder as it is: it does nothing. What takes the place of a holder belongs to this
/// module and lives as long as it.
class EffectRules
    : private PubSub::Subscriber<
          Effect::Details::SortRequest, Effect::Details::ExpandEffectsHoldersRequest,
          Effect::Details::RemoveAllPiPEffectsRequest, Effect::Details::RemoveAllStaticEffectsRequest,
          Effect::Details::RemoveNormalizeEffectsRequest, Effect::Details::RemoveCropTransposeEffectsRequest,
          Effect::Details::RemovePreTransformEffectsRequest>
{
public:
    EffectRules();
    EffectRules(const EffectRules&) = delete;
    EffectRules& operator=(const EffectRules&) = delete;
    ~EffectRules() override;

private:
    class HeldEffect;

    void notify(const Effect::Details::SortRequest& request) override;
    void notify(const Effect::Details::ExpandEffectsHoldersRequest& request) override;
    void notify(const Effect::Details::RemoveAllPiPEffectsRequest& request) override;
    void notify(const Effect::Details::RemoveAllStaticEffectsRequest& request) override;
    void notify(const Effect::Details::RemoveNormalizeEffectsRequest& request) override;
    void notify(const Effect::Details::RemoveCropTransposeEffectsRequest& request) override;
    void notify(const Effect::Details::RemovePreTransformEffectsRequest& request) override;

    /// Keyed by the identifiers of the holders.
    std::map<QString, std::vector<HeldEffect>> m_held;
};

} // namespace Host
