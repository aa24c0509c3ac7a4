// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/drawing/PictureStyle.h"
#include "host/timeline/TimelineOutline.h"

/// How timelines look, beside what pictures have in common.
namespace Host::Style {

struct ClipColours
{
    QColor strip;
    QColor body;
    QColor text;
};

ClipColours coloursOf(ClipKind kind);
/// Of clips that are not played.
ClipColours offColours();

inline const QColor transition(251, 191, 36);
inline const QColor transitionEdge(180, 83, 9);
inline const QColor link(71, 85, 105);
inline const QColor trackingLink(147, 51, 234);
inline const QColor label(13, 148, 136);
inline const QColor labelText(19, 78, 74);
inline const QColor broken(220, 38, 38);

} // namespace Host::Style
