// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/Frame.h>

#include <QCryptographicHash>
#include <QtEndian>

namespace Document::Details {
namespace {

/// Not text in any encoding, and changed by whatever changes line ends.
constexpr char signature[] = "\x89"
                             "EDM\r\n\x1A\n";
constexpr int signatureLength = 8;
constexpr int nameLength = 4;
constexpr char frameVersion = 1;
constexpr int digestLength = 32;
constexpr int lengthOffset = signatureLength + 2;
constexpr int digestOffset = lengthOffset + 8;
constexpr int contentOffset = digestOffset + digestLength;

constexpr char sealBegin[] = "<!-- EditorModel archive: ";
constexpr char sealMiddle[] = " bytes, SHA-256 ";
constexpr char sealEnd[] = " -->\n";

QByteArray digest(const QByteArray& content)
{
    return QCryptographicHash::hash(content, QCryptographicHash::Sha256);
}

[[noreturn]] void throwDamaged()
{
    throw std::runtime_error("it is damaged: its content does not fit its checksum");
}

/// The bytes from `from` to before `to`, which stay the document's: whole documents aren't copied.
QByteArray part(const QByteArray& document, int from, int to)
{
    return QByteArray::fromRawData(document.constData() + from, to - from);
}

QByteArray sealOf(const QByteArray& content)
{
    return sealBegin + QByteArray::number(content.size()) + sealMiddle + digest(content).toHex() + sealEnd;
}

bool isBlank(char c)
{
    return c == ' ' || (c >= '\t' && c <= '\r');
}

bool endsWithEndTag(const QByteArray& content)
{
    int end = content.size();
    while (end > 0 && isBlank(content[end - 1]))
        --end;
    return part(content, 0, end).endsWith("</boost_serialization>");
}

void checkLength(qint64 expected, qint64 found)
{
    if (expected > found)
        throw std::runtime_error("it is cut off: " + std::to_string(expected) + " bytes are expected, " +
                                 std::to_string(found) + " are there");
    if (expected < found)
        throw std::runtime_error("it goes on behind its end: " + std::to_string(expected) +
                                 " bytes are expected, " + std::to_string(found) + " are there");
}

} // namespace

QByteArray framed(const QByteArray& content, Route route)
{
    QByteArray document(signature, signatureLength);
    document.reserve(contentOffset + content.size());
    document += frameVersion;
    document += static_cast<char>(route);
    char length[8];
    qToLittleEndian<qint64>(content.size(), length);
    document.append(length, sizeof length);
    document += digest(content);
    document += content;
    return document;
}

bool hasFrame(const QByteArray& document)
{
    // What changes line ends changes the signature as well; its name is enough to know what was meant.
    return document.startsWith(QByteArray::fromRawData(signature, nameLength));
}

Unframed unframed(const QByteArray& document)
{
    if (!document.startsWith(QByteArray::fromRawData(signature, signatureLength)))
        throw std::runtime_error("it does not begin as a binary document does");
    if (document.size() < contentOffset)
        checkLength(contentOffset, document.size());
    if (document[signatureLength] != frameVersion)
        throw std::runtime_error("it is of version " + std::to_string(int(document[signatureLength])) +
                                 ", which is not known");
    const char route = document[signatureLength + 1];
    if (route != Archive && route != Stream)
        throwDamaged();
    const auto length = qFromLittleEndian<qint64>(document.constData() + lengthOffset);
    const QByteArray content = part(document, contentOffset, document.size());
    checkLength(length, content.size());
    if (digest(content) != document.mid(digestOffset, digestLength))
        throwDamaged();
    return {static_cast<Route>(route), content};
}

QByteArray sealed(QByteArray content)
{
    return content += sealOf(content);
}

QByteArray unsealed(const QByteArray& document)
{
    const int seal = document.lastIndexOf(sealBegin);
    if (seal < 0)
        throw std::runtime_error("it is cut off: the line that closes an archive is missing");
    const QByteArray content = part(document, 0, seal);
    // Written anew, the seal must be the same to the last byte.
    if (sealOf(content) != part(document, seal, document.size()))
        throwDamaged();
    // The archive's reader ends the process where the end tag is missing.
    if (!endsWithEndTag(content))
        throw std::runtime_error("it is cut off: its end tag is missing");
    return content;
}

bool isXmlArchive(const QByteArray& document)
{
    const int lastLine = document.lastIndexOf('\n', document.size() - 2) + 1;
    return document.left(256).contains("<!DOCTYPE boost_serialization>") ||
           document.mid(lastLine).startsWith(sealBegin);
}

} // namespace Document::Details
