// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QString>

#include <string>
#include <vector>

namespace Host {

/// What can be wrong with a project, in the order in which it is told.
enum FaultCode : int
{
    NoTimeline,
    NullClip,
    NoTrack,
    TimeOutOfRange,
    NoDuration,
    OutsideSource,
    EndsTooLong,
    Overlap,
    TrackTwice,
    ForeignTrack,
    ShowsItself,
    DanglingLink,
    LinkCycle,
    DanglingTracking,
    DanglingTransition,
    TransitionOnNothing,
    TransitionApart,
    CrowdedTransition,
    WrongShare,
    ValueOutOfRange,
    EmptyEnvelope,
    UnsortedKeys,
    DoubleKey,
    NotANumber,
    UnknownTracking,
    LostTracking,
    MissingMedia,
    UnreadableMedia,
    ChangedMedia,
    NoMediaTrack,
    MissingResource,
    UnlistedMedia,
    NullItem,
    DoubleItem,
    HeldTwice,
    FaultCodeCount,
};

/// A code as it is printed, which never changes, and what it stands for.
struct FaultRule
{
    FaultCode code;
    const char* name;
    const char* meaning;
    const char* advice;
};

/// In the order of the codes.
const std::vector<FaultRule>& faultRules();
const FaultRule& ruleOf(FaultCode code);

/// The codes and their meanings, a line each, for --help.
std::string faultCodesText();

struct ProjectFault
{
    FaultCode code;
    /// What it is about: `clip 2 "holiday"`, `file "/media/holiday.mp4"`, "the project".
    QString about;
    /// One sentence, with its full stop.
    QString text;
};

/// Faults that are found one after another.
class FaultList
{
public:
    void add(FaultCode code, const QString& about, const QString& text);
    /// In the order of the codes; those of one code in the order of finding.
    std::vector<ProjectFault> take();

private:
    std::vector<ProjectFault> m_faults;
};

} // namespace Host
