// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/effects/Transition.h>

#include <gmock/gmock.h>

namespace {

using testing::ElementsAre;
using Testing::FieldText;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, Transition::Object>);
static_assert(Testing::isVirtualBase<PubSub::Object, Transition::Object>);
static_assert(Transition::Object::DEFAULT_DURATION == MTime(2000));

const ResourceRef nothing{"n", Resource::Type(0)};
const ResourceRef film{"f", Resource::Type(1)};
const ResourceRef sound{"s", Resource::Type(2)};
const ResourceRef picture{"p", Resource::Type(3)};

Transition::Object everyFieldSet()
{
    Transition::Object transition("Whoosh 4");
    transition.tag = "Whoosh";
    transition.description = "Fast";
    transition.strategy = Transition::Object::Strategy(3);
    transition.type = Transition::Object::Type(2);
    transition.defaultDuration = 1500;
    transition.resources = {film, sound};
    transition.volume = 80;
    return transition;
}

Transition::Object needing(const std::deque<ResourceRef>& resources)
{
    Transition::Object transition;
    transition.resources = resources;
    return transition;
}

TEST(Transition, IsMadeWithItsIdentifier)
{
    const Transition::Object transition("Crossfade");
    EXPECT_EQ(transition.id, "Crossfade");
    EXPECT_THAT(Testing::defaultFields(transition), ElementsAre("tag", "description", "strategy", "type",
                                                                "resources", "defaultDuration", "volume"));
}

TEST(Transition, NeedsNoMediaWithoutResources)
{
    EXPECT_FALSE(needing({}).hasVideoResources());
    EXPECT_FALSE(needing({}).hasAudioResources());
}

TEST(Transition, KnowsTheKindsOfItsResources)
{
    EXPECT_TRUE(needing({film}).hasVideoResources());
    EXPECT_FALSE(needing({film}).hasAudioResources());
    EXPECT_FALSE(needing({sound}).hasVideoResources());
    EXPECT_TRUE(needing({sound}).hasAudioResources());
    EXPECT_TRUE(needing({nothing, picture, sound, film}).hasVideoResources());
    EXPECT_TRUE(needing({nothing, picture, film, sound}).hasAudioResources());
    EXPECT_FALSE(needing({nothing, picture}).hasVideoResources());
    EXPECT_FALSE(needing({nothing, picture}).hasAudioResources());
}

TEST(Transition, ResourcesCountWhateverTheirIdentifiers)
{
    EXPECT_TRUE(needing({ResourceRef(QString(), Resource::Type(1))}).hasVideoResources());
    EXPECT_TRUE(needing({ResourceRef(QString(), Resource::Type(2))}).hasAudioResources());
}

TEST(Transition, HasAMimeType)
{
    EXPECT_EQ(*Transition::Object::mimeType, "x-application/TransitionObject-serialized");
}

TEST(Transition, IsWrittenWithItsResourcesInFrontOfItsDuration)
{
    const std::string resources = "\n  2 items"
                                  "\n  item 1"
                                  "\n  item:"
                                  "\n    2 items"
                                  "\n    item 1"
                                  "\n    element: Q\"f\""
                                  "\n    item 2"
                                  "\n    element: 1"
                                  "\n  item 2"
                                  "\n  item:"
                                  "\n    2 items"
                                  "\n    item 1"
                                  "\n    element: Q\"s\""
                                  "\n    item 2"
                                  "\n    element: 2";
    EXPECT_THAT(Testing::fieldTexts(everyFieldSet()),
                ElementsAre(FieldText("id", "Q\"Whoosh 4\""), FieldText("tag", "Q\"Whoosh\""),
                            FieldText("description", "Q\"Fast\""), FieldText("strategy", "3"),
                            FieldText("type", "2"), FieldText("resources", resources),
                            FieldText("defaultDuration", "1500ms"), FieldText("volume", "80")));
}

TEST(Transition, IsMadeByName)
{
    Testing::expectMadeByName<Transition::Object>("Transition::Object");
}

} // namespace
