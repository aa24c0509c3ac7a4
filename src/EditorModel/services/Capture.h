// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/types/MTime.h>

#include <QString>

#include <string>

/// How recorders stand. A recorder owns its record on the bus and does the recording.
namespace Capture {

/// What all recorders have in common. T is the class that derives from it. The setters store what they are
/// given, and all that returns a T* returns this object. The model itself reads none of the fields.
template <typename T>
class Object : public virtual PubSub::Object
{
public:
    enum State : int
    {
        Stopped = 0,
        Started = 1,
        Failed = 2,
    };

    T* impl();

    /// Both set Stopped.
    T* reset();
    T* stop();
    T* start();
    /// Sets Failed, no more: what went wrong is told by setErrorString().
    T* error();

    T* setSourceId(const QString& value);
    T* setDeviceId(const std::string& value);
    T* setFilePath(const QString& value);
    T* setErrorString(const QString& value);
    T* setDuration(MTime value);

    /// Gives the fields that stand here the values of a new T; those of the derived class stay.
    T* clear();

    State state = Stopped;
    QString sourceId;
    std::string deviceId;
    /// Where the recording goes.
    QString filePath;
    QString errorString;
    MTime duration;
};

class Audio;

extern template class EDITORMODEL_EXPORT Object<Audio>;

/// How a recorder of sound stands.
class EDITORMODEL_EXPORT Audio : public Capture::Object<Audio>
{
public:
    /// The values belong to the recorder; others are reached by a cast.
    enum Quality : int
    {
        DefaultQuality = 5,
    };

    /// The values belong to the recorder; others are reached by a cast.
    enum Mode : int
    {
        DefaultMode = 0,
    };

    Audio* setQuality(Quality value);
    Audio* setVolume(int value);
    Audio* setMode(Mode value);

    Quality quality = DefaultQuality;
    int volume = 100; ///< the unit is a matter of the recorder
    Mode mode = DefaultMode;
};

/// What is counted down before a recording starts.
class EDITORMODEL_EXPORT CountDown : public virtual PubSub::Object
{
public:
    CountDown* setValue(int newValue);

    /// The unit is that of whoever counts.
    int value = 0;
};

template <typename T>
T* Object<T>::impl()
{
    return static_cast<T*>(this);
}

template <typename T>
T* Object<T>::reset()
{
    state = Stopped;
    return impl();
}

template <typename T>
T* Object<T>::stop()
{
    state = Stopped;
    return impl();
}

template <typename T>
T* Object<T>::start()
{
    state = Started;
    return impl();
}

template <typename T>
T* Object<T>::error()
{
    state = Failed;
    return impl();
}

template <typename T>
T* Object<T>::setSourceId(const QString& value)
{
    sourceId = value;
    return impl();
}

template <typename T>
T* Object<T>::setDeviceId(const std::string& value)
{
    deviceId = value;
    return impl();
}

template <typename T>
T* Object<T>::setFilePath(const QString& value)
{
    filePath = value;
    return impl();
}

template <typename T>
T* Object<T>::setErrorString(const QString& value)
{
    errorString = value;
    return impl();
}

template <typename T>
T* Object<T>::setDuration(MTime value)
{
    duration = value;
    return impl();
}

template <typename T>
T* Object<T>::clear()
{
    const T fresh;
    Object::operator=(fresh);
    return impl();
}

} // namespace Capture
