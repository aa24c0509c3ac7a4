// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/editing/EditSession.h"

#include <vector>

namespace Host {

/// The track that clips for this type of track go to by themselves; null if there is none. Sound that stands
/// alone takes the audio track that is not linked to the picture.
const Timeline::Track* trackFor(const Timeline::Object& timeline, TrackType type);

/// Tracks that are made for clips, and go again where these are refused.
class MissingTracks
{
public:
    /// The session outlives this.
    explicit MissingTracks(EditSession& session) : m_session(session) {}
    MissingTracks(const MissingTracks&) = delete;

    /// Makes a track where trackFor() has none.
    EditResult provide(TrackType type);
    /// Tracks that others have laid something on by now stay.
    void takeBack();

private:
    bool isUsed(const Timeline::Track* track) const;

    EditSession& m_session;
    std::vector<const Timeline::Track*> m_made;
};

} // namespace Host
