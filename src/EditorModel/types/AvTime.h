// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/types/MTime.h>

#include <QtGlobal>

/// Conversions between MTime and the media engine's AvTime, a signed 64-bit count of microseconds.
namespace Types {

/// Drops what is below a millisecond, towards zero.
constexpr MTime fromAvTime(qint64 avTime)
{
    return MTime(avTime / 1000);
}

/// The nearest millisecond; the count passes through a double, which is exact up to 2^53 microseconds.
constexpr MTime fromAvTimeRound(qint64 avTime)
{
    return MTime::fromUsRound(static_cast<double>(avTime));
}

/// Overflow isn't checked: beyond some 292 000 years the result means nothing.
constexpr qint64 toAvTime(MTime time)
{
    return time.ms() * 1000;
}

} // namespace Types
