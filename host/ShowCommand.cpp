// SPDX-License-Identifier: Apache-2.0
#include "ShowCommand.h"

#include "MediaInput.h"
#include "MediaTable.h"

#include <EditorModel/media/File.h>
#include <EditorModel/persistence/Document.h>

#include <deque>

namespace Host {
namespace {

std::deque<const Media::File*> filesOf(const Document::Graph& graph)
{
    std::deque<const Media::File*> files;
    for (const Serialize::ISerializable* root : graph.roots()) {
        if (const auto* const file = dynamic_cast<const Media::File*>(root)) {
            files.push_back(file);
        }
    }
    return files;
}

} // namespace

ExitCode show(const QString& path)
{
    try {
        requireFile(path);
        // What --save writes is read from anybody; nothing else needs to be.
        const Document::Graph graph = Document::loadFile(path, Document::ForeignDocuments);
        const std::deque<const Media::File*> files = filesOf(graph);
        if (files.empty()) {
            writeError(path, "holds no descriptions of media files");
            return Failure;
        }
        return writeOutput(mediaTable(files)) ? Success : Failure;
    } catch (const MediaError& error) {
        writeError(path, error.reason);
        return Failure;
    } catch (const Document::Error& error) {
        writeError(error.what());
        return Failure;
    }
}

} // namespace Host
