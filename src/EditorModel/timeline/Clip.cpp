// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/Clip.h>

#include <EditorModel/analysis/BeatDetection.h>
#include <EditorModel/analysis/MotionTracking.h>
#include <EditorModel/analysis/Stabilization.h>
#include <EditorModel/effects/Effect.h>
#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Quiz.h>
#include <EditorModel/media/File.h>
#include <EditorModel/persistence/Fields.h>
#include <EditorModel/timeline/Label.h>
#include <EditorModel/timeline/Object.h>

#include <algorithm>
#include <iterator>

namespace Timeline {

// Constant-initialised: they stand before any source's own constants are computed from them.
const MTime Clip::MIN_DURATION = 10;
const MTime Clip::DEFAULT_TITLE_CLIP_DURATION = 6000;
const MTime Clip::DEFAULT_CALLOUT_CLIP_DURATION = 3000;
const MTime Clip::DEFAULT_IMAGE_CLIP_DURATION = 4000;
const MTime Clip::DEFAULT_QUIZ_CLIP_DURATION = 5500;

Clip::~Clip() = default;

Clip* Clip::setTimeline(const Timeline::Object* newTimeline)
{
    timeline = newTimeline;
    return this;
}

Clip* Clip::setType(ClipType newType)
{
    type = newType;
    return this;
}

Clip* Clip::setName(const QString& newName)
{
    name = newName;
    return this;
}

Clip* Clip::setRange(const Composition::Range* newRange)
{
    range = newRange;
    return this;
}

Clip* Clip::setFile(const Media::File* newFile)
{
    file = newFile;
    return this;
}

Clip* Clip::setOverlay(const Overlay::Preset* preset)
{
    overlay = preset;
    return this;
}

Clip* Clip::setQuiz(const Quiz::Preset* preset)
{
    quiz = preset;
    return this;
}

Clip* Clip::setNestedTimeline(const Timeline::Object* nested)
{
    nestedTimeline = nested;
    return this;
}

Clip* Clip::setVolume(int percent)
{
    volume = percent;
    return this;
}

Clip* Clip::setVolumeEnvelope(const VolumeEnvelope* envelope)
{
    volumeEnvelope = envelope;
    return this;
}

Clip* Clip::setCropEnvelope(const TransformationEnvelope* envelope)
{
    cropEnvelope = envelope;
    return this;
}

Clip* Clip::setMoveEnvelope(const TransformationEnvelope* envelope)
{
    moveEnvelope = envelope;
    return this;
}

Clip* Clip::setRhythm(const BeatDetection::Object* beats)
{
    rhythm = beats;
    return this;
}

Clip* Clip::setStabilization(const Stabilization::Object* newStabilization)
{
    stabilization = newStabilization;
    return this;
}

Clip* Clip::setMediaTrack(int index)
{
    mediaTrack = index;
    return this;
}

Clip* Clip::setLabels(const std::set<const Timeline::Label*>& newLabels)
{
    labels = newLabels;
    return this;
}

Clip* Clip::setMotionTrackings(const std::set<QString>& ids)
{
    motionTrackings = ids;
    return this;
}

Clip* Clip::setEnabled(bool on)
{
    enabled = on;
    return this;
}

Clip* Clip::setBroken(bool on)
{
    broken = on;
    return this;
}

Clip* Clip::setUnlimitedDuration(bool on)
{
    unlimitedDuration = on;
    return this;
}

Clip* Clip::setSourceDuration(MTime duration)
{
    sourceDuration = duration;
    return this;
}

Clip* Clip::addEffect(const Effect::Object* effect)
{
    effects.push_back(effect);
    return this;
}

Clip* Clip::removeEffect(const Effect::Object* effect)
{
    effects.erase(std::remove(effects.begin(), effects.end(), effect), effects.end());
    return this;
}

Clip* Clip::clearEffects()
{
    effects.clear();
    return this;
}

Clip* Clip::replaceEffect(const Effect::Object* effect)
{
    const auto isReplaced = [effect](const Effect::Object* other) {
        return other->id == effect->id && other->uniqueId == effect->uniqueId;
    };
    *std::find_if(effects.begin(), effects.end(), isReplaced) = effect;
    return this;
}

const Effect::Object* Clip::findEffect(const QString& id) const
{
    const auto found = std::find_if(effects.begin(), effects.end(),
                                    [&id](const Effect::Object* effect) { return effect->id == id; });
    return found == effects.end() ? nullptr : *found;
}

Clip* Clip::addLabel(const Timeline::Label* label)
{
    labels.insert(label);
    return this;
}

Clip* Clip::removeLabel(const Timeline::Label* label)
{
    labels.erase(label);
    return this;
}

std::set<const Timeline::Label*> Clip::labelsDifference(const Clip* other) const
{
    std::set<const Timeline::Label*> difference;
    std::set_difference(labels.begin(), labels.end(), other->labels.begin(), other->labels.end(),
                        std::inserter(difference, difference.end()), labels.key_comp());
    return difference;
}

Clip* Clip::addMotionTracking(const QString& id)
{
    motionTrackings.insert(id);
    return this;
}

Clip* Clip::removeMotionTracking(const QString& id)
{
    motionTrackings.erase(id);
    return this;
}

bool Clip::hasLostMotionTracking() const
{
    // Whoever answers may change the clip.
    const std::set<QString> asked = motionTrackings;
    return !std::all_of(asked.begin(), asked.end(),
                        [](const QString& id) { return MotionTracking::Helper().isAvailable(id); });
}

bool Clip::isVideoClip() const
{
    return type == VideoClip || type == IntroVideoClip;
}

bool Clip::isAudioClip() const
{
    return type == AudioClip || type == IntroAudioClip;
}

bool Clip::isOverlayClip() const
{
    return type == OverlayClip || type == IntroOverlayClip;
}

bool Clip::isIntroClip() const
{
    return type == IntroVideoClip || type == IntroAudioClip;
}

void fields(Serialize::Fields& f, Clip& clip)
{
    f("timeline", clip.timeline)("type", clip.type)("name", clip.name)("enabled", clip.enabled);
    f("overlay", clip.overlay)("quiz", clip.quiz)("file", clip.file);
    f("nestedTimeline", clip.nestedTimeline)("volume", clip.volume);
    f("volumeEnvelope", clip.volumeEnvelope)("cropEnvelope", clip.cropEnvelope);
    f("moveEnvelope", clip.moveEnvelope)("broken", clip.broken);
    f("unlimitedDuration", clip.unlimitedDuration)("sourceDuration", clip.sourceDuration);
    f("effects", clip.effects)("rhythm", clip.rhythm)("stabilization", clip.stabilization);
    f("mediaTrack", clip.mediaTrack)("labels", clip.labels)("motionTrackings", clip.motionTrackings);
}

} // namespace Timeline

EDITORMODEL_PERSISTENT_CLASS(Timeline::Clip)
