// SPDX-License-Identifier: Apache-2.0
#include "host/editing/EffectRules.h"

#include <gmock/gmock.h>

#include <memory>
#include <string>
#include <vector>

namespace {

using Effect::EffectHelper;
using testing::ElementsAre;
using testing::IsEmpty;

class AudioEffect : public Effect::Object
{
public:
    using Effect::Object::Object;
    Type type() const override { return Audio; }
};

/// A chain whose effects tell in their tags in which place they were.
class Chain
{
public:
    Chain& video(const QString& id) { return add(std::make_unique<Effect::Object>(id)); }
    Chain& audio(const QString& id) { return add(std::make_unique<AudioEffect>(id)); }

    Effect::List list;

private:
    Chain& add(std::unique_ptr<Effect::Object> effect)
    {
        effect->setTag(QString::number(m_effects.size() + 1));
        list.push_back(effect.get());
        m_effects.push_back(std::move(effect));
        return *this;
    }

    std::vector<std::unique_ptr<Effect::Object>> m_effects;
};

/// "Sepia 1" for the effect with this identifier in the first place; no number for what the rules made.
std::vector<std::string> names(const Effect::List& list)
{
    std::vector<std::string> texts;
    for (const Effect::Object* effect : list) {
        texts.push_back(effect ? (effect->id + ' ' + effect->tag).trimmed().toStdString() : "null");
    }
    return texts;
}

TEST(EffectRules, PutThePictureBeforeTheSoundAndRepairsBeforeAll)
{
    const Host::EffectRules rules;
    Chain chain;
    chain.audio("AudioNormalize").audio("Echo").video("PictureInPicture").video("Sepia").video("Crop");
    chain.video("Stabilization").video("MotionBlur");
    EffectHelper::sortEffects(chain.list);
    EXPECT_THAT(names(chain.list), ElementsAre("Stabilization 6", "Crop 5", "Sepia 4", "MotionBlur 7",
                                               "PictureInPicture 3", "Echo 2", "AudioNormalize 1"));
}

TEST(EffectRules, SortEffectsOfOneRankStably)
{
    const Host::EffectRules rules;
    Chain chain;
    chain.video("b").audio("y").video("a").audio("x").video("FlipVertical").video("Crop").video("b");
    chain.video("FixVertVideo").video("Deinterlace").audio("LoudnessMatch").audio("AudioNormalize");
    EffectHelper::sortEffects(chain.list);
    EXPECT_THAT(names(chain.list),
                ElementsAre("FixVertVideo 8", "Deinterlace 9", "FlipVertical 5", "Crop 6", "b 1", "a 3",
                            "b 7", "y 2", "x 4", "LoudnessMatch 10", "AudioNormalize 11"));
    const std::vector<std::string> sorted = names(chain.list);
    EffectHelper::sortEffects(chain.list);
    EXPECT_EQ(names(chain.list), sorted);
}

struct Filter
{
    const char* name;
    Effect::List (*remove)(Effect::List& list);
    std::vector<QString> ids;
};

class EffectRulesFilter : public testing::TestWithParam<Filter>
{};

TEST_P(EffectRulesFilter, MovesEachOfItsEffectsInTheirOrderAndNoOther)
{
    const Host::EffectRules rules;
    Chain chain;
    std::vector<std::string> moved;
    std::vector<std::string> kept;
    int place = 0;
    // In turns with effects that stay, and once more in the other order.
    std::vector<QString> ids = GetParam().ids;
    ids.insert(ids.end(), GetParam().ids.rbegin(), GetParam().ids.rend());
    for (const QString& id : ids) {
        chain.video("MotionBlur").video(id);
        kept.push_back("MotionBlur " + std::to_string(++place));
        moved.push_back(id.toStdString() + ' ' + std::to_string(++place));
    }
    EXPECT_EQ(names(GetParam().remove(chain.list)), moved);
    EXPECT_EQ(names(chain.list), kept);
    EXPECT_THAT(GetParam().remove(chain.list), IsEmpty());
}

const std::vector<Filter> filters = {
    {"PictureInPicture", &EffectHelper::removeAllPiPEffects, {"PictureInPicture", "PictureInPictureShadow"}},
    {"Static",
     &EffectHelper::removeAllStaticEffects,
     {"Sepia", "Vignette", "FindEdges", "HalfToneColour", "SharpenHigh"}},
    {"Normalizing", &EffectHelper::removeAudioNormalizeEffects, {"AudioNormalize", "LoudnessMatch"}},
    {"CropTranspose",
     &EffectHelper::removeCropTransposeEffects,
     {"Crop", "RotateLeft", "RotateRight", "FlipHorizontal", "FlipVertical"}},
    {"PreTransform",
     &EffectHelper::removePreTransformEffects,
     {"Deinterlace", "Stabilization", "FixVertVideo"}},
};

INSTANTIATE_TEST_SUITE_P(Filters, EffectRulesFilter, testing::ValuesIn(filters),
                         [](const auto& filter) { return std::string(filter.param.name); });

TEST(EffectRules, LetEachEffectBeOfOneKind)
{
    const Host::EffectRules rules;
    for (const Filter& filter : filters) {
        Chain chain;
        for (const QString& id : filter.ids) {
            chain.video(id);
        }
        const std::vector<std::string> all = names(chain.list);
        for (const Filter& other : filters) {
            if (other.remove != filter.remove) {
                EXPECT_THAT(other.remove(chain.list), IsEmpty()) << other.name;
            }
        }
        EXPECT_EQ(names(chain.list), all);
    }
}

TEST(EffectRules, PutWhatAHolderHoldsInItsPlace)
{
    const Host::EffectRules rules;
    Chain chain;
    chain.video("Crop").video("SilentMovie").audio("PhoneCall").video("OldFilm").audio("Echo");
    EffectHelper::expandEffectsHolders(chain.list);
    EXPECT_THAT(names(chain.list),
                ElementsAre("Crop 1", "Sepia", "FilmGrain", "Vignette", "FrameJitter", "Phone",
                            "AudioNormalize", "Sepia", "FilmGrain", "Vignette", "Echo 5"));
    EXPECT_EQ(chain.list[4]->type(), Effect::Object::Video);
    EXPECT_EQ(chain.list[5]->type(), Effect::Object::Audio);
    EXPECT_FALSE(chain.list[1]->bypass);

    const std::vector<std::string> expanded = names(chain.list);
    EffectHelper::expandEffectsHolders(chain.list);
    EXPECT_EQ(names(chain.list), expanded);
}

TEST(EffectRules, LeaveABypassedHolderAsItIs)
{
    const Host::EffectRules rules;
    Effect::Object holder("OldFilm");
    holder.setBypass(true);
    Effect::List list = {&holder};
    EffectHelper::expandEffectsHolders(list);
    EXPECT_THAT(list, ElementsAre(&holder));
}

TEST(EffectRules, AppendWhatTheyMoveToAResultThatHoldsSomething)
{
    const Host::EffectRules rules;
    Chain before;
    before.video("MotionBlur");
    Chain chain;
    chain.video("Sepia").video("Crop").video("FlipVertical");
    PubSub::publish(Effect::Details::RemoveCropTransposeEffectsRequest(nullptr, chain.list, before.list));
    EXPECT_THAT(names(before.list), ElementsAre("MotionBlur 1", "Crop 2", "FlipVertical 3"));
    EXPECT_THAT(names(chain.list), ElementsAre("Sepia 1"));
}

TEST(EffectRules, WithstandEmptyListsAndNullEffects)
{
    const Host::EffectRules rules;
    Effect::List empty;
    EffectHelper::sortEffects(empty);
    EffectHelper::expandEffectsHolders(empty);
    EXPECT_THAT(empty, IsEmpty());
    EXPECT_THAT(EffectHelper::removeAllStaticEffects(empty), IsEmpty());

    Chain chain;
    chain.audio("Echo");
    chain.list.push_back(nullptr);
    EffectHelper::sortEffects(chain.list);
    EffectHelper::expandEffectsHolders(chain.list);
    EXPECT_THAT(EffectHelper::removeAllStaticEffects(chain.list), IsEmpty());
    EXPECT_THAT(names(chain.list), ElementsAre("null", "Echo 1"));
}

TEST(EffectRules, HoldForNobodyOnceTheModuleHasEnded)
{
    Chain chain;
    chain.audio("Echo").video("Sepia");
    {
        const Host::EffectRules rules;
    }
    EffectHelper::sortEffects(chain.list);
    EXPECT_THAT(EffectHelper::removeAllStaticEffects(chain.list), IsEmpty());
    EXPECT_THAT(names(chain.list), ElementsAre("Echo 1", "Sepia 2"));
}

} // namespace
