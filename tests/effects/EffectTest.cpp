// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldTexts.h"
#include "tests/shared/VirtualSlots.h"

#include <EditorModel/effects/Effect.h>
#include <EditorModel/persistence/Fields.h>

#include <gmock/gmock.h>

namespace EffectTests {

/// An effect of a module, without a field list of its own.
class Speech : public Effect::Object
{
    EDITORMODEL_PERSISTENT(Speech)

public:
    Type type() const override { return Audio; }
    Impl impl() const override { return Impl(7); }
    bool hasIntensity() const override { return true; }
    QString defaultTag() const override { return QStringLiteral("Voice"); }
};

} // namespace EffectTests

EDITORMODEL_ARCHIVE_NAME(EffectTests::Speech, "EffectTests::Speech")
EDITORMODEL_PERSISTENT_CLASS(EffectTests::Speech, Effect::Object)

namespace {

using EffectTests::Speech;
using testing::ElementsAre;
using Testing::FieldText;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, Effect::Object>);
static_assert(Testing::isVirtualBase<PubSub::Object, Effect::Object>);

Effect::Object everyFieldSet()
{
    Effect::Object effect("Blur", "{1}");
    effect.setTag("Soft")->setDescription("Makes it soft")->setBypass(true);
    effect.intensity = 0.25;
    return effect;
}

TEST(Effect, IsMadeWithItsIdentifiers)
{
    EXPECT_EQ(Effect::Object("Blur").id, "Blur");
    EXPECT_EQ(Effect::Object("Blur").uniqueId, QString());
    const Effect::Object effect("Blur", "{1}");
    EXPECT_EQ(effect.id, "Blur");
    EXPECT_EQ(effect.uniqueId, "{1}");
    EXPECT_THAT(Testing::defaultFields(effect), ElementsAre("tag", "description", "intensity", "bypass"));
}

TEST(Effect, AnswersForAPictureWithoutIntensity)
{
    const Effect::Object effect("Blur");
    EXPECT_EQ(effect.type(), 0);
    EXPECT_EQ(effect.impl(), 1);
    EXPECT_FALSE(effect.hasIntensity());
    EXPECT_EQ(effect.defaultTag(), QString());
}

TEST(Effect, AModuleReplacesTheAnswers)
{
    const Speech speech;
    const Effect::Object& effect = speech;
    EXPECT_EQ(effect.type(), 1);
    EXPECT_EQ(effect.impl(), 7);
    EXPECT_TRUE(effect.hasIntensity());
    EXPECT_EQ(effect.defaultTag(), "Voice");
}

#if defined(__GXX_ABI_VERSION)

/// Behind the destructor and the three of the persistent root: the four queries.
TEST(Effect, ItsVirtualFunctionsKeepTheirPlaces)
{
    using Testing::callSlot;
    const Speech speech;
    const Effect::Object* const effect = &speech;
    EXPECT_EQ(callSlot<std::string>(effect, 2), "EffectTests::Speech");
    EXPECT_EQ(callSlot<Effect::Object::Type>(effect, 5), 1);
    EXPECT_EQ(callSlot<Effect::Object::Impl>(effect, 6), 7);
    EXPECT_EQ(callSlot<bool>(effect, 7), true);
    EXPECT_EQ(callSlot<QString>(effect, 8), "Voice");
}

#endif

TEST(Effect, HasAMimeTypeForPicturesAndOneForSound)
{
    EXPECT_EQ(*Effect::Object::videoMimeType, "x-application/VideoEffectObject-serialized");
    EXPECT_EQ(*Effect::Object::audioMimeType, "x-application/AudioEffectObject-serialized");
    EXPECT_EQ(Effect::Object::mimeType(Effect::Object::Video), Effect::Object::videoMimeType);
    EXPECT_EQ(Effect::Object::mimeType(Effect::Object::Audio), Effect::Object::audioMimeType);
    EXPECT_EQ(Effect::Object::mimeType(Effect::Object::Type(0)), Effect::Object::videoMimeType);
    EXPECT_EQ(Effect::Object::mimeType(Effect::Object::Type(1)), Effect::Object::audioMimeType);
}

TEST(Effect, HasNoMimeTypeForAnythingElse)
{
    EXPECT_EQ(Effect::Object::mimeType(Effect::Object::Type(2)), nullptr);
    EXPECT_EQ(Effect::Object::mimeType(Effect::Object::Type(-1)), nullptr);
}

TEST(Effect, IsWrittenWithItsTagInTheSecondPlace)
{
    EXPECT_THAT(Testing::fieldTexts(everyFieldSet()),
                ElementsAre(FieldText("id", "Q\"Blur\""), FieldText("tag", "Q\"Soft\""),
                            FieldText("uniqueId", "Q\"%7B1%7D\""),
                            FieldText("description", "Q\"Makes it soft\""), FieldText("intensity", "0.25"),
                            FieldText("bypass", "true")));
}

TEST(Effect, IsMadeByName)
{
    Testing::expectMadeByName<Effect::Object>("Effect::Object");
}

TEST(Effect, ADerivedEffectIsWrittenWithTheSameFields)
{
    Testing::expectMadeByName<Speech>("EffectTests::Speech");
    EXPECT_EQ(Testing::fieldKeys(Speech()), Testing::fieldKeys(Effect::Object()));
}

class EffectInEveryForm : public testing::TestWithParam<Way>
{};

INSTANTIATE_TEST_SUITE_P(Ways, EffectInEveryForm, testing::ValuesIn(allWays),
                         [](const auto& instance) { return std::string(instance.param.name); });

TEST_P(EffectInEveryForm, KeepsTheTagOfTheDerivedEffectThatItWasWrittenFrom)
{
    Speech speech;
    speech.setTag(speech.defaultTag());
    const Effect::Object effect(speech);
    const Document::Graph graph = graphOf(documentOf({&effect}, GetParam()));
    const auto* const loaded = graph.rootAs<Effect::Object>();
    ASSERT_NE(loaded, nullptr);
    EXPECT_EQ(loaded->tag, "Voice");
    EXPECT_EQ(loaded->defaultTag(), QString());
}

TEST_P(EffectInEveryForm, ADerivedEffectComesBackAsWhatItWas)
{
    Speech speech;
    static_cast<Effect::Object&>(speech) = everyFieldSet();
    const Document::Graph graph = graphOf(documentOf({&speech}, GetParam()));
    ASSERT_NE(graph.rootAs<Speech>(), nullptr);
    EXPECT_EQ(Testing::fieldTexts(*graph.rootAs<Speech>()), Testing::fieldTexts(everyFieldSet()));
}

} // namespace
