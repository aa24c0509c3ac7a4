// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/project/GraphRecord.h"

#include <optional>
#include <string>

namespace Host {

/// A graph as lines of text that depend on nothing but its content: equal texts are equal graphs, the same
/// objects shared in the same way. What is ordered by address gets an order of its own, by what it holds and
/// what leads to it. Of more than a hundred objects that only their places in such orders could tell apart
/// two equal graphs may give two texts.
std::string canonicalText(const GraphRecord& record);

/// Where two graphs differ first, as a line of the one and of the other; none where they are equal.
std::optional<std::string> firstDifference(const GraphRecord& a, const GraphRecord& b);

} // namespace Host
