// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/services/Device.h>
#include <EditorModel/services/Playback.h>

#include <sstream>
#include <string>
#include <utility>
#include <vector>

namespace ServicesTests {

using AudioOutput = Device::Output<Media::Audio>;
using VideoOutput = Device::Output<Media::Video>;
using Lines = std::vector<std::string>;

/// What is played is written as the state of its player, and "-" where nothing is.
inline std::string text(const Playback::Object* playback)
{
    return playback ? std::to_string(playback->state) : "-";
}

/// The flags are "f" for full screen, "i" for initialized and "h" for high quality.
inline std::string text(const VideoOutput* output)
{
    std::ostringstream out;
    out << text(output->playback) << "/" << output->paddingColor << "/" << output->width << "x"
        << output->height << "/" << (output->fullScreen ? "f" : "") << (output->initialized ? "i" : "")
        << (output->highQuality ? "h" : "");
    return out.str();
}

inline std::string text(const AudioOutput* output)
{
    std::ostringstream out;
    out << text(output->playback) << "/" << output->volume;
    return out.str();
}

/// The device module for one kind of output, which writes every callback into a list that it may share.
template <class T>
class DeviceModule : public Device::View<T>
{
public:
    DeviceModule(Lines& lines, std::string name) : m_lines(&lines), m_name(std::move(name)) {}

    using Device::View<T>::output;
    using Device::View<T>::outputs;
    using Device::View<T>::outputAdd;
    using Device::View<T>::outputOwn;
    using Device::View<T>::outputChange;
    using Device::View<T>::outputRemove;
    using Device::View<T>::outputForget;
    using Device::View<T>::outputObserve;
    using Device::View<T>::outputIsObserved;
    using Device::View<T>::outputIsOwned;
    using Device::View<T>::outputOwnerPointer;

protected:
    void write(const std::string& what, const T* object)
    {
        m_lines->push_back(m_name + ": " + what + " " + text(object));
    }

    void outputAdded(const T* object) override { write("added", object); }
    void outputRemoved(const T* object) override { write("removed", object); }
    void outputChanged(const T* object, const T* oldValue, const T* newValue) override
    {
        m_lines->push_back(m_name + ": changed " + text(oldValue) + " to " + text(newValue));
        Device::View<T>::outputChanged(object, oldValue, newValue);
    }
    void outputChanged(const T*, const T* oldValue) override { write("changed from", oldValue); }
    void outputChanged(const T* object) override { write("changed to", object); }
    void playbackChanged(const T* object, const T* oldValue, const T* newValue) override
    {
        write("playback from " + text(oldValue) + " to " + text(newValue) + " of", object);
    }

private:
    Lines* m_lines;
    std::string m_name;
};

class Window : public DeviceModule<VideoOutput>
{
public:
    using DeviceModule::DeviceModule;

protected:
    void paddingChanged(const VideoOutput* object) override { write("padding", object); }
    void geometryChanged(const VideoOutput* object) override { write("geometry", object); }
    void fullScreenChanged(const VideoOutput* object) override { write("fullScreen", object); }
    void deviceInitialized(const VideoOutput* object) override { write("initialized", object); }
    void highQualityChanged(const VideoOutput* object) override { write("highQuality", object); }
};

class Speaker : public DeviceModule<AudioOutput>
{
public:
    using DeviceModule::DeviceModule;

protected:
    void volumeChanged(const AudioOutput* object) override { write("volume", object); }
};

} // namespace ServicesTests
