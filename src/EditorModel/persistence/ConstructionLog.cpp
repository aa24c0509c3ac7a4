// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/ConstructionLog.h>

#include <EditorModel/persistence/Type.h>
#include <EditorModel/persistence/Unregistered.h>

#include <algorithm>
#include <utility>

namespace Serialize::Details {
namespace {

thread_local ConstructionLog* current = nullptr;

void destroyNamed(void* object)
{
    delete static_cast<ISerializable*>(object);
}

} // namespace

ConstructionLog::ConstructionLog() : m_outer(std::exchange(current, this)) {}

ConstructionLog::~ConstructionLog()
{
    current = m_outer;
    destroyAll(m_made);
}

/// The place is taken first, so that nothing can fail once the object is there; the constructor may take
/// others.
template <class Create>
auto ConstructionLog::noted(void (*destroy)(void* object), Create create) -> decltype(create())
{
    if (!current)
        return create();
    const std::size_t place = current->m_made.size();
    current->m_made.push_back({nullptr, destroy});
    const auto object = create();
    current->m_made[place].object = object;
    return object;
}

void* ConstructionLog::make(const Type& type)
{
    return noted(type.destroy, [&] { return type.create(); });
}

ISerializable* ConstructionLog::makeNamed(const std::string& name)
{
    const BaseCreator* const creator = findCreator(name);
    if (!creator)
        throwUnregistered();
    return noted(&destroyNamed, [&] { return creator->Create(); });
}

void ConstructionLog::release(void* object)
{
    if (!current)
        return;
    // What is released was made a moment ago.
    auto& made = current->m_made;
    const auto found = std::find_if(made.rbegin(), made.rend(),
                                    [object](const Made& entry) { return entry.object == object; });
    if (found != made.rend())
        found->object = nullptr;
}

std::vector<ConstructionLog::Made> ConstructionLog::take()
{
    auto made = std::exchange(m_made, {});
    made.erase(std::remove_if(made.begin(), made.end(), [](const Made& entry) { return !entry.object; }),
               made.end());
    return made;
}

void destroyAll(std::vector<ConstructionLog::Made>& made) noexcept
{
    for (auto entry = made.rbegin(); entry != made.rend(); ++entry) {
        if (entry->object)
            entry->destroy(entry->object);
    }
    made.clear();
}

} // namespace Serialize::Details
