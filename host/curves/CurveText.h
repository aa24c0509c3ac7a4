// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/curves/Curve.h"
#include "host/drawing/Axis.h"

#include <string>
#include <vector>

namespace Host {

/// How much is printed of a curve.
struct CurveTextSize
{
    /// The table has a line at each end of the span and for each step between.
    int steps = 10;
    /// The plot, in cells of a terminal, without its labels.
    int columns = 64;
    int rows = 8;
};

/// One line a row of a plot, the top one first: a column for each value, filled up from the low end of the
/// range, to the nearest eighth of a cell. Where a value is not-a-number stands a "?" on the bottom row.
std::vector<std::string> areaPlot(const std::vector<double>& values, const ValueRange& range, int rows);

/// The same in one row whose cells are never empty: an eighth is the lowest value.
std::string linePlot(const std::vector<double>& values, const ValueRange& range);

/// For the terminal: what the curve is, its keys, a plot of the volume with its fades, and a table of values
/// along the time. Ends in a line end.
std::string volumeText(const VolumeCurve& curve, const CurveTextSize& size);
/// The same with a plot of one row for each part of the transform.
std::string transformationText(const TransformationCurve& curve, const CurveTextSize& size);

} // namespace Host
