// SPDX-License-Identifier: Apache-2.0
#include "host/curves/CurveHeader.h"

#include "host/drawing/PictureStyle.h"
#include "host/media/MediaText.h"

#include <QFontMetricsF>
#include <QPainter>

namespace Host {

void drawHeader(QPainter& painter, double left, const QString& title, std::size_t keys, const CurveSpan& span)
{
    painter.setFont(Style::font(22, QFont::Bold));
    painter.setPen(Style::text);
    painter.drawText(QPointF(left, 40.0), title);

    const QString dot = QString::fromUtf8("   ·   ");
    QString facts = QString::number(keys) + (keys == 1 ? " key" : " keys");
    facts += dot + "length " + QString::fromStdString(lengthText(span.length));
    if (span.fadeIn > MTime()) {
        facts += dot + "fade-in " + QString::fromStdString(lengthText(span.fadeIn));
    }
    if (span.fadeOut > MTime()) {
        facts += dot + "fade-out " + QString::fromStdString(lengthText(span.fadeOut));
    }
    painter.setFont(Style::font(14));
    painter.setPen(Style::faintText);
    painter.drawText(QPointF(left, 64.0), facts);
}

void drawLegend(QPainter& painter, const QPointF& rightEnd, const std::vector<LegendEntry>& entries)
{
    const QFont font = Style::font(13);
    painter.setFont(font);
    double right = rightEnd.x();
    for (auto entry = entries.rbegin(); entry != entries.rend(); ++entry) {
        const double width = QFontMetricsF(font).horizontalAdvance(entry->name);
        const double left = right - width;
        painter.setPen(Style::text);
        painter.drawText(QRectF(left, rightEnd.y() - 10.0, width + 4.0, 20.0),
                         Qt::AlignLeft | Qt::AlignVCenter, entry->name);
        painter.setPen(QPen(entry->colour, 2.5, entry->dashed ? Qt::DashLine : Qt::SolidLine));
        painter.drawLine(QPointF(left - 36.0, rightEnd.y()), QPointF(left - 8.0, rightEnd.y()));
        right = left - 60.0;
    }
}

} // namespace Host
