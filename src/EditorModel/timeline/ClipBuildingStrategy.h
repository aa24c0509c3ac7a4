// SPDX-License-Identifier: Apache-2.0
#pragma once

namespace Timeline {

/// How clips are built of files that are added. The strategies belong to the modules that build; all but the
/// default are reached by a cast.
enum ClipBuildingStrategy : int
{
    DefaultStrategy = 0,
};

} // namespace Timeline
