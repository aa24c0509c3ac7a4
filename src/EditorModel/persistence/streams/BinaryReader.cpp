// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/streams/BinaryTags.h>
#include <EditorModel/persistence/streams/Forms.h>

#include <QtEndian>

#include <cstring>
#include <limits>
#include <stdexcept>
#include <vector>

namespace Serialize::Details {
namespace {

std::string describe(int tag)
{
    switch (tag) {
    case NullTag:
        return "null";
    case ReferenceTag:
        return "a reference";
    case ObjectTag:
        return "an object";
    case PartTag:
        return "the part of a base";
    case EndObjectTag:
        return "the end of an object";
    case PictureTag:
        return "a picture";
    case SequenceTag:
        return "a sequence";
    case EndSequenceTag:
        return "the end of a sequence";
    case ItemTag:
        return "an item";
    case EndItemTag:
        return "the end of an item";
    case FalseTag:
    case TrueTag:
        return "a truth value";
    case Int32Tag:
        return "a number of 32 bits";
    case UInt32Tag:
        return "a number of 32 bits without a sign";
    case Int64Tag:
        return "a number of 64 bits";
    case RealTag:
        return "a real number";
    case TimeTag:
        return "a time";
    case TextTag:
        return "a text";
    case PointTag:
        return "a point";
    default:
        return tag == newName || tag >= static_cast<int>(firstName) ? "a field"
                                                                    : "the byte " + std::to_string(tag);
    }
}

/// Every length is held against what is left before anything is made of it.
class BinaryReader final : public FormReader
{
public:
    explicit BinaryReader(const QByteArray& document) : m_document(document) {}

    Mark mark(const std::string& key) override
    {
        takeKey(key);
        const int tag = takeByte();
        switch (tag) {
        case NullTag:
            return {Mark::Null, 0, {}};
        case ReferenceTag:
            return {Mark::Reference, takeCount(), {}};
        case ObjectTag:
            return {Mark::Object, ++m_lastId, takeName()};
        case PartTag:
            return {Mark::Part, 0, takeName()};
        case PictureTag:
            return {Mark::Object, ++m_lastId, pictureClass};
        default:
            throwUnexpected("an object for " + inQuotes(key), describe(tag));
        }
    }

    void endObject() override { take(EndObjectTag); }

    QByteArray png() override
    {
        const std::size_t size = takeLength();
        return QByteArray(takeBytes(size), static_cast<int>(size));
    }

    int beginSequence(const std::string& key) override
    {
        takeTagged(key, SequenceTag);
        const quint64 count = takeCount();
        // Each item has at least a byte at either end.
        if (count > left() / 2 || count > static_cast<quint64>(std::numeric_limits<int>::max()))
            throw std::runtime_error("a sequence of " + std::to_string(count) +
                                     " items is longer than the document");
        return static_cast<int>(count);
    }

    void endSequence() override { take(EndSequenceTag); }
    void beginItem() override { take(ItemTag); }
    void endItem() override { take(EndItemTag); }

    void read(const std::string& key, bool& value) override
    {
        takeKey(key);
        const int tag = takeByte();
        if (tag != TrueTag && tag != FalseTag)
            throwUnexpected(describe(TrueTag) + " for " + inQuotes(key), describe(tag));
        value = tag == TrueTag;
    }

    void read(const std::string& key, qint32& value) override
    {
        takeTagged(key, Int32Tag);
        value = takeFixed<qint32>();
    }

    void read(const std::string& key, quint32& value) override
    {
        takeTagged(key, UInt32Tag);
        value = takeFixed<quint32>();
    }

    void read(const std::string& key, qint64& value) override
    {
        takeTagged(key, Int64Tag);
        value = takeFixed<qint64>();
    }

    void read(const std::string& key, double& value) override
    {
        takeTagged(key, RealTag);
        value = takeReal();
    }

    void read(const std::string& key, MTime& value) override
    {
        takeTagged(key, TimeTag);
        value = MTime(takeFixed<qint64>());
    }

    void read(const std::string& key, std::string& value) override
    {
        takeTagged(key, TextTag);
        const std::size_t size = takeLength();
        value.assign(takeBytes(size), size);
    }

    void read(const std::string& key, QPointF& value) override
    {
        takeTagged(key, PointTag);
        value.rx() = takeReal();
        value.ry() = takeReal();
    }

    void finish() override
    {
        if (left() > 0)
            throwUnexpected("the end of the document", std::to_string(left()) + " more bytes");
    }

    std::string position() const override { return "byte " + std::to_string(m_position); }

private:
    std::size_t left() const { return static_cast<std::size_t>(m_document.size()) - m_position; }

    const char* takeBytes(std::size_t size)
    {
        if (size > left())
            throwUnexpected(std::to_string(size) + " bytes",
                            "the end of the document after " + std::to_string(left()));
        const char* const bytes = m_document.constData() + m_position;
        m_position += size;
        return bytes;
    }

    int takeByte() { return static_cast<unsigned char>(*takeBytes(1)); }

    quint64 takeCount()
    {
        quint64 count = 0;
        for (int shift = 0; shift < 64; shift += 7) {
            const auto byte = static_cast<quint64>(takeByte());
            if (shift == 63 && byte > 1)
                break;
            count |= (byte & 0x7F) << shift;
            if (byte <= 0x7F)
                return count;
        }
        throw std::runtime_error("a count of more than 64 bits");
    }

    std::size_t takeLength()
    {
        const quint64 length = takeCount();
        if (length > left())
            throwUnexpected(std::to_string(length) + " bytes", "only " + std::to_string(left()));
        return static_cast<std::size_t>(length);
    }

    template <class T>
    T takeFixed()
    {
        return qFromLittleEndian<T>(takeBytes(sizeof(T)));
    }

    double takeReal()
    {
        const auto bits = takeFixed<quint64>();
        double value;
        std::memcpy(&value, &bits, sizeof value);
        return value;
    }

    std::string takeName() { return nameOf(takeCount()); }

    std::string nameOf(quint64 number)
    {
        if (number == newName) {
            const std::size_t size = takeLength();
            return m_names.emplace_back(takeBytes(size), size);
        }
        if (number < firstName || number - firstName >= m_names.size())
            throwUnexpected("a name", "the number " + std::to_string(number));
        return m_names[static_cast<std::size_t>(number - firstName)];
    }

    void takeKey(const std::string& key)
    {
        const quint64 number = takeCount();
        if (number != newName && number < firstName)
            throwUnexpected("the field " + inQuotes(key), describe(static_cast<int>(number)));
        const std::string name = nameOf(number);
        if (name != key)
            throwUnexpected("the field " + inQuotes(key), "the field " + inQuotes(name));
    }

    void takeTagged(const std::string& key, Tag expected)
    {
        takeKey(key);
        const int tag = takeByte();
        if (tag != expected)
            throwUnexpected(describe(expected) + " for " + inQuotes(key), describe(tag));
    }

    void take(Tag expected)
    {
        const int tag = takeByte();
        if (tag != expected)
            throwUnexpected(describe(expected), describe(tag));
    }

    const QByteArray m_document;
    std::size_t m_position = 0;
    std::vector<std::string> m_names;
    quint64 m_lastId = 0;
};

} // namespace

std::unique_ptr<FormReader> makeBinaryReader(const QByteArray& document)
{
    return std::make_unique<BinaryReader>(document);
}

} // namespace Serialize::Details
