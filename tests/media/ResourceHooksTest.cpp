// SPDX-License-Identifier: Apache-2.0
#include "Engine.h"
#include "tests/shared/VirtualSlots.h"

#include <EditorModel/media/Media.h>
#include <EditorModel/timeline/Composition.h>

#include <gtest/gtest.h>

#include <optional>
#include <stdexcept>
#include <type_traits>
#include <vector>

namespace {

using namespace MediaTests;
using namespace Resource;

static_assert(!std::is_polymorphic_v<Resource::Describer>);
static_assert(!std::is_polymorphic_v<VideoProvider>);
static_assert(std::has_virtual_destructor_v<Resource::Details::Describer>);
static_assert(std::has_virtual_destructor_v<Resource::Details::Provider>);

TEST(Describer, KnowsNothingWhereNoEngineIsRegistered)
{
    const Resource::Describer describer({"abc", AudioType});
    EXPECT_EQ(describer.fileInfo(), nullptr);
    EXPECT_EQ(describer.composition(), nullptr);
    EXPECT_TRUE(describer.timing() == Timing());
}

TEST(Describer, HandsTheEngineItself)
{
    const Composition::Object outline;
    DescribingEngine engine;
    engine.outline = &outline;
    const Resource::Describer describer({"abc", AudioType});
    EXPECT_EQ(describer.resource, ResourceRef("abc", AudioType));
    EXPECT_EQ(describer.fileInfo(), &engine.info);
    EXPECT_EQ(engine.asker, &describer);
    engine.asker = nullptr;
    EXPECT_EQ(describer.composition(), &outline);
    EXPECT_EQ(engine.asker, &describer);
    engine.asker = nullptr;
    EXPECT_EQ(describer.timing().loopMinCount, 5);
    EXPECT_EQ(engine.asker, &describer);
    EXPECT_EQ(engine.asked, 3);
}

TEST(Describer, IsACopyableValue)
{
    ResourceRef resource("abc", AudioType);
    const Resource::Describer describer(resource);
    resource = {"other", VideoType};
    const Resource::Describer copy(describer);
    EXPECT_EQ(copy.resource, ResourceRef("abc", AudioType));
    Resource::Describer assigned(resource);
    EXPECT_EQ(assigned.resource, ResourceRef("other", VideoType));
    assigned = copy;
    EXPECT_EQ(assigned.resource, ResourceRef("abc", AudioType));
}

TEST(DescribingEngine, TheLastOneBuiltAnswers)
{
    const DescribingEngine first("/first");
    EXPECT_EQ(describedPath(), "/first");
    const DescribingEngine second("/second");
    EXPECT_EQ(describedPath(), "/second");
}

TEST(DescribingEngine, DestroyingItEmptiesTheHook)
{
    {
        const DescribingEngine engine("/first");
        EXPECT_EQ(describedPath(), "/first");
    }
    EXPECT_EQ(describedPath(), "");
}

TEST(DescribingEngine, DestroyingAnEarlierOneEmptiesTheHookToo)
{
    std::optional<DescribingEngine> first("/first");
    const DescribingEngine second("/second");
    first.reset();
    EXPECT_EQ(describedPath(), "");
    EXPECT_EQ(second.asked, 0);
}

TEST(DescribingEngine, ACopyIsNotRegisteredAndEmptiesTheHookWhenItEnds)
{
    const DescribingEngine engine("/first");
    {
        DescribingEngine copy(engine);
        copy.info.path = "/copy";
        EXPECT_EQ(describedPath(), "/first");
    }
    EXPECT_EQ(describedPath(), "");
}

TEST(DescribingEngine, ACopyOfOneThatIsNotRegisteredIsNotEither)
{
    const DescribingEngine engine("/first");
    {
        const DescribingEngine emptying(engine);
    }
    const DescribingEngine copy(engine);
    EXPECT_EQ(describedPath(), "");
}

TEST(DescribingEngine, AssigningLeavesTheRegisteredOneInPlace)
{
    DescribingEngine first("/first");
    DescribingEngine second("/second");
    first = second;
    EXPECT_EQ(describedPath(), "/second");
    EXPECT_EQ(second.asked, 1);
    EXPECT_EQ(first.asked, 0);
    DescribingEngine& same = second;
    second = same;
    EXPECT_EQ(describedPath(), "/second");
}

TEST(DescribingEngine, AFailureOfItsReachesTheAskerAndLeavesTheHookUsable)
{
    DescribingEngine engine("/first");
    engine.onNextQuestion = [] { throw std::runtime_error("not now"); };
    EXPECT_THROW(describedPath(), std::runtime_error);
    EXPECT_EQ(describedPath(), "/first");
}

#if defined(__GXX_ABI_VERSION)

/// Behind the destructor: file, composition, timing.
TEST(DescribingEngine, ItsVirtualFunctionsKeepTheirPlaces)
{
    using Testing::callSlot;
    const Composition::Object outline;
    DescribingEngine engine;
    engine.outline = &outline;
    const Resource::Details::Describer* const base = &engine;
    const Resource::Describer asker({"abc", AudioType});
    EXPECT_EQ(callSlot<const FileInfo*>(base, 2, &asker), &engine.info);
    EXPECT_EQ(callSlot<const Composition::Object*>(base, 3, &asker), &outline);
    EXPECT_EQ(callSlot<Timing>(base, 4, &asker).loopMinCount, 5);
}

/// Behind the destructor: blob, image, audio, video.
TEST(LoadingEngine, ItsVirtualFunctionsKeepTheirPlaces)
{
    using Testing::callSlot;
    LoadingEngine engine;
    Resource::Details::Provider* const base = &engine;
    const QString id = "abc";
    const void* const noSettings = nullptr;
    const auto loaded = [&] {
        return std::vector<int>{engine.blobs, engine.images, engine.audios, engine.videos};
    };
    callSlot<std::unique_ptr<const Blob>>(base, 2, &id, noSettings);
    EXPECT_EQ(loaded(), std::vector<int>({1, 0, 0, 0}));
    callSlot<std::unique_ptr<const Image>>(base, 3, &id, noSettings);
    EXPECT_EQ(loaded(), std::vector<int>({1, 1, 0, 0}));
    callSlot<std::unique_ptr<const Audio>>(base, 4, &id, noSettings);
    EXPECT_EQ(loaded(), std::vector<int>({1, 1, 1, 0}));
    callSlot<std::unique_ptr<const Video>>(base, 5, &id, noSettings);
    EXPECT_EQ(loaded(), std::vector<int>({1, 1, 1, 1}));
}

#endif

TEST(Provider, GivesNothingWhereNoEngineIsRegistered)
{
    EXPECT_EQ(loadingEngines(), "- - - -");
}

TEST(Provider, TakesTheIdentifierAndDropsTheKind)
{
    const Media::Audio settings;
    const AudioProvider provider(ResourceRef("abc", ImageType), &settings);
    EXPECT_EQ(provider.id, "abc");
    EXPECT_EQ(provider.settings, &settings);
}

TEST(Provider, IsAValueThatCopiesMovesAndAssigns)
{
    const Media::Video settings;
    VideoProvider provider(QString("abc"), &settings);
    const auto expectWhole = [&](const VideoProvider& other) {
        EXPECT_EQ(other.id, "abc");
        EXPECT_EQ(other.settings, &settings);
    };
    const VideoProvider copy(provider);
    expectWhole(copy);
    VideoProvider moved(std::move(provider));
    expectWhole(moved);
    VideoProvider assigned("", nullptr);
    assigned = copy;
    expectWhole(assigned);
    VideoProvider& same = assigned;
    assigned = same;
    expectWhole(assigned);
    assigned = VideoProvider("", nullptr);
    assigned = std::move(moved);
    expectWhole(assigned);
}

/// Nothing looks into pictures here, and one that is made needs an application.
const Types::Image* somePicture()
{
    static const char place = 0;
    return reinterpret_cast<const Types::Image*>(&place);
}

TEST(Provider, AsksTheOperationOfItsKindWithIdentifierAndSettings)
{
    LoadingEngine engine;
    const Media::Audio audioSettings;
    const Media::Video videoSettings;
    const Types::Blob blobSettings;

    const auto audio = AudioProvider("a", &audioSettings).resource();
    EXPECT_EQ(engine.audios, 1);
    EXPECT_EQ(audio->id, "a");
    EXPECT_EQ(audio->settings, &audioSettings);
    const auto blob = BlobProvider("b", &blobSettings).resource();
    EXPECT_EQ(engine.blobs, 1);
    EXPECT_EQ(blob->id, "b");
    EXPECT_EQ(blob->settings, &blobSettings);
    const auto image = ImageProvider("c", somePicture()).resource();
    EXPECT_EQ(engine.images, 1);
    EXPECT_EQ(image->id, "c");
    EXPECT_EQ(image->settings, somePicture());
    const auto video = VideoProvider(ResourceRef("d", NoType), &videoSettings).resource();
    EXPECT_EQ(engine.videos, 1);
    EXPECT_EQ(video->id, "d");
    EXPECT_EQ(video->settings, &videoSettings);
    EXPECT_EQ(engine.audios, 1);
    EXPECT_EQ(engine.blobs, 1);
    EXPECT_EQ(engine.images, 1);
}

/// Has nothing.
class EmptyEngine : public LoadingEngine
{
public:
    std::unique_ptr<const Video> videoResource(const QString&, const Media::Video*) override
    {
        ++videos;
        return nullptr;
    }
};

TEST(Provider, GivesNothingWhereTheEngineDoes)
{
    EmptyEngine engine;
    EXPECT_EQ(VideoProvider("d", nullptr).resource(), nullptr);
    EXPECT_EQ(engine.videos, 1);
}

TEST(LoadingEngine, TheLastOneBuiltAnswersForAllKinds)
{
    const LoadingEngine first("first");
    EXPECT_EQ(loadingEngines(), "first first first first");
    const LoadingEngine second("second");
    EXPECT_EQ(loadingEngines(), "second second second second");
}

TEST(LoadingEngine, DestroyingAnyOneEmptiesAllFourHooks)
{
    std::optional<LoadingEngine> first("first");
    std::optional<LoadingEngine> second("second");
    first.reset();
    EXPECT_EQ(loadingEngines(), "- - - -");
    const LoadingEngine third("third");
    EXPECT_EQ(loadingEngines(), "third third third third");
    second.reset();
    EXPECT_EQ(loadingEngines(), "- - - -");
}

TEST(LoadingEngine, ACopyIsNotRegisteredAndEmptiesTheHooksWhenItEnds)
{
    const LoadingEngine engine("first");
    {
        LoadingEngine copy(engine);
        copy.name = "copy";
        EXPECT_EQ(loadingEngines(), "first first first first");
    }
    EXPECT_EQ(loadingEngines(), "- - - -");
    const LoadingEngine copy(engine);
    EXPECT_EQ(loadingEngines(), "- - - -");
}

TEST(LoadingEngine, AssigningLeavesTheRegisteredOneInPlace)
{
    LoadingEngine first("first");
    LoadingEngine second("second");
    first = second;
    first.name = "first again";
    EXPECT_EQ(loadingEngines(), "second second second second");
    LoadingEngine& same = second;
    second = same;
    EXPECT_EQ(loadingEngines(), "second second second second");
}

TEST(LoadingEngine, AFailureOfItsReachesTheAskerAndLeavesTheHookUsable)
{
    LoadingEngine engine("first");
    engine.onNextAudio = [] { throw std::runtime_error("not now"); };
    EXPECT_THROW(loadingEngines(), std::runtime_error);
    EXPECT_EQ(loadingEngines(), "first first first first");
}

TEST(ResourceHooks, AnEngineMayAskTheOtherHooksWhileItAnswers)
{
    const DescribingEngine describing("/films/a.mp4");
    LoadingEngine loading("engine");
    loading.onNextAudio = [] {
        EXPECT_EQ(BlobProvider("b", nullptr).resource()->engine, "engine");
        EXPECT_EQ(ImageProvider("c", nullptr).resource()->engine, "engine");
        EXPECT_EQ(VideoProvider("d", nullptr).resource()->engine, "engine");
        EXPECT_EQ(describedPath(), "/films/a.mp4");
    };
    EXPECT_TRUE(AudioProvider("a", nullptr).resource());
    EXPECT_EQ(loading.blobs, 1);
    EXPECT_EQ(loading.images, 1);
    EXPECT_EQ(loading.videos, 1);
    EXPECT_EQ(describing.asked, 1);
}

TEST(ResourceHooks, DescribingAndLoadingEnginesComeAndGoByThemselves)
{
    const LoadingEngine loading("engine");
    {
        const DescribingEngine describing("/films/a.mp4");
        EXPECT_EQ(loadingEngines(), "engine engine engine engine");
    }
    EXPECT_EQ(loadingEngines(), "engine engine engine engine");
    const DescribingEngine describing("/films/b.mp4");
    {
        const LoadingEngine other("other");
    }
    EXPECT_EQ(describedPath(), "/films/b.mp4");
}

} // namespace
