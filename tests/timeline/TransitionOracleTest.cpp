// SPDX-License-Identifier: Apache-2.0
// The timeline beside a second reckoning: over a grid of situations, and along random edits.
#include "tests/timeline/TransitionOracle.h"

#include <EditorModel/effects/Transition.h>
#include <EditorModel/timeline/Timeline.h>

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <optional>
#include <ostream>
#include <sstream>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

namespace TransitionOracle {

std::ostream& operator<<(std::ostream& out, const Sheet& sheet)
{
    for (const ClipRow& clip : sheet.clips)
        out << (clip.placed ? " clip " : " (clip) ") << clip.ms[0] << " out " << clip.ms[1] << " in "
            << clip.ms[2];
    for (const TransitionRow& row : sheet.transitions) {
        if (row.placed)
            out << " transition " << row.pair[0] << "->" << row.pair[1];
        else
            out << " (transition)";
    }
    return out;
}

} // namespace TransitionOracle

namespace {

using TransitionOracle::Ms;
using TransitionOracle::NOBODY;
using TransitionOracle::Sheet;
using Ignored = std::set<int>;

/// A timeline, its clips and its transitions, in arrays that give them the order of a sheet.
class Model
{
public:
    explicit Model(const Sheet& sheet) : m_clips(sheet.clips.size()), m_transitions(sheet.transitions.size())
    {
        for (std::size_t i = 0; i != m_transitions.size(); ++i)
            m_transitions[i].defaultDuration = sheet.transitions[i].defaultLength;
        take(sheet);
    }

    void take(const Sheet& sheet)
    {
        timeline.clearClips();
        timeline.transitions.clear();
        for (std::size_t i = 0; i != m_clips.size(); ++i) {
            const auto& [placed, ms] = sheet.clips[i];
            Timeline::ClipTiming timing;
            timing.setDuration(ms[0]).setTransitionOut(ms[1]).setTransitionIn(ms[2]);
            if (placed)
                timeline.addClip(&m_clips[i], timing);
        }
        for (std::size_t i = 0; i != m_transitions.size(); ++i) {
            if (sheet.transitions[i].placed)
                timeline.transitions[&m_transitions[i]] = pair(sheet.transitions[i].pair);
        }
    }

    Sheet sheet() const
    {
        Sheet sheet;
        for (const Timeline::Clip& clip : m_clips) {
            TransitionOracle::ClipRow row;
            if (timeline.contains(&clip)) {
                const Timeline::ClipTiming& timing = timeline.clipTiming(&clip);
                row = {true, {timing.duration.ms(), timing.transitionOut.ms(), timing.transitionIn.ms()}};
            }
            sheet.clips.push_back(row);
        }
        for (const Transition::Object& transition : m_transitions) {
            const auto [first, second] = timeline.transitionClipPair(&transition);
            sheet.transitions.push_back({timeline.hasTransition(&transition),
                                         {number(first), number(second)},
                                         transition.defaultDuration.ms()});
        }
        return sheet;
    }

    const Timeline::Clip* clip(int number) const { return number == NOBODY ? nullptr : &m_clips[number]; }
    const Transition::Object* transition(int number) const
    {
        return number == NOBODY ? nullptr : &m_transitions[number];
    }
    Timeline::ClipPair pair(TransitionOracle::Pair numbers) const
    {
        return {clip(numbers[0]), clip(numbers[1])};
    }

    QSet<const Transition::Object*> ignored(const Ignored& numbers) const
    {
        QSet<const Transition::Object*> set;
        for (const int number : numbers)
            set.insert(transition(number));
        return set;
    }

    Timeline::Object timeline;

private:
    int number(const Timeline::Clip* clip) const { return clip ? int(clip - m_clips.data()) : NOBODY; }

    const std::vector<Timeline::Clip> m_clips;
    std::vector<Transition::Object> m_transitions;
};

/// No value for what is thrown where a strict look-up fails.
template <class Call>
std::optional<Ms> msOf(Call call)
{
    try {
        return call().ms();
    } catch (const std::out_of_range&) {
        return std::nullopt;
    }
}

template <class Call>
bool succeeds(Call call)
{
    try {
        call();
        return true;
    } catch (const std::out_of_range&) {
        return false;
    }
}

const std::vector<Ms> LENGTHS = {0, 3, 5, 9, 10, 11, 600, 1000, 4000};
const std::vector<TransitionOracle::Pair> PAIRS = {
    {0, 1}, {NOBODY, 1}, {0, NOBODY}, {NOBODY, NOBODY}, {0, 0}};

/// A wish, and the default that stands in for none.
struct Wish
{
    Ms defaultLength;
    Ms wish;
};

const std::vector<Wish> WISHES = {
    {2000, -1}, {1, -1},      {21, -1},     {2001, -1},   {-1, -1},     {-7, -1},
    {2000, 0},  {2000, 1},    {2000, 9},    {2000, 10},   {2000, 11},   {2000, 21},
    {2000, -2}, {2000, 1001}, {2000, 2000}, {2000, 2001}, {2000, 3995}, {2000, Ms(1) << 50},
};

/// How the far end of a clip is taken, by transition 3 or 4: by none, by a share alone, by a transition.
struct FarEnd
{
    Ms share;
    bool byTransition;
};

const std::vector<FarEnd> FAR_ENDS = {{0, false}, {200, false}, {7, true}, {995, true}};

/// What stands between the clips 0 and 1 already, or at one of them; clip 2 is another one.
struct Standing
{
    const char* what;
    std::vector<TransitionOracle::Pair> pairs;
    Ms tailOfFirst;
    Ms headOfSecond;
};

const std::vector<Standing> STANDINGS = {
    {"nothing", {}, 0, 0},
    {"shares alone", {}, 31, 52},
    {"one between", {{0, 1}}, 31, 52},
    {"two between", {{0, 1}, {0, 1}}, 300, 300},
    {"one at either side", {{NOBODY, 1}, {0, NOBODY}}, 15, 801},
    {"others between", {{0, 2}, {2, 1}}, 8, 400},
    {"the reverse", {{1, 0}, {0, 1}}, 4, 5},
    {"no length", {{0, 1}}, 0, 0},
    {"a length of -1", {{0, 1}}, 0, -1},
};

const std::vector<Ignored> IGNORED = {{}, {0}, {0, 1}, {3}, {4}, {NOBODY}, {NOBODY, 0, 1, 3, 4}};

Sheet situation(Ms first, Ms second, const FarEnd& head, const FarEnd& tail, const Standing& standing)
{
    Sheet sheet;
    sheet.clips = {{true, {first, standing.tailOfFirst, head.share}},
                   {true, {second, tail.share, standing.headOfSecond}},
                   {true, {700, 60, 70}}};
    sheet.transitions.resize(6);
    for (std::size_t i = 0; i != standing.pairs.size(); ++i)
        sheet.transitions[i] = {true, standing.pairs[i], 0};
    if (head.byTransition)
        sheet.transitions[3] = {true, {NOBODY, 0}, 0};
    if (tail.byTransition)
        sheet.transitions[4] = {true, {1, NOBODY}, 0};
    return sheet;
}

template <class Visit>
void forEachSituation(Visit visit)
{
    for (const Ms first : LENGTHS) {
        for (const Ms second : LENGTHS) {
            for (const FarEnd& head : FAR_ENDS) {
                for (const FarEnd& tail : FAR_ENDS) {
                    for (const Standing& standing : STANDINGS) {
                        SCOPED_TRACE(standing.what);
                        visit(situation(first, second, head, tail, standing));
                        if (testing::Test::HasFailure())
                            return;
                    }
                }
            }
        }
    }
}

TEST(TransitionGrid, AvailableDurationsAgree)
{
    int compared = 0;
    forEachSituation([&](const Sheet& sheet) {
        const Model model(sheet);
        for (const TransitionOracle::Pair pair : PAIRS) {
            ASSERT_EQ(msOf([&] { return model.timeline.availableTransitionDuration(model.pair(pair)); }),
                      TransitionOracle::available(sheet, pair))
                << pair[0] << "->" << pair[1] << " on" << sheet;
            ++compared;
        }
    });
    EXPECT_EQ(compared, 9 * 9 * 4 * 4 * 9 * 5);
}

TEST(TransitionGrid, ExpectedDurationsAgree)
{
    int compared = 0;
    forEachSituation([&](const Sheet& sheet) {
        const Model model(sheet);
        for (const Ignored& numbers : IGNORED) {
            const auto ignored = model.ignored(numbers);
            for (const TransitionOracle::Pair pair : PAIRS) {
                for (const Wish& wish : WISHES) {
                    const auto here = model.timeline.expectedTransitionDuration(
                        model.pair(pair), wish.defaultLength, wish.wish, ignored);
                    const auto there =
                        TransitionOracle::expected(sheet, pair, wish.defaultLength, wish.wish, numbers);
                    ASSERT_EQ(std::optional(here.ms()), there)
                        << pair[0] << "->" << pair[1] << " default " << wish.defaultLength << " wish "
                        << wish.wish << " first ignored " << (numbers.empty() ? -2 : *numbers.begin())
                        << " on" << sheet;
                    ++compared;
                }
            }
        }
    });
    EXPECT_EQ(compared, 9 * 9 * 4 * 4 * 9 * 7 * 5 * 18);
}

TEST(TransitionGrid, AddingATransitionLeavesTheSameTimeline)
{
    int compared = 0;
    forEachSituation([&](const Sheet& sheet) {
        Model model(sheet);
        for (const TransitionOracle::Pair pair : PAIRS) {
            for (const Ms wish : {-1, 0, 11, 1001, 8001}) {
                // A new one, and one that may stand somewhere.
                for (const int transition : {5, 0}) {
                    model.take(sheet);
                    Sheet after = sheet;
                    model.timeline.addTransition(model.transition(transition), model.pair(pair), wish);
                    ASSERT_TRUE(TransitionOracle::add(after, transition, pair, wish));
                    ASSERT_EQ(model.sheet(), after) << "transition " << transition << " " << pair[0] << "->"
                                                    << pair[1] << " wish " << wish << " on" << sheet;
                    ++compared;
                }
            }
        }
    });
    EXPECT_EQ(compared, 9 * 9 * 4 * 4 * 9 * 5 * 5 * 2);
}

TEST(TransitionGrid, SettingADurationLeavesTheSameTimeline)
{
    for (const Standing& standing : STANDINGS) {
        const Sheet sheet = situation(1000, 600, {7, true}, {995, true}, standing);
        for (const Wish& wish : WISHES) {
            for (int transition = 0; transition != 6; ++transition) {
                Model model(sheet);
                Sheet after = sheet;
                const bool isKnown = succeeds(
                    [&] { model.timeline.setTransitionDuration(model.transition(transition), wish.wish); });
                ASSERT_EQ(isKnown, TransitionOracle::setLength(after, transition, wish.wish));
                ASSERT_EQ(model.sheet(), after) << transition << " to " << wish.wish << " on" << sheet;
            }
        }
    }
}

/// A number of a clip, or of none.
rc::Gen<int> anyClip()
{
    return rc::gen::inRange(NOBODY, 4);
}

rc::Gen<int> anyTransition()
{
    return rc::gen::inRange(0, 5);
}

rc::Gen<Ms> anyLength()
{
    return rc::gen::oneOf(rc::gen::elementOf(LENGTHS), rc::gen::inRange<Ms>(-30, 30),
                          rc::gen::inRange<Ms>(0, 9000), rc::gen::just<Ms>(-1));
}

/// One edit or question on both sides, with the same outcome.
void step(Model& model, Sheet& sheet)
{
    Timeline::Object& timeline = model.timeline;
    const TransitionOracle::Pair pair = {*anyClip(), *anyClip()};
    const int transition = *anyTransition();
    const Ms length = *anyLength();
    switch (*rc::gen::inRange(0, 9)) {
    case 0:
    case 1:
    case 2:
        RC_ASSERT(succeeds([&] {
                      timeline.addTransition(model.transition(transition), model.pair(pair), length);
                  }) == TransitionOracle::add(sheet, transition, pair, length));
        break;
    case 3:
        RC_ASSERT(succeeds([&] { timeline.removeTransition(model.transition(transition)); }) ==
                  TransitionOracle::remove(sheet, transition));
        break;
    case 4:
        RC_ASSERT(succeeds([&] { timeline.setTransitionDuration(model.transition(transition), length); }) ==
                  TransitionOracle::setLength(sheet, transition, length));
        break;
    case 5:
        if (pair[0] != NOBODY) {
            timeline.setClipDuration(model.clip(pair[0]), length);
            sheet.clips[pair[0]].placed = true;
            sheet.clips[pair[0]].ms[0] = length;
        }
        break;
    case 6:
        if (pair[0] != NOBODY) {
            timeline.removeClip(model.clip(pair[0]));
            sheet.clips[pair[0]] = {};
        }
        break;
    case 7: {
        const auto ignored = *rc::gen::container<Ignored>(anyTransition());
        RC_ASSERT(msOf([&] {
                      return timeline.expectedTransitionDuration(model.pair(pair), 2000, length,
                                                                 model.ignored(ignored));
                  }) == TransitionOracle::expected(sheet, pair, 2000, length, ignored));
        break;
    }
    case 8:
        RC_ASSERT(msOf([&] { return timeline.availableTransitionDuration(model.pair(pair)); }) ==
                  TransitionOracle::available(sheet, pair));
        break;
    }
}

RC_GTEST_PROP(TransitionWalk, EveryEditLeavesTheSameTimeline, ())
{
    Sheet sheet;
    sheet.clips = {{true, {4000}}, {true, {600}}, {true, {1000}}, {false, {}}};
    sheet.transitions.resize(5);
    for (auto& row : sheet.transitions)
        row.defaultLength = *rc::gen::element<Ms>(2000, 2001, 600);
    Model model(sheet);
    const int steps = *rc::gen::inRange(1, 40);
    for (int i = 0; i != steps; ++i) {
        step(model, sheet);
        RC_ASSERT(model.sheet() == sheet);
    }
    model.timeline.clearTransitions();
    for (int transition = 0; transition != 5; ++transition)
        TransitionOracle::remove(sheet, transition);
    RC_ASSERT(model.sheet() == sheet);
}

} // namespace
