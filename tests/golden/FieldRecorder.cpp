// SPDX-License-Identifier: Apache-2.0
#include "FieldRecorder.h"

#include <EditorModel/persistence/Serializable.h>

#include <nlohmann/json.hpp>

#include <QPointF>
#include <QString>

#include <algorithm>
#include <stdexcept>
#include <utility>

namespace GoldenTests {
namespace {

bool isOf(const std::vector<StoredField>& fields, const std::vector<std::string>& keys)
{
    return std::equal(fields.begin(), fields.end(), keys.begin(), keys.end(),
                      [](const StoredField& field, const std::string& key) { return field.key == key; });
}

/// Numbers in full, texts in quotes.
template <class T>
std::string textOf(const T& value)
{
    return nlohmann::json(value).dump();
}

/// An item, by its keys.
StoredField itemOf(const std::vector<StoredField>& fields)
{
    if (isOf(fields, {"Data"}))
        return {"sequence", fields[0].kind};
    if (isOf(fields, {"Key", "Value"}))
        return {"map", fields[0].kind + " to " + fields[1].kind};
    if (isOf(fields, {"First", "Second"}))
        return {"pair", fields[0].kind + " and " + fields[1].kind};
    throw std::logic_error("an item with other keys than those of sequences, maps and pairs");
}

/// A container, by its items. A tuple is told from a sequence by elements of several kinds.
std::string containerOf(const std::vector<StoredField>& items)
{
    if (items.empty())
        return "sequence";
    std::string kinds = items.front().kind;
    bool isTuple = false;
    for (std::size_t i = 1; i < items.size(); ++i) {
        if (items[i].key != items[0].key)
            throw std::logic_error("items of different shapes in one container");
        isTuple = isTuple || items[i].kind != items[0].kind;
        kinds += " and " + items[i].kind;
    }
    return isTuple ? "tuple of " + kinds : items.front().key + " of " + items.front().kind;
}

class Writer final : public Serialize::ISerializer
{
public:
    void writePointer(const Serialize::ISerializable* object) override { m_stream.pointer(!object); }
    Serialize::ISerializer& writeObject(const Serialize::ISerializable& object) override
    {
        m_stream.object();
        object.Serialize(*this);
        return *this;
    }
    Serialize::IFieldStream& stream() override { return m_stream; }

    RecordingStream m_stream{false};
};

class Reader final : public Serialize::IDeserializer
{
public:
    void readPointer(Serialize::ISerializable*& object) override
    {
        object = nullptr;
        m_stream.pointer(true);
    }
    Serialize::IDeserializer& readObject(Serialize::ISerializable& object) override
    {
        m_stream.object();
        object.Deserialize(*this);
        return *this;
    }
    Serialize::IFieldStream& stream() override { return m_stream; }

    RecordingStream m_stream{true};
};

} // namespace

std::vector<StoredField> RecordingStream::fields() const
{
    if (!m_open.empty())
        throw std::logic_error("an object that did not end");
    return m_fields;
}

RecordingStream::Scope& RecordingStream::scope()
{
    if (m_open.empty())
        throw std::logic_error("a field outside of any object");
    return m_open.back();
}

void RecordingStream::set(const std::string& kind, const std::string& value)
{
    if (scope().empty() || !scope().back().kind.empty())
        throw std::logic_error(kind + " without a key of its own");
    scope().back().kind = kind;
    scope().back().value = value;
}

RecordingStream::Scope RecordingStream::closed()
{
    Scope fields = std::move(scope());
    m_open.pop_back();
    return fields;
}

void RecordingStream::beginItem(const Serialize::ItemRecord&)
{
    m_open.emplace_back();
}

void RecordingStream::endItem(const Serialize::ItemRecord&)
{
    const StoredField item = itemOf(closed());
    scope().push_back(item);
}

void RecordingStream::beginSequence(int* count)
{
    // A pair or a tuple comes with its count.
    if (m_furnishes && *count == 0)
        *count = 1;
    m_open.emplace_back();
}

void RecordingStream::endSequence(const Serialize::CountRecord&)
{
    const Scope items = closed();
    set(containerOf(items), items.empty() ? "empty" : std::to_string(items.size()) + " items");
}

void RecordingStream::beginClass(const Serialize::ClassRecord& record)
{
    if (!m_open.empty())
        set((std::exchange(m_isObject, false) ? "object " : "base ") + std::string(record.name), "");
    m_open.emplace_back();
}

void RecordingStream::endClass(const Serialize::ClassRecord&)
{
    Scope fields = closed();
    if (m_open.empty())
        m_fields = std::move(fields);
    else
        scope().back().value = valueOf(fields);
}

void RecordingStream::field(const Serialize::FieldRecord& record)
{
    scope().push_back({record.name, std::string()});
}

void RecordingStream::value(std::shared_ptr<const Types::Image>* value)
{
    set("picture", *value ? "set" : "null");
}

void RecordingStream::value(QPointF* value)
{
    set("point", '(' + textOf(value->x()) + ", " + textOf(value->y()) + ')');
}

void RecordingStream::value(QString* value)
{
    set("QString", textOf(value->toStdString()));
}

void RecordingStream::value(std::string* value)
{
    set("string", textOf(*value));
}

void RecordingStream::value(MTime* value)
{
    set("time", textOf(value->ms()) + " ms");
}

void RecordingStream::value(double* value)
{
    set("double", textOf(*value));
}

void RecordingStream::value(qint64* value)
{
    set("int64", textOf(*value));
}

// Colours, all of them.
void RecordingStream::value(quint32* value)
{
    set("uint32", QStringLiteral("0x%1").arg(*value, 8, 16, QLatin1Char('0')).toStdString());
}

void RecordingStream::value(qint32* value)
{
    set("int32", textOf(*value));
}

void RecordingStream::value(bool* value)
{
    set("bool", textOf(*value));
}

std::string valueOf(const std::vector<StoredField>& fields)
{
    std::string text;
    for (const StoredField& field : fields)
        text += (text.empty() ? "" : ", ") + field.key + ' ' + field.value;
    return '{' + text + '}';
}

std::vector<StoredField> written(const Serialize::ISerializable& object)
{
    Writer writer;
    object.Serialize(writer);
    return writer.m_stream.fields();
}

std::vector<StoredField> askedFor(Serialize::ISerializable& object)
{
    Reader reader;
    object.Deserialize(reader);
    return reader.m_stream.fields();
}

} // namespace GoldenTests
