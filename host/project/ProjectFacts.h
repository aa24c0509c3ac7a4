// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/library/Project.h>

#include <string>

namespace Host {

/// What is in a project, for the terminal: how much there is of everything, then its timeline, the files that
/// its clips play, the items of its collection and its resources. Ends with a line end.
std::string projectText(const Project::Content& project);

} // namespace Host
