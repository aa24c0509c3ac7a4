// SPDX-License-Identifier: Apache-2.0
#include "Instance.h"

#include <cstdlib>
#include <cstring>

namespace FieldTests {

constexpr int dirt = 0xA5;

Instance::Instance(const ClassTable& table, Unmade)
    : m_table(&table),
      m_memory(std::aligned_alloc(table.life->alignment, table.life->size), &std::free),
      m_object(nullptr, table.life->end)
{
    std::memset(m_memory.get(), dirt, table.life->size);
}

Instance::Instance(const ClassTable& table) : Instance(table, Unmade())
{
    table.life->make(m_memory.get());
    m_object.reset(m_memory.get());
}

Instance::~Instance() = default;

Instance Instance::copied() const
{
    Instance copy(*m_table, Unmade());
    m_table->life->copy(copy.m_memory.get(), object());
    copy.m_object.reset(copy.m_memory.get());
    return copy;
}

Instance Instance::moved()
{
    Instance target(*m_table, Unmade());
    m_table->life->move(target.m_memory.get(), object());
    target.m_object.reset(target.m_memory.get());
    return target;
}

bool Instance::assign(const Instance& other)
{
    return m_table->life->assign(object(), other.object()) == object();
}

bool Instance::moveAssign(Instance& other)
{
    return m_table->life->moveAssign(object(), other.object()) == object();
}

} // namespace FieldTests
