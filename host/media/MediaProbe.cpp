// SPDX-License-Identifier: Apache-2.0
#include "host/media/MediaProbe.h"

#include "host/media/MediaInput.h"

#include <QDateTime>
#include <QFileInfo>

#include <algorithm>
#include <cmath>
#include <limits>
#include <utility>

extern "C" {
#include <libavcodec/avcodec.h>
#include <libavformat/avformat.h>
#include <libavutil/log.h>
#include <libavutil/pixdesc.h>
}

namespace Host {
namespace {

using VideoTrack = Media::File::Track::Video;
using AudioTrack = Media::File::Track::Audio;

std::string codecName(const AVCodecParameters& codec)
{
    if (codec.codec_id != AV_CODEC_ID_NONE) {
        return avcodec_get_name(codec.codec_id);
    }
    char tag[AV_FOURCC_MAX_STRING_SIZE] = {};
    return codec.codec_tag == 0 ? "unknown" : av_fourcc_make_string(tag, codec.codec_tag);
}

/// The file asks for the picture to be shown lying on its side.
bool hasQuarterTurn(const AVStream& stream)
{
    return std::lround(turnOf(stream) / 90.0) % 2 != 0;
}

bool isStillPicture(const MediaInput& input, const AVStream& stream)
{
    return input.isPictureFormat() ||
           (stream.disposition & (AV_DISPOSITION_ATTACHED_PIC | AV_DISPOSITION_STILL_IMAGE)) != 0;
}

bool isOpaque(int pixelFormat)
{
    const AVPixFmtDescriptor* const format = av_pix_fmt_desc_get(static_cast<AVPixelFormat>(pixelFormat));
    return !format || (format->flags & AV_PIX_FMT_FLAG_ALPHA) == 0;
}

int bitrateOf(const AVCodecParameters& codec)
{
    // MPEG-1 has this highest value, in units of 400 bit/s, for a rate that varies.
    const std::int64_t varies = std::int64_t(0x3ffff) * 400;
    if (codec.codec_id == AV_CODEC_ID_MPEG1VIDEO && codec.bit_rate == varies) {
        return 0;
    }
    const std::int64_t highest = std::numeric_limits<int>::max();
    return static_cast<int>(std::clamp<std::int64_t>(codec.bit_rate, 0, highest));
}

void describeTrack(const AVStream& stream, Media::File::Track& track)
{
    track.index = stream.index;
    track.codecId = codecName(*stream.codecpar);
    track.bitrate = bitrateOf(*stream.codecpar);
}

VideoTrack describeVideo(const MediaInput& input, AVStream& stream)
{
    VideoTrack track;
    describeTrack(stream, track);
    const AVCodecParameters& codec = *stream.codecpar;
    track.isImage = isStillPicture(input, stream);
    track.setOpaque(isOpaque(codec.format));

    const AVRational aspect = av_guess_sample_aspect_ratio(&input.context(), &stream, nullptr);
    track.setGeometry(codec.width, codec.height);
    track.setAspect(aspect.num > 0 && aspect.den > 0 ? aspect.num : 1,
                    aspect.num > 0 && aspect.den > 0 ? aspect.den : 1);
    if (hasQuarterTurn(stream)) {
        std::swap(track.width, track.height);
        std::swap(track.aspectX, track.aspectY);
    }

    const AVRational rate = av_guess_frame_rate(&input.context(), &stream, nullptr);
    const bool hasRate = !track.isImage && rate.num > 0 && rate.den > 0;
    track.setFrameRate(hasRate ? rate.num : 0, hasRate ? rate.den : 1);
    return track;
}

AudioTrack describeAudio(const AVStream& stream)
{
    AudioTrack track;
    describeTrack(stream, track);
    const AVCodecParameters& codec = *stream.codecpar;
    track.setChannelLayout(static_cast<Norvel::Conf::ChannelLayout>(codec.ch_layout.nb_channels));
    track.setSampleRate(codec.sample_rate);
    track.setSampleFormat(static_cast<Norvel::Conf::SampleFormats>(codec.format));
    return track;
}

void describeStream(const MediaInput& input, AVStream& stream, MediaDescription& description)
{
    const AVMediaType kind = stream.codecpar->codec_type;
    if (kind != AVMEDIA_TYPE_VIDEO && kind != AVMEDIA_TYPE_AUDIO) {
        return;
    }
    if (!avcodec_find_decoder(stream.codecpar->codec_id)) {
        std::deque<std::string>& unsupported = description.unsupportedCodecs;
        const std::string name = codecName(*stream.codecpar);
        if (std::find(unsupported.begin(), unsupported.end(), name) == unsupported.end()) {
            unsupported.push_back(name);
        }
    } else if (kind == AVMEDIA_TYPE_VIDEO) {
        description.videoTracks.push_back(describeVideo(input, stream));
    } else {
        description.audioTracks.push_back(describeAudio(stream));
    }
}

void refuseWhatCannotBePlayed(const MediaDescription& description)
{
    if (!description.videoTracks.empty() || !description.audioTracks.empty()) {
        return;
    }
    if (description.unsupportedCodecs.empty()) {
        throw MediaError("holds neither picture nor sound");
    }
    QStringList names;
    for (const std::string& name : description.unsupportedCodecs) {
        names << QString::fromStdString(name);
    }
    throw MediaError("cannot be decoded here: no decoder for " + names.join(", "));
}

/// What the header tells of a damaged file may be nothing.
void refuseDamagedTracks(const MediaDescription& description)
{
    for (const VideoTrack& track : description.videoTracks) {
        if (track.width <= 0 || track.height <= 0) {
            throw MediaError("is damaged or incomplete: a picture without a size");
        }
    }
    for (const AudioTrack& track : description.audioTracks) {
        if (track.sampleRate <= 0 || track.channelLayout <= 0) {
            throw MediaError("is damaged or incomplete: sound without a sample rate");
        }
    }
}

MediaDescription describe(const QString& path)
{
    MediaInput input(path);
    MediaDescription description;
    const QFileInfo info(path);
    description.size = info.size();
    description.lastModified = info.lastModified().toMSecsSinceEpoch();
    description.format = input.format();
    description.length = input.isPictureFormat() ? MTime() : input.length();
    for (std::size_t i = 0; i != input.streamCount(); ++i) {
        describeStream(input, input.stream(i), description);
    }
    refuseWhatCannotBePlayed(description);
    refuseDamagedTracks(description);
    if (!input.reachesItsEnd()) {
        throw MediaError("is cut off: it ends long before its header says");
    }
    return description;
}

} // namespace

MediaResult probeMedia(const QString& path)
{
    try {
        return describe(path);
    } catch (const MediaError& error) {
        return MediaFailure{error.reason};
    }
}

void showMediaLibraryLog(bool show)
{
    av_log_set_level(show ? AV_LOG_INFO : AV_LOG_QUIET);
}

} // namespace Host
