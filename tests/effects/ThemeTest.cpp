// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/effects/Theme.h>

#include <gmock/gmock.h>

namespace {

using testing::ElementsAre;
using Testing::FieldText;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, Theme::Object>);
static_assert(Testing::isVirtualBase<PubSub::Object, Theme::Object>);

Theme::Object everyFieldSet()
{
    Theme::Object theme;
    theme.tag = "Travel";
    theme.transitionsList = {"Whoosh 4", "Crossfade", "Whoosh 4"};
    theme.previewVideo = "travel.mp4";
    theme.music = "guitar.mp3";
    theme.startTitle = "Simple1";
    theme.finalTitle = "EndOfCinema";
    theme.minSceneDuration = 1000;
    theme.maxSceneDuration = 9000;
    return theme;
}

TEST(Theme, IsWrittenInTheOrderOfItsFields)
{
    const std::string transitions = "\n  3 items"
                                    "\n  item 1"
                                    "\n  item: Q\"Whoosh 4\""
                                    "\n  item 2"
                                    "\n  item: Q\"Crossfade\""
                                    "\n  item 3"
                                    "\n  item: Q\"Whoosh 4\"";
    EXPECT_THAT(
        Testing::fieldTexts(everyFieldSet()),
        ElementsAre(FieldText("tag", "Q\"Travel\""), FieldText("transitionsList", transitions),
                    FieldText("previewVideo", "Q\"travel.mp4\""), FieldText("music", "Q\"guitar.mp3\""),
                    FieldText("startTitle", "Q\"Simple1\""), FieldText("finalTitle", "Q\"EndOfCinema\""),
                    FieldText("minSceneDuration", "1000ms"), FieldText("maxSceneDuration", "9000ms")));
}

TEST(Theme, IsMadeByName)
{
    Testing::expectMadeByName<Theme::Object>("Theme::Object");
}

} // namespace
