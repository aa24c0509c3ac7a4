// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/Json.h>
#include <EditorModel/persistence/JsonText.h>
#include <EditorModel/persistence/Utf8.h>
#include <EditorModel/persistence/streams/Forms.h>
#include <EditorModel/persistence/streams/JsonNames.h>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <limits>
#include <stdexcept>
#include <vector>

namespace Serialize::Details {
namespace {

using Node = nlohmann::json;

std::string describe(const Node& node)
{
    switch (node.type()) {
    case Node::value_t::null:
        return "null";
    case Node::value_t::object:
        return "an object";
    case Node::value_t::array:
        return "an array";
    case Node::value_t::string:
        return "the text " + inQuotes(node.get_ref<const std::string&>());
    default:
        return node.dump();
    }
}

/// Reads members by their keys: their order in the text does not matter.
class JsonReader final : public FormReader
{
public:
    explicit JsonReader(const QByteArray& document)
    {
        m_root = Document::Details::parsedJson(document);
        if (!m_root.is_object())
            throwUnexpected("an object", describe(m_root));
        m_open.push_back({&m_root, {}, {}, 0});
        if (take(JsonNames::root) != Node(JsonNames::stream))
            throwUnexpected("the route \"stream\"", describe(m_root[JsonNames::root]));
        if (take(JsonNames::version) != Node(JsonNames::currentVersion))
            throwUnexpected("version " + std::to_string(JsonNames::currentVersion) + " of the field stream",
                            describe(m_root[JsonNames::version]));
    }

    Mark mark(const std::string& key) override
    {
        const Node& node = take(key);
        if (node.is_null())
            return {Mark::Null, 0, {}};
        const Node* const meta = metaOf(node);
        if (!meta)
            throwUnexpected("an object for " + inQuotes(key), describe(node));
        if (meta->contains(JsonNames::reference)) {
            requireMembers(node, 1);
            requireMembers(*meta, 1);
            return {Mark::Reference, number(*meta, JsonNames::reference), {}};
        }
        Mark mark{Mark::Part, 0, className(*meta)};
        if (meta->contains(JsonNames::id)) {
            mark.kind = Mark::Object;
            mark.id = number(*meta, JsonNames::id);
        }
        requireMembers(*meta, mark.kind == Mark::Object ? 2 : 1);
        open(node);
        m_open.back().taken.push_back(meta);
        return mark;
    }

    void endObject() override { close(); }

    QByteArray png() override
    {
        std::string text;
        Json::detail::load(take(JsonNames::png), text);
        close();
        const auto decoded = QByteArray::fromBase64Encoding(QByteArray::fromStdString(text),
                                                            QByteArray::AbortOnBase64DecodingErrors);
        if (!decoded)
            throwUnexpected("base64", inQuotes(text));
        return *decoded;
    }

    int beginSequence(const std::string& key) override
    {
        const Node& node = take(key);
        if (!node.is_array())
            throwUnexpected("an array for " + inQuotes(key), describe(node));
        if (node.size() > static_cast<std::size_t>(std::numeric_limits<int>::max()))
            throw std::runtime_error("a sequence of " + std::to_string(node.size()) + " items");
        open(node);
        return static_cast<int>(node.size());
    }

    void endSequence() override { pop(); }

    void beginItem() override
    {
        Level& sequence = m_open.back();
        const Node& node = (*sequence.node)[sequence.items++];
        m_last = '[' + std::to_string(sequence.items) + ']';
        if (!node.is_object())
            throwUnexpected("an item", describe(node));
        open(node);
    }

    void endItem() override { close(); }

    void read(const std::string& key, bool& value) override { Json::detail::load(take(key), value); }
    void read(const std::string& key, qint32& value) override { Json::detail::load(take(key), value); }
    void read(const std::string& key, quint32& value) override { Json::detail::load(take(key), value); }
    void read(const std::string& key, qint64& value) override { Json::detail::load(take(key), value); }
    void read(const std::string& key, double& value) override { Json::detail::load(take(key), value); }
    void read(const std::string& key, std::string& value) override { Json::detail::load(take(key), value); }

    void read(const std::string& key, MTime& value) override
    {
        qint64 count = 0;
        read(key, count);
        value = MTime(count);
    }

    void read(const std::string& key, QPointF& value) override
    {
        const Node& node = take(key);
        if (!node.is_object())
            throwUnexpected("a point for " + inQuotes(key), describe(node));
        open(node);
        read(JsonNames::x, value.rx());
        read(JsonNames::y, value.ry());
        close();
    }

    void finish() override { close(); }

    std::string position() const override
    {
        std::string path;
        const auto add = [&path](const std::string& step) {
            if (!path.empty() && !step.empty() && step.front() != '[')
                path += '/';
            path += step;
        };
        for (const Level& level : m_open)
            add(level.step);
        add(m_last);
        return path;
    }

private:
    struct Level
    {
        const Node* node;
        /// The key or the number by which it was entered.
        std::string step;
        /// The members that have been read.
        std::vector<const Node*> taken;
        /// Of a sequence, how many items were entered; else how many parts of bases.
        std::size_t items;
    };

    static const Node* metaOf(const Node& node)
    {
        if (!node.is_object())
            return nullptr;
        const auto meta = node.find(JsonNames::meta);
        return meta != node.end() && meta->is_object() ? &*meta : nullptr;
    }

    static void requireMembers(const Node& node, std::size_t count)
    {
        if (node.size() != count)
            throwUnexpected(std::to_string(count) + " members beside one another",
                            std::to_string(node.size()));
    }

    static quint64 number(const Node& meta, const char* key)
    {
        const Node& node = meta[key];
        if (!node.is_number_unsigned())
            throwUnexpected("the number of an object", describe(node));
        return node.get<quint64>();
    }

    static std::string className(const Node& meta)
    {
        const auto name = meta.find(JsonNames::className);
        if (name == meta.end() || !name->is_string())
            throwUnexpected("the name of a class", name == meta.end() ? "none" : describe(*name));
        return name->get<std::string>();
    }

    void open(const Node& node) { m_open.push_back({&node, std::move(m_last), {}, 0}); }

    /// Ends an object of which every member must have been read.
    void close()
    {
        const Level& level = m_open.back();
        if (level.taken.size() != level.node->size())
            throwUnexpected("no more fields", "the field " + inQuotes(unread(level)));
        if (level.items > 0)
            requireMembers((*level.node)[baseKey], level.items);
        pop();
    }

    void pop()
    {
        m_last = std::move(m_open.back().step);
        m_open.pop_back();
    }

    static std::string unread(const Level& level)
    {
        for (const auto& member : level.node->items()) {
            if (std::find(level.taken.begin(), level.taken.end(), &member.value()) == level.taken.end())
                return member.key();
        }
        return {};
    }

    /// The value of a field in what is open.
    const Node& take(const std::string& key)
    {
        m_last = key;
        Level& level = m_open.back();
        const auto found = level.node->find(key);
        if (found == level.node->end())
            throwUnexpected("the field " + inQuotes(key), members(level));
        if (key == baseKey)
            return takeBase(level, *found);
        if (std::find(level.taken.begin(), level.taken.end(), &*found) != level.taken.end())
            throw std::logic_error("the field " + inQuotes(key) + " is read twice");
        level.taken.push_back(&*found);
        return *found;
    }

    const Node& takeBase(Level& level, const Node& bases)
    {
        if (!bases.is_array())
            throwUnexpected("an array for " + inQuotes(baseKey), describe(bases));
        if (level.items == 0)
            level.taken.push_back(&bases);
        if (level.items >= bases.size())
            throwUnexpected("the part of another base", "only " + std::to_string(bases.size()));
        return bases[level.items++];
    }

    /// The first unread member stands for all.
    static std::string members(const Level& level)
    {
        const std::string name = unread(level);
        return name.empty() ? "no more fields" : "the field " + inQuotes(name);
    }

    Node m_root;
    std::vector<Level> m_open;
    /// The key or the number that was read last in what is open.
    std::string m_last;
};

} // namespace

std::unique_ptr<FormReader> makeJsonReader(const QByteArray& document)
{
    return std::make_unique<JsonReader>(document);
}

} // namespace Serialize::Details
