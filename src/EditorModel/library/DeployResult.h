// SPDX-License-Identifier: Apache-2.0
#pragma once

namespace Package {

/// How the deploying of an import ended. Whoever fetches it gives meaning to the values; all but the default
/// are reached by a cast.
enum DeployResult : int
{
    DefaultDeployResult = 0,
};

} // namespace Package
