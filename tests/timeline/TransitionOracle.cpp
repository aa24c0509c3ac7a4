// SPDX-License-Identifier: Apache-2.0
#include "tests/timeline/TransitionOracle.h"

#include <algorithm>
#include <limits>

namespace TransitionOracle {
namespace {

constexpr Ms LEAST = 10;

// Side 0 of a pair is the outgoing clip, side 1 the incoming one. What a new transition takes of a clip
// stands in its cell `near`, and what the transition at the other end has taken already in its cell `far`.
constexpr int NEAR[] = {1, 2};
constexpr int FAR[] = {2, 1};

/// How a transition is laid on a pair.
struct Layout
{
    std::vector<int> sides;
    /// Of how many equal parts the transition is made, one on each side.
    Ms parts;
    /// What a wish must leave of a clip.
    Ms margin;
};

const Layout& layoutOf(Pair pair)
{
    static const Layout none{{}, 1, 0};
    static const Layout table[2][2] = {{none, {{1}, 1, LEAST}}, {{{0}, 1, LEAST}, {{0, 1}, 2, 0}}};
    return pair[0] == pair[1] ? none : table[pair[0] != NOBODY][pair[1] != NOBODY];
}

/// The first transition with `clip` on a side of its pair.
int firstAt(const Sheet& sheet, int side, int clip)
{
    for (int row = 0; row < int(sheet.transitions.size()); ++row) {
        if (clip != NOBODY && sheet.transitions[row].placed && sheet.transitions[row].pair[side] == clip)
            return row;
    }
    return NOBODY;
}

int firstOn(const Sheet& sheet, Pair pair)
{
    for (int row = 0; row < int(sheet.transitions.size()); ++row) {
        if (sheet.transitions[row].placed && sheet.transitions[row].pair == pair)
            return row;
    }
    return NOBODY;
}

int rowInPlace(const Sheet& sheet, Pair pair, const Layout& layout)
{
    switch (layout.sides.size()) {
    case 0:
        return NOBODY;
    case 1:
        return firstAt(sheet, layout.sides[0], pair[layout.sides[0]]);
    default:
        return firstOn(sheet, pair);
    }
}

bool lacksClips(const Sheet& sheet, Pair pair, const Layout& layout)
{
    return std::any_of(layout.sides.begin(), layout.sides.end(),
                       [&](int side) { return !sheet.clips[pair[side]].placed; });
}

bool isKnown(const Sheet& sheet, int transition)
{
    return sheet.transitions[transition].placed;
}

/// A clip that is gone comes back with all its cells at 0.
void write(Sheet& sheet, int transition, Ms share)
{
    for (const int side : {0, 1}) {
        const int clip = sheet.transitions[transition].pair[side];
        if (clip == NOBODY)
            continue;
        sheet.clips[clip].placed = true;
        sheet.clips[clip].ms[NEAR[side]] = share;
    }
}

} // namespace

std::optional<Ms> available(const Sheet& sheet, Pair pair)
{
    const Layout& layout = layoutOf(pair);
    if (layout.sides.empty())
        return -1;
    if (lacksClips(sheet, pair, layout))
        return std::nullopt;
    Ms least = std::numeric_limits<Ms>::max();
    for (const int side : layout.sides) {
        const auto& cells = sheet.clips[pair[side]].ms;
        const Ms taken = cells[FAR[side]];
        least = std::min(least, cells[0] - taken - (taken ? LEAST : 0));
    }
    return std::max(LEAST, layout.parts * least);
}

std::optional<Ms> expected(const Sheet& sheet, Pair pair, Ms defaultLength, Ms wish,
                           const std::set<int>& ignored)
{
    const Layout& layout = layoutOf(pair);
    if (lacksClips(sheet, pair, layout))
        return std::nullopt;

    const int inPlace = wish == -1 ? rowInPlace(sheet, pair, layout) : NOBODY;
    if (inPlace != NOBODY && !ignored.count(inPlace)) {
        wish = 0;
        for (const int side : layout.sides)
            wish += sheet.clips[pair[side]].ms[NEAR[side]];
    }
    if (wish == -1)
        wish = defaultLength * layout.parts / 2;
    if (layout.sides.empty())
        return wish;

    Ms part = wish / layout.parts;
    for (const int side : layout.sides) {
        const auto& cells = sheet.clips[pair[side]].ms;
        const int neighbour = firstAt(sheet, 1 - side, pair[side]);
        const Ms busy = neighbour != NOBODY && ignored.count(neighbour) ? 0 : cells[FAR[side]];
        part = std::min(part, cells[0] - busy - layout.margin);
    }
    return layout.parts * std::max(part, LEAST / layout.parts);
}

bool add(Sheet& sheet, int transition, Pair pair, Ms wish)
{
    if (pair[0] == pair[1])
        return true;
    const auto length = expected(sheet, pair, sheet.transitions[transition].defaultLength, wish);
    if (!length)
        return false;
    for (const int side : {0, 1}) {
        const int displaced = firstAt(sheet, side, pair[side]);
        if (displaced != NOBODY)
            remove(sheet, displaced);
    }
    sheet.transitions[transition].placed = true;
    sheet.transitions[transition].pair = pair;
    return setLength(sheet, transition, *length);
}

bool remove(Sheet& sheet, int transition)
{
    if (!isKnown(sheet, transition))
        return false;
    write(sheet, transition, 0);
    sheet.transitions[transition].placed = false;
    sheet.transitions[transition].pair = {NOBODY, NOBODY};
    return true;
}

bool setLength(Sheet& sheet, int transition, Ms length)
{
    if (!isKnown(sheet, transition))
        return false;
    const Pair pair = sheet.transitions[transition].pair;
    write(sheet, transition, pair[0] != NOBODY && pair[1] != NOBODY ? length / 2 : length);
    return true;
}

} // namespace TransitionOracle
