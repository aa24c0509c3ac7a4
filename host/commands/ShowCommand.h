// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/Console.h"

#include <QString>

namespace Host {

/// Prints what is in a project, or the timelines, the media files and the resources of another document, as
/// they were when it was saved; the files themselves are not looked at.
ExitCode show(const QString& path);

} // namespace Host
