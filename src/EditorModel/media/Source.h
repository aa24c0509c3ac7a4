// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/analysis/OverlayLinkInfo.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/effects/Envelope.h>
#include <EditorModel/media/ResourceRef.h>
#include <EditorModel/media/TimingMode.h>
#include <EditorModel/types/MTime.h>

#include <deque>
#include <string>

namespace Effect {
class Object;
}
namespace Overlay {
class Preset;
}

namespace Media {

/// How a picture is fitted to the frame that it plays in. The modes belong to the modules that play it; other
/// values are reached by a cast.
enum ResizeMode : int
{
    DefaultResizeMode = 0,
};

/// A resource that plays on its own, apart from any timeline. Clients fill it in for the module that plays
/// it; the fields are those of Timeline::Clip and Timeline::ClipTiming, in one record. Nothing is checked,
/// nothing that the pointers name is owned, and nothing is stored.
class EDITORMODEL_EXPORT Source : public virtual PubSub::Object
{
public:
    /// What happens at the end of the stretch. The modes belong to the modules that play it; other values are
    /// reached by a cast.
    enum RepeatMode : int
    {
        DefaultRepeatMode = 0,
    };

    ResourceRef resource;
    /// The stretch that plays.
    MTime from;
    MTime to;
    Media::TimingMode timingMode = Media::DefaultTimingMode;
    RepeatMode repeatMode = DefaultRepeatMode;
    /// The length of the whole source.
    MTime sourceDuration;
    bool speedCompensated = false;
    /// In percent.
    int volume = 100;
    const VolumeEnvelope* volumeEnvelope = nullptr;
    const TransformationEnvelope* cropEnvelope = nullptr;
    const TransformationEnvelope* moveEnvelope = nullptr;
    MTime fadeIn;
    MTime fadeOut;
    bool reversed = false;
    /// In the order of processing.
    std::deque<const Effect::Object*> effects;
    /// Read by the engine alone.
    std::string defaultImpl;
    Media::ResizeMode resizeMode = Media::DefaultResizeMode;

    Source();
    Source(const Source&) = default;
    Source(Source&&) = default;
    Source& operator=(const Source&) = default;
    Source& operator=(Source&&) = default;
    ~Source() override;

    Source* setResource(ResourceRef newResource);
    Source* setRange(MTime newFrom, MTime newTo);
    Source* setTimingMode(Media::TimingMode mode);
    Source* setRepeatMode(RepeatMode mode);
    Source* setSourceDuration(MTime newDuration);
    Source* setSpeedCompensated(bool on);
    Source* setVolume(int percent);
    Source* setVolumeEnvelope(const VolumeEnvelope* envelope);
    Source* setCropEnvelope(const TransformationEnvelope* envelope);
    Source* setMoveEnvelope(const TransformationEnvelope* envelope);
    Source* setFades(MTime in, MTime out);
    Source* setReversed(bool on);
    Source* setEffects(const std::deque<const Effect::Object*>& newEffects);
    Source* setDefaultImpl(const std::string& name);
    Source* setResizeMode(Media::ResizeMode mode);

    /// `to` - `from`, whatever the speed: negative where the two are in the wrong order.
    MTime duration() const;
};

/// An overlay that plays on its own, apart from any timeline. As for Source, nothing is checked, owned or
/// stored.
class EDITORMODEL_EXPORT OverlaySource : public virtual PubSub::Object
{
public:
    const Overlay::Preset* overlay = nullptr;
    const TransformationEnvelope* moveEnvelope = nullptr;
    MotionTracking::OverlayLinkInfo trackingLinkInfo;
    /// Where the shown stretch starts, from the start of the source.
    MTime sourcePosition;
    /// The length of the whole source.
    MTime sourceDuration;

    OverlaySource();
    OverlaySource(const OverlaySource&) = default;
    OverlaySource(OverlaySource&&) = default;
    OverlaySource& operator=(const OverlaySource&) = default;
    OverlaySource& operator=(OverlaySource&&) = default;
    ~OverlaySource() override;

    OverlaySource& setOverlay(const Overlay::Preset* preset);
    OverlaySource& setMoveEnvelope(const TransformationEnvelope* envelope);
    OverlaySource& setTrackingLinkInfo(const MotionTracking::OverlayLinkInfo& info);
    OverlaySource& setSourcePosition(MTime position);
    OverlaySource& setSourceDuration(MTime duration);
};

} // namespace Media
