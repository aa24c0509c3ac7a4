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
    static const QString EFFECTS_VIDEO;      ///< "Effects"
    static const QString EFFECTS_AUDIO;      ///< "EffectsAudio"
    static const QString COLOR_FILTERS;      ///< "ColorFilters"
    static const QString LUTS;               ///< "Luts"
    static const QString AUDIO_ENHANCE;      ///< "AudioEnhance"
    static const QString TRANSITIONS;        ///< "Transitions"
    static const QString TITLES;             ///< "Title"
    static const QString INTROS;             ///< "Intro"
    static const QString CALLOUTS;           ///< "Callout"
    static const QString IMPORTS;            ///< "Imports"
    static const QString USER_FILES;         ///< "UserFiles"
    static const QString UNSPLASH;           ///< "Unsplash"
    static const QString UNSPLASH_SAVED;     ///< "UnsplashSaved"
    static const QString STICKERS;           ///< "Sticker"
    static const QString QUIZZES;            ///< "Quiz"
    static const QString THEMES;             ///< "Themes"
    static const QString THEMES_VIDEO;       ///< "ThemesVideo"
    static const QString THEMES_AUDIO;       ///< "ThemesAudio"
    static const QString THEMES_TITLES;      ///< "ThemesTitles"
    static const QString WIZARD_BACKGROUNDS; ///< "WizardBackgrounds"
    static const QString ANIMATIONS;         ///< "Animations"
    static const QString PANANDZOOM;         ///< "PanAndZoom"
    static const QString EFFECTS_PIP;        ///< "PipEffects"
    static const QString PACKS;              ///< "Packs"
    static const QString TOOLS;              ///< "Tools"
    static const QString MASKS;              ///< "Masks"
};

struct EDITORMODEL_EXPORT CategoryID
{
    static const QString IMPORT;       ///< "import"
    static const QString USER_FILES;   ///< "user_files"
    static const QString SAMPLE_MUSIC; ///< "sample_music"
    static const QString SAMPLE_AUDIO; ///< "sample_audio"
    static const QString SAMPLE_VIDEO; ///< "sample_video"
    static const QString BACKGROUNDS;  ///< "backgrounds"
    static const QString INTROS;       ///< "intros"
    static const QString PACKS;        ///< "packs"
    static const QString FRAMES;       ///< "frames"
};

/// Special categories. Which texts the separator stands between is up to the modules.
struct EDITORMODEL_EXPORT ServiceCategories
{
    static const QString ALL;                ///< "all"
    static const QString FAVORITES;          ///< "favorites"
    static const QString CATEGORY_SEPARATOR; ///< "|"
};

/// Categories of packs.
namespace PackCategories {
EDITORMODEL_EXPORT extern const QString LOCAL;  ///< "local"
EDITORMODEL_EXPORT extern const QString REMOTE; ///< "remote"
} // namespace PackCategories

struct EDITORMODEL_EXPORT AudioSourceID
{
    static const QString SOUND_RECORDER; ///< "soundRecorder"
    static const QString PLAYBACK;       ///< "playback"
};

/// From the callouts to the stickers.
EDITORMODEL_EXPORT extern const std::map<QString, QString> collection2collection;

/// A category of a collection.
using CategoryPlace = std::pair<QString, QString>;
/// From "intros" of the imports to "intros" of the intros, and from "LUT" of the colour filters to the
/// look-up tables, with an empty category.
EDITORMODEL_EXPORT extern const std::map<CategoryPlace, CategoryPlace> category2category;

/// Empty.
EDITORMODEL_EXPORT extern const std::set<QString> reservedTexts;
/// 2000, 3000, 4000, 6000, 8000, 10000 and 12000.
EDITORMODEL_EXPORT extern const std::list<qint64> reservedNumbers;

} // namespace EditorCollection

namespace Indication {

/// Marks of which no collection is the bearer.
struct EDITORMODEL_EXPORT IndicationID
{
    static const QString OVERLAY_EDITOR; ///< "OverlayEditor"
    static const QString TOOLS; ///< "Tools_categories", made of EditorCollection::CollectionID::TOOLS
};

} // namespace Indication
