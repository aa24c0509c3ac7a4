// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>

#include <QPointF>
#include <QString>

#include <functional>

namespace MotionTracking {

/// That an overlay which plays on its own follows a tracked object at an offset.
struct EDITORMODEL_EXPORT OverlayLinkInfo
{
    /// The identifier of the tracking's data.
    QString trackingId;
    /// From the tracked object. The units are those of whoever plays the overlay; the model never reads it.
    QPointF offset;
    /// For whoever plays the overlay; the model never calls it.
    std::function<void()> callback;
};

} // namespace MotionTracking
