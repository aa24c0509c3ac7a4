// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/streams/XmlGuard.h>

#include <QByteArray>

#include <stdexcept>
#include <string>

namespace Serialize::Details {
namespace {

/// More than the stream ever writes; the parser's time grows with the square.
constexpr int maxAttributes = 8;

/// The place behind `end`, or the end of the document: the parser tells what is missing there.
int behind(const QByteArray& document, const char* end, int from)
{
    const int found = document.indexOf(end, from);
    return found < 0 ? document.size() : found + static_cast<int>(qstrlen(end));
}

bool standsAt(const QByteArray& document, const char* text, int position)
{
    const auto length = static_cast<int>(qstrlen(text));
    return document.size() - position >= length &&
           qstrncmp(document.constData() + position, text, length) == 0;
}

/// The place behind a tag that begins at `position`.
int behindTag(const QByteArray& document, int position)
{
    int attributes = 0;
    while (++position < document.size()) {
        const char c = document[position];
        if (c == '>')
            return position + 1;
        if (c != '"' && c != '\'')
            continue;
        if (++attributes > maxAttributes)
            throw std::runtime_error("an element has more than " + std::to_string(maxAttributes) +
                                     " attributes");
        position = document.indexOf(c, position + 1);
        if (position < 0)
            break;
    }
    return document.size();
}

} // namespace

void guardXml(const QByteArray& document)
{
    int position = document.indexOf('<');
    while (position >= 0 && position < document.size()) {
        if (standsAt(document, "<!--", position))
            position = behind(document, "-->", position + 4);
        else if (standsAt(document, "<![CDATA[", position))
            position = behind(document, "]]>", position + 9);
        else if (standsAt(document, "<?", position))
            position = behind(document, "?>", position + 2);
        else if (standsAt(document, "<!", position))
            throw std::runtime_error("a document type declaration is not taken");
        else
            position = behindTag(document, position);
        position = document.indexOf('<', position);
    }
}

} // namespace Serialize::Details
