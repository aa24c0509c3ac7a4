// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/MTime.h>

#include <QString>

namespace Stabilization {

/// How a clip was stabilized, and from what. The units of the first four fields are a matter of the analysing
/// module.
class EDITORMODEL_EXPORT Object : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Object)

public:
    /// The ways of zooming belong to the analysing module; other values are reached by a cast.
    enum OptimalZooming : int
    {
        DefaultZooming = 1,
    };

    int shakiness = 5;
    int accuracy = 15;
    int stepsize = 6;
    int smoothing = 15;
    OptimalZooming optzoom = DefaultZooming;
    /// -1 for no stream.
    int originalVideoStreamIndex = -1;
    /// -1 for no stream.
    int originalAudioStreamIndex = -1;
    QString pathOriginal;
    QString pathStabilized;
    MTime sourcePositionOriginal;
    MTime sourceDurationOriginal;

    Object* setShakiness(int value);
    Object* setAccuracy(int value);
    Object* setStepsize(int value);
    Object* setSmoothing(int value);
    Object* setOptzoom(OptimalZooming zooming);
    Object* setOriginalVideoIndex(int index);
    Object* setOriginalAudioIndex(int index);
    Object* setPathOriginal(const QString& path);
    Object* setPathStabilized(const QString& path);
    Object* setSourcePositionOriginal(MTime position);
    Object* setSourceDurationOriginal(MTime duration);
};

} // namespace Stabilization

EDITORMODEL_ARCHIVE_NAME(Stabilization::Object, "Stabilization::Object")
