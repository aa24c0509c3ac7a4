// SPDX-License-Identifier: Apache-2.0
#include "TracedView.h"

#include <EditorModel/bus/Messages.h>

#include <algorithm>
#include <type_traits>

// What the operations of a view publish, read off the bus by somebody who is not a view.

namespace {

using namespace BusTests;
using namespace Message::Types;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::UnorderedElementsAre;

template <class M, class Base>
constexpr bool isMessage = std::is_base_of_v<Base, M>&& std::is_base_of_v<PubSub::Message<Note>, M>&&
    std::has_virtual_destructor_v<M>;
static_assert(isMessage<Add<Note>, Request<Note>>);
static_assert(isMessage<Change<Note>, Request<Note>>);
static_assert(isMessage<Remove<Note>, Request<Note>>);
static_assert(isMessage<Enumerate<Note>, Request<Note>>);
static_assert(isMessage<Added<Note>, Notification<Note>>);
static_assert(isMessage<Changed<Note>, Notification<Note>>);
static_assert(isMessage<Removed<Note>, Notification<Note>>);
static_assert(isMessage<Enumerated<Note>, Notification<Note>>);
static_assert(std::is_base_of_v<PubSub::Details::MessageBase, PubSub::Message<Note>>);

/// Takes down every message about a note with all that it points at.
class Wire : public PubSub::Subscriber<Add<Note>, Change<Note>, Remove<Note>, Enumerate<Note>, Added<Note>,
                                       Changed<Note>, Removed<Note>, Enumerated<Note>>
{
public:
    explicit Wire(const Trace& names) : m_names(&names) { subscribeAll<Note>(); }

    void notify(const Add<Note>& m) override { write("add", m, ", which is " + m_names->text(m.object)); }
    void notify(const Change<Note>& m) override { write("change", m, " to " + m_names->text(m.value)); }
    void notify(const Remove<Note>& m) override { write("remove", m); }
    void notify(const Enumerate<Note>& m) override { lines.push_back(m.sender ? "?" : "enumerate"); }
    void notify(const Added<Note>& m) override { write("added", m); }
    void notify(const Changed<Note>& m) override { write("changed", m, " from " + m_names->text(m.old)); }
    void notify(const Removed<Note>& m) override { write("removed", m); }
    void notify(const Enumerated<Note>& m) override { write("enumerated", m); }

    Lines take() { return std::exchange(lines, Lines()); }

    Lines lines;

private:
    void write(const std::string& what, const PubSub::Message<Note>& message, const std::string& more = "")
    {
        lines.push_back(what + " " + m_names->text(message.sender) + more);
    }

    const Trace* m_names;
};

class Messages : public ViewTest
{
protected:
    Wire wire{trace};
    TracedView owner{trace, "owner"};
    TracedView observer{trace, "observer"};
};

TEST_F(Messages, AnOwnersOperationsAreNotificationsAlone)
{
    owner.own(&a())->setValue(1);
    EXPECT_THAT(wire.take(), ElementsAre("added a=1"));
    owner.change(&a())->setValue(2);
    EXPECT_THAT(wire.take(), ElementsAre("changed a=2 from 1"));
    owner.remove(&a());
    EXPECT_THAT(wire.take(), ElementsAre("removed a=2"));
}

TEST_F(Messages, OperationsOnAnObjectWithoutAnOwnerAreRequestsAlone)
{
    observer.add(&a())->setValue(1);
    EXPECT_THAT(wire.take(), ElementsAre("add a=1, which is a=1"));
    observer.observe(&a());
    EXPECT_THAT(wire.take(), IsEmpty());
    observer.change(&a())->setValue(2);
    EXPECT_THAT(wire.take(), ElementsAre("change a=1 to 2"));
    observer.remove(&a());
    EXPECT_THAT(wire.take(), ElementsAre("remove a=1"));
}

/// Nested in the request, so that the wire may hear the answer first.
TEST_F(Messages, AnOwnerAnswersARequestWithANotification)
{
    owner.processAddRequests();
    observer.add(&a());
    EXPECT_THAT(wire.take(), UnorderedElementsAre("add a=0, which is a=0", "added a=0"));
    observer.change(&a())->setValue(2);
    const Lines change = wire.take();
    ASSERT_EQ(change.size(), 2u);
    EXPECT_THAT(change, testing::Contains("changed a=2 from 0"));
    EXPECT_THAT(change, testing::Contains(testing::AnyOf("change a=0 to 2", "change a=2 to 2")));
    observer.remove(&a());
    EXPECT_THAT(wire.take(), UnorderedElementsAre("remove a=2", "removed a=2"));
}

TEST_F(Messages, ForgettingAndEndingPublishNothing)
{
    {
        TracedView passing(trace, "passing");
        passing.own(&a());
        passing.own(&b());
        wire.take();
        passing.forget(&b());
    }
    EXPECT_THAT(wire.take(), IsEmpty());
}

TEST_F(Messages, AnEnumerationIsAnsweredForEachOwnedObjectInTheOrderOfTheAddresses)
{
    owner.own(&b());
    owner.own(&a());
    Note observed;
    owner.observe(&observed);
    wire.take();
    owner.enumerateAll();
    Lines lines = wire.take();
    EXPECT_THAT(lines, testing::Contains("enumerate"));
    lines.erase(std::remove(lines.begin(), lines.end(), "enumerate"), lines.end());
    EXPECT_THAT(lines, ElementsAre("enumerated a=0", "enumerated b=0"));
}

TEST_F(Messages, TheOldValueOfARequestedChangeIsNotTheRequestersOwn)
{
    struct Reader : PubSub::Subscriber<Changed<Note>>
    {
        Reader() { subscribeAll<Note>(); }
        void notify(const Changed<Note>& message) override { old = message.old; }
        const Note* old = nullptr;
    } reader;
    owner.own(&a());
    Note wanted(5);
    PubSub::publish(Change<Note>(&a(), &wanted));
    EXPECT_NE(reader.old, nullptr);
    EXPECT_NE(reader.old, &wanted);
    EXPECT_EQ(wanted.value, 5);
}

} // namespace
