// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/bus/detail/MessageTable.h>

#include <algorithm>

namespace PubSub::Details {

quint64 MessageTable::registerSubscriber(void* subscriber, const SubscriberBase& base)
{
    m_registrations.add(subscriber) = {++m_lastSerial, &base};
    return m_lastSerial;
}

void MessageTable::unregisterSubscriber(const void* subscriber) noexcept
{
    m_registrations.remove(subscriber);
}

void MessageTable::subscribe(const Recipient& recipient, const Object* object)
{
    m_state.bySender.add(object).add(recipient);
}

void MessageTable::unsubscribe(const Recipient& recipient, const Object* object) noexcept
{
    ++m_state.removals;
    m_state.bySender.removeIf(object, [&](RecipientList& recipients) {
        recipients.remove(recipient.subscriber);
        return recipients.isEmpty();
    });
}

void MessageTable::subscribeAll(const Recipient& recipient, const std::type_index& objectType)
{
    all(objectType).add(recipient);
}

/// Without a list of the type nobody is in it, as where the first subscription failed.
void MessageTable::unsubscribeAll(const Recipient& recipient, const std::type_index& objectType) noexcept
{
    ++m_state.removals;
    if (RecipientList* recipients = findAll(objectType)) {
        recipients->remove(recipient.subscriber);
    }
}

RecipientList& MessageTable::all(const std::type_index& objectType)
{
    if (RecipientList* recipients = findAll(objectType)) {
        return *recipients;
    }
    return *m_byType.emplace_back(objectType, std::make_unique<RecipientList>()).second;
}

RecipientList* MessageTable::findAll(const std::type_index& objectType) const noexcept
{
    for (const auto& [type, recipients] : m_byType) {
        if (type == objectType) {
            return recipients.get();
        }
    }
    return nullptr;
}

Snapshot MessageTable::snapshotOfMany(const RecipientList& recipients)
{
    push(recipients);
    return {recipients.first().subscriber, recipients.size()};
}

/// Somebody who is in both lists is reached once.
Snapshot MessageTable::snapshotOfBoth(const Object* sender, const RecipientList& some,
                                      const RecipientList& all)
{
    const std::size_t begin = m_state.used;
    reserve(some.size() + all.size());
    push(some);
    all.forEach([&](const Recipient& recipient) {
        if (!m_registrations.find(recipient.subscriber)->base->isSubscribed(sender)) {
            m_state.snapshots[m_state.used++] = recipient;
        }
    });
    const Snapshot result{some.first().subscriber, m_state.used - begin};
    if (result.count == 1) {
        m_state.used = begin;
    }
    return result;
}

void MessageTable::push(const RecipientList& recipients)
{
    reserve(recipients.size());
    recipients.copyTo(m_state.snapshots + m_state.used);
    m_state.used += recipients.size();
}

void MessageTable::reserve(std::size_t count)
{
    if (m_state.used + count > m_arena.size()) {
        m_arena.resize(std::max(m_state.used + count, m_arena.size() * 2));
        m_state.snapshots = m_arena.data();
    }
}

bool MessageTable::isDue(const Recipient& recipient, const Object* sender,
                         const std::type_index& objectType) const
{
    const Registration* registration = m_registrations.find(recipient.subscriber);
    return registration && registration->serial == recipient.registration &&
           (registration->base->isSubscribed(objectType) || registration->base->isSubscribed(sender));
}

Channel::Channel(MessageTable& table, RecipientList& all, const std::type_index& objectType)
    : m_table(&table), m_all(&all), m_state(&table.state()), m_objectType(objectType)
{}

Snapshot Channel::snapshotOfMany(const RecipientList& recipients) const
{
    return m_table->snapshotOfMany(recipients);
}

Snapshot Channel::snapshotOfBoth(const Object* sender, const RecipientList& some) const
{
    return m_table->snapshotOfBoth(sender, some, *m_all);
}

bool Channel::isDue(const Recipient& recipient, const Object* sender) const
{
    return m_table->isDue(recipient, sender, m_objectType);
}

} // namespace PubSub::Details
