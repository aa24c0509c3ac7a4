// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/FuzzyCompare.h>

#include <algorithm>
#include <cmath>

bool Types::fuzzyEqual(double a, double b)
{
    constexpr double SMALLEST = 1e-12;
    constexpr double PRECISION = 1e12;

    const double magnitudeA = std::abs(a);
    const double magnitudeB = std::abs(b);
    if (magnitudeA <= SMALLEST && magnitudeB <= SMALLEST)
        return true;
    return std::abs(a - b) * PRECISION <= std::min(magnitudeA, magnitudeB);
}
