// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/media/Resource.h>

#include <functional>
#include <memory>
#include <string>
#include <utility>

// What an engine defines of the loaded forms and the settings.

namespace Types {
class Blob
{};
} // namespace Types

namespace Resource {

/// Says which engine loaded it, from which identifier and with which settings.
struct Loaded
{
    std::string engine;
    QString id;
    const void* settings;
};
class Audio : public Loaded
{};
class Blob : public Loaded
{};
class Image : public Loaded
{};
class Video : public Loaded
{};

} // namespace Resource

namespace MediaTests {

using AudioProvider = Resource::Provider<Resource::Audio, Media::Audio>;
using BlobProvider = Resource::Provider<Resource::Blob, Types::Blob>;
using ImageProvider = Resource::Provider<Resource::Image, Types::Image>;
using VideoProvider = Resource::Provider<Resource::Video, Media::Video>;

/// Loads everything, after it has done what the test wants of it. The counts have no lock of their own.
class LoadingEngine : public Resource::Details::Provider
{
public:
    explicit LoadingEngine(std::string aName = "engine") : name(std::move(aName)) {}

    std::unique_ptr<const Resource::Blob> blobResource(const QString& id,
                                                       const Types::Blob* settings) override
    {
        ++blobs;
        return load<Resource::Blob>(id, settings);
    }
    std::unique_ptr<const Resource::Image> imageResource(const QString& id,
                                                         const Types::Image* settings) override
    {
        ++images;
        return load<Resource::Image>(id, settings);
    }
    std::unique_ptr<const Resource::Audio> audioResource(const QString& id,
                                                         const Media::Audio* settings) override
    {
        ++audios;
        if (const auto action = std::exchange(onNextAudio, nullptr))
            action();
        return load<Resource::Audio>(id, settings);
    }
    std::unique_ptr<const Resource::Video> videoResource(const QString& id,
                                                         const Media::Video* settings) override
    {
        ++videos;
        return load<Resource::Video>(id, settings);
    }

    std::string name;
    std::function<void()> onNextAudio;
    int audios = 0;
    int blobs = 0;
    int images = 0;
    int videos = 0;

private:
    template <class R>
    std::unique_ptr<const R> load(const QString& id, const void* settings) const
    {
        auto loaded = std::make_unique<R>();
        loaded->engine = name;
        loaded->id = id;
        loaded->settings = settings;
        return loaded;
    }
};

/// Describes everything alike, after it has done what the test wants of it.
class DescribingEngine : public Resource::Details::Describer
{
public:
    explicit DescribingEngine(const QString& path = "/films/a.mp4") { info.path = path; }

    const Resource::FileInfo* fileInfo(const Resource::Describer& resource) const override
    {
        ask(resource);
        return &info;
    }
    const Composition::Object* composition(const Resource::Describer& resource) const override
    {
        ask(resource);
        return outline;
    }
    Resource::Timing timing(const Resource::Describer& resource) const override
    {
        ask(resource);
        Resource::Timing timing;
        timing.loopMinCount = 5;
        return timing;
    }

    Resource::FileInfo info;
    const Composition::Object* outline = nullptr;
    mutable std::function<void()> onNextQuestion;
    mutable int asked = 0;
    mutable const Resource::Describer* asker = nullptr;

private:
    void ask(const Resource::Describer& resource) const
    {
        ++asked;
        asker = &resource;
        if (const auto action = std::exchange(onNextQuestion, nullptr))
            action();
    }
};

/// The names of the engines behind the four hooks, in the order audio, blob, image, video.
inline std::string loadingEngines()
{
    const auto nameOf = [](const auto& loaded) { return loaded ? loaded->engine : "-"; };
    return nameOf(AudioProvider("id", nullptr).resource()) + " " +
           nameOf(BlobProvider("id", nullptr).resource()) + " " +
           nameOf(ImageProvider("id", nullptr).resource()) + " " +
           nameOf(VideoProvider("id", nullptr).resource());
}

/// The path that the registered engine tells; empty where there is none.
inline QString describedPath()
{
    const Resource::FileInfo* const info = Resource::Describer({"id", Resource::VideoType}).fileInfo();
    return info ? info->path : QString();
}

} // namespace MediaTests
