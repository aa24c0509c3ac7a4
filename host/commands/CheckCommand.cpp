// SPDX-License-Identifier: Apache-2.0
#include "host/commands/CheckCommand.h"

#include "host/analysis/TrackingStore.h"
#include "host/commands/Refusal.h"
#include "host/project/ProjectDocument.h"
#include "host/project/ProjectFaults.h"
#include "host/text/DisplayText.h"

#include <EditorModel/persistence/Document.h>

#include <QFileInfo>

#include <fmt/format.h>
#include <nlohmann/json.hpp>

#include <string>
#include <vector>

namespace Host {
namespace {

std::vector<ProjectFault> faultsOf(const QString& path)
{
    TrackingStore trackings;
    const ProjectDocument document = ProjectDocument::load(path);
    // Nobody tells of a plain document that was read.
    trackings.load(TrackingStore::folderOf(path));
    CheckedProject project = {{}, document.project(), QFileInfo(path).absolutePath(), trackings};
    project.roots.assign(document.graph().roots().begin(), document.graph().roots().end());
    return projectFaults(project);
}

std::string textOf(const std::vector<ProjectFault>& faults)
{
    std::string text;
    for (const ProjectFault& fault : faults) {
        const FaultRule& rule = ruleOf(fault.code);
        text += fmt::format("{}: {}: {} {}\n", rule.name, printable(fault.about), printable(fault.text),
                            rule.advice);
    }
    return text.empty() ? "No faults.\n" : text;
}

using Json = nlohmann::ordered_json;

std::string dumped(const Json& json)
{
    return json.dump(2, ' ', false, Json::error_handler_t::replace) + '\n';
}

std::string jsonOf(const std::vector<ProjectFault>& faults)
{
    Json list = Json::array();
    for (const ProjectFault& fault : faults) {
        const FaultRule& rule = ruleOf(fault.code);
        list.push_back({{"code", rule.name},
                        {"about", fault.about.toStdString()},
                        {"text", fault.text.toStdString()},
                        {"advice", rule.advice}});
    }
    return dumped({{"readable", true}, {"faults", list}});
}

ExitCode refuse(const QString& reason, bool asJson)
{
    if (asJson) {
        writeOutput(dumped({{"readable", false}, {"reason", reason.toStdString()}}));
    }
    writeError(reason);
    return UsageError;
}

} // namespace

ExitCode checkProject(const QString& path, bool asJson)
{
    std::vector<ProjectFault> faults;
    try {
        faults = faultsOf(path);
    } catch (const Refusal& refusal) {
        return refuse(refusal.name + ": " + refusal.reason, asJson);
    } catch (const Document::Error& error) {
        return refuse(QString::fromStdString(error.what()), asJson);
    }
    const bool isPrinted = writeOutput(asJson ? jsonOf(faults) : textOf(faults));
    return isPrinted && faults.empty() ? Success : Failure;
}

} // namespace Host
