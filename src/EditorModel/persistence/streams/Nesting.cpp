// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/streams/Nesting.h>

#include <EditorModel/persistence/Fields.h>
#include <EditorModel/persistence/streams/Forms.h>

#include <algorithm>
#include <stdexcept>
#include <utility>

namespace Serialize::Details {
namespace {

/// Field lists are held to `maxDepth` before they come here; one of their levels opens at most a sequence and
/// an item, or a class. This stops the classes that write themselves without a field list.
constexpr std::size_t maxLevels = 3 * static_cast<std::size_t>(maxDepth);

} // namespace

Identity::Identity(const ISerializable* object)
{
    if (!object)
        return;
    address = dynamic_cast<const void*>(object);
    type = typeid(*object);
}

void Nesting::field(const char* key)
{
    if (!key)
        throw std::logic_error("a field without a key");
    if (m_announced)
        throw std::logic_error("the field " + inQuotes(m_key) + " has no value");
    if (!m_levels.empty() && m_levels.back().kind == Sequence)
        throw std::logic_error("the field " + inQuotes(key) + " stands in no item of its sequence");
    m_key = key;
    m_announced = true;
}

std::string Nesting::takeKey()
{
    if (!std::exchange(m_announced, false)) {
        if (!m_levels.empty())
            throw std::logic_error("a value without a field");
        m_key = rootKey;
    }
    return std::exchange(m_key, {});
}

void Nesting::beginClass(const std::string& name, const Identity& object)
{
    open({Class, name, object, 0, 0});
}

void Nesting::endClass(const std::string& name)
{
    const Level& level = top(Class, "endClass");
    if (level.name != name)
        throw std::logic_error("endClass for " + inQuotes(name) + " where " + inQuotes(level.name) +
                               " is open");
    close();
}

void Nesting::beginSequence(int count)
{
    if (count < 0)
        throw std::logic_error("a sequence of " + std::to_string(count) + " items");
    open({Sequence, {}, {}, count, 0});
}

void Nesting::endSequence()
{
    const Level& level = top(Sequence, "endSequence");
    if (level.index != level.count)
        throw std::logic_error("a sequence of " + std::to_string(level.count) + " items ends behind item " +
                               std::to_string(level.index));
    close();
}

void Nesting::beginItem(int index)
{
    Level& level = top(Sequence, "beginItem");
    if (index != level.index + 1 || index > level.count)
        throw std::logic_error("item " + std::to_string(index) + " behind item " +
                               std::to_string(level.index) + " of " + std::to_string(level.count));
    level.index = index;
    open({Item, {}, {}, 0, index});
}

void Nesting::endItem(int index)
{
    if (top(Item, "endItem").index != index)
        throw std::logic_error("endItem for an item that is not open");
    close();
}

bool Nesting::isOpen(const Identity& object) const
{
    const auto level = std::find_if(m_levels.rbegin(), m_levels.rend(),
                                    [](const Level& candidate) { return candidate.kind == Class; });
    return level != m_levels.rend() && level->object == object;
}

void Nesting::finish() const
{
    if (m_announced)
        throw std::logic_error("the field " + inQuotes(m_key) + " has no value");
    if (!m_levels.empty())
        throw std::logic_error("the stream ends while something is open");
}

void Nesting::open(Level level)
{
    if (m_levels.size() >= maxLevels)
        throw std::runtime_error("objects nest too deep");
    m_levels.push_back(std::move(level));
}

Nesting::Level& Nesting::top(Kind kind, const char* operation)
{
    if (m_announced)
        throw std::logic_error("the field " + inQuotes(m_key) + " has no value");
    if (m_levels.empty() || m_levels.back().kind != kind)
        throw std::logic_error(std::string(operation) + " out of order");
    return m_levels.back();
}

void Nesting::close()
{
    m_levels.pop_back();
}

} // namespace Serialize::Details
