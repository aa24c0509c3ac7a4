// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/timeline/Timeline.h>

#include <QString>

#include <functional>
#include <map>
#include <memory>
#include <set>
#include <vector>

namespace Host {

/// Thrown by a step of an edit that cannot be taken. One sentence for people.
struct EditRefused
{
    QString why;
};

/// A level of a track: clips on it follow one another.
struct Lane
{
    const Timeline::Track* track;
    int level;

    bool holds(const Timeline::ClipTiming& timing) const
    {
        return timing.track == track && timing.trackLevel == level;
    }
};

/// The timeline as an edit will leave it. The steps change what they say, and links, tracking links and
/// transitions that name the same clips; finish() follows up on the rest.
class EditDraft
{
public:
    using Clips = std::set<const Timeline::Clip*>;

    /// The timeline must outlive the draft, and stay as it is.
    explicit EditDraft(const Timeline::Object& before) : m_before(before), m_timeline(before) {}

    /// The one that is edited, whose address clips and tracks may name.
    const Timeline::Object& edited() const { return m_before; }
    Timeline::Object& timeline() { return m_timeline; }
    const Timeline::Object& timeline() const { return m_timeline; }
    /// For writing.
    Timeline::ClipTiming& timing(const Timeline::Clip* clip);
    /// Says that the clip has got another length or stretch, so that finish() looks after its ends.
    void noteRetimed(const Timeline::Clip* clip) { m_retimed.push_back(clip); }

    std::vector<const Timeline::Clip*> nativeAudioOf(const Timeline::Clip* master) const;
    /// Those that start at `from` or behind.
    Clips laterClips(const Lane& lane, MTime from) const;
    /// The clips and all that depends on them. `fixed` is left out, and what comes in through it alone.
    Clips withDependants(const Clips& clips, const Timeline::Clip* fixed = nullptr) const;

    /// Refused where one of them may not be moved.
    void shift(const Clips& clips, MTime delta);
    /// Moves the later clips of the lane with what depends on them, all but `fixed`.
    void ripple(const Lane& lane, MTime from, MTime delta, const Timeline::Clip* fixed = nullptr);

    /// The offset is what the two are apart.
    void link(const Timeline::Clip* master, const Timeline::Clip* slave);
    void unlink(const Timeline::Clip* slave);
    /// Takes the clips out with all that names them.
    void erase(const Clips& clips);
    void eraseWithNativeAudio(const Clips& clips);
    /// Splits the clip, its native audio too, at a time within it. Slaves and followers that start at the cut
    /// or behind go over to the right part. Returns that.
    const Timeline::Clip* cut(const Timeline::Clip* clip, MTime at);
    /// These let the end that is cut off go with its transition and its fade.
    void cutHead(const Timeline::Clip* clip, MTime newStart);
    void cutTail(const Timeline::Clip* clip, MTime newEnd);
    /// Enters native audio for a clip that is there. Refused where there is nothing for it to play.
    void addNativeAudio(const Timeline::Clip* master, const Timeline::Clip* audio);

    /// Brings native audio, fades, transitions and the offsets of links after what was done.
    void finish();
    /// The clips that the draft has made, for whoever keeps the timeline.
    std::vector<std::unique_ptr<Timeline::Clip>> takeMade() { return std::move(m_made); }

private:
    /// What a cut has left of a clip.
    struct Parts
    {
        const Timeline::Clip* left;
        const Timeline::Clip* right;
    };

    const Timeline::Clip* makeCopy(const Timeline::Clip* clip);
    /// How far the clips of a slave's link lay apart when its offset was right.
    MTime formerDistance(const Timeline::Clip* slave) const;
    /// Gives the slave another master; the offset changes by as much as the masters lie apart.
    void relink(const Timeline::Clip* slave, const Timeline::Clip* master);
    const Timeline::Clip* cutAlone(const Timeline::Clip* clip, MTime at);
    /// Gives the right part what lies with it, and cuts native audio. Returns the parts of that.
    std::vector<Parts> handOverSlaves(const Parts& parts);
    void handOverFollowers(const Parts& parts);
    /// With their slaves and the slaves of those, all that are accepted.
    Clips withSlaves(const Clips& clips, const std::function<bool(const Timeline::Clip*)>& isAccepted) const;

    void retimeNativeAudio();
    void limitFades();
    void limitTransitions();
    void limitTransition(const Transition::Object* transition);
    void updateOffsets();

    const Timeline::Object& m_before;
    Timeline::Object m_timeline;
    std::vector<const Timeline::Clip*> m_retimed;
    /// Those whose timing may differ from the one before.
    Clips m_touched;
    /// The former distances of the links that the draft has made or changed, by their slaves.
    std::map<const Timeline::Clip*, MTime> m_formerDistances;
    std::vector<std::unique_ptr<Timeline::Clip>> m_made;
};

/// How long a transition of the wished length, -1 for none, comes out on the pair: as long as is expected,
/// but no longer than is available.
MTime fittingLength(const Timeline::Object& timeline, const Transition::Object* transition,
                    const Timeline::ClipPair& pair, MTime wish);
/// The transitions at the clip's ends leave room for each other. True for null.
bool hasRoomForTransitions(const Timeline::Object& timeline, const Timeline::Clip* clip);

} // namespace Host
