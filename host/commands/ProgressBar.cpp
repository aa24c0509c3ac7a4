// SPDX-License-Identifier: Apache-2.0
#include "host/commands/ProgressBar.h"

#include "host/text/DisplayText.h"

#include <fmt/format.h>

#include <algorithm>

#include <sys/ioctl.h>
#include <unistd.h>

namespace Host {
namespace {

constexpr int barWidth = 20;

int columnsOf(std::FILE* terminal)
{
    winsize size = {};
    return ioctl(fileno(terminal), TIOCGWINSZ, &size) == 0 && size.ws_col > 0 ? size.ws_col : 80;
}

} // namespace

std::string progressLine(const Report::Progress& progress, int width)
{
    const int total = std::max(progress.total, 0);
    const int passed = std::clamp(progress.passed, 0, total);
    const auto filled = static_cast<int>(total == 0 ? 0 : static_cast<qint64>(barWidth) * passed / total);
    const std::string bar =
        fmt::format("[{}{}]  {:>{}}/{}  ", std::string(static_cast<std::size_t>(filled), '#'),
                    std::string(static_cast<std::size_t>(barWidth - filled), ' '), passed,
                    std::to_string(total).size(), total);
    const int room = width - displayWidth(bar);
    return room > 0 ? bar + elided(progress.label, room) : elided(QString::fromStdString(bar), width);
}

ProgressBar::ProgressBar(const Report::Progress* progress, std::FILE* stream)
    : m_stream(stream), m_isTerminal(isatty(fileno(stream)) == 1)
{
    observe(progress);
}

ProgressBar::~ProgressBar()
{
    wipe();
}

void ProgressBar::changed(const Report::Progress* progress)
{
    if (!m_isTerminal) {
        return;
    }
    wipe();
    // The last column stays free: some terminals go on to the next line when it is filled.
    std::fputs(progressLine(*progress, columnsOf(m_stream) - 1).c_str(), m_stream);
    std::fflush(m_stream);
    m_isDrawn = true;
}

void ProgressBar::removed(const Report::Progress*)
{
    wipe();
}

void ProgressBar::wipe()
{
    if (m_isDrawn) {
        std::fputs("\r\x1b[K", m_stream);
        std::fflush(m_stream);
        m_isDrawn = false;
    }
}

} // namespace Host
