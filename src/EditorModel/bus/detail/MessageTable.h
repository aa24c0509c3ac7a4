// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/PubSub.h>

#include <utility>
#include <vector>

namespace PubSub::Details {

/// Who receives the messages of one type. Belongs to the thread that uses the message type.
class MessageTable
{
public:
    DeliveryState& state() { return m_state; }

    /// Returns the serial number of the registration.
    quint64 registerSubscriber(void* subscriber, const SubscriberBase& base);
    /// The subscriber has left all lists before, which is what running publications take note of.
    void unregisterSubscriber(const void* subscriber) noexcept;

    void subscribe(const Recipient& recipient, const Object* object);
    void unsubscribe(const Recipient& recipient, const Object* object) noexcept;
    void subscribeAll(const Recipient& recipient, const std::type_index& objectType);
    void unsubscribeAll(const Recipient& recipient, const std::type_index& objectType) noexcept;

    /// The recipients that subscribed to all objects of the type. Stays in place.
    RecipientList& all(const std::type_index& objectType);

    /// Of several recipients. Nobody is in it twice.
    Snapshot snapshotOfMany(const RecipientList& recipients);
    Snapshot snapshotOfBoth(const Object* sender, const RecipientList& some, const RecipientList& all);
    bool isDue(const Recipient& recipient, const Object* sender, const std::type_index& objectType) const;

private:
    struct Registration
    {
        quint64 serial = 0;
        const SubscriberBase* base = nullptr;
    };

    RecipientList* findAll(const std::type_index& objectType) const noexcept;
    void push(const RecipientList& recipients);
    void reserve(std::size_t count);

    DeliveryState m_state;
    std::vector<std::pair<std::type_index, std::unique_ptr<RecipientList>>> m_byType;
    PointerMap<Registration> m_registrations;
    quint64 m_lastSerial = 0;
    std::vector<Recipient> m_arena;
};

} // namespace PubSub::Details
