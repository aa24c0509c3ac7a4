// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/PubSub.h>

namespace PubSub::Details {

/// Lists whom a publication would reach, in its order.
class DispatcherProbe
{
public:
    template <typename M, typename T>
    static std::deque<void*> subscribers(const M& message, const PubSub::Object* sender)
    {
        return Dispatcher::instance().getSubscribers(message, typeid(M), sender, typeid(T));
    }
};

} // namespace PubSub::Details
