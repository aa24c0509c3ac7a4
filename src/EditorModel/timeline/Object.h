// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/media/Audio.h>
#include <EditorModel/media/Video.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/timeline/ClipTiming.h>
#include <EditorModel/timeline/Link.h>
#include <EditorModel/timeline/Track.h>
#include <EditorModel/timeline/TrackingLink.h>
#include <EditorModel/types/MTime.h>
#include <EditorModel/types/Range.h>

#include <QSet>
#include <QString>
#include <QtGlobal>

#include <cstddef>
#include <deque>
#include <initializer_list>
#include <map>
#include <set>
#include <utility>

namespace Composition {
struct Object;
struct Range;
} // namespace Composition

namespace Transition {
class Object;
}

namespace Timeline {

struct Clip;

/// The outgoing clip first, then the incoming one; either may be null.
using ClipPair = std::pair<const Clip*, const Clip*>;

/// Clips may lie on such a track at one time, each on a level of its own. It is told from the bits: of the
/// named types only the primary track and the native audio track have a single level, and so has 0.
EDITORMODEL_EXPORT bool isMultilevelTrack(TrackType type);
/// The track must not be null.
EDITORMODEL_EXPORT bool isMultilevelTrack(const Track* track);

/// Puts `track` in the place of `target`, and moves those in between by one towards the place that it left:
/// on its way to the back it comes to stand behind `target`, on its way to the front before it. The first
/// occurrence of each counts; where one of them isn't listed, nothing moves.
EDITORMODEL_EXPORT void displaceTrack(std::deque<const Track*>& tracks, const Track* track,
                                      const Track* target);

/// The timeline: which clips lie on it and when, the order of its tracks, and what hangs together. As a video
/// and an audio format it is the format of its own output.
///
/// Nothing that the pointers name is owned. Sets and maps are in the order of the addresses, which is another
/// one in every run; only the order of `tracks` is part of the document.
///
/// An operation changes what its name says and keeps nothing else in step: a clip that is removed leaves its
/// links and transitions, and one that is moved is checked against nothing. The modules ask the predicates
/// first and follow up.
///
/// A clip that is not on the timeline: operations that set part of a timing enter the clip with a default
/// timing first. Queries are strict, and throw `std::out_of_range("invalid map<K, T> key")`, or lenient, and
/// answer false or null; each says which. Queries walk their containers at the time of the call.
///
/// Times and durations are in the time of the timeline. Every operation that changes the timeline returns it,
/// for chains.
struct EDITORMODEL_EXPORT Object : public virtual Serialize::ISerializable,
                                   public virtual PubSub::Object,
                                   public virtual Media::Video,
                                   public virtual Media::Audio
{
    EDITORMODEL_PERSISTENT(Object)

public:
    /// The scopes belong to the modules; other values are reached by a cast.
    enum Scope : int
    {
        DefaultScope = 0,
    };

    /// Lives in memory only, as do the next three: in a loaded timeline they have their defaults.
    Scope scope = DefaultScope;
    QString reservedText;
    const Composition::Object* composition = nullptr;
    /// Not read by the model.
    bool markerUpdateEnabled = true;
    std::map<const Clip*, ClipTiming> clips;
    /// By slave; the link names the master.
    std::map<const Clip*, Link> links;
    /// By the clip that follows; the link names what it follows.
    std::map<const Clip*, TrackingLinkInfo> trackingLinks;
    /// The length of a transition stands in the timings of its clips.
    std::map<const Transition::Object*, ClipPair> transitions;
    std::deque<const Track*> tracks;
    /// Ranges of the composition that are to be exported. Live in memory only, as do the next two.
    std::set<const Composition::Range*> exportRanges;
    qint64 reservedFirst = 0;
    qint64 reservedSecond = 0;

    Object() = default;
    Object(const Object&) = default;
    Object(Object&&) = default;
    Object& operator=(const Object&) = default;
    Object& operator=(Object&& other) noexcept;
    ~Object() override;

    // Clips. All but removeClip() and clearClips() enter a clip that isn't there.

    /// Enters the clip, or replaces its whole timing.
    Object* addClip(const Clip* clip, const ClipTiming& timing);
    /// The same as addClip().
    Object* moveClip(const Clip* clip, const ClipTiming& timing);
    Object* moveClip(const Clip* clip, MTime timestamp);
    /// Links, tracking links and transitions of the clip stay.
    Object* removeClip(const Clip* clip);
    Object* clearClips();
    /// Moves the left edge to the right by `delta`, and the start in the source with it.
    Object* resizeClipLeft(const Clip* clip, MTime delta);
    /// Moves the right edge to the right by `delta`.
    Object* resizeClipRight(const Clip* clip, MTime delta);
    /// Turns the clip's stretch of its source round; start and duration stay.
    Object* reverseClip(const Clip* clip);
    Object* setClipDuration(const Clip* clip, MTime duration);
    Object* setClipSourcePosition(const Clip* clip, MTime position);
    Object* setClipFadeInDuration(const Clip* clip, MTime duration);
    Object* setClipFadeOutDuration(const Clip* clip, MTime duration);
    Object* setClipTrack(const Clip* clip, const Track* track);
    Object* setClipTrackLevel(const Clip* clip, int level);
    Object* setClipSpeedCompensated(const Clip* clip, bool on);
    /// The speed is absolute: 1 plays the source as it is. Scales the duration and the place in the source;
    /// start, transitions and fades stay. The clip must not be null, and neither its source duration nor that
    /// of its timing 0.
    Object* setClipSpeed(const Clip* clip, double speed);

    /// False on a native audio track and for clips of the three intro types. Strict.
    bool canEditTiming(const Clip* clip) const;
    /// Whether the clip can be cut `offset` behind its start: there must be Clip::MIN_DURATION or more from
    /// the inbound transition to the cut, and more than that from the cut to the outbound transition. False
    /// where canEditTiming() is. Strict, as that is.
    bool canSplit(const Clip* clip, MTime offset) const;

    // Tracks

    /// Appends the track, also one that is listed already.
    Object* addTrack(const Track* track);
    /// Takes out every occurrence. The clips on the track stay, on it.
    Object* removeTrack(const Track* track);
    /// Removes the clips on the track; their links, tracking links and transitions stay.
    Object* clearTrack(const Track* track);
    /// The clips stay, on their tracks.
    Object* clearTracks();
    /// The two are different tracks of one type. Null can't be moved, nor moved to. Nothing asks whether the
    /// two are listed.
    bool canMoveTrack(const Track* track, const Track* target) const;
    /// displaceTrack() where canMoveTrack() holds, no change otherwise.
    Object* moveTrack(const Track* track, const Track* target);

    /// The first track of the role, or null.
    const Track* primaryTrack() const;
    const Track* extraVideoTrack() const;
    const Track* nativeAudioTrack() const;
    const Track* titleTrack() const;
    const Track* quizTrack() const;
    /// Audio tracks have two roles, told apart by Track::linked.
    const Track* linkedAudioTrack() const;
    const Track* detachedAudioTrack() const;

    // Links

    /// A slave has one master: a new link replaces the old one.
    Object* addLink(const Clip* master, const Clip* slave, MTime offset);
    Object* removeLink(const Clip* slave);
    Object* clearLinks();

    // Other state

    Object* addExportRange(const Composition::Range* range);
    Object* removeExportRange(const Composition::Range* range);
    Object* setScope(Scope newScope);
    Object* setMarkerUpdateEnabled(bool on);
    Object* setComposition(const Composition::Object* newComposition);

    // Queries on clips

    /// Good until the clip is removed. Strict.
    const ClipTiming& clipTiming(const Clip* clip) const;
    /// The clip is on the timeline. Lenient.
    bool contains(const Clip* clip) const;
    /// 1 where the source plays as it is, 2 where it plays twice as fast; infinite or not-a-number where the
    /// timing's source duration is 0. Strict; the clip must not be null.
    double clipSpeed(const Clip* clip) const;
    /// The clips with at least one of the type bits in `mask`.
    std::set<const Clip*> clipsByType(int mask) const;
    /// The clips that are here and not in `other`, which is not null, by address; timings are not compared.
    std::set<const Clip*> clipsDifference(const Object* other) const;
    std::set<const Clip*> clipsAt(const Track* track) const;
    /// The clips of the track with `time` in [start, end): unlike in ClipTiming::contains(), the end is open.
    std::set<const Clip*> clipsAt(const Track* track, MTime time) const;

    // Queries on the whole timeline

    /// The end of the clip that ends last; 0 without clips.
    MTime duration() const;
    /// The same as duration().
    MTime lastClipTimestamp() const;
    /// The first start or end of any clip behind `time`, that is strictly greater; `time` if there is none.
    MTime nextClipBoundary(MTime time) const;
    /// The last start or end of any clip before `time`, that is strictly less; `time` if there is none.
    MTime prevClipBoundary(MTime time) const;

    // Queries on tracks

    /// The track is listed.
    bool contains(const Track* track) const;
    /// The place in `tracks`, from 0; the number of tracks for one that is not listed.
    std::size_t trackIndex(const Track* track) const;
    /// Null if there is none.
    const Track* findFirstTrack(TrackType type) const;
    /// In the order of `tracks`, as all three.
    std::deque<const Track*> findTracks(TrackType type) const;
    std::deque<const Track*> findTracks(std::initializer_list<TrackType> types) const;
    std::deque<const Track*> findUsedTracks(TrackType type) const;
    /// No clip lies on the track; so also for an unknown one.
    bool isTrackEmpty(const Track* track) const;
    /// The clips of the track by their start, those with one start in the order of their addresses.
    std::multimap<MTime, const Clip*> trackTiming(const Track* track) const;
    /// The end of the clip that starts last, and of several such clips the last of their ends; 0 without
    /// clips. A clip that starts earlier and ends later doesn't count. Strict on the clips that start last.
    MTime trackDuration(const std::multimap<MTime, const Clip*>& timing) const;
    MTime trackDuration(const Track* track) const;

    // Queries on links

    /// Lenient.
    bool isSlave(const Clip* clip) const;
    /// Null also for a slave whose link names none. Lenient.
    const Clip* masterOf(const Clip* clip) const;
    std::set<const Clip*> findSlaves(const Clip* master) const;
    /// The clip, on the timeline or not, then its slaves, then theirs, and so on; slaves of one master in the
    /// order of their addresses. Each clip is listed once, also where links that should not form a cycle do.
    std::deque<const Clip*> clipHeap(const Clip* clip) const;
    /// Slaves without a master are listed under null.
    std::map<const Clip*, std::set<const Clip*>> master2slaves() const;
    /// Of the slaves on the track; their masters may lie on any. Slaves without a master are left out.
    std::map<const Clip*, std::set<const Clip*>> master2slaves(const Track* track) const;
    /// The clip lies on a native audio track; false without a track. Strict.
    bool isNativeAudio(const Clip* clip) const;
    /// The first slave of the clip, by address, on a native audio track; null if there is none. Strict on the
    /// slaves that the walk meets.
    const Clip* findNativeAudio(const Clip* master) const;
    /// The clip's track hides it, or silences it; a native audio clip is silenced with its master's track as
    /// well. False for a clip that is not on the timeline or of more than one type. The track of a picture or
    /// an overlay must not be null. Strict on the master of a native audio clip.
    bool isDisabledByTrack(const Clip* clip) const;

    // Transitions. An unknown transition: removeTransition() and setTransitionDuration() throw as strict
    // queries do, the queries answer as they say.

    /// Enters the transition as long as expectedTransitionDuration() says, -1 being no wish. Transitions that
    /// leave the outgoing or enter the incoming clip already are removed. A pair of one clip or of nulls is
    /// ignored. The transition must not be null. Strict on the clips.
    Object* addTransition(const Transition::Object* transition, const ClipPair& pair, MTime duration);
    /// Also takes its share out of the timings of its clips; those that aren't there are entered.
    Object* removeTransition(const Transition::Object* transition);
    /// Removes one after another, as removeTransition() does.
    Object* clearTransitions();
    /// Without limits. Between two clips each gets half, and an odd millisecond is lost; otherwise the one
    /// clip gets all. Clips that aren't there are entered.
    Object* setTransitionDuration(const Transition::Object* transition, MTime duration);

    bool hasTransition(const Transition::Object* transition) const;
    bool hasTransition(const Clip* first, const Clip* second) const;
    /// The first by address with exactly this pair, nulls included; null if there is none.
    const Transition::Object* transitionOf(const Clip* first, const Clip* second) const;
    /// The first by address into the clip; null if there is none, and for null.
    const Transition::Object* inboundTransitionOf(const Clip* clip) const;
    /// The first by address out of the clip; null if there is none, and for null.
    const Transition::Object* outboundTransitionOf(const Clip* clip) const;
    /// A pair of nulls for an unknown transition.
    ClipPair transitionClipPair(const Transition::Object* transition) const;
    /// What the transition covers; the default range for an unknown one or for a pair of nulls. Strict on
    /// the clips.
    Types::Range transitionRange(const Transition::Object* transition) const;

    /// How long a transition may be at most: there is Clip::MIN_DURATION between it and a transition at the
    /// other end of a clip. Never less than Clip::MIN_DURATION; -1 for a pair of one clip or of nulls. Strict
    /// on the clips.
    MTime availableTransitionDuration(const ClipPair& pair) const;
    /// -1 for an unknown transition.
    MTime availableTransitionDuration(const Transition::Object* transition) const;
    /// How long a transition on this pair comes out. `duration` is the wish; -1 is none, and stands for the
    /// length of the transition in place, or else for the default, of which a one-sided transition takes
    /// half. Never less than Clip::MIN_DURATION but for a pair of one clip or of nulls, where the wish comes
    /// back; even between two clips. Transitions in `ignored` count as if they weren't there. Strict on the
    /// clips.
    MTime expectedTransitionDuration(const ClipPair& pair, MTime defaultDuration, MTime duration,
                                     const QSet<const Transition::Object*>& ignored) const;
    MTime expectedTransitionDuration(const ClipPair& pair, MTime defaultDuration, MTime duration) const;

    // Tracking links. What is unknown erases nothing.

    /// A clip follows one object: a new link replaces the old one.
    Object* addTrackingLink(const Clip* clip, const TrackingLinkInfo& info);
    /// The link of the clip that follows, good until the map changes; null if it has none. Lenient.
    const TrackingLinkInfo* getTrackingLink(const Clip* clip) const;
    /// The link of the clip that follows.
    Object* removeTrackingLink(const Clip* clip);
    /// Every link to this tracked object.
    Object* removeTrackingLink(const QString& trackingId);
    /// Every link that follows something in the clip; the clip's own link stays.
    Object* clearTrackingLinks(const Clip* clip);
    Object* clearTrackingLinks();
};

} // namespace Timeline

EDITORMODEL_ARCHIVE_NAME(Timeline::Object, "Timeline::Object")
