// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Task.h>

#include <gtest/gtest.h>

namespace {

Task::Object::Executor* executorAt(quintptr address)
{
    return reinterpret_cast<Task::Object::Executor*>(address);
}

void expectSame(const Task::Object& actual, const Task::Object& expected)
{
    EXPECT_EQ(actual.type, expected.type);
    EXPECT_EQ(actual.priority, expected.priority);
    EXPECT_EQ(actual.state, expected.state);
    EXPECT_EQ(actual.executor, expected.executor);
    EXPECT_EQ(actual.progress, expected.progress);
}

Task::Object everyFieldSet()
{
    Task::Object task;
    task.setType(Task::Object::Type(2))->setPriority(Task::Object::Priority(3));
    task.setState(Task::Object::Finished)->setExecutor(executorAt(0x10))->setProgress(0.75);
    return task;
}

TEST(Task, IsQueuedByDefault)
{
    const Task::Object task;
    EXPECT_EQ(task.type, 5);
    EXPECT_EQ(task.priority, 1);
    EXPECT_EQ(task.state, 0);
    EXPECT_EQ(task.executor, nullptr);
    EXPECT_EQ(task.progress, 0.0);
    EXPECT_TRUE(task.isQueued());
}

TEST(Task, SettersStoreAndReturnTheTask)
{
    Task::Object task;
    EXPECT_EQ(task.setType(Task::Object::Type(7)), &task);
    EXPECT_EQ(task.setPriority(Task::Object::Priority(9)), &task);
    EXPECT_EQ(task.setState(Task::Object::Started), &task);
    EXPECT_EQ(task.setExecutor(executorAt(0x20)), &task);
    EXPECT_EQ(task.setProgress(1.5), &task);
    EXPECT_EQ(task.type, 7);
    EXPECT_EQ(task.priority, 9);
    EXPECT_EQ(task.state, 1);
    EXPECT_EQ(task.executor, executorAt(0x20));
    EXPECT_EQ(task.progress, 1.5);
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

TEST(Task, CopiesAndAssignsAllFields)
{
    const Task::Object task = everyFieldSet();
    const Task::Object copy(task);
    expectSame(copy, task);
    Task::Object assigned;
    assigned = task;
    expectSame(assigned, task);
    const Task::Object& itself = assigned;
    assigned = itself;
    expectSame(assigned, task);
}

} // namespace
