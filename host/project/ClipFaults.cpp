// SPDX-License-Identifier: Apache-2.0
#include "host/project/ClipFaults.h"

#include "host/analysis/TrackingStore.h"

#include <EditorModel/effects/Envelope.h>

#include <QFileInfo>

#include <algorithm>
#include <cmath>

namespace Host {
namespace {

using Timeline::Clip;

/// Not-a-numbers are a fault of their own, wherever they stand.
bool isInfinite(double number)
{
    return std::isinf(number);
}

bool isOutOfRange(double gain)
{
    return gain < 0.0 || isInfinite(gain);
}

bool isOutOfRange(const Transformation::Object& pose)
{
    const Types::Transform& m = pose.matrix;
    const auto coefficients = {m.m11, m.m12, m.m13, m.m21, m.m22, m.m23, m.m31, m.m32, m.m33};
    return pose.opacity < 0 || pose.opacity > 100 ||
           std::any_of(coefficients.begin(), coefficients.end(), isInfinite);
}

class ClipFaults
{
public:
    ClipFaults(const CheckedTimeline& timeline, const TrackingStore& trackings, FaultList& faults)
        : m_timeline(timeline), m_trackings(trackings), m_faults(faults)
    {}

    void find()
    {
        findInFormat();
        for (const Clip* const clip : m_timeline.outline.clips()) {
            findInSettings(clip);
            findInEnvelope(clip, clip->volumeEnvelope, "volume");
            findInEnvelope(clip, clip->cropEnvelope, "crop");
            findInEnvelope(clip, clip->moveEnvelope, "move");
            findLostTrackings(clip);
        }
        for (const Clip* const follower : m_timeline.outline.followers()) {
            findUnknownTracking(follower);
        }
    }

private:
    void addAbout(FaultCode code, const Clip* clip, const QString& rest)
    {
        const QString about = m_timeline.nameOf(clip);
        m_faults.add(code, about, about.left(1).toUpper() + about.mid(1) + " " + rest);
    }

    void findInFormat()
    {
        const Timeline::Object& timeline = m_timeline.outline.timeline();
        const QString name = m_timeline.name.left(1).toUpper() + m_timeline.name.mid(1);
        if (timeline.width <= 0 || timeline.height <= 0 || timeline.aspectX <= 0 || timeline.aspectY <= 0) {
            m_faults.add(ValueOutOfRange, m_timeline.name, name + " has pictures without an extent.");
        }
        if (timeline.frameRateN <= 0 || timeline.frameRateD <= 0) {
            m_faults.add(ValueOutOfRange, m_timeline.name, name + " has no rate of pictures.");
        }
        if (timeline.sampleRate <= 0) {
            m_faults.add(ValueOutOfRange, m_timeline.name, name + " has no rate of samples.");
        }
    }

    void findInSettings(const Clip* clip)
    {
        if (clip->volume < 0) {
            addAbout(ValueOutOfRange, clip, QString("has a volume of %1 percent.").arg(clip->volume));
        }
        if (clip->sourceDuration < MTime()) {
            addAbout(ValueOutOfRange, clip, "has a source of negative length.");
        }
    }

    template <class Envelope>
    void findInEnvelope(const Clip* clip, const Envelope* envelope, const QString& name)
    {
        if (!envelope) {
            return;
        }
        const auto& keys = envelope->keyValues;
        if (keys.empty()) {
            addAbout(EmptyEnvelope, clip, QString("has a %1 envelope without keys.").arg(name));
        }
        const auto followsLater = [](const auto& a, const auto& b) { return a.step > b.step; };
        if (std::adjacent_find(keys.begin(), keys.end(), followsLater) != keys.end()) {
            addAbout(UnsortedKeys, clip, QString("has a %1 envelope whose keys are out of order.").arg(name));
        }
        const auto followsAtOnce = [](const auto& a, const auto& b) { return a.step == b.step; };
        const auto doubled = std::adjacent_find(keys.begin(), keys.end(), followsAtOnce);
        if (doubled != keys.end()) {
            addAbout(DoubleKey, clip,
                     QString("has a %1 envelope with two keys at %2.").arg(name).arg(doubled->step));
        }
        const bool isAnyWrong = std::any_of(keys.begin(), keys.end(), [](const auto& key) {
            return isInfinite(key.step) || isOutOfRange(key.value);
        });
        if (isAnyWrong || isOutOfRange(envelope->defaultValue)) {
            addAbout(ValueOutOfRange, clip,
                     QString("has a %1 envelope with a value that cannot be.").arg(name));
        }
    }

    void findLostTrackings(const Clip* clip)
    {
        for (const QString& id : clip->motionTrackings) {
            if (!m_trackings.find(id)) {
                addAbout(LostTracking, clip, QString("has lost the tracking \"%1\"%2.").arg(id, whyLost(id)));
            }
        }
    }

    QString whyLost(const QString& id) const
    {
        const QString name = TrackingStore::fileNameOf(id);
        for (const TrackingStore::Damage& damage : m_trackings.damages()) {
            if (QFileInfo(damage.path).fileName() == name) {
                return ": its file " + name + " is damaged: " + damage.reason;
            }
        }
        return QString();
    }

    void findUnknownTracking(const Clip* follower)
    {
        const Timeline::TrackedObject& tracked =
            m_timeline.outline.timeline().getTrackingLink(follower)->trackedObject;
        // One that is gone has its own fault.
        const bool isHere = m_timeline.outline.numberOf(tracked.clip) != 0;
        if (isHere && tracked.clip->motionTrackings.count(tracked.trackingId) == 0) {
            addAbout(UnknownTracking, follower,
                     QString("follows the tracking \"%1\", which %2 does not have.")
                         .arg(tracked.trackingId, m_timeline.nameOf(tracked.clip)));
        }
    }

    const CheckedTimeline& m_timeline;
    const TrackingStore& m_trackings;
    FaultList& m_faults;
};

} // namespace

void findClipFaults(const CheckedTimeline& timeline, const TrackingStore& trackings, FaultList& faults)
{
    ClipFaults(timeline, trackings, faults).find();
}

} // namespace Host
