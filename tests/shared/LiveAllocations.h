// SPDX-License-Identifier: Apache-2.0
#pragma once

namespace Testing {

/// How many allocations of the whole program, those of the library included, have not been freed. Only what
/// goes through `new` counts: every object does, the bytes of a QString do not.
long liveAllocations();

} // namespace Testing
