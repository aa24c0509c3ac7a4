// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/Source.h>

#include <utility>

namespace Media {

Source::Source() = default;
Source::~Source() = default;

Source* Source::setResource(ResourceRef newResource)
{
    resource = std::move(newResource);
    return this;
}

Source* Source::setRange(MTime newFrom, MTime newTo)
{
    from = newFrom;
    to = newTo;
    return this;
}

Source* Source::setTimingMode(Media::TimingMode mode)
{
    timingMode = mode;
    return this;
}

Source* Source::setRepeatMode(RepeatMode mode)
{
    repeatMode = mode;
    return this;
}

Source* Source::setSourceDuration(MTime newDuration)
{
    sourceDuration = newDuration;
    return this;
}

Source* Source::setSpeedCompensated(bool on)
{
    speedCompensated = on;
    return this;
}

Source* Source::setVolume(int percent)
{
    volume = percent;
    return this;
}

Source* Source::setVolumeEnvelope(const VolumeEnvelope* envelope)
{
    volumeEnvelope = envelope;
    return this;
}

Source* Source::setCropEnvelope(const TransformationEnvelope* envelope)
{
    cropEnvelope = envelope;
    return this;
}

Source* Source::setMoveEnvelope(const TransformationEnvelope* envelope)
{
    moveEnvelope = envelope;
    return this;
}

Source* Source::setFades(MTime in, MTime out)
{
    fadeIn = in;
    fadeOut = out;
    return this;
}

Source* Source::setReversed(bool on)
{
    reversed = on;
    return this;
}

Source* Source::setEffects(const std::deque<const Effect::Object*>& newEffects)
{
    effects = newEffects;
    return this;
}

Source* Source::setDefaultImpl(const std::string& name)
{
    defaultImpl = name;
    return this;
}

Source* Source::setResizeMode(Media::ResizeMode mode)
{
    resizeMode = mode;
    return this;
}

MTime Source::duration() const
{
    return to - from;
}

OverlaySource::OverlaySource() = default;
OverlaySource::~OverlaySource() = default;

OverlaySource& OverlaySource::setOverlay(const Overlay::Preset* preset)
{
    overlay = preset;
    return *this;
}

OverlaySource& OverlaySource::setMoveEnvelope(const TransformationEnvelope* envelope)
{
    moveEnvelope = envelope;
    return *this;
}

OverlaySource& OverlaySource::setTrackingLinkInfo(const MotionTracking::OverlayLinkInfo& info)
{
    trackingLinkInfo = info;
    return *this;
}

OverlaySource& OverlaySource::setSourcePosition(MTime position)
{
    sourcePosition = position;
    return *this;
}

OverlaySource& OverlaySource::setSourceDuration(MTime duration)
{
    sourceDuration = duration;
    return *this;
}

} // namespace Media
