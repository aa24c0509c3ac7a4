// SPDX-License-Identifier: Apache-2.0
#include "ClassTable.h"

#include <EditorModel/analysis/BeatDetection.h>
#include <EditorModel/analysis/Filmstrip.h>
#include <EditorModel/analysis/SceneDetection.h>
#include <EditorModel/analysis/Stabilization.h>
#include <EditorModel/analysis/Thumbnail.h>
#include <EditorModel/analysis/TrackingData.h>
#include <EditorModel/analysis/TrackingTask.h>
#include <EditorModel/analysis/VUMeter.h>
#include <EditorModel/analysis/Waveform.h>

namespace FieldTests {

template <>
struct Values<SceneDetection::Range>
{
    static std::vector<SceneDetection::Range> all() { return {{3, 4}, {4, 3}, {-1, 0}, {0, 0}}; }
};

namespace {

ClassOf<MotionTracking::Frame> trackingFrame()
{
    using MotionTracking::Frame;
    return ClassOf<Frame>("MotionTracking::Frame")
        .field<&Frame::left>("left", 0.0)
        .field<&Frame::top>("top", 0.0)
        .field<&Frame::width>("width", 1.0)
        .field<&Frame::height>("height", 1.0);
}

ClassTable timedTrackingFrame()
{
    using MotionTracking::TimedFrame;
    return ClassOf<TimedFrame>("MotionTracking::TimedFrame")
        .base(trackingFrame())
        .field<&TimedFrame::duration>("duration", 0);
}

ClassTable trackingData()
{
    using MotionTracking::Data;
    return ClassOf<Data>("MotionTracking::Data")
        .field<&Data::id>("id", "")
        .field<&Data::frames>("frames", {});
}

ClassTable analyzeTask()
{
    using Task = MotionTracking::AnalyzeTask;
    return ClassOf<Task>("MotionTracking::AnalyzeTask", Returns::Reference)
        .field<&Task::resource, &Task::setResource>("resource", {"", Resource::Type(0)})
        .field<&Task::initialFrame, &Task::setInitialFrame>("initialFrame", {0.0, 0.0, 1.0, 1.0})
        .field<&Task::initialPosition, &Task::setInitialPosition>("initialPosition", 0)
        .field<&Task::analyzingRange, &Task::setAnalyzingRange>("analyzingRange", {0, -1})
        .field<&Task::algorithm, &Task::setAlgorithm>("algorithm", MotionTracking::Algorithm(0));
}

ClassTable stabilization()
{
    using Stabilization::Object;
    return ClassOf<Object>("Stabilization::Object")
        .field<&Object::shakiness, &Object::setShakiness>("shakiness", 5)
        .field<&Object::accuracy, &Object::setAccuracy>("accuracy", 15)
        .field<&Object::stepsize, &Object::setStepsize>("stepsize", 6)
        .field<&Object::smoothing, &Object::setSmoothing>("smoothing", 15)
        .field<&Object::optzoom, &Object::setOptzoom>("optzoom", Object::OptimalZooming(1))
        .field<&Object::originalVideoStreamIndex, &Object::setOriginalVideoIndex>("originalVideoStreamIndex",
                                                                                  -1)
        .field<&Object::originalAudioStreamIndex, &Object::setOriginalAudioIndex>("originalAudioStreamIndex",
                                                                                  -1)
        .field<&Object::pathOriginal, &Object::setPathOriginal>("pathOriginal", "")
        .field<&Object::pathStabilized, &Object::setPathStabilized>("pathStabilized", "")
        .field<&Object::sourcePositionOriginal, &Object::setSourcePositionOriginal>("sourcePositionOriginal",
                                                                                    0)
        .field<&Object::sourceDurationOriginal, &Object::setSourceDurationOriginal>("sourceDurationOriginal",
                                                                                    0);
}

ClassTable beatDetection()
{
    using BeatDetection::Object;
    return ClassOf<Object>("BeatDetection::Object")
        .field<&Object::interval, &Object::setInterval>("interval", 2000)
        .field<&Object::beats, &Object::setBeats>("beats", {});
}

ClassTable sceneDetection()
{
    using SceneDetection::Object;
    return ClassOf<Object>("SceneDetection::Object")
        .field<&Object::path, &Object::setPath>("path", "")
        .field<&Object::sourceDuration, &Object::setSourceDuration>("sourceDuration", 0)
        .field<&Object::detectionLevel>("detectionLevel", 20.0)
        .field<&Object::minDuration, &Object::setMinDuration>("minDuration", 0)
        .field<&Object::maxDuration, &Object::setMaxDuration>("maxDuration", 0)
        .field<&Object::state, &Object::setState>("state", SceneDetection::State(0))
        .field<&Object::detectedScenes, &Object::setDetectedScenes>("detectedScenes", {})
        .field<&Object::otherScenes>("otherScenes", {})
        .field<&Object::task, &Object::setTask>("task", nullptr);
}

ClassTable waveform()
{
    using Waveform::Object;
    return ClassOf<Object>("Waveform::Object")
        .field<&Object::resource, &Object::setResource>("resource", {"", Resource::Type(0)})
        .field<&Object::data, &Object::setData>("data", nullptr);
}

ClassTable thumbnail()
{
    using Thumbnail::Object;
    return ClassOf<Object>("Thumbnail::Object")
        .field<&Object::resource, &Object::setResource>("resource", {"", Resource::Type(0)})
        .field<&Object::resourceDuration, &Object::setResourceDuration>("resourceDuration", 0)
        .field<&Object::position, &Object::setPosition>("position", 0)
        .field<&Object::width, &Object::setWidth>("width", 0)
        .field<&Object::height, &Object::setHeight>("height", 0)
        .by<&Object::setSize>("width", "height")
        .field<&Object::image, &Object::setImage>("image", nullptr);
}

ClassTable filmstrip()
{
    using Filmstrip::Object;
    using SetRange = Object* (Object::*)(const Types::Range&);
    return ClassOf<Object>("Filmstrip::Object")
        .field<&Object::resource, &Object::setResource>("resource", {"", Resource::Type(0)})
        .field<&Object::width, &Object::setWidth>("width", 0)
        .field<&Object::height, &Object::setHeight>("height", 0)
        .field<&Object::sourceDuration, &Object::setSourceDuration>("sourceDuration", 0)
        .field<&Object::timingMode, &Object::setTimingMode>("timingMode", Media::TimingMode(0))
        .field<&Object::sourceRange, SetRange(&Object::setSourceRange)>("sourceRange", {0, -1})
        .field<&Object::currentRange, SetRange(&Object::setCurrentRange)>("currentRange", {0, -1})
        .field<&Object::step, &Object::setStep>("step", 0)
        .field<&Object::reversed, &Object::setReversed>("reversed", false)
        .field<&Object::bumpCount>("bumpCount", 0)
        .field<&Object::payload>("payload", nullptr);
}

ClassTable vuMeter()
{
    using VUMeter::Object;
    const Decibel zero = Decibel::fromDbLevel(0.0);
    return ClassOf<Object>("VUMeter::Object")
        .field<&Object::sourceID, &Object::setSourceID>("sourceID", "")
        .field<&Object::role>("role", Object::Role(1))
        .field<&Object::leftChannelPeakLevel, &Object::setLeftChannelPeakLevel>("leftChannelPeakLevel", zero)
        .field<&Object::rightChannelPeakLevel, &Object::setRightChannelPeakLevel>("rightChannelPeakLevel",
                                                                                  zero)
        .field<&Object::leftChannelLevel, &Object::setLeftChannelLevel>("leftChannelLevel", zero)
        .field<&Object::rightChannelLevel, &Object::setRightChannelLevel>("rightChannelLevel", zero)
        .field<&Object::leftChannelClippingDetected, &Object::setLeftChannelClippingDetected>(
            "leftChannelClippingDetected", false)
        .field<&Object::rightChannelClippingDetected, &Object::setRightChannelClippingDetected>(
            "rightChannelClippingDetected", false);
}

} // namespace

std::vector<ClassTable> analysisClasses()
{
    return {trackingFrame(), timedTrackingFrame(), trackingData(),   analyzeTask(),
            stabilization(), beatDetection(),      sceneDetection(), waveform(),
            thumbnail(),     filmstrip(),          vuMeter()};
}

} // namespace FieldTests
