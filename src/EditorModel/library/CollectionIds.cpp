// SPDX-License-Identifier: Apache-2.0
// All constants in one source, in the order in which they are made: some are made of others.
#include <EditorModel/library/CollectionIds.h>

namespace EditorCollection {

const QString CollectionID::EFFECTS_VIDEO = QStringLiteral("Effects");
const QString CollectionID::EFFECTS_AUDIO = QStringLiteral("EffectsAudio");
const QString CollectionID::COLOR_FILTERS = QStringLiteral("ColorFilters");
const QString CollectionID::LUTS = QStringLiteral("Luts");
const QString CollectionID::AUDIO_ENHANCE = QStringLiteral("AudioEnhance");
const QString CollectionID::TRANSITIONS = QStringLiteral("Transitions");
const QString CollectionID::TITLES = QStringLiteral("Title");
const QString CollectionID::INTROS = QStringLiteral("Intro");
const QString CollectionID::CALLOUTS = QStringLiteral("Callout");
const QString CollectionID::IMPORTS = QStringLiteral("Imports");
const QString CollectionID::USER_FILES = QStringLiteral("UserFiles");
const QString CollectionID::UNSPLASH = QStringLiteral("Unsplash");
const QString CollectionID::UNSPLASH_SAVED = QStringLiteral("UnsplashSaved");
const QString CollectionID::STICKERS = QStringLiteral("Sticker");
const QString CollectionID::QUIZZES = QStringLiteral("Quiz");
const QString CollectionID::THEMES = QStringLiteral("Themes");
const QString CollectionID::THEMES_VIDEO = QStringLiteral("ThemesVideo");
const QString CollectionID::THEMES_AUDIO = QStringLiteral("ThemesAudio");
const QString CollectionID::THEMES_TITLES = QStringLiteral("ThemesTitles");
const QString CollectionID::WIZARD_BACKGROUNDS = QStringLiteral("WizardBackgrounds");
const QString CollectionID::ANIMATIONS = QStringLiteral("Animations");
const QString CollectionID::PANANDZOOM = QStringLiteral("PanAndZoom");
const QString CollectionID::EFFECTS_PIP = QStringLiteral("PipEffects");
const QString CollectionID::PACKS = QStringLiteral("Packs");
const QString CollectionID::TOOLS = QStringLiteral("Tools");
const QString CollectionID::MASKS = QStringLiteral("Masks");

const QString CategoryID::IMPORT = QStringLiteral("import");
const QString CategoryID::USER_FILES = QStringLiteral("user_files");
const QString CategoryID::SAMPLE_MUSIC = QStringLiteral("sample_music");
const QString CategoryID::SAMPLE_AUDIO = QStringLiteral("sample_audio");
const QString CategoryID::SAMPLE_VIDEO = QStringLiteral("sample_video");
const QString CategoryID::BACKGROUNDS = QStringLiteral("backgrounds");
const QString CategoryID::INTROS = QStringLiteral("intros");
const QString CategoryID::PACKS = QStringLiteral("packs");
const QString CategoryID::FRAMES = QStringLiteral("frames");

const QString ServiceCategories::ALL = QStringLiteral("all");
const QString ServiceCategories::FAVORITES = QStringLiteral("favorites");
const QString ServiceCategories::CATEGORY_SEPARATOR = QStringLiteral("|");

const QString PackCategories::LOCAL = QStringLiteral("local");
const QString PackCategories::REMOTE = QStringLiteral("remote");

const QString AudioSourceID::SOUND_RECORDER = QStringLiteral("soundRecorder");
const QString AudioSourceID::PLAYBACK = QStringLiteral("playback");

const std::map<QString, QString> collection2collection = {
    {CollectionID::CALLOUTS, CollectionID::STICKERS},
};

const std::map<CategoryPlace, CategoryPlace> category2category = {
    {{CollectionID::IMPORTS, QStringLiteral("intros")}, {CollectionID::INTROS, QStringLiteral("intros")}},
    {{CollectionID::COLOR_FILTERS, QStringLiteral("LUT")}, {CollectionID::LUTS, QString()}},
};

const std::set<QString> reservedTexts;
const std::list<qint64> reservedNumbers = {2000, 3000, 4000, 6000, 8000, 10000, 12000};

} // namespace EditorCollection

namespace Indication {

const QString IndicationID::OVERLAY_EDITOR = QStringLiteral("OverlayEditor");
const QString IndicationID::TOOLS = EditorCollection::CollectionID::TOOLS + QStringLiteral("_categories");

} // namespace Indication
