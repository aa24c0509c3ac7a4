// SPDX-License-Identifier: Apache-2.0
#include "tests/analysis/Trackings.h"
#include "tests/types/Printing.h"

#include <gtest/gtest.h>

#include <functional>
#include <type_traits>
#include <vector>

namespace {

using MotionTracking::Algorithm;
using MotionTracking::AnalyzeTask;
using MotionTracking::Frame;
using Types::Range;

static_assert(!std::is_polymorphic_v<AnalyzeTask>);
static_assert(sizeof(Algorithm) == 4);

const ResourceRef video = {QStringLiteral("res"), Resource::VideoType};

/// Valid, and with no field as it is by default.
AnalyzeTask fullTask()
{
    AnalyzeTask task;
    task.setResource(video).setInitialFrame(Frame(0.1, 0.2, 0.3, 0.4)).setInitialPosition(150);
    task.setAnalyzingRange(Range(100, 200)).setAlgorithm(Algorithm(2));
    return task;
}

TEST(TrackingTask, IsEmptyAndNotValidAtFirst)
{
    EXPECT_TRUE(AnalyzeTask().isEmpty());
    EXPECT_FALSE(AnalyzeTask().isValid());
}

struct Change
{
    const char* what;
    std::function<void(AnalyzeTask&)> apply;
};

/// Each makes the full task greater.
const std::vector<Change> changes = {
    {"identifier",
     [](AnalyzeTask& t) {
         t.setResource({QStringLiteral("ret"), Resource::VideoType});
     }},
    {"kind",
     [](AnalyzeTask& t) {
         t.setResource({QStringLiteral("res"), Resource::AudioType});
     }},
    {"frame", [](AnalyzeTask& t) { t.initialFrame.height = 0.5; }},
    {"position", [](AnalyzeTask& t) { t.setInitialPosition(151); }},
    {"from", [](AnalyzeTask& t) { t.analyzingRange.from = 101; }},
    {"to", [](AnalyzeTask& t) { t.analyzingRange.to = 201; }},
};

TEST(TrackingTask, IsComparedByAllButItsAlgorithm)
{
    for (const Change& change : changes) {
        SCOPED_TRACE(change.what);
        AnalyzeTask changed = fullTask();
        change.apply(changed);
        EXPECT_FALSE(changed == fullTask());
        EXPECT_TRUE(changed != fullTask());
        EXPECT_TRUE(fullTask() < changed);
        EXPECT_FALSE(changed < fullTask());
    }
    AnalyzeTask changed = fullTask();
    changed.setAlgorithm(Algorithm(3));
    EXPECT_TRUE(changed == fullTask());
    EXPECT_FALSE(changed != fullTask());
    EXPECT_FALSE(changed < fullTask());
    EXPECT_FALSE(fullTask() < changed);
}

TEST(TrackingTask, IsOrderedByItsFieldsOneAfterTheOther)
{
    // What makes the task greater by an earlier field outweighs all that a later one does to the other.
    for (std::size_t earlier = 0; earlier != changes.size(); ++earlier) {
        for (std::size_t later = earlier + 1; later != changes.size(); ++later) {
            // Identifier and kind are one field, which each change sets as a whole.
            if (earlier == 0 && later == 1)
                continue;
            AnalyzeTask greater = fullTask();
            changes[earlier].apply(greater);
            AnalyzeTask less = fullTask();
            changes[later].apply(less);
            EXPECT_TRUE(less < greater) << changes[earlier].what << ", " << changes[later].what;
            EXPECT_FALSE(greater < less) << changes[earlier].what << ", " << changes[later].what;
        }
    }
    AnalyzeTask otherKind;
    otherKind.setResource({QStringLiteral("a"), Resource::ImageType});
    AnalyzeTask otherId;
    otherId.setResource({QStringLiteral("b"), Resource::NoType});
    EXPECT_TRUE(otherKind < otherId);
    EXPECT_FALSE(otherId < otherKind);
}

TEST(TrackingTask, ComparesFramesNearlyAndOrdersThemExactly)
{
    AnalyzeTask wider = fullTask();
    wider.initialFrame.width *= 1 + 1e-13;
    EXPECT_TRUE(wider == fullTask());
    EXPECT_TRUE(fullTask() < wider);
    EXPECT_FALSE(wider < fullTask());
    // The exact difference outweighs what comes behind it.
    wider.setInitialPosition(0);
    EXPECT_TRUE(fullTask() < wider);
}

TEST(TrackingTask, IsEmptyWithAnyAlgorithm)
{
    AnalyzeTask task;
    task.setAlgorithm(Algorithm(3));
    EXPECT_TRUE(task.isEmpty());
    task.setInitialFrame(Frame(0, 0, 1 - 1e-13, 1));
    EXPECT_TRUE(task.isEmpty());
}

TEST(TrackingTask, IsNotEmptyWithAnythingElse)
{
    const std::vector<Change> single = {
        {"identifier",
         [](AnalyzeTask& t) {
             t.setResource({QStringLiteral("a"), Resource::NoType});
         }},
        {"kind",
         [](AnalyzeTask& t) {
             t.setResource({QString(), Resource::VideoType});
         }},
        {"frame", [](AnalyzeTask& t) { t.setInitialFrame(Frame(0, 0, 1, 0.5)); }},
        {"position", [](AnalyzeTask& t) { t.setInitialPosition(1); }},
        {"from", [](AnalyzeTask& t) { t.setAnalyzingRange(Range(1, -1)); }},
        {"to", [](AnalyzeTask& t) { t.setAnalyzingRange(Range(0, 0)); }},
    };
    for (const Change& change : single) {
        AnalyzeTask task;
        change.apply(task);
        EXPECT_FALSE(task.isEmpty()) << change.what;
    }
}

TEST(TrackingTask, IsValidWithAVideoAFrameAndAPositionWithinARange)
{
    EXPECT_TRUE(fullTask().isValid());
    EXPECT_TRUE(fullTask().setAlgorithm(Algorithm(99)).isValid());
    EXPECT_TRUE(fullTask().setInitialPosition(100).isValid());
    EXPECT_TRUE(fullTask().setInitialPosition(200).isValid()) << "the end of the range is inside";
    EXPECT_TRUE(fullTask().setInitialPosition(0).setAnalyzingRange(Range(0, 1)).isValid());
    EXPECT_TRUE(fullTask().setInitialFrame(Frame()).isValid());
}

TEST(TrackingTask, IsNotValidWhereAnythingIsAmiss)
{
    const ResourceRef nameless = {QString(), Resource::VideoType};
    EXPECT_FALSE(fullTask().setResource(nameless).isValid());
    for (const Resource::Type kind : {Resource::NoType, Resource::AudioType, Resource::ImageType}) {
        const ResourceRef other = {QStringLiteral("res"), kind};
        EXPECT_FALSE(fullTask().setResource(other).isValid()) << kind;
    }
    EXPECT_FALSE(fullTask().setInitialFrame(Frame(0.5, 0, 0.6, 1)).isValid());
    EXPECT_FALSE(fullTask().setInitialPosition(99).isValid());
    EXPECT_FALSE(fullTask().setInitialPosition(201).isValid());
    EXPECT_FALSE(fullTask().setInitialPosition(-1).setAnalyzingRange(Range(-1, 200)).isValid());
    EXPECT_FALSE(fullTask().setInitialPosition(0).setAnalyzingRange(Range(-1, 200)).isValid());
    EXPECT_FALSE(fullTask().setInitialPosition(150).setAnalyzingRange(Range(150, 150)).isValid());
    EXPECT_FALSE(fullTask().setInitialPosition(150).setAnalyzingRange(Range(150, 149)).isValid());
    EXPECT_FALSE(fullTask().setAnalyzingRange(Range()).isValid());
}

} // namespace
