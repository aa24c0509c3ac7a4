// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/timeline/TimelineLayout.h"

class QColor;
class QPainter;

namespace Host {

/// What ties clips together: transitions, links and tracking links. Those with a clip that is not on the
/// timeline are left out.
class TimelineTies
{
public:
    TimelineTies(const TimelineLayout& layout, const TimelineOutline& outline)
        : m_layout(layout), m_outline(outline)
    {}

    /// What a transition covers of a clip's row, over the clip's body; an empty rectangle for a clip that has
    /// no part in it. Between clips on one row it is the same for both.
    QRectF transitionArea(const Transition::Object* transition, const Timeline::Clip* clip) const;

    /// A bow tie over the cut, half of one for a transition of one clip.
    void drawTransitions(QPainter& painter) const;
    /// Curves from the master, with a dot, to the slave, with an arrowhead.
    void drawLinks(QPainter& painter) const;
    /// Dashed curves from the clip in which something is tracked to the one that follows it.
    void drawTrackingLinks(QPainter& painter) const;

private:
    void drawCurve(QPainter& painter, const Timeline::Clip* from, const Timeline::Clip* to,
                   const QColor& colour, bool isDashed) const;

    const TimelineLayout& m_layout;
    const TimelineOutline& m_outline;
};

} // namespace Host
