// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldTexts.h"
#include "tests/types/Printing.h"

#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Transition.h>
#include <EditorModel/media/File.h>
#include <EditorModel/timeline/Film.h>
#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>
#include <rapidcheck/gtest.h>

#include <utility>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using Timeline::Clip;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, Film::Object>);
static_assert(Testing::isVirtualBase<PubSub::Object, Film::Object>);

// In the order of their addresses.
const Timeline::Object timelines[4] = {};
const Clip clips[4] = {};
const Transition::Object transitions[2] = {};
Overlay::Preset presets[2];
const Media::File someFile;

using Clips = std::set<const Clip*>;

Film::Object fullFilm()
{
    Film::Object film;
    film.bindTimeline(&timelines[0], &timelines[1])->bindClip(&clips[0], &clips[1]);
    film.setExpectedDuration(7000)->setFitDurationToAudio(true)->setCropMode(true);
    film.setNativeAudioVolume(-3)->setDetachedAudioVolume(80);
    film.setTransitionsList({&transitions[1], &transitions[0], &transitions[1]});
    film.setStartTitlesEnabled(true)->setFinalTitlesEnabled(true);
    film.setStartTitles(&presets[0])->setFinalTitles(&presets[1])->setBackground(&someFile);
    return film;
}

void expectNoTitlesAndNoBackground(const Film::Object& film)
{
    EXPECT_FALSE(film.startTitlesEnabled);
    EXPECT_FALSE(film.finalTitlesEnabled);
    EXPECT_EQ(film.startTitles, nullptr);
    EXPECT_EQ(film.finalTitles, nullptr);
    EXPECT_EQ(film.background, nullptr);
}

TEST(Film, MayBeShorterThanItIsToBe)
{
    EXPECT_EQ(Film::Object::MIN_DURATION, MTime(5000));
    Film::Object film;
    film.setExpectedDuration(1);
    EXPECT_EQ(film.expectedDuration, MTime(1));
}

TEST(Film, IsBoundInAChain)
{
    Film::Object film;
    EXPECT_EQ(film.bindTimeline(&timelines[0], &timelines[1]), &film);
    EXPECT_EQ(film.bindClip(&clips[0], &clips[1]), &film);
    EXPECT_EQ(film.unbind(&timelines[0]), &film);
    EXPECT_EQ(film.unbind(&clips[0]), &film);
    EXPECT_EQ(film.removeTree(&clips[0]), &film);
}

TEST(Film, TakesAListOfTransitionsOver)
{
    std::deque<const Transition::Object*> taken = {&transitions[1], &transitions[0]};
    const auto* const first = &taken.front();
    Film::Object film;
    film.setTransitionsList(std::move(taken));
    EXPECT_EQ(&film.transitionsList.front(), first);
}

TEST(FilmTimelines, OfAMasterHaveOneSlave)
{
    Film::Object film;
    film.bindTimeline(&timelines[0], &timelines[1])->bindTimeline(&timelines[0], &timelines[2]);
    EXPECT_EQ(film.slaveOf(&timelines[0]), &timelines[2]);
    EXPECT_EQ(film.masterOf(&timelines[1]), nullptr);
    EXPECT_EQ(film.masterOf(&timelines[2]), &timelines[0]);
    EXPECT_THAT(film.timelineBindings, ElementsAre(std::make_pair(&timelines[0], &timelines[2])));
}

TEST(FilmTimelines, ThatAreNotBoundHaveNoMasterAndNoSlave)
{
    const Film::Object film = fullFilm();
    EXPECT_EQ(film.slaveOf(&timelines[1]), nullptr);
    EXPECT_EQ(film.slaveOf(&timelines[2]), nullptr);
    EXPECT_EQ(film.masterOf(&timelines[0]), nullptr);
    EXPECT_EQ(film.masterOf(&timelines[2]), nullptr);
}

TEST(FilmTimelines, MayShareASlaveWhoseMasterIsTheFirstByAddress)
{
    Film::Object film;
    film.bindTimeline(&timelines[2], &timelines[3])->bindTimeline(&timelines[1], &timelines[3]);
    EXPECT_EQ(film.masterOf(&timelines[3]), &timelines[1]);
    film.unbind(&timelines[1]);
    EXPECT_EQ(film.masterOf(&timelines[3]), &timelines[2]);
}

TEST(FilmTimelines, AreUnboundByTheirMasterAlone)
{
    Film::Object film;
    film.bindTimeline(&timelines[0], &timelines[1])->unbind(&timelines[1]);
    EXPECT_EQ(film.slaveOf(&timelines[0]), &timelines[1]);
    film.unbind(&timelines[0]);
    EXPECT_THAT(film.timelineBindings, IsEmpty());
}

TEST(FilmTimelines, ThatAreNotBoundAreTheirOwnRoots)
{
    EXPECT_EQ(Film::Object().rootOf(&timelines[0]), &timelines[0]);
    EXPECT_EQ(fullFilm().rootOf(&timelines[0]), &timelines[0]);
}

TEST(FilmTimelines, HaveTheLastMasterForARoot)
{
    Film::Object film;
    film.bindTimeline(&timelines[2], &timelines[0])->bindTimeline(&timelines[1], &timelines[2]);
    film.bindTimeline(&timelines[3], &timelines[1]);
    for (const Timeline::Object& timeline : timelines)
        EXPECT_EQ(film.rootOf(&timeline), &timelines[3]);
}

TEST(FilmTimelines, HaveNoRootAboveANullMaster)
{
    Film::Object film;
    film.bindTimeline(nullptr, &timelines[0])->bindTimeline(&timelines[0], &timelines[1]);
    EXPECT_EQ(film.rootOf(&timelines[1]), &timelines[0]);
    EXPECT_EQ(film.masterOf(&timelines[0]), nullptr);
    // Null is the first by address, so another master behind it is not come upon.
    film.bindTimeline(&timelines[2], &timelines[0]);
    EXPECT_EQ(film.rootOf(&timelines[1]), &timelines[0]);
}

TEST(FilmClips, HaveOneMasterAndManySlaves)
{
    Film::Object film;
    film.bindClip(&clips[0], &clips[1])->bindClip(&clips[0], &clips[2])->bindClip(&clips[1], &clips[3]);
    EXPECT_EQ(film.slavesOf(&clips[0]), (Clips{&clips[1], &clips[2]}));
    EXPECT_EQ(film.masterOf(&clips[2]), &clips[0]);
    film.bindClip(&clips[1], &clips[2]);
    EXPECT_EQ(film.masterOf(&clips[2]), &clips[1]);
    EXPECT_EQ(film.slavesOf(&clips[0]), (Clips{&clips[1]}));
    EXPECT_EQ(film.slavesOf(&clips[1]), (Clips{&clips[2], &clips[3]}));
}

TEST(FilmClips, ThatAreNotBoundHaveNoMasterAndNoSlaves)
{
    const Film::Object film = fullFilm();
    EXPECT_EQ(film.masterOf(&clips[0]), nullptr);
    EXPECT_EQ(film.masterOf(&clips[3]), nullptr);
    EXPECT_EQ(film.slavesOf(&clips[1]), Clips());
    EXPECT_EQ(film.slavesOf(&clips[3]), Clips());
}

TEST(FilmClips, AreUnboundByTheSlave)
{
    Film::Object film;
    film.bindClip(&clips[0], &clips[1])->bindClip(&clips[0], &clips[2])->unbind(&clips[1]);
    EXPECT_EQ(film.slavesOf(&clips[0]), (Clips{&clips[2]}));
    film.unbind(&clips[0]);
    EXPECT_EQ(film.slavesOf(&clips[0]), (Clips{&clips[2]}));
}

TEST(FilmClips, LoseOneLevelOfTheirTree)
{
    Film::Object film;
    film.bindClip(&clips[0], &clips[1])->bindClip(&clips[1], &clips[2]);
    EXPECT_EQ(film.rootOf(&clips[2]), &clips[0]);
    EXPECT_EQ(film.slavesOf(&clips[0]), (Clips{&clips[1]}));
    film.removeTree(&clips[0]);
    EXPECT_EQ(film.masterOf(&clips[1]), nullptr);
    EXPECT_EQ(film.masterOf(&clips[2]), &clips[1]);
    EXPECT_EQ(film.rootOf(&clips[2]), &clips[1]);
}

TEST(FilmClips, KeepTheirMasterWhenTheyLoseTheirSlaves)
{
    Film::Object film;
    film.bindClip(&clips[0], &clips[1])->bindClip(&clips[1], &clips[2])->bindClip(&clips[1], &clips[3]);
    film.removeTree(&clips[1]);
    EXPECT_EQ(film.masterOf(&clips[1]), &clips[0]);
    EXPECT_EQ(film.slavesOf(&clips[1]), Clips());
    EXPECT_EQ(film.slavesOf(&clips[0]), (Clips{&clips[1]}));
    film.removeTree(&clips[3]);
    EXPECT_EQ(film.slavesOf(&clips[0]), (Clips{&clips[1]}));
}

TEST(FilmClips, ThatAreNotBoundAreTheirOwnRoots)
{
    EXPECT_EQ(Film::Object().rootOf(&clips[0]), &clips[0]);
    EXPECT_EQ(fullFilm().rootOf(&clips[0]), &clips[0]);
}

TEST(FilmClips, HaveNoRootAboveANullMaster)
{
    Film::Object film;
    film.bindClip(nullptr, &clips[0])->bindClip(&clips[0], &clips[1]);
    EXPECT_EQ(film.rootOf(&clips[1]), &clips[0]);
    EXPECT_EQ(film.slavesOf(nullptr), (Clips{&clips[0]}));
}

RC_GTEST_PROP(FilmClips, HaveTheRootThatTheirTreeGrewFrom, ())
{
    // Each node hangs on an earlier one or is a root, so there are no circles.
    const auto parents = *rc::gen::container<std::vector<int>>(rc::gen::inRange(-5, 20));
    std::vector<Clip> nodes(parents.size());
    std::vector<std::size_t> roots;
    Film::Object film;
    for (std::size_t i = 0; i != nodes.size(); ++i) {
        const bool isBound = i > 0 && parents[i] >= 0;
        const std::size_t parent = isBound ? std::size_t(parents[i]) % i : i;
        roots.push_back(isBound ? roots[parent] : i);
        if (isBound)
            film.bindClip(&nodes[parent], &nodes[i]);
    }
    for (std::size_t i = 0; i != nodes.size(); ++i)
        RC_ASSERT(film.rootOf(&nodes[i]) == &nodes[roots[i]]);
}

TEST(FilmDocument, IsMadeByName)
{
    Testing::expectMadeByName<Film::Object>("Film::Object");
}

TEST(FilmDocument, IsWrittenInAnOrderOfItsOwn)
{
    EXPECT_THAT(Testing::fieldKeys(fullFilm()),
                ElementsAre("timelineBindings", "clipBindings", "expectedDuration", "nativeAudioVolume",
                            "detachedAudioVolume", "fitDurationToAudio", "cropMode", "transitionsList"));
    EXPECT_THAT(Testing::defaultFields(fullFilm()), IsEmpty());
    const auto fields = Testing::fieldTexts(fullFilm());
    EXPECT_EQ(fields[3], Testing::FieldText("nativeAudioVolume", "-3"));
    EXPECT_EQ(fields[4], Testing::FieldText("detachedAudioVolume", "80"));
}

TEST(FilmDocument, KeepsTheTreesAndTheSettings)
{
    Film::Object film = fullFilm();
    film.bindClip(&clips[1], &clips[2])->bindTimeline(&timelines[1], &timelines[2]);
    for (const Way& way : allWays) {
        SCOPED_TRACE(way.name);
        const Document::Graph graph = graphOf(documentOf({&film, &clips[2], &timelines[2]}, way));
        const auto* const loaded = graph.rootAs<Film::Object>();
        ASSERT_NE(loaded, nullptr);
        const auto* const clip = dynamic_cast<const Clip*>(graph.roots()[1]);
        const auto* const timeline = dynamic_cast<const Timeline::Object*>(graph.roots()[2]);
        ASSERT_TRUE(clip && timeline);

        EXPECT_EQ(loaded->clipBindings.size(), 2u);
        const Clip* const master = loaded->masterOf(clip);
        ASSERT_NE(master, nullptr);
        EXPECT_EQ(loaded->rootOf(clip), loaded->masterOf(master));
        EXPECT_NE(loaded->rootOf(clip), master);
        EXPECT_EQ(loaded->timelineBindings.size(), 2u);
        const Timeline::Object* const above = loaded->masterOf(timeline);
        ASSERT_NE(above, nullptr);
        EXPECT_EQ(loaded->slaveOf(loaded->rootOf(timeline)), above);

        EXPECT_EQ(loaded->expectedDuration, MTime(7000));
        EXPECT_TRUE(loaded->fitDurationToAudio);
        EXPECT_TRUE(loaded->cropMode);
        EXPECT_EQ(loaded->nativeAudioVolume, -3);
        EXPECT_EQ(loaded->detachedAudioVolume, 80);
        ASSERT_EQ(loaded->transitionsList.size(), 3u);
        EXPECT_EQ(loaded->transitionsList[0], loaded->transitionsList[2]);
        EXPECT_NE(loaded->transitionsList[0], loaded->transitionsList[1]);
    }
}

TEST(FilmDocument, KeepsNoTitlesAndNoBackground)
{
    const Film::Object film = fullFilm();
    for (const Way& way : allWays) {
        SCOPED_TRACE(way.name);
        const Document::Graph graph = graphOf(documentOf({&film}, way));
        ASSERT_NE(graph.rootAs<Film::Object>(), nullptr);
        expectNoTitlesAndNoBackground(*graph.rootAs<Film::Object>());
    }
}

} // namespace
