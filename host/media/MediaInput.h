// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/types/MTime.h>

#include <QString>

#include <cstdint>
#include <memory>
#include <stdexcept>

struct AVFormatContext;
struct AVIOContext;
struct AVStream;

namespace Host {

/// Why a file could not be opened; the reason is one line that completes "The file ...".
class MediaError : public std::runtime_error
{
public:
    explicit MediaError(const QString& why);

    const QString reason;
};

/// Throws MediaError for what is no regular file with something in it: opening a pipe or a device could wait
/// forever.
void requireFile(const QString& path);

/// A media file opened with FFmpeg, with the formats of its streams known. Nothing is read over a network,
/// also not where the file is a playlist.
class MediaInput
{
public:
    /// Throws MediaError.
    explicit MediaInput(const QString& path);

    AVFormatContext& context() const { return *m_context; }
    /// The streams follow one another as in the file.
    std::size_t streamCount() const;
    AVStream& stream(std::size_t index) const;

    /// FFmpeg's name of the format.
    std::string format() const;
    /// The longest stream's length; zero where the file doesn't tell.
    MTime length() const;
    /// The format holds single pictures.
    bool isPictureFormat() const;
    /// False if the file stops more than a second and a tenth of its length before the end that its header
    /// tells. Moves the place of reading.
    bool reachesItsEnd();

private:
    struct CloseFile
    {
        void operator()(AVIOContext* file) const;
    };
    struct CloseContext
    {
        void operator()(AVFormatContext* context) const;
    };

    bool holdsDataFrom(std::int64_t avTime);

    std::unique_ptr<AVIOContext, CloseFile> m_file;
    std::unique_ptr<AVFormatContext, CloseContext> m_context;
};

/// How a stream's pictures are to be turned for show, in degrees to the left; 0 where the file doesn't tell.
double turnOf(const AVStream& stream);

} // namespace Host
