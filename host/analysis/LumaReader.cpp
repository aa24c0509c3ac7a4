// SPDX-License-Identifier: Apache-2.0
#include "host/analysis/LumaReader.h"

#include "host/media/MediaInput.h"

extern "C" {
#include <libavcodec/avcodec.h>
#include <libavformat/avformat.h>
#include <libavutil/pixdesc.h>
}

namespace Host {
namespace {

struct FreeContext
{
    void operator()(AVCodecContext* context) const { avcodec_free_context(&context); }
};
struct FreeFrame
{
    void operator()(AVFrame* frame) const { av_frame_free(&frame); }
};
struct FreePacket
{
    void operator()(AVPacket* packet) const { av_packet_free(&packet); }
};

std::unique_ptr<AVCodecContext, FreeContext> opened(const AVStream& stream)
{
    const AVCodec* const codec = avcodec_find_decoder(stream.codecpar->codec_id);
    std::unique_ptr<AVCodecContext, FreeContext> context(avcodec_alloc_context3(codec));
    const bool isOpen = codec && context &&
                        avcodec_parameters_to_context(context.get(), stream.codecpar) >= 0 &&
                        avcodec_open2(context.get(), codec, nullptr) >= 0;
    if (!isOpen) {
        throw MediaError("has a video that cannot be decoded");
    }
    return context;
}

bool isTurned(const AVStream& stream)
{
#if LIBAVFORMAT_VERSION_INT >= AV_VERSION_INT(60, 15, 100)
    return av_packet_side_data_get(stream.codecpar->coded_side_data, stream.codecpar->nb_coded_side_data,
                                   AV_PKT_DATA_DISPLAYMATRIX) != nullptr;
#else
    return av_stream_get_side_data(&stream, AV_PKT_DATA_DISPLAYMATRIX, nullptr) != nullptr;
#endif
}

const AVStream& videoOf(const MediaInput& input, int track)
{
    const bool isThere = track >= 0 && std::size_t(track) < input.streamCount();
    if (!isThere || input.stream(std::size_t(track)).codecpar->codec_type != AVMEDIA_TYPE_VIDEO) {
        throw MediaError(QString("has no video track %1").arg(track));
    }
    const AVStream& stream = input.stream(std::size_t(track));
    if (isTurned(stream)) {
        throw MediaError("has pictures that are to be turned");
    }
    return stream;
}

/// Where the brightness stands in a picture of the format.
const AVComponentDescriptor& lumaOf(int format)
{
    const AVPixFmtDescriptor* const description = av_pix_fmt_desc_get(static_cast<AVPixelFormat>(format));
    constexpr auto unsuitable =
        AV_PIX_FMT_FLAG_RGB | AV_PIX_FMT_FLAG_PAL | AV_PIX_FMT_FLAG_BITSTREAM | AV_PIX_FMT_FLAG_HWACCEL;
    if (!description || (description->flags & unsuitable) != 0 || description->comp[0].depth != 8) {
        throw MediaError("has pictures whose brightness is not stored as bytes");
    }
    return description->comp[0];
}

} // namespace

struct LumaReader::Decoder
{
    Decoder(const QString& path, int track)
        : input(path),
          stream(videoOf(input, track)),
          context(opened(stream)),
          packet(av_packet_alloc()),
          frame(av_frame_alloc())
    {}

    bool next()
    {
        for (;;) {
            const int received = avcodec_receive_frame(context.get(), frame.get());
            if (received >= 0) {
                return true;
            }
            if (received == AVERROR_EOF || isDrained) {
                return false;
            }
            feed();
        }
    }

    /// Gives the decoder one more packet, or the news that there is none.
    void feed()
    {
        while (av_read_frame(&input.context(), packet.get()) >= 0) {
            const bool isOurs = packet->stream_index == stream.index;
            const bool isTaken = isOurs && avcodec_send_packet(context.get(), packet.get()) >= 0;
            av_packet_unref(packet.get());
            if (isTaken) {
                return;
            }
        }
        isDrained = avcodec_send_packet(context.get(), nullptr) < 0;
    }

    MTime time() const
    {
        const std::int64_t first = stream.start_time == AV_NOPTS_VALUE ? 0 : stream.start_time;
        const std::int64_t stamp = frame->best_effort_timestamp;
        return stamp == AV_NOPTS_VALUE
                   ? MTime()
                   : MTime(qint64(av_rescale_q(stamp - first, stream.time_base, AVRational{1, 1000})));
    }

    MediaInput input;
    const AVStream& stream;
    std::unique_ptr<AVCodecContext, FreeContext> context;
    std::unique_ptr<AVPacket, FreePacket> packet;
    std::unique_ptr<AVFrame, FreeFrame> frame;
    bool isDrained = false;
};

LumaReader::LumaReader(const QString& path, int track) : m_decoder(std::make_unique<Decoder>(path, track)) {}

LumaReader::~LumaReader() = default;

bool LumaReader::next(LumaPicture& picture)
{
    if (!m_decoder->next()) {
        return false;
    }
    const AVFrame& frame = *m_decoder->frame;
    const AVComponentDescriptor& luma = lumaOf(frame.format);
    picture.time = m_decoder->time();
    picture.width = frame.width;
    picture.height = frame.height;
    picture.pixels.resize(std::size_t(frame.width) * std::size_t(frame.height));
    auto* target = picture.pixels.data();
    for (int y = 0; y < frame.height; ++y) {
        const unsigned char* source = frame.data[luma.plane] + std::ptrdiff_t(y) * frame.linesize[luma.plane];
        source += luma.offset;
        for (int x = 0; x < frame.width; ++x, source += luma.step) {
            *target++ = *source;
        }
    }
    return true;
}

} // namespace Host
