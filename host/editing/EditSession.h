// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/View.h>
#include <EditorModel/timeline/Timeline.h>

#include <QString>

#include <deque>
#include <functional>
#include <memory>

namespace Overlay {
class Preset;
}
namespace Transition {
class Object;
}

namespace Host {

class EditDraft;

/// What became of a move.
struct [[nodiscard]] EditResult
{
    /// Why the move was refused: one sentence that names the clip and the time. Empty if it was done.
    QString refusal;
    /// The clip that the move is about; after a split the part to the right.
    const Timeline::Clip* clip = nullptr;

    explicit operator bool() const { return refusal.isEmpty(); }
};

/// A clip, and where and what of it is to be laid. The start is given with the move.
struct Placement
{
    const Timeline::Clip* clip = nullptr;
    const Timeline::Track* track = nullptr;
    int level = 0;
    /// The shown stretch, at native speed.
    MTime sourcePosition;
    /// -1 is all that there is of the source from `sourcePosition` on.
    MTime duration = -1;
    /// If it is not null it goes onto the native audio track, below the clip, and is linked to it.
    const Timeline::Clip* nativeAudio = nullptr;

    Placement() = default;
    Placement(const Timeline::Clip* clip_, const Timeline::Track* track_, int level_ = 0,
              MTime sourcePosition_ = 0, MTime duration_ = -1, const Timeline::Clip* nativeAudio_ = nullptr);
};

/// What becomes of the clips behind the one that changes its length.
enum class Ripple
{
    No,  ///< they stay; a clip that would reach into them is refused
    Yes, ///< they keep their distance, and so the transitions to them
};

/// The module that edits one timeline: it holds the policy that the timeline itself leaves to its editors.
///
/// A move is done as a whole, and announced as one change, or it is refused and changes nothing. It is
/// refused for a reason of its own, which each move tells, or since it would leave one of the faults that
/// TimelineFault lists, such as an overlap. A timeline that has a fault from the start can't be edited; all
/// moves are refused with it.
///
/// What holds for all moves:
/// - A lane is a level of a track. A ripple moves the later clips of the lane: those that start where the
///   edited stretch ended or behind.
/// - A clip that is moved takes along all that depends on it by links, on whatever track. A slave stays where
///   it is while its master is trimmed or retimed. The offset of a link grows by as much as the slave moves
///   against its master.
/// - Native audio, that is a slave on a native audio track, plays what its master shows as far as its source
///   goes, at the same place. It can't be edited by itself. It goes where there is nothing for it to play.
/// - A clip whose timing can't be edited isn't moved, trimmed, cut, retimed or overwritten, but it may be
///   removed, faded, linked and given transitions.
/// - A transition between clips that don't meet any more is removed. Where a clip has got another length its
///   transitions, the inbound one first, are limited to what is available then, and removed if they don't fit
///   even so. Fades are cut to the clip, the fade-out first.
/// - No piece of a clip that a move leaves is shorter than Clip::MIN_DURATION.
/// - Sound lies on audio tracks, pictures and overlays on others. A track without a role takes anything, and
///   a clip of no single type may lie anywhere.
///
/// Requests from other modules to change the timeline are granted if they leave no fault; requests to remove
/// it are refused. What an observer throws passes through the move, which is done then; from the destructor
/// it ends the process.
///
/// A timeline has one session at a time. One that is made for a timeline that any view owns already, that of
/// another session above all, refuses all moves for good.
class EditSession : private Message::View<Timeline::Object>
{
public:
    /// With a timeline of its own, empty.
    EditSession();
    /// The timeline stays the caller's, and outlives the session. What the session made is freed with the
    /// session: store the timeline before.
    explicit EditSession(Timeline::Object* timeline);
    EditSession(const EditSession&) = delete;
    /// Ends the sharing of the timeline.
    ~EditSession() override;

    const Timeline::Object* timeline() const { return m_timeline; }

    /// A clip that belongs to the session and names its timeline; it is on the timeline when it is placed.
    /// Fill in type and source before. The same for tracks and transitions.
    Timeline::Clip* makeClip(Timeline::Clip::ClipType type);
    Timeline::Track* makeTrack(TrackType type);
    Transition::Object* makeTransition(const QString& id);
    /// A copy that belongs to the session, for its clips to show.
    Overlay::Preset* makeOverlay(const Overlay::Preset& preset);

    // Placing a clip that is not on the timeline yet, and names no other one. Refused where the stretch isn't
    // in the source, the track can't take the clip, or the clip shows this timeline, directly or not.

    /// At the end of its lane.
    EditResult append(const Placement& what);
    /// The later clips of the lane make room. A clip that lies across `at` is split, and the move is refused
    /// where it can't be.
    EditResult insert(const Placement& what, MTime at);
    /// What lies under it on the lane is trimmed, split or removed, with its native audio; leftovers shorter
    /// than Clip::MIN_DURATION go too. A transition or a fade at an end that is cut off goes. Slaves of
    /// removed clips stay and are slaves no more.
    EditResult overwrite(const Placement& what, MTime at);

    // Removing. With the clip goes all that depends on it, and what leads to, from or between those.

    /// Leaves a gap.
    EditResult lift(const Timeline::Clip* clip);
    /// The later clips of the lane close the gap.
    EditResult extract(const Timeline::Clip* clip);

    // Changing clips

    /// At a time of the timeline, where Timeline::Object::canSplit() allows. The right part is a copy of the
    /// clip, made by the session. It takes over the fade-out, the outbound transition, and what follows or
    /// depends on the clip and starts at the cut or behind; it depends on and follows what the clip does.
    EditResult split(const Timeline::Clip* clip, MTime at);
    /// Takes `delta` off the start; a negative one gives more of the source. With ripple the clip's start
    /// stays and the later clips move.
    EditResult trimLeft(const Timeline::Clip* clip, MTime delta, Ripple ripple = Ripple::No);
    /// Takes `delta` off the end; a negative one gives more of the source.
    EditResult trimRight(const Timeline::Clip* clip, MTime delta, Ripple ripple = Ripple::No);
    /// To a start on the same lane.
    EditResult move(const Timeline::Clip* clip, MTime at);
    /// To another lane as well; what depends on the clip keeps its tracks.
    EditResult move(const Timeline::Clip* clip, MTime at, const Timeline::Track* track, int level);
    /// Absolute: 1 plays the source as it is. The start stays.
    EditResult setSpeed(const Timeline::Clip* clip, double speed, Ripple ripple = Ripple::No);
    /// Start and end stay.
    EditResult reverse(const Timeline::Clip* clip);
    /// Refused where the two are longer than the clip.
    EditResult setFades(const Timeline::Clip* clip, MTime fadeIn, MTime fadeOut);

    // Transitions

    /// One of the pair may be null; if none is, the second must follow the first without a gap. What leaves
    /// the one or enters the other already is replaced. The wish, -1 for none, is limited to what is
    /// available. A transition that is there already may be given another length, but not another pair.
    EditResult addTransition(const Transition::Object* transition, const Timeline::ClipPair& pair,
                             MTime wish = -1);
    EditResult removeTransition(const Transition::Object* transition);

    // Tracks

    /// At the end. The track names this timeline.
    EditResult addTrack(const Timeline::Track* track);
    /// To the place of a track of the same type.
    EditResult moveTrack(const Timeline::Track* track, const Timeline::Track* target);
    /// With its clips, each as lift() takes it; native audio goes with its track.
    EditResult removeTrack(const Timeline::Track* track);

    // Links

    /// The slave keeps its place and loses its former master. Refused where the master depends on the slave.
    EditResult link(const Timeline::Clip* master, const Timeline::Clip* slave);
    EditResult unlink(const Timeline::Clip* slave);

    // Tracking links

    /// The clip follows what a tracking has found in another one, and no longer what it followed before.
    /// Refused for sound, where the other clip doesn't list the tracking, and where that one follows the clip
    /// in turn.
    EditResult follow(const Timeline::Clip* clip, const Timeline::TrackingLinkInfo& info);
    EditResult unfollow(const Timeline::Clip* clip);

private:
    using TimelineView = Message::View<Timeline::Object>;

    void changeRequested(Timeline::Object* timeline, Timeline::Object* value) override;
    void removeRequested(Timeline::Object* timeline) override;

    /// Edits a draft, which says why it refuses by throwing, and commits it if it has no fault.
    EditResult edit(const Timeline::Clip* clip, const std::function<void(EditDraft&)>& steps);
    void commit(EditDraft& draft);

    std::unique_ptr<Timeline::Object> m_own;
    Timeline::Object* m_timeline;
    /// Why all moves are refused; empty where they aren't.
    QString m_refusal;
    /// They outlive the timeline's use of them, since old values name them.
    std::deque<std::unique_ptr<Timeline::Clip>> m_clips;
    std::deque<std::unique_ptr<Timeline::Track>> m_tracks;
    std::deque<std::unique_ptr<Transition::Object>> m_transitions;
    std::deque<std::unique_ptr<Overlay::Preset>> m_overlays;
};

} // namespace Host
