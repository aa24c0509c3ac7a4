// SPDX-License-Identifier: Apache-2.0
#include "tests/host/shared/Samples.h"

#include "host/analysis/BlockTracker.h"
#include "host/media/MediaInput.h"

#include <gmock/gmock.h>

#include <random>

namespace {

using namespace HostTests;
using Host::followRectangle;
using Host::LumaPicture;
using MotionTracking::AnalyzeTask;
using MotionTracking::Data;

/// A grey picture of 160x120 pixels with a patch of noise, the same every time, of 24x16 pixels at a place.
LumaPicture patchAt(QPoint place, int noise = 0)
{
    LumaPicture picture;
    picture.width = 160;
    picture.height = 120;
    picture.pixels.assign(160 * 120, 128);
    std::mt19937 patch(1);
    for (int y = 0; y < 16; ++y) {
        for (int x = 0; x < 24; ++x) {
            picture.pixels[std::size_t((place.y() + y) * 160 + place.x() + x)] =
                static_cast<unsigned char>(patch() % 256);
        }
    }
    std::mt19937 grain(static_cast<unsigned>(noise));
    for (unsigned char& pixel : picture.pixels) {
        pixel = static_cast<unsigned char>(std::min(255, pixel + (noise ? int(grain() % 8) : 0)));
    }
    return picture;
}

const QRect block(40, 50, 24, 16);

TEST(FindBlock, FindsWhereTheBlockHasGone)
{
    const LumaPicture from = patchAt({40, 50});
    // A sixteenth of 160 pixels is 10.
    for (const QPoint move : {QPoint(0, 0), QPoint(3, -2), QPoint(-10, 10), QPoint(10, -10), QPoint(0, 7)}) {
        EXPECT_EQ(Host::findBlock(from, block, patchAt(QPoint(40, 50) + move)), block.translated(move));
    }
}

TEST(FindBlock, BearsNoise)
{
    EXPECT_EQ(Host::findBlock(patchAt({40, 50}, 1), block, patchAt({44, 47}, 2)), block.translated(4, -3));
}

TEST(FindBlock, StaysWhereAllPlacesAreEqual)
{
    const QRect grey(100, 20, 24, 16);
    EXPECT_EQ(Host::findBlock(patchAt({10, 80}), grey, patchAt({12, 82})), grey);
}

TEST(FindBlock, StaysWithinThePicture)
{
    const QRect corner(136, 104, 24, 16);
    EXPECT_EQ(Host::findBlock(patchAt({136, 104}), corner, patchAt({130, 100})), corner.translated(-6, -4));
    const QRect other(0, 0, 24, 16);
    EXPECT_EQ(Host::findBlock(patchAt({0, 0}), other, patchAt({5, 9})), other.translated(5, 9));
}

TEST(FindBlock, LosesWhatIsGone)
{
    LumaPicture black = patchAt({0, 0});
    std::fill(black.pixels.begin(), black.pixels.end(), static_cast<unsigned char>(0));
    EXPECT_FALSE(Host::findBlock(patchAt({40, 50}), block, black));
    LumaPicture smaller = patchAt({40, 50});
    smaller.height = 100;
    EXPECT_FALSE(Host::findBlock(patchAt({40, 50}), block, smaller));
}

AnalyzeTask taskAt(MTime position, MTime end, const MotionTracking::Frame& frame)
{
    AnalyzeTask task;
    return task.setInitialPosition(position).setInitialFrame(frame).setAnalyzingRange({0, end});
}

/// In patch.mkv a patch of 40x32 pixels goes 2 pixels to the right and 1 down with every picture, from
/// (20, 30) on; there are 25 pictures a second, of 160x120 pixels.
TEST(FollowRectangle, FollowsAPatchThroughAVideo)
{
    const MotionTracking::Frame patch(20.0 / 160, 30.0 / 120, 40.0 / 160, 32.0 / 120);
    const Data data = followRectangle("patch", sample("patch.mkv"), 0, taskAt(0, 2000, patch));
    EXPECT_EQ(data.id, "patch");
    ASSERT_EQ(data.frames.size(), 25u);
    for (int n = 0; n < 25; ++n) {
        const auto found = data.frames.find(MTime(40 * n));
        ASSERT_NE(found, data.frames.end()) << n;
        EXPECT_EQ(found->second.left, (20.0 + 2 * n) / 160);
        EXPECT_EQ(found->second.top, (30.0 + n) / 120);
        EXPECT_EQ(found->second.width, 0.25);
        EXPECT_EQ(found->second.height, 32.0 / 120);
        EXPECT_EQ(found->second.duration, 40);
    }
}

TEST(FollowRectangle, StartsAndEndsWhereTheTaskSays)
{
    const MotionTracking::Frame patch(30.0 / 160, 35.0 / 120, 40.0 / 160, 32.0 / 120);
    const Data data = followRectangle("patch", sample("patch.mkv"), 0, taskAt(200, 400, patch));
    ASSERT_EQ(data.frames.size(), 6u);
    EXPECT_EQ(data.frames.begin()->first, 200);
    EXPECT_EQ(data.frames.rbegin()->first, 400);
    EXPECT_EQ(data.frames.rbegin()->second.left, 40.0 / 160);
}

TEST(FollowRectangle, WhatStandsStillIsOneEntry)
{
    const MotionTracking::Frame grey(0.0, 0.0, 0.0625, 0.0625);
    const Data data = followRectangle("grey", sample("patch.mkv"), 0, taskAt(0, 2000, grey));
    ASSERT_EQ(data.frames.size(), 1u);
    EXPECT_EQ(data.frames.begin()->second.duration, 1000);
}

std::string refusalOf(const QString& path, int track, const AnalyzeTask& task)
{
    try {
        followRectangle("x", path, track, task);
    } catch (const Host::MediaError& error) {
        return error.reason.toStdString();
    }
    return "";
}

TEST(FollowRectangle, TellsWhyItCannot)
{
    const MotionTracking::Frame all;
    const AnalyzeTask task = taskAt(0, 1000, all);
    EXPECT_EQ(refusalOf(sample("film.mp4"), 1, task), "has no video track 1");
    EXPECT_EQ(refusalOf(sample("film.mp4"), 7, task), "has no video track 7");
    EXPECT_EQ(refusalOf(sample("film.mp4"), -1, task), "has no video track -1");
    EXPECT_EQ(refusalOf(sample("film-quarter-turn.mp4"), 0, task), "has pictures that are to be turned");
    EXPECT_EQ(refusalOf(sample("picture.png"), 0, task),
              "has pictures whose brightness is not stored as bytes");
    EXPECT_EQ(refusalOf(sample("film.mp4"), 0, taskAt(9000, 9999, all)),
              "has no picture in the range that is to be searched");
    EXPECT_EQ(refusalOf(sample("film.mp4"), 0, taskAt(0, 1000, {0.5, 0.0, 0.6, 0.5})),
              "cannot be searched for a rectangle that is not within its pictures");
    EXPECT_EQ(refusalOf(sample("film.mp4"), 0, taskAt(0, 1000, {0.5, 0.5, 0.001, 0.001})),
              "cannot be searched for a rectangle without pixels");
    EXPECT_EQ(refusalOf("missing.mp4", 0, task), "does not exist");
}

} // namespace
