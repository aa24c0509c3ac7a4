// SPDX-License-Identifier: Apache-2.0
#include "host/commands/ProgressBar.h"

#include <gtest/gtest.h>

#include <poll.h>
#include <pty.h>
#include <sys/ioctl.h>
#include <unistd.h>

namespace {

TEST(ProgressLine, ShowsHowMuchIsDone)
{
    Report::Progress progress;
    progress.setTotal(4)->setLabel("clip.mp4");
    EXPECT_EQ(Host::progressLine(progress, 80), "[                    ]  0/4  clip.mp4");
    progress.setPassed(1);
    EXPECT_EQ(Host::progressLine(progress, 80), "[#####               ]  1/4  clip.mp4");
    progress.setPassed(4);
    EXPECT_EQ(Host::progressLine(progress, 80), "[####################]  4/4  clip.mp4");
}

TEST(ProgressLine, StandsStillWhileTheNumbersGrow)
{
    Report::Progress progress;
    progress.setTotal(200)->setPassed(7)->setLabel("x");
    EXPECT_EQ(Host::progressLine(progress, 80), "[                    ]    7/200  x");
}

TEST(ProgressLine, FitsTheWidth)
{
    Report::Progress progress;
    progress.setTotal(2)->setLabel("a-long-name.mp4");
    EXPECT_EQ(Host::progressLine(progress, 37), "[                    ]  0/2  a-lon...");
    EXPECT_EQ(Host::progressLine(progress, 10), "[      ...");
}

TEST(ProgressLine, KeepsToTheBarWhateverTheCounts)
{
    Report::Progress progress;
    EXPECT_EQ(Host::progressLine(progress, 80), "[                    ]  0/0  ");
    progress.setTotal(2)->setPassed(9);
    EXPECT_EQ(Host::progressLine(progress, 80), "[####################]  2/2  ");
    progress.setPassed(-1);
    EXPECT_EQ(Host::progressLine(progress, 80), "[                    ]  0/2  ");
    progress.setTotal(2147483647)->setPassed(2147483647);
    EXPECT_EQ(Host::progressLine(progress, 80), "[####################]  2147483647/2147483647  ");
}

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

TEST(ProgressBar, RedrawsItsLineOnATerminalAndWipesItOff)
{
    const Terminal terminal(36);
    ASSERT_NE(terminal.stream, nullptr);
    Report::Progress progress;
    Message::View<Report::Progress> reporter;
    reporter.own(&progress)->setTotal(2)->setLabel("clip.mp4");
    const Host::ProgressBar bar(&progress, terminal.stream);
    EXPECT_EQ(terminal.take(), "[                    ]  0/2  cli...");

    reporter.change(&progress)->setPassed(1)->setLabel("b");
    EXPECT_EQ(terminal.take(), "\r\x1b[K[##########          ]  1/2  b");

    reporter.remove(&progress);
    EXPECT_EQ(terminal.take(), "\r\x1b[K[##########          ]  1/2  b\r\x1b[K");
}

TEST(ProgressBar, DrawsNothingIntoAFile)
{
    std::FILE* const file = std::tmpfile();
    ASSERT_NE(file, nullptr);
    Report::Progress progress;
    Message::View<Report::Progress> reporter;
    reporter.own(&progress)->setTotal(2);
    {
        const Host::ProgressBar bar(&progress, file);
        reporter.change(&progress)->setPassed(1);
        reporter.remove(&progress);
    }
    EXPECT_EQ(std::ftell(file), 0);
    std::fclose(file);
}

} // namespace
