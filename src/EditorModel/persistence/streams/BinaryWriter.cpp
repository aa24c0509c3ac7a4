// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/streams/BinaryTags.h>
#include <EditorModel/persistence/streams/Forms.h>

#include <QIODevice>
#include <QtEndian>

#include <cstring>
#include <unordered_map>

namespace Serialize::Details {
namespace {

/// Numbers of fixed width are little-endian, counts and lengths of varying width: seven bits a byte, the
/// lowest first, the top bit set in all but the last. A name stands once, and as its number from then on.
class BinaryWriter final : public FormWriter
{
public:
    explicit BinaryWriter(QIODevice& device) : m_device(device) {}

    void null(const std::string& key) override { begin(key, NullTag); }

    void reference(const std::string& key, quint64 id) override
    {
        begin(key, ReferenceTag);
        putCount(id);
    }

    /// Objects are numbered by their order.
    void beginObject(const std::string& key, const std::string& className, quint64) override
    {
        begin(key, ObjectTag);
        putName(className);
    }

    void beginPart(const std::string& key, const std::string& className) override
    {
        begin(key, PartTag);
        putName(className);
    }

    void endObject() override { putTag(EndObjectTag); }

    void picture(const std::string& key, quint64, const QByteArray& png) override
    {
        begin(key, PictureTag);
        putBytes(png.constData(), static_cast<std::size_t>(png.size()));
    }

    void beginSequence(const std::string& key, int count) override
    {
        begin(key, SequenceTag);
        putCount(static_cast<quint64>(count));
    }

    void endSequence() override { putTag(EndSequenceTag); }
    void beginItem() override { putTag(ItemTag); }
    void endItem() override { putTag(EndItemTag); }

    void write(const std::string& key, bool value) override { begin(key, value ? TrueTag : FalseTag); }

    void write(const std::string& key, qint32 value) override
    {
        begin(key, Int32Tag);
        putFixed(value);
    }

    void write(const std::string& key, quint32 value) override
    {
        begin(key, UInt32Tag);
        putFixed(value);
    }

    void write(const std::string& key, qint64 value) override
    {
        begin(key, Int64Tag);
        putFixed(value);
    }

    void write(const std::string& key, double value) override
    {
        begin(key, RealTag);
        putReal(value);
    }

    void write(const std::string& key, MTime value) override
    {
        begin(key, TimeTag);
        putFixed(value.ms());
    }

    void write(const std::string& key, const std::string& value) override
    {
        begin(key, TextTag);
        putBytes(value.data(), value.size());
    }

    void write(const std::string& key, const QPointF& value) override
    {
        begin(key, PointTag);
        putReal(value.x());
        putReal(value.y());
    }

    void finish() override
    {
        pass();
        flush(m_device);
    }

private:
    void begin(const std::string& key, Tag tag)
    {
        putName(key);
        putTag(tag);
    }

    void putTag(Tag tag) { put(reinterpret_cast<const char*>(&tag), 1); }

    void putName(const std::string& name)
    {
        const auto place = m_names.emplace(name, firstName + m_names.size());
        if (!place.second) {
            putCount(place.first->second);
            return;
        }
        putCount(newName);
        putBytes(name.data(), name.size());
    }

    void putCount(quint64 count)
    {
        char bytes[10];
        std::size_t size = 0;
        for (; count > 0x7F; count >>= 7)
            bytes[size++] = static_cast<char>(0x80 | (count & 0x7F));
        bytes[size++] = static_cast<char>(count);
        put(bytes, size);
    }

    void putBytes(const char* bytes, std::size_t size)
    {
        putCount(size);
        put(bytes, size);
    }

    void putReal(double value)
    {
        quint64 bits;
        static_assert(sizeof bits == sizeof value);
        std::memcpy(&bits, &value, sizeof bits);
        putFixed(bits);
    }

    template <class T>
    void putFixed(T value)
    {
        char bytes[sizeof(T)];
        qToLittleEndian(value, bytes);
        put(bytes, sizeof bytes);
    }

    void put(const char* bytes, std::size_t size)
    {
        constexpr std::size_t enough = 1 << 16;
        m_held.append(bytes, size);
        if (m_held.size() >= enough)
            pass();
    }

    void pass()
    {
        writeAll(m_device, m_held.data(), static_cast<qint64>(m_held.size()));
        m_held.clear();
    }

    QIODevice& m_device;
    std::string m_held;
    std::unordered_map<std::string, quint64> m_names;
};

} // namespace

std::unique_ptr<FormWriter> makeBinaryWriter(QIODevice& device)
{
    return std::make_unique<BinaryWriter>(device);
}

} // namespace Serialize::Details
