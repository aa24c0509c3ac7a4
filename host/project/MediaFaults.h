// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/project/CheckedTimelines.h"
#include "host/project/FaultList.h"

#include <EditorModel/media/File.h>
#include <EditorModel/media/ResourceTable.h>

#include <deque>

namespace Host {

/// What is wrong with the files that clips play, and with files that nothing plays: each is opened anew.
/// `table` may be null; `needsTable` says that files which it lacks are a fault. Relative names count from
/// the folder.
void findMediaFaults(const std::deque<CheckedTimeline>& timelines,
                     const std::deque<const Media::File*>& files, const ResourceTable::Object* table,
                     bool needsTable, const QString& folder, FaultList& faults);

} // namespace Host
