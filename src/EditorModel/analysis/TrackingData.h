// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/MTime.h>

#include <QString>

#include <map>

class QRectF;

namespace MotionTracking {

/// A rectangle, in parts of the width and height of a picture, whose left top corner is (0, 0). A default one
/// is the whole picture.
class EDITORMODEL_EXPORT Frame : public Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Frame)

public:
    double left = 0.0;
    double top = 0.0;
    double width = 1.0;
    double height = 1.0;

    Frame() = default;
    Frame(const QRectF& rectangle);
    Frame(double left_, double top_, double width_, double height_);
    Frame(const Frame&) = default;
    Frame(Frame&&) = default;
    Frame& operator=(const Frame&) = default;
    Frame& operator=(Frame&&) = default;
    ~Frame() override;

    QRectF toRectF() const;

    /// The width or the height is within 1e-12 of zero.
    bool isNull() const;
    /// The rectangle has an extent and lies within the picture. Nothing is rounded: a sum that comes out
    /// above 1 by its last bit is outside.
    bool isValid() const;

    /// Field by field, each as Types::fuzzyEqual().
    bool operator==(const Frame& other) const;
    bool operator!=(const Frame& other) const;
    /// By `left`, `top`, `width` and `height`, exactly: one of two equal frames may be less than the other.
    bool operator<(const Frame& other) const;
};

/// A rectangle that holds for a while. Comparisons are those of Frame.
class EDITORMODEL_EXPORT TimedFrame : public MotionTracking::Frame
{
    EDITORMODEL_PERSISTENT(TimedFrame)

public:
    MTime duration;

    TimedFrame() = default;
    TimedFrame(const TimedFrame&) = default;
    TimedFrame(TimedFrame&&) = default;
    TimedFrame& operator=(const TimedFrame&) = default;
    TimedFrame& operator=(TimedFrame&&) = default;
    ~TimedFrame() override;
};

/// Where an object is in the pictures of a video, as a tracker found it.
class EDITORMODEL_EXPORT Data : public Serialize::ISerializable, public PubSub::Object
{
    EDITORMODEL_PERSISTENT(Data)

public:
    using Frames = std::map<MTime, MotionTracking::TimedFrame>;

    /// The identifier by which clips and links name the tracking.
    QString id;
    /// By the time at which each begins. Entries may overlap, and leave holes.
    Frames frames;

    Data() = default;
    Data(const QString& id_);
    Data(const Data&) = default;
    Data(Data&&) = default;
    Data& operator=(const Data&) = default;
    Data& operator=(Data&&) = default;
    ~Data() override;

    /// The durations aren't compared; the rectangles are as Frame compares them.
    bool operator==(const Data& other) const;

    /// The entry at `position`, from its key to the end of its duration, both ends included; of two that meet
    /// there the later one. Only the last entry to begin is looked at: where that has ended there is a hole,
    /// also if an earlier entry lasts longer. In a hole, and before the first entry, it is the next entry if
    /// `nextIfNone` is set; otherwise, and behind all entries, it is the end.
    Frames::const_iterator findFrame(MTime position, bool nextIfNone) const;

    /// Joins entries that follow on one another and whose rectangles are equal: the later one may begin at
    /// most 16 ms before or after the end of the earlier one. What is joined ends where its last entry does,
    /// and keeps the rectangle of its first.
    void optimize();
};

} // namespace MotionTracking

EDITORMODEL_ARCHIVE_NAME(MotionTracking::Frame, "MotionTracking::Frame")
EDITORMODEL_ARCHIVE_NAME(MotionTracking::TimedFrame, "MotionTracking::TimedFrame")
EDITORMODEL_ARCHIVE_NAME(MotionTracking::Data, "MotionTracking::Data")
