// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/timeline/Timeline.h>

#include <QString>

#include <map>
#include <string>
#include <vector>

namespace Host {

/// What a clip plays, for people to tell clips apart.
enum ClipKind : int
{
    UnknownKind,
    PictureKind,
    SoundKind,
    OverlayKind,
    QuizKind,
    NestedKind,
};

ClipKind kindOf(const Timeline::Clip& clip);
std::string kindText(ClipKind kind);
std::string roleText(TrackType type);

/// The clip's name, else that of its file, else what it is.
QString nameOf(const Timeline::Clip& clip);

/// Whether the track of a clip hides or silences it. A timeline from a file may be without what
/// Timeline::Object::isDisabledByTrack() relies on; the answer is false then.
bool isOffByTrack(const Timeline::Object& timeline, const Timeline::Clip& clip);

/// The part of the source that a clip shows, in the source's own time. Times from a file may be any: these
/// are reckoned so that they cannot overflow.
struct SourceStretch
{
    MTime from;
    MTime to;
    /// Native length divided by the present one; 0 where there is none.
    double speed;
};
SourceStretch sourceStretchOf(const Timeline::Clip& clip, const Timeline::ClipTiming& timing);

/// Timeline::Object::duration(), but without overflow where times from a file are any.
MTime lengthOf(const Timeline::Object& timeline);

/// A label of a clip.
struct ClipLabel
{
    const Timeline::Clip* clip;
    const Timeline::Label* label;
};

/// The contents of a timeline in an order that does not depend on addresses, by which people can name them:
/// tracks as the timeline lists them, clips by track, level and start, transitions by their clips. Numbers
/// count from 1. Null pointers are left out. The timeline must outlive it, and its containers stay as they
/// are.
class TimelineOutline
{
public:
    explicit TimelineOutline(const Timeline::Object& timeline);

    const Timeline::Object& timeline() const { return m_timeline; }

    /// Those that the timeline lists, each once; then those that only clips lie on.
    const std::vector<const Timeline::Track*>& tracks() const { return m_tracks; }
    /// How many of the tracks the timeline lists.
    std::size_t listedTracks() const { return m_listedTracks; }
    const std::vector<const Timeline::Clip*>& clips() const { return m_clips; }
    const std::vector<const Transition::Object*>& transitions() const { return m_transitions; }
    /// The clips that have a link, or a tracking link, in the order of the clips.
    const std::vector<const Timeline::Clip*>& slaves() const { return m_slaves; }
    const std::vector<const Timeline::Clip*>& followers() const { return m_followers; }
    /// By clip, position and name.
    const std::vector<ClipLabel>& labels() const { return m_labels; }

    /// 0 for what is not here.
    int numberOf(const Timeline::Clip* clip) const;
    int numberOf(const Timeline::Track* track) const;

private:
    void listTracks();
    void listClips();
    void listTransitions();
    void listLabels();
    template <class Value>
    std::vector<const Timeline::Clip*> inOrder(const std::map<const Timeline::Clip*, Value>& map) const;

    const Timeline::Object& m_timeline;
    std::vector<const Timeline::Track*> m_tracks;
    std::size_t m_listedTracks = 0;
    std::vector<const Timeline::Clip*> m_clips;
    std::map<const Timeline::Clip*, int> m_clipNumbers;
    std::vector<const Transition::Object*> m_transitions;
    std::vector<const Timeline::Clip*> m_slaves;
    std::vector<const Timeline::Clip*> m_followers;
    std::vector<ClipLabel> m_labels;
};

} // namespace Host
