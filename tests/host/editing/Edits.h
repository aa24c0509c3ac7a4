// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/editing/EditSession.h"
#include "host/editing/TimelineInvariants.h"

#include <EditorModel/effects/Transition.h>

#include <gmock/gmock.h>

#include <algorithm>
#include <map>
#include <string>
#include <vector>

/// What the tests of edits have in common.
namespace EditTests {

using Host::EditResult;
using Host::EditSession;
using Host::Placement;
using Host::Ripple;
using Timeline::Clip;
using Timeline::ClipTiming;
using Timeline::Track;

inline bool haveSameContent(const Timeline::Object& a, const Timeline::Object& b)
{
    return a.clips == b.clips && a.links == b.links && a.trackingLinks == b.trackingLinks &&
           a.transitions == b.transitions && a.tracks == b.tracks;
}

inline std::vector<std::string> faultTexts(const Timeline::Object& timeline)
{
    std::vector<std::string> texts;
    for (const Host::TimelineFault& fault : Host::timelineFaults(timeline)) {
        texts.push_back(fault.text.toStdString());
    }
    return texts;
}

/// Another module that watches the timeline: it counts the changes and keeps the last one's old value.
class Watcher : public Message::View<Timeline::Object>
{
public:
    explicit Watcher(const Timeline::Object* timeline) { observe(timeline); }

    int changes = 0;
    bool isRemoved = false;
    Timeline::Object old;
    Timeline::Object now;

private:
    using View::changed;
    void changed(const Timeline::Object*, const Timeline::Object* oldValue) override
    {
        ++changes;
        old = *oldValue;
        now = *object();
    }
    void removed(const Timeline::Object*) override { isRemoved = true; }
};

/// The clips of a track by level and start, as "name start-end @sourcePosition". What there is beside follows
/// in this order: level "L1", transitions "<in" and ">out", fades "/in" and "\out", "rev".
inline std::string row(const Timeline::Object& timeline, const Track* track)
{
    std::vector<std::pair<const Clip*, ClipTiming>> clips;
    for (const auto& entry : timeline.clips) {
        if (entry.second.track == track) {
            clips.emplace_back(entry);
        }
    }
    std::sort(clips.begin(), clips.end(), [](const auto& a, const auto& b) {
        return std::make_pair(a.second.trackLevel, a.second.timestamp) <
               std::make_pair(b.second.trackLevel, b.second.timestamp);
    });
    std::string text;
    const auto part = [&text](const char* mark, MTime value) {
        text += value == MTime() ? "" : mark + std::to_string(value.ms());
    };
    for (const auto& [clip, timing] : clips) {
        text += (text.empty() ? "" : ", ") + clip->name.toStdString() + " " +
                std::to_string(timing.timestamp.ms()) + "-" + std::to_string(timing.end().ms()) + " @" +
                std::to_string(timing.sourcePosition.ms());
        part(" L", timing.trackLevel);
        part(" <", timing.transitionIn);
        part(" >", timing.transitionOut);
        part(" /", timing.fadeInDuration);
        part(" \\", timing.fadeOutDuration);
        text += timing.reversed ? " rev" : "";
    }
    return text;
}

/// "slave(its start)>master(its start)+offset", in the order of the texts.
inline std::vector<std::string> linkTexts(const Timeline::Object& timeline)
{
    const auto name = [&timeline](const Clip* clip) {
        return clip->name.toStdString() + "(" + std::to_string(timeline.clipTiming(clip).timestamp.ms()) +
               ")";
    };
    std::vector<std::string> texts;
    for (const auto& [slave, link] : timeline.links) {
        texts.push_back(name(slave) + ">" + name(link.master) + "+" + std::to_string(link.offset.ms()));
    }
    std::sort(texts.begin(), texts.end());
    return texts;
}

} // namespace EditTests
