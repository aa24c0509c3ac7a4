// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/media/File.h>

#include <deque>
#include <string>

namespace Host {

/// A table of files for the terminal: a line for each, and below it a line for each of its tracks. It shows
/// what is also stored with a file, and ends in a line end.
std::string mediaTable(const std::deque<const Media::File*>& files);

} // namespace Host
