// SPDX-License-Identifier: Apache-2.0
#include "host/timeline/TimelineLabels.h"

#include "host/timeline/TimelineClipBox.h"
#include "host/timeline/TimelineStyle.h"

#include <QFontMetricsF>
#include <QPainter>

#include <algorithm>

namespace Host {
namespace {

constexpr double clothHeight = 15.0;
constexpr double clothWidth = 7.0;
/// So that the edge of the box stays whole.
constexpr double clothMargin = 1.0;
constexpr double textMargin = 4.0;

void drawFlag(QPainter& painter, const QRectF& flag, const QString& name, double room)
{
    const QFontMetricsF metrics(painter.font());
    const QString text = metrics.elidedText(name, Qt::ElideRight, room - 2.0 * textMargin);
    // A dot or two tell nothing.
    const bool hasText = text == name || text.size() > 3;
    const double textWidth = hasText ? metrics.horizontalAdvance(text) + 2.0 * textMargin : 0.0;
    const QRectF cloth(flag.left(), flag.bottom() - clothHeight - clothMargin,
                       std::max(clothWidth, textWidth), clothHeight);
    QColor ground = Style::paper;
    ground.setAlpha(215);
    painter.setPen(Qt::NoPen);
    painter.setBrush(name.isEmpty() || !hasText ? Style::label : ground);
    painter.drawRect(cloth);
    painter.setPen(QPen(Style::label, 1.6));
    painter.drawLine(flag.topLeft(), flag.bottomLeft());
    if (hasText && !name.isEmpty()) {
        painter.setPen(Style::labelText);
        painter.drawText(cloth.adjusted(textMargin, 0.0, 0.0, 0.0),
                         Qt::AlignLeft | Qt::AlignVCenter | Qt::TextDontClip, text);
    }
}

} // namespace

QRectF labelFlag(const TimelineLayout& layout, const ClipLabel& entry)
{
    const auto time = static_cast<double>(entry.label->position.ms());
    if (time < layout.begin() || time > layout.end()) {
        return {};
    }
    const QRectF body = clipBody(layout.boxOf(entry.clip));
    return QRectF(layout.x(time), body.top(), clothWidth, body.height());
}

void drawLabels(QPainter& painter, const TimelineLayout& layout, const TimelineOutline& outline)
{
    painter.setFont(Style::font(10));
    const std::vector<ClipLabel>& labels = outline.labels();
    for (std::size_t i = 0; i != labels.size(); ++i) {
        const QRectF flag = labelFlag(layout, labels[i]);
        if (flag.isEmpty()) {
            continue;
        }
        const bool isLast = i + 1 == labels.size() || labels[i + 1].clip != labels[i].clip;
        const QRectF next = isLast ? QRectF() : labelFlag(layout, labels[i + 1]);
        const double box = layout.boxOf(labels[i].clip).right();
        double end = flag.left() < box ? box : layout.rowsArea().right();
        if (!next.isEmpty()) {
            end = std::min(end, next.left() - 2.0);
        }
        drawFlag(painter, flag, labels[i].label->name, end - flag.left());
    }
}

} // namespace Host
