// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/ResourceHooks.h>

#include <array>
#include <mutex>

namespace Resource {
namespace {

template <class Impl>
struct Hook
{
    void set(Impl* newImpl)
    {
        const std::lock_guard guard(mutex);
        impl = newImpl;
    }

    std::mutex mutex;
    Impl* impl = nullptr;
};

// Never destroyed: an implementation of static life leaves its hook late.

Hook<Details::Describer>& describerHook()
{
    static auto& hook = *new Hook<Details::Describer>;
    return hook;
}

Hook<Details::Provider>& providerHook(Details::ProviderHook which)
{
    static auto& hooks = *new std::array<Hook<Details::Provider>, 4>;
    return hooks[which];
}

} // namespace

Describer::Describer(const ResourceRef& ref) : resource(ref) {}

const FileInfo* Describer::fileInfo() const
{
    auto& hook = describerHook();
    const std::lock_guard guard(hook.mutex);
    return hook.impl ? hook.impl->fileInfo(*this) : nullptr;
}

const Composition::Object* Describer::composition() const
{
    auto& hook = describerHook();
    const std::lock_guard guard(hook.mutex);
    return hook.impl ? hook.impl->composition(*this) : nullptr;
}

Timing Describer::timing() const
{
    auto& hook = describerHook();
    const std::lock_guard guard(hook.mutex);
    return hook.impl ? hook.impl->timing(*this) : Timing();
}

void Describer::registerImpl(Details::Describer* impl)
{
    describerHook().set(impl);
}

template <class R, class S>
void Provider<R, S>::registerImpl(Details::Provider* impl)
{
    providerHook(Details::Loading<R>::hook).set(impl);
}

namespace Details {

Describer::Describer()
{
    Resource::Describer::registerImpl(this);
}

Describer::Describer(const Describer&) {}

Describer& Describer::operator=(const Describer&)
{
    return *this;
}

Describer::~Describer()
{
    Resource::Describer::registerImpl(nullptr);
}

Provider::Provider()
{
    registerEverywhere(this);
}

Provider::Provider(const Provider&) {}

Provider& Provider::operator=(const Provider&)
{
    return *this;
}

Provider::~Provider()
{
    registerEverywhere(nullptr);
}

void Provider::registerEverywhere(Provider* impl)
{
    Resource::Provider<Video, Media::Video>::registerImpl(impl);
    Resource::Provider<Audio, Media::Audio>::registerImpl(impl);
    Resource::Provider<Image, Types::Image>::registerImpl(impl);
    Resource::Provider<Blob, Types::Blob>::registerImpl(impl);
}

ProviderLock::ProviderLock(ProviderHook hook) : m_hook(hook)
{
    providerHook(m_hook).mutex.lock();
}

ProviderLock::~ProviderLock()
{
    providerHook(m_hook).mutex.unlock();
}

Provider* ProviderLock::impl() const
{
    return providerHook(m_hook).impl;
}

} // namespace Details
} // namespace Resource
