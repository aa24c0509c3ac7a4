// SPDX-License-Identifier: Apache-2.0
#include "host/playback/SoundMeter.h"

#include <algorithm>
#include <utility>

namespace Host {

SoundMeter::SoundMeter(const AudioOutput* output, SoundMix::Filter hasSound) : m_hasSound(std::move(hasSound))
{
    meterOwn(&m_meter)->setSourceID("output");
    outputObserve(output);
    measure();
}

SoundMeter::~SoundMeter()
{
    meterRemove(&m_meter);
}

void SoundMeter::playbackChanged(const AudioOutput*, const AudioOutput* oldValue, const AudioOutput* newValue)
{
    playerForget(oldValue->playback);
    playerObserve(newValue->playback);
    measure();
}

void SoundMeter::volumeChanged(const AudioOutput*)
{
    measure();
}

void SoundMeter::playerChanged(const Playback::Object*, const Playback::Object* oldValue,
                               const Playback::Object* newValue)
{
    const bool isNew = newValue->audio != oldValue->audio || newValue->state != oldValue->state;
    if (isNew) {
        mix(*newValue);
    }
    if (newValue->position != oldValue->position) {
        markerForget(oldValue->position);
        markerObserve(newValue->position);
    } else if (isNew) {
        measure();
    }
}

void SoundMeter::markerChanged(const Composition::Marker*)
{
    measure();
}

void SoundMeter::mix(const Playback::Object& playback)
{
    const auto* const timeline = dynamic_cast<const Timeline::Object*>(playback.audio);
    const bool isPlayed = timeline && playback.state == Playback::Object::Playing;
    m_mix = isPlayed ? SoundMix(*timeline, m_hasSound) : SoundMix();
}

SoundLevel SoundMeter::level() const
{
    const AudioOutput* const played = output();
    const Composition::Marker* const position = marker();
    if (!played || !position) {
        return {};
    }
    const SoundLevel mixed = m_mix.at(position->position);
    const double volume = std::max(0.0, played->volume);
    return {mixed.mean * volume, mixed.peak * volume};
}

void SoundMeter::measure()
{
    const SoundLevel now = level();
    const Decibel mean = Decibel::fromRelativeLevel(now.mean);
    const Decibel peak = Decibel::fromRelativeLevel(now.peak);
    const bool isClipping = now.peak > 1.0;
    meterChange(&m_meter)
        ->setLeftChannelLevel(mean)
        ->setRightChannelLevel(mean)
        ->setLeftChannelPeakLevel(peak)
        ->setRightChannelPeakLevel(peak)
        ->setLeftChannelClippingDetected(isClipping)
        ->setRightChannelClippingDetected(isClipping);
}

} // namespace Host
