// SPDX-License-Identifier: Apache-2.0
#include "Console.h"

#include "DisplayText.h"

#include <fmt/format.h>

#include <cstdio>

namespace Host {

bool writeOutput(const std::string& text)
{
    const bool isWritten = std::fwrite(text.data(), 1, text.size(), stdout) == text.size();
    if (std::fflush(stdout) == 0 && isWritten) {
        return true;
    }
    writeError("standard output", "cannot be written");
    return false;
}

void writeError(const QString& message)
{
    fmt::print(stderr, "{}\n", printable(message.simplified()));
}

void writeError(const QString& name, const QString& message)
{
    fmt::print(stderr, "{}: {}\n", printable(name), printable(message.simplified()));
}

} // namespace Host
