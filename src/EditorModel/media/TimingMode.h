// SPDX-License-Identifier: Apache-2.0
#pragma once

namespace Media {

/// How something is fitted to its time. The modes belong to the modules that play it; the model stores and
/// compares them, and other values are reached by a cast.
enum TimingMode : int
{
    DefaultTimingMode = 0,
};

} // namespace Media
