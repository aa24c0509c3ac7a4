// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldTexts.h"

#include <EditorModel/analysis/BeatDetection.h>

#include <gmock/gmock.h>

namespace {

using testing::ElementsAre;
using Testing::FieldText;

static_assert(!Testing::isVirtualBase<Serialize::ISerializable, BeatDetection::Object>);
static_assert(Testing::isVirtualBase<PubSub::Object, BeatDetection::Object>);

/// Keys that need more than 32 bits, entered in another order than their own.
const std::map<long long, double> beats = {{9000000000LL, 0.5}, {-9000000000LL, -1.5}, {12, 0.25}};

BeatDetection::Object everyFieldSet()
{
    BeatDetection::Object object;
    object.setInterval(750)->setBeats(beats);
    return object;
}

TEST(BeatDetection, IsWrittenWithItsBeatsInTheOrderOfTheirKeys)
{
    const std::string entries = "\n  3 items"
                                "\n  item 1"
                                "\n    first: -9000000000l"
                                "\n    second: -1.5"
                                "\n  item 2"
                                "\n    first: 12l"
                                "\n    second: 0.25"
                                "\n  item 3"
                                "\n    first: 9000000000l"
                                "\n    second: 0.5";
    EXPECT_THAT(Testing::fieldTexts(everyFieldSet()),
                ElementsAre(FieldText("interval", "750ms"), FieldText("beats", entries)));
}

TEST(BeatDetection, IsMadeByName)
{
    Testing::expectMadeByName<BeatDetection::Object>("BeatDetection::Object");
}

TEST(BeatDetection, ComesBackWithItsBeats)
{
    const BeatDetection::Object object = everyFieldSet();
    for (const Way& way : allWays) {
        const Document::Graph graph = graphOf(documentOf({&object}, way));
        const auto* const loaded = graph.rootAs<BeatDetection::Object>();
        ASSERT_NE(loaded, nullptr) << way.name;
        EXPECT_EQ(loaded->interval, MTime(750)) << way.name;
        EXPECT_EQ(loaded->beats, beats) << way.name;
    }
}

} // namespace
