// SPDX-License-Identifier: Apache-2.0
#include "host/editing/MissingTracks.h"

#include <algorithm>

namespace Host {

using Timeline::Track;

const Track* trackFor(const Timeline::Object& timeline, TrackType type)
{
    const Track* const detached = type == AudioTrack ? timeline.detachedAudioTrack() : nullptr;
    return detached ? detached : timeline.findFirstTrack(type);
}

EditResult MissingTracks::provide(TrackType type)
{
    if (trackFor(*m_session.timeline(), type)) {
        return {};
    }
    const Track* const track = m_session.makeTrack(type);
    EditResult added = m_session.addTrack(track);
    if (added) {
        m_made.push_back(track);
    }
    return added;
}

void MissingTracks::takeBack()
{
    for (auto track = m_made.rbegin(); track != m_made.rend(); ++track) {
        if (!isUsed(*track) && !m_session.removeTrack(*track)) {
            break;
        }
    }
}

bool MissingTracks::isUsed(const Track* track) const
{
    const auto& clips = m_session.timeline()->clips;
    return std::any_of(clips.begin(), clips.end(),
                       [track](const auto& entry) { return entry.second.track == track; });
}

} // namespace Host
