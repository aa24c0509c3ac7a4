// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/analysis/TrackingTask.h>

#include <tuple>

namespace MotionTracking {
namespace {

auto orderOf(const AnalyzeTask& task)
{
    return std::tie(task.resource, task.initialFrame, task.initialPosition, task.analyzingRange);
}

} // namespace

AnalyzeTask& AnalyzeTask::setResource(const ResourceRef& newResource)
{
    resource = newResource;
    return *this;
}

AnalyzeTask& AnalyzeTask::setInitialFrame(const MotionTracking::Frame& frame)
{
    initialFrame = frame;
    return *this;
}

AnalyzeTask& AnalyzeTask::setInitialPosition(MTime position)
{
    initialPosition = position;
    return *this;
}

AnalyzeTask& AnalyzeTask::setAnalyzingRange(const Types::Range& range)
{
    analyzingRange = range;
    return *this;
}

AnalyzeTask& AnalyzeTask::setAlgorithm(MotionTracking::Algorithm newAlgorithm)
{
    algorithm = newAlgorithm;
    return *this;
}

bool AnalyzeTask::operator==(const AnalyzeTask& other) const
{
    return orderOf(*this) == orderOf(other);
}

bool AnalyzeTask::operator!=(const AnalyzeTask& other) const
{
    return !(*this == other);
}

bool AnalyzeTask::operator<(const AnalyzeTask& other) const
{
    return orderOf(*this) < orderOf(other);
}

bool AnalyzeTask::isEmpty() const
{
    return *this == AnalyzeTask();
}

bool AnalyzeTask::isValid() const
{
    const auto& [id, kind] = resource;
    const Types::Range& range = analyzingRange;
    return !id.isEmpty() && kind == Resource::VideoType && initialFrame.isValid() && range.from >= MTime() &&
           !range.empty() && range.from <= initialPosition && initialPosition <= range.to;
}

} // namespace MotionTracking
