// SPDX-License-Identifier: Apache-2.0
// What documents with the elements of a library look like, written down by hand. Stored data is for life:
// these texts are never written anew from what the code gives.
#include "TextArchives.h"
#include "tests/shared/FieldVisitors.h"

#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Quiz.h>
#include <EditorModel/effects/Theme.h>
#include <EditorModel/effects/TransformationPreset.h>
#include <EditorModel/effects/Transition.h>
#include <EditorModel/types/Rect.h>

#include <gtest/gtest.h>

#include <string>

namespace {

using namespace GoldenTests;
using Testing::Dump;

/// One class in both forms of text: `written` gives the documents, and they give it back.
template <class T>
void expectDocuments(const T& written, const std::string& xml, const char* json)
{
    EXPECT_EQ(saved(written), xml);
    T fromXml;
    load(xml, fromXml);
    EXPECT_EQ(Dump::of(fromXml), Dump::of(written));

    EXPECT_EQ(savedAsJson(written), nlohmann::json::parse(json));
    T content;
    loadJson(json, content);
    EXPECT_EQ(Dump::of(content), Dump::of(written));
}

const std::string transitionXml = begin + R"(
	<id>fade</id>
	<tag>Fade</tag>
	<description>Soft</description>
	<strategy>2</strategy>
	<type>3</type>
	<resources class_id="1" tracking_level="0" version="0">
		<count>2</count>
		<item_version>0</item_version>
		<item class_id="2" tracking_level="0" version="0">
			<element>matte</element>
			<element>1</element>
		</item>
		<item>
			<element>whoosh</element>
			<element>2</element>
		</item>
	</resources>
	<defaultDuration>1500</defaultDuration>
	<volume>40</volume>
)" + end;

constexpr const char* transitionJson = R"({"content": {
    "id": "fade", "tag": "Fade", "description": "Soft", "strategy": 2, "type": 3,
    "resources": {"count": 2, "item_version": 0, "item": [
        {"element": ["matte", 1]}, {"element": ["whoosh", 2]}]},
    "defaultDuration": 1500, "volume": 40}})";

TEST(TransitionDocuments, AreAsWrittenDown)
{
    Transition::Object transition("fade");
    transition.tag = "Fade";
    transition.description = "Soft";
    transition.strategy = Transition::Object::Strategy(2);
    transition.type = Transition::Object::Type(3);
    transition.resources = {{"matte", Resource::VideoType}, {"whoosh", Resource::AudioType}};
    transition.defaultDuration = 1500;
    transition.volume = 40;
    expectDocuments(transition, transitionXml, transitionJson);
}

const std::string themeXml = begin + R"(
	<tag>Party</tag>
	<transitionsList class_id="1" tracking_level="0" version="0">
		<count>2</count>
		<item_version>0</item_version>
		<item>wipe</item>
		<item>fade</item>
	</transitionsList>
	<previewVideo>party.mov</previewVideo>
	<music>party.flac</music>
	<startTitle>Hello</startTitle>
	<finalTitle>Goodbye</finalTitle>
	<minSceneDuration>1100</minSceneDuration>
	<maxSceneDuration>2200</maxSceneDuration>
)" + end;

constexpr const char* themeJson = R"({"content": {
    "tag": "Party", "transitionsList": {"count": 2, "item_version": 0, "item": ["wipe", "fade"]},
    "previewVideo": "party.mov", "music": "party.flac", "startTitle": "Hello", "finalTitle": "Goodbye",
    "minSceneDuration": 1100, "maxSceneDuration": 2200}})";

TEST(ThemeDocuments, AreAsWrittenDown)
{
    Theme::Object theme;
    theme.tag = "Party";
    theme.transitionsList = {"wipe", "fade"};
    theme.previewVideo = "party.mov";
    theme.music = "party.flac";
    theme.startTitle = "Hello";
    theme.finalTitle = "Goodbye";
    theme.minSceneDuration = 1100;
    theme.maxSceneDuration = 2200;
    expectDocuments(theme, themeXml, themeJson);
}

const std::string quizXml = begin + R"(
	<questions class_id="1" tracking_level="0" version="0">
		<count>1</count>
		<item_version>0</item_version>
		<item class_id="2" tracking_level="1" version="0" object_id="_1">
			<type>4</type>
			<text>Which are even?</text>
			<answers class_id="3" tracking_level="0" version="0">
				<count>3</count>
				<item_version>0</item_version>
				<item>two</item>
				<item>three</item>
				<item>four</item>
			</answers>
			<correctAnswers class_id="4" tracking_level="0" version="0">
				<count>2</count>
				<item_version>0</item_version>
				<item>four</item>
				<item>two</item>
			</correctAnswers>
		</item>
	</questions>
	<tag>Numbers</tag>
	<description>Easy</description>
)" + end;

constexpr const char* quizJson = R"({"content": {
    "questions": {"count": 1, "item_version": 0, "item": [{
        "type": 4, "text": "Which are even?",
        "answers": {"count": 3, "item_version": 0, "item": ["two", "three", "four"]},
        "correctAnswers": {"count": 2, "item_version": 0, "item": ["four", "two"]}}]},
    "tag": "Numbers", "description": "Easy"}})";

TEST(QuizDocuments, AreAsWrittenDown)
{
    Quiz::Question question;
    question.type = Quiz::Question::Type(4);
    question.text = "Which are even?";
    question.answers = {"two", "three", "four"};
    question.correctAnswers = {"two", "four"};
    Quiz::Preset quiz;
    quiz.questions = {question};
    quiz.tag = "Numbers";
    quiz.description = "Easy";
    expectDocuments(quiz, quizXml, quizJson);
}

/// "Hi" is SGk= in base64.
const std::string overlayXml = begin + R"(
	<type>5</type>
	<scriptId>slide</scriptId>
	<scriptSpeed>1.50000000000000000e+00</scriptSpeed>
	<items class_id="1" tracking_level="0" version="0">
		<count>1</count>
		<item_version>0</item_version>
		<item class_id="2" tracking_level="1" version="0" object_id="_1">
			<type>6</type>
			<encodedText>SGk=</encodedText>
			<transform class_id="3" tracking_level="1" version="0" object_id="_2">
				<m11>1.25000000000000000e+00</m11>
				<m12>2.00000000000000000e+00</m12>
				<m13>3.00000000000000000e+00</m13>
				<m21>4.00000000000000000e+00</m21>
				<m22>5.00000000000000000e+00</m22>
				<m23>6.00000000000000000e+00</m23>
				<m31>7.00000000000000000e+00</m31>
				<m32>8.00000000000000000e+00</m32>
				<m33>9.00000000000000000e+00</m33>
			</transform>
			<envelope class_id="4" tracking_level="1" version="0" object_id="_3">
				<defaultValue class_id="5" tracking_level="1" version="0" object_id="_4">
					<matrix object_id="_5">
						<m11>1.00000000000000000e+00</m11>
						<m12>0.00000000000000000e+00</m12>
						<m13>0.00000000000000000e+00</m13>
						<m21>0.00000000000000000e+00</m21>
						<m22>1.00000000000000000e+00</m22>
						<m23>0.00000000000000000e+00</m23>
						<m31>0.00000000000000000e+00</m31>
						<m32>0.00000000000000000e+00</m32>
						<m33>1.00000000000000000e+00</m33>
					</matrix>
					<opacity>80</opacity>
				</defaultValue>
				<keyValues class_id="6" tracking_level="0" version="0">
					<count>0</count>
					<item_version>0</item_version>
				</keyValues>
			</envelope>
			<scriptRole>title</scriptRole>
			<editTime>5.00000000000000000e-01</editTime>
			<outline class_id="7" tracking_level="1" version="0" object_id="_6">
				<color>4278255360</color>
				<width>2</width>
				<enabled>1</enabled>
			</outline>
			<editable>0</editable>
			<features>9</features>
			<textWidth>6.25000000000000000e-01</textWidth>
			<arcRadius>-7.50000000000000000e-01</arcRadius>
			<from>1.25000000000000000e-01</from>
			<to>8.75000000000000000e-01</to>
			<intro>2.50000000000000000e-01</intro>
			<outro>3.75000000000000000e-01</outro>
			<dropShadow class_id="8" tracking_level="1" version="0" object_id="_7">
				<enabled>1</enabled>
				<color>2147483649</color>
				<offsetX>-3</offsetX>
				<offsetY>7</offsetY>
				<blurRadius>8</blurRadius>
			</dropShadow>
		</item>
	</items>
	<tag>Greeting</tag>
	<description>Short</description>
	<sourceDuration>3300</sourceDuration>
)" + end;

constexpr const char* overlayJson = R"({"content": {
    "type": 5, "scriptId": "slide", "scriptSpeed": 1.5,
    "items": {"count": 1, "item_version": 0, "item": [{
        "type": 6, "encodedText": "SGk=",
        "transform": {"m11": 1.25, "m12": 2.0, "m13": 3.0, "m21": 4.0, "m22": 5.0, "m23": 6.0,
            "m31": 7.0, "m32": 8.0, "m33": 9.0},
        "envelope": {
            "defaultValue": {
                "matrix": {"m11": 1.0, "m12": 0.0, "m13": 0.0, "m21": 0.0, "m22": 1.0, "m23": 0.0,
                    "m31": 0.0, "m32": 0.0, "m33": 1.0},
                "opacity": 80},
            "keyValues": {"count": 0, "item_version": 0}},
        "scriptRole": "title", "editTime": 0.5,
        "outline": {"color": 4278255360, "width": 2, "enabled": true},
        "editable": false, "features": 9, "textWidth": 0.625, "arcRadius": -0.75,
        "from": 0.125, "to": 0.875, "intro": 0.25, "outro": 0.375,
        "dropShadow": {"enabled": true, "color": 2147483649, "offsetX": -3, "offsetY": 7, "blurRadius": 8}}]},
    "tag": "Greeting", "description": "Short", "sourceDuration": 3300}})";

TEST(OverlayDocuments, AreAsWrittenDown)
{
    TransformationEnvelope envelope;
    envelope.defaultValue.setOpacity(80);
    Overlay::Item item;
    item.setType(Overlay::Item::Type(6)).setText("Hi").setScriptRole("title").setEditTime(0.5);
    item.setTransform(Types::Transform(1.25, 2, 3, 4, 5, 6, 7, 8, 9)).setEnvelope(envelope);
    item.setOutline(Types::Pen(0xFF00FF00, 2, true)).setEditable(false).setTextWidth(0.625);
    item.setArcRadius(-0.75).setFrom(0.125).setTo(0.875).setIntro(0.25).setOutro(0.375);
    item.setDropShadow(Overlay::DropShadow(0x80000001, -3, 7, 8)).features = 9;
    Overlay::Preset preset;
    preset.setType(Overlay::Preset::Type(5))->setScriptId("slide")->setScriptSpeed(1.5);
    preset.setTag("Greeting")->setDescription("Short")->setSourceDuration(3300)->appendItem(item);
    expectDocuments(preset, overlayXml, overlayJson);
}

const std::string transformationXml = begin + R"(
	<type>7</type>
	<tag>Zoom</tag>
	<description>Slow</description>
	<sourceDuration>4400</sourceDuration>
	<transformation class_id="1" tracking_level="1" version="0" object_id="_1">
		<defaultValue class_id="2" tracking_level="1" version="0" object_id="_2">
			<matrix class_id="3" tracking_level="1" version="0" object_id="_3">
				<m11>1.00000000000000000e+00</m11>
				<m12>0.00000000000000000e+00</m12>
				<m13>0.00000000000000000e+00</m13>
				<m21>0.00000000000000000e+00</m21>
				<m22>1.00000000000000000e+00</m22>
				<m23>0.00000000000000000e+00</m23>
				<m31>0.00000000000000000e+00</m31>
				<m32>0.00000000000000000e+00</m32>
				<m33>1.00000000000000000e+00</m33>
			</matrix>
			<opacity>100</opacity>
		</defaultValue>
		<keyValues class_id="4" tracking_level="0" version="0">
			<count>1</count>
			<item_version>0</item_version>
			<item class_id="5" tracking_level="1" version="0" object_id="_4">
				<step>5.00000000000000000e-01</step>
				<value object_id="_5">
					<matrix object_id="_6">
						<m11>2.00000000000000000e+00</m11>
						<m12>0.00000000000000000e+00</m12>
						<m13>0.00000000000000000e+00</m13>
						<m21>0.00000000000000000e+00</m21>
						<m22>2.00000000000000000e+00</m22>
						<m23>0.00000000000000000e+00</m23>
						<m31>-2.50000000000000000e-01</m31>
						<m32>7.50000000000000000e-01</m32>
						<m33>1.00000000000000000e+00</m33>
					</matrix>
					<opacity>55</opacity>
				</value>
			</item>
		</keyValues>
	</transformation>
)" + end;

constexpr const char* transformationJson = R"({"content": {
    "type": 7, "tag": "Zoom", "description": "Slow", "sourceDuration": 4400,
    "transformation": {
        "defaultValue": {
            "matrix": {"m11": 1.0, "m12": 0.0, "m13": 0.0, "m21": 0.0, "m22": 1.0, "m23": 0.0,
                "m31": 0.0, "m32": 0.0, "m33": 1.0},
            "opacity": 100},
        "keyValues": {"count": 1, "item_version": 0, "item": [{
            "step": 0.5,
            "value": {
                "matrix": {"m11": 2.0, "m12": 0.0, "m13": 0.0, "m21": 0.0, "m22": 2.0, "m23": 0.0,
                    "m31": -0.25, "m32": 0.75, "m33": 1.0},
                "opacity": 55}}]}}}})";

TEST(TransformationPresetDocuments, AreAsWrittenDown)
{
    Envelope::TransformationPreset preset;
    preset.type = Envelope::TransformationPreset::Type(7);
    preset.tag = "Zoom";
    preset.description = "Slow";
    preset.sourceDuration = 4400;
    preset.transformation.addKeyValue(
        0.5, Transformation::Object(Types::Transform(2, 0, 0, 0, 2, 0, -0.25, 0.75, 1), 55));
    expectDocuments(preset, transformationXml, transformationJson);
}

const std::string rectXml = begin + R"(
	<top>2.00000000000000000e+00</top>
	<left>1.00000000000000000e+00</left>
	<bottom>4.00000000000000000e+00</bottom>
	<right>3.00000000000000000e+00</right>
)" + end;

TEST(RectDocuments, AreAsWrittenDown)
{
    expectDocuments(Types::Rect(1, 2, 3, 4), rectXml,
                    R"({"content": {"top": 2.0, "left": 1.0, "bottom": 4.0, "right": 3.0}})");
}

} // namespace
