// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/detail/PointerMap.h>

#include <QtGlobal>

#include <algorithm>
#include <cstddef>
#include <memory>
#include <vector>

namespace PubSub::Details {

/// One entry of a snapshot: a Details::Subscriber<M>* and the serial number of its registration. Serial
/// numbers are never used twice, so a subscriber that was built where another one ended is not taken for it.
struct Recipient
{
    void* subscriber;
    quint64 registration;
};

/// The recipients of one object, or of all objects of a type, in no order. Most objects have one, which lies
/// in the list itself. A long list keeps the positions of its members, so that leaving it doesn't search it.
class RecipientList
{
public:
    std::size_t size() const { return m_first.subscriber ? 1 + m_rest.size() : 0; }
    bool isEmpty() const { return !m_first.subscriber; }
    /// Has more than one.
    bool isLong() const { return !m_rest.empty(); }
    const Recipient& first() const { return m_first; }

    /// Writes size() entries; the list must not be empty.
    void copyTo(Recipient* target) const
    {
        *target = m_first;
        std::copy(m_rest.begin(), m_rest.end(), target + 1);
    }

    template <typename Visit>
    void forEach(Visit visit) const
    {
        if (!isEmpty()) {
            visit(m_first);
        }
        std::for_each(m_rest.begin(), m_rest.end(), visit);
    }

    /// The recipient must not be in the list.
    void add(const Recipient& recipient)
    {
        if (isEmpty()) {
            m_first = recipient;
        } else {
            addToRest(recipient);
        }
    }

    /// A subscriber that is not in the list is ignored.
    void remove(const void* subscriber) noexcept
    {
        if (isLong()) {
            removeFromMany(subscriber);
        } else if (m_first.subscriber == subscriber) {
            m_first = {nullptr, 0};
        }
    }

private:
    Recipient& at(std::size_t position) noexcept { return position ? m_rest[position - 1] : m_first; }
    std::size_t position(const void* subscriber) noexcept;
    void addToRest(const Recipient& recipient);
    void removeFromMany(const void* subscriber) noexcept;
    void index();

    Recipient m_first{nullptr, 0};
    std::vector<Recipient> m_rest;
    std::unique_ptr<PointerMap<std::size_t>> m_positions;
};

} // namespace PubSub::Details
