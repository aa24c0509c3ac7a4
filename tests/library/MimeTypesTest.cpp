// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/Animation.h>
#include <EditorModel/effects/Effect.h>
#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Quiz.h>
#include <EditorModel/effects/TransformationPreset.h>
#include <EditorModel/effects/Transition.h>
#include <EditorModel/library/ImportObject.h>

#include <gtest/gtest.h>

#include <set>
#include <utility>
#include <vector>

namespace {

TEST(MimeTypes, AreTheTextsThatAreOnTheClipboard)
{
    const std::vector<std::pair<const QString*, QString>> texts = {
        {Overlay::Preset::mimeType, "x-application/OverlayPreset-serialized"},
        {Quiz::Preset::mimeType, "x-application/QuizPreset-serialized"},
        {Effect::Object::audioMimeType, "x-application/AudioEffectObject-serialized"},
        {Effect::Object::videoMimeType, "x-application/VideoEffectObject-serialized"},
        {Transition::Object::mimeType, "x-application/TransitionObject-serialized"},
        {Import::Object::mimeType, "x-application/ImportObject-serialized"},
        {Envelope::TransformationPreset::mimeType, "x-application/TransformationItem-serialized"},
        {Animation::itemMimeType, "x-application/AnimationItem-serialized"},
    };
    for (const auto& [mimeType, text] : texts) {
        ASSERT_NE(mimeType, nullptr) << text.toStdString();
        EXPECT_EQ(*mimeType, text);
    }
}

TEST(MimeTypes, OfEffectsGoByTheirType)
{
    using Type = Effect::Object::Type;
    EXPECT_EQ(Effect::Object::mimeType(Type(0)), Effect::Object::videoMimeType);
    EXPECT_EQ(Effect::Object::mimeType(Type(1)), Effect::Object::audioMimeType);
    for (const int other : {-1, 2, 3, 1000})
        EXPECT_EQ(Effect::Object::mimeType(Type(other)), nullptr) << other;
}

} // namespace
