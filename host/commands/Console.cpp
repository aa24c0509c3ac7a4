// SPDX-License-Identifier: Apache-2.0
#include "host/commands/Console.h"

#include "host/text/DisplayText.h"

#include <fmt/format.h>

#include <cstdio>

namespace Host {
namespace {

/// Not with fmt::print(), which throws where the error output cannot be written: nobody could be told.
void put(const std::string& line)
{
    std::fputs((line + '\n').c_str(), stderr);
}

} // namespace

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
    put(printable(message.simplified()));
}

void writeError(const QString& name, const QString& message)
{
    put(fmt::format("{}: {}", name.isEmpty() ? "\"\"" : printable(name), printable(message.simplified())));
}

} // namespace Host
