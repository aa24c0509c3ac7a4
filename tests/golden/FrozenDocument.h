// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "samples/Sample.h"

#include <EditorModel/persistence/Document.h>

#include <QByteArray>

#include <set>
#include <string>

namespace GoldenTests {

/// The documents that are kept beside the tests, each as `NAME.xml`, `NAME.json` and `NAME.hex`: a binary
/// document, byte by byte, with what the bytes stand for behind a `#`. They are for life.
struct FrozenDocument
{
    /// With a '.' for every "::" of a class.
    static std::string fileOf(const std::string& name, Document::Form form);
    /// The names of all files there are.
    static std::set<std::string> files();

    /// Throws `std::runtime_error` where there is no such document.
    FrozenDocument(const std::string& name, Document::Form form);

    /// What differs first between the document and `bytes`, in words; empty where they say the same. Json has
    /// no order of members and no blanks, the other forms are compared to the byte.
    std::string difference(const QByteArray& bytes) const;

    Document::Form form;
    QByteArray bytes;

private:
    std::string text;
};

} // namespace GoldenTests
