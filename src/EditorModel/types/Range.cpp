// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/Range.h>

#include <algorithm>

namespace Types {

Range Range::intersection(const Range& other) const
{
    if (!hasIntersection(other))
        return {};
    return {std::max(from, other.from), std::min(to, other.to)};
}

std::set<Range> Range::added(const Range& other) const
{
    if (!hasIntersection(other))
        return {*this, other};
    return {Range(std::min(from, other.from), std::max(to, other.to))};
}

std::set<Range> Range::subsctracted(const Range& other) const
{
    if (!hasIntersection(other))
        return {*this};
    std::set<Range> pieces;
    if (from < other.from)
        pieces.emplace(from, other.from);
    if (other.to < to)
        pieces.emplace(other.to, to);
    return pieces;
}

} // namespace Types
