// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Capture.h>

namespace Capture {

template class Object<Audio>;

Audio* Audio::setQuality(Quality value)
{
    quality = value;
    return this;
}

Audio* Audio::setVolume(int value)
{
    volume = value;
    return this;
}

Audio* Audio::setMode(Mode value)
{
    mode = value;
    return this;
}

CountDown* CountDown::setValue(int newValue)
{
    value = newValue;
    return this;
}

} // namespace Capture
