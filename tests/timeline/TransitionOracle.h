// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <array>
#include <optional>
#include <set>
#include <vector>

/// A second reckoning of how long transitions are, over tables of whole numbers, to hold the timeline
/// against. Clips and transitions are numbers, in the order of addresses; -1 is null.
namespace TransitionOracle {

using Ms = long long;

constexpr int NOBODY = -1;

struct ClipRow
{
    bool placed = false;
    /// The length, then what transitions take of the tail and of the head.
    std::array<Ms, 3> ms{};

    bool operator==(const ClipRow& other) const { return placed == other.placed && ms == other.ms; }
};

/// The outgoing clip, then the incoming one.
using Pair = std::array<int, 2>;

struct TransitionRow
{
    bool placed = false;
    Pair pair{NOBODY, NOBODY};
    Ms defaultLength = 0;

    bool operator==(const TransitionRow& other) const
    {
        return placed == other.placed && pair == other.pair && defaultLength == other.defaultLength;
    }
};

struct Sheet
{
    std::vector<ClipRow> clips;
    std::vector<TransitionRow> transitions;

    bool operator==(const Sheet& other) const
    {
        return clips == other.clips && transitions == other.transitions;
    }
};

/// No value where a clip is missing.
std::optional<Ms> available(const Sheet& sheet, Pair pair);
std::optional<Ms> expected(const Sheet& sheet, Pair pair, Ms defaultLength, Ms wish,
                           const std::set<int>& ignored = {});

/// False, and no change, where a clip or the transition is missing.
bool add(Sheet& sheet, int transition, Pair pair, Ms wish);
bool remove(Sheet& sheet, int transition);
bool setLength(Sheet& sheet, int transition, Ms length);

} // namespace TransitionOracle
