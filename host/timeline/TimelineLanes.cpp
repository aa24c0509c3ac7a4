// SPDX-License-Identifier: Apache-2.0
#include "host/timeline/TimelineLanes.h"

#include "host/timeline/TimelineStyle.h"

#include <QFontMetricsF>
#include <QPainter>

namespace Host {
namespace {

constexpr double headWidth = 184.0;
constexpr double numberWidth = 30.0;
const QColor offGround(226, 232, 240);
const QColor badgeGround(226, 232, 240);
const QColor alertGround(254, 226, 226);
const QColor alertText(153, 27, 27);

struct Badge
{
    QString text;
    bool isAlert;
};

std::vector<Badge> badgesOf(const Timeline::Track* track, const TimelineOutline& outline)
{
    std::vector<Badge> badges;
    const auto add = [&badges](bool isSet, const char* text, bool isAlert) {
        if (isSet) {
            badges.push_back({text, isAlert});
        }
    };
    add(!track || !outline.timeline().contains(track), "not listed", true);
    if (track) {
        add(track->muted, "muted", true);
        add(track->hidden, "hidden", true);
        add(track->linked, "linked", false);
        add(track->gapless, "gapless", false);
        add(!track->used, "unused", false);
    }
    return badges;
}

/// From a place to the right, as far as there is room.
void drawBadges(QPainter& painter, QPointF place, double right, const std::vector<Badge>& badges)
{
    painter.setFont(Style::font(10));
    for (const Badge& badge : badges) {
        const double width = QFontMetricsF(painter.font()).horizontalAdvance(badge.text) + 12.0;
        if (place.x() + width > right) {
            return;
        }
        const QRectF area(place, QSizeF(width, 16.0));
        painter.setPen(Qt::NoPen);
        painter.setBrush(badge.isAlert ? alertGround : badgeGround);
        painter.drawRoundedRect(area, 8.0, 8.0);
        painter.setPen(badge.isAlert ? alertText : Style::faintText);
        painter.drawText(area, Qt::AlignCenter, badge.text);
        place.rx() += width + 4.0;
    }
}

QString headline(const Timeline::Track* track)
{
    if (!track) {
        return "No track";
    }
    QString role = QString::fromStdString(roleText(track->type));
    role[0] = role[0].toUpper();
    return role == "-" ? "Track" : role;
}

void drawTrackHead(QPainter& painter, const QRectF& area, const Timeline::Track* track,
                   const TimelineOutline& outline)
{
    const int number = outline.numberOf(track);
    painter.setFont(Style::font(13));
    painter.setPen(Style::faintText);
    painter.drawText(QRectF(area.left(), area.top(), numberWidth - 8.0, area.height()),
                     Qt::AlignRight | Qt::AlignVCenter, number == 0 ? QString() : QString::number(number));
    const std::vector<Badge> badges = badgesOf(track, outline);
    const double left = area.left() + numberWidth;
    painter.setFont(Style::font(13, QFont::Bold));
    painter.setPen(Style::text);
    const QRectF line(left, area.center().y() - (badges.empty() ? 10.0 : 21.0), area.right() - left, 20.0);
    painter.drawText(line, Qt::AlignLeft | Qt::AlignVCenter, headline(track));
    drawBadges(painter, QPointF(left, line.bottom() + 2.0), area.right(), badges);
}

void drawLevel(QPainter& painter, const QRectF& area, int level)
{
    painter.setFont(Style::font(11));
    painter.setPen(Style::faintText);
    painter.drawText(area.adjusted(0.0, 0.0, -12.0, -4.0), Qt::AlignRight | Qt::AlignBottom,
                     "level " + QString::number(level));
}

bool isOff(const Timeline::Track* track)
{
    return track && (track->hidden || track->muted);
}

} // namespace

void drawLaneGrounds(QPainter& painter, const TimelineLayout& layout)
{
    for (const TimelineRow& row : layout.rows()) {
        painter.fillRect(row.area, isOff(row.track) ? offGround : Style::lane);
    }
}

void drawLaneHeads(QPainter& painter, const TimelineLayout& layout, const TimelineOutline& outline)
{
    const std::vector<TimelineRow>& rows = layout.rows();
    for (std::size_t i = 0; i != rows.size(); ++i) {
        const QRectF& row = rows[i].area;
        const QRectF head(row.left() - headWidth - 8.0, row.top(), headWidth, row.height());
        painter.fillRect(head.adjusted(0.0, 0.0, 8.0, 0.0), isOff(rows[i].track) ? offGround : Style::lane);
        const bool isFirst = i == 0 || rows[i - 1].track != rows[i].track;
        const bool isLast = i + 1 == rows.size() || rows[i + 1].track != rows[i].track;
        if (isFirst) {
            drawTrackHead(painter, head, rows[i].track, outline);
        }
        if (!isFirst || !isLast || rows[i].level != 0) {
            drawLevel(painter, head, rows[i].level);
        }
        painter.setPen(QPen(Style::border, 1.0));
        painter.drawLine(row.topLeft(), row.bottomLeft());
    }
}

} // namespace Host
