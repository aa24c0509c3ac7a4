// SPDX-License-Identifier: Apache-2.0
#include "host/timeline/TimelineOutline.h"

#include <EditorModel/effects/Transition.h>
#include <EditorModel/media/File.h>

#include <QFileInfo>

#include <algorithm>
#include <tuple>

namespace Host {
namespace {

using Timeline::Clip;
using Timeline::ClipTiming;
using Timeline::Track;

template <class T>
void addOnce(std::vector<const T*>& list, const T* object)
{
    if (std::find(list.begin(), list.end(), object) == list.end()) {
        list.push_back(object);
    }
}

} // namespace

ClipKind kindOf(const Clip& clip)
{
    if (clip.nestedTimeline) {
        return NestedKind;
    }
    if (clip.quiz) {
        return QuizKind;
    }
    if (clip.isOverlayClip()) {
        return OverlayKind;
    }
    if (clip.isAudioClip()) {
        return SoundKind;
    }
    return clip.isVideoClip() ? PictureKind : UnknownKind;
}

std::string kindText(ClipKind kind)
{
    switch (kind) {
    case PictureKind:
        return "picture";
    case SoundKind:
        return "sound";
    case OverlayKind:
        return "overlay";
    case QuizKind:
        return "quiz";
    case NestedKind:
        return "timeline";
    default:
        return "-";
    }
}

std::string roleText(TrackType type)
{
    switch (type) {
    case PrimaryTrack:
        return "primary";
    case ExtraVideoTrack:
        return "extra video";
    case NativeAudioTrack:
        return "native audio";
    case AudioTrack:
        return "audio";
    case TitleTrack:
        return "title";
    case QuizTrack:
        return "quiz";
    default:
        return "-";
    }
}

QString nameOf(const Clip& clip)
{
    if (!clip.name.isEmpty()) {
        return clip.name;
    }
    const QString fileName = clip.file ? QFileInfo(clip.file->path).fileName() : QString();
    return fileName.isEmpty() ? QString::fromStdString(kindText(kindOf(clip))) : fileName;
}

bool isOffByTrack(const Timeline::Object& timeline, const Clip& clip)
{
    const auto found = timeline.clips.find(&clip);
    if (found == timeline.clips.end() || !found->second.track) {
        return false;
    }
    const bool needsMaster = clip.isAudioClip() && found->second.track->type == NativeAudioTrack;
    if (needsMaster && !timeline.contains(timeline.masterOf(&clip))) {
        return found->second.track->muted;
    }
    return timeline.isDisabledByTrack(&clip);
}

SourceStretch sourceStretchOf(const Clip& clip, const ClipTiming& timing)
{
    const auto native = static_cast<double>(clip.sourceDuration.ms());
    const auto scaled = static_cast<double>(timing.sourceDuration.ms());
    if (native <= 0.0 || scaled <= 0.0) {
        return {timing.sourcePosition, timing.sourcePosition, 0.0};
    }
    const double scale = scaled / native;
    const auto position = static_cast<double>(timing.sourcePosition.ms());
    const double from = position / scale;
    const double to = (position + static_cast<double>(timing.duration.ms())) / scale;
    const double speed = native / scaled;
    return timing.reversed
               ? SourceStretch{MTime::fromMsRound(native - to), MTime::fromMsRound(native - from), speed}
               : SourceStretch{MTime::fromMsRound(from), MTime::fromMsRound(to), speed};
}

MTime lengthOf(const Timeline::Object& timeline)
{
    double end = 0.0;
    for (const auto& entry : timeline.clips) {
        end = std::max(end, static_cast<double>(entry.second.timestamp.ms()) +
                                static_cast<double>(entry.second.duration.ms()));
    }
    return MTime::fromMsRound(end);
}

TimelineOutline::TimelineOutline(const Timeline::Object& timeline) : m_timeline(timeline)
{
    listTracks();
    listClips();
    listTransitions();
    m_slaves = inOrder(timeline.links);
    m_followers = inOrder(timeline.trackingLinks);
    listLabels();
}

/// The clips that are keys of a map, those that are not on the timeline last.
template <class Value>
std::vector<const Clip*> TimelineOutline::inOrder(const std::map<const Clip*, Value>& map) const
{
    std::vector<const Clip*> found;
    for (const auto& entry : map) {
        if (entry.first) {
            found.push_back(entry.first);
        }
    }
    const auto place = [this](const Clip* clip) { return static_cast<unsigned>(numberOf(clip)) - 1; };
    std::stable_sort(found.begin(), found.end(),
                     [&place](const Clip* a, const Clip* b) { return place(a) < place(b); });
    return found;
}

int TimelineOutline::numberOf(const Clip* clip) const
{
    const auto found = m_clipNumbers.find(clip);
    return found == m_clipNumbers.end() ? 0 : found->second;
}

int TimelineOutline::numberOf(const Track* track) const
{
    const auto found = std::find(m_tracks.begin(), m_tracks.end(), track);
    return found == m_tracks.end() ? 0 : static_cast<int>(found - m_tracks.begin()) + 1;
}

void TimelineOutline::listTracks()
{
    for (const Track* track : m_timeline.tracks) {
        if (track) {
            addOnce(m_tracks, track);
        }
    }
    m_listedTracks = m_tracks.size();
    for (const auto& [clip, timing] : m_timeline.clips) {
        if (clip && timing.track) {
            addOnce(m_tracks, timing.track);
        }
    }
}

void TimelineOutline::listClips()
{
    struct Place
    {
        const Clip* clip;
        int track;
        const ClipTiming* timing;
    };
    std::vector<Place> places;
    for (const auto& [clip, timing] : m_timeline.clips) {
        if (clip) {
            // Clips without a track come last.
            const int number = numberOf(timing.track);
            places.push_back({clip, number == 0 ? static_cast<int>(m_tracks.size()) + 1 : number, &timing});
        }
    }
    const auto key = [](const Place& place) {
        return std::tuple(place.track, place.timing->trackLevel, place.timing->timestamp,
                          place.timing->duration, nameOf(*place.clip), place.timing->sourcePosition);
    };
    std::sort(places.begin(), places.end(),
              [&key](const Place& a, const Place& b) { return key(a) < key(b); });
    for (const Place& place : places) {
        m_clips.push_back(place.clip);
        m_clipNumbers[place.clip] = static_cast<int>(m_clips.size());
    }
}

void TimelineOutline::listTransitions()
{
    for (const auto& entry : m_timeline.transitions) {
        if (entry.first) {
            m_transitions.push_back(entry.first);
        }
    }
    const auto key = [this](const Transition::Object* transition) {
        const Timeline::ClipPair pair = m_timeline.transitionClipPair(transition);
        const int from = numberOf(pair.first);
        const int to = numberOf(pair.second);
        // One into a clip stands right before one out of it.
        return std::tuple(from == 0 ? to : from, from != 0, to, transition->tag);
    };
    std::sort(m_transitions.begin(), m_transitions.end(),
              [&key](const auto* a, const auto* b) { return key(a) < key(b); });
}

void TimelineOutline::listLabels()
{
    for (const Clip* clip : m_clips) {
        for (const Timeline::Label* label : clip->labels) {
            if (label) {
                m_labels.push_back({clip, label});
            }
        }
    }
    const auto key = [this](const ClipLabel& entry) {
        return std::tuple(numberOf(entry.clip), entry.label->position, entry.label->name);
    };
    std::sort(m_labels.begin(), m_labels.end(),
              [&key](const ClipLabel& a, const ClipLabel& b) { return key(a) < key(b); });
}

} // namespace Host
