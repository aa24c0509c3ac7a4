// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/curves/Curve.h"

#include <QColor>
#include <QString>

#include <vector>

class QPainter;
class QPointF;

namespace Host {

/// The sample of a line, and what it stands for.
struct LegendEntry
{
    QString name;
    QColor colour;
    bool dashed;
};

/// The title of a picture, and below it the number of keys and the times of the span.
void drawHeader(QPainter& painter, double left, const QString& title, std::size_t keys,
                const CurveSpan& span);

/// In one line, which ends at a place and is centred on it vertically.
void drawLegend(QPainter& painter, const QPointF& rightEnd, const std::vector<LegendEntry>& entries);

} // namespace Host
