// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/media/ResourceInfo.h>
#include <EditorModel/media/ResourceRef.h>

#include <QString>

#include <memory>
#include <tuple>

/// The hooks through which the engine answers questions about resources. There are five, for the whole
/// process: one for the describer and one for each kind of loaded resource. Each has a lock of its own, which
/// is held while its question is answered: questions may come from any thread, they wait for one another, and
/// an implementation that asks its own hook again on the same thread never gets an answer.
///
/// An implementation is registered before its own constructor has begun and stays so until its destructor has
/// ended. Where other threads ask, they must not do so in the meantime.

namespace Composition {
struct Object;
}

namespace Media {
class Audio;
class Video;
} // namespace Media

namespace Types {
/// Defined by whichever module reads it.
class Blob;
class Image;
} // namespace Types

namespace Resource {

/// The loaded forms of resources, defined by the engine.
class Audio;
class Blob;
class Image;
class Video;

class Describer;

namespace Details {

/// What the engine implements to describe resources. The default constructor registers the object in place of
/// any other. The destructor empties the hook, whoever is registered; a copy isn't registered, but its
/// destructor does the same.
class EDITORMODEL_EXPORT Describer
{
public:
    virtual ~Describer();

    /// Null for what isn't known. What is pointed at stays the implementation's.
    virtual const FileInfo* fileInfo(const Resource::Describer& resource) const = 0;
    virtual const Composition::Object* composition(const Resource::Describer& resource) const = 0;
    virtual Timing timing(const Resource::Describer& resource) const = 0;

protected:
    Describer();
    Describer(const Describer& other);
    Describer& operator=(const Describer& other);
};

/// What the engine implements to load resources. The default constructor registers the object in all four
/// hooks, in place of any other. The destructor empties them, whoever is registered; a copy isn't registered,
/// but its destructor does the same.
class EDITORMODEL_EXPORT Provider
{
public:
    virtual ~Provider();

    /// Null for what can't be loaded. `settings` may be null, as the asker gives it.
    virtual std::unique_ptr<const Blob> blobResource(const QString& id, const Types::Blob* settings) = 0;
    virtual std::unique_ptr<const Image> imageResource(const QString& id, const Types::Image* settings) = 0;
    virtual std::unique_ptr<const Audio> audioResource(const QString& id, const Media::Audio* settings) = 0;
    virtual std::unique_ptr<const Video> videoResource(const QString& id, const Media::Video* settings) = 0;

protected:
    Provider();
    Provider(const Provider& other);
    Provider& operator=(const Provider& other);

private:
    static void registerEverywhere(Provider* impl);
};

/// The hooks of a provider.
enum ProviderHook : int
{
    AudioHook,
    BlobHook,
    ImageHook,
    VideoHook,
};

/// Holds the lock of a hook while it lives.
class EDITORMODEL_EXPORT ProviderLock
{
public:
    explicit ProviderLock(ProviderHook hook);
    ~ProviderLock();
    ProviderLock(const ProviderLock&) = delete;
    ProviderLock& operator=(const ProviderLock&) = delete;

    /// Null where none is registered.
    Provider* impl() const;

private:
    const ProviderHook m_hook;
};

/// Which hook and which operation give the loaded form `R`.
template <class R>
struct Loading;

template <>
struct Loading<Audio>
{
    static constexpr auto hook = AudioHook;
    static constexpr auto operation = &Provider::audioResource;
};

template <>
struct Loading<Blob>
{
    static constexpr auto hook = BlobHook;
    static constexpr auto operation = &Provider::blobResource;
};

template <>
struct Loading<Image>
{
    static constexpr auto hook = ImageHook;
    static constexpr auto operation = &Provider::imageResource;
};

template <>
struct Loading<Video>
{
    static constexpr auto hook = VideoHook;
    static constexpr auto operation = &Provider::videoResource;
};

} // namespace Details

/// Asks the engine about one resource.
class EDITORMODEL_EXPORT Describer
{
public:
    Describer(const ResourceRef& ref);

    /// What the engine tells, and owns; null where none is registered.
    const FileInfo* fileInfo() const;
    /// What the engine tells, and owns; null where none is registered.
    const Composition::Object* composition() const;
    /// A default one where no engine is registered.
    Timing timing() const;

    ResourceRef resource;

private:
    friend class Details::Describer;
    static void registerImpl(Details::Describer* impl);
};

/// Asks the engine for the loaded form `R` of a resource, with settings `S` that the engine reads: `Audio`
/// with `Media::Audio`, `Blob` with `Types::Blob`, `Image` with `Types::Image`, `Video` with `Media::Video`.
template <class R, class S>
class Provider
{
public:
    /// Takes the identifier and drops the kind. The settings aren't owned and outlive the question.
    Provider(const ResourceRef& ref, const S* settings_) : Provider(std::get<QString>(ref), settings_) {}
    Provider(const QString& id_, const S* settings_) : id(id_), settings(settings_) {}

    /// Null where no engine is registered. `R` is complete where this is called: the result deletes it.
    std::unique_ptr<const R> resource() const
    {
        const Details::ProviderLock lock(Details::Loading<R>::hook);
        Details::Provider* const impl = lock.impl();
        if (!impl)
            return nullptr;
        return (impl->*Details::Loading<R>::operation)(id, settings);
    }

    QString id;
    const S* settings;

private:
    friend class Details::Provider;
    static void registerImpl(Details::Provider* impl);
};

} // namespace Resource
