// SPDX-License-Identifier: Apache-2.0
#include "host/project/DocumentFile.h"

#include "host/commands/Refusal.h"
#include "host/media/MediaInput.h"

namespace Host {

Document::Graph loadDocument(const QString& path, Document::Origin origin)
{
    try {
        requireFile(path);
    } catch (const MediaError& error) {
        throw Refusal(path, error.reason);
    }
    return Document::loadFile(path, origin);
}

void saveDocument(const std::deque<const Serialize::ISerializable*>& roots, const QString& path)
{
    const auto form = Document::formOfPath(path);
    if (!form) {
        throw Refusal(path, "is no name of a document: such a name ends in .json, .xml or .bin");
    }
    Document::saveFile(path, roots, *form, Document::Stream);
}

QString contentOf(const Document::Graph& graph)
{
    const auto* const root = graph.rootAs<Serialize::ISerializable>();
    return root ? QString::fromStdString(root->GetNameInArchive()) : "nothing";
}

} // namespace Host
