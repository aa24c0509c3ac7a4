// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>

/// A sound level in dB. Levels add in dB, which multiplies what they stand for.
class EDITORMODEL_EXPORT Decibel
{
public:
    /// 0 dB.
    constexpr Decibel() = default;

    static constexpr Decibel fromDbLevel(double level) { return Decibel(level); }
    /// 20 log10(relative), for a ratio of amplitudes. Zero is silence, minus infinity; a negative ratio gives
    /// not-a-number.
    static Decibel fromRelativeLevel(double relative);
    /// 10^(level / 20), the ratio of amplitudes: 1 at 0 dB.
    double toRelativeLevel() const;

    constexpr double level() const { return m_level; } ///< in dB

    constexpr Decibel& operator+=(Decibel other)
    {
        m_level += other.m_level;
        return *this;
    }
    constexpr Decibel& operator-=(Decibel other)
    {
        m_level -= other.m_level;
        return *this;
    }
    constexpr Decibel operator-() const { return Decibel(-m_level); }

    friend constexpr Decibel operator+(Decibel a, Decibel b) { return Decibel(a.m_level + b.m_level); }
    friend constexpr Decibel operator-(Decibel a, Decibel b) { return Decibel(a.m_level - b.m_level); }

    friend constexpr bool operator<(Decibel a, Decibel b) { return a.m_level < b.m_level; }
    friend constexpr bool operator>(Decibel a, Decibel b) { return a.m_level > b.m_level; }

private:
    explicit constexpr Decibel(double level) : m_level(level) {}

    double m_level = 0.0;
};

/// Fuzzy, as Types::fuzzyEqual(): relative to the lesser magnitude, so that 0 dB equals nothing beyond 1e-12,
/// and silence, being infinite, doesn't equal silence.
EDITORMODEL_EXPORT bool operator==(Decibel a, Decibel b);
EDITORMODEL_EXPORT bool operator!=(Decibel a, Decibel b);
/// Less, or equal in the fuzzy sense.
EDITORMODEL_EXPORT bool operator<=(Decibel a, Decibel b);
/// Greater, or equal in the fuzzy sense.
EDITORMODEL_EXPORT bool operator>=(Decibel a, Decibel b);

constexpr Decibel operator""_dB(long double level)
{
    return Decibel::fromDbLevel(static_cast<double>(level));
}
