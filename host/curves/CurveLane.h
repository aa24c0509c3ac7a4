// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/curves/Curve.h"
#include "host/drawing/Axis.h"

#include <QColor>
#include <QPen>
#include <QPolygonF>
#include <QRectF>
#include <QString>

#include <string>
#include <vector>

class QPainter;

namespace Host {

/// Values along the time, in the order of the time.
struct Course
{
    /// From 0.0 to 1.0, ascending.
    std::vector<double> progress;
    std::vector<double> values;
};

/// Where the courses of a picture are taken: evenly, two a unit of width, and at the places that matter.
std::vector<double> coursePlaces(double width, const std::vector<double>& special);

/// A part of a picture in which values are drawn along the time, from left to right.
class CurveLane
{
public:
    CurveLane(const QRectF& area, const ValueRange& range) : m_area(area), m_range(range) {}

    const QRectF& area() const { return m_area; }
    const ValueRange& range() const { return m_range; }
    double x(double progress) const;
    /// Values beyond the range are held at its ends.
    double y(double value) const;
    QPointF place(double progress, double value) const { return {x(progress), y(value)}; }

    /// The ground, and a line for each value and each time.
    void drawGround(QPainter& painter, const std::vector<double>& values, const std::vector<MTime>& times,
                    MTime length) const;
    void drawBorder(QPainter& painter) const;
    /// To the left of the lane, one a line.
    void drawValueLabels(QPainter& painter, const std::vector<double>& values,
                         std::string (*text)(double)) const;
    /// Below the lane.
    void drawTimeLabels(QPainter& painter, const std::vector<MTime>& times, MTime length) const;
    /// A line through the values, with a gap where they are not numbers.
    void drawCourse(QPainter& painter, const Course& course, const QPen& pen) const;
    /// What lies between the values and the one nearest to zero in the range.
    void drawAreaBelow(QPainter& painter, const Course& course, QColor colour) const;
    void drawKey(QPainter& painter, double progress, double value, const QColor& colour) const;

private:
    std::vector<QPolygonF> runs(const Course& course) const;

    QRectF m_area;
    ValueRange m_range;
};

} // namespace Host
