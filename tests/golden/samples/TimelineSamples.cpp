// SPDX-License-Identifier: Apache-2.0
#include "Parts.h"

#include <EditorModel/analysis/BeatDetection.h>
#include <EditorModel/analysis/Stabilization.h>
#include <EditorModel/effects/Effect.h>
#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Transition.h>
#include <EditorModel/media/File.h>
#include <EditorModel/timeline/Editor.h>
#include <EditorModel/timeline/Film.h>
#include <EditorModel/timeline/Timeline.h>

namespace GoldenTests {
namespace {

Timeline::Clip& namedClip(Sample& sample, const char* name)
{
    auto& clip = sample.make<Timeline::Clip>();
    clip.name = name;
    return clip;
}

Transition::Object& transition(Sample& sample, const char* id)
{
    auto& transition = sample.make<Transition::Object>();
    transition.id = id;
    return transition;
}

Timeline::ClipTiming fullTiming(const Timeline::Track& track)
{
    Timeline::ClipTiming timing;
    timing.track = &track;
    timing.trackLevel = 3;
    timing.timestamp = 100;
    timing.sourceDuration = 8000;
    timing.sourcePosition = 250;
    timing.duration = 5000;
    timing.speedCompensated = true;
    timing.transitionIn = 40;
    timing.transitionOut = 60;
    timing.fadeInDuration = 70;
    timing.fadeOutDuration = 80;
    timing.timingMode = Media::TimingMode(2);
    return timing;
}

Timeline::TrackingLinkInfo trackingLink(const Timeline::Clip& clip)
{
    Timeline::TrackingLinkInfo info;
    info.trackedObject.clip = &clip;
    info.trackedObject.trackingId = "{t}";
    info.objectRelativeOffset = QPointF(0.25, -0.5);
    return info;
}

/// A track of each type.
void fillTracks(Sample& sample)
{
    const auto root = [&](TrackType type) -> Timeline::Track& {
        auto& track = sample.root<Timeline::Track>();
        track.type = type;
        return track;
    };
    root(PrimaryTrack).muted = true;
    root(ExtraVideoTrack).hidden = true;
    root(NativeAudioTrack).linked = true;
    root(AudioTrack).gapless = true;
    root(TitleTrack).used = false;
    root(QuizTrack).timeline = &sample.make<Timeline::Object>();
}

void fillLabel(Sample& sample)
{
    auto& label = sample.root<Timeline::Label>();
    label.timeline = &sample.make<Timeline::Object>();
    label.position = 330;
    label.name = "Here";
}

void fillLink(Sample& sample)
{
    auto& link = sample.root<Timeline::Link>();
    link.master = &namedClip(sample, "Beach");
    link.offset = -20;
}

void fillTrackedObject(Sample& sample)
{
    sample.root<Timeline::TrackedObject>() = trackingLink(namedClip(sample, "Beach")).trackedObject;
}

void fillTrackingLink(Sample& sample)
{
    sample.root<Timeline::TrackingLinkInfo>() = trackingLink(namedClip(sample, "Beach"));
}

void fillClipTiming(Sample& sample)
{
    auto& track = sample.make<Timeline::Track>();
    track.type = ExtraVideoTrack;
    sample.root<Timeline::ClipTiming>() = fullTiming(track);
    sample.root<Timeline::ClipTiming>().reversed = true;
}

void fillClip(Sample& sample)
{
    auto& overlay = sample.make<Overlay::Preset>();
    overlay.tag = "Greeting";
    auto& quiz = sample.make<Quiz::Preset>();
    quiz.tag = "Numbers";
    auto& file = sample.make<Media::File>();
    file.path = "a.mov";
    auto& nested = sample.make<Timeline::Object>();
    nested.width = 320;
    auto& volume = sample.make<VolumeEnvelope>();
    volume.defaultValue = 0.5;
    auto& crop = sample.make<TransformationEnvelope>();
    crop = opacityEnvelope(50);
    auto& move = sample.make<TransformationEnvelope>();
    move = opacityEnvelope(60);
    auto& blur = sample.make<Effect::Object>();
    blur.id = "blur";
    blur.uniqueId = "{e}";
    auto& rhythm = sample.make<BeatDetection::Object>();
    rhythm.interval = 1500;
    auto& steady = sample.make<Stabilization::Object>();
    steady.shakiness = 6;
    auto& label = sample.make<Timeline::Label>();
    label.position = 330;
    label.name = "Here";

    auto& clip = sample.root<Timeline::Clip>();
    clip.timeline = &sample.make<Timeline::Object>();
    clip.type = Timeline::Clip::IntroVideoClip;
    clip.name = "Clip";
    clip.enabled = false;
    clip.overlay = &overlay;
    clip.quiz = &quiz;
    clip.file = &file;
    clip.nestedTimeline = &nested;
    clip.volume = 30;
    clip.volumeEnvelope = &volume;
    clip.cropEnvelope = &crop;
    clip.moveEnvelope = &move;
    clip.broken = true;
    clip.sourceDuration = 1234;
    clip.effects = {&blur, &blur};
    clip.rhythm = &rhythm;
    clip.stabilization = &steady;
    clip.mediaTrack = 1;
    clip.labels = {&label};
    clip.motionTrackings = {"{b}", "{a}"};

    auto& other = sample.root<Timeline::Clip>();
    other.enabled = false;
    other.unlimitedDuration = true;
}

void fillTimeline(Sample& sample)
{
    auto& timeline = sample.root<Timeline::Object>();
    timeline.width = 640;
    timeline.sampleRate = 48000;
    auto& primary = sample.make<Timeline::Track>();
    primary.type = PrimaryTrack;
    primary.timeline = &timeline;
    auto& native = sample.make<Timeline::Track>();
    native.type = NativeAudioTrack;
    timeline.tracks = {&primary, &native};
    auto& beach = namedClip(sample, "Beach");
    beach.timeline = &timeline;
    beach.type = Timeline::Clip::VideoClip;
    auto& waves = namedClip(sample, "Waves");
    waves.timeline = &timeline;
    waves.type = Timeline::Clip::AudioClip;
    timeline.clips[&beach] = fullTiming(primary);
    timeline.links[&waves].master = &beach;
    timeline.links[&waves].offset = -20;
    timeline.trackingLinks[&waves] = trackingLink(beach);
    timeline.transitions[&transition(sample, "fade")] = {&beach, &waves};
}

void fillEditor(Sample& sample)
{
    auto& editor = sample.root<Editor::Object>();
    editor.enabled = false;
    editor.clips = {&namedClip(sample, "Beach")};
}

void fillFilm(Sample& sample)
{
    auto& master = sample.make<Timeline::Object>();
    master.width = 640;
    auto& slave = sample.make<Timeline::Object>();
    slave.width = 320;
    auto& fade = transition(sample, "fade");
    auto& film = sample.root<Film::Object>();
    film.bindTimeline(&master, &slave);
    film.bindClip(&namedClip(sample, "Master"), &namedClip(sample, "Slave"));
    film.expectedDuration = 61000;
    film.nativeAudioVolume = -3;
    film.detachedAudioVolume = 80;
    film.fitDurationToAudio = true;
    film.transitionsList = {&fade, &transition(sample, "wipe"), &fade};
    sample.root<Film::Object>().cropMode = true;
}

} // namespace

std::vector<NamedSample> timelineSamples()
{
    return {
        {"Timeline::Track", fillTracks},
        {"Timeline::Label", fillLabel},
        {"Timeline::Link", fillLink},
        {"Timeline::TrackedObject", fillTrackedObject},
        {"Timeline::TrackingLinkInfo", fillTrackingLink},
        {"Timeline::ClipTiming", fillClipTiming},
        {"Timeline::Clip", fillClip},
        {"Timeline::Object", fillTimeline},
        {"Editor::Object", fillEditor},
        {"Film::Object", fillFilm},
    };
}

} // namespace GoldenTests
