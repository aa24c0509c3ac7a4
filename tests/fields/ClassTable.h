// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "Values.h"

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/media/ResourceRef.h>

#include <cstddef>
#include <deque>
#include <initializer_list>
#include <iterator>
#include <memory>
#include <new>
#include <set>
#include <string>
#include <type_traits>
#include <typeinfo>
#include <utility>
#include <vector>

/// The fields of a class with their defaults and setters, as a table that the tests walk without knowing the
/// class. Objects are passed by the address of the class that the table is about. What is made for each row
/// is a function or two, so that the hundreds of rows compile fast.
namespace FieldTests {

/// The values that a field is tried with: first its default, then others.
class TriedValues
{
public:
    virtual ~TriedValues() = default;

    virtual const std::type_info& type() const = 0;
    virtual std::size_t count() const = 0;
    virtual const void* at(std::size_t index) const = 0;
    virtual bool areSame(const void* value, std::size_t index) const = 0;
    virtual void store(void* value, std::size_t index) const = 0;
};

template <class F>
class TriedValuesOf final : public TriedValues
{
public:
    explicit TriedValuesOf(const F& defaultValue)
    {
        const std::vector<F> all = Values<F>::all();
        m_values = std::make_unique<F[]>(all.size() + 1);
        m_values[0] = defaultValue;
        for (const F& value : all) {
            if (!same(value, defaultValue))
                m_values[m_count++] = value;
        }
    }

    const std::type_info& type() const override { return typeid(F); }
    std::size_t count() const override { return m_count; }
    const void* at(std::size_t index) const override { return &m_values[index]; }
    bool areSame(const void* value, std::size_t index) const override
    {
        return same(*static_cast<const F*>(value), m_values[index]);
    }
    void store(void* value, std::size_t index) const override { *static_cast<F*>(value) = m_values[index]; }

private:
    std::unique_ptr<F[]> m_values;
    std::size_t m_count = 1;
};

using SharedValues = std::shared_ptr<const TriedValues>;

SharedValues shared(TriedValues* values);
/// For pointers and enumerations: any bits of theirs are a value.
SharedValues addresses(const std::type_info& type, const void* defaultValue);
SharedValues numbers(const std::type_info& type, int defaultValue);

template <class F>
SharedValues triedValues(const F& defaultValue)
{
    if constexpr (std::is_pointer_v<F>) {
        return addresses(typeid(F), defaultValue);
    } else if constexpr (std::is_enum_v<F>) {
        static_assert(sizeof(F) == sizeof(int));
        return numbers(typeid(F), defaultValue);
    } else {
        return shared(new TriedValuesOf<F>(defaultValue));
    }
}

extern template SharedValues triedValues(const bool&);
extern template SharedValues triedValues(const int&);
extern template SharedValues triedValues(const quint32&);
extern template SharedValues triedValues(const qint64&);
extern template SharedValues triedValues(const double&);
extern template SharedValues triedValues(const MTime&);
extern template SharedValues triedValues(const QString&);
extern template SharedValues triedValues(const std::string&);
extern template SharedValues triedValues(const ResourceRef&);
extern template SharedValues triedValues(const std::set<QString>&);
extern template SharedValues triedValues(const std::deque<QString>&);

/// What setters are declared to return.
enum class Returns
{
    Pointer,   ///< to the class
    Reference, ///< to the class
    Sender,    ///< a pointer to `PubSub::Object`
    Nothing,
    Other,
};

/// A call of a setter with a value for each argument. True if the setter gave back the object itself, or has
/// nothing to give back.
using Call = bool (*)(void* object, const void* const* values);

template <class C, auto Set, class Signature = decltype(Set)>
struct SetterOf;

template <class C, auto Set, class Result, class Owner, class... Arguments>
struct SetterOf<C, Set, Result (Owner::*)(Arguments...)>
{
    static constexpr Returns returns = std::is_same_v<Result, C*>                ? Returns::Pointer
                                       : std::is_same_v<Result, C&>              ? Returns::Reference
                                       : std::is_same_v<Result, PubSub::Object*> ? Returns::Sender
                                       : std::is_void_v<Result>                  ? Returns::Nothing
                                                                                 : Returns::Other;

    static constexpr const std::type_info* types[] = {&typeid(std::decay_t<Arguments>)...};

    static bool call(void* object, const void* const* values)
    {
        return called(*static_cast<C*>(object), values, std::index_sequence_for<Arguments...>());
    }

private:
    template <std::size_t... I>
    static bool called(C& object, const void* const* values, std::index_sequence<I...>)
    {
        if constexpr (std::is_void_v<Result>) {
            (object.*Set)(*static_cast<const std::decay_t<Arguments>*>(values[I])...);
            return true;
        } else if constexpr (std::is_pointer_v<Result>) {
            return (object.*Set)(*static_cast<const std::decay_t<Arguments>*>(values[I])...) == &object;
        } else {
            return &(object.*Set)(*static_cast<const std::decay_t<Arguments>*>(values[I])...) == &object;
        }
    }
};

/// Where the field is in an object.
using Place = const void* (*)(const void* object);

template <class C, auto Member>
const void* memberOf(const void* object)
{
    return &(static_cast<const C*>(object)->*Member);
}

/// For what only an operation tells: a copy that holds until the next call.
template <class C, auto Get>
const void* toldBy(const void* object)
{
    static auto told = (static_cast<const C*>(object)->*Get)();
    told = (static_cast<const C*>(object)->*Get)();
    return &told;
}

/// How objects of a class come into being; memory is the caller's.
struct Life
{
    std::size_t size;
    std::size_t alignment;
    void (*make)(void* memory);
    void (*copy)(void* memory, const void* from);
    void (*move)(void* memory, void* from);
    void (*end)(void* object);
    /// The result of the assignment.
    const void* (*assign)(void* object, const void* from);
    const void* (*moveAssign)(void* object, void* from);
};

template <class C>
constexpr Life lifeFrom(void (*make)(void* memory))
{
    return {sizeof(C),
            alignof(C),
            make,
            [](void* memory, const void* from) { ::new (memory) C(*static_cast<const C*>(from)); },
            [](void* memory, void* from) { ::new (memory) C(std::move(*static_cast<C*>(from))); },
            [](void* object) { static_cast<C*>(object)->~C(); },
            [](void* object, const void* from) -> const void* {
                return &(*static_cast<C*>(object) = *static_cast<const C*>(from));
            },
            [](void* object, void* from) -> const void* {
                return &(*static_cast<C*>(object) = std::move(*static_cast<C*>(from)));
            }};
}

template <class C>
constexpr Life lifeOf = lifeFrom<C>([](void* memory) { ::new (memory) C; });

/// Of a class whose objects are made with arguments.
template <class C>
const Life& lifeBy(void (*make)(void* memory))
{
    static const Life life = lifeFrom<C>(make);
    return life;
}

/// The way from an object to one of its bases.
using Up = void* (*)(void* object);

struct FieldRow
{
    std::string name;
    SharedValues values;
    Place place;
    /// Null for a field that is written as a member.
    Call write;
    std::vector<Up> path;

    void* part(void* object) const;
    const void* in(void* object) const { return place(part(object)); }
    bool holds(void* object, std::size_t index) const { return values->areSame(in(object), index); }
    void store(void* object, std::size_t index) const;
};

struct SetterRow
{
    Call call;
    /// What the setter does return, and what it is to return.
    Returns returns;
    Returns expected;
    /// The fields that it sets, by their place in the table: one for each argument.
    std::vector<std::size_t> fields;
};

class ClassTable
{
public:
    ClassTable(const char* name, const char* nameInArchive, const Life& life, Returns returns);
    ClassTable(const ClassTable& other);
    ~ClassTable();

    std::string name;
    /// Null for a class that is not stored.
    const char* nameInArchive;
    const Life* life;
    Returns returns;
    std::vector<FieldRow> fields;
    std::vector<SetterRow> setters;
    /// The archive names of the stored bases.
    std::vector<std::string> storedBases;

protected:
    void addField(const char* field, SharedValues values, Place place, Call write);
    /// A setter of these fields. Throws `std::logic_error` for a field that is not there or of another type.
    void addSetter(Call call, Returns returned, const std::type_info* const* types,
                   std::initializer_list<const char*> names);
    void addBase(const ClassTable& base, Up up);
};

template <class C>
constexpr const char* nameInArchive()
{
    if constexpr (Serialize::Details::CarriesMacro<C>::value)
        return C::NameInArchive();
    else
        return nullptr;
}

template <class F>
struct MemberType;
template <class F, class C>
struct MemberType<F C::*>
{
    using Type = F;
};
template <class F, class C>
struct MemberType<F (C::*)() const>
{
    using Type = F;
};

/// The type of a member, or of what an operation tells.
template <auto Member>
using TypeOf = typename MemberType<decltype(Member)>::Type;

/// Puts a table together, a row for each field, in the order of the class: its name and default, by its
/// member and its setter.
template <class C>
class ClassOf : public ClassTable
{
public:
    explicit ClassOf(const char* className, Returns settersReturn = Returns::Pointer,
                     const Life& classLife = lifeOf<C>)
        : ClassTable(className, FieldTests::nameInArchive<C>(), classLife, settersReturn)
    {}

    /// Of a class without setters that has no default object: its defaults are those of the object that is
    /// made here.
    ClassOf(const char* className, void (*make)(void* memory))
        : ClassOf(className, Returns::Nothing, lifeBy<C>(make))
    {}

    /// All rows of a base.
    template <class B>
    ClassOf& base(const ClassOf<B>& rows)
    {
        addBase(rows, [](void* object) -> void* { return static_cast<B*>(static_cast<C*>(object)); });
        return *this;
    }

    template <auto Member>
    ClassOf& field(const char* fieldName, const TypeOf<Member>& defaultValue)
    {
        addField(fieldName, triedValues(defaultValue), &memberOf<C, Member>, nullptr);
        return *this;
    }

    template <auto Member, auto Set>
    ClassOf& field(const char* fieldName, const TypeOf<Member>& defaultValue)
    {
        return field<Member>(fieldName, defaultValue).template by<Set>(fieldName);
    }

    /// A field that is told and set by operations alone.
    template <auto Get, auto Set>
    ClassOf& property(const char* fieldName, const TypeOf<Get>& defaultValue)
    {
        addField(fieldName, triedValues(defaultValue), &toldBy<C, Get>, &SetterOf<C, Set>::call);
        return by<Set>(fieldName);
    }

    /// A setter of these fields at once, in the order of its arguments.
    template <auto Set, class... Names>
    ClassOf& by(Names... names)
    {
        using Setter = SetterOf<C, Set>;
        static_assert(std::size(Setter::types) == sizeof...(Names));
        addSetter(&Setter::call, Setter::returns, Setter::types, {names...});
        return *this;
    }
};

std::vector<ClassTable> valueClasses();
std::vector<ClassTable> timelineClasses();
std::vector<ClassTable> mediaClasses();
std::vector<ClassTable> effectClasses();
std::vector<ClassTable> analysisClasses();
std::vector<ClassTable> libraryClasses();
std::vector<ClassTable> serviceClasses();
/// Messages, what they are made of, and those who ask with them.
std::vector<ClassTable> messageClasses();

} // namespace FieldTests
