// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/effects/Envelope.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/MTime.h>

#include <QString>

#include <deque>
#include <set>

namespace BeatDetection {
class Object;
}
namespace Composition {
struct Range;
}
namespace Effect {
class Object;
}
namespace Media {
class File;
}
namespace Overlay {
class Preset;
}
namespace Quiz {
class Preset;
}
namespace Stabilization {
class Object;
}

namespace Timeline {

struct Label;
struct Object;

/// What plays: a stretch of a file, an overlay, a quiz or another timeline, with its effects. When it plays
/// is in the ClipTiming that its timeline holds for it.
///
/// Clips are told apart by their addresses. Nothing that the pointers name is owned, and nothing is checked:
/// neither that exactly one source is set nor that `timeline` holds the clip.
struct EDITORMODEL_EXPORT Clip : public virtual Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Clip)

public:
    /// One bit each, for masks of several types. A clip is of a single one, or of none while it is new.
    enum ClipType : int
    {
        VideoClip = 1,
        AudioClip = 2,
        OverlayClip = 4,
        IntroVideoClip = 8,
        IntroAudioClip = 16,
        IntroOverlayClip = 32,
    };

    /// 10 ms, the shortest piece of a clip that an edit may leave: the margin of every cut and transition.
    static const MTime MIN_DURATION;
    static const MTime DEFAULT_TITLE_CLIP_DURATION;   ///< 6000 ms
    static const MTime DEFAULT_CALLOUT_CLIP_DURATION; ///< 3000 ms
    static const MTime DEFAULT_IMAGE_CLIP_DURATION;   ///< 4000 ms
    static const MTime DEFAULT_QUIZ_CLIP_DURATION;    ///< 5500 ms

    const Timeline::Object* timeline = nullptr;
    ClipType type{};
    QString name;
    /// Not stored, and never read by the model.
    const Composition::Range* range = nullptr;
    /// This or one of the three below is what the clip shows.
    const Media::File* file = nullptr;
    const Overlay::Preset* overlay = nullptr;
    const Quiz::Preset* quiz = nullptr;
    const Timeline::Object* nestedTimeline = nullptr;
    /// In percent.
    int volume = 100;
    /// Null for none, as the two below.
    const VolumeEnvelope* volumeEnvelope = nullptr;
    const TransformationEnvelope* cropEnvelope = nullptr;
    const TransformationEnvelope* moveEnvelope = nullptr;
    const BeatDetection::Object* rhythm = nullptr;
    const Stabilization::Object* stabilization = nullptr;
    /// The index of the track within `file`.
    int mediaTrack = 0;
    std::set<const Timeline::Label*> labels;
    /// The identifiers of the data of trackings in this clip.
    std::set<QString> motionTrackings;
    /// Stored and never read by the model, as `broken`.
    bool enabled = true;
    bool broken = false;
    /// The clip may be longer than its source.
    bool unlimitedDuration = false;
    /// The native length of the source: what it is without any change of speed.
    MTime sourceDuration;
    /// In the order in which they are applied; one may stand here several times.
    std::deque<const Effect::Object*> effects;

    Clip() = default;
    Clip(const Clip&) = default;
    Clip(Clip&&) = default;
    Clip& operator=(const Clip&) = default;
    Clip& operator=(Clip&&) = default;
    ~Clip() override;

    Clip* setTimeline(const Timeline::Object* newTimeline);
    Clip* setType(ClipType newType);
    Clip* setName(const QString& newName);
    Clip* setRange(const Composition::Range* newRange);
    Clip* setFile(const Media::File* newFile);
    Clip* setOverlay(const Overlay::Preset* preset);
    Clip* setQuiz(const Quiz::Preset* preset);
    Clip* setNestedTimeline(const Timeline::Object* nested);
    Clip* setVolume(int percent);
    Clip* setVolumeEnvelope(const VolumeEnvelope* envelope);
    Clip* setCropEnvelope(const TransformationEnvelope* envelope);
    Clip* setMoveEnvelope(const TransformationEnvelope* envelope);
    Clip* setRhythm(const BeatDetection::Object* beats);
    Clip* setStabilization(const Stabilization::Object* newStabilization);
    Clip* setMediaTrack(int index);
    Clip* setLabels(const std::set<const Timeline::Label*>& newLabels);
    Clip* setMotionTrackings(const std::set<QString>& ids);
    Clip* setEnabled(bool on);
    Clip* setBroken(bool on);
    Clip* setUnlimitedDuration(bool on);
    Clip* setSourceDuration(MTime duration);

    /// Appends the effect, also one that is listed already.
    Clip* addEffect(const Effect::Object* effect);
    /// Takes out every occurrence of this address.
    Clip* removeEffect(const Effect::Object* effect);
    Clip* clearEffects();
    /// Puts the effect in the place of the first one with its `id` and `uniqueId`. There must be one.
    Clip* replaceEffect(const Effect::Object* effect);
    /// The first effect with the identifier, or null. No entry of `effects` may be null.
    const Effect::Object* findEffect(const QString& id) const;

    Clip* addLabel(const Timeline::Label* label);
    Clip* removeLabel(const Timeline::Label* label);
    /// The labels that `other`, which is not null, does not have, by address.
    std::set<const Timeline::Label*> labelsDifference(const Clip* other) const;

    Clip* addMotionTracking(const QString& id);
    Clip* removeMotionTracking(const QString& id);
    /// Asks the holder of the trackings for one after another, in ascending order, up to the first that it
    /// does not have, and returns when it has answered. A tracking is lost where nobody answers.
    bool hasLostMotionTracking() const;

    /// These four are false for a `type` of several bits.
    bool isVideoClip() const;
    bool isAudioClip() const;
    bool isOverlayClip() const;
    /// A picture or sound of an intro; an intro's overlay is not counted in.
    bool isIntroClip() const;
};

} // namespace Timeline

EDITORMODEL_ARCHIVE_NAME(Timeline::Clip, "Timeline::Clip")
