// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/EditorCollection.h>
#include <EditorModel/library/Indication.h>

#include <gmock/gmock.h>

#include <string>
#include <utility>
#include <vector>

namespace {

using EditorCollection::AudioSourceID;
using EditorCollection::CategoryID;
using EditorCollection::CategoryPlace;
using EditorCollection::CollectionID;
using EditorCollection::ServiceCategories;
using Indication::IndicationID;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::Pair;

struct Constant
{
    const char* name;
    const QString& value;
    const char* text;
};

void PrintTo(const Constant& constant, std::ostream* stream)
{
    *stream << constant.name;
}

#define CONSTANT(name, text)                                                                                 \
    {                                                                                                        \
#name, name, text                                                                                    \
    }

const std::vector<Constant> constants = {
    CONSTANT(CollectionID::EFFECTS_VIDEO, "Effects"),
    CONSTANT(CollectionID::EFFECTS_AUDIO, "EffectsAudio"),
    CONSTANT(CollectionID::COLOR_FILTERS, "ColorFilters"),
    CONSTANT(CollectionID::LUTS, "Luts"),
    CONSTANT(CollectionID::AUDIO_ENHANCE, "AudioEnhance"),
    CONSTANT(CollectionID::TRANSITIONS, "Transitions"),
    CONSTANT(CollectionID::TITLES, "Title"),
    CONSTANT(CollectionID::INTROS, "Intro"),
    CONSTANT(CollectionID::CALLOUTS, "Callout"),
    CONSTANT(CollectionID::IMPORTS, "Imports"),
    CONSTANT(CollectionID::USER_FILES, "UserFiles"),
    CONSTANT(CollectionID::UNSPLASH, "Unsplash"),
    CONSTANT(CollectionID::UNSPLASH_SAVED, "UnsplashSaved"),
    CONSTANT(CollectionID::STICKERS, "Sticker"),
    CONSTANT(CollectionID::QUIZZES, "Quiz"),
    CONSTANT(CollectionID::THEMES, "Themes"),
    CONSTANT(CollectionID::THEMES_VIDEO, "ThemesVideo"),
    CONSTANT(CollectionID::THEMES_AUDIO, "ThemesAudio"),
    CONSTANT(CollectionID::THEMES_TITLES, "ThemesTitles"),
    CONSTANT(CollectionID::WIZARD_BACKGROUNDS, "WizardBackgrounds"),
    CONSTANT(CollectionID::ANIMATIONS, "Animations"),
    CONSTANT(CollectionID::PANANDZOOM, "PanAndZoom"),
    CONSTANT(CollectionID::EFFECTS_PIP, "PipEffects"),
    CONSTANT(CollectionID::PACKS, "Packs"),
    CONSTANT(CollectionID::TOOLS, "Tools"),
    CONSTANT(CollectionID::MASKS, "Masks"),
    CONSTANT(CategoryID::IMPORT, "import"),
    CONSTANT(CategoryID::USER_FILES, "user_files"),
    CONSTANT(CategoryID::SAMPLE_MUSIC, "sample_music"),
    CONSTANT(CategoryID::SAMPLE_AUDIO, "sample_audio"),
    CONSTANT(CategoryID::SAMPLE_VIDEO, "sample_video"),
    CONSTANT(CategoryID::BACKGROUNDS, "backgrounds"),
    CONSTANT(CategoryID::INTROS, "intros"),
    CONSTANT(CategoryID::PACKS, "packs"),
    CONSTANT(CategoryID::FRAMES, "frames"),
    CONSTANT(ServiceCategories::ALL, "all"),
    CONSTANT(ServiceCategories::FAVORITES, "favorites"),
    CONSTANT(ServiceCategories::CATEGORY_SEPARATOR, "|"),
    CONSTANT(EditorCollection::PackCategories::LOCAL, "local"),
    CONSTANT(EditorCollection::PackCategories::REMOTE, "remote"),
    CONSTANT(AudioSourceID::SOUND_RECORDER, "soundRecorder"),
    CONSTANT(AudioSourceID::PLAYBACK, "playback"),
    CONSTANT(IndicationID::OVERLAY_EDITOR, "OverlayEditor"),
    CONSTANT(IndicationID::TOOLS, "Tools_categories"),
};

class LibraryConstant : public ::testing::TestWithParam<Constant>
{};

TEST_P(LibraryConstant, HasTheTextThatIsStored)
{
    EXPECT_EQ(GetParam().value, QLatin1String(GetParam().text));
}

INSTANTIATE_TEST_SUITE_P(All, LibraryConstant, ::testing::ValuesIn(constants), [](const auto& instance) {
    std::string name = instance.param.name;
    for (std::size_t colons = name.find("::"); colons != std::string::npos; colons = name.find("::"))
        name.replace(colons, 2, "_");
    return name;
});

TEST(LibraryTables, CalloutsGoToTheStickers)
{
    EXPECT_THAT(EditorCollection::collection2collection,
                ElementsAre(Pair(QString("Callout"), QString("Sticker"))));
}

TEST(LibraryTables, TwoCategoriesHaveMovedToCollectionsOfTheirOwn)
{
    EXPECT_THAT(EditorCollection::category2category,
                ElementsAre(Pair(CategoryPlace("ColorFilters", "LUT"), CategoryPlace("Luts", "")),
                            Pair(CategoryPlace("Imports", "intros"), CategoryPlace("Intro", "intros"))));
}

TEST(LibraryTables, TheReservedOnesHaveTheirContents)
{
    EXPECT_THAT(EditorCollection::reservedTexts, IsEmpty());
    EXPECT_THAT(EditorCollection::reservedNumbers, ElementsAre(2000, 3000, 4000, 6000, 8000, 10000, 12000));
}

} // namespace
