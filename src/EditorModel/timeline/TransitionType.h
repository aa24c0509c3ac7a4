// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>

namespace Timeline {

struct Clip;

/// The shape of a pair of clips: which of them a transition covers.
enum TransitionType : int
{
    NoTransition = 0, ///< no clip, or one clip twice
    BetweenClips = 1, ///< the tail of the first and the head of the second
    IntoClip = 2,     ///< the head of the second; the first is null
    OutOfClip = 3,    ///< the tail of the first; the second is null
};

/// Looks at the addresses alone: the clips needn't be on a timeline.
EDITORMODEL_EXPORT TransitionType transitionType(const Clip* first, const Clip* second);

} // namespace Timeline
