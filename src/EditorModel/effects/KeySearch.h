// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <algorithm>
#include <cstddef>
#include <limits>

namespace Animation::Details {

/// The keys around a position, by index. An index at or past the end of the list stands for no key.
struct Neighbours
{
    std::size_t lower;
    std::size_t upper;
};

/// Positions that are closer than this count as equal.
constexpr double POSITION_PRECISION = 10.0 * std::numeric_limits<double>::epsilon();

template <class Keys>
Neighbours neighbours(const Keys& keys, double step)
{
    const auto found = std::lower_bound(keys.begin(), keys.end(), step,
                                        [](const auto& key, double position) { return key.step < position; });
    const auto index = static_cast<std::size_t>(found - keys.begin());
    // In front of the first key this wraps around, past the end.
    const std::size_t before = index - 1;
    if (found == keys.end() || found->step - step >= POSITION_PRECISION)
        return {before, index};
    return {index, index + 1};
}

/// The value at a position of an envelope with these keys.
template <class Interpolator, class Keys, class T>
T valueAt(const Keys& keys, const T& defaultValue, double step)
{
    const auto [lower, upper] = neighbours(keys, step);
    const bool hasLower = lower < keys.size();
    const bool hasUpper = upper < keys.size();
    if (hasLower && hasUpper) {
        return Interpolator::interpolate(keys[lower].step, keys[upper].step, step, keys[lower].value,
                                         keys[upper].value);
    }
    if (hasLower)
        return keys[lower].value;
    if (hasUpper)
        return keys[upper].value;
    return defaultValue;
}

} // namespace Animation::Details
