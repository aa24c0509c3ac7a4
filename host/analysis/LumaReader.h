// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/types/MTime.h>

#include <QString>

#include <memory>
#include <vector>

namespace Host {

class VideoDecoder;

/// The brightness of a picture, row by row from the top.
struct LumaPicture
{
    /// From the start of the video.
    MTime time;
    int width = 0;
    int height = 0;
    std::vector<unsigned char> pixels;

    unsigned char at(int x, int y) const
    {
        return pixels[std::size_t(y) * std::size_t(width) + std::size_t(x)];
    }
};

/// Decodes the pictures of a video one after another with FFmpeg.
class LumaReader
{
public:
    /// `track` is the number of the video's track in the file. Throws MediaError for a file that cannot be
    /// opened, for a track that is no video, and for pictures that are turned or whose brightness isn't
    /// stored as bytes.
    LumaReader(const QString& path, int track);
    ~LumaReader();
    LumaReader(const LumaReader&) = delete;

    /// False behind the last picture. What cannot be decoded is passed over.
    bool next(LumaPicture& picture);

private:
    const std::unique_ptr<VideoDecoder> m_decoder;
};

} // namespace Host
