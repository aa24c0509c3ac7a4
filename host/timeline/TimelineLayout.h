// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/timeline/TimelineOutline.h"

#include <QRectF>
#include <QSize>

#include <map>
#include <utility>
#include <vector>

namespace Host {

/// A level of a track.
struct TimelineRow
{
    /// Null for clips without a track.
    const Timeline::Track* track;
    int level;
    QRectF area;
};

/// Where the parts of a timeline stand in a picture of it: a row for each level of each track, the time from
/// left to right. It is as wide as lets most clips have a name, up to a limit. Times from a file may be any;
/// what lies further out than people could edit is cut off.
class TimelineLayout
{
public:
    explicit TimelineLayout(const TimelineOutline& outline);

    QSize size() const { return m_size; }
    /// The stretch of time that is drawn, in milliseconds.
    double begin() const { return m_begin; }
    double end() const { return m_end; }
    double x(double ms) const;
    double x(MTime time) const { return x(static_cast<double>(time.ms())); }

    /// To the right of the heads, all rows high.
    const QRectF& rowsArea() const { return m_rowsArea; }
    const QRectF& rulerArea() const { return m_rulerArea; }
    const std::vector<TimelineRow>& rows() const { return m_rows; }
    /// Where a clip of the timeline is drawn; an empty rectangle for any other. At least as wide as can be
    /// seen.
    QRectF boxOf(const Timeline::Clip* clip) const;

private:
    using Lane = std::pair<const Timeline::Track*, int>;

    void findTimes();
    void makeRows();
    double wantedWidth() const;

    const TimelineOutline& m_outline;
    double m_begin = 0.0;
    double m_end = 0.0;
    QSize m_size;
    QRectF m_rowsArea;
    QRectF m_rulerArea;
    std::vector<TimelineRow> m_rows;
    std::map<Lane, std::size_t> m_rowOfLane;
};

} // namespace Host
