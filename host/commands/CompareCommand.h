// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/Console.h"

#include <QString>
#include <QStringList>

namespace Host {

/// Tells of each of the others whether it holds the same as the first, with the trackings beside it, in
/// whatever forms they are. Success if all do, Failure if one differs, and UsageError with a line on the
/// error output if one cannot be read.
ExitCode compareDocuments(const QString& first, const QStringList& others);

} // namespace Host
