// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/bus/View.h>
#include <EditorModel/services/Task.h>

#include <iostream>

class ProgressLine : public Message::View<Task::Object>
{
    void added(const Task::Object*) override { std::cout << "a task\n"; }
    void changed(const Task::Object* task, const Task::Object* old) override
    {
        std::cout << old->progress << " -> " << task->progress << (task->isPaused() ? ", paused\n" : "\n");
    }
    void removed(const Task::Object*) override { std::cout << "done\n"; }
};

int main()
{
    Task::Object task;                 // the module that makes an object keeps it alive
    Message::View<Task::Object> owner; // and owns it: it alone writes to it
    owner.own(&task);

    ProgressLine line;
    line.observeAll(); // finds every task that somebody owns

    owner.change(&task)->setProgress(0.25);            // written in place, and everybody is told
    line.change(&task)->setProgress(0.5)->setPaused(); // asks the owner to write it
    owner.remove(&task);                               // nobody owns it any longer
}
