// SPDX-License-Identifier: Apache-2.0
// Clips, tracks and transitions belong to their session and end with it.
#include "Edits.h"
#include "tests/shared/LiveAllocations.h"

#include <functional>

namespace {

using namespace EditTests;
using ::Testing::liveAllocations;

/// A session with two clips of 10 s in a row.
struct Row
{
    Row()
    {
        EXPECT_TRUE(session.addTrack(track));
        for (Clip* const clip : {a, b}) {
            EXPECT_TRUE(session.append({clip->setSourceDuration(10000), track}));
        }
    }

    EditSession session;
    Track* track = session.makeTrack(PrimaryTrack);
    Clip* a = session.makeClip(Clip::VideoClip);
    Clip* b = session.makeClip(Clip::VideoClip);
};

/// What is left of a session after the moves. Tables that the first one makes for all stay.
long leftBy(const std::function<void(Row&)>& moves)
{
    long left = 0;
    for (int i = 0; i != 2; ++i) {
        const long before = liveAllocations();
        {
            Row row;
            moves(row);
        }
        left = liveAllocations() - before;
    }
    return left;
}

TEST(EditSessionMemory, IsFreeAtItsEnd)
{
    EXPECT_EQ(leftBy([](Row&) {}), 0);
    EXPECT_EQ(leftBy([](Row& row) { EXPECT_TRUE(row.session.split(row.a, 5000)); }), 0);
    EXPECT_EQ(leftBy([](Row& row) { EXPECT_FALSE(row.session.split(row.a, 5)); }), 0);
    EXPECT_EQ(leftBy([](Row& row) {
                  const EditResult right = row.session.split(row.a, 5000);
                  EXPECT_TRUE(row.session.lift(right.clip));
                  EXPECT_TRUE(row.session.lift(row.b));
              }),
              0);
    EXPECT_EQ(leftBy([](Row& row) {
                  row.session.makeClip(Clip::AudioClip);
                  row.session.makeTrack(AudioTrack);
                  EXPECT_TRUE(row.session.addTransition(row.session.makeTransition("wipe"), {row.a, row.b}));
              }),
              0);
}

TEST(EditSessionMemory, ARefusedMoveKeepsNothing)
{
    Row row;
    Clip* const x = row.session.makeClip(Clip::VideoClip);
    x->setSourceDuration(10000);
    // Cuts the clip across, and is refused since the track ends too late then.
    const auto refuse = [&] {
        return row.session.insert({x, row.track, 0, 0, 1000}, 5000).refusal.isEmpty() ||
               row.session.split(row.a, 5).refusal.isEmpty();
    };
    row.b->setUnlimitedDuration(true);
    EXPECT_TRUE(row.session.trimRight(row.b, -(Host::LATEST_TIME - 20000)));
    EXPECT_FALSE(refuse());
    const long before = liveAllocations();
    EXPECT_FALSE(refuse());
    EXPECT_EQ(liveAllocations(), before);
}

TEST(EditSessionMemory, ALiftedClipLivesOn)
{
    Row row;
    row.a->setName("a");
    const Clip* const right = row.session.split(row.a, 5000).clip;
    Watcher watcher(row.session.timeline());
    EXPECT_TRUE(row.session.lift(right));
    // The value before names it still.
    ASSERT_EQ(watcher.old.clips.count(right), 1u);
    EXPECT_EQ(right->name, "a");
}

} // namespace
