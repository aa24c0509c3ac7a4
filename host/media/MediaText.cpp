// SPDX-License-Identifier: Apache-2.0
#include "host/media/MediaText.h"

#include "host/text/DisplayText.h"

#include <QFileInfo>
#include <QRegularExpression>
#include <QStringList>

#include <fmt/format.h>

#include <iterator>

extern "C" {
#include <libavutil/samplefmt.h>
}

namespace Host {

std::string lengthText(MTime length)
{
    // As an unsigned number also the lowest time has a magnitude.
    const auto count = static_cast<quint64>(length.ms());
    const bool isNegative = length < MTime();
    const quint64 ms = isNegative ? 0 - count : count;
    return fmt::format("{}{:02}:{:02}:{:02}.{:03}", isNegative ? "-" : "", ms / 3600000, ms / 60000 % 60,
                       ms / 1000 % 60, ms % 1000);
}

std::string sizeText(qint64 bytes)
{
    if (bytes < 1000) {
        return fmt::format("{} B", bytes);
    }
    // A size that rounds to 1000 of a unit belongs to the next one.
    double value = static_cast<double>(bytes) / 1000.0;
    const char* const units[] = {"kB", "MB", "GB", "TB", "PB", "EB"};
    const char* const* unit = units;
    for (; value >= 999.95 && unit != std::end(units) - 1; ++unit) {
        value /= 1000.0;
    }
    return fmt::format("{:.1f} {}", value, *unit);
}

std::string frameRateText(int numerator, int denominator)
{
    if (numerator <= 0 || denominator <= 0) {
        return {};
    }
    std::string rate = fmt::format("{:.3f}", static_cast<double>(numerator) / denominator);
    rate.erase(rate.find_last_not_of('0') + 1);
    if (rate.back() == '.') {
        rate.pop_back();
    }
    return rate + " fps";
}

std::string channelsText(int channels)
{
    switch (channels) {
    case 1:
        return "mono";
    case 2:
        return "stereo";
    default:
        return fmt::format("{} channels", channels);
    }
}

std::string bitrateText(int bitsPerSecond)
{
    if (bitsPerSecond <= 0) {
        return {};
    }
    return bitsPerSecond < 1000000 ? fmt::format("{:.0f} kbit/s", bitsPerSecond / 1e3)
                                   : fmt::format("{:.1f} Mbit/s", bitsPerSecond / 1e6);
}

std::string aspectText(const Media::Video& video)
{
    return video.aspectX == video.aspectY ? std::string()
                                          : fmt::format("pixels {}:{}", video.aspectX, video.aspectY);
}

std::string sampleFormatText(int format)
{
    const bool isKnown = format >= 0 && format < AV_SAMPLE_FMT_NB;
    return isKnown ? av_get_sample_fmt_name(static_cast<AVSampleFormat>(format)) : "";
}

std::string formatText(const Media::File& file)
{
    const QStringList names = QString::fromStdString(file.format).split(',');
    const QString ending = QFileInfo(file.path).suffix().toLower();
    // The reader of picture series stands for many formats.
    const bool goesByEnding = names.contains(ending) || names.first() == "image2";
    QString name = goesByEnding ? ending : names.first();
    // The readers of single pictures: "png_pipe".
    name.remove(QRegularExpression("_pipe$"));
    return printable(name);
}

} // namespace Host
