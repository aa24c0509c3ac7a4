// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/timeline/TimelineLayout.h"

class QPainter;

namespace Host {

/// The ground of each row. Those of a track that hides or silences its clips are darker.
void drawLaneGrounds(QPainter& painter, const TimelineLayout& layout);

/// To the left of the rows: the number and role of each track with what is set of its flags, and the levels.
void drawLaneHeads(QPainter& painter, const TimelineLayout& layout, const TimelineOutline& outline);

} // namespace Host
