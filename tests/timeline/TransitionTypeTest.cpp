// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/TransitionType.h>

#include <EditorModel/timeline/Clip.h>

#include <gtest/gtest.h>

#include <type_traits>

namespace {

using Timeline::transitionType;

static_assert(std::is_same_v<std::underlying_type_t<Timeline::TransitionType>, int>);
static_assert(Timeline::NoTransition == 0);
static_assert(Timeline::BetweenClips == 1);
static_assert(Timeline::IntoClip == 2);
static_assert(Timeline::OutOfClip == 3);

TEST(TransitionType, TwoNullsHaveNoTransition)
{
    EXPECT_EQ(transitionType(nullptr, nullptr), Timeline::NoTransition);
}

TEST(TransitionType, AClipHasNoTransitionToItself)
{
    const Timeline::Clip clip;
    EXPECT_EQ(transitionType(&clip, &clip), Timeline::NoTransition);
}

TEST(TransitionType, TwoDifferentClipsHaveOneBetweenThemHoweverAlikeTheyAre)
{
    const Timeline::Clip first;
    const Timeline::Clip second(first);
    EXPECT_EQ(transitionType(&first, &second), Timeline::BetweenClips);
    EXPECT_EQ(transitionType(&second, &first), Timeline::BetweenClips);
}

TEST(TransitionType, OneClipAloneIsLeftOrEntered)
{
    const Timeline::Clip clip;
    EXPECT_EQ(transitionType(nullptr, &clip), Timeline::IntoClip);
    EXPECT_EQ(transitionType(&clip, nullptr), Timeline::OutOfClip);
}

} // namespace
