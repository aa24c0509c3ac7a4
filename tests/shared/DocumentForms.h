// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Document.h>

#include <QBuffer>

#include <array>
#include <ostream>
#include <string>

/// The six ways in which a document can be stored.
struct Way
{
    Document::Form form;
    Document::Route route;
    const char* name;

    /// Times keep the low 32 bits only.
    bool wrapsTimes() const { return route == Document::Archive; }
};

inline constexpr std::array<Way, 6> allWays = {{
    {Document::Binary, Document::Archive, "BinaryArchive"},
    {Document::Xml, Document::Archive, "XmlArchive"},
    {Document::Json, Document::Archive, "JsonArchive"},
    {Document::Binary, Document::Stream, "BinaryStream"},
    {Document::Xml, Document::Stream, "XmlStream"},
    {Document::Json, Document::Stream, "JsonStream"},
}};

inline void PrintTo(const Way& way, std::ostream* stream)
{
    *stream << way.name;
}

inline QByteArray documentOf(const std::deque<const Serialize::ISerializable*>& roots, const Way& way)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    Document::save(buffer, roots, way.form, way.route);
    return buffer.data();
}

inline Document::Graph graphOf(QByteArray document)
{
    QBuffer buffer(&document);
    buffer.open(QIODevice::ReadOnly);
    return Document::load(buffer);
}

/// The error that loading ends in; fails the test's expectation by an empty text where it succeeds.
inline std::string loadError(const QByteArray& document)
{
    try {
        graphOf(document);
    } catch (const Document::Error& error) {
        return error.what();
    }
    return std::string();
}
