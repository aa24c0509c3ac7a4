// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Serializable.h>
#include <EditorModel/persistence/Serializer.h>

#include <QPointF>
#include <QString>

#include <map>
#include <memory>
#include <string>
#include <vector>

namespace StreamTest {

/// Notes every call, and writes nothing.
class Recorder : public Serialize::ISerializer, public Serialize::IFieldStream
{
public:
    std::vector<std::string> calls;
    std::map<std::string, const void*> addresses;

    void writePointer(const Serialize::ISerializable* object) override
    {
        calls.push_back("pointer " + (object ? object->GetNameInArchive() : std::string("null")));
    }

    Serialize::ISerializer& writeObject(const Serialize::ISerializable& object) override
    {
        calls.push_back("object " + object.GetNameInArchive());
        object.Serialize(*this);
        return *this;
    }

    Serialize::IFieldStream& stream() override { return *this; }

    void endItem(const Serialize::ItemRecord& item) override { note("endItem", item.index); }
    void beginItem(const Serialize::ItemRecord& item) override { note("beginItem", item.index); }
    void endSequence(const Serialize::CountRecord& sequence) override { note("endSequence", sequence.count); }
    void beginSequence(int* count) override { note("beginSequence", *count); }
    void endClass(const Serialize::ClassRecord& record) override
    {
        calls.push_back("endClass " + nameOf(record));
    }
    void beginClass(const Serialize::ClassRecord& record) override
    {
        calls.push_back("beginClass " + nameOf(record));
    }
    void field(const Serialize::FieldRecord& record) override
    {
        calls.push_back(std::string("field ") + record.name);
        addresses.emplace(record.name, record.value);
    }

    void value(std::shared_ptr<const Types::Image>* value) override
    {
        calls.push_back(*value ? "picture" : "no picture");
    }
    void value(QPointF* value) override
    {
        calls.push_back("point " + std::to_string(value->x()) + ' ' + std::to_string(value->y()));
    }
    void value(QString* value) override { calls.push_back("text " + value->toStdString()); }
    void value(std::string* value) override { calls.push_back("bytes " + *value); }
    void value(MTime* value) override { note("time", value->ms()); }
    void value(double* value) override { note("real", *value); }
    void value(qint64* value) override { note("int64", *value); }
    void value(quint32* value) override { note("uint32", *value); }
    void value(qint32* value) override { note("int32", *value); }
    void value(bool* value) override { calls.push_back(*value ? "true" : "false"); }

private:
    template <class T>
    void note(const char* what, T value)
    {
        calls.push_back(what + (' ' + std::to_string(value)));
    }

    /// With the class of the object that stands behind the record.
    static std::string nameOf(const Serialize::ClassRecord& record)
    {
        return record.name + (" of " + record.object->GetNameInArchive());
    }
};

} // namespace StreamTest
