// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldVisitors.h"

#include <EditorModel/effects/Overlay.h>

#include <gmock/gmock.h>
#include <rapidcheck/gtest.h>

namespace {

using Overlay::decodeText;
using Overlay::encodeText;

constexpr uint LAST_CODE_POINT = 0x10FFFF;
constexpr uint FIRST_SURROGATE = 0xD800;
constexpr uint LAST_SURROGATE = 0xDFFF;

bool isSurrogate(uint code)
{
    return code >= FIRST_SURROGATE && code <= LAST_SURROGATE;
}

/// QString::fromUcs4() drops a byte order mark.
QString character(uint code)
{
    if (!QChar::requiresSurrogates(code))
        return QString(QChar(code));
    return QString(QChar(QChar::highSurrogate(code))) + QChar(QChar::lowSurrogate(code));
}

TEST(OverlayText, IsBase64OfItsUtf8)
{
    EXPECT_EQ(encodeText(QString()), "");
    EXPECT_EQ(encodeText(""), "");
    EXPECT_EQ(encodeText("a"), "YQ==");
    EXPECT_EQ(encodeText("ab"), "YWI=");
    EXPECT_EQ(encodeText("abc"), "YWJj");
    // C3 A9, E6 97 A5, F0 9F 98 80
    EXPECT_EQ(encodeText(character(0xE9)), "w6k=");
    EXPECT_EQ(encodeText(character(0x65E5)), "5pel");
    EXPECT_EQ(encodeText(character(0x1F600)), "8J+YgA==");
    EXPECT_EQ(encodeText(character(0)), "AA==");
    // EF BB BF, EF BF BF: with '/' and '+' of the usual alphabet.
    EXPECT_EQ(encodeText(character(0xFEFF)), "77u/");
    EXPECT_EQ(encodeText(character(0xFFFF)), "77+/");
}

TEST(OverlayText, EveryCodePointComesBack)
{
    QString all;
    for (uint code = 0; code <= LAST_CODE_POINT; ++code) {
        if (isSurrogate(code))
            continue;
        const QString text = character(code);
        ASSERT_EQ(decodeText(encodeText(text)), text) << std::hex << code;
        ASSERT_EQ(decodeText(encodeText("a" + text + "z")), "a" + text + "z") << std::hex << code;
        all += text;
    }
    EXPECT_TRUE(decodeText(encodeText(all)) == all);
}

TEST(OverlayText, ASurrogateWithoutItsPartnerBecomesAQuestionMark)
{
    for (uint code = FIRST_SURROGATE; code <= LAST_SURROGATE; ++code) {
        const QString text = "a" + QString(QChar(code)) + "z";
        ASSERT_EQ(encodeText(text), "YT96") << std::hex << code;
        ASSERT_EQ(decodeText(encodeText(text)), "a?z") << std::hex << code;
    }
}

TEST(OverlayText, EveryKindOfTextComesBack)
{
    EXPECT_EQ(decodeText(encodeText("")), "");
    for (const QString& text : Testing::awkwardTexts())
        EXPECT_EQ(decodeText(encodeText(text)), text);
    for (const QString& text : {character(0xFEFF) + character(0xFEFF), character(0) + character(0xFEFF),
                                character(0) + character(0), "x" + character(0)})
        EXPECT_EQ(decodeText(encodeText(text)), text);
}

RC_GTEST_PROP(OverlayText, AnyTextComesBack, ())
{
    const auto codes = *rc::gen::container<std::vector<uint>>(
        rc::gen::map(rc::gen::inRange<uint>(0, LAST_CODE_POINT + 1 - 0x800),
                     [](uint code) { return code < FIRST_SURROGATE ? code : code + 0x800; }));
    QString text;
    for (const uint code : codes)
        text += character(code);
    RC_ASSERT(decodeText(encodeText(text)) == text);
    for (const QChar letter : encodeText(text)) {
        RC_ASSERT((letter >= QChar('A') && letter <= QChar('Z')) ||
                  (letter >= QChar('a') && letter <= QChar('z')) ||
                  (letter >= QChar('0') && letter <= QChar('9')) || letter == QChar('+') ||
                  letter == QChar('/') || letter == QChar('='));
    }
}

TEST(OverlayText, IsDecodedWithoutAnyCheck)
{
    EXPECT_EQ(decodeText("YQ"), "a");
    EXPECT_EQ(decodeText("Y Q\n="), "a");
    EXPECT_EQ(decodeText("***"), "");
    EXPECT_EQ(decodeText(QString::fromUtf8("\xC3\xA9")), "");
    // The byte FF begins no character.
    EXPECT_EQ(decodeText("/w=="), QString(QChar(QChar::ReplacementCharacter)));
}

TEST(OverlayText, ComesBackFromEveryForm)
{
    Overlay::Preset preset;
    for (const QString& text : Testing::awkwardTexts())
        preset.appendItem(Overlay::Item().setText(text));
    for (const Way& way : allWays) {
        const Document::Graph graph = graphOf(documentOf({&preset}, way));
        const auto* const loaded = graph.rootAs<Overlay::Preset>();
        ASSERT_NE(loaded, nullptr) << way.name;
        ASSERT_EQ(loaded->items.size(), preset.items.size()) << way.name;
        for (std::size_t i = 0; i != preset.items.size(); ++i)
            EXPECT_EQ(loaded->items[i].text, preset.items[i].text) << way.name;
    }
}

TEST(OverlayText, IsStoredEncoded)
{
    Overlay::Preset preset;
    preset.appendItem(Overlay::Item().setText("<b>Caption</b>"));
    for (const Way& way : allWays) {
        const QByteArray document = documentOf({&preset}, way);
        EXPECT_FALSE(document.contains("Caption")) << way.name;
        EXPECT_TRUE(document.contains("PGI+Q2FwdGlvbjwvYj4=")) << way.name;
    }
}

} // namespace
