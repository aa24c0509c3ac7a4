// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/bus/PubSub.h>

#include <EditorModel/bus/detail/MessageTable.h>

#include <QVarLengthArray>

#include <algorithm>
#include <mutex>
#include <unordered_map>

namespace PubSub {

namespace Details {

namespace {

/// One message type for which a subscriber is registered.
struct Registration
{
    std::type_index messageType = typeid(void);
    MessageTable* table = nullptr;
    Recipient recipient = {};
};

struct Nothing
{};

} // namespace

struct SubscriberBase::Subscriptions
{
    using Registrations = QVarLengthArray<Registration, 3>;

    PointerMap<Nothing> objects;
    std::vector<std::type_index> types;
    Registrations registrations;

    Registrations::iterator find(const void* subscriber, const std::type_index& messageType)
    {
        return std::find_if(registrations.begin(), registrations.end(),
                            [&](const Registration& registration) {
                                return registration.recipient.subscriber == subscriber &&
                                       registration.messageType == messageType;
                            });
    }

    /// Takes one registration out of its table with everything that it is subscribed to there.
    void leave(Registrations::iterator left)
    {
        const Registration registration = *left;
        *left = registrations.last();
        registrations.removeLast();
        objects.forEach([&](const void* object, Nothing) {
            registration.table->unsubscribe(registration.recipient, static_cast<const Object*>(object));
        });
        for (const std::type_index& type : types) {
            registration.table->unsubscribeAll(registration.recipient, type);
        }
        registration.table->unregisterSubscriber(registration.recipient.subscriber);
    }
};

SubscriberBase::SubscriberBase() : m_subscriptions(std::make_unique<Subscriptions>()) {}

SubscriberBase::SubscriberBase(const SubscriberBase& other) : SubscriberBase()
{
    m_subscriptions->types = other.m_subscriptions->types;
    other.m_subscriptions->objects.forEach(
        [this](const void* object, Nothing) { m_subscriptions->objects.add(object); });
}

SubscriberBase& SubscriberBase::operator=(const SubscriberBase& other)
{
    // Copies, as the sets change while they are walked, and `other` may be this subscriber.
    const SubscriberBase wanted(other);
    const SubscriberBase present(*this);
    present.m_subscriptions->objects.forEach([&](const void* address, Nothing) {
        const auto* object = static_cast<const Object*>(address);
        if (!wanted.isSubscribed(object)) {
            unsubscribe(object);
        }
    });
    for (const std::type_index& type : present.m_subscriptions->types) {
        if (!wanted.isSubscribed(type)) {
            unsubscribeAll(type);
        }
    }
    wanted.m_subscriptions->objects.forEach(
        [&](const void* address, Nothing) { subscribe(static_cast<const Object*>(address)); });
    for (const std::type_index& type : wanted.m_subscriptions->types) {
        subscribeAll(type);
    }
    return *this;
}

SubscriberBase::~SubscriberBase()
{
    while (!m_subscriptions->registrations.isEmpty()) {
        const Registration last = m_subscriptions->registrations.last();
        unregisterSelf(this, last.recipient.subscriber, last.messageType);
    }
}

void SubscriberBase::subscribe(const Object* object)
{
    if (!object || !m_subscriptions->objects.insert(object)) {
        return;
    }
    try {
        for (const Registration& registration : m_subscriptions->registrations) {
            registration.table->subscribe(registration.recipient, object);
        }
    } catch (...) {
        unsubscribe(object);
        throw;
    }
}

void SubscriberBase::unsubscribe(const Object* object)
{
    if (!m_subscriptions->objects.remove(object)) {
        return;
    }
    for (const Registration& registration : m_subscriptions->registrations) {
        registration.table->unsubscribe(registration.recipient, object);
    }
}

bool SubscriberBase::isSubscribed(const Object* object) const
{
    return object && m_subscriptions->objects.find(object);
}

void SubscriberBase::subscribeAll(const std::type_index& objectType)
{
    if (isSubscribed(objectType)) {
        return;
    }
    m_subscriptions->types.push_back(objectType);
    try {
        for (const Registration& registration : m_subscriptions->registrations) {
            registration.table->subscribeAll(registration.recipient, objectType);
        }
    } catch (...) {
        unsubscribeAll(objectType);
        throw;
    }
}

void SubscriberBase::unsubscribeAll(const std::type_index& objectType)
{
    auto& types = m_subscriptions->types;
    const auto found = std::find(types.begin(), types.end(), objectType);
    if (found == types.end()) {
        return;
    }
    const std::type_index type = objectType; // may be the element that goes
    types.erase(found);
    for (const Registration& registration : m_subscriptions->registrations) {
        registration.table->unsubscribeAll(registration.recipient, type);
    }
}

bool SubscriberBase::isSubscribed(const std::type_index& objectType) const
{
    const auto& types = m_subscriptions->types;
    return std::find(types.begin(), types.end(), objectType) != types.end();
}

void SubscriberBase::registerSelf(SubscriberBase* base, void* subscriber, const std::type_index& messageType)
{
    Subscriptions& own = *base->m_subscriptions;
    if (own.find(subscriber, messageType) != own.registrations.end()) {
        return;
    }
    MessageTable& table = Dispatcher::instance().table(messageType);
    own.registrations.reserve(own.registrations.size() + 1);
    const Recipient recipient{subscriber, table.registerSubscriber(subscriber, *base)};
    own.registrations.append({messageType, &table, recipient});
    try {
        own.objects.forEach([&](const void* object, Nothing) {
            table.subscribe(recipient, static_cast<const Object*>(object));
        });
        for (const std::type_index& type : own.types) {
            table.subscribeAll(recipient, type);
        }
    } catch (...) {
        own.leave(own.registrations.end() - 1);
        throw;
    }
}

void SubscriberBase::registerCopy(SubscriberBase* base, void* subscriber, const std::type_index& messageType)
{
    registerSelf(base, subscriber, messageType);
}

void SubscriberBase::unregisterSelf(SubscriberBase* base, void* subscriber,
                                    const std::type_index& messageType)
{
    Subscriptions& own = *base->m_subscriptions;
    const auto found = own.find(subscriber, messageType);
    if (found != own.registrations.end()) {
        own.leave(found);
    }
}

struct Dispatcher::Tables
{
    std::mutex mutex;
    std::unordered_map<std::type_index, std::unique_ptr<MessageTable>> byMessageType;
};

Dispatcher::Dispatcher() : m_tables(std::make_unique<Tables>()) {}

Dispatcher::~Dispatcher() = default;

Dispatcher& Dispatcher::instance()
{
    static Dispatcher& dispatcher = *new Dispatcher; // outlives every static subscriber
    return dispatcher;
}

Channel Dispatcher::channel(const std::type_index& messageType, const std::type_index& objectType)
{
    MessageTable& messages = table(messageType);
    return Channel(messages, messages.all(objectType), objectType);
}

MessageTable& Dispatcher::table(const std::type_index& messageType) const
{
    const std::lock_guard<std::mutex> lock(m_tables->mutex);
    std::unique_ptr<MessageTable>& found = m_tables->byMessageType[messageType];
    if (!found) {
        found = std::make_unique<MessageTable>();
    }
    return *found;
}

/// The same snapshot as that of publish(), by value and found by type.
std::deque<void*> Dispatcher::getSubscribers(const MessageBase&, const std::type_index& messageType,
                                             const Object* sender, const std::type_index& objectType) const
{
    MessageTable& messages = table(messageType);
    const Channel channel(messages, messages.all(objectType), objectType);
    const Snapshot snapshot = channel.snapshot(sender);
    if (snapshot.count <= 1) {
        return std::deque<void*>(snapshot.count, snapshot.first);
    }
    const SnapshotScope recipients(channel, snapshot);
    std::deque<void*> subscribers;
    for (std::size_t i = 0; i != snapshot.count; ++i) {
        subscribers.push_back(recipients[i].subscriber);
    }
    return subscribers;
}

} // namespace Details
} // namespace PubSub
