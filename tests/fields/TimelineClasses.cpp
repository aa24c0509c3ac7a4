// SPDX-License-Identifier: Apache-2.0
#include "FormatClasses.h"

#include <EditorModel/timeline/ClipOrder.h>
#include <EditorModel/timeline/Composition.h>
#include <EditorModel/timeline/Editor.h>
#include <EditorModel/timeline/Film.h>
#include <EditorModel/timeline/Object.h>
#include <EditorModel/timeline/Timeline.h>

namespace FieldTests {
namespace {

ClassTable clipTiming()
{
    using Timeline::ClipTiming;
    return ClassOf<ClipTiming>("Timeline::ClipTiming", Returns::Reference)
        .field<&ClipTiming::track, &ClipTiming::setTrack>("track", nullptr)
        .field<&ClipTiming::trackLevel, &ClipTiming::setTrackLevel>("trackLevel", 0)
        .field<&ClipTiming::timestamp, &ClipTiming::setTimestamp>("timestamp", 0)
        .field<&ClipTiming::duration, &ClipTiming::setDuration>("duration", 0)
        .field<&ClipTiming::sourcePosition, &ClipTiming::setSourcePosition>("sourcePosition", 0)
        .field<&ClipTiming::sourceDuration, &ClipTiming::setSourceDuration>("sourceDuration", 0)
        .field<&ClipTiming::speedCompensated, &ClipTiming::setSpeedCompensated>("speedCompensated", false)
        .field<&ClipTiming::transitionIn, &ClipTiming::setTransitionIn>("transitionIn", 0)
        .field<&ClipTiming::transitionOut, &ClipTiming::setTransitionOut>("transitionOut", 0)
        .field<&ClipTiming::fadeInDuration, &ClipTiming::setFadeInDuration>("fadeInDuration", 0)
        .field<&ClipTiming::fadeOutDuration, &ClipTiming::setFadeOutDuration>("fadeOutDuration", 0)
        .field<&ClipTiming::reversed>("reversed", false)
        .field<&ClipTiming::timingMode, &ClipTiming::setTimingMode>("timingMode", Media::TimingMode(0));
}

ClassTable clip()
{
    using Timeline::Clip;
    return ClassOf<Clip>("Timeline::Clip")
        .field<&Clip::timeline, &Clip::setTimeline>("timeline", nullptr)
        .field<&Clip::type, &Clip::setType>("type", Clip::ClipType(0))
        .field<&Clip::name, &Clip::setName>("name", "")
        .field<&Clip::range, &Clip::setRange>("range", nullptr)
        .field<&Clip::file, &Clip::setFile>("file", nullptr)
        .field<&Clip::overlay, &Clip::setOverlay>("overlay", nullptr)
        .field<&Clip::quiz, &Clip::setQuiz>("quiz", nullptr)
        .field<&Clip::nestedTimeline, &Clip::setNestedTimeline>("nestedTimeline", nullptr)
        .field<&Clip::volume, &Clip::setVolume>("volume", 100)
        .field<&Clip::volumeEnvelope, &Clip::setVolumeEnvelope>("volumeEnvelope", nullptr)
        .field<&Clip::cropEnvelope, &Clip::setCropEnvelope>("cropEnvelope", nullptr)
        .field<&Clip::moveEnvelope, &Clip::setMoveEnvelope>("moveEnvelope", nullptr)
        .field<&Clip::rhythm, &Clip::setRhythm>("rhythm", nullptr)
        .field<&Clip::stabilization, &Clip::setStabilization>("stabilization", nullptr)
        .field<&Clip::mediaTrack, &Clip::setMediaTrack>("mediaTrack", 0)
        .field<&Clip::labels, &Clip::setLabels>("labels", {})
        .field<&Clip::motionTrackings, &Clip::setMotionTrackings>("motionTrackings", {})
        .field<&Clip::enabled, &Clip::setEnabled>("enabled", true)
        .field<&Clip::broken, &Clip::setBroken>("broken", false)
        .field<&Clip::unlimitedDuration, &Clip::setUnlimitedDuration>("unlimitedDuration", false)
        .field<&Clip::sourceDuration, &Clip::setSourceDuration>("sourceDuration", 0)
        .field<&Clip::effects>("effects", {});
}

ClassTable track()
{
    using Timeline::Track;
    return ClassOf<Track>("Timeline::Track")
        .field<&Track::type, &Track::setType>("type", TrackType(0))
        .field<&Track::muted, &Track::setMuted>("muted", false)
        .field<&Track::hidden, &Track::setHidden>("hidden", false)
        .field<&Track::linked, &Track::setLinked>("linked", false)
        .field<&Track::gapless, &Track::setGapless>("gapless", false)
        .field<&Track::used, &Track::setUsed>("used", true)
        .field<&Track::timeline, &Track::setTimeline>("timeline", nullptr);
}

ClassTable label()
{
    using Timeline::Label;
    return ClassOf<Label>("Timeline::Label")
        .field<&Label::timeline>("timeline", nullptr)
        .field<&Label::position, &Label::setPosition>("position", 0)
        .field<&Label::name, &Label::setName>("name", "");
}

ClassTable link()
{
    using Timeline::Link;
    return ClassOf<Link>("Timeline::Link")
        .field<&Link::master>("master", nullptr)
        .field<&Link::offset>("offset", 0);
}

ClassTable trackedObject()
{
    using Timeline::TrackedObject;
    return ClassOf<TrackedObject>("Timeline::TrackedObject")
        .field<&TrackedObject::clip>("clip", nullptr)
        .field<&TrackedObject::trackingId>("trackingId", "");
}

ClassTable trackingLinkInfo()
{
    using Info = Timeline::TrackingLinkInfo;
    return ClassOf<Info>("Timeline::TrackingLinkInfo")
        .field<&Info::trackedObject, &Info::setTrackedObject>("trackedObject", {})
        .field<&Info::objectRelativeOffset, &Info::setObjectRelativeOffset>("objectRelativeOffset",
                                                                            {0.0, 0.0});
}

ClassTable timeline()
{
    using Timeline::Object;
    return ClassOf<Object>("Timeline::Object")
        .base(videoFormat())
        .base(audioFormat())
        .field<&Object::scope, &Object::setScope>("scope", Object::Scope(0))
        .field<&Object::reservedText>("reservedText", "")
        .field<&Object::composition, &Object::setComposition>("composition", nullptr)
        .field<&Object::markerUpdateEnabled, &Object::setMarkerUpdateEnabled>("markerUpdateEnabled", true)
        .field<&Object::clips>("clips", {})
        .field<&Object::links>("links", {})
        .field<&Object::trackingLinks>("trackingLinks", {})
        .field<&Object::transitions>("transitions", {})
        .field<&Object::tracks>("tracks", {})
        .field<&Object::exportRanges>("exportRanges", {})
        .field<&Object::reservedFirst>("reservedFirst", 0)
        .field<&Object::reservedSecond>("reservedSecond", 0);
}

ClassTable clipOrder()
{
    return ClassOf<ClipOrder>("ClipOrder", [](void* memory) { ::new (memory) ClipOrder(nullptr); })
        .field<&ClipOrder::timeline>("timeline", nullptr);
}

ClassTable film()
{
    using Film::Object;
    return ClassOf<Object>("Film::Object")
        .field<&Object::timelineBindings>("timelineBindings", {})
        .field<&Object::clipBindings>("clipBindings", {})
        .field<&Object::expectedDuration, &Object::setExpectedDuration>("expectedDuration", 5000)
        .field<&Object::fitDurationToAudio, &Object::setFitDurationToAudio>("fitDurationToAudio", false)
        .field<&Object::cropMode, &Object::setCropMode>("cropMode", false)
        .field<&Object::nativeAudioVolume, &Object::setNativeAudioVolume>("nativeAudioVolume", 0)
        .field<&Object::detachedAudioVolume, &Object::setDetachedAudioVolume>("detachedAudioVolume", 0)
        .field<&Object::transitionsList, &Object::setTransitionsList>("transitionsList", {})
        .field<&Object::startTitlesEnabled, &Object::setStartTitlesEnabled>("startTitlesEnabled", false)
        .field<&Object::finalTitlesEnabled, &Object::setFinalTitlesEnabled>("finalTitlesEnabled", false)
        .field<&Object::startTitles, &Object::setStartTitles>("startTitles", nullptr)
        .field<&Object::finalTitles, &Object::setFinalTitles>("finalTitles", nullptr)
        .field<&Object::background, &Object::setBackground>("background", nullptr);
}

ClassOf<Composition::Child> compositionChild()
{
    return ClassOf<Composition::Child>("Composition::Child")
        .field<&Composition::Child::parent>("parent", nullptr);
}

ClassTable compositionMarker()
{
    using Composition::Marker;
    return ClassOf<Marker>("Composition::Marker")
        .base(compositionChild())
        .field<&Marker::position, &Marker::setPosition>("position", 0)
        .field<&Marker::user, &Marker::setUser>("user", false);
}

ClassTable compositionRange()
{
    using Composition::Range;
    return ClassOf<Range>("Composition::Range")
        .field<&Range::parent, &Range::setParent>("parent", nullptr)
        .field<&Range::from, &Range::setFrom>("from", 0)
        .field<&Range::to, &Range::setTo>("to", -1)
        .by<&Range::setRange>("from", "to")
        .field<&Range::level, &Range::setLevel>("level", 0)
        .field<&Range::zValue, &Range::setZValue>("zValue", 0);
}

template <class T>
using Change = Composition::Object* (Composition::Object::*)(T);

ClassTable composition()
{
    using Composition::Object;
    return ClassOf<Object>("Composition::Object")
        .field<&Object::markers, &Object::setMarkers>("markers", {})
        .field<&Object::ranges, &Object::setRanges>("ranges", {})
        .field<&Object::videos, &Object::setVideos>("videos", {})
        .field<&Object::audios, &Object::setAudios>("audios", {})
        .field<&Object::marker, &Object::setMarker>("marker", nullptr)
        .by<Change<const Composition::Marker*>(&Object::change)>("marker")
        .field<&Object::range, &Object::setRange>("range", nullptr)
        .by<Change<const Composition::Range*>(&Object::change)>("range")
        .field<&Object::video, &Object::setVideo>("video", nullptr)
        .by<Change<const Media::Video*>(&Object::change)>("video")
        .field<&Object::audio, &Object::setAudio>("audio", nullptr)
        .by<Change<const Media::Audio*>(&Object::change)>("audio");
}

ClassTable editor()
{
    using Editor::Object;
    return ClassOf<Object>("Editor::Object")
        .field<&Object::timeline, &Object::setTimeline>("timeline", nullptr)
        .field<&Object::reservedFirst>("reservedFirst", nullptr)
        .field<&Object::reservedSecond>("reservedSecond", nullptr)
        .field<&Object::enabled, &Object::setEnabled>("enabled", true)
        .field<&Object::clips, &Object::setClips>("clips", {});
}

ClassTable ruler()
{
    using Ruler::Object;
    return ClassOf<Object>("Ruler::Object")
        .field<&Object::timeline, &Object::setTimeline>("timeline", nullptr)
        .field<&Object::beats, &Object::setBeats>("beats", {});
}

ClassTable fastTrack()
{
    using FastTrack::Object;
    return ClassOf<Object>("FastTrack::Object")
        .field<&Object::files, &Object::setFiles>("files", {})
        .field<&Object::reservedWord>("reservedWord", 0)
        .field<&Object::contentPath, &Object::setContentPath>("contentPath", "")
        .field<&Object::enabled, &Object::setEnabled>("enabled", false)
        .field<&Object::reservedFlag>("reservedFlag", false)
        .field<&Object::suppressors>("suppressors", {})
        .field<&Object::freezers>("freezers", {});
}

} // namespace

std::vector<ClassTable> timelineClasses()
{
    return {clipTiming(),
            clip(),
            track(),
            label(),
            link(),
            trackedObject(),
            trackingLinkInfo(),
            timeline(),
            clipOrder(),
            film(),
            editor(),
            ruler(),
            fastTrack(),
            compositionChild(),
            compositionMarker(),
            compositionRange(),
            composition()};
}

} // namespace FieldTests
