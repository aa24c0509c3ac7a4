// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>

namespace Composition {
struct Marker;
struct Range;
} // namespace Composition

namespace Media {
class Audio;
class Video;
} // namespace Media

namespace Playback {

/// How a player stands. The player owns it on the bus; the flags and the state don't act on one another.
class EDITORMODEL_EXPORT Object : public virtual PubSub::Object
{
public:
    enum State : int
    {
        Stopped = 0,
        Playing = 1,
    };

    Object* setVideo(const Media::Video* value);
    Object* setAudio(const Media::Audio* value);
    Object* setPosition(const Composition::Marker* value);
    Object* setBoundRange(const Composition::Range* value);
    Object* setState(State value);
    Object* setBusy(bool on);
    Object* setWaiting(bool on);

    Object* play();
    Object* stop();

    /// What is played: its pictures and its sound. Nothing that the pointers name is owned, and each may be
    /// null.
    const Media::Video* video = nullptr;
    const Media::Audio* audio = nullptr;
    const Composition::Marker* position = nullptr;
    /// What the playing is confined to.
    const Composition::Range* boundRange = nullptr;
    State state = Stopped;
    bool busy = false;
    /// For data.
    bool waiting = false;
};

} // namespace Playback
