// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/types/MTime.h>

#include <QString>
#include <QtGlobal>

#include <set>

namespace Task {
class Object;
}

namespace SceneDetection {

/// The states belong to the analysing module; other values are reached by a cast.
enum State : int
{
    DefaultState = 0,
};

/// The two ends of a scene; their unit is a matter of the analysing module.
struct Range
{
    qint64 from = 0;
    qint64 to = 0;

    friend constexpr bool operator==(const Range& a, const Range& b)
    {
        return a.from == b.from && a.to == b.to;
    }
    friend constexpr bool operator!=(const Range& a, const Range& b) { return !(a == b); }
    /// By `from`, then by `to`.
    friend constexpr bool operator<(const Range& a, const Range& b)
    {
        return a.from != b.from ? a.from < b.from : a.to < b.to;
    }
};

/// The job of finding scenes in a file, and what it found. It lives on the bus only and is never stored.
class EDITORMODEL_EXPORT Object : public virtual PubSub::Object
{
public:
    QString path;
    MTime sourceDuration;
    double detectionLevel = 20.0; ///< the unit is a matter of the analysing module
    /// The limits of a scene's length.
    MTime minDuration;
    MTime maxDuration;
    State state = DefaultState;
    std::set<Range> detectedScenes;
    /// What these are is a matter of the analysing module.
    std::set<Range> otherScenes;
    /// Not owned.
    const Task::Object* task = nullptr;

    Object* setPath(const QString& newPath);
    Object* setSourceDuration(const MTime& duration);
    Object* setMinDuration(const MTime& duration);
    Object* setMaxDuration(const MTime& duration);
    Object* setState(const State& newState);
    Object* setDetectedScenes(const std::set<Range>& scenes);
    Object* setTask(const Task::Object* newTask);
};

} // namespace SceneDetection
