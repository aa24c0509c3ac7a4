// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Document.h>

#include <QString>

#include <deque>

namespace Host {

/// Throws Refusal where there is no file to read, and Document::Error.
Document::Graph loadDocument(const QString& path, Document::Origin origin = Document::ForeignDocuments);

/// Replaces the file as a whole or not at all; its ending tells the form. Throws Refusal for another ending,
/// and Document::Error.
void saveDocument(const std::deque<const Serialize::ISerializable*>& roots, const QString& path);

/// The class of the first root, by its archive name, or "nothing".
QString contentOf(const Document::Graph& graph);

} // namespace Host
