// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/bus/detail/RecipientList.h>

namespace PubSub::Details {

namespace {
/// Up to here a look through the list is faster than a hash.
constexpr std::size_t searchable = 16;
} // namespace

void RecipientList::addToRest(const Recipient& recipient)
{
    m_rest.push_back(recipient);
    try {
        index();
    } catch (...) {
        m_rest.pop_back();
        throw;
    }
}

void RecipientList::removeFromMany(const void* subscriber) noexcept
{
    const std::size_t found = position(subscriber);
    if (found == size()) {
        return;
    }
    const Recipient last = m_rest.back();
    at(found) = last;
    m_rest.pop_back();
    if (m_positions && size() <= searchable / 2) {
        m_positions.reset();
    } else if (m_positions) {
        *m_positions->find(last.subscriber) = found;
        m_positions->remove(subscriber);
    }
}

/// Where the subscriber stands; size() if it does not.
std::size_t RecipientList::position(const void* subscriber) noexcept
{
    if (m_positions) {
        const std::size_t* found = m_positions->find(subscriber);
        return found ? *found : size();
    }
    std::size_t i = 0;
    while (i != size() && at(i).subscriber != subscriber) {
        ++i;
    }
    return i;
}

/// Notes the position of the last member, or those of all when the list becomes a long one.
void RecipientList::index()
{
    if (m_positions) {
        m_positions->add(at(size() - 1).subscriber) = size() - 1;
    } else if (size() > searchable) {
        auto positions = std::make_unique<PointerMap<std::size_t>>();
        for (std::size_t i = 0; i != size(); ++i) {
            positions->add(at(i).subscriber) = i;
        }
        m_positions = std::move(positions);
    }
}

} // namespace PubSub::Details
