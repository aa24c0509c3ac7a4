// SPDX-License-Identifier: Apache-2.0
// What documents with the data of a tracking look like, written down by hand. Stored data is for life: these
// texts are never written anew from what the code gives.
#include "TextArchives.h"

#include <EditorModel/analysis/MotionTracking.h>
#include <EditorModel/persistence/Document.h>

#include <gtest/gtest.h>

#include <QBuffer>

namespace {

using namespace GoldenTests;

constexpr const char* xmlArchive = R"(<?xml version="1.0" encoding="UTF-8" standalone="yes" ?>
<!DOCTYPE boost_serialization>
<boost_serialization signature="serialization::archive" version="18">
<content class_id="0" tracking_level="1" version="0" object_id="_0">
	<id>{a &amp; b}</id>
	<frames class_id="1" tracking_level="0" version="0">
		<count>2</count>
		<item_version>0</item_version>
		<item class_id="2" tracking_level="0" version="0">
			<first>-40</first>
			<second class_id="3" tracking_level="1" version="0" object_id="_1">
				<MotionTracking..Frame class_id="4" tracking_level="1" version="0" object_id="_2">
					<left>1.25000000000000000e-01</left>
					<top>2.50000000000000000e-01</top>
					<width>5.00000000000000000e-01</width>
					<height>7.50000000000000000e-01</height>
				</MotionTracking..Frame>
				<duration>40</duration>
			</second>
		</item>
		<item>
			<first>61000</first>
			<second object_id="_3">
				<MotionTracking..Frame object_id="_4">
					<left>0.00000000000000000e+00</left>
					<top>0.00000000000000000e+00</top>
					<width>1.00000000000000000e+00</width>
					<height>1.00000000000000000e+00</height>
				</MotionTracking..Frame>
				<duration>0</duration>
			</second>
		</item>
	</frames>
</content>
</boost_serialization>

)";

constexpr const char* jsonArchive = R"({"content": {
    "id": "{a & b}",
    "frames": {"count": 2, "item_version": 0, "item": [
        {"first": -40,
         "second": {
            "MotionTracking::Frame": {"left": 0.125, "top": 0.25, "width": 0.5, "height": 0.75},
            "duration": 40}},
        {"first": 61000,
         "second": {
            "MotionTracking::Frame": {"left": 0.0, "top": 0.0, "width": 1.0, "height": 1.0},
            "duration": 0}}]}}})";

constexpr const char* xmlStream = R"(<?xml version="1.0" encoding="UTF-8"?>
<EditorModel route="stream" version="1">
    <objects count="1">
        <Item>
            <Data class="MotionTracking::Data" id="1">
                <id>{a &amp; b}</id>
                <frames count="2">
                    <Item>
                        <Key>-40</Key>
                        <Value class="MotionTracking::TimedFrame" id="2">
                            <BaseOfObject class="MotionTracking::Frame">
                                <left>0.125</left>
                                <top>0.25</top>
                                <width>0.5</width>
                                <height>0.75</height>
                            </BaseOfObject>
                            <duration>40</duration>
                        </Value>
                    </Item>
                    <Item>
                        <Key>61000</Key>
                        <Value class="MotionTracking::TimedFrame" id="3">
                            <BaseOfObject class="MotionTracking::Frame">
                                <left>0</left>
                                <top>0</top>
                                <width>1</width>
                                <height>1</height>
                            </BaseOfObject>
                            <duration>0</duration>
                        </Value>
                    </Item>
                </frames>
            </Data>
        </Item>
    </objects>
</EditorModel>
)";

MotionTracking::Data tracking()
{
    MotionTracking::Data data(QStringLiteral("{a & b}"));
    data.frames[MTime(61000)] = {};
    MotionTracking::TimedFrame& first = data.frames[MTime(-40)];
    static_cast<MotionTracking::Frame&>(first) = MotionTracking::Frame(0.125, 0.25, 0.5, 0.75);
    first.duration = 40;
    return data;
}

void expectTracking(const MotionTracking::Data& data)
{
    EXPECT_TRUE(data == tracking());
    EXPECT_EQ(data.frames.at(MTime(-40)).duration, MTime(40));
    EXPECT_EQ(data.frames.at(MTime(61000)).duration, MTime(0));
}

TEST(TrackingDocuments, TheXmlArchiveIsAsWrittenDown)
{
    EXPECT_EQ(saved(tracking()), xmlArchive);

    MotionTracking::Data content;
    load(xmlArchive, content);
    expectTracking(content);
}

TEST(TrackingDocuments, TheJsonArchiveIsAsWrittenDown)
{
    EXPECT_EQ(savedAsJson(tracking()), nlohmann::json::parse(jsonArchive));

    MotionTracking::Data content;
    loadJson(jsonArchive, content);
    expectTracking(content);
}

TEST(TrackingDocuments, TheXmlStreamIsAsWrittenDown)
{
    QBuffer buffer;
    buffer.open(QIODevice::ReadWrite);
    Document::save(buffer, tracking(), Document::Xml, Document::Stream);
    EXPECT_EQ(buffer.data().toStdString(), xmlStream);

    QByteArray stored = xmlStream;
    QBuffer input(&stored);
    input.open(QIODevice::ReadOnly);
    const auto graph = Document::load(input);
    ASSERT_TRUE(graph.rootAs<MotionTracking::Data>());
    expectTracking(*graph.rootAs<MotionTracking::Data>());
}

} // namespace
