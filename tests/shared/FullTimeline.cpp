// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FullTimeline.h"

#include <algorithm>
#include <stdexcept>

namespace Testing {
namespace {

using Timeline::Clip;
using Timeline::ClipTiming;

enum TrackPlace : std::size_t
{
    Pictures,
    Native,
    LinkedSound,
    Music,
    /// Equal to the one before.
    SecondMusic,
    Titles,
    Quizzes,
    Extra,
    NestedPictures,
    InnermostPictures,
};

} // namespace

FullTimeline::FullTimeline()
{
    addFiles();
    addTracks();
    addEffects();
    addEnvelopes();
    addPresets();
    addAnalyses();
    addIntro();
    addPictures();
    addSound();
    addOverlays();
    addNestedClips();
    addLabels();
    addLinks();
    addTransitions();
}

Clip& FullTimeline::clip(const char* name)
{
    const auto found = std::find_if(clips.begin(), clips.end(),
                                    [&](const Clip& clip) { return clip.name == QString::fromUtf8(name); });
    if (found == clips.end())
        throw std::invalid_argument(name);
    return *found;
}

std::size_t FullTimeline::objectCount() const
{
    const std::size_t timelineCount = 3;
    return timelineCount + clips.size() + tracks.size() + labels.size() + transitions.size() + files.size() +
           videoTracks.size() + audioTracks.size() + effects.size() + volumeEnvelopes.size() +
           transformationEnvelopes.size() + overlays.size() + quizzes.size() + rhythms.size() +
           stabilizations.size();
}

void FullTimeline::setFieldsThatAreNotStored()
{
    for (Timeline::Object* const each : {&timeline, &nested, &innermost}) {
        each->setScope(Timeline::Object::Scope(3))->setMarkerUpdateEnabled(false);
        each->setComposition(&m_composition)->addExportRange(&m_range);
        each->reservedText = QStringLiteral("reserved");
        each->reservedFirst = 1;
        each->reservedSecond = 2;
        each->setExportMode(true)->setOpaque(false);
    }
    for (Clip& each : clips)
        each.setRange(&m_range);
    for (Media::File& file : files) {
        file.setLastModified(1700000000)->setComposition(&m_composition);
        file.setUnsupportedCodecs({"xyz"});
    }
    for (Media::File::Track::Video& track : videoTracks)
        track.setExportMode(true)->setOpaque(false);
}

void FullTimeline::addFiles()
{
    files.resize(2);
    files[0].setPath(QString::fromUtf8("/Filme/Möwe & Meer.mov"))->setSize(qint64(5) << 30);
    files[0].setFormat("mov")->setLength(120000)->setOpened(true);
    files[1].setPath(QStringLiteral("/music/song.flac"))->setSize(30000000)->setFormat("flac");
    files[1].setLength(200000)->setOpening(true)->setFailed(true);

    videoTracks.resize(2);
    for (int i = 0; i != 2; ++i) {
        Media::File::Track::Video& track = videoTracks[std::size_t(i)];
        track.setGeometry(3840 >> i, 2160 >> i)->setFrameRate(50 + i, 1)->setAspect(4, 3 + i);
        track.file = &files[0];
        track.index = 2 * i;
        track.codecId = i ? "mjpeg" : "h264";
        track.bitrate = 8000000 + i;
        track.isImage = i == 1;
        files[0].addTrack(&track);
    }
    audioTracks.resize(2);
    for (int i = 0; i != 2; ++i) {
        Media::File::Track::Audio& track = audioTracks[std::size_t(i)];
        track.setChannelLayout(Norvel::Conf::ChannelLayout(3 + i))->setSampleRate(48000 << i);
        track.setSampleFormat(Norvel::Conf::SampleFormats(4 + i));
        track.file = &files[std::size_t(i)];
        track.index = 1 - i;
        track.codecId = i ? "flac" : "aac";
        track.bitrate = 128000 + i;
        files[std::size_t(i)].addTrack(&track);
    }
}

void FullTimeline::addTracks()
{
    timeline.setGeometry(1280, 720)->setFrameRate(24, 5)->setAspect(16, 15);
    timeline.setChannelLayout(Norvel::Conf::ChannelLayout(6))->setSampleRate(96000);
    timeline.setSampleFormat(Norvel::Conf::SampleFormats(7));
    nested.setGeometry(640, 480);
    nested.setSampleRate(22050);

    const auto add = [&](Timeline::Object& owner, TrackType type) {
        tracks.emplace_back(type).setTimeline(&owner);
        owner.addTrack(&tracks.back());
    };
    for (const TrackType type : {PrimaryTrack, NativeAudioTrack, AudioTrack, AudioTrack, AudioTrack,
                                 TitleTrack, QuizTrack, ExtraVideoTrack})
        add(timeline, type);
    add(nested, PrimaryTrack);
    add(innermost, PrimaryTrack);
    tracks[LinkedSound].setLinked(true);
    tracks[Extra].setHidden(true);
    tracks[Native].setMuted(true);
    tracks[Pictures].setGapless(true);
    tracks[Quizzes].setUsed(false);
    // A timeline may list a track twice.
    timeline.addTrack(&tracks[Titles]);
}

void FullTimeline::addEffects()
{
    effects.resize(5);
    const char* const ids[] = {"blur", "sepia", "echo", "blur", "blur"};
    for (std::size_t i = 0; i != effects.size(); ++i) {
        Effect::Object& effect = effects[i];
        effect.id = QString::fromLatin1(ids[i]);
        effect.uniqueId = i < 3 ? QString::number(100 + i) : QStringLiteral("equal");
        effect.setTag(QStringLiteral("Tag <1> ") + effect.id)->setDescription(QStringLiteral("told"));
        effect.intensity = i < 3 ? 0.25 * double(i + 1) : 0.1;
        effect.setBypass(i == 1);
    }
}

void FullTimeline::addEnvelopes()
{
    volumeEnvelopes.resize(3);
    volumeEnvelopes[0].addKeyValue(0.0, 0.5)->addKeyValue(0.3, 1.7)->addKeyValue(1.0, 0.1);
    volumeEnvelopes[0].defaultValue = 0.75;
    // Equal, and not the same.
    for (const std::size_t i : {1, 2})
        volumeEnvelopes[i].addKeyValue(0.5, 2.0);

    transformationEnvelopes.resize(2);
    const Types::Transform turned(0.1, 0.2, 0.3, 0.4, 0.5, 0.6, 0.7, 0.8, 0.9);
    for (std::size_t i = 0; i != 2; ++i) {
        transformationEnvelopes[i].addKeyValue(0.25, Transformation::Object(turned, 40 + int(i)));
        transformationEnvelopes[i].addKeyValue(0.75, Transformation::Object());
        transformationEnvelopes[i].defaultValue = Transformation::Object(turned, 30);
    }
}

void FullTimeline::addPresets()
{
    overlays.resize(2);
    for (int i = 0; i != 2; ++i) {
        Overlay::Preset& preset = overlays[std::size_t(i)];
        preset.setType(Overlay::Preset::Type(2 + i))->setScriptId(QStringLiteral("lower-third"));
        preset.setScriptSpeed(1.5)
            ->setTag(QStringLiteral("Title"))
            ->setDescription(QStringLiteral("A title"));
        preset.setSourceDuration(6000 + i);
    }
    Overlay::Item item;
    item.setType(Overlay::Item::Type(4)).setText(QString::fromUtf8("<p>Grüße</p>"));
    item.setTransform(Types::Transform(2, 0, 0, 0, 3, 0, 10, 20, 1)).setEnvelope(transformationEnvelopes[0]);
    item.setScriptRole(QStringLiteral("headline")).setEditTime(0.4).setOutline({0xFF102030, 2, true});
    item.setEditable(false).setFrom(0.1).setTo(0.9).setIntro(0.2).setOutro(0.3);
    item.setTextWidth(320.5).setArcRadius(-12.25).setDropShadow({0x80000000, 1, 2, 3});
    item.features = 5;
    item.dropShadow.enabled = true;
    overlays[0].appendItem(item)->appendItem(Overlay::Item());

    quizzes.resize(1);
    Quiz::Question question;
    question.type = Quiz::Question::Type(1);
    question.text = QStringLiteral("Which?");
    question.answers = {QStringLiteral("this"), QStringLiteral("that"), QString()};
    question.correctAnswers = {QStringLiteral("that"), QStringLiteral("this")};
    quizzes[0].questions = {question, Quiz::Question()};
    quizzes[0].tag = QStringLiteral("Quiz");
    quizzes[0].description = QStringLiteral("Two questions");
}

void FullTimeline::addAnalyses()
{
    rhythms.resize(1);
    rhythms[0].setInterval(500)->setBeats({{0, 1.0}, {500, 0.5}, {-40, 0.25}});

    stabilizations.resize(1);
    stabilizations[0].setShakiness(1)->setAccuracy(2)->setStepsize(3)->setSmoothing(4);
    stabilizations[0].setOptzoom(Stabilization::Object::OptimalZooming(2));
    stabilizations[0].setOriginalVideoIndex(5)->setOriginalAudioIndex(6);
    stabilizations[0].setPathOriginal(QStringLiteral("/shaken"))->setPathStabilized(QStringLiteral("/calm"));
    stabilizations[0].setSourcePositionOriginal(70)->setSourceDurationOriginal(8000);
}

Clip& FullTimeline::addClip(Timeline::Object& owner, const char* name, Clip::ClipType type,
                            const ClipTiming& timing)
{
    Clip& added = clips.emplace_back();
    added.setTimeline(&owner)->setType(type)->setName(QString::fromUtf8(name));
    added.setSourceDuration(timing.sourceDuration);
    owner.addClip(&added, timing);
    return added;
}

void FullTimeline::addIntro()
{
    addClip(timeline, "intro", Clip::IntroVideoClip, {&tracks[Pictures], 0, 0, 4000, 0, 4000})
        .setFile(&files[0]);
    addClip(timeline, "intro sound", Clip::IntroAudioClip, {&tracks[Native], 0, 0, 4000, 0, 4000})
        .setFile(&files[0])
        ->setVolumeEnvelope(&volumeEnvelopes[1]);
    addClip(timeline, "intro title", Clip::IntroOverlayClip, {&tracks[Titles], 0, 500, 3000, 0, 3000})
        .setOverlay(&overlays[1]);
}

void FullTimeline::addPictures()
{
    Clip& beach =
        addClip(timeline, "beach", Clip::VideoClip, {&tracks[Pictures], 0, 4000, 10000, 15000, 60000});
    beach.setFile(&files[0])->setMediaTrack(1)->setStabilization(&stabilizations[0]);
    beach.setSourceDuration(120000)->addEffect(&effects[0])->addEffect(&effects[1])->addEffect(&effects[0]);
    beach.addMotionTracking(QStringLiteral("{b}"))->addMotionTracking(QStringLiteral("{a}"));

    addClip(timeline, "chapter", Clip::VideoClip, {&tracks[Pictures], 0, 14000, 8000, 0, 8000})
        .setNestedTimeline(&nested)
        ->addEffect(&effects[3]);

    Clip& seagull = addClip(timeline, "Möwe", Clip::VideoClip, {&tracks[Extra], 1, 5000, 2000, 100, 5000});
    seagull.setFile(&files[0])->setBroken(true)->setEnabled(false)->setStabilization(&stabilizations[0]);
    seagull.setCropEnvelope(&transformationEnvelopes[0])->setMoveEnvelope(&transformationEnvelopes[0]);
    seagull.addEffect(&effects[0])->addEffect(&effects[4]);
    timeline.reverseClip(&seagull);

    // Longer than 32 bits of milliseconds can tell.
    Clip& still = addClip(timeline, "still", Clip::VideoClip,
                          {&tracks[Extra], 0, 5000, 9000, 0, MTime((qint64(1) << 32) + 5)});
    still.setUnlimitedDuration(true)->setMoveEnvelope(&transformationEnvelopes[1]);
}

void FullTimeline::addSound()
{
    Clip& native = addClip(timeline, "beach sound", Clip::AudioClip,
                           {&tracks[LinkedSound], 0, 4000, 10000, 15000, 60000});
    native.setFile(&files[0])->setVolume(250)->setVolumeEnvelope(&volumeEnvelopes[0]);

    Clip& song = addClip(timeline, "song", Clip::AudioClip, {&tracks[Music], 2, 0, 20000, 300, 200000});
    song.setFile(&files[1])->setVolume(0)->setRhythm(&rhythms[0])->setVolumeEnvelope(&volumeEnvelopes[0]);
    song.addEffect(&effects[2]);
    timeline.setClipFadeInDuration(&song, 700)->setClipFadeOutDuration(&song, 900);
    timeline.setClipSpeedCompensated(&song, true)->clips.at(&song).setTimingMode(Media::TimingMode(3));

    addClip(timeline, "song again", Clip::AudioClip, {&tracks[SecondMusic], 0, 20000, 1000, 0, 200000})
        .setFile(&files[1])
        ->setRhythm(&rhythms[0])
        ->setVolumeEnvelope(&volumeEnvelopes[2]);
}

void FullTimeline::addOverlays()
{
    addClip(timeline, "caption", Clip::OverlayClip, {&tracks[Titles], 1, 6000, 3000, 0, 3000})
        .setOverlay(&overlays[0]);
    addClip(timeline, "question", Clip::OverlayClip, {&tracks[Quizzes], 0, 22000, 5500, 0, 5500})
        .setQuiz(&quizzes[0]);
}

void FullTimeline::addNestedClips()
{
    addClip(nested, "nested picture", Clip::VideoClip, {&tracks[NestedPictures], 0, 0, 4000, 0, 4000})
        .setNestedTimeline(&innermost);
    addClip(nested, "mirror", Clip::VideoClip, {&tracks[NestedPictures], 0, 4000, 4000, 0, 22000})
        .setNestedTimeline(&timeline);
    addClip(innermost, "own mirror", Clip::VideoClip, {&tracks[InnermostPictures], 0, 0, 10, 0, 10})
        .setNestedTimeline(&innermost)
        ->addEffect(&effects[0]);
}

void FullTimeline::addLabels()
{
    labels.resize(4);
    labels[0].setName(QStringLiteral("wave"))->setPosition(4500);
    labels[1].setName(QStringLiteral("splash"))->setPosition(-20);
    // Equal, and not the same.
    for (const std::size_t i : {2, 3})
        labels[i].setName(QStringLiteral("equal"))->setPosition(1);
    labels[0].timeline = &timeline;
    labels[1].timeline = &nested;
    clip("beach").addLabel(&labels[0])->addLabel(&labels[1])->addLabel(&labels[2]);
    clip("beach sound").addLabel(&labels[0])->addLabel(&labels[3]);
}

void FullTimeline::addLinks()
{
    timeline.addLink(&clip("beach"), &clip("beach sound"), 0);
    timeline.addLink(&clip("beach"), &clip("caption"), 2000);
    timeline.addLink(&clip("caption"), &clip("song again"), -3);
    nested.addLink(&clip("nested picture"), &clip("mirror"), 4000);

    timeline.addTrackingLink(&clip("caption"), {{&clip("beach"), QStringLiteral("{a}")}, {12.5, -0.25}});
    timeline.addTrackingLink(&clip("question"), {{&clip("beach"), QStringLiteral("{b}")}, {0.0, 1.0}});
    nested.addTrackingLink(&clip("mirror"), {{nullptr, QString()}, {3.0, 4.0}});
}

void FullTimeline::addTransitions()
{
    transitions.resize(4);
    const char* const ids[] = {"dissolve", "in", "out", "nested dissolve"};
    for (std::size_t i = 0; i != transitions.size(); ++i) {
        transitions[i].id = QString::fromLatin1(ids[i]);
        transitions[i].tag = QStringLiteral("Tag ") + transitions[i].id;
        transitions[i].defaultDuration = MTime(1000 + int(i));
    }
    Transition::Object& dissolve = transitions[0];
    dissolve.description = QStringLiteral("One into the other");
    dissolve.strategy = Transition::Object::Strategy(2);
    dissolve.type = Transition::Object::Type(3);
    dissolve.resources = {{QStringLiteral("wipe"), Resource::VideoType},
                          {QStringLiteral("whoosh"), Resource::AudioType}};
    dissolve.volume = 55;

    timeline.addTransition(&dissolve, {&clip("beach"), &clip("chapter")}, 600);
    timeline.addTransition(&transitions[1], {nullptr, &clip("intro")}, 300);
    timeline.addTransition(&transitions[2], {&clip("chapter"), nullptr}, 200);
    nested.addTransition(&transitions[3], {&clip("nested picture"), &clip("mirror")}, 100);
    // One transition in two timelines, and between nothing.
    innermost.transitions[&dissolve] = {nullptr, nullptr};
}

} // namespace Testing
