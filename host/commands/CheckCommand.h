// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/Console.h"

#include <QString>

namespace Host {

/// Prints what is wrong with a project or a document, or that nothing is. Success for a sound one, Failure
/// for one with faults, and UsageError with a line on the error output for one that cannot be read.
ExitCode checkProject(const QString& path, bool asJson);

} // namespace Host
