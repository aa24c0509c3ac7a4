// SPDX-License-Identifier: Apache-2.0
#include "Parts.h"

#include <EditorModel/effects/Effect.h>
#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Theme.h>
#include <EditorModel/effects/TransformationPreset.h>
#include <EditorModel/effects/Transition.h>
#include <EditorModel/types/Pen.h>
#include <EditorModel/types/Rect.h>

namespace GoldenTests {
namespace {

Types::Transform numberedTransform()
{
    Types::Transform transform;
    transform.m11 = 1.25;
    transform.m12 = 2;
    transform.m13 = 3;
    transform.m21 = 4;
    transform.m22 = 5;
    transform.m23 = 6;
    transform.m31 = 7;
    transform.m32 = 8;
    transform.m33 = 9;
    return transform;
}

TransformationEnvelope fadingEnvelope()
{
    TransformationEnvelope envelope = opacityEnvelope(80);
    envelope.keyValues.emplace_back();
    envelope.keyValues[0].step = 0.5;
    envelope.keyValues[0].value.opacity = 55;
    return envelope;
}

Overlay::DropShadow shadow()
{
    Overlay::DropShadow shadow;
    shadow.enabled = true;
    shadow.color = 0x80000001;
    shadow.offsetX = -3;
    shadow.offsetY = 7;
    shadow.blurRadius = 8;
    return shadow;
}

Overlay::Item titleItem()
{
    Overlay::Item item;
    item.type = Overlay::Item::Type(6);
    item.text = "Hi";
    item.transform = numberedTransform();
    item.envelope = fadingEnvelope();
    item.scriptRole = "title";
    item.editTime = 0.5;
    item.outline.color = 0xFF00FF00;
    item.outline.width = 2;
    item.outline.enabled = true;
    item.editable = false;
    item.features = 9;
    item.textWidth = 0.625;
    item.arcRadius = -0.75;
    item.from = 0.125;
    item.to = 0.875;
    item.intro = 0.25;
    item.outro = 0.375;
    item.dropShadow = shadow();
    return item;
}

void fillTransform(Sample& sample)
{
    sample.root<Types::Transform>() = numberedTransform();
}

void fillPen(Sample& sample)
{
    auto& pen = sample.root<Types::Pen>();
    pen.color = 0x80FF0040;
    pen.width = 3;
    pen.enabled = true;
}

void fillRect(Sample& sample)
{
    auto& rect = sample.root<Types::Rect>();
    rect.left = 1;
    rect.top = 2;
    rect.right = 3;
    rect.bottom = 4;
}

void fillTransformation(Sample& sample)
{
    auto& transformation = sample.root<Transformation::Object>();
    transformation.matrix = numberedTransform();
    transformation.opacity = 60;
}

void fillVolumeKey(Sample& sample)
{
    auto& key = sample.root<VolumeEnvelope::Key>();
    key.step = 0.25;
    key.value = 0.75;
}

void fillTransformationKey(Sample& sample)
{
    auto& key = sample.root<TransformationEnvelope::Key>();
    key.step = 0.5;
    key.value.matrix = numberedTransform();
    key.value.opacity = 55;
}

void fillVolumeEnvelope(Sample& sample)
{
    auto& envelope = sample.root<VolumeEnvelope>();
    envelope.defaultValue = 0.5;
    envelope.keyValues = {{0.25, 2.0}, {0.75, 0.125}};
}

void fillTransformationEnvelope(Sample& sample)
{
    sample.root<TransformationEnvelope>() = fadingEnvelope();
}

void fillTransformationPreset(Sample& sample)
{
    auto& preset = sample.root<Envelope::TransformationPreset>();
    preset.type = Envelope::TransformationPreset::Type(7);
    preset.tag = "Zoom";
    preset.description = "Slow";
    preset.sourceDuration = 4400;
    preset.transformation = fadingEnvelope();
}

void fillEffect(Sample& sample)
{
    auto& effect = sample.root<Effect::Object>();
    effect.id = "blur";
    effect.tag = "Blur";
    effect.uniqueId = "{e}";
    effect.description = "Soft";
    effect.intensity = 0.25;
    effect.bypass = true;
}

void fillTransition(Sample& sample)
{
    auto& transition = sample.root<Transition::Object>();
    transition.id = "fade";
    transition.tag = "Fade";
    transition.description = "Soft";
    transition.strategy = Transition::Object::Strategy(2);
    transition.type = Transition::Object::Type(3);
    transition.resources = {
        {"matte", Resource::VideoType}, {"whoosh", Resource::AudioType}, {"mask", Resource::ImageType}};
    transition.defaultDuration = 1500;
    transition.volume = 40;
}

void fillTheme(Sample& sample)
{
    auto& theme = sample.root<Theme::Object>();
    theme.tag = "Party";
    theme.transitionsList = {"wipe", "fade"};
    theme.previewVideo = "party.mov";
    theme.music = "party.flac";
    theme.startTitle = "Hello";
    theme.finalTitle = "Goodbye";
    theme.minSceneDuration = 1100;
    theme.maxSceneDuration = 2200;
}

void fillQuestion(Sample& sample)
{
    sample.root<Quiz::Question>() = evenNumbers();
}

void fillQuiz(Sample& sample)
{
    auto& quiz = sample.root<Quiz::Preset>();
    quiz.questions = {evenNumbers()};
    quiz.tag = "Numbers";
    quiz.description = "Easy";
}

void fillShadow(Sample& sample)
{
    sample.root<Overlay::DropShadow>() = shadow();
}

void fillOverlayItem(Sample& sample)
{
    sample.root<Overlay::Item>() = titleItem();
}

void fillOverlay(Sample& sample)
{
    auto& preset = sample.root<Overlay::Preset>();
    preset.type = Overlay::Preset::Type(5);
    preset.scriptId = "slide";
    preset.scriptSpeed = 1.5;
    preset.items = {titleItem(), Overlay::Item()};
    preset.tag = "Greeting";
    preset.description = "Short";
    preset.sourceDuration = 3300;
}

} // namespace

Quiz::Question evenNumbers()
{
    Quiz::Question question;
    question.type = Quiz::Question::Type(4);
    question.text = "Which are even?";
    question.answers = {"two", "three", "four"};
    question.correctAnswers = {"two", "four"};
    return question;
}

TransformationEnvelope opacityEnvelope(int percent)
{
    TransformationEnvelope envelope;
    envelope.defaultValue.opacity = percent;
    return envelope;
}

std::vector<NamedSample> effectSamples()
{
    return {
        {"Types::Transform", fillTransform},
        {"Types::Pen", fillPen},
        {"Types::Rect", fillRect},
        {"Transformation::Object", fillTransformation},
        {"AnimationDoubleKeyValue", fillVolumeKey},
        {"AnimationTransformationKeyValue", fillTransformationKey},
        {"VolumeEnvelope", fillVolumeEnvelope},
        {"TransformationEnvelope", fillTransformationEnvelope},
        {"Envelope::TransformationPreset", fillTransformationPreset},
        {"Effect::Object", fillEffect},
        {"Transition::Object", fillTransition},
        {"Theme::Object", fillTheme},
        {"Quiz::Question", fillQuestion},
        {"Quiz::Preset", fillQuiz},
        {"Overlay::DropShadow", fillShadow},
        {"Overlay::Item", fillOverlayItem},
        {"Overlay::Preset", fillOverlay},
    };
}

} // namespace GoldenTests
