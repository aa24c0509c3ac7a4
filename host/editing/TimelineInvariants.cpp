// SPDX-License-Identifier: Apache-2.0
#include "host/editing/TimelineInvariants.h"

#include "host/editing/EditText.h"

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
    const Timeline::Track* track;
    int level;
    MTime start;
    MTime end;
    const Clip* clip;

    bool isInLaneOf(const Laid& other) const { return track == other.track && level == other.level; }
};

bool isBefore(const Laid& a, const Laid& b)
{
    if (a.track != b.track) {
        return std::less<const Timeline::Track*>()(a.track, b.track);
    }
    return std::tie(a.level, a.start, a.end) < std::tie(b.level, b.start, b.end);
}

class FaultFinder
{
public:
    explicit FaultFinder(const Timeline::Object& timeline) : m_timeline(timeline) {}

    std::vector<TimelineFault> find()
    {
        findInTracks();
        findInClips();
        findOverlaps();
        findInLinks();
        findInTrackings();
        findInTransitions();
        findWrongShares();
        std::stable_sort(m_faults.begin(), m_faults.end(),
                         [](const TimelineFault& a, const TimelineFault& b) { return a.kind < b.kind; });
        return std::move(m_faults);
    }

private:
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
        for (auto track = m_timeline.tracks.begin(); track != m_timeline.tracks.end(); ++track) {
            if (!*track) {
                add(Kind::TrackListedTwice, nullptr, "A track of the timeline is null.");
            } else if (std::find(m_timeline.tracks.begin(), track, *track) != track) {
                add(Kind::TrackListedTwice, nullptr, "A track of the timeline is listed twice.");
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
            if (!timing.track || !m_timeline.contains(timing.track)) {
                addAbout(Kind::NoTrack, clip, "lies on no track of the timeline.");
            }
            findInTiming(clip, timing);
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
        m_laid.push_back({timing.track, timing.trackLevel, timing.timestamp, timing.end(), clip});
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
            const Clip* const present = timingOf(slave) ? slave : nullptr;
            add(Kind::LinkCycle, present,
                present ? "The " + clipText(present) + " depends on itself by links."
                        : QString("A clip that is not on the timeline depends on itself by links."));
        }
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

    const Timeline::Object& m_timeline;
    std::vector<TimelineFault> m_faults;
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
    return FaultFinder(timeline).find();
}

} // namespace Host
