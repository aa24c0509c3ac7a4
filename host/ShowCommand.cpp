// SPDX-License-Identifier: Apache-2.0
#include "ShowCommand.h"

#include "MediaInput.h"
#include "MediaTable.h"
#include "ResourceText.h"
#include "TimelineTable.h"

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
    try {
        requireFile(path);
        // What the commands write is read from anybody; nothing else needs to be.
        const Document::Graph graph = Document::loadFile(path, Document::ForeignDocuments);
        const std::string text = textOf(graph);
        if (text.empty()) {
            writeError(path, "holds no timeline, no descriptions of media files and no resources");
            return Failure;
        }
        return writeOutput(text) ? Success : Failure;
    } catch (const MediaError& error) {
        writeError(path, error.reason);
        return Failure;
    } catch (const Document::Error& error) {
        writeError(error.what());
        return Failure;
    }
}

} // namespace Host
