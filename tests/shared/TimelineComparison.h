// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/library/Project.h>
#include <EditorModel/timeline/Timeline.h>

#include <string>
#include <vector>

namespace Testing {

/// Walks two graphs in step, field by field, without the field lists of the library, and tells the places
/// where the second one is not what a document gives back of the first: "clips[beach]/key/volume".
///
/// Clips, labels and transitions in sets and maps are matched by their names and identifiers. Pointers go to
/// partners: where one object is shared, its partner is, and what is two objects is two. What documents do
/// not keep has its defaults in `loaded`. `wrapsTimes` takes times as they are after a store of 32 bits.
std::vector<std::string> timelineDifferences(const Timeline::Object& stored, const Timeline::Object& loaded,
                                             bool wrapsTimes = false);

/// The same for whole projects: "userCollection/items[0]/tag". Entries of the table of resources go by their
/// keys.
std::vector<std::string> projectDifferences(const Project::Content& stored, const Project::Content& loaded,
                                            bool wrapsTimes = false);

} // namespace Testing
