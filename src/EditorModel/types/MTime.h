// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QtGlobal>

#include <chrono>
#include <functional>
#include <limits>
#include <type_traits>

/// A point or a span of time in whole milliseconds. It may be negative. Sums and differences are plain signed
/// 64-bit arithmetic: overflow is the caller's to avoid.
class MTime
{
public:
    constexpr MTime() = default;

    /// Takes whole milliseconds. Fractions don't convert by themselves: see fromMsRound().
    template <class Integer, std::enable_if_t<std::is_integral_v<Integer>, int> = 0>
    constexpr MTime(Integer ms) : m_ms(static_cast<qint64>(ms))
    {}
    constexpr MTime(std::chrono::milliseconds time) : m_ms(time.count()) {}

    /// The nearest millisecond; as in all rounding here, a half goes away from zero, not-a-number becomes 0
    /// and what is out of range becomes the nearest representable time.
    static constexpr MTime fromMsRound(double ms) { return MTime(rounded(ms)); }
    /// The millisecond nearest to `us` microseconds.
    static constexpr MTime fromUsRound(double us) { return MTime(roundedThousandth(us)); }

    /// The count of milliseconds.
    constexpr qint64 ms() const { return m_ms; }
    constexpr operator std::chrono::milliseconds() const { return std::chrono::milliseconds(m_ms); }

    /// The product in double precision, rounded: exact counts up to 2^53 ms.
    constexpr MTime mulRound(double factor) const { return fromMsRound(static_cast<double>(m_ms) * factor); }
    /// The quotient in double precision, rounded. A time divided by zero saturates, zero by zero is zero.
    constexpr MTime divRound(double divisor) const
    {
        return fromMsRound(static_cast<double>(m_ms) / divisor);
    }

    constexpr MTime& operator+=(MTime other)
    {
        m_ms += other.m_ms;
        return *this;
    }
    constexpr MTime& operator-=(MTime other)
    {
        m_ms -= other.m_ms;
        return *this;
    }
    constexpr MTime operator-() const { return MTime(-m_ms); }

    friend constexpr MTime operator+(MTime a, MTime b) { return MTime(a.m_ms + b.m_ms); }
    friend constexpr MTime operator-(MTime a, MTime b) { return MTime(a.m_ms - b.m_ms); }
    friend constexpr bool operator==(MTime a, MTime b) { return a.m_ms == b.m_ms; }
    friend constexpr bool operator!=(MTime a, MTime b) { return a.m_ms != b.m_ms; }
    friend constexpr bool operator<(MTime a, MTime b) { return a.m_ms < b.m_ms; }
    friend constexpr bool operator<=(MTime a, MTime b) { return a.m_ms <= b.m_ms; }
    friend constexpr bool operator>(MTime a, MTime b) { return a.m_ms > b.m_ms; }
    friend constexpr bool operator>=(MTime a, MTime b) { return a.m_ms >= b.m_ms; }

private:
    static constexpr double TWO_TO_63 = 9223372036854775808.0;

    static constexpr qint64 rounded(double value)
    {
        if (value != value)
            return 0;
        if (value >= TWO_TO_63)
            return std::numeric_limits<qint64>::max();
        if (value <= -TWO_TO_63)
            return std::numeric_limits<qint64>::min();
        const qint64 whole = static_cast<qint64>(value);
        return whole + halfAway(value - static_cast<double>(whole), 0.5);
    }

    // Splits off the whole part first: value / 1000 could be rounded up to a half that isn't there.
    static constexpr qint64 roundedThousandth(double value)
    {
        if (!(value > -TWO_TO_63 && value < TWO_TO_63))
            return rounded(value / 1000.0);
        const qint64 whole = static_cast<qint64>(value);
        const double rest = static_cast<double>(whole % 1000) + (value - static_cast<double>(whole));
        return whole / 1000 + halfAway(rest, 500.0);
    }

    static constexpr int halfAway(double rest, double half)
    {
        return rest >= half ? 1 : rest <= -half ? -1 : 0;
    }

    qint64 m_ms = 0;
};

namespace std {

/// The magnitude. That of the lowest time has no representation and is the caller's to avoid.
constexpr MTime abs(MTime time)
{
    return time < MTime() ? -time : time;
}

template <>
struct hash<MTime>
{
    size_t operator()(MTime time) const noexcept { return hash<qint64>()(time.ms()); }
};

} // namespace std
