// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/timeline/Object.h>
#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>

#include <functional>
#include <type_traits>
#include <vector>

namespace {

using testing::ElementsAre;
using Testing::FieldText;
using testing::StartsWith;
using Timeline::Track;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, Track>);
static_assert(Testing::isVirtualBase<PubSub::Object, Track>);
static_assert(std::is_same_v<std::underlying_type_t<TrackType>, int>);

const Timeline::Object someTimeline;
const Timeline::Object otherTimeline;

Track everyFieldSet()
{
    Track track;
    track.setType(TitleTrack)->setMuted(true)->setHidden(true)->setLinked(true)->setGapless(true);
    track.setUsed(false)->setTimeline(&someTimeline);
    return track;
}

TEST(Track, HasTheseTypes)
{
    EXPECT_EQ(PrimaryTrack, 16);
    EXPECT_EQ(ExtraVideoTrack, 32);
    EXPECT_EQ(NativeAudioTrack, 48);
    EXPECT_EQ(AudioTrack, 64);
    EXPECT_EQ(TitleTrack, 80);
    EXPECT_EQ(QuizTrack, 96);
}

void expectNothingButTheType(const Track& track)
{
    EXPECT_FALSE(track.muted);
    EXPECT_FALSE(track.hidden);
    EXPECT_FALSE(track.linked);
    EXPECT_FALSE(track.gapless);
    EXPECT_TRUE(track.used);
    EXPECT_EQ(track.timeline, nullptr);
}

TEST(Track, IsMadeOfAType)
{
    const Track track(QuizTrack);
    EXPECT_EQ(track.type, QuizTrack);
    expectNothingButTheType(track);
}

TEST(Track, IsMadeByName)
{
    Testing::expectMadeByName<Track>("Timeline::Track");
}

TEST(Track, IsWrittenInTheOrderOfItsFields)
{
    // One flag at a time differs from the rest, so that no two can stand for each other.
    const std::vector<std::string> flags = {"muted", "hidden", "linked", "gapless", "used"};
    for (std::size_t on = 0; on != flags.size(); ++on) {
        Track track(TitleTrack);
        track.setMuted(on == 0)->setHidden(on == 1)->setLinked(on == 2)->setGapless(on == 3)->setUsed(on ==
                                                                                                      4);
        const auto text = [on](std::size_t flag) { return flag == on ? "true" : "false"; };
        EXPECT_THAT(Testing::fieldTexts(track),
                    ElementsAre(FieldText("type", "80"), FieldText("muted", text(0)),
                                FieldText("hidden", text(1)), FieldText("linked", text(2)),
                                FieldText("gapless", text(3)), FieldText("used", text(4)),
                                FieldText("timeline", "null")));
    }
    EXPECT_THAT(Testing::fieldTexts(everyFieldSet()).back().second, StartsWith("Timeline::Object #"));
}

TEST(Track, IsEqualInAllFields)
{
    EXPECT_TRUE(Track() == Track());
    EXPECT_FALSE(Track() != Track());
    EXPECT_TRUE(everyFieldSet() == everyFieldSet());
    const std::vector<std::function<void(Track&)>> changes = {
        [](Track& track) { track.setType(QuizTrack); },
        [](Track& track) { track.setMuted(false); },
        [](Track& track) { track.setHidden(false); },
        [](Track& track) { track.setLinked(false); },
        [](Track& track) { track.setGapless(false); },
        [](Track& track) { track.setUsed(true); },
        [](Track& track) { track.setTimeline(&otherTimeline); },
    };
    for (const auto& change : changes) {
        Track other = everyFieldSet();
        change(other);
        EXPECT_FALSE(other == everyFieldSet()) << Testing::Dump::of(other);
        EXPECT_TRUE(other != everyFieldSet()) << Testing::Dump::of(other);
    }
}

} // namespace
