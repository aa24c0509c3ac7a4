// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/Serializable.h>
#include <EditorModel/persistence/Type.h>

#include <map>
#include <stdexcept>

namespace Serialize {
namespace {

using Table = std::map<std::string, const BaseCreator*, std::less<>>;

/// Never destroyed: registrators of other modules and readers in static destructors may still use it.
Table& table()
{
    static Table* const instance = new Table;
    return *instance;
}

} // namespace

ISerializable::~ISerializable() = default;

BaseCreator::~BaseCreator() = default;

Registrator::Registrator(const char* const name, const BaseCreator* const creator)
{
    Details::requireFreeName(name);
    table().emplace(name, creator);
}

void Details::requireFreeName(const char* name)
{
    if (table().count(name) != 0)
        throw std::logic_error("the archive name \"" + std::string(name) + "\" is registered twice");
}

const BaseCreator* findCreator(const std::string& name)
{
    const auto found = table().find(name);
    return found == table().end() ? nullptr : found->second;
}

std::vector<std::string> registeredNames()
{
    std::vector<std::string> names;
    for (const auto& entry : table())
        names.push_back(entry.first);
    return names;
}

} // namespace Serialize
