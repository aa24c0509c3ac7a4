// SPDX-License-Identifier: Apache-2.0
#include "tests/archives/CutDocuments.h"

#include <nlohmann/json.hpp>

#include <QCryptographicHash>
#include <QRegularExpression>
#include <QtEndian>

#include <iterator>
#include <stdexcept>

namespace {

using nlohmann::json;

QByteArray sha256(const QByteArray& bytes)
{
    return QCryptographicHash::hash(bytes, QCryptographicHash::Sha256);
}

/// What stands in front of the content of a binary document, its digest the last of it.
constexpr int frameLength = 50;

/// A binary document of the content, framed as `document` is.
QByteArray framed(const QByteArray& content, const QByteArray& document)
{
    char length[8];
    qToLittleEndian<qint64>(content.size(), length);
    return document.left(10) + QByteArray(length, sizeof length) + sha256(content) + content;
}

QByteArray sealed(const QByteArray& content)
{
    return content + "<!-- EditorModel archive: " + QByteArray::number(content.size()) + " bytes, SHA-256 " +
           sha256(content).toHex() + " -->\n";
}

QByteArray withoutSeal(const QByteArray& document)
{
    return document.left(document.lastIndexOf("<!--"));
}

/// The lines before `place`, with an end to all that is open there: Json that lacks its later fields.
QByteArray closedJson(const QByteArray& document, int place)
{
    QByteArray text = document.left(document.lastIndexOf('\n', place));
    if (text.endsWith(','))
        text.chop(1);
    QByteArray open;
    bool isText = false;
    for (int i = 0; i < text.size(); ++i) {
        const char c = text[i];
        if (isText && c == '\\')
            ++i;
        else if (c == '"')
            isText = !isText;
        else if (!isText && (c == '{' || c == '['))
            open.prepend(c == '{' ? '}' : ']');
        else if (!isText && (c == '}' || c == ']'))
            open.remove(0, 1);
    }
    return text + open;
}

/// Json with no value where the leaf nearest behind `part` of all leaves was. Its fields are in the order of
/// the alphabet and not in that of reading, so that a cut would always be found at the same field.
QByteArray withoutLeaf(const QByteArray& document, double part)
{
    json tree = json::parse(document.toStdString());
    const json leaves = tree.flatten();
    auto leaf = std::next(leaves.begin(), static_cast<int>(part * static_cast<double>(leaves.size())));
    // Nobody reads the version of items, the items where there are none, and the class beside a reference.
    const QRegularExpression unread(QStringLiteral("/(item|item_version|class)$"));
    while (QString::fromStdString(leaf.key()).contains(unread))
        ++leaf;
    tree[json::json_pointer(leaf.key())] = json::array();
    return QByteArray::fromStdString(tree.dump());
}

} // namespace

QByteArray cutWithin(const QByteArray& document, double part, const Way& way)
{
    const auto place = [&](int size) { return static_cast<int>(part * size); };
    switch (way.form) {
    case Document::Binary:
        return framed(document.mid(frameLength, place(document.size() - frameLength)), document);
    case Document::Xml:
        if (way.route == Document::Archive) {
            // The reader reads beyond a key whose end tag is a longer one: no tag is to be read on from here.
            const int end = document.lastIndexOf("</boost_serialization>");
            return sealed(document.left(place(end)) + "<&" + withoutSeal(document).mid(end));
        }
        return document.left(place(document.size()));
    case Document::Json:
        return way.route == Document::Archive ? withoutLeaf(document, part)
                                              : closedJson(document, place(document.size()));
    }
    throw std::invalid_argument(way.name);
}

QByteArray closedAgain(const QByteArray& document, const Way& way)
{
    if (way.form == Document::Binary)
        return framed(document.mid(frameLength), document);
    if (way.form == Document::Xml && way.route == Document::Archive)
        return sealed(withoutSeal(document));
    return document;
}
