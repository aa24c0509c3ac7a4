// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/Console.h"

#include <QStringList>

namespace Host {

/// Shows the packages in the folders, each of which is a package or has packages directly below: what they
/// bring, and which collection takes it. Every fault has a line on the error output, and makes it a failure.
ExitCode showPackages(const QStringList& folders);

} // namespace Host
