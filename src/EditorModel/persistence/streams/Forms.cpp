// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/streams/Forms.h>

#include <QFileDevice>

#include <charconv>
#include <cmath>
#include <stdexcept>

namespace Serialize::Details {

void writeAll(QIODevice& device, const char* data, qint64 size)
{
    while (size > 0) {
        const qint64 written = device.write(data, size);
        if (written <= 0)
            throw std::runtime_error("the device does not take the document: " +
                                     device.errorString().toStdString());
        data += written;
        size -= written;
    }
}

void flush(QIODevice& device)
{
    auto* const file = qobject_cast<QFileDevice*>(&device);
    if (file && !file->flush())
        throw std::runtime_error("the device does not take the document: " +
                                 device.errorString().toStdString());
}

std::string textOf(double value)
{
    // The sign and the payload of a not-a-number are not kept.
    if (std::isnan(value))
        return "nan";
    char text[32];
    const auto end = std::to_chars(std::begin(text), std::end(text), value).ptr;
    return std::string(text, end);
}

double realOf(const std::string& text)
{
    double value = 0.0;
    const char* const end = text.data() + text.size();
    const auto result = std::from_chars(text.data(), end, value);
    if (text.empty() || result.ec != std::errc() || result.ptr != end)
        throwUnexpected("a number", inQuotes(text));
    return value;
}

std::string inQuotes(const std::string& text)
{
    constexpr std::size_t longest = 60;
    if (text.size() <= longest)
        return '"' + text + '"';
    std::size_t end = longest;
    while (end > 0 && (static_cast<unsigned char>(text[end]) & 0xC0) == 0x80)
        --end;
    return '"' + text.substr(0, end) + "...\"";
}

void throwUnexpected(const std::string& expected, const std::string& found)
{
    throw std::runtime_error("expected " + expected + ", found " + found);
}

} // namespace Serialize::Details
