// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/playback/PlaybackViews.h"
#include "host/playback/SoundMix.h"

#include <EditorModel/services/Device.h>

namespace Host {

/// The module that measures what goes to a sound output: it owns a meter, and brings it up to date whenever
/// the position, the playback or the output changes. While a timeline is played the levels are those of its
/// SoundMix at the position, times the volume of the output; both channels have the same. Otherwise they are
/// silence.
class SoundMeter : private Device::View<Device::Output<Media::Audio>>,
                   private PlayerViewBase,
                   private MarkerViewBase,
                   private MeterViewBase
{
public:
    /// The output is observed until it is removed. Clips that `hasSound` is false for are silent. What is
    /// changed in a timeline while it is played is not heard.
    SoundMeter(const Device::Output<Media::Audio>* output, SoundMix::Filter hasSound);
    SoundMeter(const SoundMeter&) = delete;
    ~SoundMeter() override;

    /// The meter. Its peak levels are those of SoundLevel::peak, and clipping is a peak of more than 0 dB.
    using MeterViewBase::meter;

private:
    using AudioOutput = Device::Output<Media::Audio>;

    void playbackChanged(const AudioOutput* output, const AudioOutput* oldValue,
                         const AudioOutput* newValue) override;
    void volumeChanged(const AudioOutput* output) override;
    using PlayerViewBase::playerChanged;
    void playerChanged(const Playback::Object* playback, const Playback::Object* oldValue,
                       const Playback::Object* newValue) override;
    using MarkerViewBase::markerChanged;
    void markerChanged(const Composition::Marker* marker) override;

    void mix(const Playback::Object& playback);
    SoundLevel level() const;
    void measure();

    const SoundMix::Filter m_hasSound;
    SoundMix m_mix;
    VUMeter::Object m_meter;
};

} // namespace Host
