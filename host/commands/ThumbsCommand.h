// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/Console.h"

#include <QString>

namespace Host {

/// Draws the timeline of a document with pictures out of its media. Without a path for the picture it goes
/// beside the document, as "NAME-thumbs.png", and its name is printed. Each file that cannot be read has one
/// line on the error output; the picture is drawn all the same, and the outcome is a failure. On a terminal a
/// progress bar shows how many of the pictures have been taken. There must be a QGuiApplication.
ExitCode drawThumbs(const QString& document, const QString& picturePath);

} // namespace Host
