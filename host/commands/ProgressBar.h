// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/TerminalLine.h"

#include <EditorModel/bus/View.h>
#include <EditorModel/services/Report.h>

#include <cstdio>
#include <string>

namespace Host {

/// One line that shows how far a progress has come: "[#####     ]  3/10  clip.mp4". The line has no line end
/// and fits the width.
std::string progressLine(const Report::Progress& progress, int width);

/// The module that draws the progress that it observes, on one line of a terminal, and wipes it off when the
/// progress is removed. Where the stream is no terminal it draws nothing.
class ProgressBar : private Message::View<Report::Progress>
{
public:
    /// The progress is observed until it is removed; the stream outlives the bar.
    ProgressBar(const Report::Progress* progress, std::FILE* stream);
    ProgressBar(const ProgressBar&) = delete;
    ~ProgressBar() override;

private:
    using Message::View<Report::Progress>::changed;
    void changed(const Report::Progress* progress) override;
    void removed(const Report::Progress* progress) override;

    TerminalLine m_line;
};

} // namespace Host
