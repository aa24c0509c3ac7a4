// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/effects/Effect.h>
#include <EditorModel/media/File.h>
#include <EditorModel/timeline/Timeline.h>

#include <string>
#include <unordered_set>
#include <vector>

/// A timeline that is long enough to measure, of the library's classes or of others with the same fields.
namespace LongTimelines {

constexpr int clipCount = 10000;
constexpr int trackCount = 4;
constexpr int clipsOfAFile = 10;

struct Listed
{
    using Timeline = ::Timeline::Object;
    using Track = ::Timeline::Track;
    using Clip = ::Timeline::Clip;
    using ClipTiming = ::Timeline::ClipTiming;
    using Link = ::Timeline::Link;
    using Effect = ::Effect::Object;
    using File = Media::File;
    using VideoTrack = Media::File::Track::Video;
    using AudioTrack = Media::File::Track::Audio;
};

template <class Enumeration>
void setNumber(Enumeration& value, int number)
{
    value = static_cast<Enumeration>(number);
}

/// Each clip has a timing and an effect, shares its file with a few others, and every second one is linked to
/// its neighbour. The addresses of clips ascend, so that both kinds are walked in one order.
template <class Types>
struct LongTimeline
{
    std::vector<typename Types::Clip> clips;
    std::vector<typename Types::Track> tracks;
    std::vector<typename Types::Effect> effects;
    std::vector<typename Types::File> files;
    std::vector<typename Types::VideoTrack> videoTracks;
    std::vector<typename Types::AudioTrack> audioTracks;
    typename Types::Timeline timeline;

    LongTimeline()
        : clips(clipCount),
          tracks(trackCount),
          effects(clipCount),
          files(clipCount / clipsOfAFile),
          videoTracks(files.size()),
          audioTracks(files.size())
    {
        for (int i = 0; i != trackCount; ++i) {
            setNumber(tracks[std::size_t(i)].type, PrimaryTrack * (i + 1));
            tracks[std::size_t(i)].timeline = &timeline;
            timeline.tracks.push_back(&tracks[std::size_t(i)]);
        }
        for (std::size_t i = 0; i != files.size(); ++i)
            addFile(i);
        for (int i = 0; i != clipCount; ++i)
            addClip(i);
    }

private:
    void addFile(std::size_t i)
    {
        typename Types::File& file = files[i];
        file.path = QStringLiteral("/films/holiday/file number %1.mov").arg(i);
        file.size = (qint64(1) << 32) + qint64(i);
        file.format = "mov";
        file.length = 60000;
        file.isOpened = true;
        videoTracks[i].file = &file;
        videoTracks[i].codecId = "h264";
        videoTracks[i].bitrate = 8000000;
        audioTracks[i].file = &file;
        audioTracks[i].index = 1;
        audioTracks[i].codecId = "aac";
        audioTracks[i].bitrate = 128000;
        file.videoTracks.push_back(&videoTracks[i]);
        file.audioTracks.push_back(&audioTracks[i]);
    }

    void addClip(int i)
    {
        typename Types::Effect& effect = effects[std::size_t(i)];
        effect.id = QStringLiteral("blur");
        effect.uniqueId = QString::number(i);
        effect.tag = QStringLiteral("Blur");
        effect.intensity = 0.25 * i + 0.1;

        typename Types::Clip& clip = clips[std::size_t(i)];
        clip.timeline = &timeline;
        setNumber(clip.type, 1 + i % 2);
        clip.name = QStringLiteral("clip number %1").arg(i);
        clip.file = &files[std::size_t(i / clipsOfAFile)];
        clip.mediaTrack = i % 2;
        clip.sourceDuration = 60000;
        clip.effects.push_back(&effect);

        typename Types::ClipTiming& timing = timeline.clips[&clip];
        timing.track = &tracks[std::size_t(i % trackCount)];
        timing.timestamp = MTime(1000 * (i / trackCount));
        timing.duration = 1000;
        timing.sourcePosition = MTime(i);
        timing.sourceDuration = 60000;
        if (i % 2 == 1) {
            typename Types::Link& link = timeline.links[&clip];
            link.master = &clips[std::size_t(i - 1)];
            link.offset = MTime(i);
        }
    }
};

/// Frees the timeline, and all that it and its clips point at.
template <class Timeline>
void freeTimeline(const Timeline* timeline)
{
    std::unordered_set<decltype(timeline->clips.begin()->first->file)> files;
    for (const auto& entry : timeline->clips) {
        files.insert(entry.first->file);
        for (const auto* const effect : entry.first->effects)
            delete effect;
        delete entry.first;
    }
    for (const auto* const file : files) {
        for (const auto* const track : file->videoTracks)
            delete track;
        for (const auto* const track : file->audioTracks)
            delete track;
        delete file;
    }
    for (const auto* const track : timeline->tracks)
        delete track;
    delete timeline;
}

} // namespace LongTimelines
