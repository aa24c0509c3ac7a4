// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/MTime.h>

#include <QString>

#include <deque>

namespace Theme {

/// A set of choices for a film that is put together automatically. Content packages fill it in.
class EDITORMODEL_EXPORT Object : public virtual Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Object)

public:
    /// The name in the library.
    QString tag;
    /// Identifiers of the transitions to use.
    std::deque<QString> transitionsList;
    /// What the texts of this and the three below name is a matter of whoever makes films of themes: the
    /// model never reads them.
    QString previewVideo;
    QString music;
    QString startTitle;
    QString finalTitle;
    /// How long a scene may be. The model enforces nothing of it.
    MTime minSceneDuration = 4000;
    MTime maxSceneDuration = 5000;
};

} // namespace Theme

EDITORMODEL_ARCHIVE_NAME(Theme::Object, "Theme::Object")
