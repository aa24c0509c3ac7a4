// SPDX-License-Identifier: Apache-2.0
// What documents with a film and an editor look like, written down by hand. Stored data is for life: these
// texts are never written anew from what the code gives.
#include "TextArchives.h"

#include <EditorModel/effects/Transition.h>
#include <EditorModel/timeline/Editor.h>
#include <EditorModel/timeline/Film.h>
#include <EditorModel/timeline/Timeline.h>

#include <gtest/gtest.h>

namespace {

using namespace GoldenTests;

constexpr const char* film = R"(<?xml version="1.0" encoding="UTF-8" standalone="yes" ?>
<!DOCTYPE boost_serialization>
<boost_serialization signature="serialization::archive" version="18">
<content class_id="0" tracking_level="1" version="0" object_id="_0">
	<timelineBindings class_id="1" tracking_level="0" version="0">
		<count>1</count>
		<item_version>0</item_version>
		<item class_id="2" tracking_level="0" version="0">
			<first class_id="-1"></first>
			<second class_id="-1"></second>
		</item>
	</timelineBindings>
	<clipBindings class_id="4" tracking_level="0" version="0">
		<count>1</count>
		<item_version>0</item_version>
		<item class_id="5" tracking_level="0" version="0">
			<first class_id="-1"></first>
			<second class_id="-1"></second>
		</item>
	</clipBindings>
	<expectedDuration>61000</expectedDuration>
	<nativeAudioVolume>-3</nativeAudioVolume>
	<detachedAudioVolume>80</detachedAudioVolume>
	<fitDurationToAudio>1</fitDurationToAudio>
	<cropMode>0</cropMode>
	<transitionsList class_id="7" tracking_level="0" version="0">
		<count>2</count>
		<item_version>0</item_version>
		<item class_id="-1"></item>
		<item class_id="-1"></item>
	</transitionsList>
</content>
</boost_serialization>

)";

constexpr const char* editor = R"(<?xml version="1.0" encoding="UTF-8" standalone="yes" ?>
<!DOCTYPE boost_serialization>
<boost_serialization signature="serialization::archive" version="18">
<content class_id="0" tracking_level="1" version="0" object_id="_0">
	<enabled>0</enabled>
	<clips class_id="1" tracking_level="0" version="0">
		<count>1</count>
		<item_version>0</item_version>
		<item class_id="-1"></item>
	</clips>
</content>
</boost_serialization>

)";

// The bindings and lists hold null alone, so that no other class's fields stand in the documents.

TEST(FilmDocuments, TheXmlArchiveIsAsWrittenDown)
{
    Film::Object written;
    const Timeline::Object* const noTimeline = nullptr;
    const Timeline::Clip* const noClip = nullptr;
    written.bindTimeline(noTimeline, noTimeline)->bindClip(noClip, noClip);
    written.setExpectedDuration(61000)->setNativeAudioVolume(-3)->setDetachedAudioVolume(80);
    written.setFitDurationToAudio(true)->setTransitionsList({nullptr, nullptr});
    EXPECT_EQ(saved(written), film);

    Film::Object read;
    load(film, read);
    EXPECT_EQ(saved(read), film);
    EXPECT_EQ(read.nativeAudioVolume, -3);
    EXPECT_EQ(read.detachedAudioVolume, 80);
    EXPECT_TRUE(read.fitDurationToAudio);
    EXPECT_FALSE(read.cropMode);
    EXPECT_EQ(read.transitionsList.size(), 2u);
}

TEST(EditorDocuments, TheXmlArchiveIsAsWrittenDown)
{
    Editor::Object written;
    written.disable()->setClips({nullptr});
    EXPECT_EQ(saved(written), editor);

    Editor::Object read;
    load(editor, read);
    EXPECT_FALSE(read.enabled);
    EXPECT_EQ(read.clips.size(), 1u);
}

} // namespace
