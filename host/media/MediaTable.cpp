// SPDX-License-Identifier: Apache-2.0
#include "host/media/MediaTable.h"

#include "host/media/MediaText.h"
#include "host/text/DisplayText.h"
#include "host/text/Table.h"

#include <fmt/format.h>

#include <algorithm>
#include <utility>
#include <vector>

namespace Host {
namespace {

using Row = std::vector<std::string>;

std::string codecText(const Media::File::Track& track)
{
    return printable(QString::fromStdString(track.codecId));
}

Row trackRow(const Media::File::Track::Video& track)
{
    return {fmt::format("  #{}", track.index),
            track.isImage ? "picture" : "video",
            codecText(track),
            fmt::format("{} x {}", track.width, track.height),
            frameRateText(track.frameRateN, track.frameRateD),
            aspectText(track),
            bitrateText(track.bitrate)};
}

Row trackRow(const Media::File::Track::Audio& track)
{
    return {fmt::format("  #{}", track.index),
            "audio",
            codecText(track),
            fmt::format("{} Hz", track.sampleRate),
            channelsText(track.channelLayout),
            sampleFormatText(track.sampleFormat),
            bitrateText(track.bitrate)};
}

/// The rows of both kinds of track, by the number of the track within the file.
std::vector<Row> trackRows(const Media::File& file)
{
    std::vector<std::pair<int, Row>> numbered;
    for (const auto* track : file.videoTracks) {
        if (track) {
            numbered.emplace_back(track->index, trackRow(*track));
        }
    }
    for (const auto* track : file.audioTracks) {
        if (track) {
            numbered.emplace_back(track->index, trackRow(*track));
        }
    }
    std::stable_sort(numbered.begin(), numbered.end(),
                     [](const auto& a, const auto& b) { return a.first < b.first; });
    std::vector<Row> rows;
    rows.reserve(numbered.size());
    for (auto& entry : numbered) {
        rows.push_back(std::move(entry.second));
    }
    return rows;
}

Row fileRow(const Media::File& file)
{
    return {printable(file.path), formatText(file), file.length == MTime() ? "-" : lengthText(file.length),
            sizeText(file.size)};
}

} // namespace

std::string mediaTable(const std::deque<const Media::File*>& files)
{
    Table fileTable({Table::Left, Table::Left, Table::Right, Table::Right});
    Table trackTable(
        {Table::Left, Table::Left, Table::Left, Table::Right, Table::Right, Table::Right, Table::Right});
    std::vector<std::size_t> trackCounts;
    fileTable.addRow({"File", "Format", "Length", "Size"});
    for (const Media::File* file : files) {
        fileTable.addRow(fileRow(*file));
        const std::vector<Row> rows = trackRows(*file);
        trackCounts.push_back(rows.size());
        for (const Row& row : rows) {
            trackTable.addRow(row);
        }
    }

    const std::vector<std::string> fileLines = fileTable.lines();
    const std::vector<std::string> trackLines = trackTable.lines();
    std::string text = fileLines.front() + '\n';
    auto track = trackLines.begin();
    for (std::size_t i = 0; i != trackCounts.size(); ++i) {
        text += fileLines[i + 1] + '\n';
        for (std::size_t n = 0; n != trackCounts[i]; ++n) {
            text += *track++ + '\n';
        }
    }
    return text;
}

} // namespace Host
