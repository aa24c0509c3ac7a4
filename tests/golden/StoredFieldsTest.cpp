// SPDX-License-Identifier: Apache-2.0
// Every persistent class against the table of what documents hold. The table is for life: where a test fails,
// it is the class that goes back.
#include "FieldRecorder.h"
#include "FieldTable.h"
#include "TextArchives.h"

#include <EditorModel/EditorModel.h>

#include <QXmlStreamReader>

#include <gmock/gmock.h>

#include <algorithm>
#include <memory>
#include <string>
#include <vector>

namespace {

using namespace GoldenTests;
using ::testing::UnorderedElementsAreArray;

const std::string unregistered = "Statistics::Object";
const std::string base = "base ";
const std::string byValue = "object ";

std::unique_ptr<Serialize::ISerializable> defaultOf(const std::string& name)
{
    if (name == unregistered)
        return std::make_unique<Statistics::Object>();
    const Serialize::BaseCreator* const creator = Serialize::findCreator(name);
    return std::unique_ptr<Serialize::ISerializable>(creator ? creator->Create() : nullptr);
}

std::string wordsFor(const std::vector<StoredField>& fields, std::size_t place)
{
    if (place >= fields.size())
        return "nothing";
    return '"' + fields[place].key + "\" (" + fields[place].kind + ')';
}

/// Names the first field that differs, and what is lost by it.
void expectStored(const std::string& name, const std::vector<StoredField>& stored,
                  const std::vector<StoredField>& found)
{
    const std::size_t count = std::max(stored.size(), found.size());
    for (std::size_t i = 0; i != count; ++i) {
        const std::string there = wordsFor(stored, i);
        const std::string here = wordsFor(found, i);
        if (there == here)
            continue;
        ADD_FAILURE() << name << ": field " << i + 1 << " is " << here << ", and documents hold " << there
                      << " there. Every project, package and clipboard with a " << name
                      << " would be misread or refused from this field on.";
        return;
    }
}

std::vector<StoredField> asWithoutItems(std::vector<StoredField> fields)
{
    for (StoredField& field : fields) {
        if (field.kind.rfind("map of ", 0) == 0 || field.kind.rfind("sequence of ", 0) == 0)
            field.kind = "sequence";
    }
    return fields;
}

/// What the table says of a default object's field; an object held by value is as its own rows say.
std::string defaultIn(const FieldTable& table, const StoredField& field)
{
    for (const std::string& holds : {byValue, base}) {
        if (field.kind.rfind(holds, 0) != 0 || field.value != "default")
            continue;
        std::vector<StoredField> held = table.at(field.kind.substr(holds.size()));
        for (StoredField& inner : held)
            inner.value = defaultIn(table, inner);
        return valueOf(held);
    }
    return field.value;
}

/// The keys as tags: a base stands under its class's name, and a tag takes no ':'.
std::vector<StoredField> asTags(const std::vector<StoredField>& fields)
{
    std::vector<StoredField> tags;
    for (const StoredField& field : fields) {
        const bool isBase = field.kind.rfind(base, 0) == 0;
        tags.push_back({isBase ? field.kind.substr(base.size()) : field.key, "tag"});
        std::replace(tags.back().key.begin(), tags.back().key.end(), ':', '.');
    }
    return tags;
}

/// The elements right under the content of a document.
std::vector<StoredField> tagsIn(const std::string& document)
{
    constexpr int depthOfFields = 3;
    std::vector<StoredField> tags;
    int depth = 0;
    QXmlStreamReader xml(QByteArray::fromStdString(document));
    while (!xml.atEnd()) {
        xml.readNext();
        if (xml.isStartElement() && ++depth == depthOfFields)
            tags.push_back({xml.name().toString().toStdString(), "tag"});
        else if (xml.isEndElement())
            --depth;
    }
    EXPECT_FALSE(xml.hasError()) << xml.errorString().toStdString();
    return tags;
}

std::string archiveOf(const Serialize::ISerializable& object)
{
    if (const auto* const known = dynamic_cast<const Statistics::Object*>(&object))
        return saved(*known);
    return saved(&object);
}

TEST(StoredFields, AreKnownOfEveryClassOfTheLibrary)
{
    std::vector<std::string> names = Serialize::registeredNames();
    names.push_back(unregistered);
    std::vector<std::string> known;
    for (const auto& entry : storedFields())
        known.push_back(entry.first);
    EXPECT_EQ(known.size(), 61u);
    EXPECT_THAT(known, UnorderedElementsAreArray(names))
        << "a new class is entered in fields.tsv by hand, with what its documents are to hold for good; a "
           "name that has gone takes every document with such an object with it";
}

TEST(StoredFields, AreWrittenByADefaultObjectAsTheyStand)
{
    for (const auto& [name, fields] : storedFields()) {
        const auto object = defaultOf(name);
        ASSERT_TRUE(object) << name;
        expectStored(name, asWithoutItems(fields), written(*object));
    }
}

TEST(StoredFields, AreWrittenByADefaultObjectWithTheirDefaults)
{
    const FieldTable table = storedFields();
    for (const auto& [name, fields] : table) {
        const auto untouched = defaultOf(name);
        ASSERT_TRUE(untouched) << name;
        const std::vector<StoredField> found = written(*untouched);
        ASSERT_EQ(found.size(), fields.size()) << name;
        for (std::size_t i = 0; i != fields.size(); ++i) {
            EXPECT_EQ(found[i].value, defaultIn(table, fields[i]))
                << name << ": a default object writes another value under \"" << fields[i].key
                << "\". Documents of older versions hold the table's value wherever nobody set one, and "
                << "clients leave the field alone where they count on it.";
        }
    }
}

TEST(StoredFields, AreAskedForWhereTheyStand)
{
    for (const auto& [name, fields] : storedFields()) {
        const auto object = defaultOf(name);
        ASSERT_TRUE(object) << name;
        expectStored(name, fields, askedFor(*object));
    }
}

TEST(StoredFields, AreWrittenWithTheirItemsAsTheyStand)
{
    for (const auto& [name, fields] : storedFields()) {
        const auto object = defaultOf(name);
        ASSERT_TRUE(object) << name;
        askedFor(*object);
        expectStored(name, fields, written(*object));
    }
}

TEST(StoredFields, AreTheTagsOfTheXmlArchive)
{
    for (const auto& [name, fields] : storedFields()) {
        const auto object = defaultOf(name);
        ASSERT_TRUE(object) << name;
        expectStored(name, asTags(fields), tagsIn(archiveOf(*object)));
    }
}

} // namespace
