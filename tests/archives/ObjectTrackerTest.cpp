// SPDX-License-Identifier: Apache-2.0
#include "tests/archives/SampleClasses.h"

#include <EditorModel/persistence/ObjectTracker.h>

#include <gtest/gtest.h>

#include <memory>
#include <stdexcept>

namespace {

using boost::archive::object_tracker;
using boost::serialization::make_nvp;

const void* addressOf(const Serialize::ISerializable& object)
{
    return dynamic_cast<const void*>(&object);
}

template <class Call>
std::string messageOf(Call call)
{
    try {
        call();
    } catch (const std::runtime_error& error) {
        return error.what();
    }
    return "nothing was thrown";
}

TEST(ObjectTracker, TheSameObjectTwiceByValueIsRefused)
{
    const Sample::Leaf leaf;
    object_tracker tracker;
    tracker << make_nvp("first", leaf);
    EXPECT_EQ(messageOf([&] { tracker << make_nvp("second", leaf); }),
              "Object adressed by reference was already serialized by reference");
}

TEST(ObjectTracker, TheSameContainerTwiceByValueIsRefused)
{
    const std::deque<int> numbers = {1, 2};
    object_tracker tracker;
    tracker << make_nvp("first", numbers);
    EXPECT_EQ(messageOf([&] { tracker << make_nvp("second", numbers); }),
              "Object adressed by reference was already serialized by reference");
}

TEST(ObjectTracker, AnObjectByValueThatAPointerHeldIsRefused)
{
    const Sample::Leaf leaf;
    const auto* const pointer = &leaf;
    object_tracker tracker;
    tracker << make_nvp("pointer", pointer);
    EXPECT_EQ(messageOf([&] { tracker << make_nvp("value", leaf); }),
              "Object adressed by reference was already serialized by pointer");
}

TEST(ObjectTracker, AValueAtTheAddressOfAnObjectOnTheHeapIsRefused)
{
    const auto leaf = std::make_unique<Sample::Leaf>();
    const auto* const pointer = leaf.get();
    object_tracker tracker;
    tracker << make_nvp("pointer", pointer);
    // Never read: the tracker looks at addresses alone.
    const int& member = *static_cast<const int*>(addressOf(*leaf));
    EXPECT_EQ(messageOf([&] { tracker << make_nvp("member", member); }),
              "Reference to object on heap is not allowed");
}

TEST(ObjectTracker, AValueAtTheAddressOfAnObjectHeldByValuePasses)
{
    const Sample::Leaf leaf;
    object_tracker tracker;
    tracker << make_nvp("leaf", leaf);
    // Never read, as above.
    const int& member = *static_cast<const int*>(addressOf(leaf));
    EXPECT_EQ(messageOf([&] { tracker << make_nvp("member", member); }), "nothing was thrown");
    EXPECT_EQ(tracker.records().at(addressOf(leaf)).kind, object_tracker::ByReference);
}

TEST(ObjectTracker, AnObjectMetAgainWhileItIsBeingSavedPasses)
{
    Sample::Tree tree;
    tree.other = &tree;
    tree.next = &tree;
    object_tracker tracker;
    tracker << make_nvp("tree", tree);
    const auto& record = tracker.records().at(addressOf(tree));
    EXPECT_EQ(record.kind, object_tracker::ByReference);
    EXPECT_TRUE(record.saved);
    EXPECT_FALSE(record.deleter);
}

TEST(ObjectTracker, APointerToAnObjectHeldByValueIsNoErrorAndGetsNoDeleter)
{
    Sample::Grove grove;
    grove.litter.resize(2);
    grove.couple.first = &grove.litter[1];
    object_tracker tracker;
    tracker << make_nvp("grove", grove);
    const auto& record = tracker.records().at(addressOf(grove.litter[1]));
    EXPECT_EQ(record.kind, object_tracker::ByReference);
    EXPECT_FALSE(record.deleter);
}

TEST(ObjectTracker, EachObjectOnTheHeapIsDeletedOnceHoweverManyPointersLeadToIt)
{
    auto* const first = new Sample::Counted;
    auto* const second = new Sample::Counted;
    first->next = second;
    first->also = second;
    second->next = first;
    const Sample::Counted* const root = first;
    object_tracker tracker;
    tracker << make_nvp("root", root);
    tracker << make_nvp("again", root);
    const auto& record = tracker.records().at(addressOf(*second));
    EXPECT_EQ(record.kind, object_tracker::ByPointer);
    EXPECT_TRUE(record.saved);

    Sample::Counted::s_deleted = 0;
    tracker.deleteAll();
    EXPECT_EQ(Sample::Counted::s_deleted, 2);
    EXPECT_TRUE(tracker.records().empty());
    tracker.deleteAll();
    EXPECT_EQ(Sample::Counted::s_deleted, 2);
}

TEST(ObjectTracker, PointersToDifferentBasesOfOneObjectAreOneRecord)
{
    Sample::Tree tree;
    const Sample::Trunk* const trunk = &tree;
    const Sample::Bark* const bark = &tree;
    object_tracker tracker;
    tracker << make_nvp("trunk", trunk);
    tracker << make_nvp("bark", bark);
    EXPECT_EQ(tracker.records().at(addressOf(tree)).kind, object_tracker::ByPointer);
    int deleters = 0;
    for (const auto& entry : tracker.records())
        deleters += entry.second.deleter ? 1 : 0;
    // One for the tree; the null pointers in it have one that does nothing.
    EXPECT_EQ(deleters, 2);
}

TEST(ObjectTracker, ANullPointerIsWalkedPast)
{
    const Sample::Leaf* const null = nullptr;
    object_tracker tracker;
    tracker << make_nvp("null", null);
    tracker.deleteAll();
    EXPECT_TRUE(tracker.records().empty());
}

TEST(ObjectTracker, AClassThatWasNeverRegisteredIsRefused)
{
    const Sample::Stray stray;
    const Sample::Leaf* const pointer = &stray;
    object_tracker tracker;
    try {
        tracker << make_nvp("stray", pointer);
        FAIL() << "a stray object passed";
    } catch (const boost::archive::archive_exception& error) {
        EXPECT_STREQ(error.what(), "unregistered class - derived class not registered or exported");
    }
}

TEST(ObjectTracker, PicturesAndStoredFormsOfValuesAreNotEntered)
{
    Sample::Album album;
    album.cover = std::make_shared<const Types::Image>();
    album.back = album.cover;
    Sample::Tree tree;
    tree.reversed = QStringLiteral("abc");
    object_tracker tracker;
    tracker << make_nvp("album", album) << make_nvp("tree", tree);
    EXPECT_EQ(tracker.records().count(static_cast<const PubSub::Object*>(album.cover.get())), 0u);
    EXPECT_EQ(tracker.records().count(&tree.reversed), 0u);
}

} // namespace
