// SPDX-License-Identifier: Apache-2.0
#include "host/media/MediaClips.h"

#include "host/commands/Refusal.h"

#include <QFileInfo>

#include <algorithm>

namespace Host {
namespace {

using Timeline::Clip;

/// Null unless the file has a track of moving pictures; cover art is none.
const Media::File::Track::Video* movingPicture(const Media::File& file)
{
    const auto found = std::find_if(file.videoTracks.begin(), file.videoTracks.end(),
                                    [](const auto* track) { return !track->isImage; });
    return found == file.videoTracks.end() ? nullptr : *found;
}

/// Sound that stands alone takes the audio track that is not linked to the picture.
const Timeline::Track* trackOf(const Timeline::Object& timeline, TrackType type)
{
    const Timeline::Track* const detached = type == AudioTrack ? timeline.detachedAudioTrack() : nullptr;
    return detached ? detached : timeline.findFirstTrack(type);
}

EditResult provideTrack(EditSession& session, TrackType type)
{
    if (trackOf(*session.timeline(), type)) {
        return {};
    }
    return session.addTrack(session.makeTrack(type));
}

} // namespace

MediaClips::Clips MediaClips::make(const QString& path)
{
    // A project is to find its media from any folder.
    const QString place = path.isEmpty() ? path : QFileInfo(path).absoluteFilePath();
    const MediaDescriber::Entry& entry = m_describer.describe(place);
    const Media::File& file = entry.file;
    if (!file.isOpened) {
        throw Refusal(path, entry.reason);
    }
    const auto* const video = movingPicture(file);
    const auto* const audio = file.audioTracks.empty() ? nullptr : file.audioTracks.front();
    if ((video || audio) && !(file.length > MTime())) {
        throw Refusal(path, "does not tell how long it is");
    }
    if (video) {
        return {makeClip(file, Clip::VideoClip, video->index), PrimaryTrack,
                audio ? makeClip(file, Clip::AudioClip, audio->index) : nullptr};
    }
    if (audio) {
        return {makeClip(file, Clip::AudioClip, audio->index), AudioTrack, nullptr};
    }
    if (file.videoTracks.empty()) {
        throw Refusal(path, "has neither picture nor sound");
    }
    Clip* const picture = makeClip(file, Clip::VideoClip, file.videoTracks.front()->index);
    picture->setUnlimitedDuration(true)->setSourceDuration(Clip::DEFAULT_IMAGE_CLIP_DURATION);
    return {picture, PrimaryTrack, nullptr};
}

Clip* MediaClips::makeClip(const Media::File& file, Clip::ClipType type, int mediaTrack)
{
    Clip* const clip = m_session.makeClip(type);
    clip->setName(QFileInfo(file.path).fileName())->setFile(&file)->setMediaTrack(mediaTrack);
    clip->setSourceDuration(file.length);
    return clip;
}

EditResult lay(EditSession& session, const MediaClips::Clips& clips, const MTime* at)
{
    EditResult provided = provideTrack(session, clips.track);
    if (provided && clips.nativeAudio) {
        provided = provideTrack(session, NativeAudioTrack);
    }
    if (!provided) {
        return provided;
    }
    Placement placement(clips.clip, trackOf(*session.timeline(), clips.track));
    placement.nativeAudio = clips.nativeAudio;
    return at ? session.insert(placement, *at) : session.append(placement);
}

} // namespace Host
