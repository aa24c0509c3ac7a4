// SPDX-License-Identifier: Apache-2.0
#pragma once

namespace Package {

/// How the fetching of a package ended. Whoever fetches gives meaning to the other values, which are reached
/// by a cast.
enum DeployResult : int
{
    DefaultDeployResult = 0,
};

} // namespace Package
