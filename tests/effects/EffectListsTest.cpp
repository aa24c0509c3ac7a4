// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/EffectLists.h>

#include <gmock/gmock.h>

#include <set>
#include <vector>

namespace {

using testing::ElementsAre;

const std::vector<QString> titles = {
    "DiamondLabel",      "EndOfCinema", "HipsterIntro1",     "ModernRibbon", "Quotes", "Simple1",
    "Simple4",           "SimpleText",  "StudioInformation", "TextWithLine", "Timer",  "TextWithDropShadow",
    "TextWithBackground"};

const std::vector<QString> animations = {"FadeInFadeOut", "KenBurnsSmooth"};

const std::vector<QString> transitions = {
    "Crossfade",  "BlurIn",   "DirectCrossFadeRight", "Page Turn - Left Up", "Whoosh 4", "MotionSpin 2",
    "RageZoom 1", "Glitch 3", "Lens - Right Up",      "Parallax_0",          "Flash",    "Cross Zoom - In"};

const std::vector<QString> callouts = {"SketchOvalAnimated", "SketchCheckAnimated", "SketchArrowAnimated",
                                       "ArrowBasicHead1",    "HighlightRectYellow", "ArrowShaped2",
                                       "RedExclamationMark", "ShapeRect",           "SketchRectAnimated"};

const std::vector<QString> stickers = {
    "Objects_Like",       "Emoji_laugh", "Objects_Heart", "Objects_Thumbs up",
    "Love_Heart balloon", "Love_Hearts", "Bang",          "Emoji_smile_2"};

const std::vector<QString> videoEffects = {
    "SharpenHigh",         "RetroArtefactsHigh", "CameraShake",        "FlyingObjectsPaperPlanes",
    "PopArt4Tiles",        "FindEdges",          "OilPaintSmallBrush", "GlassMosaic",
    "TiltShiftMiddle",     "HalfToneColour",     "MotionBlur",         "FixVertVideo",
    "ChromaticAberration", "GlitchMpeg_Low"};

TEST(EffectLists, NameTheAudioEffectsInOrder)
{
    EXPECT_THAT(Effect::AUDIO_EFFECTS,
                ElementsAre("Echo", "Muffle", "Overload", "Oscillation", "Vibrato", "PitchLow",
                            "PitchVeryLow", "PitchHigh", "PitchVeryHigh", "Phone", "Radio", "Robot"));
    EXPECT_EQ(Effect::AUDIO_EFFECTS.size(), 12);
}

TEST(EffectLists, NameTheAudioEnhancementsInOrder)
{
    EXPECT_THAT(Effect::AUDIO_ENHANCEMENTS,
                ElementsAre("VoiceEnhancement", "AutoNoiseRemovalLow", "AutoNoiseRemovalHigh"));
    EXPECT_EQ(Effect::AUDIO_ENHANCEMENTS.size(), 3);
}

TEST(EffectLists, NameTheBuiltInContentOfAllCollections)
{
    std::set<QString> expected;
    for (const auto& group : {titles, animations, transitions, callouts, stickers, videoEffects})
        expected.insert(group.begin(), group.end());
    EXPECT_EQ(expected.size(), 58u);
    EXPECT_EQ(Effect::BUILT_IN_CONTENT, expected);
}

} // namespace
