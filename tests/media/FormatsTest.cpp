// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/Media.h>

#include <gtest/gtest.h>

#include <type_traits>

namespace {

static_assert(std::is_base_of_v<PubSub::Object, Media::Audio>);
static_assert(std::is_base_of_v<Serialize::ISerializable, Media::Audio>);
static_assert(std::is_base_of_v<PubSub::Object, Media::Video>);
static_assert(std::is_base_of_v<Serialize::ISerializable, Media::Video>);
static_assert(std::is_base_of_v<PubSub::Object, Media::FileTarget>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, Media::FileTarget>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, Media::Object>);
static_assert(std::has_virtual_destructor_v<Media::Object>);

TEST(MediaRecords, KnowTheirArchiveNamesByClassAndByObject)
{
    EXPECT_STREQ(Media::Audio::NameInArchive(), "Audio");
    EXPECT_STREQ(Media::Video::NameInArchive(), "Video");
    EXPECT_STREQ(Media::File::NameInArchive(), "File");
    EXPECT_STREQ(Media::File::Track::NameInArchive(), "Track");
    EXPECT_STREQ(Media::File::Track::Audio::NameInArchive(), "AudioTrack");
    EXPECT_STREQ(Media::File::Track::Video::NameInArchive(), "VideoTrack");

    EXPECT_EQ(Media::Audio().GetNameInArchive(), "Audio");
    EXPECT_EQ(Media::Video().GetNameInArchive(), "Video");
    EXPECT_EQ(Media::File().GetNameInArchive(), "File");
    EXPECT_EQ(Media::File::Track().GetNameInArchive(), "Track");
    const Media::File::Track::Audio sound;
    EXPECT_EQ(static_cast<const Media::Audio&>(sound).GetNameInArchive(), "AudioTrack");
    const Media::File::Track::Video picture;
    EXPECT_EQ(static_cast<const Media::File::Track&>(picture).GetNameInArchive(), "VideoTrack");
}

} // namespace
