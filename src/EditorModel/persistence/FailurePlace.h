// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <string>

namespace Serialize::Details {

/// Where in the document the exception that is now on its way out came from: keys and item numbers from the
/// root, such as "videoTracks[2]/index". Kept per thread; fields add themselves while they are unwound.
class FailurePlace
{
public:
    static void clear();
    /// An item of 0 names the key, any other the item's number.
    static void add(const char* key, int item);
    static const std::string& text();
};

} // namespace Serialize::Details
