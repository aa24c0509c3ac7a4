// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/timeline/Timeline.h>

#include <vector>

namespace Host {

/// Those of the clips that could never be shown: their nested timelines show themselves, or one that does, by
/// way of any number of others. The clips are those with a nested timeline that `timeline` has, or would
/// have; of the other timelines all clips count.
std::vector<const Timeline::Clip*> endlessClips(const Timeline::Object& timeline,
                                                const std::vector<const Timeline::Clip*>& nesting);

/// Those of the clips that have a nested timeline.
std::vector<const Timeline::Clip*> nestingClips(const Timeline::Object& timeline);

} // namespace Host
