// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/timeline/TimelineLayout.h"

#include <vector>

class QPainter;

namespace Host {

/// The times above a timeline: round ones, as close together as their labels allow.
class TimelineRuler
{
public:
    explicit TimelineRuler(const TimelineLayout& layout);

    MTime step() const { return m_step; }
    /// The labelled ones, ascending.
    const std::vector<MTime>& times() const { return m_times; }

    void draw(QPainter& painter) const;
    /// The lines that go down through the rows.
    void drawGrid(QPainter& painter) const;

private:
    void drawSubdivision(QPainter& painter) const;

    const TimelineLayout& m_layout;
    MTime m_step;
    std::vector<MTime> m_times;
};

} // namespace Host
