// SPDX-License-Identifier: Apache-2.0
#include "host/media/MediaJson.h"

#include "host/media/MediaText.h"

#include <nlohmann/json.hpp>

namespace Host {
namespace {

using Json = nlohmann::ordered_json;

Json trackJson(const Media::File::Track& track)
{
    return {{"index", track.index}, {"codec", track.codecId}, {"bitrate", track.bitrate}};
}

Json trackJson(const Media::File::Track::Video& track)
{
    Json json = trackJson(static_cast<const Media::File::Track&>(track));
    json["isImage"] = track.isImage;
    json["width"] = track.width;
    json["height"] = track.height;
    json["frameRate"] = {track.frameRateN, track.frameRateD};
    json["pixelAspect"] = {track.aspectX, track.aspectY};
    json["opaque"] = track.opaque;
    return json;
}

Json trackJson(const Media::File::Track::Audio& track)
{
    Json json = trackJson(static_cast<const Media::File::Track&>(track));
    json["channels"] = static_cast<int>(track.channelLayout);
    json["sampleRate"] = track.sampleRate;
    json["sampleFormat"] = sampleFormatText(track.sampleFormat);
    return json;
}

template <class Tracks>
Json trackArray(const Tracks& tracks)
{
    Json array = Json::array();
    for (const auto* track : tracks) {
        array.push_back(trackJson(*track));
    }
    return array;
}

Json fileJson(const Media::File& file)
{
    return {{"path", file.path.toStdString()},
            {"format", file.format},
            {"size", file.size},
            {"lastModified", file.lastModified},
            {"length", file.length.ms()},
            {"videoTracks", trackArray(file.videoTracks)},
            {"audioTracks", trackArray(file.audioTracks)},
            {"unsupportedCodecs", file.unsupportedCodecs}};
}

} // namespace

std::string mediaJson(const std::deque<MediaDescriber::Entry>& entries)
{
    Json array = Json::array();
    for (const MediaDescriber::Entry& entry : entries) {
        if (entry.file.isOpened) {
            array.push_back(fileJson(entry.file));
        } else {
            array.push_back({{"path", entry.file.path.toStdString()}, {"error", entry.reason.toStdString()}});
        }
    }
    // Names inside a file may be in any encoding.
    return array.dump(2, ' ', false, Json::error_handler_t::replace) + '\n';
}

} // namespace Host
