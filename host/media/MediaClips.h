// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/editing/EditSession.h"
#include "host/media/MediaDescriber.h"
#include "host/media/MediaOpener.h"

namespace Host {

/// Makes clips of media files for a session. The files live as long as it does.
class MediaClips
{
public:
    struct Clips
    {
        /// Is placed on a track of this type.
        Timeline::Clip* clip;
        TrackType track;
        /// The sound of a video; null if there is none.
        Timeline::Clip* nativeAudio;
    };

    explicit MediaClips(EditSession& session) : m_session(session) {}

    /// A video with its sound, a sound, or a picture of the length that pictures have by default. Throws
    /// Refusal for a file that can't be opened, or whose length is not known.
    Clips make(const QString& path);

private:
    Timeline::Clip* makeClip(const Media::File& file, Timeline::Clip::ClipType type, int mediaTrack);

    EditSession& m_session;
    MediaOpener m_opener;
    MediaDescriber m_describer;
};

/// Lays the clips at the end of the first track of their type, or at a time, where later clips make room.
/// Makes the tracks that are missing.
EditResult lay(EditSession& session, const MediaClips::Clips& clips, const MTime* at = nullptr);

} // namespace Host
