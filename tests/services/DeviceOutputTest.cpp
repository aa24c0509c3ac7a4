// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Device.h>
#include <EditorModel/services/Playback.h>

#include "tests/shared/FieldTexts.h"

#include <cmath>
#include <limits>
#include <type_traits>
#include <utility>

namespace {

using AudioOutput = Device::Output<Media::Audio>;
using VideoOutput = Device::Output<Media::Video>;

static_assert(Testing::isVirtualBase<PubSub::Object, AudioOutput>);
static_assert(Testing::isVirtualBase<PubSub::Object, VideoOutput>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, AudioOutput>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, VideoOutput>);
static_assert(std::is_same_v<decltype(VideoOutput::paddingColor), quint32>);

void expectEveryFieldSet(const VideoOutput& output, const Playback::Object& playback)
{
    EXPECT_EQ(output.playback, &playback);
    EXPECT_EQ(output.width, 640);
    EXPECT_EQ(output.height, 480);
    EXPECT_EQ(output.paddingColor, 0xff102030u);
    EXPECT_TRUE(output.fullScreen);
    EXPECT_TRUE(output.initialized);
    EXPECT_TRUE(output.highQuality);
}

void expectEveryFieldSet(const AudioOutput& output, const Playback::Object& playback)
{
    EXPECT_EQ(output.playback, &playback);
    EXPECT_EQ(output.volume, 0.5);
}

template <class T>
void expectWholeCopies(const T& output, const Playback::Object& playback)
{
    expectEveryFieldSet(output, playback);
    T copy(output);
    expectEveryFieldSet(copy, playback);
    T assigned;
    EXPECT_EQ(&(assigned = output), &assigned);
    const T& itself = assigned;
    assigned = itself;
    expectEveryFieldSet(assigned, playback);
    T moved(std::move(copy));
    expectEveryFieldSet(moved, playback);
    T target;
    EXPECT_EQ(&(target = std::move(moved)), &target);
    expectEveryFieldSet(target, playback);
    expectEveryFieldSet(output, playback);
}

TEST(VideoOutput, ShowsNothingByDefault)
{
    const VideoOutput output;
    EXPECT_EQ(output.playback, nullptr);
    EXPECT_EQ(output.width, 0);
    EXPECT_EQ(output.height, 0);
    EXPECT_EQ(output.paddingColor, 0u);
    EXPECT_FALSE(output.fullScreen);
    EXPECT_FALSE(output.initialized);
    EXPECT_FALSE(output.highQuality);
}

TEST(VideoOutput, SettersStoreAndReturnTheOutput)
{
    const Playback::Object playback;
    VideoOutput output;
    EXPECT_EQ(output.setPlayback(&playback), &output);
    EXPECT_EQ(output.setGeometry(640, 480), &output);
    EXPECT_EQ(output.setPaddingColor(0xff102030), &output);
    EXPECT_EQ(output.setFullScreen(true), &output);
    EXPECT_EQ(output.setInitialized(true), &output);
    EXPECT_EQ(output.setHighQuality(true), &output);
    expectEveryFieldSet(output, playback);

    output.setPlayback(nullptr)->setGeometry(-1, 0)->setPaddingColor(0);
    output.setFullScreen(false)->setInitialized(false)->setHighQuality(false);
    EXPECT_EQ(output.playback, nullptr);
    EXPECT_EQ(output.width, -1);
    EXPECT_EQ(output.height, 0);
    EXPECT_EQ(output.paddingColor, 0u);
    EXPECT_FALSE(output.fullScreen);
    EXPECT_FALSE(output.initialized);
    EXPECT_FALSE(output.highQuality);
}

TEST(VideoOutput, CopiesMovesAndAssignsEveryField)
{
    const Playback::Object playback;
    VideoOutput output;
    output.setPlayback(&playback)->setGeometry(640, 480)->setPaddingColor(0xff102030);
    output.setFullScreen(true)->setInitialized(true)->setHighQuality(true);
    expectWholeCopies(output, playback);
}

TEST(AudioOutput, IsSilentByDefault)
{
    const AudioOutput output;
    EXPECT_EQ(output.playback, nullptr);
    EXPECT_EQ(output.volume, 0.0);
}

TEST(AudioOutput, SettersStoreAndReturnTheOutput)
{
    const Playback::Object playback;
    AudioOutput output;
    EXPECT_EQ(output.setPlayback(&playback), &output);
    EXPECT_EQ(output.setVolume(0.5), &output);
    expectEveryFieldSet(output, playback);
    EXPECT_EQ(output.setVolume(-2.5)->volume, -2.5);
    EXPECT_TRUE(std::isnan(output.setVolume(std::numeric_limits<double>::quiet_NaN())->volume));
    EXPECT_EQ(output.setPlayback(nullptr)->playback, nullptr);
}

TEST(AudioOutput, CopiesMovesAndAssignsEveryField)
{
    const Playback::Object playback;
    AudioOutput output;
    output.setPlayback(&playback)->setVolume(0.5);
    expectWholeCopies(output, playback);
}

} // namespace
