// SPDX-License-Identifier: Apache-2.0
#include "host/project/FaultList.h"

#include <fmt/format.h>

#include <algorithm>
#include <utility>

namespace Host {

const std::vector<FaultRule>& faultRules()
{
    static const std::vector<FaultRule> rules = {
        {NoTimeline, "no-timeline", "the project has no timeline", "Open the backup."},
        {NullClip, "null-clip", "nothing is listed as a clip", "Save the project anew without it."},
        {NoTrack, "no-track", "a clip lies on no track of its timeline", "Move the clip to a track."},
        {TimeOutOfRange, "time-out-of-range", "a time is negative or too late to be stored",
         "Move or trim the clip."},
        {NoDuration, "no-duration", "a clip has no duration", "Delete the clip."},
        {OutsideSource, "outside-source", "a clip shows more than its source has", "Trim the clip."},
        {EndsTooLong, "ends-too-long", "transitions or fades are longer than their clip", "Shorten them."},
        {Overlap, "overlap", "two clips of one track and level play at one time",
         "Move one of them, or trim it."},
        {TrackTwice, "track-twice", "a track is listed twice, or nothing is listed as one",
         "Save the project anew without it."},
        {ForeignTrack, "foreign-track", "a track says that it is another timeline's",
         "Make a new track and move its clips there."},
        {ShowsItself, "shows-itself", "a timeline shows itself inside of a clip", "Delete the clip."},
        {DanglingLink, "dangling-link", "a link names a clip that is gone", "Unlink the clip."},
        {LinkCycle, "link-cycle", "a clip depends on itself by links", "Unlink one of the clips."},
        {DanglingTracking, "dangling-tracking", "a tracking link names a clip that is gone",
         "Remove the tracking link."},
        {DanglingTransition, "dangling-transition", "a transition names a clip that is gone",
         "Remove the transition."},
        {TransitionOnNothing, "transition-on-nothing", "a transition has no clips", "Remove the transition."},
        {TransitionApart, "transition-apart", "the clips of a transition don't meet",
         "Remove the transition, or move the clips together."},
        {CrowdedTransition, "crowded-transition", "two transitions share one end of a clip",
         "Remove one of them."},
        {WrongShare, "wrong-share", "a clip's share of a transition doesn't match the transition",
         "Remove the transition and add it anew."},
        {ValueOutOfRange, "value-out-of-range", "a setting is outside of what it can be",
         "Set it to another value."},
        {EmptyEnvelope, "empty-envelope", "an envelope has no keys", "Remove the envelope, or add a key."},
        {UnsortedKeys, "unsorted-keys", "the keys of an envelope are out of order", "Add the keys anew."},
        {DoubleKey, "double-key", "an envelope has two keys at one place", "Remove one of them."},
        {NotANumber, "not-a-number", "a stored number is no number", "Set it to another value."},
        {UnknownTracking, "unknown-tracking", "a tracking link names a tracking that its clip doesn't have",
         "Link to another tracking."},
        {LostTracking, "lost-tracking", "the data of a tracking is lost", "Track the object anew."},
        {MissingMedia, "missing-media", "a media file is not there",
         "Bring the file back, or replace the clip."},
        {UnreadableMedia, "unreadable-media", "a media file can't be opened",
         "Bring a whole file back, or replace the clip."},
        {ChangedMedia, "changed-media", "a media file is not as it was described",
         "Bring the old file back, or add the file anew."},
        {NoMediaTrack, "no-media-track", "a clip plays a track that its file doesn't have",
         "Replace the clip."},
        {MissingResource, "missing-resource", "the file of a resource is not there",
         "Bring the file back, or take the resource out of the table."},
        {UnlistedMedia, "unlisted-media", "a media file is not in the table of resources",
         "Add the file to the table."},
        {NullItem, "null-item", "nothing is listed as an item of the collection",
         "Save the project anew without it."},
        {DoubleItem, "double-item", "an item of the collection is listed twice", "Remove one of them."},
        {HeldTwice, "held-twice", "an object is held in two ways", "Open the backup."},
    };
    return rules;
}

const FaultRule& ruleOf(FaultCode code)
{
    return faultRules().at(std::size_t(code));
}

std::string faultCodesText()
{
    std::string text = "Codes of faults:\n";
    for (const FaultRule& rule : faultRules()) {
        text += fmt::format("  {:<22}{}\n", rule.name, rule.meaning);
    }
    return text;
}

void FaultList::add(FaultCode code, const QString& about, const QString& text)
{
    m_faults.push_back({code, about, text});
}

std::vector<ProjectFault> FaultList::take()
{
    std::stable_sort(m_faults.begin(), m_faults.end(),
                     [](const ProjectFault& a, const ProjectFault& b) { return a.code < b.code; });
    return std::exchange(m_faults, {});
}

} // namespace Host
