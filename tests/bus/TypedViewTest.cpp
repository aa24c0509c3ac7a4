// SPDX-License-Identifier: Apache-2.0
#include "TracedView.h"

#include <EditorModel/bus/Preview.h>
#include <EditorModel/services/Task.h>

#include <type_traits>
#include <utility>

namespace {

using namespace BusTests;
using testing::ElementsAre;
using testing::IsEmpty;

class NoteViewBase : private ::Message::View<Note>
{
    EDITORMODEL_TYPED_VIEW(Note, note)
};

class TaskViewBase : private ::Message::View<Task::Object>
{
    EDITORMODEL_TYPED_VIEW(Task::Object, task)
};

/// The general callback turned into callbacks for what has changed.
class TaskView : public TaskViewBase
{
protected:
    using TaskViewBase::taskChanged;

    virtual void stateChanged(const Task::Object*, Task::Object::State) {}
    virtual void taskFinished(const Task::Object*) {}

    void taskChanged(const Task::Object* task, const Task::Object* oldValue,
                     const Task::Object* newValue) override
    {
        if (oldValue->state != newValue->state) {
            stateChanged(task, oldValue->state);
        }
        if (!oldValue->isFinished() && newValue->isFinished()) {
            taskFinished(task);
        }
    }
};

/// A module that deals with two kinds of object.
class Module : public NoteViewBase, public TaskView
{
public:
    using NoteViewBase::note;
    using NoteViewBase::noteAdd;
    using NoteViewBase::noteChange;
    using NoteViewBase::noteForget;
    using NoteViewBase::noteIsObserved;
    using NoteViewBase::noteIsOwned;
    using NoteViewBase::noteObserve;
    using NoteViewBase::noteOwn;
    using NoteViewBase::noteOwnerPointer;
    using NoteViewBase::noteRemove;
    using NoteViewBase::notes;
    using TaskView::taskChange;
    using TaskView::taskObserve;
    using TaskView::taskOwn;
    using TaskView::taskRemove;

    Lines lines;

protected:
    void noteAdded(const Note* note) override { write("added", note); }
    void noteRemoved(const Note* note) override { write("removed", note); }
    void noteChanged(const Note*, const Note* oldValue, const Note* newValue) override
    {
        lines.push_back("changed " + std::to_string(oldValue->value) + " -> " +
                        std::to_string(newValue->value));
    }
    void noteChanged(const Note*, const Note* oldValue) override { write("changed from", oldValue); }
    void noteChanged(const Note* note) override { write("changed to", note); }

    void stateChanged(const Task::Object* task, Task::Object::State oldState) override
    {
        lines.push_back("state " + std::to_string(oldState) + ", now " + std::to_string(task->state));
    }
    void taskFinished(const Task::Object*) override { lines.push_back("finished"); }

private:
    void write(const std::string& what, const Note* note)
    {
        lines.push_back(what + " " + std::to_string(note->value));
    }
};

// The operations are for the module that derives from the view, which decides what it shows of them.
template <class View, class = void>
constexpr bool observesInPublic = false;
template <class View>
constexpr bool observesInPublic<View, std::void_t<decltype(std::declval<View&>().noteObserve(nullptr))>> =
    true;
static_assert(!observesInPublic<NoteViewBase>);
static_assert(observesInPublic<Module>);

TEST(TypedView, HandsEveryCallbackOnUnderItsOwnName)
{
    Note note;
    Module module;
    module.noteOwn(&note)->setValue(1);
    module.noteChange(&note)->setValue(2);
    module.noteRemove(&note);
    EXPECT_THAT(module.lines,
                ElementsAre("added 1", "changed 0 -> 1", "changed to 1", "changed 1 -> 2", "changed from 1",
                            "changed to 2", "changed 2 -> 0", "changed to 2", "removed 2"));
}

TEST(TypedView, ForwardsEveryOperation)
{
    Note note, other;
    Module owner, observer;
    owner.noteOwn(&note);
    EXPECT_EQ(owner.note(), &note);
    EXPECT_THAT(owner.notes(), ElementsAre(&note));
    EXPECT_TRUE(owner.noteIsOwned(&note));
    EXPECT_EQ(owner.noteOwnerPointer(&note), &note);

    observer.noteObserve(&note);
    EXPECT_TRUE(observer.noteIsObserved(&note));
    EXPECT_FALSE(observer.noteIsOwned(&note));
    EXPECT_EQ(observer.noteOwnerPointer(&note), nullptr);
    observer.noteChange(nullptr)->setValue(5);
    EXPECT_EQ(note.value, 5);
    observer.noteForget(&note);
    EXPECT_FALSE(observer.noteIsObserved(&note));

    Message::View<Note> open;
    open.processAddRequests();
    observer.noteAdd(&other)->setValue(3);
    EXPECT_TRUE(open.isOwned(&other));
    EXPECT_TRUE(observer.noteIsObserved(&other));
    observer.noteRemove(&other);
    EXPECT_FALSE(open.isObserved(&other));
}

TEST(TypedView, TwoKindsOfObjectDoNotClashInOneModule)
{
    Note note;
    Task::Object task;
    Module owner, observer;
    owner.noteOwn(&note);
    owner.taskOwn(&task);
    observer.noteObserve(&note);
    observer.taskObserve(&task);
    owner.lines.clear();
    observer.lines.clear();
    observer.taskChange(&task)->setState(Task::Object::Finished);
    EXPECT_THAT(owner.lines, ElementsAre("state 0, now 3", "finished"));
    EXPECT_THAT(observer.lines, ElementsAre("state 0, now 3", "finished"));
}

TEST(TypedView, AFanOutComparesWithTheDefaultOnArrivalAndDeparture)
{
    Task::Object task;
    task.setState(Task::Object::Finished);
    Module module;
    module.taskObserve(&task);
    EXPECT_THAT(module.lines, ElementsAre("state 0, now 3", "finished"));
    module.lines.clear();
    Module owner;
    owner.taskOwn(&task);
    module.lines.clear();
    owner.taskRemove(&task);
    EXPECT_THAT(module.lines, ElementsAre("state 3, now 3"));
}

TEST(TypedView, ACopyWatchesWhatTheOriginalWatches)
{
    Note note;
    Module owner, observer;
    owner.noteOwn(&note);
    observer.noteObserve(&note);
    Module copy(observer);
    Module moved(std::move(observer));
    copy.lines.clear();
    moved.lines.clear();
    owner.noteChange(&note)->setValue(4);
    EXPECT_THAT(copy.lines, ElementsAre("changed 0 -> 4", "changed from 0", "changed to 4"));
    EXPECT_THAT(moved.lines, ElementsAre("changed 0 -> 4", "changed from 0", "changed to 4"));
}

class Player : public Preview::Details::ObjectViewBase<Note>
{
public:
    using Preview::Details::ObjectViewBase<Note>::preview;
    using Preview::Details::ObjectViewBase<Note>::previewChange;
    using Preview::Details::ObjectViewBase<Note>::previewObserve;
    using Preview::Details::ObjectViewBase<Note>::previews;

    Lines lines;

protected:
    using Preview::Details::ObjectViewBase<Note>::previewChanged;
    void previewChanged(const Note* note) override { lines.push_back(std::to_string(note->value)); }
};

TEST(Preview, WatchesOneKindOfObject)
{
    Note note;
    Message::View<Note> owner;
    owner.own(&note);
    Player player;
    EXPECT_EQ(player.preview(), nullptr);
    player.previewObserve(&note);
    player.previewChange(&note)->setValue(7);
    EXPECT_THAT(player.previews(), ElementsAre(&note));
    EXPECT_THAT(player.lines, ElementsAre("0", "7"));
}

#if defined(__GXX_ABI_VERSION)

/// Calls the virtual function in a slot of the Itanium C++ ABI's table, counted from the first function.
class Slots : public Preview::Details::ObjectViewBase<Note>
{
public:
    Lines lines;

    template <typename... Arguments>
    void call(int slot, Arguments... arguments)
    {
        using Function = void (*)(Slots*, Arguments...);
        (*reinterpret_cast<Function**>(this))[slot](this, arguments...);
    }

protected:
    void previewAdded(const Note*) override { lines.push_back("added"); }
    void previewRemoved(const Note*) override { lines.push_back("removed"); }
    void previewChanged(const Note*, const Note*, const Note*) override { lines.push_back("changed 3"); }
    void previewChanged(const Note*, const Note*) override { lines.push_back("changed 2"); }
    void previewChanged(const Note*) override { lines.push_back("changed 1"); }
    void addRequested(Note*) override { lines.push_back("add requested"); }
    void changeRequested(Note*, Note*) override { lines.push_back("change requested"); }
    void removeRequested(Note*) override { lines.push_back("remove requested"); }
};

/// Modules that were built apart meet in these tables: the destructor has two entries, then come added,
/// changed with three, two and one argument, removed, the three requests, and the five of the typed view.
TEST(TypedView, ItsVirtualFunctionsKeepTheirPlaces)
{
    Slots slots;
    const Note note;
    slots.call(2, &note);
    slots.call(3, &note, &note, &note);
    slots.call(4, &note, &note);
    slots.call(5, &note);
    slots.call(6, &note);
    EXPECT_THAT(slots.lines, ElementsAre("added", "changed 3", "changed 2", "changed 1", "removed"));
    slots.lines.clear();
    Note writable;
    slots.call(7, &writable);
    slots.call(8, &writable, &writable);
    slots.call(9, &writable);
    EXPECT_THAT(slots.lines, ElementsAre("add requested", "change requested", "remove requested"));
    slots.lines.clear();
    slots.call(10, &note);
    slots.call(11, &note);
    slots.call(12, &note, &note, &note);
    slots.call(13, &note, &note);
    slots.call(14, &note);
    EXPECT_THAT(slots.lines, ElementsAre("added", "removed", "changed 3", "changed 2", "changed 1"));
}

#endif

} // namespace
