// SPDX-License-Identifier: Apache-2.0
#include "host/editing/NativeAudio.h"

#include "host/editing/TimelineInvariants.h"

#include <algorithm>

namespace Host {
namespace {

using Timeline::Clip;
using Timeline::ClipTiming;

/// The length of the audio's source at the speed of the master, at most what a timeline can hold: that of a
/// clip may be any.
MTime scaledSource(const Clip* master, const ClipTiming& masterTiming, const Clip* audio)
{
    const double scale = master->sourceDuration <= MTime()
                             ? 1.0
                             : double(masterTiming.sourceDuration.ms()) / double(master->sourceDuration.ms());
    return std::max(MTime(), std::min(audio->sourceDuration.mulRound(scale), LATEST_TIME));
}

} // namespace

bool followMaster(const Clip* master, const ClipTiming& masterTiming, const Clip* audio,
                  ClipTiming& audioTiming)
{
    const MTime source = scaledSource(master, masterTiming, audio);
    // The stretch in the order of the source, whichever way it is played.
    const MTime shownFrom = masterTiming.reversed ? masterTiming.sourceDuration - masterTiming.sourceEnd()
                                                  : masterTiming.sourcePosition;
    const MTime shownTo = shownFrom + masterTiming.duration;
    const bool isFree = audio->unlimitedDuration;
    const MTime from = isFree ? shownFrom : std::max(MTime(), shownFrom);
    const MTime to = isFree ? shownTo : std::min(shownTo, source);
    if (to - from < Clip::MIN_DURATION) {
        return false;
    }
    const bool reversed = masterTiming.reversed;
    audioTiming.timestamp = masterTiming.timestamp + (reversed ? shownTo - to : from - shownFrom);
    audioTiming.duration = to - from;
    audioTiming.sourcePosition = reversed ? source - to : from;
    audioTiming.sourceDuration = source;
    audioTiming.reversed = reversed;
    return true;
}

} // namespace Host
