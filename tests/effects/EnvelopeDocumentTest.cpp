// SPDX-License-Identifier: Apache-2.0
// What envelopes look like in a client's archives, written down by hand.
#include <EditorModel/effects/TransformationPreset.h>
#include <EditorModel/persistence/Json.h>
#include <EditorModel/persistence/streams/Streams.h>

#include <boost/archive/xml_iarchive.hpp>
#include <boost/archive/xml_oarchive.hpp>
#include <boost/serialization/nvp.hpp>

#include <gtest/gtest.h>

#include <QBuffer>

#include <memory>
#include <sstream>

namespace {

constexpr const char* volumeXml = R"(<?xml version="1.0" encoding="UTF-8" standalone="yes" ?>
<!DOCTYPE boost_serialization>
<boost_serialization signature="serialization::archive" version="18">
<content class_id="0" tracking_level="1" version="0" object_id="_0">
	<defaultValue>5.00000000000000000e-01</defaultValue>
	<keyValues class_id="1" tracking_level="0" version="0">
		<count>2</count>
		<item_version>0</item_version>
		<item class_id="2" tracking_level="1" version="0" object_id="_1">
			<step>0.00000000000000000e+00</step>
			<value>1.00000000000000000e+00</value>
		</item>
		<item object_id="_2">
			<step>1.00000000000000000e+00</step>
			<value>2.50000000000000000e-01</value>
		</item>
	</keyValues>
</content>
</boost_serialization>

)";

VolumeEnvelope fallingEnvelope()
{
    VolumeEnvelope envelope;
    envelope.defaultValue = 0.5;
    envelope.addKeyValue(0, 1)->addKeyValue(1, 0.25);
    return envelope;
}

void expectFalling(const VolumeEnvelope& envelope)
{
    EXPECT_EQ(envelope.defaultValue, 0.5);
    ASSERT_EQ(envelope.keyValues.size(), 2u);
    EXPECT_EQ(envelope.keyValues[0].step, 0.0);
    EXPECT_EQ(envelope.keyValues[0].value, 1.0);
    EXPECT_EQ(envelope.keyValues[1].step, 1.0);
    EXPECT_EQ(envelope.keyValues[1].value, 0.25);
}

TEST(EnvelopeDocument, OfAVolumeHoldsPlainNumbers)
{
    std::ostringstream stream;
    {
        const VolumeEnvelope content = fallingEnvelope();
        boost::archive::xml_oarchive archive(stream);
        archive << BOOST_SERIALIZATION_NVP(content);
    }
    EXPECT_EQ(stream.str(), volumeXml);
}

TEST(EnvelopeDocument, OfAVolumeIsRead)
{
    std::istringstream stream(volumeXml);
    boost::archive::xml_iarchive archive(stream);
    VolumeEnvelope content;
    archive >> BOOST_SERIALIZATION_NVP(content);
    expectFalling(content);
}

TEST(EnvelopeDocument, ThatIsAFieldStreamAddsItsKeysBehindThoseThatAreThere)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    const auto writer = Serialize::makeStreamWriter(Document::Json, buffer);
    writer->writeObject(fallingEnvelope());
    writer->finish();

    VolumeEnvelope content;
    content.addKeyValue(0.75, 0.125);
    Serialize::makeStreamReader(Document::Json, buffer.data())->readObject(content);
    ASSERT_EQ(content.keyValues.size(), 3u);
    EXPECT_EQ(content.keyValues.front().step, 0.75);
    content.keyValues.pop_front();
    expectFalling(content);
}

TEST(EnvelopeDocument, NamesTheClassBehindAPointer)
{
    const VolumeEnvelope envelope = fallingEnvelope();
    std::stringstream stream;
    {
        const Serialize::ISerializable* const content = &envelope;
        boost::archive::xml_oarchive archive(stream);
        archive << BOOST_SERIALIZATION_NVP(content);
    }
    EXPECT_NE(stream.str().find("class_name=\"VolumeEnvelope\""), std::string::npos);
    Serialize::ISerializable* content = nullptr;
    boost::archive::xml_iarchive archive(stream);
    archive >> BOOST_SERIALIZATION_NVP(content);
    const std::unique_ptr<Serialize::ISerializable> owner(content);
    const auto* const loaded = dynamic_cast<const VolumeEnvelope*>(content);
    ASSERT_NE(loaded, nullptr);
    expectFalling(*loaded);
}

constexpr const char* presetJson = R"({"content": {
    "type": 2, "tag": "slow", "description": "Towards the sea", "sourceDuration": 4000,
    "transformation": {
        "defaultValue": {
            "matrix": {"m11": 1.0, "m12": 0.0, "m13": 0.0, "m21": 0.0, "m22": 1.0, "m23": 0.0,
                       "m31": 0.0, "m32": 0.0, "m33": 1.0},
            "opacity": 100},
        "keyValues": {"count": 1, "item_version": 0, "item": [{
            "step": 0.25,
            "value": {
                "matrix": {"m11": 1.0, "m12": 2.0, "m13": 3.0, "m21": 4.0, "m22": 5.0, "m23": 6.0,
                           "m31": 7.0, "m32": 8.0, "m33": 9.0},
                "opacity": 60}}]}}}})";

TEST(EnvelopeDocument, OfAPresetNestsItsEnvelope)
{
    Envelope::TransformationPreset content;
    content.type = Envelope::TransformationPreset::Type(2);
    content.tag = "slow";
    content.description = "Towards the sea";
    content.sourceDuration = MTime(4000);
    content.transformation.addKeyValue(
        0.25, Transformation::Object(Types::Transform(1, 2, 3, 4, 5, 6, 7, 8, 9), 60));
    nlohmann::json root;
    {
        Serialize::Json::oarchive archive(root);
        archive << BOOST_SERIALIZATION_NVP(content);
    }
    EXPECT_EQ(root, nlohmann::json::parse(presetJson));
}

TEST(EnvelopeDocument, OfAPresetIsRead)
{
    const nlohmann::json root = nlohmann::json::parse(presetJson);
    Envelope::TransformationPreset content;
    Serialize::Json::iarchive archive(root);
    archive >> BOOST_SERIALIZATION_NVP(content);
    EXPECT_EQ(content.type, 2);
    EXPECT_EQ(content.tag, "slow");
    EXPECT_EQ(content.description, "Towards the sea");
    EXPECT_EQ(content.sourceDuration, MTime(4000));
    ASSERT_EQ(content.transformation.keyValues.size(), 1u);
    EXPECT_EQ(content.transformation.keyValues[0].step, 0.25);
    EXPECT_EQ(content.transformation.keyValues[0].value.opacity, 60);
    EXPECT_EQ(content.transformation.keyValues[0].value.matrix.m32, 8.0);
}

} // namespace
