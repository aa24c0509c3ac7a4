// SPDX-License-Identifier: Apache-2.0
#include "host/timeline/TimelineStyle.h"

namespace Host::Style {

ClipColours coloursOf(ClipKind kind)
{
    switch (kind) {
    case PictureKind:
        return {QColor(37, 99, 235), QColor(219, 234, 254), QColor(30, 58, 138)};
    case SoundKind:
        return {QColor(22, 128, 61), QColor(220, 252, 231), QColor(20, 83, 45)};
    case OverlayKind:
        return {QColor(126, 34, 206), QColor(243, 232, 255), QColor(88, 28, 135)};
    case QuizKind:
        return {QColor(190, 24, 93), QColor(252, 231, 243), QColor(131, 24, 67)};
    case NestedKind:
        return {QColor(15, 118, 110), QColor(204, 251, 241), QColor(19, 78, 74)};
    default:
        return {QColor(71, 85, 105), QColor(226, 232, 240), QColor(51, 65, 85)};
    }
}

ClipColours offColours()
{
    return {QColor(148, 163, 184), QColor(241, 245, 249), QColor(100, 116, 139)};
}

} // namespace Host::Style
