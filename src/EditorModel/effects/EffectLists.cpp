// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/EffectLists.h>

namespace Effect {

const QStringList AUDIO_EFFECTS = {
    "Echo",         "Muffle",    "Overload",      "Oscillation", "Vibrato", "PitchLow",
    "PitchVeryLow", "PitchHigh", "PitchVeryHigh", "Phone",       "Radio",   "Robot",
};

const QStringList AUDIO_ENHANCEMENTS = {
    "VoiceEnhancement",
    "AutoNoiseRemovalLow",
    "AutoNoiseRemovalHigh",
};

const std::set<QString> BUILT_IN_CONTENT = {
    // Titles
    "DiamondLabel",
    "EndOfCinema",
    "HipsterIntro1",
    "ModernRibbon",
    "Quotes",
    "Simple1",
    "Simple4",
    "SimpleText",
    "StudioInformation",
    "TextWithLine",
    "Timer",
    "TextWithDropShadow",
    "TextWithBackground",
    // Animation
    "FadeInFadeOut",
    "KenBurnsSmooth",
    // Transitions
    "Crossfade",
    "BlurIn",
    "DirectCrossFadeRight",
    "Page Turn - Left Up",
    "Whoosh 4",
    "MotionSpin 2",
    "RageZoom 1",
    "Glitch 3",
    "Lens - Right Up",
    "Parallax_0",
    "Flash",
    "Cross Zoom - In",
    // Callouts
    "SketchOvalAnimated",
    "SketchCheckAnimated",
    "SketchArrowAnimated",
    "ArrowBasicHead1",
    "HighlightRectYellow",
    "ArrowShaped2",
    "RedExclamationMark",
    "ShapeRect",
    "SketchRectAnimated",
    // Stickers
    "Objects_Like",
    "Emoji_laugh",
    "Objects_Heart",
    "Objects_Thumbs up",
    "Love_Heart balloon",
    "Love_Hearts",
    "Bang",
    "Emoji_smile_2",
    // Video effects
    "SharpenHigh",
    "RetroArtefactsHigh",
    "CameraShake",
    "FlyingObjectsPaperPlanes",
    "PopArt4Tiles",
    "FindEdges",
    "OilPaintSmallBrush",
    "GlassMosaic",
    "TiltShiftMiddle",
    "HalfToneColour",
    "MotionBlur",
    "FixVertVideo",
    "ChromaticAberration",
    "GlitchMpeg_Low",
};

} // namespace Effect
