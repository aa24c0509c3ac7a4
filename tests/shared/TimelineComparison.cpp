// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/TimelineComparison.h"
#include "tests/shared/GraphComparison.h"

#include <EditorModel/analysis/BeatDetection.h>
#include <EditorModel/analysis/Stabilization.h>
#include <EditorModel/effects/Effect.h>
#include <EditorModel/effects/Envelope.h>
#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Quiz.h>
#include <EditorModel/effects/Transition.h>
#include <EditorModel/library/EditorCollection.h>
#include <EditorModel/library/ImportObject.h>
#include <EditorModel/library/Project.h>
#include <EditorModel/media/File.h>
#include <EditorModel/media/ResourceTable.h>

#include <map>

namespace Testing {
namespace {

class Comparison : public GraphComparison<Comparison>
{
public:
    using GraphComparison::GraphComparison;

private:
    friend class GraphComparison<Comparison>;
    using GraphComparison::same;

    static const QString& nameOf(const Timeline::Clip& clip) { return clip.name; }
    static const QString& nameOf(const Timeline::Label& label) { return label.name; }
    static const QString& nameOf(const Transition::Object& transition) { return transition.id; }

    // The fields of the classes, in the order of their declarations.

    void same(const Timeline::Object& a, const Timeline::Object& b)
    {
        using T = Timeline::Object;
        format(a, b);
        defaults(b, "scope", &T::scope, "reservedText", &T::reservedText, "composition", &T::composition,
                 "markerUpdateEnabled", &T::markerUpdateEnabled, "exportRanges", &T::exportRanges,
                 "reservedFirst", &T::reservedFirst, "reservedSecond", &T::reservedSecond);
        fields(a, b, "clips", &T::clips, "links", &T::links, "trackingLinks", &T::trackingLinks,
               "transitions", &T::transitions, "tracks", &T::tracks);
    }

    void format(const Media::Video& a, const Media::Video& b)
    {
        using T = Media::Video;
        fields(a, b, "width", &T::width, "height", &T::height, "frameRateN", &T::frameRateN, "frameRateD",
               &T::frameRateD, "aspectX", &T::aspectX, "aspectY", &T::aspectY);
        defaults(b, "exportMode", &T::exportMode, "opaque", &T::opaque);
    }

    void format(const Media::Audio& a, const Media::Audio& b)
    {
        using T = Media::Audio;
        fields(a, b, "channelLayout", &T::channelLayout, "sampleRate", &T::sampleRate, "sampleFormat",
               &T::sampleFormat);
    }

    void format(const Timeline::Object& a, const Timeline::Object& b)
    {
        format(static_cast<const Media::Video&>(a), static_cast<const Media::Video&>(b));
        format(static_cast<const Media::Audio&>(a), static_cast<const Media::Audio&>(b));
    }

    void same(const Timeline::Clip& a, const Timeline::Clip& b)
    {
        using T = Timeline::Clip;
        defaults(b, "range", &T::range);
        fields(a, b, "timeline", &T::timeline, "type", &T::type, "name", &T::name, "file", &T::file,
               "overlay", &T::overlay, "quiz", &T::quiz, "nestedTimeline", &T::nestedTimeline, "volume",
               &T::volume, "volumeEnvelope", &T::volumeEnvelope, "cropEnvelope", &T::cropEnvelope,
               "moveEnvelope", &T::moveEnvelope, "rhythm", &T::rhythm, "stabilization", &T::stabilization,
               "mediaTrack", &T::mediaTrack, "labels", &T::labels, "motionTrackings", &T::motionTrackings,
               "enabled", &T::enabled, "broken", &T::broken, "unlimitedDuration", &T::unlimitedDuration,
               "sourceDuration", &T::sourceDuration, "effects", &T::effects);
    }

    void same(const Timeline::ClipTiming& a, const Timeline::ClipTiming& b)
    {
        using T = Timeline::ClipTiming;
        fields(a, b, "track", &T::track, "trackLevel", &T::trackLevel, "timestamp", &T::timestamp, "duration",
               &T::duration, "sourcePosition", &T::sourcePosition, "sourceDuration", &T::sourceDuration,
               "speedCompensated", &T::speedCompensated, "transitionIn", &T::transitionIn, "transitionOut",
               &T::transitionOut, "fadeInDuration", &T::fadeInDuration, "fadeOutDuration",
               &T::fadeOutDuration, "reversed", &T::reversed, "timingMode", &T::timingMode);
    }

    void same(const Timeline::Track& a, const Timeline::Track& b)
    {
        using T = Timeline::Track;
        fields(a, b, "type", &T::type, "muted", &T::muted, "hidden", &T::hidden, "linked", &T::linked,
               "gapless", &T::gapless, "used", &T::used, "timeline", &T::timeline);
    }

    void same(const Timeline::Label& a, const Timeline::Label& b)
    {
        using T = Timeline::Label;
        fields(a, b, "timeline", &T::timeline, "position", &T::position, "name", &T::name);
    }

    void same(const Timeline::Link& a, const Timeline::Link& b)
    {
        fields(a, b, "master", &Timeline::Link::master, "offset", &Timeline::Link::offset);
    }

    void same(const Timeline::TrackingLinkInfo& a, const Timeline::TrackingLinkInfo& b)
    {
        using T = Timeline::TrackingLinkInfo;
        fields(a, b, "trackedObject", &T::trackedObject, "objectRelativeOffset", &T::objectRelativeOffset);
    }

    void same(const Timeline::TrackedObject& a, const Timeline::TrackedObject& b)
    {
        using T = Timeline::TrackedObject;
        fields(a, b, "clip", &T::clip, "trackingId", &T::trackingId);
    }

    void same(const Transition::Object& a, const Transition::Object& b)
    {
        using T = Transition::Object;
        fields(a, b, "id", &T::id, "tag", &T::tag, "description", &T::description, "strategy", &T::strategy,
               "type", &T::type, "defaultDuration", &T::defaultDuration, "resources", &T::resources, "volume",
               &T::volume);
    }

    void same(const Media::File& a, const Media::File& b)
    {
        using T = Media::File;
        fields(a, b, "path", &T::path, "size", &T::size, "format", &T::format, "length", &T::length,
               "isOpening", &T::isOpening, "isOpened", &T::isOpened, "isFailed", &T::isFailed, "videoTracks",
               &T::videoTracks, "audioTracks", &T::audioTracks);
        defaults(b, "lastModified", &T::lastModified, "metadata", &T::metadata, "unsupportedCodecs",
                 &T::unsupportedCodecs, "composition", &T::composition);
    }

    void same(const Media::File::Track& a, const Media::File::Track& b)
    {
        using T = Media::File::Track;
        fields(a, b, "file", &T::file, "index", &T::index, "codecId", &T::codecId, "bitrate", &T::bitrate);
    }

    void same(const Media::File::Track::Video& a, const Media::File::Track::Video& b)
    {
        format(a, b);
        same(static_cast<const Media::File::Track&>(a), static_cast<const Media::File::Track&>(b));
        fields(a, b, "isImage", &Media::File::Track::Video::isImage);
    }

    void same(const Media::File::Track::Audio& a, const Media::File::Track::Audio& b)
    {
        format(a, b);
        same(static_cast<const Media::File::Track&>(a), static_cast<const Media::File::Track&>(b));
    }

    void same(const Effect::Object& a, const Effect::Object& b)
    {
        using T = Effect::Object;
        fields(a, b, "id", &T::id, "uniqueId", &T::uniqueId, "tag", &T::tag, "description", &T::description,
               "intensity", &T::intensity, "bypass", &T::bypass);
    }

    template <class Trait, class Interpolator>
    void same(const Animation::Item<Trait, Interpolator>& a, const Animation::Item<Trait, Interpolator>& b)
    {
        using T = Animation::Item<Trait, Interpolator>;
        fields(a, b, "keyValues", &T::keyValues, "defaultValue", &T::defaultValue);
    }

    template <class V>
    void same(const Animation::KeyValue<V>& a, const Animation::KeyValue<V>& b)
    {
        using T = Animation::KeyValue<V>;
        fields(a, b, "step", &T::step, "value", &T::value);
    }

    void same(const Transformation::Object& a, const Transformation::Object& b)
    {
        using T = Transformation::Object;
        fields(a, b, "matrix", &T::matrix, "opacity", &T::opacity);
    }

    void same(const Types::Transform& a, const Types::Transform& b)
    {
        using T = Types::Transform;
        fields(a, b, "m11", &T::m11, "m12", &T::m12, "m13", &T::m13, "m21", &T::m21, "m22", &T::m22, "m23",
               &T::m23, "m31", &T::m31, "m32", &T::m32, "m33", &T::m33);
    }

    void same(const Overlay::Preset& a, const Overlay::Preset& b)
    {
        using T = Overlay::Preset;
        fields(a, b, "type", &T::type, "scriptId", &T::scriptId, "scriptSpeed", &T::scriptSpeed, "items",
               &T::items, "tag", &T::tag, "description", &T::description, "sourceDuration",
               &T::sourceDuration);
    }

    void same(const Overlay::Item& a, const Overlay::Item& b)
    {
        using T = Overlay::Item;
        fields(a, b, "type", &T::type, "text", &T::text, "transform", &T::transform, "envelope", &T::envelope,
               "scriptRole", &T::scriptRole, "editTime", &T::editTime, "outline", &T::outline, "editable",
               &T::editable, "features", &T::features, "from", &T::from, "to", &T::to, "intro", &T::intro,
               "outro", &T::outro, "textWidth", &T::textWidth, "arcRadius", &T::arcRadius, "dropShadow",
               &T::dropShadow);
    }

    void same(const Overlay::DropShadow& a, const Overlay::DropShadow& b)
    {
        using T = Overlay::DropShadow;
        fields(a, b, "enabled", &T::enabled, "color", &T::color, "offsetX", &T::offsetX, "offsetY",
               &T::offsetY, "blurRadius", &T::blurRadius);
    }

    void same(const Types::Pen& a, const Types::Pen& b)
    {
        using T = Types::Pen;
        fields(a, b, "color", &T::color, "width", &T::width, "enabled", &T::enabled);
    }

    void same(const Quiz::Preset& a, const Quiz::Preset& b)
    {
        using T = Quiz::Preset;
        fields(a, b, "questions", &T::questions, "tag", &T::tag, "description", &T::description);
    }

    void same(const Quiz::Question& a, const Quiz::Question& b)
    {
        using T = Quiz::Question;
        fields(a, b, "type", &T::type, "text", &T::text, "answers", &T::answers, "correctAnswers",
               &T::correctAnswers);
    }

    void same(const BeatDetection::Object& a, const BeatDetection::Object& b)
    {
        using T = BeatDetection::Object;
        fields(a, b, "interval", &T::interval, "beats", &T::beats);
    }

    void same(const Stabilization::Object& a, const Stabilization::Object& b)
    {
        using T = Stabilization::Object;
        fields(a, b, "shakiness", &T::shakiness, "accuracy", &T::accuracy, "stepsize", &T::stepsize,
               "smoothing", &T::smoothing, "optzoom", &T::optzoom, "originalVideoStreamIndex",
               &T::originalVideoStreamIndex, "originalAudioStreamIndex", &T::originalAudioStreamIndex,
               "pathOriginal", &T::pathOriginal, "pathStabilized", &T::pathStabilized,
               "sourcePositionOriginal", &T::sourcePositionOriginal, "sourceDurationOriginal",
               &T::sourceDurationOriginal);
    }

    void same(const Project::Content& a, const Project::Content& b)
    {
        using T = Project::Content;
        fields(a, b, "timeline", &T::timeline, "userCollection", &T::userCollection, "resourceTable",
               &T::resourceTable, "portable", &T::portable);
    }

    void same(const EditorCollection::UserObject& a, const EditorCollection::UserObject& b)
    {
        fields(a, b, "items", &EditorCollection::UserObject::items);
    }

    void same(const Import::Object& a, const Import::Object& b)
    {
        using T = Import::Object;
        defaults(b, "pack", &T::pack);
        fields(a, b, "tag", &T::tag, "description", &T::description, "descriptionUrl", &T::descriptionUrl,
               "kind", &T::kind, "category", &T::category);
        // Without a pack these tell the object's own fields.
        T own(a);
        own.pack = nullptr;
        at("/location", own.location(), b.location());
        at("/remoteUrl", own.remoteUrl(), b.remoteUrl());
        at("/remoteSize", own.remoteSize(), b.remoteSize());
    }

    void same(const ResourceTable::Object& a, const ResourceTable::Object& b)
    {
        fields(a, b, "resource2fileInfo", &ResourceTable::Object::resource2fileInfo);
    }

    void same(const ResourceTable::FileResourceInfo& a, const ResourceTable::FileResourceInfo& b)
    {
        using T = ResourceTable::FileResourceInfo;
        fields(a, b, "info", &T::info, "timing", &T::timing);
    }

    void same(const Resource::FileInfo& a, const Resource::FileInfo& b)
    {
        using T = Resource::FileInfo;
        fields(a, b, "path", &T::path, "track", &T::track, "duration", &T::duration);
    }

    void same(const Resource::Timing& a, const Resource::Timing& b)
    {
        using T = Resource::Timing;
        fields(a, b, "mode", &T::mode, "intro", &T::intro, "outro", &T::outro, "loopMinCount",
               &T::loopMinCount);
    }

    void same(const std::map<ResourceRef, ResourceTable::FileResourceInfo>& a,
              const std::map<ResourceRef, ResourceTable::FileResourceInfo>& b)
    {
        const auto keyText = [](const ResourceRef& key) {
            return "[" + std::get<0>(key).toStdString() + " " + std::to_string(std::get<1>(key)) + "]";
        };
        for (const auto& entry : a) {
            const Place place(*this, keyText(entry.first));
            const auto other = b.find(entry.first);
            if (other == b.end())
                differ();
            else
                same(entry.second, other->second);
        }
        if (a.size() != b.size())
            differ();
    }
};

} // namespace

std::vector<std::string> timelineDifferences(const Timeline::Object& stored, const Timeline::Object& loaded,
                                             bool wrapsTimes)
{
    Comparison comparison(wrapsTimes);
    comparison.partners(stored, loaded);
    return comparison.differences();
}

std::vector<std::string> projectDifferences(const Project::Content& stored, const Project::Content& loaded,
                                            bool wrapsTimes)
{
    Comparison comparison(wrapsTimes);
    comparison.partners(stored, loaded);
    return comparison.differences();
}

} // namespace Testing
