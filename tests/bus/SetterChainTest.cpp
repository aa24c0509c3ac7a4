// SPDX-License-Identifier: Apache-2.0
#include "TracedView.h"

#include <EditorModel/media/Media.h>
#include <EditorModel/services/Report.h>
#include <EditorModel/services/Task.h>

#include <stdexcept>
#include <type_traits>

namespace {

using namespace BusTests;
using testing::IsEmpty;

using Chain = Message::View<Note>::SetterChain;

static_assert(std::is_move_constructible_v<Chain> && !std::is_copy_constructible_v<Chain>);
static_assert(!std::is_copy_assignable_v<Chain> && !std::is_move_assignable_v<Chain>);
static_assert(!std::is_nothrow_destructible_v<Chain>);

// Their changes are moved in, and none can fail half-way.
static_assert(std::is_nothrow_move_assignable_v<Task::Object>);
static_assert(std::is_nothrow_move_assignable_v<Report::Progress>);
static_assert(std::is_nothrow_move_assignable_v<Media::Audio>);
static_assert(std::is_nothrow_move_assignable_v<Media::Video>);
static_assert(std::is_nothrow_move_assignable_v<Media::File>);

TEST_F(ViewTest, AChainCommitsAtTheEndOfItsStatement)
{
    TracedView owner(trace, "owner");
    owner.own(&a());
    trace.take();
    int before = -1;
    owner.change(&a())->setValue(1)->setValue((before = a().value, 2));
    EXPECT_EQ(before, 0);
    EXPECT_EQ(trace.take(), change("owner", "a", 0, 2));
}

TEST_F(ViewTest, AChainEditsTheValueThatTheObjectHadAtItsBeginning)
{
    TracedView owner(trace, "owner");
    owner.own(&a())->setValue(1);
    trace.take();
    {
        const Chain chain = owner.change(&a());
        a().setValue(9);
        EXPECT_EQ(chain->value, 1);
    }
    EXPECT_EQ(trace.take(), change("owner", "a", 9, 1));
}

TEST_F(ViewTest, AMovedChainCommitsOnceWithItsLastValue)
{
    TracedView owner(trace, "owner");
    owner.own(&a());
    trace.take();
    {
        Chain first = owner.change(&a());
        first->setValue(1);
        Chain second(std::move(first));
        EXPECT_EQ(second->value, 1);
        second->setValue(2);
        EXPECT_EQ(a().value, 0);
    }
    EXPECT_EQ(trace.take(), change("owner", "a", 0, 2));
}

TEST_F(ViewTest, AMovedAddActsOnTheClientsObject)
{
    TracedView owner(trace, "owner");
    {
        Chain first = owner.own(&a());
        const Chain second(std::move(first));
        EXPECT_EQ(second.operator->(), &a());
    }
    EXPECT_EQ(trace.take(), arrival("owner", "a", 0));
}

TEST_F(ViewTest, AChainThatIsHandedBackFromAFunctionCommitsAtTheCaller)
{
    TracedView owner(trace, "owner");
    owner.own(&a());
    trace.take();
    const auto prepare = [&](bool one) {
        Chain first = owner.change(&a()), second = owner.change(&a());
        first->setValue(1);
        second->setValue(2);
        Chain result(std::move(one ? first : second));
        Chain dropped(std::move(one ? second : first));
        static_cast<void>(dropped);
        return result;
    };
    prepare(true)->setValue(5);
    // The dropped chain commits at the end of the function.
    EXPECT_EQ(trace.take(), change("owner", "a", 0, 2) + change("owner", "a", 2, 5));
}

TEST_F(ViewTest, AChainThatAnExceptionEndsCommitsNothing)
{
    TracedView owner(trace, "owner"), client(trace, "client");
    owner.own(&a());
    client.observe(&a());
    trace.take();
    const auto fail = []() -> int { throw std::runtime_error("setter"); };
    EXPECT_THROW(owner.change(&a())->setValue(fail()), std::runtime_error);
    EXPECT_THROW(client.change(&a())->setValue(fail()), std::runtime_error);
    EXPECT_THROW(owner.own(&b())->setValue(fail()), std::runtime_error);
    EXPECT_THAT(trace.take(), IsEmpty());
    EXPECT_EQ(a().value, 0);
    EXPECT_FALSE(owner.isOwned(&b()));
}

TEST_F(ViewTest, AMovedChainThatAnExceptionEndsCommitsNothing)
{
    TracedView owner(trace, "owner");
    owner.own(&a());
    trace.take();
    EXPECT_THROW(
        {
            Chain first = owner.change(&a());
            const Chain second(std::move(first));
            throw std::runtime_error("client");
        },
        std::runtime_error);
    EXPECT_THAT(trace.take(), IsEmpty());
}

/// Changes an object while another exception unwinds past it.
class ChangesAtItsEnd
{
public:
    ChangesAtItsEnd(TracedView& view, Note& note) : m_view(view), m_note(note) {}
    ~ChangesAtItsEnd() { m_view.change(&m_note)->setValue(9); }

private:
    TracedView& m_view;
    Note& m_note;
};

TEST_F(ViewTest, AChainThatBeginsDuringUnwindingCommits)
{
    TracedView owner(trace, "owner");
    owner.own(&a());
    EXPECT_THROW(
        {
            const ChangesAtItsEnd last(owner, a());
            throw std::runtime_error("client");
        },
        std::runtime_error);
    EXPECT_EQ(a().value, 9);
}

TEST_F(ViewTest, AChangeOfAnObjectThatWasNeverOwnedIsLost)
{
    TracedView client(trace, "client");
    client.observe(&a());
    trace.take();
    client.change(&a())->setValue(1);
    EXPECT_THAT(trace.take(), IsEmpty());
    EXPECT_EQ(a().value, 0);
}

// What an edit costs

/// Counts how often its contents are copied.
struct Weighty : virtual PubSub::Object
{
    Weighty() = default;
    Weighty(const Weighty& other) : PubSub::Object(other), text(other.text) { ++copies; }
    Weighty(Weighty&& other) noexcept : PubSub::Object(other), text(std::move(other.text)) {}
    Weighty& operator=(const Weighty& other)
    {
        text = other.text;
        ++copies;
        return *this;
    }
    Weighty& operator=(Weighty&& other) noexcept
    {
        text = std::move(other.text);
        return *this;
    }

    std::string text;
    static int copies;
};

int Weighty::copies = 0;

class WeightyView : public Message::View<Weighty>
{
public:
    Lines lines;

protected:
    using View::changed;
    void changed(const Weighty* object, const Weighty* oldValue) override
    {
        lines.push_back(oldValue->text + " -> " + object->text);
    }
};

TEST(SetterChain, AnOwnersChangeCopiesTheObjectOnce)
{
    Weighty object;
    WeightyView owner, observer;
    owner.own(&object)->text = "first";
    observer.observe(&object);
    Weighty::copies = 0;
    owner.change(&object)->text += " and second";
    EXPECT_EQ(Weighty::copies, 1);
    EXPECT_EQ(owner.lines, Lines{"first -> first and second"});
    EXPECT_EQ(observer.lines, owner.lines);
}

TEST(SetterChain, ARequestersChangeCopiesTheObjectTwice)
{
    Weighty object;
    WeightyView owner, observer;
    owner.own(&object)->text = "first";
    observer.observe(&object);
    Weighty::copies = 0;
    observer.change(&object)->text += " and second";
    EXPECT_EQ(Weighty::copies, 2);
    EXPECT_EQ(owner.lines, Lines{"first -> first and second"});
    EXPECT_EQ(observer.lines, owner.lines);
}

TEST(SetterChain, OwningAndAddingCopyNothing)
{
    Weighty object, other;
    WeightyView owner, client;
    owner.processAddRequests();
    Weighty::copies = 0;
    owner.own(&object)->text = "own";
    client.add(&other)->text = "added";
    client.remove(&other);
    owner.remove(&object);
    EXPECT_EQ(Weighty::copies, 0);
}

/// Its assignment leaves part of it in place, as the address of an object is left.
struct Anchored : virtual PubSub::Object
{
    Anchored() = default;
    Anchored(const Anchored&) = default;
    Anchored& operator=(const Anchored& other)
    {
        text = other.text;
        return *this;
    }

    std::string text;
    std::string place = "nowhere";
};

TEST(SetterChain, TheAssignmentOfAnObjectDecidesWhatSurvivesAChange)
{
    Anchored object;
    object.place = "here";
    Message::View<Anchored> owner;
    owner.own(&object);
    {
        auto chain = owner.change(&object);
        chain->text = "moved";
        chain->place = "there";
    }
    EXPECT_EQ(object.text, "moved");
    EXPECT_EQ(object.place, "here");
}

TEST(SetterChain, TheAssignmentOfAnObjectDecidesWhatSurvivesARequest)
{
    struct Recorder : Message::View<Anchored>
    {
        void changed(const Anchored*, const Anchored* oldValue) override { oldText = oldValue->text; }
        using View::changed;
        std::string oldText;
    };
    Anchored object;
    object.text = "before";
    object.place = "a place whose name is too long to lie within the string";
    const std::string place = object.place;
    Recorder owner;
    Message::View<Anchored> client;
    owner.own(&object);
    client.observe(&object);
    client.change(&object)->text = "after";
    EXPECT_EQ(object.text, "after");
    EXPECT_EQ(object.place, place);
    EXPECT_EQ(owner.oldText, "before");
}

/// Cannot be made from another by a move, or be assigned one where that may fail too.
template <bool assignable>
struct Rigid : virtual PubSub::Object
{
    Rigid() = default;
    Rigid(const Rigid&) = default;
    Rigid(Rigid&& other) : PubSub::Object(other), text(std::move(other.text))
    {
        throw std::runtime_error("move construction");
    }
    Rigid& operator=(const Rigid&) = default;
    Rigid& operator=(Rigid&& other) noexcept(assignable)
    {
        text = std::move(other.text);
        if constexpr (!assignable) {
            throw std::runtime_error("move assignment");
        }
        return *this;
    }

    std::string text;
};

template <typename T>
void expectChangesToSucceed()
{
    T object;
    object.text = "a text that is too long to lie within the string";
    Message::View<T> owner, client;
    owner.own(&object);
    client.observe(&object);
    EXPECT_NO_THROW(owner.change(&object)->text += ", changed by its owner");
    EXPECT_EQ(object.text, "a text that is too long to lie within the string, changed by its owner");
    EXPECT_NO_THROW(client.change(&object)->text = "requested");
    EXPECT_EQ(object.text, "requested");
}

TEST(SetterChain, AChangeDoesNotDependOnAMoveThatMayFail)
{
    expectChangesToSucceed<Rigid<true>>();
    expectChangesToSucceed<Rigid<false>>();
}

TEST(SetterChain, LeavesTheValueOfAnOwnersChainDefault)
{
    struct Peeking : Message::View<Note>
    {
        void changed(const Note*, const Note*) override { seen = (*chain)->value; }
        using View::changed;
        SetterChain* chain = nullptr;
        int seen = -1;
    };
    Note note(4);
    Peeking owner;
    owner.own(&note);
    {
        auto chain = owner.change(&note);
        chain->setValue(5);
        owner.chain = &chain;
    }
    EXPECT_EQ(owner.seen, 0);
    EXPECT_EQ(note.value, 5);
}

TEST(SetterChain, EditsATaskInOneStatement)
{
    Task::Object task;
    Message::View<Task::Object> owner, client;
    owner.own(&task);
    client.observe(&task);
    client.change(&task)->setProgress(0.5)->setPaused();
    EXPECT_EQ(task.progress, 0.5);
    EXPECT_TRUE(task.isPaused());
}

} // namespace
