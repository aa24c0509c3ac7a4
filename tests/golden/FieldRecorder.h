// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "FieldTable.h"

#include <EditorModel/persistence/Serializer.h>

namespace GoldenTests {

/// A field stream that keeps the keys of one object and what stands under them, and no value. It takes part
/// in both directions; a reader finds one item in every container that the object has empty.
class KindStream final : public Serialize::IFieldStream
{
public:
    explicit KindStream(bool furnishes) : m_furnishes(furnishes) {}

    /// The fields of the outermost object. A container without items is a "sequence" of nothing.
    std::vector<StoredField> fields() const;

    void pointer() { setKind("pointer"); }
    /// The class that begins next is an object held by value, and no base.
    void object() { m_isObject = true; }

    void endItem(const Serialize::ItemRecord& item) override;
    void beginItem(const Serialize::ItemRecord& item) override;
    void endSequence(const Serialize::CountRecord& sequence) override;
    void beginSequence(int* count) override;
    void endClass(const Serialize::ClassRecord& record) override;
    void beginClass(const Serialize::ClassRecord& record) override;
    void field(const Serialize::FieldRecord& record) override;

    void value(std::shared_ptr<const Types::Image>*) override { setKind("picture"); }
    void value(QPointF*) override { setKind("point"); }
    void value(QString*) override { setKind("QString"); }
    void value(std::string*) override { setKind("string"); }
    void value(MTime*) override { setKind("time"); }
    void value(double*) override { setKind("double"); }
    void value(qint64*) override { setKind("int64"); }
    void value(quint32*) override { setKind("uint32"); }
    void value(qint32*) override { setKind("int32"); }
    void value(bool*) override { setKind("bool"); }

private:
    using Scope = std::vector<StoredField>;

    /// The fields of a class or an item, or the items of a container.
    Scope& scope();
    void setKind(const std::string& kind);
    Scope closed();

    const bool m_furnishes;
    bool m_isObject = false;
    std::vector<Scope> m_open;
    Scope m_fields;
};

/// What `object` writes.
std::vector<StoredField> written(const Serialize::ISerializable& object);

/// What `object` asks for when it is read; it is left with one item, of defaults and null pointers, in every
/// container.
std::vector<StoredField> askedFor(Serialize::ISerializable& object);

} // namespace GoldenTests
