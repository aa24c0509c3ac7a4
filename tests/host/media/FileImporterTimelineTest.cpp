// SPDX-License-Identifier: Apache-2.0
#include "ImportFixture.h"

#include <algorithm>

namespace {

using namespace ImportTests;
using testing::HasSubstr;

class FileImporterTimeline : public ImportFixture
{};

TEST_F(FileImporterTimeline, AppendsOnTheTrackAndTheLevelThatAreGiven)
{
    const Track* const extra = addTrack(ExtraVideoTrack);
    EXPECT_EQ(lay({png, png}, TimelineContext(now(), extra, 1, -1)), Importer::AllAdded);
    EXPECT_EQ(lines.back(), "answer 1: picture.png picture.png");
    EXPECT_EQ(textOf(*now()), "extra: picture.png 0-4000 @0 L1, picture.png 4000-8000 @0 L1");
    // No level is the lowest one.
    EXPECT_EQ(lay({png}, TimelineContext(now(), extra, MTime(-1), Clip::VideoClip, -1, true)),
              Importer::AllAdded);
    EXPECT_EQ(textOf(*now()), "extra: picture.png 0-4000 @0, picture.png 0-4000 @0 L1, "
                              "picture.png 4000-8000 @0 L1");
}

TEST_F(FileImporterTimeline, LaysTheSoundOfAVideoOnItsOwnTrackWhereverTheVideoGoes)
{
    const Track* const extra = addTrack(ExtraVideoTrack);
    EXPECT_EQ(lay({film}, TimelineContext(now(), extra, 0, -1)), Importer::AllAdded);
    EXPECT_EQ(textOf(*now()), "extra: film.mp4 0-2000 @0; native: film.mp4 0-2000 @0");
}

TEST_F(FileImporterTimeline, InsertsFilesOfAllKindsOneAfterAnotherOnATrackThatIsGiven)
{
    // It takes anything.
    const Track* const track = addTrack(TrackType());
    EXPECT_EQ(lay({png, wav, png}, TimelineContext(now(), track, 0, 1000)), Importer::AllAdded);
    EXPECT_EQ(EditTests::row(*now(), track),
              "picture.png 1000-5000 @0, speech.wav 5000-6500 @0, picture.png 6500-10500 @0");
}

TEST_F(FileImporterTimeline, GoesOnWhereAnObserverRemovesTheClipAtOnce)
{
    timelines.onChanged = [this] {
        if (!now()->clips.empty()) {
            timelines.onChanged = nullptr;
            EXPECT_TRUE(session.lift(now()->clips.begin()->first));
        }
    };
    EXPECT_EQ(lay({png, wav}, TimelineContext(now(), nullptr, 0, 1000)), Importer::AllAdded);
    EXPECT_EQ(textOf(*now()), "primary:; audio: speech.wav 1000-2500 @0");
}

TEST_F(FileImporterTimeline, InsertsAtAPositionOneAfterAnotherOnEachTrack)
{
    lay({png, wav}, TimelineContext(now()));
    EXPECT_EQ(lay({film, wav, film}, TimelineContext(now(), nullptr, -1, 1000)), Importer::AllAdded);
    EXPECT_EQ(textOf(*now()),
              "primary: picture.png 0-1000 @0, film.mp4 1000-3000 @0, film.mp4 3000-5000 @0, "
              "picture.png 5000-8000 @1000; "
              "audio: speech.wav 0-1000 @0, speech.wav 1000-2500 @0, speech.wav 2500-3000 @1000; "
              "native: film.mp4 1000-3000 @0, film.mp4 3000-5000 @0");
    EXPECT_EQ(lay({png}, TimelineContext(now(), nullptr, -1, 0)), Importer::AllAdded);
    EXPECT_THAT(textOf(*now()), HasSubstr("primary: picture.png 0-4000 @0, picture.png 4000-5000 @0,"));
}

TEST_F(FileImporterTimeline, RefusesTracksThatDoNotTakeTheFileAndLaysTheOthers)
{
    const Track* const primary = addTrack(PrimaryTrack);
    const Track* const native = addTrack(NativeAudioTrack);
    EXPECT_EQ(lay({wav, png}, TimelineContext(now(), primary, 0, -1)), Importer::SomeAdded);
    EXPECT_EQ(
        heard(),
        Lines({
            "asked: speech.wav picture.png",
            "opened speech.wav",
            "opened picture.png",
            "speech.wav not in timeline: can't be laid: The clip \"speech.wav\" can't lie at 00:00:00.000: "
            "the track takes no sound.",
            "primary: picture.png 0-4000 @0; native:",
            "answer 2: picture.png",
        }));
    const Track elsewhere(PrimaryTrack);
    const std::tuple<const Track*, int, const char*> refused[] = {
        {native, 0, "on a native audio track by itself"},
        {&elsewhere, 0, "The track is not on the timeline."},
        {primary, 1, "on level 1, which the track does not have"},
        {primary, -2, "on level -2, which the track does not have"},
    };
    for (const auto& [track, level, reason] : refused) {
        EXPECT_EQ(lay({film}, TimelineContext(now(), track, level, -1)), Importer::NoneAdded);
        ASSERT_GE(lines.size(), 2u);
        EXPECT_THAT(lines[lines.size() - 2], HasSubstr(reason));
        EXPECT_EQ(heard().back(), "answer 3:");
    }
    EXPECT_EQ(textOf(*now()), "primary: picture.png 0-4000 @0; native:");
}

TEST_F(FileImporterTimeline, LeavesNeitherAGapNorATrackForWhatIsRefusedAtAPosition)
{
    lay({png}, TimelineContext(now()));
    lines.clear();
    // Five milliseconds are no clip.
    EXPECT_EQ(lay({film, wav, png}, TimelineContext(now(), nullptr, -1, 5)), Importer::SomeAdded);
    const std::string primary = "primary: picture.png 0-4000 @0";
    const std::string reason =
        ": can't be laid: The clip \"picture.png\" can't be split at 00:00:00.005: there must be a clip "
        "of 00:00:00.010 on either side, beside the transitions.";
    EXPECT_EQ(heard(), Lines({
                           "asked: film.mp4 speech.wav picture.png",
                           "opened film.mp4",
                           "opened speech.wav",
                           primary + "; native:",
                           primary,
                           "film.mp4 not in timeline" + reason,
                           primary + "; audio:",
                           primary + "; audio: speech.wav 5-1505 @0",
                           "picture.png not in timeline" + reason,
                           "answer 2: speech.wav",
                       }));
    EXPECT_EQ(lay({png}, TimelineContext(now(), nullptr, -1, -7)), Importer::NoneAdded);
    EXPECT_EQ(textOf(*now()), primary + "; audio: speech.wav 5-1505 @0");
}

TEST_F(FileImporterTimeline, BuildsClipsByTheStrategy)
{
    EXPECT_EQ(lay({film, song}, {now(), MediaClips::PictureAlone}), Importer::AllAdded);
    EXPECT_EQ(textOf(*now()), "primary: film.mp4 0-2000 @0, song.mp3 2000-6000 @0");
    EXPECT_EQ(lay({wav, png}, {now(), MediaClips::PictureAlone}), Importer::SomeAdded);
    EXPECT_EQ(lay({film, png}, {now(), MediaClips::SoundAlone}), Importer::SomeAdded);
    EXPECT_EQ(lay({png}, {now(), static_cast<MediaClips::Strategy>(7)}), Importer::NoneAdded);
    EXPECT_EQ(textOf(*now()),
              "primary: film.mp4 0-2000 @0, song.mp3 2000-6000 @0, picture.png 6000-10000 @0; "
              "audio: film.mp4 0-2000 @0");
    Lines reasons = heard();
    reasons.erase(std::remove_if(reasons.begin(), reasons.end(),
                                 [](const std::string& line) { return line.find(" not in ") == line.npos; }),
                  reasons.end());
    EXPECT_EQ(
        reasons,
        Lines({"speech.wav not in timeline: has no picture", "picture.png not in timeline: has no sound",
               "picture.png not in timeline: cannot be laid: clips aren't built by strategy 7"}));
}

TEST_F(FileImporterTimeline, BuildsClipsOfTheTypeThatIsGiven)
{
    const auto ofType = [this](Clip::ClipType type,
                               MediaClips::Strategy strategy = Timeline::DefaultStrategy) {
        TimelineContext context(now(), nullptr, MTime(-1), type, -1, false);
        context.clipBuildingStrategy = strategy;
        return context;
    };
    EXPECT_EQ(lay({film, wav}, ofType(Clip::AudioClip)), Importer::AllAdded);
    EXPECT_EQ(textOf(*now()), "audio: film.mp4 0-2000 @0, speech.wav 2000-3500 @0");
    EXPECT_EQ(lay({film}, ofType(Clip::VideoClip)), Importer::AllAdded);
    const std::string laid = "audio: film.mp4 0-2000 @0, speech.wav 2000-3500 @0; "
                             "primary: film.mp4 0-2000 @0; native: film.mp4 0-2000 @0";
    EXPECT_EQ(textOf(*now()), laid);

    lines.clear();
    const std::tuple<QString, TimelineContext, const char*> refused[] = {
        {png, ofType(Clip::AudioClip), "has no sound"},
        {wav, ofType(Clip::VideoClip), "has no picture"},
        {film, ofType(Clip::OverlayClip), "cannot become a clip of type 4"},
        {film, ofType(Clip::IntroVideoClip), "cannot become a clip of type 8"},
        {film, ofType(Clip::VideoClip, MediaClips::SoundAlone),
         "cannot be laid: the clip would be without what makes its type"},
        {film, ofType(Clip::AudioClip, MediaClips::PictureAlone),
         "cannot be laid: the clip would be without what makes its type"},
    };
    for (const auto& [path, context, reason] : refused) {
        EXPECT_EQ(lay({path}, context), Importer::NoneAdded);
        ASSERT_GE(lines.size(), 2u);
        EXPECT_EQ(lines[lines.size() - 2], nameOf(path) + " not in timeline: " + reason);
    }
    EXPECT_EQ(textOf(*now()), laid);
}

} // namespace
