// SPDX-License-Identifier: Apache-2.0
// A document for every class, in every form and route, against the objects that it was saved from. Stored
// data is for life: where a test fails, it is the class that goes back, and never the document that is saved
// anew.
#include "FieldTable.h"
#include "FrozenDocument.h"
#include "TextArchives.h"
#include "samples/Sample.h"
#include "tests/shared/FieldTexts.h"

#include <EditorModel/library/PersistentItem.h>
#include <EditorModel/services/Statistics.h>

#include <boost/archive/binary_iarchive.hpp>
#include <boost/archive/binary_oarchive.hpp>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <QRegularExpression>

#include <algorithm>
#include <map>
#include <sstream>

namespace {

using namespace GoldenTests;
using Testing::Dump;
using ::testing::IsEmpty;

using Roots = std::deque<const Serialize::ISerializable*>;

/// The one class that no document can name: it is stored by value, in a bare archive.
const std::string unregistered = "Statistics::Object";

const std::map<std::string, NamedSample>& classSamples()
{
    static const auto samples = [] {
        std::map<std::string, NamedSample> byName;
        for (const auto& list : {mediaSamples(), effectSamples(), librarySamples(), timelineSamples()}) {
            for (const NamedSample& sample : list)
                byName.emplace(sample.name, sample);
        }
        return byName;
    }();
    return samples;
}

std::vector<std::string> classNames()
{
    std::vector<std::string> names;
    for (const auto& entry : classSamples())
        names.push_back(entry.first);
    return names;
}

/// The roots are none where the document is refused.
Document::Graph loaded(const QByteArray& document)
{
    try {
        return graphOf(document);
    } catch (const Document::Error& error) {
        ADD_FAILURE() << "what people have stored is refused: " << error.what();
        return {};
    }
}

Roots rootsOf(const Document::Graph& graph)
{
    return {graph.roots().begin(), graph.roots().end()};
}

/// All objects in one text, so that what they share shows.
std::vector<std::string> linesOf(const Roots& roots)
{
    Dump dump;
    for (const auto* root : roots)
        dump("object", root);
    std::vector<std::string> lines;
    std::istringstream text(dump.text());
    for (std::string line; std::getline(text, line);)
        lines.push_back(line);
    return lines;
}

/// The line and what it stands in: the last line before it of each smaller indentation.
std::string placeOf(const std::vector<std::string>& lines, std::size_t index)
{
    if (index >= lines.size())
        return "nothing more";
    std::string place;
    std::size_t indentation = std::string::npos;
    for (std::size_t i = index + 1; i-- > 0;) {
        const std::size_t begin = lines[i].find_first_not_of(' ');
        if (begin < indentation) {
            place = lines[i].substr(begin) + (place.empty() ? "" : ", ") + place;
            indentation = begin;
        }
    }
    return place;
}

void expectFields(const std::string& name, const Roots& read, const Roots& stored)
{
    if (read.empty() && ::testing::Test::HasFailure())
        return; // a refused document was told already
    const std::vector<std::string> here = linesOf(read);
    const std::vector<std::string> there = linesOf(stored);
    const auto place = std::mismatch(there.begin(), there.end(), here.begin(), here.end());
    if (place.first == there.end() && place.second == here.end())
        return;
    const auto index = static_cast<std::size_t>(place.first - there.begin());
    ADD_FAILURE() << name << " is misread. The document holds\n  " << placeOf(there, index)
                  << "\nand what is read is\n  " << placeOf(here, index)
                  << "\nEverything that people have stored with such an object would lose that.";
}

void expectText(const std::string& name, const FrozenDocument& document, const QByteArray& written)
{
    const std::string difference = document.difference(written);
    if (difference.empty())
        return;
    ADD_FAILURE() << name << " is stored in another way than it was: " << difference
                  << ". Versions before this one would misread or refuse the new documents, and this one "
                     "the documents that there are.";
}

class ClassDocuments : public ::testing::TestWithParam<std::string>
{
protected:
    ClassDocuments() { classSamples().at(GetParam()).fill(m_sample); }

    Sample m_sample;
};

TEST_P(ClassDocuments, GiveBackEveryField)
{
    for (const Way& way : allWays) {
        SCOPED_TRACE(FrozenDocument::fileOf(GetParam(), way));
        const auto graph = loaded(FrozenDocument(GetParam(), way).bytes);
        expectFields(GetParam(), rootsOf(graph), m_sample.roots);
    }
}

TEST_P(ClassDocuments, AreWrittenAsTheyStand)
{
    for (const Way& way : allWays) {
        SCOPED_TRACE(FrozenDocument::fileOf(GetParam(), way));
        expectText(GetParam(), FrozenDocument(GetParam(), way), documentOf(m_sample.roots, way));
    }
}

TEST_P(ClassDocuments, AreWrittenAgainAsTheyWereRead)
{
    for (const Way& way : allWays) {
        SCOPED_TRACE(FrozenDocument::fileOf(GetParam(), way));
        const FrozenDocument document(GetParam(), way);
        const auto graph = loaded(document.bytes);
        expectText(GetParam(), document, documentOf(rootsOf(graph), way));
    }
}

/// What each field holds, without the numbers of objects, which tell nothing about a field.
std::vector<std::string> fieldsOf(const Serialize::ISerializable& object)
{
    static const QRegularExpression number(" #\\d+$", QRegularExpression::MultilineOption);
    std::vector<std::string> fields;
    for (const auto& field : Testing::fieldTexts(object))
        fields.push_back(QString::fromStdString(field.second).remove(number).toStdString());
    return fields;
}

/// The values of a field in all objects of the sample.
std::vector<std::vector<std::string>> columnsOf(const Roots& objects)
{
    std::vector<std::vector<std::string>> columns;
    for (const auto* object : objects) {
        const std::vector<std::string> fields = fieldsOf(*object);
        columns.resize(fields.size());
        for (std::size_t i = 0; i != fields.size(); ++i)
            columns[i].push_back(fields[i]);
    }
    return columns;
}

TEST_P(ClassDocuments, HaveAValueOfItsOwnInEveryField)
{
    const std::unique_ptr<Serialize::ISerializable> untouched(Serialize::findCreator(GetParam())->Create());
    const std::vector<StoredField> table = storedFields().at(GetParam());
    const auto columns = columnsOf(m_sample.roots);
    const auto defaults = columnsOf(Roots(m_sample.roots.size(), untouched.get()));
    ASSERT_EQ(columns.size(), table.size());
    for (std::size_t i = 0; i != columns.size(); ++i) {
        EXPECT_NE(columns[i], defaults[i]) << "nothing shows whether \"" << table[i].key << "\" is stored";
        for (std::size_t other = 0; other != i; ++other) {
            EXPECT_NE(columns[i], columns[other])
                << "nothing tells \"" << table[i].key << "\" from \"" << table[other].key << '"';
        }
    }
}

INSTANTIATE_TEST_SUITE_P(Stored, ClassDocuments, ::testing::ValuesIn(classNames()), [](const auto& instance) {
    std::string name = instance.param;
    std::replace(name.begin(), name.end(), ':', '_');
    return name;
});

TEST(FrozenDocuments, AreThereForEveryClassInEveryForm)
{
    std::set<std::string> files = FrozenDocument::files();
    for (const auto& entry : storedFields()) {
        const std::string& name = entry.first;
        EXPECT_TRUE(name == unregistered || classSamples().count(name) == 1)
            << "no test reads the documents with a " << name;
        for (const Way& way : allWays) {
            const std::string file = FrozenDocument::fileOf(name, way);
            const std::size_t expected = name == unregistered && way.route == Document::Stream ? 0 : 1;
            EXPECT_EQ(files.erase(file), expected)
                << file << " is missing: write it by hand, from the table of fields";
        }
    }
    for (const Way& way : allWays) {
        files.erase(FrozenDocument::fileOf(wholeProject().name, way));
        files.erase(FrozenDocument::fileOf(sharedPicture().name, way));
    }
    EXPECT_THAT(files, IsEmpty()) << "documents that no test reads";
}

/// Not every document comes back to the same text: sets and maps of objects have the order of addresses, and
/// pictures are packed anew.
void expectToBeKept(const NamedSample& stored)
{
    Sample sample;
    stored.fill(sample);
    for (const Way& way : allWays) {
        SCOPED_TRACE(FrozenDocument::fileOf(stored.name, way));
        const auto first = loaded(FrozenDocument(stored.name, way).bytes);
        expectFields(stored.name, rootsOf(first), sample.roots);
        const auto second = loaded(documentOf(rootsOf(first), way));
        expectFields(stored.name, rootsOf(second), sample.roots);
    }
}

TEST(ProjectDocument, GivesBackEverythingThatItHoldsAlsoWhenItIsWrittenAgain)
{
    expectToBeKept(wholeProject());
}

TEST(ProjectDocument, IsWrittenAsItStands)
{
    const NamedSample project = wholeProject();
    Sample sample;
    project.fill(sample);
    for (const Way& way : allWays) {
        SCOPED_TRACE(FrozenDocument::fileOf(project.name, way));
        expectText(project.name, FrozenDocument(project.name, way), documentOf(sample.roots, way));
    }
}

TEST(PictureDocument, GivesBackEveryPixelAlsoWhenItIsWrittenAgain)
{
    expectToBeKept(sharedPicture());
}

TEST(PictureDocument, GivesBackOnePictureToAllThatShareIt)
{
    for (const Way& way : allWays) {
        SCOPED_TRACE(FrozenDocument::fileOf(sharedPicture().name, way));
        const auto graph = loaded(FrozenDocument(sharedPicture().name, way).bytes);
        ASSERT_EQ(graph.roots().size(), 2u);
        using namespace EditorCollection;
        const auto* const theme = dynamic_cast<PersistentItem<Theme::Object>*>(graph.roots()[0]);
        const auto* const quiz = dynamic_cast<PersistentItem<Quiz::Preset>*>(graph.roots()[1]);
        ASSERT_TRUE(theme && quiz && theme->preview);
        EXPECT_EQ(theme->preview, quiz->preview);
    }
}

// Statistics, which have no fields: what counts is that they go where others would.

TEST(StatisticsDocuments, InXmlAreWrittenAsTheyStandAndRead)
{
    const FrozenDocument document(unregistered, {Document::Xml, Document::Archive, "XmlArchive"});
    expectText(unregistered, document, QByteArray::fromStdString(saved(Statistics::Object())));
    Statistics::Object content;
    EXPECT_NO_THROW(load(document.bytes.toStdString(), content));
}

TEST(StatisticsDocuments, InJsonAreWrittenAsTheyStandAndRead)
{
    const FrozenDocument document(unregistered, {Document::Json, Document::Archive, "JsonArchive"});
    expectText(unregistered, document, QByteArray::fromStdString(savedAsJson(Statistics::Object()).dump()));
    Statistics::Object content;
    EXPECT_NO_THROW(loadJson(document.bytes.toStdString(), content));
}

TEST(StatisticsDocuments, InBinaryAreWrittenAsTheyStandAndRead)
{
    const FrozenDocument document(unregistered, {Document::Binary, Document::Archive, "BinaryArchive"});
    std::stringstream stream;
    {
        const Statistics::Object content;
        boost::archive::binary_oarchive archive(stream);
        archive << BOOST_SERIALIZATION_NVP(content);
    }
    expectText(unregistered, document, QByteArray::fromStdString(stream.str()));

    std::istringstream stored(document.bytes.toStdString());
    boost::archive::binary_iarchive archive(stored);
    Statistics::Object content;
    EXPECT_NO_THROW(archive >> BOOST_SERIALIZATION_NVP(content));
    EXPECT_EQ(stored.peek(), std::istringstream::traits_type::eof()) << "bytes of the object were left";
}

} // namespace
