// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Task.h>

#include <gtest/gtest.h>

namespace {

TEST(Task, IsQueuedAtFirst)
{
    EXPECT_TRUE(Task::Object().isQueued());
}

TEST(Task, IsInExactlyOneState)
{
    for (int state = 0; state != 5; ++state) {
        Task::Object task;
        task.setState(Task::Object::State(state));
        EXPECT_EQ(task.isQueued(), state == 0);
        EXPECT_EQ(task.isStarted(), state == 1);
        EXPECT_EQ(task.isCancelled(), state == 2);
        EXPECT_EQ(task.isFinished(), state == 3);
        EXPECT_EQ(task.isPaused(), state == 4);
    }
}

TEST(Task, GoesFromAnyStateToAnyOther)
{
    Task::Object task;
    task.setState(Task::Object::Finished);
    EXPECT_EQ(task.setCancelled(), &task);
    EXPECT_TRUE(task.isCancelled());
    EXPECT_FALSE(task.isFinished());
    EXPECT_EQ(task.setPaused(), &task);
    EXPECT_TRUE(task.isPaused());
    EXPECT_EQ(task.setQueued(), &task);
    EXPECT_TRUE(task.isQueued());
}

} // namespace
