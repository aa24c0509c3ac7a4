// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/Console.h"

#include <QString>

namespace Host {

/// Draws the timeline of a document; the ending of the picture's name tells its form. There must be a
/// QGuiApplication. What fails has one line on the error output.
ExitCode drawTimeline(const QString& document, const QString& picturePath);

} // namespace Host
