// SPDX-License-Identifier: Apache-2.0
#include "host/curves/VolumePicture.h"

#include "host/curves/CurveHeader.h"
#include "host/drawing/PictureStyle.h"

#include <EditorModel/types/Decibel.h>

#include <QFontMetricsF>
#include <QPainter>

#include <algorithm>
#include <cmath>

namespace Host {
namespace {

const QSize pictureSize(1280, 600);
const QRectF laneArea(100.0, 112.0, 1080.0, 420.0);
constexpr int mostTimes = 9;
constexpr int mostValues = 7;
/// From the middle of a key to that of its label.
constexpr double labelDistance = 17.0;

/// Where keys stand and where fades end.
std::vector<double> specialPlaces(const VolumeCurve& curve)
{
    std::vector<double> places;
    for (const VolumeEnvelope::Key& key : curve.keys()) {
        places.push_back(key.step);
    }
    const auto length = static_cast<double>(curve.span().length.ms());
    places.push_back(static_cast<double>(curve.span().fadeIn.ms()) / length);
    places.push_back(1.0 - static_cast<double>(curve.span().fadeOut.ms()) / length);
    return places;
}

ValueRange volumeRange(const VolumeCurve& curve, const std::vector<double>& places)
{
    std::vector<double> values = {0.0, 1.0};
    for (const double place : places) {
        values.push_back(curve.envelopeAt(place));
        values.push_back(curve.volumeAt(place));
    }
    const ValueRange range = rangeOf(values, 1.0);
    // Room for the keys and their labels, on the side where there is something.
    const ValueRange wide = widened(range, 0.08);
    return {range.low < 0.0 ? wide.low : range.low, wide.high};
}

} // namespace

VolumePicture::VolumePicture(const VolumeCurve& curve)
    : m_curve(curve),
      m_places(coursePlaces(laneArea.width(), specialPlaces(curve))),
      m_lane(laneArea, volumeRange(curve, m_places))
{}

QString VolumePicture::title() const
{
    return "Volume envelope";
}

QSize VolumePicture::size() const
{
    return pictureSize;
}

template <class Evaluate>
Course VolumePicture::course(Evaluate evaluate) const
{
    Course taken = {m_places, {}};
    for (const double place : m_places) {
        taken.values.push_back(evaluate(place));
    }
    return taken;
}

void VolumePicture::draw(QPainter& painter) const
{
    const MTime length = m_curve.span().length;
    const std::vector<double> values = ticks(m_lane.range(), mostValues);
    const std::vector<MTime> times = timeTicks(length, mostTimes);
    painter.fillRect(QRect(QPoint(), pictureSize), Style::paper);
    drawHeader(painter);
    m_lane.drawGround(painter, values, times, length);
    drawFadeBands(painter);

    const Course envelope = course([this](double place) { return m_curve.envelopeAt(place); });
    const Course volume = course([this](double place) { return m_curve.volumeAt(place); });
    m_lane.drawAreaBelow(painter, volume, Style::first);
    if (m_curve.span().hasFades()) {
        drawLosses(painter, envelope, volume);
        m_lane.drawCourse(painter, envelope, QPen(Style::faintText, 1.5, Qt::DashLine));
    }
    m_lane.drawCourse(painter, volume, QPen(Style::first, 3.0, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    m_lane.drawBorder(painter);
    m_lane.drawValueLabels(painter, values, percentText);
    m_lane.drawTimeLabels(painter, times, length);
    drawLevels(painter);
    drawKeys(painter);
}

void VolumePicture::drawHeader(QPainter& painter) const
{
    Host::drawHeader(painter, laneArea.left(), title(), m_curve.keys().size(), m_curve.span());
    std::vector<LegendEntry> legend;
    if (m_curve.span().hasFades()) {
        legend = {{"envelope", Style::faintText, true}, {"with its fades", Style::first, false}};
    } else {
        legend = {{"envelope", Style::first, false}};
    }
    drawLegend(painter, QPointF(laneArea.right(), 34.0), legend);
    painter.setFont(Style::font(13, QFont::Bold));
    painter.setPen(Style::faintText);
    painter.drawText(QRectF(laneArea.left() - 110.0, laneArea.top() - 26.0, 100.0, 20.0), Qt::AlignRight,
                     "volume");
    painter.drawText(QRectF(laneArea.right() + 10.0, laneArea.top() - 26.0, 90.0, 20.0), Qt::AlignLeft,
                     "level");
}

/// The stretches of time in which a fade goes on.
void VolumePicture::drawFadeBands(QPainter& painter) const
{
    const CurveSpan& span = m_curve.span();
    const auto part = [&span](MTime fade) {
        return std::min(1.0, static_cast<double>(fade.ms()) / static_cast<double>(span.length.ms()));
    };
    const auto drawBand = [&](double from, double to, const QString& name, Qt::Alignment side) {
        if (from == to) {
            return;
        }
        const QRectF band(QPointF(m_lane.x(from), laneArea.top()), QPointF(m_lane.x(to), laneArea.bottom()));
        painter.fillRect(band, Style::fadeBand);
        painter.setPen(QPen(Style::fadeText, 1.0, Qt::DotLine));
        const double inner = from == 0.0 ? band.right() : band.left();
        painter.drawLine(QPointF(inner, band.top()), QPointF(inner, band.bottom()));
        painter.setPen(Style::fadeText);
        painter.setFont(Style::font(13));
        painter.drawText(band.adjusted(8.0, 6.0, -8.0, 0.0), Qt::AlignTop | Qt::TextDontClip | side, name);
    };
    drawBand(0.0, part(span.fadeIn), "fade-in", Qt::AlignLeft);
    drawBand(1.0 - part(span.fadeOut), 1.0, "fade-out", Qt::AlignRight);
}

/// What the fades take away from the envelope.
void VolumePicture::drawLosses(QPainter& painter, const Course& envelope, const Course& volume) const
{
    painter.setPen(Qt::NoPen);
    painter.setBrush(Style::fade);
    QPolygonF upper;
    QPolygonF lower;
    const auto finish = [&] {
        std::reverse(lower.begin(), lower.end());
        painter.drawPolygon(upper + lower);
        upper.clear();
        lower.clear();
    };
    for (std::size_t i = 0; i != m_places.size(); ++i) {
        if (envelope.values[i] != volume.values[i] && !std::isnan(volume.values[i])) {
            upper.append(m_lane.place(m_places[i], envelope.values[i]));
            lower.append(m_lane.place(m_places[i], volume.values[i]));
        } else if (!upper.isEmpty()) {
            finish();
        }
    }
    finish();
}

/// The levels that people know, as far as there is room between them.
void VolumePicture::drawLevels(QPainter& painter) const
{
    painter.setFont(Style::font(13));
    const auto label = [&](double row, const QString& text) {
        painter.setPen(QPen(Style::border, 1.0));
        painter.drawLine(QPointF(laneArea.right(), row), QPointF(laneArea.right() + 5.0, row));
        painter.setPen(Style::faintText);
        painter.drawText(QRectF(laneArea.right() + 10.0, row - 10.0, 90.0, 20.0),
                         Qt::AlignLeft | Qt::AlignVCenter, text);
    };
    double last = m_lane.y(0.0);
    label(last, QString::fromUtf8("-∞ dB"));
    for (const double level :
         {-40.0, -20.0, -12.0, -6.0, -3.0, 0.0, 3.0, 6.0, 12.0, 20.0, 40.0, 60.0, 80.0}) {
        const double factor = Decibel::fromDbLevel(level).toRelativeLevel();
        const double row = m_lane.y(factor);
        if (factor <= m_lane.range().high && last - row >= 20.0) {
            label(row, QString::fromStdString(numberText(level) + " dB"));
            last = row;
        }
    }
}

void VolumePicture::drawKeys(QPainter& painter) const
{
    QRectF lastLabel;
    for (std::size_t i = 0; i != m_curve.keys().size(); ++i) {
        const VolumeEnvelope::Key& key = m_curve.keys()[i];
        if (!(key.step >= 0.0 && key.step <= 1.0) || std::isnan(key.value)) {
            continue;
        }
        m_lane.drawKey(painter, key.step, key.value, Style::first);
        const QString text = QString::fromStdString(percentText(key.value));
        painter.setFont(Style::font(12, QFont::Bold));
        const double width = QFontMetricsF(painter.font()).horizontalAdvance(text) + 6.0;
        QRectF label(0.0, 0.0, width, 16.0);
        label.moveCenter(m_lane.place(key.step, key.value) +
                         QPointF(0.0, isLabelledBelow(i) ? labelDistance : -labelDistance));
        // The labels of the outermost keys stay beside the axes.
        label.moveLeft(std::clamp(label.left(), laneArea.left() + 4.0, laneArea.right() - width - 4.0));
        if (!label.intersects(lastLabel)) {
            painter.setPen(Style::text);
            painter.drawText(label, Qt::AlignCenter, text);
            lastLabel = label;
        }
    }
}

/// On the side where the lines to its neighbours are not, if there is room.
bool VolumePicture::isLabelledBelow(std::size_t key) const
{
    const std::deque<VolumeEnvelope::Key>& keys = m_curve.keys();
    const double value = keys[key].value;
    const double before = key == 0 ? value : keys[key - 1].value;
    const double after = key + 1 == keys.size() ? value : keys[key + 1].value;
    const double lowest = laneArea.bottom() - labelDistance - 12.0;
    return before + after > 2.0 * value && m_lane.y(value) < lowest;
}

} // namespace Host
