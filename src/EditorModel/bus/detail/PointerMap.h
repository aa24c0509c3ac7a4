// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QtGlobal>

#include <cstddef>
#include <memory>
#include <new>
#include <type_traits>
#include <utility>

namespace PubSub::Details {

/// A hash map from non-null addresses, open addressing with linear probing. The node that the standard and
/// the Qt hashes allocate for every entry costs more than all the rest of a subscription; here nothing is
/// allocated while the number of entries moves within a factor of eight.
///
/// Value is default-constructible and movable, both without a failure. References to values are invalid after
/// add() and remove(). Only entering a key can fail, with bad_alloc; the map is then as it was.
template <typename Value>
class PointerMap
{
public:
    std::size_t size() const { return m_size; }
    bool isEmpty() const { return m_size == 0; }

    Value* find(const void* key) { return const_cast<Value*>(std::as_const(*this).find(key)); }

    const Value* find(const void* key) const
    {
        if (m_size == 0) {
            return nullptr;
        }
        const Slot& slot = m_slots[position(key)];
        return slot.key ? &slot.value : nullptr;
    }

    /// The value of the key, default-constructed if the key is new.
    Value& add(const void* key) { return m_slots[enter(key)].value; }

    /// False if the key was there.
    bool insert(const void* key)
    {
        const std::size_t before = m_size;
        enter(key);
        return m_size != before;
    }

    bool remove(const void* key) noexcept
    {
        return removeIf(key, [](const Value&) { return true; });
    }

    /// Removes the entry of the key if there is one and done(value), which may change it but not throw, says
    /// so.
    template <typename Done>
    bool removeIf(const void* key, Done done) noexcept
    {
        if (m_size == 0) {
            return false;
        }
        const std::size_t found = position(key);
        if (!m_slots[found].key || !done(m_slots[found].value)) {
            return false;
        }
        closeGap(found);
        --m_size;
        shrink();
        return true;
    }

    /// Calls visit(key, value) for every entry, in no order. The map must not change meanwhile.
    template <typename Visit>
    void forEach(Visit visit) const
    {
        for (std::size_t i = 0; i != m_capacity; ++i) {
            if (m_slots[i].key) {
                visit(m_slots[i].key, m_slots[i].value);
            }
        }
    }

private:
    static_assert(std::is_nothrow_move_assignable_v<Value>);

    struct Slot
    {
        const void* key = nullptr;
        Value value = Value();
    };

    static constexpr std::size_t minimum = 8;

    /// Multiplication by 2^64 over the golden ratio; its upper bits depend on all bits of the address.
    std::size_t home(const void* key) const
    {
        return static_cast<std::size_t>((reinterpret_cast<quintptr>(key) * Q_UINT64_C(0x9E3779B97F4A7C15)) >>
                                        m_shift);
    }

    /// The slot that holds the key, or the empty one in which it would have to be entered.
    std::size_t position(const void* key) const
    {
        std::size_t i = home(key);
        while (m_slots[i].key && m_slots[i].key != key) {
            i = (i + 1) & (m_capacity - 1);
        }
        return i;
    }

    std::size_t enter(const void* key)
    {
        if ((m_size + 1) * 2 > m_capacity) {
            rehash(m_capacity ? m_capacity * 2 : minimum);
        }
        const std::size_t i = position(key);
        if (!m_slots[i].key) {
            m_slots[i].key = key;
            ++m_size;
        }
        return i;
    }

    /// Empties the slot and moves later entries of its run back, so that no probe stops short of them.
    void closeGap(std::size_t gap)
    {
        const std::size_t mask = m_capacity - 1;
        for (std::size_t i = (gap + 1) & mask; m_slots[i].key; i = (i + 1) & mask) {
            if (((i - home(m_slots[i].key)) & mask) >= ((i - gap) & mask)) {
                m_slots[gap] = std::move(m_slots[i]);
                gap = i;
            }
        }
        m_slots[gap] = Slot();
    }

    /// Without the memory for it the map stays large: whoever leaves must get away.
    void shrink() noexcept
    {
        if (m_capacity == minimum || m_size * 16 >= m_capacity) {
            return;
        }
        try {
            rehash(m_capacity / 4 > minimum ? m_capacity / 4 : minimum);
        } catch (const std::bad_alloc&) {
        }
    }

    /// Nothing has moved yet where the allocation fails.
    void rehash(std::size_t capacity)
    {
        auto slots = std::make_unique<Slot[]>(capacity);
        std::swap(slots, m_slots);
        const std::size_t before = std::exchange(m_capacity, capacity);
        m_shift = 64;
        for (std::size_t rest = capacity; rest > 1; rest /= 2) {
            --m_shift;
        }
        for (std::size_t i = 0; i != before; ++i) {
            if (slots[i].key) {
                m_slots[position(slots[i].key)] = std::move(slots[i]);
            }
        }
    }

    std::unique_ptr<Slot[]> m_slots;
    std::size_t m_capacity = 0;
    std::size_t m_size = 0;
    int m_shift = 64;
};

} // namespace PubSub::Details
