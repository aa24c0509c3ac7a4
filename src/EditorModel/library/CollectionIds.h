// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>

#include <QString>
#include <QtGlobal>

#include <list>
#include <map>
#include <set>
#include <utility>

/// How modules name the collections of the library and the categories in them. The texts are part of stored
/// data. They stand once the library is loaded; nothing in the library reads the tables.
namespace EditorCollection {

struct EDITORMODEL_EXPORT CollectionID
{
    static const QString EFFECTS_VIDEO;
    static const QString EFFECTS_AUDIO;
    static const QString COLOR_FILTERS;
    static const QString LUTS;
    static const QString AUDIO_ENHANCE;
    static const QString TRANSITIONS;
    static const QString TITLES;
    static const QString INTROS;
    static const QString CALLOUTS;
    static const QString IMPORTS;
    static const QString USER_FILES;
    static const QString UNSPLASH;
    static const QString UNSPLASH_SAVED;
    static const QString STICKERS;
    static const QString QUIZZES;
    static const QString THEMES;
    static const QString THEMES_VIDEO;
    static const QString THEMES_AUDIO;
    static const QString THEMES_TITLES;
    static const QString WIZARD_BACKGROUNDS;
    static const QString ANIMATIONS;
    static const QString PANANDZOOM;
    static const QString EFFECTS_PIP;
    static const QString PACKS;
    static const QString TOOLS;
    static const QString MASKS;
};

struct EDITORMODEL_EXPORT CategoryID
{
    static const QString IMPORT;
    static const QString USER_FILES;
    static const QString SAMPLE_MUSIC;
    static const QString SAMPLE_AUDIO;
    static const QString SAMPLE_VIDEO;
    static const QString BACKGROUNDS;
    static const QString INTROS;
    static const QString PACKS;
    static const QString FRAMES;
};

/// Categories that every collection has, whatever it holds.
struct EDITORMODEL_EXPORT ServiceCategories
{
    static const QString ALL;
    static const QString FAVORITES;
    static const QString CATEGORY_SEPARATOR;
};

/// Whether a pack is installed.
namespace PackCategories {
EDITORMODEL_EXPORT extern const QString LOCAL;
EDITORMODEL_EXPORT extern const QString REMOTE;
} // namespace PackCategories

struct EDITORMODEL_EXPORT AudioSourceID
{
    static const QString SOUND_RECORDER;
    static const QString PLAYBACK;
};

EDITORMODEL_EXPORT extern const std::map<QString, QString> collection2collection;

/// A category of a collection.
using CategoryPlace = std::pair<QString, QString>;
EDITORMODEL_EXPORT extern const std::map<CategoryPlace, CategoryPlace> category2category;

/// Empty.
EDITORMODEL_EXPORT extern const std::set<QString> reservedTexts;
EDITORMODEL_EXPORT extern const std::list<qint64> reservedNumbers;

} // namespace EditorCollection

namespace Indication {

/// Marks of which no collection is the bearer.
struct EDITORMODEL_EXPORT IndicationID
{
    static const QString OVERLAY_EDITOR;
    /// The categories of EditorCollection::CollectionID::TOOLS.
    static const QString TOOLS;
};

} // namespace Indication
