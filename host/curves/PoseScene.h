// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/curves/Curve.h"

class QPainter;
class QRectF;

namespace Host {

/// Draws a little landscape into a frame, in the pose: what lies outside of the frame is cut off. A pose that
/// no picture can have leaves the frame dark.
void drawPose(QPainter& painter, const QRectF& frame, const Pose& pose);

} // namespace Host
