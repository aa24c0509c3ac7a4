// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/analysis/SceneDetection.h>

namespace SceneDetection {

Object* Object::setPath(const QString& newPath)
{
    path = newPath;
    return this;
}

Object* Object::setSourceDuration(const MTime& duration)
{
    sourceDuration = duration;
    return this;
}

Object* Object::setMinDuration(const MTime& duration)
{
    minDuration = duration;
    return this;
}

Object* Object::setMaxDuration(const MTime& duration)
{
    maxDuration = duration;
    return this;
}

Object* Object::setState(const State& newState)
{
    state = newState;
    return this;
}

Object* Object::setDetectedScenes(const std::set<Range>& scenes)
{
    detectedScenes = scenes;
    return this;
}

Object* Object::setTask(const Task::Object* newTask)
{
    task = newTask;
    return this;
}

} // namespace SceneDetection
