// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/analysis/SceneDetection.h>
#include <EditorModel/bus/View.h>
#include <EditorModel/persistence/Serializable.h>
#include <EditorModel/services/Task.h>

#include <gmock/gmock.h>

#include <type_traits>
#include <utility>

namespace {

using SceneDetection::Range;
using testing::ElementsAre;
using testing::IsEmpty;

static_assert(Testing::isVirtualBase<PubSub::Object, SceneDetection::Object>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, SceneDetection::Object>);
static_assert(sizeof(Range) == 16);
static_assert(sizeof(SceneDetection::State) == 4);

const Task::Object task;

SceneDetection::Object everyFieldSet()
{
    SceneDetection::Object object;
    object.setPath("film.mp4")->setSourceDuration(90000)->setMinDuration(500)->setMaxDuration(20000);
    object.setState(SceneDetection::State(2))->setDetectedScenes({{0, 1000}, {1000, 4000}})->setTask(&task);
    object.detectionLevel = 35.5;
    object.otherScenes = {{5000000000, 6000000000}};
    return object;
}

void expectEveryFieldSet(const SceneDetection::Object& object)
{
    EXPECT_EQ(object.path, "film.mp4");
    EXPECT_EQ(object.sourceDuration, MTime(90000));
    EXPECT_EQ(object.detectionLevel, 35.5);
    EXPECT_EQ(object.minDuration, MTime(500));
    EXPECT_EQ(object.maxDuration, MTime(20000));
    EXPECT_EQ(object.state, 2);
    EXPECT_THAT(object.detectedScenes, ElementsAre(Range{0, 1000}, Range{1000, 4000}));
    EXPECT_THAT(object.otherScenes, ElementsAre(Range{5000000000, 6000000000}));
    EXPECT_EQ(object.task, &task);
}

TEST(SceneDetection, HasFoundNothingByDefault)
{
    const SceneDetection::Object object;
    EXPECT_EQ(object.path, QString());
    EXPECT_EQ(object.sourceDuration, MTime());
    EXPECT_EQ(object.detectionLevel, 20.0);
    EXPECT_EQ(object.minDuration, MTime());
    EXPECT_EQ(object.maxDuration, MTime());
    EXPECT_EQ(object.state, 0);
    EXPECT_THAT(object.detectedScenes, IsEmpty());
    EXPECT_THAT(object.otherScenes, IsEmpty());
    EXPECT_EQ(object.task, nullptr);
}

TEST(SceneDetection, SettersStoreAndReturnTheObject)
{
    SceneDetection::Object object;
    EXPECT_EQ(object.setPath("x"), &object);
    EXPECT_EQ(object.setSourceDuration(1), &object);
    EXPECT_EQ(object.setMinDuration(1), &object);
    EXPECT_EQ(object.setMaxDuration(1), &object);
    EXPECT_EQ(object.setState(SceneDetection::State(1)), &object);
    EXPECT_EQ(object.setDetectedScenes({}), &object);
    EXPECT_EQ(object.setTask(nullptr), &object);
    expectEveryFieldSet(everyFieldSet());
}

TEST(SceneDetection, CopiesWholeAndPointsAtTheSameTask)
{
    SceneDetection::Object copy(everyFieldSet());
    const SceneDetection::Object& constant = copy;
    SceneDetection::Object second(constant);
    expectEveryFieldSet(second);
    SceneDetection::Object assigned;
    EXPECT_EQ(&(assigned = constant), &assigned);
    expectEveryFieldSet(assigned);
    const SceneDetection::Object& itself = assigned;
    assigned = itself;
    expectEveryFieldSet(assigned);

    SceneDetection::Object moved(std::move(second));
    expectEveryFieldSet(moved);
    SceneDetection::Object target;
    target = std::move(moved);
    expectEveryFieldSet(target);
    expectEveryFieldSet(copy);
}

TEST(SceneDetection, RangesAreOrderedByTheirBeginningsThenByTheirEnds)
{
    EXPECT_TRUE((Range{1, 9} < Range{2, 3}));
    EXPECT_FALSE((Range{2, 3} < Range{1, 9}));
    EXPECT_TRUE((Range{1, 2} < Range{1, 3}));
    EXPECT_FALSE((Range{1, 2} < Range{1, 2}));
    EXPECT_TRUE((Range{1, 2} == Range{1, 2}));
    EXPECT_TRUE((Range{1, 2} != Range{1, 3}));
    EXPECT_TRUE((Range{1, 2} != Range{0, 2}));
    EXPECT_TRUE((Range() == Range{0, 0}));
    // Apart only in what 32 bits don't hold.
    EXPECT_EQ((std::set<Range>{{4294967296, 0}, {0, 0}, {0, 4294967296}, {0, 0}}).size(), 3u);
}

TEST(SceneDetection, IsSharedOnTheBus)
{
    SceneDetection::Object object;
    Message::View<SceneDetection::Object> owner, observer;
    owner.own(&object);
    observer.observe(&object);
    observer.change(&object)->setState(SceneDetection::State(3))->setTask(&task);
    EXPECT_EQ(object.state, 3);
    EXPECT_EQ(object.task, &task);
}

} // namespace
