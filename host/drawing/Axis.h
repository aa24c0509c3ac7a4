// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/types/MTime.h>

#include <string>
#include <vector>

namespace Host {

/// A range of finite values; `high` is greater than `low`.
struct ValueRange
{
    double low = 0.0;
    double high = 1.0;

    /// 0.0 for `low`, 1.0 for `high`; values beyond are held at the ends, not-a-number stays.
    double partOf(double value) const;
};

/// What the finite ones of the values cover, at least `least` wide and no wider than can be drawn: values
/// beyond 1e12 are left out. Without such values it lies around zero.
ValueRange rangeOf(const std::vector<double>& values, double least);
/// Wider on both sides, by a part of its width.
ValueRange widened(const ValueRange& range, double part);

/// Wider, up to the next of the values that ticks() gives.
ValueRange rounded(const ValueRange& range, int atMost);

/// Multiples of 1, 2 or 5 times a power of ten, both ends of the range included: as close together as lets
/// there be no more than `atMost`, which is two or more.
std::vector<double> ticks(const ValueRange& range, int atMost);
/// Round times from zero to the length, both included where they are round. None for a negative length.
std::vector<MTime> timeTicks(MTime length, int atMost);

/// Up to three decimals, without needless zeros: "0.5", "-12", "1.3e+15".
std::string numberText(double value);
/// A factor in percent: "87.5 %", with one decimal at most.
std::string percentText(double factor);
/// A factor of amplitude in dB: "-6.0 dB", "-inf dB" for silence; "-" where it has no level.
std::string levelText(double factor);
/// An angle: "-12.5°".
std::string degreesText(double degrees);

} // namespace Host
