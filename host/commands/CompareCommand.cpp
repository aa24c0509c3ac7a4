// SPDX-License-Identifier: Apache-2.0
#include "host/commands/CompareCommand.h"

#include "host/analysis/TrackingStore.h"
#include "host/commands/Refusal.h"
#include "host/project/GraphComparison.h"
#include "host/project/ProjectDocument.h"
#include "host/text/DisplayText.h"

#include <EditorModel/analysis/MotionTracking.h>
#include <EditorModel/persistence/Document.h>

#include <fmt/format.h>

#include <memory>
#include <string>

namespace Host {
namespace {

/// What the document holds, and the trackings beside it.
GraphRecord recordOfFile(const QString& path)
{
    TrackingStore trackings;
    const ProjectDocument document = ProjectDocument::load(path);
    // Nobody tells of a plain document that was read.
    trackings.load(TrackingStore::folderOf(path));
    if (!trackings.damages().empty()) {
        throw Refusal(trackings.damages().front().path, trackings.damages().front().reason);
    }
    std::deque<const Serialize::ISerializable*> roots(document.graph().roots().begin(),
                                                      document.graph().roots().end());
    std::deque<std::shared_ptr<const MotionTracking::Data>> kept;
    for (const QString& id : trackings.ids()) {
        kept.push_back(trackings.find(id));
        roots.push_back(kept.back().get());
    }
    return recordOf(roots);
}

/// Whether they are the same.
bool compare(const GraphRecord& record, const QString& first, const QString& other, std::string& text)
{
    const auto difference = firstDifference(record, recordOfFile(other));
    if (difference) {
        text += fmt::format("{} differs from {}: {}\n", printable(other), printable(first),
                            printable(QString::fromStdString(*difference)));
    } else {
        text += fmt::format("{} is the same as {}.\n", printable(other), printable(first));
    }
    return !difference;
}

} // namespace

ExitCode compareDocuments(const QString& first, const QStringList& others)
{
    std::string text;
    bool isSame = true;
    const ExitCode read = unlessRefused([&] {
        const GraphRecord record = recordOfFile(first);
        for (const QString& other : others) {
            isSame = compare(record, first, other, text) && isSame;
        }
        return Success;
    });
    if (!writeOutput(text)) {
        return Failure;
    }
    return read != Success ? UsageError : isSame ? Success : Failure;
}

} // namespace Host
