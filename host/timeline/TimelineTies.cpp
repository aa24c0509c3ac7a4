// SPDX-License-Identifier: Apache-2.0
#include "host/timeline/TimelineTies.h"

#include "host/timeline/TimelineClipBox.h"
#include "host/timeline/TimelineStyle.h"

#include <EditorModel/effects/Transition.h>

#include <QFontMetricsF>
#include <QPainter>
#include <QPainterPath>

#include <algorithm>
#include <cmath>
#include <vector>

namespace Host {
namespace {

using Timeline::Clip;

/// From the ends of a box to where a curve may touch it.
constexpr double curveMargin = 9.0;

double ms(MTime time)
{
    return static_cast<double>(time.ms());
}

/// Where the two overlap in time, else where each begins; a curve then needs no long way sideways.
double curvePlace(const QRectF& box, const QRectF& other)
{
    const double left = std::max(box.left(), other.left());
    const double right = std::min(box.right(), other.right());
    const double wanted = left < right ? left + curveMargin : box.left() + curveMargin;
    return std::min(std::max(wanted, box.left()), std::max(box.center().x(), std::min(wanted, box.right())));
}

void drawArrowhead(QPainter& painter, const QPointF& tip, bool isDown, const QColor& colour)
{
    const double back = isDown ? -7.0 : 7.0;
    painter.setPen(Qt::NoPen);
    painter.setBrush(colour);
    painter.drawPolygon(QPolygonF({tip, tip + QPointF(-4.0, back), tip + QPointF(4.0, back)}));
}

/// The triangles of a bow tie, or the one on the side of the only clip.
void drawBow(QPainter& painter, const QRectF& area, Timeline::TransitionType type)
{
    const bool hasOut = type != Timeline::IntoClip;
    const bool hasIn = type != Timeline::OutOfClip;
    const QPointF middle = hasOut && hasIn ? area.center()
                           : hasOut        ? QPointF(area.right(), area.center().y())
                                           : QPointF(area.left(), area.center().y());
    painter.setPen(QPen(Style::transitionEdge, 1.0));
    painter.setBrush(Style::transition);
    if (hasOut) {
        painter.drawPolygon(QPolygonF({area.topLeft(), area.bottomLeft(), middle}));
    }
    if (hasIn) {
        painter.drawPolygon(QPolygonF({area.topRight(), area.bottomRight(), middle}));
    }
}

/// Above the tips of the triangles there is room, more of it away from their broad sides.
void drawTransitionName(QPainter& painter, const QRectF& area, const Transition::Object& transition,
                        Timeline::TransitionType type)
{
    const QString name = transition.tag.isEmpty() ? transition.id : transition.tag;
    painter.setFont(Style::font(9));
    if (name.isEmpty() || QFontMetricsF(painter.font()).horizontalAdvance(name) > area.width() * 0.55) {
        return;
    }
    const Qt::Alignment side = type == Timeline::OutOfClip  ? Qt::AlignRight
                               : type == Timeline::IntoClip ? Qt::AlignLeft
                                                            : Qt::AlignHCenter;
    painter.setPen(Style::transitionEdge);
    painter.drawText(area.adjusted(4.0, 1.0, -4.0, 0.0), side | Qt::AlignTop, name);
}

} // namespace

QRectF TimelineTies::transitionArea(const Transition::Object* transition, const Clip* clip) const
{
    const Timeline::Object& timeline = m_outline.timeline();
    const Timeline::ClipPair pair = timeline.transitionClipPair(transition);
    if (m_outline.numberOf(clip) == 0 || (clip != pair.first && clip != pair.second)) {
        return {};
    }
    const auto out = timeline.clips.find(pair.first);
    const auto in = timeline.clips.find(pair.second);
    const auto startOf = [](const Timeline::ClipTiming& timing) { return ms(timing.timestamp); };
    const auto endOf = [](const Timeline::ClipTiming& timing) {
        return ms(timing.timestamp) + ms(timing.duration);
    };
    const bool hasOut = pair.first && out != timeline.clips.end();
    const bool hasIn = pair.second && in != timeline.clips.end();
    const double from = hasOut ? endOf(out->second) - ms(out->second.transitionOut) : startOf(in->second);
    const double to = hasIn ? startOf(in->second) + ms(in->second.transitionIn) : endOf(out->second);
    const QRectF body = clipBody(m_layout.boxOf(clip)).adjusted(0.0, 2.0, 0.0, -2.0);
    return QRectF(QPointF(m_layout.x(from), body.top()),
                  QPointF(std::max(m_layout.x(to), m_layout.x(from) + 4.0), body.bottom()));
}

void TimelineTies::drawTransitions(QPainter& painter) const
{
    for (const Transition::Object* transition : m_outline.transitions()) {
        const Timeline::ClipPair pair = m_outline.timeline().transitionClipPair(transition);
        const Timeline::TransitionType type = Timeline::transitionType(pair.first, pair.second);
        std::vector<QRectF> areas;
        for (const Clip* clip : {pair.first, pair.second}) {
            const QRectF area = transitionArea(transition, clip);
            if (!area.isEmpty() && std::find(areas.begin(), areas.end(), area) == areas.end()) {
                areas.push_back(area);
            }
        }
        for (const QRectF& area : areas) {
            QColor ground = Style::paper;
            ground.setAlpha(225);
            painter.setPen(QPen(Style::transitionEdge, 1.0));
            painter.setBrush(ground);
            painter.drawRoundedRect(area, 2.0, 2.0);
            drawBow(painter, area, type);
            drawTransitionName(painter, area, *transition, type);
        }
    }
}

void TimelineTies::drawLinks(QPainter& painter) const
{
    for (const Clip* slave : m_outline.slaves()) {
        drawCurve(painter, m_outline.timeline().masterOf(slave), slave, Style::link, false);
    }
}

void TimelineTies::drawTrackingLinks(QPainter& painter) const
{
    for (const Clip* follower : m_outline.followers()) {
        const Clip* const tracked = m_outline.timeline().trackingLinks.at(follower).trackedObject.clip;
        drawCurve(painter, tracked, follower, Style::trackingLink, true);
    }
}

void TimelineTies::drawCurve(QPainter& painter, const Clip* from, const Clip* to, const QColor& colour,
                             bool isDashed) const
{
    const QRectF source = m_layout.boxOf(from);
    const QRectF target = m_layout.boxOf(to);
    if (source.isEmpty() || target.isEmpty() || from == to) {
        return;
    }
    // Between clips on one row the curve goes round above them.
    const bool isDown = target.top() > source.top();
    const bool isLevel = target.top() == source.top();
    const double side = isDown ? 1.0 : -1.0;
    const QPointF begin(curvePlace(source, target), isDown ? source.bottom() : source.top());
    const QPointF end(curvePlace(target, source), isDown || isLevel ? target.top() : target.bottom());
    const double bend = std::max(16.0, std::abs(end.y() - begin.y()) * 0.45);
    QPainterPath curve(begin);
    curve.cubicTo(begin + QPointF(0.0, side * bend), end + QPointF(0.0, isLevel ? -bend : -side * bend), end);
    QColor halo = Style::paper;
    halo.setAlpha(170);
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(halo, 3.6));
    painter.drawPath(curve);
    painter.setPen(QPen(colour, 1.4, isDashed ? Qt::DashLine : Qt::SolidLine));
    painter.drawPath(curve);
    painter.setPen(QPen(Style::paper, 1.0));
    painter.setBrush(colour);
    painter.drawEllipse(begin, 3.5, 3.5);
    drawArrowhead(painter, end, isDown || isLevel, colour);
}

} // namespace Host
