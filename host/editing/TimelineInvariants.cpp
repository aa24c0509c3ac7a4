// SPDX-License-Identifier: Apache-2.0
#include "host/editing/TimelineInvariants.h"

#include "host/editing/EditText.h"
#include "host/editing/NestedTimelines.h"

#include <algorithm>
#include <functional>
#include <initializer_list>
#include <map>
#include <set>
#include <tuple>
#include <utility>

namespace Host {
namespace {

using Timeline::Clip;
using Timeline::ClipTiming;
using Kind = TimelineFault::Kind;

bool isWithin(MTime time, MTime earliest)
{
    return earliest <= time && time <= LATEST_TIME;
}

/// Durations are a matter of their own where they are not positive, and so is a stretch before the source.
bool hasTimesInRange(const ClipTiming& timing)
{
    const std::initializer_list<MTime> counts = {timing.timestamp,      timing.sourceDuration,
                                                 timing.transitionIn,   timing.transitionOut,
                                                 timing.fadeInDuration, timing.fadeOutDuration};
    return std::all_of(counts.begin(), counts.end(), [](MTime time) { return isWithin(time, 0); }) &&
           isWithin(timing.sourcePosition, -LATEST_TIME) && timing.duration <= LATEST_TIME &&
           timing.timestamp + timing.duration <= LATEST_TIME;
}

/// A clip in its lane.
struct Laid
{
    std::size_t trackIndex;
    const Timeline::Track* track;
    int level;
    MTime start;
    MTime end;
    const Clip* clip;

    bool isInLaneOf(const Laid& other) const { return track == other.track && level == other.level; }
};

/// Addresses count only where people have no order.
bool isBefore(const Laid& a, const Laid& b)
{
    if (a.track != b.track) {
        const std::less<const Timeline::Track*> isLess;
        return a.trackIndex != b.trackIndex ? a.trackIndex < b.trackIndex : isLess(a.track, b.track);
    }
    const auto placeA = std::tie(a.level, a.start, a.end);
    const auto placeB = std::tie(b.level, b.start, b.end);
    return placeA != placeB ? placeA < placeB : clipText(a.clip) < clipText(b.clip);
}

class FaultFinder
{
public:
    FaultFinder(const Timeline::Object& identity, const Timeline::Object& timeline)
        : m_identity(identity), m_timeline(timeline)
    {}

    std::vector<TimelineFault> find()
    {
        findInTracks();
        findInClips();
        findNesting();
        findOverlaps();
        findInLinks();
        findInTrackings();
        findInTransitions();
        findWrongShares();
        std::stable_sort(m_faults.begin(), m_faults.end(), [this](const auto& a, const auto& b) {
            return a.kind != b.kind ? a.kind < b.kind : placeOf(a.clip) < placeOf(b.clip);
        });
        return std::move(m_faults);
    }

private:
    /// By what people order clips; what is not here comes last.
    using Place = std::tuple<std::size_t, int, MTime, QString>;

    Place placeOf(const Clip* clip) const
    {
        const ClipTiming* const timing = timingOf(clip);
        return timing ? Place(indexOf(timing->track), timing->trackLevel, timing->timestamp, clipText(clip))
                      : Place(m_trackIndices.size() + 1, 0, 0, QString());
    }

    /// That of the first place where it is listed; one more than the last for what isn't.
    std::size_t indexOf(const Timeline::Track* track) const
    {
        const auto found = m_trackIndices.find(track);
        return found == m_trackIndices.end() ? m_trackIndices.size() : found->second;
    }

    void add(Kind kind, const Clip* clip, const QString& text) { m_faults.push_back({kind, clip, text}); }

    /// The sentence is one about the clip: "The clip "a" " is put before it.
    void addAbout(Kind kind, const Clip* clip, const QString& rest)
    {
        add(kind, clip, "The " + clipText(clip) + " " + rest);
    }

    const ClipTiming* timingOf(const Clip* clip) const
    {
        const auto found = m_timeline.clips.find(clip);
        return found == m_timeline.clips.end() || !clip ? nullptr : &found->second;
    }

    void findInTracks()
    {
        for (const Timeline::Track* const track : m_timeline.tracks) {
            if (!track) {
                add(Kind::TrackListedTwice, nullptr, "A track of the timeline is null.");
            } else if (!m_trackIndices.emplace(track, m_trackIndices.size()).second) {
                add(Kind::TrackListedTwice, nullptr, "A track of the timeline is listed twice.");
            } else if (track->timeline != &m_identity) {
                add(Kind::ForeignTrack, nullptr,
                    QString("The track %1 names %2 as its timeline.")
                        .arg(m_trackIndices.size())
                        .arg(track->timeline ? "another one" : "none"));
            }
        }
    }

    void findInClips()
    {
        m_laid.reserve(m_timeline.clips.size());
        for (const auto& [clip, timing] : m_timeline.clips) {
            if (!clip) {
                add(Kind::NoClip, nullptr, "A clip of the timeline is null.");
                continue;
            }
            if (m_trackIndices.count(timing.track) == 0) {
                addAbout(Kind::NoTrack, clip, "lies on no track of the timeline.");
            }
            findInTiming(clip, timing);
            if (clip->nestedTimeline) {
                m_nesting.push_back(clip);
            }
        }
    }

    void findNesting()
    {
        for (const Clip* const clip : endlessClips(m_identity, m_nesting)) {
            addAbout(Kind::ShowsItself, clip, "shows a timeline that shows itself.");
        }
    }

    void findInTiming(const Clip* clip, const ClipTiming& timing)
    {
        const bool isInRange = hasTimesInRange(timing);
        if (!isInRange) {
            addAbout(Kind::TimeOutOfRange, clip,
                     "has a time that is negative or later than " + timeText(LATEST_TIME) +
                         ", its start is " + timeText(timing.timestamp) + ".");
        }
        if (timing.duration <= MTime()) {
            addAbout(Kind::NoDuration, clip, "has no duration at " + timeText(timing.timestamp) + ".");
        }
        if (!isInRange || timing.duration <= MTime()) {
            return;
        }
        if (beyondSource(clip, timing) > SOURCE_ROUNDING) {
            addAbout(Kind::OutsideSource, clip,
                     "shows its source from " + timeText(timing.sourcePosition) + " to " +
                         timeText(timing.sourceEnd()) + ", but that lasts " +
                         timeText(timing.sourceDuration) + ".");
        }
        if (timing.transitionIn + timing.transitionOut > timing.duration) {
            addAbout(Kind::TooLongAtEnds, clip,
                     "lasts " + timeText(timing.duration) + ", which is less than its transitions.");
        }
        if (timing.fadeInDuration + timing.fadeOutDuration > timing.duration) {
            addAbout(Kind::TooLongAtEnds, clip,
                     "lasts " + timeText(timing.duration) + ", which is less than its fades.");
        }
        m_laid.push_back(
            {indexOf(timing.track), timing.track, timing.trackLevel, timing.timestamp, timing.end(), clip});
    }

    void findOverlaps()
    {
        std::sort(m_laid.begin(), m_laid.end(), isBefore);
        const Laid* longest = nullptr;
        for (const Laid& laid : m_laid) {
            const bool isSameLane = longest && longest->isInLaneOf(laid);
            if (isSameLane && laid.start < longest->end) {
                addAbout(Kind::Overlap, laid.clip,
                         "starts at " + timeText(laid.start) + ", before the " + clipText(longest->clip) +
                             " on the same track and level ends at " + timeText(longest->end) + ".");
            }
            if (!isSameLane || laid.end > longest->end) {
                longest = &laid;
            }
        }
    }

    void findInLinks()
    {
        for (const auto& [slave, link] : m_timeline.links) {
            const Clip* const present = timingOf(slave) ? slave : nullptr;
            if (!present || !timingOf(link.master)) {
                add(Kind::DanglingLink, present, "A link names a clip that is not on the timeline.");
            }
            if (!isWithin(link.offset, -LATEST_TIME)) {
                add(Kind::TimeOutOfRange, present,
                    "A link has an offset of more than " + timeText(LATEST_TIME) + ".");
            }
        }
        std::set<const Clip*> done;
        for (const auto& [slave, link] : m_timeline.links) {
            // Few masters have a master themselves.
            if (m_timeline.isSlave(link.master)) {
                findCycle(slave, done);
            }
        }
    }

    /// Goes from master to master, up to what was `done` before, and notes where it came by.
    void findCycle(const Clip* slave, std::set<const Clip*>& done)
    {
        std::set<const Clip*> way;
        while (m_timeline.isSlave(slave) && done.insert(slave).second) {
            way.insert(slave);
            slave = m_timeline.masterOf(slave);
        }
        if (way.count(slave) != 0) {
            const Clip* const first = firstOfCircle(slave);
            const Clip* const present = timingOf(first) ? first : nullptr;
            add(Kind::LinkCycle, present,
                present ? "The " + clipText(present) + " depends on itself by links."
                        : QString("A clip that is not on the timeline depends on itself by links."));
        }
    }

    const Clip* firstOfCircle(const Clip* clip) const
    {
        const Clip* first = clip;
        for (const Clip* other = m_timeline.masterOf(clip); other != clip;
             other = m_timeline.masterOf(other)) {
            first = placeOf(other) < placeOf(first) ? other : first;
        }
        return first;
    }

    void findInTrackings()
    {
        for (const auto& [clip, info] : m_timeline.trackingLinks) {
            const Clip* const present = timingOf(clip) ? clip : nullptr;
            if (!present || !timingOf(info.trackedObject.clip)) {
                add(Kind::DanglingTracking, present,
                    "A tracking link names a clip that is not on the timeline.");
            }
        }
    }

    void findInTransitions()
    {
        for (const auto& [transition, pair] : m_timeline.transitions) {
            const auto& [first, second] = pair;
            if (!transition || first == second) {
                add(Kind::TransitionOnNothing, nullptr, "A transition stands on no clip, or on one twice.");
                continue;
            }
            const ClipTiming* const outgoing = timingOf(first);
            const ClipTiming* const incoming = timingOf(second);
            if ((first && !outgoing) || (second && !incoming)) {
                add(Kind::DanglingTransition,
                    outgoing   ? first
                    : incoming ? second
                               : nullptr,
                    "A transition names a clip that is not on the timeline.");
                continue;
            }
            if (outgoing && incoming && !meet(*outgoing, *incoming)) {
                addAbout(Kind::TransitionApart, first,
                         "has a transition to the " + clipText(second) + ", which does not follow it at " +
                             timeText(outgoing->timestamp) + ".");
            }
            const MTime length = outgoing ? outgoing->transitionOut : incoming->transitionIn;
            note(m_outShares, first, length, "leave");
            note(m_inShares, second, length, "enter");
        }
    }

    bool meet(const ClipTiming& a, const ClipTiming& b) const
    {
        // Times that are out of range are not to be added; the difference of such a pair is left to that.
        const bool isInRange = isWithin(a.timestamp, 0) && isWithin(a.duration, 0);
        return !isInRange || a.placedSequentially(b);
    }

    void note(std::map<const Clip*, MTime>& shares, const Clip* clip, MTime share, const char* verb)
    {
        if (clip && !shares.emplace(clip, share).second) {
            addAbout(Kind::CrowdedTransition, clip, QString("has two transitions that %1 it.").arg(verb));
        }
    }

    void findWrongShares()
    {
        for (const auto& [clip, timing] : m_timeline.clips) {
            if (clip) {
                findWrongShare(clip, timing.transitionIn, m_inShares, "inbound");
                findWrongShare(clip, timing.transitionOut, m_outShares, "outbound");
            }
        }
    }

    void findWrongShare(const Clip* clip, MTime present, const std::map<const Clip*, MTime>& shares,
                        const char* direction)
    {
        const auto share = shares.find(clip);
        const bool hasTransition = share != shares.end();
        const bool isRight =
            hasTransition ? present == share->second && present > MTime() : present == MTime();
        if (!isRight) {
            addAbout(Kind::WrongShare, clip,
                     QString("gives %1 to an %2 transition %3.")
                         .arg(timeText(present), direction,
                              hasTransition ? "of another length" : "that isn't there"));
        }
    }

    const Timeline::Object& m_identity;
    const Timeline::Object& m_timeline;
    std::vector<TimelineFault> m_faults;
    std::map<const Timeline::Track*, std::size_t> m_trackIndices;
    std::vector<const Clip*> m_nesting;
    std::vector<Laid> m_laid;
    std::map<const Clip*, MTime> m_inShares;
    std::map<const Clip*, MTime> m_outShares;
};

} // namespace

MTime beyondSource(const Clip* clip, const ClipTiming& timing)
{
    if (clip->unlimitedDuration) {
        return 0;
    }
    return std::max({MTime(), -timing.sourcePosition, timing.sourceEnd() - timing.sourceDuration});
}

std::vector<TimelineFault> timelineFaults(const Timeline::Object& timeline)
{
    return timelineFaults(timeline, timeline);
}

std::vector<TimelineFault> timelineFaults(const Timeline::Object& timeline, const Timeline::Object& value)
{
    return FaultFinder(timeline, value).find();
}

} // namespace Host
