// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/curves/Curve.h"
#include "host/curves/CurveLane.h"
#include "host/drawing/Picture.h"

#include <vector>

namespace Host {

/// A volume envelope and, if it has fades, what they make of it: percent on the left, dB on the right, the
/// time below. What the fades take away is shaded.
class VolumePicture : public Picture
{
public:
    explicit VolumePicture(const VolumeCurve& curve);

    QString title() const override;
    QSize size() const override;
    void draw(QPainter& painter) const override;

    /// Where a volume is drawn.
    const CurveLane& lane() const { return m_lane; }

private:
    template <class Evaluate>
    Course course(Evaluate evaluate) const;
    void drawFadeBands(QPainter& painter) const;
    void drawLosses(QPainter& painter, const Course& envelope, const Course& volume) const;
    void drawLevels(QPainter& painter) const;
    void drawKeys(QPainter& painter) const;
    bool isLabelledBelow(std::size_t key) const;
    void drawHeader(QPainter& painter) const;

    const VolumeCurve m_curve;
    const std::vector<double> m_places;
    const CurveLane m_lane;
};

} // namespace Host
