// SPDX-License-Identifier: Apache-2.0
#include "host/analysis/PictureReader.h"

#include <QTransform>

#include <cmath>

extern "C" {
#include <libavutil/frame.h>
#include <libswscale/swscale.h>
}

namespace Host {
namespace {

/// Nearer pictures are come to without a jump.
constexpr MTime nearby = 2000;

struct FreeScaler
{
    void operator()(SwsContext* scaler) const { sws_freeContext(scaler); }
};

} // namespace

void PictureReader::FreeFrame::operator()(AVFrame* frame) const
{
    av_frame_free(&frame);
}

QImage PictureReader::at(MTime time, const QSize& size)
{
    if (m_shown && (time < m_shownAt || time - m_shownAt > nearby)) {
        m_decoder.seek(time);
        m_shown.reset();
        m_isAhead = false;
    }
    while (hasNext() && (!m_shown || m_decoder.time() <= time)) {
        m_shown.reset(av_frame_clone(&m_decoder.frame()));
        m_shownAt = m_decoder.time();
        m_isAhead = false;
    }
    return m_shown ? converted(*m_shown, size) : QImage();
}

bool PictureReader::hasNext()
{
    m_isAhead = m_isAhead || m_decoder.next();
    return m_isAhead;
}

QImage PictureReader::converted(const AVFrame& frame, const QSize& size) const
{
    const double turn = m_decoder.turn();
    const bool isOnItsSide = std::lround(turn / 90.0) % 2 != 0;
    QImage image(isOnItsSide ? size.transposed() : size, QImage::Format_ARGB32);
    const std::unique_ptr<SwsContext, FreeScaler> scaler(
        sws_getContext(frame.width, frame.height, static_cast<AVPixelFormat>(frame.format), image.width(),
                       image.height(), AV_PIX_FMT_RGB32, SWS_AREA, nullptr, nullptr, nullptr));
    if (!scaler || image.isNull()) {
        return {};
    }
    std::uint8_t* const rows[] = {image.bits(), nullptr, nullptr, nullptr};
    const int strides[] = {int(image.bytesPerLine()), 0, 0, 0};
    sws_scale(scaler.get(), frame.data, frame.linesize, 0, frame.height, rows, strides);
    return turn == 0.0 ? image : image.transformed(QTransform().rotate(-turn));
}

} // namespace Host
