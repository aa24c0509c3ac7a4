// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "ClassTable.h"

#include <memory>

namespace FieldTests {

/// An object of a class that is known by its table. Its memory was dirty before, so that a field without a
/// default shows.
class Instance
{
public:
    explicit Instance(const ClassTable& table);
    Instance(Instance&& other) = default;
    ~Instance();

    Instance copied() const;
    Instance moved();
    /// False if the result of the assignment is another object.
    bool assign(const Instance& other);
    bool moveAssign(Instance& other);

    void* object() const { return m_object.get(); }
    void store(std::size_t field, std::size_t value) { m_table->fields[field].store(object(), value); }
    bool holds(std::size_t field, std::size_t value) const
    {
        return m_table->fields[field].holds(object(), value);
    }

private:
    struct Unmade
    {};
    Instance(const ClassTable& table, Unmade);

    const ClassTable* m_table;
    std::unique_ptr<void, void (*)(void*)> m_memory;
    std::unique_ptr<void, void (*)(void*)> m_object;
};

} // namespace FieldTests
