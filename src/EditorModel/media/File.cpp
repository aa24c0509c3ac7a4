// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/File.h>

#include <EditorModel/persistence/Fields.h>

#include <utility>

namespace Media {

File::~File() = default;
File::Track::~Track() = default;
File::Track::Audio::~Audio() = default;
File::Track::Video::~Video() = default;

File* File::setPath(const QString& newPath)
{
    path = newPath;
    return this;
}

File* File::setSize(long long newSize)
{
    size = newSize;
    return this;
}

File* File::setLastModified(long long time)
{
    lastModified = time;
    return this;
}

File* File::setFormat(std::string name)
{
    format = std::move(name);
    return this;
}

File* File::setLength(MTime newLength)
{
    length = newLength;
    return this;
}

File* File::setMetadata(const Media::Metadata* newMetadata)
{
    metadata = newMetadata;
    return this;
}

File* File::setOpening(bool on)
{
    isOpening = on;
    return this;
}

File* File::setOpened(bool on)
{
    isOpened = on;
    return this;
}

File* File::setFailed(bool on)
{
    isFailed = on;
    return this;
}

File* File::setUnsupportedCodecs(std::deque<std::string> codecs)
{
    unsupportedCodecs = std::move(codecs);
    return this;
}

File* File::setComposition(const Composition::Object* newComposition)
{
    composition = newComposition;
    return this;
}

File* File::addTrack(const Track::Video* track)
{
    videoTracks.push_back(track);
    return this;
}

File* File::addTrack(const Track::Audio* track)
{
    audioTracks.push_back(track);
    return this;
}

File* File::clearTracks()
{
    videoTracks.clear();
    audioTracks.clear();
    return this;
}

File* File::toDefaults()
{
    *this = File();
    return this;
}

void fields(Serialize::Fields& f, File& file)
{
    f("path", file.path)("size", file.size)("format", file.format)("length", file.length);
    f("isOpening", file.isOpening)("isOpened", file.isOpened)("isFailed", file.isFailed);
    f("videoTracks", file.videoTracks)("audioTracks", file.audioTracks);
}

void fields(Serialize::Fields& f, File::Track& track)
{
    f.soft("file", track.file)("index", track.index)("codecId", track.codecId)("bitrate", track.bitrate);
}

void fields(Serialize::Fields& f, File::Track::Audio& track)
{
    f.base<Media::Audio>("Audio", track).base<Media::File::Track>("Track", track);
}

void fields(Serialize::Fields& f, File::Track::Video& track)
{
    f.base<Media::Video>("Video", track).base<Media::File::Track>("Track", track)("isImage", track.isImage);
}

} // namespace Media

EDITORMODEL_PERSISTENT_CLASS(Media::File)
EDITORMODEL_PERSISTENT_CLASS(Media::File::Track)
EDITORMODEL_PERSISTENT_CLASS(Media::File::Track::Audio, Media::Audio, Media::File::Track)
EDITORMODEL_PERSISTENT_CLASS(Media::File::Track::Video, Media::Video, Media::File::Track)
