// SPDX-License-Identifier: Apache-2.0
#pragma once

// The template route over Boost's binary and XML archives. What Boost's templates would generate for every
// class and archive is made here at run time, from each class's Type, through the interfaces that Boost keeps
// for authors of archives: the documents are those that stock templates would write.

#include <EditorModel/persistence/ConstructionLog.h>
#include <EditorModel/persistence/Fields.h>

#include <boost/archive/binary_iarchive.hpp>
#include <boost/archive/binary_oarchive.hpp>
#include <boost/archive/xml_iarchive.hpp>
#include <boost/archive/xml_oarchive.hpp>
#include <boost/serialization/extended_type_info_typeid.hpp>
#include <boost/serialization/nvp.hpp>

#include <memory>
#include <string>

namespace Serialize::Details {

/// One act on an archive that stands where Boost expects a value: a name-value pair around it brings the tags
/// of the XML form, and the act does the rest.
template <class Act>
struct Step
{
    Act& act;
};

template <class Archive, class Act>
void serialize(Archive& archive, Step<Act>& step, const unsigned int)
{
    step.act(archive);
}

} // namespace Serialize::Details

namespace boost::serialization {

template <class Act>
struct implementation_level<Serialize::Details::Step<Act>>
{
    using tag = mpl::integral_c_tag;
    using type = mpl::int_<object_serializable>;
    BOOST_STATIC_CONSTANT(int, value = type::value);
};

template <class Act>
struct tracking_level<Serialize::Details::Step<Act>>
{
    using tag = mpl::integral_c_tag;
    using type = mpl::int_<track_never>;
    BOOST_STATIC_CONSTANT(int, value = type::value);
};

} // namespace boost::serialization

namespace Serialize::Details {

namespace bs = boost::serialization;
namespace ba = boost::archive;

/// Boost's record of a class.
class TypeInfo final : public bs::typeid_system::extended_type_info_typeid_0
{
public:
    TypeInfo(const std::type_info& info, const char* key) : extended_type_info_typeid_0(key)
    {
        type_register(info);
        if (key)
            key_register();
    }

    void* construct(unsigned int, ...) const override { return nullptr; }
    void destroy(void const* const) const override {}
};

template <class Archive>
class OutputForm final : public ba::detail::basic_oserializer
{
public:
    OutputForm(const TypeInfo& info, const Type& type) : basic_oserializer(info), m_type(type) {}

    void save_object_data(ba::detail::basic_oarchive& archive, const void* object) const override
    {
        archiveFields(static_cast<Archive&>(archive), m_type, const_cast<void*>(object));
    }
    bool class_info() const override { return m_type.classInfo; }
    bool tracking(const unsigned int) const override { return serialized_as_pointer(); }
    ba::version_type version() const override { return ba::version_type(m_type.version); }
    bool is_polymorphic() const override { return m_type.create != nullptr; }

private:
    const Type& m_type;
};

template <class Archive>
class PointerOutputForm final : public ba::detail::basic_pointer_oserializer
{
public:
    PointerOutputForm(const TypeInfo& info, OutputForm<Archive>& form)
        : basic_pointer_oserializer(info), m_form(form)
    {
        form.set_bpos(this);
        ba::detail::archive_serializer_map<Archive>::insert(this);
    }

    const ba::detail::basic_oserializer& get_basic_serializer() const override { return m_form; }
    void save_object_ptr(ba::detail::basic_oarchive& archive, const void* object) const override
    {
        archive.save_object(object, m_form);
    }

private:
    const OutputForm<Archive>& m_form;
};

template <class Archive>
class InputForm final : public ba::detail::basic_iserializer
{
public:
    InputForm(const TypeInfo& info, const Type& type) : basic_iserializer(info), m_type(type) {}

    void load_object_data(ba::detail::basic_iarchive& archive, void* object,
                          const unsigned int) const override
    {
        archiveFields(static_cast<Archive&>(archive), m_type, object);
    }
    bool class_info() const override { return m_type.classInfo; }
    bool tracking(const unsigned int) const override { return serialized_as_pointer(); }
    ba::version_type version() const override { return ba::version_type(m_type.version); }
    bool is_polymorphic() const override { return m_type.create != nullptr; }
    void destroy(void* object) const override { m_type.destroy(object); }

    const Type& type() const { return m_type; }

private:
    const Type& m_type;
};

template <class Archive>
class PointerInputForm final : public ba::detail::basic_pointer_iserializer
{
public:
    PointerInputForm(const TypeInfo& info, InputForm<Archive>& form)
        : basic_pointer_iserializer(info), m_form(form)
    {
        form.set_bpis(this);
        ba::detail::archive_serializer_map<Archive>::insert(this);
    }

    void* heap_allocation() const override { return ConstructionLog::make(m_form.type()); }
    const ba::detail::basic_iserializer& get_basic_serializer() const override { return m_form; }
    void load_object_ptr(ba::detail::basic_iarchive& archive, void* object, const unsigned int) const override
    {
        archive.next_object_pointer(object);
        archive.load_object(object, m_form);
    }

private:
    const InputForm<Archive>& m_form;
};

template <class Archive>
struct Outputs
{
    OutputForm<Archive> object;
    std::unique_ptr<PointerOutputForm<Archive>> pointer;

    Outputs(const TypeInfo& info, const Type& type) : object(info, type)
    {
        if (type.create)
            pointer = std::make_unique<PointerOutputForm<Archive>>(info, object);
    }
};

template <class Archive>
struct Inputs
{
    InputForm<Archive> object;
    std::unique_ptr<PointerInputForm<Archive>> pointer;

    Inputs(const TypeInfo& info, const Type& type) : object(info, type)
    {
        if (type.create)
            pointer = std::make_unique<PointerInputForm<Archive>>(info, object);
    }
};

/// Never destroyed, as Boost's tables of them are not either before the last archive.
class ArchiveForms
{
public:
    explicit ArchiveForms(const Type& type)
        : info(type.info, type.exported ? type.name : nullptr),
          binaryOutput(info, type),
          binaryInput(info, type),
          xmlOutput(info, type),
          xmlInput(info, type)
    {}

    template <class Archive>
    const auto& of() const
    {
        if constexpr (std::is_same_v<Archive, ba::binary_oarchive>)
            return binaryOutput;
        else if constexpr (std::is_same_v<Archive, ba::binary_iarchive>)
            return binaryInput;
        else if constexpr (std::is_same_v<Archive, ba::xml_oarchive>)
            return xmlOutput;
        else
            return xmlInput;
    }

    TypeInfo info;
    Outputs<ba::binary_oarchive> binaryOutput;
    Inputs<ba::binary_iarchive> binaryInput;
    Outputs<ba::xml_oarchive> xmlOutput;
    Inputs<ba::xml_iarchive> xmlInput;
};

/// Made at the first call for a type.
const ArchiveForms& formsOf(const Type& type);

template <class Archive>
constexpr bool isXml = std::is_same_v<Archive, ba::xml_oarchive> || std::is_same_v<Archive, ba::xml_iarchive>;

/// The tag of a base is the base's name, and a tag takes no ':'.
std::string tagOf(const char* name);

/// What writing and reading share.
template <class Archive>
class ArchiveFields : public Fields
{
protected:
    ArchiveFields(bool loading, Archive& archive) : Fields(loading), m_archive(archive) {}

    /// Runs `act` between the tags of `key`.
    template <class Act>
    void within(const char* key, Act act)
    {
        Step<Act> step{act};
        transfer(key, step);
    }

    template <class T>
    void transfer(const char* key, T& value)
    {
        const bs::nvp<T> pair = bs::make_nvp(key, value);
        if constexpr (Archive::is_saving::value)
            m_archive << pair;
        else
            m_archive >> pair;
    }

    Archive& m_archive;

private:
    void onObject(const Key& key, const Type& type, void* object) override
    {
        within(key.archive, [&](Archive&) { object_(type, object); });
    }

    void onBase(const Key& key, const Type& type, void* object) override
    {
        if (isXml<Archive>)
            within(tagOf(key.archive).c_str(), [&](Archive&) { object_(type, object); });
        else
            within(key.archive, [&](Archive&) { object_(type, object); });
    }

    void onContainer(const Key& key, const Type& type, void* container) override
    {
        onObject(key, type, container);
    }
    void onEntry(const Type& pair, void* entry) override { onObject(itemKey, pair, entry); }

    void onBeginItem(int) override {}
    void onEndItem(int) override {}
    void onEndSequence(int) override {}

    void object_(const Type& type, void* object)
    {
        const auto& form = formsOf(type).template of<Archive>().object;
        if constexpr (Archive::is_saving::value)
            m_archive.save_object(object, form);
        else
            m_archive.load_object(object, form);
    }
};

} // namespace Serialize::Details
