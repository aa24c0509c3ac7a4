// SPDX-License-Identifier: Apache-2.0
// Every class against the table of its fields.
#include "Instance.h"

#include "tests/golden/FieldTable.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <functional>
#include <map>
#include <set>
#include <string>
#include <utility>
#include <vector>

namespace {

using namespace FieldTests;
using testing::Contains;

/// For each field of an object, the place of its value in the table.
using Content = std::vector<std::size_t>;

const std::vector<ClassTable>& classes()
{
    static const std::vector<ClassTable> all = [] {
        std::vector<ClassTable> joined;
        for (const auto part : {valueClasses, timelineClasses, mediaClasses, effectClasses, analysisClasses,
                                libraryClasses, serviceClasses, messageClasses}) {
            const std::vector<ClassTable> tables = part();
            joined.insert(joined.end(), tables.begin(), tables.end());
        }
        return joined;
    }();
    return all;
}

Content defaults(const ClassTable& table)
{
    return Content(table.fields.size(), 0);
}

/// Neighbours of one type differ where the type has more than two values.
Content everyFieldSet(const ClassTable& table)
{
    Content content;
    for (std::size_t i = 0; i != table.fields.size(); ++i)
        content.push_back(1 + i % (table.fields[i].values->count() - 1));
    return content;
}

/// All defaults, all fields set, and each field set alone: two fields that stand for each other show.
std::vector<Content> contents(const ClassTable& table)
{
    std::vector<Content> all = {defaults(table), everyFieldSet(table)};
    for (std::size_t i = 0; i != table.fields.size(); ++i) {
        all.push_back(defaults(table));
        all.back()[i] = everyFieldSet(table)[i];
    }
    return all;
}

Instance objectWith(const ClassTable& table, const Content& content)
{
    Instance object(table);
    for (std::size_t i = 0; i != content.size(); ++i)
        object.store(i, content[i]);
    return object;
}

void expectContent(const Instance& object, const Content& content, const ClassTable& table,
                   const std::string& what)
{
    for (std::size_t i = 0; i != content.size(); ++i) {
        EXPECT_TRUE(object.holds(i, content[i]))
            << table.name << "::" << table.fields[i].name << ' ' << what
            << (content[i] == 0 ? " (its default)" : "") << ", value " << content[i] << " of the table";
    }
}

std::string nameOf(const SetterRow& setter, const ClassTable& table)
{
    std::string name = "the setter of " + table.name + "::";
    for (const std::size_t field : setter.fields)
        name += (field == setter.fields.front() ? "" : " and ") + table.fields[field].name;
    return name;
}

std::string wordFor(Returns returns)
{
    switch (returns) {
    case Returns::Pointer:
        return "a pointer to the object";
    case Returns::Reference:
        return "a reference to the object";
    case Returns::Sender:
        return "a pointer to the object as a sender";
    case Returns::Nothing:
        return "nothing";
    case Returns::Other:
        break;
    }
    return "something else";
}

TEST(Defaults, AreThoseOfTheTable)
{
    for (const ClassTable& table : classes())
        expectContent(Instance(table), defaults(table), table, "is not as in a new object");
}

TEST(Setters, ReturnAsTheirClassesDo)
{
    for (const ClassTable& table : classes()) {
        for (const SetterRow& setter : table.setters)
            EXPECT_EQ(wordFor(setter.returns), wordFor(setter.expected)) << nameOf(setter, table);
    }
}

/// Calls the setter with the values at these places in the table.
void set(const SetterRow& setter, const Content& places, const ClassTable& table, Instance& object,
         Content& content)
{
    std::vector<const void*> values;
    for (std::size_t i = 0; i != places.size(); ++i) {
        values.push_back(table.fields[setter.fields[i]].values->at(places[i]));
        content[setter.fields[i]] = places[i];
    }
    void* const part = table.fields[setter.fields.front()].part(object.object());
    EXPECT_TRUE(setter.call(part, values.data())) << nameOf(setter, table) << " returns another object";
}

/// Goes through all values of the fields of a setter, whatever the object held before.
void trySetter(const SetterRow& setter, const ClassTable& table, Content content)
{
    Instance object = objectWith(table, content);
    std::size_t most = 0;
    for (const std::size_t field : setter.fields)
        most = std::max(most, table.fields[field].values->count());
    for (std::size_t place = 0; place != most; ++place) {
        Content places;
        for (const std::size_t field : setter.fields)
            places.push_back((place + places.size()) % table.fields[field].values->count());
        set(setter, places, table, object, content);
        expectContent(object, content, table, "is wrong after " + nameOf(setter, table));
    }
}

TEST(Setters, StoreWithoutACheckAndTouchNothingElse)
{
    for (const ClassTable& table : classes()) {
        for (const SetterRow& setter : table.setters) {
            trySetter(setter, table, defaults(table));
            trySetter(setter, table, everyFieldSet(table));
        }
    }
}

TEST(Setters, KeepAFieldThatIsSetToItself)
{
    for (const ClassTable& table : classes()) {
        const Content content = everyFieldSet(table);
        for (const SetterRow& setter : table.setters) {
            Instance object = objectWith(table, content);
            std::vector<const void*> values;
            for (const std::size_t field : setter.fields)
                values.push_back(table.fields[field].in(object.object()));
            setter.call(table.fields[setter.fields.front()].part(object.object()), values.data());
            expectContent(object, content, table, "is lost when it is set to itself");
        }
    }
}

TEST(Copies, HaveEveryFieldOfTheOriginal)
{
    for (const ClassTable& table : classes()) {
        for (const Content& content : contents(table)) {
            const Instance object = objectWith(table, content);
            expectContent(object.copied(), content, table, "is not copied");
            expectContent(object, content, table, "is changed in an object that is copied");
        }
    }
}

TEST(Copies, HaveEveryFieldOfWhatIsAssignedToThem)
{
    for (const ClassTable& table : classes()) {
        for (const Content& content : contents(table)) {
            const Instance object = objectWith(table, content);
            for (const Content& earlier : {defaults(table), everyFieldSet(table)}) {
                Instance target = objectWith(table, earlier);
                EXPECT_TRUE(target.assign(object)) << table.name << ": an assignment gives another object";
                expectContent(target, content, table, "is not assigned");
                expectContent(object, content, table, "is changed in an object that is assigned");
            }
        }
    }
}

TEST(Copies, KeepEveryFieldWhenTheyAreAssignedToThemselves)
{
    for (const ClassTable& table : classes()) {
        const Content content = everyFieldSet(table);
        Instance object = objectWith(table, content);
        EXPECT_TRUE(object.assign(object)) << table.name;
        expectContent(object, content, table, "is lost in an assignment to itself");
    }
}

TEST(Moves, TakeEveryFieldOver)
{
    for (const ClassTable& table : classes()) {
        for (const Content& content : contents(table)) {
            Instance object = objectWith(table, content);
            Instance moved = object.moved();
            expectContent(moved, content, table, "is not moved");
            for (const Content& earlier : {defaults(table), everyFieldSet(table)}) {
                Instance source = objectWith(table, content);
                Instance target = objectWith(table, earlier);
                EXPECT_TRUE(target.moveAssign(source))
                    << table.name << ": a moving assignment gives another object";
                expectContent(target, content, table, "is not assigned by moving");
            }
        }
    }
}

TEST(Moves, LeaveAnObjectThatCanBeAssignedAgain)
{
    for (const ClassTable& table : classes()) {
        const Content content = everyFieldSet(table);
        Instance object = objectWith(table, content);
        const Instance moved = object.moved();
        Instance source = moved.copied();
        Instance target(table);
        target.moveAssign(source);
        for (Instance* const left : {&object, &source}) {
            left->assign(moved);
            expectContent(*left, content, table, "is not assigned to an object that was moved from");
        }
    }
}

// Modules that were built apart meet in the layout of the records, so that the order of the fields in memory
// is a part of the interface. It is not the order in which they are stored.
TEST(Layout, HasTheFieldsOfAClassInTheOrderOfItsRows)
{
    for (const ClassTable& table : classes()) {
        const Instance object(table);
        const FieldRow* last = nullptr;
        for (const FieldRow& row : table.fields) {
            const bool isMemberOfItsOwn = row.path.empty() && !row.write;
            if (!isMemberOfItsOwn)
                continue;
            if (last) {
                EXPECT_TRUE(std::less<const void*>()(last->in(object.object()), row.in(object.object())))
                    << table.name << "::" << row.name << " does not stand behind " << last->name;
            }
            last = &row;
        }
    }
}

// The tables themselves are whole.

/// The fields that documents hold under another name, or as parts.
std::string memberFor(const std::string& className, const std::string& key)
{
    static const std::map<std::pair<std::string, std::string>, std::string> members = {
        {{"Timeline::ClipTiming", "fadeInDuraion"}, "fadeInDuration"},
        {{"Timeline::ClipTiming", "fadeOutDuraion"}, "fadeOutDuration"},
        {{"Overlay::Item", "encodedText"}, "text"},
        {{"Package::Resource", "intro"}, "timing"},
        {{"Package::Resource", "outro"}, "timing"},
        {{"Package::Resource", "count"}, "timing"},
    };
    const auto member = members.find({className, key});
    return member == members.end() ? key : member->second;
}

TEST(Tables, HaveARowForEveryStoredFieldOfEveryStoredClass)
{
    std::map<std::string, const ClassTable*> stored;
    for (const ClassTable& table : classes()) {
        if (table.nameInArchive)
            stored.emplace(table.nameInArchive, &table);
    }
    const std::string base = "base ";
    for (const auto& [className, fields] : GoldenTests::storedFields()) {
        ASSERT_TRUE(stored.count(className)) << className << " has no table";
        const ClassTable& table = *stored.at(className);
        std::set<std::string> rows;
        for (const FieldRow& row : table.fields)
            rows.insert(row.name);
        for (const GoldenTests::StoredField& field : fields) {
            if (field.kind.rfind(base, 0) == 0)
                EXPECT_THAT(table.storedBases, Contains(field.kind.substr(base.size()))) << className;
            else
                EXPECT_TRUE(rows.count(memberFor(className, field.key)))
                    << className << " has no row for " << field.key;
        }
    }
}

TEST(Tables, TryEveryFieldWithMoreThanItsDefault)
{
    for (const ClassTable& table : classes()) {
        for (const FieldRow& row : table.fields)
            EXPECT_GE(row.values->count(), 2u) << table.name << "::" << row.name;
    }
}

} // namespace
