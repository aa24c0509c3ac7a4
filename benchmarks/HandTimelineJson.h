// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "HandTimeline.h"

#include <nlohmann/json.hpp>

#include <unordered_map>

/// The tree that the Json archive makes of a timeline, written down and read by hand.
namespace Hand {

using nlohmann::json;

class JsonWriter
{
public:
    json operator()(const Timeline& timeline)
    {
        json root;
        root["content"] = pointer(&timeline, "Timeline::Object");
        return root;
    }

private:
    template <class T>
    json pointer(const T* object, const char* name)
    {
        if (!object)
            return nullptr;
        json node = json::object();
        json& meta = node["$meta"];
        meta["class"] = name;
        const auto entered = m_ids.try_emplace(object, m_lastId + 1);
        if (!entered.second) {
            meta["ref"] = entered.first->second;
            return node;
        }
        meta["id"] = ++m_lastId;
        write(node, *object);
        return node;
    }

    json pointer(const Timeline* timeline) { return pointer(timeline, "Timeline::Object"); }
    json pointer(const Track* track) { return pointer(track, "Timeline::Track"); }
    json pointer(const Clip* clip) { return pointer(clip, "Timeline::Clip"); }
    json pointer(const Effect* effect) { return pointer(effect, "Effect::Object"); }
    json pointer(const File* file) { return pointer(file, "File"); }
    json pointer(const VideoTrack* track) { return pointer(track, "VideoTrack"); }
    json pointer(const AudioTrack* track) { return pointer(track, "AudioTrack"); }

    template <class Container, class Item>
    static json items(const Container& container, Item item)
    {
        json node = json::object();
        node["count"] = container.size();
        node["item_version"] = 0;
        if (container.empty())
            return node;
        json& all = node["item"];
        for (const auto& each : container)
            all.push_back(item(each));
        return node;
    }

    template <class T>
    json pointers(const std::deque<const T*>& container)
    {
        return items(container, [this](const T* object) { return pointer(object); });
    }

    template <class K, class V>
    json entries(const std::map<const K*, V>& container)
    {
        return items(container, [&](const auto& entry) {
            json node = json::object();
            node["first"] = pointer(entry.first);
            write(node["second"], entry.second);
            return node;
        });
    }

    static int ms(MTime time) { return static_cast<int>(time.ms()); }

    void write(json& node, const Timeline& timeline)
    {
        write(node["Video"], static_cast<const Video&>(timeline));
        write(node["Audio"], static_cast<const Audio&>(timeline));
        node["tracks"] = pointers(timeline.tracks);
        node["clips"] = entries(timeline.clips);
        node["links"] = entries(timeline.links);
        node["trackingLinks"] = items(timeline.trackingLinks, [](const auto&) { return nullptr; });
        node["transitions"] = items(timeline.transitions, [](const auto&) { return nullptr; });
    }

    static void write(json& node, const Video& video)
    {
        node["width"] = video.width;
        node["height"] = video.height;
        node["frameRateN"] = video.frameRateN;
        node["frameRateD"] = video.frameRateD;
        node["aspectX"] = video.aspectX;
        node["aspectY"] = video.aspectY;
    }

    static void write(json& node, const Audio& audio)
    {
        node["channelLayout"] = audio.channelLayout;
        node["sampleRate"] = audio.sampleRate;
        node["sampleFormat"] = audio.sampleFormat;
    }

    void write(json& node, const Track& track)
    {
        node["type"] = track.type;
        node["muted"] = track.muted;
        node["hidden"] = track.hidden;
        node["linked"] = track.linked;
        node["gapless"] = track.gapless;
        node["used"] = track.used;
        node["timeline"] = pointer(track.timeline);
    }

    void write(json& node, const Clip& clip)
    {
        node["timeline"] = pointer(clip.timeline);
        node["type"] = clip.type;
        node["name"] = clip.name.toStdString();
        node["enabled"] = clip.enabled;
        node["overlay"] = nullptr;
        node["quiz"] = nullptr;
        node["file"] = pointer(clip.file);
        node["nestedTimeline"] = pointer(clip.nestedTimeline);
        node["volume"] = clip.volume;
        node["volumeEnvelope"] = nullptr;
        node["cropEnvelope"] = nullptr;
        node["moveEnvelope"] = nullptr;
        node["broken"] = clip.broken;
        node["unlimitedDuration"] = clip.unlimitedDuration;
        node["sourceDuration"] = ms(clip.sourceDuration);
        node["effects"] = pointers(clip.effects);
        node["rhythm"] = nullptr;
        node["stabilization"] = nullptr;
        node["mediaTrack"] = clip.mediaTrack;
        node["labels"] = items(clip.labels, [](const auto*) { return nullptr; });
        node["motionTrackings"] =
            items(clip.motionTrackings, [](const QString& id) { return id.toStdString(); });
    }

    void write(json& node, const ClipTiming& timing)
    {
        node["track"] = pointer(timing.track);
        node["trackLevel"] = timing.trackLevel;
        node["timestamp"] = ms(timing.timestamp);
        node["sourceDuration"] = ms(timing.sourceDuration);
        node["sourcePosition"] = ms(timing.sourcePosition);
        node["duration"] = ms(timing.duration);
        node["speedCompensated"] = timing.speedCompensated;
        node["transitionIn"] = ms(timing.transitionIn);
        node["transitionOut"] = ms(timing.transitionOut);
        node["fadeInDuraion"] = ms(timing.fadeInDuration);
        node["fadeOutDuraion"] = ms(timing.fadeOutDuration);
        node["reversed"] = timing.reversed;
        node["timingMode"] = timing.timingMode;
    }

    void write(json& node, const Link& link)
    {
        node["master"] = pointer(link.master);
        node["offset"] = ms(link.offset);
    }

    static void write(json& node, const Effect& effect)
    {
        node["id"] = effect.id.toStdString();
        node["tag"] = effect.tag.toStdString();
        node["uniqueId"] = effect.uniqueId.toStdString();
        node["description"] = effect.description.toStdString();
        node["intensity"] = effect.intensity;
        node["bypass"] = effect.bypass;
    }

    void write(json& node, const File& file)
    {
        node["path"] = file.path.toStdString();
        node["size"] = file.size;
        node["format"] = file.format;
        node["length"] = ms(file.length);
        node["isOpening"] = file.isOpening;
        node["isOpened"] = file.isOpened;
        node["isFailed"] = file.isFailed;
        node["videoTracks"] = pointers(file.videoTracks);
        node["audioTracks"] = pointers(file.audioTracks);
    }

    void write(json& node, const FileTrack& track)
    {
        node["file"] = pointer(track.file);
        node["index"] = track.index;
        node["codecId"] = track.codecId;
        node["bitrate"] = track.bitrate;
    }

    void write(json& node, const VideoTrack& track)
    {
        write(node["Video"], static_cast<const Video&>(track));
        write(node["Track"], static_cast<const FileTrack&>(track));
        node["isImage"] = track.isImage;
    }

    void write(json& node, const AudioTrack& track)
    {
        write(node["Audio"], static_cast<const Audio&>(track));
        write(node["Track"], static_cast<const FileTrack&>(track));
    }

    std::unordered_map<const void*, int> m_ids;
    int m_lastId = 0;
};

class JsonReader
{
public:
    Timeline* operator()(const json& root)
    {
        const Timeline* timeline = nullptr;
        read(root, "content", timeline);
        return const_cast<Timeline*>(timeline);
    }

private:
    template <class T>
    const T* pointer(const json& node)
    {
        if (node.is_null())
            return nullptr;
        const json& meta = node.at("$meta");
        const auto reference = meta.find("ref");
        if (reference != meta.end())
            return static_cast<const T*>(m_known.at(reference->get<int>()));
        auto* const object = new T;
        m_known.emplace(meta.at("id").get<int>(), object);
        read(node, *object);
        return object;
    }

    template <class T>
    void read(const json& node, const char* key, const T*& value)
    {
        value = pointer<T>(node.at(key));
    }
    void read(const json& node, const char* key, bool& value) { value = node.at(key).get<bool>(); }
    void read(const json& node, const char* key, int& value) { value = node.at(key).get<int>(); }
    void read(const json& node, const char* key, qint64& value) { value = node.at(key).get<qint64>(); }
    void read(const json& node, const char* key, double& value) { value = node.at(key).get<double>(); }
    void read(const json& node, const char* key, MTime& value) { value = MTime(node.at(key).get<int>()); }
    void read(const json& node, const char* key, std::string& value)
    {
        value = node.at(key).get_ref<const std::string&>();
    }
    void read(const json& node, const char* key, QString& value)
    {
        value = QString::fromStdString(node.at(key).get_ref<const std::string&>());
    }

    template <class Item>
    static void eachItem(const json& items, Item item)
    {
        if (items.at("count").get<int>() == 0)
            return;
        for (const json& each : items.at("item"))
            item(each);
    }

    template <class T>
    void read(const json& node, const char* key, std::deque<const T*>& value)
    {
        eachItem(node.at(key), [&](const json& item) { value.push_back(pointer<T>(item)); });
    }
    template <class T>
    void read(const json& node, const char* key, std::set<const T*>& value)
    {
        eachItem(node.at(key), [&](const json& item) { value.insert(pointer<T>(item)); });
    }
    void read(const json& node, const char* key, std::set<QString>& value)
    {
        eachItem(node.at(key), [&](const json& item) {
            value.insert(QString::fromStdString(item.get_ref<const std::string&>()));
        });
    }
    template <class K, class V>
    void read(const json& node, const char* key, std::map<const K*, V>& value)
    {
        eachItem(node.at(key),
                 [&](const json& item) { read(item.at("second"), value[pointer<K>(item.at("first"))]); });
    }

    template <class First, class... More>
    void all(const json& node, const char* key, First& value, More&&... more)
    {
        read(node, key, value);
        if constexpr (sizeof...(more) > 0)
            all(node, more...);
    }

    template <class Tag>
    void read(const json&, Unused<Tag>&)
    {}

    void read(const json& node, std::pair<const Clip*, const Clip*>& pair)
    {
        all(node, "first", pair.first, "second", pair.second);
    }

    void read(const json& node, Timeline& timeline)
    {
        read(node.at("Video"), static_cast<Video&>(timeline));
        read(node.at("Audio"), static_cast<Audio&>(timeline));
        all(node, "tracks", timeline.tracks, "clips", timeline.clips, "links", timeline.links,
            "trackingLinks", timeline.trackingLinks, "transitions", timeline.transitions);
    }

    void read(const json& node, Video& video)
    {
        all(node, "width", video.width, "height", video.height, "frameRateN", video.frameRateN, "frameRateD",
            video.frameRateD, "aspectX", video.aspectX, "aspectY", video.aspectY);
    }

    void read(const json& node, Audio& audio)
    {
        all(node, "channelLayout", audio.channelLayout, "sampleRate", audio.sampleRate, "sampleFormat",
            audio.sampleFormat);
    }

    void read(const json& node, Track& track)
    {
        all(node, "type", track.type, "muted", track.muted, "hidden", track.hidden, "linked", track.linked,
            "gapless", track.gapless, "used", track.used, "timeline", track.timeline);
    }

    void read(const json& node, Clip& clip)
    {
        all(node, "timeline", clip.timeline, "type", clip.type, "name", clip.name, "enabled", clip.enabled,
            "overlay", clip.overlay, "quiz", clip.quiz, "file", clip.file, "nestedTimeline",
            clip.nestedTimeline, "volume", clip.volume, "volumeEnvelope", clip.volumeEnvelope, "cropEnvelope",
            clip.cropEnvelope, "moveEnvelope", clip.moveEnvelope, "broken", clip.broken, "unlimitedDuration",
            clip.unlimitedDuration, "sourceDuration", clip.sourceDuration, "effects", clip.effects, "rhythm",
            clip.rhythm, "stabilization", clip.stabilization, "mediaTrack", clip.mediaTrack, "labels",
            clip.labels, "motionTrackings", clip.motionTrackings);
    }

    void read(const json& node, ClipTiming& timing)
    {
        all(node, "track", timing.track, "trackLevel", timing.trackLevel, "timestamp", timing.timestamp,
            "sourceDuration", timing.sourceDuration, "sourcePosition", timing.sourcePosition, "duration",
            timing.duration, "speedCompensated", timing.speedCompensated, "transitionIn", timing.transitionIn,
            "transitionOut", timing.transitionOut, "fadeInDuraion", timing.fadeInDuration, "fadeOutDuraion",
            timing.fadeOutDuration, "reversed", timing.reversed, "timingMode", timing.timingMode);
    }

    void read(const json& node, Link& link) { all(node, "master", link.master, "offset", link.offset); }

    void read(const json& node, Effect& effect)
    {
        all(node, "id", effect.id, "tag", effect.tag, "uniqueId", effect.uniqueId, "description",
            effect.description, "intensity", effect.intensity, "bypass", effect.bypass);
    }

    void read(const json& node, File& file)
    {
        all(node, "path", file.path, "size", file.size, "format", file.format, "length", file.length,
            "isOpening", file.isOpening, "isOpened", file.isOpened, "isFailed", file.isFailed, "videoTracks",
            file.videoTracks, "audioTracks", file.audioTracks);
    }

    void read(const json& node, FileTrack& track)
    {
        all(node, "file", track.file, "index", track.index, "codecId", track.codecId, "bitrate",
            track.bitrate);
    }

    void read(const json& node, VideoTrack& track)
    {
        read(node.at("Video"), static_cast<Video&>(track));
        read(node.at("Track"), static_cast<FileTrack&>(track));
        all(node, "isImage", track.isImage);
    }

    void read(const json& node, AudioTrack& track)
    {
        read(node.at("Audio"), static_cast<Audio&>(track));
        read(node.at("Track"), static_cast<FileTrack&>(track));
    }

    std::unordered_map<int, const void*> m_known;
};

} // namespace Hand
