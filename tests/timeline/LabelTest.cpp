// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"
#include "tests/types/Printing.h"

#include <EditorModel/timeline/Object.h>
#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>

namespace {

using testing::ElementsAre;
using Testing::FieldText;
using testing::StartsWith;
using Timeline::Label;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, Label>);
static_assert(Testing::isVirtualBase<PubSub::Object, Label>);

const Timeline::Object someTimeline;
const Timeline::Object otherTimeline;

Label everyFieldSet()
{
    Label label;
    label.timeline = &someTimeline;
    label.setPosition(250)->setName("here");
    return label;
}

TEST(Label, IsMadeByName)
{
    Testing::expectMadeByName<Label>("Timeline::Label");
}

TEST(Label, IsWrittenInTheOrderOfItsFields)
{
    Label label = everyFieldSet();
    EXPECT_THAT(Testing::fieldTexts(label).front().first, "timeline");
    EXPECT_THAT(Testing::fieldTexts(label).front().second, StartsWith("Timeline::Object #"));
    label.timeline = nullptr;
    EXPECT_THAT(Testing::fieldTexts(label),
                ElementsAre(FieldText("timeline", "null"), FieldText("position", "250ms"),
                            FieldText("name", "Q\"here\"")));
}

TEST(Label, IsEqualInAllFields)
{
    EXPECT_TRUE(Label() == Label());
    EXPECT_TRUE(everyFieldSet() == everyFieldSet());
    Label other = everyFieldSet();
    other.timeline = &otherTimeline;
    EXPECT_FALSE(other == everyFieldSet());
    EXPECT_FALSE(*everyFieldSet().setPosition(251) == everyFieldSet());
    EXPECT_FALSE(*everyFieldSet().setName("Here") == everyFieldSet());
}

} // namespace
