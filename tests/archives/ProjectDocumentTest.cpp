// SPDX-License-Identifier: Apache-2.0
// Whole projects through every form and both routes.
#include <boost/archive/binary_iarchive.hpp>
#include <boost/archive/binary_oarchive.hpp>

#include "tests/archives/CutDocuments.h"
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FullProject.h"
#include "tests/shared/LiveAllocations.h"
#include "tests/shared/TimelineComparison.h"

#include <EditorModel/persistence/Json.h>
#include <EditorModel/persistence/ObjectTracker.h>
#include <EditorModel/persistence/Serializer.h>

#include <boost/serialization/nvp.hpp>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <sstream>
#include <typeinfo>
#include <utility>
#include <vector>

namespace {

using boost::archive::object_tracker;
using boost::serialization::make_nvp;
using nlohmann::json;
using ::testing::ElementsAre;
using Testing::FullProject;
using ::testing::IsEmpty;
using Testing::liveAllocations;
using Testing::projectDifferences;

/// The objects with a deleter of their own.
std::size_t deleterCount(const object_tracker& tracker)
{
    const auto& records = tracker.records();
    return std::size_t(std::count_if(records.begin(), records.end(), [](const auto& record) {
        return record.first && record.second.deleter;
    }));
}

class ProjectDocument : public ::testing::TestWithParam<Way>
{
protected:
    const Way& way() const { return GetParam(); }

    QByteArray document() const { return documentOf({&m_project.content}, way()); }

    void expectSame(const Project::Content& stored, const Project::Content* loaded) const
    {
        ASSERT_NE(loaded, nullptr);
        EXPECT_THAT(projectDifferences(stored, *loaded, way().wrapsTimes()), IsEmpty());
    }

    FullProject m_project;
};

INSTANTIATE_TEST_SUITE_P(Ways, ProjectDocument, ::testing::ValuesIn(allWays),
                         [](const auto& instance) { return std::string(instance.param.name); });

TEST_P(ProjectDocument, AProjectComesBackWithAllThatItNames)
{
    m_project.setFieldsThatAreNotStored();
    const auto graph = graphOf(document());
    expectSame(m_project.content, graph.rootAs<Project::Content>());
    EXPECT_EQ(graph.size(), m_project.objectCount());
}

TEST_P(ProjectDocument, WhatWasLoadedIsStoredAsWhatItWasLoadedFrom)
{
    const auto first = graphOf(document());
    const auto* const once = first.rootAs<Project::Content>();
    const auto second = graphOf(documentOf({once}, way()));
    ASSERT_NE(second.rootAs<Project::Content>(), nullptr);
    // Times are short enough after the first store.
    EXPECT_THAT(projectDifferences(*once, *second.rootAs<Project::Content>()), IsEmpty());
    EXPECT_EQ(second.size(), first.size());
}

TEST_P(ProjectDocument, AnEmptyProjectComesBackEmpty)
{
    const Project::Content empty;
    const auto graph = graphOf(documentOf({&empty}, way()));
    const auto* const loaded = graph.rootAs<Project::Content>();
    ASSERT_NE(loaded, nullptr);
    EXPECT_TRUE(*loaded == Project::Content());
    EXPECT_EQ(loaded->timeline, nullptr);
    EXPECT_EQ(loaded->userCollection, nullptr);
    EXPECT_EQ(loaded->resourceTable, nullptr);
    EXPECT_FALSE(loaded->portable);
    EXPECT_EQ(graph.size(), 1u);
}

TEST_P(ProjectDocument, AProjectWithoutACollectionComesBackWithoutOne)
{
    m_project.content.userCollection = nullptr;
    const auto graph = graphOf(document());
    expectSame(m_project.content, graph.rootAs<Project::Content>());
    EXPECT_EQ(graph.rootAs<Project::Content>()->userCollection, nullptr);
    EXPECT_EQ(graph.size(), m_project.objectCount() - 1 - m_project.imports.size());
}

TEST_P(ProjectDocument, WhatSeveralNameIsStoredOnce)
{
    // A second project names the same timeline and the same imports.
    EditorCollection::UserObject otherCollection;
    otherCollection.items = {&m_project.imports[0]};
    Project::Content other(m_project.content);
    other.userCollection = &otherCollection;
    const auto graph = graphOf(documentOf({&m_project.content, &other}, way()));
    ASSERT_EQ(graph.roots().size(), 2u);
    const auto* const first = dynamic_cast<Project::Content*>(graph.roots()[0]);
    const auto* const second = dynamic_cast<Project::Content*>(graph.roots()[1]);
    ASSERT_TRUE(first && second);
    EXPECT_EQ(graph.size(), m_project.objectCount() + 2);
    EXPECT_EQ(first->timeline, second->timeline);
    EXPECT_EQ(first->resourceTable, second->resourceTable);
    const auto& items = first->userCollection->items;
    ASSERT_EQ(items.size(), 6u);
    EXPECT_EQ(items[1], items[3]);
    EXPECT_NE(items[0], items[2]);
    EXPECT_THAT(second->userCollection->items, ElementsAre(items[1]));
}

TEST_P(ProjectDocument, EverythingThatWasLoadedIsFreedOnce)
{
    const QByteArray bytes = document();
    graphOf(bytes);
    const long before = liveAllocations();
    {
        const auto graph = graphOf(bytes);
        EXPECT_GE(liveAllocations() - before, long(m_project.objectCount()));
    }
    EXPECT_EQ(liveAllocations(), before);
}

TEST_P(ProjectDocument, TheTrackerHasOneDeleterForEachLoadedObject)
{
    const auto graph = graphOf(document());
    const Project::Content* const content = graph.rootAs<Project::Content>();
    object_tracker tracker;
    tracker << make_nvp("content", content);
    EXPECT_EQ(deleterCount(tracker), graph.size());
    EXPECT_EQ(deleterCount(tracker), m_project.objectCount());
}

TEST_P(ProjectDocument, ALoadThatFailsLeavesNothingBehind)
{
    const QByteArray whole = document();
    EXPECT_EQ(loadError(whole), "");
    EXPECT_EQ(closedAgain(whole, way()), whole);
    constexpr int cuts = 40;
    for (int cut = 1; cut < cuts; ++cut) {
        const QByteArray damaged = cutWithin(whole, double(cut) / cuts, way());
        const std::string first = loadError(damaged);
        ASSERT_NE(first, "") << "cut " << cut << " of " << cuts;
        const long before = liveAllocations();
        ASSERT_EQ(loadError(damaged), first);
        ASSERT_EQ(liveAllocations(), before) << "cut " << cut << " of " << cuts << ": " << first;
    }
}

/// In the forms that are text without a checksum, so that the class can be changed.
TEST(ProjectInDocuments, AnObjectOfAnotherClassIsRefusedAndFreed)
{
    EditorCollection::UserObject collection;
    Project::Content content;
    content.userCollection = &collection;
    for (const Way& way : {allWays[2], allWays[4], allWays[5]}) {
        SCOPED_TRACE(way.name);
        QByteArray bytes = documentOf({&content}, way);
        EXPECT_EQ(loadError(bytes), "");
        ASSERT_TRUE(bytes.contains("EditorCollection::UserObject"));
        // An empty table is read just as an empty collection is.
        bytes.replace("EditorCollection::UserObject", "ResourceTable::Object");
        bytes.replace("items", "resource2fileInfo");
        const std::string error = loadError(bytes);
        EXPECT_NE(error.find("objects[1]/userCollection"), std::string::npos) << error;
        EXPECT_NE(error.find("another class"), std::string::npos) << error;
        const long before = liveAllocations();
        EXPECT_EQ(loadError(bytes), error);
        EXPECT_EQ(liveAllocations(), before);
    }
}

/// Gives one object for every pointer, and no other values.
class OneObjectStream : public Serialize::IDeserializer, public Serialize::IFieldStream
{
public:
    explicit OneObjectStream(Serialize::ISerializable* object) : m_object(object) {}

    void readPointer(Serialize::ISerializable*& object) override { object = m_object; }
    Serialize::IDeserializer& readObject(Serialize::ISerializable&) override { return *this; }
    Serialize::IFieldStream& stream() override { return *this; }

    void endItem(const Serialize::ItemRecord&) override {}
    void beginItem(const Serialize::ItemRecord&) override {}
    void endSequence(const Serialize::CountRecord&) override {}
    void beginSequence(int* count) override { *count = 0; }
    void endClass(const Serialize::ClassRecord&) override {}
    void beginClass(const Serialize::ClassRecord&) override {}
    void field(const Serialize::FieldRecord& record) override { fields.push_back(record.name); }
    void value(std::shared_ptr<const Types::Image>*) override {}
    void value(QPointF*) override {}
    void value(QString*) override {}
    void value(std::string*) override {}
    void value(MTime*) override {}
    void value(double*) override {}
    void value(qint64*) override {}
    void value(quint32*) override {}
    void value(qint32*) override {}
    void value(bool* value) override { *value = true; }

    std::vector<std::string> fields;

private:
    Serialize::ISerializable* m_object;
};

TEST(ProjectInStreams, EachFieldRefusesAnObjectOfAnotherClass)
{
    Timeline::Object timeline;
    Project::Content content;
    OneObjectStream stream(&timeline);
    EXPECT_THROW(content.Deserialize(stream), std::bad_cast);
    EXPECT_THAT(stream.fields, ElementsAre("timeline", "userCollection"));
    EXPECT_EQ(content.timeline, &timeline);
    EXPECT_EQ(content.userCollection, nullptr);

    ResourceTable::Object table;
    OneObjectStream second(&table);
    EXPECT_THROW(content.Deserialize(second), std::bad_cast);
    EXPECT_THAT(second.fields, ElementsAre("timeline"));

    OneObjectStream nulls(nullptr);
    content.Deserialize(nulls);
    EXPECT_THAT(nulls.fields, ElementsAre("timeline", "userCollection", "resourceTable", "portable"));
    EXPECT_TRUE(content == Project::Content());
    EXPECT_TRUE(content.portable);
}

/// A client with an archive of its own holds the root by value.
TEST(ProjectInArchives, TheRootCanBeHeldByValueAndTheTrackerFreesTheRest)
{
    const FullProject project;
    std::stringstream stream;
    {
        boost::archive::binary_oarchive archive(stream);
        archive << make_nvp("content", project.content);
    }
    const std::string bytes = stream.str();
    const auto loadAndFree = [&] {
        std::istringstream input(bytes);
        Project::Content content;
        boost::archive::binary_iarchive archive(input);
        archive >> make_nvp("content", content);
        EXPECT_THAT(projectDifferences(project.content, content, true), IsEmpty());
        object_tracker tracker;
        tracker << make_nvp("content", std::as_const(content));
        EXPECT_EQ(deleterCount(tracker), project.objectCount() - 1);
        tracker.deleteAll();
    };
    loadAndFree();
    const long before = liveAllocations();
    loadAndFree();
    EXPECT_EQ(liveAllocations(), before);
}

TEST(ProjectInArchives, NullReferencesAreNullUnderTheirKeys)
{
    const Project::Content empty;
    json root;
    {
        Serialize::Json::oarchive archive(root);
        archive << make_nvp("content", empty);
    }
    const json& content = root.at("content");
    for (const char* const key : {"timeline", "userCollection", "resourceTable"})
        EXPECT_TRUE(content.at(key).is_null()) << key;
    EXPECT_EQ(content.at("portable"), json(false));
}

TEST(ProjectInArchives, TheKeysStandInTheirOrder)
{
    const Project::Content empty;
    const QByteArray text = documentOf({&empty}, allWays[1]);
    ASSERT_EQ(allWays[1].form, Document::Xml);
    int last = -1;
    for (const char* const key :
         {"<timeline", "<userCollection", "<resourceTable", "<portable>0</portable>"}) {
        EXPECT_EQ(text.count(key), 1) << key;
        EXPECT_GT(text.indexOf(key), last) << key;
        last = text.indexOf(key);
    }
}

} // namespace
