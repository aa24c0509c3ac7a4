// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/Console.h"

#include <QRectF>
#include <QString>

namespace Host {

struct TrackOptions
{
    QString project;
    /// A number or a name, as edits take them.
    QString clip;
    /// Where the object is in the first picture that the clip shows; parts of the picture's size.
    QRectF rectangle;
    /// What the tracking is to be called; empty is a new identifier.
    QString id;
};

/// Follows a rectangle through what a clip shows of its source, keeps the data beside the project, and has
/// the clip name it. Prints the identifier and what was found.
ExitCode trackClip(const TrackOptions& options);

} // namespace Host
