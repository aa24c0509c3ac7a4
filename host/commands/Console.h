// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QString>

#include <string>

namespace Host {

/// What a process tells who started it.
enum ExitCode : int
{
    Success = 0,
    Failure = 1,
    UsageError = 2,
};

/// Writes UTF-8 to the standard output, all of it or false: the disk may be full.
bool writeOutput(const std::string& text);

/// Writes one line to the error output.
void writeError(const QString& message);
/// The same, as "name: message".
void writeError(const QString& name, const QString& message);

} // namespace Host
