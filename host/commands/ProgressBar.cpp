// SPDX-License-Identifier: Apache-2.0
#include "host/commands/ProgressBar.h"

#include "host/text/DisplayText.h"

#include <fmt/format.h>

#include <algorithm>

namespace Host {
namespace {

constexpr int barWidth = 20;

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

ProgressBar::ProgressBar(const Report::Progress* progress, std::FILE* stream) : m_line(stream)
{
    observe(progress);
}

ProgressBar::~ProgressBar()
{
    m_line.wipe();
}

void ProgressBar::changed(const Report::Progress* progress)
{
    if (m_line.isTerminal()) {
        m_line.draw(progressLine(*progress, m_line.width()));
    }
}

void ProgressBar::removed(const Report::Progress*)
{
    m_line.wipe();
}

} // namespace Host
