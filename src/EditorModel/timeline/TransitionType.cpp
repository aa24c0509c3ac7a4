// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/TransitionType.h>

namespace Timeline {

TransitionType transitionType(const Clip* first, const Clip* second)
{
    if (first == second)
        return NoTransition;
    if (!first)
        return IntoClip;
    if (!second)
        return OutOfClip;
    return BetweenClips;
}

} // namespace Timeline
