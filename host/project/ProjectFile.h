// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Document.h>

#include <QByteArray>

namespace Host {

/// How a project stands in a file: a document, and around it a seal with a tag, a version, and length and
/// SHA-256 of the document, so that damage is found before anything of it is read. In Json and in XML the
/// whole file is Json and XML for every other program too.

/// What stands before the document and behind it.
struct ProjectSeal
{
    QByteArray before;
    QByteArray behind;
};

ProjectSeal projectSeal(const QByteArray& document, Document::Form form);

/// How much of a file isProjectFile() has to see.
constexpr int projectMarkLength = 512;

/// The file with this begin and this end is a project's, whole or damaged. Where all its marks are damaged it
/// is not. What is longer than a mark is looked at no further.
bool isProjectFile(const QByteArray& begin, const QByteArray& end);

/// The document of a project's file, which must be one by its marks. It shares the bytes of the
/// file, which live longer. Throws Document::Error for damage, and for what a newer version has written.
QByteArray projectDocument(const QByteArray& file);

} // namespace Host
