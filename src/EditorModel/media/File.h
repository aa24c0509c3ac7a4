// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/media/Audio.h>
#include <EditorModel/media/Object.h>
#include <EditorModel/media/Video.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/MTime.h>

#include <QString>
#include <QtGlobal>

#include <deque>
#include <string>

namespace Composition {
struct Object;
}

namespace Media {

/// Defined by whichever module fills it.
class Metadata;

/// What is known of a media file. Whoever opens the file fills it in; the model opens nothing.
///
/// The flags tell its state: none set while it is closed, then the one of opening, opened or failed; nothing
/// enforces that. What the pointers name belongs to whoever made it and must outlive the file's mention of
/// it.
class EDITORMODEL_EXPORT File : public Media::Object, public Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(File)

public:
    /// What the tracks of a file have in common.
    class EDITORMODEL_EXPORT Track : public virtual Serialize::ISerializable
    {
        EDITORMODEL_PERSISTENT(Track)

    public:
        class Audio;
        class Video;

        /// The file that holds the track.
        const Media::File* file = nullptr;
        /// The number of the track within the file.
        int index = 0;
        std::string codecId;
        /// The unit is a matter of whoever opens the file.
        int bitrate = 0;

        Track() = default;
        Track(const Track&) = default;
        Track(Track&&) = default;
        Track& operator=(const Track&) = default;
        Track& operator=(Track&&) = default;
        ~Track() override;
    };

    QString path;
    /// The units of this and of `lastModified` are a matter of whoever opens the file.
    qint64 size = 0;
    /// Not stored.
    qint64 lastModified = 0;
    /// The name of the file's format.
    std::string format;
    MTime length;
    /// Not owned, not stored.
    const Media::Metadata* metadata = nullptr;
    bool isOpening = false;
    bool isOpened = false;
    bool isFailed = false;
    /// Not owned; in the order of adding, whatever the `index` of each.
    std::deque<const Track::Video*> videoTracks;
    /// Not owned; in the order of adding, whatever the `index` of each.
    std::deque<const Track::Audio*> audioTracks;
    /// Not stored.
    std::deque<std::string> unsupportedCodecs;
    /// Not owned, not stored.
    const Composition::Object* composition = nullptr;

    File() = default;
    File(const File&) = default;
    File(File&&) = default;
    File& operator=(const File&) = default;
    File& operator=(File&&) = default;
    ~File() override;

    File* setPath(const QString& newPath);
    File* setSize(long long newSize);
    File* setLastModified(long long time);
    File* setFormat(std::string name);
    File* setLength(MTime newLength);
    File* setMetadata(const Media::Metadata* newMetadata);
    File* setOpening(bool on);
    File* setOpened(bool on);
    File* setFailed(bool on);
    File* setUnsupportedCodecs(std::deque<std::string> codecs);
    File* setComposition(const Composition::Object* newComposition);

    /// Appends the track, also one that is listed already.
    File* addTrack(const Track::Video* track);
    File* addTrack(const Track::Audio* track);
    /// Lets go of all tracks; `unsupportedCodecs` stays.
    File* clearTracks();
    /// Gives every field its default, the path included.
    File* toDefaults();
};

class EDITORMODEL_EXPORT File::Track::Audio : public Media::File::Track, public Media::Audio
{
    EDITORMODEL_PERSISTENT(Audio)

public:
    Audio() = default;
    Audio(const Audio&) = default;
    Audio(Audio&&) = default;
    Audio& operator=(const Audio&) = default;
    Audio& operator=(Audio&&) = default;
    ~Audio() override;
};

class EDITORMODEL_EXPORT File::Track::Video : public Media::File::Track, public Media::Video
{
    EDITORMODEL_PERSISTENT(Video)

public:
    /// The track is a still picture.
    bool isImage = false;

    Video() = default;
    Video(const Video&) = default;
    Video(Video&&) = default;
    Video& operator=(const Video&) = default;
    Video& operator=(Video&&) = default;
    ~Video() override;
};

} // namespace Media

EDITORMODEL_ARCHIVE_NAME(Media::File, "File")
EDITORMODEL_ARCHIVE_NAME(Media::File::Track, "Track")
EDITORMODEL_ARCHIVE_NAME(Media::File::Track::Audio, "AudioTrack")
EDITORMODEL_ARCHIVE_NAME(Media::File::Track::Video, "VideoTrack")
