// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/media/ResourceTable.h>

#include <EditorModel/bus/View.h>
#include <EditorModel/persistence/Document.h>
#include <EditorModel/persistence/streams/Streams.h>

#include <QBuffer>

#include <gmock/gmock.h>

#include <string>
#include <type_traits>
#include <utility>
#include <vector>

namespace {

using namespace ResourceTable;
using testing::ElementsAre;
using testing::IsEmpty;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, FileResourceInfo>);
static_assert(!std::is_base_of_v<PubSub::Object, FileResourceInfo>);
static_assert(Testing::isVirtualBase<Serialize::ISerializable, Object>);
static_assert(Testing::isVirtualBase<PubSub::Object, Object>);

FileResourceInfo fullInfo(int number)
{
    FileResourceInfo info;
    info.info.path = QString("/films/%1.mp4").arg(number);
    info.info.track = number + 1;
    info.info.duration = number + 2;
    info.timing.mode = Resource::Timing::Looped;
    info.timing.intro = number + 3;
    info.timing.outro = number + 4;
    info.timing.loopMinCount = number + 5;
    return info;
}

Object fullTable()
{
    Object table;
    table.resource2fileInfo[{"b", Resource::AudioType}] = fullInfo(10);
    table.resource2fileInfo[{"a", Resource::VideoType}] = fullInfo(20);
    table.resource2fileInfo[{"b", Resource::ImageType}] = fullInfo(30);
    return table;
}

TEST(FileResourceInfo, IsEqualWhereInfoAndTimingAre)
{
    const FileResourceInfo info = fullInfo(1);
    EXPECT_TRUE(info == info);
    EXPECT_TRUE(info == fullInfo(1));
    FileResourceInfo other = info;
    other.info.track = 0;
    EXPECT_FALSE(info == other);
    other = info;
    other.timing.outro = 0;
    EXPECT_FALSE(info == other);
}

TEST(ResourceTable, HasItsArchiveNames)
{
    EXPECT_STREQ(FileResourceInfo::NameInArchive(), "ResourceTable::FileResourceInfo");
    EXPECT_EQ(FileResourceInfo().GetNameInArchive(), "ResourceTable::FileResourceInfo");
    EXPECT_STREQ(Object::NameInArchive(), "ResourceTable::Object");
    EXPECT_EQ(Object().GetNameInArchive(), "ResourceTable::Object");
}

TEST(ResourceTable, IsEqualToItselfAndEmptyToAnotherEmptyOne)
{
    const Object table;
    EXPECT_TRUE(table == table);
    EXPECT_TRUE(table == Object());
}

TEST(ResourceTable, IsOrderedByIdentifierAndThenByKind)
{
    std::vector<ResourceRef> keys;
    const Object table = fullTable();
    for (const auto& entry : table.resource2fileInfo)
        keys.push_back(entry.first);
    EXPECT_THAT(keys,
                ElementsAre(ResourceRef("a", Resource::VideoType), ResourceRef("b", Resource::AudioType),
                            ResourceRef("b", Resource::ImageType)));
}

TEST(ResourceTable, OneIdentifierUnderTwoKindsIsTwoEntries)
{
    Object table;
    table.resource2fileInfo[{"a", Resource::VideoType}] = fullInfo(1);
    table.resource2fileInfo[{"a", Resource::AudioType}] = fullInfo(2);
    EXPECT_EQ(table.resource2fileInfo.size(), 2u);
    table.resource2fileInfo[{"a", Resource::AudioType}] = fullInfo(3);
    EXPECT_EQ(table.resource2fileInfo.size(), 2u);
    EXPECT_EQ((table.resource2fileInfo.at({"a", Resource::AudioType}).info.track), 4);
}

TEST(ResourceTable, EqualsOneThatWasFilledInAnotherOrder)
{
    Object table;
    table.resource2fileInfo[{"b", Resource::ImageType}] = fullInfo(30);
    table.resource2fileInfo[{"b", Resource::AudioType}] = fullInfo(10);
    table.resource2fileInfo[{"a", Resource::VideoType}] = fullInfo(20);
    EXPECT_TRUE(table == fullTable());
}

TEST(ResourceTable, DiffersInNumberKeyOrValueOfItsEntries)
{
    const ResourceRef first("a", Resource::VideoType);
    Object table = fullTable();
    table.resource2fileInfo.erase(first);
    EXPECT_FALSE(table == fullTable());
    EXPECT_FALSE(fullTable() == table);
    EXPECT_FALSE(fullTable() == Object());

    table.resource2fileInfo[{"aa", Resource::VideoType}] = fullInfo(20);
    EXPECT_FALSE(table == fullTable());

    table = fullTable();
    table.resource2fileInfo.erase(first);
    table.resource2fileInfo[{"a", Resource::AudioType}] = fullInfo(20);
    EXPECT_FALSE(table == fullTable());

    table = fullTable();
    table.resource2fileInfo[first].timing.loopMinCount = 0;
    EXPECT_FALSE(table == fullTable());

    table = fullTable();
    table.resource2fileInfo[first].info.path = "/films/other.mp4";
    EXPECT_FALSE(table == fullTable());
}

TEST(ResourceTable, ClearingEmptiesItAndReturnsIt)
{
    Object table = fullTable();
    EXPECT_EQ(table.clear(), &table);
    EXPECT_THAT(table.resource2fileInfo, IsEmpty());
    EXPECT_EQ(table.clear(), &table);
    EXPECT_THAT(table.resource2fileInfo, IsEmpty());
}

/// A document with the table under "table", as the field stream writes it.
QByteArray streamed(Document::Form form, const Object& table)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    const auto writer = Serialize::makeStreamWriter(form, buffer);
    writer->stream().field({"table", &table});
    writer->writeObject(table);
    writer->finish();
    return buffer.data();
}

void readInto(Object& table, Document::Form form, const QByteArray& document)
{
    const auto reader = Serialize::makeStreamReader(form, document);
    reader->stream().field({"table", &table});
    reader->readObject(table);
    reader->finish();
}

class ResourceTableStreams : public testing::TestWithParam<Document::Form>
{};

INSTANTIATE_TEST_SUITE_P(Forms, ResourceTableStreams,
                         testing::Values(Document::Binary, Document::Xml, Document::Json));

TEST_P(ResourceTableStreams, AnEmptyTableComesBackEmpty)
{
    Object table;
    readInto(table, GetParam(), streamed(GetParam(), Object()));
    EXPECT_THAT(table.resource2fileInfo, IsEmpty());
}

TEST_P(ResourceTableStreams, AFullTableComesBackWhole)
{
    Object table;
    readInto(table, GetParam(), streamed(GetParam(), fullTable()));
    EXPECT_TRUE(table == fullTable());
}

TEST_P(ResourceTableStreams, ATableKeepsItsEntriesAndThoseOfTheSameResourceTakeOnTheLoadedValues)
{
    const ResourceRef mine("c", Resource::VideoType);
    const ResourceRef shared("b", Resource::AudioType);
    Object table;
    table.resource2fileInfo[mine] = fullInfo(70);
    table.resource2fileInfo[shared] = fullInfo(80);
    const FileResourceInfo* const place = &table.resource2fileInfo.at(shared);

    readInto(table, GetParam(), streamed(GetParam(), fullTable()));
    Object wanted = fullTable();
    wanted.resource2fileInfo[mine] = fullInfo(70);
    EXPECT_TRUE(table == wanted);
    // The entry stays where it stands.
    EXPECT_EQ(&table.resource2fileInfo.at(shared), place);

    readInto(table, GetParam(), streamed(GetParam(), Object()));
    EXPECT_TRUE(table == wanted);
}

TEST(ResourceTableStream, ATableKeepsItsEntriesWhenReadingFails)
{
    const ResourceRef mine("c", Resource::VideoType);
    QByteArray document = streamed(Document::Xml, fullTable());
    document.replace("<track>31</track>", "<track>none</track>");
    Object table;
    table.resource2fileInfo[mine] = fullInfo(70);
    EXPECT_THROW(readInto(table, Document::Xml, document), std::runtime_error);
    EXPECT_TRUE(table.resource2fileInfo.at(mine) == fullInfo(70));
    EXPECT_TRUE((table.resource2fileInfo.at({"a", Resource::VideoType}) == fullInfo(20)));
}

TEST(ResourceTableStream, AResourceThatADocumentHasTwiceIsRefused)
{
    QByteArray document = streamed(Document::Xml, fullTable());
    document.replace(">a<", ">b<").replace("<Data>1<", "<Data>2<");
    Object table;
    table.resource2fileInfo[{"b", Resource::AudioType}] = fullInfo(80);
    EXPECT_THROW(readInto(table, Document::Xml, document), std::runtime_error);
}

QByteArray archived(Document::Form form, const Object& table)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    Document::save(buffer, table, form, Document::Archive);
    return buffer.data();
}

class ResourceTableArchives : public testing::TestWithParam<Document::Form>
{};

INSTANTIATE_TEST_SUITE_P(Forms, ResourceTableArchives,
                         testing::Values(Document::Binary, Document::Xml, Document::Json));

TEST_P(ResourceTableArchives, EmptyAndFullTablesComeBack)
{
    for (const Object& table : {Object(), fullTable()}) {
        QByteArray document = archived(GetParam(), table);
        QBuffer buffer(&document);
        buffer.open(QIODevice::ReadOnly);
        const auto graph = Document::load(buffer);
        ASSERT_TRUE(graph.rootAs<Object>());
        EXPECT_TRUE(*graph.rootAs<Object>() == table);
    }
}

TEST(AddFilesToTableRequest, IsARequestToTheTableWithACopyOfTheList)
{
    static_assert(std::is_base_of_v<Message::Types::Request<Object>, AddFilesToTableRequest>);
    const Object table;
    QStringList files{"/b.mp4", "/a.mp4"};
    const AddFilesToTableRequest request(&table, files);
    files.clear();
    EXPECT_EQ(request.sender, &table);
    EXPECT_THAT(request.files, ElementsAre("/b.mp4", "/a.mp4"));
}

/// A module that owns tables and answers requests to add files to them with one entry a path.
class TableModule : public ResourceTable::View, public PubSub::Subscriber<AddFilesToTableRequest>
{
public:
    using ResourceTable::View::resourceTable;
    using ResourceTable::View::resourceTableChange;
    using ResourceTable::View::resourceTableForget;
    using ResourceTable::View::resourceTableIsObserved;
    using ResourceTable::View::resourceTableIsOwned;
    using ResourceTable::View::resourceTableObserve;
    using ResourceTable::View::resourceTableOwn;
    using ResourceTable::View::resourceTableOwnerPointer;
    using ResourceTable::View::resourceTableRemove;
    using ResourceTable::View::resourceTables;

    void notify(const AddFilesToTableRequest& request) override
    {
        auto table = resourceTableChange(request.sender);
        for (const QString& path : request.files)
            table->resource2fileInfo[{path, Resource::VideoType}].info.path = path;
    }

    std::vector<std::string> take() { return std::exchange(m_lines, {}); }

protected:
    void resourceTableAdded(const Object* table) override { write("added", table); }
    void resourceTableRemoved(const Object* table) override { write("removed", table); }
    void resourceTableChanged(const Object*, const Object* oldValue, const Object* newValue) override
    {
        m_lines.push_back("changed " + std::to_string(oldValue->resource2fileInfo.size()) + " to " +
                          std::to_string(newValue->resource2fileInfo.size()));
    }
    void resourceTableChanged(const Object*, const Object* oldValue) override
    {
        write("changed from", oldValue);
    }
    void resourceTableChanged(const Object* table) override { write("changed now", table); }

private:
    void write(const std::string& what, const Object* table)
    {
        m_lines.push_back(what + " " + std::to_string(table->resource2fileInfo.size()));
    }

    std::vector<std::string> m_lines;
};

TEST(ResourceTableView, TellsOfTablesUnderItsPrefix)
{
    Object table = fullTable();
    TableModule owner;
    TableModule observer;
    owner.resourceTableOwn(&table);
    EXPECT_THAT(owner.take(), ElementsAre("added 3", "changed 0 to 3", "changed now 3"));
    observer.resourceTableObserve(&table);
    EXPECT_THAT(observer.take(), ElementsAre("added 3", "changed 0 to 3", "changed now 3"));
    EXPECT_EQ(observer.resourceTable(), &table);
    EXPECT_THAT(observer.resourceTables(), ElementsAre(&table));
    EXPECT_TRUE(observer.resourceTableIsObserved(&table));
    EXPECT_FALSE(observer.resourceTableIsOwned(&table));
    EXPECT_EQ(owner.resourceTableOwnerPointer(&table), &table);

    observer.resourceTableChange(&table)->clear();
    EXPECT_THAT(table.resource2fileInfo, IsEmpty());
    for (TableModule* const module : {&owner, &observer})
        EXPECT_THAT(module->take(), ElementsAre("changed 3 to 0", "changed from 3", "changed now 0"));

    owner.resourceTableRemove(&table);
    for (TableModule* const module : {&owner, &observer})
        EXPECT_THAT(module->take(), ElementsAre("changed 0 to 0", "changed now 0", "removed 0"));
}

TEST(ResourceTableView, AModuleThatListensAnswersTheRequestToAddFiles)
{
    Object table;
    TableModule owner;
    TableModule observer;
    owner.resourceTableOwn(&table);
    observer.resourceTableObserve(&table);
    owner.PubSub::Subscriber<AddFilesToTableRequest>::subscribe(&table);
    observer.take();

    PubSub::publish(AddFilesToTableRequest(&table, {"/a.mp4", "/b.mp4"}));
    EXPECT_EQ(table.resource2fileInfo.size(), 2u);
    EXPECT_EQ((table.resource2fileInfo.at({"/b.mp4", Resource::VideoType}).info.path), "/b.mp4");
    EXPECT_THAT(observer.take(), ElementsAre("changed 0 to 2", "changed from 0", "changed now 2"));
}

TEST(ResourceTableView, ARequestThatNobodyAnswersIsLost)
{
    Object table;
    TableModule owner;
    owner.resourceTableOwn(&table);
    PubSub::publish(AddFilesToTableRequest(&table, {"/a.mp4"}));
    EXPECT_THAT(table.resource2fileInfo, IsEmpty());
}

} // namespace
