// SPDX-License-Identifier: Apache-2.0
#include "host/playback/SoundMix.h"

#include "host/editing/TimelineInvariants.h"
#include "host/timeline/TimelineOutline.h"

#include <algorithm>
#include <cmath>

namespace Host {
namespace {

using Timeline::Clip;
using Timeline::ClipTiming;

/// Times from a file may be any; their sums and differences are not to overflow.
MTime bounded(MTime time)
{
    return std::clamp(time, -LATEST_TIME, LATEST_TIME);
}

Envelope::VolumeFunction envelopeOf(const Clip& clip, const ClipTiming& timing)
{
    const qint64 source = bounded(timing.sourceDuration).ms();
    const qint64 length = bounded(timing.duration).ms();
    if (source <= 0) {
        return Envelope::envelopeFunction(0, length, length, clip.volumeEnvelope);
    }
    const qint64 position = bounded(timing.sourcePosition).ms();
    return timing.reversed
               ? Envelope::envelopeFunction(source - position, source, -length, clip.volumeEnvelope)
               : Envelope::envelopeFunction(position, source, length, clip.volumeEnvelope);
}

Envelope::VolumeFunction volumeOf(const Clip& clip, const ClipTiming& timing)
{
    return Envelope::combine(
        Envelope::fadeFunction(bounded(timing.fadeInDuration).ms(), bounded(timing.fadeOutDuration).ms()),
        envelopeOf(clip, timing));
}

bool isOn(const Timeline::Object& timeline, const Clip& clip)
{
    return clip.isAudioClip() && clip.enabled && !isOffByTrack(timeline, clip);
}

} // namespace

SoundMix::SoundMix(const Timeline::Object& timeline, const Filter& hasSound)
{
    for (const auto& [clip, timing] : timeline.clips) {
        if (clip && timing.duration > MTime() && isOn(timeline, *clip) && hasSound(*clip)) {
            const MTime begin = bounded(timing.timestamp);
            m_voices.push_back({begin, begin + bounded(timing.duration), std::max(clip->volume, 0) / 100.0,
                                volumeOf(*clip, timing)});
        }
    }
    std::sort(m_voices.begin(), m_voices.end(),
              [](const Voice& a, const Voice& b) { return a.begin < b.begin; });
}

SoundLevel SoundMix::at(MTime time) const
{
    const auto behind = std::upper_bound(m_voices.begin(), m_voices.end(), time,
                                         [](MTime t, const Voice& voice) { return t < voice.begin; });
    double sum = 0.0;
    double squares = 0.0;
    for (auto voice = m_voices.begin(); voice != behind; ++voice) {
        if (time >= voice->end) {
            continue;
        }
        // A negative volume turns the sound upside down. Two keys at one place give not-a-number there.
        const double volume =
            std::abs(voice->gain * voice->volume(time.ms(), voice->begin.ms(), voice->end.ms()));
        if (std::isfinite(volume)) {
            sum += volume;
            squares += volume * volume;
        }
    }
    return {std::sqrt(squares), sum};
}

} // namespace Host
