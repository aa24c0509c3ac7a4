// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/timeline/TimelineLayout.h"

class QPainter;

namespace Host {

/// The flag of a label: its staff is the left edge, as high as the body of the clip's box. It is at least as
/// wide as the cloth without a name. Empty for a label whose position is not among the times that are drawn.
QRectF labelFlag(const TimelineLayout& layout, const ClipLabel& entry);

/// Flags at the positions of the labels, which count in the time of the timeline, in the rows of their clips;
/// with the names, as far as the next flag leaves room.
void drawLabels(QPainter& painter, const TimelineLayout& layout, const TimelineOutline& outline);

} // namespace Host
