// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/media/MediaDescriber.h"

#include <string>

namespace Host {

/// An array with one object a file, for other programs: "path" and "error", or "path" and the description,
/// with times in milliseconds, sizes in bytes and rates in bits per second. It ends in a line end.
std::string mediaJson(const std::deque<MediaDescriber::Entry>& entries);

} // namespace Host
