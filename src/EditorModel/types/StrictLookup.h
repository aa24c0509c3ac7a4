// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <stdexcept>

namespace Types {

/// The value under a key that must be there: throws `std::out_of_range("invalid map<K, T> key")` otherwise.
template <class Map, class Key>
auto& strictAt(Map& map, const Key& key)
{
    const auto found = map.find(key);
    if (found == map.end())
        throw std::out_of_range("invalid map<K, T> key");
    return found->second;
}

} // namespace Types
