// SPDX-License-Identifier: Apache-2.0
// A client of an installed EditorModel: it shares a task, and saves a rectangle and loads it back in every
// form.
#include <EditorModel/EditorModel.h>

#include <QBuffer>

#include <iostream>

namespace {

class Watch : public Message::View<Task::Object>
{
public:
    double progress = 0.0;

private:
    void changed(const Task::Object* task) override { progress = task->progress; }
};

bool sharesATask()
{
    Task::Object task;
    Message::View<Task::Object> owner;
    owner.own(&task);

    Watch watch;
    watch.observeAll();
    watch.change(&task)->setProgress(0.75);
    return task.progress == 0.75 && watch.progress == 0.75;
}

bool savesAndLoads(Document::Form form, Document::Route route)
{
    const Types::Rect rect(0.25, 0.5, 0.75, 1.0);
    QBuffer buffer;
    buffer.open(QIODevice::ReadWrite);
    Document::save(buffer, rect, form, route);
    buffer.seek(0);
    const Document::Graph graph = Document::load(buffer);
    const Types::Rect* loaded = graph.rootAs<Types::Rect>();
    return loaded && *loaded == rect;
}

bool savesAndLoadsEveryForm()
{
    for (const Document::Form form : {Document::Binary, Document::Xml, Document::Json}) {
        if (!savesAndLoads(form, Document::Archive) || !savesAndLoads(form, Document::Stream))
            return false;
    }
    return true;
}

bool check(const char* what, bool holds)
{
    std::cout << what << ": " << (holds ? "yes" : "no") << '\n';
    return holds;
}

} // namespace

int main()
{
    const bool shares = check("shares a task", sharesATask());
    const bool saves = check("saves and loads", savesAndLoadsEveryForm());
    return shares && saves ? 0 : 1;
}
