// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/editing/EditDraft.h"
#include "host/editing/EditSession.h"

#include <EditorModel/timeline/Timeline.h>

namespace Host {

// What edits ask before they begin. All throw EditRefused where the answer is no.

/// No later and no more negative than a timeline can hold, so that sums of a few can't overflow.
void checkTime(MTime time);
void checkPresent(const Timeline::Object& timeline, const Timeline::Clip* clip);
/// On the timeline, and its timing can be edited.
void checkEditable(const Timeline::Object& timeline, const Timeline::Clip* clip);
void checkCanSplit(const Timeline::Object& timeline, const Timeline::Clip* clip, MTime at);
/// The length that an edit of the clip, which starts at `start`, would leave.
void checkLength(const Timeline::Clip* clip, MTime start, MTime length);
/// The stretch of the source that an edit of the clip would leave. It may lie beyond the source as far as it
/// did `before`.
void checkStretch(const Timeline::Clip* clip, const Timeline::ClipTiming& timing, MTime before = 0);
void checkListed(const Timeline::Object& timeline, const Timeline::Track* track);
/// The clip may lie on the lane.
void checkLane(const Timeline::Object& timeline, const Timeline::Clip* clip, const Lane& lane, MTime at);

/// Checks all that doesn't depend on what lies there, and gives the timing with which the clip is laid.
Timeline::ClipTiming checkedTiming(const EditDraft& draft, const Placement& what, MTime at);

} // namespace Host
