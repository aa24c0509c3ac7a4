// SPDX-License-Identifier: Apache-2.0
#include "host/analysis/VideoDecoder.h"

extern "C" {
#include <libavcodec/avcodec.h>
#include <libavformat/avformat.h>
}

namespace Host {
namespace {

const AVStream& videoOf(const MediaInput& input, int track)
{
    const bool isThere = track >= 0 && std::size_t(track) < input.streamCount();
    if (!isThere || input.stream(std::size_t(track)).codecpar->codec_type != AVMEDIA_TYPE_VIDEO) {
        throw MediaError(QString("has no video track %1").arg(track));
    }
    return input.stream(std::size_t(track));
}

std::int64_t startOf(const AVStream& stream)
{
    return stream.start_time == AV_NOPTS_VALUE ? 0 : stream.start_time;
}

constexpr AVRational milliseconds = {1, 1000};

} // namespace

void VideoDecoder::Free::operator()(AVCodecContext* context) const
{
    avcodec_free_context(&context);
}

void VideoDecoder::Free::operator()(AVFrame* frame) const
{
    av_frame_free(&frame);
}

void VideoDecoder::Free::operator()(AVPacket* packet) const
{
    av_packet_free(&packet);
}

VideoDecoder::VideoDecoder(const QString& path, int track)
    : m_input(path), m_stream(videoOf(m_input, track)), m_packet(av_packet_alloc()), m_frame(av_frame_alloc())
{
    const AVCodec* const codec = avcodec_find_decoder(m_stream.codecpar->codec_id);
    m_context.reset(avcodec_alloc_context3(codec));
    const bool isOpen = codec && m_context &&
                        avcodec_parameters_to_context(m_context.get(), m_stream.codecpar) >= 0 &&
                        avcodec_open2(m_context.get(), codec, nullptr) >= 0;
    if (!isOpen) {
        throw MediaError("has a video that cannot be decoded");
    }
}

VideoDecoder::~VideoDecoder() = default;

bool VideoDecoder::next()
{
    for (;;) {
        const int received = avcodec_receive_frame(m_context.get(), m_frame.get());
        if (received >= 0) {
            return true;
        }
        if (received == AVERROR_EOF || m_isDrained) {
            return false;
        }
        feed();
    }
}

/// Gives the decoder one more packet, or the news that there is none.
void VideoDecoder::feed()
{
    while (av_read_frame(&m_input.context(), m_packet.get()) >= 0) {
        const bool isOurs = m_packet->stream_index == m_stream.index;
        const bool isTaken = isOurs && avcodec_send_packet(m_context.get(), m_packet.get()) >= 0;
        av_packet_unref(m_packet.get());
        if (isTaken) {
            return;
        }
    }
    m_isDrained = avcodec_send_packet(m_context.get(), nullptr) < 0;
}

MTime VideoDecoder::time() const
{
    const std::int64_t stamp = m_frame->best_effort_timestamp;
    return stamp == AV_NOPTS_VALUE
               ? MTime()
               : MTime(qint64(av_rescale_q(stamp - startOf(m_stream), m_stream.time_base, milliseconds)));
}

void VideoDecoder::seek(MTime time)
{
    const std::int64_t stamp = startOf(m_stream) + av_rescale_q(time.ms(), milliseconds, m_stream.time_base);
    av_seek_frame(&m_input.context(), m_stream.index, stamp, AVSEEK_FLAG_BACKWARD);
    avcodec_flush_buffers(m_context.get());
    m_isDrained = false;
}

double VideoDecoder::turn() const
{
    return turnOf(m_stream);
}

} // namespace Host
