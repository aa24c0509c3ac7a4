// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/ObjectTracker.h>
#include <EditorModel/persistence/Unregistered.h>

#include <set>
#include <stdexcept>

namespace boost::archive {

using namespace Serialize;

class object_tracker::Walker final : public Fields
{
public:
    Walker() : Fields(false) {}

    std::map<const void*, Record> m_records;

private:
    /// A number, a text, an enumeration. It is looked up only: an entry for each would say nothing more.
    void onScalar(const Key&, const Scalar& value, const void* address) override
    {
        if (std::holds_alternative<std::shared_ptr<const Types::Image>*>(value))
            return;
        const auto found = m_records.find(address);
        if (address && found != m_records.end() && found->second.saved && found->second.kind == ByPointer)
            throw std::runtime_error("Reference to object on heap is not allowed");
    }

    void onObject(const Key&, const Type& type, void* object) override { walkValue(type, object); }
    void onContainer(const Key&, const Type& type, void* container) override { walkValue(type, container); }

    void walkValue(const Type& type, void* object)
    {
        Record& record = m_records[object];
        if (record.kind == NotSeen) {
            record.kind = ByReference;
        } else if (record.saved) {
            throw std::runtime_error(record.kind == ByReference
                                         ? "Object adressed by reference was already serialized by reference"
                                         : "Object adressed by reference was already serialized by pointer");
        }
        m_walked.emplace(object, &type);
        Details::visit(*this, type, object);
        record.saved = true;
    }

    void onBase(const Key& key, const Type& type, void* object) override { onObject(key, type, object); }

    void onPointer(const Key&, const PointerField& field) override
    {
        const Pointee pointee = field.access.get(field);
        Record& record = m_records[pointee.object];
        if (record.kind == NotSeen) {
            record.kind = ByPointer;
            const ISerializable* const root = field.access.root(field);
            record.deleter = [root] { delete root; };
        }
        if (pointee.object && !pointee.type)
            Serialize::Details::throwUnregistered();
        // Whatever was met at this address before is known, as in any archive.
        if (pointee.object && m_walked.emplace(pointee.object, pointee.type).second)
            Details::visit(*this, *pointee.type, pointee.object);
        record.saved = true;
    }

    /// The entry of a map is a copy that lives for this call.
    void onEntry(const Type& pair, void* entry) override { Details::visit(*this, pair, entry); }

    int onBeginSequence(SequenceKind, int count) override { return count; }
    void onBeginItem(int) override {}
    void onEndItem(int) override {}
    void onEndSequence(int) override {}
    void onBinary(QByteArray&, int) override {}
    std::shared_ptr<const Types::Image> onShare(const Types::Image*) override { return nullptr; }

    std::set<std::pair<const void*, const Type*>> m_walked;
};

object_tracker::object_tracker() : m_walker(std::make_unique<Walker>()) {}

object_tracker::~object_tracker() = default;

const std::map<const void*, object_tracker::Record>& object_tracker::records() const
{
    return m_walker->m_records;
}

void object_tracker::deleteAll()
{
    const auto records = std::exchange(m_walker->m_records, {});
    for (const auto& entry : records) {
        if (entry.second.deleter)
            entry.second.deleter();
    }
}

Fields& object_tracker::fields()
{
    return *m_walker;
}

} // namespace boost::archive

namespace Serialize::Details {

void archiveFields(boost::archive::object_tracker& archive, const Type& type, void* object)
{
    visit(archive.fields(), type, object);
}

} // namespace Serialize::Details
