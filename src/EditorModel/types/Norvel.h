// SPDX-License-Identifier: Apache-2.0
#pragma once

/// The types of the media engine that the model names. It computes nothing with them.
namespace Norvel {

namespace Proc {

/// Nine coefficients in row order, the identity by default.
struct Matrix3x3
{
    double m11 = 1.0;
    double m12 = 0.0;
    double m13 = 0.0;
    double m21 = 0.0;
    double m22 = 1.0;
    double m23 = 0.0;
    double m31 = 0.0;
    double m32 = 0.0;
    double m33 = 1.0;
};

} // namespace Proc

namespace Conf {

/// Values belong to the media engine; the model stores them as numbers.
enum ChannelLayout : int
{
};

/// Values belong to the media engine; the model stores them as numbers.
enum SampleFormats : int
{
};

} // namespace Conf

} // namespace Norvel
