// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tests/shared/DocumentForms.h"

#include <QByteArray>

#include <set>
#include <string>
#include <vector>

namespace GoldenTests {

/// The documents that are kept beside the tests, in a folder a route, each as `NAME.xml`, `NAME.json` and
/// `NAME.hex`: a binary document, byte by byte, with what the bytes stand for behind a `#`. They are for
/// life.
struct FrozenDocument
{
    /// With a '.' for every "::" of a class.
    static std::string fileOf(const std::string& name, const Way& way);
    /// The names of all files there are.
    static std::set<std::string> files();
    /// All that are stored in one way.
    static std::vector<FrozenDocument> all(const Way& way);

    /// Throws `std::runtime_error` where there is no such document.
    FrozenDocument(const std::string& name, const Way& way) : FrozenDocument(way.form, fileOf(name, way)) {}

    /// What differs first between the document and `written`, in words; empty where they say the same. Json
    /// has no order of members and no blanks, the other forms are compared to the byte.
    std::string difference(const QByteArray& written) const;

    QByteArray bytes;

private:
    FrozenDocument(Document::Form form, const std::string& file);

    Document::Form form;
    std::string text;
};

} // namespace GoldenTests
