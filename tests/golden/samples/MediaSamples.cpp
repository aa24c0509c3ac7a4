// SPDX-License-Identifier: Apache-2.0
#include "Parts.h"

#include <EditorModel/analysis/BeatDetection.h>
#include <EditorModel/analysis/Stabilization.h>
#include <EditorModel/media/File.h>

namespace GoldenTests {
namespace {

void fillAudio(Sample& sample)
{
    auto& audio = sample.root<Media::Audio>();
    audio.channelLayout = Norvel::Conf::ChannelLayout(63);
    audio.sampleRate = 48000;
    audio.sampleFormat = Norvel::Conf::SampleFormats(8);
}

void fillVideo(Sample& sample)
{
    auto& video = sample.root<Media::Video>();
    video.width = 640;
    video.height = 360;
    video.frameRateN = 24000;
    video.frameRateD = 1002;
    video.aspectX = 4;
    video.aspectY = 3;
}

void fillFile(Sample& sample)
{
    auto& film = sample.root<Media::File>();
    film.path = "/films/a & b.mp4";
    film.size = 5000000000;
    film.format = "mov";
    film.length = 90061;
    film.isOpening = true;
    film.isFailed = true;
    auto& picture = sample.make<Media::File::Track::Video>();
    picture.width = 720;
    picture.file = &film;
    picture.index = 1;
    picture.isImage = true;
    auto& sound = sample.make<Media::File::Track::Audio>();
    sound.sampleRate = 22050;
    sound.file = &film;
    sound.index = 2;
    film.videoTracks = {&picture};
    film.audioTracks = {&sound};
    auto& song = sample.root<Media::File>();
    song.isOpened = true;
    song.isFailed = true;
}

void fillTrack(Sample& sample)
{
    auto& file = sample.make<Media::File>();
    file.path = "a.mov";
    auto& track = sample.root<Media::File::Track>();
    track.file = &file;
    track.index = 3;
    track.codecId = "h264";
    track.bitrate = 1500000;
}

void fillAudioTrack(Sample& sample)
{
    auto& track = sample.root<Media::File::Track::Audio>();
    track.channelLayout = Norvel::Conf::ChannelLayout(3);
    track.sampleRate = 96000;
    track.sampleFormat = Norvel::Conf::SampleFormats(4);
    track.index = 5;
    track.codecId = "aac";
    track.bitrate = 128000;
}

void fillVideoTrack(Sample& sample)
{
    auto& track = sample.root<Media::File::Track::Video>();
    track.width = 320;
    track.height = 200;
    track.frameRateN = 25;
    track.frameRateD = 2;
    track.aspectX = 16;
    track.aspectY = 15;
    track.index = 7;
    track.codecId = "vp9";
    track.bitrate = 900000;
    track.isImage = true;
}

void fillFileInfo(Sample& sample)
{
    sample.root<Resource::FileInfo>() = rainInfo().info;
}

void fillTiming(Sample& sample)
{
    sample.root<Resource::Timing>() = rainInfo().timing;
    sample.root<Resource::Timing>().mode = Resource::Timing::Stretched;
}

void fillResourceInfo(Sample& sample)
{
    sample.root<ResourceTable::FileResourceInfo>() = rainInfo();
}

void fillResourceTable(Sample& sample)
{
    auto& table = sample.root<ResourceTable::Object>();
    table.resource2fileInfo[{"c", Resource::AudioType}] = {};
    table.resource2fileInfo[{"a & b", Resource::ImageType}] = {};
    table.resource2fileInfo[{"a & b", Resource::VideoType}] = rainInfo();
}

void fillBeats(Sample& sample)
{
    auto& rhythm = sample.root<BeatDetection::Object>();
    rhythm.interval = 1500;
    rhythm.beats = {{5000000000, 0.75}, {-40, 0.25}};
}

void fillStabilization(Sample& sample)
{
    auto& steady = sample.root<Stabilization::Object>();
    steady.shakiness = 6;
    steady.accuracy = 14;
    steady.stepsize = 7;
    steady.smoothing = 16;
    steady.optzoom = Stabilization::Object::OptimalZooming(2);
    steady.originalVideoStreamIndex = 3;
    steady.originalAudioStreamIndex = 4;
    steady.pathOriginal = "shaky.mov";
    steady.pathStabilized = "steady.mov";
    steady.sourcePositionOriginal = 110;
    steady.sourceDurationOriginal = 220;
}

void fillFrame(Sample& sample)
{
    sample.root<MotionTracking::Frame>() = timedFrame();
}

void fillTimedFrame(Sample& sample)
{
    sample.root<MotionTracking::TimedFrame>() = timedFrame();
}

void fillTracking(Sample& sample)
{
    sample.root<MotionTracking::Data>() = tracking();
}

} // namespace

ResourceTable::FileResourceInfo rainInfo()
{
    ResourceTable::FileResourceInfo rain;
    rain.info.path = "rain.mov";
    rain.info.duration = 61000;
    rain.info.track = 2;
    rain.timing.mode = Resource::Timing::Looped;
    rain.timing.intro = 500;
    rain.timing.outro = 700;
    rain.timing.loopMinCount = 4;
    return rain;
}

MotionTracking::TimedFrame timedFrame()
{
    MotionTracking::TimedFrame frame;
    frame.left = 0.125;
    frame.top = 0.25;
    frame.width = 0.5;
    frame.height = 0.75;
    frame.duration = 40;
    return frame;
}

MotionTracking::Data tracking()
{
    MotionTracking::Data data("{t}");
    data.frames[MTime(61000)] = {};
    data.frames[MTime(-40)] = timedFrame();
    return data;
}

std::vector<NamedSample> mediaSamples()
{
    return {
        {"Audio", fillAudio},
        {"Video", fillVideo},
        {"File", fillFile},
        {"Track", fillTrack},
        {"AudioTrack", fillAudioTrack},
        {"VideoTrack", fillVideoTrack},
        {"Resource::FileInfo", fillFileInfo},
        {"Resource::Timing", fillTiming},
        {"ResourceTable::FileResourceInfo", fillResourceInfo},
        {"ResourceTable::Object", fillResourceTable},
        {"BeatDetection::Object", fillBeats},
        {"Stabilization::Object", fillStabilization},
        {"MotionTracking::Frame", fillFrame},
        {"MotionTracking::TimedFrame", fillTimedFrame},
        {"MotionTracking::Data", fillTracking},
    };
}

} // namespace GoldenTests
