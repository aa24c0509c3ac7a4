// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <gtest/gtest.h>

#include <array>

/// Nine coefficients in row order, written down by hand.
using Numbers = std::array<double, 9>;
inline constexpr Numbers identity{1, 0, 0, 0, 1, 0, 0, 0, 1};

template <class M>
Numbers numbersOf(const M& m)
{
    return {m.m11, m.m12, m.m13, m.m21, m.m22, m.m23, m.m31, m.m32, m.m33};
}

template <class M>
void expectMatrix(const M& matrix, const Numbers& expected)
{
    const Numbers numbers = numbersOf(matrix);
    for (std::size_t i = 0; i < 9; ++i) {
        EXPECT_NEAR(numbers[i], expected[i], 1e-12) << "coefficient " << i;
    }
}
