// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/ResourceRef.h>

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <string>
#include <type_traits>
#include <vector>

namespace {

using namespace Resource;

static_assert(std::is_same_v<ResourceRef, std::tuple<QString, Resource::Type>>);
static_assert(std::is_same_v<std::underlying_type_t<Type>, int>);
static_assert(NoType == 0 && VideoType == 1 && AudioType == 2 && ImageType == 3);

QString textOfType(Type type)
{
    return type == VideoType ? "video" : type == AudioType ? "audio" : type == ImageType ? "image" : "";
}

TEST(ResourceRef, IsEmptyAndOfNoTypeByDefault)
{
    const ResourceRef resource;
    EXPECT_TRUE(std::get<QString>(resource).isEmpty());
    EXPECT_EQ(std::get<Type>(resource), NoType);
}

TEST(ResourceRef, ReservesAnIdentifierForTheEmptyStream)
{
    EXPECT_EQ(EMPTY_STREAM, QString("RESOURCE##EMPTY_STREAM"));
    EXPECT_EQ(parseResource(serializeResource({EMPTY_STREAM, VideoType})),
              ResourceRef(EMPTY_STREAM, VideoType));
}

TEST(ResourceText, HoldsIdentifierAndType)
{
    EXPECT_EQ(serializeResource({"abc", VideoType}), "resource_id=abc:resource_type=video");
    EXPECT_EQ(serializeResource({"abc", AudioType}), "resource_id=abc:resource_type=audio");
    EXPECT_EQ(serializeResource({"abc", ImageType}), "resource_id=abc:resource_type=image");
}

TEST(ResourceText, HasNoTextForATypeWithoutAName)
{
    EXPECT_EQ(serializeResource({}), "resource_id=:resource_type=");
    EXPECT_EQ(serializeResource({"abc", NoType}), "resource_id=abc:resource_type=");
    EXPECT_EQ(serializeResource({"abc", static_cast<Type>(4)}), "resource_id=abc:resource_type=");
    EXPECT_EQ(serializeResource({"abc", static_cast<Type>(-1)}), "resource_id=abc:resource_type=");
}

TEST(ResourceText, IsReadBackAndWrittenAlike)
{
    const QString text = "resource_id=abc:resource_type=audio";
    EXPECT_EQ(parseResource(text), ResourceRef("abc", AudioType));
    EXPECT_EQ(serializeResource(parseResource(text)), text);
}

TEST(ResourceText, EveryTypeIsReadByItsName)
{
    EXPECT_EQ(parseResource("resource_id=a:resource_type=video"), ResourceRef("a", VideoType));
    EXPECT_EQ(parseResource("resource_id=a:resource_type=audio"), ResourceRef("a", AudioType));
    EXPECT_EQ(parseResource("resource_id=a:resource_type=image"), ResourceRef("a", ImageType));
    for (const char* const name : {"", "Video", "AUDIO", " video", "video ", "videos", "vide", "1"})
        EXPECT_EQ(parseResource(QString("resource_id=a:resource_type=") + name), ResourceRef("a", NoType));
}

TEST(ResourceText, PartsMayStandInAnyOrder)
{
    EXPECT_EQ(parseResource("resource_type=video:resource_id=abc"), ResourceRef("abc", VideoType));
}

TEST(ResourceText, TheLastPartOfAKeyCounts)
{
    EXPECT_EQ(parseResource("resource_id=a:resource_type=video:resource_id=b:resource_type=image"),
              ResourceRef("b", ImageType));
    EXPECT_EQ(parseResource("resource_id=a:resource_type=video:resource_id=:resource_type=film"),
              ResourceRef("", NoType));
}

TEST(ResourceText, WhatIsNotUnderstoodIsPassedOver)
{
    EXPECT_EQ(parseResource(""), ResourceRef());
    EXPECT_EQ(parseResource("abc"), ResourceRef());
    EXPECT_EQ(parseResource(":::"), ResourceRef());
    EXPECT_EQ(parseResource("resource_id"), ResourceRef());
    EXPECT_EQ(parseResource("resource_type=image"), ResourceRef("", ImageType));
    EXPECT_EQ(parseResource("resource_id=a"), ResourceRef("a", NoType));
    EXPECT_EQ(parseResource(":resource_id=a::colour=red:=:x:resource_type=image:"),
              ResourceRef("a", ImageType));
    EXPECT_EQ(parseResource("Resource_id=a:resource_Type=image: resource_id=b"), ResourceRef());
}

TEST(ResourceText, APartOfThreePiecesIsPassedOver)
{
    EXPECT_EQ(parseResource("resource_id=a=b:resource_type=image"), ResourceRef("", ImageType));
    EXPECT_EQ(parseResource("resource_id=a=:resource_type=image"), ResourceRef("", ImageType));
    EXPECT_EQ(parseResource("resource_id=a:resource_type=image="), ResourceRef("a", NoType));
}

TEST(ResourceText, APlaceMarkerInAnIdentifierIsFilledWithTheType)
{
    EXPECT_EQ(serializeResource({"a%2b", VideoType}), "resource_id=avideob:resource_type=video");
    EXPECT_EQ(serializeResource({"%2%2", ImageType}), "resource_id=imageimage:resource_type=image");
    EXPECT_EQ(serializeResource({"%2", NoType}), "resource_id=:resource_type=");
    // The lowest number is filled, and that is no longer the type's own.
    EXPECT_EQ(serializeResource({"%1", VideoType}), "resource_id=video:resource_type=%2");
    EXPECT_EQ(serializeResource({"%1 of %2", AudioType}), "resource_id=audio of %2:resource_type=%2");
    EXPECT_EQ(serializeResource({"%L1", AudioType}), "resource_id=audio:resource_type=%2");
    // Higher numbers and signs that mark nothing stay.
    EXPECT_EQ(serializeResource({"%3%12", VideoType}), "resource_id=%3%12:resource_type=video");
    EXPECT_EQ(serializeResource({"100% %x %", VideoType}), "resource_id=100% %x %:resource_type=video");
}

/// Any characters but some: half of them rare ones, halves of surrogate pairs and the null character among
/// them.
QString textWithout(const QString& forbidden)
{
    const auto units = *rc::gen::container<std::vector<int>>(
        rc::gen::suchThat(rc::gen::oneOf(rc::gen::inRange(0, 128), rc::gen::inRange(0, 0x10000),
                                         rc::gen::element<int>('_', '=', ':', '%', '0', '1', '2', 'L', 0)),
                          [&](int unit) { return !forbidden.contains(QChar(unit)); }));
    QString text;
    for (const int unit : units)
        text += QChar(unit);
    return text;
}

Type anyType()
{
    return *rc::gen::element(VideoType, AudioType, ImageType);
}

/// Puts a character somewhere into a text.
QString inserted(QString text, const QString& addition)
{
    return text.insert(*rc::gen::inRange(0, text.size() + 1), addition);
}

RC_GTEST_PROP(ResourceTextProperty, IdentifiersWithoutColonEqualsAndPercentComeBack, ())
{
    const ResourceRef resource(textWithout(":=%"), anyType());
    RC_ASSERT(parseResource(serializeResource(resource)) == resource);
}

RC_GTEST_PROP(ResourceTextProperty, ATypeWithoutANameComesBackAsNone, ())
{
    const QString id = textWithout(":=%");
    const auto type = static_cast<Type>(*rc::gen::suchThat<int>([](int n) { return n < 1 || n > 3; }));
    RC_ASSERT(parseResource(serializeResource({id, type})) == ResourceRef(id, NoType));
}

RC_GTEST_PROP(ResourceTextProperty, AnIdentifierWithEqualsIsLostAndTheTypeIsNot, ())
{
    const QString id = inserted(textWithout(":%"), "=");
    const Type type = anyType();
    RC_ASSERT(parseResource(serializeResource({id, type})) == ResourceRef("", type));
}

RC_GTEST_PROP(ResourceTextProperty, AnIdentifierWithAColonIsCutThere, ())
{
    const QString start = textWithout(":=%");
    const Type type = anyType();
    const ResourceRef resource(start + ":" + textWithout("=%"), type);
    RC_ASSERT(parseResource(serializeResource(resource)) == ResourceRef(start, type));
}

RC_GTEST_PROP(ResourceTextProperty, TheMarkerOfTheTypeInAnIdentifierComesBackAsTheType, ())
{
    const QString before = textWithout(":=%");
    const QString after = "x" + textWithout(":=%");
    const Type type = anyType();
    const ResourceRef read = parseResource(serializeResource({before + "%2" + after, type}));
    RC_ASSERT(read == ResourceRef(before + textOfType(type) + after, type));
}

RC_GTEST_PROP(ResourceTextProperty, TheMarkerOfTheIdentifierInAnIdentifierCostsTheType, ())
{
    const QString before = textWithout(":=%");
    const QString after = "x" + textWithout(":=%");
    const Type type = anyType();
    const ResourceRef read = parseResource(serializeResource({before + "%1" + after, type}));
    RC_ASSERT(read == ResourceRef(before + textOfType(type) + after, NoType));
}

RC_GTEST_PROP(ResourceTextProperty, WhatWasReadFromAnyTextIsReadBackFromItsOwn, ())
{
    // Without a sign that could mark a place, what a text gives is stable.
    const QString id = textWithout("%");
    const QString text = *rc::gen::element<QString>("", "resource_id=", "resource_type=") + id +
                         *rc::gen::element<QString>("", ":resource_type=image", ":resource_id=b");
    const ResourceRef resource = parseResource(text);
    RC_ASSERT(parseResource(serializeResource(resource)) == resource);
}

} // namespace
