// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "FieldTable.h"

#include <EditorModel/persistence/Serializer.h>

namespace GoldenTests {

/// A field stream that keeps the keys of one object and what stands under them. It takes part in both
/// directions, and stores nothing; a reader finds one item in every container that the object has empty.
class RecordingStream final : public Serialize::IFieldStream
{
public:
    explicit RecordingStream(bool furnishes) : m_furnishes(furnishes) {}

    /// The fields of the outermost object. A container without items is a "sequence" of nothing.
    std::vector<StoredField> fields() const;

    void pointer(bool isNull) { set("pointer", isNull ? "null" : "set"); }
    /// The class that begins next is an object held by value, and no base.
    void object() { m_isObject = true; }

    void endItem(const Serialize::ItemRecord& item) override;
    void beginItem(const Serialize::ItemRecord& item) override;
    void endSequence(const Serialize::CountRecord& sequence) override;
    void beginSequence(int* count) override;
    void endClass(const Serialize::ClassRecord& record) override;
    void beginClass(const Serialize::ClassRecord& record) override;
    void field(const Serialize::FieldRecord& record) override;

    void value(std::shared_ptr<const Types::Image>* value) override;
    void value(QPointF* value) override;
    void value(QString* value) override;
    void value(std::string* value) override;
    void value(MTime* value) override;
    void value(double* value) override;
    void value(qint64* value) override;
    void value(quint32* value) override;
    void value(qint32* value) override;
    void value(bool* value) override;

private:
    using Scope = std::vector<StoredField>;

    /// The fields of a class or an item, or the items of a container.
    Scope& scope();
    /// What stands under the key announced last.
    void set(const std::string& kind, const std::string& value);
    Scope closed();

    const bool m_furnishes;
    bool m_isObject = false;
    std::vector<Scope> m_open;
    Scope m_fields;
};

/// The values of an object in one text, key by key.
std::string valueOf(const std::vector<StoredField>& fields);

/// What `object` writes.
std::vector<StoredField> written(const Serialize::ISerializable& object);

/// What `object` asks for when it is read; it is left with one item, of defaults and null pointers, in every
/// container.
std::vector<StoredField> askedFor(Serialize::ISerializable& object);

} // namespace GoldenTests
