// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/timeline/Timeline.h>

namespace Host {

/// Lets native audio play what its master shows, as far as its own source goes, at the same place and speed
/// and in the same direction. Fades, transitions, track and level stay. False, with nothing changed, where
/// less than Clip::MIN_DURATION is left to play.
bool followMaster(const Timeline::Clip* master, const Timeline::ClipTiming& masterTiming,
                  const Timeline::Clip* audio, Timeline::ClipTiming& audioTiming);

} // namespace Host
