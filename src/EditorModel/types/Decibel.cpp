// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/Decibel.h>

#include <EditorModel/types/FuzzyCompare.h>

#include <cmath>

Decibel Decibel::fromRelativeLevel(double relative)
{
    return Decibel(20.0 * std::log10(relative));
}

double Decibel::toRelativeLevel() const
{
    return std::pow(10.0, m_level / 20.0);
}

bool operator==(Decibel a, Decibel b)
{
    return Types::fuzzyEqual(a.level(), b.level());
}

bool operator!=(Decibel a, Decibel b)
{
    return !(a == b);
}

bool operator<=(Decibel a, Decibel b)
{
    return a < b || a == b;
}

bool operator>=(Decibel a, Decibel b)
{
    return a > b || a == b;
}
