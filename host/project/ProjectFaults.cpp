// SPDX-License-Identifier: Apache-2.0
#include "host/project/ProjectFaults.h"

#include "host/project/CheckedTimelines.h"
#include "host/project/ClipFaults.h"
#include "host/project/GraphRecord.h"
#include "host/project/MediaFaults.h"

#include <EditorModel/library/Import.h>
#include <EditorModel/library/UserObject.h>
#include <EditorModel/media/File.h>
#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/persistence/ObjectTracker.h>

#include <map>
#include <set>
#include <stdexcept>
#include <string>

namespace Host {
namespace {

/// The objects of a class among the roots, in their order.
template <class T>
std::deque<const T*> rootsOf(const CheckedProject& project)
{
    std::deque<const T*> found;
    for (const Serialize::ISerializable* const root : project.roots) {
        if (const auto* const object = dynamic_cast<const T*>(root)) {
            found.push_back(object);
        }
    }
    return found;
}

/// Those that a project names stand before those that are roots themselves.
template <class T>
std::deque<const T*> objectsOf(const CheckedProject& project, const T* named)
{
    std::deque<const T*> found = rootsOf<T>(project);
    if (named) {
        found.push_front(named);
    }
    return found;
}

void findInTimeline(const CheckedTimeline& timeline, FaultList& faults)
{
    for (const TimelineFault& fault : timelineFaults(timeline.outline.timeline())) {
        faults.add(codeOf(fault.kind), fault.clip ? timeline.nameOf(fault.clip) : timeline.name, fault.text);
    }
}

void findInCollection(const EditorCollection::UserObject& collection, FaultList& faults)
{
    const QString about = QStringLiteral("the collection");
    std::set<const Import::Object*> listed;
    int number = 0;
    for (const Import::Object* const item : collection.items) {
        ++number;
        if (!item) {
            faults.add(NullItem, about, QString("Item %1 of the collection is nothing.").arg(number));
        } else if (!listed.insert(item).second) {
            faults.add(
                DoubleItem, about,
                QString("Item %1 of the collection, \"%2\", is listed before.").arg(number).arg(item->tag));
        }
    }
}

using Value = GraphRecord::Value;

/// The ways of keys to what is not a number.
void findWays(const Value& value, const QString& way, std::map<QString, int>& ways)
{
    const bool isText = value.text.rfind('"', 0) == 0;
    if (value.kind == Value::Scalar && !isText && value.text.find(notANumber) != std::string::npos) {
        ++ways[way];
    }
    for (const auto& [key, part] : value.parts) {
        const QString step = QString::fromStdString(key);
        findWays(part, way.isEmpty() || step.isEmpty() ? way + step : way + '/' + step, ways);
    }
}

void findNumbers(const CheckedProject& project, FaultList& faults)
{
    const GraphRecord record = recordOf(project.roots);
    std::map<QString, std::map<QString, int>> found;
    for (const GraphRecord::Node& node : record.nodes) {
        findWays(node.fields, QString(), found[QString::fromStdString(node.className)]);
    }
    for (const auto& [className, ways] : found) {
        for (const auto& [way, count] : ways) {
            faults.add(NotANumber, className,
                       QString("The field \"%1\" of a %2 is not a number, %3.")
                           .arg(way, className,
                                count == 1 ? QStringLiteral("once") : QString("%1 times").arg(count)));
        }
    }
}

void findHolding(const CheckedProject& project, FaultList& faults)
{
    boost::archive::object_tracker tracker;
    try {
        for (const Serialize::ISerializable* const root : project.roots) {
            tracker << boost::serialization::make_nvp("root", root);
        }
    } catch (const std::runtime_error& error) {
        faults.add(HeldTwice, QStringLiteral("the project"),
                   QString("An object is held in two ways: %1.").arg(error.what()));
    }
}

} // namespace

FaultCode codeOf(TimelineFault::Kind kind)
{
    switch (kind) {
    case TimelineFault::NoClip:
        return NullClip;
    case TimelineFault::NoTrack:
        return NoTrack;
    case TimelineFault::TimeOutOfRange:
        return TimeOutOfRange;
    case TimelineFault::NoDuration:
        return NoDuration;
    case TimelineFault::OutsideSource:
        return OutsideSource;
    case TimelineFault::TooLongAtEnds:
        return EndsTooLong;
    case TimelineFault::Overlap:
        return Overlap;
    case TimelineFault::TrackListedTwice:
        return TrackTwice;
    case TimelineFault::ForeignTrack:
        return ForeignTrack;
    case TimelineFault::ShowsItself:
        return ShowsItself;
    case TimelineFault::DanglingLink:
        return DanglingLink;
    case TimelineFault::LinkCycle:
        return LinkCycle;
    case TimelineFault::DanglingTracking:
        return DanglingTracking;
    case TimelineFault::DanglingTransition:
        return DanglingTransition;
    case TimelineFault::TransitionOnNothing:
        return TransitionOnNothing;
    case TimelineFault::TransitionApart:
        return TransitionApart;
    case TimelineFault::CrowdedTransition:
        return CrowdedTransition;
    case TimelineFault::WrongShare:
        return WrongShare;
    }
    // The compiler tells of a kind that has no code.
    throw std::invalid_argument("there is no kind of fault " + std::to_string(kind));
}

std::vector<ProjectFault> projectFaults(const CheckedProject& project)
{
    const Project::Content* const content = project.content;
    FaultList faults;
    if (content && !content->timeline) {
        faults.add(NoTimeline, QStringLiteral("the project"), QStringLiteral("The project has no timeline."));
    }
    const auto timelines =
        checkedTimelines(objectsOf<Timeline::Object>(project, content ? content->timeline : nullptr));
    for (const CheckedTimeline& timeline : timelines) {
        findInTimeline(timeline, faults);
        findClipFaults(timeline, project.trackings, faults);
    }
    for (const auto* collection :
         objectsOf<EditorCollection::UserObject>(project, content ? content->userCollection : nullptr)) {
        findInCollection(*collection, faults);
    }
    const auto tables = objectsOf<ResourceTable::Object>(project, content ? content->resourceTable : nullptr);
    findMediaFaults(timelines, rootsOf<Media::File>(project), tables.empty() ? nullptr : tables.front(),
                    content != nullptr, project.folder, faults);
    findNumbers(project, faults);
    findHolding(project, faults);
    return faults.take();
}

} // namespace Host
