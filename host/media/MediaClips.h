// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/editing/EditSession.h"
#include "host/media/MediaDescriber.h"

#include <EditorModel/timeline/ClipBuildingStrategy.h>

#include <optional>

namespace Host {

/// Makes clips of media files for a session. Whichever module opens files does so for it; they stay open as
/// long as this lives.
class MediaClips
{
public:
    using Strategy = Timeline::ClipBuildingStrategy;

    /// What of a file is laid. Other strategies are refused.
    /// The picture, and the sound below it as native audio. A file without the one has the other; cover art
    /// is no picture.
    static constexpr Strategy PictureWithSound = Timeline::DefaultStrategy;
    /// Without the sound; a file without a picture is refused. Cover art is one.
    static constexpr auto PictureAlone = static_cast<Strategy>(1);
    /// As a clip of its own; a file without sound is refused.
    static constexpr auto SoundAlone = static_cast<Strategy>(2);

    struct Clips
    {
        /// Is placed on a track of this type.
        Timeline::Clip* clip;
        TrackType track;
        /// The sound of a video; null if there is none.
        Timeline::Clip* nativeAudio;
    };

    explicit MediaClips(EditSession& session) : m_session(session) {}

    /// The file at the path; one that is open for these clips is taken as it is. The path is made absolute,
    /// so that a project finds its media from any folder.
    const MediaDescriber::Entry& open(const QString& path);
    /// The file at the path if it is open for these clips; null if it isn't.
    const MediaDescriber::Entry* find(const QString& path) const;

    /// A video with its sound, a sound, or a picture of the length that pictures have by default. Throws
    /// Refusal for a file that can't be opened, or whose length is not known.
    Clips make(const QString& path);
    /// The same of a file that is open, which outlives the session. With a type the clip is a VideoClip, with
    /// its sound if the strategy says so, or an AudioClip alone; a type of neither is refused, and a file or
    /// a strategy that doesn't have it.
    Clips make(const Media::File& file, Strategy strategy = PictureWithSound,
               Timeline::Clip::ClipType type = {});

private:
    Timeline::Clip* makeClip(const Media::File& file, Timeline::Clip::ClipType type, int mediaTrack);
    Timeline::Clip* makeStill(const Media::File& file, int mediaTrack);

    EditSession& m_session;
    MediaDescriber m_describer;
};

/// Where on a timeline clips are laid.
struct LayingPlace
{
    /// Null is the first track of the clips' type, which is made if it is missing.
    const Timeline::Track* track = nullptr;
    int level = 0;
    /// None is the end of the lane.
    std::optional<MTime> at = {};
    /// What lies at the time gives way; otherwise later clips make room.
    bool overwrites = false;
};

/// Makes the tracks that are missing, that of native audio among them. Where the clips are refused, these go
/// again.
EditResult lay(EditSession& session, const MediaClips::Clips& clips, const LayingPlace& place);

} // namespace Host
