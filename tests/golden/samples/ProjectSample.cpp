// SPDX-License-Identifier: Apache-2.0
#include "Parts.h"

#include <EditorModel/analysis/BeatDetection.h>
#include <EditorModel/analysis/Stabilization.h>
#include <EditorModel/effects/Effect.h>
#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Transition.h>
#include <EditorModel/library/Project.h>
#include <EditorModel/library/UserObject.h>
#include <EditorModel/media/File.h>
#include <EditorModel/timeline/Film.h>
#include <EditorModel/timeline/Timeline.h>

namespace GoldenTests {
namespace {

using Timeline::Clip;

/// A timeline of 1280 by 720 with a clip of every kind, and one within it that opens the film.
struct Cut
{
    explicit Cut(Sample& aSample);

    Clip& clip(int index, const char* name, Clip::ClipType type);
    void place(int index, const Timeline::Track& track, MTime timestamp, MTime duration);
    Timeline::ClipTiming& timing(int index) { return main.clips[&clips[index]]; }

    Sample& sample;
    Timeline::Object& main;
    Timeline::Object& opening;
    Timeline::Track* const tracks;
    Clip* const clips;
};

/// In the order of the clips.
enum ClipIndex : int
{
    Beach,
    Photo,
    Waves,
    Song,
    Title,
    Riddle,
    Opening,
    Sky,
    Wind,
    Credits,
    ClipCount,
};

constexpr TrackType trackTypes[] = {PrimaryTrack, ExtraVideoTrack, NativeAudioTrack,
                                    AudioTrack,   TitleTrack,      QuizTrack};

Cut::Cut(Sample& aSample)
    : sample(aSample),
      main(sample.make<Timeline::Object>()),
      opening(sample.make<Timeline::Object>()),
      tracks(sample.row<Timeline::Track>(std::size(trackTypes))),
      clips(sample.row<Clip>(ClipCount))
{
    main.width = 1280;
    main.height = 720;
    main.sampleRate = 48000;
    opening.width = 320;
    for (std::size_t i = 0; i != std::size(trackTypes); ++i) {
        tracks[i].type = trackTypes[i];
        tracks[i].timeline = &main;
        main.tracks.push_back(&tracks[i]);
    }
    tracks[0].gapless = true;
    tracks[2].linked = true;
    tracks[3].muted = true;
}

Clip& Cut::clip(int index, const char* name, Clip::ClipType type)
{
    Clip& clip = clips[index];
    clip.timeline = index < Sky ? &main : &opening;
    clip.name = name;
    clip.type = type;
    return clip;
}

void Cut::place(int index, const Timeline::Track& track, MTime timestamp, MTime duration)
{
    Timeline::ClipTiming& timing = (index < Sky ? main : opening).clips[&clips[index]];
    timing.track = &track;
    timing.timestamp = timestamp;
    timing.duration = duration;
    timing.sourceDuration = duration;
}

Media::File& filmFile(Sample& sample)
{
    auto& film = sample.make<Media::File>();
    film.path = "film.mov";
    film.size = 5000000000;
    film.format = "mov";
    film.length = 90061;
    film.isOpened = true;
    auto& picture = sample.make<Media::File::Track::Video>();
    picture.width = 1280;
    picture.height = 720;
    picture.file = &film;
    picture.codecId = "h264";
    picture.bitrate = 1500000;
    auto& sound = sample.make<Media::File::Track::Audio>();
    sound.sampleRate = 48000;
    sound.file = &film;
    sound.index = 1;
    sound.codecId = "aac";
    sound.bitrate = 128000;
    film.videoTracks = {&picture};
    film.audioTracks = {&sound};
    return film;
}

Media::File& photoFile(Sample& sample)
{
    auto& photo = sample.make<Media::File>();
    photo.path = "photo.png";
    photo.isOpened = true;
    auto& picture = sample.make<Media::File::Track::Video>();
    picture.width = 640;
    picture.height = 480;
    picture.file = &photo;
    picture.codecId = "png";
    picture.isImage = true;
    photo.videoTracks = {&picture};
    return photo;
}

void addPictures(Cut& cut, const Media::File& film)
{
    auto& blur = cut.sample.make<Effect::Object>();
    blur.id = "blur";
    blur.uniqueId = "{e}";
    blur.intensity = 0.25;
    auto& steady = cut.sample.make<Stabilization::Object>();
    steady.shakiness = 6;
    steady.pathStabilized = "steady.mov";
    auto& crop = cut.sample.make<TransformationEnvelope>();
    crop = opacityEnvelope(50);
    auto* const labels = cut.sample.row<Timeline::Label>(2);
    labels[0].setPosition(1000)->setName("Wave")->timeline = &cut.main;
    labels[1].setPosition(2000)->setName("Boat")->timeline = &cut.main;
    Clip& beach = cut.clip(Beach, "Beach", Clip::VideoClip);
    beach.file = &film;
    beach.sourceDuration = 90061;
    beach.effects = {&blur};
    beach.stabilization = &steady;
    beach.cropEnvelope = &crop;
    beach.labels = {&labels[0], &labels[1]};
    beach.motionTrackings = {"{t}"};
    cut.place(Beach, cut.tracks[0], 0, 5000);
    cut.timing(Beach).transitionOut = 1000;

    auto& move = cut.sample.make<TransformationEnvelope>();
    move.keyValues.emplace_back();
    move.keyValues[0].step = 1;
    move.keyValues[0].value.opacity = 0;
    Clip& photo = cut.clip(Photo, "Photo", Clip::VideoClip);
    photo.file = &photoFile(cut.sample);
    photo.unlimitedDuration = true;
    photo.moveEnvelope = &move;
    cut.place(Photo, cut.tracks[0], 4000, 3000);
    cut.timing(Photo).transitionIn = 1000;
    cut.timing(Photo).reversed = true;

    auto& fade = cut.sample.make<Transition::Object>();
    fade.id = "fade";
    fade.resources = {{"matte", Resource::VideoType}};
    cut.main.transitions[&fade] = {&beach, &photo};
}

void addSounds(Cut& cut, const Media::File& film)
{
    auto& volume = cut.sample.make<VolumeEnvelope>();
    volume.keyValues = {{0.5, 0.25}};
    Clip& waves = cut.clip(Waves, "Waves", Clip::AudioClip);
    waves.file = &film;
    waves.mediaTrack = 1;
    waves.volumeEnvelope = &volume;
    cut.place(Waves, cut.tracks[2], 0, 5000);
    cut.timing(Waves).fadeInDuration = 200;
    cut.main.links[&waves].master = &cut.clips[Beach];

    auto& file = cut.sample.make<Media::File>();
    file.path = "song.flac";
    file.isFailed = true;
    auto& rhythm = cut.sample.make<BeatDetection::Object>();
    rhythm.beats = {{500, 0.5}, {1000, 1.0}};
    Clip& song = cut.clip(Song, "Song", Clip::AudioClip);
    song.file = &file;
    song.volume = 40;
    song.broken = true;
    song.rhythm = &rhythm;
    cut.place(Song, cut.tracks[3], 0, 9000);
    cut.timing(Song).fadeOutDuration = 300;
}

/// The title follows the beach and what is tracked in it.
void addOverlays(Cut& cut)
{
    auto& greeting = cut.sample.make<Overlay::Preset>();
    greeting.tag = "Greeting";
    greeting.items.emplace_back();
    greeting.items[0].text = "Hi";
    Clip& title = cut.clip(Title, "Title", Clip::OverlayClip);
    title.overlay = &greeting;
    cut.place(Title, cut.tracks[4], 500, 2000);
    cut.timing(Title).trackLevel = 1;
    const Clip* const beach = &cut.clips[Beach];
    cut.main.links[&title] = Timeline::Link(beach, 500);
    cut.main.trackingLinks[&title] =
        Timeline::TrackingLinkInfo(Timeline::TrackedObject(beach, "{t}"), QPointF(0.25, -0.5));

    auto& quiz = cut.sample.make<Quiz::Preset>();
    quiz.questions = {evenNumbers()};
    Clip& riddle = cut.clip(Riddle, "Riddle", Clip::OverlayClip);
    riddle.enabled = false;
    riddle.quiz = &quiz;
    cut.place(Riddle, cut.tracks[5], 7000, 1500);
}

void addOpening(Cut& cut, const Media::File& film)
{
    cut.clip(Opening, "Opening", Clip::VideoClip).nestedTimeline = &cut.opening;
    cut.place(Opening, cut.tracks[1], 0, 2000);
    cut.timing(Opening).speedCompensated = true;
    cut.timing(Opening).sourcePosition = 100;

    auto& track = cut.sample.make<Timeline::Track>();
    track.type = PrimaryTrack;
    track.timeline = &cut.opening;
    cut.opening.tracks = {&track};
    cut.clip(Sky, "Sky", Clip::IntroVideoClip).file = &film;
    cut.clip(Wind, "Wind", Clip::IntroAudioClip);
    cut.clip(Credits, "Credits", Clip::IntroOverlayClip);
    cut.place(Sky, track, 0, 800);
    cut.place(Wind, track, 800, 700);
    cut.place(Credits, track, 1500, 500);
}

void fillProject(Sample& sample)
{
    auto& content = sample.root<Project::Content>();
    Cut cut(sample);
    const Media::File& file = filmFile(sample);
    addPictures(cut, file);
    addSounds(cut, file);
    addOverlays(cut);
    addOpening(cut, file);
    content.timeline = &cut.main;

    auto& song = sample.make<Import::Object>();
    fillSong(song);
    auto& imported = sample.make<Import::Object>();
    imported.tag = "Film";
    content.userCollection = &sample.make<EditorCollection::UserObject>();
    content.userCollection->items = {&song, &imported, &song};
    content.resourceTable = &sample.make<ResourceTable::Object>();
    content.resourceTable->resource2fileInfo[{"matte", Resource::VideoType}] = rainInfo();
    content.portable = true;

    auto& film = sample.root<Film::Object>();
    film.bindTimeline(&cut.main, &cut.opening)->bindClip(&cut.clips[Beach], &cut.clips[Sky]);
    film.transitionsList = {nullptr};
    sample.root<MotionTracking::Data>() = tracking();
    sample.root<Package::Object>() = package();
    sample.root<Package::Storage>() = storage();
    sample.root<Indication::Object>() = marks();
}

} // namespace

NamedSample wholeProject()
{
    return {"whole-project", fillProject};
}

} // namespace GoldenTests
