// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/analysis/SceneDetection.h>
#include <EditorModel/bus/View.h>
#include <EditorModel/persistence/Serializable.h>
#include <EditorModel/services/Task.h>

#include <gtest/gtest.h>

#include <set>
#include <type_traits>

namespace {

using SceneDetection::Range;

static_assert(Testing::isVirtualBase<PubSub::Object, SceneDetection::Object>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, SceneDetection::Object>);
static_assert(sizeof(Range) == 16);
static_assert(sizeof(SceneDetection::State) == 4);

const Task::Object task;

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
