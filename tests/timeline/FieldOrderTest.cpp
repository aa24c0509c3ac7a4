// SPDX-License-Identifier: Apache-2.0
// Modules that were built apart meet in the layout of the records, so that the order of the fields in memory
// is a part of the interface. It is not the order in which they are stored.
#include <EditorModel/timeline/Composition.h>
#include <EditorModel/timeline/Editor.h>
#include <EditorModel/timeline/Film.h>
#include <EditorModel/timeline/Timeline.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <iterator>

namespace {

template <class... Fields>
bool standInThisOrder(const Fields&... fields)
{
    const void* const addresses[] = {&fields...};
    return std::is_sorted(std::begin(addresses), std::end(addresses), std::less<const void*>());
}

/// The first of several virtual bases without fields shares its address, and its table, with the object.
template <class Base, class Class>
bool beginsWith(const Class& object)
{
    return static_cast<const void*>(static_cast<const Base*>(&object)) == &object;
}

TEST(FieldOrder, OfATiming)
{
    const Timeline::ClipTiming t;
    EXPECT_TRUE(standInThisOrder(t.track, t.trackLevel, t.timestamp, t.duration, t.sourcePosition,
                                 t.sourceDuration, t.speedCompensated, t.transitionIn, t.transitionOut,
                                 t.fadeInDuration, t.fadeOutDuration, t.reversed, t.timingMode));
}

TEST(FieldOrder, OfAClip)
{
    const Timeline::Clip c;
    EXPECT_TRUE(standInThisOrder(c.timeline, c.type, c.name, c.range, c.file, c.overlay, c.quiz,
                                 c.nestedTimeline, c.volume, c.volumeEnvelope, c.cropEnvelope, c.moveEnvelope,
                                 c.rhythm, c.stabilization, c.mediaTrack, c.labels, c.motionTrackings,
                                 c.enabled, c.broken, c.unlimitedDuration, c.sourceDuration, c.effects));
    EXPECT_TRUE(beginsWith<Serialize::ISerializable>(c));
}

TEST(FieldOrder, OfTheSmallRecords)
{
    const Timeline::Track track;
    EXPECT_TRUE(standInThisOrder(track.type, track.muted, track.hidden, track.linked, track.gapless,
                                 track.used, track.timeline));
    EXPECT_TRUE(beginsWith<Serialize::ISerializable>(track));
    const Timeline::Label label;
    EXPECT_TRUE(standInThisOrder(label.timeline, label.position, label.name));
    // The one record that is watched first and stored second.
    EXPECT_TRUE(beginsWith<PubSub::Object>(label));
    const Timeline::Link link;
    EXPECT_TRUE(standInThisOrder(link.master, link.offset));
    const Timeline::TrackedObject tracked;
    EXPECT_TRUE(standInThisOrder(tracked.clip, tracked.trackingId));
    const Timeline::TrackingLinkInfo info;
    EXPECT_TRUE(standInThisOrder(info.trackedObject, info.objectRelativeOffset));
}

TEST(FieldOrder, OfATimeline)
{
    const Timeline::Object t;
    EXPECT_TRUE(standInThisOrder(t.scope, t.reservedText, t.composition, t.markerUpdateEnabled, t.clips,
                                 t.links, t.trackingLinks, t.transitions, t.tracks, t.exportRanges,
                                 t.reservedFirst, t.reservedSecond));
    EXPECT_TRUE(beginsWith<Serialize::ISerializable>(t));
    const void* const video = static_cast<const Media::Video*>(&t);
    const void* const audio = static_cast<const Media::Audio*>(&t);
    EXPECT_TRUE(std::less<const void*>()(video, audio));
}

TEST(FieldOrder, OfAFilm)
{
    const Film::Object f;
    EXPECT_TRUE(standInThisOrder(f.timelineBindings, f.clipBindings, f.expectedDuration, f.fitDurationToAudio,
                                 f.cropMode, f.nativeAudioVolume, f.detachedAudioVolume, f.transitionsList,
                                 f.startTitlesEnabled, f.finalTitlesEnabled, f.startTitles, f.finalTitles,
                                 f.background));
    EXPECT_TRUE(beginsWith<Serialize::ISerializable>(f));
}

TEST(FieldOrder, OfAComposition)
{
    const Composition::Marker marker;
    EXPECT_TRUE(standInThisOrder(marker.parent, marker.position, marker.user));
    const Composition::Range range;
    EXPECT_TRUE(standInThisOrder(range.parent, range.from, range.to, range.level, range.zValue));
    const Composition::Object c;
    EXPECT_TRUE(
        standInThisOrder(c.markers, c.ranges, c.videos, c.audios, c.marker, c.range, c.video, c.audio));
}

TEST(FieldOrder, OfTheStateOfTheEditor)
{
    const Editor::Object editor;
    EXPECT_TRUE(standInThisOrder(editor.timeline, editor.reservedFirst, editor.reservedSecond, editor.enabled,
                                 editor.clips));
    EXPECT_TRUE(beginsWith<Serialize::ISerializable>(editor));
    const Ruler::Object ruler;
    EXPECT_TRUE(standInThisOrder(ruler.timeline, ruler.beats));
    const FastTrack::Object track;
    EXPECT_TRUE(standInThisOrder(track.files, track.reservedWord, track.contentPath, track.enabled,
                                 track.reservedFlag, track.suppressors, track.freezers));
}

} // namespace
