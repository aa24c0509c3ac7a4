// SPDX-License-Identifier: Apache-2.0
#include "host/analysis/BlockTracker.h"

#include "host/media/MediaInput.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <limits>
#include <tuple>
#include <utility>

namespace Host {
namespace {

constexpr qint64 mostDifference = 32;
/// A block is looked at in so many pixels a side at most.
constexpr int mostSamples = 48;

/// Gives up, with more than `limit`, as soon as that is passed.
qint64 difference(const LumaPicture& from, const QRect& block, const LumaPicture& in, QPoint place,
                  qint64 limit)
{
    const int stepX = (block.width() + mostSamples - 1) / mostSamples;
    const int stepY = (block.height() + mostSamples - 1) / mostSamples;
    qint64 sum = 0;
    for (int y = 0; y < block.height() && sum <= limit; y += stepY) {
        for (int x = 0; x < block.width(); x += stepX) {
            sum += std::abs(int(from.at(block.x() + x, block.y() + y)) -
                            int(in.at(place.x() + x, place.y() + y)));
        }
    }
    return sum;
}

qint64 samplesOf(const QRect& block)
{
    const auto along = [](int length) {
        const int step = (length + mostSamples - 1) / mostSamples;
        return (length + step - 1) / step;
    };
    return qint64(along(block.width())) * along(block.height());
}

QRect pixels(const MotionTracking::Frame& frame, const LumaPicture& picture)
{
    const int left = int(std::lround(frame.left * picture.width));
    const int top = int(std::lround(frame.top * picture.height));
    const int right = int(std::lround((frame.left + frame.width) * picture.width));
    const int bottom = int(std::lround((frame.top + frame.height) * picture.height));
    return QRect(left, top, right - left, bottom - top);
}

MotionTracking::TimedFrame timed(const QRect& block, const LumaPicture& picture)
{
    MotionTracking::TimedFrame frame;
    frame.left = double(block.x()) / picture.width;
    frame.top = double(block.y()) / picture.height;
    frame.width = double(block.width()) / picture.width;
    frame.height = double(block.height()) / picture.height;
    return frame;
}

/// Each entry lasts up to the next one, and the last as long as the one before.
void setDurations(MotionTracking::Data::Frames& frames)
{
    MTime last = 0;
    for (auto entry = frames.begin(); entry != frames.end(); ++entry) {
        const auto next = std::next(entry);
        last = next == frames.end() ? last : next->first - entry->first;
        entry->second.duration = last;
    }
}

} // namespace

std::optional<QRect> findBlock(const LumaPicture& from, const QRect& block, const LumaPicture& in)
{
    if (from.width != in.width || from.height != in.height) {
        return std::nullopt;
    }
    const int reach = std::max(4, std::max(in.width, in.height) / 16);
    using Found = std::tuple<qint64, int, int, int>;
    Found best(mostDifference * samplesOf(block), std::numeric_limits<int>::max(), 0, 0);
    bool isFound = false;
    for (int dy = -reach; dy <= reach; ++dy) {
        for (int dx = -reach; dx <= reach; ++dx) {
            const QRect moved = block.translated(dx, dy);
            if (!QRect(0, 0, in.width, in.height).contains(moved)) {
                continue;
            }
            const Found found(difference(from, block, in, moved.topLeft(), std::get<0>(best)),
                              dx * dx + dy * dy, dx, dy);
            if (found < best) {
                best = found;
                isFound = true;
            }
        }
    }
    return isFound ? std::optional(block.translated(std::get<2>(best), std::get<3>(best))) : std::nullopt;
}

MotionTracking::Data followRectangle(const QString& id, const QString& path, int track,
                                     const MotionTracking::AnalyzeTask& task)
{
    if (!task.initialFrame.isValid()) {
        throw MediaError("cannot be searched for a rectangle that is not within its pictures");
    }
    MotionTracking::Data data(id);
    LumaReader reader(path, track);
    LumaPicture before;
    LumaPicture picture;
    QRect block;
    while (reader.next(picture) && picture.time <= task.analyzingRange.to) {
        if (picture.time < task.initialPosition) {
            continue;
        }
        if (data.frames.empty()) {
            block = pixels(task.initialFrame, picture);
            if (block.isEmpty()) {
                throw MediaError("cannot be searched for a rectangle without pixels");
            }
        } else if (const auto found = findBlock(before, block, picture)) {
            block = *found;
        } else {
            break;
        }
        data.frames[picture.time] = timed(block, picture);
        std::swap(before, picture);
    }
    if (data.frames.empty()) {
        throw MediaError("has no picture in the range that is to be searched");
    }
    setDurations(data.frames);
    data.optimize();
    return data;
}

} // namespace Host
