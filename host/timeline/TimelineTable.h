// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/timeline/Timeline.h>

#include <string>

namespace Host {

/// A timeline in tables: its tracks, clips, transitions, links and tracking links, with the numbers that
/// TimelineOutline gives them. Ends with a line end.
std::string timelineTable(const Timeline::Object& timeline);

/// "1920 x 1080, 29.97 fps, 44100 Hz, stereo"
std::string formatText(const Timeline::Object& timeline);

} // namespace Host
