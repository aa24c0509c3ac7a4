// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/bus/detail/RecipientList.h>

namespace PubSub::Details {

namespace {
/// Up to here a look through the list is faster than a hash.
constexpr std::size_t searchable = 16;
} // namespace

void RecipientList::add(const Recipient& recipient)
{
    m_recipients.push_back(recipient);
    try {
        if (m_positions) {
            m_positions->add(recipient.subscriber) = m_recipients.size() - 1;
        } else if (m_recipients.size() > searchable) {
            auto positions = std::make_unique<PointerMap<std::size_t>>();
            for (std::size_t i = 0; i != m_recipients.size(); ++i) {
                positions->add(m_recipients[i].subscriber) = i;
            }
            m_positions = std::move(positions);
        }
    } catch (...) {
        m_recipients.pop_back();
        throw;
    }
}

void RecipientList::remove(const void* subscriber)
{
    const std::size_t found = position(subscriber);
    if (found == m_recipients.size()) {
        return;
    }
    const Recipient last = m_recipients.back();
    m_recipients[found] = last;
    m_recipients.pop_back();
    if (m_positions && m_recipients.size() <= searchable / 2) {
        m_positions.reset();
    } else if (m_positions) {
        *m_positions->find(last.subscriber) = found;
        m_positions->remove(subscriber);
    }
}

std::size_t RecipientList::position(const void* subscriber) const
{
    if (m_positions) {
        const std::size_t* found = m_positions->find(subscriber);
        return found ? *found : m_recipients.size();
    }
    std::size_t i = 0;
    while (i != m_recipients.size() && m_recipients[i].subscriber != subscriber) {
        ++i;
    }
    return i;
}

} // namespace PubSub::Details
