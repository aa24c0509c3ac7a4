// SPDX-License-Identifier: Apache-2.0
#include "Ratio.h"

#include "host/editing/EditSession.h"
#include "host/editing/TimelineInvariants.h"

#include <EditorModel/bus/View.h>
#include <EditorModel/timeline/Timeline.h>

#include <functional>
#include <map>
#include <memory>
#include <string>
#include <vector>

// A move is to cost some copies of the timeline, however many of the clips it is about: its floor is one,
// with the end of the copy, since the old value must be there for those who watch. That of taking a track out
// is a copy of what is left, too.

namespace {

using Host::EditResult;
using Host::EditSession;
using Timeline::Clip;
using Timeline::ClipTiming;

constexpr int TRACK_COUNT = 4;
const MTime LENGTH = 1000;

/// Rows of pictures, their native sound, titles that depend on them, and music.
struct Project
{
    explicit Project(int clipCount) : clips(std::size_t(clipCount))
    {
        const TrackType types[TRACK_COUNT] = {PrimaryTrack, NativeAudioTrack, TitleTrack, AudioTrack};
        const Clip::ClipType kinds[TRACK_COUNT] = {Clip::VideoClip, Clip::AudioClip, Clip::OverlayClip,
                                                   Clip::AudioClip};
        for (int i = 0; i != TRACK_COUNT; ++i)
            timeline.addTrack(tracks[i].setType(types[i])->setTimeline(&timeline));
        for (int i = 0; i != clipCount; ++i) {
            const int track = i % TRACK_COUNT;
            clips[i].setType(kinds[track])->setSourceDuration(LENGTH);
            timeline.addClip(&clips[i], ClipTiming(&tracks[track], 0, MTime(i / TRACK_COUNT * LENGTH.ms()),
                                                   LENGTH, MTime(), LENGTH));
            if (track == 1 || track == 2)
                timeline.addLink(&clips[i - track], &clips[i], MTime());
        }
        inserted.setType(Clip::VideoClip)->setSourceDuration(LENGTH);
        original = timeline;
        session = std::make_unique<EditSession>(&timeline);
        editor.observe(&timeline);
    }

    /// A picture in the middle, with its sound and its title.
    const Clip* middle() const { return &clips[clips.size() / 2 / TRACK_COUNT * TRACK_COUNT]; }
    const Clip* middleMusic() const { return middle() + TRACK_COUNT - 1; }
    const Clip* lastMusic() const { return &clips.back(); }
    MTime startOf(const Clip* clip) const { return original.clipTiming(clip).timestamp; }
    void restore() { *editor.change(&timeline).operator->() = original; }

    std::vector<Clip> clips;
    Clip inserted;
    Timeline::Track tracks[TRACK_COUNT];
    Timeline::Object timeline;
    Timeline::Object original;
    std::unique_ptr<EditSession> session;
    Message::View<Timeline::Object> editor;
};

/// One for each size, for all benchmarks.
Project& project(const benchmark::State& state)
{
    static std::map<int, std::unique_ptr<Project>> all;
    const int size = int(state.range(0));
    std::unique_ptr<Project>& made = all[size];
    if (!made)
        made = std::make_unique<Project>(size);
    return *made;
}

using Move = std::function<EditResult(Project&)>;

void edit(benchmark::State& state, const Move& move)
{
    Project& p = project(state);
    for (auto _ : state) {
        const EditResult result = move(p);
        if (!result) {
            state.SkipWithError(result.refusal.toUtf8().constData());
            return;
        }
        state.PauseTiming();
        p.restore();
        state.ResumeTiming();
    }
}

EditResult insert(Project& p)
{
    return p.session->insert({&p.inserted, &p.tracks[0]}, p.startOf(p.middle()));
}

/// Nothing depends on it, and nothing lies behind it.
EditResult move(Project& p)
{
    return p.session->move(p.lastMusic(), p.startOf(p.lastMusic()) + LENGTH);
}

EditResult split(Project& p)
{
    return p.session->split(p.middle(), p.startOf(p.middle()) + MTime(500));
}

EditResult trim(Project& p)
{
    return p.session->trimRight(p.middleMusic(), MTime(500), Host::Ripple::Yes);
}

EditResult lift(Project& p)
{
    return p.session->lift(p.middle());
}

EditResult extract(Project& p)
{
    return p.session->extract(p.middle());
}

/// With three clips of four.
EditResult removeTrack(Project& p)
{
    return p.session->removeTrack(&p.tracks[0]);
}

/// All clips of the track go.
EditResult overwriteAll(Project& p)
{
    const MTime end = p.original.duration();
    p.inserted.setUnlimitedDuration(true);
    return p.session->overwrite({&p.inserted, &p.tracks[0], 0, 0, end}, 0);
}

void findFaults(benchmark::State& state)
{
    Project& p = project(state);
    for (auto _ : state)
        benchmark::DoNotOptimize(Host::timelineFaults(p.timeline).size());
}

/// The floor.
void copyTimeline(benchmark::State& state)
{
    const Project& p = project(state);
    for (auto _ : state) {
        const Timeline::Object copy(p.timeline);
        benchmark::DoNotOptimize(copy.clips.size());
    }
}

void enter()
{
    const auto enterOne = [](const std::string& name, auto run) {
        for (const int size : {1'000, 10'000})
            benchmark::RegisterBenchmark(name.c_str(), run)->Arg(size);
    };
    const auto compare = [](const std::string& subject) {
        for (const char* size : {"1000", "10000"})
            Ratios::compare(subject + ", " + size + " clips : a copy", subject + '/' + size,
                            std::string("a copy/") + size);
    };
    enterOne("a copy", copyTimeline);
    enterOne("faults", findFaults);
    compare("faults");
    const std::pair<const char*, Move> moves[] = {
        {"insert", insert},
        {"move", move},
        {"split", split},
        {"trim", trim},
        {"delete", lift},
        {"extract", extract},
        {"removeTrack", removeTrack},
        {"overwrite all", overwriteAll},
    };
    for (const auto& [name, step] : moves) {
        enterOne(name, [step = step](benchmark::State& state) { edit(state, step); });
        compare(name);
    }
}

} // namespace

int main(int argc, char** argv)
{
    enter();
    return Ratios::run(argc, argv);
}
