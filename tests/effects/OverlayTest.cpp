// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/effects/Overlay.h>

#include <gmock/gmock.h>

#include <cmath>
#include <limits>
#include <type_traits>

namespace {

using Overlay::DropShadow;
using Overlay::Item;
using Overlay::Preset;
using testing::ElementsAre;
using Testing::FieldText;

static_assert(!Testing::isVirtualBase<Serialize::ISerializable, DropShadow>);
static_assert(!Testing::isVirtualBase<Serialize::ISerializable, Item>);
static_assert(!Testing::isVirtualBase<Serialize::ISerializable, Preset>);
static_assert(!std::is_base_of_v<PubSub::Object, DropShadow>);
static_assert(Testing::isVirtualBase<PubSub::Object, Item>);
static_assert(Testing::isVirtualBase<PubSub::Object, Preset>);

Item everyItemField()
{
    Item item;
    item.setType(Item::Type(3)).setText("a").setTransform(Types::Transform(1, 2, 3, 4, 5, 6, 7, 8, 9));
    TransformationEnvelope envelope;
    envelope.addKeyValue(0.5, Transformation::Object());
    item.setEnvelope(envelope).setScriptRole("title").setEditTime(2.5).setOutline(Types::Pen(7, 8, true));
    item.setEditable(false).setFrom(0.25).setTo(0.75).setIntro(0.125).setOutro(0.0625);
    item.setTextWidth(320.5).setArcRadius(12.5).setDropShadow(DropShadow(9, 10, 11, 12));
    item.features = 6;
    return item;
}

Item itemOfText(const QString& text)
{
    return Item().setText(text);
}

Preset everyPresetField()
{
    Preset preset;
    preset.setType(Preset::Type(2))->setScriptId("slide")->setScriptSpeed(1.5)->setTag("Titles");
    preset.setDescription("Slides in")->setSourceDuration(3000)->appendItem(itemOfText("a"));
    return preset;
}

std::vector<QString> textsOf(const Preset& preset)
{
    std::vector<QString> texts;
    for (const Item& item : preset.items)
        texts.push_back(item.text);
    return texts;
}

void expectShadow(const DropShadow& shadow, bool enabled, quint32 color, int offsetX, int offsetY,
                  int blurRadius)
{
    EXPECT_EQ(shadow.enabled, enabled);
    EXPECT_EQ(shadow.color, color);
    EXPECT_EQ(shadow.offsetX, offsetX);
    EXPECT_EQ(shadow.offsetY, offsetY);
    EXPECT_EQ(shadow.blurRadius, blurRadius);
}

TEST(DropShadow, IsOffByDefaultAndOnWithAColor)
{
    expectShadow(DropShadow(), false, 0xb43f3f3f, 4, 4, 1);
    expectShadow(DropShadow(0xff102030u), true, 0xff102030, 4, 4, 1);
    expectShadow(DropShadow(0xff102030u, -5, 6), true, 0xff102030, -5, 6, 1);
    expectShadow(DropShadow(0xff102030u, -5, 6, 9), true, 0xff102030, -5, 6, 9);
    expectShadow(DropShadow(0u), true, 0, 4, 4, 1);
}

TEST(DropShadow, IsWrittenInTheOrderOfItsFields)
{
    EXPECT_THAT(Testing::fieldTexts(DropShadow(4294967295u, 2, -3, 5)),
                ElementsAre(FieldText("enabled", "true"), FieldText("color", "4294967295u"),
                            FieldText("offsetX", "2"), FieldText("offsetY", "-3"),
                            FieldText("blurRadius", "5")));
    Testing::expectMadeByName<DropShadow>("Overlay::DropShadow");
}

TEST(OverlayItem, IsWrittenInAnOrderOfItsOwnAndWithItsTextEncoded)
{
    const Item item = everyItemField();
    EXPECT_THAT(Testing::fieldKeys(item),
                ElementsAre("type", "encodedText", "transform", "envelope", "scriptRole", "editTime",
                            "outline", "editable", "features", "textWidth", "arcRadius", "from", "to",
                            "intro", "outro", "dropShadow"));
    const auto fields = Testing::fieldTexts(item);
    EXPECT_EQ(fields[0].second, "3");
    EXPECT_EQ(fields[1].second, "Q\"YQ%3D%3D\"");
    EXPECT_EQ(fields[2].second.substr(0, 16), "Types::Transform");
    EXPECT_EQ(fields[3].second.substr(0, 22), "TransformationEnvelope");
    EXPECT_EQ(fields[4].second, "Q\"title\"");
    EXPECT_EQ(fields[5].second, "2.5");
    EXPECT_EQ(fields[6].second, "Types::Pen\n  color: 7u\n  width: 8\n  enabled: true");
    EXPECT_EQ(fields[7].second, "false");
    EXPECT_EQ(fields[8].second, "6");
    EXPECT_EQ(fields[9].second, "320.5");
    EXPECT_EQ(fields[10].second, "12.5");
    EXPECT_EQ(fields[11].second, "0.25");
    EXPECT_EQ(fields[12].second, "0.75");
    EXPECT_EQ(fields[13].second, "0.125");
    EXPECT_EQ(fields[14].second, "0.0625");
    EXPECT_EQ(fields[15].second, "Overlay::DropShadow\n  enabled: true\n  color: 9u\n  offsetX: 10"
                                 "\n  offsetY: 11\n  blurRadius: 12");
    Testing::expectMadeByName<Item>("Overlay::Item");
}

TEST(OverlayItem, EqualsWhatLooksTheSame)
{
    const Item item = everyItemField();
    EXPECT_TRUE(item == item);
    EXPECT_TRUE(item == everyItemField());
    EXPECT_TRUE(Item() == Item());
    EXPECT_FALSE(item == Item());
}

TEST(OverlayItem, DiffersByWhatItShows)
{
    const Item item = everyItemField();
    EXPECT_FALSE(item == everyItemField().setType(Item::Type(4)));
    EXPECT_FALSE(item == everyItemField().setText("A"));
    EXPECT_FALSE(item == everyItemField().setScriptRole("Title"));
    EXPECT_FALSE(item == everyItemField().setEditTime(2.75));
    EXPECT_FALSE(item == everyItemField().setOutline(Types::Pen(6, 8, true)));
    EXPECT_FALSE(item == everyItemField().setOutline(Types::Pen(7, 9, true)));
    EXPECT_FALSE(item == everyItemField().setOutline(Types::Pen(7, 8, false)));
    EXPECT_FALSE(item == everyItemField().setTextWidth(320.75));
    EXPECT_FALSE(item == everyItemField().setArcRadius(12.75));
}

TEST(OverlayItem, DiffersByEachCoefficientOfItsTransform)
{
    const Item item = everyItemField();
    using Types::Transform;
    for (double Transform::*coefficient :
         {&Transform::m11, &Transform::m12, &Transform::m13, &Transform::m21, &Transform::m22,
          &Transform::m23, &Transform::m31, &Transform::m32, &Transform::m33}) {
        Item other = everyItemField();
        other.transform.*coefficient *= 1 + 1e-9;
        EXPECT_FALSE(item == other);
        other.transform.*coefficient = item.transform.*coefficient * (1 + 1e-14);
        EXPECT_TRUE(item == other);
    }
}

TEST(OverlayItem, NothingIsNearlyZeroInATransform)
{
    Item item;
    item.transform.m31 = 1e-13;
    EXPECT_FALSE(item == Item());
}

TEST(OverlayItem, EqualsWhatDiffersInTheRest)
{
    const Item item = everyItemField();
    EXPECT_TRUE(item == everyItemField().setEnvelope({}));
    EXPECT_TRUE(item == everyItemField().setEditable(true));
    EXPECT_TRUE(item == everyItemField().setFrom(0.5));
    EXPECT_TRUE(item == everyItemField().setTo(0.5));
    EXPECT_TRUE(item == everyItemField().setIntro(0.5));
    EXPECT_TRUE(item == everyItemField().setOutro(0.5));
    EXPECT_TRUE(item == everyItemField().setDropShadow(DropShadow(1)));
    Item other = everyItemField();
    other.features = 1;
    EXPECT_TRUE(item == other);
}

TEST(OverlayItem, TheLastBitOfTheEditTimeCounts)
{
    EXPECT_FALSE(Item().setEditTime(1.0) == Item().setEditTime(std::nextafter(1.0, 2.0)));
    EXPECT_TRUE(Item().setEditTime(0.0) == Item().setEditTime(-0.0));
}

TEST(OverlayItem, WidthAndRadiusAreComparedToTwelveDigits)
{
    EXPECT_TRUE(Item().setTextWidth(1.0) == Item().setTextWidth(1.00000000000001));
    EXPECT_FALSE(Item().setTextWidth(1.0) == Item().setTextWidth(1.00000000001));
    EXPECT_TRUE(Item().setTextWidth(0.0) == Item().setTextWidth(1e-12));
    EXPECT_FALSE(Item().setTextWidth(0.0) == Item().setTextWidth(2e-12));
    EXPECT_TRUE(Item().setArcRadius(1.0) == Item().setArcRadius(1.00000000000001));
    EXPECT_FALSE(Item().setArcRadius(1.0) == Item().setArcRadius(1.00000000001));
    EXPECT_TRUE(Item().setArcRadius(-1e-12) == Item().setArcRadius(1e-12));
    EXPECT_FALSE(Item().setArcRadius(-1.0) == Item().setArcRadius(1.0));
}

TEST(OverlayItem, EqualsItselfWhateverItHolds)
{
    const Item item = Item().setEditTime(std::numeric_limits<double>::quiet_NaN());
    EXPECT_TRUE(item == item);
    EXPECT_FALSE(item == Item(item));
}

TEST(OverlayPreset, GivesItselfBackForEveryChangeOfItsItems)
{
    Preset preset;
    EXPECT_EQ(preset.appendItem(Item()), &preset);
    EXPECT_EQ(preset.prependItem(Item()), &preset);
    EXPECT_EQ(preset.removeItem(Item()), &preset);
    EXPECT_EQ(preset.clearItems(), &preset);
}

TEST(OverlayPreset, IsWrittenInTheOrderOfItsFields)
{
    Preset preset = everyPresetField();
    EXPECT_THAT(Testing::fieldKeys(preset), ElementsAre("type", "scriptId", "scriptSpeed", "items", "tag",
                                                        "description", "sourceDuration"));
    EXPECT_EQ(Testing::fieldTexts(preset)[3].second.substr(0, 41),
              "\n  1 items\n  item 1\n  item: Overlay::Item");
    preset.clearItems();
    EXPECT_THAT(Testing::fieldTexts(preset),
                ElementsAre(FieldText("type", "2"), FieldText("scriptId", "Q\"slide\""),
                            FieldText("scriptSpeed", "1.5"), FieldText("items", "\n  0 items"),
                            FieldText("tag", "Q\"Titles\""), FieldText("description", "Q\"Slides in\""),
                            FieldText("sourceDuration", "3000ms")));
    Testing::expectMadeByName<Preset>("Overlay::Preset");
}

TEST(OverlayPreset, HasAMimeType)
{
    EXPECT_EQ(*Preset::mimeType, "x-application/OverlayPreset-serialized");
}

TEST(OverlayPreset, PutsItemsAtEitherEnd)
{
    Preset preset;
    preset.prependItem(itemOfText("b"));
    EXPECT_EQ(preset.items.size(), 1u);
    EXPECT_FALSE(preset.isEmpty());
    preset.appendItem(itemOfText("c"))->prependItem(itemOfText("a"));
    EXPECT_THAT(textsOf(preset), ElementsAre("a", "b", "c"));
    preset.appendItem(preset.items.front())->prependItem(preset.items[1]);
    EXPECT_THAT(textsOf(preset), ElementsAre("b", "a", "b", "c", "a"));
    preset.clearItems();
    EXPECT_TRUE(preset.isEmpty());
}

TEST(OverlayPreset, KeepsWholeCopiesOfItems)
{
    const Item item = everyItemField();
    Preset preset;
    preset.appendItem(item)->prependItem(item);
    EXPECT_EQ(Testing::Dump::of(preset.items[0]), Testing::Dump::of(item));
    EXPECT_EQ(Testing::Dump::of(preset.items[1]), Testing::Dump::of(item));
}

TEST(OverlayPreset, RemovesEveryItemThatEqualsTheGivenOne)
{
    Preset preset;
    for (const char* text : {"a", "b", "a", "c", "a", "b"})
        preset.appendItem(itemOfText(text));
    preset.removeItem(itemOfText("a"));
    EXPECT_THAT(textsOf(preset), ElementsAre("b", "c", "b"));
    preset.removeItem(itemOfText("a"));
    EXPECT_THAT(textsOf(preset), ElementsAre("b", "c", "b"));
}

TEST(OverlayPreset, RemovesItemsThatDifferInWhatIsNotCompared)
{
    Preset preset;
    preset.appendItem(itemOfText("a").setIntro(1))->appendItem(itemOfText("a").setDropShadow(DropShadow(1)));
    preset.removeItem(itemOfText("a"));
    EXPECT_TRUE(preset.isEmpty());
}

TEST(OverlayPreset, RemovesAnItemOfItsOwn)
{
    Preset preset;
    for (const char* text : {"a", "b", "a", "c", "a", "d"})
        preset.appendItem(itemOfText(text));
    preset.removeItem(preset.items[2]);
    EXPECT_THAT(textsOf(preset), ElementsAre("b", "c", "d"));

    const double nan = std::numeric_limits<double>::quiet_NaN();
    preset.items[1].setEditTime(nan);
    preset.appendItem(preset.items[1]);
    preset.removeItem(preset.items[1]);
    EXPECT_THAT(textsOf(preset), ElementsAre("b", "d", "c"));
}

TEST(OverlayPreset, FindsItemsByType)
{
    Preset preset;
    EXPECT_FALSE(preset.hasItemType(Item::Type(0)));
    preset.appendItem(Item())->appendItem(Item().setType(Item::Type(5)));
    EXPECT_TRUE(preset.hasItemType(Item::Type(0)));
    EXPECT_TRUE(preset.hasItemType(Item::Type(5)));
    EXPECT_FALSE(preset.hasItemType(Item::Type(4)));
}

TEST(OverlayPreset, IsEmptyWithoutItemsWhateverElseItHas)
{
    Preset preset = everyPresetField();
    EXPECT_FALSE(preset.isEmpty());
    preset.clearItems();
    EXPECT_TRUE(preset.isEmpty());
    EXPECT_EQ(preset.tag, "Titles");
}

TEST(OverlayPreset, EqualsWhatShowsTheSame)
{
    const Preset preset = everyPresetField();
    EXPECT_TRUE(preset == preset);
    EXPECT_TRUE(preset == everyPresetField());
    EXPECT_TRUE(Preset() == Preset());
    Preset other = everyPresetField();
    other.items[0].setDropShadow(DropShadow(1));
    EXPECT_TRUE(preset == other);
}

TEST(OverlayPreset, DiffersByItsItemsAndItsScript)
{
    const Preset preset = everyPresetField();
    Preset other = everyPresetField();
    EXPECT_FALSE(preset == *other.appendItem(itemOfText("b")));
    other = everyPresetField();
    EXPECT_FALSE(preset == *other.clearItems());
    other = everyPresetField();
    other.items[0].setText("b");
    EXPECT_FALSE(preset == other);
    other = everyPresetField();
    EXPECT_FALSE(preset == *other.setScriptId("fade"));
    EXPECT_FALSE(preset == *other.setScriptId("slide")->setScriptSpeed(1.50000000001));
    EXPECT_TRUE(preset == *other.setScriptSpeed(1.50000000000001));
}

TEST(OverlayPreset, TheOrderOfItemsCounts)
{
    Preset first, second;
    first.appendItem(itemOfText("a"))->appendItem(itemOfText("b"));
    second.appendItem(itemOfText("b"))->appendItem(itemOfText("a"));
    EXPECT_FALSE(first == second);
}

TEST(OverlayPreset, EqualsWhatDiffersInTheRest)
{
    const Preset preset = everyPresetField();
    Preset other = everyPresetField();
    EXPECT_TRUE(preset == *other.setTag("Callouts"));
    EXPECT_TRUE(preset == *other.setType(Preset::Type(1)));
    EXPECT_TRUE(preset == *other.setDescription("Fades in"));
    EXPECT_TRUE(preset == *other.setSourceDuration(1));
}

TEST(OverlayPreset, EqualsItselfWhateverItHolds)
{
    Preset preset;
    preset.setScriptSpeed(std::numeric_limits<double>::quiet_NaN());
    EXPECT_TRUE(preset == preset);
    EXPECT_FALSE(preset == Preset(preset));
}

} // namespace
