// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Playback.h>

namespace Playback {

Object* Object::setVideo(const Media::Video* value)
{
    video = value;
    return this;
}

Object* Object::setAudio(const Media::Audio* value)
{
    audio = value;
    return this;
}

Object* Object::setPosition(const Composition::Marker* value)
{
    position = value;
    return this;
}

Object* Object::setBoundRange(const Composition::Range* value)
{
    boundRange = value;
    return this;
}

Object* Object::setState(State value)
{
    state = value;
    return this;
}

Object* Object::setBusy(bool on)
{
    busy = on;
    return this;
}

Object* Object::setWaiting(bool on)
{
    waiting = on;
    return this;
}

Object* Object::play()
{
    return setState(Playing);
}

Object* Object::stop()
{
    return setState(Stopped);
}

} // namespace Playback
