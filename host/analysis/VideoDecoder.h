// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/media/MediaInput.h"

#include <EditorModel/types/MTime.h>

#include <QString>

#include <memory>

struct AVCodecContext;
struct AVFrame;
struct AVPacket;

namespace Host {

/// Decodes the pictures of a video one after another with FFmpeg.
class VideoDecoder
{
public:
    /// `track` is the number of the video's track in the file. Throws MediaError for a file that cannot be
    /// opened, and for a track that is no video.
    VideoDecoder(const QString& path, int track);
    ~VideoDecoder();
    VideoDecoder(const VideoDecoder&) = delete;

    /// False behind the last picture. What cannot be decoded is passed over.
    bool next();
    /// Of the last picture that next() came to.
    const AVFrame& frame() const { return *m_frame; }
    /// Its time, from the start of the video.
    MTime time() const;

    /// The next picture is one at or before the time from which decoding can begin, as far as the file knows.
    void seek(MTime time);

    const AVStream& stream() const { return m_stream; }
    /// How the pictures are to be turned for show, in degrees to the left.
    double turn() const;

private:
    void feed();

    struct Free
    {
        void operator()(AVCodecContext* context) const;
        void operator()(AVFrame* frame) const;
        void operator()(AVPacket* packet) const;
    };

    MediaInput m_input;
    const AVStream& m_stream;
    std::unique_ptr<AVCodecContext, Free> m_context;
    std::unique_ptr<AVPacket, Free> m_packet;
    std::unique_ptr<AVFrame, Free> m_frame;
    bool m_isDrained = false;
};

} // namespace Host
