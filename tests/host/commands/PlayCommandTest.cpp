// SPDX-License-Identifier: Apache-2.0
#include "Command.h"
#include "tests/host/shared/SampleTimeline.h"
#include "tests/host/shared/Samples.h"
#include "tests/host/shared/Terminal.h"

#include "host/commands/LevelLine.h"
#include "host/playback/Player.h"
#include "host/playback/SoundMeter.h"
#include "host/playback/SoundOutput.h"

#include <EditorModel/persistence/Document.h>

#include <gmock/gmock.h>

namespace {

using namespace HostTests;
using testing::HasSubstr;
using testing::IsEmpty;
using Timeline::Clip;

std::string bar(std::size_t cells)
{
    return "[" + std::string(cells, '#') + std::string(30 - cells, ' ') + "]";
}

TEST(LevelLine, ShowsTheLouderChannel)
{
    VUMeter::Object meter;
    meter.setLeftChannelLevel(Decibel::fromDbLevel(-40.0))->setRightChannelLevel(Decibel::fromDbLevel(-20.0));
    EXPECT_EQ(Host::levelLine("0:01", meter), "0:01  " + bar(20) + "  -20.0 dB");
    meter.setLeftChannelLevel(Decibel::fromDbLevel(-0.04));
    EXPECT_EQ(Host::levelLine("0:01", meter), "0:01  " + bar(30) + "    0.0 dB");
    meter.setLeftChannelLevel(Decibel::fromDbLevel(3.01))->setRightChannelClippingDetected(true);
    EXPECT_EQ(Host::levelLine("0:01", meter), "0:01  " + bar(30) + "    3.0 dB  over");
    VUMeter::Object silent;
    silent.setLeftChannelLevel(Decibel::fromRelativeLevel(0.0));
    silent.setRightChannelLevel(Decibel::fromDbLevel(-61.0));
    EXPECT_EQ(Host::levelLine("0:01", silent), "0:01  " + bar(0) + "  -61.0 dB");
    silent.setRightChannelLevel(Decibel::fromRelativeLevel(0.0));
    EXPECT_EQ(Host::levelLine("0:01", silent), "0:01  " + bar(0) + "   -inf dB");
}

/// Plays a sound of 1 s in steps of 500 ms.
bool isPlayedTo(std::FILE* stream, MTime* end = nullptr)
{
    SampleTimeline sample;
    sample.addClip("sound", Clip::AudioClip, sample.addTrack(AudioTrack), 0, 1000)->setVolume(10);
    Host::Player player(sample.timeline);
    const Host::SoundOutput output(1.0);
    const Host::SoundMeter meter(output.output(), [](const Clip&) { return true; });
    const Host::LevelLine line(player.player(), meter.meter(), 500, stream);
    player.play(500, Host::Player::Dry);
    if (end) {
        *end = player.player()->position->position;
    }
    return line.isWritten();
}

TEST(LevelLine, MovesOnATerminalAndStaysThereAtTheEnd)
{
    const Terminal terminal(60);
    ASSERT_NE(terminal.stream, nullptr);
    EXPECT_TRUE(isPlayedTo(terminal.stream));
    EXPECT_EQ(terminal.take(),
              "0:00.0  " + bar(20) + "  -20.0 dB\r\x1b[K0:00.5  " + bar(20) + "  -20.0 dB\r\n");
}

TEST(LevelLine, StopsThePlaybackWhereItCannotBeWritten)
{
    std::FILE* const full = std::fopen("/dev/full", "w");
    ASSERT_NE(full, nullptr);
    MTime end;
    EXPECT_FALSE(isPlayedTo(full, &end));
    EXPECT_EQ(end, MTime(0));
    std::fclose(full);
}

/// A project of a sound of 1.5 s.
class PlayCommand : public testing::Test
{
protected:
    PlayCommand()
    {
        m_folder.copy("speech.wav", "speech.wav");
        EXPECT_EQ(editormodel({"new", "film.json", "--media", "speech.wav"}, m_folder.path()).errors, "");
    }

    void edit(const QString& words) const
    {
        EXPECT_EQ(editormodel(QStringList{"edit", "film.json"} + words.split(' '), m_folder.path()).errors,
                  "");
    }
    Outcome play(const QStringList& more = {"--step", "0.25"}) const
    {
        return editormodel(QStringList{"play", "film.json", "--dry"} + more, m_folder.path());
    }

    const Folder m_folder{};
};

TEST_F(PlayCommand, WritesALineForEachStep)
{
    edit("fade-in 1 1");
    const Outcome outcome = play();
    EXPECT_EQ(outcome.exitCode, 0);
    EXPECT_THAT(outcome.errors, IsEmpty());
    EXPECT_EQ(outcome.output, "0:00.00  " + bar(0) + "   -inf dB\n" +      //
                                  "0:00.25  " + bar(24) + "  -12.0 dB\n" + // 0.25
                                  "0:00.50  " + bar(27) + "   -6.0 dB\n" + // 0.5
                                  "0:00.75  " + bar(29) + "   -2.5 dB\n" + // 0.75
                                  "0:01.00  " + bar(30) + "    0.0 dB\n" + //
                                  "0:01.25  " + bar(30) + "    0.0 dB\n");
}

TEST_F(PlayCommand, PlaysAReversedAndRetimedClip)
{
    // 0.75 s.
    edit("reverse 1 then speed 1 2 then fade-out 1 0.5");
    EXPECT_EQ(play().output, "0:00.00  " + bar(30) + "    0.0 dB\n" +     //
                                 "0:00.25  " + bar(30) + "    0.0 dB\n" + //
                                 "0:00.50  " + bar(27) + "   -6.0 dB\n");
}

TEST_F(PlayCommand, CountsTheVolumeOfTheOutput)
{
    EXPECT_EQ(play({"--step", "1", "--volume", "200"}).output,
              "0:00  " + bar(30) + "    6.0 dB  over\n0:01  " + bar(30) + "    6.0 dB  over\n");
    EXPECT_EQ(play({"--step", "2", "--volume", "0"}).output, "0:00  " + bar(0) + "   -inf dB\n");
    EXPECT_EQ(play({}).output.substr(0, 8), "0:00.00 ");
}

TEST_F(PlayCommand, TakesItsTimeUnlessItIsDry)
{
    const Outcome outcome = editormodel({"play", "film.json", "--step", "1"}, m_folder.path());
    EXPECT_EQ(outcome.output, play({"--step", "1"}).output);
}

TEST_F(PlayCommand, LeavesOutMediaThatAreMissing)
{
    QFile::remove(m_folder.path("speech.wav"));
    const Outcome outcome = play({"--step", "1"});
    EXPECT_EQ(outcome.exitCode, 1);
    EXPECT_EQ(outcome.errors, m_folder.path("speech.wav").toStdString() + ": does not exist\n");
    EXPECT_EQ(outcome.output, "0:00  " + bar(0) + "   -inf dB\n0:01  " + bar(0) + "   -inf dB\n");
}

TEST_F(PlayCommand, TellsInOneLineWhatIsWrong)
{
    const Timeline::Object nothing;
    Document::saveFile(m_folder.path("empty.json"), {&nothing}, Document::Json, Document::Stream);
    const Outcome empty = editormodel({"play", "empty.json", "--dry"}, m_folder.path());
    EXPECT_EQ(empty.exitCode, 1);
    EXPECT_THAT(empty.output, IsEmpty());
    EXPECT_EQ(empty.errors, "empty.json: has nothing to play\n");
    EXPECT_EQ(editormodel({"play", "none.json", "--dry"}, m_folder.path()).errors,
              "none.json: does not exist\n");
    for (const char* step : {"0", "-1", "soon"}) {
        const Outcome outcome = play({"--step", step});
        EXPECT_EQ(outcome.exitCode, 2);
        EXPECT_THAT(outcome.errors, HasSubstr("a step is a time of more than zero"));
    }
}

} // namespace
