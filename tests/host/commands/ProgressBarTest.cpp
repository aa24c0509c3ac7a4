// SPDX-License-Identifier: Apache-2.0
#include "tests/host/shared/Terminal.h"

#include "host/commands/ProgressBar.h"

#include <gtest/gtest.h>

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

TEST(ProgressBar, RedrawsItsLineOnATerminalAndWipesItOff)
{
    const HostTests::Terminal terminal(36);
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
