// SPDX-License-Identifier: Apache-2.0
#include "host/timeline/ClipFilmstrips.h"

#include "host/drawing/Picture.h"
#include "host/editing/TimelineInvariants.h"
#include "host/media/ResourceKeeper.h"
#include "host/timeline/TimelineClipBox.h"

#include <EditorModel/media/File.h>

#include <algorithm>
#include <cmath>

namespace Host {
namespace {

/// In units of the picture, so that a box doesn't take pictures without end.
constexpr double leastPictureWidth = 12.0;

double shapeOf(const Media::Video& video)
{
    const double height = double(video.height) * double(video.aspectY);
    const double shape = height > 0.0 ? double(video.width) * double(video.aspectX) / height : 0.0;
    return shape > 0.0 ? shape : 1.0;
}

/// A picture need not have a length of its own.
Types::Range stretchOf(const Timeline::Clip& clip, const Timeline::ClipTiming& timing)
{
    const SourceStretch stretch = sourceStretchOf(clip, timing);
    return stretch.speed == 0.0 ? Types::Range(0, timing.duration) : Types::Range(stretch.from, stretch.to);
}

/// Times from a file may be any.
bool isWithin(const Types::Range& range)
{
    return range.from >= -LATEST_TIME && range.to <= LATEST_TIME;
}

} // namespace

const Media::Video* videoOf(const Timeline::Clip& clip)
{
    if (!clip.file || !clip.isVideoClip()) {
        return nullptr;
    }
    for (const auto* track : clip.file->videoTracks) {
        if (track && track->index == clip.mediaTrack) {
            return track;
        }
    }
    return nullptr;
}

ResourceRef pictureResourceOf(const Timeline::Clip& clip)
{
    int index = 0;
    if (videoOf(clip)) {
        for (const auto* track : clip.file->videoTracks) {
            if (track && track->index == clip.mediaTrack) {
                return {ResourceKeeper::identifier(clip.file->path, index),
                        track->isImage ? Resource::ImageType : Resource::VideoType};
            }
            ++index;
        }
    }
    return {};
}

ClipFilmstrips::ClipFilmstrips(const TimelineLayout& layout, const TimelineOutline& outline)
{
    for (const Timeline::Clip* clip : outline.clips()) {
        const Media::Video* const video = videoOf(*clip);
        const QRectF box = layout.boxOf(clip);
        if (!video || clipStrip(box).isEmpty()) {
            continue;
        }
        const double height = clipBody(box).height();
        const double width = std::max(height * shapeOf(*video), leastPictureWidth);
        const Timeline::ClipTiming& timing = outline.timeline().clips.at(clip);
        const Types::Range stretch = stretchOf(*clip, timing);
        if (!isWithin(stretch)) {
            continue;
        }
        const auto shown = double(stretch.length().ms());
        // At least one, so that each picture has a time of its own.
        const MTime step = std::max(MTime(1), MTime::fromMsRound(shown * width / box.width()));
        add(&m_filmstrips[clip])
            ->setResource(pictureResourceOf(*clip))
            ->setWidth(int(std::lround(width * pngScale)))
            ->setHeight(int(std::lround(height * pngScale)))
            ->setSourceDuration(clip->sourceDuration)
            ->setTimingMode(timing.timingMode)
            ->setSourceRange(stretch)
            ->setCurrentRange(stretch)
            ->setStep(step)
            ->setReversed(timing.reversed);
    }
}

ClipFilmstrips::~ClipFilmstrips()
{
    for (const auto& entry : m_filmstrips) {
        remove(&entry.second);
    }
}

const Filmstrip::Object* ClipFilmstrips::of(const Timeline::Clip& clip) const
{
    const auto found = m_filmstrips.find(&clip);
    return found == m_filmstrips.end() ? nullptr : &found->second;
}

} // namespace Host
