// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <cstdio>
#include <string>

namespace Host {

/// One line of a terminal that is drawn again and again in the same place.
class TerminalLine
{
public:
    /// The stream outlives the line.
    explicit TerminalLine(std::FILE* stream);

    /// The stream is a terminal; there is nothing to be drawn on any other.
    bool isTerminal() const { return m_isTerminal; }
    /// How many cells of the terminal the line may take.
    int width() const;

    void draw(const std::string& text);
    void wipe();
    /// Leaves the line where it is, and goes on below it.
    void keep();

private:
    void end(const char* how);

    std::FILE* const m_stream;
    const bool m_isTerminal;
    bool m_isDrawn = false;
};

} // namespace Host
