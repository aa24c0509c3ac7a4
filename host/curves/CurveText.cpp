// SPDX-License-Identifier: Apache-2.0
#include "host/curves/CurveText.h"

#include "host/media/MediaText.h"
#include "host/text/DisplayText.h"
#include "host/text/Table.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <optional>
#include <utility>

namespace Host {
namespace {

constexpr int eighths = 8;

std::string joined(const std::vector<std::string>& lines)
{
    std::string text;
    for (const std::string& line : lines) {
        text += line + '\n';
    }
    return text;
}

std::string cell(int filled)
{
    const char* const cells[] = {" ", "▁", "▂", "▃", "▄", "▅", "▆", "▇", "█"};
    return cells[std::clamp(filled, 0, eighths)];
}

std::string title(const char* kind, std::size_t keys, const CurveSpan& span)
{
    std::string text =
        fmt::format("{}: {} {} over {}", kind, keys, keys == 1 ? "key" : "keys", lengthText(span.length));
    if (span.fadeIn > MTime()) {
        text += ", fade-in " + lengthText(span.fadeIn);
    }
    if (span.fadeOut > MTime()) {
        text += ", fade-out " + lengthText(span.fadeOut);
    }
    return text + '\n';
}

/// Keys may stand anywhere, also at no number at all.
std::string keyTime(const CurveSpan& span, double step)
{
    return std::isfinite(step) ? lengthText(span.timeAt(step)) : "-";
}

template <class Evaluate>
std::vector<double> sampled(int columns, Evaluate evaluate)
{
    std::vector<double> values;
    for (const double progress : evenSteps(std::max(columns - 1, 1))) {
        values.push_back(evaluate(progress));
    }
    return values;
}

std::string padded(const std::string& text, int width)
{
    return std::string(static_cast<std::size_t>(std::max(0, width - displayWidth(text))), ' ') + text;
}

/// The beginning, the middle where there is room, and the end of the time under a plot.
std::string timeScale(MTime length, int columns)
{
    const std::string begin = lengthText(MTime());
    const std::string middle = lengthText(length.divRound(2.0));
    const std::string end = lengthText(length);
    const int half = columns / 2 - static_cast<int>(middle.size()) / 2;
    std::string scale = begin;
    if (half >= static_cast<int>(begin.size()) + 2) {
        scale += padded(middle, half + static_cast<int>(middle.size()) - static_cast<int>(begin.size()));
    }
    const int room = columns - static_cast<int>(scale.size());
    return scale + (room > static_cast<int>(end.size()) ? padded(end, room) : "  " + end);
}

std::string volumePlot(const VolumeCurve& curve, const CurveTextSize& size)
{
    const std::vector<double> values =
        sampled(size.columns, [&](double progress) { return curve.volumeAt(progress); });
    std::vector<double> covered = values;
    covered.insert(covered.end(), {0.0, 1.0});
    const ValueRange range = rounded(rangeOf(covered, 1.0), 12);

    const std::string top = percentText(range.high);
    const std::string middle = percentText((range.low + range.high) / 2.0);
    const std::string bottom = percentText(range.low);
    const int margin = std::max({displayWidth(top), displayWidth(middle), displayWidth(bottom)});
    const std::vector<std::string> lines = areaPlot(values, range, size.rows);
    std::string text;
    for (std::size_t row = 0; row != lines.size(); ++row) {
        const bool isMiddle = row * 2 == lines.size();
        text += padded(row == 0   ? top
                       : isMiddle ? middle
                                  : "",
                       margin) +
                (row == 0 || isMiddle ? " ┤" : " │") + lines[row] + '\n';
    }
    text += padded(bottom, margin) + " └";
    for (int column = 0; column != size.columns; ++column) {
        text += "─";
    }
    return text + '\n' + padded("", margin + 2) + timeScale(curve.span().length, size.columns) + '\n';
}

std::string volumeKeys(const VolumeCurve& curve)
{
    Table table({Table::Left, Table::Left, Table::Right, Table::Right, Table::Right});
    table.addRow({"Key", "Time", "Step", "Volume", "Level"});
    int number = 0;
    for (const VolumeEnvelope::Key& key : curve.keys()) {
        table.addRow({fmt::format("#{}", ++number), keyTime(curve.span(), key.step), numberText(key.step),
                      percentText(key.value), levelText(key.value)});
    }
    return joined(table.lines());
}

std::string volumeTable(const VolumeCurve& curve, int steps)
{
    const bool hasFades = curve.span().hasFades();
    Table table({Table::Left, Table::Right, Table::Right, Table::Right, Table::Right});
    table.addRow({"Time", hasFades ? "Envelope" : "", hasFades ? "Fades" : "", "Volume", "Level"});
    for (const double progress : evenSteps(steps)) {
        const double volume = curve.volumeAt(progress);
        table.addRow({lengthText(curve.span().timeAt(progress)),
                      hasFades ? percentText(curve.envelopeAt(progress)) : "",
                      hasFades ? percentText(curve.fadeAt(progress)) : "", percentText(volume),
                      levelText(volume)});
    }
    return joined(table.lines());
}

/// One part of a pose, for the plot of one row.
struct Part
{
    const char* name;
    double Pose::*value;
    /// How wide the range of its row is at least.
    double least;
    std::string (*text)(double value);
    bool turns;
};

const Part parts[] = {
    {"dx", &Pose::dx, 0.01, numberText, false},
    {"dy", &Pose::dy, 0.01, numberText, false},
    {"Scale x", &Pose::scaleX, 0.01, percentText, false},
    {"Scale y", &Pose::scaleY, 0.01, percentText, false},
    {"Rotation", &Pose::rotation, 1.0, degreesText, true},
    {"Opacity", &Pose::opacity, 0.01, percentText, false},
};

std::vector<std::string> poseCells(const Pose& pose)
{
    std::vector<std::string> cells;
    for (const Part& part : parts) {
        cells.push_back(part.text(pose.*part.value));
    }
    return cells;
}

Table poseTable(std::vector<std::string> firstHeads)
{
    std::vector<Table::Alignment> columns(firstHeads.size(), Table::Left);
    for (const Part& part : parts) {
        columns.push_back(Table::Right);
        firstHeads.emplace_back(part.name);
    }
    Table table(columns);
    table.addRow(firstHeads);
    return table;
}

void addPose(Table& table, std::vector<std::string> firstCells, const Pose& pose)
{
    const std::vector<std::string> cells = poseCells(pose);
    firstCells.insert(firstCells.end(), cells.begin(), cells.end());
    table.addRow(firstCells);
}

/// The lowest and the highest of the values that are numbers.
std::optional<std::pair<double, double>> extent(const std::vector<double>& values)
{
    std::optional<std::pair<double, double>> found;
    for (const double value : values) {
        if (!std::isnan(value)) {
            found = found ? std::pair(std::min(found->first, value), std::max(found->second, value))
                          : std::pair(value, value);
        }
    }
    return found;
}

std::string posePlots(const TransformationCurve& curve, int columns)
{
    Table table({Table::Left, Table::Left, Table::Right, Table::Left});
    table.addRow({"", timeScale(curve.span().length, columns), "Lowest", " Highest"});
    for (const Part& part : parts) {
        std::vector<double> values =
            sampled(columns, [&](double progress) { return curve.poseAt(progress).*part.value; });
        if (part.turns) {
            values = unwrapped(values);
        }
        const auto covered = extent(values);
        table.addRow({part.name, linePlot(values, rangeOf(values, part.least)),
                      covered ? part.text(covered->first) : "-",
                      " " + (covered ? part.text(covered->second) : "-")});
    }
    return joined(table.lines());
}

} // namespace

std::vector<std::string> areaPlot(const std::vector<double>& values, const ValueRange& range, int rows)
{
    std::vector<std::string> lines;
    for (int row = rows - 1; row >= 0; --row) {
        std::string line;
        for (const double value : values) {
            const double part = range.partOf(value);
            if (std::isnan(part)) {
                line += row == 0 ? "?" : " ";
            } else {
                line += cell(static_cast<int>(std::lround(part * rows * eighths)) - row * eighths);
            }
        }
        lines.push_back(line);
    }
    return lines;
}

std::string linePlot(const std::vector<double>& values, const ValueRange& range)
{
    std::string line;
    for (const double value : values) {
        const double part = range.partOf(value);
        line += std::isnan(part) ? "?" : cell(1 + static_cast<int>(std::lround(part * (eighths - 1))));
    }
    return line;
}

std::string volumeText(const VolumeCurve& curve, const CurveTextSize& size)
{
    return title("Volume envelope", curve.keys().size(), curve.span()) + '\n' + volumeKeys(curve) + '\n' +
           volumePlot(curve, size) + '\n' + volumeTable(curve, size.steps);
}

std::string transformationText(const TransformationCurve& curve, const CurveTextSize& size)
{
    Table keys = poseTable({"Key", "Time", "Step"});
    int number = 0;
    for (const TransformationEnvelope::Key& key : curve.keys()) {
        addPose(keys, {fmt::format("#{}", ++number), keyTime(curve.span(), key.step), numberText(key.step)},
                poseOf(key.value));
    }
    Table values = poseTable({"Time"});
    for (const double progress : evenSteps(size.steps)) {
        addPose(values, {lengthText(curve.span().timeAt(progress))}, curve.poseAt(progress));
    }
    return title("Transformation envelope", curve.keys().size(), curve.span()) + '\n' + joined(keys.lines()) +
           '\n' + posePlots(curve, size.columns) + '\n' + joined(values.lines());
}

} // namespace Host
