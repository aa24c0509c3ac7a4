// SPDX-License-Identifier: Apache-2.0
#include "host/drawing/Axis.h"

#include <EditorModel/types/Decibel.h>

#include <fmt/format.h>

#include <algorithm>
#include <cmath>

namespace Host {
namespace {

constexpr double widest = 1e12;

/// A number with up to so many decimals; never "-0".
std::string trimmed(double value, int decimals)
{
    std::string text = fmt::format("{:.{}f}", value, decimals);
    if (text.find('.') != std::string::npos) {
        text.erase(text.find_last_not_of('0') + 1);
        if (text.back() == '.') {
            text.pop_back();
        }
    }
    return text == "-0" ? "0" : text;
}

/// Large numbers have so many digits that nobody reads them.
std::string shortNumber(double value, int decimals)
{
    return std::abs(value) < 1e9 ? trimmed(value, decimals) : fmt::format("{:.3g}", value);
}

double tickStep(double width, int atMost)
{
    const double power = std::pow(10.0, std::floor(std::log10(width / atMost)));
    for (const double factor : {1.0, 2.0, 5.0, 10.0, 20.0}) {
        if (std::floor(width / (factor * power) * (1.0 + 1e-9)) + 1 <= atMost) {
            return factor * power;
        }
    }
    return 50.0 * power;
}

} // namespace

double ValueRange::partOf(double value) const
{
    return std::isnan(value) ? value : (std::clamp(value, low, high) - low) / (high - low);
}

ValueRange rangeOf(const std::vector<double>& values, double least)
{
    bool any = false;
    ValueRange range = {0.0, 0.0};
    for (const double value : values) {
        if (std::abs(value) <= widest) {
            range.low = any ? std::min(range.low, value) : value;
            range.high = any ? std::max(range.high, value) : value;
            any = true;
        }
    }
    // A tiny width at a large value would vanish in it.
    const double width = std::max(least, std::max(std::abs(range.low), std::abs(range.high)) * 1e-6);
    const double missing = width - (range.high - range.low);
    if (missing > 0.0) {
        range.low -= missing / 2.0;
        range.high += missing / 2.0;
    }
    return range;
}

ValueRange widened(const ValueRange& range, double part)
{
    const double more = (range.high - range.low) * part;
    return {range.low - more, range.high + more};
}

ValueRange rounded(const ValueRange& range, int atMost)
{
    const double step = tickStep(range.high - range.low, atMost);
    return {std::floor(range.low / step + 1e-9) * step, std::ceil(range.high / step - 1e-9) * step};
}

std::vector<double> ticks(const ValueRange& range, int atMost)
{
    const double step = tickStep(range.high - range.low, atMost);
    const double first = std::ceil(range.low / step - 1e-9);
    const auto count = static_cast<int>(std::floor(range.high / step + 1e-9) - first) + 1;
    std::vector<double> values;
    for (int n = 0; n < count; ++n) {
        values.push_back((first + n) * step);
    }
    return values;
}

std::vector<MTime> timeTicks(MTime length, int atMost)
{
    constexpr qint64 second = 1000;
    constexpr qint64 minute = 60 * second;
    constexpr qint64 hour = 60 * minute;
    constexpr qint64 steps[] = {1,           2,           5,           10,         20,         50,
                                100,         200,         500,         second,     2 * second, 5 * second,
                                10 * second, 15 * second, 30 * second, minute,     2 * minute, 5 * minute,
                                10 * minute, 15 * minute, 30 * minute, hour,       2 * hour,   6 * hour,
                                12 * hour,   24 * hour,   48 * hour,   120 * hour, 240 * hour};
    const auto fits = [&](qint64 step) { return length.ms() / step + 1 <= atMost; };
    const auto* found = std::find_if(std::begin(steps), std::end(steps), fits);
    qint64 step = found == std::end(steps) ? *(std::end(steps) - 1) : *found;
    while (!fits(step)) {
        step *= 2;
    }
    std::vector<MTime> times;
    for (qint64 time = 0; time <= length.ms(); time += step) {
        times.emplace_back(time);
    }
    return times;
}

std::string numberText(double value)
{
    return shortNumber(value, 3);
}

std::string percentText(double factor)
{
    return shortNumber(factor * 100.0, 1) + " %";
}

std::string levelText(double factor)
{
    const double level = Decibel::fromRelativeLevel(factor).level();
    if (std::isnan(level)) {
        return "-";
    }
    if (std::isinf(level)) {
        return level < 0.0 ? "-inf dB" : "inf dB";
    }
    const std::string text = fmt::format("{:.1f} dB", level);
    return text == "-0.0 dB" ? "0.0 dB" : text;
}

std::string degreesText(double degrees)
{
    return shortNumber(degrees, 1) + "°";
}

} // namespace Host
