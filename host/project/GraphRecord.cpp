// SPDX-License-Identifier: Apache-2.0
#include "host/project/GraphRecord.h"

#include <EditorModel/persistence/Serializer.h>
#include <EditorModel/types/Image.h>

#include <QCryptographicHash>
#include <QImage>
#include <QPointF>
#include <QString>

#include <charconv>
#include <cmath>
#include <map>
#include <set>
#include <stdexcept>
#include <typeindex>

namespace Host {

const char* const notANumber = "nan";

namespace {

using Serialize::ISerializable;
using Value = GraphRecord::Value;

std::string exact(double number)
{
    if (std::isnan(number)) {
        return notANumber;
    }
    char buffer[64];
    return std::string(buffer, std::to_chars(buffer, buffer + sizeof buffer, number).ptr);
}

/// A text in quotes, which keep it apart from all else. Half a surrogate pair has no UTF-8.
std::string exact(const QString& text)
{
    if (text.isValidUtf16()) {
        return '"' + text.toStdString() + '"';
    }
    const auto* const units = reinterpret_cast<const char*>(text.utf16());
    return "UTF-16 " + QByteArray(units, text.size() * 2).toHex().toStdString();
}

/// By their pixels: the bytes of a picture's file are the encoder's affair.
std::string pictureText(const Types::Image& picture)
{
    const QImage image = picture.toImage().convertToFormat(QImage::Format_ARGB32);
    QCryptographicHash hash(QCryptographicHash::Sha256);
    for (int y = 0; y < image.height(); ++y) {
        hash.addData(reinterpret_cast<const char*>(image.constScanLine(y)), image.width() * 4);
    }
    return "picture " + std::to_string(image.width()) + "x" + std::to_string(image.height()) + " " +
           hash.result().toHex().toStdString();
}

/// The sets that are ordered by address. In a map the keys tell.
bool isAddressSet(const std::string& className, const std::string& key)
{
    static const std::set<std::pair<std::string, std::string>> sets = {{"Timeline::Clip", "labels"},
                                                                       {"Editor::Object", "clips"}};
    return sets.count({className, key}) != 0;
}

class Recorder final : public Serialize::ISerializer, private Serialize::IFieldStream
{
public:
    GraphRecord record(const std::deque<const ISerializable*>& roots)
    {
        m_record.roots.kind = Value::Sequence;
        for (const ISerializable* const root : roots) {
            m_open = {{&m_record.roots, ""}};
            writePointer(root);
        }
        while (m_done != m_waiting.size()) {
            const auto [object, node] = m_waiting[m_done++];
            write(*object, node);
        }
        return std::move(m_record);
    }

    void writePointer(const ISerializable* object) override
    {
        if (!object) {
            put("null");
            return;
        }
        const auto known = m_numbers.find(identityOf(*object));
        if (known != m_numbers.end()) {
            putReference(known->second, false);
            return;
        }
        // Objects wait for their turn: a chain of them may be longer than the stack is deep.
        const std::size_t node = number(*object);
        m_waiting.emplace_back(object, node);
        m_pointedAt.insert(node);
        putReference(node, false);
    }

    ISerializer& writeObject(const ISerializable& object) override
    {
        const auto known = m_numbers.find(identityOf(object));
        if (known != m_numbers.end() && m_pointedAt.count(known->second) != 0) {
            putReference(known->second, true);
            return *this;
        }
        const std::size_t node = number(object);
        putReference(node, true);
        write(object, node);
        return *this;
    }

    Serialize::IFieldStream& stream() override { return *this; }

private:
    struct Open
    {
        Value* value;
        /// Of the field whose value comes next.
        std::string key;
    };
    using Identity = std::pair<const void*, std::type_index>;

    static Identity identityOf(const ISerializable& object)
    {
        return {dynamic_cast<const void*>(&object), typeid(object)};
    }

    std::size_t number(const ISerializable& object)
    {
        const std::size_t node = m_record.nodes.size();
        m_record.nodes.push_back({object.GetNameInArchive(), {}});
        m_numbers[identityOf(object)] = node;
        return node;
    }

    void write(const ISerializable& object, std::size_t node)
    {
        Value& fields = m_record.nodes[node].fields;
        fields.kind = Value::Fields;
        std::vector<Open> outer = {{&fields, ""}};
        outer.swap(m_open);
        object.Serialize(*this);
        outer.swap(m_open);
    }

    Value& add(Value::Kind kind)
    {
        Open& open = m_open.back();
        open.value->parts.emplace_back(std::exchange(open.key, std::string()), Value());
        Value& value = open.value->parts.back().second;
        value.kind = kind;
        return value;
    }

    void put(const std::string& text) { add(Value::Scalar).text = text; }

    void putReference(std::size_t node, bool byValue)
    {
        Value& value = add(Value::Reference);
        value.node = node;
        value.byValue = byValue;
    }

    void open(Value::Kind kind) { m_open.push_back({&add(kind), ""}); }

    void close()
    {
        if (m_open.size() < 2) {
            throw std::logic_error("an object ends what it did not begin");
        }
        m_open.pop_back();
    }

    /// The object itself has its node; what it begins further is a base.
    void beginClass(const Serialize::ClassRecord& record) override
    {
        open(Value::Fields);
        m_open.back().value->text = record.name;
    }
    void endClass(const Serialize::ClassRecord&) override { close(); }

    void beginSequence(int*) override
    {
        const std::string key = m_open.back().key;
        const bool isSet = isAddressSet(m_open.back().value->text, key);
        open(isSet ? Value::Unordered : Value::Sequence);
    }
    void endSequence(const Serialize::CountRecord&) override
    {
        Value& sequence = *m_open.back().value;
        const bool isMap = !sequence.parts.empty() && isKeyedByPointer(sequence.parts.front().second);
        if (isMap) {
            sequence.kind = Value::Unordered;
        }
        close();
    }
    void beginItem(const Serialize::ItemRecord&) override { open(Value::Fields); }
    void endItem(const Serialize::ItemRecord&) override { close(); }

    static bool isKeyedByPointer(const Value& item)
    {
        if (item.parts.empty() || item.parts.front().first != "Key") {
            return false;
        }
        const Value& key = item.parts.front().second;
        return (key.kind == Value::Reference && !key.byValue) ||
               (key.kind == Value::Scalar && key.text == "null");
    }

    void field(const Serialize::FieldRecord& record) override
    {
        m_open.back().key = record.name ? record.name : "";
    }

    void value(std::shared_ptr<const Types::Image>* picture) override
    {
        put(*picture ? pictureText(**picture) : "null");
    }
    void value(QPointF* point) override { put(exact(point->x()) + " " + exact(point->y())); }
    void value(QString* text) override { put(exact(*text)); }
    void value(std::string* text) override { put('"' + *text + '"'); }
    void value(MTime* time) override { put(std::to_string(time->ms()) + " ms"); }
    void value(double* number) override { put(exact(*number)); }
    void value(qint64* number) override { put(std::to_string(*number)); }
    void value(quint32* number) override { put(std::to_string(*number)); }
    void value(qint32* number) override { put(std::to_string(*number)); }
    void value(bool* truth) override { put(*truth ? "true" : "false"); }

    GraphRecord m_record;
    std::vector<Open> m_open;
    std::map<Identity, std::size_t> m_numbers;
    std::set<std::size_t> m_pointedAt;
    std::deque<std::pair<const ISerializable*, std::size_t>> m_waiting;
    std::size_t m_done = 0;
};

} // namespace

GraphRecord recordOf(const std::deque<const ISerializable*>& roots)
{
    return Recorder().record(roots);
}

} // namespace Host
