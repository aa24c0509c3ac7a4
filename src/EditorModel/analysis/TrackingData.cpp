// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/analysis/TrackingData.h>

#include <EditorModel/persistence/Fields.h>
#include <EditorModel/types/FuzzyCompare.h>

#include <QRectF>

#include <algorithm>
#include <cmath>
#include <iterator>
#include <tuple>

namespace MotionTracking {
namespace {

/// How far the end of an entry and the beginning of the next one may lie apart where they are joined.
constexpr MTime LARGEST_GAP = 16;

bool follows(const Data::Frames::value_type& entry, const Data::Frames::value_type& earlier)
{
    const MTime end = earlier.first + earlier.second.duration;
    return std::abs(end - entry.first) <= LARGEST_GAP && earlier.second == entry.second;
}

} // namespace

Frame::Frame(const QRectF& rectangle)
    : Frame(rectangle.left(), rectangle.top(), rectangle.width(), rectangle.height())
{}

Frame::Frame(double left_, double top_, double width_, double height_)
    : left(left_), top(top_), width(width_), height(height_)
{}

Frame::~Frame() = default;
TimedFrame::~TimedFrame() = default;

QRectF Frame::toRectF() const
{
    return {left, top, width, height};
}

bool Frame::isNull() const
{
    constexpr double SMALLEST = 1e-12;
    return std::abs(width) <= SMALLEST || std::abs(height) <= SMALLEST;
}

bool Frame::isValid() const
{
    const auto isPlace = [](double position) { return 0.0 <= position && position < 1.0; };
    return isPlace(left) && isPlace(top) && width > 0.0 && height > 0.0 && left + width <= 1.0 &&
           top + height <= 1.0;
}

bool Frame::operator==(const Frame& other) const
{
    return Types::fuzzyEqual(left, other.left) && Types::fuzzyEqual(top, other.top) &&
           Types::fuzzyEqual(width, other.width) && Types::fuzzyEqual(height, other.height);
}

bool Frame::operator!=(const Frame& other) const
{
    return !(*this == other);
}

bool Frame::operator<(const Frame& other) const
{
    return std::tie(left, top, width, height) < std::tie(other.left, other.top, other.width, other.height);
}

Data::Data(const QString& id_) : id(id_) {}

Data::~Data() = default;

bool Data::operator==(const Data& other) const
{
    return id == other.id && std::equal(frames.begin(), frames.end(), other.frames.begin(),
                                        other.frames.end(), [](const auto& a, const auto& b) {
                                            return a.first == b.first && a.second == b.second;
                                        });
}

Data::Frames::const_iterator Data::findFrame(MTime position, bool nextIfNone) const
{
    const auto next = frames.upper_bound(position);
    if (next != frames.begin()) {
        const auto last = std::prev(next);
        if (position <= last->first + last->second.duration)
            return last;
    }
    return nextIfNone ? next : frames.end();
}

void Data::optimize()
{
    if (frames.empty())
        return;
    auto run = frames.begin();
    for (auto entry = std::next(run); entry != frames.end();) {
        if (follows(*entry, *run)) {
            run->second.duration = entry->first + entry->second.duration - run->first;
            entry = frames.erase(entry);
        } else {
            run = entry++;
        }
    }
}

void fields(Serialize::Fields& f, Frame& frame)
{
    f("left", frame.left)("top", frame.top)("width", frame.width)("height", frame.height);
}

void fields(Serialize::Fields& f, TimedFrame& frame)
{
    f.base<MotionTracking::Frame>("MotionTracking::Frame", frame)("duration", frame.duration);
}

void fields(Serialize::Fields& f, Data& data)
{
    f("id", data.id)("frames", data.frames);
}

} // namespace MotionTracking

EDITORMODEL_PERSISTENT_CLASS(MotionTracking::Frame)
EDITORMODEL_PERSISTENT_CLASS(MotionTracking::TimedFrame, MotionTracking::Frame)
EDITORMODEL_PERSISTENT_CLASS(MotionTracking::Data)
