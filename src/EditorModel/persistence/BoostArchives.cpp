// SPDX-License-Identifier: Apache-2.0
// The template route over Boost's binary and XML archives. What Boost's templates would generate for every
// class and archive is made here at run time, from each class's Type, through the interfaces that Boost keeps
// for authors of archives: the documents are those that stock templates would write.
#include <EditorModel/persistence/BoostArchives.h>
#include <EditorModel/persistence/ConstructionLog.h>
#include <EditorModel/persistence/Fields.h>
#include <EditorModel/persistence/Pictures.h>
#include <EditorModel/persistence/Roots.h>
#include <EditorModel/persistence/Unregistered.h>
#include <EditorModel/persistence/Utf8.h>
#include <EditorModel/types/Image.h>

#include <boost/archive/binary_iarchive.hpp>
#include <boost/archive/binary_oarchive.hpp>
#include <boost/archive/xml_iarchive.hpp>
#include <boost/archive/xml_oarchive.hpp>
#include <boost/serialization/collection_size_type.hpp>
#include <boost/serialization/extended_type_info_typeid.hpp>
#include <boost/serialization/item_version_type.hpp>
#include <boost/serialization/nvp.hpp>
#include <boost/serialization/string.hpp>
#include <boost/serialization/void_cast.hpp>

#include <charconv>
#include <limits>
#include <map>
#include <mutex>
#include <stdexcept>
#include <typeindex>

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
namespace {

namespace bs = boost::serialization;
namespace ba = boost::archive;

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

} // namespace

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

namespace {

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

template <class Archive>
constexpr bool isXml = std::is_same_v<Archive, ba::xml_oarchive> || std::is_same_v<Archive, ba::xml_iarchive>;

/// The tag of a base is the base's name, and a tag takes no ':'.
std::string tagOf(const char* name)
{
    std::string tag = name;
    for (char& c : tag) {
        if (c == ':')
            c = '.';
    }
    return tag;
}

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

/// The part of XML's text that Boost writes as it stands but does not read back.
bool isControl(char c)
{
    return static_cast<unsigned char>(c) < 0x20 && c != '\t' && c != '\n' && c != '\r';
}

void saveText(ba::binary_oarchive& archive, const std::string& text)
{
    ba::save_access::save_primitive(archive, text);
}

/// Control characters go as character references, which the archive's reader takes.
void saveText(ba::xml_oarchive& archive, const std::string& text)
{
    requireUtf8(text);
    std::string piece;
    for (const char c : text) {
        if (!isControl(c)) {
            piece += c;
            continue;
        }
        ba::save_access::save_primitive(archive, piece);
        archive.put(("&#" + std::to_string(static_cast<int>(c)) + ";").c_str());
        piece.clear();
    }
    ba::save_access::save_primitive(archive, piece);
}

template <class Archive>
class ArchiveWriter final : public ArchiveFields<Archive>
{
public:
    explicit ArchiveWriter(Archive& archive) : ArchiveFields<Archive>(false, archive) {}

private:
    using ArchiveFields<Archive>::m_archive;
    using ArchiveFields<Archive>::transfer;
    using ArchiveFields<Archive>::within;

    void onScalar(const Key& key, const Scalar& value, const void*) override
    {
        std::visit([&](auto* source) { save(key, *source); }, value);
    }

    template <class T>
    void save(const Key& key, T& value)
    {
        transfer(key.archive, value);
    }

    void save(const Key& key, std::string& text)
    {
        within(key.archive, [&](Archive& archive) { saveText(archive, text); });
    }

    void save(const Key& key, QString& text)
    {
        std::string utf8 = text.toStdString();
        save(key, utf8);
    }

    /// The low half of the count of milliseconds.
    void save(const Key& key, MTime& time)
    {
        int low = static_cast<int>(static_cast<quint32>(time.ms()));
        transfer(key.archive, low);
    }

    void save(const Key& key, QPointF& point)
    {
        within(key.archive, [&](Archive&) {
            transfer("x", point.rx());
            transfer("y", point.ry());
        });
    }

    void save(const Key& key, std::shared_ptr<const Types::Image>& picture)
    {
        this->object(key, sharedPictureType(), &picture);
    }

    void onPointer(const Key& key, const PointerField& field) override
    {
        within(key.archive, [&](Archive& archive) {
            if (field.declared)
                archive.register_basic_serializer(formsOf(*field.declared).template of<Archive>().object);
            const Pointee pointee = field.access.get(field);
            if (!pointee.object) {
                archive.save_null_pointer();
                ba::save_access::end_preamble(archive);
                return;
            }
            if (!pointee.type || !(pointee.type->exported || pointee.type == field.declared))
                throwUnregistered();
            archive.save_pointer(pointee.object, formsOf(*pointee.type).template of<Archive>().pointer.get());
        });
    }

    int onBeginSequence(SequenceKind kind, int count) override
    {
        if (kind == Collection) {
            bs::collection_size_type size(static_cast<std::size_t>(count));
            bs::item_version_type version(0);
            transfer("count", size);
            transfer("item_version", version);
        } else if (kind == QtCollection) {
            transfer("count", count);
        }
        return count;
    }

    void onBinary(QByteArray& bytes, int size) override
    {
        m_archive.save_binary(bytes.constData(), static_cast<std::size_t>(size));
    }

    std::shared_ptr<const Types::Image> onShare(const Types::Image*) override { return nullptr; }
};

/// The pictures that an archive has read, by the address under which its pointers know them.
using PictureOwners = std::map<const Types::Image*, std::shared_ptr<const Types::Image>>;

/// The address of this names the owners among an archive's helpers.
constexpr char pictureOwnersId = 0;

/// The longest text whose buffer is kept for the next one, in bytes.
constexpr std::size_t keptBuffer = 4096;

template <class Archive>
class ArchiveReader final : public ArchiveFields<Archive>
{
public:
    explicit ArchiveReader(Archive& archive) : ArchiveFields<Archive>(true, archive) {}

private:
    using ArchiveFields<Archive>::m_archive;
    using ArchiveFields<Archive>::transfer;
    using ArchiveFields<Archive>::within;

    void onScalar(const Key& key, const Scalar& value, const void*) override
    {
        std::visit([&](auto* target) { load(key, *target); }, value);
    }

    template <class T>
    void load(const Key& key, T& value)
    {
        transfer(key.archive, value);
    }

    /// XML's own reader takes neither infinities nor not-a-numbers, which its writer writes.
    void load(const Key& key, double& value)
    {
        if constexpr (isXml<Archive>) {
            std::string text;
            transfer(key.archive, text);
            const auto result = std::from_chars(text.data(), text.data() + text.size(), value);
            if (result.ec != std::errc() || result.ptr != text.data() + text.size())
                throw std::runtime_error("\"" + text + "\" is no number");
        } else {
            transfer(key.archive, value);
        }
    }

    /// Texts pass through one buffer: most are short, and an allocation for each would cost more than the
    /// text.
    void load(const Key& key, QString& text)
    {
        thread_local std::string utf8;
        transfer(key.archive, utf8);
        text = textOfUtf8(utf8);
        if (utf8.size() > keptBuffer)
            std::string().swap(utf8);
    }

    void load(const Key& key, MTime& time)
    {
        int low = 0;
        transfer(key.archive, low);
        time = MTime(low);
    }

    void load(const Key& key, QPointF& point)
    {
        within(key.archive, [&](Archive&) {
            load("x", point.rx());
            load("y", point.ry());
        });
    }

    void load(const Key& key, std::shared_ptr<const Types::Image>& picture)
    {
        this->object(key, sharedPictureType(), &picture);
    }

    void onPointer(const Key& key, const PointerField& field) override
    {
        within(key.archive, [&](Archive& archive) {
            const ba::detail::basic_pointer_iserializer* declared = nullptr;
            if (field.declared) {
                const auto& forms = formsOf(*field.declared).template of<Archive>();
                archive.register_basic_serializer(forms.object);
                declared = forms.pointer.get();
            }
            void* object = nullptr;
            const auto* const found = archive.load_pointer(object, declared, &find);
            if (!object) {
                field.access.set(field, {nullptr, nullptr});
                return;
            }
            // Most pointers lead to an object of the very class that their field is declared with.
            const Type* const type =
                found == declared ? field.declared : findType(typeidOf(found->get_eti()), nullptr);
            if (!type)
                throwUnregistered();
            field.access.set(field, {object, type});
        });
    }

    static const std::type_info& typeidOf(const bs::extended_type_info& info)
    {
        return static_cast<const bs::typeid_system::extended_type_info_typeid_0&>(info).get_typeid();
    }

    /// Boost's own table may hold a form that a client's templates made: what that makes goes into no log.
    static const ba::detail::basic_pointer_iserializer* find(const bs::extended_type_info& info)
    {
        const Type* const type = findType(typeidOf(info), nullptr);
        if (!type)
            throwUnregistered();
        return formsOf(*type).template of<Archive>().pointer.get();
    }

    int onBeginSequence(SequenceKind kind, int count) override
    {
        if (kind == QtCollection) {
            transfer("count", count);
        } else if (kind == Collection) {
            bs::collection_size_type size(0);
            transfer("count", size);
            if (m_archive.get_library_version() > bs::library_version_type(3)) {
                bs::item_version_type version(0);
                transfer("item_version", version);
            }
            if (size > static_cast<std::size_t>(std::numeric_limits<int>::max()))
                throw std::runtime_error("a count of " + std::to_string(size) + " items");
            count = static_cast<int>(size);
        }
        if (count < 0)
            throw std::runtime_error("a count of " + std::to_string(count) + " items");
        return count;
    }

    void onBinary(QByteArray& bytes, int size) override
    {
        bytes.resize(size);
        m_archive.load_binary(bytes.data(), static_cast<std::size_t>(size));
    }

    std::shared_ptr<const Types::Image> onShare(const Types::Image* image) override
    {
        auto& owners = m_archive.template get_helper<PictureOwners>(const_cast<char*>(&pictureOwnersId));
        auto& owner = owners[image];
        if (!owner) {
            ConstructionLog::release(const_cast<Types::Image*>(image));
            owner.reset(image);
        }
        return owner;
    }
};

template <class Archive>
void writeRoots(std::ostream& stream, Roots& roots)
{
    Archive archive(stream);
    ArchiveWriter<Archive> fields(archive);
    visitRoots(fields, roots);
}

template <class Archive>
void readRoots(std::istream& stream, Roots& roots)
{
    Archive archive(stream);
    ArchiveReader<Archive> fields(archive);
    visitRoots(fields, roots);
}

} // namespace

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

void writeBinaryArchive(std::ostream& stream, Roots& roots)
{
    writeRoots<ba::binary_oarchive>(stream, roots);
}

void writeXmlArchive(std::ostream& stream, Roots& roots)
{
    writeRoots<ba::xml_oarchive>(stream, roots);
}

void readBinaryArchive(std::istream& stream, Roots& roots)
{
    readRoots<ba::binary_iarchive>(stream, roots);
}

void readXmlArchive(std::istream& stream, Roots& roots)
{
    readRoots<ba::xml_iarchive>(stream, roots);
}

void archiveFields(ba::binary_oarchive& archive, const Type& type, void* object)
{
    ArchiveWriter<ba::binary_oarchive> fields(archive);
    visit(fields, type, object);
}

void archiveFields(ba::binary_iarchive& archive, const Type& type, void* object)
{
    ArchiveReader<ba::binary_iarchive> fields(archive);
    visit(fields, type, object);
}

void archiveFields(ba::xml_oarchive& archive, const Type& type, void* object)
{
    ArchiveWriter<ba::xml_oarchive> fields(archive);
    visit(fields, type, object);
}

void archiveFields(ba::xml_iarchive& archive, const Type& type, void* object)
{
    ArchiveReader<ba::xml_iarchive> fields(archive);
    visit(fields, type, object);
}

} // namespace Serialize::Details
