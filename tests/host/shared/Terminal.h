// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <cstdio>
#include <string>

#include <poll.h>
#include <pty.h>
#include <sys/ioctl.h>
#include <unistd.h>

namespace HostTests {

/// A terminal whose other end the test reads.
class Terminal
{
public:
    explicit Terminal(unsigned short columns)
    {
        winsize size = {};
        size.ws_col = columns;
        if (openpty(&m_reader, &m_writer, nullptr, nullptr, &size) == 0) {
            stream = fdopen(m_writer, "w");
        }
    }
    Terminal(const Terminal&) = delete;
    ~Terminal()
    {
        if (stream) {
            fclose(stream);
            close(m_reader);
        }
    }

    /// All that was written since the last call. A terminal hands on in portions of its own, so a mark is
    /// written behind and read up to.
    std::string take() const
    {
        std::fputc(mark, stream);
        std::fflush(stream);
        std::string text;
        for (char next = 0; isReadable() && read(m_reader, &next, 1) == 1 && next != mark;) {
            text += next;
        }
        return text;
    }

    std::FILE* stream = nullptr;

private:
    static constexpr char mark = '\x1e';

    /// Waits for a minute at most, if there is nothing to read yet.
    bool isReadable() const
    {
        pollfd reader = {m_reader, POLLIN, 0};
        return poll(&reader, 1, 60000) == 1;
    }

    int m_reader = -1;
    int m_writer = -1;
};

} // namespace HostTests
