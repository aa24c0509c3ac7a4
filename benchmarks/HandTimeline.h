// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/types/MTime.h>

// Export keys are for the archives that stand before them.
#include <boost/archive/binary_iarchive.hpp>
#include <boost/archive/binary_oarchive.hpp>
#include <boost/archive/xml_iarchive.hpp>
#include <boost/archive/xml_oarchive.hpp>

#include <boost/serialization/base_object.hpp>
#include <boost/serialization/deque.hpp>
#include <boost/serialization/export.hpp>
#include <boost/serialization/level.hpp>
#include <boost/serialization/map.hpp>
#include <boost/serialization/nvp.hpp>
#include <boost/serialization/set.hpp>
#include <boost/serialization/string.hpp>
#include <boost/serialization/tracking.hpp>
#include <boost/serialization/utility.hpp>

#include <QString>

#include <deque>
#include <map>
#include <set>
#include <string>
#include <utility>

/// The records of a timeline once more, with the same fields and bases, and Boost.Serialization's templates
/// used by hand. Their export keys have a small first letter, as both kinds of class live in one process:
/// what they store is as long as what the model stores.
namespace Hand {

using boost::serialization::base_object;
using boost::serialization::make_nvp;

struct Root
{
    virtual ~Root() = default;
};

/// What no clip of the measurement points at.
template <class Tag>
struct Unused : Root, virtual PubSub::Object
{
    template <class Archive>
    void serialize(Archive&, const unsigned int)
    {}
};

struct MediaObject : virtual PubSub::Object
{
    QString label;
};

struct Video : MediaObject, virtual Root
{
    int width = 1920;
    int height = 1080;
    int frameRateN = 30000;
    int frameRateD = 1001;
    int aspectX = 1;
    int aspectY = 1;
    bool exportMode = false;
    bool opaque = true;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& make_nvp("width", width) & make_nvp("height", height);
        ar& make_nvp("frameRateN", frameRateN) & make_nvp("frameRateD", frameRateD);
        ar& make_nvp("aspectX", aspectX) & make_nvp("aspectY", aspectY);
    }
};

struct Audio : MediaObject, virtual Root
{
    int channelLayout = 2;
    int sampleRate = 44100;
    int sampleFormat = 1;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& make_nvp("channelLayout", channelLayout) & make_nvp("sampleRate", sampleRate);
        ar& make_nvp("sampleFormat", sampleFormat);
    }
};

struct File;

struct FileTrack : virtual Root
{
    const File* file = nullptr;
    int index = 0;
    std::string codecId;
    int bitrate = 0;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& make_nvp("file", file) & make_nvp("index", index);
        ar& make_nvp("codecId", codecId) & make_nvp("bitrate", bitrate);
    }
};

struct VideoTrack : FileTrack, Video
{
    bool isImage = false;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& make_nvp("Video", base_object<Video>(*this)) & make_nvp("Track", base_object<FileTrack>(*this));
        ar& make_nvp("isImage", isImage);
    }
};

struct AudioTrack : FileTrack, Audio
{
    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& make_nvp("Audio", base_object<Audio>(*this)) & make_nvp("Track", base_object<FileTrack>(*this));
    }
};

struct File : MediaObject, Root
{
    QString path;
    qint64 size = 0;
    qint64 lastModified = 0;
    std::string format;
    MTime length;
    const void* metadata = nullptr;
    bool isOpening = false;
    bool isOpened = false;
    bool isFailed = false;
    std::deque<const VideoTrack*> videoTracks;
    std::deque<const AudioTrack*> audioTracks;
    std::deque<std::string> unsupportedCodecs;
    const void* composition = nullptr;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& make_nvp("path", path) & make_nvp("size", size) & make_nvp("format", format);
        ar& make_nvp("length", length) & make_nvp("isOpening", isOpening) & make_nvp("isOpened", isOpened);
        ar& make_nvp("isFailed", isFailed) & make_nvp("videoTracks", videoTracks);
        ar& make_nvp("audioTracks", audioTracks);
    }
};

struct Effect : virtual Root, virtual PubSub::Object
{
    QString id;
    QString uniqueId;
    QString tag;
    QString description;
    double intensity = 1.0;
    bool bypass = false;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& make_nvp("id", id) & make_nvp("tag", tag) & make_nvp("uniqueId", uniqueId);
        ar& make_nvp("description", description) & make_nvp("intensity", intensity);
        ar& make_nvp("bypass", bypass);
    }
};

struct Timeline;

struct Track : virtual Root, virtual PubSub::Object
{
    int type = 0;
    bool muted = false;
    bool hidden = false;
    bool linked = false;
    bool gapless = false;
    bool used = true;
    const Timeline* timeline = nullptr;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& make_nvp("type", type) & make_nvp("muted", muted) & make_nvp("hidden", hidden);
        ar& make_nvp("linked", linked) & make_nvp("gapless", gapless) & make_nvp("used", used);
        ar& make_nvp("timeline", timeline);
    }
};

struct Clip : virtual Root, virtual PubSub::Object
{
    const Timeline* timeline = nullptr;
    int type = 0;
    QString name;
    const void* range = nullptr;
    const File* file = nullptr;
    const Unused<struct Overlay>* overlay = nullptr;
    const Unused<struct Quiz>* quiz = nullptr;
    const Timeline* nestedTimeline = nullptr;
    int volume = 100;
    const Unused<struct VolumeEnvelope>* volumeEnvelope = nullptr;
    const Unused<struct TransformationEnvelope>* cropEnvelope = nullptr;
    const Unused<struct TransformationEnvelope>* moveEnvelope = nullptr;
    const Unused<struct Rhythm>* rhythm = nullptr;
    const Unused<struct Stabilization>* stabilization = nullptr;
    int mediaTrack = 0;
    std::set<const Unused<struct Label>*> labels;
    std::set<QString> motionTrackings;
    bool enabled = true;
    bool broken = false;
    bool unlimitedDuration = false;
    MTime sourceDuration;
    std::deque<const Effect*> effects;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& make_nvp("timeline", timeline) & make_nvp("type", type) & make_nvp("name", name);
        ar& make_nvp("enabled", enabled) & make_nvp("overlay", overlay) & make_nvp("quiz", quiz);
        ar& make_nvp("file", file) & make_nvp("nestedTimeline", nestedTimeline);
        ar& make_nvp("volume", volume) & make_nvp("volumeEnvelope", volumeEnvelope);
        ar& make_nvp("cropEnvelope", cropEnvelope) & make_nvp("moveEnvelope", moveEnvelope);
        ar& make_nvp("broken", broken) & make_nvp("unlimitedDuration", unlimitedDuration);
        ar& make_nvp("sourceDuration", sourceDuration) & make_nvp("effects", effects);
        ar& make_nvp("rhythm", rhythm) & make_nvp("stabilization", stabilization);
        ar& make_nvp("mediaTrack", mediaTrack) & make_nvp("labels", labels);
        ar& make_nvp("motionTrackings", motionTrackings);
    }
};

struct ClipTiming : virtual Root
{
    const Track* track = nullptr;
    int trackLevel = 0;
    MTime timestamp;
    MTime duration;
    MTime sourcePosition;
    MTime sourceDuration;
    bool speedCompensated = false;
    MTime transitionIn;
    MTime transitionOut;
    MTime fadeInDuration;
    MTime fadeOutDuration;
    bool reversed = false;
    int timingMode = 0;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& make_nvp("track", track) & make_nvp("trackLevel", trackLevel);
        ar& make_nvp("timestamp", timestamp) & make_nvp("sourceDuration", sourceDuration);
        ar& make_nvp("sourcePosition", sourcePosition) & make_nvp("duration", duration);
        ar& make_nvp("speedCompensated", speedCompensated) & make_nvp("transitionIn", transitionIn);
        ar& make_nvp("transitionOut", transitionOut) & make_nvp("fadeInDuraion", fadeInDuration);
        ar& make_nvp("fadeOutDuraion", fadeOutDuration) & make_nvp("reversed", reversed);
        ar& make_nvp("timingMode", timingMode);
    }
};

struct Link : virtual Root
{
    const Clip* master = nullptr;
    MTime offset;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& make_nvp("master", master) & make_nvp("offset", offset);
    }
};

struct Timeline : virtual Root, virtual PubSub::Object, virtual Video, virtual Audio
{
    int scope = 0;
    QString reservedText;
    const void* composition = nullptr;
    bool markerUpdateEnabled = true;
    std::map<const Clip*, ClipTiming> clips;
    std::map<const Clip*, Link> links;
    std::map<const Clip*, Unused<struct TrackingLinkInfo>> trackingLinks;
    std::map<const Unused<struct Transition>*, std::pair<const Clip*, const Clip*>> transitions;
    std::deque<const Track*> tracks;
    std::set<const void*> exportRanges;
    qint64 reservedFirst = 0;
    qint64 reservedSecond = 0;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& make_nvp("Video", base_object<Video>(*this)) & make_nvp("Audio", base_object<Audio>(*this));
        ar& make_nvp("tracks", tracks) & make_nvp("clips", clips) & make_nvp("links", links);
        ar& make_nvp("trackingLinks", trackingLinks) & make_nvp("transitions", transitions);
    }
};

} // namespace Hand

namespace boost::serialization {

/// Values: no class information, never tracked, a nameless pair around the primitive.
template <class Archive>
void serialize(Archive& ar, QString& text, const unsigned int)
{
    std::string utf8 = text.toStdString();
    ar& make_nvp(nullptr, utf8);
    if (Archive::is_loading::value)
        text = QString::fromStdString(utf8);
}

template <class Archive>
void serialize(Archive& ar, MTime& time, const unsigned int)
{
    int low = static_cast<int>(time.ms());
    ar& make_nvp(nullptr, low);
    time = MTime(low);
}

} // namespace boost::serialization

BOOST_CLASS_IMPLEMENTATION(QString, boost::serialization::object_serializable)
BOOST_CLASS_TRACKING(QString, boost::serialization::track_never)
BOOST_CLASS_IMPLEMENTATION(MTime, boost::serialization::object_serializable)
BOOST_CLASS_TRACKING(MTime, boost::serialization::track_never)

BOOST_CLASS_EXPORT_GUID(Hand::Video, "video")
BOOST_CLASS_EXPORT_GUID(Hand::Audio, "audio")
BOOST_CLASS_EXPORT_GUID(Hand::File, "file")
BOOST_CLASS_EXPORT_GUID(Hand::FileTrack, "track")
BOOST_CLASS_EXPORT_GUID(Hand::VideoTrack, "videoTrack")
BOOST_CLASS_EXPORT_GUID(Hand::AudioTrack, "audioTrack")
BOOST_CLASS_EXPORT_GUID(Hand::Effect, "effect::Object")
BOOST_CLASS_EXPORT_GUID(Hand::Track, "timeline::Track")
BOOST_CLASS_EXPORT_GUID(Hand::Clip, "timeline::Clip")
BOOST_CLASS_EXPORT_GUID(Hand::ClipTiming, "timeline::ClipTiming")
BOOST_CLASS_EXPORT_GUID(Hand::Link, "timeline::Link")
BOOST_CLASS_EXPORT_GUID(Hand::Timeline, "timeline::Object")
