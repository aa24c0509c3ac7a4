// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>

#include <type_traits>

namespace {

using testing::ElementsAre;
using Testing::FieldText;
using testing::StartsWith;
using Timeline::Clip;
using Timeline::TrackedObject;
using Timeline::TrackingLinkInfo;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, TrackedObject>);
static_assert(!std::is_base_of_v<PubSub::Object, TrackedObject>);
static_assert(Testing::isVirtualBase<Serialize::ISerializable, TrackingLinkInfo>);
static_assert(!std::is_base_of_v<PubSub::Object, TrackingLinkInfo>);

const Clip someClip;
const Clip otherClip;

TEST(TrackedObject, NamesAClipAndATracking)
{
    const TrackedObject object(&someClip, "face");
    EXPECT_EQ(object.clip, &someClip);
    EXPECT_EQ(object.trackingId, "face");
}

TEST(TrackedObject, IsMadeByName)
{
    Testing::expectMadeByName<TrackedObject>("Timeline::TrackedObject");
}

TEST(TrackedObject, IsWrittenInTheOrderOfItsFields)
{
    EXPECT_THAT(Testing::fieldTexts(TrackedObject(nullptr, "face")),
                ElementsAre(FieldText("clip", "null"), FieldText("trackingId", "Q\"face\"")));
    EXPECT_THAT(Testing::fieldTexts(TrackedObject(&someClip, "")).front().second,
                StartsWith("Timeline::Clip #"));
}

TEST(TrackedObject, IsEqualInBothFields)
{
    const TrackedObject object(&someClip, "face");
    EXPECT_TRUE(object == TrackedObject(&someClip, "face"));
    EXPECT_FALSE(object != TrackedObject(&someClip, "face"));
    for (const TrackedObject& other : {TrackedObject(&otherClip, "face"), TrackedObject(&someClip, "Face")}) {
        EXPECT_FALSE(object == other);
        EXPECT_TRUE(object != other);
    }
}

TEST(TrackingLinkInfo, NamesAnObjectAndAnOffset)
{
    const TrackingLinkInfo info(TrackedObject(&someClip, "face"), QPointF(0.5, -0.25));
    EXPECT_TRUE(info.trackedObject == TrackedObject(&someClip, "face"));
    EXPECT_EQ(info.objectRelativeOffset.x(), 0.5);
    EXPECT_EQ(info.objectRelativeOffset.y(), -0.25);
}

TEST(TrackingLinkInfo, IsMadeByName)
{
    Testing::expectMadeByName<TrackingLinkInfo>("Timeline::TrackingLinkInfo");
}

TEST(TrackingLinkInfo, IsWrittenWithItsObjectInside)
{
    EXPECT_THAT(Testing::fieldTexts(TrackingLinkInfo(TrackedObject(nullptr, "face"), QPointF(0.5, -0.25))),
                ElementsAre(FieldText("trackedObject", "Timeline::TrackedObject\n"
                                                       "  clip: null\n"
                                                       "  trackingId: Q\"face\""),
                            FieldText("objectRelativeOffset", "0.5,-0.25")));
}

TEST(TrackingLinkInfo, IsEqualInAllFields)
{
    const TrackingLinkInfo info(TrackedObject(&someClip, "face"), QPointF(0.5, 0.25));
    EXPECT_TRUE(info == TrackingLinkInfo(TrackedObject(&someClip, "face"), QPointF(0.5, 0.25)));
    EXPECT_FALSE(info == TrackingLinkInfo(TrackedObject(&otherClip, "face"), QPointF(0.5, 0.25)));
    EXPECT_FALSE(info == TrackingLinkInfo(TrackedObject(&someClip, "hand"), QPointF(0.5, 0.25)));
    EXPECT_FALSE(info == TrackingLinkInfo(TrackedObject(&someClip, "face"), QPointF(0.5001, 0.25)));
    EXPECT_FALSE(info == TrackingLinkInfo(TrackedObject(&someClip, "face"), QPointF(0.5, 0.2501)));
}

TEST(TrackingLinkInfo, IsEqualUpToTheNoiseOfItsOffset)
{
    const TrackedObject object(&someClip, "face");
    const TrackingLinkInfo info(object, QPointF(0.3, -1000.3));
    EXPECT_TRUE(info == TrackingLinkInfo(object, QPointF(0.1 + 0.2, -1000.1 - 0.2)));
    EXPECT_TRUE(info == TrackingLinkInfo(object, QPointF(0.3 * (1 + 1e-14), -1000.3)));
    EXPECT_FALSE(info == TrackingLinkInfo(object, QPointF(0.3 * (1 + 1e-9), -1000.3)));
}

} // namespace
