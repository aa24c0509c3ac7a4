// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/streams/Forms.h>
#include <EditorModel/persistence/streams/Nesting.h>
#include <EditorModel/persistence/streams/Streams.h>

#include <optional>
#include <unordered_map>

namespace Serialize::Details {

/// Makes the objects of a document and finds them again by their numbers.
class GraphReader final : public StreamReader, private IFieldStream
{
public:
    explicit GraphReader(std::unique_ptr<FormReader> form) : m_form(std::move(form)) {}

    void readPointer(ISerializable*& object) override;
    IDeserializer& readObject(ISerializable& object) override;
    IFieldStream& stream() override { return *this; }
    void finish() override;
    std::string position() const override { return m_form->position(); }
    const std::vector<ISerializable*>& made() const override { return m_made; }

private:
    void field(const FieldRecord& record) override { m_nesting.field(record.name); }
    void beginClass(const ClassRecord& record) override;
    void endClass(const ClassRecord& record) override;
    void beginSequence(int* count) override;
    void endSequence(const CountRecord& sequence) override;
    void beginItem(const ItemRecord& item) override;
    void endItem(const ItemRecord& item) override;

    void value(std::shared_ptr<const Types::Image>* picture) override;
    void value(QPointF* value) override { m_form->read(m_nesting.takeKey(), *value); }
    void value(QString* value) override;
    void value(std::string* value) override { m_form->read(m_nesting.takeKey(), *value); }
    void value(MTime* value) override { m_form->read(m_nesting.takeKey(), *value); }
    void value(double* value) override { m_form->read(m_nesting.takeKey(), *value); }
    void value(qint64* value) override { m_form->read(m_nesting.takeKey(), *value); }
    void value(quint32* value) override { m_form->read(m_nesting.takeKey(), *value); }
    void value(qint32* value) override { m_form->read(m_nesting.takeKey(), *value); }
    void value(bool* value) override { m_form->read(m_nesting.takeKey(), *value); }

    ISerializable* readNew(Mark mark);
    void readFields(ISerializable& object);
    void beginMarked(const Mark& mark, const ClassRecord& record);
    void note(quint64 id, ISerializable* object, std::shared_ptr<const Types::Image> picture);
    ISerializable* known(quint64 id) const;

    /// One of the two.
    struct Known
    {
        ISerializable* object;
        std::shared_ptr<const Types::Image> picture;
    };

    const std::unique_ptr<FormReader> m_form;
    Nesting m_nesting;
    std::unordered_map<quint64, Known> m_known;
    std::vector<ISerializable*> m_made;
    /// What was read of an object behind a pointer, whose class begins next.
    std::optional<Mark> m_opened;
    /// How many objects and parts have begun.
    std::size_t m_begun = 0;
};

} // namespace Serialize::Details
