// SPDX-License-Identifier: Apache-2.0
// The names under which elements travel over the clipboard and by drag and drop.
#include <EditorModel/effects/Animation.h>
#include <EditorModel/effects/Effect.h>
#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Quiz.h>
#include <EditorModel/effects/TransformationPreset.h>
#include <EditorModel/effects/Transition.h>
#include <EditorModel/library/ImportObject.h>

namespace {

const QString videoEffect = QStringLiteral("x-application/VideoEffectObject-serialized");
const QString audioEffect = QStringLiteral("x-application/AudioEffectObject-serialized");
const QString transition = QStringLiteral("x-application/TransitionObject-serialized");
const QString overlayPreset = QStringLiteral("x-application/OverlayPreset-serialized");
const QString quizPreset = QStringLiteral("x-application/QuizPreset-serialized");
const QString importObject = QStringLiteral("x-application/ImportObject-serialized");
const QString transformationPreset = QStringLiteral("x-application/TransformationItem-serialized");
const QString animationItem = QStringLiteral("x-application/AnimationItem-serialized");

} // namespace

const QString* const Effect::Object::videoMimeType = &videoEffect;
const QString* const Effect::Object::audioMimeType = &audioEffect;
const QString* const Transition::Object::mimeType = &transition;
const QString* const Overlay::Preset::mimeType = &overlayPreset;
const QString* const Quiz::Preset::mimeType = &quizPreset;
const QString* const Import::Object::mimeType = &importObject;
const QString* const Envelope::TransformationPreset::mimeType = &transformationPreset;
const QString* const Animation::itemMimeType = &animationItem;
