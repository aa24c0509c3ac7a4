// SPDX-License-Identifier: Apache-2.0
#include "host/media/MediaOpener.h"

#include "host/media/OpeningFailed.h"

#include <algorithm>
#include <utility>
#include <variant>

namespace Host {

struct MediaOpener::Tracks
{
    std::deque<Media::File::Track::Video> videos;
    std::deque<Media::File::Track::Audio> audios;

    bool areIn(const Media::File& file) const
    {
        return anyIn(videos, file.videoTracks) || anyIn(audios, file.audioTracks);
    }

private:
    template <class Track>
    static bool anyIn(const std::deque<Track>& tracks, const std::deque<const Track*>& listed)
    {
        return std::any_of(tracks.begin(), tracks.end(), [&listed](const Track& track) {
            return std::find(listed.begin(), listed.end(), &track) != listed.end();
        });
    }
};

/// One request that is being answered. When the outermost one ends no message is left that could name old
/// tracks.
class MediaOpener::Request
{
public:
    explicit Request(MediaOpener& opener) : m_opener(opener) { ++m_opener.m_requests; }
    Request(const Request&) = delete;
    Request& operator=(const Request&) = delete;
    ~Request()
    {
        if (--m_opener.m_requests == 0) {
            m_opener.m_retired.clear();
        }
    }

private:
    MediaOpener& m_opener;
};

MediaOpener::MediaOpener()
{
    processAddRequests();
}

MediaOpener::~MediaOpener() = default;

void MediaOpener::take(Media::File* file)
{
    own(file);
}

void MediaOpener::open(const Media::File* file, const QString& path)
{
    const Request request(*this);
    change(file)->toDefaults()->setPath(path)->setOpening(true);
    answer(file);
}

void MediaOpener::addRequested(Media::File* file)
{
    if (!file->isOpening) {
        View::addRequested(file);
    }
}

void MediaOpener::changeRequested(Media::File* file, Media::File* value)
{
    const Request request(*this);
    // The answer comes after it, not from a callback in it, so that all hear of the two changes in their
    // order.
    View::changeRequested(file, value);
    answer(file);
}

void MediaOpener::removeRequested(Media::File* file)
{
    const Request request(*this);
    View::removeRequested(file);
}

void MediaOpener::changed(const Media::File* file)
{
    const auto kept = m_tracks.find(file);
    if (kept != m_tracks.end() && !kept->second->areIn(*file)) {
        retireTracks(file);
    }
}

void MediaOpener::removed(const Media::File* file)
{
    retireTracks(file);
}

bool MediaOpener::isStillOpening(const Media::File* file) const
{
    return isOwned(file) && file->isOpening;
}

void MediaOpener::answer(const Media::File* file)
{
    if (!isStillOpening(file)) {
        return;
    }
    MediaResult result = probeMedia(file->path);
    if (const auto* const failure = std::get_if<MediaFailure>(&result)) {
        fail(file, failure->reason);
    } else {
        succeed(file, std::get<MediaDescription>(std::move(result)));
    }
}

void MediaOpener::fail(const Media::File* file, const QString& reason)
{
    PubSub::publish(OpeningFailed(file, reason));
    if (isStillOpening(file)) {
        change(file)->setOpening(false)->setFailed(true);
    }
}

void MediaOpener::succeed(const Media::File* file, MediaDescription description)
{
    retireTracks(file);
    Tracks& tracks = *(m_tracks[file] = std::make_unique<Tracks>());
    tracks.videos = std::move(description.videoTracks);
    tracks.audios = std::move(description.audioTracks);

    auto opened = change(file);
    opened->setOpening(false)->setOpened(true)->clearTracks();
    opened->setSize(description.size)->setLastModified(description.lastModified);
    opened->setFormat(std::move(description.format))->setLength(description.length);
    opened->setUnsupportedCodecs(std::move(description.unsupportedCodecs));
    for (Media::File::Track::Video& track : tracks.videos) {
        track.file = file;
        opened->addTrack(&track);
    }
    for (Media::File::Track::Audio& track : tracks.audios) {
        track.file = file;
        opened->addTrack(&track);
    }
}

void MediaOpener::retireTracks(const Media::File* file)
{
    const auto kept = m_tracks.find(file);
    if (kept != m_tracks.end()) {
        m_retired.push_back(std::move(kept->second));
        m_tracks.erase(kept);
    }
}

} // namespace Host
