// SPDX-License-Identifier: Apache-2.0
#include "host/commands/LevelLine.h"

#include "host/text/DisplayText.h"
#include "host/text/TimeText.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>

namespace Host {
namespace {

constexpr int barWidth = 30;
constexpr double quietest = -60.0;

std::string barText(double level)
{
    const double part = std::clamp(1.0 - level / quietest, 0.0, 1.0);
    const auto filled = static_cast<std::size_t>(std::lround(part * barWidth));
    return std::string(filled, '#') + std::string(barWidth - filled, ' ');
}

std::string levelText(double level)
{
    // Zero has no sign.
    return std::isfinite(level) ? fmt::format("{:.1f}", std::round(level * 10.0) / 10.0 + 0.0) : "-inf";
}

} // namespace

std::string levelLine(const std::string& time, const VUMeter::Object& meter)
{
    const double level = std::max(meter.leftChannelLevel.level(), meter.rightChannelLevel.level());
    const bool isClipping = meter.leftChannelClippingDetected || meter.rightChannelClippingDetected;
    return fmt::format("{}  [{}]  {:>5} dB{}", time, barText(level), levelText(level),
                       isClipping ? "  over" : "");
}

LevelLine::LevelLine(const Playback::Object* playback, const VUMeter::Object* meter, MTime step,
                     std::FILE* stream)
    : m_step(step), m_stream(stream), m_line(stream)
{
    playerObserve(playback);
    meterObserve(meter);
}

LevelLine::~LevelLine()
{
    m_line.keep();
}

void LevelLine::playerChanged(const Playback::Object* playback)
{
    if (playback->state != Playback::Object::Playing) {
        m_line.keep();
    }
}

void LevelLine::meterChanged(const VUMeter::Object* meter, const VUMeter::Object*)
{
    const Playback::Object* const playback = player();
    if (!playback || playback->state != Playback::Object::Playing || !playback->position) {
        return;
    }
    const std::string line = levelLine(timeText(*playback), *meter);
    if (m_line.isTerminal()) {
        m_line.draw(elided(QString::fromStdString(line), m_line.width()));
    } else {
        write(line + '\n');
    }
    if (!m_isWritten) {
        playerChange(playback)->stop();
    }
}

/// As wide as the longest.
std::string LevelLine::timeText(const Playback::Object& playback) const
{
    const MTime longest = playback.boundRange ? playback.boundRange->to : playback.position->position;
    const std::string time = tickText(playback.position->position, m_step, longest);
    return fmt::format("{:>{}}", time, tickText(longest, m_step, longest).size());
}

void LevelLine::write(const std::string& line)
{
    const bool isTaken = std::fputs(line.c_str(), m_stream) >= 0 && std::fflush(m_stream) == 0;
    m_isWritten = m_isWritten && isTaken;
}

} // namespace Host
