// SPDX-License-Identifier: Apache-2.0
#include "host/curves/CurveLane.h"

#include "host/drawing/PictureStyle.h"
#include "host/media/MediaText.h"

#include <QLinearGradient>
#include <QPainter>

#include <algorithm>
#include <cmath>

namespace Host {
namespace {

double progressOf(MTime time, MTime length)
{
    return static_cast<double>(time.ms()) / static_cast<double>(length.ms());
}

} // namespace

std::vector<double> coursePlaces(double width, const std::vector<double>& special)
{
    std::vector<double> places = evenSteps(static_cast<int>(width * 2.0));
    std::copy_if(special.begin(), special.end(), std::back_inserter(places),
                 [](double place) { return place >= 0.0 && place <= 1.0; });
    std::sort(places.begin(), places.end());
    return places;
}

double CurveLane::x(double progress) const
{
    return m_area.left() + progress * m_area.width();
}

double CurveLane::y(double value) const
{
    return m_area.bottom() - m_range.partOf(value) * m_area.height();
}

void CurveLane::drawGround(QPainter& painter, const std::vector<double>& values,
                           const std::vector<MTime>& times, MTime length) const
{
    painter.fillRect(m_area, Style::lane);
    painter.setPen(QPen(Style::grid, 1.0));
    for (const double value : values) {
        painter.drawLine(place(0.0, value), place(1.0, value));
    }
    for (const MTime time : times) {
        const double column = x(progressOf(time, length));
        painter.drawLine(QPointF(column, m_area.top()), QPointF(column, m_area.bottom()));
    }
}

void CurveLane::drawBorder(QPainter& painter) const
{
    painter.setPen(QPen(Style::border, 1.0));
    painter.setBrush(Qt::NoBrush);
    painter.drawLine(m_area.topLeft(), m_area.bottomLeft());
    painter.drawLine(m_area.bottomLeft(), m_area.bottomRight());
}

void CurveLane::drawValueLabels(QPainter& painter, const std::vector<double>& values,
                                std::string (*text)(double)) const
{
    painter.setFont(Style::font(13));
    painter.setPen(Style::faintText);
    for (const double value : values) {
        const QRectF room(m_area.left() - 110.0, y(value) - 10.0, 100.0, 20.0);
        painter.drawText(room, Qt::AlignRight | Qt::AlignVCenter, QString::fromStdString(text(value)));
    }
}

void CurveLane::drawTimeLabels(QPainter& painter, const std::vector<MTime>& times, MTime length) const
{
    painter.setFont(Style::font(13));
    for (const MTime time : times) {
        const double column = x(progressOf(time, length));
        painter.setPen(QPen(Style::border, 1.0));
        painter.drawLine(QPointF(column, m_area.bottom()), QPointF(column, m_area.bottom() + 6.0));
        painter.setPen(Style::faintText);
        painter.drawText(QRectF(column - 80.0, m_area.bottom() + 9.0, 160.0, 20.0), Qt::AlignCenter,
                         QString::fromStdString(lengthText(time)));
    }
}

void CurveLane::drawCourse(QPainter& painter, const Course& course, const QPen& pen) const
{
    painter.setPen(pen);
    painter.setBrush(Qt::NoBrush);
    for (const QPolygonF& run : runs(course)) {
        painter.drawPolyline(run);
    }
}

void CurveLane::drawAreaBelow(QPainter& painter, const Course& course, QColor colour) const
{
    QLinearGradient gradient(m_area.topLeft(), m_area.bottomLeft());
    colour.setAlpha(90);
    gradient.setColorAt(0.0, colour);
    colour.setAlpha(20);
    gradient.setColorAt(1.0, colour);
    painter.setPen(Qt::NoPen);
    painter.setBrush(gradient);
    const double base = y(std::clamp(0.0, m_range.low, m_range.high));
    for (QPolygonF& run : runs(course)) {
        run.append(QPointF(run.last().x(), base));
        run.append(QPointF(run.first().x(), base));
        painter.drawPolygon(run);
    }
}

void CurveLane::drawKey(QPainter& painter, double progress, double value, const QColor& colour) const
{
    painter.setPen(QPen(colour, 2.0));
    painter.setBrush(Style::paper);
    painter.drawEllipse(place(progress, value), 4.5, 4.5);
}

std::vector<QPolygonF> CurveLane::runs(const Course& course) const
{
    std::vector<QPolygonF> found;
    bool isOpen = false;
    for (std::size_t i = 0; i != course.progress.size(); ++i) {
        if (std::isnan(course.values[i])) {
            isOpen = false;
            continue;
        }
        if (!isOpen) {
            found.emplace_back();
            isOpen = true;
        }
        found.back().append(place(course.progress[i], course.values[i]));
    }
    return found;
}

} // namespace Host
