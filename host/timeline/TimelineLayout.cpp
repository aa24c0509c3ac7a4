// SPDX-License-Identifier: Apache-2.0
#include "host/timeline/TimelineLayout.h"

#include <algorithm>
#include <cmath>
#include <set>

namespace Host {
namespace {

constexpr double headWidth = 196.0;
constexpr double margin = 28.0;
constexpr double headerHeight = 92.0;
constexpr double rulerHeight = 34.0;
constexpr double rowHeight = 62.0;
constexpr double rowGap = 3.0;
constexpr double trackGap = 10.0;
constexpr double leastWidth = 1040.0;
constexpr double greatestWidth = 8000.0;
/// What a clip needs for some of its name.
constexpr double readableWidth = 84.0;
constexpr double leastBoxWidth = 2.0;
/// Some thirty years.
constexpr double farthestTime = 1e12;

double timeOf(MTime time)
{
    return std::clamp(static_cast<double>(time.ms()), -farthestTime, farthestTime);
}

} // namespace

TimelineLayout::TimelineLayout(const TimelineOutline& outline) : m_outline(outline)
{
    findTimes();
    makeRows();
}

double TimelineLayout::x(double ms) const
{
    const double time = std::clamp(ms, m_begin, m_end);
    return m_rowsArea.left() + (time - m_begin) / (m_end - m_begin) * m_rowsArea.width();
}

QRectF TimelineLayout::boxOf(const Timeline::Clip* clip) const
{
    if (m_outline.numberOf(clip) == 0) {
        return {};
    }
    const Timeline::ClipTiming& timing = m_outline.timeline().clips.at(clip);
    const QRectF& row = m_rows[m_rowOfLane.at({timing.track, timing.trackLevel})].area;
    const double left = x(timing.timestamp);
    const double right = x(timeOf(timing.timestamp) + timeOf(timing.duration));
    return QRectF(left, row.top() + 3.0, std::max(right - left, leastBoxWidth), row.height() - 6.0);
}

void TimelineLayout::findTimes()
{
    for (const Timeline::Clip* clip : m_outline.clips()) {
        const Timeline::ClipTiming& timing = m_outline.timeline().clips.at(clip);
        const double start = timeOf(timing.timestamp);
        m_begin = std::min(m_begin, start);
        m_end = std::max({m_end, start, start + timeOf(timing.duration)});
    }
    if (m_end - m_begin < 1.0) {
        m_end = m_begin + 1000.0;
    }
}

/// So that four clips of five have the width that they need.
double TimelineLayout::wantedWidth() const
{
    std::vector<double> lengths;
    for (const Timeline::Clip* clip : m_outline.clips()) {
        lengths.push_back(std::max(1.0, timeOf(m_outline.timeline().clips.at(clip).duration)));
    }
    if (lengths.empty()) {
        return leastWidth;
    }
    const auto fifth = lengths.begin() + static_cast<std::ptrdiff_t>(lengths.size() / 5);
    std::nth_element(lengths.begin(), fifth, lengths.end());
    return std::clamp((m_end - m_begin) / *fifth * readableWidth, leastWidth, greatestWidth);
}

void TimelineLayout::makeRows()
{
    std::map<const Timeline::Track*, std::set<int>> levels;
    for (const Timeline::Clip* clip : m_outline.clips()) {
        const Timeline::ClipTiming& timing = m_outline.timeline().clips.at(clip);
        levels[timing.track].insert(timing.trackLevel);
    }
    std::vector<const Timeline::Track*> tracks = m_outline.tracks();
    if (levels.count(nullptr) != 0) {
        tracks.push_back(nullptr);
    }
    const double left = margin + headWidth;
    const double width = std::round(wantedWidth());
    double top = headerHeight + rulerHeight;
    for (const Timeline::Track* track : tracks) {
        if (levels[track].empty()) {
            levels[track].insert(0);
        }
        for (const int level : levels[track]) {
            m_rowOfLane[{track, level}] = m_rows.size();
            m_rows.push_back({track, level, QRectF(left, top, width, rowHeight)});
            top += rowHeight + rowGap;
        }
        top += trackGap - rowGap;
    }
    const double bottom = m_rows.empty() ? top + rowHeight : m_rows.back().area.bottom();
    m_rulerArea = QRectF(left, headerHeight, width, rulerHeight);
    m_rowsArea = QRectF(QPointF(left, m_rulerArea.bottom()), QPointF(left + width, bottom));
    m_size = QSize(static_cast<int>(left + width + margin), static_cast<int>(bottom + margin));
}

} // namespace Host
