// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Device.h>

template class Message::View<Device::Output<Media::Audio>>;
template class Message::View<Device::Output<Media::Video>>;

namespace Device {

template class OutputViewBase<Media::Audio>;
template class OutputViewBase<Media::Video>;

using AudioOutput = Output<Media::Audio>;
using VideoOutput = Output<Media::Video>;

VideoOutput* VideoOutput::setPlayback(const Playback::Object* value)
{
    playback = value;
    return this;
}

VideoOutput* VideoOutput::setGeometry(int newWidth, int newHeight)
{
    width = newWidth;
    height = newHeight;
    return this;
}

VideoOutput* VideoOutput::setPaddingColor(quint32 argb)
{
    paddingColor = argb;
    return this;
}

VideoOutput* VideoOutput::setFullScreen(bool on)
{
    fullScreen = on;
    return this;
}

VideoOutput* VideoOutput::setInitialized(bool on)
{
    initialized = on;
    return this;
}

VideoOutput* VideoOutput::setHighQuality(bool on)
{
    highQuality = on;
    return this;
}

AudioOutput* AudioOutput::setPlayback(const Playback::Object* value)
{
    playback = value;
    return this;
}

AudioOutput* AudioOutput::setVolume(double value)
{
    volume = value;
    return this;
}

void View<VideoOutput>::outputChanged(const VideoOutput* output, const VideoOutput* oldValue,
                                      const VideoOutput* newValue)
{
    if (oldValue->playback != newValue->playback)
        playbackChanged(output, oldValue, newValue);
    if (oldValue->paddingColor != newValue->paddingColor)
        paddingChanged(output);
    if (oldValue->width != newValue->width || oldValue->height != newValue->height)
        geometryChanged(output);
    if (oldValue->fullScreen != newValue->fullScreen)
        fullScreenChanged(output);
    if (!oldValue->initialized && newValue->initialized)
        deviceInitialized(output);
    if (oldValue->highQuality != newValue->highQuality)
        highQualityChanged(output);
}

void View<VideoOutput>::playbackChanged(const VideoOutput*, const VideoOutput*, const VideoOutput*) {}
void View<VideoOutput>::paddingChanged(const VideoOutput*) {}
void View<VideoOutput>::geometryChanged(const VideoOutput*) {}
void View<VideoOutput>::fullScreenChanged(const VideoOutput*) {}
void View<VideoOutput>::deviceInitialized(const VideoOutput*) {}
void View<VideoOutput>::highQualityChanged(const VideoOutput*) {}

void View<AudioOutput>::outputChanged(const AudioOutput* output, const AudioOutput* oldValue,
                                      const AudioOutput* newValue)
{
    if (oldValue->playback != newValue->playback)
        playbackChanged(output, oldValue, newValue);
    if (oldValue->volume != newValue->volume)
        volumeChanged(output);
}

void View<AudioOutput>::playbackChanged(const AudioOutput*, const AudioOutput*, const AudioOutput*) {}
void View<AudioOutput>::volumeChanged(const AudioOutput*) {}

} // namespace Device
