// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/Utf8.h>
#include <EditorModel/persistence/streams/Forms.h>
#include <EditorModel/persistence/streams/JsonNames.h>

#include <QIODevice>

#include <nlohmann/json.hpp>

#include <cmath>
#include <stdexcept>
#include <vector>

namespace Serialize::Details {
namespace {

/// Keeps the members of an object in the order of the fields.
using Node = nlohmann::ordered_json;

class JsonWriter final : public FormWriter
{
public:
    explicit JsonWriter(QIODevice& device) : m_device(device)
    {
        m_root[JsonNames::root] = JsonNames::stream;
        m_root[JsonNames::version] = JsonNames::currentVersion;
        m_open.push_back(&m_root);
    }

    void null(const std::string& key) override { place(key) = nullptr; }

    void reference(const std::string& key, quint64 id) override
    {
        place(key)[JsonNames::meta][JsonNames::reference] = id;
    }

    void beginObject(const std::string& key, const std::string& className, quint64 id) override
    {
        beginPart(key, className);
        (*m_open.back())[JsonNames::meta][JsonNames::id] = id;
    }

    void beginPart(const std::string& key, const std::string& className) override
    {
        requireUtf8(className);
        Node& node = place(key);
        node[JsonNames::meta][JsonNames::className] = className;
        m_open.push_back(&node);
    }

    void endObject() override { m_open.pop_back(); }

    void picture(const std::string& key, quint64 id, const QByteArray& png) override
    {
        beginObject(key, pictureClass, id);
        place(JsonNames::png) = png.toBase64().toStdString();
        endObject();
    }

    void beginSequence(const std::string& key, int) override
    {
        Node& node = place(key);
        node = Node::array();
        m_open.push_back(&node);
    }

    void endSequence() override { m_open.pop_back(); }

    void beginItem() override
    {
        m_open.back()->push_back(Node::object());
        m_open.push_back(&m_open.back()->back());
    }

    void endItem() override { m_open.pop_back(); }

    void write(const std::string& key, bool value) override { place(key) = value; }
    void write(const std::string& key, qint32 value) override { place(key) = value; }
    void write(const std::string& key, quint32 value) override { place(key) = value; }
    void write(const std::string& key, qint64 value) override { place(key) = value; }
    void write(const std::string& key, double value) override { place(key) = number(value); }
    void write(const std::string& key, MTime value) override { place(key) = value.ms(); }

    void write(const std::string& key, const std::string& value) override
    {
        requireUtf8(value);
        place(key) = value;
    }

    void write(const std::string& key, const QPointF& value) override
    {
        Node& node = place(key);
        node[JsonNames::x] = number(value.x());
        node[JsonNames::y] = number(value.y());
    }

    void finish() override
    {
        const std::string text = m_root.dump(4) + '\n';
        writeAll(m_device, text.data(), static_cast<qint64>(text.size()));
        flush(m_device);
    }

private:
    /// Json has no numbers for infinities and not-a-numbers.
    static Node number(double value) { return std::isfinite(value) ? Node(value) : Node(textOf(value)); }

    /// A new node in what is open. A class can have several bases: their parts stand in an array.
    Node& place(const std::string& key)
    {
        requireUtf8(key);
        Node& node = *m_open.back();
        if (key == baseKey) {
            node[key].push_back(nullptr);
            return node[key].back();
        }
        if (node.contains(key))
            throw std::logic_error("the key " + inQuotes(key) + " stands twice in one object");
        return node[key];
    }

    QIODevice& m_device;
    Node m_root;
    /// What is open is not moved: members come only to the innermost.
    std::vector<Node*> m_open;
};

} // namespace

std::unique_ptr<FormWriter> makeJsonWriter(QIODevice& device)
{
    return std::make_unique<JsonWriter>(device);
}

} // namespace Serialize::Details
