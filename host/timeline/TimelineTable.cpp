// SPDX-License-Identifier: Apache-2.0
#include "host/timeline/TimelineTable.h"

#include "host/drawing/Axis.h"
#include "host/media/MediaText.h"
#include "host/text/DisplayText.h"
#include "host/text/Table.h"
#include "host/timeline/TimelineOutline.h"

#include <EditorModel/effects/Transition.h>

#include <fmt/format.h>

#include <map>
#include <set>
#include <string>
#include <utility>
#include <vector>

namespace Host {
namespace {

using Timeline::Clip;
using Timeline::ClipTiming;
using Timeline::Track;

constexpr int widestName = 32;

/// The marks that are set, with commas between.
std::string listed(const std::vector<std::pair<bool, std::string>>& marks)
{
    std::string text;
    for (const auto& [isSet, mark] : marks) {
        if (isSet) {
            text += (text.empty() ? "" : ", ") + mark;
        }
    }
    return text;
}

std::string counted(std::size_t count, const char* one, const char* many)
{
    return fmt::format("{} {}", count, count == 1 ? one : many);
}

std::string lines(const Table& table)
{
    std::string text;
    for (const std::string& line : table.lines()) {
        text += line + '\n';
    }
    return text;
}

std::string numberText(int number)
{
    return number == 0 ? "-" : fmt::format("{}", number);
}

/// A clip that another part of the timeline names: it need not be on the timeline.
std::string clipText(const TimelineOutline& outline, const Clip* clip)
{
    if (!clip) {
        return "-";
    }
    const int number = outline.numberOf(clip);
    return fmt::format("{} {}", number == 0 ? "?" : fmt::format("{}", number),
                       elided(nameOf(*clip), widestName));
}

std::string timeOrNone(MTime time)
{
    return time == MTime() ? "" : lengthText(time);
}

std::string trackTable(const TimelineOutline& outline)
{
    std::map<const Track*, int> clipCounts;
    std::map<const Track*, std::set<int>> levels;
    for (const auto& [clip, timing] : outline.timeline().clips) {
        if (clip) {
            ++clipCounts[timing.track];
            levels[timing.track].insert(timing.trackLevel);
        }
    }
    Table table({Table::Right, Table::Left, Table::Right, Table::Right, Table::Left});
    table.addRow({"Track", "Role", "Clips", "Levels", "State"});
    for (std::size_t i = 0; i != outline.tracks().size(); ++i) {
        const Track* const track = outline.tracks()[i];
        table.addRow({fmt::format("{}", i + 1), roleText(track->type), fmt::format("{}", clipCounts[track]),
                      fmt::format("{}", levels[track].size()),
                      listed({{track->muted, "muted"},
                              {track->hidden, "hidden"},
                              {track->linked, "linked"},
                              {track->gapless, "gapless"},
                              {!track->used, "unused"},
                              {i >= outline.listedTracks(), "not listed"}})});
    }
    return outline.tracks().empty() ? std::string() : "\n" + lines(table);
}

std::string sourceText(const SourceStretch& stretch)
{
    return stretch.speed == 0.0 ? "-"
                                : fmt::format("{} - {}", lengthText(stretch.from), lengthText(stretch.to));
}

std::string clipState(const TimelineOutline& outline, const Clip& clip, const ClipTiming& timing)
{
    return listed({{timing.reversed, "reversed"},
                   {clip.volume != 100, fmt::format("volume {} %", clip.volume)},
                   {!clip.effects.empty(), counted(clip.effects.size(), "effect", "effects")},
                   {clip.isIntroClip() || clip.type == Clip::IntroOverlayClip, "intro"},
                   {!clip.enabled, "disabled"},
                   {clip.broken, "broken"},
                   {isOffByTrack(outline.timeline(), clip), "off by its track"}});
}

std::string clipTable(const TimelineOutline& outline)
{
    Table table({Table::Right, Table::Left, Table::Left, Table::Right, Table::Right, Table::Right,
                 Table::Right, Table::Left, Table::Right, Table::Right, Table::Right, Table::Left});
    table.addRow({"Clip", "Name", "Kind", "Track", "Level", "Start", "Length", "Source", "Speed", "Fade-in",
                  "Fade-out", "State"});
    for (const Clip* clip : outline.clips()) {
        const ClipTiming& timing = outline.timeline().clips.at(clip);
        const SourceStretch stretch = sourceStretchOf(*clip, timing);
        table.addRow({fmt::format("{}", outline.numberOf(clip)), elided(nameOf(*clip), widestName),
                      kindText(kindOf(*clip)), numberText(outline.numberOf(timing.track)),
                      fmt::format("{}", timing.trackLevel), lengthText(timing.timestamp),
                      lengthText(timing.duration), sourceText(stretch),
                      stretch.speed == 0.0 ? "-" : Host::numberText(stretch.speed),
                      timeOrNone(timing.fadeInDuration), timeOrNone(timing.fadeOutDuration),
                      clipState(outline, *clip, timing)});
    }
    return outline.clips().empty() ? std::string() : "\n" + lines(table);
}

/// How much of its clips a transition takes. A clip that is not on the timeline gives nothing.
MTime transitionLength(const Timeline::Object& timeline, const Timeline::ClipPair& pair)
{
    const auto out = timeline.clips.find(pair.first);
    const auto in = timeline.clips.find(pair.second);
    double ms = 0.0;
    if (pair.first && out != timeline.clips.end()) {
        ms += static_cast<double>(out->second.transitionOut.ms());
    }
    if (pair.second && in != timeline.clips.end()) {
        ms += static_cast<double>(in->second.transitionIn.ms());
    }
    return MTime::fromMsRound(ms);
}

std::string transitionTable(const TimelineOutline& outline)
{
    Table table({Table::Right, Table::Left, Table::Left, Table::Left, Table::Right});
    table.addRow({"Transition", "Name", "Out of", "Into", "Length"});
    for (std::size_t i = 0; i != outline.transitions().size(); ++i) {
        const Transition::Object* const transition = outline.transitions()[i];
        const Timeline::ClipPair pair = outline.timeline().transitionClipPair(transition);
        const QString name = transition->tag.isEmpty() ? transition->id : transition->tag;
        table.addRow({fmt::format("{}", i + 1), name.isEmpty() ? "-" : elided(name, widestName),
                      clipText(outline, pair.first), clipText(outline, pair.second),
                      lengthText(transitionLength(outline.timeline(), pair))});
    }
    return outline.transitions().empty() ? std::string() : "\n" + lines(table);
}

std::string linkTable(const TimelineOutline& outline)
{
    Table table({Table::Left, Table::Left, Table::Right});
    table.addRow({"Linked clip", "Master", "Offset"});
    for (const Clip* slave : outline.slaves()) {
        const Timeline::Link& link = outline.timeline().links.at(slave);
        table.addRow({clipText(outline, slave), clipText(outline, link.master), lengthText(link.offset)});
    }
    return outline.slaves().empty() ? std::string() : "\n" + lines(table);
}

std::string trackingTable(const TimelineOutline& outline)
{
    Table table({Table::Left, Table::Left, Table::Left});
    table.addRow({"Following clip", "Tracked in", "Tracking"});
    for (const Clip* follower : outline.followers()) {
        const Timeline::TrackedObject& object = outline.timeline().trackingLinks.at(follower).trackedObject;
        table.addRow({clipText(outline, follower), clipText(outline, object.clip),
                      elided(object.trackingId, widestName)});
    }
    return outline.followers().empty() ? std::string() : "\n" + lines(table);
}

std::string labelTable(const TimelineOutline& outline)
{
    Table table({Table::Left, Table::Left, Table::Right});
    table.addRow({"Label", "Clip", "Position"});
    for (const auto& [clip, label] : outline.labels()) {
        table.addRow({label->name.isEmpty() ? "-" : elided(label->name, widestName), clipText(outline, clip),
                      lengthText(label->position)});
    }
    return outline.labels().empty() ? std::string() : "\n" + lines(table);
}

} // namespace

std::string formatText(const Timeline::Object& timeline)
{
    const std::string rate = frameRateText(timeline.frameRateN, timeline.frameRateD);
    return fmt::format("{} x {}{}, {} Hz, {}", timeline.width, timeline.height,
                       rate.empty() ? rate : ", " + rate, timeline.sampleRate,
                       channelsText(timeline.channelLayout));
}

std::string timelineTable(const Timeline::Object& timeline)
{
    const TimelineOutline outline(timeline);
    return fmt::format("Timeline: {} on {}, {}; {}\n", counted(outline.clips().size(), "clip", "clips"),
                       counted(outline.listedTracks(), "track", "tracks"), lengthText(lengthOf(timeline)),
                       formatText(timeline)) +
           trackTable(outline) + clipTable(outline) + transitionTable(outline) + linkTable(outline) +
           trackingTable(outline) + labelTable(outline);
}

} // namespace Host
