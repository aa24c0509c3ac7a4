// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/Utf8.h>

#include <cstring>
#include <stdexcept>

namespace Serialize::Details {
namespace {

/// The bytes that may follow a lead byte: how many, and the range of the first of them (RFC 3629, section 4).
struct Tail
{
    int length;
    unsigned char low;
    unsigned char high;
};

Tail tailOf(unsigned char lead)
{
    if (lead >= 0xC2 && lead <= 0xDF)
        return {1, 0x80, 0xBF};
    if (lead == 0xE0)
        return {2, 0xA0, 0xBF};
    if (lead == 0xED)
        return {2, 0x80, 0x9F};
    if (lead >= 0xE1 && lead <= 0xEF)
        return {2, 0x80, 0xBF};
    if (lead == 0xF0)
        return {3, 0x90, 0xBF};
    if (lead == 0xF4)
        return {3, 0x80, 0x8F};
    if (lead >= 0xF1 && lead <= 0xF3)
        return {3, 0x80, 0xBF};
    return {0, 0, 0};
}

} // namespace

bool isUtf8(const std::string& text)
{
    const auto* byte = reinterpret_cast<const unsigned char*>(text.data());
    const auto* const end = byte + text.size();
    while (byte != end) {
        // Most texts are ASCII: eight bytes at a time.
        if (end - byte >= 8) {
            quint64 eight;
            std::memcpy(&eight, byte, sizeof eight);
            if ((eight & Q_UINT64_C(0x8080808080808080)) == 0) {
                byte += 8;
                continue;
            }
        }
        const unsigned char lead = *byte++;
        if (lead < 0x80)
            continue;
        const Tail tail = tailOf(lead);
        if (tail.length == 0 || end - byte < tail.length || *byte < tail.low || *byte > tail.high)
            return false;
        for (int i = 1; i < tail.length; ++i) {
            if ((byte[i] & 0xC0) != 0x80)
                return false;
        }
        byte += tail.length;
    }
    return true;
}

void requireUtf8(const std::string& text)
{
    if (!isUtf8(text))
        throw std::runtime_error("the text is not UTF-8");
}

QString textOfUtf8(const std::string& utf8)
{
    requireUtf8(utf8);
    QString text = QString::fromStdString(utf8);
    // Qt takes the mark for a sign of the encoding and drops it.
    if (utf8.compare(0, 3, "\xEF\xBB\xBF") == 0)
        text.prepend(QChar(QChar::ByteOrderMark));
    return text;
}

} // namespace Serialize::Details
