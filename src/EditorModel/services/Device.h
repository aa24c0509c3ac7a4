// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/TypedView.h>

#include <QtGlobal>

namespace Media {
class Audio;
class Video;
} // namespace Media

namespace Playback {
class Object;
}

/// The windows and sound devices that a player plays to. The player owns the outputs on the bus, and the
/// modules of the devices observe them.
namespace Device {

template <typename T>
class Output;

/// What a window that shows pictures is to be like.
template <>
class EDITORMODEL_EXPORT Output<Media::Video> : public virtual PubSub::Object
{
public:
    Output* setPlayback(const Playback::Object* value);
    Output* setGeometry(int newWidth, int newHeight);
    Output* setPaddingColor(quint32 argb);
    Output* setFullScreen(bool on);
    Output* setInitialized(bool on);
    Output* setHighQuality(bool on);

    /// Not owned; null if nothing is played.
    const Playback::Object* playback = nullptr;
    int width = 0;  ///< in pixels
    int height = 0; ///< in pixels
    /// Of what the picture leaves free, as ARGB.
    quint32 paddingColor = 0;
    bool fullScreen = false;
    bool initialized = false;
    bool highQuality = false;
};

/// What a sound device is to play.
template <>
class EDITORMODEL_EXPORT Output<Media::Audio> : public virtual PubSub::Object
{
public:
    Output* setPlayback(const Playback::Object* value);
    Output* setVolume(double value);

    /// Not owned; null if nothing is played.
    const Playback::Object* playback = nullptr;
    /// 0 is silence, where an output starts; the scale is that of the modules that play.
    double volume = 0.0;
};

} // namespace Device

extern template class EDITORMODEL_EXPORT Message::View<Device::Output<Media::Audio>>;
extern template class EDITORMODEL_EXPORT Message::View<Device::Output<Media::Video>>;

namespace Device {

/// The typed view of outputs for T, which is Media::Audio or Media::Video.
template <typename T>
class OutputViewBase : private ::Message::View<Device::Output<T>>
{
    EDITORMODEL_TYPED_VIEW(Device::Output<T>, output)
};

extern template class EDITORMODEL_EXPORT OutputViewBase<Media::Audio>;
extern template class EDITORMODEL_EXPORT OutputViewBase<Media::Video>;

/// Tells a module what has become different in an output. The callbacks run in the order in which they stand
/// here, before outputChanged(output), and also on arrival and departure, which compare with a new output.
template <typename T>
class View;

template <>
class EDITORMODEL_EXPORT View<Device::Output<Media::Video>> : public OutputViewBase<Media::Video>
{
protected:
    using OutputViewBase<Media::Video>::outputChanged;
    /// Makes the calls below; a replacement that wants them goes on to this one.
    void outputChanged(const Device::Output<Media::Video>* output,
                       const Device::Output<Media::Video>* oldValue,
                       const Device::Output<Media::Video>* newValue) override;

    /// The values are the whole output, before and after.
    virtual void playbackChanged(const Device::Output<Media::Video>* output,
                                 const Device::Output<Media::Video>* oldValue,
                                 const Device::Output<Media::Video>* newValue);
    virtual void paddingChanged(const Device::Output<Media::Video>* output);
    virtual void geometryChanged(const Device::Output<Media::Video>* output);
    virtual void fullScreenChanged(const Device::Output<Media::Video>* output);
    /// The output has become initialized; nothing is called for the way back.
    virtual void deviceInitialized(const Device::Output<Media::Video>* output);
    virtual void highQualityChanged(const Device::Output<Media::Video>* output);
};

template <>
class EDITORMODEL_EXPORT View<Device::Output<Media::Audio>> : public OutputViewBase<Media::Audio>
{
protected:
    using OutputViewBase<Media::Audio>::outputChanged;
    /// Makes the calls below; a replacement that wants them goes on to this one.
    void outputChanged(const Device::Output<Media::Audio>* output,
                       const Device::Output<Media::Audio>* oldValue,
                       const Device::Output<Media::Audio>* newValue) override;

    /// The values are the whole output, before and after.
    virtual void playbackChanged(const Device::Output<Media::Audio>* output,
                                 const Device::Output<Media::Audio>* oldValue,
                                 const Device::Output<Media::Audio>* newValue);
    /// A volume that is not a number differs from every other one, itself included.
    virtual void volumeChanged(const Device::Output<Media::Audio>* output);
};

} // namespace Device
