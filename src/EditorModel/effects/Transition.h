// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/media/ResourceRef.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/MTime.h>

#include <QString>

#include <deque>

namespace Transition {

/// A transition between two clips, as the library describes it.
class EDITORMODEL_EXPORT Object : public virtual Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Object)

public:
    /// The strategies belong to the modules that carry transitions out; other values are reached by a cast.
    enum Strategy : int
    {
        DefaultStrategy = 0,
    };

    /// As for the strategies; the shape of a pair of clips on a timeline is another matter.
    enum Type : int
    {
        DefaultType = 0,
    };

    static constexpr MTime DEFAULT_DURATION = 2000;
    /// "x-application/TransitionObject-serialized", for the clipboard and for drag and drop.
    static const QString* const mimeType;

    QString id;
    /// The name in the library.
    QString tag;
    QString description;
    Strategy strategy = DefaultStrategy;
    Type type = DefaultType;
    MTime defaultDuration = DEFAULT_DURATION;
    /// Media that the transition needs beside the clips.
    std::deque<ResourceRef> resources;
    /// In percent.
    int volume = 100;

    Object(const QString& id_ = QString());

    /// Whether `resources` has one of this kind.
    bool hasVideoResources() const;
    bool hasAudioResources() const;
};

} // namespace Transition

EDITORMODEL_ARCHIVE_NAME(Transition::Object, "Transition::Object")
