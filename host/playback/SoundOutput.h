// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/services/Device.h>

namespace Host {

/// The module of a sound device that there is none of: it has an output, adds it for whichever player takes
/// outputs, and ends its sharing when it ends itself.
class SoundOutput : private Device::View<Device::Output<Media::Audio>>
{
public:
    /// As a factor: 1.0 leaves the sound as it is.
    explicit SoundOutput(double volume);
    SoundOutput(const SoundOutput&) = delete;
    ~SoundOutput() override;

    const Device::Output<Media::Audio>* output() const { return &m_output; }

private:
    Device::Output<Media::Audio> m_output;
};

} // namespace Host
