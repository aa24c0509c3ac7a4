// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/timeline/Timeline.h>

#include <functional>
#include <vector>

namespace Host {

/// As factors of full scale: 1.0 is 0 dB.
struct SoundLevel
{
    /// Of sounds that have nothing to do with one another: the root of the sum of the squares.
    double mean = 0.0;
    /// Where all of them are at their highest at once: the sum.
    double peak = 0.0;
};

/// How loud a timeline makes the sounds of its clips, each of which is taken to be at full scale; nothing is
/// decoded. A clip sounds from its start up to, but not including, its end, unless it or its track is turned
/// off. Its volume is multiplied with its envelope and its fades. The fades go with the clip. The axis of the
/// envelope is the clip's whole source, so that a key stays with what it was made for when the clip is
/// trimmed, retimed or reversed; where the source has no length it is the clip. What a transition does to the
/// sound is not counted.
///
/// It is a snapshot: later changes of the timeline are not seen.
class SoundMix
{
public:
    using Filter = std::function<bool(const Timeline::Clip&)>;

    /// Nothing sounds.
    SoundMix() = default;
    /// Of the clips with sound, those that `hasSound` is true for.
    SoundMix(const Timeline::Object& timeline, const Filter& hasSound);

    SoundLevel at(MTime time) const;

private:
    struct Voice
    {
        MTime begin;
        MTime end;
        double gain;
        Envelope::VolumeFunction volume;
    };

    /// By their begin.
    std::vector<Voice> m_voices;
};

} // namespace Host
