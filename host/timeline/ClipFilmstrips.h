// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/timeline/TimelineLayout.h"

#include <EditorModel/analysis/Filmstrip.h>
#include <EditorModel/bus/View.h>
#include <EditorModel/media/Video.h>

#include <map>

namespace Host {

/// The video that a clip shows a part of; null where it shows none, or none that its file describes.
const Media::Video* videoOf(const Timeline::Clip& clip);
/// An empty one for a clip without such a video.
ResourceRef pictureResourceOf(const Timeline::Clip& clip);

/// Asks over the bus for a filmstrip for each clip with pictures, to be drawn in the body of its box: as many
/// pictures beside one another, in their own shape, as it takes to fill it. What nobody fills is empty.
class ClipFilmstrips : private Message::View<Filmstrip::Object>
{
public:
    ClipFilmstrips(const TimelineLayout& layout, const TimelineOutline& outline);
    ClipFilmstrips(const ClipFilmstrips&) = delete;
    ~ClipFilmstrips() override;

    /// Null if there is none.
    const Filmstrip::Object* of(const Timeline::Clip& clip) const;

private:
    std::map<const Timeline::Clip*, Filmstrip::Object> m_filmstrips;
};

} // namespace Host
