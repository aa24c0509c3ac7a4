// SPDX-License-Identifier: Apache-2.0
#include "host/media/MediaClips.h"

#include "host/commands/Refusal.h"
#include "host/editing/MissingTracks.h"
#include "host/media/FileFacts.h"

#include <QFileInfo>

namespace Host {
namespace {

using Timeline::Clip;
using Timeline::Track;

/// What of a file is to be laid.
struct Parts
{
    bool picture;
    bool sound;
};

QString wholePath(const QString& path)
{
    return path.isEmpty() ? path : absolutePath(path);
}

Parts partsOf(const QString& path, MediaClips::Strategy strategy, Clip::ClipType type)
{
    const bool isKnown = strategy == MediaClips::PictureWithSound || strategy == MediaClips::PictureAlone ||
                         strategy == MediaClips::SoundAlone;
    if (!isKnown) {
        throw Refusal(path, QString("cannot be laid: clips aren't built by strategy %1").arg(strategy));
    }
    if (type != Clip::ClipType() && type != Clip::VideoClip && type != Clip::AudioClip) {
        throw Refusal(path, QString("cannot become a clip of type %1").arg(type));
    }
    const Parts parts = {strategy != MediaClips::SoundAlone && type != Clip::AudioClip,
                         strategy != MediaClips::PictureAlone};
    const bool isContradiction =
        (type == Clip::VideoClip && !parts.picture) || (type == Clip::AudioClip && !parts.sound);
    if (isContradiction) {
        throw Refusal(path, "cannot be laid: the clip would be without what makes its type");
    }
    return parts;
}

EditResult place(EditSession& session, const MediaClips::Clips& clips, const LayingPlace& where)
{
    const Track* const track = where.track ? where.track : trackFor(*session.timeline(), clips.track);
    Placement placement(clips.clip, track, where.level);
    placement.nativeAudio = clips.nativeAudio;
    if (!where.at) {
        return session.append(placement);
    }
    return where.overwrites ? session.overwrite(placement, *where.at) : session.insert(placement, *where.at);
}

} // namespace

const MediaDescriber::Entry& MediaClips::open(const QString& path)
{
    const MediaDescriber::Entry* const found = find(path);
    return found ? *found : m_describer.describe(wholePath(path));
}

const MediaDescriber::Entry* MediaClips::find(const QString& path) const
{
    const QString whole = wholePath(path);
    for (const MediaDescriber::Entry& entry : m_describer.entries()) {
        if (entry.file.isOpened && entry.file.path == whole) {
            return &entry;
        }
    }
    return nullptr;
}

MediaClips::Clips MediaClips::make(const QString& path)
{
    const MediaDescriber::Entry& entry = open(path);
    if (!entry.file.isOpened) {
        throw Refusal(path, entry.reason);
    }
    return make(entry.file);
}

MediaClips::Clips MediaClips::make(const Media::File& file, Strategy strategy, Clip::ClipType type)
{
    const QString& path = file.path;
    const Parts parts = partsOf(path, strategy, type);
    const auto* const video = parts.picture ? movingPicture(file) : nullptr;
    const auto* const audio = parts.sound && !file.audioTracks.empty() ? file.audioTracks.front() : nullptr;
    const bool isSound = audio && !video && type != Clip::VideoClip;
    const auto* const still = parts.picture && !video && !isSound ? stillPicture(file) : nullptr;
    if (!video && !isSound && !still) {
        const bool wantsBoth = parts.picture && parts.sound && type != Clip::VideoClip;
        throw Refusal(path, wantsBoth       ? "has neither picture nor sound"
                            : parts.picture ? "has no picture"
                                            : "has no sound");
    }
    if (still) {
        return {makeStill(file, still->index), PrimaryTrack, nullptr};
    }
    if (!(file.length > MTime())) {
        throw Refusal(path, "does not tell how long it is");
    }
    if (isSound) {
        return {makeClip(file, Clip::AudioClip, audio->index), AudioTrack, nullptr};
    }
    return {makeClip(file, Clip::VideoClip, video->index), PrimaryTrack,
            audio ? makeClip(file, Clip::AudioClip, audio->index) : nullptr};
}

Clip* MediaClips::makeClip(const Media::File& file, Clip::ClipType type, int mediaTrack)
{
    Clip* const clip = m_session.makeClip(type);
    clip->setName(QFileInfo(file.path).fileName())->setFile(&file)->setMediaTrack(mediaTrack);
    clip->setSourceDuration(file.length);
    return clip;
}

Clip* MediaClips::makeStill(const Media::File& file, int mediaTrack)
{
    Clip* const clip = makeClip(file, Clip::VideoClip, mediaTrack);
    clip->setUnlimitedDuration(true)->setSourceDuration(Clip::DEFAULT_IMAGE_CLIP_DURATION);
    return clip;
}

EditResult lay(EditSession& session, const MediaClips::Clips& clips, const LayingPlace& where)
{
    MissingTracks missing(session);
    EditResult result = where.track ? EditResult() : missing.provide(clips.track);
    if (result && clips.nativeAudio) {
        result = missing.provide(NativeAudioTrack);
    }
    if (result) {
        result = place(session, clips, where);
    }
    if (!result) {
        missing.takeBack();
    }
    return result;
}

} // namespace Host
