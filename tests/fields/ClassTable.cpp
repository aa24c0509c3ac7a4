// SPDX-License-Identifier: Apache-2.0
#include "ClassTable.h"

#include <algorithm>
#include <cstring>
#include <stdexcept>

namespace FieldTests {
namespace {

/// Values of a type that is the bits of another.
template <class Bits>
class PlainValues final : public TriedValues
{
public:
    PlainValues(const std::type_info& type, Bits defaultValue, const std::vector<Bits>& others)
        : m_type(type), m_values{defaultValue}
    {
        std::copy_if(others.begin(), others.end(), std::back_inserter(m_values),
                     [&](Bits value) { return value != defaultValue; });
    }

    const std::type_info& type() const override { return m_type; }
    std::size_t count() const override { return m_values.size(); }
    const void* at(std::size_t index) const override { return &m_values[index]; }
    bool areSame(const void* value, std::size_t index) const override
    {
        return std::memcmp(value, at(index), sizeof(Bits)) == 0;
    }
    void store(void* value, std::size_t index) const override { std::memcpy(value, at(index), sizeof(Bits)); }

private:
    const std::type_info& m_type;
    std::vector<Bits> m_values;
};

} // namespace

SharedValues shared(TriedValues* values)
{
    return SharedValues(values);
}

SharedValues addresses(const std::type_info& type, const void* defaultValue)
{
    return shared(new PlainValues<const void*>(type, defaultValue, Values<const void*>::all()));
}

SharedValues numbers(const std::type_info& type, int defaultValue)
{
    return shared(new PlainValues<int>(type, defaultValue, Values<int>::all()));
}

template SharedValues triedValues(const bool&);
template SharedValues triedValues(const int&);
template SharedValues triedValues(const quint32&);
template SharedValues triedValues(const qint64&);
template SharedValues triedValues(const double&);
template SharedValues triedValues(const MTime&);
template SharedValues triedValues(const QString&);
template SharedValues triedValues(const std::string&);
template SharedValues triedValues(const ResourceRef&);
template SharedValues triedValues(const std::set<QString>&);
template SharedValues triedValues(const std::deque<QString>&);

void* FieldRow::part(void* object) const
{
    for (const Up up : path)
        object = up(object);
    return object;
}

void FieldRow::store(void* object, std::size_t index) const
{
    if (write) {
        const void* const value = values->at(index);
        write(part(object), &value);
    } else {
        values->store(const_cast<void*>(in(object)), index);
    }
}

ClassTable::ClassTable(const char* className, const char* archiveName, const Life& classLife,
                       Returns settersReturn)
    : name(className), nameInArchive(archiveName), life(&classLife), returns(settersReturn)
{}

ClassTable::ClassTable(const ClassTable& other) = default;
ClassTable::~ClassTable() = default;

void ClassTable::addField(const char* field, SharedValues values, Place place, Call write)
{
    fields.push_back({field, std::move(values), place, write, {}});
}

void ClassTable::addSetter(Call call, Returns returned, const std::type_info* const* types,
                           std::initializer_list<const char*> names)
{
    SetterRow setter{call, returned, returns, {}};
    for (const std::string field : names) {
        const auto row = std::find_if(fields.begin(), fields.end(),
                                      [&](const FieldRow& candidate) { return candidate.name == field; });
        if (row == fields.end() || row->values->type() != *types[setter.fields.size()])
            throw std::logic_error("a setter of " + name + " does not fit the field " + field);
        setter.fields.push_back(static_cast<std::size_t>(row - fields.begin()));
    }
    setters.push_back(setter);
}

void ClassTable::addBase(const ClassTable& base, Up up)
{
    const std::size_t first = fields.size();
    for (FieldRow row : base.fields) {
        row.name = base.name + "::" + row.name;
        row.path.insert(row.path.begin(), up);
        fields.push_back(std::move(row));
    }
    for (SetterRow row : base.setters) {
        for (std::size_t& index : row.fields)
            index += first;
        setters.push_back(std::move(row));
    }
    if (base.nameInArchive)
        storedBases.emplace_back(base.nameInArchive);
}

} // namespace FieldTests
