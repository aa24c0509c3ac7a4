// SPDX-License-Identifier: Apache-2.0
#include "Ratio.h"

#include <EditorModel/analysis/MotionTracking.h>

#include <iterator>
#include <random>
#include <vector>

// A look-up is to cost what the map's own does, and joining what follows on one another one walk. Where
// entries are joined, each round needs data of its own, and the copy is part of the floor.

namespace {

using MotionTracking::Data;
using MotionTracking::TimedFrame;

constexpr int ENTRY_COUNT = 100'000;
constexpr int ENTRY_DURATION = 40;

/// Entries without a hole between them, in runs of equal rectangles.
Data trackingOf(int runLength)
{
    Data data;
    for (int i = 0; i != ENTRY_COUNT; ++i) {
        TimedFrame frame;
        frame.left = double(i / runLength) / ENTRY_COUNT;
        frame.width = 0.25;
        frame.duration = ENTRY_DURATION;
        data.frames.emplace_hint(data.frames.end(), MTime(i * ENTRY_DURATION), frame);
    }
    return data;
}

const Data& tracking(int runLength)
{
    static const Data single = trackingOf(1);
    static const Data runs = trackingOf(10);
    static const Data whole = trackingOf(ENTRY_COUNT);
    return runLength == 1 ? single : runLength == 10 ? runs : whole;
}

// Look-ups

const std::vector<MTime>& positions()
{
    static const std::vector<MTime> all = [] {
        std::mt19937 random(1);
        std::uniform_int_distribution<int> anywhere(0, ENTRY_COUNT * ENTRY_DURATION);
        std::vector<MTime> drawn;
        for (int i = 0; i != 1024; ++i)
            drawn.push_back(anywhere(random));
        return drawn;
    }();
    return all;
}

template <class Find>
void lookUp(benchmark::State& state, Find find)
{
    const Data& data = tracking(1);
    const std::vector<MTime>& all = positions();
    std::size_t i = 0;
    for (auto _ : state)
        benchmark::DoNotOptimize(find(data, all[i++ % all.size()]));
}

void findFrame(benchmark::State& state)
{
    lookUp(state, [](const Data& data, MTime position) { return data.findFrame(position, false); });
}

void upperBound(benchmark::State& state)
{
    lookUp(state, [](const Data& data, MTime position) {
        const auto next = data.frames.upper_bound(position);
        if (next == data.frames.begin())
            return data.frames.end();
        const auto entry = std::prev(next);
        return position <= entry->first + entry->second.duration ? entry : data.frames.end();
    });
}

// Joining

/// Nothing is joined, so that the data stays as it is.
void optimizeNothing(benchmark::State& state)
{
    Data data = tracking(1);
    for (auto _ : state) {
        data.optimize();
        benchmark::DoNotOptimize(data.frames.size());
    }
}

/// Compares each entry with the one before it, and does nothing with the outcome.
void compareNeighbours(benchmark::State& state)
{
    const Data data = tracking(1);
    for (auto _ : state) {
        int equalCount = 0;
        const std::pair<const MTime, TimedFrame>* last = &*data.frames.begin();
        for (const auto& entry : data.frames) {
            const bool meets = last->first + last->second.duration == entry.first;
            equalCount += meets && last->second.left == entry.second.left;
            last = &entry;
        }
        benchmark::DoNotOptimize(equalCount);
    }
}

void copyAndOptimize(benchmark::State& state)
{
    const Data& data = tracking(int(state.range(0)));
    for (auto _ : state) {
        Data copy = data;
        copy.optimize();
        benchmark::DoNotOptimize(copy.frames.size());
    }
}

void copy(benchmark::State& state)
{
    const Data& data = tracking(int(state.range(0)));
    for (auto _ : state) {
        const Data::Frames frames = data.frames;
        benchmark::DoNotOptimize(frames.size());
    }
}

BENCHMARK(findFrame);
BENCHMARK(upperBound);
BENCHMARK(optimizeNothing);
BENCHMARK(compareNeighbours);
BENCHMARK(copyAndOptimize)->Arg(1)->Arg(10)->Arg(ENTRY_COUNT);
BENCHMARK(copy)->Arg(1)->Arg(10)->Arg(ENTRY_COUNT);

const bool compared =
    Ratios::compare("findFrame(), 100000 entries : upper_bound", "findFrame", "upperBound", 1.1) &&
    Ratios::compare("optimize() that joins nothing : a walk", "optimizeNothing", "compareNeighbours", 2.0) &&
    Ratios::compare("a copy, and optimize() that joins nothing : a copy", "copyAndOptimize/1", "copy/1",
                    1.5) &&
    Ratios::compare("a copy, and optimize() of runs of ten : a copy", "copyAndOptimize/10", "copy/10", 1.5) &&
    Ratios::compare("a copy, and optimize() into one entry : a copy", "copyAndOptimize/100000", "copy/100000",
                    1.5);

} // namespace

int main(int argc, char** argv)
{
    return Ratios::run(argc, argv);
}
