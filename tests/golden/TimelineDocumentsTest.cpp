// SPDX-License-Identifier: Apache-2.0
// What documents with a timeline held by value look like, written down by hand. Stored data is for life:
// these texts are never written anew from what the code gives.
#include "TextArchives.h"
#include "tests/shared/FieldVisitors.h"

#include <EditorModel/effects/Transition.h>
#include <EditorModel/persistence/ObjectTracker.h>
#include <EditorModel/timeline/Timeline.h>

#include <gtest/gtest.h>

#include <array>

namespace {

using namespace GoldenTests;
using Testing::Dump;

// Numbers of classes that a document leaves out went to the classes of null pointers.

constexpr const char* timelineXml = R"(<?xml version="1.0" encoding="UTF-8" standalone="yes" ?>
<!DOCTYPE boost_serialization>
<boost_serialization signature="serialization::archive" version="18">
<content class_id="0" tracking_level="1" version="0" object_id="_0">
	<Video class_id="1" tracking_level="1" version="0" object_id="_1">
		<width>640</width>
		<height>360</height>
		<frameRateN>24000</frameRateN>
		<frameRateD>1002</frameRateD>
		<aspectX>4</aspectX>
		<aspectY>3</aspectY>
	</Video>
	<Audio class_id="2" tracking_level="1" version="0" object_id="_2">
		<channelLayout>63</channelLayout>
		<sampleRate>48000</sampleRate>
		<sampleFormat>8</sampleFormat>
	</Audio>
	<tracks class_id="3" tracking_level="0" version="0">
		<count>3</count>
		<item_version>0</item_version>
		<item class_id="4" tracking_level="1" version="0" object_id="_3">
			<type>16</type>
			<muted>1</muted>
			<hidden>0</hidden>
			<linked>1</linked>
			<gapless>0</gapless>
			<used>1</used>
			<timeline class_id_reference="0" object_id_reference="_0"></timeline>
		</item>
		<item class_id_reference="4" object_id="_4">
			<type>64</type>
			<muted>0</muted>
			<hidden>1</hidden>
			<linked>1</linked>
			<gapless>0</gapless>
			<used>0</used>
			<timeline class_id="-1"></timeline>
		</item>
		<item class_id_reference="4" object_id="_5">
			<type>80</type>
			<muted>0</muted>
			<hidden>0</hidden>
			<linked>0</linked>
			<gapless>1</gapless>
			<used>1</used>
			<timeline class_id="-1"></timeline>
		</item>
	</tracks>
	<clips class_id="5" tracking_level="0" version="0">
		<count>2</count>
		<item_version>0</item_version>
		<item class_id="6" tracking_level="0" version="0">
			<first class_id="7" tracking_level="1" version="0" object_id="_6">
				<timeline class_id_reference="0" object_id_reference="_0"></timeline>
				<type>4</type>
				<name>A &amp; B</name>
				<enabled>0</enabled>
				<overlay class_id="-1"></overlay>
				<quiz class_id="-1"></quiz>
				<file class_id="-1"></file>
				<nestedTimeline class_id="-1"></nestedTimeline>
				<volume>70</volume>
				<volumeEnvelope class_id="-1"></volumeEnvelope>
				<cropEnvelope class_id="-1"></cropEnvelope>
				<moveEnvelope class_id="-1"></moveEnvelope>
				<broken>1</broken>
				<unlimitedDuration>1</unlimitedDuration>
				<sourceDuration>9000</sourceDuration>
				<effects class_id="13" tracking_level="0" version="0">
					<count>0</count>
					<item_version>0</item_version>
				</effects>
				<rhythm class_id="-1"></rhythm>
				<stabilization class_id="-1"></stabilization>
				<mediaTrack>2</mediaTrack>
				<labels class_id="16" tracking_level="0" version="0">
					<count>0</count>
					<item_version>0</item_version>
				</labels>
				<motionTrackings class_id="17" tracking_level="0" version="0">
					<count>1</count>
					<item_version>0</item_version>
					<item>{t}</item>
				</motionTrackings>
			</first>
			<second class_id="18" tracking_level="1" version="0" object_id="_7">
				<track class_id_reference="4" object_id_reference="_3"></track>
				<trackLevel>3</trackLevel>
				<timestamp>100</timestamp>
				<sourceDuration>8000</sourceDuration>
				<sourcePosition>250</sourcePosition>
				<duration>5000</duration>
				<speedCompensated>1</speedCompensated>
				<transitionIn>40</transitionIn>
				<transitionOut>60</transitionOut>
				<fadeInDuraion>70</fadeInDuraion>
				<fadeOutDuraion>80</fadeOutDuraion>
				<reversed>0</reversed>
				<timingMode>2</timingMode>
			</second>
		</item>
		<item>
			<first class_id_reference="7" object_id="_8">
				<timeline class_id="-1"></timeline>
				<type>1</type>
				<name>C</name>
				<enabled>1</enabled>
				<overlay class_id="-1"></overlay>
				<quiz class_id="-1"></quiz>
				<file class_id="-1"></file>
				<nestedTimeline class_id="-1"></nestedTimeline>
				<volume>100</volume>
				<volumeEnvelope class_id="-1"></volumeEnvelope>
				<cropEnvelope class_id="-1"></cropEnvelope>
				<moveEnvelope class_id="-1"></moveEnvelope>
				<broken>0</broken>
				<unlimitedDuration>1</unlimitedDuration>
				<sourceDuration>0</sourceDuration>
				<effects>
					<count>0</count>
					<item_version>0</item_version>
				</effects>
				<rhythm class_id="-1"></rhythm>
				<stabilization class_id="-1"></stabilization>
				<mediaTrack>0</mediaTrack>
				<labels>
					<count>0</count>
					<item_version>0</item_version>
				</labels>
				<motionTrackings>
					<count>0</count>
					<item_version>0</item_version>
				</motionTrackings>
			</first>
			<second object_id="_9">
				<track class_id="-1"></track>
				<trackLevel>0</trackLevel>
				<timestamp>0</timestamp>
				<sourceDuration>0</sourceDuration>
				<sourcePosition>0</sourcePosition>
				<duration>0</duration>
				<speedCompensated>0</speedCompensated>
				<transitionIn>0</transitionIn>
				<transitionOut>0</transitionOut>
				<fadeInDuraion>0</fadeInDuraion>
				<fadeOutDuraion>0</fadeOutDuraion>
				<reversed>1</reversed>
				<timingMode>0</timingMode>
			</second>
		</item>
	</clips>
	<links class_id="19" tracking_level="0" version="0">
		<count>1</count>
		<item_version>0</item_version>
		<item class_id="20" tracking_level="0" version="0">
			<first class_id_reference="7" object_id_reference="_8"></first>
			<second class_id="21" tracking_level="1" version="0" object_id="_10">
				<master class_id_reference="7" object_id_reference="_6"></master>
				<offset>-20</offset>
			</second>
		</item>
	</links>
	<trackingLinks class_id="22" tracking_level="0" version="0">
		<count>1</count>
		<item_version>0</item_version>
		<item class_id="23" tracking_level="0" version="0">
			<first class_id_reference="7" object_id_reference="_8"></first>
			<second class_id="24" tracking_level="1" version="0" object_id="_11">
				<trackedObject class_id="25" tracking_level="1" version="0" object_id="_12">
					<clip class_id_reference="7" object_id_reference="_6"></clip>
					<trackingId>{t}</trackingId>
				</trackedObject>
				<objectRelativeOffset>
					<x>2.50000000000000000e-01</x>
					<y>-5.00000000000000000e-01</y>
				</objectRelativeOffset>
			</second>
		</item>
	</trackingLinks>
	<transitions class_id="26" tracking_level="0" version="0">
		<count>1</count>
		<item_version>0</item_version>
		<item class_id="27" tracking_level="0" version="0">
			<first class_id="28" tracking_level="1" version="0" object_id="_13">
				<id>Fade</id>
				<tag></tag>
				<description></description>
				<strategy>0</strategy>
				<type>0</type>
				<resources class_id="29" tracking_level="0" version="0">
					<count>0</count>
					<item_version>0</item_version>
				</resources>
				<defaultDuration>2000</defaultDuration>
				<volume>100</volume>
			</first>
			<second class_id="30" tracking_level="0" version="0">
				<first class_id_reference="7" object_id_reference="_6"></first>
				<second class_id="-1"></second>
			</second>
		</item>
	</transitions>
</content>
</boost_serialization>

)";

/// Identities are given out as pointers name objects: first the track, then the timeline that it names.
constexpr const char* timelineJson = R"({"content": {
    "$meta": {"id": 2},
    "Video": {"width": 640, "height": 360, "frameRateN": 24000, "frameRateD": 1002, "aspectX": 4, "aspectY": 3},
    "Audio": {"channelLayout": 63, "sampleRate": 48000, "sampleFormat": 8},
    "tracks": {"count": 3, "item_version": 0, "item": [
        {"$meta": {"class": "Timeline::Track", "id": 1},
         "type": 16, "muted": true, "hidden": false, "linked": true, "gapless": false, "used": true,
         "timeline": {"$meta": {"class": "Timeline::Object", "ref": 2}}},
        {"$meta": {"class": "Timeline::Track", "id": 3},
         "type": 64, "muted": false, "hidden": true, "linked": true, "gapless": false, "used": false,
         "timeline": null},
        {"$meta": {"class": "Timeline::Track", "id": 4},
         "type": 80, "muted": false, "hidden": false, "linked": false, "gapless": true, "used": true,
         "timeline": null}]},
    "clips": {"count": 2, "item_version": 0, "item": [
        {"first": {"$meta": {"class": "Timeline::Clip", "id": 5},
            "timeline": {"$meta": {"class": "Timeline::Object", "ref": 2}},
            "type": 4, "name": "A & B", "enabled": false, "overlay": null, "quiz": null, "file": null,
            "nestedTimeline": null, "volume": 70,
            "volumeEnvelope": null, "cropEnvelope": null, "moveEnvelope": null,
            "broken": true, "unlimitedDuration": true, "sourceDuration": 9000,
            "effects": {"count": 0, "item_version": 0}, "rhythm": null, "stabilization": null,
            "mediaTrack": 2, "labels": {"count": 0, "item_version": 0},
            "motionTrackings": {"count": 1, "item_version": 0, "item": ["{t}"]}},
         "second": {"track": {"$meta": {"class": "Timeline::Track", "ref": 1}}, "trackLevel": 3,
            "timestamp": 100, "sourceDuration": 8000, "sourcePosition": 250, "duration": 5000,
            "speedCompensated": true, "transitionIn": 40, "transitionOut": 60,
            "fadeInDuraion": 70, "fadeOutDuraion": 80, "reversed": false, "timingMode": 2}},
        {"first": {"$meta": {"class": "Timeline::Clip", "id": 6},
            "timeline": null,
            "type": 1, "name": "C", "enabled": true, "overlay": null, "quiz": null, "file": null,
            "nestedTimeline": null, "volume": 100,
            "volumeEnvelope": null, "cropEnvelope": null, "moveEnvelope": null,
            "broken": false, "unlimitedDuration": true, "sourceDuration": 0,
            "effects": {"count": 0, "item_version": 0}, "rhythm": null, "stabilization": null,
            "mediaTrack": 0, "labels": {"count": 0, "item_version": 0},
            "motionTrackings": {"count": 0, "item_version": 0}},
         "second": {"track": null, "trackLevel": 0,
            "timestamp": 0, "sourceDuration": 0, "sourcePosition": 0, "duration": 0,
            "speedCompensated": false, "transitionIn": 0, "transitionOut": 0,
            "fadeInDuraion": 0, "fadeOutDuraion": 0, "reversed": true, "timingMode": 0}}]},
    "links": {"count": 1, "item_version": 0, "item": [
        {"first": {"$meta": {"class": "Timeline::Clip", "ref": 6}},
         "second": {"master": {"$meta": {"class": "Timeline::Clip", "ref": 5}}, "offset": -20}}]},
    "trackingLinks": {"count": 1, "item_version": 0, "item": [
        {"first": {"$meta": {"class": "Timeline::Clip", "ref": 6}},
         "second": {
            "trackedObject": {"clip": {"$meta": {"class": "Timeline::Clip", "ref": 5}}, "trackingId": "{t}"},
            "objectRelativeOffset": {"x": 0.25, "y": -0.5}}}]},
    "transitions": {"count": 1, "item_version": 0, "item": [
        {"first": {"$meta": {"class": "Transition::Object", "id": 7},
            "id": "Fade", "tag": "", "description": "", "strategy": 0, "type": 0,
            "resources": {"count": 0, "item_version": 0}, "defaultDuration": 2000, "volume": 100},
         "second": {"first": {"$meta": {"class": "Timeline::Clip", "ref": 5}}, "second": null}}]}}})";

/// Frees what an archive has made behind the pointers of `content`.
template <class T>
void freePointees(const T& content)
{
    boost::archive::object_tracker tracker;
    tracker << BOOST_SERIALIZATION_NVP(content);
    tracker.deleteAll();
}

class TimelineDocuments : public ::testing::Test
{
protected:
    TimelineDocuments()
    {
        m_timeline.width = 640;
        m_timeline.height = 360;
        m_timeline.frameRateN = 24000;
        m_timeline.frameRateD = 1002;
        m_timeline.aspectX = 4;
        m_timeline.aspectY = 3;
        m_timeline.channelLayout = Norvel::Conf::ChannelLayout(63);
        m_timeline.sampleRate = 48000;
        m_timeline.sampleFormat = Norvel::Conf::SampleFormats(8);
        setTracks();
        setClips();
        m_timeline.links[second()] = Timeline::Link(first(), -20);
        m_timeline.trackingLinks[second()] =
            Timeline::TrackingLinkInfo(Timeline::TrackedObject(first(), "{t}"), QPointF(0.25, -0.5));
        m_timeline.transitions[&m_fade] = {first(), nullptr};
    }

    const Timeline::Clip* first() const { return &m_clips[0]; }
    const Timeline::Clip* second() const { return &m_clips[1]; }

    Timeline::Object m_timeline;

private:
    void setTracks()
    {
        m_tracks[0].setType(PrimaryTrack)->setMuted(true)->setLinked(true)->setTimeline(&m_timeline);
        m_tracks[1].setType(AudioTrack)->setHidden(true)->setLinked(true)->setUsed(false);
        m_tracks[2].setType(TitleTrack)->setGapless(true);
        m_timeline.tracks = {&m_tracks[0], &m_tracks[1], &m_tracks[2]};
    }

    void setClips()
    {
        Timeline::Clip& overlay = m_clips[0];
        overlay.setTimeline(&m_timeline)->setType(Timeline::Clip::OverlayClip)->setName("A & B");
        overlay.setEnabled(false)->setVolume(70)->setBroken(true)->setUnlimitedDuration(true);
        overlay.setSourceDuration(9000)->setMediaTrack(2)->setMotionTrackings({"{t}"});
        m_clips[1].setType(Timeline::Clip::VideoClip)->setName("C")->setUnlimitedDuration(true);

        Timeline::ClipTiming& timing = m_timeline.clips[first()];
        timing.setTrack(&m_tracks[0]).setTrackLevel(3).setTimestamp(100).setDuration(5000);
        timing.setSourcePosition(250).setSourceDuration(8000).setSpeedCompensated(true);
        timing.setTransitionIn(40).setTransitionOut(60).setFadeInDuration(70).setFadeOutDuration(80);
        timing.setTimingMode(Media::TimingMode(2));
        m_timeline.clips[second()].reversed = true;
    }

    std::array<Timeline::Track, 3> m_tracks;
    /// Neighbours, since maps are stored in the order of addresses.
    std::array<Timeline::Clip, 2> m_clips;
    Transition::Object m_fade{"Fade"};
};

TEST_F(TimelineDocuments, TheXmlArchiveIsAsWrittenDown)
{
    EXPECT_EQ(saved(m_timeline), timelineXml);

    Timeline::Object read;
    load(timelineXml, read);
    EXPECT_EQ(Dump::of(read), Dump::of(m_timeline));
    freePointees(read);
}

TEST_F(TimelineDocuments, TheJsonArchiveIsAsWrittenDown)
{
    EXPECT_EQ(savedAsJson(m_timeline), nlohmann::json::parse(timelineJson));

    Timeline::Object content;
    loadJson(timelineJson, content);
    EXPECT_EQ(Dump::of(content), Dump::of(m_timeline));
    freePointees(content);
}

} // namespace
