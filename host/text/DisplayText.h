// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QString>

#include <string>

namespace Host {

/// UTF-8 that may go to a terminal: what would steer it or break the line is written as "\x1b".
std::string printable(const QString& text);

/// The number of cells that a terminal takes for UTF-8: two for most East Asian characters, none for what
/// combines.
int displayWidth(const std::string& text);

/// Cut to a width, with "..." at the end if something is missing.
std::string elided(const QString& text, int width);

} // namespace Host
