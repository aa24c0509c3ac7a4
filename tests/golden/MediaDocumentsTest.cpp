// SPDX-License-Identifier: Apache-2.0
// What documents with a media file held by value look like, written down by hand. Stored data is for life:
// these texts are never written anew from what the code gives.
#include "TextArchives.h"

#include <EditorModel/media/Media.h>

#include <gtest/gtest.h>

namespace {

using namespace GoldenTests;

constexpr const char* xmlArchive = R"(<?xml version="1.0" encoding="UTF-8" standalone="yes" ?>
<!DOCTYPE boost_serialization>
<boost_serialization signature="serialization::archive" version="18">
<content class_id="0" tracking_level="1" version="0" object_id="_0">
	<path>/films/a &amp; b.mp4</path>
	<size>5000000000</size>
	<format>mov</format>
	<length>90061</length>
	<isOpening>0</isOpening>
	<isOpened>1</isOpened>
	<isFailed>0</isFailed>
	<videoTracks class_id="1" tracking_level="0" version="0">
		<count>1</count>
		<item_version>0</item_version>
		<item class_id="2" tracking_level="1" version="0" object_id="_1">
			<Video class_id="3" tracking_level="1" version="0" object_id="_2">
				<width>640</width>
				<height>360</height>
				<frameRateN>24000</frameRateN>
				<frameRateD>1001</frameRateD>
				<aspectX>4</aspectX>
				<aspectY>3</aspectY>
			</Video>
			<Track class_id="4" tracking_level="1" version="0" object_id="_3">
				<file class_id_reference="0" object_id_reference="_0"></file>
				<index>0</index>
				<codecId>h264</codecId>
				<bitrate>1500000</bitrate>
			</Track>
			<isImage>1</isImage>
		</item>
	</videoTracks>
	<audioTracks class_id="5" tracking_level="0" version="0">
		<count>2</count>
		<item_version>0</item_version>
		<item class_id="6" tracking_level="1" version="0" object_id="_4">
			<Audio class_id="7" tracking_level="1" version="0" object_id="_5">
				<channelLayout>63</channelLayout>
				<sampleRate>48000</sampleRate>
				<sampleFormat>8</sampleFormat>
			</Audio>
			<Track object_id="_6">
				<file class_id="-1"></file>
				<index>1</index>
				<codecId>aac</codecId>
				<bitrate>128000</bitrate>
			</Track>
		</item>
		<item class_id_reference="6" object_id_reference="_4"></item>
	</audioTracks>
</content>
</boost_serialization>

)";

/// Identities are given out as pointers name objects: first the video track, then the file behind it.
constexpr const char* jsonArchive = R"({"content": {
    "$meta": {"id": 2},
    "path": "/films/a & b.mp4", "size": 5000000000, "format": "mov", "length": 90061,
    "isOpening": false, "isOpened": true, "isFailed": false,
    "videoTracks": {"count": 1, "item_version": 0, "item": [{
        "$meta": {"class": "VideoTrack", "id": 1},
        "Video": {"width": 640, "height": 360, "frameRateN": 24000, "frameRateD": 1001, "aspectX": 4, "aspectY": 3},
        "Track": {"file": {"$meta": {"class": "File", "ref": 2}}, "index": 0, "codecId": "h264", "bitrate": 1500000},
        "isImage": true}]},
    "audioTracks": {"count": 2, "item_version": 0, "item": [{
        "$meta": {"class": "AudioTrack", "id": 3},
        "Audio": {"channelLayout": 63, "sampleRate": 48000, "sampleFormat": 8},
        "Track": {"file": null, "index": 1, "codecId": "aac", "bitrate": 128000}},
        {"$meta": {"class": "AudioTrack", "ref": 3}}]}}})";

class MediaDocuments : public ::testing::Test
{
protected:
    void SetUp() override
    {
        m_video.setGeometry(640, 360)->setFrameRate(24000, 1001)->setAspect(4, 3);
        m_video.file = &m_file;
        m_video.codecId = "h264";
        m_video.bitrate = 1500000;
        m_video.isImage = true;
        m_audio.setChannelLayout(static_cast<Norvel::Conf::ChannelLayout>(63))->setSampleRate(48000);
        m_audio.setSampleFormat(static_cast<Norvel::Conf::SampleFormats>(8));
        m_audio.index = 1;
        m_audio.codecId = "aac";
        m_audio.bitrate = 128000;
        m_file.setPath(QStringLiteral("/films/a & b.mp4"))->setSize(5000000000)->setFormat("mov");
        m_file.setLength(MTime(90061))->setOpened(true);
        m_file.addTrack(&m_video)->addTrack(&m_audio)->addTrack(&m_audio);
    }

    static void expectWhole(const Media::File& file)
    {
        EXPECT_EQ(file.path, QStringLiteral("/films/a & b.mp4"));
        EXPECT_EQ(file.size, 5000000000);
        EXPECT_EQ(file.format, "mov");
        EXPECT_EQ(file.length, MTime(90061));
        EXPECT_TRUE(file.isOpened);
        EXPECT_FALSE(file.isOpening || file.isFailed);
        ASSERT_EQ(file.videoTracks.size(), 1u);
        const auto& video = *file.videoTracks[0];
        EXPECT_EQ(video.width, 640);
        EXPECT_EQ(video.height, 360);
        EXPECT_EQ(video.frameRateN, 24000);
        EXPECT_EQ(video.aspectX, 4);
        EXPECT_EQ(video.file, &file);
        EXPECT_EQ(video.codecId, "h264");
        EXPECT_EQ(video.bitrate, 1500000);
        EXPECT_TRUE(video.isImage);
        ASSERT_EQ(file.audioTracks.size(), 2u);
        EXPECT_EQ(file.audioTracks[0], file.audioTracks[1]);
        EXPECT_EQ(file.audioTracks[0]->channelLayout, 63);
        EXPECT_EQ(file.audioTracks[0]->sampleFormat, 8);
        EXPECT_EQ(file.audioTracks[0]->file, nullptr);
        EXPECT_EQ(file.audioTracks[0]->index, 1);
    }

    static void freeTracks(const Media::File& file)
    {
        delete file.videoTracks[0];
        delete file.audioTracks[0];
    }

    Media::File::Track::Video m_video;
    Media::File::Track::Audio m_audio;
    Media::File m_file;
};

TEST_F(MediaDocuments, TheXmlArchiveIsAsWrittenDown)
{
    EXPECT_EQ(saved(m_file), xmlArchive);

    Media::File content;
    load(xmlArchive, content);
    expectWhole(content);
    freeTracks(content);
}

TEST_F(MediaDocuments, TheJsonArchiveIsAsWrittenDown)
{
    EXPECT_EQ(savedAsJson(m_file), nlohmann::json::parse(jsonArchive));

    Media::File content;
    loadJson(jsonArchive, content);
    expectWhole(content);
    freeTracks(content);
}

} // namespace
