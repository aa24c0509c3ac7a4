// SPDX-License-Identifier: Apache-2.0
#include "ClassTable.h"

#include <EditorModel/effects/Effect.h>
#include <EditorModel/effects/Envelope.h>
#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Quiz.h>
#include <EditorModel/effects/Theme.h>
#include <EditorModel/effects/TransformationPreset.h>
#include <EditorModel/effects/Transition.h>
#include <EditorModel/types/Transform.h>

namespace FieldTests {
namespace {

const Types::Transform identity(1.0, 0.0, 0.0, 0.0, 1.0, 0.0, 0.0, 0.0, 1.0);

ClassTable transformation()
{
    using Transformation::Object;
    return ClassOf<Object>("Transformation::Object")
        .field<&Object::matrix, &Object::setMatrix>("matrix", identity)
        .field<&Object::opacity, &Object::setOpacity>("opacity", 100);
}

ClassTable volumeKey()
{
    using Key = Animation::KeyValue<double>;
    return ClassOf<Key>("Animation::KeyValue<double>")
        .field<&Key::step>("step", 0.0)
        .field<&Key::value>("value", 0.0);
}

ClassTable transformationKey()
{
    using Key = Animation::KeyValue<Transformation::Object>;
    return ClassOf<Key>("Animation::KeyValue<Transformation::Object>")
        .field<&Key::step>("step", 0.0)
        .field<&Key::value>("value", {identity, 100});
}

ClassTable volumeEnvelope()
{
    return ClassOf<VolumeEnvelope>("VolumeEnvelope")
        .field<&VolumeEnvelope::keyValues>("keyValues", {})
        .field<&VolumeEnvelope::defaultValue>("defaultValue", 1.0);
}

ClassTable transformationEnvelope()
{
    return ClassOf<TransformationEnvelope>("TransformationEnvelope")
        .field<&TransformationEnvelope::keyValues>("keyValues", {})
        .field<&TransformationEnvelope::defaultValue>("defaultValue", {identity, 100});
}

ClassTable effect()
{
    using Effect::Object;
    return ClassOf<Object>("Effect::Object")
        .field<&Object::id>("id", "")
        .field<&Object::uniqueId>("uniqueId", "")
        .field<&Object::tag, &Object::setTag>("tag", "")
        .field<&Object::description, &Object::setDescription>("description", "")
        .field<&Object::intensity>("intensity", 1.0)
        .field<&Object::bypass, &Object::setBypass>("bypass", false);
}

ClassTable transition()
{
    using Transition::Object;
    return ClassOf<Object>("Transition::Object")
        .field<&Object::id>("id", "")
        .field<&Object::tag>("tag", "")
        .field<&Object::description>("description", "")
        .field<&Object::strategy>("strategy", Object::Strategy(0))
        .field<&Object::type>("type", Object::Type(0))
        .field<&Object::defaultDuration>("defaultDuration", 2000)
        .field<&Object::resources>("resources", {})
        .field<&Object::volume>("volume", 100);
}

ClassTable theme()
{
    using Theme::Object;
    return ClassOf<Object>("Theme::Object")
        .field<&Object::tag>("tag", "")
        .field<&Object::transitionsList>("transitionsList", {})
        .field<&Object::previewVideo>("previewVideo", "")
        .field<&Object::music>("music", "")
        .field<&Object::startTitle>("startTitle", "")
        .field<&Object::finalTitle>("finalTitle", "")
        .field<&Object::minSceneDuration>("minSceneDuration", 4000)
        .field<&Object::maxSceneDuration>("maxSceneDuration", 5000);
}

ClassTable dropShadow()
{
    using Overlay::DropShadow;
    return ClassOf<DropShadow>("Overlay::DropShadow")
        .field<&DropShadow::enabled>("enabled", false)
        .field<&DropShadow::color>("color", 0xb43f3f3f)
        .field<&DropShadow::offsetX>("offsetX", 4)
        .field<&DropShadow::offsetY>("offsetY", 4)
        .field<&DropShadow::blurRadius>("blurRadius", 1);
}

ClassTable overlayItem()
{
    using Overlay::Item;
    return ClassOf<Item>("Overlay::Item", Returns::Reference)
        .field<&Item::type, &Item::setType>("type", Item::Type(0))
        .field<&Item::text, &Item::setText>("text", "")
        .field<&Item::transform, &Item::setTransform>("transform", identity)
        .field<&Item::envelope, &Item::setEnvelope>("envelope", {})
        .field<&Item::scriptRole, &Item::setScriptRole>("scriptRole", "")
        .field<&Item::editTime, &Item::setEditTime>("editTime", 0.0)
        .field<&Item::outline, &Item::setOutline>("outline", {0xff000000, 0, false})
        .field<&Item::editable, &Item::setEditable>("editable", true)
        .field<&Item::features>("features", 0)
        .field<&Item::from, &Item::setFrom>("from", 0.0)
        .field<&Item::to, &Item::setTo>("to", 1.0)
        .field<&Item::intro, &Item::setIntro>("intro", 0.0)
        .field<&Item::outro, &Item::setOutro>("outro", 0.0)
        .field<&Item::textWidth, &Item::setTextWidth>("textWidth", 0.0)
        .field<&Item::arcRadius, &Item::setArcRadius>("arcRadius", 0.0)
        .field<&Item::dropShadow, &Item::setDropShadow>("dropShadow", {});
}

ClassTable overlayPreset()
{
    using Overlay::Preset;
    return ClassOf<Preset>("Overlay::Preset")
        .field<&Preset::type, &Preset::setType>("type", Preset::Type(0))
        .field<&Preset::scriptId, &Preset::setScriptId>("scriptId", "")
        .field<&Preset::scriptSpeed, &Preset::setScriptSpeed>("scriptSpeed", 1.0)
        .field<&Preset::items>("items", {})
        .field<&Preset::tag, &Preset::setTag>("tag", "")
        .field<&Preset::description, &Preset::setDescription>("description", "")
        .field<&Preset::sourceDuration, &Preset::setSourceDuration>("sourceDuration", 0);
}

ClassTable quizQuestion()
{
    using Quiz::Question;
    return ClassOf<Question>("Quiz::Question")
        .field<&Question::type>("type", Question::Type(0))
        .field<&Question::text>("text", "")
        .field<&Question::answers>("answers", {})
        .field<&Question::correctAnswers>("correctAnswers", {});
}

ClassTable quizPreset()
{
    using Quiz::Preset;
    return ClassOf<Preset>("Quiz::Preset")
        .field<&Preset::questions>("questions", {})
        .field<&Preset::tag>("tag", "")
        .field<&Preset::description>("description", "");
}

ClassTable transformationPreset()
{
    using Preset = Envelope::TransformationPreset;
    return ClassOf<Preset>("Envelope::TransformationPreset")
        .field<&Preset::type>("type", Preset::Type(0))
        .field<&Preset::tag>("tag", "")
        .field<&Preset::description>("description", "")
        .field<&Preset::sourceDuration>("sourceDuration", 0)
        .field<&Preset::transformation>("transformation", {});
}

} // namespace

std::vector<ClassTable> effectClasses()
{
    return {transformation(),
            volumeKey(),
            transformationKey(),
            volumeEnvelope(),
            transformationEnvelope(),
            effect(),
            transition(),
            theme(),
            dropShadow(),
            overlayItem(),
            overlayPreset(),
            quizQuestion(),
            quizPreset(),
            transformationPreset()};
}

} // namespace FieldTests
