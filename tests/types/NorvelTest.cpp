// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/Norvel.h>

#include <gtest/gtest.h>

#include <limits>
#include <type_traits>

namespace {

template <class Enumeration>
void survivesAsAnInt(int value)
{
    EXPECT_EQ(value, static_cast<int>(static_cast<Enumeration>(value)));
}

TEST(Norvel, EnumerationsSurviveAsAnInt)
{
    for (const int value : {0, 1, 2, std::numeric_limits<int>::max(), std::numeric_limits<int>::min()}) {
        survivesAsAnInt<Norvel::Conf::ChannelLayout>(value);
        survivesAsAnInt<Norvel::Conf::SampleFormats>(value);
    }
    EXPECT_TRUE((std::is_same_v<int, std::underlying_type_t<Norvel::Conf::ChannelLayout>>));
    EXPECT_TRUE((std::is_same_v<int, std::underlying_type_t<Norvel::Conf::SampleFormats>>));
}

TEST(Norvel, MatrixIsNineNumbersInRowOrder)
{
    const Norvel::Proc::Matrix3x3 matrix = {1, 2, 3, 4, 5, 6, 7, 8, 9};
    EXPECT_EQ(9 * sizeof(double), sizeof(matrix));
    const double* numbers = &matrix.m11;
    EXPECT_EQ(1.0, *numbers);
    EXPECT_EQ(4.0, matrix.m21);
    EXPECT_EQ(6.0, matrix.m23);
    EXPECT_EQ(7.0, matrix.m31);
    EXPECT_EQ(9.0, matrix.m33);
}

} // namespace
