// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/persistence/Persistent.h>

#include <QPointF>
#include <QString>

namespace Timeline {

struct Clip;

/// What motion tracking found in a clip.
struct EDITORMODEL_EXPORT TrackedObject : public virtual Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(TrackedObject)

public:
    /// The clip in which the object was found; not owned.
    const Timeline::Clip* clip = nullptr;
    /// The identifier of the tracking's data.
    QString trackingId;

    TrackedObject() = default;
    TrackedObject(const Timeline::Clip* clip_, const QString& trackingId_);
    TrackedObject(const TrackedObject&) = default;
    TrackedObject(TrackedObject&&) = default;
    TrackedObject& operator=(const TrackedObject&) = default;
    TrackedObject& operator=(TrackedObject&&) = default;
    ~TrackedObject() override;
};

EDITORMODEL_EXPORT bool operator==(const TrackedObject& a, const TrackedObject& b);
EDITORMODEL_EXPORT bool operator!=(const TrackedObject& a, const TrackedObject& b);

/// That a clip follows a tracked object at an offset. The timeline holds the link under the clip that
/// follows.
struct EDITORMODEL_EXPORT TrackingLinkInfo : public virtual Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(TrackingLinkInfo)

public:
    Timeline::TrackedObject trackedObject;
    /// From the tracked object. The units are those of the modules: the model stores and compares it, no
    /// more.
    QPointF objectRelativeOffset;

    TrackingLinkInfo() = default;
    TrackingLinkInfo(const Timeline::TrackedObject& trackedObject_, const QPointF& objectRelativeOffset_);
    TrackingLinkInfo(const TrackingLinkInfo&) = default;
    TrackingLinkInfo(TrackingLinkInfo&&) = default;
    TrackingLinkInfo& operator=(const TrackingLinkInfo&) = default;
    TrackingLinkInfo& operator=(TrackingLinkInfo&&) = default;
    ~TrackingLinkInfo() override;

    TrackingLinkInfo* setTrackedObject(const Timeline::TrackedObject& object);
    TrackingLinkInfo* setObjectRelativeOffset(const QPointF& offset);
};

/// The offsets are compared as QPointF does, not exactly.
EDITORMODEL_EXPORT bool operator==(const TrackingLinkInfo& a, const TrackingLinkInfo& b);

} // namespace Timeline

EDITORMODEL_ARCHIVE_NAME(Timeline::TrackedObject, "Timeline::TrackedObject")
EDITORMODEL_ARCHIVE_NAME(Timeline::TrackingLinkInfo, "Timeline::TrackingLinkInfo")
