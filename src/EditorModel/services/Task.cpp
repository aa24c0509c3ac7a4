// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Task.h>

namespace Task {

Object* Object::setType(Type value)
{
    type = value;
    return this;
}

Object* Object::setPriority(Priority value)
{
    priority = value;
    return this;
}

Object* Object::setState(State value)
{
    state = value;
    return this;
}

Object* Object::setExecutor(Executor* value)
{
    executor = value;
    return this;
}

Object* Object::setProgress(double value)
{
    progress = value;
    return this;
}

Object* Object::setQueued()
{
    return setState(Queued);
}

Object* Object::setCancelled()
{
    return setState(Cancelled);
}

Object* Object::setPaused()
{
    return setState(Paused);
}

bool Object::isQueued() const
{
    return state == Queued;
}

bool Object::isStarted() const
{
    return state == Started;
}

bool Object::isCancelled() const
{
    return state == Cancelled;
}

bool Object::isFinished() const
{
    return state == Finished;
}

bool Object::isPaused() const
{
    return state == Paused;
}

} // namespace Task
