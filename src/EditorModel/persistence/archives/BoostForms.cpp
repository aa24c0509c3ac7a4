// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/archives/BoostForms.h>
#include <EditorModel/persistence/archives/Registration.h>

#include <boost/serialization/void_cast.hpp>

#include <map>
#include <mutex>
#include <typeindex>
#include <vector>

namespace Serialize::Details {
namespace {

/// The side of a cast that is not entered as a type itself, such as the root class.
const TypeInfo& bareInfo(const std::type_info& info)
{
    static auto* const infos = new std::map<std::type_index, std::unique_ptr<TypeInfo>>;
    auto& entry = (*infos)[info];
    if (!entry)
        entry = std::make_unique<TypeInfo>(info, nullptr);
    return *entry;
}

/// All casts are entered as casts over a virtual base: their offsets are never used.
class Caster final : public bs::void_cast_detail::void_caster
{
public:
    Caster(const TypeInfo& derived, const TypeInfo& base, CastEntry::Cast up, CastEntry::Cast down)
        : void_caster(&derived, &base), m_up(up), m_down(down)
    {
        recursive_register(true);
    }
    ~Caster() override { recursive_unregister(); }

    void const* upcast(void const* const object) const override { return m_up(object); }
    void const* downcast(void const* const object) const override { return m_down(object); }
    bool has_virtual_base() const override { return true; }

private:
    const CastEntry::Cast m_up;
    const CastEntry::Cast m_down;
};

} // namespace

const ArchiveForms& formsOf(const Type& type)
{
    if (const ArchiveForms* const forms = type.forms.load(std::memory_order_acquire))
        return *forms;
    static std::mutex* const mutex = new std::mutex;
    const std::lock_guard<std::mutex> lock(*mutex);
    if (const ArchiveForms* const forms = type.forms.load(std::memory_order_relaxed))
        return *forms;
    const auto* const forms = new ArchiveForms(type);
    type.forms.store(forms, std::memory_order_release);
    return *forms;
}

std::string tagOf(const char* name)
{
    std::string tag = name;
    for (char& c : tag) {
        if (c == ':')
            c = '.';
    }
    return tag;
}

void enterForms(const Type& type)
{
    formsOf(type);
}

CastEntry::CastEntry(const Type& derived, const std::type_info& base, Cast up, Cast down)
{
    // Boost takes what it makes for a cast back when the cast leaves its table, so they leave it at the end.
    static std::vector<std::unique_ptr<Caster>> casters;
    casters.push_back(std::make_unique<Caster>(formsOf(derived).info, bareInfo(base), up, down));
}

} // namespace Serialize::Details
