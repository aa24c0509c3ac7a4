// SPDX-License-Identifier: Apache-2.0
#include "host/timeline/ClipFilmstrips.h"

#include "host/analysis/FilmstripMaker.h"
#include "host/drawing/Picture.h"
#include "host/editing/TimelineInvariants.h"
#include "host/media/ResourceKeeper.h"
#include "host/timeline/TimelineClipBox.h"

#include <EditorModel/media/File.h>

#include <algorithm>
#include <cmath>
#include <tuple>

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
    std::size_t pictures = 0;
    for (const Timeline::Clip* clip : outline.clips()) {
        setFilmstrip(*clip, outline.timeline().clips.at(clip), layout.boxOf(clip));
        const Filmstrip::Object* const filmstrip = of(*clip);
        pictures += filmstrip ? picturePositions(*filmstrip).size() : 0;
    }
    m_reporter.own(&m_progress)->setTotal(int(pictures));
}

ClipFilmstrips::~ClipFilmstrips()
{
    m_reporter.remove(&m_progress);
    for (const auto& entry : m_filmstrips) {
        if (isObserved(&entry.second)) {
            remove(&entry.second);
        }
    }
}

void ClipFilmstrips::request()
{
    subscribeAll<Thumbnail::Object>();
    int passed = 0;
    for (const Timeline::Clip* const clip : clipsByFile()) {
        Filmstrip::Object& filmstrip = m_filmstrips.at(clip);
        m_reporter.change(&m_progress)->setPassed(passed)->setLabel(clip->file->path);
        add(&filmstrip);
        passed += int(picturePositions(filmstrip).size());
    }
    unsubscribeAll<Thumbnail::Object>();
    m_reporter.change(&m_progress)->setPassed(passed);
}

const Filmstrip::Object* ClipFilmstrips::of(const Timeline::Clip& clip) const
{
    const auto found = m_filmstrips.find(&clip);
    return found == m_filmstrips.end() ? nullptr : &found->second;
}

/// A picture has come.
void ClipFilmstrips::notify(const Message::Types::Changed<Thumbnail::Object>&)
{
    m_reporter.change(&m_progress)->setPassed(m_progress.passed + 1);
}

/// A clip without a video, and one that is too narrow for pictures, has none.
void ClipFilmstrips::setFilmstrip(const Timeline::Clip& clip, const Timeline::ClipTiming& timing,
                                  const QRectF& box)
{
    const Media::Video* const video = videoOf(clip);
    const Types::Range stretch = stretchOf(clip, timing);
    if (!video || clipStrip(box).isEmpty() || !isWithin(stretch)) {
        return;
    }
    const double height = clipBody(box).height();
    const double width = std::max(height * shapeOf(*video), leastPictureWidth);
    const auto shown = double(stretch.length().ms());
    // At least one, so that each picture has a time of its own.
    const MTime step = std::max(MTime(1), MTime::fromMsRound(shown * width / box.width()));
    m_filmstrips[&clip]
        .setResource(pictureResourceOf(clip))
        ->setWidth(int(std::lround(width * pngScale)))
        ->setHeight(int(std::lround(height * pngScale)))
        ->setSourceDuration(clip.sourceDuration)
        ->setTimingMode(timing.timingMode)
        ->setSourceRange(stretch)
        ->setCurrentRange(stretch)
        ->setStep(step)
        ->setReversed(timing.reversed);
}

std::vector<const Timeline::Clip*> ClipFilmstrips::clipsByFile() const
{
    std::vector<const Timeline::Clip*> clips;
    for (const auto& entry : m_filmstrips) {
        clips.push_back(entry.first);
    }
    const auto key = [this](const Timeline::Clip* clip) {
        const Types::Range& stretch = m_filmstrips.at(clip).sourceRange;
        return std::make_tuple(clip->file->path, clip->mediaTrack, stretch.from, stretch.to);
    };
    std::sort(clips.begin(), clips.end(), [&key](const auto* a, const auto* b) { return key(a) < key(b); });
    return clips;
}

} // namespace Host
