// SPDX-License-Identifier: Apache-2.0
#include "host/text/DisplayText.h"

#include <QVector>

#include <fmt/format.h>

#include <algorithm>
#include <clocale>
#include <cwchar>

namespace Host {
namespace {

/// The widths of characters whatever the user's locale is; the C library has them by locale only.
class CharacterWidths
{
public:
    CharacterWidths() : m_locale(newlocale(LC_CTYPE_MASK, "C.UTF-8", nullptr)) {}
    CharacterWidths(const CharacterWidths&) = delete;
    CharacterWidths& operator=(const CharacterWidths&) = delete;
    ~CharacterWidths()
    {
        if (m_locale) {
            freelocale(m_locale);
        }
    }

    int of(const QVector<uint>& characters) const
    {
        if (!m_locale) {
            return characters.size();
        }
        const locale_t before = uselocale(m_locale);
        int width = 0;
        for (const uint character : characters) {
            width += std::max(0, wcwidth(static_cast<wchar_t>(character)));
        }
        uselocale(before);
        return width;
    }

private:
    const locale_t m_locale;
};

int widthOf(const QVector<uint>& characters)
{
    static const CharacterWidths widths;
    return widths.of(characters);
}

bool steersATerminal(uint character)
{
    // The joiners shape letters and emoji; other format characters can turn a line round.
    constexpr uint nonJoiner = 0x200C;
    constexpr uint joiner = 0x200D;
    switch (QChar::category(character)) {
    case QChar::Other_Control:
    case QChar::Separator_Line:
    case QChar::Separator_Paragraph:
        return true;
    case QChar::Other_Format:
        return character != nonJoiner && character != joiner;
    default:
        return false;
    }
}

} // namespace

std::string printable(const QString& text)
{
    std::string printed;
    for (const uint character : text.toUcs4()) {
        if (steersATerminal(character)) {
            printed += fmt::format("\\x{:02x}", character);
        } else {
            printed += QString::fromUcs4(&character, 1).toStdString();
        }
    }
    return printed;
}

int displayWidth(const std::string& text)
{
    return widthOf(QString::fromStdString(text).toUcs4());
}

std::string elided(const QString& text, int width)
{
    std::string whole = printable(text);
    if (displayWidth(whole) <= width) {
        return whole;
    }
    const QString dots = QString("...").left(std::max(width, 0));
    QVector<uint> kept = QString::fromStdString(whole).toUcs4();
    while (!kept.isEmpty() && widthOf(kept) + dots.size() > width) {
        kept.removeLast();
    }
    return (QString::fromUcs4(kept.constData(), kept.size()) + dots).toStdString();
}

} // namespace Host
