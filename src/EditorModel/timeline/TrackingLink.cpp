// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/TrackingLink.h>

#include <EditorModel/persistence/Fields.h>
#include <EditorModel/timeline/Clip.h>

namespace Timeline {

TrackedObject::TrackedObject(const Timeline::Clip* clip_, const QString& trackingId_)
    : clip(clip_), trackingId(trackingId_)
{}

TrackedObject::~TrackedObject() = default;

bool operator==(const TrackedObject& a, const TrackedObject& b)
{
    return a.clip == b.clip && a.trackingId == b.trackingId;
}

bool operator!=(const TrackedObject& a, const TrackedObject& b)
{
    return !(a == b);
}

TrackingLinkInfo::TrackingLinkInfo(const Timeline::TrackedObject& trackedObject_,
                                   const QPointF& objectRelativeOffset_)
    : trackedObject(trackedObject_), objectRelativeOffset(objectRelativeOffset_)
{}

TrackingLinkInfo::~TrackingLinkInfo() = default;

TrackingLinkInfo* TrackingLinkInfo::setTrackedObject(const Timeline::TrackedObject& object)
{
    trackedObject = object;
    return this;
}

TrackingLinkInfo* TrackingLinkInfo::setObjectRelativeOffset(const QPointF& offset)
{
    objectRelativeOffset = offset;
    return this;
}

bool operator==(const TrackingLinkInfo& a, const TrackingLinkInfo& b)
{
    return a.trackedObject == b.trackedObject && a.objectRelativeOffset == b.objectRelativeOffset;
}

void fields(Serialize::Fields& f, TrackedObject& object)
{
    f("clip", object.clip)("trackingId", object.trackingId);
}

void fields(Serialize::Fields& f, TrackingLinkInfo& info)
{
    f("trackedObject", info.trackedObject)("objectRelativeOffset", info.objectRelativeOffset);
}

} // namespace Timeline

EDITORMODEL_PERSISTENT_CLASS(Timeline::TrackedObject)
EDITORMODEL_PERSISTENT_CLASS(Timeline::TrackingLinkInfo)
