// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QColor>
#include <QFont>

/// What the pictures have in common in their looks.
namespace Host::Style {

inline const QColor paper(255, 255, 255);
inline const QColor lane(248, 250, 252);
inline const QColor grid(226, 232, 240);
inline const QColor border(148, 163, 184);
inline const QColor text(30, 41, 59);
inline const QColor faintText(100, 116, 139);
inline const QColor first(37, 99, 235);
inline const QColor second(234, 88, 12);
inline const QColor fadeBand(245, 158, 11, 20);
inline const QColor fade(245, 158, 11, 75);
inline const QColor fadeText(180, 83, 9);

inline QFont font(int pixels, QFont::Weight weight = QFont::Normal)
{
    QFont made("DejaVu Sans");
    made.setStyleHint(QFont::SansSerif);
    made.setPixelSize(pixels);
    made.setWeight(weight);
    return made;
}

} // namespace Host::Style
