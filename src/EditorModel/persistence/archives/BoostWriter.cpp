// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/Roots.h>
#include <EditorModel/persistence/Unregistered.h>
#include <EditorModel/persistence/Utf8.h>
#include <EditorModel/persistence/archives/BoostForms.h>
#include <EditorModel/persistence/archives/Pictures.h>

#include <boost/serialization/collection_size_type.hpp>
#include <boost/serialization/item_version_type.hpp>
#include <boost/serialization/string.hpp>

namespace Serialize::Details {
namespace {

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

template <class Archive>
void writeRoots(std::ostream& stream, Roots& roots)
{
    Archive archive(stream);
    ArchiveWriter<Archive> fields(archive);
    visitRoots(fields, roots);
}

} // namespace

void writeBinaryArchive(std::ostream& stream, Roots& roots)
{
    writeRoots<ba::binary_oarchive>(stream, roots);
}

void writeXmlArchive(std::ostream& stream, Roots& roots)
{
    writeRoots<ba::xml_oarchive>(stream, roots);
}

void archiveFields(ba::binary_oarchive& archive, const Type& type, void* object)
{
    ArchiveWriter<ba::binary_oarchive> fields(archive);
    visit(fields, type, object);
}

void archiveFields(ba::xml_oarchive& archive, const Type& type, void* object)
{
    ArchiveWriter<ba::xml_oarchive> fields(archive);
    visit(fields, type, object);
}

} // namespace Serialize::Details
