// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/Console.h"

#include <QString>
#include <QStringList>

namespace Host {

/// Makes a project with the timeline of media files, one after another: video and pictures on the primary
/// track, the sound of a video below it on the native audio track, other sound on an audio track. The files
/// are listed in the user's collection, and their tracks in the table of resources. Each file that cannot be
/// taken has a line on the error output, and there is no project then. A file that exists is not replaced.
ExitCode newProject(const QString& path, const QStringList& media);

} // namespace Host
