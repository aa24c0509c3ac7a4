// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/analysis/TrackingData.h>
#include <EditorModel/media/ResourceRef.h>
#include <EditorModel/types/MTime.h>
#include <EditorModel/types/Range.h>

namespace MotionTracking {

/// The algorithms belong to the tracker; all but the default are reached by a cast.
enum Algorithm : int
{
    DefaultAlgorithm = 0,
};

/// What a tracker is to follow, and where. Nothing is checked but by isValid().
class EDITORMODEL_EXPORT AnalyzeTask
{
public:
    ResourceRef resource;
    /// Where the object is at `initialPosition`.
    MotionTracking::Frame initialFrame;
    MTime initialPosition;
    Types::Range analyzingRange; ///< in the time of the resource, as the position; its end is inside
    MotionTracking::Algorithm algorithm = DefaultAlgorithm;

    AnalyzeTask& setResource(const ResourceRef& newResource);
    AnalyzeTask& setInitialFrame(const MotionTracking::Frame& frame);
    AnalyzeTask& setInitialPosition(MTime position);
    AnalyzeTask& setAnalyzingRange(const Types::Range& range);
    AnalyzeTask& setAlgorithm(MotionTracking::Algorithm newAlgorithm);

    /// The algorithm isn't compared; the frames are as Frame compares them.
    bool operator==(const AnalyzeTask& other) const;
    bool operator!=(const AnalyzeTask& other) const;
    /// By the resource's identifier and kind, the frame, the position and the range. The algorithm isn't
    /// compared, and the frames are compared exactly: one of two equal tasks may be less than the other.
    bool operator<(const AnalyzeTask& other) const;

    /// The task equals a default one, whatever its algorithm.
    bool isEmpty() const;
    /// A video is named, the frame is valid, and the initial position lies in a range of some length that
    /// doesn't begin before 0. Here the end of the range is inside.
    bool isValid() const;
};

} // namespace MotionTracking
