// SPDX-License-Identifier: Apache-2.0
#include "host/text/TimeText.h"

#include <QRegularExpression>

#include <fmt/format.h>

namespace Host {
namespace {

constexpr quint64 second = 1000;
constexpr quint64 minute = 60 * second;
constexpr quint64 hour = 60 * minute;
constexpr qint64 longestTyped = 100000 * qint64(hour);

/// As an unsigned number also the lowest time has a magnitude.
quint64 magnitude(MTime time)
{
    const auto count = static_cast<quint64>(time.ms());
    return time < MTime() ? 0 - count : count;
}

/// "5" of the decimals of a second stands for 500 milliseconds.
qint64 decimalsOf(const QString& digits)
{
    return digits.leftJustified(3, '0').toLongLong();
}

std::string fractionText(quint64 ms, int decimals)
{
    return decimals == 0 ? std::string() : "." + fmt::format("{:03}", ms).substr(0, decimals);
}

int decimalsFor(quint64 ms)
{
    if (ms % 1000 == 0) {
        return 0;
    }
    return ms % 100 == 0 ? 1 : ms % 10 == 0 ? 2 : 3;
}

std::string clockText(quint64 ms, bool withHours, int decimals)
{
    const std::string seconds = fmt::format("{:02}", ms / second % 60) + fractionText(ms % second, decimals);
    return withHours ? fmt::format("{}:{:02}:{}", ms / hour, ms / minute % 60, seconds)
                     : fmt::format("{}:{}", ms / minute, seconds);
}

} // namespace

std::optional<MTime> timeOfText(const QString& text)
{
    static const QRegularExpression clock(
        "\\A([+-]?)(?:([0-9]{1,6}):)?([0-9]{1,2}):([0-9]{1,2})(?:\\.([0-9]{1,3}))?\\z");
    static const QRegularExpression seconds("\\A([+-]?)([0-9]{1,9})(?:\\.([0-9]{1,3}))?s?\\z");
    static const QRegularExpression milliseconds("\\A([+-]?)([0-9]{1,12})ms\\z");
    qint64 ms = 0;
    QString sign;
    if (const auto found = clock.match(text); found.hasMatch()) {
        const bool hasHours = !found.captured(2).isEmpty();
        const qint64 minutes = found.captured(3).toLongLong();
        const qint64 wholeSeconds = found.captured(4).toLongLong();
        if (wholeSeconds > 59 || (hasHours && minutes > 59)) {
            return std::nullopt;
        }
        sign = found.captured(1);
        ms = ((found.captured(2).toLongLong() * 60 + minutes) * 60 + wholeSeconds) * qint64(second) +
             decimalsOf(found.captured(5));
    } else if (const auto plain = seconds.match(text); plain.hasMatch()) {
        sign = plain.captured(1);
        ms = plain.captured(2).toLongLong() * qint64(second) + decimalsOf(plain.captured(3));
    } else if (const auto counted = milliseconds.match(text); counted.hasMatch()) {
        sign = counted.captured(1);
        ms = counted.captured(2).toLongLong();
    } else {
        return std::nullopt;
    }
    if (ms > longestTyped) {
        return std::nullopt;
    }
    return MTime(sign == "-" ? -ms : ms);
}

std::string spanText(MTime span)
{
    const quint64 ms = magnitude(span);
    const int decimals = decimalsFor(ms % second);
    const std::string sign = span < MTime() ? "-" : "";
    if (ms < minute) {
        return sign + fmt::format("{}", ms / second) + fractionText(ms % second, decimals) + " s";
    }
    return sign + clockText(ms, ms >= hour, decimals);
}

std::string tickText(MTime time, MTime step, MTime longest)
{
    return (time < MTime() ? "-" : "") +
           clockText(magnitude(time), magnitude(longest) >= hour, decimalsFor(magnitude(step) % second));
}

} // namespace Host
