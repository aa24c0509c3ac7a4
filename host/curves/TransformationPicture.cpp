// SPDX-License-Identifier: Apache-2.0
#include "host/curves/TransformationPicture.h"

#include "host/curves/CurveHeader.h"
#include "host/curves/PoseScene.h"
#include "host/drawing/PictureStyle.h"
#include "host/media/MediaText.h"

#include <QPainter>

#include <algorithm>
#include <cmath>

namespace Host {
namespace {

const QSize pictureSize(1280, 900);
constexpr double left = 110.0;
constexpr double width = 1120.0;
constexpr double framesTop = 92.0;
const QSizeF frameSize(128.0, 72.0);
constexpr double lanesTop = 236.0;
constexpr double laneHeight = 110.0;
constexpr double laneDistance = 158.0;
constexpr int mostTimes = 9;
constexpr int mostValues = 5;

/// One line of a lane.
struct Part
{
    const char* name;
    double Pose::*value;
};

struct LaneKind
{
    const char* name;
    std::vector<Part> parts;
    std::string (*text)(double value);
    /// How much of the values a lane shows at least, so that what stands still looks still.
    double least;
    bool turns;
};

const std::vector<LaneKind>& laneKinds()
{
    static const std::vector<LaneKind> kinds = {
        {"Translation", {{"dx", &Pose::dx}, {"dy", &Pose::dy}}, numberText, 0.1, false},
        {"Scale", {{"x", &Pose::scaleX}, {"y", &Pose::scaleY}}, percentText, 0.1, false},
        {"Rotation", {{"", &Pose::rotation}}, degreesText, 10.0, true},
        {"Opacity", {{"", &Pose::opacity}}, percentText, 1.0, false},
    };
    return kinds;
}

std::vector<double> keyPlaces(const TransformationCurve& curve)
{
    std::vector<double> places;
    for (const TransformationEnvelope::Key& key : curve.keys()) {
        places.push_back(key.step);
    }
    return places;
}

} // namespace

struct TransformationPicture::Lane
{
    const LaneKind& kind;
    CurveLane lane;
    std::vector<Course> courses;
};

TransformationPicture::TransformationPicture(const TransformationCurve& curve)
    : m_curve(curve), m_places(coursePlaces(width, keyPlaces(curve)))
{
    for (std::size_t index = 0; index != laneKinds().size(); ++index) {
        addLane(index);
    }
}

TransformationPicture::~TransformationPicture() = default;

void TransformationPicture::addLane(std::size_t index)
{
    const LaneKind& kind = laneKinds()[index];
    std::vector<Course> courses;
    std::vector<double> all;
    for (const Part& part : kind.parts) {
        Course course = {m_places, {}};
        for (const double place : m_places) {
            course.values.push_back(m_curve.poseAt(place).*part.value);
        }
        if (kind.turns) {
            course.values = unwrapped(std::move(course.values));
        }
        all.insert(all.end(), course.values.begin(), course.values.end());
        courses.push_back(std::move(course));
    }
    const QRectF area(left, lanesTop + laneDistance * static_cast<double>(index), width, laneHeight);
    if (kind.parts.front().value == &Pose::opacity) {
        all.insert(all.end(), {0.0, 1.0});
    }
    m_lanes.push_back({kind, CurveLane(area, widened(rangeOf(all, kind.least), 0.1)), std::move(courses)});
}

QString TransformationPicture::title() const
{
    return "Transformation envelope";
}

QSize TransformationPicture::size() const
{
    return pictureSize;
}

const CurveLane& TransformationPicture::lane(int index) const
{
    return m_lanes[static_cast<std::size_t>(index)].lane;
}

double TransformationPicture::frameProgress(int index)
{
    return (index + 0.5) / frameCount;
}

QPointF TransformationPicture::frameCentre(int index) const
{
    return {left + width * frameProgress(index), framesTop + frameSize.height() / 2.0};
}

void TransformationPicture::draw(QPainter& painter) const
{
    painter.fillRect(QRect(QPoint(), pictureSize), Style::paper);
    drawHeader(painter, left, title(), m_curve.keys().size(), m_curve.span());
    drawFrames(painter);
    for (const Lane& lane : m_lanes) {
        drawLane(painter, lane);
    }
    m_lanes.back().lane.drawTimeLabels(painter, timeTicks(m_curve.span().length, mostTimes),
                                       m_curve.span().length);
}

void TransformationPicture::drawFrames(QPainter& painter) const
{
    for (int index = 0; index != frameCount; ++index) {
        drawFrame(painter, index);
    }
}

void TransformationPicture::drawFrame(QPainter& painter, int index) const
{
    QRectF frame(QPointF(), frameSize);
    frame.moveCenter(frameCentre(index));
    const double progress = frameProgress(index);
    drawPose(painter, frame, m_curve.poseAt(progress));
    painter.setFont(Style::font(12));
    painter.setPen(Style::faintText);
    painter.drawText(QRectF(frame.left() - 6.0, frame.bottom() + 4.0, frame.width() + 12.0, 16.0),
                     Qt::AlignCenter, QString::fromStdString(lengthText(m_curve.span().timeAt(progress))));
}

void TransformationPicture::drawLane(QPainter& painter, const Lane& lane) const
{
    const CurveLane& drawn = lane.lane;
    const std::vector<double> values = ticks(drawn.range(), mostValues);
    drawn.drawGround(painter, values, timeTicks(m_curve.span().length, mostTimes), m_curve.span().length);

    painter.setFont(Style::font(14, QFont::Bold));
    painter.setPen(Style::text);
    painter.drawText(QPointF(left, drawn.area().top() - 10.0), lane.kind.name);

    const QColor colours[] = {Style::first, Style::second};
    std::vector<LegendEntry> legend;
    for (std::size_t i = 0; i != lane.courses.size(); ++i) {
        // The second line is dashed, so that the first one shows where both are the same.
        const bool dashed = i != 0;
        drawn.drawCourse(
            painter, lane.courses[i],
            QPen(colours[i], 2.5, dashed ? Qt::DashLine : Qt::SolidLine, Qt::FlatCap, Qt::RoundJoin));
        legend.push_back({lane.kind.parts[i].name, colours[i], dashed});
    }
    if (legend.size() > 1) {
        drawLegend(painter, QPointF(drawn.area().right(), drawn.area().top() - 15.0), legend);
    }
    drawn.drawBorder(painter);
    drawn.drawValueLabels(painter, values, lane.kind.text);
    for (std::size_t i = 0; i != lane.courses.size(); ++i) {
        const Course& course = lane.courses[i];
        for (const TransformationEnvelope::Key& key : m_curve.keys()) {
            const auto place = std::lower_bound(course.progress.begin(), course.progress.end(), key.step);
            if (place == course.progress.end() || *place != key.step) {
                continue;
            }
            const double value = course.values[static_cast<std::size_t>(place - course.progress.begin())];
            if (!std::isnan(value)) {
                drawn.drawKey(painter, key.step, value, colours[i]);
            }
        }
    }
}

} // namespace Host
