// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/analysis/VideoDecoder.h"

#include <QImage>
#include <QSize>

namespace Host {

/// Takes single pictures out of a video, or out of a file with one picture.
class PictureReader
{
public:
    /// As VideoDecoder.
    PictureReader(const QString& path, int track) : m_decoder(path, track) {}

    /// What is shown at a time from the start of the video: before the first picture the first, behind the
    /// last the last. Turned as the file asks for, and scaled to the size, whatever its own shape. Null where
    /// nothing can be decoded. Times that grow are the quickest.
    QImage at(MTime time, const QSize& size);

private:
    /// The decoder has come to a picture that isn't shown yet.
    bool hasNext();
    QImage converted(const AVFrame& frame, const QSize& size) const;

    struct FreeFrame
    {
        void operator()(AVFrame* frame) const;
    };

    VideoDecoder m_decoder;
    bool m_isAhead = false;
    std::unique_ptr<AVFrame, FreeFrame> m_shown;
    MTime m_shownAt;
};

} // namespace Host
