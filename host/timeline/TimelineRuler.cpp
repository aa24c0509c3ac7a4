// SPDX-License-Identifier: Apache-2.0
#include "host/timeline/TimelineRuler.h"

#include "host/drawing/Axis.h"
#include "host/text/TimeText.h"
#include "host/timeline/TimelineStyle.h"

#include <QPainter>

#include <algorithm>
#include <cmath>

namespace Host {
namespace {

constexpr double labelWidth = 96.0;
constexpr double tickHeight = 10.0;
constexpr double smallTickHeight = 5.0;

MTime stepFor(double length, int atMost)
{
    const std::vector<MTime> times = timeTicks(MTime::fromMsRound(length), atMost);
    return times.size() > 1 ? times[1] - times[0] : MTime::fromMsRound(std::ceil(length));
}

} // namespace

TimelineRuler::TimelineRuler(const TimelineLayout& layout)
    : m_layout(layout),
      m_step(stepFor(layout.end() - layout.begin(),
                     static_cast<int>(layout.rulerArea().width() / labelWidth) + 1))
{
    const auto step = static_cast<double>(m_step.ms());
    for (double n = std::ceil(layout.begin() / step); n * step <= layout.end(); n += 1.0) {
        m_times.push_back(MTime::fromMsRound(n * step));
    }
}

void TimelineRuler::draw(QPainter& painter) const
{
    const QRectF& area = m_layout.rulerArea();
    const MTime longest = MTime::fromMsRound(std::max(m_layout.end(), -m_layout.begin()));
    drawSubdivision(painter);
    painter.setFont(Style::font(12));
    for (const MTime time : m_times) {
        const double x = m_layout.x(time);
        painter.setPen(QPen(Style::border, 1.0));
        painter.drawLine(QPointF(x, area.bottom() - tickHeight), QPointF(x, area.bottom()));
        painter.setPen(Style::faintText);
        painter.drawText(
            QRectF(x - labelWidth / 2.0, area.top(), labelWidth, area.height() - tickHeight - 2.0),
            Qt::AlignHCenter | Qt::AlignBottom, QString::fromStdString(tickText(time, m_step, longest)));
    }
    painter.setPen(QPen(Style::border, 1.0));
    painter.drawLine(area.bottomLeft(), area.bottomRight());
}

void TimelineRuler::drawSubdivision(QPainter& painter) const
{
    const double small = static_cast<double>(m_step.ms()) / 5.0;
    const double bottom = m_layout.rulerArea().bottom();
    painter.setPen(QPen(Style::grid, 1.0));
    for (double n = std::ceil(m_layout.begin() / small); n * small <= m_layout.end(); n += 1.0) {
        const double x = m_layout.x(n * small);
        painter.drawLine(QPointF(x, bottom - smallTickHeight), QPointF(x, bottom));
    }
}

void TimelineRuler::drawGrid(QPainter& painter) const
{
    painter.setPen(QPen(Style::grid, 1.0));
    for (const MTime time : m_times) {
        const double x = m_layout.x(time);
        painter.drawLine(QPointF(x, m_layout.rowsArea().top()), QPointF(x, m_layout.rowsArea().bottom()));
    }
}

} // namespace Host
