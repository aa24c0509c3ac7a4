// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/bus/View.h>
#include <EditorModel/services/Capture.h>

#include "tests/shared/FieldTexts.h"
#include "tests/types/Printing.h"

#include <type_traits>

namespace {

using Capture::Audio;
using Capture::CountDown;

static_assert(Testing::isVirtualBase<PubSub::Object, Audio>);
static_assert(Testing::isVirtualBase<PubSub::Object, CountDown>);
static_assert(std::is_base_of_v<Capture::Object<Audio>, Audio>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, Audio>);
static_assert(std::is_same_v<std::underlying_type_t<Audio::State>, int>);
static_assert(std::is_same_v<std::underlying_type_t<Audio::Quality>, int>);
static_assert(std::is_same_v<std::underlying_type_t<Audio::Mode>, int>);

Audio everyFieldSet()
{
    Audio audio;
    audio.error()->setSourceId("source")->setDeviceId("device")->setFilePath("/voice.wav");
    audio.setErrorString("disk full")->setDuration(1500);
    audio.setQuality(Audio::Quality(2))->setVolume(80)->setMode(Audio::Mode(3));
    return audio;
}

void expectEveryFieldSet(const Audio& audio)
{
    EXPECT_EQ(audio.state, 2);
    EXPECT_EQ(audio.sourceId, "source");
    EXPECT_EQ(audio.deviceId, "device");
    EXPECT_EQ(audio.filePath, "/voice.wav");
    EXPECT_EQ(audio.errorString, "disk full");
    EXPECT_EQ(audio.duration, MTime(1500));
    EXPECT_EQ(audio.quality, 2);
    EXPECT_EQ(audio.volume, 80);
    EXPECT_EQ(audio.mode, 3);
}

/// For any class of captures.
template <class T>
void expectEmptyCapture(const T& capture)
{
    EXPECT_EQ(capture.state, 0);
    EXPECT_EQ(capture.sourceId, "");
    EXPECT_EQ(capture.deviceId, "");
    EXPECT_EQ(capture.filePath, "");
    EXPECT_EQ(capture.errorString, "");
    EXPECT_EQ(capture.duration, MTime(0));
}

/// A client's own recorder, new ones of which have a path already.
class Screen : public Capture::Object<Screen>
{
public:
    Screen() { filePath = "/screen.mp4"; }

    Screen* setNumber(int value)
    {
        number = value;
        return this;
    }

    int number = 0;
};

TEST(AudioCapture, StartsFailsAndStops)
{
    Audio audio;
    EXPECT_EQ(audio.start(), &audio);
    EXPECT_EQ(audio.state, 1);
    EXPECT_EQ(audio.stop(), &audio);
    EXPECT_EQ(audio.state, 0);
    EXPECT_EQ(audio.error(), &audio);
    EXPECT_EQ(audio.state, 2);
    EXPECT_EQ(audio.reset(), &audio);
    EXPECT_EQ(audio.state, 0);
    EXPECT_EQ(audio.error()->start()->state, 1);
    EXPECT_EQ(audio.reset()->state, 0);
    EXPECT_EQ(audio.error()->stop()->state, 0);
}

TEST(AudioCapture, TheStateLeavesAllElseAlone)
{
    Audio audio = everyFieldSet();
    audio.reset()->start()->stop()->error();
    expectEveryFieldSet(audio);
}

TEST(AudioCapture, AFailureSetsNoText)
{
    Audio audio;
    audio.error();
    EXPECT_EQ(audio.errorString, "");
    audio.setErrorString("disk full")->error();
    EXPECT_EQ(audio.errorString, "disk full");
}

TEST(AudioCapture, ClearingLeavesTheFieldsOfSoundAlone)
{
    Audio audio = everyFieldSet();
    EXPECT_EQ(audio.clear(), &audio);
    expectEmptyCapture(audio);
    EXPECT_EQ(audio.quality, 2);
    EXPECT_EQ(audio.volume, 80);
    EXPECT_EQ(audio.mode, 3);
}

TEST(AudioCapture, IsChangedThroughItsOwner)
{
    Audio audio;
    audio.setFilePath("/old.wav")->setQuality(Audio::Quality(2));
    Message::View<Audio> recorder;
    Message::View<Audio> client;
    recorder.own(&audio);
    client.observe(&audio);
    client.change(&audio)->clear()->setFilePath("/new.wav")->start()->setVolume(50);
    EXPECT_EQ(audio.filePath, "/new.wav");
    EXPECT_EQ(audio.state, 1);
    EXPECT_EQ(audio.volume, 50);
    EXPECT_EQ(audio.quality, 2);
}

TEST(Capture, GivesEveryRecorderAsItself)
{
    Screen screen;
    static_assert(std::is_same_v<decltype(screen.impl()), Screen*>);
    EXPECT_EQ(screen.impl(), &screen);
    EXPECT_EQ(screen.start()->setNumber(1)->setDuration(10)->setNumber(2), &screen);
    EXPECT_EQ(screen.state, 1);
    EXPECT_EQ(screen.number, 2);
    EXPECT_EQ(screen.duration, MTime(10));
    Audio audio;
    EXPECT_EQ(audio.impl(), &audio);
}

TEST(Capture, IsClearedToTheFieldsOfANewRecorder)
{
    Screen screen;
    screen.setNumber(2)->start()->setSourceId("source")->setFilePath("/other.mp4");
    EXPECT_EQ(screen.clear(), &screen);
    EXPECT_EQ(screen.state, 0);
    EXPECT_EQ(screen.sourceId, "");
    EXPECT_EQ(screen.filePath, "/screen.mp4");
    EXPECT_EQ(screen.number, 2);
}

TEST(CountDown, CountsForWhoeverWatches)
{
    CountDown countDown;
    Message::View<CountDown> owner;
    Message::View<CountDown> client;
    owner.own(&countDown)->setValue(3);
    client.observe(&countDown);
    client.change(&countDown)->setValue(2);
    EXPECT_EQ(countDown.value, 2);
}

} // namespace
