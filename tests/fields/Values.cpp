// SPDX-License-Identifier: Apache-2.0
#include "Values.h"

namespace FieldTests {

Testing::Filler& filler()
{
    static Testing::Filler instance;
    return instance;
}

std::vector<MTime> Values<MTime>::all()
{
    std::vector<MTime> values;
    for (const qint64 milliseconds : extremes<qint64>())
        values.emplace_back(milliseconds);
    return values;
}

std::vector<QString> Values<QString>::all()
{
    std::vector<QString> values = Testing::awkwardTexts();
    values.push_back(QString());
    return values;
}

std::vector<std::string> Values<std::string>::all()
{
    return {"plain", std::string("nul\0behind", 10), "\xff not UTF-8", " ", ""};
}

std::vector<QPointF> Values<QPointF>::all()
{
    std::vector<QPointF> values;
    for (const double number : Values<double>::all())
        values.emplace_back(number, -number / 3);
    return values;
}

bool Values<QPointF>::same(const QPointF& a, const QPointF& b)
{
    return FieldTests::same(a.x(), b.x()) && FieldTests::same(a.y(), b.y());
}

std::vector<Types::Range> Values<Types::Range>::all()
{
    return {{2, 5}, {5, 2}, {-1, -1}, {std::numeric_limits<qint64>::max(), 0}, {0, 0}};
}

std::vector<Decibel> Values<Decibel>::all()
{
    std::vector<Decibel> values;
    for (const double level : Values<double>::all())
        values.push_back(Decibel::fromDbLevel(level));
    return values;
}

bool Values<Decibel>::same(const Decibel& a, const Decibel& b)
{
    return FieldTests::same(a.level(), b.level());
}

std::vector<MotionTracking::OverlayLinkInfo> Values<MotionTracking::OverlayLinkInfo>::all()
{
    return {{"tracking", {0.25, -3.0}, [] {}}, {"", {0.0, 0.0}, [] {}}, {"tracking", {0.0, 0.0}, nullptr}};
}

bool Values<MotionTracking::OverlayLinkInfo>::same(const MotionTracking::OverlayLinkInfo& a,
                                                   const MotionTracking::OverlayLinkInfo& b)
{
    return a.trackingId == b.trackingId && FieldTests::same(a.offset, b.offset) &&
           bool(a.callback) == bool(b.callback);
}

} // namespace FieldTests
