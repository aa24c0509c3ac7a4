// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/media/Resource.h>

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <limits>
#include <type_traits>
#include <utility>

namespace {

using namespace Resource;

static_assert(std::is_same_v<std::underlying_type_t<Timing::Mode>, int>);
static_assert(Testing::isVirtualBase<Serialize::ISerializable, FileInfo>);
static_assert(Testing::isVirtualBase<Serialize::ISerializable, Timing>);
static_assert(!std::is_base_of_v<PubSub::Object, FileInfo>);
static_assert(!std::is_base_of_v<PubSub::Object, Timing>);
static_assert(!std::is_polymorphic_v<ResourceTiming>);

FileInfo fullInfo()
{
    FileInfo info;
    info.path = "/films/a.mp4";
    info.track = 2;
    info.duration = 61000;
    return info;
}

TEST(FileInfo, IsEqualWhereEveryFieldIs)
{
    const FileInfo info = fullInfo();
    EXPECT_TRUE(info == info);
    EXPECT_TRUE(info == fullInfo());
    FileInfo other = fullInfo();
    other.path = "/films/A.mp4";
    EXPECT_FALSE(info == other);
    other = fullInfo();
    other.track = 3;
    EXPECT_FALSE(info == other);
    other = fullInfo();
    other.duration = 61001;
    EXPECT_FALSE(info == other);
}

Timing fullTiming()
{
    Timing timing;
    timing.mode = Timing::Looped;
    timing.intro = 500;
    timing.outro = 700;
    timing.loopMinCount = 4;
    return timing;
}

TEST(Timing, IsEqualWhereEveryFieldIs)
{
    const Timing timing = fullTiming();
    EXPECT_TRUE(timing == timing);
    EXPECT_TRUE(timing == fullTiming());
    Timing other = fullTiming();
    other.mode = Timing::Stretched;
    EXPECT_FALSE(timing == other);
    other = fullTiming();
    other.intro = 501;
    EXPECT_FALSE(timing == other);
    other = fullTiming();
    other.outro = 701;
    EXPECT_FALSE(timing == other);
    other = fullTiming();
    other.loopMinCount = 5;
    EXPECT_FALSE(timing == other);
}

TEST(ResourceInfo, HasItsArchiveNames)
{
    EXPECT_STREQ(FileInfo::NameInArchive(), "Resource::FileInfo");
    EXPECT_EQ(FileInfo().GetNameInArchive(), "Resource::FileInfo");
    EXPECT_STREQ(Timing::NameInArchive(), "Resource::Timing");
    EXPECT_EQ(Timing().GetNameInArchive(), "Resource::Timing");
}

TEST(ResourceTiming, IsAPairOfTimes)
{
    const ResourceTiming timing(3, 4);
    const ResourceTiming copy = timing;
    EXPECT_EQ(copy.position, MTime(3));
    EXPECT_EQ(copy.duration, MTime(4));
}

/// An engine that gives every resource one timing, and counts how often it is asked.
class Engine : public Resource::Details::Describer
{
public:
    explicit Engine(int mode) : m_mode(static_cast<Timing::Mode>(mode)) {}

    const FileInfo* fileInfo(const Resource::Describer&) const override { return nullptr; }
    const Composition::Object* composition(const Resource::Describer&) const override { return nullptr; }
    Timing timing(const Resource::Describer& describer) const override
    {
        ++asked;
        lastResource = describer.resource;
        Timing timing;
        timing.mode = m_mode;
        timing.intro = 11;
        timing.outro = 12;
        timing.loopMinCount = 13;
        return timing;
    }

    mutable int asked = 0;
    mutable ResourceRef lastResource;

private:
    const Timing::Mode m_mode;
};

using Pair = std::pair<qint64, qint64>;

Pair timings(int mode, qint64 position, qint64 resourceDuration, qint64 begin, qint64 end)
{
    // What is not the mode plays no part.
    Timing timing;
    timing.mode = static_cast<Timing::Mode>(mode);
    timing.intro = 100;
    timing.outro = 200;
    timing.loopMinCount = 3;
    const ResourceTiming result =
        getTimings(position, resourceDuration, begin, end, {"abc", VideoType}, timing);
    return {result.position.ms(), result.duration.ms()};
}

struct Case
{
    int mode;
    qint64 position;
    qint64 resourceDuration;
    qint64 begin;
    qint64 end;
    Pair expected;
};

void expectAll(std::initializer_list<Case> cases)
{
    for (const Case& c : cases) {
        EXPECT_EQ(timings(c.mode, c.position, c.resourceDuration, c.begin, c.end), c.expected)
            << "mode " << c.mode << ", position " << c.position << " of " << c.resourceDuration << " in "
            << c.begin << " to " << c.end;
    }
}

TEST(GetTimings, AreThoseOfTheClipWhereNobodyDescribesTheResource)
{
    expectAll({
        {0, 1500, 4000, 1000, 3000, {1500, 0}},
        {0, 0, 4000, 1000, 3000, {0, 0}},
        {0, -7, 1, 1000, 3000, {-7, 0}},
        {0, 9000, 4000, 3000, 1000, {9000, 0}},
    });
}

TEST(GetTimings, AreThoseOfTheClipWhereTheDescriberHasNoModeEither)
{
    const Engine engine(0);
    expectAll({{0, 1500, 4000, 1000, 3000, {1500, 0}}, {0, -7, 1, 1000, 3000, {-7, 0}}});
    EXPECT_EQ(engine.asked, 2);
    EXPECT_EQ(engine.lastResource, ResourceRef("abc", VideoType));
}

TEST(GetTimings, CountFromTheRangeWhereTheDescriberHasAMode)
{
    for (const int mode : {1, 2, 3, 4, -1}) {
        SCOPED_TRACE(mode);
        const Engine engine(mode);
        expectAll({
            {0, 1500, 4000, 1000, 3000, {500, 2000}},
            {0, 1000, 4000, 1000, 3000, {0, 2000}},
            {0, 3000, 4000, 1000, 3000, {2000, 2000}},
            {0, 400, 4000, 1000, 3000, {-600, 2000}},
            {0, 9000, 1, 1000, 3000, {8000, 2000}},
            {0, 1500, 4000, 3000, 1000, {-1500, -2000}},
        });
        EXPECT_EQ(engine.asked, 6);
    }
}

TEST(GetTimings, StretchTheRangeOverTheWholeResource)
{
    expectAll({
        {1, 1000, 4000, 1000, 3000, {0, 4000}},
        {1, 1500, 4000, 1000, 3000, {1000, 4000}},
        {1, 3000, 4000, 1000, 3000, {4000, 4000}},
        // Outside of the range it goes on.
        {1, 500, 4000, 1000, 3000, {-1000, 4000}},
        {1, 5000, 4000, 1000, 3000, {8000, 4000}},
        // A range with its ends turned round is gone through backwards.
        {1, 1500, 4000, 3000, 1000, {3000, 4000}},
        {1, 0, 1000, -500, 500, {500, 1000}},
    });
}

TEST(GetTimings, RoundAStretchedPosition)
{
    expectAll({
        {1, 1, 1000, 0, 3, {333, 1000}},
        {1, 2, 1000, 0, 3, {667, 1000}},
        {1, 1, 1, 0, 2, {1, 1}},
        {1, -1, 1, 0, 2, {-1, 1}},
        {1, 1, 1, 0, 3, {0, 1}},
    });
}

TEST(GetTimings, RepeatALoopedResourceInBothDirections)
{
    expectAll({
        {3, 0, 1000, 0, 5000, {0, 1000}},
        {3, 999, 1000, 0, 5000, {999, 1000}},
        {3, 1000, 1000, 0, 5000, {0, 1000}},
        {3, 2345, 1000, 0, 5000, {345, 1000}},
        {3, -1, 1000, 0, 5000, {999, 1000}},
        {3, -1000, 1000, 0, 5000, {0, 1000}},
        {3, -2345, 1000, 0, 5000, {655, 1000}},
        {3, 7, 1, 0, 5000, {0, 1}},
        // The range plays no part.
        {3, 2345, 1000, 2000, 1000, {345, 1000}},
    });
    const qint64 longest = std::numeric_limits<qint64>::max();
    expectAll({{3, -1, longest, 0, 1, {longest - 1, longest}},
               {3, longest - 2, longest, 0, 1, {longest - 2, longest}}});
}

TEST(GetTimings, LeaveAPositionAsItIsInAnyOtherMode)
{
    for (const int mode : {2, 4, 100, -1}) {
        expectAll({
            {mode, 1500, 4000, 1000, 3000, {1500, 4000}},
            {mode, -5, 4000, 1000, 3000, {-5, 4000}},
            {mode, 9000, 4000, 3000, 1000, {9000, 4000}},
        });
    }
}

TEST(GetTimings, GoByTheGivenModeAndNotTheDescribers)
{
    for (const int described : {0, 1, 2, 3}) {
        SCOPED_TRACE(described);
        const Engine engine(described);
        expectAll({
            {1, 1500, 4000, 1000, 3000, {1000, 4000}},
            {2, 1500, 4000, 1000, 3000, {1500, 4000}},
            {3, 1500, 1000, 1000, 3000, {500, 1000}},
        });
        // And yet it is asked each time.
        EXPECT_EQ(engine.asked, 3);
    }
}

TEST(GetTimings, AreZeroForARangeOrAResourceOfNoLength)
{
    const Engine engine(1);
    for (const int mode : {0, 1, 2, 3, 4}) {
        expectAll({
            {mode, 1500, 4000, 1000, 1000, {0, 0}},
            {mode, 1500, 0, 1000, 3000, {0, 0}},
            {mode, 1500, -1, 1000, 3000, {0, 0}},
            {mode, 1500, -4000, 1000, 1000, {0, 0}},
        });
    }
    EXPECT_EQ(engine.asked, 0);
}

RC_GTEST_PROP(GetTimingsProperty, ALoopedPositionIsInTheResourceAndAWholeNumberOfPassesAway, ())
{
    const auto position = *rc::gen::inRange<qint64>(-1'000'000, 1'000'000);
    const auto duration = *rc::gen::inRange<qint64>(1, 5000);
    const auto [place, length] = timings(3, position, duration, 0, 1);
    RC_ASSERT(place >= 0);
    RC_ASSERT(place < duration);
    RC_ASSERT((position - place) % duration == 0);
    RC_ASSERT(length == duration);
}

RC_GTEST_PROP(GetTimingsProperty, AStretchedRangeOfTheResourcesLengthOnlyShifts, ())
{
    const auto position = *rc::gen::inRange<qint64>(-1'000'000, 1'000'000);
    const auto begin = *rc::gen::inRange<qint64>(-1'000'000, 1'000'000);
    const auto duration = *rc::gen::inRange<qint64>(1, 5000);
    RC_ASSERT(timings(1, position, duration, begin, begin + duration) == Pair(position - begin, duration));
}

} // namespace
