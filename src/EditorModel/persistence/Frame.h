// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Document.h>

#include <QByteArray>

#include <optional>

namespace Document::Details {

/// Guards against damage: what a framed document holds is handed on only if its length and SHA-256 are right,
/// and nothing follows it. All functions throw `std::runtime_error` with a reason.

/// A binary document: a signature, version and route, the length, the digest, then the content.
QByteArray framed(const QByteArray& content, Route route);

struct Unframed
{
    Route route;
    /// The document's own bytes: it must outlive them.
    QByteArray content;
};
Unframed unframed(const QByteArray& document);
bool hasFrame(const QByteArray& document);

/// An XML archive: the content, and a comment behind it with its length and digest.
QByteArray sealed(QByteArray content);
/// The document's own bytes: it must outlive them.
QByteArray unsealed(const QByteArray& document);
/// The document begins as an archive does, sealed or not.
bool isXmlArchive(const QByteArray& document);

} // namespace Document::Details
