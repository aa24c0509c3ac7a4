// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tests/types/Printing.h"

#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>
#include <rapidcheck.h>

#include <set>
#include <stdexcept>
#include <vector>

/// What the tests of timelines have in common. Clips and tracks stand in arrays there, so that their
/// addresses ascend.
namespace TimelineTests {

using Clips = std::set<const Timeline::Clip*>;

inline const Timeline::Clip* const noClip = nullptr;
inline const Timeline::Track* const noTrack = nullptr;

/// Where and when; the source is as long as the clip.
inline Timeline::ClipTiming lying(const Timeline::Track* track, MTime timestamp, MTime duration,
                                  int level = 0)
{
    return Timeline::ClipTiming(track, level, timestamp, duration, MTime(), duration);
}

template <class Call>
void expectUnknownKey(Call call)
{
    try {
        call();
        FAIL() << "an unknown key was accepted";
    } catch (const std::out_of_range& error) {
        EXPECT_STREQ(error.what(), "invalid map<K, T> key");
    }
}

/// The numbers below `count`, in any order; for properties.
inline std::vector<int> anyOrder(int count)
{
    std::vector<int> order;
    for (int i = 0; i != count; ++i)
        order.insert(order.begin() + *rc::gen::inRange(0, i + 1), i);
    return order;
}

} // namespace TimelineTests
