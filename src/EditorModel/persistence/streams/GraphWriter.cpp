// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/streams/GraphWriter.h>

#include <EditorModel/persistence/Serializable.h>
#include <EditorModel/persistence/Type.h>
#include <EditorModel/persistence/Unregistered.h>
#include <EditorModel/persistence/archives/Pictures.h>
#include <EditorModel/types/Image.h>

#include <stdexcept>
#include <utility>

namespace Serialize::Details {
namespace {

/// A class that has no name of its own answers with that of its base, and would come back as its base.
void requireRegistered(const ISerializable& object)
{
    const std::string name = object.GetNameInArchive();
    const Type* const type = findType(name);
    if (!findCreator(name) || (type && type->info != typeid(object)))
        throwUnregistered();
}

} // namespace

void GraphWriter::writePointer(const ISerializable* object)
{
    if (!object) {
        m_form->null(m_nesting.takeKey());
        return;
    }
    const auto known = m_objects.find(Identity(object));
    if (known != m_objects.end()) {
        m_form->reference(m_nesting.takeKey(), known->second.id);
        return;
    }
    requireRegistered(*object);
    writeNew(*object, true);
}

ISerializer& GraphWriter::writeObject(const ISerializable& object)
{
    writeNew(object, false);
    return *this;
}

void GraphWriter::writeNew(const ISerializable& object, bool byPointer)
{
    const quint64 before = m_lastId;
    const std::size_t depth = m_nesting.depth();
    m_behindPointer = byPointer;
    object.Serialize(*this);
    if (m_lastId == before || m_nesting.depth() != depth)
        throw std::logic_error("the class " + inQuotes(object.GetNameInArchive()) +
                               " does not write itself as one class");
}

void GraphWriter::beginClass(const ClassRecord& record)
{
    if (!record.name)
        throw std::logic_error("a class without a name");
    const Identity identity(record.object);
    const std::string key = m_nesting.takeKey();
    if (!identity.address || m_nesting.isOpen(identity))
        m_form->beginPart(key, record.name);
    else
        m_form->beginObject(key, record.name, number(identity, record.name));
    m_nesting.beginClass(record.name, identity);
}

quint64 GraphWriter::number(const Identity& identity, const std::string& className)
{
    const Known object{++m_lastId, std::exchange(m_behindPointer, false)};
    const auto place = m_objects.emplace(identity, object);
    if (!place.second) {
        // A reader has made an object of its own for that pointer already.
        if (place.first->second.byPointer)
            throw std::runtime_error("an object of the class " + inQuotes(className) +
                                     " is held by value, but a pointer to it was written before");
        place.first->second = object;
    }
    return object.id;
}

void GraphWriter::endClass(const ClassRecord& record)
{
    m_nesting.endClass(record.name ? record.name : "");
    m_form->endObject();
}

void GraphWriter::beginSequence(int* count)
{
    const std::string key = m_nesting.takeKey();
    m_nesting.beginSequence(*count);
    m_form->beginSequence(key, *count);
}

void GraphWriter::endSequence(const CountRecord&)
{
    m_nesting.endSequence();
    m_form->endSequence();
}

void GraphWriter::beginItem(const ItemRecord& item)
{
    m_nesting.beginItem(item.index);
    m_form->beginItem();
}

void GraphWriter::endItem(const ItemRecord& item)
{
    m_nesting.endItem(item.index);
    m_form->endItem();
}

void GraphWriter::value(std::shared_ptr<const Types::Image>* picture)
{
    const std::string key = m_nesting.takeKey();
    if (!*picture) {
        m_form->null(key);
        return;
    }
    const auto known = m_pictures.find(*picture);
    if (known != m_pictures.end()) {
        m_form->reference(key, known->second);
        return;
    }
    const QByteArray png = pngOf(**picture);
    m_pictures.emplace(*picture, ++m_lastId);
    m_form->picture(key, m_lastId, png);
}

void GraphWriter::value(QString* value)
{
    m_form->write(m_nesting.takeKey(), value->toStdString());
}

void GraphWriter::finish()
{
    m_nesting.finish();
    m_form->finish();
}

} // namespace Serialize::Details
