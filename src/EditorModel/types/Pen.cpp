// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/Pen.h>

#include <EditorModel/persistence/Fields.h>

#include <QBrush>
#include <QColor>
#include <QPen>

#include <algorithm>
#include <limits>

namespace {

// QPen::width() rounds in some versions of Qt and cuts off in others.
int wholeWidth(const QPen& pen)
{
    constexpr double LOWEST = std::numeric_limits<int>::min();
    constexpr double HIGHEST = std::numeric_limits<int>::max();
    const double width = pen.widthF();
    return qIsNaN(width) ? 0 : static_cast<int>(std::clamp(width, LOWEST, HIGHEST));
}

} // namespace

namespace Types {

Pen::Pen() = default;

Pen::Pen(quint32 color_, int width_, bool enabled_) : color(color_), width(width_), enabled(enabled_) {}

Pen::Pen(const QPen& pen) : Pen(pen.color().rgba(), wholeWidth(pen), pen.brush().style() != Qt::NoBrush) {}

Pen& Pen::operator=(const QPen& pen)
{
    return *this = Pen(pen);
}

Pen Pen::fromQPen(const QPen& pen)
{
    return Pen(pen);
}

QPen Pen::toQPen() const
{
    const QBrush brush(QColor::fromRgba(color), enabled ? Qt::SolidPattern : Qt::NoBrush);
    return QPen(brush, static_cast<double>(width), Qt::SolidLine, Qt::SquareCap, Qt::BevelJoin);
}

void fields(Serialize::Fields& f, Pen& pen)
{
    f("color", pen.color)("width", pen.width)("enabled", pen.enabled);
}

} // namespace Types

EDITORMODEL_PERSISTENT_CLASS(Types::Pen)
