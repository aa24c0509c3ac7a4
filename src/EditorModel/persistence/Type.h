// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/persistence/Persistent.h>

#include <atomic>
#include <typeinfo>

namespace Serialize {

class Fields;
struct Type;

namespace Details {
class ArchiveForms;

/// The field list of a class; `EDITORMODEL_PERSISTENT_CLASS` makes it call the class's `fields`.
template <class T>
void visitFields(Fields& fields, T& object);
} // namespace Details

/// What persistence knows of one class or container: one constant of static storage each,
/// constant-initialised, so that it is whole before any registration uses it. Addresses are of the complete
/// object.
struct Type
{
    using Visit = void (*)(Fields& fields, void* object);

    const std::type_info& info;
    /// Runs the field list; the address is that of the class itself, which may be a base of a larger object.
    Visit visit;
    /// The archive name of a class; null for a container.
    const char* name = nullptr;
    /// The name is an export key: it may stand for an object of the class behind a pointer.
    bool exported = false;
    /// Archives write the class's number and version before its first object.
    bool classInfo = true;
    unsigned int version = 0;
    /// A default-constructed object on the heap; null for what is never held by a pointer.
    void* (*create)() = nullptr;
    void (*destroy)(void* object) = nullptr;
    /// The persistent root of the object at the address; null for what has none.
    ISerializable* (*serializable)(void* object) = nullptr;

    /// Cache of what the archives of the template route need; see ArchiveForms.
    mutable std::atomic<const Details::ArchiveForms*> forms{nullptr};
};

/// The type that was entered for a class, or null. `guess` is tried first and may be null.
EDITORMODEL_EXPORT const Type* findType(const std::type_info& info, const Type* guess);

/// The type with this export key, or null.
EDITORMODEL_EXPORT const Type* findType(const std::string& name);

namespace Details {

/// Enters a class for look-up by its `typeid` and its export key, for the life of the process: a module with
/// such a class stays loaded. Constructed statically in the class's source.
class EDITORMODEL_EXPORT TypeEntry
{
public:
    explicit TypeEntry(const Type& type);
};

/// Tells Boost's archives that `derived` can stand behind a pointer to `base`. The casts take and give the
/// addresses of these two classes; `down` gives null for an object of another class.
class EDITORMODEL_EXPORT CastEntry
{
public:
    using Cast = const void* (*)(const void*);
    CastEntry(const Type& derived, const std::type_info& base, Cast up, Cast down);
};

template <class Derived, class Base>
const void* upcast(const void* object)
{
    return static_cast<const Base*>(static_cast<const Derived*>(object));
}

template <class Derived, class Base>
const void* downcast(const void* object)
{
    return dynamic_cast<const Derived*>(static_cast<const Base*>(object));
}

template <class Derived, class Base>
void enterCast()
{
    CastEntry{Derived::persistentType(), typeid(Base), &upcast<Derived, Base>, &downcast<Derived, Base>};
}

/// Throws `std::logic_error` where another class has the name; two such classes cannot be in one process.
EDITORMODEL_EXPORT void requireFreeName(const char* name);

/// Enters a registered class with its persistent bases, the root among them; gives its name, so that a
/// registrator can do this first.
template <class T, class... Bases>
const char* enter()
{
    requireFreeName(T::persistentType().name);
    TypeEntry{T::persistentType()};
    (enterCast<T, Bases>(), ...);
    return T::persistentType().name;
}

template <class T>
void visitType(Fields& fields, void* object)
{
    visitFields(fields, *static_cast<T*>(object));
}

template <class T>
void* createType()
{
    return new T;
}

template <class T>
void destroyType(void* object)
{
    delete static_cast<T*>(object);
}

template <class T>
ISerializable* serializableOf(void* object)
{
    return static_cast<T*>(object);
}

/// The bodies of `Serialize` and `Deserialize`.
EDITORMODEL_EXPORT void writeFields(ISerializer& serializer, const Type& type, const void* object);
EDITORMODEL_EXPORT void readFields(IDeserializer& deserializer, const Type& type, void* object);

} // namespace Details
} // namespace Serialize

/// In the source of a class that carries `EDITORMODEL_PERSISTENT_UNREGISTERED`, at global scope, behind its
/// `void fields(Serialize::Fields& f, Class& object)`.
#define EDITORMODEL_PERSISTENT_CLASS_UNREGISTERED(Class, Name) EDITORMODEL_DETAILS_TYPE_(, Class, Name, false)

/// In the source of a class that carries `EDITORMODEL_PERSISTENT`, at global scope, behind its
/// `void fields(Serialize::Fields& f, Class& object)`. Persistent bases follow the class.
#define EDITORMODEL_PERSISTENT_CLASS(...)                                                                    \
    EDITORMODEL_DETAILS_CLASS_(, __VA_ARGS__, ::Serialize::ISerializable)

/// The same for an instantiation that `EDITORMODEL_PERSISTENT_INSTANTIATION` declares in the header, before
/// the `template class` that makes it.
#define EDITORMODEL_PERSISTENT_INSTANTIATION_CLASS(...)                                                      \
    EDITORMODEL_DETAILS_CLASS_(template <>, __VA_ARGS__, ::Serialize::ISerializable)

#define EDITORMODEL_DETAILS_CLASS_(Template, Class, ...)                                                     \
    EDITORMODEL_DETAILS_TYPE_(Template, Class, ::boost::serialization::guid<Class>(), true)                  \
    Template ::Serialize::ISerializable* Class::Creator::Create() const                                      \
    {                                                                                                        \
        return new Class;                                                                                    \
    }                                                                                                        \
    Template const ::Serialize::Registrator Class::s_registrator(                                            \
        ::Serialize::Details::enter<Class, __VA_ARGS__>(), new Class::Creator);

#define EDITORMODEL_DETAILS_TYPE_(Template, Class, Name, Exported)                                           \
    template <>                                                                                              \
    void Serialize::Details::visitFields<Class>(::Serialize::Fields & f, Class & object)                     \
    {                                                                                                        \
        fields(f, object);                                                                                   \
    }                                                                                                        \
    Template const ::Serialize::Type& Class::persistentType()                                                \
    {                                                                                                        \
        static const ::Serialize::Type type{typeid(Class),                                                   \
                                            &::Serialize::Details::visitType<Class>,                         \
                                            Name,                                                            \
                                            Exported,                                                        \
                                            true,                                                            \
                                            0,                                                               \
                                            &::Serialize::Details::createType<Class>,                        \
                                            &::Serialize::Details::destroyType<Class>,                       \
                                            &::Serialize::Details::serializableOf<Class>};                   \
        return type;                                                                                         \
    }                                                                                                        \
    Template const char* Class::NameInArchive()                                                              \
    {                                                                                                        \
        return Name;                                                                                         \
    }                                                                                                        \
    Template const std::string Class::GetNameInArchive() const                                               \
    {                                                                                                        \
        return Name;                                                                                         \
    }                                                                                                        \
    Template void Class::Serialize(::Serialize::ISerializer& serializer) const                               \
    {                                                                                                        \
        ::Serialize::Details::writeFields(serializer, persistentType(), this);                               \
    }                                                                                                        \
    Template void Class::Deserialize(::Serialize::IDeserializer& deserializer)                               \
    {                                                                                                        \
        ::Serialize::Details::readFields(deserializer, persistentType(), this);                              \
    }
