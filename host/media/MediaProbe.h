// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/media/File.h>
#include <EditorModel/types/MTime.h>

#include <QString>
#include <QtGlobal>

#include <deque>
#include <string>
#include <variant>

namespace Host {

/// What a media file turned out to be.
struct MediaDescription
{
    /// In bytes.
    qint64 size = 0;
    /// In milliseconds since 1970, UTC.
    qint64 lastModified = 0;
    /// FFmpeg's name of the format; it may list several, with commas between.
    std::string format;
    /// Zero for pictures.
    MTime length;
    /// Both in the order of the file. `file` is null, and `index` counts the streams of every kind.
    std::deque<Media::File::Track::Video> videoTracks;
    std::deque<Media::File::Track::Audio> audioTracks;
    /// The codecs of video and sound that FFmpeg cannot decode here, each once. Their tracks are not listed.
    std::deque<std::string> unsupportedCodecs;
};

/// Why a file could not be opened: one line that completes the sentence "The file ...".
struct MediaFailure
{
    QString reason;
};

using MediaResult = std::variant<MediaDescription, MediaFailure>;

/// Reads the description of a file with FFmpeg's libraries, without decoding it. How the fields of a track
/// are filled:
/// - `bitrate` is in bits per second, 0 where the file doesn't tell.
/// - `channelLayout` is the number of channels, `sampleFormat` the number of FFmpeg's sample format.
/// - `width`, `height` and the pixel aspect are those of the picture as it is shown: where the file asks for
///   a quarter turn they are exchanged.
/// - Still pictures and cover art have `isImage` set, and the frame rate 0/1.
/// - `opaque` is false where the pixels have an alpha channel.
///
/// A file that ends long before its header says so counts as failed: more than a second and a tenth of the
/// length. Where the format has no index, finding out takes a walk through the file.
MediaResult probeMedia(const QString& path);

/// What FFmpeg's libraries say while they work goes to the error output, or nowhere. Holds for the process.
void showMediaLibraryLog(bool show);

} // namespace Host
