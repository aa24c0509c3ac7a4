// SPDX-License-Identifier: Apache-2.0
#include "ClassTable.h"

#include <EditorModel/services/Capture.h>
#include <EditorModel/services/Device.h>
#include <EditorModel/services/Playback.h>
#include <EditorModel/services/Report.h>
#include <EditorModel/services/Statistics.h>
#include <EditorModel/services/Task.h>

namespace FieldTests {
namespace {

ClassTable task()
{
    using Task::Object;
    return ClassOf<Object>("Task::Object")
        .field<&Object::type, &Object::setType>("type", Object::Type(5))
        .field<&Object::priority, &Object::setPriority>("priority", Object::Priority(1))
        .field<&Object::state, &Object::setState>("state", Object::State(0))
        .field<&Object::executor, &Object::setExecutor>("executor", nullptr)
        .field<&Object::progress, &Object::setProgress>("progress", 0.0);
}

ClassTable progress()
{
    using Report::Progress;
    return ClassOf<Progress>("Report::Progress")
        .field<&Progress::total, &Progress::setTotal>("total", 0)
        .field<&Progress::passed, &Progress::setPassed>("passed", 0)
        .field<&Progress::label, &Progress::setLabel>("label", "")
        .field<&Progress::title, &Progress::setTitle>("title", "")
        .field<&Progress::cancelButtonText, &Progress::setCancelButtonText>("cancelButtonText", "")
        .field<&Progress::cancelled, &Progress::cancel>("cancelled", false)
        .field<&Progress::uniqueModal, &Progress::setUniqueModal>("uniqueModal", true);
}

ClassTable playback()
{
    using Playback::Object;
    return ClassOf<Object>("Playback::Object")
        .field<&Object::video, &Object::setVideo>("video", nullptr)
        .field<&Object::audio, &Object::setAudio>("audio", nullptr)
        .field<&Object::position, &Object::setPosition>("position", nullptr)
        .field<&Object::boundRange, &Object::setBoundRange>("boundRange", nullptr)
        .field<&Object::state, &Object::setState>("state", Object::State(0))
        .field<&Object::busy, &Object::setBusy>("busy", false)
        .field<&Object::waiting, &Object::setWaiting>("waiting", false);
}

ClassTable videoOutput()
{
    using Output = Device::Output<Media::Video>;
    return ClassOf<Output>("Device::Output<Media::Video>")
        .field<&Output::playback, &Output::setPlayback>("playback", nullptr)
        .field<&Output::width>("width", 0)
        .field<&Output::height>("height", 0)
        .by<&Output::setGeometry>("width", "height")
        .field<&Output::paddingColor, &Output::setPaddingColor>("paddingColor", 0)
        .field<&Output::fullScreen, &Output::setFullScreen>("fullScreen", false)
        .field<&Output::initialized, &Output::setInitialized>("initialized", false)
        .field<&Output::highQuality, &Output::setHighQuality>("highQuality", false);
}

ClassTable audioOutput()
{
    using Output = Device::Output<Media::Audio>;
    return ClassOf<Output>("Device::Output<Media::Audio>")
        .field<&Output::playback, &Output::setPlayback>("playback", nullptr)
        .field<&Output::volume, &Output::setVolume>("volume", 0.0);
}

ClassTable audioCapture()
{
    using Capture::Audio;
    return ClassOf<Audio>("Capture::Audio")
        .field<&Audio::state>("state", Audio::State(0))
        .field<&Audio::sourceId, &Audio::setSourceId>("sourceId", "")
        .field<&Audio::deviceId, &Audio::setDeviceId>("deviceId", "")
        .field<&Audio::filePath, &Audio::setFilePath>("filePath", "")
        .field<&Audio::errorString, &Audio::setErrorString>("errorString", "")
        .field<&Audio::duration, &Audio::setDuration>("duration", 0)
        .field<&Audio::quality, &Audio::setQuality>("quality", Audio::Quality(5))
        .field<&Audio::volume, &Audio::setVolume>("volume", 100)
        .field<&Audio::mode, &Audio::setMode>("mode", Audio::Mode(0));
}

ClassTable countDown()
{
    using Capture::CountDown;
    return ClassOf<CountDown>("Capture::CountDown")
        .field<&CountDown::value, &CountDown::setValue>("value", 0);
}

ClassTable statistics()
{
    return ClassOf<Statistics::Object>("Statistics::Object");
}

} // namespace

std::vector<ClassTable> serviceClasses()
{
    return {task(),        progress(),     playback(),  videoOutput(),
            audioOutput(), audioCapture(), countDown(), statistics()};
}

} // namespace FieldTests
