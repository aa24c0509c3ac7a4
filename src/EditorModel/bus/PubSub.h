// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/detail/RecipientList.h>

#include <QtGlobal>

#include <cstddef>
#include <deque>
#include <memory>
#include <type_traits>
#include <typeindex>

/// The in-process message bus. Messages are told apart by their C++ type, subscribers by what they subscribed
/// to: single objects, by address, or all objects of a type. Delivery is synchronous and nested on the
/// caller's thread; there is no queue.
namespace PubSub {

/// Virtual base of everything that can be subscribed to. Its identity is its address: a copy is a new object
/// without subscribers, and an assignment leaves the subscribers of the assigned-to object alone.
/// An object that ends takes no subscription with it: whoever subscribed to it unsubscribes first.
class EDITORMODEL_EXPORT Object
{
public:
    Object() = default;
    Object(const Object&) noexcept {}
    Object& operator=(const Object&) noexcept { return *this; }
    virtual ~Object() = default;
};

namespace Details {

class DispatcherProbe;
class MessageTable;

/// Polymorphic root of all messages.
class EDITORMODEL_EXPORT MessageBase
{
public:
    MessageBase() = default;
    MessageBase(const MessageBase&) = default;
    MessageBase& operator=(const MessageBase&) = default;
    virtual ~MessageBase() = default;
};

} // namespace Details

/// A message about an object of type T. It holds pointers only and lives on the stack of its publisher.
template <typename T>
class Message : public Details::MessageBase
{
public:
    explicit Message(const T* about) : sender(about) {}

    /// The object that the message is about; null reaches only those that subscribed to all of T.
    const T* sender;
};

namespace Details {

/// What one subscriber is subscribed to. One set serves all message types of the subscriber.
///
/// Everything here may be called while a publication is under way, also from its handlers and at any depth.
class EDITORMODEL_EXPORT SubscriberBase
{
public:
    SubscriberBase();
    /// Copies the subscriptions; the copy is a subscriber of its own.
    SubscriberBase(const SubscriberBase& other);
    SubscriberBase& operator=(const SubscriberBase& other);
    /// Leaves the bus: nothing reaches this subscriber afterwards, also not from a running publication.
    virtual ~SubscriberBase();

    /// Subscriptions are not counted: one unsubscribe() undoes any number of calls. Null is ignored. Where
    /// the memory for a subscription is missing there is none; leaving needs no memory.
    void subscribe(const Object* object);
    void unsubscribe(const Object* object);
    bool isSubscribed(const Object* object) const;

    /// Subscribes to the messages about every T, also about future ones and those with a null sender.
    template <typename T>
    void subscribeAll()
    {
        subscribeAll(std::type_index(typeid(T)));
    }

    /// Undoes subscribeAll<T>(); subscriptions to single objects stay.
    template <typename T>
    void unsubscribeAll()
    {
        unsubscribeAll(std::type_index(typeid(T)));
    }

    /// True between subscribeAll<T>() and unsubscribeAll<T>().
    template <typename T>
    bool isSubscribedAll() const
    {
        return isSubscribed(std::type_index(typeid(T)));
    }

protected:
    /// Enters `subscriber`, a Details::Subscriber<M>*, under the message type on behalf of `base`.
    void registerSelf(SubscriberBase* base, void* subscriber, const std::type_index& messageType);
    /// Does for a copied subscriber what registerSelf() does for a new one, subscriptions of `base` included.
    void registerCopy(SubscriberBase* base, void* subscriber, const std::type_index& messageType);
    void unregisterSelf(SubscriberBase* base, void* subscriber, const std::type_index& messageType);

private:
    friend class MessageTable;
    struct Subscriptions;

    void subscribeAll(const std::type_index& objectType);
    void unsubscribeAll(const std::type_index& objectType);
    bool isSubscribed(const std::type_index& objectType) const;

    std::unique_ptr<Subscriptions> m_subscriptions;
};

/// Receives the messages of type M.
template <typename M>
class Subscriber : public virtual SubscriberBase
{
public:
    /// Called for every message of type M that is published about an object subscribed to. It may throw: the
    /// exception passes through publish() and ends the publication.
    virtual void notify(const M& message) = 0;

    Subscriber() { registerSelf(this, this, typeid(M)); }
    Subscriber(const Subscriber& other) : SubscriberBase(other) { registerCopy(this, this, typeid(M)); }

    Subscriber& operator=(const Subscriber& other)
    {
        SubscriberBase::operator=(other);
        return *this;
    }

    ~Subscriber() override { unregisterSelf(this, this, typeid(M)); }
};

/// The part of a message type's table that a publication reads without a call.
struct DeliveryState
{
    PointerMap<RecipientList> bySender;
    /// The snapshots of all running publications, innermost last. They move when the arena grows.
    Recipient* snapshots = nullptr;
    std::size_t used = 0;
    /// Grows with everything that can take somebody out of a snapshot.
    quint64 removals = 0;
};

/// How many subscribers a publication has, and the first of them. A single one is not entered in the arena:
/// there is nobody behind it whom its handler could take out.
struct Snapshot
{
    void* first;
    std::size_t count;
};

/// The way from one message type to its subscribers. Valid for the life of the process.
class EDITORMODEL_EXPORT Channel
{
public:
    /// The innermost snapshot lies in the arena if it counts more than one. The way to a single recipient, or
    /// to none, calls nothing.
    Q_ALWAYS_INLINE Snapshot snapshot(const Object* sender) const
    {
        const RecipientList* recipients = m_state->bySender.find(sender);
        if (!recipients) {
            recipients = m_all;
        } else if (!m_all->isEmpty()) {
            return snapshotOfBoth(sender, *recipients);
        }
        if (recipients->isLong()) {
            return snapshotOfMany(*recipients);
        }
        return {recipients->first().subscriber, recipients->isEmpty() ? 0u : 1u};
    }

    /// Whether somebody in a snapshot still lives and is subscribed, to the sender or to all.
    bool isDue(const Recipient& recipient, const Object* sender) const;
    DeliveryState& state() const { return *m_state; }

private:
    friend class Dispatcher;
    Channel(MessageTable& table, RecipientList& all, const std::type_index& objectType);
    Snapshot snapshotOfMany(const RecipientList& recipients) const;
    Snapshot snapshotOfBoth(const Object* sender, const RecipientList& some) const;

    MessageTable* m_table;
    RecipientList* m_all;
    DeliveryState* m_state;
    std::type_index m_objectType;
};

/// Keeps the tables, one a message type. It is made at first use, also during static initialisation, and is
/// never destroyed. The tables share nothing that changes, so two message types may be used on two threads.
class EDITORMODEL_EXPORT Dispatcher
{
public:
    static Dispatcher& instance();

    Dispatcher(const Dispatcher&) = delete;
    Dispatcher& operator=(const Dispatcher&) = delete;

    Channel channel(const std::type_index& messageType, const std::type_index& objectType);

private:
    friend class DispatcherProbe;
    friend class SubscriberBase;
    struct Tables;

    Dispatcher();
    ~Dispatcher();

    MessageTable& table(const std::type_index& messageType) const;
    std::deque<void*> getSubscribers(const MessageBase& message, const std::type_index& messageType,
                                     const Object* sender, const std::type_index& objectType) const;

    const std::unique_ptr<Tables> m_tables;
};

/// Takes a snapshot off the arena, also when a handler throws.
class SnapshotScope
{
public:
    SnapshotScope(const Channel& channel, const Snapshot& snapshot)
        : m_state(channel.state()), m_begin(m_state.used - snapshot.count), m_removals(m_state.removals)
    {}
    SnapshotScope(const SnapshotScope&) = delete;
    SnapshotScope& operator=(const SnapshotScope&) = delete;
    ~SnapshotScope() { m_state.used = m_begin; }

    const Recipient& operator[](std::size_t index) const { return m_state.snapshots[m_begin + index]; }
    /// True if nobody has left since the snapshot was taken, so that no one in it needs to be asked.
    bool isUntouched() const { return m_state.removals == m_removals; }

private:
    DeliveryState& m_state;
    const std::size_t m_begin;
    const quint64 m_removals;
};

template <typename T>
struct SenderType
{
    using Type = T;
};

template <typename T>
SenderType<T> senderType(const PubSub::Message<T>*);

/// The T that is named by the PubSub::Message<T> base of M.
template <typename M>
using SenderOf = typename decltype(senderType(static_cast<const M*>(nullptr)))::Type;

/// A type without a PubSub::Object base cannot be subscribed to by address and goes out with a null sender.
template <typename T>
const Object* senderAddress(const T* sender)
{
    static_assert(sizeof(T) > 0, "the sender's type must be complete where a message is published");
    if constexpr (std::is_convertible_v<const T*, const Object*>) {
        return sender;
    } else {
        return nullptr;
    }
}

/// Delivers to more than one. Apart, so that the way to a single one stays short.
template <typename M>
Q_NEVER_INLINE void deliver(const M& message, const Object* sender, const Channel& channel,
                            const Snapshot& snapshot)
{
    const SnapshotScope recipients(channel, snapshot);
    for (std::size_t i = 0; i != snapshot.count; ++i) {
        const Recipient& recipient = recipients[i];
        if (recipients.isUntouched() || channel.isDue(recipient, sender)) {
            static_cast<Subscriber<M>*>(recipient.subscriber)->notify(message);
        }
    }
}

} // namespace Details

/// Receives the messages of several types with one set of subscriptions.
template <typename... M>
class Subscriber : public virtual Details::Subscriber<M>...
{
public:
    Subscriber() = default;
    Subscriber(const Subscriber&) = default;

    Subscriber& operator=(const Subscriber& other)
    {
        Details::SubscriberBase::operator=(other);
        return *this;
    }
};

/// Delivers the message, before it returns, to every subscriber of its type that is subscribed to its sender
/// or to all of the sender's type. Those who are to be reached are settled at the start: who subscribes
/// meanwhile is not reached, who unsubscribes or ends before its turn is passed over. The order among them is
/// not defined.
///
/// What a handler throws passes through; the subscribers behind it are not reached then.
template <typename M>
void publish(const M& message)
{
    using Sender = Details::SenderOf<M>;
    static const Details::Channel channel =
        Details::Dispatcher::instance().channel(typeid(M), typeid(Sender));

    const Object* sender = Details::senderAddress(static_cast<const Message<Sender>&>(message).sender);
    const Details::Snapshot snapshot = channel.snapshot(sender);
    if (snapshot.count == 0) {
        return;
    }
    if (snapshot.count == 1) {
        static_cast<Details::Subscriber<M>*>(snapshot.first)->notify(message);
        return;
    }
    Details::deliver(message, sender, channel, snapshot);
}

} // namespace PubSub
