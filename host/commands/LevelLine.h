// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/TerminalLine.h"
#include "host/playback/PlaybackViews.h"

#include <EditorModel/types/MTime.h>

#include <cstdio>
#include <string>

namespace Host {

/// How loud it is at a time, as a bar from -60 to 0 dB and as a number: "0:01.5  [###     ]   -6.0 dB". Of
/// the two channels it is the louder. A level that clips has "over" behind it. The line has no line end.
std::string levelLine(const std::string& time, const VUMeter::Object& meter);

/// The module that writes the levels of a meter while a playback plays, with the time of its position: on one
/// line of a terminal, and a line each time anywhere else. When the playback stops, the last line stays on
/// the terminal.
class LevelLine : private PlayerViewBase, private MeterViewBase
{
public:
    /// The times are multiples of `step`. Both are observed until they are removed; the stream outlives this.
    LevelLine(const Playback::Object* playback, const VUMeter::Object* meter, MTime step, std::FILE* stream);
    LevelLine(const LevelLine&) = delete;
    ~LevelLine() override;

    /// All that was to be written is written. The playback is stopped where it isn't.
    bool isWritten() const { return m_isWritten; }

private:
    using PlayerViewBase::playerChanged;
    void playerChanged(const Playback::Object* playback) override;
    using MeterViewBase::meterChanged;
    void meterChanged(const VUMeter::Object* meter, const VUMeter::Object* oldValue) override;

    std::string timeText(const Playback::Object& playback) const;
    void write(const std::string& line);

    const MTime m_step;
    std::FILE* const m_stream;
    TerminalLine m_line;
    bool m_isWritten = true;
};

} // namespace Host
