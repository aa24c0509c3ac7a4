// SPDX-License-Identifier: Apache-2.0
// Modules that were built apart meet in the layout of the records, so that the order of their bases is a part
// of the interface.
#include <EditorModel/timeline/Editor.h>
#include <EditorModel/timeline/Film.h>
#include <EditorModel/timeline/Timeline.h>

#include <gtest/gtest.h>

#include <functional>

namespace {

/// The first of several virtual bases without fields shares its address, and its table, with the object.
template <class Base, class Class>
bool beginsWith(const Class& object)
{
    return static_cast<const void*>(static_cast<const Base*>(&object)) == &object;
}

TEST(BaseOrder, RecordsAreStoredFirstAndWatchedSecond)
{
    EXPECT_TRUE(beginsWith<Serialize::ISerializable>(Timeline::Clip()));
    EXPECT_TRUE(beginsWith<Serialize::ISerializable>(Timeline::Track()));
    EXPECT_TRUE(beginsWith<Serialize::ISerializable>(Timeline::Object()));
    EXPECT_TRUE(beginsWith<Serialize::ISerializable>(Film::Object()));
    EXPECT_TRUE(beginsWith<Serialize::ISerializable>(Editor::Object()));
}

TEST(BaseOrder, ALabelIsWatchedFirstAndStoredSecond)
{
    EXPECT_TRUE(beginsWith<PubSub::Object>(Timeline::Label()));
}

TEST(BaseOrder, ATimelineHasItsPictureInFrontOfItsSound)
{
    const Timeline::Object timeline;
    const void* const video = static_cast<const Media::Video*>(&timeline);
    const void* const audio = static_cast<const Media::Audio*>(&timeline);
    EXPECT_TRUE(std::less<const void*>()(video, audio));
}

} // namespace
