// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/Unregistered.h>
#include <EditorModel/persistence/archives/JsonNodes.h>
#include <EditorModel/persistence/archives/Pictures.h>

#include <deque>
#include <limits>
#include <stdexcept>
#include <unordered_map>

namespace Serialize::Json {

using MetaDetails::s_class_name;
using MetaDetails::s_id;
using MetaDetails::s_meta;
using MetaDetails::s_reference;
using nlohmann::json;

namespace {

/// An object as archives know it: one address can be an object and its first base or member at once.
struct Identity
{
    const void* object;
    const Type* type;

    bool operator==(const Identity& other) const { return object == other.object && type == other.type; }
};

struct IdentityHash
{
    std::size_t operator()(const Identity& identity) const
    {
        return std::hash<const void*>()(identity.object) * 31 + std::hash<const void*>()(identity.type);
    }
};

} // namespace

class oarchive::Writer final : public Fields
{
public:
    explicit Writer(json& root) : Fields(false), m_root(root) { m_root = nullptr; }

    json& head() { return m_nodes.empty() ? m_root : m_nodes.back(); }

    void begin(const char* key)
    {
        if (m_hasFailed)
            throw std::logic_error("the archive has failed before");
        if (key)
            m_nodes.emplace_back();
    }

    void end(const char* key)
    {
        if (!key)
            return;
        json node = std::move(m_nodes.back());
        m_nodes.pop_back();
        json& parent = head();
        if (sharesKey(parent, key))
            parent[key].push_back(std::move(node));
        else if (!parent.emplace(key, std::move(node)).second)
            fail(std::string("the key \"") + key + "\" stands twice");
    }

    /// After an exception some of the tree is gone, with the places of objects in it.
    void abandon() { m_hasFailed = true; }

private:
    /// Where an object stands in the tree, by its members: nodes move, these do not.
    struct Place
    {
        json::object_t* members;
        std::size_t id;
    };

    [[noreturn]] void fail(const std::string& reason)
    {
        abandon();
        throw std::runtime_error(reason);
    }

    template <class Body>
    void within(const char* key, Body body)
    {
        begin(key);
        try {
            body();
        } catch (...) {
            abandon();
            throw;
        }
        end(key);
    }

    void onScalar(const Key& key, const Scalar& value, const void*) override
    {
        within(key.archive, [&] { std::visit([&](auto* source) { save(*source); }, value); });
    }

    template <class T>
    void save(T& value)
    {
        detail::save(head(), value);
    }

    void save(QString& text) { detail::save(head(), text.toStdString()); }
    /// The low half of the count of milliseconds.
    void save(MTime& time) { detail::save(head(), static_cast<int>(static_cast<quint32>(time.ms()))); }
    void save(QPointF& point)
    {
        within("x", [&] { save(point.rx()); });
        within("y", [&] { save(point.ry()); });
    }
    void save(std::shared_ptr<const Types::Image>& picture)
    {
        Details::visit(*this, Details::sharedPictureType(), &picture);
    }

    void onObject(const Key& key, const Type& type, void* object) override
    {
        within(key.archive, [&] {
            head() = json::object();
            // One that is held by value a second time stands a second time: it is another object after
            // loading.
            if (type.create)
                m_places.try_emplace(Identity{object, &type}, Place{membersOfHead(), 0});
            Details::visit(*this, type, object);
        });
    }

    void onBase(const Key& key, const Type& type, void* object) override
    {
        within(key.archive, [&] {
            head() = json::object();
            Details::visit(*this, type, object);
        });
    }

    void onPointer(const Key& key, const PointerField& field) override
    {
        const Pointee pointee = field.access.get(field);
        within(key.archive, [&] {
            if (!pointee.object)
                return;
            if (!pointee.type || !pointee.type->exported)
                Details::throwUnregistered();
            head()[s_meta][s_class_name] = pointee.type->name;
            const auto entered =
                m_places.try_emplace(Identity{pointee.object, pointee.type}, Place{membersOfHead(), 0});
            const std::size_t id = idOf(entered.first->second);
            if (entered.second)
                Details::visit(*this, *pointee.type, pointee.object);
            else
                head()[s_meta][s_reference] = id;
        });
    }

    /// The identity of an object; one that was held by value so far gets its identity now.
    std::size_t idOf(Place& place)
    {
        if (place.id == 0) {
            place.id = ++m_lastId;
            (*place.members)[s_meta][s_id] = place.id;
        }
        return place.id;
    }

    json::object_t* membersOfHead() { return head().get_ptr<json::object_t*>(); }

    void onContainer(const Key& key, const Type& type, void* container) override
    {
        within(key.archive, [&] { Details::visit(*this, type, container); });
    }

    void onEntry(const Type& pair, void* entry) override { onContainer(Details::itemKey, pair, entry); }

    int onBeginSequence(SequenceKind kind, int count) override
    {
        if (kind != Group)
            head()[countKey] = count;
        if (kind == Collection)
            head()[itemVersionKey] = 0;
        return count;
    }

    void onBeginItem(int) override {}
    void onEndItem(int) override {}
    void onEndSequence(int) override {}

    void onBinary(QByteArray& bytes, int size) override
    {
        const QByteArray raw = QByteArray::fromRawData(bytes.constData(), size);
        json& target = head().is_null() ? head() : head()[bytesKey];
        target = raw.toBase64().toStdString();
    }

    std::shared_ptr<const Types::Image> onShare(const Types::Image*) override { return nullptr; }

    json& m_root;
    std::deque<json> m_nodes;
    std::unordered_map<Identity, Place, IdentityHash> m_places;
    std::size_t m_lastId = 0;
    bool m_hasFailed = false;
};

oarchive::oarchive(json& root) : m_writer(std::make_unique<Writer>(root)) {}

oarchive::~oarchive() = default;

json& oarchive::headRef()
{
    return m_writer->head();
}

void oarchive::save_binary(const void* address, std::size_t count)
{
    requireByteCount(count);
    QByteArray bytes = QByteArray::fromRawData(static_cast<const char*>(address), static_cast<int>(count));
    m_writer->binary(bytes, bytes.size());
}

Fields& oarchive::fields()
{
    return *m_writer;
}

void oarchive::begin(const char* key)
{
    m_writer->begin(key);
}

void oarchive::end(const char* key)
{
    m_writer->end(key);
}

void oarchive::abandon(const char*)
{
    m_writer->abandon();
}

void oarchive::number(qint64& value)
{
    detail::save(headRef(), value);
}

void oarchive::number(double& value)
{
    detail::save(headRef(), value);
}

} // namespace Serialize::Json

void Serialize::Details::archiveFields(Json::oarchive& archive, const Type& type, void* object)
{
    visit(archive.fields(), type, object);
}
