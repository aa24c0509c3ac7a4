// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/streams/GraphReader.h>

#include <EditorModel/persistence/ConstructionLog.h>
#include <EditorModel/persistence/Serializable.h>
#include <EditorModel/persistence/Utf8.h>
#include <EditorModel/persistence/archives/Pictures.h>
#include <EditorModel/types/Image.h>

#include <new>
#include <stdexcept>
#include <utility>

namespace Serialize::Details {
namespace {

std::string describe(const Mark& mark)
{
    switch (mark.kind) {
    case Mark::Null:
        return "null";
    case Mark::Reference:
        return "a reference to object " + std::to_string(mark.id);
    case Mark::Object:
        return "an object of the class " + inQuotes(mark.className);
    case Mark::Part:
        return "the part of the base " + inQuotes(mark.className);
    }
    return {};
}

void requireKind(const Mark& mark, Mark::Kind kind, const std::string& expected)
{
    if (mark.kind != kind)
        throwUnexpected(expected, describe(mark));
}

} // namespace

void GraphReader::readPointer(ISerializable*& object)
{
    Mark mark = m_form->mark(m_nesting.takeKey());
    if (mark.kind == Mark::Null) {
        object = nullptr;
    } else if (mark.kind == Mark::Reference) {
        object = known(mark.id);
    } else {
        requireKind(mark, Mark::Object, "a pointer");
        object = readNew(std::move(mark));
    }
}

ISerializable* GraphReader::readNew(Mark mark)
{
    ISerializable* const object = ConstructionLog::makeNamed(mark.className);
    if (!object)
        throw std::bad_alloc();
    m_made.push_back(object);
    m_opened = std::move(mark);
    readFields(*object);
    return object;
}

IDeserializer& GraphReader::readObject(ISerializable& object)
{
    readFields(object);
    return *this;
}

void GraphReader::readFields(ISerializable& object)
{
    const std::size_t before = m_begun;
    const std::size_t depth = m_nesting.depth();
    object.Deserialize(*this);
    if (m_begun == before || m_nesting.depth() != depth)
        throw std::logic_error("the class " + inQuotes(object.GetNameInArchive()) +
                               " does not read itself as one class");
}

void GraphReader::beginClass(const ClassRecord& record)
{
    if (!record.name)
        throw std::logic_error("a class without a name");
    if (m_opened)
        beginMarked(*std::exchange(m_opened, std::nullopt), record);
    else
        beginMarked(m_form->mark(m_nesting.takeKey()), record);
}

void GraphReader::beginMarked(const Mark& mark, const ClassRecord& record)
{
    const Identity identity(record.object);
    const bool isPart = !identity.address || m_nesting.isOpen(identity);
    if (isPart)
        requireKind(mark, Mark::Part, "the part of the base " + inQuotes(record.name));
    else
        requireKind(mark, Mark::Object, "an object of the class " + inQuotes(record.name));
    if (mark.className != record.name)
        throwUnexpected("the class " + inQuotes(record.name), inQuotes(mark.className));
    // Known before its fields are read: they may point back at it.
    if (!isPart)
        note(mark.id, const_cast<ISerializable*>(record.object), nullptr);
    m_nesting.beginClass(record.name, identity);
    ++m_begun;
}

void GraphReader::endClass(const ClassRecord& record)
{
    m_nesting.endClass(record.name ? record.name : "");
    m_form->endObject();
}

void GraphReader::beginSequence(int* count)
{
    const int stored = m_form->beginSequence(m_nesting.takeKey());
    m_nesting.beginSequence(stored);
    *count = stored;
}

void GraphReader::endSequence(const CountRecord&)
{
    m_nesting.endSequence();
    m_form->endSequence();
}

void GraphReader::beginItem(const ItemRecord& item)
{
    m_nesting.beginItem(item.index);
    m_form->beginItem();
}

void GraphReader::endItem(const ItemRecord& item)
{
    m_nesting.endItem(item.index);
    m_form->endItem();
}

void GraphReader::value(std::shared_ptr<const Types::Image>* picture)
{
    const Mark mark = m_form->mark(m_nesting.takeKey());
    if (mark.kind == Mark::Null) {
        picture->reset();
        return;
    }
    if (mark.kind == Mark::Reference) {
        const auto entry = m_known.find(mark.id);
        if (entry == m_known.end() || !entry->second.picture)
            throwUnexpected("a picture", "a reference to " + std::to_string(mark.id) + ", which is none");
        *picture = entry->second.picture;
        return;
    }
    requireKind(mark, Mark::Object, "a picture");
    if (mark.className != pictureClass)
        throwUnexpected("a picture", describe(mark));
    const auto image = std::make_shared<const Types::Image>(pixmapOfPng(m_form->png()));
    note(mark.id, nullptr, image);
    *picture = image;
}

void GraphReader::value(QString* value)
{
    std::string utf8;
    m_form->read(m_nesting.takeKey(), utf8);
    *value = textOfUtf8(utf8);
}

void GraphReader::note(quint64 id, ISerializable* object, std::shared_ptr<const Types::Image> picture)
{
    if (!m_known.emplace(id, Known{object, std::move(picture)}).second)
        throw std::runtime_error("the number " + std::to_string(id) + " stands for two objects");
}

ISerializable* GraphReader::known(quint64 id) const
{
    const auto entry = m_known.find(id);
    if (entry == m_known.end() || !entry->second.object)
        throwUnexpected("an object", "a reference to " + std::to_string(id) + ", which is none read before");
    return entry->second.object;
}

void GraphReader::finish()
{
    m_nesting.finish();
    m_form->finish();
}

} // namespace Serialize::Details
