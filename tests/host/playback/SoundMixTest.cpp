// SPDX-License-Identifier: Apache-2.0
#include "tests/host/shared/SampleTimeline.h"

#include "host/playback/SoundMix.h"

#include <gmock/gmock.h>

#include <limits>

namespace {

using namespace HostTests;
using Host::SoundMix;
using testing::DoubleEq;
using testing::DoubleNear;
using Timeline::Clip;

/// A sound of 4 s from 10 s on.
class SoundMixTest : public testing::Test
{
protected:
    Clip* addSound(MTime start = 10000, MTime length = 4000)
    {
        return sample.addClip("sound", Clip::AudioClip, track, start, length);
    }

    /// From full volume where the source begins down to nothing where it ends.
    static VolumeEnvelope falling()
    {
        VolumeEnvelope envelope;
        envelope.addKeyValue(0.0, 1.0);
        envelope.addKeyValue(1.0, 0.0);
        return envelope;
    }

    SoundMix mix() const
    {
        return {sample.timeline, [](const Clip&) { return true; }};
    }
    double at(MTime time) const { return mix().at(time).mean; }

    SampleTimeline sample{};
    Timeline::Track* const track = sample.addTrack(AudioTrack);
};

TEST_F(SoundMixTest, HearsAClipFromItsStartUpToItsEnd)
{
    addSound();
    EXPECT_EQ(at(9999), 0.0);
    EXPECT_EQ(at(10000), 1.0);
    EXPECT_EQ(at(13999), 1.0);
    EXPECT_EQ(at(14000), 0.0);
    EXPECT_EQ(SoundMix().at(0).mean, 0.0);
}

TEST_F(SoundMixTest, FadesInAndOut)
{
    const Clip* const clip = addSound();
    sample.timeline.setClipFadeInDuration(clip, 1000)->setClipFadeOutDuration(clip, 2000);
    EXPECT_EQ(at(10000), 0.0);
    EXPECT_THAT(at(10250), DoubleEq(0.25));
    EXPECT_THAT(at(10500), DoubleEq(0.5));
    EXPECT_EQ(at(11000), 1.0);
    EXPECT_EQ(at(12000), 1.0);
    EXPECT_THAT(at(12500), DoubleEq(0.75));
    EXPECT_THAT(at(13500), DoubleEq(0.25));
}

TEST_F(SoundMixTest, MultipliesVolumeEnvelopeAndFades)
{
    VolumeEnvelope half;
    half.addKeyValue(0.3, 0.5);
    const Clip* const clip = addSound()->setVolume(80)->setVolumeEnvelope(&half);
    sample.timeline.setClipFadeInDuration(clip, 1000);
    // 0.8 * 0.5 * 0.25
    EXPECT_THAT(at(10250), DoubleEq(0.1));
}

TEST_F(SoundMixTest, LaysTheEnvelopeOverTheWholeSource)
{
    const VolumeEnvelope envelope = falling();
    const Clip* const clip = addSound()->setVolumeEnvelope(&envelope);
    // From 1 s to 5 s of a source of 8 s.
    sample.trim(clip, 1000, 3000);
    EXPECT_THAT(at(10000), DoubleEq(0.875));
    EXPECT_THAT(at(12000), DoubleEq(0.625));
    EXPECT_THAT(at(13000), DoubleEq(0.5));
}

TEST_F(SoundMixTest, PlaysTheEnvelopeOfAReversedClipBackwards)
{
    const VolumeEnvelope envelope = falling();
    const Clip* const clip = addSound()->setVolumeEnvelope(&envelope);
    sample.trim(clip, 1000, 3000);
    sample.timeline.reverseClip(clip);
    // From 5 s back to 1 s.
    EXPECT_THAT(at(10000), DoubleEq(0.375));
    EXPECT_THAT(at(12000), DoubleEq(0.625));
    EXPECT_THAT(at(13000), DoubleEq(0.75));
    // A fade belongs to the clip.
    sample.timeline.setClipFadeInDuration(clip, 4000);
    EXPECT_THAT(at(13000), DoubleEq(0.5625));
}

TEST_F(SoundMixTest, PlaysTheEnvelopeOfARetimedClipAtItsSpeed)
{
    const VolumeEnvelope envelope = falling();
    const Clip* const clip = addSound()->setVolumeEnvelope(&envelope);
    sample.trim(clip, 1000, 3000);
    sample.timeline.setClipSpeed(clip, 2.0);
    // 2 s that show 4 s of the source.
    EXPECT_THAT(at(10000), DoubleEq(0.875));
    EXPECT_THAT(at(11000), DoubleEq(0.625));
    EXPECT_THAT(at(11500), DoubleEq(0.5));
    EXPECT_EQ(at(12000), 0.0);
}

TEST_F(SoundMixTest, LaysTheEnvelopeOverAClipWhoseSourceHasNoLength)
{
    const VolumeEnvelope envelope = falling();
    const Clip* const clip = addSound()->setVolumeEnvelope(&envelope);
    sample.timeline.clips.at(clip).setSourceDuration(0);
    EXPECT_THAT(at(11000), DoubleEq(0.75));
}

TEST_F(SoundMixTest, AddsSoundsThatMeet)
{
    addSound()->setVolume(60);
    addSound(12000)->setVolume(80);
    EXPECT_THAT(mix().at(11000).peak, DoubleEq(0.6));
    EXPECT_THAT(mix().at(12000).mean, DoubleNear(1.0, 1e-12));
    EXPECT_THAT(mix().at(12000).peak, DoubleNear(1.4, 1e-12));
    EXPECT_THAT(mix().at(14000).mean, DoubleEq(0.8));
}

TEST_F(SoundMixTest, IsSilentWhereSoundIsTurnedOff)
{
    Clip* const clip = addSound();
    EXPECT_EQ(at(11000), 1.0);
    clip->setEnabled(false);
    EXPECT_EQ(at(11000), 0.0);
    clip->setEnabled(true);
    track->setMuted(true);
    EXPECT_EQ(at(11000), 0.0);
    track->setMuted(false)->setHidden(true);
    EXPECT_EQ(at(11000), 1.0);
    EXPECT_EQ(SoundMix(sample.timeline, [clip](const Clip& c) { return &c != clip; }).at(11000).mean, 0.0);
    clip->setVolume(0);
    EXPECT_EQ(at(11000), 0.0);
}

TEST_F(SoundMixTest, SilencesNativeAudioWithTheTrackOfItsMaster)
{
    Timeline::Track* const pictures = sample.addTrack(PrimaryTrack);
    const Clip* const picture = sample.addClip("film", Clip::VideoClip, pictures, 10000, 4000);
    const Clip* const sound =
        sample.addClip("film", Clip::AudioClip, sample.addTrack(NativeAudioTrack), 10000, 4000);
    sample.timeline.addLink(picture, sound, 0);
    EXPECT_EQ(mix().at(11000).peak, 1.0);
    pictures->setMuted(true);
    EXPECT_EQ(mix().at(11000).peak, 0.0);
}

TEST_F(SoundMixTest, HearsNoPicturesAndTitles)
{
    sample.addClip("film", Clip::VideoClip, sample.addTrack(PrimaryTrack), 0, 4000);
    sample.addClip("title", Clip::OverlayClip, sample.addTrack(TitleTrack), 0, 4000);
    EXPECT_EQ(mix().at(1000).peak, 0.0);
}

TEST_F(SoundMixTest, BearsWhateverAFileHolds)
{
    constexpr qint64 lowest = std::numeric_limits<qint64>::min();
    constexpr qint64 highest = std::numeric_limits<qint64>::max();
    VolumeEnvelope steps;
    steps.addKeyValue(0.5, 1.0);
    steps.addKeyValue(0.5, 0.25);
    addSound(lowest, highest)->setVolumeEnvelope(&steps);
    const Clip* const negative = addSound(0, lowest);
    const Clip* const clip = addSound(0, 4000)->setVolume(-100);
    for (const Clip* wild : {negative, clip}) {
        sample.timeline.setClipFadeInDuration(wild, lowest)->setClipFadeOutDuration(wild, highest);
        sample.timeline.setClipSourcePosition(wild, lowest);
    }
    for (const MTime time : {MTime(lowest), MTime(-1), MTime(0), MTime(2000), MTime(highest)}) {
        EXPECT_LE(mix().at(time).peak, 1.0);
    }
    Clip* const last = addSound(20000, 4000)->setVolumeEnvelope(&steps);
    // Where the keys meet the envelope gives not-a-number. The later one stands in front.
    EXPECT_EQ(at(21999), 0.25);
    EXPECT_EQ(at(22000), 0.0);
    EXPECT_EQ(at(22001), 1.0);
    VolumeEnvelope below;
    below.addKeyValue(0.0, -0.5);
    last->setVolumeEnvelope(&below);
    EXPECT_EQ(at(21000), 0.5);
}

} // namespace
