// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/curves/Curve.h"
#include "host/curves/CurveLane.h"
#include "host/drawing/Picture.h"

#include <QPointF>

#include <deque>
#include <vector>

namespace Host {

/// A transformation envelope: little frames along the time, and below them a lane each for the translation,
/// the scale, the rotation and the opacity.
///
/// The model leaves the unit of a translation open. In the little frames the origin lies in the middle of the
/// frame, y points down, and a unit is the height of the frame in both directions; under the identity the
/// picture fills the frame.
class TransformationPicture : public Picture
{
public:
    explicit TransformationPicture(const TransformationCurve& curve);
    ~TransformationPicture() override;

    QString title() const override;
    QSize size() const override;
    void draw(QPainter& painter) const override;

    /// From the top: translation, scale, rotation, opacity.
    static constexpr int laneCount = 4;
    const CurveLane& lane(int index) const;
    /// The middle of a little frame, at the progress that it shows.
    static constexpr int frameCount = 8;
    QPointF frameCentre(int index) const;
    static double frameProgress(int index);

private:
    struct Lane;

    void addLane(std::size_t index);
    void drawFrames(QPainter& painter) const;
    void drawFrame(QPainter& painter, int index) const;
    void drawLane(QPainter& painter, const Lane& lane) const;

    const TransformationCurve m_curve;
    const std::vector<double> m_places;
    std::deque<Lane> m_lanes;
};

} // namespace Host
