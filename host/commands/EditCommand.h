// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/Console.h"

#include <QString>
#include <QStringList>

namespace Host {

/// What `edit` takes, a line each.
extern const char* const editCommands;

/// Carries out the commands that the words make up, with "then" or "," between them, on the timeline of a
/// project, and stores it. If one of them is refused, for which there is one line on the error output, the
/// document stays as it is. `packages` are folders, from which titles and transitions may come.
ExitCode editProject(const QString& path, const QStringList& words, const QStringList& packages);

} // namespace Host
