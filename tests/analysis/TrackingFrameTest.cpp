// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/analysis/MotionTracking.h>

#include <QRectF>

#include <gmock/gmock.h>

#include <cmath>
#include <limits>
#include <type_traits>

namespace {

using MotionTracking::Frame;
using MotionTracking::TimedFrame;
using testing::ElementsAre;
using testing::StartsWith;

static_assert(std::is_base_of_v<Serialize::ISerializable, Frame>);
static_assert(!Testing::isVirtualBase<Serialize::ISerializable, Frame>);
static_assert(!std::is_base_of_v<PubSub::Object, Frame>);
static_assert(std::is_base_of_v<Frame, TimedFrame> && !Testing::isVirtualBase<Frame, TimedFrame>);

constexpr double notANumber = std::numeric_limits<double>::quiet_NaN();

void expectFields(const Frame& frame, double left, double top, double width, double height)
{
    EXPECT_EQ(frame.left, left);
    EXPECT_EQ(frame.top, top);
    EXPECT_EQ(frame.width, width);
    EXPECT_EQ(frame.height, height);
}

TEST(TrackingFrame, IsValidAtFirst)
{
    EXPECT_TRUE(Frame().isValid());
    EXPECT_FALSE(Frame().isNull());
}

TEST(TrackingFrame, IsMadeOfFourNumbersOrOfARectangle)
{
    expectFields(Frame(0.1, 0.2, 0.3, 0.4), 0.1, 0.2, 0.3, 0.4);
    expectFields(Frame(QRectF(0.1, 0.2, 0.3, 0.4)), 0.1, 0.2, 0.3, 0.4);
    expectFields(QRectF(), 0, 0, 0, 0);
    // A rectangle with a negative extent stays as it is.
    expectFields(Frame(QRectF(0.5, 0.75, -0.25, -0.5)), 0.5, 0.75, -0.25, -0.5);
}

TEST(TrackingFrame, BecomesARectangle)
{
    const QRectF rectangle = Frame(0.1, 0.2, 0.3, 0.4).toRectF();
    EXPECT_EQ(rectangle.left(), 0.1);
    EXPECT_EQ(rectangle.top(), 0.2);
    EXPECT_EQ(rectangle.width(), 0.3);
    EXPECT_EQ(rectangle.height(), 0.4);
}

TEST(TrackingFrame, IsNullWithoutAWidthOrAHeight)
{
    EXPECT_TRUE(Frame(0, 0, 0, 0).isNull());
    for (const double extent : {0.0, -0.0, 1e-12, -1e-12, 1e-300}) {
        EXPECT_TRUE(Frame(0, 0, extent, 1).isNull()) << extent;
        EXPECT_TRUE(Frame(0, 0, 1, extent).isNull()) << extent;
    }
    for (const double extent : {1.1e-12, -1.1e-12, 0.5, -1.0, notANumber}) {
        EXPECT_FALSE(Frame(0, 0, extent, 1).isNull()) << extent;
        EXPECT_FALSE(Frame(0, 0, 1, extent).isNull()) << extent;
    }
    EXPECT_FALSE(Frame(0.5, 0.5, 1, 1).isNull());
}

TEST(TrackingFrame, IsValidWithinThePicture)
{
    const double justBelow1 = std::nextafter(1.0, 0.0);
    const double justAbove1 = std::nextafter(1.0, 2.0);
    struct Case
    {
        double place;
        double extent;
        bool isValid;
    };
    const Case cases[] = {
        {0.0, 1.0, true},          {0.5, 0.5, true},         {0.25, 0.75, true}, {0.0, 1e-300, true},
        {justBelow1, 1e-17, true}, {-0.0, 1.0, true},        {0.5, 0.6, false},  {1.0, 0.0, false},
        {1.0, 0.1, false},         {1.0, 1e-17, false},      {1.5, 0.1, false},  {-1e-17, 0.5, false},
        {-0.5, 0.5, false},        {0.0, 0.0, false},        {0.5, -0.1, false}, {0.0, justAbove1, false},
        {0.5, justAbove1, false},  {justBelow1, 0.5, false}, {0.5, 1.0, false},  {justBelow1, 1e-15, false},
        {notANumber, 0.5, false},  {0.5, notANumber, false},
    };
    for (const Case& c : cases) {
        EXPECT_EQ(Frame(c.place, 0, c.extent, 1).isValid(), c.isValid) << c.place << ", " << c.extent;
        EXPECT_EQ(Frame(0, c.place, 1, c.extent).isValid(), c.isValid) << c.place << ", " << c.extent;
        EXPECT_EQ(Frame(c.place, c.place, c.extent, c.extent).isValid(), c.isValid)
            << c.place << ", " << c.extent;
    }
}

/// Two frames that differ in one field only, whichever it is.
template <class Expect>
void forEachField(double a, double b, Expect expect)
{
    const Frame base(0.1, 0.2, 0.3, 0.4);
    for (double Frame::*field : {&Frame::left, &Frame::top, &Frame::width, &Frame::height}) {
        Frame first = base;
        Frame second = base;
        first.*field = a;
        second.*field = b;
        expect(first, second);
    }
}

TEST(TrackingFrame, IsEqualWhereAllFieldsNearlyAre)
{
    const auto expectEqual = [](const Frame& a, const Frame& b) {
        EXPECT_TRUE(a == b);
        EXPECT_TRUE(b == a);
        EXPECT_FALSE(a != b);
    };
    const auto expectDifferent = [](const Frame& a, const Frame& b) {
        EXPECT_FALSE(a == b);
        EXPECT_FALSE(b == a);
        EXPECT_TRUE(a != b);
    };
    EXPECT_TRUE(Frame() == Frame());
    forEachField(0.5, 0.5, expectEqual);
    forEachField(0.5, 0.5 * (1 + 1e-13), expectEqual);
    forEachField(0.5, 0.5 * (1 + 1e-11), expectDifferent);
    forEachField(1e9, 1e9 * (1 + 1e-13), expectEqual);
    forEachField(1e-9, 1e-9 * (1 + 1e-11), expectDifferent);
    forEachField(0.0, 1e-12, expectEqual);
    forEachField(-1e-12, 1e-12, expectEqual);
    forEachField(0.0, 1.1e-12, expectDifferent);
    forEachField(0.5, -0.5, expectDifferent);
    forEachField(notANumber, notANumber, expectDifferent);
}

TEST(TrackingFrame, IsOrderedByItsFieldsOneAfterTheOther)
{
    forEachField(0.5, 0.6, [](const Frame& a, const Frame& b) {
        EXPECT_TRUE(a < b);
        EXPECT_FALSE(b < a);
    });
    EXPECT_FALSE(Frame() < Frame());
    EXPECT_TRUE(Frame(0.1, 0.9, 0.9, 0.9) < Frame(0.2, 0.1, 0.1, 0.1));
    EXPECT_TRUE(Frame(0.1, 0.1, 0.9, 0.9) < Frame(0.1, 0.2, 0.1, 0.1));
    EXPECT_TRUE(Frame(0.1, 0.1, 0.1, 0.9) < Frame(0.1, 0.1, 0.2, 0.1));
    EXPECT_FALSE(Frame(0.2, 0.1, 0.1, 0.1) < Frame(0.1, 0.9, 0.9, 0.9));
}

TEST(TrackingFrame, MayBeEqualToAnotherAndLessThanIt)
{
    forEachField(0.5, 0.5 * (1 + 1e-13), [](const Frame& a, const Frame& b) {
        EXPECT_TRUE(a == b);
        EXPECT_TRUE(a < b);
    });
    EXPECT_TRUE(Frame(0, 0, 1, 1) == Frame(1e-13, 0, 1, 1));
    EXPECT_TRUE(Frame(0, 0, 1, 1) < Frame(1e-13, 0, 1, 1));
}

TEST(TrackingFrame, IsMadeByName)
{
    Testing::expectMadeByName<Frame>("MotionTracking::Frame");
}

TEST(TrackingFrame, IsWrittenInTheOrderOfItsFields)
{
    EXPECT_THAT(Testing::fieldKeys(Frame()), ElementsAre("left", "top", "width", "height"));
}

TEST(TimedTrackingFrame, IsComparedWithoutItsDuration)
{
    TimedFrame longer;
    longer.duration = 40;
    EXPECT_TRUE(longer == TimedFrame());
    EXPECT_FALSE(TimedFrame() < longer);
}

TEST(TimedTrackingFrame, IsMadeByName)
{
    Testing::expectMadeByName<TimedFrame>("MotionTracking::TimedFrame");
}

TEST(TimedTrackingFrame, IsWrittenWithTheFrameInFrontOfTheDuration)
{
    TimedFrame frame;
    frame.duration = 40;
    const std::vector<Testing::FieldText> fields = Testing::fieldTexts(frame);
    ASSERT_EQ(fields.size(), 2u);
    EXPECT_THAT(fields[0].first + ':' + fields[0].second,
                StartsWith("base MotionTracking:Frame: MotionTracking::Frame"));
    EXPECT_EQ(fields[1], Testing::FieldText("duration", "40ms"));
}

} // namespace
