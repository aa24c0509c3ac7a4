// SPDX-License-Identifier: Apache-2.0
#include "tests/archives/Forms.h"
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

TEST(Stabilization, HasElevenDefaults)
{
    const Stabilization::Object object;
    EXPECT_EQ(object.shakiness, 5);
    EXPECT_EQ(object.accuracy, 15);
    EXPECT_EQ(object.stepsize, 6);
    EXPECT_EQ(object.smoothing, 15);
    EXPECT_EQ(object.optzoom, 1);
    EXPECT_EQ(object.originalVideoStreamIndex, -1);
    EXPECT_EQ(object.originalAudioStreamIndex, -1);
    EXPECT_EQ(object.pathOriginal, QString());
    EXPECT_EQ(object.pathStabilized, QString());
    EXPECT_EQ(object.sourcePositionOriginal, MTime());
    EXPECT_EQ(object.sourceDurationOriginal, MTime());
}

TEST(Stabilization, SettersReturnTheObject)
{
    Stabilization::Object object;
    EXPECT_EQ(object.setShakiness(1), &object);
    EXPECT_EQ(object.setAccuracy(1), &object);
    EXPECT_EQ(object.setStepsize(1), &object);
    EXPECT_EQ(object.setSmoothing(1), &object);
    EXPECT_EQ(object.setOptzoom(Stabilization::Object::OptimalZooming(0)), &object);
    EXPECT_EQ(object.setOriginalVideoIndex(1), &object);
    EXPECT_EQ(object.setOriginalAudioIndex(1), &object);
    EXPECT_EQ(object.setPathOriginal("x"), &object);
    EXPECT_EQ(object.setPathStabilized("x"), &object);
    EXPECT_EQ(object.setSourcePositionOriginal(1), &object);
    EXPECT_EQ(object.setSourceDurationOriginal(1), &object);
}

TEST(Stabilization, SettersStore)
{
    const Stabilization::Object object = everyFieldSet();
    EXPECT_EQ(object.shakiness, 10);
    EXPECT_EQ(object.accuracy, 14);
    EXPECT_EQ(object.stepsize, 7);
    EXPECT_EQ(object.smoothing, 30);
    EXPECT_EQ(object.optzoom, 2);
    EXPECT_EQ(object.originalVideoStreamIndex, 3);
    EXPECT_EQ(object.originalAudioStreamIndex, 4);
    EXPECT_EQ(object.pathOriginal, "shaky.mp4");
    EXPECT_EQ(object.pathStabilized, "calm.mp4");
    EXPECT_EQ(object.sourcePositionOriginal, MTime(5000));
    EXPECT_EQ(object.sourceDurationOriginal, MTime(60000));
}

TEST(Stabilization, CopiesWhole)
{
    Testing::expectWholeCopies(everyFieldSet());
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
