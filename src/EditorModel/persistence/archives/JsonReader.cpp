// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/ConstructionLog.h>
#include <EditorModel/persistence/Unregistered.h>
#include <EditorModel/persistence/Utf8.h>
#include <EditorModel/persistence/archives/JsonNodes.h>
#include <EditorModel/persistence/archives/Pictures.h>
#include <EditorModel/types/Image.h>
#include <EditorModel/types/StrictLookup.h>

#include <cstring>
#include <stdexcept>
#include <unordered_map>
#include <vector>

namespace Serialize::Json {

using MetaDetails::s_class_name;
using MetaDetails::s_id;
using MetaDetails::s_meta;
using MetaDetails::s_reference;
using nlohmann::json;

class iarchive::Reader final : public Fields
{
public:
    explicit Reader(const json& root) : Fields(true), m_root(root) { push(root); }

    const json& head() const { return *m_heads.back().node; }

    /// What is read next is the node under the key, or the object that it mentions.
    void begin(const char* key)
    {
        if (!key)
            return;
        push(under(key));
        if (m_heads.back().mentions)
            resolve();
    }

    void end(const char* key)
    {
        if (key)
            m_heads.pop_back();
    }

private:
    /// A node that is being read, how many of the items that share its key are read, and the identity in it.
    struct Head
    {
        const json* node;
        std::size_t next;
        std::optional<std::size_t> id;
        bool mentions;
    };

    /// An object that was read, with the node that it stands in.
    struct Known
    {
        Pointee object;
        const json* node;
    };

    /// Leaves whatever is begun in it, also when an exception passes through.
    class HeadScope
    {
    public:
        explicit HeadScope(Reader& reader)
            : m_reader(reader), m_depth(static_cast<std::ptrdiff_t>(reader.m_heads.size()))
        {}
        ~HeadScope() { m_reader.m_heads.erase(m_reader.m_heads.begin() + m_depth, m_reader.m_heads.end()); }
        HeadScope(const HeadScope&) = delete;
        HeadScope& operator=(const HeadScope&) = delete;

    private:
        Reader& m_reader;
        const std::ptrdiff_t m_depth;
    };

    void push(const json& node)
    {
        const auto reference = identityIn(node, s_reference);
        m_heads.push_back({&node, 0, reference ? reference : identityIn(node, s_id), reference.has_value()});
    }

    /// Goes on with the node that a mention names.
    void resolve()
    {
        if (!m_isEntered)
            enterObjects();
        m_heads.back().node = Types::strictAt(m_nodes, *m_heads.back().id);
    }

    /// Notes where each object stands. Only a document that mentions an object before it, or holds it by
    /// value twice, needs this: elsewhere every mention is of an object that was read. Walks without
    /// recursion, as nothing bounds the depth of a tree.
    void enterObjects()
    {
        m_isEntered = true;
        std::size_t weight = 0;
        std::vector<const json*> pending{&m_root};
        while (!pending.empty()) {
            const json& node = *pending.back();
            pending.pop_back();
            const auto id = identityIn(node, s_id);
            if (id && !m_nodes.try_emplace(*id, &node).second)
                throwTwice(*id);
            for (const json& child : node) {
                weight += weightOf(child);
                if (child.is_structured())
                    pending.push_back(&child);
            }
        }
        m_budget = weight * 4 + 64;
    }

    /// What reading a node takes, without what is under it.
    static std::size_t weightOf(const json& node)
    {
        const auto* const text = node.get_ptr<const std::string*>();
        return 1 + (text ? text->size() : 0);
    }

    /// A document that mentions parts of itself over and over could be read for ever, and into any amount of
    /// memory. One that was saved reads each part once.
    const json& spend(const json& node)
    {
        if (!m_isEntered)
            return node;
        const std::size_t weight = weightOf(node);
        if (weight > m_budget)
            throw std::runtime_error("the document repeats its own parts without end");
        m_budget -= weight;
        return node;
    }

    [[noreturn]] static void throwTwice(std::size_t id)
    {
        throw std::runtime_error("the identifier " + std::to_string(id) + " stands for two objects");
    }

    const json& under(const char* key)
    {
        Head& at = m_heads.back();
        if (!at.node->is_object())
            throw std::runtime_error(std::string("there is ") + at.node->type_name() + " where \"" + key +
                                     "\" is expected");
        const auto found = at.node->find(key);
        if (found == at.node->end())
            throw std::runtime_error(std::string("\"") + key + "\" is missing");
        if (!sharesKey(*at.node, key))
            return spend(*found);
        if (!found->is_array() || at.next >= found->size())
            throw std::runtime_error(std::string("there are too few of \"") + key + "\"");
        return spend((*found)[at.next++]);
    }

    template <class Body>
    void within(const char* key, Body body)
    {
        const HeadScope scope(*this);
        begin(key);
        body();
    }

    void onScalar(const Key& key, const Scalar& value, const void*) override
    {
        within(key.archive, [&] { std::visit([&](auto* target) { load(*target); }, value); });
    }

    template <class T>
    void load(T& value)
    {
        detail::load(head(), value);
    }

    void load(QString& text)
    {
        std::string utf8;
        detail::load(head(), utf8);
        text = Details::textOfUtf8(utf8);
    }

    void load(MTime& time)
    {
        int low = 0;
        detail::load(head(), low);
        time = MTime(low);
    }

    void load(QPointF& point)
    {
        within("x", [&] { load(point.rx()); });
        within("y", [&] { load(point.ry()); });
    }

    void load(std::shared_ptr<const Types::Image>& picture)
    {
        Details::visit(*this, Details::sharedPictureType(), &picture);
    }

    void onObject(const Key& key, const Type& type, void* object) override
    {
        within(key.archive, [&] {
            requireObject();
            const Head& at = m_heads.back();
            if (at.id && !at.mentions && type.create)
                enter({object, &type});
            Details::visit(*this, type, object);
        });
    }

    /// The object of the node that is being read.
    void enter(const Pointee& object)
    {
        const Head& at = m_heads.back();
        if (!m_known.try_emplace(*at.id, Known{object, at.node}).second)
            throwTwice(*at.id);
    }

    void onBase(const Key& key, const Type& type, void* object) override
    {
        within(key.archive, [&] {
            requireObject();
            Details::visit(*this, type, object);
        });
    }

    void onPointer(const Key& key, const PointerField& field) override
    {
        const HeadScope scope(*this);
        if (key.archive)
            push(under(key.archive));
        field.access.set(field, head().is_null() ? Pointee{nullptr, nullptr} : readObject());
    }

    Pointee readObject()
    {
        requireObject();
        const Head at = m_heads.back();
        if (at.id) {
            const auto known = m_known.find(*at.id);
            if (known != m_known.end() && (at.mentions || known->second.node == at.node))
                return known->second.object;
        }
        if (at.mentions)
            resolve();
        const Type& type = typeOfHead();
        const Pointee made{Details::ConstructionLog::make(type), &type};
        if (at.id)
            enter(made);
        Details::visit(*this, type, made.object);
        return made;
    }

    const Type& typeOfHead() const
    {
        const auto meta = head().find(s_meta);
        if (meta == head().end() || !meta->is_object() || !meta->contains(s_class_name))
            throw std::runtime_error("an object has no class name");
        std::string name;
        detail::load((*meta)[s_class_name], name);
        const Type* const type =
            name == Details::pictureType().name ? &Details::pictureType() : findType(name);
        if (!type || !type->create)
            Details::throwUnregistered();
        return *type;
    }

    void requireObject() const
    {
        if (!head().is_object())
            throw std::runtime_error(std::string("there is ") + head().type_name() +
                                     " where an object is expected");
    }

    void onContainer(const Key& key, const Type& type, void* container) override
    {
        within(key.archive, [&] { Details::visit(*this, type, container); });
    }

    void onEntry(const Type& pair, void* entry) override { onContainer(Details::itemKey, pair, entry); }

    int onBeginSequence(SequenceKind kind, int count) override
    {
        if (kind == Group)
            return count;
        within(countKey, [&] { load(count); });
        if (count < 0)
            throw std::runtime_error("a count of " + std::to_string(count) + " items");
        requireItems(head(), static_cast<std::size_t>(count));
        return count;
    }

    void onBeginItem(int) override {}
    void onEndItem(int) override {}
    void onEndSequence(int) override {}

    void onBinary(QByteArray& bytes, int size) override
    {
        std::string text;
        if (head().is_string())
            load(text);
        else
            within(bytesKey, [&] { load(text); });
        const auto decoded = QByteArray::fromBase64Encoding(QByteArray::fromStdString(text),
                                                            QByteArray::AbortOnBase64DecodingErrors);
        if (!decoded)
            throw std::runtime_error("the bytes are not in base64");
        if (decoded.decoded.size() != size)
            throw std::runtime_error("there are " + std::to_string(decoded.decoded.size()) + " bytes where " +
                                     std::to_string(size) + " are counted");
        bytes = decoded.decoded;
    }

    std::shared_ptr<const Types::Image> onShare(const Types::Image* image) override
    {
        auto& owner = m_pictures[image];
        if (!owner) {
            Details::ConstructionLog::release(const_cast<Types::Image*>(image));
            owner.reset(image);
        }
        return owner;
    }

    const json& m_root;
    std::vector<Head> m_heads;
    bool m_isEntered = false;
    std::unordered_map<std::size_t, const json*> m_nodes;
    std::unordered_map<std::size_t, Known> m_known;
    std::unordered_map<const Types::Image*, std::shared_ptr<const Types::Image>> m_pictures;
    std::size_t m_budget = 0;
};

iarchive::iarchive(const json& root) : m_reader(std::make_unique<Reader>(root)) {}

iarchive::~iarchive() = default;

const json& iarchive::headRef() const
{
    return m_reader->head();
}

void iarchive::load_binary(void* address, std::size_t count)
{
    requireByteCount(count);
    QByteArray bytes;
    m_reader->binary(bytes, static_cast<int>(count));
    std::memcpy(address, bytes.constData(), count);
}

Fields& iarchive::fields()
{
    return *m_reader;
}

void iarchive::begin(const char* key)
{
    m_reader->begin(key);
}

void iarchive::end(const char* key)
{
    m_reader->end(key);
}

void iarchive::abandon(const char* key)
{
    m_reader->end(key);
}

void iarchive::checkCount(std::size_t count) const
{
    requireItems(headRef(), count);
}

void iarchive::number(qint64& value)
{
    detail::load(headRef(), value);
}

void iarchive::number(double& value)
{
    detail::load(headRef(), value);
}

} // namespace Serialize::Json

void Serialize::Details::archiveFields(Json::iarchive& archive, const Type& type, void* object)
{
    visit(archive.fields(), type, object);
}
