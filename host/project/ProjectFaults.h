// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/editing/TimelineInvariants.h"
#include "host/project/FaultList.h"

#include <EditorModel/library/Project.h>

#include <QString>

#include <deque>
#include <vector>

namespace Host {

class TrackingStore;

/// A project that was read, or a plain document.
struct CheckedProject
{
    std::deque<const Serialize::ISerializable*> roots;
    /// One of the roots; null for a plain document, which need not have a timeline or a table of resources.
    const Project::Content* content = nullptr;
    /// Relative names of media files count from here.
    QString folder;
    const TrackingStore& trackings;
};

/// All faults, in the order of their codes, whatever the addresses of the objects. Every media file is opened
/// anew and compared with its description, which takes its time. Nothing is changed.
std::vector<ProjectFault> projectFaults(const CheckedProject& project);

FaultCode codeOf(TimelineFault::Kind kind);

} // namespace Host
