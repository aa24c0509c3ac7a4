// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/analysis/Stabilization.h>

#include <EditorModel/persistence/Fields.h>

namespace Stabilization {

Object* Object::setShakiness(int value)
{
    shakiness = value;
    return this;
}

Object* Object::setAccuracy(int value)
{
    accuracy = value;
    return this;
}

Object* Object::setStepsize(int value)
{
    stepsize = value;
    return this;
}

Object* Object::setSmoothing(int value)
{
    smoothing = value;
    return this;
}

Object* Object::setOptzoom(OptimalZooming zooming)
{
    optzoom = zooming;
    return this;
}

Object* Object::setOriginalVideoIndex(int index)
{
    originalVideoStreamIndex = index;
    return this;
}

Object* Object::setOriginalAudioIndex(int index)
{
    originalAudioStreamIndex = index;
    return this;
}

Object* Object::setPathOriginal(const QString& path)
{
    pathOriginal = path;
    return this;
}

Object* Object::setPathStabilized(const QString& path)
{
    pathStabilized = path;
    return this;
}

Object* Object::setSourcePositionOriginal(MTime position)
{
    sourcePositionOriginal = position;
    return this;
}

Object* Object::setSourceDurationOriginal(MTime duration)
{
    sourceDurationOriginal = duration;
    return this;
}

void fields(Serialize::Fields& f, Object& object)
{
    f("shakiness", object.shakiness)("accuracy", object.accuracy);
    f("stepsize", object.stepsize)("smoothing", object.smoothing)("optzoom", object.optzoom);
    f("originalVideoStreamIndex", object.originalVideoStreamIndex);
    f("originalAudioStreamIndex", object.originalAudioStreamIndex);
    f("pathOriginal", object.pathOriginal)("pathStabilized", object.pathStabilized);
    f("sourcePositionOriginal", object.sourcePositionOriginal);
    f("sourceDurationOriginal", object.sourceDurationOriginal);
}

} // namespace Stabilization

EDITORMODEL_PERSISTENT_CLASS(Stabilization::Object)
