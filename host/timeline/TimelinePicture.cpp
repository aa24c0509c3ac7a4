// SPDX-License-Identifier: Apache-2.0
#include "host/timeline/TimelinePicture.h"

#include "host/media/MediaText.h"
#include "host/timeline/ClipFilmstrips.h"
#include "host/timeline/TimelineClipBox.h"
#include "host/timeline/TimelineLabels.h"
#include "host/timeline/TimelineLanes.h"
#include "host/timeline/TimelineRuler.h"
#include "host/timeline/TimelineStyle.h"
#include "host/timeline/TimelineTable.h"
#include "host/timeline/TimelineTies.h"

#include <QFontMetricsF>
#include <QPainter>

#include <set>

namespace Host {
namespace {

constexpr double left = 28.0;

QString counted(std::size_t count, const char* one, const char* many)
{
    return QString::number(count) + ' ' + (count == 1 ? one : many);
}

} // namespace

TimelinePicture::TimelinePicture(const Timeline::Object& timeline, const QString& title)
    : m_title(title), m_outline(timeline), m_layout(m_outline)
{}

void TimelinePicture::draw(QPainter& painter) const
{
    painter.fillRect(QRect(QPoint(), size()), Style::paper);
    drawHeader(painter);
    drawLegend(painter);
    const TimelineRuler ruler(m_layout);
    drawLaneGrounds(painter, m_layout);
    ruler.draw(painter);
    ruler.drawGrid(painter);
    drawLaneHeads(painter, m_layout, m_outline);
    for (const Timeline::Clip* clip : m_outline.clips()) {
        drawClipBox(painter, m_layout, m_outline, *clip, m_filmstrips ? m_filmstrips->of(*clip) : nullptr);
    }
    const TimelineTies ties(m_layout, m_outline);
    ties.drawTransitions(painter);
    drawLabels(painter, m_layout, m_outline);
    ties.drawLinks(painter);
    ties.drawTrackingLinks(painter);
    if (m_outline.clips().empty()) {
        painter.setFont(Style::font(14));
        painter.setPen(Style::faintText);
        painter.drawText(m_layout.rowsArea(), Qt::AlignCenter, "no clips");
    }
}

void TimelinePicture::drawHeader(QPainter& painter) const
{
    painter.setFont(Style::font(22, QFont::Bold));
    painter.setPen(Style::text);
    painter.drawText(QPointF(left, 40.0),
                     QFontMetricsF(painter.font()).elidedText(m_title, Qt::ElideMiddle, 560.0));
    const Timeline::Object& timeline = m_outline.timeline();
    const QStringList facts = {counted(m_outline.clips().size(), "clip", "clips"),
                               counted(m_outline.listedTracks(), "track", "tracks"),
                               "length " + QString::fromStdString(lengthText(lengthOf(timeline))),
                               QString::fromStdString(formatText(timeline))};
    painter.setFont(Style::font(14));
    painter.setPen(Style::faintText);
    painter.drawText(QPointF(left, 64.0), facts.join(QString::fromUtf8("   ·   ")));
}

/// The kinds of clips that there are, in one line that ends above the end of the rows.
void TimelinePicture::drawLegend(QPainter& painter) const
{
    std::set<ClipKind> kinds;
    for (const Timeline::Clip* clip : m_outline.clips()) {
        kinds.insert(kindOf(*clip));
    }
    kinds.erase(UnknownKind);
    painter.setFont(Style::font(13));
    double right = m_layout.rowsArea().right();
    for (auto kind = kinds.rbegin(); kind != kinds.rend(); ++kind) {
        const QString name = QString::fromStdString(kindText(*kind));
        const double width = QFontMetricsF(painter.font()).horizontalAdvance(name);
        painter.setPen(Style::text);
        painter.drawText(QRectF(right - width, 24.0, width + 4.0, 20.0), Qt::AlignLeft | Qt::AlignVCenter,
                         name);
        const Style::ClipColours colours = Style::coloursOf(*kind);
        const QRectF swatch(right - width - 24.0, 27.0, 16.0, 14.0);
        painter.setPen(QPen(colours.strip, 1.0));
        painter.setBrush(colours.body);
        painter.drawRoundedRect(swatch, 3.0, 3.0);
        painter.fillRect(swatch.adjusted(0.0, 0.0, 0.0, -8.0), colours.strip);
        right -= width + 44.0;
    }
}

} // namespace Host
