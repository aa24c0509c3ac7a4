// SPDX-License-Identifier: Apache-2.0
#include "tests/services/DeviceModule.h"
#include "tests/shared/FieldTexts.h"
#include "tests/shared/VirtualSlots.h"

#include <gmock/gmock.h>

#include <functional>
#include <limits>
#include <type_traits>

namespace {

using namespace ServicesTests;
using testing::ElementsAre;
using testing::IsEmpty;

static_assert(Testing::isVirtualBase<PubSub::Object, AudioOutput>);
static_assert(Testing::isVirtualBase<PubSub::Object, VideoOutput>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, AudioOutput>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, VideoOutput>);
static_assert(std::is_same_v<decltype(VideoOutput::paddingColor), quint32>);

const double notANumber = std::numeric_limits<double>::quiet_NaN();

struct Step
{
    std::function<void(VideoOutput*)> apply;
    /// What is called between the general callbacks.
    Lines calls;
    std::string now;
};

/// Each call stands for the values on both sides of it: owner first, then observer.
Lines changeLines(const std::string& before, const std::string& now, const Lines& calls)
{
    Lines lines;
    for (const std::string who : {"owner: ", "observer: "}) {
        lines.push_back(who + "changed " + before + " to " + now);
        for (const std::string& call : calls)
            lines.push_back(who + call + " " + now);
        lines.push_back(who + "changed from " + before);
        lines.push_back(who + "changed to " + now);
    }
    return lines;
}

class VideoViewTest : public testing::Test
{
protected:
    Lines take() { return std::exchange(m_lines, {}); }

    Playback::Object m_player;
    Lines m_lines;
    Window m_owner{m_lines, "owner"};
    Window m_observer{m_lines, "observer"};
};

class AudioViewTest : public testing::Test
{
protected:
    Lines take() { return std::exchange(m_lines, {}); }

    Playback::Object m_player;
    Lines m_lines;
    Speaker m_owner{m_lines, "owner"};
    Speaker m_observer{m_lines, "observer"};
};

TEST_F(VideoViewTest, TellsOfEachThingThatChangesAlone)
{
    const std::vector<Step> steps = {
        {[&](VideoOutput* o) { o->setPlayback(&m_player); },
         {"playback from -/0/0x0/ to 0/0/0x0/ of"},
         "0/0/0x0/"},
        {[](VideoOutput* o) { o->setPaddingColor(7); }, {"padding"}, "0/7/0x0/"},
        {[](VideoOutput* o) { o->setGeometry(4, 0); }, {"geometry"}, "0/7/4x0/"},
        {[](VideoOutput* o) { o->setGeometry(4, 3); }, {"geometry"}, "0/7/4x3/"},
        {[](VideoOutput* o) { o->setGeometry(8, 6); }, {"geometry"}, "0/7/8x6/"},
        {[](VideoOutput* o) { o->setFullScreen(true); }, {"fullScreen"}, "0/7/8x6/f"},
        {[](VideoOutput* o) { o->setInitialized(true); }, {"initialized"}, "0/7/8x6/fi"},
        {[](VideoOutput* o) { o->setHighQuality(true); }, {"highQuality"}, "0/7/8x6/fih"},
        {[](VideoOutput*) {}, {}, "0/7/8x6/fih"},
        {[](VideoOutput* o) { o->setHighQuality(false); }, {"highQuality"}, "0/7/8x6/fi"},
        {[](VideoOutput* o) { o->setInitialized(false); }, {}, "0/7/8x6/f"},
        {[](VideoOutput* o) { o->setFullScreen(false); }, {"fullScreen"}, "0/7/8x6/"},
        {[](VideoOutput* o) { o->setPaddingColor(0); }, {"padding"}, "0/0/8x6/"},
        {[](VideoOutput* o) { o->setPlayback(nullptr); },
         {"playback from 0/0/8x6/ to -/0/8x6/ of"},
         "-/0/8x6/"},
    };
    VideoOutput output;
    m_owner.outputOwn(&output);
    m_observer.outputObserve(&output);
    take();
    std::string before = "-/0/0x0/";
    for (const Step& step : steps) {
        SCOPED_TRACE(before + " to " + step.now);
        step.apply(m_observer.outputChange(&output).operator->());
        EXPECT_EQ(take(), changeLines(before, step.now, step.calls));
        before = step.now;
    }
}

TEST_F(VideoViewTest, TellsOfAllThatChangesAtOnceInOrder)
{
    VideoOutput output;
    m_owner.outputOwn(&output);
    m_observer.outputObserve(&output);
    take();
    {
        auto chain = m_observer.outputChange(&output);
        chain->setHighQuality(true)->setInitialized(true)->setFullScreen(true)->setGeometry(4, 3);
        chain->setPaddingColor(7)->setPlayback(&m_player);
    }
    EXPECT_EQ(take(), changeLines("-/0/0x0/", "0/7/4x3/fih",
                                  {"playback from -/0/0x0/ to 0/7/4x3/fih of", "padding", "geometry",
                                   "fullScreen", "initialized", "highQuality"}));
}

TEST_F(VideoViewTest, TellsOfWhatPlaysFromOnePlayerToTheNext)
{
    Playback::Object next;
    next.play();
    VideoOutput output;
    output.setPlayback(&m_player);
    m_owner.outputOwn(&output);
    m_observer.outputObserve(&output);
    take();
    m_observer.outputChange(&output)->setPlayback(&next);
    EXPECT_EQ(take(), changeLines("0/0/0x0/", "1/0/0x0/", {"playback from 0/0/0x0/ to 1/0/0x0/ of"}));
}

TEST_F(VideoViewTest, ComparesAnArrivalAndADepartureWithANewOutput)
{
    VideoOutput output;
    output.setPlayback(&m_player)->setPaddingColor(7)->setGeometry(4, 3);
    output.setFullScreen(true)->setInitialized(true)->setHighQuality(true);
    m_owner.outputOwn(&output);
    EXPECT_THAT(take(), ElementsAre("owner: added 0/7/4x3/fih", "owner: changed -/0/0x0/ to 0/7/4x3/fih",
                                    "owner: playback from -/0/0x0/ to 0/7/4x3/fih of 0/7/4x3/fih",
                                    "owner: padding 0/7/4x3/fih", "owner: geometry 0/7/4x3/fih",
                                    "owner: fullScreen 0/7/4x3/fih", "owner: initialized 0/7/4x3/fih",
                                    "owner: highQuality 0/7/4x3/fih", "owner: changed to 0/7/4x3/fih"));

    // The flag of a departing output goes from initialized to not initialized, for which there is no call.
    m_owner.outputRemove(&output);
    EXPECT_THAT(take(), ElementsAre("owner: changed 0/7/4x3/fih to -/0/0x0/",
                                    "owner: playback from 0/7/4x3/fih to -/0/0x0/ of 0/7/4x3/fih",
                                    "owner: padding 0/7/4x3/fih", "owner: geometry 0/7/4x3/fih",
                                    "owner: fullScreen 0/7/4x3/fih", "owner: highQuality 0/7/4x3/fih",
                                    "owner: changed to 0/7/4x3/fih", "owner: removed 0/7/4x3/fih"));
}

TEST_F(VideoViewTest, TellsOfNothingWhereANewOutputArrivesAndDeparts)
{
    VideoOutput output;
    m_observer.outputObserve(&output);
    EXPECT_THAT(take(), ElementsAre("observer: added -/0/0x0/", "observer: changed -/0/0x0/ to -/0/0x0/",
                                    "observer: changed to -/0/0x0/"));
    m_observer.outputForget(&output);
    EXPECT_THAT(take(), ElementsAre("observer: changed -/0/0x0/ to -/0/0x0/", "observer: changed to -/0/0x0/",
                                    "observer: removed -/0/0x0/"));
}

TEST_F(AudioViewTest, TellsOfWhatPlaysAndOfTheVolume)
{
    AudioOutput output;
    m_owner.outputOwn(&output);
    m_observer.outputObserve(&output);
    EXPECT_THAT(take(), ElementsAre("owner: added -/0", "owner: changed -/0 to -/0", "owner: changed to -/0",
                                    "observer: added -/0", "observer: changed -/0 to -/0",
                                    "observer: changed to -/0"));

    m_observer.outputChange(&output)->setVolume(0.5);
    EXPECT_EQ(take(), changeLines("-/0", "-/0.5", {"volume"}));
    m_observer.outputChange(&output)->setPlayback(&m_player);
    EXPECT_EQ(take(), changeLines("-/0.5", "0/0.5", {"playback from -/0.5 to 0/0.5 of"}));
    m_observer.outputChange(&output)->setVolume(0.5);
    EXPECT_EQ(take(), changeLines("0/0.5", "0/0.5", {}));
    m_observer.outputChange(&output)->setVolume(1)->setPlayback(nullptr);
    EXPECT_EQ(take(), changeLines("0/0.5", "-/1", {"playback from 0/0.5 to -/1 of", "volume"}));
}

TEST_F(AudioViewTest, ComparesVolumesExactly)
{
    AudioOutput output;
    output.setVolume(1.0);
    m_owner.outputOwn(&output);
    m_observer.outputObserve(&output);
    take();
    m_observer.outputChange(&output)->setVolume(1.0 + std::numeric_limits<double>::epsilon());
    EXPECT_EQ(take(), changeLines("-/1", "-/1", {"volume"}));

    m_observer.outputChange(&output)->setVolume(0.0);
    take();
    m_observer.outputChange(&output)->setVolume(-0.0);
    EXPECT_EQ(take(), changeLines("-/0", "-/-0", {}));
}

TEST_F(AudioViewTest, AVolumeThatIsNotANumberAlwaysDiffers)
{
    AudioOutput output;
    m_owner.outputOwn(&output);
    m_observer.outputObserve(&output);
    take();
    m_observer.outputChange(&output)->setVolume(notANumber);
    EXPECT_EQ(take(), changeLines("-/0", "-/nan", {"volume"}));
    m_observer.outputChange(&output)->setVolume(notANumber);
    EXPECT_EQ(take(), changeLines("-/nan", "-/nan", {"volume"}));
    m_observer.outputChange(&output)->setPlayback(&m_player);
    EXPECT_EQ(take(), changeLines("-/nan", "0/nan", {"playback from -/nan to 0/nan of", "volume"}));
    m_observer.outputChange(&output)->setVolume(0);
    EXPECT_EQ(take(), changeLines("0/nan", "0/0", {"volume"}));
}

TEST_F(AudioViewTest, ComparesAnArrivalAndADepartureWithANewOutput)
{
    AudioOutput output;
    output.setPlayback(&m_player)->setVolume(0.5);
    m_observer.outputObserve(&output);
    EXPECT_THAT(take(), ElementsAre("observer: added 0/0.5", "observer: changed -/0 to 0/0.5",
                                    "observer: playback from -/0 to 0/0.5 of 0/0.5", "observer: volume 0/0.5",
                                    "observer: changed to 0/0.5"));
    m_observer.outputForget(&output);
    EXPECT_THAT(take(), ElementsAre("observer: changed 0/0.5 to -/0",
                                    "observer: playback from 0/0.5 to -/0 of 0/0.5", "observer: volume 0/0.5",
                                    "observer: changed to 0/0.5", "observer: removed 0/0.5"));
}

template <class T>
class OutputViewTest : public testing::Test
{};

using Outputs = testing::Types<AudioOutput, VideoOutput>;
TYPED_TEST_SUITE(OutputViewTest, Outputs, );

TYPED_TEST(OutputViewTest, OwnsObservesAndForgets)
{
    const Playback::Object player;
    TypeParam outputs[2];
    Lines lines;
    DeviceModule<TypeParam> module(lines, "module");
    EXPECT_EQ(module.output(), nullptr);
    EXPECT_THAT(module.outputs(), IsEmpty());
    EXPECT_EQ(module.outputOwnerPointer(&outputs[0]), &outputs[0]);

    module.outputOwn(&outputs[1])->setPlayback(&player);
    module.outputObserve(&outputs[0]);
    EXPECT_EQ(outputs[1].playback, &player);
    EXPECT_EQ(module.output(), &outputs[0]);
    EXPECT_THAT(module.outputs(), ElementsAre(&outputs[0], &outputs[1]));
    EXPECT_TRUE(module.outputIsObserved(&outputs[0]));
    EXPECT_FALSE(module.outputIsOwned(&outputs[0]));
    EXPECT_EQ(module.outputOwnerPointer(&outputs[0]), nullptr);
    EXPECT_TRUE(module.outputIsObserved(&outputs[1]));
    EXPECT_TRUE(module.outputIsOwned(&outputs[1]));
    EXPECT_EQ(module.outputOwnerPointer(&outputs[1]), &outputs[1]);

    module.outputChange(&outputs[1])->setPlayback(nullptr);
    EXPECT_EQ(outputs[1].playback, nullptr);
    module.outputForget(&outputs[0]);
    EXPECT_THAT(module.outputs(), ElementsAre(&outputs[1]));
    module.outputRemove(&outputs[1]);
    EXPECT_THAT(module.outputs(), IsEmpty());
}

TYPED_TEST(OutputViewTest, AddsToWhoeverTakesAdds)
{
    const Playback::Object player;
    Message::View<TypeParam> owner;
    owner.processAddRequests();
    TypeParam output;
    Lines lines;
    DeviceModule<TypeParam> module(lines, "module");
    module.outputAdd(&output)->setPlayback(&player);
    EXPECT_TRUE(owner.isOwned(&output));
    EXPECT_TRUE(module.outputIsObserved(&output));
    EXPECT_FALSE(module.outputIsOwned(&output));
}

TYPED_TEST(OutputViewTest, ACopyWatchesWhatTheOtherWatches)
{
    const Playback::Object player;
    TypeParam output;
    Lines ownerLines, lines;
    DeviceModule<TypeParam> owner(ownerLines, "owner");
    owner.outputOwn(&output);
    DeviceModule<TypeParam> module(lines, "module");
    module.outputObserve(&output);
    lines.clear();
    DeviceModule<TypeParam> copy(module);
    DeviceModule<TypeParam> moved(std::move(copy));
    EXPECT_THAT(lines, IsEmpty());
    EXPECT_TRUE(moved.outputIsObserved(&output));
    module.outputForget(&output);
    lines.clear();
    owner.outputChange(&output)->setPlayback(&player);
    // The copy that was moved from goes on to watch: a move leaves it as it was.
    EXPECT_EQ(lines.size(), 8u);
}

void setEverything(VideoOutput* output, const Playback::Object* player)
{
    output->setPlayback(player)->setPaddingColor(7)->setGeometry(4, 3);
    output->setFullScreen(true)->setInitialized(true)->setHighQuality(true);
}

void setEverything(AudioOutput* output, const Playback::Object* player)
{
    output->setPlayback(player)->setVolume(0.5);
}

/// A module that leaves the callbacks as they are hears nothing and is no trouble to others.
TYPED_TEST(OutputViewTest, CanBeUsedWithoutReplacingItsCallbacks)
{
    struct Quiet : Device::View<TypeParam>
    {
        using Device::View<TypeParam>::outputChange;
        using Device::View<TypeParam>::outputObserve;
        using Device::View<TypeParam>::outputRemove;
    };
    const Playback::Object player;
    TypeParam output;
    Lines lines;
    DeviceModule<TypeParam> owner(lines, "owner");
    owner.outputOwn(&output);
    Quiet quiet;
    quiet.outputObserve(&output);
    lines.clear();
    setEverything(quiet.outputChange(&output).operator->(), &player);
    EXPECT_EQ(lines.size(), 4u);
    quiet.outputRemove(&output);
    EXPECT_EQ(lines.size(), 8u);
}

TEST(OutputView, OneModuleDealsWithPicturesAndSound)
{
    class Player : public Device::View<VideoOutput>, public Device::View<AudioOutput>
    {
    public:
        using Device::View<VideoOutput>::outputOwn;
        using Device::View<AudioOutput>::outputOwn;
        using Device::View<VideoOutput>::outputChange;
        using Device::View<AudioOutput>::outputChange;

        Lines lines;

    protected:
        void geometryChanged(const VideoOutput* output) override { lines.push_back(text(output)); }
        void volumeChanged(const AudioOutput* output) override { lines.push_back(text(output)); }
    };
    VideoOutput picture;
    AudioOutput sound;
    Player player;
    player.outputOwn(&picture);
    player.outputOwn(&sound);
    player.outputChange(&picture)->setGeometry(4, 3);
    player.outputChange(&sound)->setVolume(0.5);
    EXPECT_THAT(player.lines, ElementsAre("-/0/4x3/", "-/0.5"));
}

#if defined(__GXX_ABI_VERSION)

/// Behind those of a typed view.
TEST_F(VideoViewTest, ItsVirtualFunctionsKeepTheirPlaces)
{
    const VideoOutput output;
    const VideoOutput* const object = &output;
    Device::View<VideoOutput>* const view = &m_owner;
    Testing::callSlot<void>(view, 10, object);
    Testing::callSlot<void>(view, 15, object, object, object);
    for (int slot = 16; slot != 21; ++slot)
        Testing::callSlot<void>(view, slot, object);
    EXPECT_THAT(take(),
                ElementsAre("owner: added -/0/0x0/", "owner: playback from -/0/0x0/ to -/0/0x0/ of -/0/0x0/",
                            "owner: padding -/0/0x0/", "owner: geometry -/0/0x0/",
                            "owner: fullScreen -/0/0x0/", "owner: initialized -/0/0x0/",
                            "owner: highQuality -/0/0x0/"));
}

TEST_F(AudioViewTest, ItsVirtualFunctionsKeepTheirPlaces)
{
    const AudioOutput output;
    const AudioOutput* const object = &output;
    Device::View<AudioOutput>* const view = &m_owner;
    Testing::callSlot<void>(view, 10, object);
    Testing::callSlot<void>(view, 15, object, object, object);
    Testing::callSlot<void>(view, 16, object);
    EXPECT_THAT(take(), ElementsAre("owner: added -/0", "owner: playback from -/0 to -/0 of -/0",
                                    "owner: volume -/0"));
}

#endif

} // namespace
