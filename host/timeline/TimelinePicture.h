// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/drawing/Picture.h"
#include "host/timeline/TimelineLayout.h"

namespace Host {

class ClipFilmstrips;

/// A timeline: a ruler, and below it a row for each level of each track with its clips and what ties them
/// together. The timeline must outlive it, and stays as it is.
class TimelinePicture : public Picture
{
public:
    TimelinePicture(const Timeline::Object& timeline, const QString& title);

    QString title() const override { return m_title; }
    QSize size() const override { return m_layout.size(); }
    void draw(QPainter& painter) const override;

    /// From now on clips are drawn with these, which must outlive it; null for none.
    void showFilmstrips(const ClipFilmstrips* filmstrips) { m_filmstrips = filmstrips; }

    const TimelineOutline& outline() const { return m_outline; }
    const TimelineLayout& layout() const { return m_layout; }

private:
    void drawHeader(QPainter& painter) const;
    void drawLegend(QPainter& painter) const;

    const QString m_title;
    const TimelineOutline m_outline;
    const TimelineLayout m_layout;
    const ClipFilmstrips* m_filmstrips = nullptr;
};

} // namespace Host
