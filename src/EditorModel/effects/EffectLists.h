// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>

#include <QString>
#include <QStringList>

#include <set>

/// Identifiers of what comes with the editor, as modules and content packages know them. They are part of
/// stored data; nothing in the library reads them. They stand once the library is loaded.
namespace Effect {

EDITORMODEL_EXPORT extern const QStringList AUDIO_EFFECTS;
EDITORMODEL_EXPORT extern const QStringList AUDIO_ENHANCEMENTS;

/// Titles, animations, transitions, callouts, stickers and video effects.
EDITORMODEL_EXPORT extern const std::set<QString> BUILT_IN_CONTENT;

} // namespace Effect
