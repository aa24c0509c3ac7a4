// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/Roots.h>
#include <EditorModel/persistence/Unregistered.h>
#include <EditorModel/persistence/Utf8.h>
#include <EditorModel/persistence/archives/BoostForms.h>
#include <EditorModel/persistence/archives/Pictures.h>
#include <EditorModel/types/Image.h>

#include <boost/serialization/collection_size_type.hpp>
#include <boost/serialization/item_version_type.hpp>
#include <boost/serialization/string.hpp>

#include <charconv>
#include <limits>
#include <map>
#include <stdexcept>
#include <utility>

namespace Serialize::Details {
namespace {

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
    explicit ArchiveReader(Archive& archive)
        : ArchiveFields<Archive>(true, archive), m_outer(std::exchange(running, this))
    {}
    ArchiveReader(const ArchiveReader&) = delete;
    ArchiveReader& operator=(const ArchiveReader&) = delete;
    ~ArchiveReader() override { running = m_outer; }

    /// Reads the fields of an object that the archive holds, with the reader that is at work on the archive
    /// if there is one.
    static void read(Archive& archive, const Type& type, void* object)
    {
        if (running && &running->m_archive == &archive) {
            visit(*running, type, object);
        } else {
            ArchiveReader reader(archive);
            visit(reader, type, object);
        }
    }

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
        transfer(key.archive, m_utf8);
        text = textOfUtf8(m_utf8);
        if (m_utf8.size() > keptBuffer)
            std::string().swap(m_utf8);
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
                declared = forms.pointer.get();
                // To be done before each pointer, and without effect if it has been done.
                if (std::exchange(m_registered, declared) != declared)
                    archive.register_basic_serializer(forms.object);
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

    /// The reader at work on this thread, the innermost if several are.
    static thread_local ArchiveReader* running;

    ArchiveReader* const m_outer;
    std::string m_utf8;
    const ba::detail::basic_pointer_iserializer* m_registered = nullptr;
};

template <class Archive>
thread_local ArchiveReader<Archive>* ArchiveReader<Archive>::running = nullptr;

template <class Archive>
void readRoots(std::istream& stream, Roots& roots)
{
    Archive archive(stream);
    ArchiveReader<Archive> fields(archive);
    visitRoots(fields, roots);
}

} // namespace

void readBinaryArchive(std::istream& stream, Roots& roots)
{
    readRoots<ba::binary_iarchive>(stream, roots);
}

void readXmlArchive(std::istream& stream, Roots& roots)
{
    readRoots<ba::xml_iarchive>(stream, roots);
}

void archiveFields(ba::binary_iarchive& archive, const Type& type, void* object)
{
    ArchiveReader<ba::binary_iarchive>::read(archive, type, object);
}

void archiveFields(ba::xml_iarchive& archive, const Type& type, void* object)
{
    ArchiveReader<ba::xml_iarchive>::read(archive, type, object);
}

} // namespace Serialize::Details
