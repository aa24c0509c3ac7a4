// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>

namespace Task {

/// One unit of background work, such as an analysis. Who carries it out is outside the model; nothing here
/// guards the order of the states.
class EDITORMODEL_EXPORT Object : public virtual PubSub::Object
{
public:
    /// Opaque handle of the module that carries the task out.
    class Executor;

    /// The kinds of tasks belong to the modules that make them; other values are reached by a cast.
    enum Type : int
    {
        DefaultType = 5,
    };

    /// Other values are reached by a cast.
    enum Priority : int
    {
        DefaultPriority = 1,
    };

    enum State : int
    {
        Queued = 0,
        Started = 1,
        Cancelled = 2,
        Finished = 3,
        Paused = 4,
    };

    Object* setType(Type value);
    Object* setPriority(Priority value);
    Object* setState(State value);
    /// The executor is not owned.
    Object* setExecutor(Executor* value);
    Object* setProgress(double value);

    Object* setQueued();
    Object* setCancelled();
    Object* setPaused();

    bool isQueued() const;
    bool isStarted() const;
    bool isCancelled() const;
    bool isFinished() const;
    bool isPaused() const;

    Type type = DefaultType;
    Priority priority = DefaultPriority;
    State state = Queued;
    Executor* executor = nullptr;
    /// The part that is done, from 0 to 1; it is stored as it is given.
    double progress = 0.0;
};

} // namespace Task
