// SPDX-License-Identifier: Apache-2.0
#include "host/project/ProjectFile.h"

#include <QtEndian>

#include <openssl/evp.h>

#include <optional>
#include <stdexcept>

namespace Host {
namespace {

constexpr int version = 1;

/// Not text in any encoding, and changed by whatever changes line ends.
const QByteArray binarySignature("\x89"
                                 "EMP\r\n\x1A\n",
                                 8);
constexpr int digestLength = 32;
constexpr int versionOffset = 8;
constexpr int lengthOffset = versionOffset + 4;
constexpr int digestOffset = lengthOffset + 8;
constexpr int contentOffset = digestOffset + digestLength;

const QByteArray jsonBegin(R"({"format": "EditorModel project", "version": )");
const QByteArray jsonTag(R"("EditorModel project")");
const QByteArray jsonLength(R"(, "length": )");
const QByteArray jsonDigest(R"(, "sha256": ")");
const QByteArray jsonDocument(R"(", "document":)"
                              "\n");
const QByteArray jsonEnd("\n}\n");

const QByteArray xmlBegin("<!-- EditorModel project: version ");
const QByteArray xmlTag("<!-- EditorModel project");
const QByteArray xmlLength(", length ");
const QByteArray xmlDigest(", SHA-256 ");
const QByteArray xmlEnd(" -->\n");

/// By a library that knows the processor's instructions for it: Qt's takes as long as writing the file.
QByteArray digestOf(const QByteArray& bytes)
{
    QByteArray digest(digestLength, '\0');
    if (EVP_Digest(bytes.constData(), std::size_t(bytes.size()),
                   reinterpret_cast<unsigned char*>(digest.data()), nullptr, EVP_sha256(), nullptr) != 1) {
        throw std::runtime_error("a checksum cannot be made");
    }
    return digest;
}

const char* nameOf(Document::Form form)
{
    switch (form) {
    case Document::Binary:
        return "binary project";
    case Document::Xml:
        return "XML project";
    case Document::Json:
        return "Json project";
    }
    return "project";
}

/// The stretch of the bytes without a copy of them.
QByteArray part(const QByteArray& bytes, qint64 from, qint64 length)
{
    return QByteArray::fromRawData(bytes.constData() + from, int(length));
}

[[noreturn]] void refuse(Document::Form form, const std::string& reason)
{
    throw Document::Error(nameOf(form), "", reason);
}

void checkVersion(Document::Form form, std::optional<qint64> found)
{
    if (!found || *found < version) {
        refuse(form, "it is damaged: its version cannot be read");
    }
    if (*found > version) {
        refuse(form, "it was written by a newer version: its layout has the number " +
                         std::to_string(*found) + ", and " + std::to_string(version) +
                         " is the latest that is known here");
    }
}

void checkLength(Document::Form form, std::optional<qint64> expected, qint64 found)
{
    if (!expected) {
        refuse(form, "it is damaged: its length cannot be read");
    }
    if (*expected == found) {
        return;
    }
    refuse(form, (*expected > found ? "it is cut off: " : "it goes on behind its end: ") +
                     std::to_string(*expected) + " bytes are expected, " + std::to_string(found) +
                     " are there");
}

/// A decimal number behind the first `key`.
std::optional<qint64> numberBehind(const QByteArray& text, const QByteArray& key)
{
    const int at = text.indexOf(key);
    if (at < 0) {
        return std::nullopt;
    }
    const int from = at + key.size();
    int to = from;
    while (to < text.size() && text[to] >= '0' && text[to] <= '9') {
        ++to;
    }
    bool isNumber = false;
    const qint64 number = text.mid(from, to - from).toLongLong(&isNumber);
    return isNumber ? std::optional(number) : std::nullopt;
}

/// Written anew, the seal must be the same to the last byte.
QByteArray checked(Document::Form form, const QByteArray& file, int from, qint64 length)
{
    const QByteArray document = part(file, from, length);
    const ProjectSeal seal = projectSeal(document, form);
    if (part(file, 0, from) != seal.before ||
        part(file, from + length, file.size() - from - length) != seal.behind) {
        refuse(form, "it is damaged: its content does not fit its checksum");
    }
    return document;
}

QByteArray fromBinary(const QByteArray& file)
{
    if (!file.startsWith(binarySignature)) {
        refuse(Document::Binary, "it is damaged: it does not begin as a project does");
    }
    if (file.size() < lengthOffset) {
        checkLength(Document::Binary, contentOffset, file.size());
    }
    checkVersion(Document::Binary, qFromLittleEndian<quint32>(file.constData() + versionOffset));
    if (file.size() < contentOffset) {
        checkLength(Document::Binary, contentOffset, file.size());
    }
    const qint64 length = file.size() - contentOffset;
    checkLength(Document::Binary, qFromLittleEndian<qint64>(file.constData() + lengthOffset), length);
    return checked(Document::Binary, file, contentOffset, length);
}

QByteArray fromJson(const QByteArray& file)
{
    const int from = file.indexOf('\n') + 1;
    const QByteArray line = part(file, 0, from ? from : file.size());
    if (!line.startsWith(jsonBegin)) {
        refuse(Document::Json, "it is damaged: its first line is not that of a project");
    }
    checkVersion(Document::Json, numberBehind(line, jsonBegin));
    if (!line.endsWith(jsonDocument)) {
        refuse(Document::Json, from ? "it is damaged: its first line is not that of a project"
                                    : "it is cut off: its first line has no end");
    }
    const qint64 length = qint64(file.size()) - from - jsonEnd.size();
    checkLength(Document::Json, numberBehind(line, jsonLength), length);
    return checked(Document::Json, file, from, length);
}

QByteArray fromXml(const QByteArray& file)
{
    // In an XML document itself there is no comment.
    const int end = file.lastIndexOf(xmlTag);
    if (end < 0) {
        refuse(Document::Xml, "it is cut off: the line that closes a project is missing");
    }
    const QByteArray line = part(file, end, file.size() - end);
    checkVersion(Document::Xml, numberBehind(line, xmlBegin));
    checkLength(Document::Xml, numberBehind(line, xmlLength), end);
    return checked(Document::Xml, file, 0, end);
}

bool isBinaryProject(const QByteArray& file)
{
    // What changes line ends changes the signature as well; its name is enough to know what was meant.
    return file.startsWith(binarySignature.left(4));
}

bool isJsonProject(const QByteArray& begin)
{
    return begin.startsWith('{') &&
           (begin.startsWith(jsonBegin.left(10)) || begin.left(jsonBegin.size() + 16).contains(jsonTag));
}

/// Without its last line a project still says what its root is.
bool isXmlProject(const QByteArray& begin, const QByteArray& end)
{
    return begin.startsWith('<') && !begin.contains("<!DOCTYPE") &&
           (begin.contains("class=\"Project::Content\"") || end.contains(xmlTag));
}

} // namespace

ProjectSeal projectSeal(const QByteArray& document, Document::Form form)
{
    const QByteArray digest = digestOf(document);
    const QByteArray length = QByteArray::number(document.size());
    switch (form) {
    case Document::Binary: {
        QByteArray head(contentOffset, '\0');
        head.replace(0, binarySignature.size(), binarySignature);
        qToLittleEndian<quint32>(version, head.data() + versionOffset);
        qToLittleEndian<qint64>(document.size(), head.data() + lengthOffset);
        head.replace(digestOffset, digestLength, digest);
        return {head, {}};
    }
    case Document::Xml:
        return {{},
                xmlBegin + QByteArray::number(version) + xmlLength + length + xmlDigest + digest.toHex() +
                    xmlEnd};
    case Document::Json:
        return {jsonBegin + QByteArray::number(version) + jsonLength + length + jsonDigest + digest.toHex() +
                    jsonDocument,
                jsonEnd};
    }
    throw std::invalid_argument("there is no form " + std::to_string(form));
}

bool isProjectFile(const QByteArray& begin, const QByteArray& end)
{
    return isBinaryProject(begin) || isJsonProject(begin) ||
           isXmlProject(begin.left(projectMarkLength), end.right(projectMarkLength));
}

QByteArray projectDocument(const QByteArray& file)
{
    if (isBinaryProject(file)) {
        return fromBinary(file);
    }
    return file.startsWith('{') ? fromJson(file) : fromXml(file);
}

} // namespace Host
