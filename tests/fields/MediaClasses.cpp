// SPDX-License-Identifier: Apache-2.0
#include "FormatClasses.h"

#include <EditorModel/media/FileAnalyzer.h>
#include <EditorModel/media/ResourceHooks.h>
#include <EditorModel/media/ResourceInfo.h>
#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/media/Source.h>

namespace FieldTests {
namespace {

ClassOf<Media::Object> mediaObject()
{
    return ClassOf<Media::Object>("Media::Object").field<&Media::Object::label>("label", "");
}

ClassTable file()
{
    using Media::File;
    return ClassOf<File>("Media::File")
        .base(mediaObject())
        .field<&File::path, &File::setPath>("path", "")
        .field<&File::size, &File::setSize>("size", 0)
        .field<&File::lastModified, &File::setLastModified>("lastModified", 0)
        .field<&File::format, &File::setFormat>("format", "")
        .field<&File::length, &File::setLength>("length", 0)
        .field<&File::metadata, &File::setMetadata>("metadata", nullptr)
        .field<&File::isOpening, &File::setOpening>("isOpening", false)
        .field<&File::isOpened, &File::setOpened>("isOpened", false)
        .field<&File::isFailed, &File::setFailed>("isFailed", false)
        .field<&File::videoTracks>("videoTracks", {})
        .field<&File::audioTracks>("audioTracks", {})
        .field<&File::unsupportedCodecs, &File::setUnsupportedCodecs>("unsupportedCodecs", {})
        .field<&File::composition, &File::setComposition>("composition", nullptr);
}

ClassOf<Media::File::Track> track()
{
    using Track = Media::File::Track;
    return ClassOf<Track>("Media::File::Track")
        .field<&Track::file>("file", nullptr)
        .field<&Track::index>("index", 0)
        .field<&Track::codecId>("codecId", "")
        .field<&Track::bitrate>("bitrate", 0);
}

ClassTable audioTrack()
{
    return ClassOf<Media::File::Track::Audio>("Media::File::Track::Audio").base(audioFormat()).base(track());
}

ClassTable videoTrack()
{
    using Video = Media::File::Track::Video;
    return ClassOf<Video>("Media::File::Track::Video")
        .base(videoFormat())
        .base(track())
        .field<&Video::isImage>("isImage", false);
}

ClassTable fileTarget()
{
    using Media::FileTarget;
    return ClassOf<FileTarget>("Media::FileTarget")
        .base(mediaObject())
        .field<&FileTarget::path, &FileTarget::setPath>("path", "")
        .field<&FileTarget::videoTrack, &FileTarget::setVideoTrack>("videoTrack", 0)
        .field<&FileTarget::audioTrack, &FileTarget::setAudioTrack>("audioTrack", 0);
}

ClassTable source()
{
    using Media::Source;
    return ClassOf<Source>("Media::Source")
        .field<&Source::resource, &Source::setResource>("resource", {"", Resource::Type(0)})
        .field<&Source::from>("from", 0)
        .field<&Source::to>("to", 0)
        .by<&Source::setRange>("from", "to")
        .field<&Source::timingMode, &Source::setTimingMode>("timingMode", Media::TimingMode(0))
        .field<&Source::repeatMode, &Source::setRepeatMode>("repeatMode", Source::RepeatMode(0))
        .field<&Source::sourceDuration, &Source::setSourceDuration>("sourceDuration", 0)
        .field<&Source::speedCompensated, &Source::setSpeedCompensated>("speedCompensated", false)
        .field<&Source::volume, &Source::setVolume>("volume", 100)
        .field<&Source::volumeEnvelope, &Source::setVolumeEnvelope>("volumeEnvelope", nullptr)
        .field<&Source::cropEnvelope, &Source::setCropEnvelope>("cropEnvelope", nullptr)
        .field<&Source::moveEnvelope, &Source::setMoveEnvelope>("moveEnvelope", nullptr)
        .field<&Source::fadeIn>("fadeIn", 0)
        .field<&Source::fadeOut>("fadeOut", 0)
        .by<&Source::setFades>("fadeIn", "fadeOut")
        .field<&Source::reversed, &Source::setReversed>("reversed", false)
        .field<&Source::effects, &Source::setEffects>("effects", {})
        .field<&Source::defaultImpl, &Source::setDefaultImpl>("defaultImpl", "")
        .field<&Source::resizeMode, &Source::setResizeMode>("resizeMode", Media::ResizeMode(0));
}

ClassTable overlaySource()
{
    using Media::OverlaySource;
    return ClassOf<OverlaySource>("Media::OverlaySource", Returns::Reference)
        .field<&OverlaySource::overlay, &OverlaySource::setOverlay>("overlay", nullptr)
        .field<&OverlaySource::moveEnvelope, &OverlaySource::setMoveEnvelope>("moveEnvelope", nullptr)
        .field<&OverlaySource::trackingLinkInfo, &OverlaySource::setTrackingLinkInfo>(
            "trackingLinkInfo", {"", {0.0, 0.0}, nullptr})
        .field<&OverlaySource::sourcePosition, &OverlaySource::setSourcePosition>("sourcePosition", 0)
        .field<&OverlaySource::sourceDuration, &OverlaySource::setSourceDuration>("sourceDuration", 0);
}

ClassTable fileInfo()
{
    using Resource::FileInfo;
    return ClassOf<FileInfo>("Resource::FileInfo")
        .field<&FileInfo::path>("path", "")
        .field<&FileInfo::track>("track", 0)
        .field<&FileInfo::duration>("duration", 0);
}

ClassTable timing()
{
    using Resource::Timing;
    return ClassOf<Timing>("Resource::Timing")
        .field<&Timing::mode>("mode", Timing::Mode(0))
        .field<&Timing::intro>("intro", 0)
        .field<&Timing::outro>("outro", 0)
        .field<&Timing::loopMinCount>("loopMinCount", 0);
}

ClassTable resourceTiming()
{
    using Resource::ResourceTiming;
    return ClassOf<ResourceTiming>("Resource::ResourceTiming",
                                   [](void* memory) { ::new (memory) ResourceTiming(0, 0); })
        .field<&ResourceTiming::position>("position", 0)
        .field<&ResourceTiming::duration>("duration", 0);
}

ClassTable resourceDescriber()
{
    using Resource::Describer;
    return ClassOf<Describer>("Resource::Describer", [](void* memory) { ::new (memory) Describer({}); })
        .field<&Describer::resource>("resource", {"", Resource::Type(0)});
}

ClassTable fileResourceInfo()
{
    using Info = ResourceTable::FileResourceInfo;
    return ClassOf<Info>("ResourceTable::FileResourceInfo")
        .field<&Info::info>("info", {})
        .field<&Info::timing>("timing", {});
}

ClassTable resourceTable()
{
    using ResourceTable::Object;
    return ClassOf<Object>("ResourceTable::Object")
        .field<&Object::resource2fileInfo>("resource2fileInfo", {});
}

ClassTable fileAnalyzer()
{
    using FileAnalyzer::Object;
    return ClassOf<Object>("FileAnalyzer::Object")
        .field<&Object::files, &Object::setFiles>("files", {})
        .field<&Object::status, &Object::setStatus>("status", FileAnalyzer::Status(0))
        .field<&Object::opened, &Object::setOpened>("opened", {})
        .field<&Object::failed, &Object::setFailed>("failed", {});
}

} // namespace

ClassOf<Media::Audio> audioFormat()
{
    using Media::Audio;
    return ClassOf<Audio>("Media::Audio")
        .base(mediaObject())
        .field<&Audio::channelLayout, &Audio::setChannelLayout>("channelLayout",
                                                                Norvel::Conf::ChannelLayout(2))
        .field<&Audio::sampleRate, &Audio::setSampleRate>("sampleRate", 44100)
        .field<&Audio::sampleFormat, &Audio::setSampleFormat>("sampleFormat", Norvel::Conf::SampleFormats(1));
}

ClassOf<Media::Video> videoFormat()
{
    using Media::Video;
    return ClassOf<Video>("Media::Video")
        .base(mediaObject())
        .field<&Video::width>("width", 1920)
        .field<&Video::height>("height", 1080)
        .by<&Video::setGeometry>("width", "height")
        .field<&Video::frameRateN>("frameRateN", 30000)
        .field<&Video::frameRateD>("frameRateD", 1001)
        .by<&Video::setFrameRate>("frameRateN", "frameRateD")
        .field<&Video::aspectX>("aspectX", 1)
        .field<&Video::aspectY>("aspectY", 1)
        .by<&Video::setAspect>("aspectX", "aspectY")
        .field<&Video::exportMode, &Video::setExportMode>("exportMode", false)
        .field<&Video::opaque, &Video::setOpaque>("opaque", true);
}

std::vector<ClassTable> mediaClasses()
{
    return {mediaObject(),    audioFormat(),       videoFormat(),      file(),
            track(),          audioTrack(),        videoTrack(),       fileTarget(),
            source(),         overlaySource(),     fileInfo(),         timing(),
            resourceTiming(), resourceDescriber(), fileResourceInfo(), resourceTable(),
            fileAnalyzer()};
}

} // namespace FieldTests
