// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/types/MTime.h>

#include <set>

namespace Types {

/// The half-open span [from, to). Nothing keeps the ends in order: a range with `to` at or before `from` is
/// empty, and yet has a place that intersections see.
struct EDITORMODEL_EXPORT Range
{
    MTime from;
    MTime to = -1;

    /// From 0 to -1: empty.
    constexpr Range() = default;
    constexpr Range(MTime from_, MTime to_) : from(from_), to(to_) {}

    /// `from` is inside, `to` is outside.
    constexpr bool contains(MTime time) const { return from <= time && time < to; }
    constexpr bool empty() const { return to <= from; }
    /// Zero where the ends are in the wrong order.
    constexpr MTime length() const { return to > from ? to - from : MTime(); }

    /// Both ends open: ranges that only touch don't intersect. A point [t, t) intersects what it lies
    /// strictly inside of.
    constexpr bool hasIntersection(const Range& other) const { return from < other.to && to > other.from; }
    /// A default range where hasIntersection() is false, touching ranges included.
    Range intersection(const Range& other) const;

    /// The union: one range where the two intersect, both ranges where not. Ranges that only touch aren't
    /// joined.
    std::set<Range> added(const Range& other) const;
    /// What `other` leaves of this range: none, one or two pieces, none of them empty. A range that doesn't
    /// intersect `other` comes back as it is, even when it is empty.
    std::set<Range> subsctracted(const Range& other) const;

    friend constexpr bool operator==(const Range& a, const Range& b)
    {
        return a.from == b.from && a.to == b.to;
    }
    friend constexpr bool operator!=(const Range& a, const Range& b) { return !(a == b); }
    /// By `from`, then by `to`.
    friend constexpr bool operator<(const Range& a, const Range& b)
    {
        return a.from != b.from ? a.from < b.from : a.to < b.to;
    }
};

} // namespace Types
