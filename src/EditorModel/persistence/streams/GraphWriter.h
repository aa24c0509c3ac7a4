// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/streams/Forms.h>
#include <EditorModel/persistence/streams/Nesting.h>
#include <EditorModel/persistence/streams/Streams.h>

#include <unordered_map>

namespace Serialize::Details {

/// Numbers the objects of a graph in the order in which they are met, and writes each once.
class GraphWriter final : public StreamWriter, private IFieldStream
{
public:
    explicit GraphWriter(std::unique_ptr<FormWriter> form) : m_form(std::move(form)) {}

    void writePointer(const ISerializable* object) override;
    ISerializer& writeObject(const ISerializable& object) override;
    IFieldStream& stream() override { return *this; }
    void finish() override;

private:
    struct Known
    {
        quint64 id;
        bool byPointer;
    };

    void field(const FieldRecord& record) override { m_nesting.field(record.name); }
    void beginClass(const ClassRecord& record) override;
    void endClass(const ClassRecord& record) override;
    void beginSequence(int* count) override;
    void endSequence(const CountRecord& sequence) override;
    void beginItem(const ItemRecord& item) override;
    void endItem(const ItemRecord& item) override;

    void value(std::shared_ptr<const Types::Image>* picture) override;
    void value(QPointF* value) override { m_form->write(m_nesting.takeKey(), *value); }
    void value(QString* value) override;
    void value(std::string* value) override { m_form->write(m_nesting.takeKey(), *value); }
    void value(MTime* value) override { m_form->write(m_nesting.takeKey(), *value); }
    void value(double* value) override { m_form->write(m_nesting.takeKey(), *value); }
    void value(qint64* value) override { m_form->write(m_nesting.takeKey(), *value); }
    void value(quint32* value) override { m_form->write(m_nesting.takeKey(), *value); }
    void value(qint32* value) override { m_form->write(m_nesting.takeKey(), *value); }
    void value(bool* value) override { m_form->write(m_nesting.takeKey(), *value); }

    void writeNew(const ISerializable& object, bool byPointer);
    quint64 number(const Identity& identity, const std::string& className);

    const std::unique_ptr<FormWriter> m_form;
    Nesting m_nesting;
    std::unordered_map<Identity, Known, IdentityHash> m_objects;
    /// Held, so that no other picture comes to stand at the address of one that was written.
    std::unordered_map<std::shared_ptr<const Types::Image>, quint64> m_pictures;
    quint64 m_lastId = 0;
    /// The class that begins next is that of an object behind a pointer.
    bool m_behindPointer = false;
};

} // namespace Serialize::Details
