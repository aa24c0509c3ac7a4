// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/timeline/TimelineLayout.h"

#include <EditorModel/analysis/Filmstrip.h>
#include <EditorModel/analysis/Thumbnail.h>
#include <EditorModel/bus/View.h>
#include <EditorModel/media/Video.h>
#include <EditorModel/services/Report.h>

#include <map>
#include <vector>

namespace Host {

/// The video that a clip shows a part of; null where it shows none, or none that its file describes.
const Media::Video* videoOf(const Timeline::Clip& clip);
/// An empty one for a clip without such a video.
ResourceRef pictureResourceOf(const Timeline::Clip& clip);

/// Asks over the bus for a filmstrip for each clip with pictures, to be drawn in the body of its box: as many
/// pictures beside one another, in their own shape, as it takes to fill it. What nobody fills is empty.
///
/// It tells by a progress how many of the pictures have come. The label is the path of the file that they are
/// taken from.
class ClipFilmstrips : private Message::View<Filmstrip::Object>,
                       private PubSub::Subscriber<Message::Types::Changed<Thumbnail::Object>>
{
public:
    /// Asks for nothing yet.
    ClipFilmstrips(const TimelineLayout& layout, const TimelineOutline& outline);
    ClipFilmstrips(const ClipFilmstrips&) = delete;
    ~ClipFilmstrips() override;

    /// Those of one file together, in the order of their sources.
    void request();

    /// Owned here, and counted on while request() is running.
    const Report::Progress* progress() const { return &m_progress; }
    /// Null if there is none.
    const Filmstrip::Object* of(const Timeline::Clip& clip) const;

private:
    using FilmstripView = Message::View<Filmstrip::Object>;

    void notify(const Message::Types::Changed<Thumbnail::Object>& message) override;
    void setFilmstrip(const Timeline::Clip& clip, const Timeline::ClipTiming& timing, const QRectF& box);
    std::vector<const Timeline::Clip*> clipsByFile() const;

    std::map<const Timeline::Clip*, Filmstrip::Object> m_filmstrips;
    Report::Progress m_progress;
    Message::View<Report::Progress> m_reporter;
};

} // namespace Host
