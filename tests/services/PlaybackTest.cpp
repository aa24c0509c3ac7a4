// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/bus/View.h>
#include <EditorModel/media/Audio.h>
#include <EditorModel/media/Video.h>
#include <EditorModel/services/Playback.h>
#include <EditorModel/timeline/Composition.h>

#include "tests/shared/FieldTexts.h"

#include <type_traits>

namespace {

using Player = Playback::Object;

static_assert(Testing::isVirtualBase<PubSub::Object, Player>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, Player>);
static_assert(std::is_same_v<std::underlying_type_t<Player::State>, int>);

class PlaybackTest : public testing::Test
{
protected:
    void expectEveryFieldSet(const Player& player) const
    {
        EXPECT_EQ(player.video, &video);
        EXPECT_EQ(player.audio, &audio);
        EXPECT_EQ(player.position, &position);
        EXPECT_EQ(player.boundRange, &range);
        EXPECT_EQ(player.state, 7);
        EXPECT_TRUE(player.busy);
        EXPECT_TRUE(player.waiting);
    }

    const Media::Video video{};
    const Media::Audio audio{};
    const Composition::Marker position{};
    const Composition::Range range{};
};

TEST_F(PlaybackTest, PlaysAndStops)
{
    Player player;
    EXPECT_EQ(player.play(), &player);
    EXPECT_EQ(player.state, 1);
    EXPECT_EQ(player.play()->state, 1);
    EXPECT_EQ(player.stop(), &player);
    EXPECT_EQ(player.state, 0);
    EXPECT_EQ(player.setState(Player::Playing)->state, 1);
}

TEST_F(PlaybackTest, TheFlagsAndTheStateAreIndependent)
{
    Player player;
    player.play()->setBusy(true);
    EXPECT_EQ(player.state, 1);
    EXPECT_TRUE(player.busy);
    EXPECT_FALSE(player.waiting);
    player.setWaiting(true)->stop();
    EXPECT_EQ(player.state, 0);
    EXPECT_TRUE(player.busy);
    EXPECT_TRUE(player.waiting);
    player.play()->setBusy(false);
    EXPECT_EQ(player.state, 1);
    EXPECT_TRUE(player.waiting);
}

TEST_F(PlaybackTest, IsChangedThroughItsOwner)
{
    Player player;
    Message::View<Player> owner;
    Message::View<Player> client;
    owner.own(&player);
    client.observe(&player);
    {
        auto chain = client.change(&player);
        chain->setVideo(&video)->setAudio(&audio)->setPosition(&position)->setBoundRange(&range);
        chain->play()->setState(Player::State(7))->setBusy(true)->setWaiting(true);
        EXPECT_EQ(player.video, nullptr);
    }
    expectEveryFieldSet(player);
}

} // namespace
