// SPDX-License-Identifier: Apache-2.0
#include "Ratio.h"

#include <EditorModel/bus/View.h>
#include <EditorModel/effects/Transition.h>
#include <EditorModel/timeline/Timeline.h>

#include <functional>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <utility>
#include <vector>

// An edit is to cost the one copy that it needs of what the timeline holds, and a question the one walk that
// answers it. Where the answer is a container of its own, making it is part of the floor.

namespace {

using Timeline::Clip;
using Timeline::ClipTiming;

constexpr int TRACK_COUNT = 4;

/// Rows of pictures, their native sound, titles and music; the pictures are masters of sound and titles.
struct Project
{
    explicit Project(int clipCount) : clips(std::size_t(clipCount))
    {
        const TrackType types[TRACK_COUNT] = {PrimaryTrack, NativeAudioTrack, TitleTrack, AudioTrack};
        for (int i = 0; i != TRACK_COUNT; ++i)
            timeline.addTrack(tracks[i].setType(types[i])->setTimeline(&timeline));
        for (int i = 0; i != clipCount; ++i) {
            const int track = i % TRACK_COUNT;
            clips[i].setType(Clip::ClipType(1 << track % 3))->setSourceDuration(MTime(1000));
            timeline.addClip(&clips[i], ClipTiming(&tracks[track], 0, MTime(i / TRACK_COUNT * 1000),
                                                   MTime(1000), MTime(), MTime(1000)));
        }
    }

    /// All but the clips.
    void fillUp()
    {
        const std::size_t count = clips.size();
        transitions = std::vector<Transition::Object>(count / 10);
        for (std::size_t i = 0; i != count; ++i) {
            const std::size_t master = i / TRACK_COUNT * TRACK_COUNT;
            if (i % TRACK_COUNT == 1 || i % TRACK_COUNT == 2)
                timeline.addLink(&clips[master], &clips[i], MTime());
            if (i % 20 == 2) {
                timeline.addTrackingLink(
                    &clips[i], Timeline::TrackingLinkInfo(Timeline::TrackedObject(&clips[master], "id"), {}));
            }
        }
        for (std::size_t i = 0; i != transitions.size(); ++i)
            timeline.transitions[&transitions[i]] = {&clips[i], &clips[i + 1]};
    }

    std::vector<Clip> clips;
    Timeline::Track tracks[TRACK_COUNT];
    Timeline::Track emptyTrack;
    std::vector<Transition::Object> transitions;
    Timeline::Object timeline;
};

enum Contents
{
    ClipsAlone,
    Everything,
};

/// One for each size and contents, for all benchmarks.
Project& project(const benchmark::State& state, Contents contents)
{
    static std::map<std::pair<int, Contents>, std::unique_ptr<Project>> all;
    const int size = int(state.range(0));
    std::unique_ptr<Project>& made = all[{size, contents}];
    if (!made) {
        made = std::make_unique<Project>(size);
        if (contents == Everything)
            made->fillUp();
    }
    return *made;
}

// Edits

class Observer : public Message::View<Timeline::Object>
{
protected:
    using View::changed;
    void changed(const Timeline::Object* timeline) override
    {
        benchmark::DoNotOptimize(timeline->clips.size());
    }
};

void moveClip(benchmark::State& state, bool asOwner)
{
    Project& p = project(state, ClipsAlone);
    Observer owner, observer;
    owner.own(&p.timeline);
    observer.observe(&p.timeline);
    Observer& editor = asOwner ? owner : observer;
    const Clip* const clip = &p.clips[p.clips.size() / 2];
    int time = 0;
    for (auto _ : state)
        editor.change(&p.timeline)->moveClip(clip, MTime(++time % 1000));
}

void copyClips(benchmark::State& state)
{
    const Project& p = project(state, ClipsAlone);
    for (auto _ : state) {
        const auto copy = p.timeline.clips;
        benchmark::DoNotOptimize(copy.size());
    }
}

// Copies

void copyTimeline(benchmark::State& state)
{
    const Project& p = project(state, Everything);
    for (auto _ : state) {
        const Timeline::Object copy(p.timeline);
        benchmark::DoNotOptimize(copy.clips.size());
    }
}

void copyContainers(benchmark::State& state)
{
    const Timeline::Object& timeline = project(state, Everything).timeline;
    for (auto _ : state) {
        const auto clips = timeline.clips;
        const auto links = timeline.links;
        const auto trackingLinks = timeline.trackingLinks;
        const auto transitions = timeline.transitions;
        const auto tracks = timeline.tracks;
        const auto exportRanges = timeline.exportRanges;
        benchmark::DoNotOptimize(clips.size() + links.size() + trackingLinks.size() + transitions.size() +
                                 tracks.size() + exportRanges.size());
    }
}

// Queries and their floors

using ClipSet = std::set<const Clip*>;

/// Reads every timing, and does nothing with it.
int walkClips(const Project& p)
{
    qint64 sum = 0;
    for (const auto& [clip, timing] : p.timeline.clips)
        sum += timing.timestamp.ms();
    return int(sum);
}

int walkClipsAndTypes(const Project& p)
{
    int sum = 0;
    for (const auto& [clip, timing] : p.timeline.clips)
        sum += clip->type;
    return sum;
}

int walkClipsTwice(const Project& p)
{
    const int sum = walkClips(p);
    benchmark::ClobberMemory();
    return sum + walkClips(p);
}

const Clip* walkLinks(const Project& p)
{
    const Clip* last = nullptr;
    for (const auto& [slave, link] : p.timeline.links)
        last = link.master ? link.master : last;
    return last;
}

bool walkLinksTwice(const Project& p)
{
    const Clip* const last = walkLinks(p);
    benchmark::ClobberMemory();
    return last == walkLinks(p);
}

/// A walk, and a set of as many clips as lie on a track, in the order of meeting.
ClipSet walkIntoSet(const Project& p)
{
    ClipSet chosen;
    int i = 0;
    for (const auto& [clip, timing] : p.timeline.clips) {
        if (timing.timestamp >= MTime() && i++ % TRACK_COUNT == 0)
            chosen.insert(chosen.end(), clip);
    }
    return chosen;
}

ClipSet walkTypesIntoSet(const Project& p)
{
    ClipSet chosen;
    for (const auto& [clip, timing] : p.timeline.clips) {
        if (clip->type == Clip::AudioClip)
            chosen.insert(chosen.end(), clip);
    }
    return chosen;
}

std::multimap<MTime, const Clip*> walkIntoMultimap(const Project& p)
{
    std::multimap<MTime, const Clip*> byStart;
    int i = 0;
    for (const auto& [clip, timing] : p.timeline.clips) {
        if (i++ % TRACK_COUNT == 0)
            byStart.emplace_hint(byStart.end(), timing.timestamp, clip);
    }
    return byStart;
}

std::map<const Clip*, ClipSet> walkLinksIntoGroups(const Project& p)
{
    std::map<const Clip*, ClipSet> groups;
    for (const auto& [slave, link] : p.timeline.links)
        groups[link.master].insert(slave);
    return groups;
}

/// A clip in the middle that has slaves.
const Clip* aMaster(const Project& p)
{
    return &p.clips[p.clips.size() / 2 / TRACK_COUNT * TRACK_COUNT];
}

int findClip(const Project& p)
{
    return int(p.timeline.clips.find(&p.clips[p.clips.size() / 2])->second.duration.ms());
}

/// Of the clip that isDisabledByTrack() is asked about.
bool findHidden(const Project& p)
{
    const Clip* const clip = aMaster(p);
    const auto found = p.timeline.clips.find(clip);
    return clip->isVideoClip() && found != p.timeline.clips.end() && found->second.track->hidden;
}

struct Question
{
    std::string name;
    std::function<void(benchmark::State&)> run;
    std::string floor;
};

template <class Ask>
Question question(const char* name, const char* floor, Ask ask)
{
    const auto run = [ask](benchmark::State& state) {
        const Project& p = project(state, Everything);
        for (auto _ : state)
            benchmark::DoNotOptimize(ask(p));
    };
    return {name, run, floor};
}

const std::vector<Question> floors = {
    question("a walk", "", walkClips),
    question("a walk with types", "", walkClipsAndTypes),
    question("two walks", "", walkClipsTwice),
    question("a walk of the links", "", walkLinks),
    question("two walks of the links", "", walkLinksTwice),
    question("a walk into a set", "", walkIntoSet),
    question("a walk with types into a set", "", walkTypesIntoSet),
    question("a walk into a multimap", "", walkIntoMultimap),
    question("a walk into groups", "", walkLinksIntoGroups),
    question("a find", "", findClip),
    question("a find of a hidden track", "", findHidden),
};

const std::vector<Question> questions = {
    question("duration", "a walk", [](const Project& p) { return p.timeline.duration(); }),
    question("nextClipBoundary", "a walk",
             [](const Project& p) { return p.timeline.nextClipBoundary(MTime(5500)); }),
    question("prevClipBoundary", "a walk",
             [](const Project& p) { return p.timeline.prevClipBoundary(MTime(5500)); }),
    question("isTrackEmpty", "a walk",
             [](const Project& p) { return p.timeline.isTrackEmpty(&p.emptyTrack); }),
    question("trackDuration", "a walk",
             [](const Project& p) { return p.timeline.trackDuration(&p.tracks[0]); }),
    question("clipsAt a time", "a walk",
             [](const Project& p) { return p.timeline.clipsAt(&p.tracks[0], MTime(5500)); }),
    question("clipsAt", "a walk into a set",
             [](const Project& p) { return p.timeline.clipsAt(&p.tracks[0]); }),
    question("clipsByType without", "a walk with types",
             [](const Project& p) { return p.timeline.clipsByType(Clip::IntroVideoClip); }),
    question("clipsByType", "a walk with types into a set",
             [](const Project& p) { return p.timeline.clipsByType(Clip::AudioClip); }),
    question("clipsDifference", "two walks",
             [](const Project& p) { return p.timeline.clipsDifference(&p.timeline); }),
    question("trackTiming", "a walk into a multimap",
             [](const Project& p) { return p.timeline.trackTiming(&p.tracks[0]); }),
    question("findSlaves", "a walk of the links",
             [](const Project& p) { return p.timeline.findSlaves(aMaster(p)); }),
    question("findNativeAudio", "a walk of the links",
             [](const Project& p) { return p.timeline.findNativeAudio(&p.clips[1]); }),
    question("clipHeap of one", "a walk of the links",
             [](const Project& p) { return p.timeline.clipHeap(&p.clips[1]); }),
    question("clipHeap of three", "two walks of the links",
             [](const Project& p) { return p.timeline.clipHeap(aMaster(p)); }),
    question("master2slaves", "a walk into groups",
             [](const Project& p) { return p.timeline.master2slaves(); }),
    question("clipTiming", "a find",
             [](const Project& p) { return p.timeline.clipTiming(&p.clips[p.clips.size() / 2]).duration; }),
    question("isDisabledByTrack", "a find of a hidden track",
             [](const Project& p) { return p.timeline.isDisabledByTrack(aMaster(p)); }),
};

void enter()
{
    const auto enterOne = [](const std::string& name, auto run) {
        for (const int size : {100, 1'000, 10'000, 50'000})
            benchmark::RegisterBenchmark(name.c_str(), run)->Arg(size);
    };
    enterOne("moveClip by the owner", [](benchmark::State& state) { moveClip(state, true); });
    enterOne("moveClip by another", [](benchmark::State& state) { moveClip(state, false); });
    enterOne("copyClips", copyClips);
    enterOne("copyTimeline", copyTimeline);
    enterOne("copyContainers", copyContainers);
    for (const Question& floor : floors)
        enterOne(floor.name, floor.run);
    for (const Question& asked : questions)
        enterOne(asked.name, asked.run);

    const auto compareAll = [](const std::string& subject, const std::string& floor, double goal) {
        for (const char* size : {"100", "1000", "10000", "50000"}) {
            Ratios::compare(subject + ", " + size + " clips : " + floor, subject + '/' + size,
                            floor + '/' + size, goal);
        }
    };
    compareAll("moveClip by the owner", "copyClips", 1.3);
    compareAll("moveClip by another", "copyClips", 0);
    compareAll("copyTimeline", "copyContainers", 1.1);
    for (const Question& asked : questions)
        compareAll(asked.name, asked.floor, 1.5);
}

} // namespace

int main(int argc, char** argv)
{
    enter();
    return Ratios::run(argc, argv);
}
