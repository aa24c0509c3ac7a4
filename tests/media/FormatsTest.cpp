// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/Media.h>

#include <gtest/gtest.h>

#include <type_traits>
#include <utility>

namespace {

using Norvel::Conf::ChannelLayout;
using Norvel::Conf::SampleFormats;

static_assert(std::is_base_of_v<PubSub::Object, Media::Audio>);
static_assert(std::is_base_of_v<Serialize::ISerializable, Media::Audio>);
static_assert(std::is_base_of_v<PubSub::Object, Media::Video>);
static_assert(std::is_base_of_v<Serialize::ISerializable, Media::Video>);
static_assert(std::is_base_of_v<PubSub::Object, Media::FileTarget>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, Media::FileTarget>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, Media::Object>);
static_assert(std::has_virtual_destructor_v<Media::Object>);

Media::Audio audioWithEveryFieldSet()
{
    Media::Audio audio;
    audio.label = "surround";
    audio.setChannelLayout(ChannelLayout(6))->setSampleRate(48000)->setSampleFormat(SampleFormats(8));
    return audio;
}

void expectEveryFieldSet(const Media::Audio& audio)
{
    EXPECT_EQ(audio.label, "surround");
    EXPECT_EQ(audio.channelLayout, 6);
    EXPECT_EQ(audio.sampleRate, 48000);
    EXPECT_EQ(audio.sampleFormat, 8);
}

Media::Video videoWithEveryFieldSet()
{
    Media::Video video;
    video.label = "wide";
    video.setGeometry(720, 576)->setFrameRate(25, 1)->setAspect(64, 45)->setExportMode(true)->setOpaque(
        false);
    return video;
}

void expectEveryFieldSet(const Media::Video& video)
{
    EXPECT_EQ(video.label, "wide");
    EXPECT_EQ(video.width, 720);
    EXPECT_EQ(video.height, 576);
    EXPECT_EQ(video.frameRateN, 25);
    EXPECT_EQ(video.frameRateD, 1);
    EXPECT_EQ(video.aspectX, 64);
    EXPECT_EQ(video.aspectY, 45);
    EXPECT_TRUE(video.exportMode);
    EXPECT_FALSE(video.opaque);
}

Media::FileTarget targetWithEveryFieldSet()
{
    Media::FileTarget target;
    target.label = "main";
    target.setPath("/films/a.mov")->setVideoTrack(2)->setAudioTrack(3);
    return target;
}

void expectEveryFieldSet(const Media::FileTarget& target)
{
    EXPECT_EQ(target.label, "main");
    EXPECT_EQ(target.path, "/films/a.mov");
    EXPECT_EQ(target.videoTrack, 2);
    EXPECT_EQ(target.audioTrack, 3);
}

/// Every way of copying a whole record.
template <class T>
void expectCopiesAreWhole(const T& original)
{
    const T copy(original);
    expectEveryFieldSet(copy);

    T assigned;
    EXPECT_EQ(&(assigned = original), &assigned);
    expectEveryFieldSet(assigned);
    const T& itself = assigned;
    assigned = itself;
    expectEveryFieldSet(assigned);

    T moved(std::move(assigned));
    expectEveryFieldSet(moved);
    T target;
    target = std::move(moved);
    expectEveryFieldSet(target);
    expectEveryFieldSet(original);
}

TEST(MediaAudio, IsCdSoundInStereoByDefault)
{
    const Media::Audio audio;
    EXPECT_TRUE(audio.label.isEmpty());
    EXPECT_EQ(audio.channelLayout, 2);
    EXPECT_EQ(audio.sampleRate, 44100);
    EXPECT_EQ(audio.sampleFormat, 1);
}

TEST(MediaAudio, SettersStoreWhatTheyAreGivenAndReturnTheObject)
{
    Media::Audio audio;
    EXPECT_EQ(audio.setChannelLayout(ChannelLayout(-1)), &audio);
    EXPECT_EQ(audio.setSampleRate(-5), &audio);
    EXPECT_EQ(audio.setSampleFormat(SampleFormats(0x7fffffff)), &audio);
    EXPECT_EQ(audio.channelLayout, -1);
    EXPECT_EQ(audio.sampleRate, -5);
    EXPECT_EQ(audio.sampleFormat, 0x7fffffff);
}

TEST(MediaAudio, CopiesWhole)
{
    expectCopiesAreWhole(audioWithEveryFieldSet());
}

TEST(MediaVideo, IsFullHdWithSquarePixelsByDefault)
{
    const Media::Video video;
    EXPECT_TRUE(video.label.isEmpty());
    EXPECT_EQ(video.width, 1920);
    EXPECT_EQ(video.height, 1080);
    EXPECT_EQ(video.frameRateN, 30000);
    EXPECT_EQ(video.frameRateD, 1001);
    EXPECT_EQ(video.aspectX, 1);
    EXPECT_EQ(video.aspectY, 1);
    EXPECT_FALSE(video.exportMode);
    EXPECT_TRUE(video.opaque);
}

TEST(MediaVideo, SettersStoreWhatTheyAreGivenAndReturnTheObject)
{
    Media::Video video;
    EXPECT_EQ(video.setGeometry(0, -1), &video);
    EXPECT_EQ(video.setFrameRate(24, 0), &video);
    EXPECT_EQ(video.setAspect(-3, 7), &video);
    EXPECT_EQ(video.setExportMode(true), &video);
    EXPECT_EQ(video.setOpaque(false), &video);
    EXPECT_EQ(video.width, 0);
    EXPECT_EQ(video.height, -1);
    EXPECT_EQ(video.frameRateN, 24);
    EXPECT_EQ(video.frameRateD, 0);
    EXPECT_EQ(video.aspectX, -3);
    EXPECT_EQ(video.aspectY, 7);
    EXPECT_TRUE(video.exportMode);
    EXPECT_FALSE(video.opaque);
}

TEST(MediaVideo, CopiesWhole)
{
    expectCopiesAreWhole(videoWithEveryFieldSet());
}

TEST(MediaFileTarget, NamesNothingByDefault)
{
    const Media::FileTarget target;
    EXPECT_TRUE(target.path.isEmpty());
    EXPECT_EQ(target.videoTrack, 0);
    EXPECT_EQ(target.audioTrack, 0);
}

TEST(MediaFileTarget, SettersReturnTheObject)
{
    Media::FileTarget target;
    EXPECT_EQ(target.setPath("x"), &target);
    EXPECT_EQ(target.setVideoTrack(-1), &target);
    EXPECT_EQ(target.setAudioTrack(-2), &target);
    EXPECT_EQ(target.videoTrack, -1);
    EXPECT_EQ(target.audioTrack, -2);
}

TEST(MediaFileTarget, CopiesWhole)
{
    expectCopiesAreWhole(targetWithEveryFieldSet());
}

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
