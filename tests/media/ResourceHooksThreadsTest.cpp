// SPDX-License-Identifier: Apache-2.0
// The locks of the hooks. The engines keep their counts without a lock of their own, so that the thread
// sanitizer tells where one of the hooks is not held.
#include "Engine.h"

#include <gtest/gtest.h>

#include <atomic>
#include <chrono>
#include <deque>
#include <functional>
#include <future>
#include <optional>
#include <thread>
#include <utility>
#include <vector>

namespace {

using namespace MediaTests;
using namespace std::chrono_literals;

/// Runs all at once, and returns when all have ended.
void runTogether(const std::vector<std::function<void()>>& jobs)
{
    std::promise<void> start;
    const std::shared_future<void> started = start.get_future().share();
    std::vector<std::thread> threads;
    for (const auto& job : jobs) {
        threads.emplace_back([&job, started] {
            started.wait();
            job();
        });
    }
    start.set_value();
    for (std::thread& thread : threads)
        thread.join();
}

/// Long enough for what nothing holds back to come about.
bool isHeldBack(const std::future<void>& future)
{
    return future.wait_for(100ms) == std::future_status::timeout;
}

/// Long enough for anything but what waits for ever.
void expectToEnd(const std::future<void>& future)
{
    EXPECT_EQ(future.wait_for(60s), std::future_status::ready);
}

TEST(ResourceHooksThreads, QuestionsOfOneHookAreAnsweredOneAfterTheOther)
{
    constexpr int questions = 2000;
    constexpr int askers = 3;
    LoadingEngine loading;
    const DescribingEngine describing;
    std::vector<std::function<void()>> jobs;
    const auto repeat = [&](auto question) {
        for (int i = 0; i != askers; ++i) {
            jobs.push_back([question] {
                for (int n = 0; n != questions; ++n)
                    question();
            });
        }
    };
    repeat([] { AudioProvider("a", nullptr).resource(); });
    repeat([] { BlobProvider("b", nullptr).resource(); });
    repeat([] { ImageProvider("c", nullptr).resource(); });
    repeat([] { VideoProvider("d", nullptr).resource(); });
    repeat([] { Resource::Describer({"e", Resource::VideoType}).fileInfo(); });
    repeat([] { Resource::Describer({"e", Resource::VideoType}).composition(); });
    repeat([] { Resource::Describer({"e", Resource::VideoType}).timing(); });
    runTogether(jobs);
    EXPECT_EQ(loading.audios, askers * questions);
    EXPECT_EQ(loading.blobs, askers * questions);
    EXPECT_EQ(loading.images, askers * questions);
    EXPECT_EQ(loading.videos, askers * questions);
    EXPECT_EQ(describing.asked, 3 * askers * questions);
}

TEST(ResourceHooksThreads, AQuestionWaitsForTheAnswerToTheOneBefore)
{
    LoadingEngine loading;
    DescribingEngine describing;
    std::future<void> second;
    bool wasHeldBack = false;

    loading.onNextAudio = [&] {
        second = std::async(std::launch::async, [] { AudioProvider("a", nullptr).resource(); });
        wasHeldBack = isHeldBack(second);
    };
    AudioProvider("a", nullptr).resource();
    EXPECT_TRUE(wasHeldBack);
    expectToEnd(second);

    for (const auto question : {+[] {
                                    Resource::Describer({"e", Resource::VideoType}).fileInfo();
                                },
                                +[] {
                                    Resource::Describer({"e", Resource::VideoType}).composition();
                                },
                                +[] {
                                    Resource::Describer({"e", Resource::VideoType}).timing();
                                }}) {
        wasHeldBack = false;
        describing.onNextQuestion = [&] {
            second = std::async(std::launch::async, question);
            wasHeldBack = isHeldBack(second);
        };
        describedPath();
        EXPECT_TRUE(wasHeldBack);
        expectToEnd(second);
    }
}

TEST(ResourceHooksThreads, QuestionsOfOtherHooksDoNotWait)
{
    LoadingEngine loading;
    const DescribingEngine describing;
    loading.onNextAudio = [] {
        expectToEnd(std::async(std::launch::async, [] { BlobProvider("b", nullptr).resource(); }));
        expectToEnd(std::async(std::launch::async, [] { ImageProvider("c", nullptr).resource(); }));
        expectToEnd(std::async(std::launch::async, [] { VideoProvider("d", nullptr).resource(); }));
        expectToEnd(std::async(std::launch::async, [] { describedPath(); }));
    };
    EXPECT_TRUE(AudioProvider("a", nullptr).resource());
}

TEST(ResourceHooksThreads, AnEngineIsRegisteredOnlyBetweenAnswers)
{
    DescribingEngine first("/first");
    std::optional<DescribingEngine> second;
    std::future<void> registering;
    bool wasHeldBack = false;
    first.onNextQuestion = [&] {
        registering = std::async(std::launch::async, [&] { second.emplace("/second"); });
        wasHeldBack = isHeldBack(registering);
    };
    EXPECT_EQ(describedPath(), "/first");
    EXPECT_TRUE(wasHeldBack);
    registering.get();
    EXPECT_EQ(describedPath(), "/second");
}

TEST(ResourceHooksThreads, AnEngineLeavesOnlyBetweenAnswers)
{
    DescribingEngine engine("/first");
    std::optional<DescribingEngine> copy(engine);
    std::future<void> leaving;
    bool wasHeldBack = false;
    engine.onNextQuestion = [&] {
        leaving = std::async(std::launch::async, [&] { copy.reset(); });
        wasHeldBack = isHeldBack(leaving);
    };
    EXPECT_EQ(describedPath(), "/first");
    EXPECT_TRUE(wasHeldBack);
    leaving.get();
    EXPECT_EQ(describedPath(), "");
}

template <class Provider>
void expectToBecomeEmpty(const Provider& provider)
{
    const auto deadline = std::chrono::steady_clock::now() + 60s;
    while (provider.resource() && std::chrono::steady_clock::now() < deadline)
        std::this_thread::yield();
    EXPECT_FALSE(provider.resource());
}

TEST(ResourceHooksThreads, TheFourHooksOfAProviderAreEmptiedOneAfterTheOther)
{
    LoadingEngine engine;
    std::optional<LoadingEngine> copy(engine);
    std::future<void> leaving;
    engine.onNextAudio = [&] {
        leaving = std::async(std::launch::async, [&] { copy.reset(); });
        // The video hook is emptied and let go of, and then the audio hook is waited for.
        expectToBecomeEmpty(VideoProvider("d", nullptr));
        EXPECT_TRUE(isHeldBack(leaving));
        EXPECT_TRUE(ImageProvider("c", nullptr).resource());
        EXPECT_TRUE(BlobProvider("b", nullptr).resource());
    };
    EXPECT_TRUE(AudioProvider("a", nullptr).resource());
    leaving.get();
    EXPECT_EQ(loadingEngines(), "- - - -");
}

/// Does what the test wants of it while it loads an image.
class ImageEngine : public LoadingEngine
{
public:
    std::unique_ptr<const Resource::Image> imageResource(const QString& id,
                                                         const Types::Image* settings) override
    {
        if (const auto action = std::exchange(onNextImage, nullptr))
            action();
        return LoadingEngine::imageResource(id, settings);
    }

    std::function<void()> onNextImage;
};

TEST(ResourceHooksThreads, TheImageHookOfAProviderIsEmptiedBehindTheAudioHookAndInFrontOfTheBlobHook)
{
    ImageEngine engine;
    std::optional<LoadingEngine> copy(engine);
    std::future<void> leaving;
    engine.onNextImage = [&] {
        leaving = std::async(std::launch::async, [&] { copy.reset(); });
        expectToBecomeEmpty(AudioProvider("a", nullptr));
        EXPECT_TRUE(isHeldBack(leaving));
        EXPECT_TRUE(BlobProvider("b", nullptr).resource());
    };
    EXPECT_TRUE(ImageProvider("c", nullptr).resource());
    leaving.get();
    EXPECT_EQ(loadingEngines(), "- - - -");
}

TEST(ResourceHooksThreads, EnginesThatRegisterAtOnceLeaveOneInEachHook)
{
    for (int round = 0; round != 50; ++round) {
        std::optional<LoadingEngine> loading[4];
        std::optional<DescribingEngine> describing[4];
        std::vector<std::function<void()>> jobs;
        for (int i = 0; i != 4; ++i) {
            jobs.push_back([&, i] { loading[i].emplace("engine"); });
            jobs.push_back([&, i] { describing[i].emplace("/films/a.mp4"); });
        }
        runTogether(jobs);
        EXPECT_EQ(loadingEngines(), "engine engine engine engine");
        EXPECT_EQ(describedPath(), "/films/a.mp4");
        int answers = 0;
        for (int i = 0; i != 4; ++i) {
            answers += loading[i]->audios + loading[i]->blobs + loading[i]->images + loading[i]->videos;
            answers += describing[i]->asked;
        }
        EXPECT_EQ(answers, 5);
    }
}

TEST(ResourceHooksThreads, QuestionsGetAWholeAnswerOrNoneWhileTheHooksAreEmptied)
{
    for (int round = 0; round != 50; ++round) {
        LoadingEngine loading("engine");
        const DescribingEngine describing("/films/a.mp4");
        std::deque<LoadingEngine> loadingCopies;
        std::deque<DescribingEngine> describingCopies;
        loadingCopies.emplace_back(loading);
        describingCopies.emplace_back(describing);
        std::atomic<int> answers = 0;
        const auto ask = [&] {
            for (int n = 0; n != 100; ++n) {
                if (const auto video = VideoProvider("d", nullptr).resource()) {
                    EXPECT_EQ(video->engine, "engine");
                    ++answers;
                }
                const QString path = describedPath();
                if (!path.isEmpty()) {
                    EXPECT_EQ(path, "/films/a.mp4");
                    ++answers;
                }
            }
        };
        runTogether({ask, ask, [&] { loadingCopies.clear(); }, [&] { describingCopies.clear(); }});
        EXPECT_EQ(loading.videos + describing.asked, answers);
        EXPECT_EQ(loadingEngines(), "- - - -");
        EXPECT_EQ(describedPath(), "");
    }
}

TEST(ResourceHooksThreads, LoadingEnginesComeAndGoWhileResourcesAreDescribed)
{
    const DescribingEngine describing("/films/a.mp4");
    const auto ask = [] {
        for (int n = 0; n != 500; ++n)
            EXPECT_EQ(describedPath(), "/films/a.mp4");
    };
    const auto comeAndGo = [] {
        for (int n = 0; n != 500; ++n)
            const LoadingEngine engine;
    };
    runTogether({ask, ask, comeAndGo, comeAndGo});
    EXPECT_EQ(describing.asked, 1000);
    EXPECT_EQ(loadingEngines(), "- - - -");
}

} // namespace
