// SPDX-License-Identifier: Apache-2.0
// A long walk of random moves, many of them impossible, over a timeline of some tens of clips.
#include "Edits.h"

#include "host/editing/NativeAudio.h"

#include <algorithm>
#include <functional>
#include <limits>
#include <map>
#include <random>
#include <tuple>

namespace {

using namespace EditTests;

constexpr int STEPS = 100000;
constexpr std::size_t MOST_CLIPS = 40;
constexpr std::size_t MOST_TRACKS = 9;

class Walk
{
public:
    Walk()
    {
        for (const TrackType type :
             {PrimaryTrack, NativeAudioTrack, ExtraVideoTrack, ExtraVideoTrack, AudioTrack, TitleTrack}) {
            EXPECT_TRUE(session.addTrack(session.makeTrack(type)));
        }
        m_transitions.push_back(nullptr);
        for (int i = 0; i != 12; ++i) {
            m_transitions.push_back(session.makeTransition("dissolve"));
        }
        fillMoves();
    }

    /// Takes one step and returns the name of the move and what became of it.
    std::pair<std::string, EditResult> step()
    {
        m_shown = inOrder();
        if (m_shown.size() > MOST_CLIPS) {
            return {"lift", session.lift(present())};
        }
        const auto& [name, move] = m_moves[number(m_moves.size())];
        return {name, move()};
    }

    /// Another module's wish, whether it is a good one or not.
    void request(Watcher& watcher)
    {
        m_shown = inOrder();
        auto value = watcher.change(session.timeline());
        if (chance(3)) {
            retime(*value.operator->(), clip());
        } else if (chance(2)) {
            value->addTrackingLink(clip(), Timeline::TrackingLinkInfo({clip(), "face"}, QPointF()));
        } else {
            value->moveClip(clip(), wild());
        }
    }

    EditSession session;

private:
    void fillMoves()
    {
        const auto add = [this](const char* name, int weight, const std::function<EditResult()>& move) {
            m_moves.insert(m_moves.end(), std::size_t(weight), {name, move});
        };
        add("append", 6, [this] { return session.append(placement()); });
        add("insert", 8, [this] { return session.insert(placement(), time()); });
        add("overwrite", 12, [this] { return session.overwrite(placement(), time()); });
        add("lift", 3, [this] { return session.lift(clip()); });
        add("extract", 3, [this] { return session.extract(clip()); });
        add("split", 8, [this] { return session.split(clip(), time()); });
        add("trimLeft", 10, [this] { return session.trimLeft(clip(), delta(), ripple()); });
        add("trimRight", 10, [this] { return session.trimRight(clip(), delta(), ripple()); });
        add("move", 10, [this] { return session.move(clip(), time()); });
        add("move to a lane", 8, [this] { return session.move(clip(), time(), track(), level()); });
        add("setSpeed", 6, [this] { return session.setSpeed(clip(), speed(), ripple()); });
        add("reverse", 3, [this] { return session.reverse(clip()); });
        add("setFades", 5, [this] { return session.setFades(clip(), delta(), delta()); });
        add("addTransition", 16, [this] { return session.addTransition(transition(), pair(), wish()); });
        add("removeTransition", 2, [this] { return session.removeTransition(transition()); });
        add("addTrack", 3, [this] { return session.addTrack(newTrack()); });
        add("moveTrack", 2, [this] { return session.moveTrack(track(), track()); });
        add("removeTrack", 1, [this] { return session.removeTrack(chance(4) ? track() : nullptr); });
        add("link", 8, [this] { return session.link(clip(), clip()); });
        add("follow", 8, [this] {
            return session.follow(clip(), Timeline::TrackingLinkInfo({clip(), "face"}, QPointF()));
        });
        add("unfollow", 4, [this] { return session.unfollow(clip()); });
        add("unlink", 3, [this] { return session.unlink(clip()); });
    }

    /// By little, and only what has no native audio, since the other module looks after nothing.
    void retime(Timeline::Object& value, const Clip* clip)
    {
        const auto entry = value.clips.find(clip);
        if (entry != value.clips.end() && !value.isNativeAudio(clip) && value.findSlaves(clip).empty() &&
            entry->second.duration > MTime(20)) {
            value.setClipSpeed(clip, value.clipSpeed(clip) * 1.01);
        }
    }

    std::size_t number(std::size_t below) { return m_random() % below; }
    MTime number(int from, int to) { return from + int(m_random() % unsigned(to - from + 1)); }
    bool chance(std::size_t oneIn) { return number(oneIn) == 0; }

    /// By place, so that the walk doesn't depend on addresses.
    std::vector<const Clip*> inOrder() const
    {
        const Timeline::Object& timeline = *session.timeline();
        std::vector<std::tuple<std::size_t, int, MTime, const Clip*>> sorted;
        for (const auto& [clip, timing] : timeline.clips) {
            sorted.emplace_back(timeline.trackIndex(timing.track), timing.trackLevel, timing.timestamp, clip);
        }
        std::sort(sorted.begin(), sorted.end());
        std::vector<const Clip*> clips;
        for (const auto& entry : sorted) {
            clips.push_back(std::get<const Clip*>(entry));
        }
        return clips;
    }

    const Clip* present() { return m_shown.empty() ? nullptr : m_shown[number(m_shown.size())]; }

    const Clip* clip()
    {
        if (chance(40)) {
            return chance(2) ? nullptr : &m_stranger;
        }
        return present();
    }

    const Clip* newClip(Clip::ClipType type)
    {
        if (chance(20)) {
            return clip();
        }
        Clip* const made = session.makeClip(type);
        if (chance(2)) {
            made->addMotionTracking("face");
        }
        return made->setSourceDuration(number(5, 6000))->setUnlimitedDuration(chance(8));
    }

    Clip::ClipType type()
    {
        const Clip::ClipType types[] = {Clip::VideoClip, Clip::VideoClip, Clip::AudioClip, Clip::OverlayClip};
        return chance(60) ? Clip::IntroVideoClip : types[number(4)];
    }

    const Track* track()
    {
        const auto& tracks = session.timeline()->tracks;
        return tracks.empty() || chance(40) ? nullptr : tracks[number(tracks.size())];
    }

    /// A track that takes the type, most of the time.
    const Track* trackFor(Clip::ClipType type)
    {
        const TrackType types[] = {chance(3) ? ExtraVideoTrack : PrimaryTrack, AudioTrack, TitleTrack};
        const Track* const found = session.timeline()->findFirstTrack(types[type == Clip::AudioClip     ? 1
                                                                            : type == Clip::OverlayClip ? 2
                                                                                                        : 0]);
        return found && !chance(10) ? found : track();
    }

    const Track* newTrack()
    {
        const TrackType types[] = {PrimaryTrack, NativeAudioTrack, ExtraVideoTrack, AudioTrack, TitleTrack};
        for (const TrackType type : types) {
            if (!session.timeline()->findFirstTrack(type)) {
                return session.makeTrack(type);
            }
        }
        const bool isFull = session.timeline()->tracks.size() >= MOST_TRACKS;
        return isFull ? track() : session.makeTrack(types[number(5)]);
    }

    int level() { return chance(20) ? -1 : chance(4) ? 1 : 0; }

    Placement placement()
    {
        const Clip::ClipType newType = type();
        const Clip* const placed = newClip(newType);
        const MTime from = chance(2) ? MTime() : number(-5, 800);
        const MTime duration = chance(3) ? MTime(-1) : number(0, 3000);
        const bool hasAudio = newType == Clip::VideoClip && !chance(3);
        return {placed, trackFor(newType), level(),
                from,   duration,          hasAudio ? newClip(Clip::AudioClip) : nullptr};
    }

    MTime wild()
    {
        const MTime times[] = {std::numeric_limits<qint64>::min(), std::numeric_limits<qint64>::max(),
                               MTime(2147483647), MTime(-2147483647), MTime(-1)};
        return times[number(5)];
    }

    MTime time()
    {
        const Clip* const near = present();
        if (chance(60)) {
            return wild();
        }
        if (!near || chance(3)) {
            return number(-100, 15000);
        }
        const ClipTiming& timing = session.timeline()->clipTiming(near);
        if (chance(3)) {
            return timing.timestamp + MTime(number(std::size_t(timing.duration.ms()) + 1));
        }
        const int margins[] = {0, 0, 0, -1, 1, 9, -10, 11};
        return (chance(3) ? timing.timestamp : timing.end()) + margins[number(8)];
    }

    MTime delta() { return chance(60) ? wild() : chance(2) ? number(-30, 30) : number(-1500, 1500); }

    MTime wish() { return chance(2) ? MTime(-1) : delta(); }
    Ripple ripple() { return chance(2) ? Ripple::Yes : Ripple::No; }

    double speed()
    {
        const double speeds[] = {1, 1, 2,  0.5,  0.75, 1.1,
                                 3, 0, -1, 1e-9, 1e9,  std::numeric_limits<double>::quiet_NaN()};
        return speeds[number(12)];
    }

    const Transition::Object* transition() { return m_transitions[number(m_transitions.size())]; }

    Timeline::ClipPair pair()
    {
        const std::size_t first = number(m_shown.size() + 1);
        switch (number(5)) {
        case 0:
            return {clip(), nullptr};
        case 1:
            return {nullptr, clip()};
        case 2:
            return {clip(), clip()};
        default:
            // Neighbours, as they come.
            return first + 1 < m_shown.size() ? Timeline::ClipPair(m_shown[first], m_shown[first + 1])
                                              : Timeline::ClipPair();
        }
    }

    std::mt19937 m_random{20240229};
    std::vector<std::pair<std::string, std::function<EditResult()>>> m_moves;
    std::vector<const Clip*> m_shown;
    std::vector<const Transition::Object*> m_transitions;
    Clip m_stranger;
};

/// What holds beyond what makes a timeline sound.
void expectPolicy(const Timeline::Object& timeline)
{
    for (const auto& [clip, timing] : timeline.clips) {
        ASSERT_GE(timing.duration.ms(), Clip::MIN_DURATION.ms());
    }
    for (const auto& [slave, link] : timeline.links) {
        if (timeline.isNativeAudio(slave)) {
            ClipTiming following = timeline.clipTiming(slave);
            ASSERT_TRUE(Host::followMaster(link.master, timeline.clipTiming(link.master), slave, following));
            ASSERT_TRUE(following == timeline.clipTiming(slave));
        }
        ASSERT_EQ(link.offset.ms(),
                  (timeline.clipTiming(slave).timestamp - timeline.clipTiming(link.master).timestamp).ms());
    }
}

/// Of the faults that are found only when a move is done, a move may run into these; the others would be the
/// session's own.
bool isExpected(const QString& refusal)
{
    return !refusal.contains("would leave a fault") || refusal.contains("on the same track and level") ||
           refusal.contains("negative or later");
}

TEST(EditSessionWalk, EveryMoveIsDoneAsAWholeOrRefusedAndLeavesTheTimelineSound)
{
    Walk walk;
    const Timeline::Object& timeline = *walk.session.timeline();
    Watcher watcher(&timeline);
    Timeline::Object before = timeline;
    std::map<std::string, int> done, refused;
    std::size_t mostTransitions = 0;
    for (int i = 0; i != STEPS; ++i) {
        watcher.changes = 0;
        if (i % 50 == 0) {
            walk.request(watcher);
            ASSERT_LE(watcher.changes, 1) << i;
        } else {
            const auto [name, result] = walk.step();
            ASSERT_EQ(watcher.changes, result ? 1 : 0) << i << " " << name;
            ASSERT_TRUE(isExpected(result.refusal))
                << i << " " << name << ": " << result.refusal.toStdString();
            ++(result ? done : refused)[name];
        }
        if (watcher.changes == 0) {
            ASSERT_TRUE(haveSameContent(before, timeline)) << i;
            continue;
        }
        ASSERT_TRUE(haveSameContent(before, watcher.old)) << i;
        before = timeline;
        mostTransitions = std::max(mostTransitions, timeline.transitions.size());
        ASSERT_THAT(faultTexts(timeline), testing::IsEmpty()) << i;
        ASSERT_NO_FATAL_FAILURE(expectPolicy(timeline)) << i;
    }
    // The walk has been everywhere.
    for (const auto& [name, count] : done) {
        EXPECT_GE(count, 100) << name;
        EXPECT_GE(refused[name], 100) << name;
    }
    EXPECT_EQ(done.size(), 22u);
    EXPECT_GE(mostTransitions, 4u);
}

} // namespace
