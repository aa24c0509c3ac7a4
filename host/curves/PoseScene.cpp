// SPDX-License-Identifier: Apache-2.0
#include "host/curves/PoseScene.h"

#include "host/drawing/PictureStyle.h"

#include <QPainter>
#include <QPainterPath>
#include <QTransform>

#include <algorithm>
#include <cmath>

namespace Host {
namespace {

/// Beyond it the intersection of paths loses its way.
constexpr double largest = 1e6;

/// From the picture's units, with the origin in the middle, to the frame.
QTransform onFrame(const QRectF& frame, const Norvel::Proc::Matrix3x3& m)
{
    return QTransform(m.m11, m.m12, m.m13, m.m21, m.m22, m.m23, m.m31, m.m32, m.m33) *
           QTransform::fromScale(frame.height(), frame.height()) *
           QTransform::fromTranslate(frame.center().x(), frame.center().y());
}

bool canBeDrawn(const Pose& pose)
{
    const Norvel::Proc::Matrix3x3& m = pose.matrix;
    const double all[] = {m.m11, m.m12, m.m13, m.m21, m.m22, m.m23, m.m31, m.m32, m.m33, pose.opacity};
    return std::all_of(std::begin(all), std::end(all),
                       [](double value) { return std::abs(value) <= largest; });
}

QPainterPath rectangle(const QRectF& rect)
{
    QPainterPath path;
    path.addRect(rect);
    return path;
}

/// The parts of the scene lie over one another, so that they are mixed with the ground instead of being
/// translucent.
QColor mixed(const QColor& ground, const QColor& colour, double opacity)
{
    const auto mix = [opacity](int from, int to) {
        return static_cast<int>(std::lround(from + (to - from) * opacity));
    };
    return QColor(mix(ground.red(), colour.red()), mix(ground.green(), colour.green()),
                  mix(ground.blue(), colour.blue()));
}

struct Scene
{
    QPainterPath sky;
    QPainterPath hills;
    QPainterPath sun;
};

Scene landscape(double aspect)
{
    const double right = aspect / 2.0;
    Scene scene;
    scene.hills.moveTo(-right, 0.5);
    scene.hills.lineTo(-right, 0.22);
    scene.hills.cubicTo(-right * 0.5, -0.05, -right * 0.2, 0.1, 0.0, 0.22);
    scene.hills.cubicTo(right * 0.3, 0.32, right * 0.7, 0.05, right, 0.12);
    scene.hills.lineTo(right, 0.5);
    scene.hills.closeSubpath();
    scene.sun.addEllipse(QPointF(right * 0.5, -0.22), 0.12, 0.12);
    scene.sky = rectangle(QRectF(-right, -0.5, aspect, 1.0));
    return scene;
}

} // namespace

void drawPose(QPainter& painter, const QRectF& frame, const Pose& pose)
{
    const QPainterPath ground = rectangle(frame);
    painter.setPen(Qt::NoPen);
    painter.fillPath(ground, Style::text);
    if (canBeDrawn(pose)) {
        const QTransform transform = onFrame(frame, pose.matrix);
        const Scene scene = landscape(frame.width() / frame.height());
        const auto fill = [&](const QPainterPath& part, const QColor& colour) {
            // Cut by hand: the generator of SVG knows no clipping.
            painter.fillPath(transform.map(part).intersected(ground),
                             mixed(Style::text, colour, std::clamp(pose.opacity, 0.0, 1.0)));
        };
        fill(scene.sky, QColor(125, 190, 245));
        fill(scene.hills, QColor(92, 160, 92));
        fill(scene.sun, QColor(252, 211, 77));
    }
    painter.setPen(QPen(Style::border, 1.0));
    painter.setBrush(Qt::NoBrush);
    painter.drawRect(frame);
}

} // namespace Host
