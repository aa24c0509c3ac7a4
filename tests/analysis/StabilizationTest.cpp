// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldTexts.h"

#include <EditorModel/analysis/Stabilization.h>

#include <gmock/gmock.h>

namespace {

using testing::ElementsAre;
using Testing::FieldText;

static_assert(!Testing::isVirtualBase<Serialize::ISerializable, Stabilization::Object>);
static_assert(Testing::isVirtualBase<PubSub::Object, Stabilization::Object>);

Stabilization::Object everyFieldSet()
{
    Stabilization::Object object;
    object.setShakiness(10)->setAccuracy(14)->setStepsize(7)->setSmoothing(30);
    object.setOptzoom(Stabilization::Object::OptimalZooming(2));
    object.setOriginalVideoIndex(3)->setOriginalAudioIndex(4);
    object.setPathOriginal("shaky.mp4")->setPathStabilized("calm.mp4");
    object.setSourcePositionOriginal(5000)->setSourceDurationOriginal(60000);
    return object;
}

TEST(Stabilization, IsWrittenInTheOrderOfItsFields)
{
    EXPECT_THAT(
        Testing::fieldTexts(everyFieldSet()),
        ElementsAre(FieldText("shakiness", "10"), FieldText("accuracy", "14"), FieldText("stepsize", "7"),
                    FieldText("smoothing", "30"), FieldText("optzoom", "2"),
                    FieldText("originalVideoStreamIndex", "3"), FieldText("originalAudioStreamIndex", "4"),
                    FieldText("pathOriginal", "Q\"shaky.mp4\""), FieldText("pathStabilized", "Q\"calm.mp4\""),
                    FieldText("sourcePositionOriginal", "5000ms"),
                    FieldText("sourceDurationOriginal", "60000ms")));
}

TEST(Stabilization, IsMadeByName)
{
    Testing::expectMadeByName<Stabilization::Object>("Stabilization::Object");
}

TEST(Stabilization, ComesBackWithAllItsValues)
{
    const Stabilization::Object object = everyFieldSet();
    for (const Way& way : allWays) {
        const Document::Graph graph = graphOf(documentOf({&object}, way));
        ASSERT_NE(graph.rootAs<Stabilization::Object>(), nullptr) << way.name;
        EXPECT_EQ(Testing::fieldTexts(*graph.rootAs<Stabilization::Object>()), Testing::fieldTexts(object))
            << way.name;
    }
}

} // namespace
