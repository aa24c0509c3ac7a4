// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/project/CheckedTimelines.h"
#include "host/project/FaultList.h"

namespace Host {

class TrackingStore;

/// What is wrong with the settings of a timeline and of its clips, with their envelopes and their trackings.
void findClipFaults(const CheckedTimeline& timeline, const TrackingStore& trackings, FaultList& faults);

} // namespace Host
