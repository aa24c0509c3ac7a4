// SPDX-License-Identifier: Apache-2.0
#include "host/editing/ClipKeeper.h"

#include "host/editing/EditChecks.h"
#include "host/editing/EditText.h"

#include <set>

namespace Host {
namespace {

using Timeline::Clip;

/// What the rules of a timeline ask of its clips is the same.
bool suitsAlike(const Clip& a, const Clip& b)
{
    return a.timeline == b.timeline && a.type == b.type && a.sourceDuration == b.sourceDuration &&
           a.unlimitedDuration == b.unlimitedDuration && a.nestedTimeline == b.nestedTimeline;
}

QString refusalFor(const Timeline::Object& timeline, const Clip* clip, const QString& why)
{
    return "The " + clipText(clip) + " at " + timeText(timeline.clipTiming(clip).timestamp) + why;
}

/// Empty if it is there.
QString absence(const Timeline::Object& timeline, const Clip* clip)
{
    try {
        checkPresent(timeline, clip);
    } catch (const EditRefused& refused) {
        return refused.why;
    }
    return {};
}

} // namespace

ClipKeeper::ClipKeeper(const Timeline::Object* timeline) : m_timeline(timeline)
{
    subscribe(timeline);
    follow();
}

ClipKeeper::~ClipKeeper()
{
    for (const Clip* const clip : objects()) {
        letGo(clip);
    }
}

EditResult ClipKeeper::setEnabled(const Clip* clip, bool on)
{
    const QString why = absence(*m_timeline, clip);
    if (!why.isEmpty()) {
        return {why, clip};
    }
    Clips switched = nativeAudioOf(clip);
    switched.insert(switched.begin(), clip);
    return set(
        switched, [on](const Clip& shown) { return shown.enabled == on; },
        [on](Clip& shown) { shown.setEnabled(on); });
}

EditResult ClipKeeper::setVolume(const Clip* clip, int percent)
{
    const QString why = absence(*m_timeline, clip);
    if (!why.isEmpty()) {
        return {why, clip};
    }
    if (percent < 0) {
        return {refusalFor(*m_timeline, clip, QString(" can't have a volume of %1 %.").arg(percent)), clip};
    }
    const Clips heard = clip->isAudioClip() ? Clips{clip} : nativeAudioOf(clip);
    if (heard.empty()) {
        return {refusalFor(*m_timeline, clip, " has no sound, and so no volume."), clip};
    }
    return set(
        heard, [percent](const Clip& sound) { return sound.volume == percent; },
        [percent](Clip& sound) { sound.setVolume(percent); });
}

void ClipKeeper::notify(const Message::Types::Changed<Timeline::Object>&)
{
    follow();
}

void ClipKeeper::changeRequested(Clip* clip, Clip* value)
{
    const bool isAudible = value->volume >= 0 || value->volume == clip->volume;
    if (isAudible && suitsAlike(*clip, *value)) {
        ClipView::changeRequested(clip, value);
    }
}

void ClipKeeper::removeRequested(Clip*) {}

/// Brings what is owned here after the timeline.
void ClipKeeper::follow()
{
    for (const Clip* const clip : objects()) {
        if (!m_timeline->contains(clip)) {
            letGo(clip);
        }
    }
    std::set<const Clip*> arrived;
    for (const auto& [clip, timing] : m_timeline->clips) {
        if (clip && !isObserved(clip)) {
            arrived.insert(arrived.end(), clip);
        }
    }
    if (arrived.empty()) {
        return;
    }
    const std::set<const Clip*> taken = enumerateAll();
    for (const Clip* const clip : arrived) {
        if (taken.count(clip) > 0) {
            observe(clip);
        } else {
            own(const_cast<Clip*>(clip));
        }
    }
}

/// To remove what somebody else owns would be a request to him.
void ClipKeeper::letGo(const Clip* clip)
{
    if (isOwned(clip)) {
        remove(clip);
    } else {
        forget(clip);
    }
}

ClipKeeper::Clips ClipKeeper::nativeAudioOf(const Clip* clip) const
{
    Clips found;
    for (const auto& [slave, link] : m_timeline->links) {
        if (link.master == clip && m_timeline->contains(slave) && m_timeline->isNativeAudio(slave)) {
            found.push_back(slave);
        }
    }
    return found;
}

EditResult ClipKeeper::set(const Clips& clips, const std::function<bool(const Clip&)>& isSet,
                           const std::function<void(Clip&)>& setter)
{
    for (const Clip* const clip : clips) {
        if (!isSet(*clip)) {
            setter(*change(clip).operator->());
        }
        if (!isSet(*clip)) {
            return {refusalFor(*m_timeline, clip, " is not changed by the module that owns it."), clip};
        }
    }
    return {QString(), clips.front()};
}

} // namespace Host
