// SPDX-License-Identifier: Apache-2.0
// Trackings of all kinds against walks that do the same step by step.
#include "tests/analysis/Trackings.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <cmath>

namespace {

using MotionTracking::Data;
using MotionTracking::Frame;
using TrackingTests::Entry;
using TrackingTests::trackingOf;

/// Entries of a few rectangles, some of which are nearly equal, close enough to one another that holes and
/// overlaps of about 16 ms are common.
rc::Gen<std::vector<Entry>> entries()
{
    const auto step = rc::gen::map(
        rc::gen::tuple(rc::gen::inRange(1, 60), rc::gen::inRange(-10, 70), rc::gen::inRange(0, 6)),
        [](const std::tuple<int, int, int>& values) {
            static const double widths[] = {0.3, 0.3, 0.3 * (1 + 0.8e-12), 0.3 * (1 + 1.6e-12), 0.0, 0.25};
            const auto [distance, duration, width] = values;
            return Entry{distance, duration, Frame(0.1, 0.2, widths[width], 0.4)};
        });
    return rc::gen::map(rc::gen::container<std::vector<Entry>>(step), [](std::vector<Entry> all) {
        int start = -100;
        for (Entry& entry : all)
            start = entry.start += start;
        return all;
    });
}

bool isNear(double a, double b)
{
    const double magnitudeA = std::fabs(a);
    const double magnitudeB = std::fabs(b);
    const bool bothVanish = magnitudeA <= 1e-12 && magnitudeB <= 1e-12;
    return bothVanish || std::fabs(a - b) * 1e12 <= std::fmin(magnitudeA, magnitudeB);
}

std::vector<Entry> joined(const std::vector<Entry>& all)
{
    std::vector<Entry> result;
    for (const Entry& entry : all) {
        if (!result.empty()) {
            Entry& last = result.back();
            const bool sameRectangle =
                isNear(last.frame.left, entry.frame.left) && isNear(last.frame.top, entry.frame.top) &&
                isNear(last.frame.width, entry.frame.width) && isNear(last.frame.height, entry.frame.height);
            const int gap = last.start + last.duration - entry.start;
            if (sameRectangle && -16 <= gap && gap <= 16) {
                last.duration = entry.start + entry.duration - last.start;
                continue;
            }
        }
        result.push_back(entry);
    }
    return result;
}

/// With every bit of the rectangles.
std::vector<std::vector<double>> contents(const Data& data)
{
    std::vector<std::vector<double>> all;
    for (const auto& [start, frame] : data.frames) {
        all.push_back({double(start.ms()), double(frame.duration.ms()), frame.left, frame.top, frame.width,
                       frame.height});
    }
    return all;
}

RC_GTEST_PROP(TrackingDataOptimize, JoinsAsAWalkIntoANewListDoes, ())
{
    const std::vector<Entry> all = *entries();
    Data data = trackingOf(all);
    data.optimize();
    RC_ASSERT(contents(data) == contents(trackingOf(joined(all))));
}

RC_GTEST_PROP(TrackingDataOptimize, ASecondTimeChangesNothing, ())
{
    Data data = trackingOf(*entries());
    data.optimize();
    const auto once = contents(data);
    data.optimize();
    RC_ASSERT(contents(data) == once);
}

RC_GTEST_PROP(TrackingDataFindFrame, FindsWhatAWalkFinds, ())
{
    const std::vector<Entry> all = *entries();
    const int position = *rc::gen::inRange(-120, all.empty() ? 0 : all.back().start + 80);
    const bool nextIfNone = *rc::gen::arbitrary<bool>();

    const Entry* covering = nullptr;
    const Entry* next = nullptr;
    for (const Entry& entry : all) {
        if (entry.start > position) {
            next = &entry;
            break;
        }
        covering = position <= entry.start + entry.duration ? &entry : nullptr;
    }
    const Entry* const expected = covering ? covering : nextIfNone ? next : nullptr;

    const Data data = trackingOf(all);
    const auto found = data.findFrame(position, nextIfNone);
    RC_CLASSIFY(expected == covering && covering, "covered");
    RC_CLASSIFY(!expected, "none");
    RC_ASSERT((found == data.frames.end()) == !expected);
    if (expected)
        RC_ASSERT(found->first == MTime(expected->start));
}

} // namespace
