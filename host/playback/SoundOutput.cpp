// SPDX-License-Identifier: Apache-2.0
#include "host/playback/SoundOutput.h"

namespace Host {

SoundOutput::SoundOutput(double volume)
{
    outputAdd(&m_output)->setVolume(volume);
}

SoundOutput::~SoundOutput()
{
    outputRemove(&m_output);
}

} // namespace Host
