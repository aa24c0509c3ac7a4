// SPDX-License-Identifier: Apache-2.0
#include "host/commands/TerminalLine.h"

#include <sys/ioctl.h>
#include <unistd.h>

namespace Host {

TerminalLine::TerminalLine(std::FILE* stream) : m_stream(stream), m_isTerminal(isatty(fileno(stream)) == 1) {}

int TerminalLine::width() const
{
    winsize size = {};
    const bool isKnown = ioctl(fileno(m_stream), TIOCGWINSZ, &size) == 0 && size.ws_col > 0;
    // The last column stays free: some terminals go on to the next line when it is filled.
    return (isKnown ? size.ws_col : 80) - 1;
}

void TerminalLine::draw(const std::string& text)
{
    wipe();
    std::fputs(text.c_str(), m_stream);
    std::fflush(m_stream);
    m_isDrawn = true;
}

void TerminalLine::wipe()
{
    end("\r\x1b[K");
}

void TerminalLine::keep()
{
    end("\n");
}

void TerminalLine::end(const char* how)
{
    if (m_isDrawn) {
        std::fputs(how, m_stream);
        std::fflush(m_stream);
        m_isDrawn = false;
    }
}

} // namespace Host
