// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/timeline/TimelineLayout.h"

class QPainter;

namespace Filmstrip {
class Object;
}

namespace Host {

/// The strip with the name of a clip, above its body; one of no height where the box is too narrow for it.
QRectF clipStrip(const QRectF& box);
/// The rest of the box, where fades and transitions are drawn.
QRectF clipBody(const QRectF& box);

/// Draws a clip of the timeline: its kind by colour, number and name, length, speed and direction, marks
/// where its source goes on at either end, fades as ramps. A clip that is not played is grey, and hatched if
/// that is its own doing. What there is no room for is left out. The pictures of a
/// filmstrip stand in the body, behind the rest.
void drawClipBox(QPainter& painter, const TimelineLayout& layout, const TimelineOutline& outline,
                 const Timeline::Clip& clip, const Filmstrip::Object* filmstrip = nullptr);

} // namespace Host
