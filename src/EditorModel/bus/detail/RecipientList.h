// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/bus/detail/PointerMap.h>

#include <boost/container/small_vector.hpp>

namespace PubSub::Details {

/// The recipients of one object, or of all objects of a type, side by side in memory and in no order. Most
/// objects have one or two; a long list keeps the positions of its members, so that leaving it doesn't search
/// it.
class RecipientList
{
public:
    std::size_t size() const { return m_recipients.size(); }
    bool isEmpty() const { return m_recipients.empty(); }
    const Recipient* begin() const { return m_recipients.data(); }
    const Recipient* end() const { return m_recipients.data() + m_recipients.size(); }

    /// The recipient must not be in the list.
    void add(const Recipient& recipient);
    /// A subscriber that is not in the list is ignored.
    void remove(const void* subscriber);

private:
    std::size_t position(const void* subscriber) const;

    boost::container::small_vector<Recipient, 1> m_recipients;
    std::unique_ptr<PointerMap<std::size_t>> m_positions;
};

} // namespace PubSub::Details
