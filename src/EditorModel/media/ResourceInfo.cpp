// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/ResourceInfo.h>

#include <EditorModel/media/ResourceHooks.h>
#include <EditorModel/persistence/Fields.h>

namespace Resource {
namespace {

/// The remainder that lies in [0, duration) also for a negative position.
MTime wrapped(MTime position, MTime duration)
{
    const qint64 remainder = position.ms() % duration.ms();
    return remainder < 0 ? MTime(remainder) + duration : MTime(remainder);
}

} // namespace

FileInfo::~FileInfo() = default;
Timing::~Timing() = default;

bool operator==(const FileInfo& a, const FileInfo& b)
{
    return a.path == b.path && a.track == b.track && a.duration == b.duration;
}

bool operator==(const Timing& a, const Timing& b)
{
    return a.mode == b.mode && a.intro == b.intro && a.outro == b.outro && a.loopMinCount == b.loopMinCount;
}

ResourceTiming getTimings(MTime position, MTime resourceDuration, MTime rangeBegin, MTime rangeEnd,
                          const ResourceRef& resource, const Timing& timing)
{
    if (rangeBegin == rangeEnd || resourceDuration <= MTime())
        return {MTime(), MTime()};
    const Timing described = Describer(resource).timing();
    const MTime passed = position - rangeBegin;
    const MTime rangeLength = rangeEnd - rangeBegin;
    switch (timing.mode) {
    case Timing::Described:
        if (described.mode == Timing::Described)
            return {position, MTime()};
        return {passed, rangeLength};
    case Timing::Stretched: {
        const double part = static_cast<double>(passed.ms()) / static_cast<double>(rangeLength.ms());
        return {resourceDuration.mulRound(part), resourceDuration};
    }
    case Timing::Looped:
        return {wrapped(position, resourceDuration), resourceDuration};
    }
    return {position, resourceDuration};
}

void fields(Serialize::Fields& f, FileInfo& info)
{
    f("path", info.path)("duration", info.duration)("track", info.track);
}

void fields(Serialize::Fields& f, Timing& timing)
{
    f("mode", timing.mode)("intro", timing.intro)("outro", timing.outro);
    f("loopMinCount", timing.loopMinCount);
}

} // namespace Resource

EDITORMODEL_PERSISTENT_CLASS(Resource::FileInfo)
EDITORMODEL_PERSISTENT_CLASS(Resource::Timing)
