// SPDX-License-Identifier: Apache-2.0
#include "host/analysis/LumaReader.h"

#include "host/analysis/VideoDecoder.h"

extern "C" {
#include <libavutil/frame.h>
#include <libavutil/pixdesc.h>
}

namespace Host {
namespace {

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

LumaReader::LumaReader(const QString& path, int track)
    : m_decoder(std::make_unique<VideoDecoder>(path, track))
{
    if (m_decoder->turn() != 0.0) {
        throw MediaError("has pictures that are to be turned");
    }
}

LumaReader::~LumaReader() = default;

bool LumaReader::next(LumaPicture& picture)
{
    if (!m_decoder->next()) {
        return false;
    }
    const AVFrame& frame = m_decoder->frame();
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
