// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/persistence/Serializable.h>

#include <type_traits>

namespace boost {
namespace archive {
class binary_oarchive;
class binary_iarchive;
class xml_oarchive;
class xml_iarchive;
class object_tracker;
} // namespace archive
namespace serialization {
struct version_type;
template <class T>
struct guid_defined;
template <class T>
inline const char* guid();
} // namespace serialization
} // namespace boost

namespace Serialize {

namespace Json {
class oarchive;
class iarchive;
} // namespace Json

struct Type;

namespace Details {

template <class T, class = void>
struct CarriesMacro : std::false_type
{};
/// A derived class inherits the marker of its base, and is persistent only if it carries one of its own.
template <class T>
struct CarriesMacro<T, std::void_t<typename T::PersistentClass>>
    : std::is_same<typename T::PersistentClass, T>
{};

EDITORMODEL_EXPORT void archiveFields(boost::archive::binary_oarchive& archive, const Type& type,
                                      void* object);
EDITORMODEL_EXPORT void archiveFields(boost::archive::binary_iarchive& archive, const Type& type,
                                      void* object);
EDITORMODEL_EXPORT void archiveFields(boost::archive::xml_oarchive& archive, const Type& type, void* object);
EDITORMODEL_EXPORT void archiveFields(boost::archive::xml_iarchive& archive, const Type& type, void* object);
EDITORMODEL_EXPORT void archiveFields(Json::oarchive& archive, const Type& type, void* object);
EDITORMODEL_EXPORT void archiveFields(Json::iarchive& archive, const Type& type, void* object);
EDITORMODEL_EXPORT void archiveFields(boost::archive::object_tracker& archive, const Type& type,
                                      void* object);

} // namespace Details

/// True for a class that carries `EDITORMODEL_PERSISTENT` itself.
template <class T>
constexpr bool isPersistent = Details::CarriesMacro<std::remove_cv_t<T>>::value;

/// What Boost's archives find, by argument-dependent look-up, as the body of every persistent class: a client
/// that includes an archive's header can write and read persistent objects with no further include.
template <class Archive, class T, class = std::enable_if_t<isPersistent<T>>>
void serialize(Archive& archive, T& object, const boost::serialization::version_type&)
{
    // An object held by value keeps its identity only if the archive knows how to point at its class.
    archive.template register_type<T>();
    Details::archiveFields(archive, T::persistentType(), &object);
}

} // namespace Serialize

/// In the class: what every persistent class has, for a class that is written and read only where its type is
/// known, and never made by name.
#define EDITORMODEL_PERSISTENT_UNREGISTERED(Class)                                                           \
public:                                                                                                      \
    using PersistentClass = Class;                                                                           \
    static const char* NameInArchive();                                                                      \
    const std::string GetNameInArchive() const override;                                                     \
    void Serialize(::Serialize::ISerializer& serializer) const override;                                     \
    void Deserialize(::Serialize::IDeserializer& deserializer) override;                                     \
    static const ::Serialize::Type& persistentType();

/// In the class: the same, and a registered name and creator. The class is default-constructible. Goes with
/// `EDITORMODEL_ARCHIVE_NAME` behind the class and `EDITORMODEL_PERSISTENT_CLASS` in its source.
#define EDITORMODEL_PERSISTENT(Class)                                                                        \
    EDITORMODEL_PERSISTENT_UNREGISTERED(Class)                                                               \
    class Creator : public ::Serialize::BaseCreator                                                          \
    {                                                                                                        \
    public:                                                                                                  \
        ::Serialize::ISerializable* Create() const override;                                                 \
    };                                                                                                       \
                                                                                                             \
private:                                                                                                     \
    static const ::Serialize::Registrator s_registrator;                                                     \
                                                                                                             \
public:

/// At global scope in the header of the class: its archive name, the key of both routes. Every client must
/// see it, since Boost reads it where a client's own templates are instantiated.
#define EDITORMODEL_ARCHIVE_NAME(Class, Name)                                                                \
    namespace boost {                                                                                        \
    namespace serialization {                                                                                \
    template <>                                                                                              \
    struct guid_defined<Class> : std::true_type                                                              \
    {};                                                                                                      \
    template <>                                                                                              \
    constexpr const char* guid<Class>()                                                                      \
    {                                                                                                        \
        return Name;                                                                                         \
    }                                                                                                        \
    }                                                                                                        \
    }

/// In the header, behind a class template that carries `EDITORMODEL_PERSISTENT` and the archive name of one
/// of its instantiations: declares what `EDITORMODEL_PERSISTENT_INSTANTIATION_CLASS` defines in a source, its
/// registrator included. An `extern template class` follows. `Class` has no comma in it: give an alias.
#define EDITORMODEL_PERSISTENT_INSTANTIATION(Class)                                                          \
    template <>                                                                                              \
    const char* Class::NameInArchive();                                                                      \
    template <>                                                                                              \
    const std::string Class::GetNameInArchive() const;                                                       \
    template <>                                                                                              \
    void Class::Serialize(::Serialize::ISerializer& serializer) const;                                       \
    template <>                                                                                              \
    void Class::Deserialize(::Serialize::IDeserializer& deserializer);                                       \
    template <>                                                                                              \
    const ::Serialize::Type& Class::persistentType();                                                        \
    template <>                                                                                              \
    ::Serialize::ISerializable* Class::Creator::Create() const;                                              \
    template <>                                                                                              \
    const ::Serialize::Registrator Class::s_registrator;
