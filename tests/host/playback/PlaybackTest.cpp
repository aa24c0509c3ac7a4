// SPDX-License-Identifier: Apache-2.0
// How the modules of a playback hear of one another.
#include "tests/host/shared/SampleTimeline.h"

#include "host/playback/Player.h"
#include "host/playback/SoundMeter.h"
#include "host/playback/SoundOutput.h"

#include <fmt/format.h>
#include <gmock/gmock.h>

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace {

using namespace HostTests;
using Host::Player;
using Host::SoundMeter;
using Host::SoundOutput;
using testing::Each;
using testing::ElementsAre;
using testing::StartsWith;
using Timeline::Clip;
using AudioOutput = Device::Output<Media::Audio>;
using Lines = std::vector<std::string>;

std::string levelText(const VUMeter::Object& meter)
{
    return fmt::format("level {:.1f}", meter.leftChannelLevel.level());
}

/// Writes down what changes, and stops the playback at a time. In which order those who watch one object hear
/// of it is not fixed, so that the levels stand apart, with the position at which they are heard.
class Witness : private Host::PlayerViewBase, private Host::MarkerViewBase, private Host::MeterViewBase
{
public:
    Witness(const Playback::Object* playback, const VUMeter::Object* meter)
    {
        playerObserve(playback);
        markerObserve(playback->position);
        meterObserve(meter);
    }

    Lines moves;
    Lines levels;
    std::optional<MTime> stopAt;

private:
    using PlayerViewBase::playerChanged;
    void playerChanged(const Playback::Object* playback, const Playback::Object*) override
    {
        moves.emplace_back(playback->state == Playback::Object::Playing ? "playing" : "stopped");
    }
    using MarkerViewBase::markerChanged;
    void markerChanged(const Composition::Marker* marker, const Composition::Marker*) override
    {
        moves.push_back(fmt::format("position {}", marker->position.ms()));
        if (marker->position == stopAt) {
            playerChange(player())->stop();
        }
    }
    using MeterViewBase::meterChanged;
    void meterChanged(const VUMeter::Object* meter, const VUMeter::Object*) override
    {
        levels.push_back(levelText(*meter) + " at " +
                         (marker() ? fmt::to_string(marker()->position.ms()) : "no position"));
    }
    void playerRemoved(const Playback::Object*) override { moves.emplace_back("no playback"); }
    void markerRemoved(const Composition::Marker*) override { moves.emplace_back("no position"); }
    void meterRemoved(const VUMeter::Object*) override { moves.emplace_back("no meter"); }
};

/// A module with an output of its own.
class OutputModule : private Device::View<AudioOutput>
{
public:
    void add() { outputAdd(&object)->setVolume(0.5); }

    AudioOutput object;
    Lines lines;

private:
    using Device::View<AudioOutput>::outputChanged;
    void outputAdded(const AudioOutput*) override { lines.emplace_back("added"); }
    void outputRemoved(const AudioOutput*) override { lines.emplace_back("removed"); }
    void playbackChanged(const AudioOutput* output, const AudioOutput*, const AudioOutput*) override
    {
        lines.emplace_back(output->playback ? "playback" : "no playback");
    }
    void volumeChanged(const AudioOutput* output) override
    {
        lines.push_back(fmt::format("volume {}", output->volume));
    }
};

/// A sound of 1 s that fades in all the time.
class PlaybackModules : public testing::Test
{
protected:
    PlaybackModules()
    {
        const Clip* const clip =
            sample.addClip("sound", Clip::AudioClip, sample.addTrack(AudioTrack), 0, 1000);
        sample.timeline.setClipFadeInDuration(clip, 1000);
    }

    static bool hasSound(const Clip&) { return true; }

    SampleTimeline sample{};
};

TEST_F(PlaybackModules, HearOfEachStepInTurn)
{
    Player player(sample.timeline);
    const SoundOutput output(1.0);
    const SoundMeter meter(output.output(), hasSound);
    Witness witness(player.player(), meter.meter());
    player.play(250, Player::Dry);
    EXPECT_THAT(witness.moves, ElementsAre("position 0", "playing", "position 250", "position 500",
                                           "position 750", "stopped", "position 1000"));
    // Before it plays, on three fourths of the way up, and after it has stopped.
    EXPECT_THAT(witness.levels,
                ElementsAre("level -inf at 0", "level -inf at 0", "level -12.0 at 250", "level -6.0 at 500",
                            "level -2.5 at 750", "level -inf at 750", "level -inf at 1000"));
}

TEST_F(PlaybackModules, CountTheVolumeOfTheOutput)
{
    Player player(sample.timeline);
    const SoundOutput output(2.0);
    const SoundMeter meter(output.output(), hasSound);
    Witness witness(player.player(), meter.meter());
    player.play(750, Player::Dry);
    // 0.75 * 2
    EXPECT_THAT(witness.levels, ElementsAre("level -inf at 0", "level -inf at 0", "level 3.5 at 750",
                                            "level -inf at 750", "level -inf at 1000"));
}

TEST_F(PlaybackModules, MeasureTheMomentTheVolumeIsTurned)
{
    class Knob : public Host::MarkerViewBase
    {
    public:
        explicit Knob(const AudioOutput* output) : m_view(output)
        {
            markerObserve(output->playback->position);
        }

    private:
        using MarkerViewBase::markerChanged;
        void markerChanged(const Composition::Marker*, const Composition::Marker*) override
        {
            m_view.change(m_view.object())->setVolume(0.1);
        }
        Message::View<AudioOutput> m_view;
    };
    Player player(sample.timeline);
    const SoundOutput output(1.0);
    const SoundMeter meter(output.output(), hasSound);
    Witness witness(player.player(), meter.meter());
    const Knob knob(output.output());
    player.play(500, Player::Dry);
    EXPECT_EQ(output.output()->volume, 0.1);
    // At position 0 already. 0.5 * 0.1 is left then.
    EXPECT_THAT(witness.levels, ElementsAre("level -inf at 0", "level -inf at 0", "level -inf at 0",
                                            "level -26.0 at 500", "level -inf at 500", "level -inf at 1000"));
}

TEST_F(PlaybackModules, StayWhereSomebodyStopsThem)
{
    Player player(sample.timeline);
    const SoundOutput output(1.0);
    const SoundMeter meter(output.output(), hasSound);
    Witness witness(player.player(), meter.meter());
    witness.stopAt = 500;
    player.play(250, Player::Dry);
    EXPECT_EQ(player.player()->position->position, MTime(500));
    EXPECT_EQ(player.player()->state, Playback::Object::Stopped);
    EXPECT_THAT(witness.moves,
                ElementsAre("position 0", "playing", "position 250", "position 500", "stopped"));
    // And begin anew.
    witness.stopAt.reset();
    player.play(250, Player::Dry);
    EXPECT_EQ(player.player()->position->position, MTime(1000));
}

TEST_F(PlaybackModules, TellWhatIsPlayed)
{
    const Player player(sample.timeline);
    const Playback::Object& playback = *player.player();
    EXPECT_EQ(playback.video, &sample.timeline);
    EXPECT_EQ(playback.audio, &sample.timeline);
    EXPECT_EQ(playback.position->position, MTime(0));
    EXPECT_EQ(*playback.boundRange, Composition::Range(0, 1000, 0, 0));
    EXPECT_EQ(playback.state, Playback::Object::Stopped);
}

TEST_F(PlaybackModules, DoNotPlayAnEmptyTimeline)
{
    const Timeline::Object empty;
    Player player(empty);
    const SoundOutput output(1.0);
    const SoundMeter meter(output.output(), hasSound);
    Witness witness(player.player(), meter.meter());
    player.play(250, Player::Dry);
    EXPECT_THAT(witness.moves, ElementsAre("position 0"));
    EXPECT_THAT(witness.levels, ElementsAre("level -inf at 0"));
}

TEST_F(PlaybackModules, TakeOutputsInAndLetThemGo)
{
    OutputModule module;
    {
        const Player player(sample.timeline);
        module.add();
        EXPECT_EQ(module.object.playback, player.player());
        EXPECT_THAT(module.lines, ElementsAre("added", "playback", "volume 0.5"));
        module.lines.clear();
    }
    EXPECT_EQ(module.object.playback, nullptr);
    EXPECT_THAT(module.lines, ElementsAre("no playback"));
}

TEST_F(PlaybackModules, AreSilentWithoutAPlayer)
{
    const SoundOutput output(1.0);
    const SoundMeter meter(output.output(), hasSound);
    EXPECT_EQ(output.output()->playback, nullptr);
    EXPECT_EQ(levelText(*meter.meter()), "level -inf");
    EXPECT_EQ(meter.meter()->sourceID, "output");
}

TEST_F(PlaybackModules, EndInAnyOrder)
{
    auto player = std::make_unique<Player>(sample.timeline);
    auto output = std::make_unique<SoundOutput>(1.0);
    auto meter = std::make_unique<SoundMeter>(output->output(), hasSound);
    Witness witness(player->player(), meter->meter());
    player.reset();
    EXPECT_THAT(witness.moves, ElementsAre("no playback", "no position"));
    EXPECT_THAT(witness.levels, Each(StartsWith("level -inf")));
    output.reset();
    meter.reset();
    EXPECT_EQ(witness.moves.back(), "no meter");
}

} // namespace
