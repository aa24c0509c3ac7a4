// SPDX-License-Identifier: Apache-2.0
#include "host/commands/ShowCommand.h"

#include "host/commands/Refusal.h"
#include "host/media/MediaTable.h"
#include "host/media/ResourceText.h"
#include "host/project/ProjectDocument.h"
#include "host/project/ProjectFacts.h"
#include "host/timeline/TimelineTable.h"

#include <EditorModel/media/File.h>
#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/persistence/Document.h>

#include <deque>
#include <string>

namespace Host {
namespace {

/// The roots of this class, in their order.
template <class T>
std::deque<const T*> rootsOf(const Document::Graph& graph)
{
    std::deque<const T*> found;
    for (const Serialize::ISerializable* root : graph.roots()) {
        if (const auto* const object = dynamic_cast<const T*>(root)) {
            found.push_back(object);
        }
    }
    return found;
}

void append(std::string& text, const std::string& part)
{
    text += (text.empty() ? "" : "\n") + part;
}

/// Of a plain document.
std::string textOf(const Document::Graph& graph)
{
    std::string text;
    for (const Timeline::Object* timeline : rootsOf<Timeline::Object>(graph)) {
        append(text, timelineTable(*timeline));
    }
    const std::deque<const Media::File*> files = rootsOf<Media::File>(graph);
    if (!files.empty()) {
        append(text, mediaTable(files));
    }
    for (const ResourceTable::Object* table : rootsOf<ResourceTable::Object>(graph)) {
        append(text, resourceText(*table));
    }
    return text;
}

} // namespace

ExitCode show(const QString& path)
{
    return unlessRefused([&] {
        const ProjectDocument document = ProjectDocument::load(path);
        const std::string text =
            document.project() ? projectText(*document.project()) : textOf(document.graph());
        if (text.empty()) {
            throw Refusal(path,
                          "holds no project, no timeline, no descriptions of media files and no resources");
        }
        return writeOutput(text) ? Success : Failure;
    });
}

} // namespace Host
