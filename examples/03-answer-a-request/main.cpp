// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/bus/View.h>
#include <EditorModel/media/FileAdder.h>
#include <EditorModel/services/Task.h>

#include <iostream>

namespace Result { // the values belong to who answers
constexpr FileAdder::AddedResult Added{1};
constexpr FileAdder::AddedResult GivenUp{2};
} // namespace Result

class Worker : public PubSub::Subscriber<FileAdder::AddMediaFiles>
{
public:
    Worker() { subscribe(FileAdder::globalObject()); }

private:
    void notify(const FileAdder::AddMediaFiles& request) override
    {
        Task::Object task;
        m_tasks.own(&task)->setState(Task::Object::Started);
        QStringList done;
        for (const QString& file : request.files) {
            if (task.isCancelled()) {
                break;
            }
            std::cout << "worker: " << file.toStdString() << '\n'; // here it would be opened
            done << file;
            m_tasks.change(&task)->setProgress(double(done.size()) / request.files.size());
        }
        m_tasks.remove(&task);

        const auto result = done == request.files ? Result::Added : Result::GivenUp;
        PubSub::publish(FileAdder::AddMediaFilesResult(result, done));
    }

    Message::View<Task::Object> m_tasks;
};

class Dialog : public Message::View<Task::Object>
{
public:
    Dialog() { observeNew(); } // every task that somebody begins from now on

private:
    void changed(const Task::Object* task, const Task::Object* old) override
    {
        if (task->progress != old->progress) {
            std::cout << "dialog: " << 100 * task->progress << " %, that will do\n";
            change(task)->setCancelled(); // the worker hears of it at once
        }
    }
};

void ask(const QStringList& files)
{
    const auto contexts = FileAdder::Contexts().setContext(FileAdder::UserCollectionContext());
    const auto result = FileAdder::addMediaFiles(files, FileAdder::Asrc(0), contexts);
    std::cout << "result: " << result << '\n';
}

int main()
{
    ask({"beach.mp4"}); // nobody answers
    const Worker worker;
    ask({"beach.mp4", "hills.mp4"});
    const Dialog dialog;
    ask({"beach.mp4", "hills.mp4"});
}
